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

/* ==== pointops/mirror.api ==== */

/* ---- Mirror ---- */
/* flip 0: top and bottom exchanged; 1: left and right; 2: both. AC4: the alpha channel is never written. */
/* flip 3 (one-channel *R only): main diagonal, dst(x, y) = src(y, x); flip 4: dst(x, y) = src(W-1-y, H-1-x); */
/* the result of a diagonal flip is H x W. Every other member answers -21 to 3 and 4. */
/* *R with pSrc == pDst and srcStep == dstStep is the in-place form, before any check. */
/* Checks: pointers -8, sizes -6, flip outside 0..2 -21, a flip that changes nothing -6 */
/* (flip 0 or 2 with height 1, flip 1 or 2 with width 1); steps are not checked. *IR check the same way. */
/* Diagonals: pointers -8; steps below 1 or not a multiple of the element size -14; sizes -6; */
/* -9999 unless srcStep holds W and dstStep H elements and the source and destination spans are disjoint. */
PVX_API PvxStatus pvxiMirror_8u_C1R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_8u_C3R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_8u_C4R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_8u_AC4R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_16u_C1R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_16u_C3R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_16u_C4R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_16u_AC4R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_16s_C1R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_16s_C3R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_16s_C4R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_16s_AC4R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_32s_C1R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_32s_C3R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_32s_C4R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_32s_AC4R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_32f_C1R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_32f_C3R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_32f_C4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_32f_AC4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_8u_C1IR(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_8u_C3IR(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_8u_C4IR(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_8u_AC4IR(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_16u_C1IR(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_16u_C3IR(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_16u_C4IR(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_16u_AC4IR(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_16s_C1IR(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_16s_C3IR(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_16s_C4IR(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_16s_AC4IR(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_32s_C1IR(Pvx32s* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_32s_C3IR(Pvx32s* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_32s_C4IR(Pvx32s* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_32s_AC4IR(Pvx32s* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_32f_C1IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_32f_C3IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_32f_C4IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);
PVX_API PvxStatus pvxiMirror_32f_AC4IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize, int flip);

/* ==== pointops/swapchannels.api ==== */

/* ---- SwapChannels ---- */
/* Destination channel i receives source channel dstOrder[i]; entries are checked as unsigned numbers (-60). */
/* C3R, C3IR: 3 entries 0..2. C4R, C4IR: 4 entries 0..3. AC4R: 3 entries 0..2, destination alpha never written. */
/* C3C4R: 4 entries 0..3; an entry of 3 leaves that destination channel as it was. C4C3R: 3 entries 0..3. */
/* pSrc == pDst on C3R, C4R, AC4R works in place on the destination rows (dstStep), whatever srcStep is; */
/* C3C4R and C4C3R change the pixel size and need regions that do not overlap. */
/* Checks: *R pointers (source, destination, order) -8, sizes -6, a step of 0 -14, entries -60; */
/* *IR image pointer -8, a step of 0 -14, sizes -6, order pointer -8, entries -60. Negative steps are used as given. */
PVX_API PvxStatus pvxiSwapChannels_8u_C3R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_8u_C4R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_8u_AC4R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_8u_C3C4R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_8u_C4C3R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_16u_C3R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_16u_C4R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_16u_AC4R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_16u_C3C4R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_16u_C4C3R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_16s_C3R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_16s_C4R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_16s_AC4R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_16s_C3C4R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_16s_C4C3R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_32s_C3R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_32s_C4R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_32s_AC4R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_32s_C3C4R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_32s_C4C3R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_32f_C3R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_32f_C4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_32f_AC4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_32f_C3C4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_32f_C4C3R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_8u_C3IR(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, const int* dstOrder);
PVX_API PvxStatus pvxiSwapChannels_8u_C4IR(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, const int* dstOrder);

/* ==== pointops/transpose.api ==== */

/* ---- Transpose ---- */
/* Destination (x, y) is source (y, x); roiSize is the source size, the destination is height x width. */
/* *R: pointers -8, sizes -6; steps are used as given (0 and negative included). */
/* *IR: pointer -8; sizes below 1 or width != height -6. Transposed in tiles of at most 32 x 32. */
PVX_API PvxStatus pvxiTranspose_8u_C1R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_8u_C3R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_8u_C4R(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_16u_C1R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_16u_C3R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_16u_C4R(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_16s_C1R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_16s_C3R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_16s_C4R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_32s_C1R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_32s_C3R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_32s_C4R(const Pvx32s* pSrc, int srcStep, Pvx32s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_32f_C1R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_32f_C3R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_32f_C4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_8u_C1IR(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_8u_C3IR(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_8u_C4IR(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_16u_C1IR(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_16u_C3IR(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_16u_C4IR(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_16s_C1IR(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_16s_C3IR(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_16s_C4IR(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_32s_C1IR(Pvx32s* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_32s_C3IR(Pvx32s* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_32s_C4IR(Pvx32s* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_32f_C1IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_32f_C3IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiTranspose_32f_C4IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);

#ifdef __cplusplus
}
#endif

#endif /* PVXI_H */
