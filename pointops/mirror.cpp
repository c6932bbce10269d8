// Mirror: flips a region about its horizontal axis (flip 0: row i becomes row
// height-1-i), its vertical axis (flip 1: column j becomes column width-1-j)
// or both (flip 2), and, on the one-channel not-in-place members only, about
// the main diagonal (flip 3: destination (x, y) = source (y, x)) or the other
// diagonal (flip 4: destination (x, y) = source (W-1-y, H-1-x) of a W x H
// source); the diagonal results are H x W.
//
// Check order of the not-in-place members:
//  1. pSrc == pDst with srcStep == dstStep is the in-place form, before
//     anything else is looked at.
//  2. One-channel flips 3 and 4: pointers -8; steps below 1 or not a multiple
//     of the element size -14; sizes -6; then the two regions must be usable
//     together, else -9999: each step must hold its row (srcStep >= W
//     elements, dstStep >= H elements) and the source and destination memory
//     spans must not overlap, since a diagonal flip cannot run in place.
//  3. Otherwise pointers -8, sizes -6, flip outside 0..2 -21, and a flip that
//     would change nothing (flip 0 or 2 with height 1, flip 1 or 2 with width
//     1) -6, as callers rely on. Steps are not checked.
// The in-place members check the pointer, the sizes and the flip the same way.
// AC4 members never write the alpha channel.
//
// Rows are reversed in blocks of three or four vectors by byte shuffles;
// kernels work on bytes, templated by element size and channel count, so
// 16s/16u and 32s/32f share them. Non-temporal stores: members that write
// every channel stream as arithmetic does, once what they read and write
// reaches half the largest cache (on 4K 8u frames, 1.2 to 2.3 times faster
// than ordinary stores across C1, C3 and C4 and flips 0 and 1). Below that,
// flip 0 is a copy of each row by the C runtime, which has the widest stores
// of the processor (1080p C4: 1.13 times faster than our vector copies).
// AC4 members, which read the destination's lines for its alpha anyway,
// never stream: streamed, 4096 x 2160 frames ran 1.08 to 1.18 times slower.
#include <array>
#include <cstring>

#include "check.h"
#include "entry.h"
#include "layout.h"
#include "shuffle.h"
#include "simd.h"
#include "store.h"

namespace pvx {

// The diagonal flips are transposes; they forward to the Transpose bodies.
namespace body {
PvxStatus pvxiTranspose_8u_C1R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PvxStatus pvxiTranspose_16u_C1R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PvxStatus pvxiTranspose_16s_C1R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PvxStatus pvxiTranspose_32s_C1R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PvxStatus pvxiTranspose_32f_C1R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
}  // namespace body

namespace {

using namespace simd;
using Bytes = std::uint8_t;

inline PvxStatus TransposeC1(const Pvx8u* s, int ss, Pvx8u* d, int ds, PvxiSize r)
{
    return body::pvxiTranspose_8u_C1R(s, ss, d, ds, r);
}
inline PvxStatus TransposeC1(const Pvx16u* s, int ss, Pvx16u* d, int ds, PvxiSize r)
{
    return body::pvxiTranspose_16u_C1R(s, ss, d, ds, r);
}
inline PvxStatus TransposeC1(const Pvx16s* s, int ss, Pvx16s* d, int ds, PvxiSize r)
{
    return body::pvxiTranspose_16s_C1R(s, ss, d, ds, r);
}
inline PvxStatus TransposeC1(const Pvx32s* s, int ss, Pvx32s* d, int ds, PvxiSize r)
{
    return body::pvxiTranspose_32s_C1R(s, ss, d, ds, r);
}
inline PvxStatus TransposeC1(const Pvx32f* s, int ss, Pvx32f* d, int ds, PvxiSize r)
{
    return body::pvxiTranspose_32f_C1R(s, ss, d, ds, r);
}

// Pixel of C channels of E bytes (AC4 members blend the fourth back).
// A reversal block is four vectors, or three when a pixel does not divide 16.
template <int E, int C, bool kAlpha>
struct Pixel {
    static constexpr int kSize = C * E;
    static constexpr int kVectors = 16 % kSize == 0 ? 4 : 3;
    static constexpr int kBlock = 16 * kVectors / kSize;  // pixels
    using Geo = ReverseGeometry<kSize, kVectors>;
    using Plan = ShufflePlan<kVectors, kVectors>;

