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

/* ==== pointops/add.api ==== */

/* ---- Add ---- */
/* Add: src1 + src2; in place: srcDst = src + srcDst. */
/* Real types check pointers and sizes only: steps are used as given (a zero step re-reads one row). */
/* Complex types check steps as well. Sfs: exact result times 2^-scaleFactor, rounded half to even, saturated. */
PVX_API PvxStatus pvxiAdd_8u_C1RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_8u_C3RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_8u_C4RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_8u_AC4RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16u_C1RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16u_C3RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16u_C4RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16u_AC4RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16s_C1RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16s_C3RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16s_C4RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16s_AC4RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_8u_C1IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_8u_C3IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_8u_C4IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_8u_AC4IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16u_C1IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16u_C3IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16u_C4IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16u_AC4IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16s_C1IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16s_C3IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16s_C4IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16s_AC4IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_32f_C1R(const Pvx32f* pSrc1, int src1Step, const Pvx32f* pSrc2, int src2Step, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAdd_32f_C3R(const Pvx32f* pSrc1, int src1Step, const Pvx32f* pSrc2, int src2Step, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAdd_32f_C4R(const Pvx32f* pSrc1, int src1Step, const Pvx32f* pSrc2, int src2Step, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAdd_32f_AC4R(const Pvx32f* pSrc1, int src1Step, const Pvx32f* pSrc2, int src2Step, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAdd_32f_C1IR(const Pvx32f* pSrc, int srcStep, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAdd_32f_C3IR(const Pvx32f* pSrc, int srcStep, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAdd_32f_C4IR(const Pvx32f* pSrc, int srcStep, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAdd_32f_AC4IR(const Pvx32f* pSrc, int srcStep, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAdd_16sc_C1RSfs(const Pvx16sc* pSrc1, int src1Step, const Pvx16sc* pSrc2, int src2Step, Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16sc_C3RSfs(const Pvx16sc* pSrc1, int src1Step, const Pvx16sc* pSrc2, int src2Step, Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16sc_AC4RSfs(const Pvx16sc* pSrc1, int src1Step, const Pvx16sc* pSrc2, int src2Step, Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_32sc_C1RSfs(const Pvx32sc* pSrc1, int src1Step, const Pvx32sc* pSrc2, int src2Step, Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_32sc_C3RSfs(const Pvx32sc* pSrc1, int src1Step, const Pvx32sc* pSrc2, int src2Step, Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_32sc_AC4RSfs(const Pvx32sc* pSrc1, int src1Step, const Pvx32sc* pSrc2, int src2Step, Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16sc_C1IRSfs(const Pvx16sc* pSrc, int srcStep, Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16sc_C3IRSfs(const Pvx16sc* pSrc, int srcStep, Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_16sc_AC4IRSfs(const Pvx16sc* pSrc, int srcStep, Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_32sc_C1IRSfs(const Pvx32sc* pSrc, int srcStep, Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_32sc_C3IRSfs(const Pvx32sc* pSrc, int srcStep, Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_32sc_AC4IRSfs(const Pvx32sc* pSrc, int srcStep, Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAdd_32fc_C1R(const Pvx32fc* pSrc1, int src1Step, const Pvx32fc* pSrc2, int src2Step, Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAdd_32fc_C3R(const Pvx32fc* pSrc1, int src1Step, const Pvx32fc* pSrc2, int src2Step, Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAdd_32fc_AC4R(const Pvx32fc* pSrc1, int src1Step, const Pvx32fc* pSrc2, int src2Step, Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAdd_32fc_C1IR(const Pvx32fc* pSrc, int srcStep, Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAdd_32fc_C3IR(const Pvx32fc* pSrc, int srcStep, Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAdd_32fc_AC4IR(const Pvx32fc* pSrc, int srcStep, Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);

/* ---- AddC ---- */
/* AddC: src + value; in place: srcDst = srcDst + value. */
/* C3 and AC4 take 3 values, C4 takes 4; the value pointer is checked with the image pointers. */
PVX_API PvxStatus pvxiAddC_8u_C1RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u value, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16u_C1RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u value, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16s_C1RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s value, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_8u_C3RSfs(const Pvx8u* pSrc, int srcStep, const Pvx8u value[3], Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_8u_C4RSfs(const Pvx8u* pSrc, int srcStep, const Pvx8u value[4], Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_8u_AC4RSfs(const Pvx8u* pSrc, int srcStep, const Pvx8u value[3], Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16u_C3RSfs(const Pvx16u* pSrc, int srcStep, const Pvx16u value[3], Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16u_C4RSfs(const Pvx16u* pSrc, int srcStep, const Pvx16u value[4], Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16u_AC4RSfs(const Pvx16u* pSrc, int srcStep, const Pvx16u value[3], Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16s_C3RSfs(const Pvx16s* pSrc, int srcStep, const Pvx16s value[3], Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16s_C4RSfs(const Pvx16s* pSrc, int srcStep, const Pvx16s value[4], Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16s_AC4RSfs(const Pvx16s* pSrc, int srcStep, const Pvx16s value[3], Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_8u_C1IRSfs(Pvx8u value, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16u_C1IRSfs(Pvx16u value, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16s_C1IRSfs(Pvx16s value, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_8u_C3IRSfs(const Pvx8u value[3], Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_8u_C4IRSfs(const Pvx8u value[4], Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_8u_AC4IRSfs(const Pvx8u value[3], Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16u_C3IRSfs(const Pvx16u value[3], Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16u_C4IRSfs(const Pvx16u value[4], Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16u_AC4IRSfs(const Pvx16u value[3], Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16s_C3IRSfs(const Pvx16s value[3], Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16s_C4IRSfs(const Pvx16s value[4], Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16s_AC4IRSfs(const Pvx16s value[3], Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_32f_C1R(const Pvx32f* pSrc, int srcStep, Pvx32f value, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAddC_32f_C3R(const Pvx32f* pSrc, int srcStep, const Pvx32f value[3], Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAddC_32f_C4R(const Pvx32f* pSrc, int srcStep, const Pvx32f value[4], Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAddC_32f_AC4R(const Pvx32f* pSrc, int srcStep, const Pvx32f value[3], Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAddC_32f_C1IR(Pvx32f value, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAddC_32f_C3IR(const Pvx32f value[3], Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAddC_32f_C4IR(const Pvx32f value[4], Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAddC_32f_AC4IR(const Pvx32f value[3], Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAddC_16sc_C1RSfs(const Pvx16sc* pSrc, int srcStep, Pvx16sc value, Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_32sc_C1RSfs(const Pvx32sc* pSrc, int srcStep, Pvx32sc value, Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16sc_C3RSfs(const Pvx16sc* pSrc, int srcStep, const Pvx16sc value[3], Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16sc_AC4RSfs(const Pvx16sc* pSrc, int srcStep, const Pvx16sc value[3], Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_32sc_C3RSfs(const Pvx32sc* pSrc, int srcStep, const Pvx32sc value[3], Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_32sc_AC4RSfs(const Pvx32sc* pSrc, int srcStep, const Pvx32sc value[3], Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16sc_C1IRSfs(Pvx16sc value, Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_32sc_C1IRSfs(Pvx32sc value, Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16sc_C3IRSfs(const Pvx16sc value[3], Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_16sc_AC4IRSfs(const Pvx16sc value[3], Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_32sc_C3IRSfs(const Pvx32sc value[3], Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_32sc_AC4IRSfs(const Pvx32sc value[3], Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiAddC_32fc_C1R(const Pvx32fc* pSrc, int srcStep, Pvx32fc value, Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAddC_32fc_C3R(const Pvx32fc* pSrc, int srcStep, const Pvx32fc value[3], Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAddC_32fc_AC4R(const Pvx32fc* pSrc, int srcStep, const Pvx32fc value[3], Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAddC_32fc_C1IR(Pvx32fc value, Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAddC_32fc_C3IR(const Pvx32fc value[3], Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAddC_32fc_AC4IR(const Pvx32fc value[3], Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);

/* ==== pointops/convert.api ==== */

/* ---- Convert ---- */
/* roundMode: 0 toward zero, 1 nearest even, any other value half away from zero (not checked). */
/* The caller's floating-point control is restored before return. */
PVX_API PvxStatus pvxiConvert_32f8u_C1R(const Pvx32f* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int roundMode);

/* ==== pointops/copy.api ==== */

/* ---- Copy ---- */
/* Channel-pointer forms (C3C1 C4C1 C1C3 C1C4 C3CR C4CR): the pointer addresses the chosen channel. */
/* AC4 destinations keep their fourth channel; C1C3 C1C4 C3CR C4CR leave the other channels untouched. */
/* Kept values (AC4 alpha, other channels, pixels masked out) are read and stored back unchanged with */
/* the written ones, 16 bytes at a time: two calls that write different channels, or different */
/* masked pixels, of the same rows must not run at the same time. */
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

/* ==== pointops/div.api ==== */

/* ---- Div ---- */
/* Div: pSrc2 / pSrc1 (the first image is the divisor); in place: pSrcDst / pSrc. */
/* Checks pointers (-8), sizes (-6), steps (-14). A zero divisor pixel is not an error: every row is */
/* computed and the call returns pvxStsDivByZero (6). */
/* Integer members: the exact quotient times 2^-scaleFactor, rounded half to even, saturated. Over a */
/* zero divisor: the type's maximum for a positive dividend, its minimum (0 unsigned) for a negative one, 0 for 0. */
/* 32f: groups of four elements from the start of each row (AC4: one pixel); without a zero divisor in */
/* the group q = n*r, e = 1 - d*r, result q + (e*q + q)*e with r the reciprocal estimate of d (may differ */
/* from exact division in the last bits); with one, each element alone: the exact quotient, or over zero */
/* +inf, -inf, or the quiet NaN 0x7FC00000 for a zero or NaN dividend. The last (width*channels) mod 4 */
/* elements of a row are groups of one. */
/* Complex: (a+bi)/(c+di) = ((ac+bd) + (bc-ad)i) / (c^2+d^2); 16sc, 32sc exact with the Sfs rule per */
/* part, 32fc in single precision in that order; a zero divisor divides each part of the dividend by zero. */
PVX_API PvxStatus pvxiDiv_8u_C1RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_8u_C3RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_8u_C4RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_8u_AC4RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16u_C1RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16u_C3RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16u_C4RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16u_AC4RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16s_C1RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16s_C3RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16s_C4RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16s_AC4RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_8u_C1IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_8u_C3IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_8u_C4IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_8u_AC4IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16u_C1IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16u_C3IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16u_C4IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16u_AC4IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16s_C1IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16s_C3IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16s_C4IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16s_AC4IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_32f_C1R(const Pvx32f* pSrc1, int src1Step, const Pvx32f* pSrc2, int src2Step, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDiv_32f_C3R(const Pvx32f* pSrc1, int src1Step, const Pvx32f* pSrc2, int src2Step, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDiv_32f_C4R(const Pvx32f* pSrc1, int src1Step, const Pvx32f* pSrc2, int src2Step, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDiv_32f_AC4R(const Pvx32f* pSrc1, int src1Step, const Pvx32f* pSrc2, int src2Step, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDiv_32f_C1IR(const Pvx32f* pSrc, int srcStep, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDiv_32f_C3IR(const Pvx32f* pSrc, int srcStep, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDiv_32f_C4IR(const Pvx32f* pSrc, int srcStep, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDiv_32f_AC4IR(const Pvx32f* pSrc, int srcStep, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDiv_16sc_C1RSfs(const Pvx16sc* pSrc1, int src1Step, const Pvx16sc* pSrc2, int src2Step, Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16sc_C3RSfs(const Pvx16sc* pSrc1, int src1Step, const Pvx16sc* pSrc2, int src2Step, Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16sc_AC4RSfs(const Pvx16sc* pSrc1, int src1Step, const Pvx16sc* pSrc2, int src2Step, Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_32sc_C1RSfs(const Pvx32sc* pSrc1, int src1Step, const Pvx32sc* pSrc2, int src2Step, Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_32sc_C3RSfs(const Pvx32sc* pSrc1, int src1Step, const Pvx32sc* pSrc2, int src2Step, Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_32sc_AC4RSfs(const Pvx32sc* pSrc1, int src1Step, const Pvx32sc* pSrc2, int src2Step, Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16sc_C1IRSfs(const Pvx16sc* pSrc, int srcStep, Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16sc_C3IRSfs(const Pvx16sc* pSrc, int srcStep, Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_16sc_AC4IRSfs(const Pvx16sc* pSrc, int srcStep, Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_32sc_C1IRSfs(const Pvx32sc* pSrc, int srcStep, Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_32sc_C3IRSfs(const Pvx32sc* pSrc, int srcStep, Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_32sc_AC4IRSfs(const Pvx32sc* pSrc, int srcStep, Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDiv_32fc_C1R(const Pvx32fc* pSrc1, int src1Step, const Pvx32fc* pSrc2, int src2Step, Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDiv_32fc_C3R(const Pvx32fc* pSrc1, int src1Step, const Pvx32fc* pSrc2, int src2Step, Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDiv_32fc_AC4R(const Pvx32fc* pSrc1, int src1Step, const Pvx32fc* pSrc2, int src2Step, Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDiv_32fc_C1IR(const Pvx32fc* pSrc, int srcStep, Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDiv_32fc_C3IR(const Pvx32fc* pSrc, int srcStep, Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDiv_32fc_AC4IR(const Pvx32fc* pSrc, int srcStep, Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);

/* ---- DivC ---- */
/* DivC: pSrc / value; in place: pSrcDst / value. Checks pointers (-8), sizes (-6), steps (-14), then */
/* a zero constant (any channel): pvxStsDivByZeroErr (-10). Integer and complex members as Div; */
/* 32f divides exactly (correctly rounded). */
PVX_API PvxStatus pvxiDivC_8u_C1RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u value, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16u_C1RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u value, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16s_C1RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s value, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_8u_C3RSfs(const Pvx8u* pSrc, int srcStep, const Pvx8u value[3], Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_8u_C4RSfs(const Pvx8u* pSrc, int srcStep, const Pvx8u value[4], Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_8u_AC4RSfs(const Pvx8u* pSrc, int srcStep, const Pvx8u value[3], Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16u_C3RSfs(const Pvx16u* pSrc, int srcStep, const Pvx16u value[3], Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16u_C4RSfs(const Pvx16u* pSrc, int srcStep, const Pvx16u value[4], Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16u_AC4RSfs(const Pvx16u* pSrc, int srcStep, const Pvx16u value[3], Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16s_C3RSfs(const Pvx16s* pSrc, int srcStep, const Pvx16s value[3], Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16s_C4RSfs(const Pvx16s* pSrc, int srcStep, const Pvx16s value[4], Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16s_AC4RSfs(const Pvx16s* pSrc, int srcStep, const Pvx16s value[3], Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_8u_C1IRSfs(Pvx8u value, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16u_C1IRSfs(Pvx16u value, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16s_C1IRSfs(Pvx16s value, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_8u_C3IRSfs(const Pvx8u value[3], Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_8u_C4IRSfs(const Pvx8u value[4], Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_8u_AC4IRSfs(const Pvx8u value[3], Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16u_C3IRSfs(const Pvx16u value[3], Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16u_C4IRSfs(const Pvx16u value[4], Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16u_AC4IRSfs(const Pvx16u value[3], Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16s_C3IRSfs(const Pvx16s value[3], Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16s_C4IRSfs(const Pvx16s value[4], Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16s_AC4IRSfs(const Pvx16s value[3], Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_32f_C1R(const Pvx32f* pSrc, int srcStep, Pvx32f value, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDivC_32f_C3R(const Pvx32f* pSrc, int srcStep, const Pvx32f value[3], Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDivC_32f_C4R(const Pvx32f* pSrc, int srcStep, const Pvx32f value[4], Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDivC_32f_AC4R(const Pvx32f* pSrc, int srcStep, const Pvx32f value[3], Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDivC_32f_C1IR(Pvx32f value, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDivC_32f_C3IR(const Pvx32f value[3], Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDivC_32f_C4IR(const Pvx32f value[4], Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDivC_32f_AC4IR(const Pvx32f value[3], Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDivC_16sc_C1RSfs(const Pvx16sc* pSrc, int srcStep, Pvx16sc value, Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_32sc_C1RSfs(const Pvx32sc* pSrc, int srcStep, Pvx32sc value, Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16sc_C3RSfs(const Pvx16sc* pSrc, int srcStep, const Pvx16sc value[3], Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16sc_AC4RSfs(const Pvx16sc* pSrc, int srcStep, const Pvx16sc value[3], Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_32sc_C3RSfs(const Pvx32sc* pSrc, int srcStep, const Pvx32sc value[3], Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_32sc_AC4RSfs(const Pvx32sc* pSrc, int srcStep, const Pvx32sc value[3], Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16sc_C1IRSfs(Pvx16sc value, Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_32sc_C1IRSfs(Pvx32sc value, Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16sc_C3IRSfs(const Pvx16sc value[3], Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_16sc_AC4IRSfs(const Pvx16sc value[3], Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_32sc_C3IRSfs(const Pvx32sc value[3], Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_32sc_AC4IRSfs(const Pvx32sc value[3], Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiDivC_32fc_C1R(const Pvx32fc* pSrc, int srcStep, Pvx32fc value, Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDivC_32fc_C3R(const Pvx32fc* pSrc, int srcStep, const Pvx32fc value[3], Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDivC_32fc_AC4R(const Pvx32fc* pSrc, int srcStep, const Pvx32fc value[3], Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDivC_32fc_C1IR(Pvx32fc value, Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDivC_32fc_C3IR(const Pvx32fc value[3], Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiDivC_32fc_AC4IR(const Pvx32fc value[3], Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);

/* ---- Div_Round ---- */
/* Div_Round: as the integer Div, rounded by roundMode: 0 toward zero, 1 nearest even, 2 half away from */
/* zero. Checks pointers (-8), sizes (-6), steps (-14), then the mode: pvxStsRoundModeNotSupportedErr (-213). */
PVX_API PvxStatus pvxiDiv_Round_8u_C1RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_8u_C3RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_8u_C4RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_8u_AC4RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_16u_C1RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_16u_C3RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_16u_C4RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_16u_AC4RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_16s_C1RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_16s_C3RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_16s_C4RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_16s_AC4RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_8u_C1IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_8u_C3IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_8u_C4IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_8u_AC4IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_16u_C1IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_16u_C3IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_16u_C4IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_16u_AC4IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_16s_C1IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_16s_C3IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_16s_C4IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int roundMode, int scaleFactor);
PVX_API PvxStatus pvxiDiv_Round_16s_AC4IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int roundMode, int scaleFactor);

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

/* ==== pointops/mul.api ==== */

/* ---- Mul ---- */
/* Mul: src1 * src2; complex: (ac - bd) + (ad + bc)i; in place: srcDst = src * srcDst. */
/* Real types check pointers and sizes only: steps are used as given (a zero step re-reads one row). */
/* Complex types check steps as well. Sfs: exact result times 2^-scaleFactor, rounded half to even, saturated. */
PVX_API PvxStatus pvxiMul_8u_C1RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_8u_C3RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_8u_C4RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_8u_AC4RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16u_C1RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16u_C3RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16u_C4RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16u_AC4RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16s_C1RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16s_C3RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16s_C4RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16s_AC4RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_8u_C1IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_8u_C3IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_8u_C4IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_8u_AC4IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16u_C1IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16u_C3IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16u_C4IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16u_AC4IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16s_C1IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16s_C3IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16s_C4IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16s_AC4IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_32f_C1R(const Pvx32f* pSrc1, int src1Step, const Pvx32f* pSrc2, int src2Step, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMul_32f_C3R(const Pvx32f* pSrc1, int src1Step, const Pvx32f* pSrc2, int src2Step, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMul_32f_C4R(const Pvx32f* pSrc1, int src1Step, const Pvx32f* pSrc2, int src2Step, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMul_32f_AC4R(const Pvx32f* pSrc1, int src1Step, const Pvx32f* pSrc2, int src2Step, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMul_32f_C1IR(const Pvx32f* pSrc, int srcStep, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMul_32f_C3IR(const Pvx32f* pSrc, int srcStep, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMul_32f_C4IR(const Pvx32f* pSrc, int srcStep, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMul_32f_AC4IR(const Pvx32f* pSrc, int srcStep, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMul_16sc_C1RSfs(const Pvx16sc* pSrc1, int src1Step, const Pvx16sc* pSrc2, int src2Step, Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16sc_C3RSfs(const Pvx16sc* pSrc1, int src1Step, const Pvx16sc* pSrc2, int src2Step, Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16sc_AC4RSfs(const Pvx16sc* pSrc1, int src1Step, const Pvx16sc* pSrc2, int src2Step, Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_32sc_C1RSfs(const Pvx32sc* pSrc1, int src1Step, const Pvx32sc* pSrc2, int src2Step, Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_32sc_C3RSfs(const Pvx32sc* pSrc1, int src1Step, const Pvx32sc* pSrc2, int src2Step, Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_32sc_AC4RSfs(const Pvx32sc* pSrc1, int src1Step, const Pvx32sc* pSrc2, int src2Step, Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16sc_C1IRSfs(const Pvx16sc* pSrc, int srcStep, Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16sc_C3IRSfs(const Pvx16sc* pSrc, int srcStep, Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_16sc_AC4IRSfs(const Pvx16sc* pSrc, int srcStep, Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_32sc_C1IRSfs(const Pvx32sc* pSrc, int srcStep, Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_32sc_C3IRSfs(const Pvx32sc* pSrc, int srcStep, Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_32sc_AC4IRSfs(const Pvx32sc* pSrc, int srcStep, Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMul_32fc_C1R(const Pvx32fc* pSrc1, int src1Step, const Pvx32fc* pSrc2, int src2Step, Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMul_32fc_C3R(const Pvx32fc* pSrc1, int src1Step, const Pvx32fc* pSrc2, int src2Step, Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMul_32fc_AC4R(const Pvx32fc* pSrc1, int src1Step, const Pvx32fc* pSrc2, int src2Step, Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMul_32fc_C1IR(const Pvx32fc* pSrc, int srcStep, Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMul_32fc_C3IR(const Pvx32fc* pSrc, int srcStep, Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMul_32fc_AC4IR(const Pvx32fc* pSrc, int srcStep, Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);

/* ---- MulC ---- */
/* MulC: src * value; in place: srcDst = srcDst * value. */
/* C3 and AC4 take 3 values, C4 takes 4; the value pointer is checked with the image pointers. */
PVX_API PvxStatus pvxiMulC_8u_C1RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u value, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16u_C1RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u value, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16s_C1RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s value, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_8u_C3RSfs(const Pvx8u* pSrc, int srcStep, const Pvx8u value[3], Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_8u_C4RSfs(const Pvx8u* pSrc, int srcStep, const Pvx8u value[4], Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_8u_AC4RSfs(const Pvx8u* pSrc, int srcStep, const Pvx8u value[3], Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16u_C3RSfs(const Pvx16u* pSrc, int srcStep, const Pvx16u value[3], Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16u_C4RSfs(const Pvx16u* pSrc, int srcStep, const Pvx16u value[4], Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16u_AC4RSfs(const Pvx16u* pSrc, int srcStep, const Pvx16u value[3], Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16s_C3RSfs(const Pvx16s* pSrc, int srcStep, const Pvx16s value[3], Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16s_C4RSfs(const Pvx16s* pSrc, int srcStep, const Pvx16s value[4], Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16s_AC4RSfs(const Pvx16s* pSrc, int srcStep, const Pvx16s value[3], Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_8u_C1IRSfs(Pvx8u value, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16u_C1IRSfs(Pvx16u value, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16s_C1IRSfs(Pvx16s value, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_8u_C3IRSfs(const Pvx8u value[3], Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_8u_C4IRSfs(const Pvx8u value[4], Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_8u_AC4IRSfs(const Pvx8u value[3], Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16u_C3IRSfs(const Pvx16u value[3], Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16u_C4IRSfs(const Pvx16u value[4], Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16u_AC4IRSfs(const Pvx16u value[3], Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16s_C3IRSfs(const Pvx16s value[3], Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16s_C4IRSfs(const Pvx16s value[4], Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16s_AC4IRSfs(const Pvx16s value[3], Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_32f_C1R(const Pvx32f* pSrc, int srcStep, Pvx32f value, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulC_32f_C3R(const Pvx32f* pSrc, int srcStep, const Pvx32f value[3], Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulC_32f_C4R(const Pvx32f* pSrc, int srcStep, const Pvx32f value[4], Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulC_32f_AC4R(const Pvx32f* pSrc, int srcStep, const Pvx32f value[3], Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulC_32f_C1IR(Pvx32f value, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulC_32f_C3IR(const Pvx32f value[3], Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulC_32f_C4IR(const Pvx32f value[4], Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulC_32f_AC4IR(const Pvx32f value[3], Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulC_16sc_C1RSfs(const Pvx16sc* pSrc, int srcStep, Pvx16sc value, Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_32sc_C1RSfs(const Pvx32sc* pSrc, int srcStep, Pvx32sc value, Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16sc_C3RSfs(const Pvx16sc* pSrc, int srcStep, const Pvx16sc value[3], Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16sc_AC4RSfs(const Pvx16sc* pSrc, int srcStep, const Pvx16sc value[3], Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_32sc_C3RSfs(const Pvx32sc* pSrc, int srcStep, const Pvx32sc value[3], Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_32sc_AC4RSfs(const Pvx32sc* pSrc, int srcStep, const Pvx32sc value[3], Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16sc_C1IRSfs(Pvx16sc value, Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_32sc_C1IRSfs(Pvx32sc value, Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16sc_C3IRSfs(const Pvx16sc value[3], Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_16sc_AC4IRSfs(const Pvx16sc value[3], Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_32sc_C3IRSfs(const Pvx32sc value[3], Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_32sc_AC4IRSfs(const Pvx32sc value[3], Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiMulC_32fc_C1R(const Pvx32fc* pSrc, int srcStep, Pvx32fc value, Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulC_32fc_C3R(const Pvx32fc* pSrc, int srcStep, const Pvx32fc value[3], Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulC_32fc_AC4R(const Pvx32fc* pSrc, int srcStep, const Pvx32fc value[3], Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulC_32fc_C1IR(Pvx32fc value, Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulC_32fc_C3IR(const Pvx32fc value[3], Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulC_32fc_AC4IR(const Pvx32fc value[3], Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);

/* ==== pointops/mulscale.api ==== */

/* ---- MulScale ---- */
/* MulScale: the integer part of pSrc1 * pSrc2 / M, M = 255 (8u) or 65535 (16u), truncated, not rounded: */
/* 255 * 255 gives 255, 128 * 1 gives 0. Checks pointers (-8), steps (-14), then sizes (-6). */
PVX_API PvxStatus pvxiMulScale_8u_C1R(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulScale_8u_C3R(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulScale_8u_C4R(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulScale_8u_AC4R(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulScale_16u_C1R(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulScale_16u_C3R(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulScale_16u_C4R(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulScale_16u_AC4R(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulScale_8u_C1IR(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulScale_8u_C3IR(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulScale_8u_C4IR(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulScale_8u_AC4IR(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulScale_16u_C1IR(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulScale_16u_C3IR(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulScale_16u_C4IR(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulScale_16u_AC4IR(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize);

/* ---- MulCScale ---- */
/* MulCScale: the integer part of pSrc * value / M, as MulScale; in place: pSrcDst * value / M. */
PVX_API PvxStatus pvxiMulCScale_8u_C1R(const Pvx8u* pSrc, int srcStep, Pvx8u value, Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulCScale_16u_C1R(const Pvx16u* pSrc, int srcStep, Pvx16u value, Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulCScale_8u_C3R(const Pvx8u* pSrc, int srcStep, const Pvx8u value[3], Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulCScale_8u_C4R(const Pvx8u* pSrc, int srcStep, const Pvx8u value[4], Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulCScale_8u_AC4R(const Pvx8u* pSrc, int srcStep, const Pvx8u value[3], Pvx8u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulCScale_16u_C3R(const Pvx16u* pSrc, int srcStep, const Pvx16u value[3], Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulCScale_16u_C4R(const Pvx16u* pSrc, int srcStep, const Pvx16u value[4], Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulCScale_16u_AC4R(const Pvx16u* pSrc, int srcStep, const Pvx16u value[3], Pvx16u* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulCScale_8u_C1IR(Pvx8u value, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulCScale_16u_C1IR(Pvx16u value, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulCScale_8u_C3IR(const Pvx8u value[3], Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulCScale_8u_C4IR(const Pvx8u value[4], Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulCScale_8u_AC4IR(const Pvx8u value[3], Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulCScale_16u_C3IR(const Pvx16u value[3], Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulCScale_16u_C4IR(const Pvx16u value[4], Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiMulCScale_16u_AC4IR(const Pvx16u value[3], Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize);

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
/* Kept values (AC4 alpha, other channels, pixels masked out) are read and stored back unchanged with */
/* the written ones, 16 bytes at a time: two calls that write different channels, or different */
/* masked pixels, of the same rows must not run at the same time. */
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

/* ==== pointops/sub.api ==== */

/* ---- Sub ---- */
/* Sub: src2 - src1 (second minus first, as callers rely on); in place: srcDst = srcDst - src. */
/* Real types check pointers and sizes only: steps are used as given (a zero step re-reads one row). */
/* Complex types check steps as well. Sfs: exact result times 2^-scaleFactor, rounded half to even, saturated. */
PVX_API PvxStatus pvxiSub_8u_C1RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_8u_C3RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_8u_C4RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_8u_AC4RSfs(const Pvx8u* pSrc1, int src1Step, const Pvx8u* pSrc2, int src2Step, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16u_C1RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16u_C3RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16u_C4RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16u_AC4RSfs(const Pvx16u* pSrc1, int src1Step, const Pvx16u* pSrc2, int src2Step, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16s_C1RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16s_C3RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16s_C4RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16s_AC4RSfs(const Pvx16s* pSrc1, int src1Step, const Pvx16s* pSrc2, int src2Step, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_8u_C1IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_8u_C3IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_8u_C4IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_8u_AC4IRSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16u_C1IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16u_C3IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16u_C4IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16u_AC4IRSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16s_C1IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16s_C3IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16s_C4IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16s_AC4IRSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_32f_C1R(const Pvx32f* pSrc1, int src1Step, const Pvx32f* pSrc2, int src2Step, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSub_32f_C3R(const Pvx32f* pSrc1, int src1Step, const Pvx32f* pSrc2, int src2Step, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSub_32f_C4R(const Pvx32f* pSrc1, int src1Step, const Pvx32f* pSrc2, int src2Step, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSub_32f_AC4R(const Pvx32f* pSrc1, int src1Step, const Pvx32f* pSrc2, int src2Step, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSub_32f_C1IR(const Pvx32f* pSrc, int srcStep, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSub_32f_C3IR(const Pvx32f* pSrc, int srcStep, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSub_32f_C4IR(const Pvx32f* pSrc, int srcStep, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSub_32f_AC4IR(const Pvx32f* pSrc, int srcStep, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSub_16sc_C1RSfs(const Pvx16sc* pSrc1, int src1Step, const Pvx16sc* pSrc2, int src2Step, Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16sc_C3RSfs(const Pvx16sc* pSrc1, int src1Step, const Pvx16sc* pSrc2, int src2Step, Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16sc_AC4RSfs(const Pvx16sc* pSrc1, int src1Step, const Pvx16sc* pSrc2, int src2Step, Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_32sc_C1RSfs(const Pvx32sc* pSrc1, int src1Step, const Pvx32sc* pSrc2, int src2Step, Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_32sc_C3RSfs(const Pvx32sc* pSrc1, int src1Step, const Pvx32sc* pSrc2, int src2Step, Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_32sc_AC4RSfs(const Pvx32sc* pSrc1, int src1Step, const Pvx32sc* pSrc2, int src2Step, Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16sc_C1IRSfs(const Pvx16sc* pSrc, int srcStep, Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16sc_C3IRSfs(const Pvx16sc* pSrc, int srcStep, Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_16sc_AC4IRSfs(const Pvx16sc* pSrc, int srcStep, Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_32sc_C1IRSfs(const Pvx32sc* pSrc, int srcStep, Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_32sc_C3IRSfs(const Pvx32sc* pSrc, int srcStep, Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_32sc_AC4IRSfs(const Pvx32sc* pSrc, int srcStep, Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSub_32fc_C1R(const Pvx32fc* pSrc1, int src1Step, const Pvx32fc* pSrc2, int src2Step, Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSub_32fc_C3R(const Pvx32fc* pSrc1, int src1Step, const Pvx32fc* pSrc2, int src2Step, Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSub_32fc_AC4R(const Pvx32fc* pSrc1, int src1Step, const Pvx32fc* pSrc2, int src2Step, Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSub_32fc_C1IR(const Pvx32fc* pSrc, int srcStep, Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSub_32fc_C3IR(const Pvx32fc* pSrc, int srcStep, Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSub_32fc_AC4IR(const Pvx32fc* pSrc, int srcStep, Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);

/* ---- SubC ---- */
/* SubC: src - value; in place: srcDst = srcDst - value. */
/* C3 and AC4 take 3 values, C4 takes 4; the value pointer is checked with the image pointers. */
PVX_API PvxStatus pvxiSubC_8u_C1RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u value, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16u_C1RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u value, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16s_C1RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s value, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_8u_C3RSfs(const Pvx8u* pSrc, int srcStep, const Pvx8u value[3], Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_8u_C4RSfs(const Pvx8u* pSrc, int srcStep, const Pvx8u value[4], Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_8u_AC4RSfs(const Pvx8u* pSrc, int srcStep, const Pvx8u value[3], Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16u_C3RSfs(const Pvx16u* pSrc, int srcStep, const Pvx16u value[3], Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16u_C4RSfs(const Pvx16u* pSrc, int srcStep, const Pvx16u value[4], Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16u_AC4RSfs(const Pvx16u* pSrc, int srcStep, const Pvx16u value[3], Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16s_C3RSfs(const Pvx16s* pSrc, int srcStep, const Pvx16s value[3], Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16s_C4RSfs(const Pvx16s* pSrc, int srcStep, const Pvx16s value[4], Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16s_AC4RSfs(const Pvx16s* pSrc, int srcStep, const Pvx16s value[3], Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_8u_C1IRSfs(Pvx8u value, Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16u_C1IRSfs(Pvx16u value, Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16s_C1IRSfs(Pvx16s value, Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_8u_C3IRSfs(const Pvx8u value[3], Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_8u_C4IRSfs(const Pvx8u value[4], Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_8u_AC4IRSfs(const Pvx8u value[3], Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16u_C3IRSfs(const Pvx16u value[3], Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16u_C4IRSfs(const Pvx16u value[4], Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16u_AC4IRSfs(const Pvx16u value[3], Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16s_C3IRSfs(const Pvx16s value[3], Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16s_C4IRSfs(const Pvx16s value[4], Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16s_AC4IRSfs(const Pvx16s value[3], Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_32f_C1R(const Pvx32f* pSrc, int srcStep, Pvx32f value, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSubC_32f_C3R(const Pvx32f* pSrc, int srcStep, const Pvx32f value[3], Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSubC_32f_C4R(const Pvx32f* pSrc, int srcStep, const Pvx32f value[4], Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSubC_32f_AC4R(const Pvx32f* pSrc, int srcStep, const Pvx32f value[3], Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSubC_32f_C1IR(Pvx32f value, Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSubC_32f_C3IR(const Pvx32f value[3], Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSubC_32f_C4IR(const Pvx32f value[4], Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSubC_32f_AC4IR(const Pvx32f value[3], Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSubC_16sc_C1RSfs(const Pvx16sc* pSrc, int srcStep, Pvx16sc value, Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_32sc_C1RSfs(const Pvx32sc* pSrc, int srcStep, Pvx32sc value, Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16sc_C3RSfs(const Pvx16sc* pSrc, int srcStep, const Pvx16sc value[3], Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16sc_AC4RSfs(const Pvx16sc* pSrc, int srcStep, const Pvx16sc value[3], Pvx16sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_32sc_C3RSfs(const Pvx32sc* pSrc, int srcStep, const Pvx32sc value[3], Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_32sc_AC4RSfs(const Pvx32sc* pSrc, int srcStep, const Pvx32sc value[3], Pvx32sc* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16sc_C1IRSfs(Pvx16sc value, Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_32sc_C1IRSfs(Pvx32sc value, Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16sc_C3IRSfs(const Pvx16sc value[3], Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_16sc_AC4IRSfs(const Pvx16sc value[3], Pvx16sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_32sc_C3IRSfs(const Pvx32sc value[3], Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_32sc_AC4IRSfs(const Pvx32sc value[3], Pvx32sc* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSubC_32fc_C1R(const Pvx32fc* pSrc, int srcStep, Pvx32fc value, Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSubC_32fc_C3R(const Pvx32fc* pSrc, int srcStep, const Pvx32fc value[3], Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSubC_32fc_AC4R(const Pvx32fc* pSrc, int srcStep, const Pvx32fc value[3], Pvx32fc* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSubC_32fc_C1IR(Pvx32fc value, Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSubC_32fc_C3IR(const Pvx32fc value[3], Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSubC_32fc_AC4IR(const Pvx32fc value[3], Pvx32fc* pSrcDst, int srcDstStep, PvxiSize roiSize);

/* ==== pointops/swapchannels.api ==== */

/* ---- SwapChannels ---- */
/* Destination channel i receives source channel dstOrder[i]; entries are checked as unsigned numbers (-60). */
/* C3R, C3IR: 3 entries 0..2. C4R, C4IR: 4 entries 0..3. AC4R: 3 entries 0..2, destination alpha never written. */
/* C3C4R: 4 entries 0..3; an entry of 3 leaves that destination channel as it was. C4C3R: 3 entries 0..3. */
/* pSrc == pDst works in place on the destination rows (dstStep), whatever srcStep is; for C3C4R and */
/* C4C3R each row holds the source pixels from its start and takes the destination pixels there. */
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

/* ==== pointops/unary.api ==== */

/* ---- Abs ---- */
/* Abs: |x|; the 16s value -32768 saturates to 32767. Checks pointers (-8), sizes (-6), steps (-14). */
PVX_API PvxStatus pvxiAbs_16s_C1R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAbs_16s_C3R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAbs_16s_C4R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAbs_16s_AC4R(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAbs_32f_C1R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAbs_32f_C3R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAbs_32f_C4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAbs_32f_AC4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAbs_16s_C1IR(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAbs_16s_C3IR(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAbs_16s_C4IR(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAbs_16s_AC4IR(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAbs_32f_C1IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAbs_32f_C3IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAbs_32f_C4IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiAbs_32f_AC4IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);

/* ---- Sqr ---- */
/* Sqr: x * x; integer members: times 2^-scaleFactor, rounded half to even, saturated. */
/* Checks pointers (-8), sizes (-6), steps (-14). */
PVX_API PvxStatus pvxiSqr_8u_C1RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_8u_C3RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_8u_C4RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_8u_AC4RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_16u_C1RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_16u_C3RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_16u_C4RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_16u_AC4RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_16s_C1RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_16s_C3RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_16s_C4RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_16s_AC4RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_8u_C1IRSfs(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_8u_C3IRSfs(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_8u_C4IRSfs(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_8u_AC4IRSfs(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_16u_C1IRSfs(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_16u_C3IRSfs(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_16u_C4IRSfs(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_16u_AC4IRSfs(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_16s_C1IRSfs(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_16s_C3IRSfs(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_16s_C4IRSfs(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_16s_AC4IRSfs(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqr_32f_C1R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSqr_32f_C3R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSqr_32f_C4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSqr_32f_AC4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSqr_32f_C1IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSqr_32f_C3IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSqr_32f_C4IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSqr_32f_AC4IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);

/* ---- Sqrt ---- */
/* Sqrt: the square root; integer members: the exact root times 2^-scaleFactor, rounded half to even, */
/* saturated; a negative 16s value gives 0. 32f: correctly rounded, NaN for negative values. */
/* Checks pointers (-8), sizes (-6), steps (-14); the 32f members check steps before sizes. */
PVX_API PvxStatus pvxiSqrt_8u_C1RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_8u_C3RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_8u_C4RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_8u_AC4RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_16u_C1RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_16u_C3RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_16u_C4RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_16u_AC4RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_16s_C1RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_16s_C3RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_16s_C4RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_16s_AC4RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_8u_C1IRSfs(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_8u_C3IRSfs(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_8u_C4IRSfs(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_8u_AC4IRSfs(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_16u_C1IRSfs(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_16u_C3IRSfs(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_16u_C4IRSfs(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_16u_AC4IRSfs(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_16s_C1IRSfs(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_16s_C3IRSfs(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_16s_C4IRSfs(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_16s_AC4IRSfs(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiSqrt_32f_C1R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSqrt_32f_C3R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSqrt_32f_C4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSqrt_32f_AC4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSqrt_32f_C1IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSqrt_32f_C3IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSqrt_32f_C4IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiSqrt_32f_AC4IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);

/* ---- Exp ---- */
/* Exp: e^x; integer members: times 2^-scaleFactor, rounded half to even, saturated. 32f: within 1 ulp */
/* of e^x for every input, whatever rounding the caller set. Checks pointers (-8), sizes (-6), steps (-14). */
PVX_API PvxStatus pvxiExp_8u_C1RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_8u_C3RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_8u_C4RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_8u_AC4RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_16u_C1RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_16u_C3RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_16u_C4RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_16u_AC4RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_16s_C1RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_16s_C3RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_16s_C4RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_16s_AC4RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_8u_C1IRSfs(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_8u_C3IRSfs(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_8u_C4IRSfs(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_8u_AC4IRSfs(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_16u_C1IRSfs(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_16u_C3IRSfs(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_16u_C4IRSfs(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_16u_AC4IRSfs(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_16s_C1IRSfs(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_16s_C3IRSfs(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_16s_C4IRSfs(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_16s_AC4IRSfs(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiExp_32f_C1R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiExp_32f_C3R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiExp_32f_C4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiExp_32f_AC4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiExp_32f_C1IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiExp_32f_C3IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiExp_32f_C4IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiExp_32f_AC4IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);

/* ---- Ln ---- */
/* Ln: the natural logarithm; integer members: times 2^-scaleFactor, rounded half to even, saturated; */
/* ln 0 gives the type's minimum (0 unsigned), a negative 16s value gives 0. 32f: within 1 ulp of ln x */
/* for every input, whatever rounding the caller set; NaN for negative values. A call that met a 0 */
/* (whose logarithm is a pole, as a division by zero) returns pvxStsDivByZero (6). */
/* Checks pointers (-8), sizes (-6), steps (-14). */
PVX_API PvxStatus pvxiLn_8u_C1RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_8u_C3RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_8u_C4RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_8u_AC4RSfs(const Pvx8u* pSrc, int srcStep, Pvx8u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_16u_C1RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_16u_C3RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_16u_C4RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_16u_AC4RSfs(const Pvx16u* pSrc, int srcStep, Pvx16u* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_16s_C1RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_16s_C3RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_16s_C4RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_16s_AC4RSfs(const Pvx16s* pSrc, int srcStep, Pvx16s* pDst, int dstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_8u_C1IRSfs(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_8u_C3IRSfs(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_8u_C4IRSfs(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_8u_AC4IRSfs(Pvx8u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_16u_C1IRSfs(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_16u_C3IRSfs(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_16u_C4IRSfs(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_16u_AC4IRSfs(Pvx16u* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_16s_C1IRSfs(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_16s_C3IRSfs(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_16s_C4IRSfs(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_16s_AC4IRSfs(Pvx16s* pSrcDst, int srcDstStep, PvxiSize roiSize, int scaleFactor);
PVX_API PvxStatus pvxiLn_32f_C1R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiLn_32f_C3R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiLn_32f_C4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiLn_32f_AC4R(const Pvx32f* pSrc, int srcStep, Pvx32f* pDst, int dstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiLn_32f_C1IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiLn_32f_C3IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiLn_32f_C4IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);
PVX_API PvxStatus pvxiLn_32f_AC4IR(Pvx32f* pSrcDst, int srcDstStep, PvxiSize roiSize);

/* ---- Complement ---- */
/* Complement: converts between two's complement and sign-magnitude (its own inverse on every value but */
/* INT_MIN): a negative x becomes INT_MIN - x (its magnitude with the sign bit set); INT_MIN becomes 0. */
/* Checks the pointer (-8), sizes (-6), the step (-14). */
PVX_API PvxStatus pvxiComplement_32s_C1IR(Pvx32s* pSrcDst, int srcDstStep, PvxiSize roiSize);

#ifdef __cplusplus
}
#endif

#endif /* PVXI_H */
