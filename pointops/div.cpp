// Div, DivC, Div_Round: quotients of two images or of an image and a constant.
//
// Operand order: the first image divides the second (pSrc2 / pSrc1), as Sub
// subtracts the first from the second; in place, pSrcDst / pSrc. Callers
// depend on this order.
//
// Integer members (8u, 16u, 16s): the exact quotient times 2^-scaleFactor,
// rounded (half to even; Div_Round by its mode) and saturated. A zero divisor
// pixel counts as an infinite quotient of the dividend's sign: the type's
// maximum for a positive dividend, its minimum (0 for unsigned types) for a
// negative one, and 0 for 0 / 0; the call still computes every row and returns
// pvxStsDivByZero (6), as Div_32f does.
//
// Why the vector path may divide in floating point: the quotient v = N / d
// with N = n * 2^-sf (exact: a power-of-two scale) is a rational whose
// distance to any rounding boundary (an integer or a half-integer) that it
// does not equal is at least 1 / (2 d 2^max(sf,0)), i.e. at least v / (2 |N|)
// relative to v; boundaries that it equals are representable and the
// correctly rounded division returns them exactly. So a division correctly
// rounded to p bits decides every rounding like the exact value as long as
// 2^-p < 1 / (2 |N|) wherever v can be below the saturation point (division
// rounded to nearest: the call sets that mode for its duration). For 8u
// (|N| < 2^16 there) single precision suffices at every scale factor; for
// 16-bit elements single precision suffices for sf >= -7 (|N| < 2^23) and
// double precision (|N| < 2^48) serves the rest. Scale factors are capped
// where further scaling changes no result.
//
// Div_32f: groups of four elements counted from the start of each row. A
// group without a zero divisor gets the refined reciprocal: r = rcp(d),
// q = n r, e = 1 - d r, result q + (e q + q) e (this operation order is the
// contract; the last bits may differ from a correctly rounded quotient). A
// group with a zero divisor is computed element by element: the exact
// quotient for non-zero divisors; +inf, -inf or the quiet NaN 0x7FC00000 for
// a positive, negative, or zero/NaN dividend over zero. The last (width *
// channels) mod 4 elements of a row are groups of one. Rows are merged into
// one only when every row holds whole groups, so results never depend on the
// steps or on alignment. AC4: a group is one pixel; the alpha divisor is not
// looked at.
//
// DivC_32f divides exactly (correctly rounded); complex members use
// (a+bi)/(c+di) = ((ac+bd) + (bc-ad)i)/(c^2+d^2): 32fc in single precision in
// that order, 16sc and 32sc exactly in wide integers with the Sfs rule per
// part. A zero complex divisor treats each part of the dividend as over zero.
//
// Checks: pointers (-8), sizes (-6), steps (-14); then DivC's constant (any
// zero channel: pvxStsDivByZeroErr, -10) and Div_Round's mode (-213).
#include <algorithm>
#include <cstring>
#include <limits>
#include <type_traits>

#include "arith.h"
#include "arith_round.h"
#include "check.h"
#include "entry.h"
#include "fpguard.h"
#include "layout.h"
#include "simd.h"

namespace pvx {
namespace {

using namespace simd;

// Lanes of the fourth channel in a register of units U (AC4), and 1 in them.
template <class U, Lay L>
struct AlphaLanes {
    VI mask = Zero(), one = Zero();
    AlphaLanes()
    {
        if constexpr (kKeepsAlpha<L>) {
            alignas(16) U m[16 / sizeof(U)], o[16 / sizeof(U)];
            for (int i = 0; i < static_cast<int>(16 / sizeof(U)); ++i) {
                bool a = i % 4 == 3;
                std::memset(&m[i], a ? 0xFF : 0, sizeof(U));
                o[i] = a ? U(1) : U(0);
            }
            mask = LoadA(m);
            one = LoadA(o);
        }
    }
    // The register with 1 in the alpha lanes.
    VI Fill(VI v) const
    {
        if constexpr (kKeepsAlpha<L>) return Or(AndNot(mask, v), one);
        else return v;
    }
};

// ---- integer quotient (8u, 16u, 16s) ------------------------------------------------

// Quotient of integer elements U under rounding R: two images (the first is
// the divisor) or an image over a constant (kConst).
template <class U, Lay L, Rnd R, bool kConst>
struct IntDivOp {
    using Unit = U;
    int sf;
    bool wide;  // double precision: 16-bit elements below sf -7
    VF scaleF;
    VD scaleD;
    AlphaLanes<U, L> alpha;
    bool* zero = nullptr;  // set when a zero divisor is met (the row loop copies the op)

