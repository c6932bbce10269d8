/* pvxtypes.h: pixel types, records, status values and the shared enumerations
 * of pvx. Compiles as C99 and as C++. */
#ifndef PVXTYPES_H
#define PVXTYPES_H

#include <stdint.h>

#if defined(__GNUC__)
#define PVX_API __attribute__((visibility("default")))
#else
#define PVX_API
#endif

#ifdef __cplusplus
extern "C" {
#endif

/* ---- pixel types ---- */
typedef uint8_t  Pvx8u;
typedef int8_t   Pvx8s;
typedef uint16_t Pvx16u;
typedef int16_t  Pvx16s;
typedef uint32_t Pvx32u;
typedef int32_t  Pvx32s;
typedef int64_t  Pvx64s;
typedef uint64_t Pvx64u;
typedef float    Pvx32f;
typedef double   Pvx64f;

/* complex: real part then imaginary part */
typedef struct { Pvx16s re; Pvx16s im; } Pvx16sc;
typedef struct { Pvx32s re; Pvx32s im; } Pvx32sc;
typedef struct { Pvx32f re; Pvx32f im; } Pvx32fc;
typedef struct { Pvx64f re; Pvx64f im; } Pvx64fc;

/* ---- records (all fields signed 32-bit) ---- */
typedef struct { int width; int height; } PvxiSize;
typedef struct { int x; int y; int width; int height; } PvxiRect;
typedef struct { int x; int y; } PvxiPoint;

/* ---- status: 0 success, negative error (nothing written), positive warning ---- */
typedef int PvxStatus;

enum PvxStatusValue {
    pvxStsNotSupportedModeErr      = -9999, /* valid arguments this library does not serve */
    pvxStsWarpDirectionErr         = -231,  /* warp direction not 0 or 1 */
    pvxStsOddOffsetErr             = -227,  /* an x offset or width must be even */
    pvxStsBorderErr                = -225,  /* border type not served by this function */
    pvxStsRoundModeNotSupportedErr = -213,  /* rounding mode not 0, 1 or 2, or not served */
    pvxStsWeightErr                = -211,  /* median centre weight below 1 */
    pvxStsQualityIndexErr          = -210,  /* quality index undefined for flat images */
    pvxStsResizeTooSmallErr        = -201,  /* destination too small for the resize method */
    pvxStsNoiseValErr              = -125,  /* Wiener noise parameter out of range */
    pvxStsNotEvenStepErr           = -108,  /* step not a multiple of the element size */
    pvxStsHistoNofLevelsErr        = -107,  /* histogram with fewer than 2 levels */
    pvxStsLUTNofLevelsErr          = -106,  /* look-up table with fewer than 2 levels */
    pvxStsChannelOrderErr          = -60,   /* channel-order entry out of range */
    pvxStsZeroMaskValuesErr        = -59,   /* every mask value is zero */
    pvxStsCoeffErr                 = -58,   /* transform coefficients are singular */
    pvxStsRectErr                  = -57,   /* rectangle is degenerate */
    pvxStsQuadErr                  = -56,   /* quadrangle is degenerate */
    pvxStsNumChannelsErr           = -53,   /* channel count not served by Init/GetSize */
    pvxStsDivisorErr               = -51,   /* integer filter divisor is zero */
    pvxStsAlphaTypeErr             = -50,   /* alpha-composition code not supported */
    pvxStsChannelErr               = -47,   /* channel count or index out of range */
    pvxStsStrideErr                = -37,   /* step too small for row plus border */
    pvxStsEpsValErr                = -36,   /* tolerance is negative */
    pvxStsAnchorErr                = -34,   /* anchor lies outside the mask */
    pvxStsMaskSizeErr              = -33,   /* mask size invalid */
    pvxStsResizeFactorErr          = -23,   /* resize factor out of range */
    pvxStsInterpolationErr         = -22,   /* interpolation code not supported */
    pvxStsMirrorFlipErr            = -21,   /* flip axis not 0, 1 or 2 */
    pvxStsMoment00ZeroErr          = -20,   /* zero-order moment too small */
    pvxStsThresholdErr             = -18,   /* upper threshold below the lower */
    pvxStsContextMatchErr          = -17,   /* spec object of another kind */
    pvxStsFftFlagErr               = -16,   /* normalisation flag not served */
    pvxStsFftOrderErr              = -15,   /* FFT order out of range */
    pvxStsStepErr                  = -14,   /* step below 1 or too small for the row */
    pvxStsScaleRangeErr            = -13,   /* value range is empty */
    pvxStsDataTypeErr              = -12,   /* pixel-type code not supported */
    pvxStsOutOfRangeErr            = -11,   /* offset or point outside the image */
    pvxStsDivByZeroErr             = -10,   /* constant divisor is zero */
    pvxStsMemAllocErr              = -9,    /* work buffer could not be allocated */
    pvxStsNullPtrErr               = -8,    /* a required pointer is null */
    pvxStsRangeErr                 = -7,    /* bounds or levels out of order */
    pvxStsSizeErr                  = -6,    /* width or height below 1, or size out of range */
    pvxStsBadArgErr                = -5,    /* argument outside its accepted set */
    pvxStsNoErr                    = 0,     /* success */
    pvxStsNoOperation              = 1,     /* warning: nothing to do, nothing written */
    pvxStsDivByZero                = 6,     /* warning: a divisor was zero, defined value written */
    pvxStsNoIntersection           = 29,    /* warning: region outside the source, nothing written */
    pvxStsEvenMedianWeight         = 39,    /* warning: an even weight was reduced by one */
    pvxStsSizeWrn                  = 48     /* warning: result completed in a reduced form */
};

/* ---- shared enumerations (integer arguments; values fixed) ---- */
typedef enum {
    pvxRndTowardZero  = 0, /* truncate toward zero */
    pvxRndNearestEven = 1, /* nearest, ties to even */
    pvxRndHalfAway    = 2  /* nearest, ties away from zero */
} PvxRoundMode;

/* the mask's two extents as decimal digits */
typedef enum {
    pvxMskSize1x3 = 13,
    pvxMskSize1x5 = 15,
    pvxMskSize3x1 = 31,
    pvxMskSize5x1 = 51,
    pvxMskSize3x3 = 33,
    pvxMskSize5x5 = 55
} PvxiMaskSize;

typedef enum {
    pvxCmpLess      = 0,
    pvxCmpLessEq    = 1,
    pvxCmpEq        = 2,
    pvxCmpGreaterEq = 3,
    pvxCmpGreater   = 4
} PvxCmpOp;

/* Mirror axes. pvxAxsDiagonal (3) is the main diagonal: destination (x, y) is
 * source (y, x). pvxAxsAntiDiagonal (4) is the other one: destination (x, y)
 * is source (W-1-y, H-1-x) for a W x H source (an H x W destination). The
 * diagonals are served by the one-channel not-in-place Mirror members only. */
typedef enum {
    pvxAxsHorizontal   = 0, /* top and bottom exchanged */
    pvxAxsVertical     = 1, /* left and right exchanged */
    pvxAxsBoth         = 2, /* a turn by 180 degrees */
    pvxAxsDiagonal     = 3,
    pvxAxsAntiDiagonal = 4
} PvxiAxis;

/* Low four bits: the border kind; bits 4 to 7: the border pixels on that side
 * are already in memory. */
typedef enum {
    pvxBorderConst       = 0, /* the caller's border value */
    pvxBorderRepl        = 1, /* the nearest edge pixel */
    pvxBorderMirror      = 3, /* reflection about the edge pixel */
    pvxBorderMirrorR     = 4, /* reflection with the edge pixel repeated */
    pvxBorderInMem       = 6, /* every pixel read around the region exists */
    pvxBorderInMemTop    = 0x0010,
    pvxBorderInMemBottom = 0x0020,
    pvxBorderInMemLeft   = 0x0040,
    pvxBorderInMemRight  = 0x0080
} PvxiBorderType;

typedef enum {
    pvxNearest = 1,
    pvxLinear  = 2,
    pvxCubic   = 6,
    pvxSuper   = 8,
    pvxLanczos = 16
} PvxiInterpolation;

typedef enum {
    pvxWarpForward  = 0,
    pvxWarpBackward = 1
} PvxiWarpDirection;

typedef enum {
    pvxHintDefault  = 0,
    pvxHintFast     = 1,
    pvxHintAccurate = 2 /* 32f sums in double precision; any other value is the fast path */
} PvxAccuracyHint;

typedef enum {
    pvx8u  = 1,
    pvx16u = 5,
    pvx16s = 7,
    pvx32f = 13,
    pvx64f = 19
} PvxDataType;

typedef struct {
    int left;
    int top;
    int right;
    int bottom;
} PvxiBorderSize;

/* Spec objects are laid out for x86-64. Where a head holds pointers it is
 * larger than on a 32-bit platform: the histogram spec's head (data type,
 * channels, uniform flag, identifier, four level counts, four level-array
 * pointers) is 64 bytes here, not 48, so its size is 64 + 4 x (sum of
 * nLevels over the channels). */

/* The version record; constant for the life of the process. */
typedef struct {
    int majorVersion;
    int minorVersion;
    int updateVersion;
    int buildNumber;
    char cpuTag[4];          /* "p8" and two zero bytes */
    const char* name;
    const char* versionText;
    const char* buildDate;
} PvxVersionRecord;

#ifdef __cplusplus
}
#endif

#endif /* PVXTYPES_H */
