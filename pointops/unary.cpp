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
//   Sqr: x * x. Integer squares are the image times itself through the exact
//     integer products of Mul (and its all-zero scale factors).
//   Sqrt: the exact square root, rounded. 8u at sf >= 0: the number of
//     fixed steps that x has reached. In float lanes for other 8u and for
//     16-bit elements at sf >= -2 (roots up to 1024), in double lanes for
//     16-bit elements below: the correctly rounded root of x * 4^-sf
//     (sf <= 0) or root times 2^-sf (sf > 0) never crosses a rounding
//     boundary, as a root of an integer is an integer (exact) or at least
//     1 / (4 (2y + 1)) away from any half-integer y, far above the rounding
//     error where the result is not saturated. 32f: correctly rounded root,
//     NaN for negative inputs.
//   Exp: e^x for integers from a table of the at most 16 inputs whose result
//     is neither 0 nor saturated at this scale factor, built per call in
//     double precision (extended beyond |x| = 700) and rounded half to even;
//     inputs beyond the table's ends repeat its end values. 32f: ExpF below,
//     within 1 ulp.
//   Ln: 16-bit at sf >= -1 and 8u at sf >= -2: the number of fixed steps
//     that x has reached (results are 0 to 22 there). Other 16-bit: ln x
//     2^-sf in single precision (LnF below), rounded half to even; a value
//     too close to a rounding boundary for that precision is done again in
//     double precision. Other 8u: a per-call table of the 256 results in
//     double precision. 32f: LnF, within 1 ulp.
//     ln 0 counts as a division by zero (a pole), hence the status.
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
#include "fpguard.h"
#include "layout.h"
#include "mul.h"
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
[[gnu::always_inline]] inline VI MapRounded(VI v, FnF f, FnD g)
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

// The same in float lanes whatever the element size, for a function whose
// float result is known to land on the same side of every rounding boundary.
template <class U, class FnF>
[[gnu::always_inline]] inline VI MapRoundedF(VI v, FnF f)
{
    constexpr int kN = 4 / sizeof(U);
    VI w[kN], r[kN];
    Widen32<U>(v, w);
    for (int i = 0; i < kN; ++i) r[i] = SatI32<U, Rnd::kEven>(f(CvtI32F(w[i])));
    return Narrow32<U>(r);
}

// ---- single-precision e^x and ln x ---------------------------------------------------
//
// Both run under round-to-nearest without flushing (the bodies set it), where
// every float input gives a result within 1 ulp of the exact value; checked
// over all 2^32 inputs.

// ln 2 in two parts: the first has few bits, so that n times it is exact.
inline constexpr float kLn2Hi = 0.693359375f, kLn2Lo = -2.12194440e-4f;

// c1 x + c0.
inline VF Lin(VF x, float c1, float c0) { return AddF(MulF(SplatF(c1), x), SplatF(c0)); }

// e^r for r = c - n ln 2, with n = c log2 e rounded (c in [-104, 89]).
[[gnu::always_inline]] inline VF ExpReducedF(VF c, VF& n)
{
    n = RoundEvenF(MulF(c, SplatF(1.44269504088896341f)));
    VF r = SubF(SubF(c, MulF(n, SplatF(kLn2Hi))), MulF(n, SplatF(kLn2Lo)));
    VF q = SplatF(1.9875691500e-4f);
    for (float k : {1.3981999507e-3f, 8.3334519073e-3f, 4.1665795894e-2f, 1.6666665459e-1f, 5.0000001201e-1f})
        q = AddF(MulF(q, r), SplatF(k));
    return AddF(AddF(MulF(q, MulF(r, r)), r), SplatF(1.0f));
}

