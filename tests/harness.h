// Test harness: guarded images, deterministic random fills per type, shape
// generators, comparison helpers and the nothing-written-on-error check.
#pragma once

#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <limits>
#include <random>
#include <string>
#include <type_traits>
#include <vector>

#include "pvxi.h"

namespace pvxtest {

using Rng = std::mt19937_64;

// PVX_TEST_SEED=n in the environment moves every seed by n, so that long runs
// can draw other images and shapes than the fixed ones CI replays; unset, the
// runs are the same every time.
inline std::uint64_t SeedOffset()
{
    static const std::uint64_t offset = [] {
        const char* s = std::getenv("PVX_TEST_SEED");
        return s ? std::strtoull(s, nullptr, 10) : 0ull;
    }();
    return offset;
}

inline Rng MakeRng(std::uint64_t seed)
{
    return Rng((seed + (SeedOffset() << 32)) * 0x9E3779B97F4A7C15ull + 1);
}

inline int RandInt(Rng& rng, int lo, int hi)  // inclusive
{
    return std::uniform_int_distribution<int>(lo, hi)(rng);
}

// ---- element types -----------------------------------------------------------

template <class T> struct Elem { using type = T; static constexpr int kParts = 1; };
template <> struct Elem<Pvx16sc> { using type = Pvx16s; static constexpr int kParts = 2; };
template <> struct Elem<Pvx32sc> { using type = Pvx32s; static constexpr int kParts = 2; };
template <> struct Elem<Pvx32fc> { using type = Pvx32f; static constexpr int kParts = 2; };
template <> struct Elem<Pvx64fc> { using type = Pvx64f; static constexpr int kParts = 2; };
template <class T> using ElemT = typename Elem<T>::type;

template <class T> const char* TypeName();
template <> inline const char* TypeName<Pvx8u>() { return "8u"; }
template <> inline const char* TypeName<Pvx8s>() { return "8s"; }
template <> inline const char* TypeName<Pvx16u>() { return "16u"; }
template <> inline const char* TypeName<Pvx16s>() { return "16s"; }
template <> inline const char* TypeName<Pvx32u>() { return "32u"; }
template <> inline const char* TypeName<Pvx32s>() { return "32s"; }
template <> inline const char* TypeName<Pvx32f>() { return "32f"; }
template <> inline const char* TypeName<Pvx64f>() { return "64f"; }
template <> inline const char* TypeName<Pvx16sc>() { return "16sc"; }
template <> inline const char* TypeName<Pvx32sc>() { return "32sc"; }
template <> inline const char* TypeName<Pvx32fc>() { return "32fc"; }

// Random element: integers over the whole range with the extremes and zero
// over-represented; floats as small integers, fractions and halves (so that
// rounding ties occur), with occasional large values.
template <class E>
E RandomElem(Rng& rng)
{
    int pick = RandInt(rng, 0, 15);
    if constexpr (std::is_integral_v<E>) {
        using L = std::numeric_limits<E>;
        if (pick == 0) return L::min();
        if (pick == 1) return L::max();
        if (pick == 2) return 0;
        if (pick < 6) return static_cast<E>(RandInt(rng, -3, 3) + (std::is_signed_v<E> ? 0 : 3));
        return static_cast<E>(std::uniform_int_distribution<long long>(L::min(), L::max())(rng));
    } else {
        if (pick == 0) return 0;
        if (pick < 4) return static_cast<E>(RandInt(rng, -600, 600)) / 2;
        if (pick == 4) return static_cast<E>(std::uniform_real_distribution<double>(-1e6, 1e6)(rng));
        return static_cast<E>(std::uniform_real_distribution<double>(-300, 300)(rng));
    }
}

// Every pairing of two complex numbers whose parts come from the type's
// extremes, their neighbours and small values (10^4 pairs), appended to x and y.
template <class T>
void AppendExtremePairs(std::vector<T>& x, std::vector<T>& y)
{
    using E = decltype(T{}.re);
    using L = std::numeric_limits<E>;
    const E parts[] = {L::min(), L::min() + 1, L::min() / 2, -3, -1, 0, 1, 2, L::max() / 2 + 1, L::max()};
    for (E p : parts)
        for (E q : parts)
            for (E r : parts)
                for (E s : parts) {
                    x.push_back({p, q});
                    y.push_back({r, s});
                }
}

template <class E>
void FillRandom(E* p, std::size_t n, Rng& rng)
{
    for (std::size_t i = 0; i < n; ++i) p[i] = RandomElem<E>(rng);
}

// ---- guarded images ----------------------------------------------------------

struct ShapeOptions {
    bool randomPad = true;      // step = row bytes + a random pad
    bool unaligned = true;      // first pixel at a random element offset
    bool tightEnd = false;      // no guard after the last row: overreads reach ASan
    int minPadBytes = 0;
};

// An image embedded in a larger buffer: guard bytes before the first row,
// between rows (the pad of each step) and after the last row. Every byte
// outside the region is pattern-filled, so writes outside are caught, and the
// whole buffer can be compared against its state before a call.
class GuardedImage {
public:
    GuardedImage() = default;
    GuardedImage(int width, int height, int pixelBytes, int elemBytes, Rng& rng, ShapeOptions o = {})
        : width_(width), height_(height), pixelBytes_(pixelBytes)
    {
        int rowBytes = width * pixelBytes;
        int pad = o.randomPad ? elemBytes * RandInt(rng, 0, 9) : 0;
        step_ = rowBytes + pad + o.minPadBytes;
        if (step_ < 1) step_ = elemBytes;
        front_ = 64 + (o.unaligned ? elemBytes * RandInt(rng, 0, 15) : 0);
        std::size_t back = o.tightEnd ? 0 : 32 + static_cast<std::size_t>(RandInt(rng, 0, 31));
        std::size_t body = height > 0 ? static_cast<std::size_t>(step_) * (height - 1) + rowBytes : 0;
        buf_.resize(front_ + body + back);
        // 64-byte aligned base so that "unaligned" is deterministic
        for (std::size_t i = 0; i < buf_.size(); ++i) buf_[i] = static_cast<std::uint8_t>(0xA5 ^ (i * 29));
        before_ = buf_;
    }

