// SwapChannels: reorders the channels of every pixel.
//
// Destination channel i receives source channel dstOrder[i]. The order arrays:
//   C3R, C3IR  3 entries, each 0..2
//   C4R, C4IR  4 entries, each 0..3
//   AC4R       3 entries, each 0..2; the destination alpha is never written
//   C3C4R      4 entries, each 0..3; an entry of 3 leaves that destination
//              channel as it was ({2, 1, 0, 3} turns BGR into RGBA and keeps
//              the alpha already in the destination)
//   C4C3R      3 entries, each 0..3
// Entries are compared as unsigned numbers, so a negative entry is refused
// like a large one (-60); every entry is checked before any pixel is written.
// When pSrc equals pDst every form runs in place on the destination rows
// (dstStep), whatever srcStep is: each row holds the source pixels from its
// start and receives the destination pixels there. C4C3R packs four-channel
// pixels into three in the same buffer, C3C4R spreads three-channel pixels
// out (the row must then hold the wider pixels); the rest of the row is not
// written.
//
// Kernels work on bytes, templated by element size, so 16s/16u and 32s/32f
// share them and 32f values move as bit patterns.
#include <array>
#include <cstring>

#include "check.h"
#include "entry.h"
#include "layout.h"
#include "shuffle.h"
#include "simd.h"
#include "store.h"

namespace pvx {
namespace {

using namespace simd;

// Source and destination channels in memory, entries of the order array and
// the bound that every entry must stay below (as an unsigned number).
template <Lay L> struct SwapForm;
template <> struct SwapForm<Lay::C3>   { static constexpr int kIn = 3, kOut = 3, kEntries = 3, kBound = 3; };
template <> struct SwapForm<Lay::C4>   { static constexpr int kIn = 4, kOut = 4, kEntries = 4, kBound = 4; };
template <> struct SwapForm<Lay::AC4>  { static constexpr int kIn = 4, kOut = 4, kEntries = 3, kBound = 3; };
template <> struct SwapForm<Lay::C3C4> { static constexpr int kIn = 3, kOut = 4, kEntries = 4, kBound = 4; };
template <> struct SwapForm<Lay::C4C3> { static constexpr int kIn = 4, kOut = 3, kEntries = 3, kBound = 4; };

constexpr int kKeep = -1;  // destination channel left as it was

// The order as the kernels see it: one source channel per destination
// channel, or kKeep (AC4 alpha, an entry of 3 in C3C4).
template <Lay L>
void NormalizeOrder(const int* dstOrder, int* ord)
{
    using F = SwapForm<L>;
    for (int c = 0; c < F::kOut; ++c) ord[c] = kKeep;
    for (int c = 0; c < F::kEntries; ++c) ord[c] = dstOrder[c];
    if constexpr (L == Lay::C3C4)
        for (int c = 0; c < 4; ++c)
            if (ord[c] == 3) ord[c] = kKeep;
}

template <Lay L>
PvxStatus CheckOrder(const int* dstOrder)
{
    using F = SwapForm<L>;
    for (int c = 0; c < F::kEntries; ++c)
        if (static_cast<unsigned>(dstOrder[c]) >= static_cast<unsigned>(F::kBound)) return pvxStsChannelOrderErr;
    return pvxStsNoErr;
}

// Masks of one block of 16 / E pixels: the shuffles, and the bytes of kept
// destination channels. The source byte of each destination byte is the
// byte's place in its source pixel (fixed by the layout) plus the offset of
// the channel that the order names, looked up with one byte shuffle a
// vector; a kept channel's offset has its top bit set.
template <int E, int Cin, int Cout>
struct SwapPlan {
    ShufflePlan<Cin, Cout> shuffle;
    VI keep[Cout];
    bool anyKeep = false;

    // Per destination byte b: its channel (first 16 * Cout bytes) and its
    // source byte without the channel offset (the next 16 * Cout).
    static constexpr auto kLayout = [] {
        std::array<std::uint8_t, 32 * Cout> t{};
        for (int b = 0; b < 16 * Cout; ++b) {
            int p = b / (Cout * E), c = (b / E) % Cout, e = b % E;
            t[b] = static_cast<std::uint8_t>(c);
            t[16 * Cout + b] = static_cast<std::uint8_t>(p * Cin * E + e);
        }
        return t;
    }();

