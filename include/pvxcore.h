/* pvxcore.h: the companion core library: aligned memory, the largest cache,
 * processor features and status texts. Compiles as C99 and as C++. */
#ifndef PVXCORE_H
#define PVXCORE_H

#include "pvxtypes.h"

#ifdef __cplusplus
extern "C" {
#endif

/* Feature bits of pvxGetEnabledCpuFeatures. A bit is set when the processor
 * has the feature and the operating system has enabled its registers. */
#define PVX_CPUID_MMX    0x00000001ULL
#define PVX_CPUID_SSE    0x00000002ULL
#define PVX_CPUID_SSE2   0x00000004ULL
#define PVX_CPUID_SSE3   0x00000008ULL
#define PVX_CPUID_SSSE3  0x00000010ULL
#define PVX_CPUID_SSE41  0x00000020ULL
#define PVX_CPUID_SSE42  0x00000040ULL
#define PVX_CPUID_AVX    0x00000080ULL
#define PVX_CPUID_AES    0x00000100ULL
#define PVX_CPUID_CLMUL  0x00000200ULL
#define PVX_CPUID_F16C   0x00000800ULL
#define PVX_CPUID_AVX2   0x00008000ULL
#define PVX_CPUID_AVX512F 0x00010000ULL
#define PVX_CPUID_BMI1   0x00020000ULL
#define PVX_CPUID_BMI2   0x00040000ULL
#define PVX_CPUID_POPCNT 0x00080000ULL
#define PVX_CPUID_FMA    0x00100000ULL

/* A block of at least `length` bytes aligned to 64 bytes, or null when length
 * is below 1 or memory is short. Thread-safe. */
PVX_API void* pvxMalloc(int length);

/* Releases a block from pvxMalloc; null is accepted and ignored. */
PVX_API void pvxFree(void* ptr);

/* Stores the size in bytes of the largest cache of this machine.
 * pvxStsNullPtrErr for a null pointer, pvxStsNotSupportedModeErr when the
 * size cannot be found (the stored value is then 0). */
PVX_API PvxStatus pvxGetMaxCacheSizeB(int* pSizeByte);

/* The PVX_CPUID_* bits enabled on this machine. */
PVX_API Pvx64u pvxGetEnabledCpuFeatures(void);

/* Non-zero when every bit of featureMask is enabled. */
PVX_API int ownGetFeature(Pvx64u featureMask);

/* The status's name and a one-line meaning, e.g.
 * "pvxStsNullPtrErr: a required pointer is null"; "unknown status" for a
 * value that the library never returns. The text is static. */
PVX_API const char* pvxGetStatusString(PvxStatus status);

#ifdef __cplusplus
}
#endif

#endif /* PVXCORE_H */
