// The frame: image memory, the version record, the core services and the
// shared helpers that every family uses.
#include <xmmintrin.h>

#include <cstdint>
#include <cstring>
#include <string>

#include "check.h"
#include "fpguard.h"
#include "harness.h"
#include "sfs.h"

namespace {

using namespace pvxtest;

using MallocFn = void* (*)(int, int, int*);

struct MallocMember {
    const char* name;
    MallocFn fn;
    int pixelBytes;
};

#define PVX_MALLOC(t, l, bytes) {"pvxiMalloc_" #t "_" #l, reinterpret_cast<MallocFn>(&pvxiMalloc_##t##_##l), bytes}
const MallocMember kMallocs[] = {
    PVX_MALLOC(8u, C1, 1),     PVX_MALLOC(8u, C2, 2),     PVX_MALLOC(8u, C3, 3),     PVX_MALLOC(8u, C4, 4),
    PVX_MALLOC(8u, AC4, 4),    PVX_MALLOC(16u, C1, 2),    PVX_MALLOC(16u, C2, 4),    PVX_MALLOC(16u, C3, 6),
    PVX_MALLOC(16u, C4, 8),    PVX_MALLOC(16u, AC4, 8),   PVX_MALLOC(16s, C1, 2),    PVX_MALLOC(16s, C2, 4),
    PVX_MALLOC(16s, C3, 6),    PVX_MALLOC(16s, C4, 8),    PVX_MALLOC(16s, AC4, 8),   PVX_MALLOC(32s, C1, 4),
    PVX_MALLOC(32s, C2, 8),    PVX_MALLOC(32s, C3, 12),   PVX_MALLOC(32s, C4, 16),   PVX_MALLOC(32s, AC4, 16),
    PVX_MALLOC(32f, C1, 4),    PVX_MALLOC(32f, C2, 8),    PVX_MALLOC(32f, C3, 12),   PVX_MALLOC(32f, C4, 16),
    PVX_MALLOC(32f, AC4, 16),  PVX_MALLOC(32sc, C1, 8),   PVX_MALLOC(32sc, C2, 16),  PVX_MALLOC(32sc, C3, 24),
    PVX_MALLOC(32sc, C4, 32),  PVX_MALLOC(32sc, AC4, 32), PVX_MALLOC(32fc, C1, 8),   PVX_MALLOC(32fc, C2, 16),
    PVX_MALLOC(32fc, C3, 24),  PVX_MALLOC(32fc, C4, 32),  PVX_MALLOC(32fc, AC4, 32),
};
#undef PVX_MALLOC

TEST(ImageMemory, EveryMemberRoundsRowsUpTo64Bytes)
{
    for (const auto& m : kMallocs) {
        SCOPED_TRACE(m.name);
        for (int w : {1, 2, 3, 21, 22, 63, 64, 65, 100, 1000}) {
            int step = -1;
            void* p = m.fn(w, 3, &step);
            ASSERT_NE(p, nullptr);
            EXPECT_EQ(step, (w * m.pixelBytes + 63) / 64 * 64) << "width " << w;
            EXPECT_EQ(reinterpret_cast<std::uintptr_t>(p) % 64, 0u);
            std::memset(p, 0x5a, static_cast<std::size_t>(step) * 3);  // the whole block is ours (ASan checks)
            pvxiFree(p);
        }
    }
}

TEST(ImageMemory, EdgeCases)
{
    int step = -1;
    void* p = pvxiMalloc_8u_C1(1, 1, &step);
    EXPECT_EQ(step, 64);
    pvxiFree(p);
    p = pvxiMalloc_8u_C1(64, 2, &step);
    EXPECT_EQ(step, 64);
    pvxiFree(p);
    p = pvxiMalloc_8u_C1(65, 1, &step);
    EXPECT_EQ(step, 128);
    pvxiFree(p);
    p = pvxiMalloc_8u_C3(22, 1, &step);
    EXPECT_EQ(step, 128);
    pvxiFree(p);
    p = pvxiMalloc_32fc_C3(3, 1, &step);
    EXPECT_EQ(step, 128);
    pvxiFree(p);

    int a = 0, b = 0;
    pvxiFree(pvxiMalloc_16u_AC4(37, 1, &a));
    pvxiFree(pvxiMalloc_16u_C4(37, 1, &b));
    EXPECT_EQ(a, b);

    for (auto [w, h] : {std::pair{0, 5}, {5, 0}, {-1, 5}, {5, -3}}) {
        step = 77;
        EXPECT_EQ(pvxiMalloc_8u_C1(w, h, &step), nullptr);
        EXPECT_EQ(step, 0);
    }
    EXPECT_EQ(pvxiMalloc_8u_C1(10, 10, nullptr), nullptr);
    pvxiFree(nullptr);
}

TEST(ImageMemory, AllocationFailureKeepsTheStep)
{
    // 40000 * 64 * 60000 bytes wraps in 32 bits; either a short block or null,
    // and the step is the computed one.
    int step = 0;
    void* p = pvxiMalloc_8u_C1(40000, 100000, &step);
    EXPECT_EQ(step, 40000);
    pvxiFree(p);
}

TEST(Version, RecordFields)
{
    const PvxVersionRecord* v = pvxiGetLibVersion();
    ASSERT_NE(v, nullptr);
    EXPECT_EQ(v->majorVersion, 8);
    EXPECT_EQ(v->minorVersion, 2);
    EXPECT_EQ(v->updateVersion, 1);
    EXPECT_EQ(v->buildNumber, 44077);
    EXPECT_EQ(std::memcmp(v->cpuTag, "p8\0\0", 4), 0);
    EXPECT_STREQ(v->versionText, "8.2.1 (r44077)");
    EXPECT_STREQ(v->buildDate, "Oct  9 2014");
    std::string want = ownGetFeature(0x80) ? "pvxIP SSE4.1/4.2 (p8)+" : "pvxIP SSE4.1/4.2 (p8)";
    EXPECT_EQ(v->name, want);
    EXPECT_EQ(pvxiGetLibVersion(), v);
}

TEST(Core, MallocAlignsAndFreesNull)
{
    for (int n : {1, 3, 64, 65, 4096, 100000}) {
        void* p = pvxMalloc(n);
        ASSERT_NE(p, nullptr);
        EXPECT_EQ(reinterpret_cast<std::uintptr_t>(p) % 64, 0u);
        std::memset(p, 1, n);
        pvxFree(p);
    }
    EXPECT_EQ(pvxMalloc(0), nullptr);
    EXPECT_EQ(pvxMalloc(-5), nullptr);
    pvxFree(nullptr);
}

TEST(Core, CacheSizeAndFeatures)
{
    int size = 0;
    ASSERT_EQ(pvxGetMaxCacheSizeB(&size), pvxStsNoErr);
    EXPECT_GE(size, 32 * 1024);
    EXPECT_EQ(pvxGetMaxCacheSizeB(nullptr), pvxStsNullPtrErr);
    Pvx64u f = pvxGetEnabledCpuFeatures();
    // this build needs SSE4.2, so a machine that runs it has it
    EXPECT_TRUE(f & PVX_CPUID_SSE42);
    EXPECT_TRUE(ownGetFeature(PVX_CPUID_SSE2 | PVX_CPUID_SSE41));
    EXPECT_EQ(ownGetFeature(f | (1ull << 63)), 0);
    EXPECT_NE(ownGetFeature(0), 0);
}

TEST(Core, StatusStrings)
{
    EXPECT_STREQ(pvxGetStatusString(pvxStsNullPtrErr), "pvxStsNullPtrErr: a required pointer is null");
    const int all[] = {0, 1, 6, 29, 48, -5, -6, -8, -9, -10, -11, -12, -13, -14, -15, -17, -20, -21, -22, -23, -33,
                       -34, -36, -37, -47, -50, -51, -53, -60, -56, -57, -58, -106, -107, -108, -125, -201, -213,
                       -225, -227, -9999,
                       // returned by the filter, statistics, warp and transform families
                       -7, -16, -18, -59, -210, -211, -231, 39};
    for (int s : all) EXPECT_STRNE(pvxGetStatusString(s), "unknown status") << s;
    EXPECT_STREQ(pvxGetStatusString(-4), "unknown status");
}

TEST(FpGuard, SetsAndRestoresTheControl)
{
    unsigned before = _mm_getcsr();
    {
        pvx::FpGuard g(pvx::FpRound::kTowardZero, true);
        EXPECT_EQ(_mm_getcsr() & 0x6000u, 0x6000u);
        EXPECT_EQ(_mm_getcsr() & 0x8040u, 0x8040u);
        EXPECT_EQ(_mm_cvtss_si32(_mm_set_ss(2.7f)), 2);
    }
    EXPECT_EQ(_mm_getcsr(), before);
    _mm_setcsr((before & ~0x6000u) | 0x2000u);  // caller rounds down
    {
        pvx::FpGuard g(pvx::FpRound::kNearest);
        EXPECT_EQ(_mm_cvtss_si32(_mm_set_ss(2.5f)), 2);
    }
    EXPECT_EQ(_mm_getcsr() & 0x6000u, 0x2000u);
    _mm_setcsr(before);
}

TEST(ScaleFactor, RoundsHalfToEvenAndSaturates)
{
    using pvx::ScaleSat;
    EXPECT_EQ(ScaleSat<Pvx8u>(3, 1), 2);
    EXPECT_EQ(ScaleSat<Pvx8u>(5, 1), 2);
    EXPECT_EQ(ScaleSat<Pvx8u>(7, 1), 4);
    EXPECT_EQ(ScaleSat<Pvx8u>(510, 9), 1);
    EXPECT_EQ(ScaleSat<Pvx8u>(510, 10), 0);
    EXPECT_EQ(ScaleSat<Pvx8u>(1, -8), 255);
    EXPECT_EQ(ScaleSat<Pvx8u>(0, -30), 0);
    EXPECT_EQ(ScaleSat<Pvx8u>(-3, 0), 0);
    EXPECT_EQ(ScaleSat<Pvx16s>(-5, 1), -2);
    EXPECT_EQ(ScaleSat<Pvx16s>(-7, 1), -4);
    EXPECT_EQ(ScaleSat<Pvx16s>(-1, -200), -32768);
    EXPECT_EQ(ScaleSat<Pvx32s>(static_cast<pvx::Wide>(1) << 62, 0), 2147483647);
    EXPECT_EQ(ScaleSat<Pvx16u>(-(static_cast<pvx::Wide>(1) << 62), 1000), 0);
    // against a double reference over a range of values and factors
    for (int sf = 1; sf <= 20; ++sf)
        for (long long r = -70000; r <= 70000; r += 997) {
            double q = std::ldexp(static_cast<double>(r), -sf);
            double want = std::nearbyint(q);  // default rounding: half to even
            EXPECT_EQ(static_cast<long long>(pvx::ScaleRound(r, sf)), static_cast<long long>(want)) << r << " " << sf;
        }
}

TEST(Checks, OrdersReturnTheFirstFailure)
{
    int x = 0;
    using pvx::CheckFrame;
    using pvx::Order;
    PvxiSize bad{0, 4}, good{4, 4};
    EXPECT_EQ(CheckFrame<Order::kPtrSizeStep>({&x, nullptr}, bad, {0}), pvxStsNullPtrErr);
    EXPECT_EQ(CheckFrame<Order::kPtrSizeStep>({&x}, bad, {0}), pvxStsSizeErr);
    EXPECT_EQ(CheckFrame<Order::kPtrSizeStep>({&x}, good, {4, 0}), pvxStsStepErr);
    EXPECT_EQ(CheckFrame<Order::kPtrStepSize>({&x}, bad, {0}), pvxStsStepErr);
    EXPECT_EQ(CheckFrame<Order::kPtrStepSize>({&x}, bad, {4}), pvxStsSizeErr);
    EXPECT_EQ(CheckFrame<Order::kPtrSize>({&x}, good, {0, -4}), pvxStsNoErr);
    EXPECT_EQ(pvx::CheckStepsNonZero({-4, 3}), pvxStsNoErr);
    EXPECT_EQ(pvx::CheckStepsNonZero({-4, 0}), pvxStsStepErr);
}

TEST(Harness, GuardedImageCatchesWritesOutsideTheRegion)
{
    Rng rng = MakeRng(1);
    for (int i = 0; i < 20; ++i) {
        GuardedImage img = MakeImage<Pvx16u>(RandInt(rng, 1, 40), RandInt(rng, 1, 5), 3, rng);
        EXPECT_TRUE(img.Unchanged());
        img.row<Pvx16u>(img.height() - 1)[img.width() * 3 - 1] ^= 1;  // last element: inside
        EXPECT_TRUE(img.GuardsIntact());
        EXPECT_FALSE(img.Unchanged());
        img.row<std::uint8_t>(img.height() - 1)[img.width() * 6] ^= 1;  // first byte after the region
        EXPECT_FALSE(img.GuardsIntact());
        img.row<std::uint8_t>(img.height() - 1)[img.width() * 6] ^= 1;
        img.data()[-1] ^= 1;  // the byte before the first pixel
        EXPECT_FALSE(img.GuardsIntact());
    }
}

}  // namespace
