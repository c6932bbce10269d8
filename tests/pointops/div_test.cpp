// Div, DivC, Div_Round: every member against an exact wide-integer reference
// (scale factors -10 to 20 and the extremes, every rounding mode), Div_32f against its
// documented group rule, check orders, zero divisors and constants.
#include <xmmintrin.h>

#include <bit>
#include <climits>
#include <cmath>
#include <limits>

#include "arith_members.h"

namespace {

using namespace pvxtest;
__extension__ typedef __int128 Wide;

// num * 2^-sf / den, rounded by mode (0 toward zero, 1 half to even, 2 half
// away), saturated to E; over zero: E's maximum, minimum or 0 by the sign of num.
template <class E>
E RefQuot(Wide num, Wide den, int sf, int mode)
{
    using L = std::numeric_limits<E>;
    if (den == 0) return num > 0 ? L::max() : num < 0 ? L::min() : E{};
    if (den < 0) {
        num = -num;
        den = -den;
    }
    // |num| < 2^64 and den >= 1: beyond 2^100 every value rounds to 0 or
    // saturates.
    if (sf > 100) return E{};
    if (sf < -100) return num > 0 ? L::max() : num < 0 ? L::min() : E{};
    if (sf >= 0) den <<= sf;
    else num <<= -sf;
    Wide q = num / den, r = num % den;
    Wide twice = 2 * (r < 0 ? -r : r);
    bool up = mode != 0 && (twice > den || (twice == den && (mode == 2 || q % 2 != 0)));
    if (up) q += num < 0 ? -1 : 1;
    if (q < static_cast<Wide>(L::min())) return L::min();
    if (q > static_cast<Wide>(L::max())) return L::max();
    return static_cast<E>(q);
}

template <class T>
bool IsZero(const T& v)
{
    if constexpr (Elem<T>::kParts == 2) return v.re == 0 && v.im == 0;
    else return v == 0;
}

// Expected status of Div: 6 when a processed divisor (the first image) is 0.
template <class T>
PvxStatus DivStatus(const Member& m, const std::vector<T>& a, const std::vector<T>&, int C)
{
    if (m.Const()) return pvxStsNoErr;
    for (std::size_t i = 0; i < a.size(); ++i)
        if (!(m.Alpha() && i % C == 3) && IsZero(a[i])) return pvxStsDivByZero;
    return pvxStsNoErr;
}

float OverZero(float n)
{
    if (n > 0) return INFINITY;
    if (n < 0) return -INFINITY;
    return std::bit_cast<float>(0x7FC00000u);
}

float RcpQuot(float n, float d)
{
    float r = _mm_cvtss_f32(_mm_rcp_ss(_mm_set_ss(d)));
    float q = n * r;
    float e = 1.0f - d * r;
    return q + (e * q + q) * e;
}

// The quotient num / den of one element or pixel of type T (num: dividend).
template <class T>
T RefDiv(const T& num, const T& den, int sf, int mode)
{
    if constexpr (std::is_same_v<T, Pvx32f>) {
        return den == 0 ? OverZero(num) : num / den;
    } else if constexpr (std::is_same_v<T, Pvx32fc>) {
        if (den.re == 0 && den.im == 0) return {OverZero(num.re), OverZero(num.im)};
        float m = den.re * den.re + den.im * den.im;
        return {(num.re * den.re + num.im * den.im) / m, (num.im * den.re - num.re * den.im) / m};
    } else if constexpr (Elem<T>::kParts == 2) {
        using E = ElemT<T>;
        Wide a = num.re, b = num.im, c = den.re, d = den.im, m = c * c + d * d;
        if (m == 0) return {RefQuot<E>(a, 0, sf, mode), RefQuot<E>(b, 0, sf, mode)};
        return {RefQuot<E>(a * c + b * d, m, sf, mode), RefQuot<E>(b * c - a * d, m, sf, mode)};
    } else {
        return RefQuot<T>(num, den, sf, mode);
    }
}

bool IsInt(const Member& m)
{
    std::string t = m.type;
    return t != "32f" && t != "32fc";
}

// A random constant for one channel: never zero, extremes over-represented.
template <class T>
T RandomNonZero(Rng& rng)
{
    T v;
    do {
        if constexpr (Elem<T>::kParts == 2) v = {RandomElem<ElemT<T>>(rng), RandomElem<ElemT<T>>(rng)};
        else v = RandomElem<T>(rng);
    } while (IsZero(v));
    return v;
}

// -10 to 20, and the extremes, where the scale alone decides (a scalar tail
// must not negate INT_MIN).
std::vector<int> ScaleFactors()
{
    std::vector<int> sfs;
    for (int sf = -10; sf <= 20; ++sf) sfs.push_back(sf);
    for (int sf : {-40, 40, INT_MIN, INT_MIN + 1, INT_MAX}) sfs.push_back(sf);
    return sfs;
}

TEST(Div, IntegerMembersEveryScaleFactorAndMode)
{
    std::vector<Member> ms = Members("Div");
    for (const Member& m : Members("Div_Round")) ms.push_back(m);
    int n = 0;
    for (const Member& m : ms) {
        if (!IsInt(m)) continue;
        ++n;
        ForTypeCode(m.type, [&](auto tag) {
            using T = decltype(tag);
            std::vector<int> modes = m.Rounding() ? std::vector<int>{0, 1, 2} : std::vector<int>{1};
            for (int mode : modes)
                for (int sf : ScaleFactors()) {
                    std::vector<T> value(4);
                    ForShapes(m.name, 1000 + (sf % 1000) * 7 + mode, 3, [&](Shape s, Rng& rng) {
                        CheckMember<T>(m, s, rng, sf, mode, value,
                                       [&](T a, T b, int) { return RefDiv<T>(b, a, sf, mode); }, DivStatus<T>);
                    }, 40);
                    if (::testing::Test::HasFailure()) return;
                }
        });
        if (::testing::Test::HasFailure()) return;
    }
    EXPECT_EQ(n, 24 + 12 + 24);
}

TEST(DivC, IntegerMembersEveryScaleFactor)
{
    int n = 0;
    for (const Member& m : Members("DivC")) {
        if (!IsInt(m)) continue;
        ++n;
        ForTypeCode(m.type, [&](auto tag) {
            using T = decltype(tag);
            Rng vr = MakeRng(31);
            for (int sf : ScaleFactors()) {
                std::vector<T> value(4);
                for (auto& v : value) v = RandomNonZero<T>(vr);
                ForShapes(m.name, 2000 + sf % 1000, 3, [&](Shape s, Rng& rng) {
                    CheckMember<T>(m, s, rng, sf, 1, value,
                                   [&](T a, T c, int) { return RefDiv<T>(a, c, sf, 1); });
                }, 40);
                if (::testing::Test::HasFailure()) return;
            }
        });
        if (::testing::Test::HasFailure()) return;
    }
    EXPECT_EQ(n, 24 + 12);
}

// Div_32f: groups of four elements from the start of each row (AC4: pixels,
// alpha divisors ignored); the last (width*C) mod 4 elements are groups of one.
std::vector<float> RefDiv32fRow(const float* d, const float* n, const float* old, int width, int C, bool alpha)
{
    int count = width * C;
    std::vector<float> out(old, old + count);
    int full = alpha ? count : count - count % 4;
    for (int g = 0; g < count; g += (g < full ? 4 : 1)) {
        int len = g < full ? 4 : 1;
        bool zero = false;
        for (int j = g; j < g + len; ++j)
            if (!(alpha && j % 4 == 3) && d[j] == 0) zero = true;
        for (int j = g; j < g + len; ++j) {
            if (alpha && j % 4 == 3) continue;
            out[j] = zero ? (d[j] == 0 ? OverZero(n[j]) : n[j] / d[j]) : RcpQuot(n[j], d[j]);
        }
    }
    return out;
}

TEST(Div, Float32GroupsOfFour)
{
    for (const Member& m : Members("Div")) {
        if (std::string(m.type) != "32f") continue;
        const int C = m.Channels();
        ForShapes(m.name, 3000, 30, [&](Shape s, Rng& rng) {
            GuardedImage a = MakeImage<float>(s.width, s.height, C, rng);
            GuardedImage b = MakeImage<float>(s.width, s.height, C, rng);
            GuardedImage d = MakeImage<float>(s.width, s.height, C, rng);
            GuardedImage* out = m.InPlace() ? &b : &d;
            std::vector<float> want;
            bool zero = false;
            for (int y = 0; y < s.height; ++y) {
                auto r = RefDiv32fRow(a.row<float>(y), b.row<float>(y), out->row<float>(y), s.width, C, m.Alpha());
                want.insert(want.end(), r.begin(), r.end());
                for (int j = 0; j < s.width * C; ++j)
                    if (!(m.Alpha() && j % 4 == 3) && a.row<float>(y)[j] == 0) zero = true;
            }
            CallArgs<float> x = ArgsOver<float>(a, &b, d, {s.width, s.height});
            EXPECT_EQ(Invoke<float>(m, x), zero ? pvxStsDivByZero : pvxStsNoErr);
            EXPECT_TRUE(RegionEquals(*out, want));
            EXPECT_TRUE(a.Unchanged());
        });
    }
}

TEST(Div, Float32ContiguousRowsKeepTheirGroups)
{
    // width 5: a group of four and a group of one per row; a zero in the
    // group of one must not send the next row's first group to exact division.
    const int w = 5, h = 4;
    std::vector<float> d(w * h), n(w * h), a(w * h), b(w * h);
    Rng rng = MakeRng(4);
    for (int i = 0; i < w * h; ++i) {
        d[i] = 3.0f + static_cast<float>(RandInt(rng, 0, 1000)) / 7;
        n[i] = static_cast<float>(RandInt(rng, -1000, 1000)) / 3;
    }
    d[4] = 0;
    ASSERT_EQ(pvxiDiv_32f_C1R(d.data(), w * 4, n.data(), w * 4, a.data(), w * 4, {w, h}), pvxStsDivByZero);
    for (int y = 0; y < h; ++y)
        pvxiDiv_32f_C1R(d.data() + w * y, w * 4, n.data() + w * y, w * 4, b.data() + w * y, w * 4, {w, 1});
    EXPECT_EQ(0, std::memcmp(a.data(), b.data(), a.size() * 4));
    EXPECT_EQ(a[5], RcpQuot(n[5], d[5]));
}

TEST(Div, FloatAndComplexFloatMembers)
{
    for (const char* g : {"Div", "DivC"}) {
        for (const Member& m : Members(g)) {
            std::string t = m.type;
            if (t != "32fc" && !(t == "32f" && m.Const())) continue;
            ForTypeCode(m.type, [&](auto tag) {
                using T = decltype(tag);
                Rng vr = MakeRng(5);
                std::vector<T> value(4);
                for (auto& v : value) v = RandomNonZero<T>(vr);
                ForShapes(m.name, 4000, 12, [&](Shape s, Rng& rng) {
                    if (m.Const())
                        CheckMember<T>(m, s, rng, 0, 1, value, [&](T a, T c, int) { return RefDiv<T>(a, c, 0, 1); });
                    else
                        CheckMember<T>(m, s, rng, 0, 1, value, [&](T a, T b, int) { return RefDiv<T>(b, a, 0, 1); },
                                       DivStatus<T>);
                }, 60);
            });
        }
    }
}

TEST(Div, Float32EdgeCases)
{
    float d[8] = {0, 0, 0, 4, 4, 4, 4, 4}, n[8] = {5, -5, 0, 2, 2, 2, 2, 2}, q[8];
    ASSERT_EQ(pvxiDiv_32f_C1R(d, 32, n, 32, q, 32, {8, 1}), pvxStsDivByZero);
    EXPECT_EQ(q[0], INFINITY);
    EXPECT_EQ(q[1], -INFINITY);
    EXPECT_EQ(std::bit_cast<std::uint32_t>(q[2]), 0x7FC00000u);
    EXPECT_EQ(q[3], 0.5f);
    EXPECT_EQ(q[4], 0.5f);
    float nanDividend = std::bit_cast<float>(0xFFC01234u);
    float d2[1] = {0}, n2[1] = {nanDividend};
    ASSERT_EQ(pvxiDiv_32f_C1R(d2, 4, n2, 4, q, 4, {1, 1}), pvxStsDivByZero);
    EXPECT_EQ(std::bit_cast<std::uint32_t>(q[0]), 0x7FC00000u);
    EXPECT_EQ(pvxiDiv_32f_C1R(d + 3, 20, n + 3, 20, q, 20, {5, 1}), pvxStsNoErr);
}

TEST(Div, Float32NonFiniteDivisorsAndOneZeroAmongSixteen)
{
    // Infinite and NaN divisors are not zero: their groups keep the refined
    // quotient. A single zero anywhere among sixteen elements sends only its
    // own group to exact division.
    const float special[] = {INFINITY, -INFINITY, NAN, 0.0f, -0.0f};
    for (float s : special) {
        for (int at = 0; at < 16; ++at) {
            float d[16], n[16], q[16];
            for (int j = 0; j < 16; ++j) {
                d[j] = 0.75f + 3 * j;
                n[j] = -40.0f + 7 * j;
            }
            d[at] = s;
            ASSERT_EQ(pvxiDiv_32f_C1R(d, 64, n, 64, q, 64, {16, 1}), s == 0 ? pvxStsDivByZero : pvxStsNoErr);
            for (int j = 0; j < 16; ++j) {
                bool exact = s == 0 && j / 4 == at / 4;
                float want = exact ? (d[j] == 0 ? OverZero(n[j]) : n[j] / d[j]) : RcpQuot(n[j], d[j]);
                if (std::isnan(want)) EXPECT_TRUE(std::isnan(q[j])) << s << " " << at << " " << j;
                else EXPECT_EQ(q[j], want) << s << " " << at << " " << j;
            }
        }
    }
}

TEST(Div, IntegerZeroDivisorAndExtremeScaleFactors)
{
    Pvx8u d[4] = {0, 0, 0, 1}, n[4] = {7, 0, 255, 255}, q[4];
    EXPECT_EQ(pvxiDiv_8u_C1RSfs(d, 4, n, 4, q, 4, {4, 1}, 0), pvxStsDivByZero);
    EXPECT_EQ(q[0], 255);
    EXPECT_EQ(q[1], 0);
    EXPECT_EQ(q[3], 255);
    Pvx16s ds[3] = {0, 0, 0}, ns[3] = {-3, 3, 0}, qs[3];
    for (int sf : {-1000, -40, 0, 40, 1000}) {
        EXPECT_EQ(pvxiDiv_16s_C1RSfs(ds, 6, ns, 6, qs, 6, {3, 1}, sf), pvxStsDivByZero);
        EXPECT_EQ(qs[0], -32768);
        EXPECT_EQ(qs[1], 32767);
        EXPECT_EQ(qs[2], 0);
    }
    Pvx16u du[2] = {65535, 3}, nu[2] = {1, 65535}, qu[2];
    EXPECT_EQ(pvxiDiv_16u_C1RSfs(du, 4, nu, 4, qu, 4, {2, 1}, -1000), pvxStsNoErr);
    EXPECT_EQ(qu[0], 65535);
    EXPECT_EQ(pvxiDiv_16u_C1RSfs(du, 4, nu, 4, qu, 4, {2, 1}, 1000), pvxStsNoErr);
    EXPECT_EQ(qu[0], 0);
    EXPECT_EQ(qu[1], 0);
    EXPECT_EQ(pvxiDiv_16u_C1RSfs(du, 4, nu, 4, qu, 4, {2, 1}, -16), pvxStsNoErr);
    EXPECT_EQ(qu[0], 1);  // 65536 / 65535 rounds to 1
    Pvx32sc dc[1] = {{0, 0}}, nc[1] = {{-5, 9}}, qc[1];
    EXPECT_EQ(pvxiDiv_32sc_C1RSfs(dc, 8, nc, 8, qc, 8, {1, 1}, 3), pvxStsDivByZero);
    EXPECT_EQ(qc[0].re, std::numeric_limits<Pvx32s>::min());
    EXPECT_EQ(qc[0].im, std::numeric_limits<Pvx32s>::max());
}

// 16sc quotients: every pairing of parts from the extremes (numerators and
// divisors that fill 32 bits, zero divisors) at every scale factor where
// results differ, and small dividends over large divisors, whose quotients
// stay below saturation far down the negative scale factors.
TEST(Div, ComplexExtremes16sc)
{
    std::vector<Pvx16sc> den, num;
    AppendExtremePairs(den, num);
    Rng rng = MakeRng(21);
    for (int i = 0; i < 4000; ++i) {
        den.push_back({RandomElem<Pvx16s>(rng), RandomElem<Pvx16s>(rng)});
        const int top = 1 << RandInt(rng, 0, 12);
        num.push_back({static_cast<Pvx16s>(RandInt(rng, -top, top)), static_cast<Pvx16s>(RandInt(rng, -top, top))});
    }
    const int n = static_cast<int>(den.size());
    std::vector<Pvx16sc> q(n);
    for (int sf = -50; sf <= 34; ++sf) {
        SCOPED_TRACE(sf);
        ASSERT_EQ(pvxiDiv_16sc_C1RSfs(den.data(), 4 * n, num.data(), 4 * n, q.data(), 4 * n, {n, 1}, sf),
                  pvxStsDivByZero);
        for (int i = 0; i < n; ++i) {
            Pvx16sc want = RefDiv<Pvx16sc>(num[i], den[i], sf, 1);
            ASSERT_TRUE(q[i].re == want.re && q[i].im == want.im)
                << i << ": (" << num[i].re << ", " << num[i].im << ") / (" << den[i].re << ", " << den[i].im << ")";
        }
    }
}

// The integer rules are exact whatever rounding the caller has set: quotients
// that lie close to a rounding boundary, under each directed mode, and the
// caller's mode back after the call.
TEST(Div, IntegerResultsIgnoreTheCallersRoundingMode)
{
    const unsigned saved = _MM_GET_ROUNDING_MODE();
    for (unsigned mode : {_MM_ROUND_DOWN, _MM_ROUND_UP, _MM_ROUND_TOWARD_ZERO}) {
        std::vector<Pvx16u> d(16, 271), n(16, 48798), q(16);
        for (int i = 8; i < 16; ++i) {
            d[i] = 255;
            n[i] = 65534;
        }
        _MM_SET_ROUNDING_MODE(mode);
        PvxStatus plain = pvxiDiv_16u_C1RSfs(d.data(), 32, n.data(), 32, q.data(), 32, {16, 1}, -7);
        std::vector<Pvx16u> even = q;
        PvxStatus away = pvxiDiv_Round_16u_C1RSfs(d.data(), 32, n.data(), 32, q.data(), 32, {16, 1}, 2, -7);
        PvxStatus byConst = pvxiDivC_16u_C1RSfs(n.data(), 32, 271, q.data(), 32, {8, 1}, -7);
        unsigned after = _MM_GET_ROUNDING_MODE();
        _MM_SET_ROUNDING_MODE(saved);
        EXPECT_EQ(after, mode);
        EXPECT_EQ(plain, pvxStsNoErr);
        EXPECT_EQ(away, pvxStsNoErr);
        EXPECT_EQ(byConst, pvxStsNoErr);
        for (int i = 0; i < 16; ++i) EXPECT_EQ(even[i], (RefQuot<Pvx16u>(n[i], d[i], -7, 1))) << mode << " " << i;
        for (int i = 0; i < 8; ++i) EXPECT_EQ(q[i], (RefQuot<Pvx16u>(48798, 271, -7, 1))) << mode << " " << i;
        for (int i = 8; i < 16; ++i) EXPECT_EQ(q[i], (RefQuot<Pvx16u>(n[i], d[i], -7, 2))) << mode << " " << i;
    }
}

// Every 8u dividend and divisor at every scale factor and rounding mode.
TEST(Div, Exhaustive8u)
{
    std::vector<Pvx8u> d(65536), n(65536), q(65536);
    for (int i = 0; i < 65536; ++i) {
        d[i] = static_cast<Pvx8u>(i & 255);
        n[i] = static_cast<Pvx8u>(i >> 8);
    }
    for (int mode = 0; mode <= 2; ++mode)
        for (int sf = -10; sf <= 20; ++sf) {
            ASSERT_EQ(pvxiDiv_Round_8u_C1RSfs(d.data(), 256, n.data(), 256, q.data(), 256, {256, 256}, mode, sf),
                      pvxStsDivByZero);
            for (int i = 0; i < 65536; ++i)
                ASSERT_EQ(q[i], RefQuot<Pvx8u>(n[i], d[i], sf, mode)) << "n " << +n[i] << " d " << +d[i] << " sf " << sf
                                                                      << " mode " << mode;
        }
}

// A dividend x in [0, d) whose quotient x 2^-sf / d lies 1 / (2 d) from a
// half-integer, above it for r = 1 and below for r = -1 (odd d > 1, sf < 0):
// 2^(1-sf) x = r (mod d).
int NearTieDividend(int d, int sf, int r)
{
    long long m = 1;
    for (int i = 0; i < 1 - sf; ++i) m = m * 2 % d;
    const long long want = (r % d + d) % d;
    for (int x = 0; x < d; ++x)
        if (m * x % d == want) return x;
    return 0;
}

// 16-bit quotients near rounding boundaries: dividends and divisors chosen so
// that many quotients are ties or one step off a tie. Below scale factor 0
// half of them are the closest non-ties that a scaled quotient can be, with
// divisors up to 1023 and quotients up to the saturation point.
TEST(Div, SixteenBitRoundingBoundaries)
{
    Rng rng = MakeRng(11);
    const int N = 4096;
    std::vector<Pvx16s> d(N), n(N), q(N);
    std::vector<Pvx16u> du(N), nu(N), qu(N);
    for (int sf = -10; sf <= 20; ++sf) {
        for (int i = 0; i < N; ++i) {
            int dv = RandInt(rng, 1, 300) * (RandInt(rng, 0, 1) ? 1 : -1);
            int k = RandInt(rng, -100, 100);
            int nv = (2 * k + 1) * dv / 2 + RandInt(rng, -1, 1);  // near a half-integer quotient
            if (sf > 0) nv = (nv << std::min(sf, 8)) + RandInt(rng, -1, 1);
            d[i] = static_cast<Pvx16s>(dv);
            n[i] = static_cast<Pvx16s>(std::clamp(nv, -32768, 32767));
            du[i] = static_cast<Pvx16u>(std::abs(dv));
            nu[i] = static_cast<Pvx16u>(std::clamp(std::abs(nv) * 2 + RandInt(rng, -1, 1), 0, 65535));
            if (sf < 0 && RandInt(rng, 0, 1)) {
                const int dd = 2 * RandInt(rng, 1, 511) + 1, r = RandInt(rng, 0, 1) ? 1 : -1;
                const int x = NearTieDividend(dd, sf, r);
                // the largest dividend whose quotient is not saturated
                const int top16u = static_cast<int>(std::min<long long>(65535, (65535LL * dd) >> -sf));
                const int top16s = static_cast<int>(std::min<long long>(32767, (32767LL * dd) >> -sf));
                du[i] = static_cast<Pvx16u>(dd);
                nu[i] = static_cast<Pvx16u>(x + dd * RandInt(rng, 0, std::max(0, top16u - x) / dd));
                d[i] = static_cast<Pvx16s>(RandInt(rng, 0, 1) ? dd : -dd);
                const int ns = x + dd * RandInt(rng, 0, std::max(0, top16s - x) / dd);
                n[i] = static_cast<Pvx16s>(RandInt(rng, 0, 1) ? ns : -ns);
            }
        }
        for (int mode = 0; mode <= 2; ++mode) {
            ASSERT_EQ(pvxiDiv_Round_16s_C1RSfs(d.data(), 2 * N, n.data(), 2 * N, q.data(), 2 * N, {N, 1}, mode, sf), 0);
            ASSERT_EQ(pvxiDiv_Round_16u_C1RSfs(du.data(), 2 * N, nu.data(), 2 * N, qu.data(), 2 * N, {N, 1}, mode, sf), 0);
            for (int i = 0; i < N; ++i) {
                ASSERT_EQ(q[i], RefQuot<Pvx16s>(n[i], d[i], sf, mode)) << n[i] << "/" << d[i] << " sf " << sf;
                ASSERT_EQ(qu[i], RefQuot<Pvx16u>(nu[i], du[i], sf, mode)) << nu[i] << "/" << du[i] << " sf " << sf;
            }
        }
    }
}

TEST(Div, CheckOrders)
{
    for (const char* g : {"Div", "DivC", "Div_Round"})
        for (const Member& m : Members(g))
            ForTypeCode(m.type, [&](auto tag) {
                using T = decltype(tag);
                Rng vr = MakeRng(3);
                std::vector<T> value(4);
                for (auto& v : value) v = RandomNonZero<T>(vr);
                CheckOrder<T>(m, false, value);
            });
}

TEST(DivC, ZeroConstantAfterFrameChecks)
{
    for (const Member& m : Members("DivC"))
        ForTypeCode(m.type, [&](auto tag) {
            using T = decltype(tag);
            SCOPED_TRACE(m.name);
            Rng rng = MakeRng(8);
            const int C = m.Channels();
            GuardedImage a = MakeImage<T>(6, 2, C, rng), d = MakeImage<T>(6, 2, C, rng);
            for (int zeroAt = 0; zeroAt < m.Processed(); ++zeroAt) {
                std::vector<T> value(4);
                for (auto& v : value) v = RandomNonZero<T>(rng);
                value[zeroAt] = T{};
                if (m.Sig().rfind("C1", 0) == 0 && zeroAt > 0) break;
                CallArgs<T> x = ArgsOver<T>(a, nullptr, d, {6, 2});
                x.value = value.data();
                EXPECT_TRUE(NothingWritten(Invoke<T>(m, x), pvxStsDivByZeroErr, a, d));
                x.aStep = 0;
                EXPECT_TRUE(NothingWritten(Invoke<T>(m, x), pvxStsStepErr, a, d));
            }
            // the alpha channel of an AC4 constant is not part of it
            if (m.Alpha()) {
                std::vector<T> value(4);
                for (auto& v : value) v = RandomNonZero<T>(rng);
                value[3] = T{};
                CallArgs<T> x = ArgsOver<T>(a, nullptr, d, {6, 2});
                x.value = value.data();
                EXPECT_EQ(Invoke<T>(m, x), pvxStsNoErr);
            }
        });
}

TEST(Div_Round, ModeCheckedAfterFrame)
{
    for (const Member& m : Members("Div_Round"))
        ForTypeCode(m.type, [&](auto tag) {
            using T = decltype(tag);
            SCOPED_TRACE(m.name);
            Rng rng = MakeRng(9);
            const int C = m.Channels();
            GuardedImage a = MakeImage<T>(6, 2, C, rng), b = MakeImage<T>(6, 2, C, rng), d = MakeImage<T>(6, 2, C, rng);
            CallArgs<T> x = ArgsOver<T>(a, &b, d, {6, 2});
            for (int mode : {3, -1, 100}) {
                x.mode = mode;
                EXPECT_TRUE(NothingWritten(Invoke<T>(m, x), pvxStsRoundModeNotSupportedErr, a, b, d));
                CallArgs<T> y = x;
                y.bStep = 0;
                EXPECT_TRUE(NothingWritten(Invoke<T>(m, y), pvxStsStepErr, a, b, d));
                y = x;
                y.roi = {0, 2};
                EXPECT_TRUE(NothingWritten(Invoke<T>(m, y), pvxStsSizeErr, a, b, d));
                y = x;
                y.a = nullptr;
                EXPECT_TRUE(NothingWritten(Invoke<T>(m, y), pvxStsNullPtrErr, a, b, d));
            }
        });
    Pvx8u s1[1] = {2}, s2[1] = {5}, q[1];
    EXPECT_EQ(pvxiDiv_Round_8u_C1RSfs(s1, 1, s2, 1, q, 1, {1, 1}, 3, 0), pvxStsRoundModeNotSupportedErr);
    EXPECT_EQ(pvxiDiv_Round_8u_C1RSfs(s1, 1, s2, 1, q, 1, {1, 1}, 0, 0), 0);
    EXPECT_EQ(q[0], 2);
    EXPECT_EQ(pvxiDiv_Round_8u_C1RSfs(s1, 1, s2, 1, q, 1, {1, 1}, 1, 0), 0);
    EXPECT_EQ(q[0], 2);
    EXPECT_EQ(pvxiDiv_Round_8u_C1RSfs(s1, 1, s2, 1, q, 1, {1, 1}, 2, 0), 0);
    EXPECT_EQ(q[0], 3);
}

}  // namespace
