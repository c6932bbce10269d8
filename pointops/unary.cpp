// One-operand arithmetic: Abs, Sqr, Sqrt, Exp, Ln, Complement.
//
// Integer members take a scale factor: the exact real result times
// 2^-scaleFactor, rounded half to even and saturated, as the two-image
// arithmetic does. Values that are not real numbers (square root and
// logarithm of a negative number) are written as 0; the logarithm of 0 is
// minus infinity and saturates to the type's minimum (0 for unsigned types),
// and a call that met it returns pvxStsDivByZero (6), 32f members included
// (which write -inf).
//
//   Abs (16s, 32f): |x|; Abs of -32768 saturates to 32767.
//   Sqr: x * x. Integer products are exact in float (8u) or double lanes.
//   Sqrt: the exact square root, rounded. For 8u in float and 16-bit elements
//     in double lanes the correctly rounded root of x * 4^-sf (sf <= 0) or
//     root times 2^-sf (sf > 0) never crosses a rounding boundary: a root of
//     an integer is an integer (exact) or at least 1 / (4 (2y + 1)) away from
//     any half-integer y, far above the rounding error where the result is
//     not saturated. 32f: correctly rounded root, NaN for negative inputs.
//   Exp: e^x for integers from a table of the at most 16 inputs whose result
//     is neither 0 nor saturated at this scale factor, built per call in
//     double precision (extended beyond |x| = 700) and rounded half to even;
//     inputs beyond the table's ends repeat its end values. 32f: expf per
//     element.
//   Ln: ln x per element in double precision (8u from a per-call table of 256
//     values), rounded half to even. 32f: logf per element.
//   Complement (32s, in place): converts between two's complement and
//     sign-magnitude. A negative x becomes INT_MIN - x (wrapping): its
//     magnitude with the sign bit set; applied twice it gives x back. INT_MIN
//     (negative zero in sign-magnitude, and no sign-magnitude number in two's
//     complement) becomes 0; non-negative values are unchanged.
//
// Integer tails run the vector op on a register of copies of the element, so
// a row's tail is bit-identical to its body.
//
// Checks: pointers (-8), sizes (-6), steps (-14); Sqrt_32f checks steps
// before sizes, as callers rely on.
#include <cmath>
#include <cstdint>
#include <cstring>
#include <limits>
#include <numbers>
#include <type_traits>

#include "arith.h"
#include "arith_round.h"
#include "check.h"
#include "entry.h"
#include "layout.h"
#include "simd.h"

