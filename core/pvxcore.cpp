// The companion core library: aligned memory, the largest cache, processor
// features and status texts. Nothing here keeps state that changes after load.
#include "pvxcore.h"

#include <cpuid.h>
#include <unistd.h>

#include <atomic>
#include <cstdlib>

namespace {

constexpr int kAlign = 64;

struct CpuId {
    unsigned a = 0, b = 0, c = 0, d = 0;
};

CpuId Query(unsigned leaf, unsigned sub = 0)
{
    CpuId r;
    if (!__get_cpuid_count(leaf, sub, &r.a, &r.b, &r.c, &r.d)) return CpuId{};
    return r;
}

unsigned long long XGetBv()
{
    unsigned lo, hi;
    __asm__ volatile("xgetbv" : "=a"(lo), "=d"(hi) : "c"(0));
    return (static_cast<unsigned long long>(hi) << 32) | lo;
}

Pvx64u DetectFeatures()
{
    Pvx64u f = 0;
    unsigned maxLeaf = Query(0).a;
    if (maxLeaf < 1) return 0;
    CpuId l1 = Query(1);
    if (l1.d & (1u << 23)) f |= PVX_CPUID_MMX;
    if (l1.d & (1u << 25)) f |= PVX_CPUID_SSE;
    if (l1.d & (1u << 26)) f |= PVX_CPUID_SSE2;
    if (l1.c & (1u << 0)) f |= PVX_CPUID_SSE3;
    if (l1.c & (1u << 9)) f |= PVX_CPUID_SSSE3;
    if (l1.c & (1u << 19)) f |= PVX_CPUID_SSE41;
    if (l1.c & (1u << 20)) f |= PVX_CPUID_SSE42;
    if (l1.c & (1u << 25)) f |= PVX_CPUID_AES;
    if (l1.c & (1u << 1)) f |= PVX_CPUID_CLMUL;
    if (l1.c & (1u << 23)) f |= PVX_CPUID_POPCNT;
    // The AVX family counts only when the OS saves the wide registers.
    bool osxsave = l1.c & (1u << 27);
    unsigned long long xcr0 = osxsave ? XGetBv() : 0;
    bool ymm = (xcr0 & 0x6) == 0x6;
    bool zmm = (xcr0 & 0xe6) == 0xe6;
    if (ymm && (l1.c & (1u << 28))) f |= PVX_CPUID_AVX;
    if (ymm && (l1.c & (1u << 29))) f |= PVX_CPUID_F16C;
    if (ymm && (l1.c & (1u << 12))) f |= PVX_CPUID_FMA;
    if (maxLeaf >= 7) {
        CpuId l7 = Query(7);
        if (ymm && (l7.b & (1u << 5))) f |= PVX_CPUID_AVX2;
        if (zmm && (l7.b & (1u << 16))) f |= PVX_CPUID_AVX512F;
        if (l7.b & (1u << 3)) f |= PVX_CPUID_BMI1;
        if (l7.b & (1u << 8)) f |= PVX_CPUID_BMI2;
    }
    return f;
}

// Largest data or unified cache described by a deterministic cache-parameters
// leaf: 4 on Intel, 0x8000001D on AMD (same layout); 0 when the leaf is absent.
long long LargestCacheOfLeaf(unsigned leaf)
{
    unsigned maxLeaf = Query(leaf & 0x80000000u).a;
    if (maxLeaf < leaf) return 0;
    long long best = 0;
    for (unsigned i = 0; i < 16; ++i) {
        CpuId r = Query(leaf, i);
        unsigned type = r.a & 0x1f;
        if (type == 0) break;
        if (type == 2) continue;  // instruction cache
        long long ways = ((r.b >> 22) & 0x3ff) + 1;
        long long parts = ((r.b >> 12) & 0x3ff) + 1;
        long long line = (r.b & 0xfff) + 1;
        long long sets = static_cast<long long>(r.c) + 1;
        long long size = ways * parts * line * sets;
        if (size > best) best = size;
    }
    return best;
}

// The processor's own description first; the C runtime's view only when the
// processor has neither leaf (it overstates the last-level cache on some
// machines).
long long DetectMaxCache()
{
    long long best = LargestCacheOfLeaf(4);
    if (best == 0) best = LargestCacheOfLeaf(0x8000001Du);
    if (best == 0) {
        const int names[] = {_SC_LEVEL4_CACHE_SIZE, _SC_LEVEL3_CACHE_SIZE, _SC_LEVEL2_CACHE_SIZE,
                             _SC_LEVEL1_DCACHE_SIZE};
        for (int n : names) {
            long v = sysconf(n);
            if (v > best) best = v;
        }
    }
    return best;
}

// Both answers are found on first use, not by a static initializer: another
// library's or the program's initializers may ask first (in a static link the
// order between them is unspecified). Threads that race compute the same
// value; the atomics need neither a lock nor the C++ runtime's guards.
constexpr Pvx64u kKnown = 1ull << 63;  // no feature bit
std::atomic<Pvx64u> gFeatures{0};
std::atomic<long long> gMaxCache{-1};

Pvx64u Features()
{
    Pvx64u f = gFeatures.load(std::memory_order_relaxed);
    if (!(f & kKnown)) {
        f = DetectFeatures() | kKnown;
        gFeatures.store(f, std::memory_order_relaxed);
    }
    return f & ~kKnown;
}

long long MaxCache()
{
    long long c = gMaxCache.load(std::memory_order_relaxed);
    if (c < 0) {
        c = DetectMaxCache();
        gMaxCache.store(c, std::memory_order_relaxed);
    }
    return c;
}

}  // namespace

