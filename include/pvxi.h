/* generated from the family tables (*.api) by tools/pvxgen; do not edit */
/* pvxi.h: every exported image function of pvx. */
#ifndef PVXI_H
#define PVXI_H

#include "pvxtypes.h"
#include "pvxcore.h"

#ifdef __cplusplus
extern "C" {
#endif

/* ==== core/image.api ==== */

/* ---- Image memory ---- */
/* pvxiMalloc_*: rows of step bytes, step = row bytes rounded up to 64; *pStepBytes receives the step. */
/* Null for a null pStepBytes, for a width or height below 1 (step 0), or when memory is short. */
PVX_API Pvx8u* pvxiMalloc_8u_C1(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx8u* pvxiMalloc_8u_C2(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx8u* pvxiMalloc_8u_C3(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx8u* pvxiMalloc_8u_C4(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx8u* pvxiMalloc_8u_AC4(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx16u* pvxiMalloc_16u_C1(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx16u* pvxiMalloc_16u_C2(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx16u* pvxiMalloc_16u_C3(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx16u* pvxiMalloc_16u_C4(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx16u* pvxiMalloc_16u_AC4(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx16s* pvxiMalloc_16s_C1(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx16s* pvxiMalloc_16s_C2(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx16s* pvxiMalloc_16s_C3(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx16s* pvxiMalloc_16s_C4(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx16s* pvxiMalloc_16s_AC4(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32s* pvxiMalloc_32s_C1(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32s* pvxiMalloc_32s_C2(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32s* pvxiMalloc_32s_C3(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32s* pvxiMalloc_32s_C4(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32s* pvxiMalloc_32s_AC4(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32f* pvxiMalloc_32f_C1(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32f* pvxiMalloc_32f_C2(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32f* pvxiMalloc_32f_C3(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32f* pvxiMalloc_32f_C4(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32f* pvxiMalloc_32f_AC4(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32sc* pvxiMalloc_32sc_C1(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32sc* pvxiMalloc_32sc_C2(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32sc* pvxiMalloc_32sc_C3(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32sc* pvxiMalloc_32sc_C4(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32sc* pvxiMalloc_32sc_AC4(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32fc* pvxiMalloc_32fc_C1(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32fc* pvxiMalloc_32fc_C2(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32fc* pvxiMalloc_32fc_C3(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32fc* pvxiMalloc_32fc_C4(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API Pvx32fc* pvxiMalloc_32fc_AC4(int widthPixels, int heightPixels, int* pStepBytes);
PVX_API void pvxiFree(void* ptr);

/* ---- Version ---- */
PVX_API const PvxVersionRecord* pvxiGetLibVersion(void);

/* ==== pointops/convert.api ==== */

/* ---- Convert ---- */
/* roundMode: 0 toward zero, 1 nearest even, any other value half away from zero (not checked). */
/* The caller's floating-point control is restored before return. */
PVX_API PvxStatus pvxiConvert_32f8u_C1R(const Pvx32f* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int roundMode);

#ifdef __cplusplus
}
#endif

#endif /* PVXI_H */