// e^x: n = x log2 e rounded, r = x - n ln 2 (|r| <= ln 2 / 2), a polynomial for
// e^r by Horner's rule, times 2^n as two factors, so that results near
// overflow and in the subnormal range are rounded once. Inputs are clamped to
// [-104, 89], beyond which every result is 0 or infinite; NaN stays NaN.
// (Pairing the terms as for ln below is 13% faster but reaches 1.014 ulp.)
[[gnu::always_inline]] inline VF ExpF(VF x)
{
    // Where every lane's result is a normal number (n in [-124, 126]), 2^n goes
    // straight into the exponent field of e^r, which is what the two factors
    // below give there, bit for bit; NaN fails the test.
    if (MaskF(AndF(GeF(x, SplatF(-86.0f)), GeF(SplatF(87.0f), x))) == 0xF) {
        VF n;
        VF p = ExpReducedF(x, n);
        return AsFloat(AddI32(AsInt(p), SllI32n(CvtF32(n), 23)));
    }
    // No product here may come out subnormal or below: many processors finish
    // those in microcode, and 1080p frames of inputs below -87 (common where
    // weights decay as e^-x) took 3.4 times as long as ordinary ones. Lanes
    // below -104, whose result is 0, and NaN lanes work on 0. Where n <= -126
    // the result is below 2^-125, so its bits are p 2^(n + 149) rounded to an
    // integer (the conversion rounds once, to nearest, as the product did).
    VF ordered = OrderedF(x), zero = LtF(x, SplatF(-104.0f));
    VF c = AndF(MinF(x, SplatF(89.0f)), AndNotF(zero, ordered));
    VF n;
    VF p = ExpReducedF(c, n);
    VI ni = CvtF32(n);
    VI tiny = GtI32(SplatU32(-125), ni);
    VF bits = AsFloat(CvtF32(MulF(p, AsFloat(SllI32n(AddI32(ni, SplatU32(149 + 127)), 23)))));
    ni = AndNot(tiny, ni);
    VI n1 = SraI32n(ni, 1), n2 = SubI32(ni, n1);
    VF s1 = AsFloat(SllI32n(AddI32(n1, SplatU32(127)), 23));
    VF s2 = AsFloat(SllI32n(AddI32(n2, SplatU32(127)), 23));
    VF r = SelectF(MulF(MulF(p, s1), s2), bits, AsFloat(tiny));
    return SelectF(AddF(x, x), AndNotF(zero, r), ordered);
}

// ln x of positive normal x times 2^-shift: x = m 2^e with m in
// [sqrt(1/2), sqrt(2)), ln(1 + f) for f = m - 1 by a polynomial, plus e ln 2
// in two parts. The polynomial's terms are paired (Estrin's scheme), which
// halves the chain of dependent operations of Horner's rule: 1.2 times faster.
[[gnu::always_inline]] inline VF LnNormalF(VF x, VI shift)
{
    // Offsetting the bits by those of sqrt(1/2) moves the exponent's step to
    // m = sqrt(1/2): e and m come out of one subtraction, a shift and a mask.
    constexpr std::int32_t kSqrtHalf = 0x3F3504F3;
    VI off = SubI32(AsInt(x), SplatU32(kSqrtHalf));
    VI e = SubI32(SraI32n(off, 23), shift);
    VF m = AsFloat(AddI32(And(off, SplatU32(0x007FFFFF)), SplatU32(kSqrtHalf)));
    VF f = SubF(m, SplatF(1.0f));  // exact: m is within a factor 2 of 1
    VF ef = CvtI32F(e);
    VF f2 = MulF(f, f), f4 = MulF(f2, f2), f3 = MulF(f2, f);
    VF hi = AddF(MulF(AddF(MulF(SplatF(7.0376836292e-2f), f2), Lin(f, -1.1514610310e-1f, 1.1676998740e-1f)), f2),
                 Lin(f, -1.2420140846e-1f, 1.4249322787e-1f));
    VF q = AddF(MulF(hi, f4), AddF(MulF(Lin(f, -1.6668057665e-1f, 2.0000714765e-1f), f2),
                                   Lin(f, -2.4999993993e-1f, 3.3333331174e-1f)));
    VF y = SubF(AddF(MulF(q, f3), MulF(ef, SplatF(kLn2Lo))), MulF(f2, SplatF(0.5f)));
    return AddF(AddF(f, y), MulF(ef, SplatF(kLn2Hi)));
}