extern "C" {

PVX_API void* pvxMalloc(int length)
{
    if (length < 1) return nullptr;
    size_t n = (static_cast<size_t>(length) + kAlign - 1) & ~static_cast<size_t>(kAlign - 1);
    return std::aligned_alloc(kAlign, n);
}

PVX_API void pvxFree(void* ptr)
{
    std::free(ptr);
}

PVX_API PvxStatus pvxGetMaxCacheSizeB(int* pSizeByte)
{
    if (!pSizeByte) return pvxStsNullPtrErr;
    long long cache = MaxCache();
    if (cache <= 0 || cache > 0x7fffffff) {
        *pSizeByte = 0;
        return pvxStsNotSupportedModeErr;
    }
    *pSizeByte = static_cast<int>(cache);
    return pvxStsNoErr;
}

PVX_API Pvx64u pvxGetEnabledCpuFeatures(void)
{
    return Features();
}

PVX_API int ownGetFeature(Pvx64u featureMask)
{
    return (Features() & featureMask) == featureMask;
}

PVX_API const char* pvxGetStatusString(PvxStatus status)
{
    switch (status) {
    case pvxStsNoErr: return "pvxStsNoErr: success";
    case pvxStsNoOperation: return "pvxStsNoOperation: warning: nothing to do, nothing written";
    case pvxStsDivByZero: return "pvxStsDivByZero: warning: a divisor was zero; a defined value was written";
    case pvxStsNoIntersection: return "pvxStsNoIntersection: warning: the region does not intersect the source; nothing written";
    case pvxStsEvenMedianWeight: return "pvxStsEvenMedianWeight: warning: an even centre weight was reduced by one";
    case pvxStsSizeWrn: return "pvxStsSizeWrn: warning: a size was smaller than needed; the result was completed in a reduced form";
    case pvxStsBadArgErr: return "pvxStsBadArgErr: an argument value is outside its accepted set";
    case pvxStsRangeErr: return "pvxStsRangeErr: bounds or levels are not in ascending order";
    case pvxStsSizeErr: return "pvxStsSizeErr: a width or height is less than 1, or a size is out of range";
    case pvxStsNullPtrErr: return "pvxStsNullPtrErr: a required pointer is null";
    case pvxStsMemAllocErr: return "pvxStsMemAllocErr: a work buffer could not be allocated";
    case pvxStsDivByZeroErr: return "pvxStsDivByZeroErr: the constant divisor is zero";
    case pvxStsOutOfRangeErr: return "pvxStsOutOfRangeErr: an offset or point lies outside the image or the prepared range";
    case pvxStsDataTypeErr: return "pvxStsDataTypeErr: the pixel-type code is not supported";
    case pvxStsScaleRangeErr: return "pvxStsScaleRangeErr: the value range is empty";
    case pvxStsFftFlagErr: return "pvxStsFftFlagErr: the normalisation flag is not supported";
    case pvxStsStepErr: return "pvxStsStepErr: a step is less than 1 or too small for the row";
    case pvxStsFftOrderErr: return "pvxStsFftOrderErr: an FFT order is out of range";
    case pvxStsContextMatchErr: return "pvxStsContextMatchErr: the spec or state object is not of the expected kind";
    case pvxStsThresholdErr: return "pvxStsThresholdErr: the upper threshold is below the lower threshold";
    case pvxStsMoment00ZeroErr: return "pvxStsMoment00ZeroErr: the zero-order moment is too small to normalise";
    case pvxStsMirrorFlipErr: return "pvxStsMirrorFlipErr: the flip axis is not 0, 1 or 2";
    case pvxStsInterpolationErr: return "pvxStsInterpolationErr: the interpolation code is not supported";
    case pvxStsResizeFactorErr: return "pvxStsResizeFactorErr: a resize factor is out of range";
    case pvxStsMaskSizeErr: return "pvxStsMaskSizeErr: a mask size is invalid";
    case pvxStsAnchorErr: return "pvxStsAnchorErr: the anchor lies outside the mask";
    case pvxStsEpsValErr: return "pvxStsEpsValErr: the tolerance is negative";
    case pvxStsStrideErr: return "pvxStsStrideErr: a step is too small for the row plus the border";
    case pvxStsChannelErr: return "pvxStsChannelErr: a channel count or channel index is out of range";
    case pvxStsAlphaTypeErr: return "pvxStsAlphaTypeErr: the alpha-composition operation is not supported";
    case pvxStsDivisorErr: return "pvxStsDivisorErr: an integer filter divisor is zero";
    case pvxStsNumChannelsErr: return "pvxStsNumChannelsErr: the channel count is not served";
    case pvxStsChannelOrderErr: return "pvxStsChannelOrderErr: a channel-order entry is out of range";
    case pvxStsZeroMaskValuesErr: return "pvxStsZeroMaskValuesErr: every value of the mask is zero";
    case pvxStsQuadErr: return "pvxStsQuadErr: a quadrangle is degenerate";
    case pvxStsRectErr: return "pvxStsRectErr: a rectangle is degenerate";
    case pvxStsCoeffErr: return "pvxStsCoeffErr: transform coefficients are singular";
    case pvxStsLUTNofLevelsErr: return "pvxStsLUTNofLevelsErr: a look-up table has fewer than 2 levels";
    case pvxStsHistoNofLevelsErr: return "pvxStsHistoNofLevelsErr: a histogram has fewer than 2 levels";
    case pvxStsNotEvenStepErr: return "pvxStsNotEvenStepErr: a step is not a multiple of the element size";
    case pvxStsNoiseValErr: return "pvxStsNoiseValErr: the noise parameter is out of range";
    case pvxStsResizeTooSmallErr: return "pvxStsResizeTooSmallErr: the destination is too small for the resize method";
    case pvxStsQualityIndexErr: return "pvxStsQualityIndexErr: the quality index is undefined for images this flat";
    case pvxStsWeightErr: return "pvxStsWeightErr: the centre weight is less than 1";
    case pvxStsRoundModeNotSupportedErr: return "pvxStsRoundModeNotSupportedErr: the rounding mode is not supported";
    case pvxStsBorderErr: return "pvxStsBorderErr: the border type is not served by this function";
    case pvxStsWarpDirectionErr: return "pvxStsWarpDirectionErr: the warp direction is not 0 or 1";
    case pvxStsOddOffsetErr: return "pvxStsOddOffsetErr: an x offset or width must be even";
    case pvxStsNotSupportedModeErr: return "pvxStsNotSupportedModeErr: a valid combination this library does not serve";
    default: return "unknown status";
    }
}

}  // extern "C"
