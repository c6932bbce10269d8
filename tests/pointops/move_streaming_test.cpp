// Large regions of Transpose, Mirror, planar copies, channel swaps, fills and
// arithmetic are written with non-temporal stores when they are large against
// the largest cache; the pixels must be the same as with ordinary stores.
// Real caches are tens of megabytes, so this file stands in for the core
// library's cache query: the library calls pvxGetMaxCacheSizeB through the
// dynamic linker, which finds this definition first. Unless a test sets a
// size, it forwards to the core library.
#include <dlfcn.h>

#include <algorithm>
#include <atomic>

#include "harness.h"
#include "ref/move_ref.h"

namespace {

std::atomic<int> gCacheBytes{0};
std::atomic<int> gCacheQueries{0};

// Sets the reported cache size for one scope.
struct SmallCache {
    explicit SmallCache(int bytes)
    {
        gCacheBytes = bytes;
        gCacheQueries = 0;
    }
    ~SmallCache() { gCacheBytes = 0; }
};

}  // namespace

extern "C" PvxStatus pvxGetMaxCacheSizeB(int* pSizeByte)
{
    if (int bytes = gCacheBytes.load()) {
        ++gCacheQueries;
        if (!pSizeByte) return pvxStsNullPtrErr;
        *pSizeByte = bytes;
        return pvxStsNoErr;
    }
    using Fn = PvxStatus (*)(int*);
    static const Fn real = reinterpret_cast<Fn>(dlsym(RTLD_NEXT, "pvxGetMaxCacheSizeB"));
    return real(pSizeByte);
}

