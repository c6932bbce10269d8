// Mirror against a scalar reference: every member and flip, the in-place
// forms and the same-pointer redirection, the diagonal flips of the
// one-channel members, the refused no-op flips, check orders, nothing written
// on error, and a region large enough for the streaming stores of 8u C1.
#include <array>

#include "harness.h"
#include "ref/move_ref.h"

namespace {

using namespace pvxtest;
using pvxref::RefDiagonal;
using pvxref::RefMirror;

template <class T>
using MirrorFn = PvxStatus (*)(const T*, int, T*, int, PvxiSize, int);
template <class T>
using MirrorIFn = PvxStatus (*)(T*, int, PvxiSize, int);

template <class T>
struct Members {
    std::array<MirrorFn<T>, 4> fn;    // C1 C3 C4 AC4
    std::array<MirrorIFn<T>, 4> ifn;  // the in-place forms
};

const Members<Pvx8u> k8u{{pvxiMirror_8u_C1R, pvxiMirror_8u_C3R, pvxiMirror_8u_C4R, pvxiMirror_8u_AC4R},
                         {pvxiMirror_8u_C1IR, pvxiMirror_8u_C3IR, pvxiMirror_8u_C4IR, pvxiMirror_8u_AC4IR}};
const Members<Pvx16u> k16u{{pvxiMirror_16u_C1R, pvxiMirror_16u_C3R, pvxiMirror_16u_C4R, pvxiMirror_16u_AC4R},
                           {pvxiMirror_16u_C1IR, pvxiMirror_16u_C3IR, pvxiMirror_16u_C4IR, pvxiMirror_16u_AC4IR}};
const Members<Pvx16s> k16s{{pvxiMirror_16s_C1R, pvxiMirror_16s_C3R, pvxiMirror_16s_C4R, pvxiMirror_16s_AC4R},
                           {pvxiMirror_16s_C1IR, pvxiMirror_16s_C3IR, pvxiMirror_16s_C4IR, pvxiMirror_16s_AC4IR}};
const Members<Pvx32s> k32s{{pvxiMirror_32s_C1R, pvxiMirror_32s_C3R, pvxiMirror_32s_C4R, pvxiMirror_32s_AC4R},
                           {pvxiMirror_32s_C1IR, pvxiMirror_32s_C3IR, pvxiMirror_32s_C4IR, pvxiMirror_32s_AC4IR}};
const Members<Pvx32f> k32f{{pvxiMirror_32f_C1R, pvxiMirror_32f_C3R, pvxiMirror_32f_C4R, pvxiMirror_32f_AC4R},
                           {pvxiMirror_32f_C1IR, pvxiMirror_32f_C3IR, pvxiMirror_32f_C4IR, pvxiMirror_32f_AC4IR}};

const char* const kLayoutNames[4] = {"C1", "C3", "C4", "AC4"};
const int kMemChannels[4] = {1, 3, 4, 4};

bool ChangesNothing(Shape s, int flip)
{
    return (flip != 1 && s.height == 1) || (flip != 0 && s.width == 1);
}

template <class T>
void EveryMember(const Members<T>& m, const char* type, std::uint64_t seed)
{
    for (int li = 0; li < 4; ++li) {
        int ch = kMemChannels[li];
        bool alpha = li == 3;
        for (int flip = 0; flip < 3; ++flip) {
            std::string member = std::string("Mirror_") + type + "_" + kLayoutNames[li] + "R flip " +
                                 std::to_string(flip);
            ForShapes(member.c_str(), seed + li * 8 + flip, 30, [&](Shape s, Rng& rng) {
                PvxiSize roi{s.width, s.height};
                GuardedImage src = MakeImage<T>(s.width, s.height, ch, rng);
                GuardedImage dst = MakeImage<T>(s.width, s.height, ch, rng);
                const auto dstBefore = dst.Packed<T>();  // AC4 keeps its alpha
                PvxStatus st = m.fn[li](src.ptr<T>(), src.step(), dst.ptr<T>(), dst.step(), roi, flip);
                if (ChangesNothing(s, flip)) {
                    EXPECT_TRUE(NothingWritten(st, pvxStsSizeErr, dst));
                } else {
                    ASSERT_EQ(st, pvxStsNoErr);
                    EXPECT_TRUE(RegionEquals(dst, RefMirror(src.Packed<T>(), dstBefore, s.width, s.height, ch, alpha,
                                                            flip)));
                }
                EXPECT_TRUE(src.Unchanged());

                // The in-place form, and the same pointer with equal steps.
                for (int form = 0; form < 2; ++form) {
                    GuardedImage img = MakeImage<T>(s.width, s.height, ch, rng);
                    auto before = img.Packed<T>();
                    PvxStatus si = form == 0 ? m.ifn[li](img.ptr<T>(), img.step(), roi, flip)
                                             : m.fn[li](img.ptr<T>(), img.step(), img.ptr<T>(), img.step(), roi, flip);
                    if (ChangesNothing(s, flip)) {
                        EXPECT_TRUE(NothingWritten(si, pvxStsSizeErr, img)) << "form " << form;
                    } else {
                        ASSERT_EQ(si, pvxStsNoErr) << "form " << form;
                        EXPECT_TRUE(RegionEquals(img, RefMirror(before, before, s.width, s.height, ch, alpha, flip)))
                            << "form " << form;
                    }
                }
            });
        }
        // The axes 3 and 4 belong to the one-channel not-in-place members.
        Rng rng = MakeRng(seed + 99);
        GuardedImage img = MakeImage<T>(9, 7, ch, rng), other = MakeImage<T>(7, 9, ch, rng);
        for (int flip : {3, 4, 5, -1}) {
            EXPECT_TRUE(NothingWritten(m.ifn[li](img.ptr<T>(), img.step(), {9, 7}, flip), pvxStsMirrorFlipErr, img));
            if (li != 0 || (flip != 3 && flip != 4)) {
                EXPECT_TRUE(NothingWritten(
                    m.fn[li](img.ptr<T>(), img.step(), other.ptr<T>(), other.step(), {9, 7}, flip),
                    pvxStsMirrorFlipErr, other))
                    << type << kLayoutNames[li] << " flip " << flip;
            }
        }
    }
}

TEST(Mirror, EveryMemberAgainstReference)
{
    EveryMember(k8u, "8u", 200);
    EveryMember(k16u, "16u", 300);
    EveryMember(k16s, "16s", 400);
    EveryMember(k32s, "32s", 500);
    EveryMember(k32f, "32f", 600);
}

template <class T>
void Diagonals(MirrorFn<T> fn, const char* type, std::uint64_t seed)
{
    for (int flip : {3, 4}) {
        std::string member = std::string("Mirror_") + type + "_C1R flip " + std::to_string(flip);
        ForShapes(member.c_str(), seed + flip, 40, [&](Shape s, Rng& rng) {
            // Tall shapes too: the destination is height x width.
            Shape t = RandInt(rng, 0, 1) ? s : Shape{s.height, s.width};
            GuardedImage src = MakeImage<T>(t.width, t.height, 1, rng);
            GuardedImage dst = MakeImage<T>(t.height, t.width, 1, rng);
            ASSERT_EQ(fn(src.ptr<T>(), src.step(), dst.ptr<T>(), dst.step(), {t.width, t.height}, flip), pvxStsNoErr);
            EXPECT_TRUE(RegionEquals(dst, RefDiagonal(src.Packed<T>(), t.width, t.height, flip)));
            EXPECT_TRUE(src.Unchanged());
        });
    }
}

TEST(Mirror, DiagonalsOfOneChannelMembers)
{
    Diagonals(pvxiMirror_8u_C1R, "8u", 700);
    Diagonals(pvxiMirror_16u_C1R, "16u", 710);
    Diagonals(pvxiMirror_16s_C1R, "16s", 720);
    Diagonals(pvxiMirror_32s_C1R, "32s", 730);
    Diagonals(pvxiMirror_32f_C1R, "32f", 740);
}

TEST(Mirror, DocumentedExamples)
{
    Pvx8u row[5] = {1, 2, 3, 4, 5}, out[5] = {9, 9, 9, 9, 9};
    // Height 1: flip 0 changes nothing and is refused; flip 1 reverses.
    EXPECT_EQ(pvxiMirror_8u_C1R(row, 5, out, 5, {5, 1}, 0), pvxStsSizeErr);
    EXPECT_EQ(out[0], 9);
    EXPECT_EQ(pvxiMirror_8u_C1R(row, 5, out, 5, {5, 1}, 2), pvxStsSizeErr);
    ASSERT_EQ(pvxiMirror_8u_C1R(row, 5, out, 5, {5, 1}, 1), pvxStsNoErr);
    EXPECT_EQ(std::vector<Pvx8u>(out, out + 5), (std::vector<Pvx8u>{5, 4, 3, 2, 1}));
    EXPECT_EQ(pvxiMirror_8u_C1R(row, 5, out, 5, {5, 1}, 5), pvxStsMirrorFlipErr);
    // Width 1: flips 1 and 2 are refused, flip 0 turns the column over.
    Pvx16s col[3] = {1, 2, 3}, cout[3] = {};
    EXPECT_EQ(pvxiMirror_16s_C1R(col, 2, cout, 2, {1, 3}, 1), pvxStsSizeErr);
    EXPECT_EQ(pvxiMirror_16s_C1R(col, 2, cout, 2, {1, 3}, 2), pvxStsSizeErr);
    ASSERT_EQ(pvxiMirror_16s_C1R(col, 2, cout, 2, {1, 3}, 0), pvxStsNoErr);
    EXPECT_EQ(cout[0], 3);
    EXPECT_EQ(cout[2], 1);
    // A source step of 0 with flip 0 is accepted: every row is the first.
    Pvx8u two[10] = {};
    ASSERT_EQ(pvxiMirror_8u_C1R(row, 0, two, 5, {5, 2}, 0), pvxStsNoErr);
    EXPECT_EQ(std::vector<Pvx8u>(two, two + 10), (std::vector<Pvx8u>{1, 2, 3, 4, 5, 1, 2, 3, 4, 5}));
    // The same pointer with equal steps is the in-place form, even for a step
    // of 0 and an axis that only the not-in-place members serve.
    Pvx8u sq[4] = {1, 2, 3, 4};
    ASSERT_EQ(pvxiMirror_8u_C1R(sq, 2, sq, 2, {2, 2}, 2), pvxStsNoErr);
    EXPECT_EQ(std::vector<Pvx8u>(sq, sq + 4), (std::vector<Pvx8u>{4, 3, 2, 1}));
    EXPECT_EQ(pvxiMirror_8u_C1R(sq, 2, sq, 2, {2, 2}, 3), pvxStsMirrorFlipErr);
    // AC4 keeps the destination alpha, in place as well.
    Pvx8u px[8] = {1, 2, 3, 100, 5, 6, 7, 200};
    ASSERT_EQ(pvxiMirror_8u_AC4IR(px, 8, {2, 1}, 1), pvxStsNoErr);
    EXPECT_EQ(std::vector<Pvx8u>(px, px + 8), (std::vector<Pvx8u>{5, 6, 7, 100, 1, 2, 3, 200}));
}

TEST(Mirror, CheckOrder)
{
    Rng rng = MakeRng(800);
    GuardedImage src = MakeImage<Pvx8u>(6, 4, 1, rng), dst = MakeImage<Pvx8u>(6, 4, 1, rng);
    const Pvx8u* s = src.ptr<Pvx8u>();
    Pvx8u* d = dst.ptr<Pvx8u>();
    auto f = pvxiMirror_8u_C1R;
    EXPECT_TRUE(NothingWritten(f(nullptr, 6, d, 6, {0, 0}, 9), pvxStsNullPtrErr, dst));
    EXPECT_TRUE(NothingWritten(f(s, 6, nullptr, 6, {0, 0}, 9), pvxStsNullPtrErr, dst));
    EXPECT_TRUE(NothingWritten(f(s, 6, d, 6, {0, 4}, 9), pvxStsSizeErr, dst));
    EXPECT_TRUE(NothingWritten(f(s, 6, d, 6, {6, 4}, 9), pvxStsMirrorFlipErr, dst));
    EXPECT_TRUE(NothingWritten(f(s, 6, d, 6, {6, 1}, 0), pvxStsSizeErr, dst));
    EXPECT_TRUE(NothingWritten(f(s, 6, d, 6, {1, 4}, 1), pvxStsSizeErr, dst));
    // In place: pointer, sizes, flip, then the no-op flips.
    GuardedImage img = MakeImage<Pvx32f>(6, 4, 3, rng);
    Pvx32f* p = img.ptr<Pvx32f>();
    EXPECT_TRUE(NothingWritten(pvxiMirror_32f_C3IR(nullptr, 0, {0, 0}, 9), pvxStsNullPtrErr, img));
    EXPECT_TRUE(NothingWritten(pvxiMirror_32f_C3IR(p, 0, {6, 0}, 9), pvxStsSizeErr, img));
    EXPECT_TRUE(NothingWritten(pvxiMirror_32f_C3IR(p, 0, {6, 4}, 3), pvxStsMirrorFlipErr, img));
    EXPECT_TRUE(NothingWritten(pvxiMirror_32f_C3IR(p, img.step(), {6, 1}, 2), pvxStsSizeErr, img));
    EXPECT_TRUE(NothingWritten(pvxiMirror_32f_C3IR(p, img.step(), {1, 4}, 2), pvxStsSizeErr, img));
}

TEST(Mirror, DiagonalCheckOrder)
{
    Rng rng = MakeRng(810);
    GuardedImage src = MakeImage<Pvx32f>(6, 4, 1, rng), dst = MakeImage<Pvx32f>(4, 6, 1, rng);
    const Pvx32f* s = src.ptr<Pvx32f>();
    Pvx32f* d = dst.ptr<Pvx32f>();
    int ss = src.step(), ds = dst.step();
    auto f = pvxiMirror_32f_C1R;
    for (int flip : {3, 4}) {
        EXPECT_TRUE(NothingWritten(f(nullptr, 0, d, 0, {0, 0}, flip), pvxStsNullPtrErr, dst));
        EXPECT_TRUE(NothingWritten(f(s, 0, nullptr, 0, {0, 0}, flip), pvxStsNullPtrErr, dst));
        // Steps before sizes: below 1, or not a multiple of the element size.
        EXPECT_TRUE(NothingWritten(f(s, 0, d, ds, {0, 0}, flip), pvxStsStepErr, dst));
        EXPECT_TRUE(NothingWritten(f(s, ss, d, -ds, {0, 0}, flip), pvxStsStepErr, dst));
        EXPECT_TRUE(NothingWritten(f(s, ss + 2, d, ds, {0, 0}, flip), pvxStsStepErr, dst));
        EXPECT_TRUE(NothingWritten(f(s, ss, d, 6, {0, 0}, flip), pvxStsStepErr, dst));
        EXPECT_TRUE(NothingWritten(f(s, ss, d, ds, {6, 0}, flip), pvxStsSizeErr, dst));
        // Regions that cannot be used together.
        EXPECT_TRUE(NothingWritten(f(s, 20, d, ds, {6, 4}, flip), pvxStsNotSupportedModeErr, dst));   // step < row
        EXPECT_TRUE(NothingWritten(f(s, ss, d, 12, {6, 4}, flip), pvxStsNotSupportedModeErr, dst));   // step < row
        EXPECT_TRUE(NothingWritten(f(d, ds, d + 1, ds, {4, 4}, flip), pvxStsNotSupportedModeErr, dst));  // overlap
        EXPECT_TRUE(NothingWritten(f(d, ds, d, ds + 4, {4, 4}, flip), pvxStsNotSupportedModeErr, dst));  // overlap
        EXPECT_EQ(f(s, ss, d, ds, {6, 4}, flip), pvxStsNoErr);
        dst.Snapshot();

        // Steps that just hold their rows, and regions that touch without
        // overlapping (either one first in memory), are usable together.
        std::vector<Pvx32f> buf(48);
        for (int i = 0; i < 48; ++i) buf[i] = static_cast<Pvx32f>(i);
        const std::vector<Pvx32f> first(buf.begin(), buf.begin() + 24);
        ASSERT_EQ(f(buf.data(), 24, buf.data() + 24, 16, {6, 4}, flip), pvxStsNoErr);  // source, then destination
        EXPECT_EQ(std::vector<Pvx32f>(buf.begin() + 24, buf.end()), RefDiagonal(first, 6, 4, flip));
        EXPECT_EQ(std::vector<Pvx32f>(buf.begin(), buf.begin() + 24), first);
        ASSERT_EQ(f(buf.data() + 24, 16, buf.data(), 24, {4, 6}, flip), pvxStsNoErr);  // destination, then source
        EXPECT_EQ(std::vector<Pvx32f>(buf.begin(), buf.begin() + 24),
                  RefDiagonal(RefDiagonal(first, 6, 4, flip), 4, 6, flip));
    }
    // The same pointer with equal steps is the in-place form: -21.
    EXPECT_TRUE(NothingWritten(f(d, ds, d, ds, {4, 4}, 3), pvxStsMirrorFlipErr, dst));
}

TEST(Mirror, LargeRegionStreamsTheSameResult)
{
    // 8u C1 flip 0 writes with streaming stores above 2097152 pixels; an
    // unaligned destination checks the aligned start.
    Rng rng = MakeRng(820);
    const int w = 2053, h = 1024;
    GuardedImage src = MakeImage<Pvx8u>(w, h, 1, rng);
    GuardedImage dst = MakeImage<Pvx8u>(w, h, 1, rng);
    ASSERT_GT(std::int64_t{w} * h, 2097152);
    ASSERT_EQ(pvxiMirror_8u_C1R(src.ptr<Pvx8u>(), src.step(), dst.ptr<Pvx8u>(), dst.step(), {w, h}, 0), pvxStsNoErr);
    EXPECT_TRUE(RegionEquals(dst, RefMirror(src.Packed<Pvx8u>(), dst.Packed<Pvx8u>(), w, h, 1, false, 0)));
}

}  // namespace