    // The source byte of each destination byte of a block, and the bytes of
    // the fourth channel (blended back from the destination), as tables fixed
    // at compile time.
    static constexpr auto kSources = [] {
        std::array<Bytes, 16 * kVectors> t{};
        for (int b = 0; b < 16 * kVectors; ++b) t[b] = static_cast<Bytes>((kBlock - 1 - b / kSize) * kSize + b % kSize);
        return t;
    }();
    static constexpr auto kAlphaBytes = [] {
        std::array<Bytes, 16> t{};
        for (int b = 0; b < 16; ++b) t[b] = (b / E) % 4 == 3 ? 0xFF : 0;
        return t;
    }();
    static Plan MakePlan()
    {
        VI src[kVectors];
        for (int k = 0; k < kVectors; ++k) src[k] = LoadU(kSources.data() + 16 * k);
        Plan plan;
        BuildShufflePlan(plan, src);
        return plan;
    }
    static VI AlphaMask() { return LoadU(kAlphaBytes.data()); }
};

enum StoreKind { kUnaligned, kAligned, kStream };

template <int S>
inline void Put(Bytes* p, VI v)
{
    if constexpr (S == kStream) StoreNt(p, v);
    else if constexpr (S == kAligned) StoreA(p, v);
    else StoreU(p, v);
}

// AC4 flip 0 takes one of its two source rows, and writes one of its two
// destination rows, in falling order, which the hardware prefetchers do not
// follow. On large regions the row pair fetches the next such rows, a line
// each 64 bytes copied (measured when C4 took this path too, 1080p 8u: 1.1
// to 1.2 times faster; fetching only the first lines of each row gained a
// third of that). When the region is in
// the cache the fetches only take load slots (8 MB: 1.07 times slower), and
// the reversed flips, which have more work per byte, gained nothing.
struct RowsAhead {
    const Bytes* src;
    const Bytes* dst;
    void At(std::ptrdiff_t srcOffset, std::ptrdiff_t dstOffset) const
    {
        Prefetch(src + srcOffset);
        Prefetch(dst + dstOffset);
    }
};

// Copies n bytes of one row (flip 0), 64 bytes a step; AC4 blends the
// destination alpha back (n and the start are whole pixels there). Streaming
// stores (never with alpha) start where the destination is aligned.
template <class Px, bool kAlpha, int S>
void CopyRow(const Bytes* s, Bytes* d, std::ptrdiff_t n, VI alpha)
{
    std::ptrdiff_t i = 0;
    if constexpr (!kAlpha) {
        if constexpr (S == kStream)
            for (; i < n && !IsAligned(d + i); ++i) d[i] = s[i];
        for (; i + 64 <= n; i += 64) {
            VI a = LoadU(s + i), b = LoadU(s + i + 16), c = LoadU(s + i + 32), e = LoadU(s + i + 48);
            Put<S>(d + i, a);
            Put<S>(d + i + 16, b);
            Put<S>(d + i + 32, c);
            Put<S>(d + i + 48, e);
        }
        for (; i + 16 <= n; i += 16) Put<S>(d + i, LoadU(s + i));
        if (i < n) StoreShort(d + i, n - i, LoadShort(s + i, n - i));
    } else {
        for (; i + 16 <= n; i += 16) Put<S>(d + i, SelectBytes(LoadU(s + i), LoadU(d + i), alpha));
        if (i < n) StoreShort(d + i, n - i, SelectBytes(LoadShort(s + i, n - i), LoadShort(d + i, n - i), alpha));
    }
}

// Two rows at once, 32 bytes of each a step. Two read and two write streams
// that run interleaved measured 1.2 to 1.6 times faster than one row after
// the other on frames of 8 MB and more (rows taken from the bottom up alone
// are the slow case).
template <class Px, bool kAlpha, int S, bool kAhead>
void CopyRowPair(const Bytes* s0, Bytes* d0, const Bytes* s1, Bytes* d1, std::ptrdiff_t n, VI alpha, RowsAhead ahead)
{
    std::ptrdiff_t i = 0;
    for (; i + 32 <= n; i += 32) {
        if constexpr (kAhead)
            if ((i & 63) == 0) ahead.At(i, i);
        VI a0 = LoadU(s0 + i), a1 = LoadU(s0 + i + 16), b0 = LoadU(s1 + i), b1 = LoadU(s1 + i + 16);
        if constexpr (kAlpha) {
            a0 = SelectBytes(a0, LoadU(d0 + i), alpha);
            a1 = SelectBytes(a1, LoadU(d0 + i + 16), alpha);
            b0 = SelectBytes(b0, LoadU(d1 + i), alpha);
            b1 = SelectBytes(b1, LoadU(d1 + i + 16), alpha);
        }
        Put<S>(d0 + i, a0);
        Put<S>(d0 + i + 16, a1);
        Put<S>(d1 + i, b0);
        Put<S>(d1 + i + 16, b1);
    }
    if (i < n) {
        CopyRow<Px, kAlpha, S>(s0 + i, d0 + i, n - i, alpha);
        CopyRow<Px, kAlpha, S>(s1 + i, d1 + i, n - i, alpha);
    }
}

// n pixels of a block or fewer, reversed from s to d in registers: read into
// the top of a block, so that the reversed block has them at its start, and
// written up to the end of the n pixels. The pixels of rows' ends had gone
// one at a time.
template <class Px, bool kAlpha>
[[gnu::always_inline]] inline void ReverseShort(const Bytes* s, Bytes* d, std::ptrdiff_t n,
                                                const typename Px::Plan& plan, VI alpha)
{
    constexpr int NV = Px::kVectors;
    VI in[NV], out[NV];
    LoadRowHigh<NV>(s, n * Px::kSize, in);
    ShuffleBlock<typename Px::Geo>(in, out, plan);
    if constexpr (kAlpha) {
        VI old[NV];
        LoadRow<NV>(d, n * Px::kSize, old);
        for (int k = 0; k < NV; ++k) out[k] = SelectBytes(out[k], old[k], alpha);
    }
    StoreRow<NV>(d, n * Px::kSize, out);
}

// Writes the pixels of a source row in reverse order (flips 1 and 2): block
// x of the destination is the reversed block that ends width - x pixels into
// the source; the fewer pixels left as one short block.
template <class Px, bool kAlpha, int S>
void ReverseRow(const Bytes* s, Bytes* d, std::ptrdiff_t width, const typename Px::Plan& plan, VI alpha)
{
    constexpr int NV = Px::kVectors, P = Px::kBlock, PS = Px::kSize;
    std::ptrdiff_t x = 0;
    for (; x + P <= width; x += P) {
        const Bytes* sb = s + (width - x - P) * PS;
        Bytes* db = d + x * PS;
        VI in[NV], out[NV];
        for (int j = 0; j < NV; ++j) in[j] = LoadU(sb + 16 * j);
        ShuffleBlock<typename Px::Geo>(in, out, plan);
        for (int k = 0; k < NV; ++k) {
            if constexpr (kAlpha) out[k] = SelectBytes(out[k], LoadU(db + 16 * k), alpha);
            Put<S>(db + 16 * k, out[k]);
        }
    }
    if (x < width) ReverseShort<Px, kAlpha>(s, d + x * PS, width - x, plan, alpha);
}

// Two rows reversed at once, block by block (see CopyRowPair).
template <class Px, bool kAlpha, int S>
void ReverseRowPair(const Bytes* s0, Bytes* d0, const Bytes* s1, Bytes* d1, std::ptrdiff_t width,
                    const typename Px::Plan& plan, VI alpha)
{
    constexpr int NV = Px::kVectors, P = Px::kBlock, PS = Px::kSize;
    std::ptrdiff_t x = 0;
    for (; x + P <= width; x += P) {
        std::ptrdiff_t so = (width - x - P) * PS, dof = x * PS;
        VI in0[NV], in1[NV], out0[NV], out1[NV];
        for (int j = 0; j < NV; ++j) {
            in0[j] = LoadU(s0 + so + 16 * j);
            in1[j] = LoadU(s1 + so + 16 * j);
        }
        ShuffleBlock<typename Px::Geo>(in0, out0, plan);
        ShuffleBlock<typename Px::Geo>(in1, out1, plan);
        for (int k = 0; k < NV; ++k) {
            if constexpr (kAlpha) {
                out0[k] = SelectBytes(out0[k], LoadU(d0 + dof + 16 * k), alpha);
                out1[k] = SelectBytes(out1[k], LoadU(d1 + dof + 16 * k), alpha);
            }
            Put<S>(d0 + dof + 16 * k, out0[k]);
            Put<S>(d1 + dof + 16 * k, out1[k]);
        }
    }
    if (x < width) {
        ReverseShort<Px, kAlpha>(s0, d0 + x * PS, width - x, plan, alpha);
        ReverseShort<Px, kAlpha>(s1, d1 + x * PS, width - x, plan, alpha);
    }
}

// In place, flip 0: exchanges two rows (AC4: their colour channels). kAhead:
// fetches the row below b, the next of the rows taken in falling order, as
// the copying flip does (4K 8u C4: about 1.15 times faster, 1080p about level).
template <class Px, bool kAlpha, bool kAhead>
void ExchangeRows(Bytes* a, Bytes* b, std::ptrdiff_t width, VI alpha, const Bytes* next)
{
    std::ptrdiff_t n = width * Px::kSize, i = 0;
    for (; i + 16 <= n; i += 16) {
        if constexpr (kAhead)
            if ((i & 63) == 0) Prefetch(next + i);
        VI va = LoadU(a + i), vb = LoadU(b + i);
        if constexpr (kAlpha) {
            StoreU(a + i, SelectBytes(vb, va, alpha));
            StoreU(b + i, SelectBytes(va, vb, alpha));
        } else {
            StoreU(a + i, vb);
            StoreU(b + i, va);
        }
    }
    if (i < n) {
        VI va = LoadShort(a + i, n - i), vb = LoadShort(b + i, n - i);
        if constexpr (kAlpha) {
            StoreShort(a + i, n - i, SelectBytes(vb, va, alpha));
            StoreShort(b + i, n - i, SelectBytes(va, vb, alpha));
        } else {
            StoreShort(a + i, n - i, vb);
            StoreShort(b + i, n - i, va);
        }
    }
}

// In place, flip 1: blocks from both ends exchanged reversed while they do
// not meet, then single pixels towards the middle (an odd width's middle
// pixel stays).
template <class Px, bool kAlpha>
void ReverseRowInPlace(Bytes* r, std::ptrdiff_t width, const typename Px::Plan& plan, VI alpha)
{
    constexpr int NV = Px::kVectors, P = Px::kBlock, PS = Px::kSize;
    std::ptrdiff_t x = 0;
    for (; 2 * (x + P) <= width; x += P) {
        Bytes* lb = r + x * PS;
        Bytes* rb = r + (width - x - P) * PS;
        VI l[NV], rr[NV], ol[NV], orr[NV];
        for (int j = 0; j < NV; ++j) {
            l[j] = LoadU(lb + 16 * j);
            rr[j] = LoadU(rb + 16 * j);
        }
        ShuffleBlock<typename Px::Geo>(rr, ol, plan);
        ShuffleBlock<typename Px::Geo>(l, orr, plan);
        for (int k = 0; k < NV; ++k) {
            if constexpr (kAlpha) {
                ol[k] = SelectBytes(ol[k], l[k], alpha);
                orr[k] = SelectBytes(orr[k], rr[k], alpha);
            }
            StoreU(lb + 16 * k, ol[k]);
            StoreU(rb + 16 * k, orr[k]);
        }
    }
    // the middle, fewer than two blocks: read into the top of two blocks,
    // each reversed into the other's place
    const std::ptrdiff_t m = width - 2 * x;
    if (m <= 1) return;
    Bytes* mid = r + x * PS;
    VI in[2 * NV], out[2 * NV];
    LoadRowHigh<2 * NV>(mid, m * PS, in);
    ShuffleBlock<typename Px::Geo>(in + NV, out, plan);
    ShuffleBlock<typename Px::Geo>(in, out + NV, plan);
    if constexpr (kAlpha) {
        VI old[2 * NV];
        LoadRow<2 * NV>(mid, m * PS, old);
        for (int k = 0; k < 2 * NV; ++k) out[k] = SelectBytes(out[k], old[k], alpha);
    }
    StoreRow<2 * NV>(mid, m * PS, out);
}

// In place, flip 2: row a becomes row b reversed and row b becomes row a
// reversed.
template <class Px, bool kAlpha>
void ExchangeReversedRows(Bytes* a, Bytes* b, std::ptrdiff_t width, const typename Px::Plan& plan, VI alpha)
{
    constexpr int NV = Px::kVectors, P = Px::kBlock, PS = Px::kSize;
    std::ptrdiff_t x = 0;
    for (; x + P <= width; x += P) {
        Bytes* ab = a + x * PS;
        Bytes* bb = b + (width - x - P) * PS;
        VI va[NV], vb[NV], oa[NV], ob[NV];
        for (int j = 0; j < NV; ++j) {
            va[j] = LoadU(ab + 16 * j);
            vb[j] = LoadU(bb + 16 * j);
        }
        ShuffleBlock<typename Px::Geo>(vb, oa, plan);
        ShuffleBlock<typename Px::Geo>(va, ob, plan);
        for (int k = 0; k < NV; ++k) {
            if constexpr (kAlpha) {
                oa[k] = SelectBytes(oa[k], va[k], alpha);
                ob[k] = SelectBytes(ob[k], vb[k], alpha);
            }
            StoreU(ab + 16 * k, oa[k]);
            StoreU(bb + 16 * k, ob[k]);
        }
    }
    if (x == width) return;
    // a's last n pixels and b's first n, each the other reversed
    const std::ptrdiff_t n = width - x, bytes = n * PS;
    Bytes* at = a + x * PS;
    VI ha[NV], hb[NV], oa[NV], ob[NV];
    LoadRowHigh<NV>(at, bytes, ha);
    LoadRowHigh<NV>(b, bytes, hb);
    ShuffleBlock<typename Px::Geo>(hb, oa, plan);
    ShuffleBlock<typename Px::Geo>(ha, ob, plan);
    if constexpr (kAlpha) {
        VI va[NV], vb[NV];
        LoadRow<NV>(at, bytes, va);
        LoadRow<NV>(b, bytes, vb);
        for (int k = 0; k < NV; ++k) {
            oa[k] = SelectBytes(oa[k], va[k], alpha);
            ob[k] = SelectBytes(ob[k], vb[k], alpha);
        }
    }
    StoreRow<NV>(at, bytes, oa);
    StoreRow<NV>(b, bytes, ob);
}

// Flip 0 without alpha: row copies, by the C runtime, or streamed a row at a
// time from the outer rows inwards (from the first aligned byte of a row).
template <class Px>
void CopyRows(const Bytes* src, std::ptrdiff_t ss, Bytes* dst, std::ptrdiff_t ds, PvxiSize roi, bool nt)
{
    const int h = roi.height;
    const std::ptrdiff_t n = roi.width * Px::kSize;
    if (!nt) {
        for (int y = 0; y < h; ++y) std::memmove(dst + ds * y, src + ss * (h - 1 - y), static_cast<std::size_t>(n));
        return;
    }
    const VI none = Zero();
    for (int y = 0; y <= h - 1 - y; ++y) {
        const int y2 = h - 1 - y;
        CopyRow<Px, false, kStream>(src + ss * y2, dst + ds * y, n, none);
        if (y != y2) CopyRow<Px, false, kStream>(src + ss * y, dst + ds * y2, n, none);
    }
    StoreFence();
}

// One destination row reversed (flips 1 and 2): streamed (never with alpha)
// when the row starts aligned, aligned or unaligned.
template <class Px, bool kAlpha>
void ReverseOneRow(const Bytes* s, Bytes* d, std::ptrdiff_t width, bool nt, const typename Px::Plan& plan, VI alpha)
{
    const bool aligned = IsAligned(d);
    if constexpr (!kAlpha) {
        if (nt && aligned) {
            ReverseRow<Px, false, kStream>(s, d, width, plan, alpha);
            return;
        }
    }
    if (aligned) ReverseRow<Px, kAlpha, kAligned>(s, d, width, plan, alpha);
    else ReverseRow<Px, kAlpha, kUnaligned>(s, d, width, plan, alpha);
}

// Destination rows y and height-1-y are written together, from the outer
// rows inwards; the middle row of an odd height alone. Flip 0 reaches here
// only for AC4 members, which never stream.
template <class Px, bool kAlpha>
void MirrorRows(const Bytes* src, std::ptrdiff_t ss, Bytes* dst, std::ptrdiff_t ds, PvxiSize roi, int flip, bool nt)
{
    const typename Px::Plan plan = Px::MakePlan();
    const VI alpha = Px::AlphaMask();
    const int h = roi.height;
    const std::ptrdiff_t width = roi.width, n = width * Px::kSize;
    const bool ahead = kAlpha && flip == 0 && FetchAhead(2 * n * h);
    for (int y = 0; y <= h - 1 - y; ++y) {
        int y2 = h - 1 - y;
        const Bytes* s0 = src + ss * (flip == 1 ? y : y2);
        const Bytes* s1 = src + ss * (flip == 1 ? y2 : y);
        Bytes* d0 = dst + ds * y;
        Bytes* d1 = dst + ds * y2;
        bool aligned = IsAligned(d0) && IsAligned(d1);
        if constexpr (kAlpha) {
            if (flip == 0) {
                if (y == y2) {
                    if (IsAligned(d0)) CopyRow<Px, true, kAligned>(s0, d0, n, alpha);
                    else CopyRow<Px, true, kUnaligned>(s0, d0, n, alpha);
                    continue;
                }
                RowsAhead next{src + ss * (y2 - 1), d1 - ds};
                if (aligned && ahead) CopyRowPair<Px, true, kAligned, true>(s0, d0, s1, d1, n, alpha, next);
                else if (aligned) CopyRowPair<Px, true, kAligned, false>(s0, d0, s1, d1, n, alpha, next);
                else if (ahead) CopyRowPair<Px, true, kUnaligned, true>(s0, d0, s1, d1, n, alpha, next);
                else CopyRowPair<Px, true, kUnaligned, false>(s0, d0, s1, d1, n, alpha, next);
                continue;
            }
        }
        if (y == y2) {
            ReverseOneRow<Px, kAlpha>(s0, d0, width, nt, plan, alpha);
            continue;
        }
        if constexpr (!kAlpha) {
            if (aligned && nt) {
                ReverseRowPair<Px, false, kStream>(s0, d0, s1, d1, width, plan, alpha);
                continue;
            }
        }
        if (aligned) ReverseRowPair<Px, kAlpha, kAligned>(s0, d0, s1, d1, width, plan, alpha);
        else ReverseRowPair<Px, kAlpha, kUnaligned>(s0, d0, s1, d1, width, plan, alpha);
    }
    if (nt) StoreFence();
}

template <class Px, bool kAlpha>
void MirrorInPlace(Bytes* p, std::ptrdiff_t step, PvxiSize roi, int flip)
{
    const typename Px::Plan plan = Px::MakePlan();
    const VI alpha = Px::AlphaMask();
    int h = roi.height;
    if (flip == 1) {
        for (int y = 0; y < h; ++y) ReverseRowInPlace<Px, kAlpha>(p + step * y, roi.width, plan, alpha);
        return;
    }
    const bool ahead = flip == 0 && FetchAhead(2 * static_cast<std::int64_t>(roi.width) * Px::kSize * h);
    for (int y = 0; y < h - 1 - y; ++y) {
        Bytes* a = p + step * y;
        Bytes* b = p + step * (h - 1 - y);
        if (flip == 2) ExchangeReversedRows<Px, kAlpha>(a, b, roi.width, plan, alpha);
        else if (ahead) ExchangeRows<Px, kAlpha, true>(a, b, roi.width, alpha, b - step);
        else ExchangeRows<Px, kAlpha, false>(a, b, roi.width, alpha, b);
    }
    if (flip == 2 && h % 2 == 1) ReverseRowInPlace<Px, kAlpha>(p + step * (h / 2), roi.width, plan, alpha);
}

// -21 for an axis outside 0..2, then -6 for a flip that changes nothing.
inline PvxStatus CheckFlip(PvxiSize roi, int flip)
{
    if (flip < 0 || flip > 2) return pvxStsMirrorFlipErr;
    if ((flip != 1 && roi.height == 1) || (flip != 0 && roi.width == 1)) return pvxStsSizeErr;
    return pvxStsNoErr;
}

template <class T, Lay L>
using PixelOf = Pixel<sizeof(T), kChannels<L>, kKeepsAlpha<L>>;

template <class T, Lay L>
PvxStatus MirrorInPlaceBody(T* pSrcDst, int srcDstStep, PvxiSize roi, int flip)
{
    if (PvxStatus s = CheckPtrs({pSrcDst})) return s;
    if (PvxStatus s = CheckRoi(roi)) return s;
    if (PvxStatus s = CheckFlip(roi, flip)) return s;
    MirrorInPlace<PixelOf<T, L>, kKeepsAlpha<L>>(reinterpret_cast<Bytes*>(pSrcDst), srcDstStep, roi, flip);
    return pvxStsNoErr;
}

// The source (W x H) and destination (H x W) of a diagonal flip: each step
// holds its row and the two memory spans are disjoint.
template <class T>
bool DiagonalRegionsValid(const T* pSrc, int srcStep, const T* pDst, int dstStep, PvxiSize roi)
{
    std::int64_t srcRow = std::int64_t{roi.width} * sizeof(T), dstRow = std::int64_t{roi.height} * sizeof(T);
    if (srcStep < srcRow || dstStep < dstRow) return false;
    auto s0 = reinterpret_cast<std::uintptr_t>(pSrc), d0 = reinterpret_cast<std::uintptr_t>(pDst);
    std::uintptr_t s1 = s0 + static_cast<std::uintptr_t>(std::int64_t{srcStep} * (roi.height - 1) + srcRow);
    std::uintptr_t d1 = d0 + static_cast<std::uintptr_t>(std::int64_t{dstStep} * (roi.width - 1) + dstRow);
    return s1 <= d0 || d1 <= s0;
}

// Flip 3 is the transpose; flip 4 is the transpose of both images read
// bottom-up (destination (x, y) = source (W-1-y, H-1-x)).
template <class T>
PvxStatus MirrorDiagonal(const T* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi, int flip)
{
    if (PvxStatus s = CheckPtrs({pSrc, pDst})) return s;
    constexpr int E = sizeof(T);
    if (srcStep < 1 || dstStep < 1 || srcStep % E != 0 || dstStep % E != 0) return pvxStsStepErr;
    if (PvxStatus s = CheckRoi(roi)) return s;
    if (!DiagonalRegionsValid(pSrc, srcStep, pDst, dstStep, roi)) return pvxStsNotSupportedModeErr;
    if (flip == 3) return TransposeC1(pSrc, srcStep, pDst, dstStep, roi);
    return TransposeC1(RowAt(pSrc, srcStep, roi.height - 1), -srcStep, RowAt(pDst, dstStep, roi.width - 1), -dstStep,
                       roi);
}

template <class T, Lay L>
PvxStatus MirrorBody(const T* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi, int flip)
{
    if (pSrc == pDst && srcStep == dstStep) return MirrorInPlaceBody<T, L>(pDst, dstStep, roi, flip);
    if constexpr (L == Lay::C1)
        if (flip == 3 || flip == 4) return MirrorDiagonal(pSrc, srcStep, pDst, dstStep, roi, flip);
    if (PvxStatus s = CheckPtrs({pSrc, pDst})) return s;
    if (PvxStatus s = CheckRoi(roi)) return s;
    if (PvxStatus s = CheckFlip(roi, flip)) return s;
    using Px = PixelOf<T, L>;
    std::int64_t pixels = std::int64_t{roi.width} * roi.height;
    bool nt = false;
    if constexpr (!kKeepsAlpha<L>) {
        nt = StreamWorkingSet(2 * pixels * Px::kSize);
        if (flip == 0) {
            CopyRows<Px>(reinterpret_cast<const Bytes*>(pSrc), srcStep, reinterpret_cast<Bytes*>(pDst), dstStep, roi,
                         nt);
            return pvxStsNoErr;
        }
    }
    MirrorRows<Px, kKeepsAlpha<L>>(reinterpret_cast<const Bytes*>(pSrc), srcStep, reinterpret_cast<Bytes*>(pDst),
                                   dstStep, roi, flip, nt);
    return pvxStsNoErr;
}

}  // namespace
}  // namespace pvx

#include "mirror.exports.inc"
