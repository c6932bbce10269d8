// Copy, CopyManaged and Dup: every member against a scalar reference on
// guarded images, the check order, zero and negative steps, bit patterns of
// 32f NaNs, and the streamed path of large planar copies.
#include <algorithm>
#include <cstdint>
#include <cstring>
#include <vector>

#include "../../pointops/move.h"
#include "harness.h"

namespace {

using namespace pvxtest;

// Arguments of every member; planar sides pass an array of plane pointers.
struct Args {
    const void* src;
    int srcStep;
    void* dst;
    int dstStep;
    PvxiSize roi;
    const Pvx8u* mask;
    int maskStep;
    int flags;
};
using Call = PvxStatus (*)(const Args&);

// Destination channel dc of a pixel takes source channel Src(dc, k), or
// keeps its value when that is -1; k is the chosen channel of the
// channel-pointer forms.
using SrcOf = int (*)(int dc, int k);
int Same(int dc, int) { return dc; }
int Alpha(int dc, int) { return dc < 3 ? dc : -1; }
int Pick(int, int k) { return k; }
int Put(int dc, int k) { return dc == k ? 0 : -1; }
int One(int dc, int k) { return dc == k ? dc : -1; }
int First(int, int) { return 0; }

struct Form {
    int srcC, dstC;                  // channels in memory
    bool srcPlanar, dstPlanar;       // one plane per channel, one step
    bool srcAtChannel, dstAtChannel;  // the pointer addresses channel k
    bool masked;
    SrcOf src;
};

const Form kC1{1, 1, false, false, false, false, false, Same};
const Form kC3{3, 3, false, false, false, false, false, Same};
const Form kC4{4, 4, false, false, false, false, false, Same};
const Form kAC4{4, 4, false, false, false, false, false, Alpha};
const Form kC1M{1, 1, false, false, false, false, true, Same};
const Form kC3M{3, 3, false, false, false, false, true, Same};
const Form kC4M{4, 4, false, false, false, false, true, Same};
const Form kAC4M{4, 4, false, false, false, false, true, Alpha};
const Form kC3C1{3, 1, false, false, true, false, false, Pick};
const Form kC4C1{4, 1, false, false, true, false, false, Pick};
const Form kC1C3{1, 3, false, false, false, true, false, Put};
const Form kC1C4{1, 4, false, false, false, true, false, Put};
const Form kC3CR{3, 3, false, false, true, true, false, One};
const Form kC4CR{4, 4, false, false, true, true, false, One};
const Form kC3AC4{3, 4, false, false, false, false, false, Alpha};
const Form kAC4C3{4, 3, false, false, false, false, false, Same};
const Form kC3P3{3, 3, false, true, false, false, false, Same};
const Form kC4P4{4, 4, false, true, false, false, false, Same};
const Form kP3C3{3, 3, true, false, false, false, false, Same};
const Form kP4C4{4, 4, true, false, false, false, false, Same};
const Form kDup3{1, 3, false, false, false, false, false, First};
const Form kDup4{1, 4, false, false, false, false, false, First};

struct Member {
    const char* name;
    int elemBytes;
    Form form;
    Call call;
};

#define COPY_(t, T, l, name, form)                                                                            \
    {#name, sizeof(T), form, [](const Args& a) {                                                             \
         return name(static_cast<const T*>(a.src), a.srcStep, static_cast<T*>(a.dst), a.dstStep, a.roi);    \
     }}
#define COPY_R(t, T, l) COPY_(t, T, l, pvxiCopy_##t##_##l##R, k##l)
#define COPY_CR(t, T, l) COPY_(t, T, l, pvxiCopy_##t##_##l, k##l)
#define COPY_M(t, T, l)                                                                                      \
    {"pvxiCopy_" #t "_" #l "MR", sizeof(T), k##l##M, [](const Args& a) {                                     \
         return pvxiCopy_##t##_##l##MR(static_cast<const T*>(a.src), a.srcStep, static_cast<T*>(a.dst),      \
                                       a.dstStep, a.roi, a.mask, a.maskStep);                                \
     }}
#define COPY_TO_PLANES(t, T, l)                                                                              \
    {"pvxiCopy_" #t "_" #l "R", sizeof(T), k##l, [](const Args& a) {                                         \
         return pvxiCopy_##t##_##l##R(static_cast<const T*>(a.src), a.srcStep, static_cast<T* const*>(a.dst), \
                                      a.dstStep, a.roi);                                                     \
     }}
