// Row kernels of the bit-exact data-movement families (Copy, Set, Dup): every
// element is moved as a bit pattern in integer registers, so 32f NaNs keep
// their payload. Kernels depend on the element size only; 16s and 16u, 32s
// and 32f share them.
//
// Three engines:
//   MoveRow    a fixed byte permutation of blocks of 16 / S pixels between
//              interleaved and planar streams, optionally keeping some
//              destination bytes (channel blends) or taking a constant
//              pattern as the source;
//   MaskRow    a masked copy or fill of 16 pixels a step, the mask byte
//              expanded to the pixel width;
//   FillRow    a fill with a replicated pattern whose period divides 48.
//
// Kept destination bytes (channel blends, pixels masked out) are loaded and
// stored back with the bytes written, 16 at a time: their values never
// change, but two calls that write different channels of the same pixels
// must not run at once (the family headers say so).
//
// Loads and stores are movdqu on every row: on aligned addresses it runs as
// fast as movdqa (measured on 600 KB and 6 MB fills), so an aligned path per
// row would double the kernels for nothing. Only the streamed stores need
// aligned addresses, and they get them from a scalar or overlapping head.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <cstring>

#include "simd.h"

namespace pvx::move {

using namespace simd;
using Byte = std::uint8_t;

// ---- MoveRow ------------------------------------------------------------------
//
// A map describes one block of N = 16 / S pixels. The input side has kIn
// vectors and the output side kOut; a planar side has one vector per plane
// (one stream each), an interleaved side one stream of consecutive vectors.
// Src(g) gives the input byte (global index q * 16 + j) that output byte g
// (o * 16 + j) takes, or -1 where the destination byte is kept. kShort: a
// pointer addresses one channel of a multi-channel pixel, so the last pixel
// of a row ends S bytes after it and blocks stop one pixel early.

template <int S, int C>  // interleaved C channels -> C planes
struct Deinterleave {
    static constexpr int kS = S, kIn = C, kOut = C, kInPix = C * S, kOutPix = S;
    static constexpr bool kInPlanar = false, kOutPlanar = true, kShort = false, kQuad = C == 4;
    static constexpr int Src(int g) { return ((g % 16) / S) * C * S + (g / 16) * S + g % S; }
};

template <int S, int C>  // C planes -> interleaved C channels
struct Interleave {
    static constexpr int kS = S, kIn = C, kOut = C, kInPix = S, kOutPix = C * S;
    static constexpr bool kInPlanar = true, kOutPlanar = false, kShort = false, kQuad = C == 4;
    static constexpr int Src(int g) { return ((g / S) % C) * 16 + (g / (C * S)) * S + g % S; }
};

template <int S, int C>  // one channel of C (pointer at the channel) -> one channel
struct Extract {
    static constexpr int kS = S, kIn = C, kOut = 1, kInPix = C * S, kOutPix = S;
    static constexpr bool kInPlanar = false, kOutPlanar = false, kShort = true;
    static constexpr int Src(int g) { return (g / S) * C * S + g % S; }
};

template <int S, int C>  // one channel -> one channel of C (pointer at the channel)
struct Insert {
    static constexpr int kS = S, kIn = 1, kOut = C, kInPix = S, kOutPix = C * S;
    static constexpr bool kInPlanar = false, kOutPlanar = false, kShort = true;
    static constexpr int Src(int g) { return g % (C * S) < S ? (g / (C * S)) * S + g % (C * S) : -1; }
};

template <int S, int C>  // one channel to the same channel (both pointers at it)
struct Channel {
    static constexpr int kS = S, kIn = C, kOut = C, kInPix = C * S, kOutPix = C * S;
    static constexpr bool kInPlanar = false, kOutPlanar = false, kShort = true;
    static constexpr int Src(int g) { return g % (C * S) < S ? g : -1; }
};

template <int S>  // four channels, the destination's fourth kept
struct KeepAlpha {
    static constexpr int kS = S, kIn = 4, kOut = 4, kInPix = 4 * S, kOutPix = 4 * S;
    static constexpr bool kInPlanar = false, kOutPlanar = false, kShort = false;
    static constexpr int Src(int g) { return g % (4 * S) < 3 * S ? g : -1; }
};

template <int S>  // three channels -> four, the destination's fourth kept
struct ThreeToAlpha {
    static constexpr int kS = S, kIn = 3, kOut = 4, kInPix = 3 * S, kOutPix = 4 * S;
    static constexpr bool kInPlanar = false, kOutPlanar = false, kShort = false;
    static constexpr int Src(int g) { return (g / S) % 4 < 3 ? (g / (4 * S)) * 3 * S + g % (4 * S) : -1; }
};

template <int S>  // four channels -> three
struct AlphaToThree {
    static constexpr int kS = S, kIn = 4, kOut = 3, kInPix = 4 * S, kOutPix = 3 * S;
    static constexpr bool kInPlanar = false, kOutPlanar = false, kShort = false;
    static constexpr int Src(int g) { return (g / (3 * S)) * 4 * S + g % (3 * S); }
};

template <int C>  // one 8-bit channel -> every channel of C
struct Replicate {
    static constexpr int kS = 1, kIn = 1, kOut = C, kInPix = 1, kOutPix = C;
    static constexpr bool kInPlanar = false, kOutPlanar = false, kShort = false;
    static constexpr int Src(int g) { return g / C; }
};

// The shuffles of a map, computed once at compile time, with the cheapest of
// three ways to build the output vectors (counting pshufb and por as one
// instruction and pblendvb as two: por issues on more ports than pshufb and
// pblendvb):
//   kOrShuffles     OR of one pshufb per contributing input;
//   kShuffleBlend   one pshufb per input shared by every output, then blends
//                   (when each input lands on the same positions in every
//                   output: one input feeding several outputs);
//   kBlendShuffle   blends first, then one pshufb per output (when the bytes
//                   of each output sit at distinct positions of their inputs).
// Merging three planes ties (three pshufb and six blends against nine pshufb
// and six por) and takes the blends: fewer instructions per line keep more
// loads in flight, and 8-bit merges of 4K frames ran about 1.1 times faster
// (streamed) with no loss at 1080p. Splitting into three planes ties as well
// and takes the blends first (six blends and three pshufb): 1.12 to 1.14
// times faster than the shuffles and ORs for 8u, 16s and 32f frames from
// 640 x 480 to 4K on the processor we measure now; an earlier one ran the
// shuffles and ORs faster. Other ties go to kOrShuffles. direct marks an
// output that is input o unchanged (channel blends); keep marks the
// destination bytes that are kept.
enum class Plan { kOrShuffles, kShuffleBlend, kBlendShuffle };

inline constexpr int kBlendCost = 2;  // pshufb and por count one

struct MoveTable {
    alignas(16) std::int8_t idx[4][4][16];    // [o][q]: pshufb of input q for output o
    alignas(16) std::int8_t keep[4][16];      // [o]: destination bytes kept
    alignas(16) std::int8_t sel[4][4][16];    // [o][q]: bytes that output o takes from input q
    alignas(16) std::int8_t shared[4][16];    // [q]: kShuffleBlend: the one pshufb of input q
    alignas(16) std::int8_t pick[4][4][16];   // [o][q]: kBlendShuffle: positions output o takes from input q
    alignas(16) std::int8_t gather[4][16];    // [o]: kBlendShuffle: the one pshufb of output o
    bool used[4][4];
    bool direct[4];
    bool keeps[4];
    bool sharedUsed[4];
    Plan plan;
};

// Maps of four channels, which move as a transpose (below).
template <class M>
constexpr bool IsQuad()
{
    if constexpr (requires { M::kQuad; }) return M::kQuad;
    else return false;
}

template <class M>
constexpr MoveTable BuildMoveTable()
{
    MoveTable t{};
    int costPerOutput = 0;
    for (int o = 0; o < M::kOut; ++o) {
        bool direct = true;
        for (int j = 0; j < 16; ++j) {
            int s = M::Src(o * 16 + j);
            t.keep[o][j] = s < 0 ? -1 : 0;
            if (s < 0) t.keeps[o] = true;
            if (s >= 0 && s != o * 16 + j) direct = false;
            for (int q = 0; q < M::kIn; ++q) {
                bool from = s >= 0 && s / 16 == q;
                t.idx[o][q][j] = from ? static_cast<std::int8_t>(s % 16) : static_cast<std::int8_t>(-128);
                t.sel[o][q][j] = from ? -1 : 0;
                if (from) t.used[o][q] = true;
            }
        }
        t.direct[o] = direct && o < M::kIn;
        int n = 0;
        for (int q = 0; q < M::kIn; ++q) n += t.used[o][q];
        if (t.direct[o]) continue;
        costPerOutput += 2 * n - 1;
    }
    // shuffle first: one pshufb per input must serve every output
    bool consistent = true;
    for (int q = 0; q < M::kIn; ++q)
        for (int j = 0; j < 16; ++j) t.shared[q][j] = -128;
    int costShared = 0;
    for (int o = 0; o < M::kOut; ++o) {
        if (t.direct[o]) continue;
        int n = 0;
        for (int q = 0; q < M::kIn; ++q) {
            if (!t.used[o][q]) continue;
            ++n;
            t.sharedUsed[q] = true;
            for (int j = 0; j < 16; ++j) {
                std::int8_t b = t.idx[o][q][j];
                if (b < 0) continue;
                if (t.shared[q][j] >= 0 && t.shared[q][j] != b) consistent = false;
                t.shared[q][j] = b;
            }
        }
        costShared += kBlendCost * (n - 1);
    }
    for (int q = 0; q < M::kIn; ++q) costShared += t.sharedUsed[q];
    bool blendTies = M::kInPlanar;  // merges, measured above
    if (consistent && (costShared < costPerOutput || (blendTies && costShared == costPerOutput)))
        t.plan = Plan::kShuffleBlend;
    else t.plan = Plan::kOrShuffles;

    // blend first: each output's bytes sit at distinct positions of their
    // inputs, so blends gather them into one vector and one pshufb orders it
    bool distinct = !M::kInPlanar;
    for (int o = 0; o < M::kOut; ++o) {
        if (t.direct[o] || t.keeps[o]) continue;
        int owner[16];
        for (int p = 0; p < 16; ++p) owner[p] = -1;
        for (int j = 0; j < 16; ++j) {
            int s = M::Src(o * 16 + j);
            if (s < 0) continue;
            if (owner[s % 16] >= 0 && owner[s % 16] != s / 16) distinct = false;
            owner[s % 16] = s / 16;
            t.gather[o][j] = static_cast<std::int8_t>(s % 16);
        }
        for (int q = 0; q < M::kIn; ++q)
            for (int p = 0; p < 16; ++p) t.pick[o][q][p] = owner[p] == q ? -1 : 0;
    }
    if (distinct && M::kOutPlanar && !IsQuad<M>()) t.plan = Plan::kBlendShuffle;

    return t;
}

template <class M>
inline constexpr MoveTable kMoveTable = BuildMoveTable<M>();

// Four channels to four planes and back as a 4x4 transpose of 32-bit lanes:
// within a 16-byte vector of interleaved pixels, group[] gathers each
// channel into one lane (c * 4 + p * S + e <- p * 4 S + c * S + e) and
// ungroup[] undoes it; 4-byte elements need neither. 12 instructions per 64
// bytes where the per-output shuffles take 28.
template <int S>
struct QuadTable {
    alignas(16) std::int8_t group[16];
    alignas(16) std::int8_t ungroup[16];
    constexpr QuadTable() : group{}, ungroup{}
    {
        for (int p = 0; p < 4 / S; ++p)
            for (int c = 0; c < 4; ++c)
                for (int e = 0; e < S; ++e) {
                    group[c * 4 + p * S + e] = static_cast<std::int8_t>(p * 4 * S + c * S + e);
                    ungroup[p * 4 * S + c * S + e] = static_cast<std::int8_t>(c * 4 + p * S + e);
                }
    }
};

template <int S>
inline constexpr QuadTable<S> kQuadTable{};

// The output vectors of one block from its input vectors: shuffles, or the
// input unchanged, or the four-channel transpose (which works on v in
// place). Kept destination bytes are blended in by the caller.
template <class M>
[[gnu::always_inline]] inline void BuildBlock(VI* v, VI* r)
{
    constexpr const MoveTable& T = kMoveTable<M>;
    if constexpr (IsQuad<M>()) {
        constexpr const QuadTable<M::kS>& Q = kQuadTable<M::kS>;
        if constexpr (!M::kInPlanar && M::kS < 4)
            for (int q = 0; q < 4; ++q) v[q] = ShuffleBytes(v[q], LoadA(Q.group));
        Transpose4x32(v[0], v[1], v[2], v[3]);
        if constexpr (M::kInPlanar && M::kS < 4)
            for (int q = 0; q < 4; ++q) v[q] = ShuffleBytes(v[q], LoadA(Q.ungroup));
        for (int o = 0; o < 4; ++o) r[o] = v[o];
        return;
    }
    if constexpr (T.plan == Plan::kBlendShuffle) {
        for (int o = 0; o < M::kOut; ++o) {
            bool first = true;
            for (int q = 0; q < M::kIn; ++q) {
                if (!T.used[o][q]) continue;
                r[o] = first ? v[q] : SelectBytes(r[o], v[q], LoadA(T.pick[o][q]));
                first = false;
            }
            r[o] = ShuffleBytes(r[o], LoadA(T.gather[o]));
        }
        return;
    }
    VI sh[M::kIn];
    if constexpr (T.plan == Plan::kShuffleBlend)
        for (int q = 0; q < M::kIn; ++q)
            if (T.sharedUsed[q]) sh[q] = ShuffleBytes(v[q], LoadA(T.shared[q]));
    for (int o = 0; o < M::kOut; ++o) {
        r[o] = Zero();
        if (T.direct[o]) {
            r[o] = v[o];
        } else if (T.plan == Plan::kShuffleBlend) {
            bool first = true;
            for (int q = 0; q < M::kIn; ++q) {
                if (!T.used[o][q]) continue;
                r[o] = first ? sh[q] : SelectBytes(r[o], sh[q], LoadA(T.sel[o][q]));
                first = false;
            }
        } else {
            for (int q = 0; q < M::kIn; ++q)
                if (T.used[o][q]) r[o] = Or(r[o], ShuffleBytes(v[q], LoadA(T.idx[o][q])));
        }
    }
}

// One block of N pixels at pixel x: loads every input vector, builds every
// output vector, blends in the kept destination bytes, and stores. Always
// inlined: a call per block, which the compiler chose once rows ran four
// blocks a step, halved the speed.
template <class M, bool kConst, bool kStream>
[[gnu::always_inline]] inline void MoveBlock(const Byte* const* in, Byte* const* out, std::ptrdiff_t x, const VI* pat)
{
    constexpr const MoveTable& T = kMoveTable<M>;
    VI v[M::kIn], r[M::kOut];
    for (int q = 0; q < M::kIn; ++q) {
        if constexpr (kConst) v[q] = pat[q];
        else v[q] = LoadU(M::kInPlanar ? in[q] + x * M::kS : in[0] + x * M::kInPix + 16 * q);
    }
    BuildBlock<M>(v, r);
    for (int o = 0; o < M::kOut; ++o) {
        Byte* d = M::kOutPlanar ? out[o] + x * M::kS : out[0] + x * M::kOutPix + 16 * o;
        if (T.keeps[o]) r[o] = SelectBytes(r[o], LoadU(d), LoadA(T.keep[o]));
        Store<false, kStream>(d, r[o]);
    }
}

// Bytes of n pixels of a stream of pixels of kPix bytes; a stream whose
// pointer is at one channel of its pixels (kShort maps) ends with that
// channel.
template <class M, int kPix>
constexpr std::ptrdiff_t StreamBytes(std::ptrdiff_t n)
{
    return M::kShort ? (n - 1) * kPix + M::kS : n * kPix;
}

// Pixels [x, x + n) as one block read and written in registers up to the
// ends of the streams, with nothing outside them touched: 0 < n <= N (the
// last pixel of a kShort row included). Rows' ends and rows shorter than a
// block went a pixel at a time, a table-driven element copy each, and an
// 8x8 tile of 3-channel pixels split into planes took 130 ns.
template <class M, bool kConst>
[[gnu::always_inline]] inline void MoveShort(const Byte* const* in, Byte* const* out, std::ptrdiff_t x,
                                             std::ptrdiff_t n, const VI* pat)
{
    constexpr const MoveTable& T = kMoveTable<M>;
    VI v[M::kIn], r[M::kOut];
    if constexpr (kConst) {
        for (int q = 0; q < M::kIn; ++q) v[q] = pat[q];
    } else if constexpr (M::kInPlanar) {
        for (int q = 0; q < M::kIn; ++q) LoadRow<1>(in[q] + x * M::kS, n * M::kS, &v[q]);
    } else {
        LoadRow<M::kIn>(in[0] + x * M::kInPix, StreamBytes<M, M::kInPix>(n), v);
    }
    BuildBlock<M>(v, r);
    if constexpr (M::kOutPlanar) {
        for (int o = 0; o < M::kOut; ++o) {
            Byte* d = out[o] + x * M::kS;
            if (T.keeps[o]) {
                VI old;
                LoadRow<1>(d, n * M::kS, &old);
                r[o] = SelectBytes(r[o], old, LoadA(T.keep[o]));
            }
            StoreRow<1>(d, n * M::kS, &r[o]);
        }
    } else {
        Byte* d = out[0] + x * M::kOutPix;
        const std::ptrdiff_t bytes = StreamBytes<M, M::kOutPix>(n);
        constexpr bool kAnyKeep = [] {
            for (int o = 0; o < M::kOut; ++o)
                if (kMoveTable<M>.keeps[o]) return true;
            return false;
        }();
        if constexpr (kAnyKeep) {
            VI old[M::kOut];
            LoadRow<M::kOut>(d, bytes, old);
            for (int o = 0; o < M::kOut; ++o)
                if (T.keeps[o]) r[o] = SelectBytes(r[o], old[o], LoadA(T.keep[o]));
        }
        StoreRow<M::kOut>(d, bytes, r);
    }
}

// First pixel from which every output stream is 16-byte aligned (so that
// blocks can be streamed), or -1 when no pixel within a block gets there.
template <class M>
inline std::ptrdiff_t StreamStart(Byte* const* out)
{
    auto addr = [](const Byte* p) { return reinterpret_cast<std::uintptr_t>(p); };
    constexpr int kStreams = M::kOutPlanar ? M::kOut : 1;
    constexpr int kStride = M::kOutPlanar ? M::kS : M::kOutPix;
    for (int s = 1; s < kStreams; ++s)
        if ((addr(out[s]) - addr(out[0])) % 16 != 0) return -1;
    for (int h = 0; h < 16; ++h)
        if ((addr(out[0]) + static_cast<std::uintptr_t>(h) * kStride) % 16 == 0) return h;
    return -1;
}

// The whole blocks of pixels [x, end), four a step while four remain, so
// that every planar stream is read or written a whole 64-byte line at a time;
// returns the first pixel left over. Inlined into MoveRow, whose local copies
// of the stream pointers stay in registers. Four a step made 8-bit merges of
// 1080p frames held in the cache about 1.1 times faster in the median of
// interleaved runs (the best runs were alike) and streamed 4K merges about
// 1.08 times faster.
template <class M, bool kConst, bool kStream>
[[gnu::always_inline]] inline std::ptrdiff_t MoveBlocks(const Byte* const* in, Byte* const* out, std::ptrdiff_t x,
                                                        std::ptrdiff_t end, const VI* pat)
{
    constexpr std::ptrdiff_t kN = 16 / M::kS;
    for (; x + 4 * kN <= end; x += 4 * kN) {
        MoveBlock<M, kConst, kStream>(in, out, x, pat);
        MoveBlock<M, kConst, kStream>(in, out, x + kN, pat);
        MoveBlock<M, kConst, kStream>(in, out, x + 2 * kN, pat);
        MoveBlock<M, kConst, kStream>(in, out, x + 3 * kN, pat);
    }
    for (; x + kN <= end; x += kN) MoveBlock<M, kConst, kStream>(in, out, x, pat);
    return x;
}

// Moves w pixels of one row: whole blocks, then what they leave as one short
// block. kNt: stream the output (non-temporal stores) where the output
// streams can be aligned; the unaligned head and the tail are ordinary
// stores, and the caller fences after its last row.
template <class M, bool kConst = false, bool kNt = false>
void MoveRow(const Byte* const* inStreams, Byte* const* outStreams, std::ptrdiff_t w, const VI* pat = nullptr)
{
    // Local copies: stores through the rows cannot alias them, so the
    // pointers stay in registers.
    const Byte* in[4] = {};
    Byte* out[4] = {};
    if constexpr (!kConst)
        for (int s = 0; s < (M::kInPlanar ? M::kIn : 1); ++s) in[s] = inStreams[s];
    for (int s = 0; s < (M::kOutPlanar ? M::kOut : 1); ++s) out[s] = outStreams[s];
    constexpr std::ptrdiff_t kN = 16 / M::kS;
    const std::ptrdiff_t end = M::kShort ? w - 1 : w;
    std::ptrdiff_t x = 0;
    if constexpr (kNt) {
        std::ptrdiff_t h = StreamStart<M>(out);
        if (h >= 0 && h + kN <= end) {
            if (h > 0) MoveShort<M, kConst>(in, out, 0, h, pat);
            x = MoveBlocks<M, kConst, true>(in, out, h, end, pat);
            if (x < w) MoveShort<M, kConst>(in, out, x, w - x, pat);
            return;
        }
    }
    x = MoveBlocks<M, kConst, false>(in, out, x, end, pat);
    if (x < w) MoveShort<M, kConst>(in, out, x, w - x, pat);
}

// The input vectors of one block when the input is a pixel pattern: byte j of
// vector q is pattern byte (16 q + j) mod pixel bytes.
template <class M>
inline void PatternVectors(const Byte* pix, VI* pat)
{
    alignas(16) Byte b[16];
    for (int q = 0; q < M::kIn; ++q) {
        for (int j = 0; j < 16; ++j) b[j] = pix[(16 * q + j) % M::kInPix];
        pat[q] = LoadA(b);
    }
}

// ---- MaskRow --------------------------------------------------------------------

// Byte j of expansion vector k picks the mask byte of the pixel that holds
// byte 16 k + j of a block of 16 pixels of P bytes; alpha marks the fourth
// channel of AC4 pixels.
template <int S, int C, bool kAlpha>
struct MaskTable {
    static constexpr int P = C * S;
    alignas(16) std::int8_t expand[P][16];
    alignas(16) std::int8_t alpha[P][16];
    constexpr MaskTable() : expand{}, alpha{}
    {
        for (int k = 0; k < P; ++k)
            for (int j = 0; j < 16; ++j) {
                expand[k][j] = static_cast<std::int8_t>((16 * k + j) / P);
                alpha[k][j] = kAlpha && (16 * k + j) % P >= 3 * S ? -1 : 0;
            }
    }
};

template <int S, int C, bool kAlpha>
inline constexpr MaskTable<S, C, kAlpha> kMaskTable{};

// Writes pixel x of w where its mask byte is non-zero, 16 pixels a step
// (blocks whose mask is all zero are skipped); the fewer pixels left as one
// short block in registers, whose mask lanes past the row read as zero.
// kConst: the source is a pattern: pat holds the P vectors of a block.
template <int S, int C, bool kAlpha, bool kConst>
void MaskRow(const Byte* src, Byte* dst, const Byte* mask, std::ptrdiff_t w, const VI* pat = nullptr)
{
    constexpr int P = C * S;
    constexpr const MaskTable<S, C, kAlpha>& T = kMaskTable<S, C, kAlpha>;
    auto keepOf = [&](VI off, int k) {
        VI keep = ShuffleBytes(off, LoadA(T.expand[k]));
        if constexpr (kAlpha) keep = Or(keep, LoadA(T.alpha[k]));
        return keep;
    };
    std::ptrdiff_t x = 0;
    for (; x + 16 <= w; x += 16) {
        VI off = EqU8(LoadU(mask + x), Zero());  // 0xff where the pixel is left
        if (MoveMask8(off) == 0xffff) continue;
        for (int k = 0; k < P; ++k) {
            Byte* d = dst + x * P + 16 * k;
            VI s = kConst ? pat[k] : LoadU(src + x * P + 16 * k);
            StoreU(d, SelectBytes(s, LoadU(d), keepOf(off, k)));
        }
    }
    if (x == w) return;
    const std::ptrdiff_t n = w - x, bytes = n * P;
    VI off = EqU8(LoadShort(mask + x, n), Zero());
    if (MoveMask8(off) == 0xffff) return;
    VI s[P], d[P];
    if constexpr (kConst)
        for (int k = 0; k < P; ++k) s[k] = pat[k];
    else LoadRow<P>(src + x * P, bytes, s);
    LoadRow<P>(dst + x * P, bytes, d);
    for (int k = 0; k < P; ++k) d[k] = SelectBytes(s[k], d[k], keepOf(off, k));
    StoreRow<P>(dst + x * P, bytes, d);
}

// The P vectors of a block of 16 pixels filled with one pixel value.
template <int P>
inline void BlockPattern(const Byte* pix, VI* pat)
{
    alignas(16) Byte b[16];
    for (int k = 0; k < P; ++k) {
        for (int j = 0; j < 16; ++j) b[j] = pix[(16 * k + j) % P];
        pat[k] = LoadA(b);
    }
}

// ---- FillRow ----------------------------------------------------------------------

// A fill pattern: byte i of a row is bytes[i % 48] (the pixel size divides
// 48), with 16 more bytes so that any phase can be loaded as one vector.
struct FillPattern {
    alignas(16) Byte bytes[64];
};

// The pattern is four byte shuffles of the pixel with indices fixed at
// compile time: built byte by byte, with a division a byte, it took half the
// time of a 16x16 fill.
template <int kPixelBytes>
inline FillPattern MakeFillPattern(const Byte* pix)
{
    static_assert(kPixelBytes <= 16 && 48 % kPixelBytes == 0);
    static constexpr auto kIndex = [] {
        std::array<Byte, 64> t{};
        for (int i = 0; i < 64; ++i) t[i] = static_cast<Byte>(i % kPixelBytes);
        return t;
    }();
    alignas(16) Byte px[16] = {};
    std::memcpy(px, pix, kPixelBytes);
    const VI v = LoadA(px);
    FillPattern p;
    for (int k = 0; k < 4; ++k) StoreA(p.bytes + 16 * k, ShuffleBytes(v, LoadU(kIndex.data() + 16 * k)));
    return p;
}

// Fills n bytes. Rows of 64 bytes or less are copies of the pattern's start
// (the last 16 bytes as one vector that may overlap the one before).
// Longer rows: one unaligned vector at the start, then aligned vectors from
// the first 16-byte boundary (streamed when kNt), then one unaligned vector
// that ends the row. The head and end vectors re-write bytes of the aligned
// run with the same values, which a fill may do.
template <bool kNt>
void FillRow(Byte* d, std::ptrdiff_t n, const FillPattern& p)
{
    if (n <= 64) {
        if (n < 16) {
            std::memcpy(d, p.bytes, static_cast<std::size_t>(n));
            return;
        }
        for (std::ptrdiff_t i = 0; i + 16 <= n; i += 16) StoreU(d + i, LoadA(p.bytes + i));
        StoreU(d + n - 16, LoadU(p.bytes + n - 16));
        return;
    }
    const Byte* b = p.bytes;
    StoreU(d, LoadA(b));
    std::ptrdiff_t i = static_cast<std::ptrdiff_t>((0 - reinterpret_cast<std::uintptr_t>(d)) & 15);
    int ph = static_cast<int>(i % 48);
    VI v0 = LoadU(b + ph), v1 = LoadU(b + (ph + 16) % 48), v2 = LoadU(b + (ph + 32) % 48);
    auto store = [d](std::ptrdiff_t at, VI v) { Store<true, kNt>(d + at, v); };
    for (; i + 48 <= n; i += 48) {
        store(i, v0);
        store(i + 16, v1);
        store(i + 32, v2);
    }
    if (i + 16 <= n) { store(i, v0); i += 16; }
    if (i + 16 <= n) { store(i, v1); i += 16; }
    if (i < n) StoreU(d + n - 16, LoadU(b + (n - 16) % 48));
}

}  // namespace pvx::move
