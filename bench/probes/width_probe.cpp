// How much this machine gives to wider vectors on the access patterns of the
// bandwidth-bound kernels: reads, fills, copies and streamed copies of frame
// sizes, with 16-byte (SSE, the library's level) and 32-byte (AVX2) loads and
// stores, next to the C runtime's memcpy and memset. The library is built for
// one processor level, so where a peer's 32-byte kernels reach more, the gap
// shows here on plain memory traffic with no pixel work at all.
//
// Timing as in pvx_bench --pvx_rounds: the variants of a row run in turn, in
// batches of about 20 ms, for N rounds (first argument, default 30); each
// figure is the median (and the fastest) batch's microseconds per call.
#include <immintrin.h>

#include <algorithm>
#include <chrono>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <functional>
#include <string>
#include <vector>

namespace {

using Byte = std::uint8_t;
volatile int gSink;

template <bool kNt>
__attribute__((noinline)) void Copy16(Byte* d, const Byte* s, std::size_t n)
{
    for (std::size_t i = 0; i < n; i += 64)
        for (int k = 0; k < 64; k += 16) {
            __m128i v = _mm_load_si128(reinterpret_cast<const __m128i*>(s + i + k));
            if constexpr (kNt) _mm_stream_si128(reinterpret_cast<__m128i*>(d + i + k), v);
            else _mm_store_si128(reinterpret_cast<__m128i*>(d + i + k), v);
        }
    if constexpr (kNt) _mm_sfence();
}

template <bool kNt>
__attribute__((noinline, target("avx2"))) void Copy32(Byte* d, const Byte* s, std::size_t n)
{
    for (std::size_t i = 0; i < n; i += 64)
        for (int k = 0; k < 64; k += 32) {
            __m256i v = _mm256_load_si256(reinterpret_cast<const __m256i*>(s + i + k));
            if constexpr (kNt) _mm256_stream_si256(reinterpret_cast<__m256i*>(d + i + k), v);
            else _mm256_store_si256(reinterpret_cast<__m256i*>(d + i + k), v);
        }
    if constexpr (kNt) _mm_sfence();
}

__attribute__((noinline)) void Fill16(Byte* d, std::size_t n)
{
    __m128i v = _mm_set1_epi8(7);
    for (std::size_t i = 0; i < n; i += 64)
        for (int k = 0; k < 64; k += 16) _mm_store_si128(reinterpret_cast<__m128i*>(d + i + k), v);
}

__attribute__((noinline, target("avx2"))) void Fill32(Byte* d, std::size_t n)
{
    __m256i v = _mm256_set1_epi8(7);
    for (std::size_t i = 0; i < n; i += 64)
        for (int k = 0; k < 64; k += 32) _mm256_store_si256(reinterpret_cast<__m256i*>(d + i + k), v);
}

__attribute__((noinline)) int Read16(const Byte* s, std::size_t n)
{
    __m128i a = _mm_setzero_si128(), b = a, c = a, e = a;
    for (std::size_t i = 0; i < n; i += 64) {
        a = _mm_or_si128(a, _mm_load_si128(reinterpret_cast<const __m128i*>(s + i)));
        b = _mm_or_si128(b, _mm_load_si128(reinterpret_cast<const __m128i*>(s + i + 16)));
        c = _mm_or_si128(c, _mm_load_si128(reinterpret_cast<const __m128i*>(s + i + 32)));
        e = _mm_or_si128(e, _mm_load_si128(reinterpret_cast<const __m128i*>(s + i + 48)));
    }
    return _mm_cvtsi128_si32(_mm_or_si128(_mm_or_si128(a, b), _mm_or_si128(c, e)));
}

__attribute__((noinline, target("avx2"))) int Read32(const Byte* s, std::size_t n)
{
    __m256i a = _mm256_setzero_si256(), b = a;
    for (std::size_t i = 0; i < n; i += 64) {
        a = _mm256_or_si256(a, _mm256_load_si256(reinterpret_cast<const __m256i*>(s + i)));
        b = _mm256_or_si256(b, _mm256_load_si256(reinterpret_cast<const __m256i*>(s + i + 32)));
    }
    return _mm256_extract_epi32(_mm256_or_si256(a, b), 0);
}

struct Variant {
    const char* name;
    std::function<void()> fn;
};

// Prints one row: median and fastest batch of each variant, and the ratio of
// the first variant's time to each other's.
void Row(const char* title, std::vector<Variant> vs, int rounds)
{
    using Clock = std::chrono::steady_clock;
    auto since = [](Clock::time_point t0) {
        return std::chrono::duration<double, std::micro>(Clock::now() - t0).count();
    };
    std::vector<int> batch(vs.size());
    for (std::size_t i = 0; i < vs.size(); ++i) {
        vs[i].fn();
        auto t0 = Clock::now();
        vs[i].fn();
        batch[i] = std::max(1, static_cast<int>(20000.0 / std::max(since(t0), 1.0)));
    }
    std::vector<std::vector<double>> us(vs.size());
    for (int r = 0; r < rounds; ++r)
        for (std::size_t k = 0; k < vs.size(); ++k) {
            std::size_t i = (k + static_cast<std::size_t>(r)) % vs.size();
            vs[i].fn();
            auto t0 = Clock::now();
            for (int j = 0; j < batch[i]; ++j) vs[i].fn();
            us[i].push_back(since(t0) / batch[i]);
        }
    std::printf("%-18s", title);
    double base = 0, baseBest = 0;
    for (std::size_t i = 0; i < vs.size(); ++i) {
        std::sort(us[i].begin(), us[i].end());
        double med = us[i][us[i].size() / 2], best = us[i].front();
        if (i == 0) {
            base = med;
            baseBest = best;
            std::printf("  %s %.0f us", vs[i].name, med);
        } else {
            std::printf("  | %s %.0f us %.2fx (best %.2fx)", vs[i].name, med, base / med, baseBest / best);
        }
    }
    std::printf("\n");
}

Byte* Buffer(std::size_t n, int value)
{
    auto* p = static_cast<Byte*>(std::aligned_alloc(64, n));
    if (!p) std::exit(1);
    std::memset(p, value, n);
    return p;
}

}  // namespace