#define COPY_FROM_PLANES(t, T, l)                                                                            \
    {"pvxiCopy_" #t "_" #l "R", sizeof(T), k##l, [](const Args& a) {                                         \
         return pvxiCopy_##t##_##l##R(static_cast<const T* const*>(a.src), a.srcStep, static_cast<T*>(a.dst), \
                                      a.dstStep, a.roi);                                                     \
     }}
#define COPY_TYPE(t, T)                                                                                      \
    COPY_R(t, T, C1), COPY_R(t, T, C3), COPY_R(t, T, C4), COPY_R(t, T, AC4), COPY_M(t, T, C1),               \
        COPY_M(t, T, C3), COPY_M(t, T, C4), COPY_M(t, T, AC4), COPY_R(t, T, C3C1), COPY_R(t, T, C4C1),       \
        COPY_R(t, T, C1C3), COPY_R(t, T, C1C4), COPY_CR(t, T, C3CR), COPY_CR(t, T, C4CR),                    \
        COPY_R(t, T, C3AC4), COPY_R(t, T, AC4C3), COPY_TO_PLANES(t, T, C3P3), COPY_TO_PLANES(t, T, C4P4),    \
        COPY_FROM_PLANES(t, T, P3C3), COPY_FROM_PLANES(t, T, P4C4)

const Member kMembers[] = {
    COPY_TYPE(8u, Pvx8u),
    COPY_TYPE(16s, Pvx16s),
    COPY_TYPE(16u, Pvx16u),
    COPY_TYPE(32f, Pvx32f),
    COPY_TYPE(32s, Pvx32s),
    COPY_(8u, Pvx8u, C1C3, pvxiDup_8u_C1C3R, kDup3),
    COPY_(8u, Pvx8u, C1C4, pvxiDup_8u_C1C4R, kDup4),
    {"pvxiCopyManaged_8u_C1R", 1, kC1,
     [](const Args& a) {
         return pvxiCopyManaged_8u_C1R(static_cast<const Pvx8u*>(a.src), a.srcStep, static_cast<Pvx8u*>(a.dst),
                                       a.dstStep, a.roi, a.flags);
     }},
};

#undef COPY_TYPE
#undef COPY_FROM_PLANES
#undef COPY_TO_PLANES
#undef COPY_M
#undef COPY_CR
#undef COPY_R
#undef COPY_

// The images of one call: a planar side is one guarded image whose plane c
// is rows c * h .. c * h + h - 1 (so that the planes share a step).
struct Case {
    GuardedImage src, dst, mask;
    int w, h, k;
};

GuardedImage MakeSide(int w, int h, int channels, bool planar, int elemBytes, Rng& rng, ShapeOptions o)
{
    GuardedImage img(w, planar ? h * channels : h, (planar ? 1 : channels) * elemBytes, elemBytes, rng, o);
    img.Randomize<Pvx8u>(rng);
    return img;
}

// Byte offset of element (x, y, c) in the packed region of a side.
std::size_t At(int w, int h, int channels, bool planar, int elemBytes, int x, int y, int c)
{
    if (planar) return ((static_cast<std::size_t>(c) * h + y) * w + x) * elemBytes;
    return ((static_cast<std::size_t>(y) * w + x) * channels + c) * elemBytes;
}

// Pointer argument of a side: the planes' array or the first element (of
// channel k for channel-pointer forms), from the last row when flipped.
struct Side {
    void* planes[4] = {};
    void* ptr = nullptr;
    int step = 0;
    void* arg() { return ptr ? ptr : static_cast<void*>(planes); }
};

Side MakeArg(GuardedImage& img, int h, int channels, bool planar, bool atChannel, int k, int elemBytes, bool flip)
{
    Side s;
    s.step = flip ? -img.step() : img.step();
    int y0 = flip ? h - 1 : 0;
    if (planar) {
        for (int c = 0; c < channels; ++c) s.planes[c] = img.row<Pvx8u>(c * h + y0);
    } else {
        s.ptr = img.row<Pvx8u>(y0) + (atChannel ? k * elemBytes : 0);
    }
    return s;
}

// Four bit patterns that must survive a 32f copy: signalling and quiet NaNs
// with payloads, and a negative quiet NaN.
const std::uint32_t kNaNs[] = {0x7f800001u, 0x7fbfffffu, 0xffc12345u, 0x7fc00000u};