    explicit IntDivOp(int scaleFactor) : sf(scaleFactor)
    {
        wide = sizeof(U) == 2 && sf < -7;
        int capped = sf > 40 ? 40 : sf;
        int lowest = sizeof(U) == 1 ? -16 : -32;
        capped = capped < lowest ? lowest : capped;
        scaleF = SplatF(Pow2F(-capped));
        scaleD = SplatD(Pow2D(-capped));
    }
    static constexpr bool kHasVector = true;
    bool Vector() const { return true; }

    VI Quot(VI num, VI den) const
    {
        constexpr int kN = 4 / sizeof(U);
        VI n[kN], d[kN], r[kN];
        Widen32<U>(num, n);
        Widen32<U>(den, d);
        if (!wide) {
            for (int i = 0; i < kN; ++i) {
                VF x = CvtI32F(n[i]);
                if (sf != 0) x = MulF(x, scaleF);  // scale factor 0, the usual one, skips the multiply by 1
                r[i] = Sat(DivF(x, CvtI32F(d[i])));
            }
        } else {
            for (int i = 0; i < kN; ++i)
                r[i] = SatI32<U, R>(DivD(MulD(CvtLoI32D(n[i]), scaleD), CvtLoI32D(d[i])),
                                    DivD(MulD(CvtHiI32D(n[i]), scaleD), CvtHiI32D(d[i])));
        }
        return Narrow32<U>(r);
    }

    VI Vec(VI a, VI b) const
    {
        if constexpr (kConst) {
            return Quot(a, b);
        } else {
            VI den = alpha.Fill(a);
            if (!*zero && MaskBytes(Eq0(den))) *zero = true;
            return Quot(b, den);
        }
    }
    U Scalar(U a, U b) const
    {
        if constexpr (kConst) {
            return QuotSat<U>(a, b, sf, R);
        } else {
            if (a == 0) *zero = true;
            return QuotSat<U>(b, a, sf, R);
        }
    }

private:
    // A single-precision quotient to 32-bit lanes, rounded by R and saturated
    // to U. Unsigned quotients are never negative: capping at the maximum
    // (+inf included) and converting by the rounding control (nearest for the
    // call, so half to even) or by truncation does it in two operations; 0 / 0
    // (NaN) converts to INT_MIN, which the packs take to 0, as they must.
    static VI Sat(VF q)
    {
        constexpr bool kUnsigned = !std::numeric_limits<U>::is_signed;
        if constexpr (kUnsigned && R == Rnd::kEven) {
            return CvtF32(MinF(SplatF(static_cast<float>(std::numeric_limits<U>::max())), q));
        } else if constexpr (kUnsigned && R == Rnd::kZero) {
            return CvtTruncF32(MinF(SplatF(static_cast<float>(std::numeric_limits<U>::max())), q));
        } else {
            return SatI32<U, R>(q);
        }
    }

    static VI Eq0(VI v)
    {
        if constexpr (sizeof(U) == 1) return EqU8(v, Zero());
        else return EqI16(v, Zero());
    }
};

// ---- 32f ----------------------------------------------------------------------------

// The value over a zero divisor: +inf, -inf, or the quiet NaN 0x7FC00000 for a
// zero or NaN dividend.
inline float OverZero(float n)
{
    if (n > 0) return std::numeric_limits<float>::infinity();
    if (n < 0) return -std::numeric_limits<float>::infinity();
    return std::bit_cast<float>(0x7FC00000u);
}

inline VF OverZero(VF n)
{
    VF gt = GtF(n, ZeroF()), lt = LtF(n, ZeroF());
    VF r = OrF(AndF(gt, AsFloat(SplatU32(0x7F800000u))), AndF(lt, AsFloat(SplatU32(0xFF800000u))));
    return OrF(r, AndNotF(OrF(gt, lt), AsFloat(SplatU32(0x7FC00000u))));
}

// The second-order step q + (e q + q) e, in this order, from q = n r and
// e = 1 - d r with r the reciprocal estimate of d.
inline VF Refine(VF q, VF e)
{
    return AddF(q, MulF(AddF(MulF(e, q), q), e));
}

// n / d from the reciprocal estimate refined to second order.
inline VF RefinedQuot(VF n, VF d)
{
    VF r = RcpF(d);
    return Refine(MulF(n, r), SubF(SplatF(1.0f), MulF(d, r)));
}

// Div_32f: one register is one group of four (AC4: one pixel).
template <Lay L>
struct Div32fOp {
    using Unit = Pvx32f;
    AlphaLanes<Pvx32f, L> alpha;
    bool* zero = nullptr;  // set when a zero divisor is met (the row loop copies the op)

