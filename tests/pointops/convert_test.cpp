// Convert from float with a rounding mode, against a scalar reference.
#include <xmmintrin.h>

#include <cmath>

#include "harness.h"

namespace {

using namespace pvxtest;

// Reference: clamp to [0, 255] with NaN as 0, then round by the mode in double
// arithmetic.
Pvx8u RefConvert8u(float v, int mode)
{
    double x = std::isnan(v) ? 0.0 : std::fmin(std::fmax(static_cast<double>(v), 0.0), 255.0);
    double r;
    if (mode == 0) r = std::trunc(x);
    else if (mode == 1) r = x - std::floor(x) == 0.5 ? (std::fmod(std::floor(x), 2) == 0 ? std::floor(x) : std::ceil(x)) : std::round(x);
    else r = std::floor(x + 0.5);  // x >= 0: half away from zero
    return static_cast<Pvx8u>(r);
}

TEST(Convert, Float8uEveryModeAgainstReference)
{
    for (int mode : {0, 1, 2, 3, -1, 77}) {
        ForShapes("pvxiConvert_32f8u_C1R", 100 + mode, 40, [&](Shape s, Rng& rng) {
            GuardedImage src = MakeImage<Pvx32f>(s.width, s.height, 1, rng);
            // a few specials and exact ties
            Pvx32f* r0 = src.row<Pvx32f>(0);
            const float specials[] = {NAN, INFINITY, -INFINITY, 0.5f, 1.5f, 2.5f, 254.5f, 255.5f, 0.49999997f, -0.5f, 1e10f, -1e10f};
            for (int i = 0; i < s.width && i < 12; ++i) r0[i] = specials[RandInt(rng, 0, 11)];
            src.Snapshot();
            GuardedImage dst = MakeImage<Pvx8u>(s.width, s.height, 1, rng);
            auto in = src.Packed<Pvx32f>();
            std::vector<Pvx8u> want(in.size());
            for (std::size_t i = 0; i < in.size(); ++i) want[i] = RefConvert8u(in[i], mode);
            ASSERT_EQ(pvxiConvert_32f8u_C1R(src.ptr<Pvx32f>(), src.step(), dst.ptr<Pvx8u>(), dst.step(),
                                            {s.width, s.height}, mode),
                      pvxStsNoErr);
            EXPECT_TRUE(RegionEquals(dst, want));
            EXPECT_TRUE(src.Unchanged());
        });
    }
}

TEST(Convert, ContiguousRowsGiveTheSameResult)
{
    Rng rng = MakeRng(5);
    std::vector<Pvx32f> src(37 * 5);
    FillRandom(src.data(), src.size(), rng);
    std::vector<Pvx8u> a(37 * 5), b(37 * 5);
    ASSERT_EQ(pvxiConvert_32f8u_C1R(src.data(), 37 * 4, a.data(), 37, {37, 5}, 1), pvxStsNoErr);
    for (int y = 0; y < 5; ++y)
        ASSERT_EQ(pvxiConvert_32f8u_C1R(src.data() + 37 * y, 37 * 4, b.data() + 37 * y, 37, {37, 1}, 1), pvxStsNoErr);
    EXPECT_EQ(a, b);
}

TEST(Convert, RestoresTheCallersRoundingControl)
{
    unsigned before = _mm_getcsr();
    float src[3] = {0.5f, 1.5f, 2.5f};
    Pvx8u dst[3];
    // The results follow the mode, not the caller's control: 19 elements run
    // a whole step and one overlapping it, 11 and 6 two parts of 8 and of 4,
    // 3 the scalar path.
    float ties[19];
    Pvx8u got[19];
    for (int i = 0; i < 19; ++i) ties[i] = static_cast<float>(i % 7) + (i % 3 == 0 ? 0.5f : i % 3 == 1 ? 0.25f : 0.75f);
    for (unsigned rc : {0x0000u, 0x2000u, 0x4000u, 0x6000u}) {
        _mm_setcsr((before & ~0x6000u) | rc);
        for (int mode : {0, 1, 2, 3}) {
            for (int w : {19, 11, 6}) {
                ASSERT_EQ(pvxiConvert_32f8u_C1R(ties, 76, got, 19, {w, 1}, mode), pvxStsNoErr);
                for (int i = 0; i < w; ++i)
                    EXPECT_EQ(got[i], RefConvert8u(ties[i], mode)) << "control " << rc << " mode " << mode << " " << i;
            }
            ASSERT_EQ(pvxiConvert_32f8u_C1R(src, 12, dst, 3, {3, 1}, mode), pvxStsNoErr);
            EXPECT_EQ(_mm_getcsr() & 0x6000u, rc);
            ASSERT_EQ(pvxiConvert_32f8u_C1R(nullptr, 12, dst, 3, {3, 1}, mode), pvxStsNullPtrErr);
            EXPECT_EQ(_mm_getcsr() & 0x6000u, rc);
        }
    }
    _mm_setcsr(before);
    EXPECT_EQ(pvxiConvert_32f8u_C1R(src, 12, dst, 3, {3, 1}, 3), pvxStsNoErr);
    EXPECT_EQ(dst[0], 1);
    EXPECT_EQ(dst[2], 3);
}

TEST(Convert, CheckOrder)
{
    Rng rng = MakeRng(9);
    GuardedImage src = MakeImage<Pvx32f>(8, 2, 1, rng), dst = MakeImage<Pvx8u>(8, 2, 1, rng);
    const Pvx32f* s = src.ptr<Pvx32f>();
    Pvx8u* d = dst.ptr<Pvx8u>();
    EXPECT_TRUE(NothingWritten(pvxiConvert_32f8u_C1R(nullptr, 0, d, 0, {0, 0}, 0), pvxStsNullPtrErr, dst));
    EXPECT_TRUE(NothingWritten(pvxiConvert_32f8u_C1R(s, 0, nullptr, 0, {0, 0}, 0), pvxStsNullPtrErr, dst));
    EXPECT_TRUE(NothingWritten(pvxiConvert_32f8u_C1R(s, 0, d, 0, {0, 2}, 0), pvxStsSizeErr, dst));
    EXPECT_TRUE(NothingWritten(pvxiConvert_32f8u_C1R(s, 0, d, dst.step(), {8, 2}, 0), pvxStsStepErr, dst));
    EXPECT_TRUE(NothingWritten(pvxiConvert_32f8u_C1R(s, src.step(), d, -8, {8, 2}, 0), pvxStsStepErr, dst));
}

}  // namespace
