// Mul and MulC: products of two images or of an image and a constant, under
// the scale-factor rule or in single precision; complex members multiply as
// complex numbers.
#include "arith.h"
#include "entry.h"

namespace pvx {
namespace {

using namespace simd;

// a * b. 8u products fit unsigned 16-bit lanes (with their rounding up to
// scale factor 8); above that, and for 16-bit types, the exact products come
// from 16-bit multiplies straight into 32-bit lanes: 16u products need all 32
// bits unsigned (kU32), 16s products fit signed 32 bits.
struct MulX : ExactBase {
    static constexpr bool kFits16U = true;
    template <class U> static constexpr bool kU32 = std::is_same_v<U, Pvx16u>;
    static VI L16(VI a, VI b) { return MulLoI16(a, b); }
    static Wide Exact(Wide a, Wide b) { return a * b; }
    static float F(float a, float b) { return a * b; }
    static VF V(VF a, VF b) { return MulF(a, b); }
    template <class U>
    static void Exact32(VI a, VI b, VI* r)
    {
        if constexpr (std::is_same_v<U, Pvx8u>) {
            VI lo = MulLoI16(WidenLoU8(a), WidenLoU8(b));
            VI hi = MulLoI16(WidenHiU8(a), WidenHiU8(b));
            r[0] = WidenLoU16(lo);
            r[1] = WidenHiU16(lo);
            r[2] = WidenLoU16(hi);
            r[3] = WidenHiU16(hi);
        } else {
            VI lo = MulLoI16(a, b);
            VI hi = std::is_same_v<U, Pvx16u> ? MulHiU16(a, b) : MulHiI16(a, b);
            r[0] = InterleaveLo16(lo, hi);
            r[1] = InterleaveHi16(lo, hi);
        }
    }
    // 16s, sf 1 to 15: one multiply-add per pair gives a * b + 2^(sf-1) - tie
    // in 32 bits, where tie marks a product that lies halfway above an even
    // result (its low sf + 1 bits are 2^(sf-1)); those bits are the low 16-bit
    // product's. Then shift and pack: 13 operations a register instead of 21,
    // and the tie test is a compare where a shift would queue with the
    // interleaves and packs on the shuffle ports.
    template <class U>
        requires std::is_same_v<U, Pvx16s>
    static VI Down(VI a, VI b, const SfsK& k)
    {
        VI tie = EqI16(And(MulLoI16(a, b), k.tie16), k.tieAt16);
        VI add = AddI16(tie, k.tieAt16);
        VI ones = k.one16;
        VI lo = MulAddPairsI16(InterleaveLo16(a, ones), InterleaveLo16(b, add));
        VI hi = MulAddPairsI16(InterleaveHi16(a, ones), InterleaveHi16(b, add));
        return PackSsS32(SraI32(lo, k.cnt), SraI32(hi, k.cnt));
    }
};

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
    template <class T, Sf M> using Op = std::conditional_t<kIsComplex<T>, CMulOp<T, M>, PartOp<MulX, T, M>>;
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