    int width() const { return width_; }
    int height() const { return height_; }
    int step() const { return step_; }
    std::uint8_t* data() { return buf_.data() + front_; }
    const std::uint8_t* data() const { return buf_.data() + front_; }
    template <class T> T* ptr() { return reinterpret_cast<T*>(data()); }
    template <class T> T* row(int y) { return reinterpret_cast<T*>(data() + static_cast<std::ptrdiff_t>(step_) * y); }
    template <class T> const T* row(int y) const
    {
        return reinterpret_cast<const T*>(data() + static_cast<std::ptrdiff_t>(step_) * y);
    }

    // Random pixel values, then a fresh snapshot.
    template <class E>
    void Randomize(Rng& rng)
    {
        for (int y = 0; y < height_; ++y) FillRandom(row<E>(y), width_ * pixelBytes_ / sizeof(E), rng);
        before_ = buf_;
    }
    // Pixels copied from a packed array of width * pixelBytes per row.
    void Load(const void* packed)
    {
        for (int y = 0; y < height_; ++y)
            std::memcpy(row<std::uint8_t>(y), static_cast<const std::uint8_t*>(packed) + y * width_ * pixelBytes_,
                        width_ * pixelBytes_);
        before_ = buf_;
    }
    // The region as a packed array.
    template <class E>
    std::vector<E> Packed() const
    {
        std::size_t perRow = width_ * pixelBytes_ / sizeof(E);
        std::vector<E> out(perRow * height_);
        for (int y = 0; y < height_; ++y) std::memcpy(&out[y * perRow], row<E>(y), perRow * sizeof(E));
        return out;
    }

