// Set: every member against a scalar reference on guarded images, the check
// order, zero steps, 32f bit patterns and large streamed fills.
#include <algorithm>
#include <cstdint>
#include <cstring>
#include <vector>

#include "../../pointops/move.h"
#include "harness.h"

namespace {

using namespace pvxtest;

struct Args {
    const void* value;  // the value itself for one-value forms, else the array
    void* dst;
    int dstStep;
    PvxiSize roi;
    const Pvx8u* mask;
    int maskStep;
};
using Call = PvxStatus (*)(const Args&);

enum class Kind { kAll, kAlpha, kChannel };  // every channel, channels 0-2 of 4, channel k

struct Member {
    const char* name;
    int elemBytes, channels;
    Kind kind;
    bool masked, array;
    Call call;
};

#define SET_ONE(t, T, l, name, C, kind)                                                                        \
    {#name, sizeof(T), C, kind, false, false,                                                                  \
     [](const Args& a) { return name(*static_cast<const T*>(a.value), static_cast<T*>(a.dst), a.dstStep, a.roi); }}
#define SET_N(t, T, l, C, kind)                                                                               \
    {"pvxiSet_" #t "_" #l "R", sizeof(T), C, kind, false, true, [](const Args& a) {                          \
         return pvxiSet_##t##_##l##R(static_cast<const T*>(a.value), static_cast<T*>(a.dst), a.dstStep, a.roi); \
     }}
#define SET_M1(t, T)                                                                                          \
    {"pvxiSet_" #t "_C1MR", sizeof(T), 1, Kind::kAll, true, false, [](const Args& a) {                       \
         return pvxiSet_##t##_C1MR(*static_cast<const T*>(a.value), static_cast<T*>(a.dst), a.dstStep, a.roi,  \
                                   a.mask, a.maskStep);                                                       \
     }}
#define SET_MN(t, T, l, C, kind)                                                                              \
    {"pvxiSet_" #t "_" #l "MR", sizeof(T), C, kind, true, true, [](const Args& a) {                          \
         return pvxiSet_##t##_##l##MR(static_cast<const T*>(a.value), static_cast<T*>(a.dst), a.dstStep,       \
                                      a.roi, a.mask, a.maskStep);                                             \
     }}
