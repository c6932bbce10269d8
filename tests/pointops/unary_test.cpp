// Abs, Sqr, Sqrt, Exp, Ln, Complement: every member against references in wide
// or extended arithmetic, every scale factor from -10 to 20 on the integer
// types (every 16-bit input for the rounding ones), check orders.
#include <xmmintrin.h>

#include <cfenv>
#include <cmath>
#include <cstring>
#include <initializer_list>
#include <limits>

#include "arith_members.h"

namespace {

using namespace pvxtest;
__extension__ typedef __int128 Wide;

template <class E>
E Sat(long double v)
{
    using L = std::numeric_limits<E>;
    if (std::isnan(v)) return E{};
    if (v <= static_cast<long double>(L::min())) return L::min();
    if (v >= static_cast<long double>(L::max())) return L::max();
    return static_cast<E>(v);
}

// r * 2^-sf rounded half to even, exactly, for integer r.
template <class E>
E RefScale(Wide r, int sf)
{
    if (sf <= 0) return Sat<E>(static_cast<long double>(r * (static_cast<Wide>(1) << -sf)));
    Wide q = r >> sf, rem = r - (q << sf), half = static_cast<Wide>(1) << (sf - 1);
    if (rem > half || (rem == half && (q & 1))) ++q;
    return Sat<E>(static_cast<long double>(q));
}

// Half to even of an extended-precision value.
long double RoundEven(long double v)
{
    long double f = std::floor(v), d = v - f;
    if (d > 0.5L || (d == 0.5L && std::fmod(f, 2.0L) != 0)) return f + 1;
    return f;
}

// The exact square root of x * 2^-sf, rounded half to even (integer method).
template <class E>
E RefSqrt(long long x, int sf)
{
    if (x < 0) return 0;
    auto isqrt = [](Wide v) {
        Wide r = static_cast<Wide>(std::sqrt(static_cast<long double>(v)));
        while (r * r > v) --r;
        while ((r + 1) * (r + 1) <= v) ++r;
        return r;
    };
    Wide k;
    if (sf <= 0) {
        Wide X = static_cast<Wide>(x) << (-2 * sf);
        k = isqrt(X);
        if (4 * X >= (2 * k + 1) * (2 * k + 1)) ++k;  // no ties: 4X is even
    } else {
        Wide m2 = static_cast<Wide>(1) << (2 * sf);  // (2^sf)^2
        k = isqrt(x) >> sf;
        Wide lhs = 4 * static_cast<Wide>(x), rhs = (2 * k + 1) * (2 * k + 1) * m2;
        if (lhs > rhs || (lhs == rhs && (k & 1))) ++k;
    }
    return Sat<E>(static_cast<long double>(k));
}

template <class E>
E RefExp(long long x, int sf)
{
    long double v = std::ldexp(std::exp(static_cast<long double>(x)), -sf);
    return Sat<E>(RoundEven(v));
}

template <class E>
E RefLn(long long x, int sf)
{
    if (x == 0) return std::numeric_limits<E>::min();
    if (x < 0) return 0;
    return Sat<E>(RoundEven(std::ldexp(std::log(static_cast<long double>(x)), -sf)));
}

template <class T>
T RefUnary(const std::string& g, T x, int sf)
{
    if constexpr (std::is_same_v<T, Pvx32f>) {
        if (g == "Abs") return std::fabs(x);
        if (g == "Sqr") return x * x;
        if (g == "Sqrt") return std::sqrt(x);
        if (g == "Exp") return std::exp(x);
        return std::log(x);
    } else if constexpr (std::is_same_v<T, Pvx32s>) {
        return x >= 0 ? x : static_cast<Pvx32s>(0x80000000u - static_cast<std::uint32_t>(x));
    } else {
        if (g == "Abs") return Sat<T>(std::fabs(static_cast<long double>(x)));
        if (g == "Sqr") return RefScale<T>(static_cast<Wide>(x) * x, sf);
        if (g == "Sqrt") return RefSqrt<T>(x, sf);
        if (g == "Exp") return RefExp<T>(x, sf);
        return RefLn<T>(x, sf);
    }
}

template <class T>
PvxStatus LnStatus(const Member& m, const std::vector<T>& a, const std::vector<T>&, int C)
{
    if (std::string(m.group) != "Ln") return pvxStsNoErr;
    for (std::size_t i = 0; i < a.size(); ++i)
        if (!(m.Alpha() && i % C == 3) && a[i] == 0) return pvxStsDivByZero;
    return pvxStsNoErr;
}

// 32f e^x and ln x are within 1 ulp of the exact value, so within 2 ulp of
// the reference; the other members are exact.
template <class T>
double Tolerance(const std::string& g)
{
    return std::is_same_v<T, Pvx32f> && (g == "Exp" || g == "Ln") ? 0x1p-22 : 0;
}

const char* const kGroups[] = {"Abs", "Sqr", "Sqrt", "Exp", "Ln", "Complement"};

TEST(Unary, EveryMemberEveryScaleFactor)
{
    int n = 0;
    for (const char* g : kGroups)
        for (const Member& m : Members(g)) {
            ++n;
            ForTypes<Pvx8u, Pvx16u, Pvx16s, Pvx32s, Pvx32f>(m.type, [&](auto tag) {
                using T = decltype(tag);
                std::vector<T> none(4);
                int lo = m.Sfs() ? -10 : 0, hi = m.Sfs() ? 20 : 0;
                for (int sf = lo; sf <= hi; ++sf) {
                    ForShapes(m.name, 600 + sf, m.Sfs() ? 3 : 30, [&](Shape s, Rng& rng) {
                        CheckMember<T>(m, s, rng, sf, 1, none, [&](T a, T, int) { return RefUnary<T>(g, a, sf); },
                                       LnStatus<T>, Tolerance<T>(g));
                    }, 50);
                    if (::testing::Test::HasFailure()) return;
                }
            });
            if (::testing::Test::HasFailure()) return;
        }
    EXPECT_EQ(n, 16 + 4 * 32 + 1);
}

// Every value of an integer type once, in rows of 256 (one row for 8u).
template <class T>
struct AllInputs {
    using L = std::numeric_limits<T>;
    static constexpr int kCount = static_cast<int>(L::max()) - L::min() + 1;
    static constexpr int kWidth = kCount >= 256 ? 256 : kCount;
    static constexpr int kStep = kWidth * static_cast<int>(sizeof(T));
    static constexpr PvxiSize kRoi{kWidth, kCount / kWidth};
    std::vector<T> src;
    AllInputs() : src(kCount)
    {
        for (int i = 0; i < kCount; ++i) src[i] = static_cast<T>(L::min() + i);
    }
    PvxStatus Run(PvxStatus (*fn)(const T*, int, T*, int, PvxiSize, int), std::vector<T>& dst, int sf) const
    {
        dst.assign(kCount, T{});
        return fn(src.data(), kStep, dst.data(), kStep, kRoi, sf);
    }
};

// Every input of the integer types at every scale factor from -10 to 20.
template <class T>
void Exhaustive(const char* g, PvxStatus (*fn)(const T*, int, T*, int, PvxiSize, int),
                std::initializer_list<int> extra = {})
{
    const AllInputs<T> in;
    std::vector<T> dst;
    std::vector<int> sfs(extra);
    for (int sf = -10; sf <= 20; ++sf) sfs.push_back(sf);
    for (int sf : sfs) {
        PvxStatus st = in.Run(fn, dst, sf);
        ASSERT_EQ(st, std::string(g) == "Ln" ? pvxStsDivByZero : pvxStsNoErr);
        for (int i = 0; i < in.kCount; ++i)
            ASSERT_EQ(dst[i], RefUnary<T>(g, in.src[i], sf)) << g << " x " << +in.src[i] << " sf " << sf;
    }
}

TEST(Unary, ExhaustiveInputs)
{
    Exhaustive<Pvx8u>("Sqr", pvxiSqr_8u_C1RSfs);
    Exhaustive<Pvx16u>("Sqr", pvxiSqr_16u_C1RSfs);
    Exhaustive<Pvx16s>("Sqr", pvxiSqr_16s_C1RSfs);
    Exhaustive<Pvx8u>("Sqrt", pvxiSqrt_8u_C1RSfs);
    Exhaustive<Pvx16u>("Sqrt", pvxiSqrt_16u_C1RSfs);
    Exhaustive<Pvx16s>("Sqrt", pvxiSqrt_16s_C1RSfs);
    Exhaustive<Pvx8u>("Exp", pvxiExp_8u_C1RSfs);
    Exhaustive<Pvx16u>("Exp", pvxiExp_16u_C1RSfs);
    Exhaustive<Pvx16s>("Exp", pvxiExp_16s_C1RSfs);
    // Ln rounds from single precision unless a value is near a rounding
    // boundary: the scale factors where results have the most bits too
    // (below -16 every 16-bit result above ln 1 saturates).
    Exhaustive<Pvx8u>("Ln", pvxiLn_8u_C1RSfs, {-40, -24, -16, -13});
    Exhaustive<Pvx16u>("Ln", pvxiLn_16u_C1RSfs, {-40, -24, -16, -15, -14, -13, -12, -11});
    Exhaustive<Pvx16s>("Ln", pvxiLn_16s_C1RSfs, {-40, -24, -16, -15, -14, -13, -12, -11});
}

// Exp tables at scale factors far from the usual ones: the non-saturated
// window moves with the scale factor and must stay inside one table.
TEST(Unary, ExpAtLargeScaleFactors)
{
    std::vector<Pvx16s> src(65536), dst(65536);
    for (int i = 0; i < 65536; ++i) src[i] = static_cast<Pvx16s>(i - 32768);
    for (int sf : {-30000, -1000, -60, -25, 25, 60, 200, 1000, 2000, 30000}) {
        ASSERT_EQ(pvxiExp_16s_C1RSfs(src.data(), 512, dst.data(), 512, {256, 256}, sf), pvxStsNoErr);
        for (int i = 0; i < 65536; ++i) {
            int x = src[i];
            if (std::abs(x) > 11000) continue;  // beyond extended precision
            ASSERT_EQ(dst[i], RefExp<Pvx16s>(x, sf)) << "x " << x << " sf " << sf;
        }
    }
}

TEST(Unary, EdgeCases)
{
    Pvx16s a[3] = {-32768, -5, 32767}, d[3];
    ASSERT_EQ(pvxiAbs_16s_C1R(a, 6, d, 6, {3, 1}), pvxStsNoErr);
    EXPECT_EQ(d[0], 32767);
    EXPECT_EQ(d[1], 5);
    Pvx32s c[5] = {-1, -5, std::numeric_limits<Pvx32s>::min(), 0, 7};
    ASSERT_EQ(pvxiComplement_32s_C1IR(c, 20, {5, 1}), pvxStsNoErr);
    EXPECT_EQ(static_cast<std::uint32_t>(c[0]), 0x80000001u);
    EXPECT_EQ(static_cast<std::uint32_t>(c[1]), 0x80000005u);
    EXPECT_EQ(c[2], 0);
    EXPECT_EQ(c[4], 7);
    ASSERT_EQ(pvxiComplement_32s_C1IR(c, 20, {2, 1}), pvxStsNoErr);
    EXPECT_EQ(c[0], -1);
    EXPECT_EQ(c[1], -5);
    Pvx8u z[2] = {0, 1}, lz[2];
    EXPECT_EQ(pvxiLn_8u_C1RSfs(z, 2, lz, 2, {2, 1}, 0), pvxStsDivByZero);
    EXPECT_EQ(lz[0], 0);
    EXPECT_EQ(lz[1], 0);
    float f[2] = {0, 1}, lf[2];
    EXPECT_EQ(pvxiLn_32f_C1R(f, 8, lf, 8, {2, 1}), pvxStsDivByZero);
    EXPECT_EQ(lf[0], -INFINITY);
    Pvx16s s[2] = {-4, 16}, r[2];
    EXPECT_EQ(pvxiSqrt_16s_C1RSfs(s, 4, r, 4, {2, 1}, 0), pvxStsNoErr);
    EXPECT_EQ(r[0], 0);
    EXPECT_EQ(r[1], 4);
}

// 32f e^x and ln x over special and subnormal inputs, and under every rounding
// mode the caller may have set: the same bits as under round-to-nearest, and
// the caller's mode back afterwards.
TEST(Unary, ExpLnSpecialValuesAndCallerRounding)
{
    const float inf = std::numeric_limits<float>::infinity(), nan = std::numeric_limits<float>::quiet_NaN();
    std::vector<float> x = {0.0f, -0.0f, 1.0f, -1.0f, inf, -inf, nan, 0x1p-149f, 0x1p-127f, 0x1.fffffep-127f,
                            0x1p-126f, 88.72283f, 88.7229f, -87.33655f, -95.0f, -100.0f, -103.5f, -103.9f, -104.5f,
                            1e30f, 3.4028235e38f};
    Rng rng = MakeRng(77);
    for (int i = 0; i < 300; ++i)
        x.push_back(std::ldexp(static_cast<float>(RandInt(rng, 1, 1000000)) / 1e6f, RandInt(rng, -30, 30)));
    const int n = static_cast<int>(x.size());
    for (int g = 0; g < 2; ++g) {
        auto run = [&](std::vector<float>& out) {
            out.assign(n, 0);
            int step = n * 4;
            return g ? pvxiLn_32f_C1R(x.data(), step, out.data(), step, {n, 1})
                     : pvxiExp_32f_C1R(x.data(), step, out.data(), step, {n, 1});
        };
        std::vector<float> nearest, got;
        EXPECT_EQ(run(nearest), g ? pvxStsDivByZero : pvxStsNoErr);
        for (int i = 0; i < n; ++i) {
            double want = g ? (x[i] == 0 ? -INFINITY : std::log(static_cast<double>(x[i])))
                            : std::exp(static_cast<double>(x[i]));
            float w = static_cast<float>(want);
            if (std::isnan(want)) {
                EXPECT_TRUE(std::isnan(nearest[i])) << x[i];
            } else if (std::isinf(w) || w == 0) {
                EXPECT_EQ(nearest[i], w) << g << " " << x[i];
            } else {
                EXPECT_NEAR(nearest[i], want, std::fabs(want) * 0x1p-23 + 0x1p-149) << g << " " << x[i];
            }
        }
        for (int mode : {FE_UPWARD, FE_DOWNWARD, FE_TOWARDZERO}) {
            std::fesetround(mode);
            run(got);
            int after = std::fegetround();
            std::fesetround(FE_TONEAREST);
            EXPECT_EQ(after, mode);
            EXPECT_EQ(std::memcmp(got.data(), nearest.data(), 4 * n), 0) << g << " mode " << mode;
        }
        // Flush-to-zero and denormals-are-zero set by the caller change
        // nothing either (subnormal inputs and results above), and stay set.
        const unsigned csr = _mm_getcsr();
        _mm_setcsr(csr | 0x8040u);
        run(got);
        const unsigned after = _mm_getcsr();
        _mm_setcsr(csr);
        EXPECT_EQ(after & 0x8040u, 0x8040u);
        EXPECT_EQ(std::memcmp(got.data(), nearest.data(), 4 * n), 0) << g << " flushing";
    }
}

// The integer members round their own way whatever the caller set: every
// input gives the same result under each rounding mode and under flushing
// as under round-to-nearest (their tables and steps are built per call).
template <class T>
void SameUnderCallerModes(const char* g, PvxStatus (*fn)(const T*, int, T*, int, PvxiSize, int))
{
    const AllInputs<T> in;
    std::vector<T> want, got;
    for (int sf : {-9, -3, -2, -1, 0, 1, 2, 5}) {
        PvxStatus st = in.Run(fn, want, sf);
        for (int mode : {FE_UPWARD, FE_DOWNWARD, FE_TOWARDZERO, -1}) {
            const unsigned csr = _mm_getcsr();
            if (mode < 0) _mm_setcsr(csr | 0x8040u);
            else std::fesetround(mode);
            PvxStatus st2 = in.Run(fn, got, sf);
            _mm_setcsr(csr);
            EXPECT_EQ(st2, st) << g << " sf " << sf << " mode " << mode;
            ASSERT_EQ(got, want) << g << " sf " << sf << " mode " << mode;
        }
    }
}

TEST(Unary, IntegerResultsIgnoreCallerRounding)
{
    SameUnderCallerModes<Pvx8u>("Sqrt", pvxiSqrt_8u_C1RSfs);
    SameUnderCallerModes<Pvx16u>("Sqrt", pvxiSqrt_16u_C1RSfs);
    SameUnderCallerModes<Pvx16s>("Sqrt", pvxiSqrt_16s_C1RSfs);
    SameUnderCallerModes<Pvx8u>("Exp", pvxiExp_8u_C1RSfs);
    SameUnderCallerModes<Pvx16u>("Exp", pvxiExp_16u_C1RSfs);
    SameUnderCallerModes<Pvx16s>("Exp", pvxiExp_16s_C1RSfs);
    SameUnderCallerModes<Pvx8u>("Ln", pvxiLn_8u_C1RSfs);
    SameUnderCallerModes<Pvx16u>("Ln", pvxiLn_16u_C1RSfs);
    SameUnderCallerModes<Pvx16s>("Ln", pvxiLn_16s_C1RSfs);
}

TEST(Unary, CheckOrders)
{
    for (const char* g : kGroups)
        for (const Member& m : Members(g))
            ForTypes<Pvx8u, Pvx16u, Pvx16s, Pvx32s, Pvx32f>(m.type, [&](auto tag) {
                using T = decltype(tag);
                std::vector<T> none(4);
                bool stepsFirst = std::string(g) == "Sqrt" && std::string(m.type) == "32f";
                CheckOrder<T>(m, stepsFirst, none);
            });
}

}  // namespace
