// The element-wise frame of the arithmetic families (Add, Sub, Mul and their
// constant forms; the division and unary families build on it too).
//
// An operation is a struct with a scalar member (the definition, used for row
// tails and for the members that have no vector path) and a vector member that
// maps whole 16-byte registers of units (elements, or complex numbers for the
// complex multiplications) to a register of results. One row loop serves:
//   - two images (in place is just src2 == dst),
//   - an image and a constant (in place: src == dst); the constant is a
//     pattern of one to three registers that repeats with the pixel, so C3
//     constants line up,
//   - one image (unary operations).
// AC4 rows are computed as four channels and the destination's old alpha is
// blended back in before the store, so alpha is never given a new value.
//
// Integer operations follow the scale-factor rule of core/sfs.h exactly: the
// exact result is formed in 16- or 32-bit lanes, scaled (round half to even
// for sf > 0, saturating shift up for sf < 0) and packed with saturation.
// Scale factors above the point where every result rounds to 0 fill the
// destination with 0 before any pixel is read.
//
// An op struct has: using Unit (the element a lane holds: the part type for
// part-wise complex ops, the complex type for complex products); a
// constructor from the scale factor; static constexpr bool kHasVector; bool
// Vector() const (the call's scale factor may still refuse the vector path);
// Unit Scalar(Unit, Unit) and VI Vec(VI, VI) (one argument each for unary
// ops). IntOp, FloatOp and PartOp below build ops from an exact-operation
// struct X; IntOp is exact for every scale factor.
//
// A family supplies a struct Fam with
//   template <class T, Sf M> using Op;   two-image op, Scalar(src1, src2)
//   template <class T, Sf M> using OpC;  constant op,  Scalar(src, value)
//   template <class T> static constexpr Wide MaxAbs();  bound of |exact result|
//   static constexpr int kIdentity;      constant (re part for complex) that
//                                        makes the op a copy at sf 0 (constant
//                                        forms of integer types only)
// and names ArithBody / ArithIBody / ArithCBody / ArithCIBody (or, for unary
// families whose Op has Scalar(a) and Vec(a), ArithUBody / ArithUIBody) in its
// table. Families with their own checks or statuses call RunRows from their
// own bodies; an op that must report something per call (a zero divisor)
// can carry a pointer to a flag: ArithRow copies the op, not what it points to.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <limits>
#include <numeric>
#include <type_traits>

#include "arith_round.h"
#include "check.h"
#include "forward.h"
#include "fpguard.h"
#include "layout.h"
#include "sfs.h"
#include "simd.h"
#include "store.h"