void SeedNaNs(GuardedImage& img, int rows, int elemsPerRow)
{
    for (int y = 0; y < rows; ++y)
        for (int i = 0; i < elemsPerRow && i < 8; i += 2)
            std::memcpy(img.row<Pvx8u>(y) + 4 * i, &kNaNs[(i / 2 + y) % 4], 4);
    img.Snapshot();
}

// One random call of a member against the reference.
void RunCase(const Member& m, Shape s, Rng& rng)
{
    const Form& f = m.form;
    const int S = m.elemBytes, w = s.width, h = s.height;
    ShapeOptions o;
    o.randomPad = RandInt(rng, 0, 2) != 0;  // else contiguous rows
    o.tightEnd = RandInt(rng, 0, 1) != 0;    // images end with the last row: overreads reach ASan
    const bool flip = RandInt(rng, 0, 3) == 0;
    const int k = RandInt(rng, 0, (f.srcC > f.dstC ? f.srcC : f.dstC) - 1);
    const int maskMode = RandInt(rng, 0, 5) == 0 ? 1 : (RandInt(rng, 0, 5) == 0 ? 2 : 0);
    const int flagsPick[] = {0, 1, 2, 3, -1, 6};
    const int flags = flagsPick[RandInt(rng, 0, 5)];
    SCOPED_TRACE(::testing::Message() << "k " << k << " flip " << flip << " contiguous " << !o.randomPad << " tight "
                                      << o.tightEnd << " mask "
                                      << maskMode << " flags " << flags);

    GuardedImage src = MakeSide(w, h, f.srcC, f.srcPlanar, S, rng, o);
    GuardedImage dst = MakeSide(w, h, f.dstC, f.dstPlanar, S, rng, o);
    GuardedImage mask(w, h, 1, 1, rng, o);
    FillMask(mask, maskMode, rng);
    if (S == 4) SeedNaNs(src, src.height(), w * (f.srcPlanar ? 1 : f.srcC));

    auto in = src.Packed<Pvx8u>();
    auto want = dst.Packed<Pvx8u>();
    auto mk = mask.Packed<Pvx8u>();
    for (int y = 0; y < h; ++y)
        for (int x = 0; x < w; ++x) {
            if (f.masked && mk[static_cast<std::size_t>(y) * w + x] == 0) continue;
            for (int dc = 0; dc < f.dstC; ++dc) {
                int sc = f.src(dc, k);
                if (sc < 0) continue;
                std::memcpy(&want[At(w, h, f.dstC, f.dstPlanar, S, x, y, dc)],
                            &in[At(w, h, f.srcC, f.srcPlanar, S, x, y, sc)], S);
            }
        }

    Side a = MakeArg(src, h, f.srcC, f.srcPlanar, f.srcAtChannel, k, S, flip);
    Side b = MakeArg(dst, h, f.dstC, f.dstPlanar, f.dstAtChannel, k, S, flip);
    const Pvx8u* mp = mask.row<Pvx8u>(flip ? h - 1 : 0);
    int ms = flip ? -mask.step() : mask.step();
    ASSERT_EQ(m.call({a.arg(), a.step, b.arg(), b.step, {w, h}, mp, ms, flags}), pvxStsNoErr);
    EXPECT_TRUE(RegionEquals(dst, want));
    EXPECT_TRUE(src.Unchanged());
    EXPECT_TRUE(mask.Unchanged());
}

TEST(Copy, EveryMemberAgainstReference)
{
    std::uint64_t seed = 1;
    for (const Member& m : kMembers) {
        Rng rng = MakeRng(seed++);
        for (Shape s : WidthSweep(rng)) {
            SCOPED_TRACE(::testing::Message() << m.name << " seed " << seed - 1 << " width " << s.width << " height "
                                              << s.height);
            RunCase(m, s, rng);
            if (HasFatalFailure()) return;
        }
    }
}

TEST(Copy, MaskedFormsWithAnAllZeroMaskWriteNothing)
{
    Rng rng = MakeRng(77);
    for (const Member& m : kMembers) {
        if (!m.form.masked) continue;
        SCOPED_TRACE(m.name);
        const Form& f = m.form;
        for (int w : {1, 16, 33, 200}) {
            GuardedImage src = MakeSide(w, 3, f.srcC, false, m.elemBytes, rng, {});
            GuardedImage dst = MakeSide(w, 3, f.dstC, false, m.elemBytes, rng, {});
            GuardedImage mask(w, 3, 1, 1, rng, {});
            FillMask(mask, 1, rng);
            EXPECT_TRUE(NothingWritten(m.call({src.data(), src.step(), dst.data(), dst.step(), {w, 3}, mask.data(),
                                               mask.step(), 0}),
                                       pvxStsNoErr, dst));
        }
    }
}

