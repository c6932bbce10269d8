// Byte shuffles of whole blocks of vectors, shared by the channel-order and
// mirror kernels. A block of NIn source vectors becomes NOut destination
// vectors; each destination vector is the OR of byte shuffles of the few
// source vectors that can supply it (a geometry class names them at compile
// time, so a 3-channel block costs 7 shuffles, a 4-channel block 4).
#pragma once

#include <cstdint>
#include <utility>

#include "simd.h"

namespace pvx {

// Masks for one block: mask[k][j] picks the bytes of destination vector k
// that come from source vector j; lanes that j does not supply are 0x80
// (shuffled to zero).
template <int NIn, int NOut>
struct ShufflePlan {
    simd::VI mask[NOut][NIn];
};

// src[k], k < NOut: byte i is the source byte (below 16 * NIn) of destination
// byte 16 * k + i in the block, or has its top bit set for a byte left zero.
// The masks are built in registers: built byte by byte in memory and then
// loaded, they took most of the time of a small call (about 150 ns of the
// 200 that a 2x2 SwapChannels took).
template <int NIn, int NOut>
inline void BuildShufflePlan(ShufflePlan<NIn, NOut>& plan, const simd::VI* src)
{
    using namespace simd;
    const VI low = SplatU8(0x0F), high = SplatU8(0xF0), none = SplatU8(0x80);
    for (int k = 0; k < NOut; ++k) {
        VI lane = And(src[k], low), from = And(src[k], high);  // byte within, and 16 x the source vector
        for (int j = 0; j < NIn; ++j) {
            VI mine = EqU8(from, SplatU8(static_cast<std::uint8_t>(16 * j)));
            plan.mask[k][j] = Or(And(mine, lane), AndNot(mine, none));
        }
    }
}

// One destination vector K from source vectors Geo::Lo(K)..Geo::Hi(K).
template <class Geo, int K, int NIn, int NOut>
inline simd::VI ShuffleOne(const simd::VI* in, const ShufflePlan<NIn, NOut>& p)
{
    constexpr int lo = Geo::Lo(K), hi = Geo::Hi(K);
    simd::VI acc = simd::ShuffleBytes(in[lo], p.mask[K][lo]);
    if constexpr (hi > lo) acc = simd::Or(acc, simd::ShuffleBytes(in[lo + 1], p.mask[K][lo + 1]));
    if constexpr (hi > lo + 1) acc = simd::Or(acc, simd::ShuffleBytes(in[lo + 2], p.mask[K][lo + 2]));
    static_assert(hi - lo <= 2, "a destination vector draws from at most three source vectors");
    return acc;
}

template <class Geo, int NIn, int NOut>
inline void ShuffleBlock(const simd::VI* in, simd::VI* out, const ShufflePlan<NIn, NOut>& p)
{
    [&]<int... K>(std::integer_sequence<int, K...>) {
        ((out[K] = ShuffleOne<Geo, K>(in, p)), ...);
    }(std::make_integer_sequence<int, NOut>{});
}

// Channel reordering of P = 16 / E pixels: Cin source channels, Cout
// destination channels of E bytes each. Destination vector k can draw from
// any channel of the pixels that it covers.
template <int E, int Cin, int Cout>
struct ReorderGeometry {
    static constexpr int kPixels = 16 / E;
    static constexpr int Lo(int k) { return (16 * k) / (Cout * E) * Cin * E / 16; }
    static constexpr int Hi(int k) { return ((16 * k + 15) / (Cout * E) * Cin * E + Cin * E - 1) / 16; }
};

// Reversal of the pixels of NV vectors of PS-byte pixels (PS * P = 16 * NV).
template <int PS, int NV>
struct ReverseGeometry {
    static constexpr int kPixels = 16 * NV / PS;
    static constexpr int Lo(int k) { return (kPixels - 1 - (16 * k + 15) / PS) * PS / 16; }
    static constexpr int Hi(int k) { return ((kPixels - 1 - (16 * k) / PS) * PS + PS - 1) / 16; }
};

}  // namespace pvx