namespace pvx {

// Scale-factor case of an integer op, chosen once per call; kNone for floats.
// kHalf is sf == 1 for ops that have a whole-register path for it (the
// others never see it).
enum class Sf { kNone, kZero, kDown, kUp, kHalf };

// The second operand of the row loop.
enum class Src2 { kImage, kConst, kNone };

// ---- scale-factor constants --------------------------------------------------

// Scale factors beyond these give the same results (every non-zero result has
// saturated), so shifts are capped and no shift count overflows.
inline constexpr int kUpCap = 64;

// Register constants of the Sfs rule for a destination element type U.
struct SfsK {
    int sf = 0;
    simd::VI cnt;             // shift count: sf down, or min(-sf, bits of U) up
    simd::VI one16, half16;   // 16-bit lanes: 1, 2^(sf-1) - 1
    simd::VI tie16, tieAt16;  // 16-bit lanes, sf 1 to 15: 2^(sf+1) - 1, 2^(sf-1)
    simd::VF down;            // float lanes, sf 1 to 40: 2^-sf
    simd::VI one32, half32;   // 32-bit lanes
    simd::VI lo16, hi16;      // shift-up clamps (lo - 1, hi + 1), 16-bit lanes
    simd::VI lo32, hi32;      // 32-bit lanes
};

template <class U>
inline SfsK MakeSfsK(int sf, Sf m)
{
    using namespace simd;
    SfsK k;
    k.sf = sf;
    k.one16 = _mm_set1_epi16(1);
    k.one32 = _mm_set1_epi32(1);
    k.half16 = k.half32 = k.tie16 = k.tieAt16 = Zero();
    k.lo16 = k.hi16 = k.lo32 = k.hi32 = Zero();
    k.cnt = Zero();
    k.down = SplatF(1.0f);
    if (m == Sf::kDown) {
        int s = sf > 40 ? 40 : sf;
        k.down = SplatF(static_cast<float>(Pow2D(-s)));
        std::int64_t half = (std::int64_t{1} << (s - 1)) - 1;
        k.cnt = ShiftCount(s);
        k.half16 = _mm_set1_epi16(static_cast<short>(half & 0xFFFF));
        k.half32 = _mm_set1_epi32(static_cast<int>(half & 0xFFFFFFFF));
        if (s <= 15) {
            k.tie16 = _mm_set1_epi16(static_cast<short>((1 << (s + 1)) - 1));
            k.tieAt16 = _mm_set1_epi16(static_cast<short>(1 << (s - 1)));
        }
    } else if (m == Sf::kUp) {
        // The result is r * 2^up saturated: clamp r to [lo - 1, hi + 1], where
        // [lo, hi] are the values whose shifted result fits, then shift; the
        // pack saturates the clamped ends. Beyond the width of U every non-zero
        // result saturates, so the count is capped there.
        using L = std::numeric_limits<U>;
        constexpr int kBits = 8 * sizeof(U);
        int up = sf < -kBits ? kBits : -sf;
        std::int64_t hi = (static_cast<std::int64_t>(L::max()) >> up) + 1;
        std::int64_t lo = L::is_signed ? -((-static_cast<std::int64_t>(L::min())) >> up) - 1 : -1;
        k.cnt = ShiftCount(up);
        k.hi16 = _mm_set1_epi16(static_cast<short>(hi > 32767 ? 32767 : hi));
        k.lo16 = _mm_set1_epi16(static_cast<short>(lo < -32768 ? -32768 : lo));
        k.hi32 = _mm_set1_epi32(static_cast<int>(hi));
        k.lo32 = _mm_set1_epi32(static_cast<int>(lo));
    }
    return k;
}

// The scalar rule with the scale factor bounded so that no negation or shift
// in it overflows; results are those of ScaleSat for every int. The exact
// results of 8- and 16-bit operands (|r| < 2^34: products of two 16-bit
// values, or a complex part, a * c - b * d) are scaled in 64 bits, three
// times faster than in 128 (whose variable shifts took most of a row tail's
// time: about 5 ns an element at sf 1). Shifted up, any non-zero one of them
// saturates a 16-bit destination by 2^24, so the count is capped there.
template <class U>
inline U SfsScalar(Wide r, int sf)
{
    if constexpr (sizeof(U) <= 2) {
        auto v = static_cast<std::int64_t>(r);
        if (sf > 0) {
            if (sf > 40) return U{};
            std::int64_t half = (std::int64_t{1} << (sf - 1)) - 1;
            v = (v + ((v >> sf) & 1) + half) >> sf;
        } else if (sf < 0) {
            int up = sf < -24 ? 24 : -sf;  // compared before negating: sf may be INT_MIN
            v *= std::int64_t{1} << up;
        }
        return Saturate<U>(v);
    } else {
        return ScaleSat<U>(r, sf < -kUpCap ? -kUpCap : sf);
    }
}

// Scales exact results held in signed 16-bit lanes (8u results).
template <Sf M>
inline simd::VI Scale16(simd::VI r, const SfsK& k)
{
    using namespace simd;
    if constexpr (M == Sf::kDown) {
        VI odd = And(SraI16(r, k.cnt), k.one16);
        return SraI16(AddI16(AddI16(r, odd), k.half16), k.cnt);
    } else if constexpr (M == Sf::kUp) {
        return SllI16(MaxI16(MinI16(r, k.hi16), k.lo16), k.cnt);
    } else {
        return r;
    }
}

// Scales exact results held in unsigned 16-bit lanes (8u products, up to sf 8).
template <Sf M>
inline simd::VI Scale16U(simd::VI r, const SfsK& k)
{
    using namespace simd;
    if constexpr (M == Sf::kDown) {
        VI odd = And(SrlI16(r, k.cnt), k.one16);
        return SrlI16(AddI16(AddI16(r, odd), k.half16), k.cnt);
    } else if constexpr (M == Sf::kUp) {
        return SllI16(MinU16(r, k.hi16), k.cnt);
    } else {
        return MinU16(r, _mm_set1_epi16(255));
    }
}

// Scales exact results held in signed 32-bit lanes, or unsigned ones (kU32:
// 16u products, which need all 32 bits).
template <Sf M, bool kU32 = false>
inline simd::VI Scale32(simd::VI r, const SfsK& k)
{
    using namespace simd;
    if constexpr (kU32) {
        if constexpr (M == Sf::kDown) {
            VI odd = And(SrlI32(r, k.cnt), k.one32);
            return SrlI32(AddI32(AddI32(r, odd), k.half32), k.cnt);
        } else if constexpr (M == Sf::kUp) {
            return SllI32(MinU32(r, k.hi32), k.cnt);
        } else {
            return MinU32(r, _mm_set1_epi32(0xFFFF));
        }
    } else {
        if constexpr (M == Sf::kDown) {
            VI odd = And(SraI32(r, k.cnt), k.one32);
            return SraI32(AddI32(AddI32(r, odd), k.half32), k.cnt);
        } else if constexpr (M == Sf::kUp) {
            return SllI32(MaxI32(MinI32(r, k.hi32), k.lo32), k.cnt);
        } else {
            return r;
        }
    }
}

// Packs scaled 32-bit lanes to U with saturation: two registers for 16-bit U,
// four for 8u.
template <class U>
inline simd::VI Narrow32(const simd::VI* r)
{
    using namespace simd;
    if constexpr (std::is_same_v<U, Pvx8u>) return PackUsS16(PackSsS32(r[0], r[1]), PackSsS32(r[2], r[3]));
    else if constexpr (std::is_same_v<U, Pvx16u>) return PackUsS32(r[0], r[1]);
    else return PackSsS32(r[0], r[1]);
}

// Widens a register of U to 32-bit lanes (zero or sign extension).
template <class U>
inline void Widen32(simd::VI v, simd::VI* out)
{
    using namespace simd;
    if constexpr (std::is_same_v<U, Pvx8u>) {
        VI lo = WidenLoU8(v), hi = WidenHiU8(v);
        out[0] = WidenLoU16(lo);
        out[1] = WidenHiU16(lo);
        out[2] = WidenLoU16(hi);
        out[3] = WidenHiU16(hi);
    } else if constexpr (std::is_same_v<U, Pvx16u>) {
        out[0] = WidenLoU16(v);
        out[1] = WidenHiU16(v);
    } else {
        out[0] = WidenLoS16(v);
        out[1] = WidenHiS16(v);
    }
}

// ---- exact operations and the op structs ----------------------------------------

// Defaults for the exact-operation structs of the families (X below):
//   static Wide Exact(Wide a, Wide b)     the exact integer result
//   static float F(float a, float b), static VF V(VF a, VF b)   float forms
//   kFits16: 8u results and their rounding fit signed 16-bit lanes
//     (then static VI L16(VI a, VI b) on widened lanes)
//   kFits16U: 8u results fit unsigned 16-bit lanes, with their rounding up
//     to sf 8 (then static VI L16(VI a, VI b) on widened lanes; 32-bit lanes
//     above sf 8)
//   template <class U> static VI Half(VI a, VI b): the whole sf == 1 result
//   template <class U> static VI Down(VI a, VI b, const SfsK&): the whole
//     result for sf 1 to kDownMax<U> (32-bit lanes above)
//   static VI L32(VI a, VI b) on 32-bit lanes, or
//   template <class U> static void Exact32(VI a, VI b, VI* r) on raw registers
//   template <class U> static VI Sat(VI a, VI b): the whole sf == 0 result
//   kU32<U>: the exact result needs unsigned 32-bit lanes (vector up to sf 16)
//   kSum: the exact result is a sum or difference of two elements (exact in
//     double lanes for 32-bit parts; then static VD D(VD a, VD b))
// Ops state kHasVector; Vector() may still refuse a call's scale factor.
struct ExactBase {
    static constexpr bool kSum = false;
    static constexpr bool kFits16 = false;
    static constexpr bool kFits16U = false;
    template <class U> static constexpr bool kU32 = false;
};

template <class X, class U>
concept HasSat = requires(simd::VI a) { X::template Sat<U>(a, a); };
template <class X, class U>
concept HasHalf = requires(simd::VI a) { X::template Half<U>(a, a); };
template <class X, class U>
concept HasDown = requires(simd::VI a, const SfsK& k) { X::template Down<U>(a, a, k); };
template <class X, class U>
concept FloatDown = HasDown<X, U> && requires { requires X::template kFloatDown<U>; };
template <class X, class U>
concept HasExact32 = requires(simd::VI a, simd::VI* r) { X::template Exact32<U>(a, a, r); };

// Integer op on elements U (8u, 16u, 16s, 32s) under the Sfs rule. The
// unsigned 32-bit products above sf 16 take the scalar path. 32s (the parts
// of 32sc) has sums only: in double lanes, where a sum is exact, its scaling
// by a power of 2 too, and the rounding explicit (the scalar rule in 128 bits
// took 4 to 14 ns an element, these 1.5 to 1.8 on 1080p-sized regions).
template <class X, class U, Sf M>
struct IntOp {
    using Unit = U;
    static constexpr bool kHasVector = sizeof(U) <= 2 || X::kSum;
    static constexpr bool kHalfPath = HasHalf<X, U>;
    // Ops that round in float lanes need the nearest rounding mode set.
    static constexpr bool kRoundsInFloat = M == Sf::kDown && FloatDown<X, U>;
    SfsK k;
    simd::VD scaleD;  // 32s: 2^-sf
    bool vec;
    explicit IntOp(int sf)
        : k(MakeSfsK<U>(sf, M)),
          scaleD(simd::SplatD(Pow2D(sf < -kUpCap ? kUpCap : -sf))),  // sf below 40 here
          vec(kHasVector && !(X::template kU32<U> && M == Sf::kDown && sf > 16))
    {
    }
    bool Vector() const { return vec; }
    U Scalar(U a, U b) const { return SfsScalar<U>(X::Exact(a, b), k.sf); }
    simd::VI Vec(simd::VI a, simd::VI b) const
    {
        using namespace simd;
        if constexpr (sizeof(U) == 4) {
            VD lo = MulD(X::D(CvtLoI32D(a), CvtLoI32D(b)), scaleD);
            VD hi = MulD(X::D(CvtHiI32D(a), CvtHiI32D(b)), scaleD);
            return SatI32<U, Rnd::kEven>(lo, hi);
        } else if constexpr (M == Sf::kZero && HasSat<X, U>) {
            return X::template Sat<U>(a, b);
        } else if constexpr (M == Sf::kHalf) {
            return X::template Half<U>(a, b);
        } else if constexpr (M == Sf::kDown && HasDown<X, U>) {
            return k.sf <= X::template kDownMax<U> ? X::template Down<U>(a, b, k) : Vec32(a, b);
        } else if constexpr (sizeof(U) == 1 && X::kFits16U) {
            if (M != Sf::kDown || k.sf <= 8) {
                VI lo = Scale16U<M>(X::L16(WidenLoU8(a), WidenLoU8(b)), k);
                VI hi = Scale16U<M>(X::L16(WidenHiU8(a), WidenHiU8(b)), k);
                return PackUsS16(lo, hi);
            }
            return Vec32(a, b);
        } else if constexpr (sizeof(U) == 1 && X::kFits16) {
            VI lo = Scale16<M>(X::L16(WidenLoU8(a), WidenLoU8(b)), k);
            VI hi = Scale16<M>(X::L16(WidenHiU8(a), WidenHiU8(b)), k);
            return PackUsS16(lo, hi);
        } else {
            return Vec32(a, b);
        }
    }
    // Exact results in 32-bit lanes, scaled and packed.
    simd::VI Vec32(simd::VI a, simd::VI b) const
    {
        using namespace simd;
        if constexpr (sizeof(U) <= 2) {
            constexpr int kN = 4 / sizeof(U);
            VI r[kN];
            if constexpr (HasExact32<X, U>) {
                X::template Exact32<U>(a, b, r);
            } else {
                VI wa[kN], wb[kN];
                Widen32<U>(a, wa);
                Widen32<U>(b, wb);
                for (int i = 0; i < kN; ++i) r[i] = X::L32(wa[i], wb[i]);
            }
            for (int i = 0; i < kN; ++i) r[i] = Scale32<M, X::template kU32<U>>(r[i], k);
            return Narrow32<U>(r);
        } else {
            static_assert(sizeof(U) <= 2, "32-bit sums take the double lanes of Vec");
            return a;
        }
    }
};

// Float op (IEEE single, results as computed).
template <class X>
struct FloatOp {
    using Unit = Pvx32f;
    static constexpr bool kHasVector = true;
    explicit FloatOp(int) {}
    bool Vector() const { return true; }
    Pvx32f Scalar(Pvx32f a, Pvx32f b) const { return X::F(a, b); }
    simd::VI Vec(simd::VI a, simd::VI b) const { return simd::AsInt(X::V(simd::AsFloat(a), simd::AsFloat(b))); }
};

// The op of X for pixel type T: complex types work part by part.
template <class X, class T, Sf M>
using PartOp = std::conditional_t<std::is_floating_point_v<Element<T>>, FloatOp<X>, IntOp<X, Element<T>, M>>;

// Unary ops of the frame itself.
template <class U>
struct ZeroOp {
    using Unit = U;
    static constexpr bool kHasVector = true;
    bool Vector() const { return true; }
    U Scalar(U) const { return U{}; }
    simd::VI Vec(simd::VI) const { return simd::Zero(); }
};
template <class U>
struct IdentityOp {
    using Unit = U;
    static constexpr bool kHasVector = true;
    bool Vector() const { return true; }
    U Scalar(U a) const { return a; }
    simd::VI Vec(simd::VI a) const { return a; }
};

// ---- the row loop ---------------------------------------------------------------

// The repeating per-register data of layout L for units U: the constant
// pattern (C3 needs three registers to line up again) and the AC4 alpha mask.
template <class U, class T, Lay L>
struct Pattern {
    static constexpr int kPerChannel = sizeof(T) / sizeof(U);        // 2 for part-wise complex
    static constexpr int kPixelUnits = kChannels<L> * kPerChannel;   // units per pixel
    static constexpr int kKeptUnits = kProcessed<L> * kPerChannel;   // units written per pixel
    static constexpr int kPixelBytes = kPixelUnits * static_cast<int>(sizeof(U));
    static constexpr int kRegs = std::lcm(kPixelBytes, simd::kBytes) / simd::kBytes;
    static constexpr int kLanes = simd::kBytes / static_cast<int>(sizeof(U));  // units per register
    static constexpr int kUnits = kRegs * kLanes;
    static_assert(simd::kBytes % sizeof(U) == 0 && kRegs <= 3);