    static constexpr bool kHasVector = true;
    static constexpr bool kScalarTail = true;  // a register is a group: the tail stays groups of one
    bool Vector() const { return true; }
    VI Vec(VI a, VI b) const
    {
        VF d = AsFloat(alpha.Fill(a));
        VF n = AsFloat(b);
        VF z = EqF(d, ZeroF());
        if (!MaskF(z)) return AsInt(RefinedQuot(n, d));
        *zero = true;
        return AsInt(SelectF(DivF(n, d), OverZero(n), z));
    }
    // Four groups, four independent chains, and one test for the four: a zero
    // divisor has an infinite estimate, so its e (0 times infinity) is NaN, and
    // a NaN in any e makes the sum of the four e registers NaN. The sum takes
    // adds, which have spare room here, where a compare a register would
    // compete with the multiplies for their two ports.
    // Any NaN sends the four groups to the exact zero test (NaN and infinite
    // divisors too, which then take the refined quotient as before).
    void Vec4(const VI* a, const VI* b, VI* out) const
    {
        VF d[4], q[4], e[4];
        for (int k = 0; k < 4; ++k) {
            d[k] = AsFloat(alpha.Fill(a[k]));
            VF r = RcpF(d[k]);
            q[k] = MulF(AsFloat(b[k]), r);
            e[k] = SubF(SplatF(1.0f), MulF(d[k], r));
        }
        VF sum = AddF(AddF(e[0], e[1]), AddF(e[2], e[3]));
        if (__builtin_expect(MaskF(OrderedF(sum)) == 0xF, 1)) {
            for (int k = 0; k < 4; ++k) out[k] = AsInt(Refine(q[k], e[k]));
        } else {
            for (int k = 0; k < 4; ++k) out[k] = Vec(a[k], b[k]);
        }
    }
    // A tail element: a group of one.
    Pvx32f Scalar(Pvx32f d, Pvx32f n) const
    {
        if (d == 0) {
            *zero = true;
            return OverZero(n);
        }
        return _mm_cvtss_f32(RefinedQuot(_mm_set_ss(n), _mm_set_ss(d)));
    }
};

// DivC_32f: correctly rounded quotient by the constant.
struct DivC32fOp {
    using Unit = Pvx32f;
    static constexpr bool kHasVector = true;
    bool Vector() const { return true; }
    VI Vec(VI a, VI c) const { return AsInt(DivF(AsFloat(a), AsFloat(c))); }
    Pvx32f Scalar(Pvx32f a, Pvx32f c) const { return a / c; }
};

// ---- complex ------------------------------------------------------------------------

// Complex quotient: num / den with the parts of 16sc and 32sc exact under
// the Sfs rule, 32fc in single precision.
//
// 32fc: two numbers a register, each part by the same operations in the same
// order as Scalar.
//
// 16sc: four numbers a register, the quotients in double lanes. The parts'
// numerators ac + bd and bc - ad and the divisor c^2 + d^2 are exact in
// 32-bit multiply-adds, except that ac + bd and c^2 + d^2 wrap to -2^31 where
// they reach 2^31 (parts of -32768), which the conversion to double lifts
// back. By the argument at the top of this file the correctly rounded double
// quotient decides every rounding like the exact one at every scale factor:
// a quotient v = N / m below the saturation point has |N| < 2^15 m <= 2^46,
// so it lies at least 2^-47 of itself from any boundary it does not equal,
// and the division errs by at most 2^-53. Beyond 2^46 every non-zero
// result saturates, so the scale is capped there. A zero divisor puts each
// part of the dividend over 0, whose infinities and NaN the saturation takes
// to the maximum, minimum and 0.
template <class T, bool kConst>
struct CplxDivOp {
    using Unit = T;
    using E = Element<T>;
    static constexpr bool kS16 = std::is_same_v<T, Pvx16sc>;
    int sf;
    VD scaleD;
    bool* zero = nullptr;  // set when a zero divisor is met (the row loop copies the op)