#define SET_TYPE(t, T)                                                                                        \
    SET_ONE(t, T, C1, pvxiSet_##t##_C1R, 1, Kind::kAll), SET_N(t, T, C3, 3, Kind::kAll),                     \
        SET_N(t, T, C4, 4, Kind::kAll), SET_N(t, T, AC4, 4, Kind::kAlpha), SET_M1(t, T),                      \
        SET_MN(t, T, C3, 3, Kind::kAll), SET_MN(t, T, C4, 4, Kind::kAll), SET_MN(t, T, AC4, 4, Kind::kAlpha), \
        SET_ONE(t, T, C3CR, pvxiSet_##t##_C3CR, 3, Kind::kChannel),                                          \
        SET_ONE(t, T, C4CR, pvxiSet_##t##_C4CR, 4, Kind::kChannel)

const Member kMembers[] = {
    SET_TYPE(8u, Pvx8u), SET_TYPE(16s, Pvx16s), SET_TYPE(16u, Pvx16u), SET_TYPE(32f, Pvx32f), SET_TYPE(32s, Pvx32s),
};

#undef SET_TYPE
#undef SET_MN
#undef SET_M1
#undef SET_N
#undef SET_ONE

// Random value bytes, sometimes one repeated byte; 4-byte members get NaN
// bit patterns now and then. Exactly the values the member takes (three for
// AC4), so that a read beyond them shows under AddressSanitizer.
std::vector<Pvx8u> RandomValue(const Member& m, Rng& rng)
{
    const int count = !m.array ? 1 : m.kind == Kind::kAlpha ? 3 : m.channels;
    std::vector<Pvx8u> v(count * m.elemBytes);
    for (auto& b : v) b = static_cast<Pvx8u>(rng());
    if (RandInt(rng, 0, 3) == 0) std::fill(v.begin(), v.end(), v[0]);  // 0, -1, 0x0101...: one repeated byte
    const std::uint32_t nans[] = {0x7f800001u, 0xffc12345u};
    if (m.elemBytes == 4 && RandInt(rng, 0, 2) == 0) std::memcpy(&v[0], &nans[RandInt(rng, 0, 1)], 4);
    return v;
}

// The expected region: dst with the value written where the member writes.
std::vector<Pvx8u> Expected(const Member& m, const GuardedImage& dst, const GuardedImage& mask,
                            const std::vector<Pvx8u>& value, int k)
{
    auto want = dst.Packed<Pvx8u>();
    auto mk = mask.Packed<Pvx8u>();
    const int S = m.elemBytes, C = m.channels, w = dst.width(), h = dst.height();
    for (int y = 0; y < h; ++y)
        for (int x = 0; x < w; ++x) {
            if (m.masked && mk[static_cast<std::size_t>(y) * w + x] == 0) continue;
            for (int c = 0; c < C; ++c) {
                if (m.kind == Kind::kAlpha && c == 3) continue;
                if (m.kind == Kind::kChannel && c != k) continue;
                int vi = m.kind == Kind::kChannel ? 0 : c;
                std::memcpy(&want[((static_cast<std::size_t>(y) * w + x) * C + c) * S], &value[vi * S], S);
            }
        }
    return want;
}

TEST(Set, EveryMemberAgainstReference)
{
    std::uint64_t seed = 500;
    for (const Member& m : kMembers) {
        Rng rng = MakeRng(seed++);
        for (Shape s : WidthSweep(rng)) {
            const int w = s.width, h = s.height, S = m.elemBytes;
            ShapeOptions o;
            o.randomPad = RandInt(rng, 0, 2) != 0;
            o.tightEnd = RandInt(rng, 0, 1) != 0;  // the image ends with its last row: overruns reach ASan
            const bool flip = RandInt(rng, 0, 3) == 0;
            const int k = RandInt(rng, 0, m.channels - 1);
            const int maskMode = RandInt(rng, 0, 5) == 0 ? 1 : (RandInt(rng, 0, 5) == 0 ? 2 : 0);
            SCOPED_TRACE(::testing::Message() << m.name << " seed " << seed - 1 << " width " << w << " height " << h
                                              << " k " << k << " flip " << flip << " contiguous " << !o.randomPad << " tight " << o.tightEnd
                                              << " mask " << maskMode);
            GuardedImage dst(w, h, m.channels * S, S, rng, o);
            dst.Randomize<Pvx8u>(rng);
            GuardedImage mask(w, h, 1, 1, rng, o);
            FillMask(mask, maskMode, rng);
            auto value = RandomValue(m, rng);
            auto want = Expected(m, dst, mask, value, k);
            Pvx8u* d = dst.row<Pvx8u>(flip ? h - 1 : 0) + (m.kind == Kind::kChannel ? k * S : 0);
            const Pvx8u* mp = mask.row<Pvx8u>(flip ? h - 1 : 0);
            ASSERT_EQ(m.call({value.data(), d, flip ? -dst.step() : dst.step(), {w, h}, mp,
                              flip ? -mask.step() : mask.step()}),
                      pvxStsNoErr);
            EXPECT_TRUE(RegionEquals(dst, want));
            EXPECT_TRUE(mask.Unchanged());
            if (HasFatalFailure()) return;
        }
    }
}

// Long rows are filled by copying a filled block over the rest, and separate
// rows as copies of the first: rows shorter and longer than the block,
// padded, contiguous, bottom-up and all one row, with values whose bytes
// differ.
TEST(Set, LargeRegionsAgainstReference)
{
    std::uint64_t seed = 900;
    const Shape shapes[] = {{3000, 25}, {9000, 8}, {13001, 6}, {4100, 40}};
    for (const Member& m : kMembers) {
        if (m.kind != Kind::kAll || m.masked) continue;
        Rng rng = MakeRng(seed++);
        for (Shape s : shapes) {
            for (int variant = 0; variant < 3; ++variant) {
                const int w = s.width, h = s.height, S = m.elemBytes;
                ShapeOptions o;
                o.randomPad = variant != 0;
                const bool flip = variant == 2;
                SCOPED_TRACE(::testing::Message() << m.name << " width " << w << " height " << h << " variant "
                                                  << variant);
                GuardedImage dst(w, h, m.channels * S, S, rng, o);
                dst.Randomize<Pvx8u>(rng);
                GuardedImage mask(1, 1, 1, 1, rng, {});
                std::vector<Pvx8u> value(4 * S);
                for (std::size_t i = 0; i < value.size(); ++i) value[i] = static_cast<Pvx8u>(i * 37 + 11);
                auto want = Expected(m, dst, mask, value, 0);
                Pvx8u* d = dst.row<Pvx8u>(flip ? h - 1 : 0);
                ASSERT_EQ(m.call({value.data(), d, flip ? -dst.step() : dst.step(), {w, h}, nullptr, 0}),
                          pvxStsNoErr);
                EXPECT_TRUE(RegionEquals(dst, want));
                if (HasFatalFailure()) return;
            }
            // A step of 0: every row is the first, which is filled again
            // rather than copied onto itself.
            GuardedImage row(s.width, 1, m.channels * m.elemBytes, m.elemBytes, rng, {});
            row.Randomize<Pvx8u>(rng);
            GuardedImage none(1, 1, 1, 1, rng, {});
            std::vector<Pvx8u> value(4 * m.elemBytes, 0x5A);
            value[0] = 0xA5;
            auto want = Expected(m, row, none, value, 0);
            ASSERT_EQ(m.call({value.data(), row.data(), 0, {s.width, s.height}, nullptr, 0}), pvxStsNoErr);
            EXPECT_TRUE(RegionEquals(row, want)) << m.name << " width " << s.width << " step 0";
        }
    }
}

// Pointers (value array, destination, mask) -8, then width and height -6;
// steps are never checked, and a step of 0 fills the first row again.
TEST(Set, CheckOrderZeroStepsAndNothingWrittenOnError)
{
    Rng rng = MakeRng(6);
    for (const Member& m : kMembers) {
        SCOPED_TRACE(m.name);
        const int w = 21, S = m.elemBytes;
        GuardedImage dst(w, 1, m.channels * S, S, rng, {});
        dst.Randomize<Pvx8u>(rng);
        GuardedImage mask(w, 1, 1, 1, rng, {});
        FillMask(mask, 0, rng);
        auto value = RandomValue(m, rng);
        auto call = [&](const void* v, void* d, const Pvx8u* mp, PvxiSize roi, int step) {
            return m.call({v, d, step, roi, mp, step});
        };
        for (PvxiSize roi : {PvxiSize{w, 1}, PvxiSize{0, 0}}) {
            if (m.array) {
                EXPECT_TRUE(NothingWritten(call(nullptr, dst.data(), mask.data(), roi, 0), pvxStsNullPtrErr, dst));
            }
            EXPECT_TRUE(NothingWritten(call(value.data(), nullptr, mask.data(), roi, 0), pvxStsNullPtrErr, dst));
            if (m.masked) {
                EXPECT_TRUE(NothingWritten(call(value.data(), dst.data(), nullptr, roi, 0), pvxStsNullPtrErr, dst));
            }
        }
        for (PvxiSize roi : {PvxiSize{0, 1}, PvxiSize{w, 0}, PvxiSize{-1, 3}, PvxiSize{w, -2}})
            EXPECT_TRUE(NothingWritten(call(value.data(), dst.data(), mask.data(), roi, 0), pvxStsSizeErr, dst, mask));
        auto want = Expected(m, dst, mask, value, 0);
        ASSERT_EQ(call(value.data(), dst.data(), mask.data(), {w, 3}, 0), pvxStsNoErr);
        EXPECT_TRUE(RegionEquals(dst, want));
    }
}

// A fill larger than the threshold and the largest cache is streamed; the
// bytes are the value all the same, from an unaligned start and with a row
// length that leaves a tail. Where the cache is too large for a test region,
// a 12 MB fill still takes the ordinary path above the threshold.
TEST(Set, LargeFillsEqualTheReference)
{
    int cache = 0;
    ASSERT_EQ(pvxGetMaxCacheSizeB(&cache), pvxStsNoErr);
    const bool streamed = cache <= (64 << 20);
    const int w = 4001, h = streamed ? static_cast<int>(static_cast<std::int64_t>(cache) / (w * 3)) + 2 : 1000;
    std::vector<Pvx8u> buf(static_cast<std::size_t>(w) * 3 * h + 64, 0);
    const Pvx8u v[3] = {1, 2, 3};
    ASSERT_EQ(pvxiSet_8u_C3R(v, buf.data() + 5, w * 3, {w, h}), pvxStsNoErr);
    std::size_t bad = 0;
    for (std::size_t i = 0; i < static_cast<std::size_t>(w) * 3 * h; ++i) bad += buf[5 + i] != v[i % 3];
    EXPECT_EQ(bad, 0u);
    EXPECT_EQ(buf[4], 0);
    EXPECT_EQ(buf[5 + static_cast<std::size_t>(w) * 3 * h], 0);
}

// The streamed fill writes what the ordinary fill writes, at every start
// alignment and length (the public calls stream only above the cache size).
TEST(Set, StreamedFillEqualsOrdinaryFill)
{
    using pvx::move::Byte;
    const Byte pix[12] = {1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12};
    for (int p : {1, 2, 3, 4, 6, 8, 12}) {
        pvx::move::FillPattern pat;
        for (int i = 0; i < 64; ++i) pat.bytes[i] = pix[i % p];
        for (int n : {1, 15, 16, 17, 47, 48, 63, 64, 65, 100, 1000, 1027}) {
            for (int off = 0; off < 16; ++off) {
                std::vector<Byte> a(n + 64, 0), b(n + 64, 0);
                pvx::move::FillRow<true>(a.data() + off, n, pat);
                pvx::move::FillRow<false>(b.data() + off, n, pat);
                EXPECT_EQ(a, b);
                std::size_t bad = 0;
                for (int i = 0; i < n; ++i) bad += a[off + i] != pix[i % p];
                EXPECT_EQ(bad, 0u) << "pattern " << p << " length " << n << " offset " << off;
                EXPECT_EQ(a[off + n], 0);
            }
        }
    }
}

}  // namespace
