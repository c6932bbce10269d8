// Mul and MulC: products of two images or of an image and a constant, under
// the scale-factor rule or in single precision; complex members multiply as
// complex numbers.
#include "arith.h"
#include "entry.h"
#include "mul.h"

namespace pvx {
namespace {

using namespace simd;
using mul::MulX;

// Complex product of integer parts: re = ac - bd, im = ad + bc, exact in wide
// integers, each part under the scale-factor rule.
template <class T, Sf M>
struct CMulIntOp {
    using Unit = T;
    using E = Element<T>;
    static constexpr bool kHasVector = false;
    int sf;
    explicit CMulIntOp(int s) : sf(s) {}
    bool Vector() const { return false; }
    T Scalar(T x, T y) const
    {
        Wide a = x.re, b = x.im, c = y.re, d = y.im;
        return {SfsScalar<E>(a * c - b * d, sf), SfsScalar<E>(a * d + b * c, sf)};
    }
};

// Complex product in single precision: re = a*c - b*d, im = a*d + b*c, each
// product rounded, then one subtraction or addition. The vector form computes
// im as b*c + a*d, the same value (addition commutes exactly).
struct CMulFOp {
    using Unit = Pvx32fc;
    static constexpr bool kHasVector = true;
    explicit CMulFOp(int) {}
    bool Vector() const { return true; }
    Pvx32fc Scalar(Pvx32fc x, Pvx32fc y) const
    {
        float ac = x.re * y.re, bd = x.im * y.im, ad = x.re * y.im, bc = x.im * y.re;
        return {ac - bd, ad + bc};
    }
    VI Vec(VI xv, VI yv) const
    {
        VF x = AsFloat(xv), y = AsFloat(yv);
        VF p = MulF(x, DupEvenF(y));              // a*c, b*c
        VF q = MulF(SwapPairsF(x), DupOddF(y));   // b*d, a*d
        return AsInt(SubAddF(p, q));              // a*c - b*d, b*c + a*d
    }
};

template <class T, Sf M>
using CMulOp = std::conditional_t<std::is_same_v<T, Pvx32fc>, CMulFOp, CMulIntOp<T, M>>;

struct MulFam {
    template <class T, Sf M>
    using Op = std::conditional_t<kIsComplex<T>, CMulOp<T, M>, mul::RealMulFam::Op<T, M>>;
    template <class T, Sf M> using OpC = Op<T, M>;
    // 8u: 65025, so every scale factor above 16; complex: |ac - bd| < 2 max^2.
    template <class T>
    static constexpr Wide MaxAbs()
    {
        Wide m = ElemMaxAbs<Element<T>>();
        return kIsComplex<T> ? 2 * m * m : m * m;
    }
    static constexpr int kIdentity = 1;
};

}  // namespace
}  // namespace pvx

#include "mul.exports.inc"