    // A register's worth past the pattern, so that a register starting at
    // any unit finds its constants in one load (CstAt).
    alignas(16) U unit[kUnits + kLanes];
    simd::VI cst[kRegs];
    simd::VI alpha[kRegs];

    // The alpha mask depends on the layout only: a table fixed at compile
    // time, where it was built byte by byte on every call and then loaded as
    // vectors, a store-to-load forward that fails on every load.
    static constexpr auto kAlphaBytes = [] {
        std::array<std::uint8_t, (kRegs + 1) * simd::kBytes> m{};
        for (int j = 0; j < (kRegs + 1) * simd::kBytes; ++j)
            m[j] = j % kPixelBytes >= kKeptUnits * static_cast<int>(sizeof(U)) ? 0xFF : 0;
        return m;
    }();

    // Where each byte of the constant pattern comes from in the constant's
    // bytes (0x80: a zero byte, the alpha units).
    static constexpr int kValueBytes = kKeptUnits * static_cast<int>(sizeof(U));
    static constexpr auto kValueIndex = [] {
        std::array<std::uint8_t, (kRegs + 1) * simd::kBytes> m{};
        for (int j = 0; j < (kRegs + 1) * simd::kBytes; ++j) {
            int c = j / static_cast<int>(sizeof(U)) % kPixelUnits;
            m[j] = c < kKeptUnits ? static_cast<std::uint8_t>(c * sizeof(U) + j % sizeof(U)) : 0x80;
        }
        return m;
    }();

