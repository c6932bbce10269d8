// Add, Sub, Mul and their constant forms, every member, against the wide
// reference of tests/ref/arith_ref.h: every scale factor from -10 to 20 and a
// few extreme ones, random operands including the type's extremes, in-place
// forms, AC4 alpha, check order, zero steps, and nothing written on error.
#include <climits>
#include <cstring>

#include <xmmintrin.h>

#include "harness.h"
#include "ref/arith_ref.h"

namespace {

using namespace pvxtest;
using pvxref::Bin;

template <class T> constexpr bool kComplex = Elem<T>::kParts == 2;
template <class T> constexpr bool kFloat = std::is_floating_point_v<ElemT<T>>;

template <class T>
std::vector<int> ScaleFactors()
{
    if constexpr (kFloat<T>) {
        return {0};
    } else {
        std::vector<int> sfs;
        for (int sf = -10; sf <= 20; ++sf) sfs.push_back(sf);
        for (int sf : {-15, -16, -17, -31, -40, INT_MIN, 24, 29, 30, 31, 32, 33, 34, 63, 64, 65, 100, INT_MAX})
            sfs.push_back(sf);
        return sfs;
    }
}

template <class T>
T RandomPixelElem(Rng& rng)
{
    T v;
    FillRandom(reinterpret_cast<ElemT<T>*>(&v), Elem<T>::kParts, rng);
    return v;
}

// The element value that makes the operation a copy (0 for Add and Sub, 1 for Mul).
template <class T>
T Identity(Bin op)
{
    T v{};
    auto* p = reinterpret_cast<ElemT<T>*>(&v);
    p[0] = op == Bin::kMul ? 1 : 0;
    return v;
}

template <class T>
std::vector<ElemT<T>> Parts(const std::vector<T>& v)
{
    std::vector<ElemT<T>> out(v.size() * Elem<T>::kParts);
    std::memcpy(out.data(), v.data(), v.size() * sizeof(T));
    return out;
}

// Expected region: element i of a pixel of C elements is x op y where i % C <
// K, else the destination's old value (AC4 alpha).
template <class T, class X, class Y>
std::vector<T> Expect(Bin op, int C, int K, int sf, const std::vector<T>& old, X x, Y y)
{
    std::vector<T> want(old.size());
    for (std::size_t i = 0; i < old.size(); ++i)
        want[i] = static_cast<int>(i % C) < K ? pvxref::RefBin(op, x(i), y(i), sf) : old[i];
    return want;
}

Shape RandomShape(Rng& rng) { return {RandInt(rng, 1, 100), RandInt(rng, 1, 3)}; }

std::vector<Shape> ShapesFor(int sf, Rng& rng)
{
    if (sf >= -1 && sf <= 3) return Shapes(rng, 22, 130);
    return {RandomShape(rng), RandomShape(rng)};
}

// One type and layout of one operation: the two-image, in-place, constant and
// constant in-place members. Sub is second minus first: its two-image forms
// take x from the second image.
template <class T>
using TwoFn = PvxStatus (*)(const T*, int, const T*, int, T*, int, PvxiSize, int);
template <class T>
using InPlaceFn = PvxStatus (*)(const T*, int, T*, int, PvxiSize, int);
template <class T>
using ConstFn = PvxStatus (*)(const T*, int, const T*, T*, int, PvxiSize, int);
template <class T>
using ConstInPlaceFn = PvxStatus (*)(const T*, T*, int, PvxiSize, int);

// C elements per pixel in memory, the first K of them processed.
template <class T>
void RunMembers(const char* name, Bin op, int C, int K, TwoFn<T> two, InPlaceFn<T> inPlace, ConstFn<T> cst,
                ConstInPlaceFn<T> cstInPlace)
{
    const bool swap = op == Bin::kSub;
    std::uint64_t seed = 0;
    for (const char* c = name; *c; ++c) seed = seed * 131 + static_cast<unsigned char>(*c);
    Rng rng = MakeRng(seed);
    for (int sf : ScaleFactors<T>()) {
        for (Shape s : ShapesFor(sf, rng)) {
            SCOPED_TRACE(::testing::Message() << name << " sf " << sf << " width " << s.width << " height "
                                              << s.height);
            PvxiSize roi{s.width, s.height};
            GuardedImage a = MakeImage<T>(s.width, s.height, C, rng), b = MakeImage<T>(s.width, s.height, C, rng);
            GuardedImage d = MakeImage<T>(s.width, s.height, C, rng);
            auto pa = a.Packed<T>(), pb = b.Packed<T>(), pd = d.Packed<T>();
            T value[4];
            for (T& v : value) v = RandInt(rng, 0, 3) == 0 ? Identity<T>(op) : RandomPixelElem<T>(rng);
            auto at = [](const std::vector<T>& v) { return [&v](std::size_t i) { return v[i]; }; };
            auto val = [&](std::size_t i) { return value[i % C]; };

            // two images
            ASSERT_EQ(two(a.ptr<T>(), a.step(), b.ptr<T>(), b.step(), d.ptr<T>(), d.step(), roi, sf), pvxStsNoErr);
            auto want = swap ? Expect(op, C, K, sf, pd, at(pb), at(pa)) : Expect(op, C, K, sf, pd, at(pa), at(pb));
            ASSERT_TRUE(RegionEquals(d, Parts(want))) << "two images";
            ASSERT_TRUE(a.Unchanged() && b.Unchanged());

            // in place: srcDst = srcDst op src for Sub, src op srcDst otherwise
            GuardedImage e = MakeImage<T>(s.width, s.height, C, rng);
            auto pe = e.Packed<T>();
            ASSERT_EQ(inPlace(a.ptr<T>(), a.step(), e.ptr<T>(), e.step(), roi, sf), pvxStsNoErr);
            want = swap ? Expect(op, C, K, sf, pe, at(pe), at(pa)) : Expect(op, C, K, sf, pe, at(pa), at(pe));
            ASSERT_TRUE(RegionEquals(e, Parts(want))) << "in place";

            // constant: src op value
            d.Snapshot();
            pd = d.Packed<T>();
            ASSERT_EQ(cst(a.ptr<T>(), a.step(), value, d.ptr<T>(), d.step(), roi, sf), pvxStsNoErr);
            want = Expect(op, C, K, sf, pd, at(pa), val);
            ASSERT_TRUE(RegionEquals(d, Parts(want))) << "constant";
            ASSERT_TRUE(a.Unchanged());

            // constant in place: srcDst op value
            e.Snapshot();
            pe = e.Packed<T>();
            ASSERT_EQ(cstInPlace(value, e.ptr<T>(), e.step(), roi, sf), pvxStsNoErr);
            want = Expect(op, C, K, sf, pe, at(pe), val);
            ASSERT_TRUE(RegionEquals(e, Parts(want))) << "constant in place";
        }
    }

    // Check order: pointers (-8) before sizes (-6); complex members then steps
    // (-14); real members use steps as given.
    SCOPED_TRACE(name);
    GuardedImage a = MakeImage<T>(8, 3, C, rng), b = MakeImage<T>(8, 3, C, rng), d = MakeImage<T>(8, 3, C, rng);
    const T* pa = a.ptr<T>();
    const T* pb = b.ptr<T>();
    T* pd = d.ptr<T>();
    int sa = a.step(), sb = b.step(), sd = d.step();
    T value[4] = {Identity<T>(op), RandomPixelElem<T>(rng), RandomPixelElem<T>(rng), RandomPixelElem<T>(rng)};
    const PvxiSize ok{8, 3}, none{0, 0};
    constexpr PvxStatus kNull = pvxStsNullPtrErr, kSize = pvxStsSizeErr, kStep = pvxStsStepErr;
    EXPECT_TRUE(NothingWritten(two(nullptr, sa, pb, sb, pd, sd, none, 1), kNull, a, b, d));
    EXPECT_TRUE(NothingWritten(two(pa, sa, nullptr, sb, pd, sd, none, 1), kNull, a, b, d));
    EXPECT_TRUE(NothingWritten(two(pa, sa, pb, sb, nullptr, sd, none, 1), kNull, a, b, d));
    EXPECT_TRUE(NothingWritten(inPlace(nullptr, sa, pd, sd, none, 1), kNull, a, d));
    EXPECT_TRUE(NothingWritten(inPlace(pa, sa, nullptr, sd, none, 1), kNull, a, d));
    EXPECT_TRUE(NothingWritten(cst(nullptr, sa, value, pd, sd, none, 1), kNull, a, d));
    EXPECT_TRUE(NothingWritten(cst(pa, sa, value, nullptr, sd, none, 1), kNull, a, d));
    EXPECT_TRUE(NothingWritten(cstInPlace(value, nullptr, sd, none, 1), kNull, d));
    if (K > 1) {
        EXPECT_TRUE(NothingWritten(cst(pa, sa, nullptr, pd, sd, none, 1), kNull, a, d));
        EXPECT_TRUE(NothingWritten(cstInPlace(nullptr, pd, sd, none, 1), kNull, d));
    }
    for (PvxiSize bad : {PvxiSize{0, 3}, PvxiSize{8, 0}, PvxiSize{-1, 3}, PvxiSize{8, INT_MIN}}) {
        EXPECT_TRUE(NothingWritten(two(pa, 0, pb, -1, pd, 0, bad, 0), kSize, a, b, d));
        EXPECT_TRUE(NothingWritten(inPlace(pa, 0, pd, 0, bad, 0), kSize, a, d));
        EXPECT_TRUE(NothingWritten(cst(pa, 0, value, pd, 0, bad, 0), kSize, a, d));
        EXPECT_TRUE(NothingWritten(cstInPlace(value, pd, 0, bad, 0), kSize, d));
    }
    if constexpr (kComplex<T>) {
        for (int bad : {0, -1, INT_MIN}) {
            EXPECT_TRUE(NothingWritten(two(pa, bad, pb, sb, pd, sd, ok, 0), kStep, a, b, d));
            EXPECT_TRUE(NothingWritten(two(pa, sa, pb, bad, pd, sd, ok, 0), kStep, a, b, d));
            EXPECT_TRUE(NothingWritten(two(pa, sa, pb, sb, pd, bad, ok, 0), kStep, a, b, d));
            EXPECT_TRUE(NothingWritten(inPlace(pa, bad, pd, sd, ok, 0), kStep, a, d));
            EXPECT_TRUE(NothingWritten(inPlace(pa, sa, pd, bad, ok, 0), kStep, a, d));
            EXPECT_TRUE(NothingWritten(cst(pa, bad, value, pd, sd, ok, 0), kStep, a, d));
            EXPECT_TRUE(NothingWritten(cst(pa, sa, value, pd, bad, ok, 0), kStep, a, d));
            EXPECT_TRUE(NothingWritten(cstInPlace(value, pd, bad, ok, 0), kStep, d));
        }
    } else {
        // Zero source steps re-read the first row for every destination row.
        auto row0 = [](const GuardedImage& img) {
            auto p = img.Packed<T>();
            std::vector<T> out(p.size());
            for (std::size_t i = 0; i < p.size(); ++i) out[i] = p[i % (p.size() / img.height())];
            return out;
        };
        auto r0a = row0(a), r0b = row0(b);
        auto old = d.Packed<T>();
        auto at = [](const std::vector<T>& v) { return [&v](std::size_t i) { return v[i]; }; };
        int sf = kFloat<T> ? 0 : 1;
        ASSERT_EQ(two(pa, 0, pb, 0, pd, sd, ok, sf), pvxStsNoErr);
        auto want = swap ? Expect(op, C, K, sf, old, at(r0b), at(r0a)) : Expect(op, C, K, sf, old, at(r0a), at(r0b));
        EXPECT_TRUE(RegionEquals(d, Parts(want))) << "zero source steps";
        d.Snapshot();
        old = d.Packed<T>();
        auto val = [&](std::size_t) { return value[1]; };
        T v1[4] = {value[1], value[1], value[1], value[1]};
        ASSERT_EQ(cst(pa, 0, v1, pd, sd, ok, sf), pvxStsNoErr);
        want = Expect(op, C, K, sf, old, at(r0a), val);
        EXPECT_TRUE(RegionEquals(d, Parts(want))) << "zero source step, constant";
    }
}

#define WITH_SF(x) , x
#define NO_SF(x)
#define ONE_VALUE *v
#define VALUES v
#define MEMBERS(OP, t, L, SFX, SFA, C, K, VAL)                                                                    \
    RunMembers<Pvx##t>(                                                                                          \
        "pvxi" #OP "_" #t "_" #L, Bin::k##OP, C, K,                                                              \
        +[](const Pvx##t* a, int as, const Pvx##t* b, int bs, Pvx##t* d, int ds, PvxiSize r,                      \
           [[maybe_unused]] int sf) { return pvxi##OP##_##t##_##L##R##SFX(a, as, b, bs, d, ds, r SFA(sf)); },       \
        +[](const Pvx##t* a, int as, Pvx##t* d, int ds, PvxiSize r, [[maybe_unused]] int sf) {                    \
            return pvxi##OP##_##t##_##L##IR##SFX(a, as, d, ds, r SFA(sf));                                           \
        },                                                                                                       \
        +[](const Pvx##t* a, int as, const Pvx##t* v, Pvx##t* d, int ds, PvxiSize r, [[maybe_unused]] int sf) {   \
            return pvxi##OP##C_##t##_##L##R##SFX(a, as, VAL, d, ds, r SFA(sf));                                      \
        },                                                                                                       \
        +[](const Pvx##t* v, Pvx##t* d, int ds, PvxiSize r, [[maybe_unused]] int sf) {                            \
            return pvxi##OP##C_##t##_##L##IR##SFX(VAL, d, ds, r SFA(sf));                                            \
        })

#define REAL_MEMBERS(OP, t, SFX, SFA)                  \
    MEMBERS(OP, t, C1, SFX, SFA, 1, 1, ONE_VALUE);     \
    MEMBERS(OP, t, C3, SFX, SFA, 3, 3, VALUES);        \
    MEMBERS(OP, t, C4, SFX, SFA, 4, 4, VALUES);        \
    MEMBERS(OP, t, AC4, SFX, SFA, 4, 3, VALUES)
#define COMPLEX_MEMBERS(OP, t, SFX, SFA)               \
    MEMBERS(OP, t, C1, SFX, SFA, 1, 1, ONE_VALUE);     \
    MEMBERS(OP, t, C3, SFX, SFA, 3, 3, VALUES);        \
    MEMBERS(OP, t, AC4, SFX, SFA, 4, 3, VALUES)

#define FAMILY_TESTS(OP)                                                  \
    TEST(OP, Members8u) { REAL_MEMBERS(OP, 8u, Sfs, WITH_SF); }           \
    TEST(OP, Members16u) { REAL_MEMBERS(OP, 16u, Sfs, WITH_SF); }         \
    TEST(OP, Members16s) { REAL_MEMBERS(OP, 16s, Sfs, WITH_SF); }         \
    TEST(OP, Members32f) { REAL_MEMBERS(OP, 32f, , NO_SF); }              \
    TEST(OP, Members16sc) { COMPLEX_MEMBERS(OP, 16sc, Sfs, WITH_SF); }    \
    TEST(OP, Members32sc) { COMPLEX_MEMBERS(OP, 32sc, Sfs, WITH_SF); }    \
    TEST(OP, Members32fc) { COMPLEX_MEMBERS(OP, 32fc, , NO_SF); }

FAMILY_TESTS(Add)
FAMILY_TESTS(Sub)
FAMILY_TESTS(Mul)

// ---- documented cases ----------------------------------------------------------

TEST(Add, RoundsHalfToEven)
{
    Pvx8u a[3] = {1, 2, 3}, b[3] = {2, 3, 4}, d[3];
    ASSERT_EQ(pvxiAdd_8u_C1RSfs(a, 3, b, 3, d, 3, {3, 1}, 1), pvxStsNoErr);
    EXPECT_EQ(d[0], 2);
    EXPECT_EQ(d[1], 2);
    EXPECT_EQ(d[2], 4);
}

TEST(Add, LargeScaleFactorsGiveZeroOrSaturate)
{
    Rng rng = MakeRng(3);
    std::vector<Pvx8u> a(200), b(200), d(200, 7);
    FillRandom(a.data(), a.size(), rng);
    FillRandom(b.data(), b.size(), rng);
    a[0] = b[0] = 0;
    a[1] = b[1] = 255;
    ASSERT_EQ(pvxiAdd_8u_C1RSfs(a.data(), 200, b.data(), 200, d.data(), 200, {200, 1}, 10), pvxStsNoErr);
    for (Pvx8u v : d) ASSERT_EQ(v, 0);
    ASSERT_EQ(pvxiAdd_8u_C1RSfs(a.data(), 200, b.data(), 200, d.data(), 200, {200, 1}, 9), pvxStsNoErr);
    EXPECT_EQ(d[1], 1);  // 510 / 512 rounds to 1
    ASSERT_EQ(pvxiAdd_8u_C1RSfs(a.data(), 200, b.data(), 200, d.data(), 200, {200, 1}, -8), pvxStsNoErr);
    for (int i = 0; i < 200; ++i) ASSERT_EQ(d[i], a[i] + b[i] ? 255 : 0) << i;
}

TEST(Add, ConstantZeroCopiesTheSource)
{
    Rng rng = MakeRng(4);
    GuardedImage s = MakeImage<Pvx8u>(77, 5, 1, rng), d = MakeImage<Pvx8u>(77, 5, 1, rng);
    ASSERT_EQ(pvxiAddC_8u_C1RSfs(s.ptr<Pvx8u>(), s.step(), 0, d.ptr<Pvx8u>(), d.step(), {77, 5}, 0), pvxStsNoErr);
    EXPECT_TRUE(RegionEquals(d, s.Packed<Pvx8u>()));

    // One pointer with different steps is not in place: a zero source step
    // copies the first row into every row.
    auto want = d.Packed<Pvx8u>();
    for (std::size_t i = 77; i < want.size(); ++i) want[i] = want[i % 77];
    ASSERT_EQ(pvxiAddC_8u_C1RSfs(d.ptr<Pvx8u>(), 0, 0, d.ptr<Pvx8u>(), d.step(), {77, 5}, 0), pvxStsNoErr);
    EXPECT_TRUE(RegionEquals(d, want));
}

TEST(Add, ContiguousRowsGiveTheSameResult)
{
    Rng rng = MakeRng(5);
    std::vector<Pvx16s> a(37 * 3 * 5), b(a.size()), d1(a.size()), d2(a.size());
    FillRandom(a.data(), a.size(), rng);
    FillRandom(b.data(), b.size(), rng);
    int step = 37 * 3 * 2;
    ASSERT_EQ(pvxiAdd_16s_C3RSfs(a.data(), step, b.data(), step, d1.data(), step, {37, 5}, 2), pvxStsNoErr);
    for (int y = 0; y < 5; ++y)
        ASSERT_EQ(pvxiAdd_16s_C3RSfs(a.data() + 111 * y, step, b.data() + 111 * y, step, d2.data() + 111 * y, step,
                                     {37, 1}, 2),
                  pvxStsNoErr);
    EXPECT_EQ(d1, d2);
}

// Whole-region calls on contiguous rows (one merged row) equal row-by-row calls,
// so constants keep their channel pattern and AC4 alpha across rows.
template <class T, int C, class F>
void ExpectMergedEqualsRows(F call)
{
    const int w = 37, h = 4, n = w * C;
    Rng rng = MakeRng(11);
    std::vector<T> a(n * h), b(n * h), d1(n * h), d2(n * h);
    FillRandom(reinterpret_cast<ElemT<T>*>(a.data()), a.size() * Elem<T>::kParts, rng);
    FillRandom(reinterpret_cast<ElemT<T>*>(b.data()), b.size() * Elem<T>::kParts, rng);
    FillRandom(reinterpret_cast<ElemT<T>*>(d1.data()), d1.size() * Elem<T>::kParts, rng);
    d2 = d1;
    int step = n * static_cast<int>(sizeof(T));
    ASSERT_EQ(call(a.data(), b.data(), d1.data(), step, PvxiSize{w, h}), pvxStsNoErr);
    for (int y = 0; y < h; ++y)
        ASSERT_EQ(call(a.data() + n * y, b.data() + n * y, d2.data() + n * y, step, PvxiSize{w, 1}), pvxStsNoErr);
    EXPECT_EQ(std::memcmp(d1.data(), d2.data(), d1.size() * sizeof(T)), 0);
}

TEST(Arith, ContiguousRowsKeepPatternsAndAlpha)
{
    ExpectMergedEqualsRows<Pvx8u, 3>([](const Pvx8u* a, const Pvx8u*, Pvx8u* d, int st, PvxiSize r) {
        const Pvx8u v[3] = {1, 200, 37};
        return pvxiAddC_8u_C3RSfs(a, st, v, d, st, r, 1);
    });
    ExpectMergedEqualsRows<Pvx8u, 4>([](const Pvx8u* a, const Pvx8u* b, Pvx8u* d, int st, PvxiSize r) {
        return pvxiMul_8u_AC4RSfs(a, st, b, st, d, st, r, 3);
    });
    ExpectMergedEqualsRows<Pvx32fc, 4>([](const Pvx32fc* a, const Pvx32fc*, Pvx32fc* d, int st, PvxiSize r) {
        const Pvx32fc v[3] = {{1, 2}, {-3, 0.5f}, {7, 7}};
        return pvxiSubC_32fc_AC4R(a, st, v, d, st, r);
    });
    ExpectMergedEqualsRows<Pvx16sc, 3>([](const Pvx16sc* a, const Pvx16sc*, Pvx16sc* d, int st, PvxiSize r) {
        const Pvx16sc v[3] = {{1, 2}, {-3, 5}, {7, 7}};
        return pvxiMulC_16sc_C3RSfs(a, st, v, d, st, r, 2);
    });
    ExpectMergedEqualsRows<Pvx16u, 3>([](const Pvx16u* a, const Pvx16u*, Pvx16u* d, int st, PvxiSize r) {
        const Pvx16u v[3] = {0, 0, 0};
        return pvxiSubC_16u_C3RSfs(a, st, v, d, st, r, 0);
    });
}

TEST(Arith, NegativeStepsWalkUpwards)
{
    const int w = 21, h = 3;
    Rng rng = MakeRng(12);
    std::vector<Pvx8u> a(w * h), b(w * h), d(w * h), want(w * h);
    FillRandom(a.data(), a.size(), rng);
    FillRandom(b.data(), b.size(), rng);
    ASSERT_EQ(pvxiSub_8u_C1RSfs(a.data() + w * (h - 1), -w, b.data() + w * (h - 1), -w, d.data() + w * (h - 1), -w,
                                {w, h}, 0),
              pvxStsNoErr);
    for (int i = 0; i < w * h; ++i) want[i] = b[i] > a[i] ? b[i] - a[i] : 0;
    EXPECT_EQ(d, want);
}

TEST(Sub, SecondMinusFirst)
{
    Pvx8u a = 10, b = 3, d = 99;
    ASSERT_EQ(pvxiSub_8u_C1RSfs(&a, 1, &b, 1, &d, 1, {1, 1}, 0), pvxStsNoErr);
    EXPECT_EQ(d, 0);
    ASSERT_EQ(pvxiSub_8u_C1RSfs(&b, 1, &a, 1, &d, 1, {1, 1}, 0), pvxStsNoErr);
    EXPECT_EQ(d, 7);
    Pvx8u sd = 10;
    ASSERT_EQ(pvxiSub_8u_C1IRSfs(&b, 1, &sd, 1, {1, 1}, 0), pvxStsNoErr);
    EXPECT_EQ(sd, 7);
    ASSERT_EQ(pvxiSubC_8u_C1RSfs(&a, 1, 3, &d, 1, {1, 1}, 0), pvxStsNoErr);
    EXPECT_EQ(d, 7);
    Pvx32f fa = 1.5f, fb = 4.0f, fd = 0;
    ASSERT_EQ(pvxiSub_32f_C1R(&fa, 4, &fb, 4, &fd, 4, {1, 1}), pvxStsNoErr);
    EXPECT_EQ(fd, 2.5f);
}

TEST(Mul, ComplexProduct)
{
    Pvx16sc a{3, 4}, b{5, -2}, d{};
    ASSERT_EQ(pvxiMul_16sc_C1RSfs(&a, 4, &b, 4, &d, 4, {1, 1}, 0), pvxStsNoErr);
    EXPECT_EQ(d.re, 23);  // 15 + 8
    EXPECT_EQ(d.im, 14);  // -6 + 20
    Pvx32sc big{INT_MIN, INT_MIN}, e{};
    ASSERT_EQ(pvxiMul_32sc_C1RSfs(&big, 8, &big, 8, &e, 8, {1, 1}, 62), pvxStsNoErr);
    EXPECT_EQ(e.re, 0);  // 2^62 - 2^62
    EXPECT_EQ(e.im, 2);  // 2^63 / 2^62
    Pvx32fc fa{1.5f, -2.0f}, fb{4.0f, 0.25f}, fd{};
    ASSERT_EQ(pvxiMulC_32fc_C1R(&fa, 8, fb, &fd, 8, {1, 1}), pvxStsNoErr);
    EXPECT_EQ(fd.re, 6.5f);
    EXPECT_EQ(fd.im, -7.625f);
}

// Every pairing of parts from the extremes and their neighbours, in rows long
// enough for whole registers: the sums that reach 2^31 or 2^63 (all four parts
// the minimum) or come near it, and ties, at every scale factor where they
// differ.
template <class T, class F>
void ComplexExtremes(int sfFrom, int sfTo, F mul)
{
    std::vector<T> a, b;
    AppendExtremePairs(a, b);
    const int n = static_cast<int>(a.size()), step = n * static_cast<int>(sizeof(T));
    std::vector<T> d(n);
    for (int sf = sfFrom; sf <= sfTo; ++sf) {
        SCOPED_TRACE(sf);
        ASSERT_EQ(mul(a.data(), step, b.data(), step, d.data(), step, PvxiSize{n, 1}, sf), pvxStsNoErr);
        for (int i = 0; i < n; ++i) {
            T want = pvxref::RefBin(Bin::kMul, a[i], b[i], sf);
            ASSERT_TRUE(d[i].re == want.re && d[i].im == want.im)
                << i << ": (" << a[i].re << ", " << a[i].im << ") (" << b[i].re << ", " << b[i].im << ")";
        }
    }
}

TEST(Mul, ComplexExtremes)
{
    ComplexExtremes<Pvx16sc>(-17, 33, pvxiMul_16sc_C1RSfs);
    ComplexExtremes<Pvx32sc>(-33, 65, pvxiMul_32sc_C1RSfs);
}

TEST(Mul, ZeroFromScaleFactor17For8u)
{
    Pvx8u a = 255, d = 9;
    ASSERT_EQ(pvxiMul_8u_C1RSfs(&a, 1, &a, 1, &d, 1, {1, 1}, 16), pvxStsNoErr);
    EXPECT_EQ(d, 1);  // 65025 / 65536
    ASSERT_EQ(pvxiMul_8u_C1RSfs(&a, 1, &a, 1, &d, 1, {1, 1}, 17), pvxStsNoErr);
    EXPECT_EQ(d, 0);
}

// The product members of one 16-bit type, for the rounding-mode test.
template <class T>
struct Products {
    PvxStatus (*mul)(const T*, int, const T*, int, T*, int, PvxiSize, int);
    PvxStatus (*mulI)(const T*, int, T*, int, PvxiSize, int);
    PvxStatus (*mulC)(const T*, int, T, T*, int, PvxiSize, int);
    PvxStatus (*sqr)(const T*, int, T*, int, PvxiSize, int);
    T constant;
};

// Operands a * b: for each scale factor 1 to 8, products at the ties
// q 2^sf + 2^(sf-1) (odd and even q) and one off them either side, and
// then every pair of the given values.
template <class T>
void TieOperands(std::initializer_list<int> qs, std::initializer_list<T> values, std::vector<T>& a, std::vector<T>& b)
{
    for (int sf = 1; sf <= 8; ++sf)
        for (int q : qs)
            for (int off = -1; off <= 1; ++off) {
                long p = static_cast<long>(q) * (1L << sf) + (1L << (sf - 1)) + off;
                if (p % 2 != 0 || p / 2 > std::numeric_limits<T>::max()) continue;
                a.push_back(2);
                b.push_back(static_cast<T>(p / 2));
            }
    for (T x : values)
        for (T y : values) {
            a.push_back(x);
            b.push_back(y);
        }
}

// 16-bit products are scaled in float lanes at scale factors 1 to 8: they
// give the exact rule under each rounding mode a caller may have set, in the
// plain, in-place, constant and square forms, and the caller's mode is back.
template <class T>
void ProductsIgnoreTheCallersRoundingMode(const Products<T>& f, const std::vector<T>& a, const std::vector<T>& b)
{
    const int n = static_cast<int>(a.size()), step = n * static_cast<int>(sizeof(T));
    const unsigned saved = _MM_GET_ROUNDING_MODE();
    for (unsigned mode : {_MM_ROUND_NEAREST, _MM_ROUND_DOWN, _MM_ROUND_UP, _MM_ROUND_TOWARD_ZERO})
        for (int sf = 1; sf <= 9; ++sf) {
            SCOPED_TRACE(::testing::Message() << "mode " << mode << " sf " << sf);
            std::vector<T> plain(n), inPlace = b, byConst(n), square(n);
            _MM_SET_ROUNDING_MODE(mode);
            const PvxStatus st[4] = {f.mul(a.data(), step, b.data(), step, plain.data(), step, {n, 1}, sf),
                                     f.mulI(a.data(), step, inPlace.data(), step, {n, 1}, sf),
                                     f.mulC(b.data(), step, f.constant, byConst.data(), step, {n, 1}, sf),
                                     f.sqr(b.data(), step, square.data(), step, {n, 1}, sf)};
            const unsigned after = _MM_GET_ROUNDING_MODE();
            _MM_SET_ROUNDING_MODE(saved);
            EXPECT_EQ(after, mode);
            for (PvxStatus s : st) ASSERT_EQ(s, pvxStsNoErr);
            for (int i = 0; i < n; ++i) {
                const pvxref::Wide x = a[i], y = b[i];
                ASSERT_EQ(plain[i], pvxref::Sfs<T>(x * y, sf)) << a[i] << " * " << b[i];
                ASSERT_EQ(inPlace[i], plain[i]) << a[i] << " * " << b[i];
                ASSERT_EQ(byConst[i], pvxref::Sfs<T>(f.constant * y, sf)) << b[i];
                ASSERT_EQ(square[i], pvxref::Sfs<T>(y * y, sf)) << b[i];
            }
        }
}

// Products around 2^24 (the end of exact floats) and the extremes too; 16u
// products up to 65535 squared need all 32 bits and saturate.
TEST(Mul, Products16IgnoreTheCallersRoundingMode)
{
    std::vector<Pvx16s> a, b;
    TieOperands<Pvx16s>({0, 1, 2, 3, -1, -2, -3, 4095, -4096},
                        {4096, 4097, 4095, -4096, -4097, 32767, -32768, 181, -181, 23170, 2049}, a, b);
    ProductsIgnoreTheCallersRoundingMode<Pvx16s>(
        {pvxiMul_16s_C1RSfs, pvxiMul_16s_C1IRSfs, pvxiMulC_16s_C1RSfs, pvxiSqr_16s_C1RSfs, -3}, a, b);
    std::vector<Pvx16u> c, d;
    TieOperands<Pvx16u>({0, 1, 2, 3, 4095, 65534, 65535},
                        {4096, 4097, 4095, 8191, 32768, 46340, 46341, 65535, 255, 256, 257, 2049}, c, d);
    ProductsIgnoreTheCallersRoundingMode<Pvx16u>(
        {pvxiMul_16u_C1RSfs, pvxiMul_16u_C1IRSfs, pvxiMulC_16u_C1RSfs, pvxiSqr_16u_C1RSfs, 65535}, c, d);
}

}  // namespace