// Pointers (source, destination, mask; every plane of a planar side) -8,
// then width and height -6; steps are never checked.
TEST(Copy, CheckOrderAndNothingWrittenOnError)
{
    Rng rng = MakeRng(3);
    for (const Member& m : kMembers) {
        SCOPED_TRACE(m.name);
        const Form& f = m.form;
        const int S = m.elemBytes, w = 5, h = 2;
        GuardedImage src = MakeSide(w, h, f.srcC, f.srcPlanar, S, rng, {});
        GuardedImage dst = MakeSide(w, h, f.dstC, f.dstPlanar, S, rng, {});
        GuardedImage mask(w, h, 1, 1, rng, {});
        FillMask(mask, 2, rng);
        Side a = MakeArg(src, h, f.srcC, f.srcPlanar, false, 0, S, false);
        Side b = MakeArg(dst, h, f.dstC, f.dstPlanar, false, 0, S, false);
        auto call = [&](const void* s, void* d, const Pvx8u* mp, PvxiSize roi) {
            return m.call({s, a.step, d, b.step, roi, mp, mask.step(), 2});
        };
        for (PvxiSize roi : {PvxiSize{w, h}, PvxiSize{0, 0}, PvxiSize{-1, h}}) {
            EXPECT_TRUE(NothingWritten(call(nullptr, b.arg(), mask.data(), roi), pvxStsNullPtrErr, dst, src));
            EXPECT_TRUE(NothingWritten(call(a.arg(), nullptr, mask.data(), roi), pvxStsNullPtrErr, dst, src));
            if (f.masked) {
                EXPECT_TRUE(NothingWritten(call(a.arg(), b.arg(), nullptr, roi), pvxStsNullPtrErr, dst, src));
            }
            for (int c = 0; c < 4; ++c) {
                if (f.srcPlanar && c < f.srcC) {
                    Side n = a;
                    n.planes[c] = nullptr;
                    EXPECT_TRUE(NothingWritten(call(n.arg(), b.arg(), mask.data(), roi), pvxStsNullPtrErr, dst));
                }
                if (f.dstPlanar && c < f.dstC) {
                    Side n = b;
                    n.planes[c] = nullptr;
                    EXPECT_TRUE(NothingWritten(call(a.arg(), n.arg(), mask.data(), roi), pvxStsNullPtrErr, dst));
                }
            }
        }
        for (PvxiSize roi : {PvxiSize{0, h}, PvxiSize{w, 0}, PvxiSize{-3, h}, PvxiSize{w, -1}, PvxiSize{0, 0}})
            EXPECT_TRUE(NothingWritten(call(a.arg(), b.arg(), mask.data(), roi), pvxStsSizeErr, dst, src, mask));
    }
}

// A step of 0 with height 3 processes the first row three times: the first
// destination row is the copy of the first source row, and nothing else moves.
TEST(Copy, ZeroStepsAreAcceptedAndRepeatTheFirstRow)
{
    Rng rng = MakeRng(4);
    for (const Member& m : kMembers) {
        SCOPED_TRACE(m.name);
        const Form& f = m.form;
        const int S = m.elemBytes, w = 37;
        GuardedImage src = MakeSide(w, 1, f.srcC, f.srcPlanar, S, rng, {});
        GuardedImage dst = MakeSide(w, 1, f.dstC, f.dstPlanar, S, rng, {});
        GuardedImage mask(w, 1, 1, 1, rng, {});
        FillMask(mask, 0, rng);
        auto in = src.Packed<Pvx8u>();
        auto want = dst.Packed<Pvx8u>();
        const int k = f.srcC > 1 && f.dstC > 1 ? 1 : 2;
        for (int x = 0; x < w; ++x) {
            if (f.masked && mask.data()[x] == 0) continue;
            for (int dc = 0; dc < f.dstC; ++dc)
                if (int sc = f.src(dc, k); sc >= 0)
                    std::memcpy(&want[At(w, 1, f.dstC, f.dstPlanar, S, x, 0, dc)],
                                &in[At(w, 1, f.srcC, f.srcPlanar, S, x, 0, sc)], S);
        }
        Side a = MakeArg(src, 1, f.srcC, f.srcPlanar, f.srcAtChannel, k, S, false);
        Side b = MakeArg(dst, 1, f.dstC, f.dstPlanar, f.dstAtChannel, k, S, false);
        ASSERT_EQ(m.call({a.arg(), 0, b.arg(), 0, {w, 3}, mask.data(), 0, 2}), pvxStsNoErr);
        EXPECT_TRUE(RegionEquals(dst, want));
    }
}