namespace {

using namespace pvxtest;
using pvxref::RefMirror;
using pvxref::RefTranspose;

constexpr int kCache = 300000;  // every large region below reads and writes more than half of it

template <class T>
void TransposeLarge(PvxStatus (*fn)(const T*, int, T*, int, PvxiSize), int ch, int w, int h, std::uint64_t seed)
{
    SCOPED_TRACE(::testing::Message() << "Transpose " << sizeof(T) << "-byte C" << ch << " " << w << "x" << h);
    Rng rng = MakeRng(seed);
    for (bool aligned : {true, false}) {
        ShapeOptions o{!aligned, !aligned, false, 0};
        GuardedImage src = MakeImage<T>(w, h, ch, rng, o), dst = MakeImage<T>(h, w, ch, rng, o);
        SmallCache cache(kCache);
        ASSERT_EQ(fn(src.ptr<T>(), src.step(), dst.ptr<T>(), dst.step(), {w, h}), pvxStsNoErr);
        EXPECT_GT(gCacheQueries.load(), 0);
        EXPECT_TRUE(RegionEquals(dst, RefTranspose(src.Packed<T>(), w, h, ch)));
    }
}

// Regions of 393 to 750 kB, streamed under the small cache.
TEST(MoveStreaming, TransposeLargeRegions)
{
    TransposeLarge(pvxiTranspose_8u_C1R, 1, 701, 601, 1);
    TransposeLarge(pvxiTranspose_16u_C1R, 1, 480, 433, 2);
    TransposeLarge(pvxiTranspose_8u_C3R, 3, 401, 347, 3);
    TransposeLarge(pvxiTranspose_32f_C1R, 1, 331, 311, 4);
    TransposeLarge(pvxiTranspose_16s_C3R, 3, 281, 253, 5);
    TransposeLarge(pvxiTranspose_16u_C4R, 4, 241, 211, 6);
    TransposeLarge(pvxiTranspose_32s_C3R, 3, 203, 199, 7);
    TransposeLarge(pvxiTranspose_32f_C4R, 4, 163, 157, 8);
}

// Regions of 393 to 750 kB: streamed under the smaller cache, except AC4,
// which never streams; under the larger one (the region read and written
// under half of it, over a quarter) ordinary stores, with the falling rows
// of flip 0 fetched ahead where alpha is kept.
template <class T>
void MirrorLarge(PvxStatus (*fn)(const T*, int, T*, int, PvxiSize, int), int ch, bool alpha, int w, int h,
                 std::uint64_t seed)
{
    Rng rng = MakeRng(seed);
    for (int cacheBytes : {kCache, 10 * kCache})
        for (int flip = 0; flip < 3; ++flip)
            for (bool aligned : {true, false}) {
                SCOPED_TRACE(::testing::Message() << "Mirror " << sizeof(T) << "-byte " << (alpha ? "AC" : "C") << ch
                                                  << " " << w << "x" << h << " flip " << flip << " aligned "
                                                  << aligned << " cache " << cacheBytes);
                ShapeOptions o{!aligned, !aligned, false, 0};
                GuardedImage src = MakeImage<T>(w, h, ch, rng, o), dst = MakeImage<T>(w, h, ch, rng, o);
                const auto dstBefore = dst.Packed<T>();  // AC4 keeps its alpha
                SmallCache cache(cacheBytes);
                ASSERT_EQ(fn(src.ptr<T>(), src.step(), dst.ptr<T>(), dst.step(), {w, h}, flip), pvxStsNoErr);
                if (!alpha || flip == 0) {
                    EXPECT_GT(gCacheQueries.load(), 0);
                }
                EXPECT_TRUE(RegionEquals(dst, RefMirror(src.Packed<T>(), dstBefore, w, h, ch, alpha, flip)));
            }
}

TEST(MoveStreaming, MirrorLargeRegions)
{
    MirrorLarge(pvxiMirror_8u_C4R, 4, false, 400, 333, 11);
    MirrorLarge(pvxiMirror_8u_AC4R, 4, true, 397, 345, 12);
    MirrorLarge(pvxiMirror_16s_C4R, 4, false, 260, 257, 13);
    MirrorLarge(pvxiMirror_16u_AC4R, 4, true, 263, 255, 14);
    MirrorLarge(pvxiMirror_32f_C4R, 4, false, 190, 181, 15);
    MirrorLarge(pvxiMirror_32s_AC4R, 4, true, 181, 190, 16);
    MirrorLarge(pvxiMirror_8u_C1R, 1, false, 701, 601, 41);
    MirrorLarge(pvxiMirror_16u_C1R, 1, false, 501, 433, 42);
    MirrorLarge(pvxiMirror_32f_C1R, 1, false, 331, 311, 43);
    MirrorLarge(pvxiMirror_8u_C3R, 3, false, 401, 347, 44);
    MirrorLarge(pvxiMirror_16s_C3R, 3, false, 281, 253, 45);
    MirrorLarge(pvxiMirror_32s_C3R, 3, false, 203, 199, 46);
}

// In place, flip 0 fetches its falling rows ahead on large regions too (and
// asks for the cache size to decide); flip 2 exchanges reversed rows.
template <class T>
void MirrorInPlaceLarge(PvxStatus (*fn)(T*, int, PvxiSize, int), bool alpha, int w, int h, std::uint64_t seed)
{
    Rng rng = MakeRng(seed);
    for (int flip : {0, 2}) {
        SCOPED_TRACE(::testing::Message() << "Mirror in place " << sizeof(T) << "-byte " << (alpha ? "AC4" : "C4")
                                          << " flip " << flip);
        GuardedImage img = MakeImage<T>(w, h, 4, rng);
        const auto before = img.Packed<T>();
        SmallCache cache(kCache);
        ASSERT_EQ(fn(img.ptr<T>(), img.step(), {w, h}, flip), pvxStsNoErr);
        if (flip == 0) {
            EXPECT_GT(gCacheQueries.load(), 0);
        }
        EXPECT_TRUE(RegionEquals(img, RefMirror(before, before, w, h, 4, alpha, flip)));
    }
}

TEST(MoveStreaming, MirrorInPlaceLargeRegions)
{
    MirrorInPlaceLarge(pvxiMirror_8u_C4IR, false, 401, 331, 17);
    MirrorInPlaceLarge(pvxiMirror_16u_AC4IR, true, 199, 343, 18);
}

// Planes merged into pixels, and pixels split into planes, stream once what
// the call reads and writes reaches the cache; the planes are stacked in one
// image, so they share its step and the padding between its rows (and,
// unaligned, start at different offsets within a vector).
template <class T>
using MergeFn = PvxStatus (*)(const T* const*, int, T*, int, PvxiSize);
template <class T>
using SplitFn = PvxStatus (*)(const T*, int, T* const*, int, PvxiSize);

template <class T, class Fn>
void PlanarLarge(Fn fn, int ch, int w, int h, std::uint64_t seed)
{
    constexpr bool kSplit = std::is_same_v<Fn, SplitFn<T>>;
    Rng rng = MakeRng(seed);
    for (bool aligned : {true, false}) {
        SCOPED_TRACE(::testing::Message() << (kSplit ? "Split " : "Merge ") << sizeof(T) << "-byte " << ch << " "
                                          << w << "x" << h << " aligned " << aligned);
        ShapeOptions o{!aligned, !aligned, false, 0};
        GuardedImage planes = MakeImage<T>(w, h * ch, 1, rng, o), pixels = MakeImage<T>(w, h, ch, rng, o);
        GuardedImage want = kSplit ? planes : pixels;
        T* p[4] = {};
        for (int c = 0; c < ch; ++c) p[c] = planes.row<T>(c * h);
        SmallCache cache(kCache);
        if constexpr (kSplit) {
            ASSERT_EQ(fn(pixels.ptr<T>(), pixels.step(), p, planes.step(), {w, h}), pvxStsNoErr);
        } else {
            const T* const* in = p;
            ASSERT_EQ(fn(in, planes.step(), pixels.ptr<T>(), pixels.step(), {w, h}), pvxStsNoErr);
        }
        EXPECT_GT(gCacheQueries.load(), 0);
        for (int y = 0; y < h; ++y)
            for (int x = 0; x < w; ++x)
                for (int c = 0; c < ch; ++c) {
                    if constexpr (kSplit) want.row<T>(c * h + y)[x] = pixels.row<T>(y)[x * ch + c];
                    else want.row<T>(y)[x * ch + c] = planes.row<T>(c * h + y)[x];
                }
        EXPECT_TRUE(RegionEquals(kSplit ? planes : pixels, want.Packed<T>()));
    }
}

TEST(MoveStreaming, PlanarLargeRegions)
{
    // Above the threshold: more than 393216 bytes written (read and written
    // above 786433).
    PlanarLarge<Pvx8u, MergeFn<Pvx8u>>(pvxiCopy_8u_P3C3R, 3, 401, 337, 21);
    PlanarLarge<Pvx8u, MergeFn<Pvx8u>>(pvxiCopy_8u_P4C4R, 4, 331, 301, 22);
    PlanarLarge<Pvx16s, MergeFn<Pvx16s>>(pvxiCopy_16s_P3C3R, 3, 261, 257, 23);
    PlanarLarge<Pvx16u, MergeFn<Pvx16u>>(pvxiCopy_16u_P4C4R, 4, 211, 237, 24);
    PlanarLarge<Pvx32f, MergeFn<Pvx32f>>(pvxiCopy_32f_P3C3R, 3, 271, 251, 25);
    PlanarLarge<Pvx8u, SplitFn<Pvx8u>>(pvxiCopy_8u_C3P3R, 3, 403, 331, 31);
    PlanarLarge<Pvx8u, SplitFn<Pvx8u>>(pvxiCopy_8u_C4P4R, 4, 333, 299, 32);
    PlanarLarge<Pvx16s, SplitFn<Pvx16s>>(pvxiCopy_16s_C3P3R, 3, 263, 255, 33);
    PlanarLarge<Pvx16u, SplitFn<Pvx16u>>(pvxiCopy_16u_C4P4R, 4, 213, 235, 34);
    PlanarLarge<Pvx32f, SplitFn<Pvx32f>>(pvxiCopy_32f_C4P4R, 4, 271, 251, 35);
}

// Dup streams like the merges (above 786433 bytes read and written); C1C4
// writes every channel.
void DupLarge(PvxStatus (*fn)(const Pvx8u*, int, Pvx8u*, int, PvxiSize), int ch, int w, int h, std::uint64_t seed)
{
    Rng rng = MakeRng(seed);
    for (bool aligned : {true, false}) {
        SCOPED_TRACE(::testing::Message() << "Dup C1C" << ch << " " << w << "x" << h << " aligned " << aligned);
        ShapeOptions o{!aligned, !aligned, false, 0};
        GuardedImage src = MakeImage<Pvx8u>(w, h, 1, rng, o), dst = MakeImage<Pvx8u>(w, h, ch, rng, o);
        GuardedImage want = dst;
        SmallCache cache(kCache);
        ASSERT_EQ(fn(src.ptr<Pvx8u>(), src.step(), dst.ptr<Pvx8u>(), dst.step(), {w, h}), pvxStsNoErr);
        EXPECT_GT(gCacheQueries.load(), 0);
        for (int y = 0; y < h; ++y)
            for (int x = 0; x < w; ++x)
                for (int c = 0; c < ch; ++c) want.row<Pvx8u>(y)[x * ch + c] = src.row<Pvx8u>(y)[x];
        EXPECT_TRUE(RegionEquals(dst, want.Packed<Pvx8u>()));
    }
}

TEST(MoveStreaming, DupLargeRegions)
{
    DupLarge(pvxiDup_8u_C1C3R, 3, 403, 491, 26);
    DupLarge(pvxiDup_8u_C1C4R, 4, 401, 397, 27);
}

// Arithmetic streams its stores once a call reads and writes half the cache,
// and below that, from 1 MB, fetches its sources ahead (aligned rows only);
// the pixels and the status must be those of the same rows done one call
// each, too small for either.
template <class Call>
void ArithLarge(const char* name, int elemBytes, int ch, int w, int h, std::uint64_t seed, Call call)
{
    Rng rng = MakeRng(seed);
    for (bool aligned : {true, false}) {
        SCOPED_TRACE(::testing::Message() << name << " " << w << "x" << h << " aligned " << aligned);
        ShapeOptions o{!aligned, !aligned, false, 0};
        GuardedImage a(w, h, ch * elemBytes, elemBytes, rng, o), b(w, h, ch * elemBytes, elemBytes, rng, o);
        a.Randomize<Pvx8u>(rng);
        b.Randomize<Pvx8u>(rng);
        if (elemBytes == 4) {
            // Finite floats, and a zero in every divisor row.
            for (int y = 0; y < h; ++y)
                for (int x = 0; x < w * ch; ++x) {
                    a.row<Pvx32f>(y)[x] = static_cast<Pvx32f>(RandInt(rng, -999, 999)) / 7;
                    b.row<Pvx32f>(y)[x] = static_cast<Pvx32f>(RandInt(rng, -999, 999)) / 3;
                }
            for (int y = 0; y < h; ++y) a.row<Pvx32f>(y)[(y * 7) % (w * ch)] = 0;
        }
        GuardedImage byRow(w, h, ch * elemBytes, elemBytes, rng, o);
        GuardedImage fetched = byRow, streamed = byRow;
        PvxStatus want = pvxStsNoErr;
        for (int y = 0; y < h; ++y)
            if (PvxStatus s = call(a, b, byRow, y, 1); s != pvxStsNoErr && want == pvxStsNoErr) want = s;
        {
            SmallCache cache(1 << 30);
            EXPECT_EQ(call(a, b, fetched, 0, h), want);
            EXPECT_GT(gCacheQueries.load(), 0);
        }
        {
            SmallCache cache(kCache);
            EXPECT_EQ(call(a, b, streamed, 0, h), want);
            EXPECT_GT(gCacheQueries.load(), 0);
        }
        EXPECT_TRUE(RegionEquals(fetched, byRow.Packed<Pvx8u>()));
        EXPECT_TRUE(RegionEquals(streamed, byRow.Packed<Pvx8u>()));
    }
}

TEST(MoveStreaming, ArithmeticLargeRegions)
{
    // Above 1 MB read and written.
    using G = GuardedImage;
    ArithLarge("Add_32f_C1R", 4, 1, 297, 301, 31, [](G& a, G& b, G& d, int y, int n) {
        return pvxiAdd_32f_C1R(a.row<Pvx32f>(y), a.step(), b.row<Pvx32f>(y), b.step(), d.row<Pvx32f>(y), d.step(),
                               {297, n});
    });
    ArithLarge("Div_32f_C3R", 4, 3, 172, 203, 32, [](G& a, G& b, G& d, int y, int n) {
        return pvxiDiv_32f_C3R(a.row<Pvx32f>(y), a.step(), b.row<Pvx32f>(y), b.step(), d.row<Pvx32f>(y), d.step(),
                               {172, n});
    });
    ArithLarge("Sub_16s_C3RSfs", 2, 3, 251, 239, 33, [](G& a, G& b, G& d, int y, int n) {
        return pvxiSub_16s_C3RSfs(a.row<Pvx16s>(y), a.step(), b.row<Pvx16s>(y), b.step(), d.row<Pvx16s>(y),
                                  d.step(), {251, n}, 1);
    });
    ArithLarge("Add_8u_C3RSfs", 1, 3, 397, 311, 35, [](G& a, G& b, G& d, int y, int n) {
        return pvxiAdd_8u_C3RSfs(a.row<Pvx8u>(y), a.step(), b.row<Pvx8u>(y), b.step(), d.row<Pvx8u>(y), d.step(),
                                 {397, n}, 1);
    });
    ArithLarge("MulC_8u_C1RSfs", 1, 1, 701, 763, 34, [](G& a, G&, G& d, int y, int n) {
        return pvxiMulC_8u_C1RSfs(a.row<Pvx8u>(y), a.step(), 3, d.row<Pvx8u>(y), d.step(), {701, n}, 2);
    });
    ArithLarge("Abs_16s_C1R", 2, 1, 613, 457, 36, [](G& a, G&, G& d, int y, int n) {
        return pvxiAbs_16s_C1R(a.row<Pvx16s>(y), a.step(), d.row<Pvx16s>(y), d.step(), {613, n});
    });
}

// Channel swaps stream once what the call reads and writes reaches half the
// cache, on destination rows that start aligned; the pixels must be those of
// the order. Forms that keep destination channels, and in-place calls, keep
// ordinary stores and must be just as right.
template <class T>
void SwapLarge(PvxStatus (*fn)(const T*, int, T*, int, PvxiSize, const int*), int cin, int cout,
               std::vector<int> order, int w, int h, std::uint64_t seed)
{
    Rng rng = MakeRng(seed);
    struct Shape {
        bool srcUnaligned, dstUnaligned;
    };
    const bool keeps = std::any_of(order.begin(), order.end(), [cin](int c) { return c >= cin; });
    for (Shape sh : {Shape{false, false}, Shape{true, false}, Shape{true, true}}) {
        SCOPED_TRACE(::testing::Message() << "SwapChannels " << sizeof(T) << "-byte C" << cin << "C" << cout << " "
                                          << w << "x" << h << " unaligned src " << sh.srcUnaligned << " dst "
                                          << sh.dstUnaligned);
        // Padded steps (when unaligned) give rows of both alignments.
        GuardedImage src = MakeImage<T>(w, h, cin, rng, {sh.srcUnaligned, sh.srcUnaligned, false, 0});
        GuardedImage dst = MakeImage<T>(w, h, cout, rng, {sh.srcUnaligned, sh.dstUnaligned, false, 0});
        GuardedImage want = dst;
        for (int y = 0; y < h; ++y)
            for (int x = 0; x < w; ++x)
                for (int c = 0; c < cout; ++c)
                    if (order[c] < cin) want.row<T>(y)[x * cout + c] = src.row<T>(y)[x * cin + order[c]];
        SmallCache cache(kCache);
        ASSERT_EQ(fn(src.ptr<T>(), src.step(), dst.ptr<T>(), dst.step(), {w, h}, order.data()), pvxStsNoErr);
        if (keeps) EXPECT_EQ(gCacheQueries.load(), 0);
        else EXPECT_GT(gCacheQueries.load(), 0);
        EXPECT_TRUE(RegionEquals(dst, want.Packed<T>()));
    }
}

TEST(MoveStreaming, SwapChannelsLargeRegions)
{
    // Above 786433 bytes read and written.
    SwapLarge(pvxiSwapChannels_8u_C3R, 3, 3, {2, 1, 0}, 401, 337, 41);
    SwapLarge(pvxiSwapChannels_16u_C4R, 4, 4, {3, 0, 2, 1}, 211, 241, 42);
    SwapLarge(pvxiSwapChannels_32f_C4C3R, 4, 3, {2, 3, 0}, 181, 161, 43);
    SwapLarge(pvxiSwapChannels_16s_C3C4R, 3, 4, {2, 1, 0, 3}, 231, 219, 44);  // keeps channel 3
    // In place, same pointer: ordinary stores.
    Rng rng = MakeRng(45);
    GuardedImage img = MakeImage<Pvx8u>(401, 337, 3, rng, {false, false, false, 0});
    GuardedImage want = img;
    for (int y = 0; y < 337; ++y)
        for (int x = 0; x < 401; ++x) std::swap(want.row<Pvx8u>(y)[3 * x], want.row<Pvx8u>(y)[3 * x + 2]);
    const int order[3] = {2, 1, 0};
    SmallCache cache(kCache);
    ASSERT_EQ(pvxiSwapChannels_8u_C3R(img.ptr<Pvx8u>(), img.step(), img.ptr<Pvx8u>(), img.step(), {401, 337}, order),
              pvxStsNoErr);
    EXPECT_EQ(gCacheQueries.load(), 0);
    EXPECT_TRUE(RegionEquals(img, want.Packed<Pvx8u>()));
}

// Fills that keep destination channels (AC4 alpha, the other channels of a
// CR pixel) ask the cache size above 1048576 bytes and stream from there;
// the kept channels must come through unchanged.
TEST(MoveStreaming, KeepingFillsLargeRegions)
{
    Rng rng = MakeRng(51);
    for (bool aligned : {true, false}) {
        SCOPED_TRACE(::testing::Message() << "aligned " << aligned);
        ShapeOptions o{!aligned, !aligned, false, 0};
        GuardedImage ac4 = MakeImage<Pvx8u>(601, 457, 4, rng, o);  // 1098628 bytes
        GuardedImage cr = MakeImage<Pvx16u>(401, 449, 3, rng, o);  // 1080294 bytes
        GuardedImage wantAc4 = ac4, wantCr = cr;
        const Pvx8u v[3] = {9, 8, 7};
        for (int y = 0; y < 457; ++y)
            for (int x = 0; x < 601; ++x)
                for (int c = 0; c < 3; ++c) wantAc4.row<Pvx8u>(y)[4 * x + c] = v[c];
        for (int y = 0; y < 449; ++y)
            for (int x = 0; x < 401; ++x) wantCr.row<Pvx16u>(y)[3 * x + 1] = 4321;
        SmallCache cache(kCache);
        ASSERT_EQ(pvxiSet_8u_AC4R(v, ac4.ptr<Pvx8u>(), ac4.step(), {601, 457}), pvxStsNoErr);
        EXPECT_GT(gCacheQueries.load(), 0);
        gCacheQueries = 0;
        ASSERT_EQ(pvxiSet_16u_C3CR(4321, cr.ptr<Pvx16u>() + 1, cr.step(), {401, 449}), pvxStsNoErr);
        EXPECT_GT(gCacheQueries.load(), 0);
        EXPECT_TRUE(RegionEquals(ac4, wantAc4.Packed<Pvx8u>()));
        EXPECT_TRUE(RegionEquals(cr, wantCr.Packed<Pvx16u>()));
    }
}

TEST(MoveStreaming, SmallRegionsDoNotAsk)
{
    // Below the thresholds the cache size is not needed.
    std::vector<Pvx8u> a(64 * 64), b(64 * 64);
    SmallCache cache(kCache);
    ASSERT_EQ(pvxiTranspose_8u_C1R(a.data(), 64, b.data(), 64, {64, 64}), pvxStsNoErr);
    ASSERT_EQ(pvxiMirror_8u_C4R(a.data(), 64, b.data(), 64, {16, 64}, 1), pvxStsNoErr);
    EXPECT_EQ(gCacheQueries.load(), 0);
}

}  // namespace
