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
/* Exp: e^x; integer members: times 2^-scaleFactor, rounded half to even, saturated. 32f: expf of each */
/* element. Checks pointers (-8), sizes (-6), steps (-14). */
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
/* ln 0 gives the type's minimum (0 unsigned), a negative 16s value gives 0. 32f: logf of each element. */
/* A call that met a 0 returns pvxStsDivByZero (6). Checks pointers (-8), sizes (-6), steps (-14). */
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