    explicit SwapPlan(const int* ord)
    {
        alignas(16) std::uint8_t offset[16] = {};
        for (int c = 0; c < Cout; ++c) offset[c] = ord[c] == kKeep ? 0x80 : static_cast<std::uint8_t>(ord[c] * E);
        const VI offsets = LoadA(offset);
        VI src[Cout], kept = Zero();
        for (int k = 0; k < Cout; ++k) {
            VI channel = LoadU(kLayout.data() + 16 * k), place = LoadU(kLayout.data() + 16 * (Cout + k));
            src[k] = AddI8(ShuffleBytes(offsets, channel), place);
            keep[k] = And(src[k], SplatU8(0x80));  // SelectBytes looks at the top bit only
            kept = Or(kept, keep[k]);
        }
        anyKeep = MaskBytes(kept) != 0;
        BuildShufflePlan(shuffle, src);
    }
};

// Reorders `width` pixels of Cin channels into Cout channels, 16 / E pixels a
// step; kept channels are blended back from the destination. The fewer than
// 16 / E pixels left go as one more block, read and written in registers up
// to the row's end (they had gone a pixel at a time, about 2 ns a pixel: the
// 8 pixels left of a 24-pixel 8u row took longer than the block before
// them). Every block is loaded before it is stored, so src == dst works in
// place when the pixel size stays or shrinks. A: both rows 16-byte aligned;
// kNt: the destination row is aligned and blocks are streamed (every block
// starts a multiple of 16 bytes into the row).
template <int E, int Cin, int Cout, bool kKeepAny, bool A, bool kNt = false>
void SwapRow(const std::uint8_t* src, std::uint8_t* dst, std::ptrdiff_t width, const SwapPlan<E, Cin, Cout>& plan)
{
    using Geo = ReorderGeometry<E, Cin, Cout>;
    constexpr int P = Geo::kPixels;
    auto block = [&](const VI* in, const VI* old, VI* out) {
        ShuffleBlock<Geo>(in, out, plan.shuffle);
        if constexpr (kKeepAny)
            for (int k = 0; k < Cout; ++k) out[k] = SelectBytes(out[k], old[k], plan.keep[k]);
    };
    std::ptrdiff_t x = 0;
    for (; x + P <= width; x += P) {
        const std::uint8_t* s = src + x * Cin * E;
        std::uint8_t* d = dst + x * Cout * E;
        VI in[Cin], old[Cout], out[Cout];
        for (int j = 0; j < Cin; ++j) in[j] = Load<A>(s + 16 * j);
        if constexpr (kKeepAny)
            for (int k = 0; k < Cout; ++k) old[k] = Load<A>(d + 16 * k);
        block(in, old, out);
        for (int k = 0; k < Cout; ++k) Store<A, kNt>(d + 16 * k, out[k]);
    }
    if (x == width) return;
    const std::ptrdiff_t n = width - x;
    std::uint8_t* d = dst + x * Cout * E;
    VI in[Cin], old[Cout], out[Cout];
    LoadRow<Cin>(src + x * Cin * E, n * Cin * E, in);
    if constexpr (kKeepAny) LoadRow<Cout>(d, n * Cout * E, old);
    block(in, old, out);
    StoreRow<Cout>(d, n * Cout * E, out);
}

// C3C4 on one buffer: the destination pixels are wider than the source
// pixels, so the row runs from its right end in chunks whose source is first
// copied aside; a chunk then writes only over its own source and over pixels
// already done. (C4C3 narrows: left to right, a block never writes over
// source that is still to be read, so SwapRow serves it as it is.)
template <int E, int Cin, int Cout>
void SwapRowWidening(std::uint8_t* row, std::ptrdiff_t width, const SwapPlan<E, Cin, Cout>& plan)
{
    constexpr std::ptrdiff_t kChunk = 256;
    alignas(16) std::uint8_t aside[kChunk * Cin * E];
    for (std::ptrdiff_t end = width; end > 0;) {
        std::ptrdiff_t x = end > kChunk ? end - kChunk : 0;
        std::memcpy(aside, row + x * Cin * E, static_cast<std::size_t>((end - x) * Cin * E));
        if (plan.anyKeep) SwapRow<E, Cin, Cout, true, false>(aside, row + x * Cout * E, end - x, plan);
        else SwapRow<E, Cin, Cout, false, false>(aside, row + x * Cout * E, end - x, plan);
        end = x;
    }
}

template <int E, int Cin, int Cout>
void RunSwap(const std::uint8_t* src, std::ptrdiff_t srcStep, std::uint8_t* dst, std::ptrdiff_t dstStep, PvxiSize roi,
             const int* ord)
{
    SwapPlan<E, Cin, Cout> plan(ord);
    std::ptrdiff_t width = roi.width;
    int rows = roi.height;
    if (srcStep == width * Cin * E && dstStep == width * Cout * E) {
        width *= rows;
        rows = 1;
    }
    // Large calls that write a destination of their own stream their stores,
    // as the arithmetic does: 8-bit 4K frames (50 MB read and written) went
    // from OpenCV's speed to about 1.35 times it. Kept channels and in-place
    // calls read the destination and keep ordinary stores.
    const bool stream = !plan.anyKeep && src != dst &&
                        StreamWorkingSet(static_cast<std::int64_t>(width) * rows * (Cin + Cout) * E);
    for (int y = 0; y < rows; ++y) {
        const std::uint8_t* s = src + srcStep * y;
        std::uint8_t* d = dst + dstStep * y;
        if constexpr (Cin < Cout) {
            if (s == d) {
                SwapRowWidening<E, Cin, Cout>(d, width, plan);
                continue;
            }
        }
        bool aligned = IsAligned(s) && IsAligned(d);
        if (stream && IsAligned(d)) {
            if (aligned) SwapRow<E, Cin, Cout, false, true, true>(s, d, width, plan);
            else SwapRow<E, Cin, Cout, false, false, true>(s, d, width, plan);
        } else if (plan.anyKeep) {
            if (aligned) SwapRow<E, Cin, Cout, true, true>(s, d, width, plan);
            else SwapRow<E, Cin, Cout, true, false>(s, d, width, plan);
        } else {
            if (aligned) SwapRow<E, Cin, Cout, false, true>(s, d, width, plan);
            else SwapRow<E, Cin, Cout, false, false>(s, d, width, plan);
        }
    }
    if (stream) StoreFence();
}

template <class T, Lay L>
void Swap(const T* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi, const int* dstOrder)
{
    int ord[4];
    NormalizeOrder<L>(dstOrder, ord);
    RunSwap<sizeof(T), SwapForm<L>::kIn, SwapForm<L>::kOut>(reinterpret_cast<const std::uint8_t*>(pSrc), srcStep,
                                                            reinterpret_cast<std::uint8_t*>(pDst), dstStep, roi, ord);
}

template <class T, Lay L>
PvxStatus SwapChannelsBody(const T* pSrc, int srcStep, T* pDst, int dstStep, PvxiSize roi, const int* dstOrder)
{
    if (PvxStatus s = CheckPtrs({pSrc, pDst, dstOrder})) return s;
    if (PvxStatus s = CheckRoi(roi)) return s;
    if (PvxStatus s = CheckStepsNonZero({srcStep, dstStep})) return s;
    if (PvxStatus s = CheckOrder<L>(dstOrder)) return s;
    // Same pointer: in place on the destination rows.
    if (pSrc == pDst) srcStep = dstStep;
    Swap<T, L>(pSrc, srcStep, pDst, dstStep, roi, dstOrder);
    return pvxStsNoErr;
}

// In place: the step is checked before the sizes, and the order pointer after
// them, as callers of the in-place forms rely on.
template <class T, Lay L>
PvxStatus SwapChannelsInPlaceBody(T* pSrcDst, int srcDstStep, PvxiSize roi, const int* dstOrder)
{
    if (PvxStatus s = CheckPtrs({pSrcDst})) return s;
    if (PvxStatus s = CheckStepsNonZero({srcDstStep})) return s;
    if (PvxStatus s = CheckRoi(roi)) return s;
    if (PvxStatus s = CheckPtrs({dstOrder})) return s;
    if (PvxStatus s = CheckOrder<L>(dstOrder)) return s;
    Swap<T, L>(pSrcDst, srcDstStep, pSrcDst, srcDstStep, roi, dstOrder);
    return pvxStsNoErr;
}

}  // namespace
}  // namespace pvx

#include "swapchannels.exports.inc"
