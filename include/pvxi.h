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

/* ==== pointops/copy.api ==== */

/* ---- Copy ---- */
/* Channel-pointer forms (C3C1 C4C1 C1C3 C1C4 C3CR C4CR): the pointer addresses the chosen channel. */
/* AC4 destinations keep their fourth channel; C1C3 C1C4 C3CR C4CR leave the other channels untouched. */
PVX_API PvxStatus pvxiCopy_8u_C1R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_8u_C3R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_8u_C4R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_8u_AC4R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16s_C1R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16s_C3R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16s_C4R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16s_AC4R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16u_C1R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16u_C3R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16u_C4R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16u_AC4R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32f_C1R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32f_C3R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32f_C4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32f_AC4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32s_C1R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32s_C3R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32s_C4R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32s_AC4R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_8u_C3C1R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_8u_C4C1R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_8u_C1C3R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_8u_C1C4R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_8u_C3AC4R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_8u_AC4C3R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16s_C3C1R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16s_C4C1R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16s_C1C3R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16s_C1C4R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16s_C3AC4R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16s_AC4C3R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16u_C3C1R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16u_C4C1R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16u_C1C3R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16u_C1C4R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16u_C3AC4R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16u_AC4C3R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32f_C3C1R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32f_C4C1R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32f_C1C3R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32f_C1C4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32f_C3AC4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32f_AC4C3R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32s_C3C1R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32s_C4C1R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32s_C1C3R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32s_C1C4R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32s_C3AC4R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32s_AC4C3R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_8u_C3CR(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_8u_C4CR(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16s_C3CR(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16s_C4CR(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16u_C3CR(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16u_C4CR(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32f_C3CR(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32f_C4CR(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32s_C3CR(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32s_C4CR(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize);
/* Masked: a pixel is copied where its mask byte is non-zero. */
PVX_API PvxStatus pvxiCopy_8u_C1MR(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiCopy_8u_C3MR(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiCopy_8u_C4MR(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiCopy_8u_AC4MR(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiCopy_16s_C1MR(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiCopy_16s_C3MR(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiCopy_16s_C4MR(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiCopy_16s_AC4MR(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiCopy_16u_C1MR(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiCopy_16u_C3MR(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiCopy_16u_C4MR(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiCopy_16u_AC4MR(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiCopy_32f_C1MR(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiCopy_32f_C3MR(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiCopy_32f_C4MR(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiCopy_32f_AC4MR(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiCopy_32s_C1MR(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiCopy_32s_C3MR(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiCopy_32s_C4MR(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiCopy_32s_AC4MR(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
/* Planar side: an array of one pointer per plane and one step for every plane. */
PVX_API PvxStatus pvxiCopy_8u_C3P3R(const Pvx8u* pSrc, int srcStep, Pvx8u* const pDst[3], int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_8u_C4P4R(const Pvx8u* pSrc, int srcStep, Pvx8u* const pDst[4], int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16s_C3P3R(const Pvx16s* pSrc, int srcStep, Pvx16s* const pDst[3], int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16s_C4P4R(const Pvx16s* pSrc, int srcStep, Pvx16s* const pDst[4], int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16u_C3P3R(const Pvx16u* pSrc, int srcStep, Pvx16u* const pDst[3], int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16u_C4P4R(const Pvx16u* pSrc, int srcStep, Pvx16u* const pDst[4], int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32f_C3P3R(const Pvx32f* pSrc, int srcStep, Pvx32f* const pDst[3], int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32f_C4P4R(const Pvx32f* pSrc, int srcStep, Pvx32f* const pDst[4], int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32s_C3P3R(const Pvx32s* pSrc, int srcStep, Pvx32s* const pDst[3], int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32s_C4P4R(const Pvx32s* pSrc, int srcStep, Pvx32s* const pDst[4], int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_8u_P3C3R(const Pvx8u* const pSrc[3], int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_8u_P4C4R(const Pvx8u* const pSrc[4], int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16s_P3C3R(const Pvx16s* const pSrc[3], int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16s_P4C4R(const Pvx16s* const pSrc[4], int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16u_P3C3R(const Pvx16u* const pSrc[3], int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_16u_P4C4R(const Pvx16u* const pSrc[4], int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32f_P3C3R(const Pvx32f* const pSrc[3], int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32f_P4C4R(const Pvx32f* const pSrc[4], int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32s_P3C3R(const Pvx32s* const pSrc[3], int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiCopy_32s_P4C4R(const Pvx32s* const pSrc[4], int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize);

/* ---- CopyManaged ---- */
/* flags: bit value 2 reads and writes the rows with non-temporal loads and stores; other bits change nothing. */
PVX_API PvxStatus pvxiCopyManaged_8u_C1R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int flags);

/* ---- Dup ---- */
/* The one source channel is written into every destination channel, the fourth of C1C4 included. */
PVX_API PvxStatus pvxiDup_8u_C1C3R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDup_8u_C1C4R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);

/* ==== pointops/set.api ==== */

/* ---- Set ---- */
/* C3 and AC4 take three values, C4 four; AC4 destinations keep their fourth channel. */
PVX_API PvxStatus pvxiSet_8u_C1R(Pvx8u value, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_16s_C1R(Pvx16s value, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_16u_C1R(Pvx16u value, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_32f_C1R(Pvx32f value, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_32s_C1R(Pvx32s value, Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_8u_C3R(const Pvx8u value[3], Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_8u_C4R(const Pvx8u value[4], Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_8u_AC4R(const Pvx8u value[3], Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_16s_C3R(const Pvx16s value[3], Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_16s_C4R(const Pvx16s value[4], Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_16s_AC4R(const Pvx16s value[3], Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_16u_C3R(const Pvx16u value[3], Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_16u_C4R(const Pvx16u value[4], Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_16u_AC4R(const Pvx16u value[3], Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_32f_C3R(const Pvx32f value[3], Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_32f_C4R(const Pvx32f value[4], Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_32f_AC4R(const Pvx32f value[3], Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_32s_C3R(const Pvx32s value[3], Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_32s_C4R(const Pvx32s value[4], Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_32s_AC4R(const Pvx32s value[3], Pvx32s* pDst, int dstStep, PvxiSize roiSize);
/* Masked: the value is written where the mask byte is non-zero. */
PVX_API PvxStatus pvxiSet_8u_C1MR(Pvx8u value, Pvx8u* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiSet_16s_C1MR(Pvx16s value, Pvx16s* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiSet_16u_C1MR(Pvx16u value, Pvx16u* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiSet_32f_C1MR(Pvx32f value, Pvx32f* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiSet_32s_C1MR(Pvx32s value, Pvx32s* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiSet_8u_C3MR(const Pvx8u value[3], Pvx8u* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiSet_8u_C4MR(const Pvx8u value[4], Pvx8u* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiSet_8u_AC4MR(const Pvx8u value[3], Pvx8u* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiSet_16s_C3MR(const Pvx16s value[3], Pvx16s* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiSet_16s_C4MR(const Pvx16s value[4], Pvx16s* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiSet_16s_AC4MR(const Pvx16s value[3], Pvx16s* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiSet_16u_C3MR(const Pvx16u value[3], Pvx16u* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiSet_16u_C4MR(const Pvx16u value[4], Pvx16u* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiSet_16u_AC4MR(const Pvx16u value[3], Pvx16u* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiSet_32f_C3MR(const Pvx32f value[3], Pvx32f* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiSet_32f_C4MR(const Pvx32f value[4], Pvx32f* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiSet_32f_AC4MR(const Pvx32f value[3], Pvx32f* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiSet_32s_C3MR(const Pvx32s value[3], Pvx32s* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiSet_32s_C4MR(const Pvx32s value[4], Pvx32s* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
PVX_API PvxStatus pvxiSet_32s_AC4MR(const Pvx32s value[3], Pvx32s* pDst, int dstStep, PvxiSize roiSize, const Pvx8u* pMask, int maskStep);
/* One channel: the destination pointer addresses it; the other channels are left untouched. */
PVX_API PvxStatus pvxiSet_8u_C3CR(Pvx8u value, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_8u_C4CR(Pvx8u value, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_16s_C3CR(Pvx16s value, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_16s_C4CR(Pvx16s value, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_16u_C3CR(Pvx16u value, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_16u_C4CR(Pvx16u value, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_32f_C3CR(Pvx32f value, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_32f_C4CR(Pvx32f value, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_32s_C3CR(Pvx32s value, Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSet_32s_C4CR(Pvx32s value, Pvx32s* pDst, int dstStep, PvxiSize roiSize);

#ifdef __cplusplus
}
#endif

#endif /* PVXI_H */