TEST(Copy, NaNBitPatternsSurvive32fCopies)
{
    std::vector<Pvx32f> src(4 * 40), dst(4 * 40, 0.0f);
    for (std::size_t i = 0; i < src.size(); ++i) std::memcpy(&src[i], &kNaNs[i % 4], 4);
    ASSERT_EQ(pvxiCopy_32f_C4R(src.data(), 16 * 40, dst.data(), 16 * 40, {40, 1}), pvxStsNoErr);
    EXPECT_EQ(std::memcmp(src.data(), dst.data(), src.size() * 4), 0);
    std::vector<Pvx32f> p0(40), p1(40), p2(40), p3(40), back(4 * 40);
    Pvx32f* planes[4] = {p0.data(), p1.data(), p2.data(), p3.data()};
    ASSERT_EQ(pvxiCopy_32f_C4P4R(src.data(), 16 * 40, planes, 4 * 40, {40, 1}), pvxStsNoErr);
    const Pvx32f* cplanes[4] = {p0.data(), p1.data(), p2.data(), p3.data()};
    ASSERT_EQ(pvxiCopy_32f_P4C4R(cplanes, 4 * 40, back.data(), 16 * 40, {40, 1}), pvxStsNoErr);
    EXPECT_EQ(std::memcmp(src.data(), back.data(), src.size() * 4), 0);
    std::uint32_t bits;
    std::memcpy(&bits, &p2[5], 4);
    EXPECT_EQ(bits, kNaNs[(5 * 4 + 2) % 4]);
}

// Large planar copies of 4-byte elements stream their stores once they write
// at least the largest cache; the pixels are those of the reference all the
// same (the streamed kernels are also checked directly below). Plane pointers are offset so that the streamed path starts after a
// scalar head, or misaligned against each other so that it falls back to
// ordinary stores. Height-1 calls stay below the threshold.
TEST(Copy, LargePlanarCopiesEqualTheReference)
{
    int cache = 0;
    ASSERT_EQ(pvxGetMaxCacheSizeB(&cache), pvxStsNoErr);
    // Where the cache is too large for a test region, 1200x1000 still runs
    // the ordinary path of a region above the threshold.
    const bool streamed = cache <= (64 << 20);
    const int w = 1200;
    for (int channels : {3, 4}) {
        const int h = streamed ? static_cast<int>(static_cast<std::int64_t>(cache) / (w * channels * 4)) + 3 : 1000;
        const std::size_t n = static_cast<std::size_t>(w) * h;
        for (int skew : {0, 1}) {
            SCOPED_TRACE(::testing::Message() << "channels " << channels << " skew " << skew);
            std::vector<std::uint32_t> inter(n * channels + 8), planes(n * channels + 16), back(n * channels + 8);
            Rng rng = MakeRng(channels);
            for (auto& v : inter) v = static_cast<std::uint32_t>(rng());
            const int step = w * 4, istep = w * channels * 4;
            Pvx32f* p[4];
            for (int c = 0; c < channels; ++c)
                p[c] = reinterpret_cast<Pvx32f*>(planes.data() + 1 + c * (n + skew));
            const Pvx32f* src = reinterpret_cast<const Pvx32f*>(inter.data() + 1);
            if (channels == 3) ASSERT_EQ(pvxiCopy_32f_C3P3R(src, istep, p, step, {w, h}), pvxStsNoErr);
            else ASSERT_EQ(pvxiCopy_32f_C4P4R(src, istep, p, step, {w, h}), pvxStsNoErr);
            std::size_t bad = 0;
            for (int c = 0; c < channels; ++c)
                for (std::size_t i = 0; i < n; ++i)
                    bad += std::memcmp(p[c] + i, src + i * channels + c, 4) != 0;
            EXPECT_EQ(bad, 0u);

            const Pvx32f* cp[4] = {p[0], p[1], p[2], p[3]};
            Pvx32f* out = reinterpret_cast<Pvx32f*>(back.data() + 3);
            if (channels == 3) ASSERT_EQ(pvxiCopy_32f_P3C3R(cp, step, out, istep, {w, h}), pvxStsNoErr);
            else ASSERT_EQ(pvxiCopy_32f_P4C4R(cp, step, out, istep, {w, h}), pvxStsNoErr);
            EXPECT_EQ(std::memcmp(out, src, n * channels * 4), 0);
            EXPECT_EQ(back[0] | back[1] | back[2], 0u);
            EXPECT_EQ(back[3 + n * channels], 0u);

            // height-1 calls take the ordinary path
            std::fill(back.begin(), back.end(), 0u);
            for (int y = 0; y < h; y += 97) {
                const Pvx32f* r[4];
                for (int c = 0; c < channels; ++c) r[c] = p[c] + static_cast<std::size_t>(y) * w;
                Pvx32f* d = out + static_cast<std::size_t>(y) * w * channels;
                if (channels == 3) ASSERT_EQ(pvxiCopy_32f_P3C3R(r, step, d, istep, {w, 1}), pvxStsNoErr);
                else ASSERT_EQ(pvxiCopy_32f_P4C4R(r, step, d, istep, {w, 1}), pvxStsNoErr);
                EXPECT_EQ(std::memcmp(d, src + static_cast<std::size_t>(y) * w * channels, w * channels * 4), 0);
            }
        }
    }
}

