// Transpose against a scalar reference: every member, both forms, shapes
// that cover whole blocks and every kind of leftover strip, steps of 0 and
// negative steps, check orders and nothing written on error.
#include <algorithm>
#include <array>

#include "harness.h"
#include "ref/move_ref.h"

namespace {

using namespace pvxtest;
using pvxref::RefTranspose;

template <class T>
using TransposeFn = PvxStatus (*)(const T*, int, T*, int, PvxiSize);
template <class T>
using TransposeIFn = PvxStatus (*)(T*, int, PvxiSize);

template <class T>
struct Members {
    std::array<TransposeFn<T>, 3> fn;    // C1 C3 C4
    std::array<TransposeIFn<T>, 3> ifn;  // C1IR C3IR C4IR
};

const Members<Pvx8u> k8u{{pvxiTranspose_8u_C1R, pvxiTranspose_8u_C3R, pvxiTranspose_8u_C4R},
                         {pvxiTranspose_8u_C1IR, pvxiTranspose_8u_C3IR, pvxiTranspose_8u_C4IR}};
const Members<Pvx16u> k16u{{pvxiTranspose_16u_C1R, pvxiTranspose_16u_C3R, pvxiTranspose_16u_C4R},
                           {pvxiTranspose_16u_C1IR, pvxiTranspose_16u_C3IR, pvxiTranspose_16u_C4IR}};
const Members<Pvx16s> k16s{{pvxiTranspose_16s_C1R, pvxiTranspose_16s_C3R, pvxiTranspose_16s_C4R},
                           {pvxiTranspose_16s_C1IR, pvxiTranspose_16s_C3IR, pvxiTranspose_16s_C4IR}};
const Members<Pvx32s> k32s{{pvxiTranspose_32s_C1R, pvxiTranspose_32s_C3R, pvxiTranspose_32s_C4R},
                           {pvxiTranspose_32s_C1IR, pvxiTranspose_32s_C3IR, pvxiTranspose_32s_C4IR}};
const Members<Pvx32f> k32f{{pvxiTranspose_32f_C1R, pvxiTranspose_32f_C3R, pvxiTranspose_32f_C4R},
                           {pvxiTranspose_32f_C1IR, pvxiTranspose_32f_C3IR, pvxiTranspose_32f_C4IR}};

const int kChannels[3] = {1, 3, 4};

// Sides around every block size (2, 4, 8, 16), random sides, and two shapes
// that cross the tiles (rows of 1 kB at most) in both directions.
std::vector<Shape> TransposeShapes(Rng& rng, int count, int pixelBytes)
{
    const int tile = 1024 / pixelBytes;
    const int sides[] = {1, 2, 3, 4, 5, 7, 8, 9, 15, 16, 17, 31, 32, 33, 63, 64, 65, 67};
    std::vector<Shape> out;
    for (int s : sides) out.push_back({s, sides[RandInt(rng, 0, 17)]});
    out.push_back({2 * tile + RandInt(rng, 1, 9), tile + RandInt(rng, 1, 9)});
    out.push_back({tile + RandInt(rng, 1, 9), 2 * tile + RandInt(rng, 1, 9)});
    while (static_cast<int>(out.size()) < count) {
        int w = RandInt(rng, 0, 2) ? RandInt(rng, 1, 560) : sides[RandInt(rng, 0, 17)];
        int h = RandInt(rng, 0, 2) ? RandInt(rng, 1, 280) : sides[RandInt(rng, 0, 17)];
        out.push_back({w, h});
    }
    return out;
}

template <class T>
void EveryMember(const Members<T>& m, const char* type, std::uint64_t seed)
{
    for (int li = 0; li < 3; ++li) {
        int ch = kChannels[li];
        Rng rng = MakeRng(seed + li);
        for (Shape s : TransposeShapes(rng, 40, static_cast<int>(sizeof(T)) * ch)) {
            SCOPED_TRACE(::testing::Message() << "Transpose_" << type << "_C" << ch << "R seed " << seed + li
                                              << " width " << s.width << " height " << s.height);
            GuardedImage src = MakeImage<T>(s.width, s.height, ch, rng);
            GuardedImage dst = MakeImage<T>(s.height, s.width, ch, rng);
            ASSERT_EQ(m.fn[li](src.ptr<T>(), src.step(), dst.ptr<T>(), dst.step(), {s.width, s.height}), pvxStsNoErr);
            EXPECT_TRUE(RegionEquals(dst, RefTranspose(src.Packed<T>(), s.width, s.height, ch)));
            EXPECT_TRUE(src.Unchanged());
            if (::testing::Test::HasFailure()) return;
        }
        const int sides[] = {1, 2, 3, 4, 7, 8, 9, 16, 17, 31, 32, 33, 40, 63, 64, 65, 67, 97, 130};
        for (int n : sides) {
            SCOPED_TRACE(::testing::Message() << "Transpose_" << type << "_C" << ch << "IR side " << n);
            GuardedImage img = MakeImage<T>(n, n, ch, rng);
            auto want = RefTranspose(img.Packed<T>(), n, n, ch);
            ASSERT_EQ(m.ifn[li](img.ptr<T>(), img.step(), {n, n}), pvxStsNoErr);
            EXPECT_TRUE(RegionEquals(img, want));
            if (::testing::Test::HasFailure()) return;
        }
    }
}

TEST(Transpose, EveryMemberAgainstReference)
{
    EveryMember(k8u, "8u", 100);
    EveryMember(k16u, "16u", 110);
    EveryMember(k16s, "16s", 120);
    EveryMember(k32s, "32s", 130);
    EveryMember(k32f, "32f", 140);
}

// A negative source step reads the source bottom-up. The image ends where its
// buffer ends, so the row read first is the last in memory: a kernel that
// reads past the end of a row reaches beyond the buffer (caught under ASan).
template <class T>
void BottomUp(TransposeFn<T> fn, int ch, Rng& rng)
{
    for (Shape s : {Shape{37, 21}, Shape{1, 5}, Shape{6, 1}, Shape{67, 33}}) {
        SCOPED_TRACE(::testing::Message() << "C" << ch << " " << sizeof(T) << "-byte elements, width " << s.width
                                          << " height " << s.height);
        ShapeOptions o;
        o.tightEnd = true;
        GuardedImage src = MakeImage<T>(s.width, s.height, ch, rng, o), dst = MakeImage<T>(s.height, s.width, ch, rng);
        ASSERT_EQ(fn(src.row<T>(s.height - 1), -src.step(), dst.ptr<T>(), dst.step(), {s.width, s.height}),
                  pvxStsNoErr);
        auto in = src.Packed<T>();
        std::vector<T> flipped(in.size());
        const std::size_t row = static_cast<std::size_t>(s.width) * ch;
        for (int y = 0; y < s.height; ++y)
            std::copy_n(&in[(s.height - 1 - y) * row], row, &flipped[y * row]);
        EXPECT_TRUE(RegionEquals(dst, RefTranspose(flipped, s.width, s.height, ch)));
    }
}

TEST(Transpose, StepsAreUsedAsGiven)
{
    Rng rng = MakeRng(150);
    for (int li = 0; li < 3; ++li) {
        BottomUp(k8u.fn[li], kChannels[li], rng);
        BottomUp(k16u.fn[li], kChannels[li], rng);
        BottomUp(k32f.fn[li], kChannels[li], rng);
    }
    // A source step of 0 repeats the first row.
    GuardedImage src0 = MakeImage<Pvx8u>(19, 1, 1, rng), dst0 = MakeImage<Pvx8u>(18, 19, 1, rng);
    ASSERT_EQ(pvxiTranspose_8u_C1R(src0.ptr<Pvx8u>(), 0, dst0.ptr<Pvx8u>(), dst0.step(), {19, 18}), pvxStsNoErr);
    std::vector<Pvx8u> rep;
    for (int y = 0; y < 18; ++y) for (Pvx8u v : src0.Packed<Pvx8u>()) rep.push_back(v);
    EXPECT_TRUE(RegionEquals(dst0, RefTranspose(rep, 19, 18, 1)));
}

TEST(Transpose, FloatBitPatternsMove)
{
    const std::uint32_t bits[4] = {0x7fc00001u, 0xff800000u, 0x80000000u, 0xffffffffu};
    Pvx32f src[4], dst[4];
    std::memcpy(src, bits, 16);
    ASSERT_EQ(pvxiTranspose_32f_C1R(src, 8, dst, 8, {2, 2}), pvxStsNoErr);
    std::uint32_t got[4];
    std::memcpy(got, dst, 16);
    EXPECT_EQ(got[0], bits[0]);
    EXPECT_EQ(got[1], bits[2]);
    EXPECT_EQ(got[2], bits[1]);
    EXPECT_EQ(got[3], bits[3]);
}

TEST(Transpose, CheckOrder)
{
    Rng rng = MakeRng(160);
    GuardedImage src = MakeImage<Pvx8u>(5, 4, 1, rng), dst = MakeImage<Pvx8u>(4, 5, 1, rng);
    const Pvx8u* s = src.ptr<Pvx8u>();
    Pvx8u* d = dst.ptr<Pvx8u>();
    EXPECT_TRUE(NothingWritten(pvxiTranspose_8u_C1R(nullptr, 0, d, 0, {0, 0}), pvxStsNullPtrErr, dst));
    EXPECT_TRUE(NothingWritten(pvxiTranspose_8u_C1R(s, 5, nullptr, 4, {5, 4}), pvxStsNullPtrErr, dst));
    EXPECT_TRUE(NothingWritten(pvxiTranspose_8u_C1R(s, 0, d, 0, {0, 4}), pvxStsSizeErr, dst));
    EXPECT_TRUE(NothingWritten(pvxiTranspose_8u_C1R(s, 5, d, 4, {5, -4}), pvxStsSizeErr, dst));
    // Steps are not checked.
    EXPECT_EQ(pvxiTranspose_8u_C1R(s, 0, d, dst.step(), {5, 4}), pvxStsNoErr);

    // In place: square regions only; a 4 by 5 region is refused.
    GuardedImage img = MakeImage<Pvx8u>(5, 5, 1, rng);
    Pvx8u* p = img.ptr<Pvx8u>();
    EXPECT_TRUE(NothingWritten(pvxiTranspose_8u_C1IR(nullptr, img.step(), {5, 5}), pvxStsNullPtrErr, img));
    EXPECT_TRUE(NothingWritten(pvxiTranspose_8u_C1IR(p, img.step(), {4, 5}), pvxStsSizeErr, img));
    EXPECT_TRUE(NothingWritten(pvxiTranspose_8u_C1IR(p, img.step(), {5, 4}), pvxStsSizeErr, img));
    EXPECT_TRUE(NothingWritten(pvxiTranspose_8u_C1IR(p, img.step(), {0, 0}), pvxStsSizeErr, img));
    EXPECT_TRUE(NothingWritten(pvxiTranspose_32f_C4IR(img.ptr<Pvx32f>(), 0, {-1, -1}), pvxStsSizeErr, img));
    EXPECT_EQ(pvxiTranspose_8u_C1IR(p, img.step(), {5, 5}), pvxStsNoErr);
}

}  // namespace