    // value: kProcessed<L> pixel elements, or null (no constant: cst is zero
    // and unit is never read).
    explicit Pattern(const T* value)
    {
        for (int r = 0; r < kRegs; ++r) {
            alpha[r] = simd::LoadU(kAlphaBytes.data() + r * simd::kBytes);
            cst[r] = simd::Zero();
        }
        if (!value) return;
        if constexpr (kValueBytes <= simd::kBytes) {
            // One byte shuffle a register of the constant's bytes: the C3
            // 8u pattern was 64 byte stores and four failed store-to-load
            // forwards, a third of an 8x8 MulC call.
            const simd::VI v = simd::LoadPartial<kValueBytes>(value);
            for (int r = 0; r <= kRegs; ++r) {
                simd::VI c = simd::ShuffleBytes(v, simd::LoadU(kValueIndex.data() + r * simd::kBytes));
                if (r < kRegs) cst[r] = c;
                simd::StoreA(reinterpret_cast<std::uint8_t*>(unit) + r * simd::kBytes, c);
            }
        } else {
            const U* v = reinterpret_cast<const U*>(value);
            for (int i = 0; i < kUnits + kLanes; ++i) {
                int c = i % kPixelUnits;
                unit[i] = c < kKeptUnits ? v[c] : U{};
            }
            for (int r = 0; r < kRegs; ++r)
                cst[r] = simd::LoadA(reinterpret_cast<const std::uint8_t*>(unit) + r * simd::kBytes);
        }
    }

