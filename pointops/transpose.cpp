// Transpose: destination pixel (x, y) is source pixel (y, x); roiSize is the
// source size and the destination is height x width.
//
// Only pointers and sizes are checked; steps of 0 or below are used as given
// (the diagonal mirrors read both images bottom-up through negative steps).
// The in-place forms need a square region; they exchange tiles of at most
// 32 x 32 pixels with their mirror tiles across the diagonal.
//
// Kernels work on bytes, templated by pixel size, so every type and channel
// count of one pixel size shares them. Whole blocks are transposed in vector
// registers (16 x 16 and 8 x 8 bytes, 8 x 8 and 4 x 4 16-bit, 4 x 4 32-bit,
// 2 x 2 64-bit, and 4 x 4 and 2 x 2 of the three-channel pixels; 12-byte
// pixels move one at a time with single 16-byte stores), walked in
// cache-sized tiles. Regions are written through a tile buffer with
// non-temporal stores as arithmetic streams, once what the call reads and
// writes reaches half the largest cache (1080p 32f C3 and 4K 8u C3 frames:
// 1.4 times faster than ordinary stores, which had taken over just below the
// cache size).
#include <algorithm>
#include <cstring>

#include "check.h"
#include "entry.h"
#include "layout.h"
#include "simd.h"
#include "store.h"

