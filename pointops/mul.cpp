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
// 16sc runs four numbers a register in 32-bit lanes, 32sc two in 64-bit
// lanes; both parts are exact there. ac - bd comes from two products (16sc:
// multiply-adds with one half of each pair masked off) and lies strictly
// inside the lane's range; ad + bc reaches 2^31 (2^63 for 32sc), which wraps
// to the lane's minimum, only when all four parts are the type's minimum (no
// other sum comes near the minimum), so that lane is set to the lane's
// maximum, which every scale factor rounds and saturates as it does the
// true sum. As the parts use all the lane's bits, the rounding compares the
// remainder with the halfway point instead of adding before the shift (that
// addition would overflow).
template <class T, Sf M>
struct CMulIntOp {
    using Unit = T;
    using E = Element<T>;
    static constexpr bool kWide = sizeof(E) == 4;  // 64-bit lanes
    static constexpr bool kHasVector = true;
    SfsK k;
    VI cnt, lowBits, halfway;  // down: sf, 2^sf - 1, 2^(sf-1) in the lanes; up: the shift
    // (sf from 2 log2 of the type's range up never gets here: every result
    // is 0, filled before)
    explicit CMulIntOp(int s) : k(MakeSfsK<E>(s, M)), cnt(k.cnt), lowBits(Zero()), halfway(Zero())
    {
        if (M == Sf::kDown) {
            if constexpr (kWide) {
                cnt = ShiftCount(s);
                lowBits = SplatU64((std::uint64_t{1} << s) - 1);
                halfway = SplatU64(std::uint64_t{1} << (s - 1));
            } else {
                lowBits = SplatU32(static_cast<std::uint32_t>((std::uint64_t{1} << s) - 1));
                halfway = SplatU32(std::uint32_t{1} << (s - 1));
            }
        } else if (M == Sf::kUp && kWide) {
            cnt = ShiftCount(s < -31 ? 31 : -s);
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
        if constexpr (kWide) {
            VI xo = SrlI64n(x, 32), yo = SrlI64n(y, 32);  // b and d in the even lanes
            VI r = SubI64(MulEvenI32(x, y), MulEvenI32(xo, yo));
            VI i = AddI64(MulEvenI32(x, yo), MulEvenI32(xo, y));
            i = Xor(i, EqI64(i, SplatU64(std::uint64_t{1} << 63)));
            return _mm_blend_epi16(Scale64(r), SllI64n(Scale64(i), 32), 0xCC);
        } else {
            VI r = MulSubPairsI16(x, y);
            VI i = MulAddPairsI16(x, SwapHalves16(y));
            i = Xor(i, EqI32(i, SplatU32(0x80000000u)));
            return PackPairsS32(Scale32(r), Scale32(i));
        }
    }
    // Any 32-bit exact part: down by the floor and a rounding step, up by
    // the clamped shift; the pack saturates.
    VI Scale32(VI v) const
    {
        if constexpr (M == Sf::kDown) {
            VI q = SraI32(v, cnt);
            VI inc = GtI32(And(v, lowBits), SubI32(halfway, And(q, k.one32)));
            return SubI32(q, inc);
        } else {
            return pvx::Scale32<M>(v, k);
        }
    }
    // Any 64-bit exact part, scaled the same way (the floor from a logical
    // shift between sign flips; up: clamped to +-2^31 first, beyond which
    // every shift saturates) and saturated to 32 bits in the low half.
    VI Scale64(VI v) const
    {
        const VI top = SplatU64(0x7FFFFFFF), bottom = SplatU64(0xFFFFFFFF80000000u);
        if constexpr (M == Sf::kDown) {
            VI sign = GtI64(Zero(), v);
            VI q = Xor(SrlI64(Xor(v, sign), cnt), sign);
            VI inc = GtI64(And(v, lowBits), SubI64(halfway, And(q, SplatU64(1))));
            v = SubI64(q, inc);
        } else if constexpr (M == Sf::kUp) {
            const VI up = SplatU64(0x80000000u);
            v = SelectBytes(v, up, GtI64(v, up));
            v = SelectBytes(v, bottom, GtI64(bottom, v));
            v = SllI64(v, cnt);
        }
        v = SelectBytes(v, top, GtI64(v, top));
        return SelectBytes(v, bottom, GtI64(bottom, v));
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