    void Snapshot() { before_ = buf_; }
    bool InRoi(std::size_t i) const
    {
        if (i < front_) return false;
        std::size_t off = i - front_;
        std::size_t y = off / step_;
        return y < static_cast<std::size_t>(height_) && off % step_ < static_cast<std::size_t>(width_ * pixelBytes_);
    }
    // Index of the first byte outside the region that changed, or -1.
    long FirstGuardChange() const
    {
        for (std::size_t i = 0; i < buf_.size(); ++i)
            if (buf_[i] != before_[i] && !InRoi(i)) return static_cast<long>(i);
        return -1;
    }
    bool GuardsIntact() const { return FirstGuardChange() < 0; }
    bool Unchanged() const { return buf_ == before_; }

private:
    int width_ = 0, height_ = 0, pixelBytes_ = 0, step_ = 0;
    std::size_t front_ = 0;
    std::vector<std::uint8_t> buf_, before_;
};

// A guarded image of pixel type T and `channels` elements per pixel.
template <class T>
GuardedImage MakeImage(int width, int height, int channels, Rng& rng, ShapeOptions o = {})
{
    GuardedImage img(width, height, static_cast<int>(sizeof(T)) * channels, static_cast<int>(sizeof(ElemT<T>)), rng, o);
    img.Randomize<ElemT<T>>(rng);
    return img;
}

// A one-channel 8u mask image: mode 0 random with about a third zero bytes,
// 1 all zero, 2 all non-zero (random values 1..255); then a fresh snapshot.
inline void FillMask(GuardedImage& mask, int mode, Rng& rng)
{
    for (int y = 0; y < mask.height(); ++y) {
        Pvx8u* m = mask.row<Pvx8u>(y);
        for (int x = 0; x < mask.width(); ++x) {
            if (mode == 1) m[x] = 0;
            else if (mode == 2 || RandInt(rng, 0, 2) != 0) m[x] = static_cast<Pvx8u>(RandInt(rng, 1, 255));
            else m[x] = 0;
        }
    }
    mask.Snapshot();
}

// ---- shapes ------------------------------------------------------------------

struct Shape {
    int width, height;
};

// Widths 1..3, around the vector widths, odd widths and random ones up to
// maxWidth; heights including 1.
inline std::vector<Shape> Shapes(Rng& rng, int count, int maxWidth = 300)
{
    std::vector<Shape> out;
    const int fixed[] = {1, 2, 3, 4, 5, 7, 8, 9, 15, 16, 17, 31, 32, 33, 63, 64, 65, 67};
    for (int w : fixed) out.push_back({w, RandInt(rng, 1, 4)});
    while (static_cast<int>(out.size()) < count)
        out.push_back({RandInt(rng, 1, maxWidth), RandInt(rng, 1, 6)});
    return out;
}

// Every width from 1 to 67 (heights 1..3), then `extra` random widths up to
// maxWidth (heights 1..5): the sweep for families whose kernels change with
// the width modulo a vector.
inline std::vector<Shape> WidthSweep(Rng& rng, int extra = 16, int maxWidth = 300)
{
    std::vector<Shape> out;
    for (int w = 1; w <= 67; ++w) out.push_back({w, RandInt(rng, 1, 3)});
    for (int i = 0; i < extra; ++i) out.push_back({RandInt(rng, 68, maxWidth), RandInt(rng, 1, 5)});
    return out;
}

// ---- comparisons -------------------------------------------------------------

// Exact comparison of a region with an expected packed array; reports the first
// difference with its position.
template <class E>
::testing::AssertionResult RegionEquals(const GuardedImage& img, const std::vector<E>& want)
{
    auto got = img.Packed<E>();
    if (got.size() != want.size()) return ::testing::AssertionFailure() << "size " << got.size() << " vs " << want.size();
    for (std::size_t i = 0; i < got.size(); ++i) {
        bool same;
        if constexpr (std::is_floating_point_v<E>) same = std::memcmp(&got[i], &want[i], sizeof(E)) == 0;
        else same = got[i] == want[i];
        if (!same) {
            std::size_t perRow = got.size() / img.height();
            return ::testing::AssertionFailure()
                   << "element " << i % perRow << " of row " << i / perRow << ": got " << +got[i] << ", want "
                   << +want[i];
        }
    }
    if (long g = img.FirstGuardChange(); g >= 0) return ::testing::AssertionFailure() << "guard byte " << g << " changed";
    return ::testing::AssertionSuccess();
}

// Float comparison with a stated tolerance: |got - want| <= abs + rel * |want|;
// NaN matches NaN and infinities must match exactly.
template <class E>
::testing::AssertionResult RegionNear(const GuardedImage& img, const std::vector<E>& want, double rel, double abs = 0)
{
    auto got = img.Packed<E>();
    for (std::size_t i = 0; i < got.size(); ++i) {
        double g = got[i], w = want[i];
        bool ok = (std::isnan(g) && std::isnan(w)) || g == w ||
                  (std::isfinite(g) && std::isfinite(w) && std::fabs(g - w) <= abs + rel * std::fabs(w));
        if (!ok) {
            std::size_t perRow = got.size() / img.height();
            return ::testing::AssertionFailure()
                   << "element " << i % perRow << " of row " << i / perRow << ": got " << g << ", want " << w;
        }
    }
    if (long g = img.FirstGuardChange(); g >= 0) return ::testing::AssertionFailure() << "guard byte " << g << " changed";
    return ::testing::AssertionSuccess();
}

// An error status, and no byte of any of the images changed.
template <class... Img>
::testing::AssertionResult NothingWritten(PvxStatus st, PvxStatus want, const Img&... imgs)
{
    if (st != want) return ::testing::AssertionFailure() << "status " << st << ", want " << want;
    bool same = (imgs.Unchanged() && ...);
    if (!same) return ::testing::AssertionFailure() << "status " << st << " but an image was written";
    return ::testing::AssertionSuccess();
}

// ---- family driver -----------------------------------------------------------

// Runs `run(shape, rng)` over the shapes of one family member, with the seed
// and the shape in the failure message so that a case can be replayed.
template <class F>
void ForShapes(const char* member, std::uint64_t seed, int count, F&& run, int maxWidth = 300)
{
    Rng rng = MakeRng(seed);
    for (const Shape& s : Shapes(rng, count, maxWidth)) {
        SCOPED_TRACE(::testing::Message() << member << " seed " << seed << " PVX_TEST_SEED " << SeedOffset() << " width " << s.width << " height "
                                          << s.height);
        run(s, rng);
        if (::testing::Test::HasFatalFailure()) return;
    }
}

}  // namespace pvxtest