namespace pvx {
namespace {

using namespace simd;
using Bytes = std::uint8_t;

// 16 x 16 bytes in four interleaving stages: pairs of rows, quads, octets,
// then whole columns.
inline void Block8u16(const Bytes* s, std::ptrdiff_t ss, Bytes* d, std::ptrdiff_t ds)
{
    VI r[16], a[16], b[16], c[16];
    for (int i = 0; i < 16; ++i) r[i] = LoadU(s + ss * i);
    for (int i = 0; i < 8; ++i) {
        a[i] = InterleaveLo8(r[2 * i], r[2 * i + 1]);      // row pair i, columns 0..7
        a[8 + i] = InterleaveHi8(r[2 * i], r[2 * i + 1]);  // row pair i, columns 8..15
    }
    for (int h = 0; h < 2; ++h)
        for (int m = 0; m < 4; ++m) {
            b[h * 8 + m] = InterleaveLo16(a[h * 8 + 2 * m], a[h * 8 + 2 * m + 1]);      // quad m, 4 columns
            b[h * 8 + 4 + m] = InterleaveHi16(a[h * 8 + 2 * m], a[h * 8 + 2 * m + 1]);  // quad m, next 4
        }
    for (int g = 0; g < 4; ++g)
        for (int n = 0; n < 2; ++n) {
            c[g * 4 + n] = InterleaveLo32(b[g * 4 + 2 * n], b[g * 4 + 2 * n + 1]);      // octet n, columns 4g, 4g+1
            c[g * 4 + 2 + n] = InterleaveHi32(b[g * 4 + 2 * n], b[g * 4 + 2 * n + 1]);  // columns 4g+2, 4g+3
        }
    for (int g = 0; g < 4; ++g)
        for (int h = 0; h < 2; ++h) {
            int col = 4 * g + 2 * h;
            StoreU(d + ds * col, InterleaveLo64(c[g * 4 + h * 2], c[g * 4 + h * 2 + 1]));
            StoreU(d + ds * (col + 1), InterleaveHi64(c[g * 4 + h * 2], c[g * 4 + h * 2 + 1]));
        }
}

// 8 x 8 bytes from 64-bit rows.
inline void Block8u8(const Bytes* s, std::ptrdiff_t ss, Bytes* d, std::ptrdiff_t ds)
{
    VI r[8], a[4];
    for (int i = 0; i < 8; ++i) r[i] = LoadLo64(s + ss * i);
    for (int i = 0; i < 4; ++i) a[i] = InterleaveLo8(r[2 * i], r[2 * i + 1]);
    VI b0 = InterleaveLo16(a[0], a[1]), b1 = InterleaveHi16(a[0], a[1]);
    VI b2 = InterleaveLo16(a[2], a[3]), b3 = InterleaveHi16(a[2], a[3]);
    VI c[4] = {InterleaveLo32(b0, b2), InterleaveHi32(b0, b2), InterleaveLo32(b1, b3), InterleaveHi32(b1, b3)};
    for (int i = 0; i < 4; ++i) {
        StoreLo64(d + ds * (2 * i), c[i]);
        StoreHi64(d + ds * (2 * i + 1), c[i]);
    }
}

// 8 x 8 16-bit elements in three interleaving stages.
inline void Block16u8(const Bytes* s, std::ptrdiff_t ss, Bytes* d, std::ptrdiff_t ds)
{
    VI r[8], a[8], b[8];
    for (int i = 0; i < 8; ++i) r[i] = LoadU(s + ss * i);
    for (int i = 0; i < 4; ++i) {
        a[i] = InterleaveLo16(r[2 * i], r[2 * i + 1]);
        a[4 + i] = InterleaveHi16(r[2 * i], r[2 * i + 1]);
    }
    for (int h = 0; h < 2; ++h)
        for (int m = 0; m < 2; ++m) {
            b[h * 4 + m] = InterleaveLo32(a[h * 4 + 2 * m], a[h * 4 + 2 * m + 1]);
            b[h * 4 + 2 + m] = InterleaveHi32(a[h * 4 + 2 * m], a[h * 4 + 2 * m + 1]);
        }
    for (int g = 0; g < 4; ++g) {
        StoreU(d + ds * (2 * g), InterleaveLo64(b[g * 2], b[g * 2 + 1]));
        StoreU(d + ds * (2 * g + 1), InterleaveHi64(b[g * 2], b[g * 2 + 1]));
    }
}

// 4 x 4 16-bit elements from 64-bit rows.
inline void Block16u4(const Bytes* s, std::ptrdiff_t ss, Bytes* d, std::ptrdiff_t ds)
{
    VI a0 = InterleaveLo16(LoadLo64(s), LoadLo64(s + ss));
    VI a1 = InterleaveLo16(LoadLo64(s + 2 * ss), LoadLo64(s + 3 * ss));
    VI c0 = InterleaveLo32(a0, a1), c1 = InterleaveHi32(a0, a1);
    StoreLo64(d, c0);
    StoreHi64(d + ds, c0);
    StoreLo64(d + 2 * ds, c1);
    StoreHi64(d + 3 * ds, c1);
}

// 4 x 4 32-bit elements.
inline void Block32u4(const Bytes* s, std::ptrdiff_t ss, Bytes* d, std::ptrdiff_t ds)
{
    VI r0 = LoadU(s), r1 = LoadU(s + ss), r2 = LoadU(s + 2 * ss), r3 = LoadU(s + 3 * ss);
    VI a0 = InterleaveLo32(r0, r1), a1 = InterleaveHi32(r0, r1);
    VI a2 = InterleaveLo32(r2, r3), a3 = InterleaveHi32(r2, r3);
    StoreU(d, InterleaveLo64(a0, a2));
    StoreU(d + ds, InterleaveHi64(a0, a2));
    StoreU(d + 2 * ds, InterleaveLo64(a1, a3));
    StoreU(d + 3 * ds, InterleaveHi64(a1, a3));
}

// The three-channel pixel sizes share blocks whose rows are 12 bytes: 4 x 4
// pixels of 3 bytes, 2 x 2 of 6 bytes. Each row is loaded exactly (nothing
// past its last byte is read or written, so a region may end where the
// caller's memory ends, and an in-place exchange never touches the tile
// beside it), its pixels spread to 4- or 8-byte lanes, the lanes transposed,
// and each column packed back to 12 bytes.
inline VI Load12(const Bytes* p)
{
    std::int32_t tail;
    std::memcpy(&tail, p + 8, 4);
    return _mm_insert_epi32(LoadLo64(p), tail, 2);
}
inline void Store12(Bytes* p, VI v)
{
    StoreLo64(p, v);
    std::int32_t tail = _mm_extract_epi32(v, 2);
    std::memcpy(p + 8, &tail, 4);
}

inline void Block24u4(const Bytes* s, std::ptrdiff_t ss, Bytes* d, std::ptrdiff_t ds)
{
    const VI spread = _mm_setr_epi8(0, 1, 2, -1, 3, 4, 5, -1, 6, 7, 8, -1, 9, 10, 11, -1);
    const VI pack = _mm_setr_epi8(0, 1, 2, 4, 5, 6, 8, 9, 10, 12, 13, 14, -1, -1, -1, -1);
    VI r0 = ShuffleBytes(Load12(s), spread), r1 = ShuffleBytes(Load12(s + ss), spread);
    VI r2 = ShuffleBytes(Load12(s + 2 * ss), spread), r3 = ShuffleBytes(Load12(s + 3 * ss), spread);
    Transpose4x32(r0, r1, r2, r3);
    Store12(d, ShuffleBytes(r0, pack));
    Store12(d + ds, ShuffleBytes(r1, pack));
    Store12(d + 2 * ds, ShuffleBytes(r2, pack));
    Store12(d + 3 * ds, ShuffleBytes(r3, pack));
}

inline void Block48u2(const Bytes* s, std::ptrdiff_t ss, Bytes* d, std::ptrdiff_t ds)
{
    const VI spread = _mm_setr_epi8(0, 1, 2, 3, 4, 5, -1, -1, 6, 7, 8, 9, 10, 11, -1, -1);
    const VI pack = _mm_setr_epi8(0, 1, 2, 3, 4, 5, 8, 9, 10, 11, 12, 13, -1, -1, -1, -1);
    VI r0 = ShuffleBytes(Load12(s), spread), r1 = ShuffleBytes(Load12(s + ss), spread);
    Store12(d, ShuffleBytes(InterleaveLo64(r0, r1), pack));
    Store12(d + ds, ShuffleBytes(InterleaveHi64(r0, r1), pack));
}

// 12-byte pixels, one column of the region at a time: one 16-byte store a
// pixel. The 4 bytes past a stored pixel belong to the next pixel of its
// destination row, which the walk down the column writes next; the last row
// stores exactly 12 bytes. kWide: 16-byte loads as well, whose last 4 bytes
// belong to the next pixel of the source row (the last column loads exactly
// 12). So nothing outside the region is read or written, and an in-place
// exchange keeps off the tile beside it. Against moves of 8 and 4 bytes a
// pixel this measured 1.1 to 1.5 times faster on regions from 64 x 64 to
// 1080p. The streamed 4K frames, whose source comes from memory, ran 1.1
// times slower with the wide loads (three loads in sixteen then span two
// lines instead of one), so the streamed path loads exactly 12 bytes.
template <bool kWide>
inline void Region96(const Bytes* s, std::ptrdiff_t ss, Bytes* d, std::ptrdiff_t ds, int w, int h)
{
    for (int x = 0; x < w; ++x, s += 12, d += ds) {
        int y = 0;
        if (x + 1 < w)
            for (; y + 1 < h; ++y) StoreU(d + y * 12, kWide ? LoadU(s + ss * y) : Load12(s + ss * y));
        for (; y < h; ++y) Store12(d + y * 12, Load12(s + ss * y));
    }
}

// 2 x 2 64-bit pixels.
inline void Block64u2(const Bytes* s, std::ptrdiff_t ss, Bytes* d, std::ptrdiff_t ds)
{
    VI r0 = LoadU(s), r1 = LoadU(s + ss);
    StoreU(d, InterleaveLo64(r0, r1));
    StoreU(d + ds, InterleaveHi64(r0, r1));
}

// The vector block of side K for pixels of PS bytes, and the next smaller
// side for the strips that the larger block leaves (1: pixel by pixel).
template <int PS, int K>
inline void Block(const Bytes* s, std::ptrdiff_t ss, Bytes* d, std::ptrdiff_t ds)
{
    if constexpr (PS == 1 && K == 16) Block8u16(s, ss, d, ds);
    else if constexpr (PS == 1 && K == 8) Block8u8(s, ss, d, ds);
    else if constexpr (PS == 2 && K == 8) Block16u8(s, ss, d, ds);
    else if constexpr (PS == 2 && K == 4) Block16u4(s, ss, d, ds);
    else if constexpr (PS == 4 && K == 4) Block32u4(s, ss, d, ds);
    else if constexpr (PS == 3 && K == 4) Block24u4(s, ss, d, ds);
    else if constexpr (PS == 6 && K == 2) Block48u2(s, ss, d, ds);
    else if constexpr (PS == 8 && K == 2) Block64u2(s, ss, d, ds);
    else if constexpr (PS == 16 && K == 1) StoreU(d, LoadU(s));
    else {
        static_assert(K == 1);
        std::memcpy(d, s, PS);
    }
}

template <int PS>
inline constexpr int kBlock = PS == 1 ? 16 : PS == 2 ? 8 : PS == 3 || PS == 4 ? 4 : PS == 6 || PS == 8 ? 2 : 1;
template <int PS, int K> inline constexpr int kSmaller = (PS == 1 && K == 16) ? 8 : (PS == 2 && K == 8) ? 4 : 1;

// Transposes a w x h source region into the h x w destination: whole K x K
// blocks, then the right and bottom strips with the next smaller block.
// kFromMemory: the streamed path, whose source is not in the cache.
template <int PS, int K = kBlock<PS>, bool kFromMemory = false>
void TransposeRegion(const Bytes* src, std::ptrdiff_t ss, Bytes* dst, std::ptrdiff_t ds, int w, int h)
{
    constexpr std::ptrdiff_t ps = PS;
    if constexpr (PS == 12) {
        Region96<!kFromMemory>(src, ss, dst, ds, w, h);
    } else {
        int wk = w / K * K, hk = h / K * K;
        for (int x = 0; x < wk; x += K)
            for (int y = 0; y < hk; y += K) Block<PS, K>(src + ss * y + x * ps, ss, dst + ds * x + y * ps, ds);
        if constexpr (K > 1) {
            constexpr int K2 = kSmaller<PS, K>;
            if (wk < w) TransposeRegion<PS, K2>(src + wk * ps, ss, dst + ds * wk, ds, w - wk, h);
            if (hk < h && wk > 0) TransposeRegion<PS, K2>(src + ss * hk, ss, dst + hk * ps, ds, wk, h - hk);
        }
    }
}

// Tile side in pixels: rows of 256 bytes (1 kB for the three-channel sizes
// of 3 and 6 bytes), a multiple of the block side. Each tile row is then at
// least four lines that the prefetchers can run ahead on. With 256-byte rows
// a tile of source and destination (128 kB at most) stays in the second
// level cache; 8u tiles of 64 x 64, which fit the first level, measured 2 to
// 3 times slower on 4K frames. The 1 kB tiles of the 3- and 6-byte pixels
// (up to 700 kB together) do not fit, yet measured 1.1 to 1.4 times faster
// than 256-byte ones on 720p, 1080p, 1500 x 1400 and 4K frames; for the other
// sizes 1 kB rows were up to 1.8 times slower on some shapes (32f C4 at
// 1280 x 720, 8u C1 at 1024 x 1024). The 12-byte pixels, moved one at a
// time, take tiles of 12 x 12: against the 21 x 21 of 256-byte rows they
// measured as fast on 640 x 480, 1080p and 2000 x 1000 frames and 1.1 to
// 1.5 times faster on eight other shapes from 512 x 512 to 2048 x 1024
// (512 x 512, 1024 x 768 and 1024 x 1024 gained most); sides of 8, 10, 14,
// 16, 24 and 85 each lost somewhere.
template <int PS>
inline constexpr int kTile =
    PS == 12 ? 12 : std::max(kBlock<PS>, (PS == 3 || PS == 6 ? 1024 : 256) / PS / kBlock<PS> * kBlock<PS>);

// Tiles along bands of source rows: reading the source in order measured
// about 1.5 times faster on 4K frames than bands of source columns.
template <int PS>
void TransposeTiled(const Bytes* src, std::ptrdiff_t ss, Bytes* dst, std::ptrdiff_t ds, int w, int h)
{
    constexpr std::ptrdiff_t ps = PS;
    constexpr int T = kTile<PS>;
    for (int ty = 0; ty < h; ty += T)
        for (int tx = 0; tx < w; tx += T)
            TransposeRegion<PS>(src + ss * ty + tx * ps, ss, dst + ds * tx + ty * ps, ds, std::min(T, w - tx),
                                std::min(T, h - ty));
}

// Copies n bytes with non-temporal stores where the destination is aligned.
inline void StreamBytes(Bytes* d, const Bytes* s, std::ptrdiff_t n)
{
    std::ptrdiff_t i = 0;
    for (; i < n && !IsAligned(d + i); ++i) d[i] = s[i];
    for (; i + 16 <= n; i += 16) StoreNt(d + i, LoadU(s + i));
    for (; i < n; ++i) d[i] = s[i];
}

// Large regions: each tile is transposed into a buffer in the cache, then
// streamed to the destination rows.
template <int PS>
void TransposeStreaming(const Bytes* src, std::ptrdiff_t ss, Bytes* dst, std::ptrdiff_t ds, int w, int h)
{
    constexpr std::ptrdiff_t ps = PS;
    constexpr int T = PS <= 4 ? 64 : 32;
    alignas(64) Bytes buf[T * T * PS];
    for (int tx = 0; tx < w; tx += T) {
        int tw = std::min(T, w - tx);
        for (int ty = 0; ty < h; ty += T) {
            int th = std::min(T, h - ty);
            std::ptrdiff_t bs = th * ps;
            TransposeRegion<PS, kBlock<PS>, true>(src + ss * ty + tx * ps, ss, buf, bs, tw, th);
            for (int r = 0; r < tw; ++r) StreamBytes(dst + ds * (tx + r) + ty * ps, buf + bs * r, bs);
        }
    }
    StoreFence();
}

// Square region in place: each diagonal tile through a buffer; every other
// tile pair (i, j), (j, i) by transposing (i, j) into the buffer, (j, i)
// straight into the place of (i, j), then the buffer into the place of (j, i).
template <int PS>
void TransposeInPlace(Bytes* p, std::ptrdiff_t step, int n)
{
    constexpr std::ptrdiff_t ps = PS;
    constexpr int T = 32;
    alignas(64) Bytes buf[T * T * PS];
    for (int ty = 0; ty < n; ty += T) {
        int th = std::min(T, n - ty);
        std::ptrdiff_t bs = th * ps;
        Bytes* diag = p + step * ty + ty * ps;
        TransposeRegion<PS>(diag, step, buf, bs, th, th);
        for (int r = 0; r < th; ++r) std::memcpy(diag + step * r, buf + bs * r, bs);
        for (int tx = ty + T; tx < n; tx += T) {
            int tw = std::min(T, n - tx);
            Bytes* a = p + step * ty + tx * ps;  // th rows, tw columns
            Bytes* b = p + step * tx + ty * ps;  // tw rows, th columns
            TransposeRegion<PS>(a, step, buf, bs, tw, th);
            TransposeRegion<PS>(b, step, a, step, th, tw);
            for (int r = 0; r < tw; ++r) std::memcpy(b + step * r, buf + bs * r, bs);
        }
    }
}

template <class T, Lay L>
PvxStatus TransposeBody(const T* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi)
{
    if (PvxStatus s = CheckFrame<Order::kPtrSize>({pSrc, pDst}, roi, {})) return s;
    constexpr int PS = sizeof(T) * kChannels<L>;
    const Bytes* s = reinterpret_cast<const Bytes*>(pSrc);
    Bytes* d = reinterpret_cast<Bytes*>(pDst);
    if (StreamWorkingSet(2 * std::int64_t{roi.width} * roi.height * PS))
        TransposeStreaming<PS>(s, srcStep, d, dstStep, roi.width, roi.height);
    else
        TransposeTiled<PS>(s, srcStep, d, dstStep, roi.width, roi.height);
    return pvxStsNoErr;
}

template <class T, Lay L>
PvxStatus TransposeInPlaceBody(T* pSrcDst, int srcDstStep, PvxiSize roi)
{
    if (PvxStatus s = CheckPtrs({pSrcDst})) return s;
    if (roi.width < 1 || roi.height < 1 || roi.width != roi.height) return pvxStsSizeErr;
    TransposeInPlace<sizeof(T) * kChannels<L>>(reinterpret_cast<Bytes*>(pSrcDst), srcDstStep, roi.width);
    return pvxStsNoErr;
}

}  // namespace
}  // namespace pvx

#include "transpose.exports.inc"
