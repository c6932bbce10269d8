// SwapChannels against a scalar reference: every member, random orders
// (repeats included), guarded images, in-place forms and same-pointer calls,
// check orders and nothing written on error.
#include <algorithm>
#include <array>

#include "harness.h"

namespace {

using namespace pvxtest;

enum class Form { C3, C4, AC4, C3C4, C4C3 };

struct FormInfo {
    const char* name;
    int in, out, entries, bound;
};

FormInfo Info(Form f)
{
    switch (f) {
    case Form::C3: return {"C3R", 3, 3, 3, 3};
    case Form::C4: return {"C4R", 4, 4, 4, 4};
    case Form::AC4: return {"AC4R", 4, 4, 3, 3};
    case Form::C3C4: return {"C3C4R", 3, 4, 4, 4};
    case Form::C4C3: return {"C4C3R", 4, 3, 3, 4};
    }
    return {};
}

template <class T>
using SwapFn = PvxStatus (*)(const T*, int, T*, int, PvxiSize, const int*);

template <class T>
struct Members {
    std::array<SwapFn<T>, 5> fn;  // C3 C4 AC4 C3C4 C4C3
};

const Members<Pvx8u> k8u{{pvxiSwapChannels_8u_C3R, pvxiSwapChannels_8u_C4R, pvxiSwapChannels_8u_AC4R,
                          pvxiSwapChannels_8u_C3C4R, pvxiSwapChannels_8u_C4C3R}};
const Members<Pvx16u> k16u{{pvxiSwapChannels_16u_C3R, pvxiSwapChannels_16u_C4R, pvxiSwapChannels_16u_AC4R,
                            pvxiSwapChannels_16u_C3C4R, pvxiSwapChannels_16u_C4C3R}};
const Members<Pvx16s> k16s{{pvxiSwapChannels_16s_C3R, pvxiSwapChannels_16s_C4R, pvxiSwapChannels_16s_AC4R,
                            pvxiSwapChannels_16s_C3C4R, pvxiSwapChannels_16s_C4C3R}};
const Members<Pvx32s> k32s{{pvxiSwapChannels_32s_C3R, pvxiSwapChannels_32s_C4R, pvxiSwapChannels_32s_AC4R,
                            pvxiSwapChannels_32s_C3C4R, pvxiSwapChannels_32s_C4C3R}};
const Members<Pvx32f> k32f{{pvxiSwapChannels_32f_C3R, pvxiSwapChannels_32f_C4R, pvxiSwapChannels_32f_AC4R,
                            pvxiSwapChannels_32f_C3C4R, pvxiSwapChannels_32f_C4C3R}};

// Destination channels that keep their value: the alpha of AC4 and the C3C4
// channels whose entry is 3.
bool Kept(Form f, const int* order, int c)
{
    return c >= Info(f).entries || (f == Form::C3C4 && order[c] == 3);
}

// Reference: destination channel c takes source channel order[c] unless it
// is kept.
template <class T>
std::vector<T> RefSwap(const std::vector<T>& src, const std::vector<T>& dstBefore, std::size_t pixels, Form f,
                       const int* order)
{
    FormInfo fi = Info(f);
    std::vector<T> out = dstBefore;
    for (std::size_t p = 0; p < pixels; ++p) {
        for (int c = 0; c < fi.out; ++c)
            if (!Kept(f, order, c)) out[p * fi.out + c] = src[p * fi.in + order[c]];
    }
    return out;
}

std::array<int, 4> RandomOrder(Rng& rng, Form f)
{
    FormInfo fi = Info(f);
    std::array<int, 4> o{};
    for (int c = 0; c < fi.entries; ++c) o[c] = RandInt(rng, 0, fi.bound - 1);
    if (RandInt(rng, 0, 2) == 0) {  // a permutation
        for (int c = 0; c < fi.entries; ++c) o[c] = c % fi.bound;
        for (int c = fi.entries - 1; c > 0; --c) std::swap(o[c], o[RandInt(rng, 0, c)]);
    }
    return o;
}

template <class T>
void EveryForm(const Members<T>& m, const char* type, std::uint64_t seed)
{
    for (Form f : {Form::C3, Form::C4, Form::AC4, Form::C3C4, Form::C4C3}) {
        FormInfo fi = Info(f);
        std::string member = std::string("SwapChannels_") + type + "_" + fi.name;
        ForShapes(member.c_str(), seed + static_cast<int>(f), 40, [&](Shape s, Rng& rng) {
            auto order = RandomOrder(rng, f);
            GuardedImage src = MakeImage<T>(s.width, s.height, fi.in, rng);
            GuardedImage dst = MakeImage<T>(s.width, s.height, fi.out, rng);
            auto want = RefSwap(src.Packed<T>(), dst.Packed<T>(), std::size_t(s.width) * s.height, f, order.data());
            ASSERT_EQ(m.fn[static_cast<int>(f)](src.ptr<T>(), src.step(), dst.ptr<T>(), dst.step(),
                                                {s.width, s.height}, order.data()),
                      pvxStsNoErr)
                << order[0] << order[1] << order[2] << order[3];
            EXPECT_TRUE(RegionEquals(dst, want)) << order[0] << order[1] << order[2] << order[3];
            EXPECT_TRUE(src.Unchanged());
        });
        // Contiguous rows (steps equal to the row length) and long rows.
        Rng rng = MakeRng(seed * 7 + static_cast<int>(f));
        for (int w : {1, 5, 16, 33, 301}) {
            auto order = RandomOrder(rng, f);
            ShapeOptions packed{false, false, false, 0};
            GuardedImage src = MakeImage<T>(w, 3, fi.in, rng, packed);
            GuardedImage dst = MakeImage<T>(w, 3, fi.out, rng, packed);
            auto want = RefSwap(src.Packed<T>(), dst.Packed<T>(), std::size_t(w) * 3, f, order.data());
            ASSERT_EQ(m.fn[static_cast<int>(f)](src.ptr<T>(), src.step(), dst.ptr<T>(), dst.step(), {w, 3},
                                                order.data()),
                      pvxStsNoErr);
            EXPECT_TRUE(RegionEquals(dst, want)) << member << " packed width " << w;
        }
    }
}

TEST(SwapChannels, EveryMemberAgainstReference)
{
    EveryForm(k8u, "8u", 10);
    EveryForm(k16u, "16u", 20);
    EveryForm(k16s, "16s", 30);
    EveryForm(k32s, "32s", 40);
    EveryForm(k32f, "32f", 50);
}

// With pSrc == pDst every form runs in place on the destination rows,
// whatever srcStep says: a row holds the source pixels from its start and
// takes the destination pixels there (C3C4 and C4C3 change the pixel size,
// so the image holds the wider pixels and the rest of each row stays).
template <class T>
void SamePointer(const Members<T>& m, const char* type, std::uint64_t seed)
{
    for (Form f : {Form::C3, Form::C4, Form::AC4, Form::C3C4, Form::C4C3}) {
        FormInfo fi = Info(f);
        const int wide = std::max(fi.in, fi.out);
        std::string member = std::string("SwapChannels_") + type + "_" + fi.name + " same pointer";
        ForShapes(member.c_str(), seed + static_cast<int>(f), 30, [&](Shape s, Rng& rng) {
            auto order = RandomOrder(rng, f);
            GuardedImage img = MakeImage<T>(s.width, s.height, wide, rng);
            auto before = img.Packed<T>();
            auto want = before;
            const std::size_t row = std::size_t(s.width) * wide;
            for (int y = 0; y < s.height; ++y)
                for (int p = 0; p < s.width; ++p)
                    for (int c = 0; c < fi.out; ++c)
                        if (!Kept(f, order.data(), c))
                            want[y * row + p * fi.out + c] = before[y * row + p * fi.in + order[c]];
            int srcStep = RandInt(rng, 0, 1) ? img.step() : (RandInt(rng, 0, 1) ? -3 : 12345);
            ASSERT_EQ(m.fn[static_cast<int>(f)](img.ptr<T>(), srcStep, img.ptr<T>(), img.step(), {s.width, s.height},
                                                order.data()),
                      pvxStsNoErr);
            EXPECT_TRUE(RegionEquals(img, want)) << order[0] << order[1] << order[2] << order[3];
        }, 700);  // rows of several chunks for the widening form
    }
}

TEST(SwapChannels, SamePointerWorksInPlace)
{
    SamePointer(k8u, "8u", 60);
    SamePointer(k16s, "16s", 61);
    SamePointer(k16u, "16u", 62);
    SamePointer(k32s, "32s", 63);
    SamePointer(k32f, "32f", 64);
}

TEST(SwapChannels, InPlaceForms)
{
    for (int ch : {3, 4}) {
        Form f = ch == 3 ? Form::C3 : Form::C4;
        auto fn = ch == 3 ? pvxiSwapChannels_8u_C3IR : pvxiSwapChannels_8u_C4IR;
        ForShapes(ch == 3 ? "SwapChannels_8u_C3IR" : "SwapChannels_8u_C4IR", 70 + ch, 40, [&](Shape s, Rng& rng) {
            auto order = RandomOrder(rng, f);
            GuardedImage img = MakeImage<Pvx8u>(s.width, s.height, ch, rng);
            auto before = img.Packed<Pvx8u>();
            auto want = RefSwap(before, before, std::size_t(s.width) * s.height, f, order.data());
            ASSERT_EQ(fn(img.ptr<Pvx8u>(), img.step(), {s.width, s.height}, order.data()), pvxStsNoErr);
            EXPECT_TRUE(RegionEquals(img, want));
        });
    }
}

TEST(SwapChannels, DocumentedExamples)
{
    // {2, 1, 0} exchanges the first and third channels; {0, 0, 0} writes the
    // first channel three times, also on one buffer.
    Pvx8u src[9] = {1, 2, 3, 4, 5, 6, 7, 8, 9};
    Pvx8u dst[9] = {};
    const int rev[3] = {2, 1, 0}, first[3] = {0, 0, 0};
    ASSERT_EQ(pvxiSwapChannels_8u_C3R(src, 9, dst, 9, {3, 1}, rev), pvxStsNoErr);
    EXPECT_EQ(std::vector<Pvx8u>(dst, dst + 9), (std::vector<Pvx8u>{3, 2, 1, 6, 5, 4, 9, 8, 7}));
    ASSERT_EQ(pvxiSwapChannels_8u_C3R(src, 9, dst, 9, {3, 1}, first), pvxStsNoErr);
    EXPECT_EQ(std::vector<Pvx8u>(dst, dst + 9), (std::vector<Pvx8u>{1, 1, 1, 4, 4, 4, 7, 7, 7}));
    ASSERT_EQ(pvxiSwapChannels_8u_C3R(src, 9, src, 9, {3, 1}, rev), pvxStsNoErr);
    EXPECT_EQ(std::vector<Pvx8u>(src, src + 9), (std::vector<Pvx8u>{3, 2, 1, 6, 5, 4, 9, 8, 7}));

    // C3C4: an entry of 3 keeps the destination channel.
    Pvx16u s3[6] = {10, 20, 30, 40, 50, 60};
    Pvx16u d4[8] = {1, 2, 3, 4, 5, 6, 7, 8};
    const int bgra[4] = {2, 1, 0, 3};
    ASSERT_EQ(pvxiSwapChannels_16u_C3C4R(s3, 12, d4, 16, {2, 1}, bgra), pvxStsNoErr);
    EXPECT_EQ(std::vector<Pvx16u>(d4, d4 + 8), (std::vector<Pvx16u>{30, 20, 10, 4, 60, 50, 40, 8}));
    // C4C3 may pick the fourth source channel.
    Pvx32f s4[4] = {1.5f, 2.5f, 3.5f, -0.0f};
    Pvx32f d3[3] = {};
    const int pick[3] = {3, 3, 0};
    ASSERT_EQ(pvxiSwapChannels_32f_C4C3R(s4, 16, d3, 12, {1, 1}, pick), pvxStsNoErr);
    EXPECT_TRUE(std::signbit(d3[0]) && d3[0] == 0.0f && d3[2] == 1.5f);
}

TEST(SwapChannels, NegativeStepsAreUsed)
{
    Rng rng = MakeRng(80);
    GuardedImage src = MakeImage<Pvx8u>(21, 4, 3, rng), dst = MakeImage<Pvx8u>(21, 4, 3, rng);
    const int order[3] = {1, 2, 0};
    // Read the source bottom-up.
    ASSERT_EQ(pvxiSwapChannels_8u_C3R(src.row<Pvx8u>(3), -src.step(), dst.ptr<Pvx8u>(), dst.step(), {21, 4}, order),
              pvxStsNoErr);
    auto in = src.Packed<Pvx8u>();
    std::vector<Pvx8u> flipped(in.size());
    for (int y = 0; y < 4; ++y) std::memcpy(&flipped[y * 63], &in[(3 - y) * 63], 63);
    EXPECT_TRUE(RegionEquals(dst, RefSwap(flipped, dst.Packed<Pvx8u>(), 84, Form::C3, order)));
}

TEST(SwapChannels, BitPatternsOfFloatsMove)
{
    const std::uint32_t bits[4] = {0x7fc00001u, 0xff800000u, 0x80000000u, 0x7f800001u};  // NaNs, -inf, -0
    Pvx32f src[4], dst[4];
    std::memcpy(src, bits, 16);
    const int order[4] = {3, 2, 1, 0};
    ASSERT_EQ(pvxiSwapChannels_32f_C4R(src, 16, dst, 16, {1, 1}, order), pvxStsNoErr);
    std::uint32_t got[4];
    std::memcpy(got, dst, 16);
    EXPECT_EQ(got[0], bits[3]);
    EXPECT_EQ(got[1], bits[2]);
    EXPECT_EQ(got[2], bits[1]);
    EXPECT_EQ(got[3], bits[0]);
}

TEST(SwapChannels, CheckOrderNotInPlace)
{
    Rng rng = MakeRng(90);
    GuardedImage src = MakeImage<Pvx8u>(8, 2, 3, rng), dst = MakeImage<Pvx8u>(8, 2, 3, rng);
    const Pvx8u* s = src.ptr<Pvx8u>();
    Pvx8u* d = dst.ptr<Pvx8u>();
    const int ok[3] = {2, 1, 0}, bad[3] = {0, 3, 1}, neg[3] = {2, -1, 0};
    int ss = src.step(), ds = dst.step();
    auto f = pvxiSwapChannels_8u_C3R;
    EXPECT_TRUE(NothingWritten(f(nullptr, 0, d, 0, {0, 0}, nullptr), pvxStsNullPtrErr, dst));
    EXPECT_TRUE(NothingWritten(f(s, 0, nullptr, 0, {0, 0}, ok), pvxStsNullPtrErr, dst));
    EXPECT_TRUE(NothingWritten(f(s, ss, d, ds, {8, 2}, nullptr), pvxStsNullPtrErr, dst));
    EXPECT_TRUE(NothingWritten(f(s, 0, d, 0, {0, 2}, bad), pvxStsSizeErr, dst));
    EXPECT_TRUE(NothingWritten(f(s, 0, d, 0, {8, -1}, bad), pvxStsSizeErr, dst));
    EXPECT_TRUE(NothingWritten(f(s, 0, d, ds, {8, 2}, bad), pvxStsStepErr, dst));
    EXPECT_TRUE(NothingWritten(f(s, ss, d, 0, {8, 2}, bad), pvxStsStepErr, dst));
    EXPECT_TRUE(NothingWritten(f(s, ss, d, ds, {8, 2}, bad), pvxStsChannelOrderErr, dst));
    EXPECT_TRUE(NothingWritten(f(s, ss, d, ds, {8, 2}, neg), pvxStsChannelOrderErr, dst));
    // Negative steps pass the step check.
    EXPECT_TRUE(NothingWritten(f(s, -ss, d, -ds, {8, 2}, bad), pvxStsChannelOrderErr, dst));

    // Bounds of every form; the last entry is checked too.
    GuardedImage s4 = MakeImage<Pvx32f>(8, 2, 4, rng), d4 = MakeImage<Pvx32f>(8, 2, 4, rng);
    GuardedImage d3 = MakeImage<Pvx32f>(8, 2, 3, rng);
    const int c4bad[4] = {0, 1, 2, 4}, ac4bad[3] = {0, 1, 3}, c4c3bad[3] = {0, 3, 4}, c3c4bad[4] = {0, 1, 2, -1};
    const int c4ok[4] = {3, 2, 1, 0};
    auto* p4 = s4.ptr<Pvx32f>();
    EXPECT_TRUE(NothingWritten(pvxiSwapChannels_32f_C4R(p4, s4.step(), d4.ptr<Pvx32f>(), d4.step(), {8, 2}, c4bad),
                               pvxStsChannelOrderErr, d4));
    EXPECT_TRUE(NothingWritten(pvxiSwapChannels_32f_AC4R(p4, s4.step(), d4.ptr<Pvx32f>(), d4.step(), {8, 2}, ac4bad),
                               pvxStsChannelOrderErr, d4));
    EXPECT_TRUE(NothingWritten(
        pvxiSwapChannels_32f_C4C3R(p4, s4.step(), d3.ptr<Pvx32f>(), d3.step(), {8, 2}, c4c3bad),
        pvxStsChannelOrderErr, d3));
    EXPECT_TRUE(NothingWritten(
        pvxiSwapChannels_32f_C3C4R(d3.ptr<Pvx32f>(), d3.step(), d4.ptr<Pvx32f>(), d4.step(), {8, 2}, c3c4bad),
        pvxStsChannelOrderErr, d4, d3));
    EXPECT_EQ(pvxiSwapChannels_32f_C4R(p4, s4.step(), d4.ptr<Pvx32f>(), d4.step(), {8, 2}, c4ok), pvxStsNoErr);
}

TEST(SwapChannels, CheckOrderInPlace)
{
    Rng rng = MakeRng(91);
    GuardedImage img = MakeImage<Pvx8u>(8, 2, 3, rng);
    Pvx8u* p = img.ptr<Pvx8u>();
    const int bad[3] = {0, 1, 3};
    auto f = pvxiSwapChannels_8u_C3IR;
    EXPECT_TRUE(NothingWritten(f(nullptr, 0, {0, 0}, nullptr), pvxStsNullPtrErr, img));
    // The step comes before the sizes, and the order pointer after them.
    EXPECT_TRUE(NothingWritten(f(p, 0, {0, 0}, bad), pvxStsStepErr, img));
    EXPECT_TRUE(NothingWritten(f(p, 0, {0, 2}, nullptr), pvxStsStepErr, img));
    EXPECT_TRUE(NothingWritten(f(p, img.step(), {0, 2}, nullptr), pvxStsSizeErr, img));
    EXPECT_TRUE(NothingWritten(f(p, img.step(), {8, 2}, nullptr), pvxStsNullPtrErr, img));
    EXPECT_TRUE(NothingWritten(f(p, img.step(), {8, 2}, bad), pvxStsChannelOrderErr, img));
    const int bad4[4] = {0, 1, 2, 4};
    GuardedImage img4 = MakeImage<Pvx8u>(8, 2, 4, rng);
    EXPECT_TRUE(NothingWritten(pvxiSwapChannels_8u_C4IR(img4.ptr<Pvx8u>(), -img4.step(), {8, 2}, bad4),
                               pvxStsChannelOrderErr, img4));
}

}  // namespace
