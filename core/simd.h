// A thin layer over 128-bit SSE4.2 vectors, so that kernels say what they do
// (saturation and signedness in the name) instead of spelling intrinsics. A
// wider build is a new layer with the same names, not a rewrite of kernels.
// Add an op here only when a kernel needs it.
#pragma once

#include <nmmintrin.h>
#include <smmintrin.h>

#include <cstddef>
#include <cstdint>
#include <cstring>

namespace pvx::simd {

using VI = __m128i;  // 16 bytes of integers
using VF = __m128;   // 4 floats
using VD = __m128d;  // 2 doubles

inline constexpr int kBytes = 16;

inline bool IsAligned(const void* p) { return (reinterpret_cast<std::uintptr_t>(p) & 15) == 0; }

// ---- loads and stores ----
inline VI LoadU(const void* p) { return _mm_loadu_si128(static_cast<const VI*>(p)); }
inline VI LoadA(const void* p) { return _mm_load_si128(static_cast<const VI*>(p)); }
inline VI LoadNt(const void* p) { return _mm_stream_load_si128(const_cast<VI*>(static_cast<const VI*>(p))); }
inline VI LoadLo64(const void* p) { return _mm_loadl_epi64(static_cast<const VI*>(p)); }
inline void StoreU(void* p, VI v) { _mm_storeu_si128(static_cast<VI*>(p), v); }
inline void StoreA(void* p, VI v) { _mm_store_si128(static_cast<VI*>(p), v); }
inline void StoreNt(void* p, VI v) { _mm_stream_si128(static_cast<VI*>(p), v); }
inline void StoreLo64(void* p, VI v) { _mm_storel_epi64(static_cast<VI*>(p), v); }
inline void StoreFence() { _mm_sfence(); }
inline void StoreHi64(void* p, VI v) { _mm_storel_epi64(static_cast<VI*>(p), _mm_unpackhi_epi64(v, v)); }
// The low 32 bits, through memcpy as the address may have any alignment.
inline VI LoadLo32(const void* p)
{
    int x;
    std::memcpy(&x, p, 4);
    return _mm_cvtsi32_si128(x);
}
// The first N bytes at p (N <= 8) as a little-endian number, from whole 4-,
// 2- and 1-byte loads that read no further than p + N.
template <int N>
inline std::uint64_t LoadBytes64(const std::uint8_t* p)
{
    static_assert(N >= 0 && N <= 8);
    std::uint64_t x = 0;
    if constexpr (N == 8) {
        std::memcpy(&x, p, 8);
    } else {
        if constexpr ((N & 4) != 0) {
            std::uint32_t t;
            std::memcpy(&t, p, 4);
            x = t;
        }
        if constexpr ((N & 2) != 0) {
            std::uint16_t t;
            std::memcpy(&t, p + (N & 4), 2);
            x |= static_cast<std::uint64_t>(t) << (8 * (N & 4));
        }
        if constexpr ((N & 1) != 0) x |= static_cast<std::uint64_t>(p[N & 6]) << (8 * (N & 6));
    }
    return x;
}
// The first N bytes at p (N <= 16), the rest zero, read no further than
// p + N and gathered in general registers, so that the vector never waits on
// narrower stores (a vector load of bytes just stored one by one does).
template <int N>
inline VI LoadPartial(const void* p)
{
    static_assert(N > 0 && N <= 16);
    const auto* b = static_cast<const std::uint8_t*>(p);
    std::uint64_t lo = LoadBytes64<(N < 8 ? N : 8)>(b), hi = LoadBytes64<(N > 8 ? N - 8 : 0)>(b + 8);
    return _mm_set_epi64x(static_cast<long long>(hi), static_cast<long long>(lo));
}
template <int kLane>
inline void Store32(void* p, VI v)
{
    int x = _mm_extract_epi32(v, kLane);
    std::memcpy(p, &x, 4);
}
inline void Prefetch(const void* p) { _mm_prefetch(static_cast<const char*>(p), _MM_HINT_T0); }  // a hint: never faults

inline VF LoadUF(const float* p) { return _mm_loadu_ps(p); }
inline VF LoadAF(const float* p) { return _mm_load_ps(p); }
inline void StoreUF(float* p, VF v) { _mm_storeu_ps(p, v); }
inline void StoreAF(float* p, VF v) { _mm_store_ps(p, v); }

// Aligned or unaligned access chosen once per row by the caller.
template <bool A> inline VI Load(const void* p) { if constexpr (A) return LoadA(p); else return LoadU(p); }
template <bool A> inline void Store(void* p, VI v) { if constexpr (A) StoreA(p, v); else StoreU(p, v); }
// The same, or a streamed (non-temporal) store when kNt, which needs an
// aligned address.
template <bool A, bool kNt> inline void Store(void* p, VI v)
{
    if constexpr (kNt) StoreNt(p, v);
    else Store<A>(p, v);
}

// ---- constants ----
inline VI Zero() { return _mm_setzero_si128(); }
inline VF ZeroF() { return _mm_setzero_ps(); }
inline VI SplatU8(std::uint8_t v) { return _mm_set1_epi8(static_cast<char>(v)); }
inline VI SplatU16(std::uint16_t v) { return _mm_set1_epi16(static_cast<short>(v)); }
inline VI SplatU32(std::uint32_t v) { return _mm_set1_epi32(static_cast<int>(v)); }
inline VI SplatU64(std::uint64_t v) { return _mm_set1_epi64x(static_cast<long long>(v)); }
inline VF SplatF(float v) { return _mm_set1_ps(v); }

// ---- bitwise ----
inline VI And(VI a, VI b) { return _mm_and_si128(a, b); }
inline VI Or(VI a, VI b) { return _mm_or_si128(a, b); }
inline VI Xor(VI a, VI b) { return _mm_xor_si128(a, b); }
inline VI AndNot(VI notThis, VI b) { return _mm_andnot_si128(notThis, b); }
// Bytes of b where the mask byte's top bit is set, else bytes of a.
inline VI SelectBytes(VI a, VI b, VI mask) { return _mm_blendv_epi8(a, b, mask); }
inline VI ShuffleBytes(VI v, VI idx) { return _mm_shuffle_epi8(v, idx); }
// One bit per byte: the top bit of each byte, byte 0 in bit 0.
inline int MoveMask8(VI v) { return _mm_movemask_epi8(v); }
// Transposes four vectors seen as rows of four 32-bit lanes.
inline void Transpose4x32(VI& a, VI& b, VI& c, VI& d)
{
    VI t0 = _mm_unpacklo_epi32(a, b), t1 = _mm_unpacklo_epi32(c, d);
    VI t2 = _mm_unpackhi_epi32(a, b), t3 = _mm_unpackhi_epi32(c, d);
    a = _mm_unpacklo_epi64(t0, t1);
    b = _mm_unpackhi_epi64(t0, t1);
    c = _mm_unpacklo_epi64(t2, t3);
    d = _mm_unpackhi_epi64(t2, t3);
}
// Interleaving of the low or high halves of a and b, by element width.
inline VI InterleaveLo8(VI a, VI b) { return _mm_unpacklo_epi8(a, b); }
inline VI InterleaveHi8(VI a, VI b) { return _mm_unpackhi_epi8(a, b); }
inline VI InterleaveLo16(VI a, VI b) { return _mm_unpacklo_epi16(a, b); }
inline VI InterleaveHi16(VI a, VI b) { return _mm_unpackhi_epi16(a, b); }
inline VI InterleaveLo32(VI a, VI b) { return _mm_unpacklo_epi32(a, b); }
inline VI InterleaveHi32(VI a, VI b) { return _mm_unpackhi_epi32(a, b); }
inline VI InterleaveLo64(VI a, VI b) { return _mm_unpacklo_epi64(a, b); }
inline VI InterleaveHi64(VI a, VI b) { return _mm_unpackhi_epi64(a, b); }

// ---- integer arithmetic ----
inline VI AddSatU8(VI a, VI b) { return _mm_adds_epu8(a, b); }
inline VI SubSatU8(VI a, VI b) { return _mm_subs_epu8(a, b); }
inline VI AddSatU16(VI a, VI b) { return _mm_adds_epu16(a, b); }
inline VI SubSatU16(VI a, VI b) { return _mm_subs_epu16(a, b); }
inline VI AddSatS16(VI a, VI b) { return _mm_adds_epi16(a, b); }
inline VI SubSatS16(VI a, VI b) { return _mm_subs_epi16(a, b); }
inline VI AddI16(VI a, VI b) { return _mm_add_epi16(a, b); }
inline VI SubI16(VI a, VI b) { return _mm_sub_epi16(a, b); }
inline VI AddI32(VI a, VI b) { return _mm_add_epi32(a, b); }
inline VI SubI32(VI a, VI b) { return _mm_sub_epi32(a, b); }
inline VI MulLoI16(VI a, VI b) { return _mm_mullo_epi16(a, b); }
inline VI MulLoI32(VI a, VI b) { return _mm_mullo_epi32(a, b); }
inline VI EqU8(VI a, VI b) { return _mm_cmpeq_epi8(a, b); }
inline VI EqI32(VI a, VI b) { return _mm_cmpeq_epi32(a, b); }
inline VI AddI8(VI a, VI b) { return _mm_add_epi8(a, b); }
inline VI SubI8(VI a, VI b) { return _mm_sub_epi8(a, b); }
inline VI AvgU8(VI a, VI b) { return _mm_avg_epu8(a, b); }     // (a + b + 1) >> 1
inline VI AvgU16(VI a, VI b) { return _mm_avg_epu16(a, b); }   // (a + b + 1) >> 1
inline VI MinU16(VI a, VI b) { return _mm_min_epu16(a, b); }
inline VI MulAddPairsI16(VI a, VI b) { return _mm_madd_epi16(a, b); }  // a0*b0 + a1*b1 in 32 bits
// a0*b0 - a1*b1 of each pair of 16-bit lanes, exact in 32 bits (the real
// part of a 16sc product): two multiply-adds with one half masked off.
inline VI MulSubPairsI16(VI a, VI b)
{
    const VI low = SplatU32(0xFFFF);
    return SubI32(MulAddPairsI16(And(a, low), b), MulAddPairsI16(AndNot(low, a), b));
}
inline VI MulHiI16(VI a, VI b) { return _mm_mulhi_epi16(a, b); }
inline VI MulHiU16(VI a, VI b) { return _mm_mulhi_epu16(a, b); }
inline VI MinI16(VI a, VI b) { return _mm_min_epi16(a, b); }
inline VI MaxI16(VI a, VI b) { return _mm_max_epi16(a, b); }
inline VI MinI32(VI a, VI b) { return _mm_min_epi32(a, b); }
inline VI MaxI32(VI a, VI b) { return _mm_max_epi32(a, b); }
inline VI MinU32(VI a, VI b) { return _mm_min_epu32(a, b); }
// Shifts by a count held in the low 64 bits of a register (counts above the
// lane width give 0, or the sign for arithmetic right shifts).
inline VI ShiftCount(int n) { return _mm_cvtsi32_si128(n); }
inline VI SllI16(VI v, VI n) { return _mm_sll_epi16(v, n); }
inline VI SrlI16(VI v, VI n) { return _mm_srl_epi16(v, n); }
inline VI SraI16(VI v, VI n) { return _mm_sra_epi16(v, n); }
inline VI SllI32(VI v, VI n) { return _mm_sll_epi32(v, n); }
inline VI SrlI32(VI v, VI n) { return _mm_srl_epi32(v, n); }
inline VI SraI32(VI v, VI n) { return _mm_sra_epi32(v, n); }
inline VI EqI16(VI a, VI b) { return _mm_cmpeq_epi16(a, b); }
inline VI GtI8(VI a, VI b) { return _mm_cmpgt_epi8(a, b); }  // signed
inline VI GtI16(VI a, VI b) { return _mm_cmpgt_epi16(a, b); }  // signed
inline VI GtI32(VI a, VI b) { return _mm_cmpgt_epi32(a, b); }  // signed
inline VI AbsI16(VI a) { return _mm_abs_epi16(a); }
inline VI MaxU16(VI a, VI b) { return _mm_max_epu16(a, b); }
inline VI MinU8(VI a, VI b) { return _mm_min_epu8(a, b); }
inline VI MaxU8(VI a, VI b) { return _mm_max_epu8(a, b); }
inline VI SrlI16n(VI v, int n) { return _mm_srli_epi16(v, n); }
inline VI SrlI32n(VI v, int n) { return _mm_srli_epi32(v, n); }
inline VI SllI16n(VI v, int n) { return _mm_slli_epi16(v, n); }
inline VI SraI32n(VI v, int n) { return _mm_srai_epi32(v, n); }
inline VI SllI32n(VI v, int n) { return _mm_slli_epi32(v, n); }
inline int MaskBytes(VI a) { return _mm_movemask_epi8(a); }
// The two 16-bit halves of every 32-bit lane exchanged (the parts of 16sc).
inline VI SwapHalves16(VI v) { return ShuffleBytes(v, _mm_setr_epi8(2, 3, 0, 1, 6, 7, 4, 5, 10, 11, 8, 9, 14, 15, 12, 13)); }
// The 32-bit lanes of a and b packed with signed saturation into alternating
// 16-bit lanes: a0 b0 a1 b1 a2 b2 a3 b3 (the parts of 16sc).
inline VI PackPairsS32(VI a, VI b)
{
    return ShuffleBytes(_mm_packs_epi32(a, b), _mm_setr_epi8(0, 1, 8, 9, 2, 3, 10, 11, 4, 5, 12, 13, 6, 7, 14, 15));
}
// 64-bit lanes
inline VI AddI64(VI a, VI b) { return _mm_add_epi64(a, b); }
inline VI SubI64(VI a, VI b) { return _mm_sub_epi64(a, b); }
inline VI MulEvenI32(VI a, VI b) { return _mm_mul_epi32(a, b); }  // lanes 0 and 2, signed, to 64 bits
inline VI EqI64(VI a, VI b) { return _mm_cmpeq_epi64(a, b); }
inline VI GtI64(VI a, VI b) { return _mm_cmpgt_epi64(a, b); }  // signed
inline VI SllI64(VI v, VI n) { return _mm_sll_epi64(v, n); }
inline VI SrlI64(VI v, VI n) { return _mm_srl_epi64(v, n); }
inline VI SrlI64n(VI v, int n) { return _mm_srli_epi64(v, n); }
inline VI SllI64n(VI v, int n) { return _mm_slli_epi64(v, n); }

// ---- widening and narrowing ----
inline VI WidenLoU8(VI v) { return _mm_cvtepu8_epi16(v); }
inline VI WidenHiU8(VI v) { return _mm_unpackhi_epi8(v, _mm_setzero_si128()); }
inline VI WidenLoU16(VI v) { return _mm_cvtepu16_epi32(v); }
inline VI WidenHiU16(VI v) { return _mm_unpackhi_epi16(v, _mm_setzero_si128()); }
inline VI WidenLoS16(VI v) { return _mm_cvtepi16_epi32(v); }
inline VI WidenHiS16(VI v) { return _mm_srai_epi32(_mm_unpackhi_epi16(v, v), 16); }
inline VI PackUsS16(VI a, VI b) { return _mm_packus_epi16(a, b); }  // s16 -> u8, saturating
inline VI PackSsS16(VI a, VI b) { return _mm_packs_epi16(a, b); }   // s16 -> s8, saturating
inline VI PackUsS32(VI a, VI b) { return _mm_packus_epi32(a, b); }  // s32 -> u16, saturating
inline VI PackSsS32(VI a, VI b) { return _mm_packs_epi32(a, b); }   // s32 -> s16, saturating

// ---- float ----
inline VF AddF(VF a, VF b) { return _mm_add_ps(a, b); }
inline VF SubF(VF a, VF b) { return _mm_sub_ps(a, b); }
inline VF MulF(VF a, VF b) { return _mm_mul_ps(a, b); }
inline VF DivF(VF a, VF b) { return _mm_div_ps(a, b); }
inline VF MinF(VF a, VF b) { return _mm_min_ps(a, b); }
inline VF MaxF(VF a, VF b) { return _mm_max_ps(a, b); }
inline VF RcpF(VF a) { return _mm_rcp_ps(a); }
inline VF TruncF(VF a) { return _mm_round_ps(a, _MM_FROUND_TO_ZERO | _MM_FROUND_NO_EXC); }
// Rounds by the thread's current rounding control (see FpGuard).
inline VI CvtF32(VF a) { return _mm_cvtps_epi32(a); }
inline VI CvtTruncF32(VF a) { return _mm_cvttps_epi32(a); }
inline VF CvtI32F(VI a) { return _mm_cvtepi32_ps(a); }
inline VI AsInt(VF a) { return _mm_castps_si128(a); }
inline VF AsFloat(VI a) { return _mm_castsi128_ps(a); }
// Complex pairs (re, im) in lanes 0-1 and 2-3.
inline VF DupEvenF(VF a) { return _mm_moveldup_ps(a); }  // re, re
inline VF DupOddF(VF a) { return _mm_movehdup_ps(a); }   // im, im
inline VF SwapPairsF(VF a) { return _mm_shuffle_ps(a, a, _MM_SHUFFLE(2, 3, 0, 1)); }
inline VF SubAddF(VF a, VF b) { return _mm_addsub_ps(a, b); }  // a - b in even lanes, a + b in odd
inline VF SqrtF(VF a) { return _mm_sqrt_ps(a); }
inline VF AndF(VF a, VF b) { return _mm_and_ps(a, b); }
inline VF OrF(VF a, VF b) { return _mm_or_ps(a, b); }
inline VF AndNotF(VF notThis, VF b) { return _mm_andnot_ps(notThis, b); }
inline VF EqF(VF a, VF b) { return _mm_cmpeq_ps(a, b); }
inline VF GtF(VF a, VF b) { return _mm_cmpgt_ps(a, b); }
inline VF LtF(VF a, VF b) { return _mm_cmplt_ps(a, b); }
inline VF GeF(VF a, VF b) { return _mm_cmpge_ps(a, b); }
inline VF OrderedF(VF a) { return _mm_cmpord_ps(a, a); }  // all ones where not NaN
inline VF SelectF(VF a, VF b, VF mask) { return _mm_blendv_ps(a, b, mask); }  // b where mask
inline int MaskF(VF a) { return _mm_movemask_ps(a); }
// Rounding that ignores the thread's rounding control.
inline VF RoundEvenF(VF a) { return _mm_round_ps(a, _MM_FROUND_TO_NEAREST_INT | _MM_FROUND_NO_EXC); }

// ---- double ----
inline VD SplatD(double v) { return _mm_set1_pd(v); }
inline VD AddD(VD a, VD b) { return _mm_add_pd(a, b); }
inline VD SubD(VD a, VD b) { return _mm_sub_pd(a, b); }
inline VD MulD(VD a, VD b) { return _mm_mul_pd(a, b); }
inline VD DivD(VD a, VD b) { return _mm_div_pd(a, b); }
inline VD MinD(VD a, VD b) { return _mm_min_pd(a, b); }
inline VD MaxD(VD a, VD b) { return _mm_max_pd(a, b); }
inline VD SqrtD(VD a) { return _mm_sqrt_pd(a); }
inline VD AndD(VD a, VD b) { return _mm_and_pd(a, b); }
inline VD AndNotD(VD notThis, VD b) { return _mm_andnot_pd(notThis, b); }
inline VD OrD(VD a, VD b) { return _mm_or_pd(a, b); }
inline VD GeD(VD a, VD b) { return _mm_cmpge_pd(a, b); }
inline VD EqD(VD a, VD b) { return _mm_cmpeq_pd(a, b); }
inline VD OrderedD(VD a) { return _mm_cmpord_pd(a, a); }
inline VD TruncD(VD a) { return _mm_round_pd(a, _MM_FROUND_TO_ZERO | _MM_FROUND_NO_EXC); }
inline VD RoundEvenD(VD a) { return _mm_round_pd(a, _MM_FROUND_TO_NEAREST_INT | _MM_FROUND_NO_EXC); }
// 32-bit lanes 0-1 (Lo) or 2-3 (Hi) to doubles; two doubles to 32-bit lanes
// 0-1 (rounded by the rounding control: give it integral values).
inline VD CvtLoI32D(VI a) { return _mm_cvtepi32_pd(a); }
inline VD CvtHiI32D(VI a) { return _mm_cvtepi32_pd(_mm_unpackhi_epi64(a, a)); }
inline VD CvtLoFD(VF a) { return _mm_cvtps_pd(a); }
inline VD CvtHiFD(VF a) { return _mm_cvtps_pd(_mm_movehl_ps(a, a)); }
inline VI CvtD32Pair(VD lo, VD hi) { return _mm_unpacklo_epi64(_mm_cvtpd_epi32(lo), _mm_cvtpd_epi32(hi)); }

// ---- rows of any length ----
// A row's end, or a row shorter than a block, read and written in registers
// with nothing outside [p, p + n) touched. Copying it to the stack and back
// (memcpy into a buffer, vector loads of the buffer) made every load wait for
// the narrower stores before it: 26 ns a row of 8 three-byte pixels.

// Byte shifts by a count known at run time: one shuffle whose index comes
// from a sliding window over kSlide (-128 gives a zero lane).
alignas(16) inline constexpr std::int8_t kSlide[48] = {
    -128, -128, -128, -128, -128, -128, -128, -128, -128, -128, -128, -128, -128, -128, -128, -128,
    0,    1,    2,    3,    4,    5,    6,    7,    8,    9,    10,   11,   12,   13,   14,   15,
    -128, -128, -128, -128, -128, -128, -128, -128, -128, -128, -128, -128, -128, -128, -128, -128};
// lane i takes lane i + a (zero past lane 15); 0 <= a <= 16
inline VI ShiftDownBytes(VI v, std::ptrdiff_t a) { return ShuffleBytes(v, LoadU(kSlide + 16 + a)); }
// lane i takes lane i - a (zero below lane a); 0 <= a <= 16
inline VI ShiftUpBytes(VI v, std::ptrdiff_t a) { return ShuffleBytes(v, LoadU(kSlide + 16 - a)); }

// Bytes [0, n) at p in lanes 0..n-1, the rest zero; 0 < n <= 16. Two
// overlapping 8- or 4-byte loads; below 4 bytes, byte loads.
[[gnu::always_inline]] inline VI LoadShort(const void* p, std::ptrdiff_t n)
{
    const auto* b = static_cast<const std::uint8_t*>(p);
    if (n == 16) return LoadU(b);
    if (n == 8) return LoadLo64(b);
    if (n == 4) return LoadLo32(b);
    if (n >= 8) return Or(LoadLo64(b), ShiftUpBytes(LoadLo64(b + n - 8), n - 8));
    if (n >= 4) return Or(LoadLo32(b), ShiftUpBytes(LoadLo32(b + n - 4), n - 4));
    int x = b[0];
    if (n > 1) x |= b[1] << 8;
    if (n > 2) x |= b[2] << 16;
    return _mm_cvtsi32_si128(x);
}

// Lanes 0..n-1 of v to [p, p + n); 0 < n <= 16.
[[gnu::always_inline]] inline void StoreShort(void* p, std::ptrdiff_t n, VI v)
{
    auto* b = static_cast<std::uint8_t*>(p);
    if (n == 16) return StoreU(b, v);
    if (n == 8) return StoreLo64(b, v);
    if (n == 4) return Store32<0>(b, v);
    if (n >= 8) {
        StoreLo64(b, v);
        StoreLo64(b + n - 8, ShiftDownBytes(v, n - 8));
        return;
    }
    if (n >= 4) {
        Store32<0>(b, v);
        Store32<0>(b + n - 4, ShiftDownBytes(v, n - 4));
        return;
    }
    int x = _mm_cvtsi128_si32(v);
    b[0] = static_cast<std::uint8_t>(x);
    if (n > 1) b[1] = static_cast<std::uint8_t>(x >> 8);
    if (n > 2) b[2] = static_cast<std::uint8_t>(x >> 16);
}

// Bytes [0, n) at p in registers v[0..K), lanes past n zero; n <= 16 K. The
// last partial register is one load ending at p + n, shifted down. The loops
// run to K, a constant, so that v stays in registers once inlined.
template <int K>
[[gnu::always_inline]] inline void LoadRow(const void* p, std::ptrdiff_t n, VI* v)
{
    const auto* b = static_cast<const std::uint8_t*>(p);
    const std::ptrdiff_t full = n / 16, r = n % 16;
#pragma GCC unroll 16
    for (int k = 0; k < K; ++k) {
        if (k < full) v[k] = LoadU(b + 16 * k);
        else if (k == full && r != 0) v[k] = k > 0 ? ShiftDownBytes(LoadU(b + n - 16), 16 - r) : LoadShort(b, r);
        else v[k] = Zero();
    }
}

// Bytes [0, n) at p at the top of registers v[0..K), in lanes 16 K - n to
// 16 K - 1, the lanes below zero; n <= 16 K. Registers are loads ending at
// p + n, 16 bytes apart; the first partial one is a load at p (or the short
// row) shifted up.
template <int K>
[[gnu::always_inline]] inline void LoadRowHigh(const void* p, std::ptrdiff_t n, VI* v)
{
    const auto* b = static_cast<const std::uint8_t*>(p);
#pragma GCC unroll 16
    for (int k = 0; k < K; ++k) {
        const std::ptrdiff_t off = n - 16 * (K - k);  // where register k starts in the row
        if (off >= 0) v[k] = LoadU(b + off);
        else if (off > -16) v[k] = ShiftUpBytes(n >= 16 ? LoadU(b) : LoadShort(b, n), -off);
        else v[k] = Zero();
    }
}

// Registers v[0..K) to bytes [0, n) at p; n <= 16 K. The last partial
// register goes out as the 16 bytes ending at p + n, the end of the register
// before it joined to its start.
template <int K>
[[gnu::always_inline]] inline void StoreRow(void* p, std::ptrdiff_t n, const VI* v)
{
    auto* b = static_cast<std::uint8_t*>(p);
    const std::ptrdiff_t full = n / 16, r = n % 16;
#pragma GCC unroll 16
    for (int k = 0; k < K; ++k) {
        if (k < full) {
            StoreU(b + 16 * k, v[k]);
        } else if (k == full && r != 0) {
            if (k == 0) StoreShort(b, r, v[0]);
            else StoreU(b + n - 16, Or(ShiftDownBytes(v[k - 1], r), ShiftUpBytes(v[k], 16 - r)));
        }
    }
}

}  // namespace pvx::simd