    explicit CplxDivOp(int scaleFactor)
        : sf(scaleFactor), scaleD(SplatD(Pow2D(-std::clamp(scaleFactor, -46, 40))))
    {
    }
    static constexpr bool kHasVector = std::is_same_v<T, Pvx32fc> || kS16;
    bool Vector() const { return kHasVector; }

    // A constant divisor has no zero part pair (the call refused it).
    [[gnu::always_inline]] VI Vec(VI a, VI b) const { return Vec(a, b, Zero()); }
    // keep: the alpha lanes of AC4, whose divisors are not looked at.
    [[gnu::always_inline]] VI Vec(VI a, VI b, VI keep) const
    {
        if constexpr (kS16) return VecS16(kConst ? a : b, kConst ? b : a, keep);
        else return VecF(kConst ? a : b, kConst ? b : a, keep);
    }

    // Each takes the dividend, then the divisor. The 32fc one is inlined
    // into the row loop, where a call per register had been left (rows in
    // cache 1.2 times faster); the 16sc one measured 1.4 times slower
    // inlined, so it stays the compiler's choice.
    [[gnu::always_inline]] VI VecF(VI a, VI b, VI keep) const
    {
        VF num = AsFloat(a), den = AsFloat(b);
        VF p = MulF(num, den);               // ac, bd
        VF t = MulF(num, SwapPairsF(den));   // ad, bc
        VF dd = MulF(den, den);
        VF m = AddF(DupEvenF(dd), DupOddF(dd));  // c^2 + d^2
        // (bc - ad, ac + bd) in one add-subtract, then back to (re, im)
        VF x = SwapPairsF(_mm_blend_ps(p, t, 0xA));  // bc, ac
        VF y = _mm_blend_ps(t, p, 0xA);              // ad, bd
        VF q = DivF(SwapPairsF(SubAddF(x, y)), m);
        if constexpr (!kConst) {
            VF z = EqF(den, ZeroF());
            z = AndNotF(AsFloat(keep), AndF(z, SwapPairsF(z)));
            if (MaskF(z)) [[unlikely]] {
                *zero = true;
                q = SelectF(q, OverZero(num), z);
            }
        }
        return AsInt(q);
    }

    VI VecS16(VI x, VI y, VI keep) const
    {
        VI nr = MulAddPairsI16(x, y);                  // ac + bd
        VI ni = MulSubPairsI16(SwapHalves16(x), y);    // bc - ad
        VI m = MulAddPairsI16(y, y);                   // c^2 + d^2
        if constexpr (!kConst) {
            VI z = AndNot(keep, EqI32(m, Zero()));
            if (MaskBytes(z)) [[unlikely]] {
                *zero = true;
                nr = SelectBytes(nr, SraI32n(SllI32n(x, 16), 16), z);
                ni = SelectBytes(ni, SraI32n(x, 16), z);
            }
        }
        const VD wrapped = SplatD(-2147483648.0), lift = SplatD(4294967296.0);
        auto d = [&](VD v) { return AddD(v, AndD(EqD(v, wrapped), lift)); };
        VD ml = d(CvtLoI32D(m)), mh = d(CvtHiI32D(m));
        auto quot = [&](VI n) {
            return SatI32<E, Rnd::kEven>(DivD(MulD(d(CvtLoI32D(n)), scaleD), ml),
                                         DivD(MulD(d(CvtHiI32D(n)), scaleD), mh));
        };
        return PackPairsS32(quot(nr), quot(ni));
    }

