// Set: fills a region, one channel or a masked part of it with a constant,
// bit-exact for every element type.
#include <cstdlib>
#include <cstring>

#include "check.h"
#include "entry.h"
#include "layout.h"
#include "move.h"
#include "store.h"

namespace pvx {
namespace {

using namespace simd;
using move::Byte;

// One pixel of the value: K elements, the rest of the pixel zero (the AC4
// alpha and the other channels of a CR pixel are never written).
template <class T, int C>
struct Pixel {
    alignas(16) Byte bytes[C * sizeof(T)] = {};
    Pixel(const T* value, int k) { std::memcpy(bytes, value, k * sizeof(T)); }
};

// Long fills are string moves, which write whole cache lines without reading
// them first; 16-byte stores cannot, and reach only 0.5 to 0.75 of memset on
// regions in the outer cache.
//
// A row of kReplicateMin bytes or more fills its first kReplicatePeriod bytes
// and copies them forward over the rest with one overlapping string move
// (each byte copied from kReplicatePeriod bytes before it). The distance
// matters: the move ran at memset speed from about 6 KB on 6.2 MB C3 fills
// and at 0.9 of it from about 24 KB on 25 MB ones, but at 192 bytes at half
// that and at 3 KB at a third, as each load then waits for stores still in
// flight. The period is a multiple of the 48-byte pattern period and of the
// 64-byte line.
//
// Separate rows of kRowCopyMin bytes or more are copies of the first row,
// which stays in the cache: 4K C3 frames with padded rows fill at memset
// speed this way and at 0.78 of it with vector stores. Shorter rows lose
// more to the call than they gain. Rows that overlap (a step shorter than
// the row, which fills accept) are each filled in turn instead.
constexpr std::ptrdiff_t kReplicatePeriod = 24576;
constexpr std::ptrdiff_t kReplicateMin = 2 * kReplicatePeriod;
constexpr std::ptrdiff_t kRowCopyMin = 4096;

inline void FillLongRow(Byte* d, std::ptrdiff_t n, const move::FillPattern& pat)
{
    if (n < kReplicateMin) {
        move::FillRow<false>(d, n, pat);
        return;
    }
    move::FillRow<false>(d, kReplicatePeriod, pat);
    std::size_t count = static_cast<std::size_t>(n - kReplicatePeriod);
    const Byte* from = d;
    Byte* to = d + kReplicatePeriod;
    asm volatile("rep movsb" : "+D"(to), "+S"(from), "+c"(count) : : "memory");
}

// Plain fills: the value replicated over a 48-byte pattern and stored row by
// row, one row when the step equals the row length. Regions of more than
// 1048576 bytes that are at least as large as the largest cache are streamed.
template <int C, class T>
void FillRows(const T* value, Byte* dst, int dstStep, PvxiSize roi)
{
    constexpr int kP = C * sizeof(T);
    Pixel<T, C> pix(value, C);
    move::FillPattern pat = move::MakeFillPattern<kP>(pix.bytes);
    std::ptrdiff_t rowBytes = static_cast<std::ptrdiff_t>(roi.width) * kP;
    int rows = roi.height;
    bool nt = UseNonTemporal(rowBytes * rows, kNtThresholdSet);
    if (RowsContiguous(rowBytes, {dstStep})) {
        rowBytes *= rows;
        rows = 1;
    }
    // A value whose bytes are all equal (every 8u C1 value, 0 of any type)
    // is a memset, which the C runtime does with the widest stores the
    // processor has; 16-byte stores reach only about 0.8 of that on regions
    // that stay in the cache (measured on 1080p frames).
    bool uniform = true;
    for (int i = 1; i < kP; ++i) uniform = uniform && pix.bytes[i] == pix.bytes[0];
    if (uniform && !nt) {
        for (int y = 0; y < rows; ++y)
            std::memset(RowAt(dst, dstStep, y), pix.bytes[0], static_cast<std::size_t>(rowBytes));
        return;
    }
    if (nt) {
        for (int y = 0; y < rows; ++y) move::FillRow<true>(RowAt(dst, dstStep, y), rowBytes, pat);
        StoreFence();
        return;
    }
    FillLongRow(dst, rowBytes, pat);
    bool apart = std::abs(static_cast<std::ptrdiff_t>(dstStep)) >= rowBytes;
    for (int y = 1; y < rows; ++y) {
        Byte* d = RowAt(dst, dstStep, y);
        if (apart && rowBytes >= kRowCopyMin) std::memcpy(d, dst, static_cast<std::size_t>(rowBytes));
        else FillLongRow(d, rowBytes, pat);
    }
}

// Fills that keep some destination bytes (AC4 alpha, the other channels of a
// CR pixel). They read the destination and store it back blended; regions
// above the threshold that are at least as large as the largest cache stream
// those stores like the plain fills.
template <class M, int C, class T>
void BlendRows(const T* value, int k, Byte* dst, int dstStep, PvxiSize roi)
{
    Pixel<T, C> pix(value, k);
    VI pat[M::kIn];
    move::PatternVectors<M>(pix.bytes, pat);
    std::ptrdiff_t w = roi.width;
    int rows = roi.height;
    bool nt = UseNonTemporal(w * M::kOutPix * rows, kNtThresholdSet);
    if (RowsContiguous(w * M::kOutPix, {dstStep})) {
        w *= rows;
        rows = 1;
    }
    Byte* out[1];
    for (int y = 0; y < rows; ++y) {
        out[0] = RowAt(dst, dstStep, y);
        if (nt) move::MoveRow<M, true, true>(nullptr, out, w, pat);
        else move::MoveRow<M, true>(nullptr, out, w, pat);
    }
    if (nt) StoreFence();
}

template <class T, Lay L>
PvxStatus SetArrayBody(const T* value, T* pDst, int dstStep, PvxiSize roi)
{
    if (PvxStatus s = CheckFrame<Order::kPtrSize>({value, pDst}, roi, {})) return s;
    constexpr int kS = sizeof(T);
    Byte* dst = reinterpret_cast<Byte*>(pDst);
    if constexpr (L == Lay::C1) FillRows<1>(value, dst, dstStep, roi);
    else if constexpr (L == Lay::C3) FillRows<3>(value, dst, dstStep, roi);
    else if constexpr (L == Lay::C4) FillRows<4>(value, dst, dstStep, roi);
    else if constexpr (L == Lay::AC4) BlendRows<move::KeepAlpha<kS>, 4>(value, 3, dst, dstStep, roi);
    else if constexpr (L == Lay::C3CR) BlendRows<move::Channel<kS, 3>, 3>(value, 1, dst, dstStep, roi);
    else BlendRows<move::Channel<kS, 4>, 4>(value, 1, dst, dstStep, roi);
    return pvxStsNoErr;
}

// C1 and CR members take the value itself; the others an array of 3 or 4.
template <class T, Lay L>
PvxStatus SetBody(T value, T* pDst, int dstStep, PvxiSize roi)
{
    return SetArrayBody<T, L>(&value, pDst, dstStep, roi);
}

template <class T, Lay L>
PvxStatus SetBody(const T* value, T* pDst, int dstStep, PvxiSize roi)
{
    return SetArrayBody<T, L>(value, pDst, dstStep, roi);
}

// Masked fill: the masked-copy kernel with a pattern as its source. It never
// streams, whatever the size: blocks whose mask is all zero are skipped, and
// streamed stores of lines written in part cost the memory a read and a
// write each, far more than the cache they would spare.
template <class T, Lay L>
PvxStatus SetMaskArrayBody(const T* value, T* pDst, int dstStep, PvxiSize roi, const Pvx8u* pMask, int maskStep)
{
    if (PvxStatus s = CheckFrame<Order::kPtrSize>({value, pDst, pMask}, roi, {})) return s;
    constexpr int kS = sizeof(T), kC = kChannels<L>, kP = kS * kC;
    Pixel<T, kC> pix(value, kProcessed<L>);
    VI pat[kP];
    move::BlockPattern<kP>(pix.bytes, pat);
    std::ptrdiff_t w = roi.width;
    int rows = roi.height;
    if (RowsContiguous(w * kP, {dstStep}) && RowsContiguous(w, {maskStep})) {
        w *= rows;
        rows = 1;
    }
    for (int y = 0; y < rows; ++y)
        move::MaskRow<kS, kC, kKeepsAlpha<L>, true>(nullptr, reinterpret_cast<Byte*>(RowAt(pDst, dstStep, y)),
                                                    RowAt(pMask, maskStep, y), w, pat);
    return pvxStsNoErr;
}

template <class T, Lay L>
PvxStatus SetMaskBody(T value, T* pDst, int dstStep, PvxiSize roi, const Pvx8u* pMask, int maskStep)
{
    return SetMaskArrayBody<T, L>(&value, pDst, dstStep, roi, pMask, maskStep);
}

template <class T, Lay L>
PvxStatus SetMaskBody(const T* value, T* pDst, int dstStep, PvxiSize roi, const Pvx8u* pMask, int maskStep)
{
    return SetMaskArrayBody<T, L>(value, pDst, dstStep, roi, pMask, maskStep);
}

}  // namespace
}  // namespace pvx

#include "set.exports.inc"
