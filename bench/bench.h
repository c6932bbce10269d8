// Benchmark harness: a case times pvx and its nearest peer (OpenCV) on the
// same buffers in one run, single-threaded, with memcpy/memset of the same
// bytes as the bandwidth reference. After all cases the runner prints, per
// case, the peer/pvx and memref/pvx time ratios (above 1: pvx is faster).
#pragma once

#include <benchmark/benchmark.h>

#include <cstdint>
#include <functional>
#include <random>
#include <string>
#include <vector>

namespace pvxbench {

// One case: `pvx` and `peer` do the same work; `memref` moves the same bytes
// with memcpy or memset (may be empty for compute-bound cases); `agree`, run
// once before timing, returns false when the outputs of pvx and the peer
// differ. `bytes` is what one call reads plus writes.
struct Case {
    std::string name;
    std::int64_t bytes = 0;
    std::function<void()> pvx, peer, memref;
    std::function<bool()> agree;
};

// Registers a case; call from a static initializer or a register function.
void Register(Case c);

// Deterministic random bytes.
inline void FillBytes(void* p, std::size_t n, unsigned seed = 1)
{
    std::mt19937 rng(seed);
    auto* b = static_cast<std::uint8_t*>(p);
    for (std::size_t i = 0; i < n; ++i) b[i] = static_cast<std::uint8_t>(rng() >> 24);
}

struct Frame {
    int width, height;
    const char* label;
};
inline const Frame kFrames[] = {{1920, 1080, "1080p"}, {3840, 2160, "4K"}};

// Registers cases at static-initialization time: PVX_BENCH_CASES(Fn) { Register(...); }
struct AutoRegister {
    explicit AutoRegister(void (*fn)()) { fn(); }
};
#define PVX_BENCH_CASES(fn)                                        \
    static void fn();                                              \
    static ::pvxbench::AutoRegister fn##_registered_(&fn);         \
    static void fn()

}  // namespace pvxbench