    T Scalar(T a, T b) const
    {
        const T& num = kConst ? a : b;
        const T& den = kConst ? b : a;
        T r;
        if constexpr (std::is_floating_point_v<E>) {
            if (den.re == 0 && den.im == 0) {
                *zero = true;
                r.re = OverZero(num.re);
                r.im = OverZero(num.im);
                return r;
            }
            float m = den.re * den.re + den.im * den.im;
            r.re = (num.re * den.re + num.im * den.im) / m;
            r.im = (num.im * den.re - num.re * den.im) / m;
        } else {
            Wide c = den.re, d = den.im, x = num.re, y = num.im;
            Wide m = c * c + d * d;
            if (m == 0) *zero = true;
            r.re = m == 0 ? QuotSat<E>(x, 0, sf, Rnd::kEven) : QuotSat<E>(x * c + y * d, m, sf, Rnd::kEven);
            r.im = m == 0 ? QuotSat<E>(y, 0, sf, Rnd::kEven) : QuotSat<E>(y * c - x * d, m, sf, Rnd::kEven);
        }
        return r;
    }
};

// ---- running ------------------------------------------------------------------------

template <class T, Lay L>
bool HasZeroChannel(const T* v)
{
    for (int c = 0; c < kProcessed<L>; ++c) {
        if constexpr (kIsComplex<T>) {
            if (v[c].re == 0 && v[c].im == 0) return true;
        } else {
            if (v[c] == 0) return true;
        }
    }
    return false;
}

template <class T, Lay L, Src2 K>
PvxStatus DivRun(const T* a, int aStep, const T* b, int bStep, T* d, int dStep, PvxiSize roi, int sf, Rnd r,
                 const T* value)
{
    constexpr bool kC = K == Src2::kConst;
    bool zero = false;
    if constexpr (std::is_same_v<T, Pvx32f>) {
        if constexpr (kC) {
            RunRows<T, L, K>(DivC32fOp{}, a, aStep, b, bStep, d, dStep, roi, value);
        } else {
            // Without alpha the channels play no part: rows run as one-channel
            // rows of width * channels elements, so one register is one group
            // and only the last (width * channels) mod 4 elements are singles.
            constexpr Lay kRowLay = kKeepsAlpha<L> ? L : Lay::C1;
            Div32fOp<kRowLay> op;
            op.zero = &zero;
            PvxiSize rows{roi.width * (kKeepsAlpha<L> ? 1 : kChannels<L>), roi.height};
            if (rows.width % 4 == 0 || kKeepsAlpha<L>) {
                RunRows<T, kRowLay, K>(op, a, aStep, b, bStep, d, dStep, rows);
            } else {
                // Rows with a partial last group are never merged: the groups
                // of the next row start at its own first element. Run one at
                // a time, they are too small to stream their stores.
                for (int y = 0; y < roi.height; ++y)
                    RunRows<T, kRowLay, K>(op, RowAt(a, aStep, y), aStep, RowAt(b, bStep, y), bStep,
                                           RowAt(d, dStep, y), dStep, PvxiSize{rows.width, 1});
            }
        }
    } else if constexpr (kIsComplex<T>) {
        auto run = [&] {
            CplxDivOp<T, kC> op(sf);
            op.zero = &zero;
            RunRows<T, L, K>(op, a, aStep, b, bStep, d, dStep, roi, value);
        };
        if constexpr (std::is_floating_point_v<Element<T>>) {
            run();
        } else {
            // (16sc quotients in double lanes rely on rounding to nearest too)
            FpGuard nearest(FpRound::kNearest);
            run();
        }
    } else {
        // The exactness argument above needs quotients rounded to nearest:
        // under a caller's directed rounding, 16u at scale factor -7 missed
        // the rounding boundary. The caller's mode is restored on return.
        FpGuard nearest(FpRound::kNearest);
        auto run = [&]<Rnd R>() {
            IntDivOp<T, L, R, kC> op(sf);
            op.zero = &zero;
            RunRows<T, L, K>(op, a, aStep, b, bStep, d, dStep, roi, value);
        };
        if (r == Rnd::kZero) run.template operator()<Rnd::kZero>();
        else if (r == Rnd::kAway) run.template operator()<Rnd::kAway>();
        else run.template operator()<Rnd::kEven>();
    }
    return zero ? pvxStsDivByZero : pvxStsNoErr;
}

constexpr Order kDivOrder = Order::kPtrSizeStep;

// ---- checked bodies -------------------------------------------------------------------

template <class T, Lay L>
PvxStatus DivBody(const T* pSrc1, int src1Step, const T* pSrc2, int src2Step, T* pDst, int dstStep, PvxiSize roi,
                  int scaleFactor = 0)
{
    if (PvxStatus s = CheckFrame<kDivOrder>({pSrc1, pSrc2, pDst}, roi, {src1Step, src2Step, dstStep})) return s;
    return DivRun<T, L, Src2::kImage>(pSrc1, src1Step, pSrc2, src2Step, pDst, dstStep, roi, scaleFactor, Rnd::kEven,
                                      nullptr);
}

// In place: pSrcDst = pSrcDst / pSrc.
template <class T, Lay L>
PvxStatus DivIBody(const T* pSrc, int srcStep, T* pSrcDst, int srcDstStep, PvxiSize roi, int scaleFactor = 0)
{
    if (PvxStatus s = CheckFrame<kDivOrder>({pSrc, pSrcDst}, roi, {srcStep, srcDstStep})) return s;
    return DivRun<T, L, Src2::kImage>(pSrc, srcStep, pSrcDst, srcDstStep, pSrcDst, srcDstStep, roi, scaleFactor,
                                      Rnd::kEven, nullptr);
}

template <class T, Lay L>
PvxStatus DivCRun(const T* pSrc, int srcStep, const T* value, T* pDst, int dstStep, PvxiSize roi, int sf)
{
    if (HasZeroChannel<T, L>(value)) return pvxStsDivByZeroErr;
    return DivRun<T, L, Src2::kConst>(pSrc, srcStep, pSrc, srcStep, pDst, dstStep, roi, sf, Rnd::kEven, value);
}

template <class T, Lay L>
PvxStatus DivCBody(const T* pSrc, int srcStep, const T* value, T* pDst, int dstStep, PvxiSize roi,
                   int scaleFactor = 0)
{
    if (PvxStatus s = CheckFrame<kDivOrder>({pSrc, value, pDst}, roi, {srcStep, dstStep})) return s;
    return DivCRun<T, L>(pSrc, srcStep, value, pDst, dstStep, roi, scaleFactor);
}
template <class T, Lay L>
PvxStatus DivCBody(const T* pSrc, int srcStep, T value, T* pDst, int dstStep, PvxiSize roi, int scaleFactor = 0)
{
    if (PvxStatus s = CheckFrame<kDivOrder>({pSrc, pDst}, roi, {srcStep, dstStep})) return s;
    return DivCRun<T, L>(pSrc, srcStep, &value, pDst, dstStep, roi, scaleFactor);
}
template <class T, Lay L>
PvxStatus DivCIBody(const T* value, T* pSrcDst, int srcDstStep, PvxiSize roi, int scaleFactor = 0)
{
    if (PvxStatus s = CheckFrame<kDivOrder>({value, pSrcDst}, roi, {srcDstStep})) return s;
    return DivCRun<T, L>(pSrcDst, srcDstStep, value, pSrcDst, srcDstStep, roi, scaleFactor);
}
template <class T, Lay L>
PvxStatus DivCIBody(T value, T* pSrcDst, int srcDstStep, PvxiSize roi, int scaleFactor = 0)
{
    if (PvxStatus s = CheckFrame<kDivOrder>({pSrcDst}, roi, {srcDstStep})) return s;
    return DivCRun<T, L>(pSrcDst, srcDstStep, &value, pSrcDst, srcDstStep, roi, scaleFactor);
}

// Div_Round: the rounding mode is checked after pointers, sizes and steps.
template <class T, Lay L>
PvxStatus DivRoundBody(const T* pSrc1, int src1Step, const T* pSrc2, int src2Step, T* pDst, int dstStep,
                       PvxiSize roi, int roundMode, int scaleFactor)
{
    if (PvxStatus s = CheckFrame<kDivOrder>({pSrc1, pSrc2, pDst}, roi, {src1Step, src2Step, dstStep})) return s;
    if (roundMode < 0 || roundMode > 2) return pvxStsRoundModeNotSupportedErr;
    return DivRun<T, L, Src2::kImage>(pSrc1, src1Step, pSrc2, src2Step, pDst, dstStep, roi, scaleFactor,
                                      static_cast<Rnd>(roundMode), nullptr);
}
template <class T, Lay L>
PvxStatus DivRoundIBody(const T* pSrc, int srcStep, T* pSrcDst, int srcDstStep, PvxiSize roi, int roundMode,
                        int scaleFactor)
{
    if (PvxStatus s = CheckFrame<kDivOrder>({pSrc, pSrcDst}, roi, {srcStep, srcDstStep})) return s;
    if (roundMode < 0 || roundMode > 2) return pvxStsRoundModeNotSupportedErr;
    return DivRun<T, L, Src2::kImage>(pSrc, srcStep, pSrcDst, srcDstStep, pSrcDst, srcDstStep, roi, scaleFactor,
                                      static_cast<Rnd>(roundMode), nullptr);
}

}  // namespace
}  // namespace pvx

#include "div.exports.inc"