// ln x of the float lanes of x >= 1 in double precision, within 2^-46 of
// it: x = m 2^e as in LnNormalF (exact in float for the 16-bit integers
// this serves), then ln m = 2 atanh(s) for s = (m - 1) / (m + 1), |s| < 0.172,
// by its series up to s^17, plus e ln 2.
inline void LnD(VF x, VD& lo, VD& hi)
{
    constexpr std::int32_t kSqrtHalf = 0x3F3504F3;
    VI off = SubI32(AsInt(x), SplatU32(kSqrtHalf));
    VI e = SraI32n(off, 23);
    VF m = AsFloat(AddI32(And(off, SplatU32(0x007FFFFF)), SplatU32(kSqrtHalf)));
    auto ln = [](VD m, VD e) {
        VD s = DivD(SubD(m, SplatD(1.0)), AddD(m, SplatD(1.0))), z = MulD(s, s);
        VD p = SplatD(2.0 / 17);
        for (int k = 7; k >= 0; --k) p = AddD(MulD(p, z), SplatD(2.0 / (2 * k + 1)));
        return AddD(MulD(p, s), MulD(e, SplatD(std::numbers::ln2)));
    };
    lo = ln(CvtLoFD(m), CvtLoI32D(e));
    hi = ln(CvtHiFD(m), CvtHiI32D(e));
}

// ln x of any x: a subnormal input is its bits as an integer times 2^-149,
// so it goes on as that integer, exactly converted, with 149 off its exponent
// (scaled by 2^23 in float, as first written, the product with a subnormal
// operand went through microcode: 2.6 times the time); a negative x or NaN
// gives NaN, 0 gives -inf, +inf stays +inf. Vectors of positive normal
// values, the usual case, skip all of that.
[[gnu::always_inline]] inline VF LnF(VF x)
{
    constexpr float kInf = std::numeric_limits<float>::infinity();
    if (MaskF(AndF(GeF(x, SplatF(0x1p-126f)), LtF(x, SplatF(kInf)))) == 0xF) return LnNormalF(x, Zero());
    VF tiny = LtF(x, SplatF(0x1p-126f));
    VF r = LnNormalF(SelectF(x, CvtI32F(AsInt(x)), tiny), And(AsInt(tiny), SplatU32(149)));
    VF nan = OrF(LtF(x, ZeroF()), AndNotF(OrderedF(x), SplatF(-0.0f)));  // the sign bit selects
    r = SelectF(r, SplatF(kInf), EqF(x, SplatF(kInf)));
    r = SelectF(r, SplatF(-kInf), EqF(x, ZeroF()));
    return SelectF(r, AddF(x, SplatF(std::numeric_limits<float>::quiet_NaN())), nan);
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
    static_assert(std::is_same_v<T, Pvx32f>, "integer squares go through SqrIntBody");
    explicit SqrOp(int) {}
    VI Vec(VI a) const
    {
        VF x = AsFloat(a);
        return AsInt(MulF(x, x));
    }
};

// ---- Sqrt ---------------------------------------------------------------------------