// The streamed row kernels write what the ordinary ones write, for every
// alignment of the output streams (the cache of the test machine may be too
// large for the public calls to take the streamed path).
template <class M>
void CheckStreamedRow(int inStreams, int outStreams, Rng& rng)
{
    using pvx::move::Byte;
    for (int w : {1, 3, 4, 5, 17, 64, 301}) {
        for (int off = 0; off < 16; off += 4) {
            for (int skew : {0, 4, 8}) {
                const std::size_t plane = (static_cast<std::size_t>(w) * M::kOutPix + 15) / 16 * 16 + 64;
                std::vector<Byte> in(4 * (static_cast<std::size_t>(w) * M::kInPix + 64));
                for (auto& b : in) b = static_cast<Byte>(rng());
                std::vector<Byte> a(4 * plane + 64, 0xA5), b(4 * plane + 64, 0xA5);
                const Byte* ip[4];
                Byte* ap[4];
                Byte* bp[4];
                for (int s = 0; s < inStreams; ++s) ip[s] = in.data() + s * (w * M::kInPix + 64) + off;
                for (int s = 0; s < outStreams; ++s) {
                    std::size_t at = s * plane + off + (s == 1 ? skew : 0);
                    ap[s] = a.data() + at;
                    bp[s] = b.data() + at;
                }
                pvx::move::MoveRow<M, false, true>(ip, ap, w);
                pvx::move::MoveRow<M, false, false>(ip, bp, w);
                EXPECT_EQ(a, b) << "width " << w << " offset " << off << " skew " << skew;
            }
        }
    }
}

TEST(Copy, StreamedPlanarKernelsEqualOrdinaryOnes)
{
    Rng rng = MakeRng(21);
    CheckStreamedRow<pvx::move::Deinterleave<4, 3>>(1, 3, rng);
    CheckStreamedRow<pvx::move::Deinterleave<4, 4>>(1, 4, rng);
    CheckStreamedRow<pvx::move::Interleave<4, 3>>(3, 1, rng);
    CheckStreamedRow<pvx::move::Interleave<4, 4>>(4, 1, rng);
}

TEST(Copy, ManagedCopyIsTheSameWithEveryFlag)
{
    Rng rng = MakeRng(11);
    std::vector<Pvx8u> src(100000), a(100000), b(100000);
    FillRandom(src.data(), src.size(), rng);
    for (int off : {0, 1, 7, 15}) {
        for (int flags : {0, 2, 3, 0x7fffffff}) {
            std::fill(a.begin(), a.end(), 0);
            std::fill(b.begin(), b.end(), 0);
            ASSERT_EQ(pvxiCopyManaged_8u_C1R(src.data() + off, 997, a.data() + 16 - off, 1000, {997, 99}, flags),
                      pvxStsNoErr);
            ASSERT_EQ(pvxiCopy_8u_C1R(src.data() + off, 997, b.data() + 16 - off, 1000, {997, 99}), pvxStsNoErr);
            EXPECT_EQ(a, b) << "offset " << off << " flags " << flags;
        }
    }
}

}  // namespace