int main(int argc, char** argv)
{
    int rounds = argc > 1 ? std::max(1, std::atoi(argv[1])) : 30;
    if (!__builtin_cpu_supports("avx2")) {
        std::printf("this processor has no AVX2: nothing to compare\n");
        return 0;
    }
    std::printf("ratios: time of the 16-byte kernel over the others (above 1: the other is faster)\n");
    // 1080p: an 8-bit three-channel frame (6 MB, stays in a 32 MB last-level
    // cache with its copy) and a 32f one-channel frame; 4K: 25 MB, streamed.
    const std::size_t frame3 = 1920u * 1080 * 3, frame4 = 1920u * 1080 * 4, uhd3 = 3840u * 2160 * 3;
    Byte* a = Buffer(uhd3, 1);
    Byte* b = Buffer(uhd3, 2);
    Row("read 1080p 32f", {{"16B", [&] { gSink = Read16(a, frame4); }}, {"32B", [&] { gSink = Read32(a, frame4); }}},
        rounds);
    Row("fill 1080p C3", {{"16B", [&] { Fill16(a, frame3); }}, {"32B", [&] { Fill32(a, frame3); }},
                          {"memset", [&] { std::memset(a, 7, frame3); }}},
        rounds);
    Row("copy 1080p C3", {{"16B", [&] { Copy16<false>(a, b, frame3); }}, {"32B", [&] { Copy32<false>(a, b, frame3); }},
                          {"memcpy", [&] { std::memcpy(a, b, frame3); }}},
        rounds);
    Row("stream 4K C3", {{"16B", [&] { Copy16<true>(a, b, uhd3); }}, {"32B", [&] { Copy32<true>(a, b, uhd3); }},
                         {"memcpy", [&] { std::memcpy(a, b, uhd3); }}},
        rounds);
    std::free(a);
    std::free(b);
    return 0;
}