template <class T, Lay L>
struct SqrtOp : UnaryBase<SqrtOp<T, L>, T> {
    VF preF, postF;
    VD preD, postD;
    // 16-bit elements at sf >= -2 in float lanes: the root is below 1024, so
    // its float error (below 2^-14 in any rounding mode) is below half its
    // distance from a rounding boundary (at least 2^-13, see the top of the
    // file), and the scalings by powers of 2 are exact. Results agree with
    // the double lanes on every input and scale factor, in 0.29 of the time
    // on 1080p frames. At sf -3 the margin is gone: under upward rounding
    // some results differ; below, results reach 65535 and boundaries come
    // closer than a float can resolve.
    bool floatLanes = false;
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
        floatLanes = b >= -2;
    }
    VI Vec(VI a) const
    {
        if constexpr (std::is_same_v<T, Pvx32f>) {
            return AsInt(SqrtF(AsFloat(a)));
        } else {
            // Negative 16s inputs give NaN, written as 0.
            auto f = [&](VF x) { return MulF(SqrtF(MulF(x, preF)), postF); };
            if (sizeof(T) == 2 && floatLanes) return MapRoundedF<T>(a, f);
            return MapRounded<T>(a, f, [&](VD x) { return MulD(SqrtD(MulD(x, preD)), postD); });
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
    static constexpr bool kNearest = true;
    VI Vec(VI a) const
    {
        if constexpr (std::is_same_v<T, Pvx8u>) {
            VI idx = MinU8(MaxU8(a, SplatU8(static_cast<std::uint8_t>(lo))), SplatU8(static_cast<std::uint8_t>(hi)));
            return ShuffleBytes(tabLo, SubI8(idx, SplatU8(static_cast<std::uint8_t>(lo))));
        } else if constexpr (std::is_same_v<T, Pvx32f>) {
            return AsInt(ExpF(AsFloat(a)));
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
struct LnOp : UnaryBase<LnOp<T, L>, T> {
    static constexpr bool kNearest = true;
    // Lanes of a 4-lane vector whose zeros count: AC4 alpha (lane 3) does not;
    // likewise for the 16 bytes of 8u.
    static constexpr int kCounted = L == Lay::AC4 ? 0x7 : 0xF;
    static constexpr int kCounted8 = L == Lay::AC4 ? 0x7777 : 0xFFFF;
    VF scale;
    VD scaleD;
    VI table[std::is_same_v<T, Pvx8u> ? 16 : 1];  // 8u: the 256 results, 16 a register
    explicit LnOp(int sf)
        : scale(SplatF(Pow2F(-Bound(sf, -40, 40)))), scaleD(SplatD(Pow2D(-Bound(sf, -40, 40))))
    {
        if constexpr (std::is_same_v<T, Pvx8u>) {
            alignas(16) Pvx8u t[256];
            for (int x = 0; x < 256; ++x) t[x] = LnRound<T>(x, sf);
            for (int h = 0; h < 16; ++h) table[h] = LoadA(t + 16 * h);
        }
    }
    [[gnu::always_inline]] VI Vec(VI a) const
    {
        if constexpr (std::is_same_v<T, Pvx8u>) {
            // 8u: one byte shuffle of each register of the table by the low
            // four bits, kept where the high four bits name that register.
            VI lo = And(a, SplatU8(0x0F)), hi = And(SrlI16n(a, 4), SplatU8(0x0F));
            VI r = Zero();
            for (int h = 0; h < 16; ++h)
                r = Or(r, And(ShuffleBytes(table[h], lo), EqU8(hi, SplatU8(static_cast<std::uint8_t>(h)))));
            if (!*this->flag && (MaskBytes(EqU8(a, Zero())) & kCounted8)) *this->flag = true;
            return r;
        } else if constexpr (std::is_same_v<T, Pvx32f>) {
            VF x = AsFloat(a);
            if (!*this->flag && (MaskF(EqF(x, ZeroF())) & kCounted)) *this->flag = true;
            return AsInt(LnF(x));
        } else {
            // y = ln x 2^-sf in single precision is within 1 ulp, y 2^-23, of
            // the exact value; a lane within y 2^-22 of a rounding boundary (a
            // half-integer) is done again in double precision (LnD), in the
            // register loop: a call there, however rare, made the compiler
            // keep more of the constants in memory (1080p frames 1.1 times
            // slower, 16u at sf -8 and 16s at sf -4). No result that is not saturated lies nearer a boundary
            // than 2^-35.9 of it (x 16056 at sf -11; a long-double loop over
            // every input and sf -40 to -1 found it). The inputs are
            // integers, so the logarithm of max(x, 1) needs none of LnF's
            // special cases: x <= 1 gives 0, which is the result of 1 and of
            // the negative 16s inputs, and ln 0 (the type's minimum) is set
            // after (random 1080p frames: 16s 1.45 times faster, where half
            // the inputs sent LnF down its general path; 16u 1.07).
            constexpr int kN = 4 / sizeof(T);
            auto abs = [](VF v) { return AndNotF(SplatF(-0.0f), v); };
            const VF kAbove = SplatF(static_cast<float>(std::numeric_limits<T>::max()) + 1.0f);
            VI w[kN], r[kN];
            Widen32<T>(a, w);
            VF zero = ZeroF();
            for (int i = 0; i < kN; ++i) {
                VF x = CvtI32F(w[i]);
                VF y = MulF(LnNormalF(MaxF(x, SplatF(1.0f)), Zero()), scale);  // y >= 0
                VF gap = abs(SubF(SplatF(0.5f), abs(SubF(y, RoundEvenF(y)))));
                // (y at or above the type's maximum + 1 saturates however it rounds)
                VF nearV = AndF(GeF(MulF(y, SplatF(0x1p-22f)), gap), LtF(y, kAbove));
                int near = MaskF(nearV);
                VF z = EqF(x, ZeroF());
                zero = OrF(zero, z);  // each w[i] holds whole pixels
                r[i] = SatI32<T, Rnd::kEven>(y);
                if constexpr (std::is_signed_v<T>) r[i] = SelectBytes(r[i], SplatU32(0xFFFF8000u), AsInt(z));
                if (near) [[unlikely]] {
                    VD lo, hi;
                    LnD(MaxF(x, SplatF(1.0f)), lo, hi);
                    VI exact = SatI32<T, Rnd::kEven>(MulD(lo, scaleD), MulD(hi, scaleD));
                    r[i] = SelectBytes(r[i], exact, AsInt(nearV));
                }
            }
            if (!*this->flag && (MaskF(zero) & kCounted)) *this->flag = true;
            return Narrow32<T>(r);
        }
    }
};

// ---- results of few values ----------------------------------------------------------

// Sqrt of 8u at sf >= 0 and Ln of 8u at sf >= -2 and of 16-bit elements at
// sf >= -1 take at most 24 values (0 to 16 for Sqrt_8u at sf 0, 0 to 22 for
// 16-bit Ln at sf -1), and neither ever decreases with x. The result is then
// the number of fixed steps that x has reached: two operations a step, where
// the square roots took four float roots a register, the 8u logarithm a table
// of four operations for each of its sixteen registers, and the 16-bit one
// two logarithms a register. On 1080p frames Sqrt_8u at sf 0 takes 0.4 of
// the time, Ln_8u at sf 0 0.25 and at sf -2 0.7, 16-bit Ln at sf 0 0.1 and
// at sf -1 0.35. The exhaustive test holds the steps to the rules of the
// other paths.
struct Steps {
    static constexpr int kMax = 24;
    int at[kMax];  // x >= at[k] adds one; a step repeats where the result jumps by more
    int n = 0;
    bool Add(int x)
    {
        if (n == kMax) return false;
        at[n++] = x;
        return true;
    }
};

// round(sqrt(x) 2^-sf) >= k where sqrt(x) >= (k - 1/2) 2^sf, that is 4x >= b
// with b = (2k - 1)^2 4^sf. At 4x == b (sf >= 1) the value is a tie, which
// goes to the even one of k - 1 and k.
inline bool SqrtSteps8(int sf, Steps& s)
{
    if (sf < 0) return false;  // results up to 255: the float path
    if (sf > 4) return true;   // every result is 0
    for (std::int64_t k = 1;; ++k) {
        std::int64_t b = (2 * k - 1) * (2 * k - 1) << (2 * sf);
        std::int64_t x = (b + 3) / 4;
        if (b % 4 == 0 && k % 2 == 1) ++x;
        if (x > 255) return true;
        if (!s.Add(static_cast<int>(x))) return false;
    }
}

// The first inputs at which LnRound reaches 1, 2, ..., at sf -2 to 4 (row
// -2 up to 255, for 8u only), as a loop over every input printed them.
// Below sf -2 the 8u results outgrow Steps, 16-bit results do below -1, and
// from sf 5 on every positive input gives 0.
inline constexpr std::uint16_t kLnSteps[7][22] = {
    {2, 2, 2, 3, 4, 4, 6, 7, 9, 11, 14, 18, 23, 30, 38, 49, 62, 80, 103, 131, 169, 216},
    {2, 3, 4, 6, 10, 16, 26, 43, 71, 116, 191, 315, 519, 855, 1409, 2322, 3828, 6311, 10405, 17155, 28283, 46631},
    {2, 5, 13, 34, 91, 245, 666, 1809, 4915, 13360, 36316},
    {3, 21, 149, 1097, 8104, 59875},
    {8, 404, 22027},
    {55},
    {2981}};  // 0: no more steps

template <class T>
bool LnSteps(int sf, Steps& s)
{
    if (sf < (sizeof(T) == 1 ? -2 : -1)) return false;
    if (sf > 4) return true;
    for (int t : kLnSteps[sf + 2]) {
        if (t == 0 || t > std::numeric_limits<T>::max()) break;
        s.Add(t);
    }
    return true;
}

template <class T, int K, Lay L, bool kLn>
    requires(K % 4 == 0)
struct StepsOp : UnaryBase<StepsOp<T, K, L, kLn>, T> {
    static constexpr bool k8 = sizeof(T) == 1;
    static constexpr int kCounted = L != Lay::AC4 ? 0xFFFF : k8 ? 0x7777 : 0x3F3F;  // bytes where ln 0 counts
    // Step t as t - 1 in a signed compare: x, its sign bit flipped for the
    // unsigned types, has reached it where it is above it. Unused steps are
    // the largest signed value, above every x.
    static constexpr int kFlip = std::is_signed_v<T> ? 0 : k8 ? 0x80 : 0x8000;
    static constexpr int kTop = k8 ? 0x7F : 0x7FFF;
    VI at[K];
    static VI Splat(int v) { return k8 ? SplatU8(static_cast<std::uint8_t>(v)) : SplatU16(static_cast<std::uint16_t>(v)); }
    explicit StepsOp(const Steps& s)
    {
        for (int k = 0; k < K; ++k) at[k] = Splat(k < s.n ? (s.at[k] - 1) ^ kFlip : kTop);
    }
    VI Vec(VI a) const
    {
        // Four sums, unrolled: one sum took a cycle a step, and a rolled loop
        // three, twice the time of the 8u table at 24 steps.
        VI x = kFlip ? Xor(a, Splat(kFlip)) : a, r[4] = {Zero(), Zero(), Zero(), Zero()};
#pragma GCC unroll 32
        for (int k = 0; k < K; ++k)
            r[k % 4] = k8 ? SubI8(r[k % 4], GtI8(x, at[k])) : SubI16(r[k % 4], GtI16(x, at[k]));
        VI sum = k8 ? AddI8(AddI8(r[0], r[1]), AddI8(r[2], r[3])) : AddI16(AddI16(r[0], r[1]), AddI16(r[2], r[3]));
        if constexpr (kLn) {
            VI zero = k8 ? EqU8(a, Zero()) : EqI16(a, Zero());
            if (!*this->flag && (MaskBytes(zero) & kCounted)) *this->flag = true;
            if constexpr (std::is_signed_v<T>) sum = SelectBytes(sum, SplatU16(0x8000), zero);  // ln 0: the minimum
        }
        return sum;
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

// Runs op over the rows (src may be dst); a logarithm of 0 met gives the
// division-by-zero status.
template <class T, Lay L, class Op>
PvxStatus RunUnary(Op op, const T* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi)
{
    bool met = false;
    op.flag = &met;
    RunRows<T, L, Src2::kNone>(op, pSrc, srcStep, pSrc, srcStep, pDst, dstStep, roi);
    return met ? pvxStsDivByZero : pvxStsNoErr;
}

// StepsOp with room for the steps of s: 8, 16 or 24 for 8u; 4 (16-bit Ln
// at sf 2 to 4), 12 (sf 0 and 1) or 24 (sf -1) for 16-bit elements.
template <class T, Lay L, bool kLn>
PvxStatus RunSteps(const Steps& s, const T* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi)
{
    constexpr int kFew = sizeof(T) == 1 ? 8 : 4, kMore = sizeof(T) == 1 ? 16 : 12;
    if (s.n <= kFew) return RunUnary<T, L>(StepsOp<T, kFew, L, kLn>(s), pSrc, srcStep, pDst, dstStep, roi);
    if (s.n <= kMore) return RunUnary<T, L>(StepsOp<T, kMore, L, kLn>(s), pSrc, srcStep, pDst, dstStep, roi);
    return RunUnary<T, L>(StepsOp<T, Steps::kMax, L, kLn>(s), pSrc, srcStep, pDst, dstStep, roi);
}

// Exp and Ln build their tables and steps, and run, under round-to-nearest
// without flushing, whatever the caller set, so that their results do not
// depend on it.
template <class Op>
concept NeedsNearest = requires { Op::kNearest; };

// The op of a call: Op, or one that counts steps where the results take few
// values (Ln of 16-bit elements at sf >= -1, Sqrt of 8u at sf >= 0, Ln of 8u
// at sf >= -2). Ops of their own, chosen per call: a test of the scale
// factor in LnOp's register loop made the other scale factors 17% slower.
template <template <class, Lay> class Op, class T, Lay L>
PvxStatus RunUnaryOp(int scaleFactor, const T* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi)
{
    constexpr bool kLn = std::is_same_v<Op<T, L>, LnOp<T, L>>;
    constexpr bool kSqrt = std::is_same_v<Op<T, L>, SqrtOp<T, L>>;
    auto run = [&]() -> PvxStatus {
        if constexpr ((kLn && sizeof(T) <= 2) || (kSqrt && std::is_same_v<T, Pvx8u>)) {
            Steps s;
            if (kLn ? LnSteps<T>(scaleFactor, s) : SqrtSteps8(scaleFactor, s))
                return RunSteps<T, L, kLn>(s, pSrc, srcStep, pDst, dstStep, roi);
        }
        return RunUnary<T, L>(Op<T, L>(scaleFactor), pSrc, srcStep, pDst, dstStep, roi);
    };
    if constexpr (NeedsNearest<Op<T, L>>) {
        FpGuard nearest(FpRound::kNearest);
        return run();
    } else {
        return run();
    }
}

template <template <class, Lay> class Op, class T, Lay L, Order O>
PvxStatus UnaryBody(const T* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi, int scaleFactor = 0)
{
    if (PvxStatus s = CheckFrame<O>({pSrc, pDst}, roi, {srcStep, dstStep})) return s;
    return RunUnaryOp<Op, T, L>(scaleFactor, pSrc, srcStep, pDst, dstStep, roi);
}

template <template <class, Lay> class Op, class T, Lay L, Order O>
PvxStatus UnaryIBody(T* pSrcDst, int srcDstStep, PvxiSize roi, int scaleFactor = 0)
{
    if (PvxStatus s = CheckFrame<O>({pSrcDst}, roi, {srcDstStep})) return s;
    return RunUnaryOp<Op, T, L>(scaleFactor, pSrcDst, srcDstStep, pSrcDst, srcDstStep, roi);
}

// Integer squares: the checks of this family, then the product of the image
// with itself (in place, all three operands are one image).
template <class T, Lay L, Order O>
PvxStatus SqrIntBody(const T* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi, int scaleFactor)
{
    if (PvxStatus s = CheckFrame<O>({pSrc, pDst}, roi, {srcStep, dstStep})) return s;
    return ArithRun<mul::RealMulFam, T, L, Src2::kImage>(pSrc, srcStep, pSrc, srcStep, pDst, dstStep, roi,
                                                         scaleFactor, nullptr);
}

template <class T, Lay L, Order O>
PvxStatus SqrIntIBody(T* pSrcDst, int srcDstStep, PvxiSize roi, int scaleFactor)
{
    if (PvxStatus s = CheckFrame<O>({pSrcDst}, roi, {srcDstStep})) return s;
    return ArithRun<mul::RealMulFam, T, L, Src2::kImage>(pSrcDst, srcDstStep, pSrcDst, srcDstStep, pSrcDst,
                                                         srcDstStep, roi, scaleFactor, nullptr);
}

}  // namespace
}  // namespace pvx

#include "unary.exports.inc"
