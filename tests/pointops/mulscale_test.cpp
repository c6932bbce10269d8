// MulScale, MulCScale: every member against floor(a * b / M), every 8u pair,
// the documented edge cases and the steps-before-sizes check order.
#include <limits>

#include "arith_members.h"

namespace {

using namespace pvxtest;

template <class T>
T RefMulScale(T a, T b)
{
    unsigned long long m = std::numeric_limits<T>::max();
    return static_cast<T>(static_cast<unsigned long long>(a) * b / m);
}

TEST(MulScale, EveryMemberAgainstReference)
{
    int n = 0;
    for (const char* g : {"MulScale", "MulCScale"})
        for (const Member& m : Members(g)) {
            ++n;
            ForTypes<Pvx8u, Pvx16u>(m.type, [&](auto tag) {
                using T = decltype(tag);
                Rng vr = MakeRng(12);
                std::vector<T> value(4);
                for (auto& v : value) v = RandomElem<T>(vr);
                ForShapes(m.name, 500, 24, [&](Shape s, Rng& rng) {
                    CheckMember<T>(m, s, rng, 0, 1, value, [](T a, T b, int) { return RefMulScale(a, b); });
                });
            });
        }
    EXPECT_EQ(n, 32);
}

TEST(MulScale, Every8uPair)
{
    std::vector<Pvx8u> a(65536), b(65536), d(65536);
    for (int i = 0; i < 65536; ++i) {
        a[i] = static_cast<Pvx8u>(i & 255);
        b[i] = static_cast<Pvx8u>(i >> 8);
    }
    ASSERT_EQ(pvxiMulScale_8u_C1R(a.data(), 256, b.data(), 256, d.data(), 256, {256, 256}), pvxStsNoErr);
    for (int i = 0; i < 65536; ++i) ASSERT_EQ(d[i], a[i] * b[i] / 255) << +a[i] << " * " << +b[i];
}

TEST(MulScale, Products16uAroundMultiplesOfTheMaximum)
{
    // the pairs whose product lies next to a multiple of 65535
    std::vector<Pvx16u> a, b;
    for (unsigned x : {1u, 2u, 3u, 5u, 255u, 256u, 257u, 32767u, 32768u, 65534u, 65535u})
        for (unsigned y = 0; y < 65536; y += 97) {
            a.push_back(static_cast<Pvx16u>(x));
            b.push_back(static_cast<Pvx16u>(y));
        }
    std::vector<Pvx16u> d(a.size());
    int w = static_cast<int>(a.size());
    ASSERT_EQ(pvxiMulScale_16u_C1R(a.data(), 2 * w, b.data(), 2 * w, d.data(), 2 * w, {w, 1}), pvxStsNoErr);
    for (int i = 0; i < w; ++i) ASSERT_EQ(d[i], RefMulScale(a[i], b[i])) << a[i] << " * " << b[i];
}

TEST(MulScale, EdgeCases)
{
    Pvx8u a[3] = {128, 255, 200}, b[3] = {1, 255, 200}, d[3];
    ASSERT_EQ(pvxiMulScale_8u_C1R(a, 3, b, 3, d, 3, {3, 1}), pvxStsNoErr);
    EXPECT_EQ(d[0], 0);
    EXPECT_EQ(d[1], 255);
    EXPECT_EQ(d[2], 156);
    Pvx8u one[1] = {1}, full[1] = {255};
    ASSERT_EQ(pvxiMulScale_8u_C1R(full, 1, one, 1, d, 1, {1, 1}), pvxStsNoErr);
    EXPECT_EQ(d[0], 1);
    Pvx16u u[2] = {65535, 32768}, v[2] = {65535, 1}, du[2];
    ASSERT_EQ(pvxiMulScale_16u_C1R(u, 4, v, 4, du, 4, {2, 1}), pvxStsNoErr);
    EXPECT_EQ(du[0], 65535);
    EXPECT_EQ(du[1], 0);
}

TEST(MulScale, CheckOrderStepsBeforeSizes)
{
    for (const char* g : {"MulScale", "MulCScale"})
        for (const Member& m : Members(g))
            ForTypes<Pvx8u, Pvx16u>(m.type, [&](auto tag) {
                using T = decltype(tag);
                std::vector<T> value(4, T(3));
                CheckOrder<T>(m, true, value);
            });
}

}  // namespace