    // The constant and alpha mask of a register starting at unit s of a row.
    simd::VI CstAt(std::ptrdiff_t s) const { return simd::LoadU(unit + s % kPixelUnits); }
    static simd::VI AlphaAt(std::ptrdiff_t s)
    {
        return simd::LoadU(kAlphaBytes.data() + s % kPixelUnits * static_cast<std::ptrdiff_t>(sizeof(U)));
    }
};

// An op over two images may also map four registers at once (Vec4), to test
// a rare condition once for the four instead of once a register. Its sources
// are prefetched a kilobyte ahead: such ops are long per byte, and the loads
// of the next lines would otherwise wait behind them (Div_32f at 1080p: 766
// to 736 us, and 4.5 to 4.2 us on 64 KB rows in L2).
inline constexpr int kPrefetchAhead = 1024;
template <class Op>
concept HasVec4 = requires(const Op& o, const simd::VI* v, simd::VI* r) { o.Vec4(v, v, r); };

// Ops whose result depends on where a register starts (Div_32f's groups of
// four) state kScalarTail; the others map each lane on its own, and a row's
// last partial register may be run again over units already done.
template <class Op>
concept ScalarTailOp = requires { requires Op::kScalarTail; };

// An op over two images that must know which lanes are kept (a divisor's
// zero test, which the alpha lanes of AC4 must not set off) takes the mask
// of kept bytes (all zero outside AC4) as a third argument.
template <class Op>
concept KeepAwareOp = requires(const Op& o, simd::VI v) { o.Vec(v, v, v); };

// The op on one register's inputs: two images, an image and a constant, or
// one image; AC4 keeps the bytes of vd that keep selects.
template <class Op, Src2 K, bool kAlpha>
[[gnu::always_inline]] inline simd::VI ApplyOp(const Op& o, simd::VI va, simd::VI vb, simd::VI c, simd::VI vd,
                                               simd::VI keep)
{
    simd::VI v;
    if constexpr (K == Src2::kImage && KeepAwareOp<Op>) v = o.Vec(va, vb, keep);
    else if constexpr (K == Src2::kImage) v = o.Vec(va, vb);
    else if constexpr (K == Src2::kConst) v = o.Vec(va, c);
    else v = o.Vec(va);
    if constexpr (kAlpha) v = simd::SelectBytes(v, vd, keep);
    return v;
}

// The op on the register at unit j of a row (A: aligned loads).
template <bool A, Src2 K, bool kAlpha, class Op, class U>
[[gnu::always_inline]] inline simd::VI ApplyAt(const Op& o, const U* a, const U* b, const U* d, std::ptrdiff_t j,
                                               simd::VI c, simd::VI keep)
{
    using namespace simd;
    return ApplyOp<Op, K, kAlpha>(o, Load<A>(a + j), K == Src2::kImage ? Load<A>(b + j) : Zero(), c,
                                  kAlpha ? Load<A>(d + j) : Zero(), keep);
}

// A row of n units, fewer than a register but at least kPart bytes: two parts
// of kPart bytes, [0, h) and [n - h, n), in one register, both read before
// either is stored. False where the op or layout does not allow it (ops of
// kScalarTail; AC4 parts that do not start on a pixel, as the ops' alpha
// lanes are fixed) or the row is shorter. Out of line, so that the row
// function stays small enough to be inlined into the row loop (called per
// row, it copies the op, all its scale-factor constants, per row).
template <int kPart, Src2 K, class Op, class T, Lay L>
[[gnu::noinline]] bool PartsRow(const Op& o, const Pattern<typename Op::Unit, T, L>& pat, const typename Op::Unit* a,
                                const typename Op::Unit* b, typename Op::Unit* d, std::ptrdiff_t n)
{
    using namespace simd;
    using P = Pattern<typename Op::Unit, T, L>;
    constexpr bool kAlpha = kKeepsAlpha<L>;
    constexpr int kPartUnits = kPart / static_cast<int>(sizeof(typename Op::Unit));
    if constexpr (kPartUnits == 0 || ScalarTailOp<Op> || (kAlpha && kPartUnits % P::kPixelUnits != 0)) {
        return false;
    } else {
        if (n < kPartUnits) return false;
        std::ptrdiff_t s = n - kPartUnits;
        // (4-byte parts fill the register twice: no lane is left 0 to look
        // like a zero divisor or a logarithm of 0)
        auto join = [](VI lo, VI hi) {
            if constexpr (kPart == 8) return InterleaveLo64(lo, hi);
            VI t = InterleaveLo32(lo, hi);
            return InterleaveLo64(t, t);
        };
        auto both = [&](const auto* p) {
            if constexpr (kPart == 8) return join(LoadLo64(p), LoadLo64(p + s));
            else return join(LoadLo32(p), LoadLo32(p + s));
        };
        VI v = ApplyOp<Op, K, kAlpha>(o, both(a), K == Src2::kImage ? both(b) : Zero(),
                                      K == Src2::kConst ? join(pat.CstAt(0), pat.CstAt(s)) : Zero(),
                                      kAlpha ? both(d) : Zero(), join(P::AlphaAt(0), P::AlphaAt(s)));
        if constexpr (kPart == 8) {
            StoreLo64(d, v);
            StoreHi64(d + s, v);
        } else {
            Store32<0>(d, v);
            Store32<1>(d + s, v);
        }
        return true;
    }
}

// One row of n units: d = op(a, b), op(a, value pattern) or op(a). Vector body
// in groups of the pattern's registers, then single registers, then the rest:
// one more register ending at the row's end, or two overlapping parts in a
// row shorter than a register, or (ops of kScalarTail, rows under 4 bytes)
// scalar units. The overlapping registers read their inputs before
// anything is stored, so units done twice get the same value in place too.
// AC4: the alpha units of d keep their value. A selects aligned loads and
// stores, kNt (aligned rows only) streamed stores of the vectors, fenced by
// the caller, and kFetch (aligned rows only) fetching the sources ahead.
template <class Op, class T, Lay L, Src2 K, bool A, bool kNt = false, bool kFetch = false>
void ArithRow(const Op& op, const Pattern<typename Op::Unit, T, L>& pat, const typename Op::Unit* a,
              const typename Op::Unit* b, typename Op::Unit* d, std::ptrdiff_t n)
{
    using namespace simd;
    using P = Pattern<typename Op::Unit, T, L>;
    constexpr bool kAlpha = kKeepsAlpha<L>;
    static_assert(!kNt || (A && !kAlpha));
    std::ptrdiff_t i = 0;
    if constexpr (Op::kHasVector) {
        // Local copies: the stores below may alias anything reached through a
        // reference, so constants held there would be reloaded every register.
        const Op o = op;
        VI cst[P::kRegs], alpha[P::kRegs];
        for (int r = 0; r < P::kRegs; ++r) {
            cst[r] = pat.cst[r];
            alpha[r] = pat.alpha[r];
        }
        std::ptrdiff_t nv = o.Vector() ? n : 0;
        if (nv < P::kLanes && (PartsRow<8, K>(o, pat, a, b, d, nv) || PartsRow<4, K>(o, pat, a, b, d, nv))) return;
        // The last partial register, as one more register ending at the row's
        // end, read before anything is stored (lane-wise ops; AC4 only where
        // every register starts on a pixel).
        constexpr bool kTail = !ScalarTailOp<Op> && (!kAlpha || P::kLanes % P::kPixelUnits == 0);
        std::ptrdiff_t last = -1;
        VI lastV = Zero();
        if constexpr (kTail) {
            if (nv > P::kLanes && nv % P::kLanes != 0) {
                last = nv - P::kLanes;
                lastV = ApplyAt<false, K, kAlpha>(o, a, b, d, last, K == Src2::kConst ? pat.CstAt(last) : Zero(),
                                                  P::AlphaAt(last));
            }
        }
        if constexpr (HasVec4<Op> && K == Src2::kImage && P::kRegs == 1) {
            for (; i + 4 * P::kUnits <= nv; i += 4 * P::kUnits) {
                VI va[4], vb[4], v[4];
                Prefetch(reinterpret_cast<const char*>(a + i) + kPrefetchAhead);
                Prefetch(reinterpret_cast<const char*>(b + i) + kPrefetchAhead);
                for (int r = 0; r < 4; ++r) {
                    va[r] = Load<A>(a + i + r * P::kLanes);
                    vb[r] = Load<A>(b + i + r * P::kLanes);
                }
                o.Vec4(va, vb, v);
                for (int r = 0; r < 4; ++r) {
                    if constexpr (kAlpha) v[r] = SelectBytes(v[r], Load<A>(d + i + r * P::kLanes), alpha[0]);
                    Store<A, kNt>(d + i + r * P::kLanes, v[r]);
                }
            }
        }
        // Four registers a step keep enough loads in flight for cache-resident
        // rows (Add_8u at 1080p: 0.87x to 1.05x of the peer, measured). With
        // kFetch, each register first asks for its source lines kFetchAhead
        // bytes on (four times a line for 8u C1: counting would cost more).
#pragma GCC unroll 4
        for (; i + P::kUnits <= nv; i += P::kUnits) {
            if constexpr (kFetch) {
                Prefetch(reinterpret_cast<const char*>(a + i) + kFetchAhead);
                if constexpr (K == Src2::kImage) Prefetch(reinterpret_cast<const char*>(b + i) + kFetchAhead);
            }
            for (int r = 0; r < P::kRegs; ++r) {
                std::ptrdiff_t j = i + r * P::kLanes;
                Store<A, kNt>(d + j, ApplyAt<A, K, kAlpha>(o, a, b, d, j, cst[r], alpha[r]));
            }
        }
        // Whole registers short of a pattern (C3: up to two) go as registers
        // too, each with its place in the pattern: a C3 row of 8 or 11 8u
        // pixels has no whole pattern at all.
        for (int r = 0; r < P::kRegs - 1 && i + P::kLanes <= nv; ++r, i += P::kLanes)
            Store<A, kNt>(d + i, ApplyAt<A, K, kAlpha>(o, a, b, d, i, cst[r], alpha[r]));
        if (last >= 0) {
            StoreU(d + last, lastV);
            return;
        }
    }
    for (; i < n; ++i) {
        if constexpr (kAlpha)
            if (i % P::kPixelUnits >= P::kKeptUnits) continue;
        if constexpr (K == Src2::kImage) d[i] = op.Scalar(a[i], b[i]);
        else if constexpr (K == Src2::kConst) d[i] = op.Scalar(a[i], pat.unit[i % P::kUnits]);
        else d[i] = op.Scalar(a[i]);
    }
}

// The bytes a call reads and writes, from the bytes of one image: an image
// given as both sources (Sqr, Mul of an image by itself) is read once, and
// an image written in place counts as read only.
template <Src2 K, class T>
inline std::int64_t BytesTouched(const T* a, const T* b, const T* d, std::int64_t imageBytes)
{
    const void* out = d;
    const bool inPlace = out == a || out == b;
    const std::int64_t images = (K == Src2::kImage && static_cast<const void*>(a) != b ? 2 : 1) + !inPlace;
    return images * imageBytes;
}

// Whether a call's sources are to be fetched ahead (FetchSources), for calls
// whose rows all start aligned.
template <Src2 K, class Op, class T>
inline bool WantsFetch(const Op& op, const T* a, int aStep, const T* b, int bStep, const T* d, int dStep, int rows,
                       std::int64_t imageBytes)
{
    if (imageBytes <= kFetchSourcesMin / 3) return false;
    if (!simd::IsAligned(a) || !simd::IsAligned(b) || !simd::IsAligned(d)) return false;
    if (rows > 1 && ((aStep | bStep | dStep) & 15) != 0) return false;
    return op.Vector() && FetchSources(BytesTouched<K>(a, b, d, imageBytes));
}

// The rows of a call whose sources are fetched ahead, kept out of line: the
// large calls that take this lose nothing to the call, and the row loop of
// the others stays as it was (8x8 tiles ran 1.2 times slower when the two
// shared one).
template <class Op, class T, Lay L, Src2 K>
[[gnu::noinline]] void RowsFetching(const Op& op, const Pattern<typename Op::Unit, T, L>& pat, const T* a, int aStep,
                                    const T* b, int bStep, T* d, int dStep, std::ptrdiff_t n, int rows)
{
    using U = typename Op::Unit;
    for (int y = 0; y < rows; ++y) {
        const U* ra = reinterpret_cast<const U*>(RowAt(a, aStep, y));
        const U* rb = K == Src2::kImage ? reinterpret_cast<const U*>(RowAt(b, bStep, y)) : ra;
        ArithRow<Op, T, L, K, true, false, true>(op, pat, ra, rb, reinterpret_cast<U*>(RowAt(d, dStep, y)), n);
    }
}

// Every row of the region: rows merged into one when every step equals the
// row length; aligned or unaligned path chosen per row by its addresses. For
// kConst, value holds the constant's kProcessed<L> elements; for kNone, b is
// unused (pass a).
//
// Aligned rows are written with streamed stores when the call reads and
// writes at least half the largest cache and writes an image of its own (not
// in place, no alpha kept). At that size the destination is pushed out of the
// cache by the sources before anyone reads it, and streaming saves the read
// of every destination line and leaves the sources cached: 1080p frames of
// 25 to 37 MB a call (Add_32f, AddC_32fc, Sub_16s C3) run 1.2 to 1.4 times
// faster. Below that, on frames that stay in the cache, streaming is slower
// (Add_8u at 6 MB: 1.3 times), so those keep ordinary stores.
template <class T, Lay L, Src2 K, class Op>
void RunRows(const Op& op, const T* a, int aStep, const T* b, int bStep, T* d, int dStep, PvxiSize roi,
             const T* value = nullptr)
{
    using U = typename Op::Unit;
    using P = Pattern<U, T, L>;
    const P pat(value);
    std::ptrdiff_t rowBytes = static_cast<std::ptrdiff_t>(roi.width) * kChannels<L> * sizeof(T);
    std::ptrdiff_t n = rowBytes / static_cast<std::ptrdiff_t>(sizeof(U));
    int rows = roi.height;
    bool merged = K == Src2::kImage ? RowsContiguous(rowBytes, {aStep, bStep, dStep})
                                    : RowsContiguous(rowBytes, {aStep, dStep});
    constexpr bool kCanStream = !kKeepsAlpha<L> && Op::kHasVector;
    bool nt = false;
    if constexpr (kCanStream) {
        const void* out = d;
        if (op.Vector() && out != a && out != b) nt = StreamWorkingSet(BytesTouched<K>(a, b, d, rowBytes * rows));
    }
    if (merged) {
        n *= rows;
        rows = 1;
    }
    if constexpr (Op::kHasVector) {
        if (!nt && WantsFetch<K>(op, a, aStep, K == Src2::kImage ? b : a, bStep, d, dStep, rows,
                                 rowBytes * roi.height)) {
            RowsFetching<Op, T, L, K>(op, pat, a, aStep, b, bStep, d, dStep, n, rows);
            return;
        }
    }
    for (int y = 0; y < rows; ++y) {
        const U* ra = reinterpret_cast<const U*>(RowAt(a, aStep, y));
        const U* rb = K == Src2::kImage ? reinterpret_cast<const U*>(RowAt(b, bStep, y)) : ra;
        U* rd = reinterpret_cast<U*>(RowAt(d, dStep, y));
        if (simd::IsAligned(ra) && simd::IsAligned(rb) && simd::IsAligned(rd)) {
            if constexpr (kCanStream)
                if (nt) {
                    ArithRow<Op, T, L, K, true, true>(op, pat, ra, rb, rd, n);
                    continue;
                }
            ArithRow<Op, T, L, K, true>(op, pat, ra, rb, rd, n);
        } else {
            ArithRow<Op, T, L, K, false>(op, pat, ra, rb, rd, n);
        }
    }
    if (nt) simd::StoreFence();
}

// ---- shortcuts --------------------------------------------------------------------

// Fills the processed channels of the region with 0 (AC4 alpha kept): the
// result of every scale factor at which all results round to 0.
template <class T, Lay L>
PvxStatus FillZero(T* pDst, int dstStep, PvxiSize roi)
{
    if constexpr (kHasMoveMembers<T, L>) return SetZeroForward<T, L>(pDst, dstStep, roi);
    using U = Element<T>;
    RunRows<T, L, Src2::kNone>(ZeroOp<U>{}, pDst, dstStep, pDst, dstStep, pDst, dstStep, roi);
    return pvxStsNoErr;
}

// Copies the processed channels of the region (AC4 alpha kept): the result of
// an identity constant at scale factor 0.
template <class T, Lay L>
PvxStatus CopyRows(const T* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi)
{
    if (pSrc == pDst && srcStep == dstStep) return pvxStsNoErr;  // in place: nothing moves
    if constexpr (kHasMoveMembers<T, L>) {
        return CopyForward<T, L>(pSrc, srcStep, pDst, dstStep, roi);
    } else if constexpr (kKeepsAlpha<L>) {
        RunRows<T, L, Src2::kNone>(IdentityOp<Element<T>>{}, pSrc, srcStep, pSrc, srcStep, pDst, dstStep, roi);
    } else {
        std::size_t rowBytes = static_cast<std::size_t>(roi.width) * kChannels<L> * sizeof(T);
        int rows = roi.height;
        if (RowsContiguous(static_cast<std::ptrdiff_t>(rowBytes), {srcStep, dstStep})) {
            rowBytes *= rows;
            rows = 1;
        }
        for (int y = 0; y < rows; ++y)
            if (RowAt(pSrc, srcStep, y) != RowAt(pDst, dstStep, y))
                std::memmove(RowAt(pDst, dstStep, y), RowAt(pSrc, srcStep, y), rowBytes);
    }
    return pvxStsNoErr;
}

// The smallest positive scale factor at which every exact result with
// |r| <= maxAbs rounds to 0 (ties go to the even 0).
constexpr int ZeroFrom(Wide maxAbs)
{
    int s = 1;
    while ((static_cast<Wide>(1) << (s - 1)) < maxAbs) ++s;
    return s;
}

// True when the constant makes the family's op a copy at scale factor 0.
template <class Fam, class T, Lay L>
bool IsIdentity(const T* value)
{
    using E = Element<T>;
    const E* v = reinterpret_cast<const E*>(value);
    for (int c = 0; c < kProcessed<L>; ++c) {
        if constexpr (kIsComplex<T>) {
            if (v[2 * c] != Fam::kIdentity || v[2 * c + 1] != 0) return false;
        } else {
            if (v[c] != Fam::kIdentity) return false;
        }
    }
    return true;
}

// The family's op for the second operand K: OpC for constants, else Op.
template <class Fam, class T, Src2 K, Sf M>
struct OpOfT {
    using type = typename Fam::template Op<T, M>;
};
template <class Fam, class T, Sf M>
struct OpOfT<Fam, T, Src2::kConst, M> {
    using type = typename Fam::template OpC<T, M>;
};
template <class Fam, class T, Src2 K, Sf M>
using OpOf = typename OpOfT<Fam, T, K, M>::type;
template <class Op>
concept HalfPathOp = requires { requires Op::kHalfPath; };
template <class Op>
concept RoundsInFloatOp = requires { requires Op::kRoundsInFloat; };

// Runs the family's op over the region for the scale factor: zero fill above
// the family's zero point, else the op for sf 0, down or up.
template <class Fam, class T, Lay L, Src2 K>
PvxStatus ArithRun(const T* a, int aStep, const T* b, int bStep, T* d, int dStep, PvxiSize roi, int sf,
                   const T* value)
{
    auto run = [&]<Sf M>() {
        using Op = OpOf<Fam, T, K, M>;
        if constexpr (RoundsInFloatOp<Op>) {
            // (the caller's mode is restored on return)
            FpGuard nearest(FpRound::kNearest);
            RunRows<T, L, K>(Op(sf), a, aStep, b, bStep, d, dStep, roi, value);
        } else {
            RunRows<T, L, K>(Op(sf), a, aStep, b, bStep, d, dStep, roi, value);
        }
    };
    if constexpr (std::is_floating_point_v<Element<T>>) {
        run.template operator()<Sf::kNone>();
    } else {
        constexpr int kZeroFrom = ZeroFrom(Fam::template MaxAbs<T>());
        if (sf >= kZeroFrom) return FillZero<T, L>(d, dStep, roi);
        if (sf == 0) {
            if constexpr (K == Src2::kConst)
                if (IsIdentity<Fam, T, L>(value)) return CopyRows<T, L>(a, aStep, d, dStep, roi);
            run.template operator()<Sf::kZero>();
        } else if (sf > 0) {
            if constexpr (HalfPathOp<OpOf<Fam, T, K, Sf::kDown>>) {
                if (sf == 1) {
                    run.template operator()<Sf::kHalf>();
                    return pvxStsNoErr;
                }
            }
            run.template operator()<Sf::kDown>();
        } else {
            run.template operator()<Sf::kUp>();
        }
    }
    return pvxStsNoErr;
}

// ---- checked bodies ------------------------------------------------------------------
// O is the family's check order: real types kPtrSize (steps used as given),
// complex types kPtrSizeStep. Float forms have no scale factor.

// Two images: d = op(src1, src2).
template <class Fam, class T, Lay L, Order O>
PvxStatus ArithBody(const T* pSrc1, int src1Step, const T* pSrc2, int src2Step, T* pDst, int dstStep, PvxiSize roi,
                    int scaleFactor)
{
    if (PvxStatus s = CheckFrame<O>({pSrc1, pSrc2, pDst}, roi, {src1Step, src2Step, dstStep})) return s;
    return ArithRun<Fam, T, L, Src2::kImage>(pSrc1, src1Step, pSrc2, src2Step, pDst, dstStep, roi, scaleFactor,
                                            nullptr);
}
template <class Fam, class T, Lay L, Order O>
PvxStatus ArithBody(const T* pSrc1, int src1Step, const T* pSrc2, int src2Step, T* pDst, int dstStep, PvxiSize roi)
{
    return ArithBody<Fam, T, L, O>(pSrc1, src1Step, pSrc2, src2Step, pDst, dstStep, roi, 0);
}

// In place: srcDst = op(src, srcDst); the in-place image is the second operand.
template <class Fam, class T, Lay L, Order O>
PvxStatus ArithIBody(const T* pSrc, int srcStep, T* pSrcDst, int srcDstStep, PvxiSize roi, int scaleFactor)
{
    if (PvxStatus s = CheckFrame<O>({pSrc, pSrcDst}, roi, {srcStep, srcDstStep})) return s;
    return ArithRun<Fam, T, L, Src2::kImage>(pSrc, srcStep, pSrcDst, srcDstStep, pSrcDst, srcDstStep, roi,
                                            scaleFactor, nullptr);
}
template <class Fam, class T, Lay L, Order O>
PvxStatus ArithIBody(const T* pSrc, int srcStep, T* pSrcDst, int srcDstStep, PvxiSize roi)
{
    return ArithIBody<Fam, T, L, O>(pSrc, srcStep, pSrcDst, srcDstStep, roi, 0);
}

// Constant: d = op(src, value); one value (C1) or a pointer to 3 or 4, which is
// checked with the other pointers in argument order.
template <class Fam, class T, Lay L, Order O>
PvxStatus ArithCBody(const T* pSrc, int srcStep, const T* value, T* pDst, int dstStep, PvxiSize roi, int scaleFactor)
{
    if (PvxStatus s = CheckFrame<O>({pSrc, value, pDst}, roi, {srcStep, dstStep})) return s;
    return ArithRun<Fam, T, L, Src2::kConst>(pSrc, srcStep, pSrc, srcStep, pDst, dstStep, roi, scaleFactor, value);
}
template <class Fam, class T, Lay L, Order O>
PvxStatus ArithCBody(const T* pSrc, int srcStep, T value, T* pDst, int dstStep, PvxiSize roi, int scaleFactor)
{
    if (PvxStatus s = CheckFrame<O>({pSrc, pDst}, roi, {srcStep, dstStep})) return s;
    return ArithRun<Fam, T, L, Src2::kConst>(pSrc, srcStep, pSrc, srcStep, pDst, dstStep, roi, scaleFactor, &value);
}
template <class Fam, class T, Lay L, Order O>
PvxStatus ArithCBody(const T* pSrc, int srcStep, const T* value, T* pDst, int dstStep, PvxiSize roi)
{
    return ArithCBody<Fam, T, L, O>(pSrc, srcStep, value, pDst, dstStep, roi, 0);
}
template <class Fam, class T, Lay L, Order O>
PvxStatus ArithCBody(const T* pSrc, int srcStep, T value, T* pDst, int dstStep, PvxiSize roi)
{
    return ArithCBody<Fam, T, L, O>(pSrc, srcStep, value, pDst, dstStep, roi, 0);
}

// Constant in place: srcDst = op(srcDst, value).
template <class Fam, class T, Lay L, Order O>
PvxStatus ArithCIBody(const T* value, T* pSrcDst, int srcDstStep, PvxiSize roi, int scaleFactor)
{
    if (PvxStatus s = CheckFrame<O>({value, pSrcDst}, roi, {srcDstStep})) return s;
    return ArithRun<Fam, T, L, Src2::kConst>(pSrcDst, srcDstStep, pSrcDst, srcDstStep, pSrcDst, srcDstStep, roi,
                                            scaleFactor, value);
}
template <class Fam, class T, Lay L, Order O>
PvxStatus ArithCIBody(T value, T* pSrcDst, int srcDstStep, PvxiSize roi, int scaleFactor)
{
    if (PvxStatus s = CheckFrame<O>({pSrcDst}, roi, {srcDstStep})) return s;
    return ArithRun<Fam, T, L, Src2::kConst>(pSrcDst, srcDstStep, pSrcDst, srcDstStep, pSrcDst, srcDstStep, roi,
                                            scaleFactor, &value);
}
template <class Fam, class T, Lay L, Order O>
PvxStatus ArithCIBody(const T* value, T* pSrcDst, int srcDstStep, PvxiSize roi)
{
    return ArithCIBody<Fam, T, L, O>(value, pSrcDst, srcDstStep, roi, 0);
}
template <class Fam, class T, Lay L, Order O>
PvxStatus ArithCIBody(T value, T* pSrcDst, int srcDstStep, PvxiSize roi)
{
    return ArithCIBody<Fam, T, L, O>(value, pSrcDst, srcDstStep, roi, 0);
}

// One image (unary families: Fam::Op has Scalar(a) and Vec(a)): d = op(src).
template <class Fam, class T, Lay L, Order O>
PvxStatus ArithUBody(const T* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi, int scaleFactor)
{
    if (PvxStatus s = CheckFrame<O>({pSrc, pDst}, roi, {srcStep, dstStep})) return s;
    return ArithRun<Fam, T, L, Src2::kNone>(pSrc, srcStep, pSrc, srcStep, pDst, dstStep, roi, scaleFactor, nullptr);
}
template <class Fam, class T, Lay L, Order O>
PvxStatus ArithUBody(const T* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi)
{
    return ArithUBody<Fam, T, L, O>(pSrc, srcStep, pDst, dstStep, roi, 0);
}

// One image in place: srcDst = op(srcDst).
template <class Fam, class T, Lay L, Order O>
PvxStatus ArithUIBody(T* pSrcDst, int srcDstStep, PvxiSize roi, int scaleFactor)
{
    if (PvxStatus s = CheckFrame<O>({pSrcDst}, roi, {srcDstStep})) return s;
    return ArithRun<Fam, T, L, Src2::kNone>(pSrcDst, srcDstStep, pSrcDst, srcDstStep, pSrcDst, srcDstStep, roi,
                                           scaleFactor, nullptr);
}
template <class Fam, class T, Lay L, Order O>
PvxStatus ArithUIBody(T* pSrcDst, int srcDstStep, PvxiSize roi)
{
    return ArithUIBody<Fam, T, L, O>(pSrcDst, srcDstStep, roi, 0);
}

// The bound of |exact result| of the common operations on elements E.
template <class E>
constexpr Wide ElemMaxAbs()
{
    using Lim = std::numeric_limits<E>;
    Wide lo = Lim::min(), hi = Lim::max();
    return -lo > hi ? -lo : hi;
}

}  // namespace pvx