namespace pvx {
namespace {

using namespace simd;

template <class U>
VI Broadcast(U x)
{
    alignas(16) U b[16 / sizeof(U)];
    for (auto& e : b) e = x;
    return LoadA(b);
}
template <class U>
U Lane0(VI v)
{
    U u;
    std::memcpy(&u, &v, sizeof(U));
    return u;
}

// Common members of the unary ops. Vec-derived ops get a scalar tail that is
// the vector op on a broadcast register.
template <class Self, class U>
struct UnaryBase {
    using Unit = U;
    static constexpr bool kHasVector = true;
    bool* flag = nullptr;  // set when a logarithm of 0 is met (the row loop copies the op)
    bool Vector() const { return true; }
    U Scalar(U x) const { return Lane0<U>(static_cast<const Self*>(this)->Vec(Broadcast(x))); }
};

// Scale factor bounded to [lo, hi], where further scaling changes no result.
inline int Bound(int sf, int lo, int hi) { return sf < lo ? lo : sf > hi ? hi : sf; }

// Integer lanes of U as floats (8u) or double pairs (16-bit), a per-lane
// function, and the rounded, saturated result.
template <class U, class FnF, class FnD>
VI MapRounded(VI v, FnF f, FnD g)
{
    constexpr int kN = 4 / sizeof(U);
    VI w[kN], r[kN];
    Widen32<U>(v, w);
    for (int i = 0; i < kN; ++i) {
        if constexpr (sizeof(U) == 1) r[i] = SatI32<U, Rnd::kEven>(f(CvtI32F(w[i])));
        else r[i] = SatI32<U, Rnd::kEven>(g(CvtLoI32D(w[i])), g(CvtHiI32D(w[i])));
    }
    return Narrow32<U>(r);
}

// ---- Abs ----------------------------------------------------------------------------

template <class T, Lay L>
struct AbsOp : UnaryBase<AbsOp<T, L>, T> {
    explicit AbsOp(int) {}
    VI Vec(VI a) const
    {
        if constexpr (std::is_same_v<T, Pvx16s>) return MinU16(AbsI16(a), SplatU16(32767));
        else return AndNot(SplatU32(0x80000000u), a);
    }
};

// ---- Sqr ----------------------------------------------------------------------------

template <class T, Lay L>
struct SqrOp : UnaryBase<SqrOp<T, L>, T> {
    VF scaleF;
    VD scaleD;
    explicit SqrOp(int sf)
    {
        // 8u squares are below 2^16, 16-bit ones below 2^32: beyond these
        // bounds every non-zero result is 0 or saturated.
        int b = Bound(sf, -33, 40);
        scaleF = SplatF(Pow2F(-b));
        scaleD = SplatD(Pow2D(-b));
    }
    VI Vec(VI a) const
    {
        if constexpr (std::is_same_v<T, Pvx32f>) {
            VF x = AsFloat(a);
            return AsInt(MulF(x, x));
        } else {
            return MapRounded<T>(
                a, [&](VF x) { return MulF(MulF(x, x), scaleF); }, [&](VD x) { return MulD(MulD(x, x), scaleD); });
        }
    }
};

// ---- Sqrt ---------------------------------------------------------------------------

template <class T, Lay L>
struct SqrtOp : UnaryBase<SqrtOp<T, L>, T> {
    VF preF, postF;
    VD preD, postD;
    explicit SqrtOp(int sf)
    {
        // sf < 0: the root of x * 4^-sf (exact); beyond -18 every non-zero
        // result saturates. sf > 0: the root times 2^-sf; beyond 40 all are 0.
        int b = Bound(sf, -18, 40);
        int pre = b < 0 ? -2 * b : 0, post = b > 0 ? -b : 0;
        preF = SplatF(Pow2F(pre));
        postF = SplatF(Pow2F(post));
        preD = SplatD(Pow2D(pre));
        postD = SplatD(Pow2D(post));
    }
    VI Vec(VI a) const
    {
        if constexpr (std::is_same_v<T, Pvx32f>) {
            return AsInt(SqrtF(AsFloat(a)));
        } else {
            // Negative 16s inputs give NaN, written as 0.
            return MapRounded<T>(
                a, [&](VF x) { return MulF(SqrtF(MulF(x, preF)), postF); },
                [&](VD x) { return MulD(SqrtD(MulD(x, preD)), postD); });
        }
    }
};

// ---- Exp ----------------------------------------------------------------------------

// Half to even of a non-negative double.
inline double RoundEven(double v)
{
    double f = std::floor(v), d = v - f;
    if (d > 0.5 || (d == 0.5 && std::fmod(f, 2.0) != 0)) return f + 1;
    return f;
}

// e^x * 2^-sf rounded half to even and saturated to U.
template <class U>
U ExpRound(int x, int sf)
{
    using Lim = std::numeric_limits<U>;
    long double z = x * std::numbers::log2e_v<long double> - sf;  // log2 of the value
    if (z < -3) return 0;
    if (z > 18) return Lim::max();
    // The value lies in [2^-3, 2^18]: e^x is computed in double up to |x| 700,
    // in extended precision beyond (x up to 11356), and from z for the rest.
    double v;
    if (x >= -700 && x <= 700) v = std::ldexp(std::exp(static_cast<double>(x)), -sf);
    else if (x >= -11000 && x <= 11000) v = static_cast<double>(std::ldexp(std::exp(static_cast<long double>(x)), -sf));
    else v = static_cast<double>(std::exp2(z));
    double r = RoundEven(v);
    return r > static_cast<double>(Lim::max()) ? Lim::max() : static_cast<U>(r);
}

template <class T, Lay L>
struct ExpOp : UnaryBase<ExpOp<T, L>, T> {
    // Integers: results of the inputs lo..lo+15 (hi is the last one that
    // differs); inputs below lo give table[0], above hi table[hi - lo].
    int lo = 0, hi = 0;
    VI tabLo, tabHi;  // the results' low and high bytes
    explicit ExpOp(int sf)
    {
        if constexpr (!std::is_same_v<T, Pvx32f>) {
            using Lim = std::numeric_limits<T>;
            double c = std::nearbyint(sf * std::numbers::ln2);
            int x0 = c < Lim::min() ? Lim::min() : c > Lim::max() ? Lim::max() : static_cast<int>(c);
            lo = hi = x0;
            while (lo > Lim::min() && ExpRound<T>(lo, sf) > 0) --lo;
            while (hi < Lim::max() && ExpRound<T>(hi, sf) < Lim::max()) ++hi;
            alignas(16) std::uint8_t bl[16], bh[16];
            for (int i = 0; i < 16; ++i) {
                int x = lo + i < hi ? lo + i : hi;
                unsigned r = static_cast<std::uint16_t>(ExpRound<T>(x, sf));
                bl[i] = static_cast<std::uint8_t>(r);
                bh[i] = static_cast<std::uint8_t>(r >> 8);
            }
            tabLo = LoadA(bl);
            tabHi = LoadA(bh);
        }
    }
    static constexpr bool kHasVector = !std::is_same_v<T, Pvx32f>;
    bool Vector() const { return kHasVector; }
    VI Vec(VI a) const
    {
        if constexpr (std::is_same_v<T, Pvx8u>) {
            VI idx = MinU8(MaxU8(a, SplatU8(static_cast<std::uint8_t>(lo))), SplatU8(static_cast<std::uint8_t>(hi)));
            return ShuffleBytes(tabLo, SubI8(idx, SplatU8(static_cast<std::uint8_t>(lo))));
        } else if constexpr (std::is_same_v<T, Pvx32f>) {
            return a;  // never called
        } else {
            VI c;
            if constexpr (std::is_same_v<T, Pvx16u>)
                c = MinU16(MaxU16(a, SplatU16(static_cast<std::uint16_t>(lo))), SplatU16(static_cast<std::uint16_t>(hi)));
            else
                c = MinI16(MaxI16(a, SplatU16(static_cast<std::uint16_t>(lo))), SplatU16(static_cast<std::uint16_t>(hi)));
            VI idx = SubI16(c, SplatU16(static_cast<std::uint16_t>(lo)));  // 0..15
            VI l = ShuffleBytes(tabLo, Or(idx, SplatU16(0x8000)));
            VI h = ShuffleBytes(tabHi, Or(SllI16n(idx, 8), SplatU16(0x0080)));
            return Or(l, h);
        }
    }
    T Scalar(T x) const
    {
        if constexpr (std::is_same_v<T, Pvx32f>) return std::exp(x);
        else return Lane0<T>(Vec(Broadcast(x)));
    }
};

// ---- Ln -----------------------------------------------------------------------------

// ln x * 2^-sf rounded half to even and saturated; 0 gives the minimum, negative 0.
template <class U>
U LnRound(int x, int sf)
{
    using Lim = std::numeric_limits<U>;
    if (x <= 0) return x == 0 ? Lim::min() : U{};
    double v = std::ldexp(std::log(static_cast<double>(x)), -Bound(sf, -40, 40));
    double r = RoundEven(v);
    return r > static_cast<double>(Lim::max()) ? Lim::max() : static_cast<U>(r);
}

template <class T, Lay L>
struct LnOp {
    using Unit = T;
    static constexpr bool kHasVector = false;
    int sf;
    T table[std::is_same_v<T, Pvx8u> ? 256 : 1];
    bool* flag = nullptr;
    explicit LnOp(int scaleFactor) : sf(scaleFactor)
    {
        if constexpr (std::is_same_v<T, Pvx8u>)
            for (int x = 0; x < 256; ++x) table[x] = LnRound<T>(x, sf);
    }
    bool Vector() const { return false; }
    VI Vec(VI a) const { return a; }  // never called
    T Scalar(T x) const
    {
        if (x == 0) *flag = true;
        if constexpr (std::is_same_v<T, Pvx32f>) return std::log(x);
        else if constexpr (std::is_same_v<T, Pvx8u>) return table[x];
        else return LnRound<T>(x, sf);
    }
};

// ---- Complement ---------------------------------------------------------------------

template <class T, Lay L>
struct ComplementOp {
    using Unit = Pvx32s;
    static constexpr bool kHasVector = true;
    bool* flag = nullptr;
    explicit ComplementOp(int) {}
    bool Vector() const { return true; }
    VI Vec(VI a) const
    {
        VI flipped = SubI32(SplatU32(0x80000000u), a);
        return SelectBytes(a, flipped, SraI32n(a, 31));
    }
    Pvx32s Scalar(Pvx32s x) const
    {
        if (x >= 0) return x;
        return static_cast<Pvx32s>(0x80000000u - static_cast<std::uint32_t>(x));
    }
};

// ---- checked bodies -------------------------------------------------------------------

template <template <class, Lay> class Op, class T, Lay L, Order O>
PvxStatus UnaryBody(const T* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi, int scaleFactor = 0)
{
    if (PvxStatus s = CheckFrame<O>({pSrc, pDst}, roi, {srcStep, dstStep})) return s;
    bool met = false;
    Op<T, L> op(scaleFactor);
    op.flag = &met;
    RunRows<T, L, Src2::kNone>(op, pSrc, srcStep, pSrc, srcStep, pDst, dstStep, roi);
    return met ? pvxStsDivByZero : pvxStsNoErr;
}

template <template <class, Lay> class Op, class T, Lay L, Order O>
PvxStatus UnaryIBody(T* pSrcDst, int srcDstStep, PvxiSize roi, int scaleFactor = 0)
{
    if (PvxStatus s = CheckFrame<O>({pSrcDst}, roi, {srcDstStep})) return s;
    bool met = false;
    Op<T, L> op(scaleFactor);
    op.flag = &met;
    RunRows<T, L, Src2::kNone>(op, pSrcDst, srcDstStep, pSrcDst, srcDstStep, pSrcDst, srcDstStep, roi);
    return met ? pvxStsDivByZero : pvxStsNoErr;
}

}  // namespace
}  // namespace pvx

#include "unary.exports.inc"
