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
//
// 16sc has a vector path in 32-bit lanes, four numbers a register. Both
// parts are exact there: ac and bd come from multiply-adds with one half of
// each pair masked off, and ac - bd lies within (-2^31, 2^31); ad + bc comes
// from one multiply-add with c and d swapped and reaches 2^31, which wraps to
// -2^31, only when all four parts are -32768 (no other sum comes near -2^31),
// so that lane is set to 2^31 - 1, which every scale factor rounds and
// saturates as it does 2^31. As the parts use all 32 bits, the rounding
// compares the remainder with the halfway point instead of adding before the
// shift (that addition would overflow).
template <class T, Sf M>
struct CMulIntOp {
    using Unit = T;
    using E = Element<T>;
    static constexpr bool kHasVector = std::is_same_v<T, Pvx16sc>;
    SfsK k;
    VI lowBits, halfway;  // sf 1 to 31: 2^sf - 1, 2^(sf-1)
    // (sf 32 and above never get here: every result is 0, filled before)
    explicit CMulIntOp(int s) : k(MakeSfsK<E>(s, M)), lowBits(Zero()), halfway(Zero())
    {
        if (M == Sf::kDown && s < 32) {
            lowBits = SplatU32(static_cast<std::uint32_t>((std::uint64_t{1} << s) - 1));
            halfway = SplatU32(std::uint32_t{1} << (s - 1));
        }
    }
    bool Vector() const { return kHasVector; }
    T Scalar(T x, T y) const
    {
        Wide a = x.re, b = x.im, c = y.re, d = y.im;
        return {SfsScalar<E>(a * c - b * d, k.sf), SfsScalar<E>(a * d + b * c, k.sf)};
    }
    VI Vec(VI x, VI y) const
    {
        const VI re = SplatU32(0xFFFF);
        const VI swap = _mm_setr_epi8(2, 3, 0, 1, 6, 7, 4, 5, 10, 11, 8, 9, 14, 15, 12, 13);
        const VI pairs = _mm_setr_epi8(0, 1, 8, 9, 2, 3, 10, 11, 4, 5, 12, 13, 6, 7, 14, 15);
        VI r = SubI32(MulAddPairsI16(And(x, re), y), MulAddPairsI16(AndNot(re, x), y));
        VI i = MulAddPairsI16(x, ShuffleBytes(y, swap));
        i = Xor(i, EqI32(i, SplatU32(0x80000000u)));
        return ShuffleBytes(PackSsS32(Scale(r), Scale(i)), pairs);
    }
    // Any 32-bit exact part: down by the floor and a rounding step, up by
    // the clamped shift; the pack saturates.
    VI Scale(VI v) const
    {
        if constexpr (M == Sf::kDown) {
            VI q = SraI32(v, k.cnt);
            VI inc = GtI32(And(v, lowBits), SubI32(halfway, And(q, k.one32)));
            return SubI32(q, inc);
        } else {
            return Scale32<M>(v, k);
        }
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
