// A scoped guard over the calling thread's floating-point control (MXCSR):
// sets the rounding mode and flush-to-zero for its scope and restores the
// caller's setting on every path out, returns and exceptions alike.
#pragma once

#include <xmmintrin.h>

namespace pvx {

enum class FpRound : unsigned {
    kNearest = 0x0000,
    kDown = 0x2000,
    kUp = 0x4000,
    kTowardZero = 0x6000,
};

class FpGuard {
public:
    static constexpr unsigned kRoundMask = 0x6000;
    static constexpr unsigned kFlushMask = 0x8040;  // flush-to-zero and denormals-are-zero

    explicit FpGuard(FpRound round, bool flushToZero = false) : saved_(_mm_getcsr())
    {
        unsigned csr = (saved_ & ~(kRoundMask | kFlushMask)) | static_cast<unsigned>(round);
        if (flushToZero) csr |= kFlushMask;
        _mm_setcsr(csr);
    }
    ~FpGuard() { _mm_setcsr(saved_); }
    FpGuard(const FpGuard&) = delete;
    FpGuard& operator=(const FpGuard&) = delete;

private:
    unsigned saved_;
};

}  // namespace pvx
