// Copy, CopyManaged and Dup: copies between images of the same or of
// different channel layouts, bit-exact for every element type.
#include "check.h"
#include "entry.h"
#include "layout.h"
#include "move.h"
#include "store.h"

namespace pvx {
namespace {

using namespace simd;
using move::Byte;

// The row kernel of each channel-changing layout, by element size.
template <int S, Lay L> struct MapOf;
template <int S> struct MapOf<S, Lay::AC4> { using type = move::KeepAlpha<S>; };
template <int S> struct MapOf<S, Lay::C3C1> { using type = move::Extract<S, 3>; };
template <int S> struct MapOf<S, Lay::C4C1> { using type = move::Extract<S, 4>; };
template <int S> struct MapOf<S, Lay::C1C3> { using type = move::Insert<S, 3>; };
template <int S> struct MapOf<S, Lay::C1C4> { using type = move::Insert<S, 4>; };
template <int S> struct MapOf<S, Lay::C3CR> { using type = move::Channel<S, 3>; };
template <int S> struct MapOf<S, Lay::C4CR> { using type = move::Channel<S, 4>; };
template <int S> struct MapOf<S, Lay::C3AC4> { using type = move::ThreeToAlpha<S>; };
template <int S> struct MapOf<S, Lay::AC4C3> { using type = move::AlphaToThree<S>; };
template <int S> struct MapOf<S, Lay::C3P3> { using type = move::Deinterleave<S, 3>; };
template <int S> struct MapOf<S, Lay::C4P4> { using type = move::Deinterleave<S, 4>; };
template <int S> struct MapOf<S, Lay::P3C3> { using type = move::Interleave<S, 3>; };
template <int S> struct MapOf<S, Lay::P4C4> { using type = move::Interleave<S, 4>; };

template <class T>
inline const Byte* Bytes(const T* p) { return reinterpret_cast<const Byte*>(p); }
template <class T>
inline Byte* Bytes(T* p) { return reinterpret_cast<Byte*>(p); }

// Copies rows of rowBytes. memmove runs at memory bandwidth on every row
// length we measured (1080p and 4K frames, 8u C1 and C3), so the plain
// copies are one call per row, or one call when the rows are contiguous.
void CopyRows(const Byte* src, int srcStep, Byte* dst, int dstStep, std::ptrdiff_t rowBytes, int rows)
{
    if (RowsContiguous(rowBytes, {srcStep, dstStep})) {
        rowBytes *= rows;
        rows = 1;
    }
    for (int y = 0; y < rows; ++y)
        std::memmove(RowAt(dst, dstStep, y), RowAt(src, srcStep, y), static_cast<std::size_t>(rowBytes));
}

// Copies n bytes with non-temporal loads (where the source is aligned with
// the destination) and non-temporal stores from the first 16-byte boundary of
// the destination; the unaligned first and last vectors are ordinary copies
// that overlap the streamed run with the same bytes. The caller fences.
template <bool kNtLoad>
void CopyRowNt(const Byte* s, Byte* d, std::ptrdiff_t n)
{
    StoreU(d, LoadU(s));
    std::ptrdiff_t i = static_cast<std::ptrdiff_t>((0 - reinterpret_cast<std::uintptr_t>(d)) & 15);
    auto load = [s](std::ptrdiff_t at) {
        if constexpr (kNtLoad) return LoadNt(s + at);
        else return LoadU(s + at);
    };
    for (; i + 64 <= n; i += 64) {
        VI a = load(i), b = load(i + 16), c = load(i + 32), e = load(i + 48);
        StoreNt(d + i, a);
        StoreNt(d + i + 16, b);
        StoreNt(d + i + 32, c);
        StoreNt(d + i + 48, e);
    }
    for (; i + 16 <= n; i += 16) StoreNt(d + i, load(i));
    if (i < n) StoreU(d + n - 16, LoadU(s + n - 16));
}

void CopyRowsNt(const Byte* src, int srcStep, Byte* dst, int dstStep, std::ptrdiff_t rowBytes, int rows)
{
    if (RowsContiguous(rowBytes, {srcStep, dstStep})) {
        rowBytes *= rows;
        rows = 1;
    }
    for (int y = 0; y < rows; ++y) {
        const Byte* s = RowAt(src, srcStep, y);
        Byte* d = RowAt(dst, dstStep, y);
        if (rowBytes < 16) {
            std::memmove(d, s, static_cast<std::size_t>(rowBytes));
        } else {
            bool sameAlign = ((reinterpret_cast<std::uintptr_t>(s) - reinterpret_cast<std::uintptr_t>(d)) & 15) == 0;
            if (sameAlign) CopyRowNt<true>(s, d, rowBytes);
            else CopyRowNt<false>(s, d, rowBytes);
        }
    }
    StoreFence();
}

// The rows of a map between single-pointer images, or planes (one pointer
// per vector of the planar side, one step for every plane). kNt: streamed
// stores, fenced after the last row.
template <class M, bool kNt = false>
void MoveRows(const Byte* const* in, int inStep, Byte* const* out, int outStep, PvxiSize roi)
{
    constexpr int kInStreams = M::kInPlanar ? M::kIn : 1;
    constexpr int kOutStreams = M::kOutPlanar ? M::kOut : 1;
    std::ptrdiff_t w = roi.width;
    int rows = roi.height;
    if (RowsContiguous(w * M::kInPix, {inStep}) && RowsContiguous(w * M::kOutPix, {outStep})) {
        w *= rows;
        rows = 1;
    }
    const Byte* ri[4] = {};
    Byte* ro[4] = {};
    for (int y = 0; y < rows; ++y) {
        for (int s = 0; s < kInStreams; ++s) ri[s] = RowAt(in[s], inStep, y);
        for (int s = 0; s < kOutStreams; ++s) ro[s] = RowAt(out[s], outStep, y);
        move::MoveRow<M, false, kNt>(ri, ro, w);
    }
    if constexpr (kNt) StoreFence();
}

template <class T, Lay L>
PvxStatus CopyBody(const T* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi)
{
    if (PvxStatus s = CheckFrame<Order::kPtrSize>({pSrc, pDst}, roi, {})) return s;
    if constexpr (L == Lay::C1 || L == Lay::C3 || L == Lay::C4) {
        CopyRows(Bytes(pSrc), srcStep, Bytes(pDst), dstStep,
                 static_cast<std::ptrdiff_t>(roi.width) * kChannels<L> * sizeof(T), roi.height);
    } else {
        const Byte* in[1] = {Bytes(pSrc)};
        Byte* out[1] = {Bytes(pDst)};
        MoveRows<typename MapOf<sizeof(T), L>::type>(in, srcStep, out, dstStep, roi);
    }
    return pvxStsNoErr;
}

// Interleaved to planar and back. Every member streams as arithmetic does,
// when what the call reads and writes together reaches half the largest
// cache: the source then pushes the written pixels out of the cache before
// anyone reads them, and streaming saves the read of every written line. On
// 4K 8u frames (25 MB written) merges ran about 1.25 times faster that way
// and splits 2.2 times, and 1080p 32f frames (the same bytes) 1.8 and 2.1
// times (each plane is written a whole line per step of four blocks, so
// every line leaves its write-combining buffer whole).
template <Lay L, class T>
void RunPlanar(const Byte* const* in, int inStep, Byte* const* out, int outStep, PvxiSize roi)
{
    using M = typename MapOf<sizeof(T), L>::type;
    const std::int64_t written = static_cast<std::int64_t>(roi.width) * roi.height * M::kIn * sizeof(T);
    if (StreamWorkingSet(2 * written)) MoveRows<M, true>(in, inStep, out, outStep, roi);
    else MoveRows<M>(in, inStep, out, outStep, roi);
}

template <class T, Lay L>
PvxStatus CopyToPlanesBody(const T* pSrc, int srcStep, T* const* pDst, int dstStep, PvxiSize roi)
{
    constexpr int kC = L == Lay::C3P3 ? 3 : 4;
    if (PvxStatus s = CheckPtrs({pSrc, pDst})) return s;
    for (int c = 0; c < kC; ++c)
        if (!pDst[c]) return pvxStsNullPtrErr;
    if (PvxStatus s = CheckRoi(roi)) return s;
    const Byte* in[1] = {Bytes(pSrc)};
    Byte* out[4] = {};
    for (int c = 0; c < kC; ++c) out[c] = Bytes(pDst[c]);
    RunPlanar<L, T>(in, srcStep, out, dstStep, roi);
    return pvxStsNoErr;
}

template <class T, Lay L>
PvxStatus CopyFromPlanesBody(const T* const* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi)
{
    constexpr int kC = L == Lay::P3C3 ? 3 : 4;
    if (PvxStatus s = CheckPtrs({pSrc})) return s;
    for (int c = 0; c < kC; ++c)
        if (!pSrc[c]) return pvxStsNullPtrErr;
    if (PvxStatus s = CheckPtrs({pDst})) return s;
    if (PvxStatus s = CheckRoi(roi)) return s;
    const Byte* in[4] = {};
    for (int c = 0; c < kC; ++c) in[c] = Bytes(pSrc[c]);
    Byte* out[1] = {Bytes(pDst)};
    RunPlanar<L, T>(in, srcStep, out, dstStep, roi);
    return pvxStsNoErr;
}

// Masked copy: one kernel per pixel size serves every element type.
template <class T, Lay L>
PvxStatus CopyMaskBody(const T* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi, const Pvx8u* pMask,
                       int maskStep)
{
    if (PvxStatus s = CheckFrame<Order::kPtrSize>({pSrc, pDst, pMask}, roi, {})) return s;
    constexpr int kS = sizeof(T), kC = kChannels<L>, kP = kS * kC;
    std::ptrdiff_t w = roi.width;
    int rows = roi.height;
    if (RowsContiguous(w * kP, {srcStep, dstStep}) && RowsContiguous(w, {maskStep})) {
        w *= rows;
        rows = 1;
    }
    for (int y = 0; y < rows; ++y)
        move::MaskRow<kS, kC, kKeepsAlpha<L>, false>(Bytes(RowAt(pSrc, srcStep, y)), Bytes(RowAt(pDst, dstStep, y)),
                                                     RowAt(pMask, maskStep, y), w);
    return pvxStsNoErr;
}

// Flags bit value 2: non-temporal loads and stores; the pixels are the same.
template <class T, Lay L>
PvxStatus CopyManagedBody(const T* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi, int flags)
{
    if (PvxStatus s = CheckFrame<Order::kPtrSize>({pSrc, pDst}, roi, {})) return s;
    std::ptrdiff_t rowBytes = static_cast<std::ptrdiff_t>(roi.width) * kChannels<L> * sizeof(T);
    if (flags & 2) CopyRowsNt(Bytes(pSrc), srcStep, Bytes(pDst), dstStep, rowBytes, roi.height);
    else CopyRows(Bytes(pSrc), srcStep, Bytes(pDst), dstStep, rowBytes, roi.height);
    return pvxStsNoErr;
}

// Dup streams its stores as the merges of planes do, once what it reads and
// writes reaches half the largest cache (4K 8u C1C3, 33 MB: about 1.5 times
// faster than ordinary stores, which ran level with the peer's).
template <class T, Lay L>
PvxStatus DupBody(const T* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi)
{
    if (PvxStatus s = CheckFrame<Order::kPtrSize>({pSrc, pDst}, roi, {})) return s;
    using M = move::Replicate<L == Lay::C1C3 ? 3 : 4>;
    const Byte* in[1] = {Bytes(pSrc)};
    Byte* out[1] = {Bytes(pDst)};
    const std::int64_t touched = static_cast<std::int64_t>(roi.width) * roi.height * (1 + M::kOut) * sizeof(T);
    if (StreamWorkingSet(touched)) MoveRows<M, true>(in, srcStep, out, dstStep, roi);
    else MoveRows<M>(in, srcStep, out, dstStep, roi);
    return pvxStsNoErr;
}

}  // namespace
}  // namespace pvx

#include "copy.exports.inc"
