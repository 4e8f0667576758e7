/*
 * zoxcc: colour-conversion primitives for raster images.
 *
 * Every conversion takes row pointers, byte steps and a region size, converts the region and returns
 * a zoxStatus: 0 success, negative an error (nothing written), positive a warning that comes with a
 * finished result. The library keeps no state, opens no files, starts no threads and prints nothing.
 *
 * Conventions shared by all conversions:
 *  - A step is the signed distance in bytes between the first pixels of two adjacent rows; row r
 *    starts at the pointer plus r times the step. Zero and negative steps are legal and walk rows as
 *    told (only the families that say so reject steps below 1).
 *  - Planar sides pass an array of plane pointers; one step serves all planes of a side.
 *  - Arguments are checked before anything is written: pointers, then sizes, then the rest, unless a
 *    family says otherwise below.
 *  - Many row kernels treat whole blocks of N pixels (counted from the row's first pixel) in a block
 *    form and the pixels behind the last whole block in a remainder form; the two can differ by one
 *    unit, so a pixel's value may depend on its column and on the width. Each family below says N.
 *
 * This header compiles as C and as C++.
 */
#ifndef ZOXCC_H
#define ZOXCC_H

#include <stdint.h>

#if defined(__GNUC__)
#define ZOXCC_API __attribute__((visibility("default")))
#else
#define ZOXCC_API
#endif

#ifdef __cplusplus
extern "C" {
#endif

/* ---- Status codes ---------------------------------------------------------------------------- */

typedef int32_t zoxStatus;

enum {
    zoxStatusOk = 0,
    zoxWarnNoOperation = 1,      /* nothing done, and no error (tone mapping of a negative source) */
    zoxWarnOddSize = 35,         /* done on the part of the region its chroma sampling covers */
    zoxStatusBadArgument = -5,   /* a CfaGrid outside 0..3 */
    zoxStatusBadSize = -6,       /* width or height below the minimum, or another size out of range */
    zoxStatusNullPointer = -8,   /* a pointer argument or an element of a pointer array is null */
    zoxStatusNoMemory = -9,      /* a working buffer could not be allocated; destination untouched */
    zoxStatusBadStep = -14,      /* a step below 1, where the family checks steps */
    zoxStatusBadRange = -49,     /* the upper range limit is not above the lower one */
    zoxStatusBadDitherLevels = -54,
    zoxStatusBadNoise = -55,
    zoxStatusBadDitherKind = -224
};

/* ---- Shared records ------------------------------------------------------------------------------ */

/* A region of width by height pixels, passed by value. */
typedef struct ImageSize {
    int32_t width;
    int32_t height;
} ImageSize;

typedef struct ImageRect {
    int32_t x;
    int32_t y;
    int32_t width;
    int32_t height;
} ImageRect;

/* The version record: constant data that lives as long as the library. */
typedef struct LibraryVersion {
    int32_t major;
    int32_t minor;
    int32_t update;
    int32_t revision;
    char targetCode[4];       /* "p8" and two zero bytes */
    const char* name;
    const char* versionText;
    const char* buildDate;
} LibraryVersion;

/* Dither method of the bit-depth reduction functions. */
typedef int32_t DitherKind;
enum {
    PlainQuantise = 0,
    FloydSteinbergDiffusion = 1,
    JarvisJudiceNinkeDiffusion = 2,
    StuckiDiffusion = 3,
    OrderedMatrix4x4 = 4
};

/* Colour layout of the 2x2 Bayer mosaic, anchored at the origin of the whole image:
 * row 0 even/odd column, then row 1 even/odd column. */
typedef int32_t CfaGrid;
enum {
    GridBlueGreen = 0, /* B G / G R */
    GridRedGreen = 1,  /* R G / G B */
    GridGreenBlue = 2, /* G B / R G */
    GridGreenRed = 3   /* G R / B G */
};

/* ---- Version --------------------------------------------------------------------------------------- */

/* Returns the version record; the record's name ends in "+" when the core services report feature 128
 * (AVX2, with the operating system saving its register state). The library holds SSE4.1 and AVX2
 * kernels of the same bytes and chooses once, while it loads, from the same feature word: the "+"
 * record names exactly the processors that run the AVX2 kernels. */
ZOXCC_API const LibraryVersion* zoxccGetLibVersion(void);

/* ---- RGB <-> YUV, 8u, full resolution ----------------------------------------------------------------
 * Y = 0.299 R + 0.587 G + 0.114 B over the full range; U = 0.492 (B - Y) + 128, V = 0.877 (R - Y) + 128.
 * C3: R,G,B (forward source) or Y,U,V (inverse source), lowest address first. AC4R: the destination's
 * fourth byte is neither read nor written. AC4P4R: the source's fourth byte goes to plane 4 unchanged.
 * C3C4R: alpha fills the fourth byte. Block widths N: RGBToYUV C3R 16, C3P3R 8, AC4P4R 8, P3R 16;
 * YUVToRGB C3R 8, C3C4R 8, P3C3R 16; the AC4R forms and YUVToRGB P3R use one form in all columns.
 * Checks: src/dst null, then sizes, then each plane pointer. Steps are not examined. */
ZOXCC_API zoxStatus zoxiRGBToYUV_8u_C3R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYUV_8u_AC4R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYUV_8u_C3P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYUV_8u_AC4P4R(const uint8_t* src, int srcStep, uint8_t* const dst[4], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYUV_8u_P3R(const uint8_t* const src[3], int srcStep, uint8_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUVToRGB_8u_C3R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUVToRGB_8u_AC4R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUVToRGB_8u_C3C4R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);
ZOXCC_API zoxStatus zoxiYUVToRGB_8u_P3C3R(const uint8_t* const src[3], int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUVToRGB_8u_P3R(const uint8_t* const src[3], int srcStep, uint8_t* const dst[3], int dstStep, ImageSize roiSize);

/* ---- RGB <-> YCbCr, 8u, full resolution --------------------------------------------------------------
 * Studio range: Y 16..235, Cb and Cr 16..240 around 128; BT.601 weights, BT.709 in the 709CSC forms.
 * C3: R,G,B (forward source) or Y,Cb,Cr (inverse source), lowest address first; YCbCrToBGR writes
 * B,G,R. AC4R: the destination's fourth byte is neither read nor written. AC4P3R: the source's fourth
 * byte is not used. P3C4R: alpha fills the fourth byte. Block widths N: RGBToYCbCr C3R 16, C3P3R 16,
 * AC4P3R 8, P3R 8; YCbCrToRGB C3R 4, P3R 4, P3C3R 8, P3C4R 8; the AC4R forms and the four YCbCrToBGR
 * forms use one form in all columns. Checks: C3R and AC4R forms: src/dst null, then sizes. RGBToYCbCr
 * C3P3R and AC4P3R and the YCbCrToBGR forms: src/dst and each plane pointer, then sizes. The other P3
 * forms: src/dst null, then sizes, then each plane pointer. Steps are not examined. */
ZOXCC_API zoxStatus zoxiRGBToYCbCr_8u_C3R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCbCr_8u_AC4R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCbCr_8u_C3P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCbCr_8u_AC4P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCbCr_8u_P3R(const uint8_t* const src[3], int srcStep, uint8_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToRGB_8u_C3R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToRGB_8u_AC4R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToRGB_8u_P3R(const uint8_t* const src[3], int srcStep, uint8_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToRGB_8u_P3C3R(const uint8_t* const src[3], int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToRGB_8u_P3C4R(const uint8_t* const src[3], int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);
ZOXCC_API zoxStatus zoxiYCbCrToBGR_8u_P3C3R(const uint8_t* const src[3], int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToBGR_8u_P3C4R(const uint8_t* const src[3], int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);
ZOXCC_API zoxStatus zoxiYCbCrToBGR_709CSC_8u_P3C3R(const uint8_t* const src[3], int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToBGR_709CSC_8u_P3C4R(const uint8_t* const src[3], int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);

/* ---- RGB to chroma-sampled YCbCr and YUV, 8u: 4:2:0, 4:2:2, 4:1:1 --------------------------------------
 * roiSize counts luma pixels. Chroma comes from the sums of each channel over a unit (4:2:0: 2x2 pixels,
 * 4:2:2: 2x1, 4:1:1: 4x1); the CbYCr422 RGB members filter with taps 1/4, 1/2, 1/4 instead (the first
 * pair of a row has no left neighbour), the Gamma one after the BT.709 forward table. BGR names read B,G,R;
 * C4 and AC4 sources leave the fourth byte unread.
 * Layouts: P3 three planes Y, Cb, Cr (YCrCb names: Y, Cr, Cb, with dstStep in the same order); chroma
 * planes 4:2:0 width/2 x height/2, 4:2:2 width/2 x height, 4:1:1 width/4 x height. P2: Y, then Cb,Cr pairs.
 * C2: 4 bytes for 2 pixels, YCbCr422 and YUV422 Y0 Cb Y1 Cr, YCrCb422 Y0 Cr Y1 Cb, CbYCr422 Cb Y0 Cr Y1.
 * Matrix and range: YUV full range (BT.601 analogue weights); YCbCr studio range BT.601, 709CSC studio
 * BT.709, 709HDTV full-range BT.709 with every sample held to 1..254.
 * Each member's block form runs on the units that start before its limit column and a remainder form
 * on the rest (values differ by a unit at most).
 * Odd sizes: 4:2:0 converts whole 2x2 units only; a last odd row and column are left untouched, and a
 * region one pixel wide or high writes nothing. 4:2:2 last odd pixel: YUV422 C3C2R Y and U; YUV422 P3
 * forms Y, U, V; BGRToYCbCr422 C2R Y and Cb, P3R Y only; RGBToYCbCr422 C3P3R nothing; RGBToYCbCr422 and
 * RGBToYCrCb422 C2R Y and its group's second byte; CbYCr422 Cb and Y. 4:1:1: BGRToYCbCr411 AC4P3R gives
 * the up to 3 pixels behind the last unit luma only, C3P3R nothing.
 * Without R: packed planes, source rows of width pixels, destination steps width and width/2 (4:2:2:
 * width/2 rounded up); a 4:2:2 image of even width and 256 pixels or more is converted as one row.
 * RGBToYUV422_8u_C3P3R: rows whose four pointers and steps are multiples of 16 take their own forms.
 * Minimum sizes: BGRToYCbCr420/BGRToYCrCb420 (all) and RGBToYCrCb420 2x2, 4:1:1 width 4, RGBToYCbCr422
 * C3P3R and BGRToYCbCr422 width 2, others 1x1. zoxWarnOddSize with the finished result: 4:2:0 width or
 * height odd; 4:1:1 width not a multiple of 4; RGBToYCbCr422_8u_C3P3R width odd.
 * Checks: every pointer (array elements included), then sizes; RGBToYUV420, RGBToYUV422,
 * BGRToYUV420_AC4P3R, RGBToYCbCr420_8u_C3P3R and the two P3C2R members: src and dst, sizes, then the
 * array elements. Steps are not examined. */
ZOXCC_API zoxStatus zoxiRGBToYUV420_8u_C3P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYUV420_8u_C3P3(const uint8_t* src, uint8_t* const dst[3], ImageSize imageSize);
ZOXCC_API zoxStatus zoxiRGBToYUV420_8u_P3R(const uint8_t* const src[3], int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYUV420_8u_P3(const uint8_t* const src[3], uint8_t* const dst[3], ImageSize imageSize);
ZOXCC_API zoxStatus zoxiBGRToYUV420_8u_AC4P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCbCr420_8u_C3P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCbCr420_8u_C3P2R(const uint8_t* src, int srcStep, uint8_t* dstY, int dstYStep, uint8_t* dstCbCr, int dstCbCrStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCbCr420_8u_C4P2R(const uint8_t* src, int srcStep, uint8_t* dstY, int dstYStep, uint8_t* dstCbCr, int dstCbCrStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToYCbCr420_8u_C3P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToYCbCr420_8u_AC4P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToYCrCb420_8u_C3P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToYCrCb420_8u_AC4P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCrCb420_8u_AC4P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToYCbCr420_709CSC_8u_C3P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToYCbCr420_709CSC_8u_AC4P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToYCrCb420_709CSC_8u_C3P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToYCrCb420_709CSC_8u_AC4P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToYCbCr420_709CSC_8u_C3P2R(const uint8_t* src, int srcStep, uint8_t* dstY, int dstYStep, uint8_t* dstCbCr, int dstCbCrStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToYCbCr420_709HDTV_8u_AC4P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToYCbCr411_8u_AC4P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToYCbCr411_8u_C3P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYUV422_8u_C3C2R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYUV422_8u_C3P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYUV422_8u_C3P3(const uint8_t* src, uint8_t* const dst[3], ImageSize imageSize);
ZOXCC_API zoxStatus zoxiRGBToYUV422_8u_P3R(const uint8_t* const src[3], int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYUV422_8u_P3(const uint8_t* const src[3], uint8_t* const dst[3], ImageSize imageSize);
ZOXCC_API zoxStatus zoxiBGRToYCbCr422_8u_C3C2R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToYCbCr422_8u_AC4C2R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToYCbCr422_8u_C3P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToYCbCr422_8u_AC4P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCbCr422_8u_C3P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCbCr422_8u_C3C2R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCbCr422_8u_P3C2R(const uint8_t* const src[3], int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCrCb422_8u_C3C2R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCrCb422_8u_P3C2R(const uint8_t* const src[3], int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToCbYCr422_8u_AC4C2R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToCbYCr422_709HDTV_8u_AC4C2R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToCbYCr422_709HDTV_8u_C3C2R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToCbYCr422_8u_C3C2R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToCbYCr422Gamma_8u_C3C2R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);

/* ---- Chroma-sampled YCbCr and YUV to RGB, 8u: 4:2:0, 4:2:2, 4:1:1 --------------------------------------
 * roiSize counts luma pixels. Chroma is replicated: every pixel of a unit (4:2:0: 2x2, 4:2:2: 2x1, 4:1:1:
 * 4x1) takes the unit's Cb and Cr unchanged. BGR names write B,G,R; C4 writes alpha fourth, AC4 writes 0;
 * P3 destinations (P3R, C2P3R) are R, G, B planes with one step.
 * Sources: P3 three planes Y, Cb, Cr (YCrCb names: Y, Cr, Cb, srcStep in the same order); chroma planes
 * 4:2:0 width/2 x height/2, 4:2:2 (width+1)/2 x height, 4:1:1 width/4 x height. P2: Y, then Cb,Cr pairs
 * (YCrCb names: Cr,Cb). C2: 4 bytes for 2 pixels, YCbCr422 and YUV422 Y0 Cb Y1 Cr, YCrCb422 Y0 Cr Y1 Cb,
 * CbYCr422 Cb Y0 Cr Y1.
 * Matrix and range: YUV full range (BT.601 analogue weights); YCbCr studio range BT.601, 709CSC studio
 * BT.709, 709HDTV full-range BT.709. Pixels before each member's limit column take its block form, the
 * others a remainder form (values differ by a unit at most).
 * Odd sizes: 4:2:0 converts whole 2x2 units only (a last odd row and column are left untouched, a region
 * one pixel wide or high writes nothing). C2, odd width: the last pixel takes its own chroma byte and the
 * other from the group before (width 1: its one byte as both). P3 4:2:2, odd width: the last pixel takes
 * its own samples (YCbCr422ToBGR_8u_P3C3R leaves it). 4:1:1: the up to 3 pixels behind the last unit
 * take that unit's chroma.
 * YCbCr420ToBGR_8u_P3C3R and YCbCr422ToRGB_8u_P3C3R: rows whose pointers and steps are all multiples of 16
 * take their own block form, which may differ by a unit from the others'.
 * Without R: packed planes, source steps width and width/2 (4:2:2: width/2 rounded up), destination
 * steps width (P3) or 3 width; a 4:2:2 image of even width and 256 pixels or more is converted as one row.
 * Minimum sizes: YCbCr411 width 4, YCbCr422ToBGR (C2C3R, C2C4R, P3C3R) width 2, YUV420ToBGR 2x2, others
 * 1x1. zoxWarnOddSize with the finished result: 4:2:0 width or height odd.
 * Checks: src and dst, sizes, then array elements; YCbCr411 and YCbCr422ToBGR_8u_P3C3R every pointer
 * (elements included) first; the two YCrCb420 P2C4R members sizes first. Steps are not examined. */
ZOXCC_API zoxStatus zoxiYCbCr420ToBGR_8u_P2C3R(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToBGR_8u_P2C4R(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);
ZOXCC_API zoxStatus zoxiYCbCr420ToRGB_8u_P2C3R(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToRGB_8u_P2C4R(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);
ZOXCC_API zoxStatus zoxiYCbCr420ToBGR_8u_P3C4R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);
ZOXCC_API zoxStatus zoxiYCrCb420ToBGR_8u_P2C3R(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCrCb420ToBGR_8u_P2C4R(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);
ZOXCC_API zoxStatus zoxiYCrCb420ToRGB_8u_P2C3R(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCrCb420ToRGB_8u_P2C4R(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);
ZOXCC_API zoxStatus zoxiYCbCr420ToBGR_8u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToRGB_8u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCrCb420ToRGB_8u_P3C4R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);
ZOXCC_API zoxStatus zoxiYCbCr420ToBGR_709CSC_8u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToBGR_709HDTV_8u_P3C4R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);
ZOXCC_API zoxStatus zoxiYUV420ToBGR_8u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUV420ToRGB_8u_P3R(const uint8_t* const src[3], const int srcStep[3], uint8_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUV420ToRGB_8u_P3(const uint8_t* const src[3], uint8_t* const dst[3], ImageSize imageSize);
ZOXCC_API zoxStatus zoxiYUV420ToRGB_8u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUV420ToRGB_8u_P3C3(const uint8_t* const src[3], uint8_t* dst, ImageSize imageSize);
ZOXCC_API zoxStatus zoxiYUV420ToRGB_8u_P3AC4R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToRGB_8u_C2C4R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);
ZOXCC_API zoxStatus zoxiYCrCb422ToRGB_8u_C2C4R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);
ZOXCC_API zoxStatus zoxiYCrCb422ToBGR_8u_C2C4R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);
ZOXCC_API zoxStatus zoxiYCrCb422ToRGB_8u_C2C3R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCrCb422ToBGR_8u_C2C3R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToBGR_8u_C2C3R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToBGR_8u_C2C4R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);
ZOXCC_API zoxStatus zoxiYCbCr422ToRGB_8u_C2C3R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToRGB_8u_C2P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCrCb422ToRGB_8u_C2P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiCbYCr422ToBGR_709HDTV_8u_C2C3R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiCbYCr422ToBGR_709HDTV_8u_C2C4R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);
ZOXCC_API zoxStatus zoxiCbYCr422ToBGR_8u_C2C4R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);
ZOXCC_API zoxStatus zoxiCbYCr422ToRGB_8u_C2C3R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToBGR_8u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToRGB_8u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUV422ToRGB_8u_C2C3R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUV422ToRGB_8u_P3R(const uint8_t* const src[3], const int srcStep[3], uint8_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUV422ToRGB_8u_P3(const uint8_t* const src[3], uint8_t* const dst[3], ImageSize imageSize);
ZOXCC_API zoxStatus zoxiYUV422ToRGB_8u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUV422ToRGB_8u_P3C3(const uint8_t* const src[3], uint8_t* dst, ImageSize imageSize);
ZOXCC_API zoxStatus zoxiYUV422ToRGB_8u_P3AC4R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr411ToBGR_8u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr411ToBGR_8u_P3C4R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);

/* ---- Repacking of chroma-sampled images, 8u: among 4:2:2, 4:2:0, 4:1:1, groups, pairs and planes -------
 * No arithmetic: every output sample is a copy of one input sample. Chroma is thinned by dropping
 * (4:2:2 to 4:2:0: the even rows; 4:2:2 to 4:1:1: the even samples) and widened by repeating (4:2:0 to
 * 4:2:2: each row twice; 4:1:1 to 4:2:2: each sample twice). 4:1:1 to 4:2:0 folds two chroma rows into
 * one (samples alternate between them), 4:2:0 to 4:1:1 unfolds one row into two: exact inverses.
 * Layouts: C2 4 bytes for 2 pixels (YCbCr422 Y0 Cb Y1 Cr, YCrCb422 Y0 Cr Y1 Cb, CbYCr422 Cb Y0 Cr Y1);
 * P3 planes Y, Cb, Cr (YCrCb names: Y, Cr, Cb); P2 Y and Cb,Cr pairs. Chroma planes: 4:2:2 width/2 x
 * height, 4:2:0 width/2 x height/2, 4:1:1 width/4 x height.
 * Region in use: width rounded down to 4 with 4:1:1 on either side (else to 2), height rounded down to 2
 * with 4:2:0 on either side; nothing beyond it is read or written, and no warning is given.
 * zoxiYCbCr420ToYCrCb420_8u_P2P3R writes each pair's first byte to the second plane, like
 * zoxiYCbCr420_8u_P2P3R.
 * Checks: every pointer (array elements included), then the sizes: 2x2 for members with 4:2:0 (4x2 with
 * 4:1:1 on the other side), 2x1 for 4:2:2 copies, width 4 for the 4:1:1 ones with 4:2:2 or 4:1:1 (height
 * not examined: 0 or below converts nothing) but YCbCr422ToYCbCr411_8u_C2P3R (4x1), width 2 for
 * YCbCr422ToYCrCb422 (height not examined); YCbCr420ToYCrCb420_8u_P2P3R: srcY, srcCbCr, dst, then a size
 * below 1, then the planes, then 2x2. Steps are not examined. */
ZOXCC_API zoxStatus zoxiCbYCr422ToYCbCr411_8u_C2P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiCbYCr422ToYCbCr420_8u_C2P2R(const uint8_t* src, int srcStep, uint8_t* dstY, int dstYStep, uint8_t* dstCbCr, int dstCbCrStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiCbYCr422ToYCbCr420_8u_C2P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiCbYCr422ToYCbCr422_8u_C2P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiCbYCr422ToYCbCr422_8u_C2R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiCbYCr422ToYCrCb420_8u_C2P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr411ToYCbCr420_8u_P2P3R(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr411ToYCbCr420_8u_P3P2R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dstY, int dstYStep, uint8_t* dstCbCr, int dstCbCrStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr411ToYCbCr420_8u_P3R(const uint8_t* const src[3], const int srcStep[3], uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr411ToYCrCb420_8u_P2P3R(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr411ToYCbCr422_8u_P2C2R(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr411ToYCbCr422_8u_P2P3R(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr411ToYCbCr422_8u_P3C2R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr411ToYCbCr422_8u_P3R(const uint8_t* const src[3], const int srcStep[3], uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr411ToYCrCb422_8u_P3C2R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr411ToYCrCb422_8u_P3R(const uint8_t* const src[3], const int srcStep[3], uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr411_8u_P2P3R(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr411_8u_P3P2R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dstY, int dstYStep, uint8_t* dstCbCr, int dstCbCrStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToCbYCr422_8u_P2C2R(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToYCbCr411_8u_P2P3R(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToYCbCr411_8u_P3P2R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dstY, int dstYStep, uint8_t* dstCbCr, int dstCbCrStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCrCb420ToYCbCr411_8u_P3P2R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dstY, int dstYStep, uint8_t* dstCbCr, int dstCbCrStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToYCbCr422_8u_P2C2R(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToYCbCr422_8u_P2P3R(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToYCbCr422_8u_P3R(const uint8_t* const src[3], const int srcStep[3], uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToYCrCb420_8u_P2P3R(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420_8u_P2P3R(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420_8u_P3P2R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dstY, int dstYStep, uint8_t* dstCbCr, int dstCbCrStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToCbYCr422_8u_C2R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToCbYCr422_8u_P3C2R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToYCbCr411_8u_C2P2R(const uint8_t* src, int srcStep, uint8_t* dstY, int dstYStep, uint8_t* dstCbCr, int dstCbCrStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToYCbCr411_8u_C2P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToYCbCr411_8u_P3P2R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dstY, int dstYStep, uint8_t* dstCbCr, int dstCbCrStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToYCbCr411_8u_P3R(const uint8_t* const src[3], const int srcStep[3], uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToYCbCr420_8u_C2P2R(const uint8_t* src, int srcStep, uint8_t* dstY, int dstYStep, uint8_t* dstCbCr, int dstCbCrStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToYCbCr420_8u_C2P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToYCbCr420_8u_P3P2R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dstY, int dstYStep, uint8_t* dstCbCr, int dstCbCrStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToYCbCr420_8u_P3R(const uint8_t* const src[3], const int srcStep[3], uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToYCrCb420_8u_C2P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToYCrCb422_8u_C2R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToYCrCb422_8u_P3C2R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422_8u_C2P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422_8u_P3C2R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCrCb420ToCbYCr422_8u_P3C2R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCrCb420ToYCbCr420_8u_P3P2R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dstY, int dstYStep, uint8_t* dstCbCr, int dstCbCrStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCrCb420ToYCbCr422_8u_P3C2R(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCrCb420ToYCbCr422_8u_P3R(const uint8_t* const src[3], const int srcStep[3], uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCrCb422ToYCbCr411_8u_C2P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCrCb422ToYCbCr420_8u_C2P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCrCb422ToYCbCr422_8u_C2P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);

/* ---- Gamma correction, 8u / 16u / 32f ----------------------------------------------------------------
 * The BT.709 transfer curve, forward (linear to encoded) or inverse, on every colour sample. 8u reads a
 * constant table; 16u evaluates the curve in double precision per sample, or through a 65536-entry table
 * taken from zoxcore for the call when the region has more than 65536 colour samples
 * (zoxStatusNoMemory, image untouched, when that fails); 32f maps through [rangeLow, rangeHigh] without
 * clamping. AC4: the fourth channel is neither read nor written. I: in place. P3: three planes, one step.
 * Checks: 32f range (zoxStatusBadRange when rangeHigh - rangeLow is not above 0), pointers (source side
 * first, the plane array then each plane), sizes, steps below 1 (zoxStatusBadStep). */
ZOXCC_API zoxStatus zoxiGammaFwd_8u_C3R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaFwd_8u_C3IR(uint8_t* srcDst, int srcDstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaFwd_8u_AC4R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaFwd_8u_AC4IR(uint8_t* srcDst, int srcDstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaFwd_8u_P3R(const uint8_t* const src[3], int srcStep, uint8_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaFwd_8u_IP3R(uint8_t* const srcDst[3], int srcDstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaFwd_16u_C3R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaFwd_16u_C3IR(uint16_t* srcDst, int srcDstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaFwd_16u_AC4R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaFwd_16u_AC4IR(uint16_t* srcDst, int srcDstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaFwd_16u_P3R(const uint16_t* const src[3], int srcStep, uint16_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaFwd_16u_IP3R(uint16_t* const srcDst[3], int srcDstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaFwd_32f_C3R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize, float rangeLow, float rangeHigh);
ZOXCC_API zoxStatus zoxiGammaFwd_32f_C3IR(float* srcDst, int srcDstStep, ImageSize roiSize, float rangeLow, float rangeHigh);
ZOXCC_API zoxStatus zoxiGammaFwd_32f_AC4R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize, float rangeLow, float rangeHigh);
ZOXCC_API zoxStatus zoxiGammaFwd_32f_AC4IR(float* srcDst, int srcDstStep, ImageSize roiSize, float rangeLow, float rangeHigh);
ZOXCC_API zoxStatus zoxiGammaFwd_32f_P3R(const float* const src[3], int srcStep, float* const dst[3], int dstStep, ImageSize roiSize, float rangeLow, float rangeHigh);
ZOXCC_API zoxStatus zoxiGammaFwd_32f_IP3R(float* const srcDst[3], int srcDstStep, ImageSize roiSize, float rangeLow, float rangeHigh);
ZOXCC_API zoxStatus zoxiGammaInv_8u_C3R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaInv_8u_C3IR(uint8_t* srcDst, int srcDstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaInv_8u_AC4R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaInv_8u_AC4IR(uint8_t* srcDst, int srcDstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaInv_8u_P3R(const uint8_t* const src[3], int srcStep, uint8_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaInv_8u_IP3R(uint8_t* const srcDst[3], int srcDstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaInv_16u_C3R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaInv_16u_C3IR(uint16_t* srcDst, int srcDstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaInv_16u_AC4R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaInv_16u_AC4IR(uint16_t* srcDst, int srcDstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaInv_16u_P3R(const uint16_t* const src[3], int srcStep, uint16_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaInv_16u_IP3R(uint16_t* const srcDst[3], int srcDstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGammaInv_32f_C3R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize, float rangeLow, float rangeHigh);
ZOXCC_API zoxStatus zoxiGammaInv_32f_C3IR(float* srcDst, int srcDstStep, ImageSize roiSize, float rangeLow, float rangeHigh);
ZOXCC_API zoxStatus zoxiGammaInv_32f_AC4R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize, float rangeLow, float rangeHigh);
ZOXCC_API zoxStatus zoxiGammaInv_32f_AC4IR(float* srcDst, int srcDstStep, ImageSize roiSize, float rangeLow, float rangeHigh);
ZOXCC_API zoxStatus zoxiGammaInv_32f_P3R(const float* const src[3], int srcStep, float* const dst[3], int dstStep, ImageSize roiSize, float rangeLow, float rangeHigh);
ZOXCC_API zoxStatus zoxiGammaInv_32f_IP3R(float* const srcDst[3], int srcDstStep, ImageSize roiSize, float rangeLow, float rangeHigh);

/* ---- Sixteen-bit RGB words, 16u <-> 8u, full resolution ----------------------------------------------
 * Words hold three fields from bit 0: low, middle, high. 565: 5, 6, 5 bits; 555: 5, 5, 5 (bit 15 written
 * 0, ignored when read); 444: 4, 4, 4 (bits 12..15 written 0). BGR words put blue in the low field, RGB
 * words red. Fields grow to 8 bits by a bare left shift (31 gives 248) and shrink by a truncating right
 * shift. Words <-> 8-bit pixels: byte 0 of the pixel is the low field in both the BGR and the RGB
 * member. Y, Cb, Cr bytes (studio range) to words: block colour, a = mulHigh((Y - 16) << 7, 9535),
 * R = clip8((a + mulHigh(v << 7, 13074)) >> 4), G = clip8((a - mulHigh(v << 7, 6660) - mulHigh(u << 7,
 * 3211)) >> 4), B = clip8((a + mulHigh(u << 7, 16523)) >> 4) with u = Cb - 128, v = Cr - 128; C3R pixels
 * from column w & ~7 on take pixel colour, a = 76284 (Y - 16), R = clip8((a + 104595 v) >> 16),
 * G = clip8((a - 25690 u - 53281 v) >> 16), B = clip8((a + 132186 u) >> 16); P3C3R planes take block
 * colour everywhere. Steps of word images are taken in whole words (21 gives 20, -21 gives -22).
 * Checks: src and dst, then a size below 1 (zoxStatusBadSize), then each plane. */
ZOXCC_API zoxStatus zoxiBGR565ToBGR_16u8u_C3R(const uint16_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGB565ToRGB_16u8u_C3R(const uint16_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToBGR565_8u16u_C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToRGB565_8u16u_C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToBGR444_8u16u_C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToBGR555_8u16u_C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToBGR565_8u16u_C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToRGB444_8u16u_C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToRGB555_8u16u_C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToRGB565_8u16u_C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToBGR444_8u16u_P3C3R(const uint8_t* const src[3], int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToBGR555_8u16u_P3C3R(const uint8_t* const src[3], int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToBGR565_8u16u_P3C3R(const uint8_t* const src[3], int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToRGB444_8u16u_P3C3R(const uint8_t* const src[3], int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToRGB555_8u16u_P3C3R(const uint8_t* const src[3], int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToRGB565_8u16u_P3C3R(const uint8_t* const src[3], int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);

/* ---- Sixteen-bit RGB words to chroma-sampled images ------------------------------------------------------
 * BGR555 and BGR565 words (red in the high field; bit 15 of 555 ignored) to studio-range YCbCr, and BGR
 * words and RGB565 words (red in the low field) to YUV. Fields grow by a bare shift (r, g, b below).
 * YCbCr forms: block luma Y = (mulHighU(r << 8, 8422) + mulHighU(g << 8, 16515) + mulHighU(b << 8, 3212)
 * + 2112) >> 7; block chroma of the channel sums sr, sg, sb over a group of 4 (4:2:0, 4:1:1), x = s << 5:
 * Cb = (mulHighU(xb, 28770) - mulHighU(xr, 9699) - mulHighU(xg, 19071) + 16400) >> 7, Cr = (mulHighU(xr,
 * 28770) - mulHighU(xg, 24117) - mulHighU(xb, 4653) + 16400) >> 7 (a pair: 8200 and >> 6); pixel luma
 * Y = (16843 r + 33030 g + 6423 b + 0x108000) >> 16; pixel chroma Cb = ((28770 sb - 19071 sg - 9699 sr +
 * 0x8000) >> 18) + 128 (a pair: 0x4000, >> 17; one pixel: 0x2000, >> 16), Cr alike with 28770, -24117,
 * -4653. Block forms take columns below (w & ~15) + (w & 4) in 4:2:0, (w & ~31) + (w & 8) in 4:2:2 and
 * w & ~3 in 4:1:1, pixel forms the groups up to w & ~1. A last odd column and a 4:2:0 last odd row take
 * pixel luma and no chroma (the packed 4:2:2 member writes the one-pixel Cb in the column's second
 * byte); 4:1:1 from BGR555 gives the last w & 3 columns pixel luma, from BGR565 leaves them unwritten.
 * YUV 4:2:0 from BGR words: block Y = (mulHighU(r << 8, 9798) + mulHighU(g << 8, 19235) + mulHighU(b << 8,
 * 3736) + 64) >> 7, S = 32 x the four Y, U = clip8((mulHigh(32 sb - S, 16122) + 8224) >> 6), V alike with
 * sr and 28737, below w & ~3; pixel q = 19595 r + 38470 g + 7471 b, Y = (q + 0x8000) >> 16, with Q the
 * four q U = ((((sb << 16) - Q + 0x1ffff) >> 16) * 32244 >> 18) + 128, V = clip8(... 57475 ...); the
 * second row of a pair at srcStep & ~1 past the first. YUV from RGB565: y2 = mulHigh(r << 2, 9798) +
 * mulHigh(b << 2, 3736) + mulHigh(g << 2, 19235), Y = clip8((y2 + 1) >> 1), D = (sum of y2) >> 2 (a pair:
 * >> 1), U = clip8(mulHigh((sb >> 1) - D, 16121) + 128) (a pair: sb - D), V alike with sr and 28737,
 * below w & ~15; pixel Y = q >> 16 and the chroma above (a pair: 0xffff, >> 17). YUV members leave a
 * last odd column and row unwritten. Checks: src, dst, each plane, then sizes (below 4 wide for 4:1:1,
 * 2 x 2 for 4:2:0, 2 wide for 4:2:2); RGB565 members check sizes (below 1) before the planes.
 * zoxWarnOddSize: 4:1:1 when w & 3, YUV 4:2:0 when w or h is odd, RGB565 to YUV 4:2:2 when w is odd.
 * The YCrCb members name Cr's plane and step before Cb's. Source steps are taken as they come. */
ZOXCC_API zoxStatus zoxiBGR555ToYCbCr411_16u8u_C3P3R(const uint16_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGR565ToYCbCr411_16u8u_C3P3R(const uint16_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGR555ToYCbCr420_16u8u_C3P3R(const uint16_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGR565ToYCbCr420_16u8u_C3P3R(const uint16_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGR555ToYCrCb420_16u8u_C3P3R(const uint16_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGR565ToYCrCb420_16u8u_C3P3R(const uint16_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGR555ToYCbCr422_16u8u_C3C2R(const uint16_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGR565ToYCbCr422_16u8u_C3C2R(const uint16_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGR555ToYCbCr422_16u8u_C3P3R(const uint16_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGR565ToYCbCr422_16u8u_C3P3R(const uint16_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGR555ToYUV420_16u8u_C3P3R(const uint16_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGR565ToYUV420_16u8u_C3P3R(const uint16_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGB565ToYUV420_16u8u_C3P3R(const uint16_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGB565ToYUV422_16u8u_C3P3R(const uint16_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize);

/* ---- Sixteen-bit RGB words from chroma-sampled images --------------------------------------------------
 * Y, Cb, Cr at studio range (or Y, U, V) to the words above. Chroma: packed 4:2:2 (Y0 Cb Y1 Cr, 2w bytes a
 * row) and 4:2:2 planes ((w + 1) / 2 samples a row) serve columns 2i, 2i + 1 from sample i; 4:2:0 planes
 * ((w + 1) / 2 samples, (h + 1) / 2 rows) serve 2x2 blocks; 4:1:1 planes (w / 4 samples) serve 4i..4i + 3.
 * Forms (u = Cb - 128, v = Cr - 128): block colour as above, rounded block colour with 8 added before each
 * shift by 4; pixel colour as above, rounded with 0x8000 added; folded colour R = clip8((76284 Y +
 * 104595 Cr - 14608761) >> 16), G = clip8((76284 Y - 25690 Cb - 53281 Cr + 8887730) >> 16),
 * B = clip8((76284 Y + 132186 Cb - 18140365) >> 16); YUV block colour R = clip8(((Y << 4) + mulHigh(v << 7,
 * 9338)) >> 4), G = clip8(((Y << 4) - mulHigh(v << 7, 4759) - mulHigh(u << 7, 3227)) >> 4), B = clip8(((Y <<
 * 4) + mulHigh(u << 7, 16646)) >> 4); YUV pixel colour R = clip8(((Y << 16) + 74711 v) >> 16), G =
 * clip8(((Y << 16) - 25821 u - 38076 v) >> 16), B = clip8(((Y << 16) + 133169 u) >> 16).
 * Odd sizes: packed 4:2:2 takes block colour below w & ~7 and folded colour up to w & ~1; a last odd
 * column takes pixel colour with its own Cb and the Cr just ahead of its Y, and a region one pixel wide
 * folded colour with its one chroma byte as both. 4:2:2 planes: block colour; width 1 writes nothing.
 * 4:2:0 planes: block colour everywhere, a last odd column and row included. 4:1:1: rounded block colour
 * below w & ~3, rounded pixel colour for the last w & 3 columns on sample w / 4 - 1; zoxWarnOddSize when
 * w & 3. YUV 4:2:0: YUV block colour, a last odd column and row YUV pixel colour; width or height 1 writes
 * nothing. Checks: src and dst, then a size below 1 (below 4 wide for 4:1:1, whose planes are checked
 * before the size), then each plane.
 * Dither members: block colour (YUV block colour for YUV sources) in every pixel, edges included, then for
 * each channel c with n = 2^bits - 1, q = (n c) >> 8, e = (c << 8) - s q (s = 4352, 2105 or 1036 for 4-,
 * 5- and 6-bit fields) and the field q + 1 where e is above the tile threshold t, else q. The 4x4 tile
 * starts at the region's first pixel; its ranks 0 8 2 10 / 12 4 14 6 / 3 11 1 9 / 15 7 13 5 give t = 289 k
 * for 4-bit fields and floor(17 k 255 / 31) for 5-bit ones, halved for the 6-bit field. A packed 4:2:2
 * last odd column and width 1 take the one chroma byte as both Cb and Cr. No member warns. */
ZOXCC_API zoxStatus zoxiYCbCr422ToBGR444_8u16u_C2C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToBGR555_8u16u_C2C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToBGR565_8u16u_C2C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToRGB444_8u16u_C2C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToRGB555_8u16u_C2C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToRGB565_8u16u_C2C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToBGR444_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToBGR555_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToBGR565_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToRGB444_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToRGB555_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToRGB565_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToBGR444_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToBGR555_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToBGR565_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToRGB444_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToRGB555_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToRGB565_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr411ToBGR555_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr411ToBGR565_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUV420ToBGR444_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUV420ToBGR555_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUV420ToBGR565_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUV420ToRGB444_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUV420ToRGB555_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUV420ToRGB565_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToBGR444Dither_8u16u_C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToBGR555Dither_8u16u_C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToBGR565Dither_8u16u_C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToRGB444Dither_8u16u_C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToRGB555Dither_8u16u_C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToRGB565Dither_8u16u_C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToBGR444Dither_8u16u_P3C3R(const uint8_t* const src[3], int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToBGR555Dither_8u16u_P3C3R(const uint8_t* const src[3], int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToBGR565Dither_8u16u_P3C3R(const uint8_t* const src[3], int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToRGB444Dither_8u16u_P3C3R(const uint8_t* const src[3], int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToRGB555Dither_8u16u_P3C3R(const uint8_t* const src[3], int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCrToRGB565Dither_8u16u_P3C3R(const uint8_t* const src[3], int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToBGR444Dither_8u16u_C2C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToBGR555Dither_8u16u_C2C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToBGR565Dither_8u16u_C2C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToRGB444Dither_8u16u_C2C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToRGB555Dither_8u16u_C2C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToRGB565Dither_8u16u_C2C3R(const uint8_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToBGR444Dither_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToBGR555Dither_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToBGR565Dither_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToRGB444Dither_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToRGB555Dither_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr422ToRGB565Dither_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToBGR444Dither_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToBGR555Dither_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToBGR565Dither_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToRGB444Dither_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToRGB555Dither_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCbCr420ToRGB565Dither_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUV420ToBGR444Dither_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUV420ToBGR555Dither_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUV420ToBGR565Dither_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUV420ToRGB444Dither_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUV420ToRGB555Dither_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYUV420ToRGB565Dither_8u16u_P3C3R(const uint8_t* const src[3], const int srcStep[3], uint16_t* dst, int dstStep, ImageSize roiSize);

/* ---- Colour twist, 8u / 8s / 16u / 16s / 32f ---------------------------------------------------------
 * An affine map of the three colour channels: output channel i is a sum of the three inputs times
 * twist[i][0..2] plus the offset twist[i][3] (in sample units), in single precision with each step
 * rounded: (twist[i][3] + c0 x twist[i][0]) + (c2 x twist[i][2] + c1 x twist[i][1]), at 8s
 * ((c0 x twist[i][0] + c1 x twist[i][1]) + c2 x twist[i][2]) + twist[i][3]. Integer depths limit the sum to
 * the depth's range (8s from above to 127 only, then saturate through 32, 16 and 8 bits), a NaN sum to
 * the upper limit, and round to nearest with ties to even whatever rounding mode the caller has set (the
 * mode is set to nearest for the call and put back); 32f stores the sums, in the caller's mode.
 * Layouts: C3; AC4, the fourth channel neither read nor written; P3, three planes with one step; I, in
 * place. zoxiColorTwist_32f_C4R maps four channels by a 4x4 matrix, no offsets:
 * ((c0 x m[i][0] + c1 x m[i][1]) + c2 x m[i][2]) + c3 x m[i][3].
 * Checks: zoxStatusNullPointer for a null image, plane or matrix; zoxStatusBadSize for a size below 1;
 * zoxStatusBadStep for a step below 1. */
ZOXCC_API zoxStatus zoxiColorTwist32f_8u_C3R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_8u_C3IR(uint8_t* srcDst, int srcDstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_8u_AC4R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_8u_AC4IR(uint8_t* srcDst, int srcDstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_8u_P3R(const uint8_t* const src[3], int srcStep, uint8_t* const dst[3], int dstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_8u_IP3R(uint8_t* const srcDst[3], int srcDstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_8s_C3R(const int8_t* src, int srcStep, int8_t* dst, int dstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_8s_C3IR(int8_t* srcDst, int srcDstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_8s_AC4R(const int8_t* src, int srcStep, int8_t* dst, int dstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_8s_AC4IR(int8_t* srcDst, int srcDstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_8s_P3R(const int8_t* const src[3], int srcStep, int8_t* const dst[3], int dstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_8s_IP3R(int8_t* const srcDst[3], int srcDstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_16u_C3R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_16u_C3IR(uint16_t* srcDst, int srcDstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_16u_AC4R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_16u_AC4IR(uint16_t* srcDst, int srcDstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_16u_P3R(const uint16_t* const src[3], int srcStep, uint16_t* const dst[3], int dstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_16u_IP3R(uint16_t* const srcDst[3], int srcDstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_16s_C3R(const int16_t* src, int srcStep, int16_t* dst, int dstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_16s_C3IR(int16_t* srcDst, int srcDstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_16s_AC4R(const int16_t* src, int srcStep, int16_t* dst, int dstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_16s_AC4IR(int16_t* srcDst, int srcDstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_16s_P3R(const int16_t* const src[3], int srcStep, int16_t* const dst[3], int dstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist32f_16s_IP3R(int16_t* const srcDst[3], int srcDstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist_32f_C3R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist_32f_C3IR(float* srcDst, int srcDstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist_32f_AC4R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist_32f_AC4IR(float* srcDst, int srcDstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist_32f_P3R(const float* const src[3], int srcStep, float* const dst[3], int dstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist_32f_IP3R(float* const srcDst[3], int srcDstStep, ImageSize roiSize, const float twist[3][4]);
ZOXCC_API zoxStatus zoxiColorTwist_32f_C4R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize, const float twist[4][4]);

/* ---- Gray conversions, 8u / 16u / 16s / 32f / 64f ---------------------------------------------------
 * RGBToGray takes the weights 0.299, 0.587, 0.114 (channel 0, 1, 2 in memory order); ColorToGray the
 * caller's coeffs, a null pointer standing for the same fixed set (but at 64f AC4C1, which rejects it).
 * 8u works in fixed point, the weights in Q15 (the fixed ones 9798, 19235, 3736): in blocks of 8 pixels
 * (and, from C3, one of 4: the columns below width & ~3, from AC4 below width & ~7) each product is
 * (s x w) >> 8, the three and 64 are summed with 16-bit unsigned saturation and shifted right by 7 as a
 * signed 16-bit value, limited to 0..255; the other columns store the low byte of
 * (s0 w0 + s1 w1 + s2 w2 + 16384) >> 15. So (0, 6, 70) gives 11 in a block and 12 in the last columns.
 * 16u and 16s: (s0 c0 + s1 c1) + s2 c2 in single precision (16s samples plus 32768), rounded to nearest,
 * ties to even; 16s minus 32768, saturated in blocks of 4 and kept to the low 16 bits after them. 32f:
 * (c0 s0 + c1 s1) + c2 s2. 64f: (s0 c0 + s1 c1) + s2 c2 in double precision; from C3 the row goes by
 * pairs of destination samples (one lone first pixel when the destination row is not on 16 bytes), and
 * the second of each pair sums s0 c0 + (s1 c1 + s2 c2). AC4C1 sources: channel 3 is not used.
 * GrayToRGB copies the sample to three channels, C1C4R the fourth taking alpha. YCbCr422ToGray takes the
 * luma bytes of a packed 4:2:2 row (byte 2x for pixel x; an odd width ends on a plain pixel).
 * 16-bit and 32f members take their steps in whole samples (rounded down); 8u and 64f in bytes as given.
 * Checks: zoxStatusNullPointer for src or dst, then zoxStatusBadSize for a size below 1. */
ZOXCC_API zoxStatus zoxiRGBToGray_8u_C3C1R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToGray_8u_AC4C1R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToGray_16u_C3C1R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToGray_16u_AC4C1R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToGray_16s_C3C1R(const int16_t* src, int srcStep, int16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToGray_16s_AC4C1R(const int16_t* src, int srcStep, int16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToGray_32f_C3C1R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToGray_32f_AC4C1R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiColorToGray_8u_C3C1R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize, const float coeffs[3]);
ZOXCC_API zoxStatus zoxiColorToGray_8u_AC4C1R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize, const float coeffs[3]);
ZOXCC_API zoxStatus zoxiColorToGray_16u_C3C1R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize, const float coeffs[3]);
ZOXCC_API zoxStatus zoxiColorToGray_16u_AC4C1R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize, const float coeffs[3]);
ZOXCC_API zoxStatus zoxiColorToGray_16s_C3C1R(const int16_t* src, int srcStep, int16_t* dst, int dstStep, ImageSize roiSize, const float coeffs[3]);
ZOXCC_API zoxStatus zoxiColorToGray_16s_AC4C1R(const int16_t* src, int srcStep, int16_t* dst, int dstStep, ImageSize roiSize, const float coeffs[3]);
ZOXCC_API zoxStatus zoxiColorToGray_32f_C3C1R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize, const float coeffs[3]);
ZOXCC_API zoxStatus zoxiColorToGray_32f_AC4C1R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize, const float coeffs[3]);
ZOXCC_API zoxStatus zoxiColorToGray_64f_C3C1R(const double* src, int srcStep, double* dst, int dstStep, ImageSize roiSize, const double coeffs[3]);
ZOXCC_API zoxStatus zoxiColorToGray_64f_AC4C1R(const double* src, int srcStep, double* dst, int dstStep, ImageSize roiSize, const double coeffs[3]);
ZOXCC_API zoxStatus zoxiGrayToRGB_8u_C1C3R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGrayToRGB_8u_C1C4R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);
ZOXCC_API zoxStatus zoxiGrayToRGB_16u_C1C3R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGrayToRGB_16u_C1C4R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize, uint16_t alpha);
ZOXCC_API zoxStatus zoxiGrayToRGB_32f_C1C3R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiGrayToRGB_32f_C1C4R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize, float alpha);
ZOXCC_API zoxStatus zoxiYCbCr422ToGray_8u_C2C1R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);

/* ---- RGB <-> YCoCg, 8u / 16s / 32s --------------------------------------------------------------------
 * Y = (R + 2G + B + 2) >> 2, Co = (R - B + 1) >> 1, Cg = (2G - R - B + 2) >> 2 (plain), or the reversible
 * lifting form (_Rev): Co = R - B, t = B + (Co >> 1), Cg = G - t, Y = t + (Cg >> 1), undone exactly by
 * t = Y - (Cg >> 1), G = Cg + t, B = t - (Co >> 1), R = B + Co. Plain reverse: R = Y + Co - Cg,
 * G = Y + Cg, B = Y - Co - Cg. Right shifts are arithmetic (toward minus infinity).
 * Colour side interleaved: B,G,R in channels 0..2 (R,G,B in the two RGB members); C4P3R ignores channel
 * 3, P3C4R writes alpha there. YCoCg side: planes Y, Co, Cg, one step for all three. Widths: 8u16s
 * forward and 16s32s forward in 32 bits, stored as computed; 16s forward plain in 32 bits, saturated to
 * 16 bits in blocks of 4 pixels and reduced to the low 16 bits in the last width % 4 pixels (the only
 * place-dependent result: Co and Cg can reach 32768); 16s forward _Rev wraps to 16 bits at every step;
 * 16s8u reverse wraps to 16 bits and clamps each result to 0..255; 16s and 32s16s reverse keep the low
 * 16 bits. The 8u RGB pair biases chroma by 128: forward Co + 128 limited to 255, Cg + 128 to 0..255;
 * reverse R = Y + Co - Cg, G = Y + Cg - 128, B = Y - Co - Cg + 256, each clamped to 0..255.
 * Checks: the interleaved pointer, the plane array and each plane (zoxStatusNullPointer), then, for
 * these members only, a size below 1 (zoxStatusBadSize): RGBToYCoCg_8u_C3P3R, BGRToYCoCg_8u16s C3P3R and
 * C4P3R, BGRToYCoCg_Rev_8u16s C3P3R and C4P3R, SBGRToYCoCg_16s C3P3R and C4P3R, SBGRToYCoCg_16s32s_C3P3R,
 * SBGRToYCoCg_Rev_16s32s_C3P3R, YCoCgToSBGR_16s_P3C4R, YCoCgToSBGR_32s16s C3 and C4. The others return
 * zoxStatusOk and write nothing for a size below 1. Steps are not examined. */
ZOXCC_API zoxStatus zoxiRGBToYCoCg_8u_C3P3R(const uint8_t* src, int srcStep, uint8_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToYCoCg_8u16s_C3P3R(const uint8_t* src, int srcStep, int16_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToYCoCg_8u16s_C4P3R(const uint8_t* src, int srcStep, int16_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiSBGRToYCoCg_16s_C3P3R(const int16_t* src, int srcStep, int16_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiSBGRToYCoCg_16s_C4P3R(const int16_t* src, int srcStep, int16_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiSBGRToYCoCg_16s32s_C3P3R(const int16_t* src, int srcStep, int32_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiSBGRToYCoCg_16s32s_C4P3R(const int16_t* src, int srcStep, int32_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToYCoCg_Rev_8u16s_C3P3R(const uint8_t* src, int srcStep, int16_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiBGRToYCoCg_Rev_8u16s_C4P3R(const uint8_t* src, int srcStep, int16_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiSBGRToYCoCg_Rev_16s_C3P3R(const int16_t* src, int srcStep, int16_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiSBGRToYCoCg_Rev_16s_C4P3R(const int16_t* src, int srcStep, int16_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiSBGRToYCoCg_Rev_16s32s_C3P3R(const int16_t* src, int srcStep, int32_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiSBGRToYCoCg_Rev_16s32s_C4P3R(const int16_t* src, int srcStep, int32_t* const dst[3], int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCoCgToRGB_8u_P3C3R(const uint8_t* const src[3], int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCoCgToBGR_16s8u_P3C3R(const int16_t* const src[3], int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCoCgToBGR_16s8u_P3C4R(const int16_t* const src[3], int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);
ZOXCC_API zoxStatus zoxiYCoCgToSBGR_16s_P3C3R(const int16_t* const src[3], int srcStep, int16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCoCgToSBGR_16s_P3C4R(const int16_t* const src[3], int srcStep, int16_t* dst, int dstStep, ImageSize roiSize, int16_t alpha);
ZOXCC_API zoxStatus zoxiYCoCgToSBGR_32s16s_P3C3R(const int32_t* const src[3], int srcStep, int16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCoCgToSBGR_32s16s_P3C4R(const int32_t* const src[3], int srcStep, int16_t* dst, int dstStep, ImageSize roiSize, int16_t alpha);
ZOXCC_API zoxStatus zoxiYCoCgToBGR_Rev_16s8u_P3C3R(const int16_t* const src[3], int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCoCgToBGR_Rev_16s8u_P3C4R(const int16_t* const src[3], int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize, uint8_t alpha);
ZOXCC_API zoxStatus zoxiYCoCgToSBGR_Rev_16s_P3C3R(const int16_t* const src[3], int srcStep, int16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCoCgToSBGR_Rev_16s_P3C4R(const int16_t* const src[3], int srcStep, int16_t* dst, int dstStep, ImageSize roiSize, int16_t alpha);
ZOXCC_API zoxStatus zoxiYCoCgToSBGR_Rev_32s16s_P3C3R(const int32_t* const src[3], int srcStep, int16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCoCgToSBGR_Rev_32s16s_P3C4R(const int32_t* const src[3], int srcStep, int16_t* dst, int dstStep, ImageSize roiSize, int16_t alpha);

/* ---- Tone mapping, 32f to 8u ------------------------------------------------------------------------
 * One channel of floats to bytes by one global scale. ToneMapLinear maps the maximum M (in single
 * precision, samples that are not numbers ignored) to 255: each product s * (255 / M) is truncated to a
 * 32-bit integer and its low byte stored (a negative sample wraps). ToneMapMean maps twice the mean T
 * to 255: the truncated product s * (float)(255 / T) saturated to 0..255. The sum of the mean is taken
 * row by row in sixteen single-precision partial sums (a row's first samples up to a 16-byte boundary
 * in the lanes of their places), folded into a double-precision total, so its last bits depend on the
 * rows' alignment. A float to integer conversion out of the 32-bit range, or of a value that is not a
 * number, gives the most negative integer (so 0 in both forms). A negative statistic returns
 * zoxWarnNoOperation with nothing written; one not above the smallest normal float (1.1754944e-38) fills
 * the region with 0. Source rows are found in whole floats (the low two bits of step times row are
 * dropped); rows whose source and destination overlap are converted strictly left to right, so
 * dst == src works. Checks: src/dst null, then sizes. */
ZOXCC_API zoxStatus zoxiToneMapLinear_32f8u_C1R(const float* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiToneMapMean_32f8u_C1R(const float* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);

/* ---- RGB <-> XYZ and RGB <-> YCC, 8u / 16u / 16s / 32f --------------------------------------------------
 * XYZ: CIE XYZ by the single-precision matrices X = 0.412453 R + 0.35758 G + 0.180423 B, Y = 0.212671 R +
 * 0.71516 G + 0.072169 B, Z = 0.019334 R + 0.119193 G + 0.950227 B, and their inverse. YCC: luma
 * t = 0.299 R + 0.587 G + 0.114 B, Y = 0.7132668 t, C1 = 0.4368627 (B - t) and C2 = 0.5319216 (R - t)
 * (0.53192 at 32f) with offsets 0.6117647 and 0.5372549 of full scale (156 and 137 at 8u, 40092 and
 * 35209 at 16 bits); back: Y gain 1.3584, C1 to B 2.2179, C2 to R 1.8215, on G 0.194 of C1 and 0.509
 * of C2. C3R: three channels, lowest address first (R,G,B / X,Y,Z / Y,C1,C2); AC4R: a fourth channel
 * neither read for a value nor written, also in the destination. 8u: integer forms, block columns
 * below the width rounded down to 8 (C3R) or 4 (AC4R), remainder columns in a whole-sample form that
 * can differ by one unit. 16u/16s: single precision, sums left to right; 16s samples lifted by 32768
 * and results limited to -32768..32767, 16u to 0..65535; block of 4 pixels, different from the
 * remainder columns only in the YCC members (nearest against truncation). 32f: one form in all
 * columns; XYZ limits only Z to 0..1, XYZToRGB and YCCToRGB limit each result to 0..1, RGBToYCC limits
 * nothing. 16- and 32-bit members take their steps in whole samples, rounded down. Checks: src/dst
 * null, then sizes. */
ZOXCC_API zoxStatus zoxiRGBToXYZ_8u_C3R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToXYZ_8u_AC4R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToXYZ_16u_C3R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToXYZ_16u_AC4R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToXYZ_16s_C3R(const int16_t* src, int srcStep, int16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToXYZ_16s_AC4R(const int16_t* src, int srcStep, int16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToXYZ_32f_C3R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToXYZ_32f_AC4R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiXYZToRGB_8u_C3R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiXYZToRGB_8u_AC4R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiXYZToRGB_16u_C3R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiXYZToRGB_16u_AC4R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiXYZToRGB_16s_C3R(const int16_t* src, int srcStep, int16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiXYZToRGB_16s_AC4R(const int16_t* src, int srcStep, int16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiXYZToRGB_32f_C3R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiXYZToRGB_32f_AC4R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCC_8u_C3R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCC_8u_AC4R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCC_16u_C3R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCC_16u_AC4R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCC_16s_C3R(const int16_t* src, int srcStep, int16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCC_16s_AC4R(const int16_t* src, int srcStep, int16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCC_32f_C3R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiRGBToYCC_32f_AC4R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCCToRGB_8u_C3R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCCToRGB_8u_AC4R(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCCToRGB_16u_C3R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCCToRGB_16u_AC4R(const uint16_t* src, int srcStep, uint16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCCToRGB_16s_C3R(const int16_t* src, int srcStep, int16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCCToRGB_16s_AC4R(const int16_t* src, int srcStep, int16_t* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCCToRGB_32f_C3R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize);
ZOXCC_API zoxStatus zoxiYCCToRGB_32f_AC4R(const float* src, int srcStep, float* dst, int dstStep, ImageSize roiSize);

#ifdef __cplusplus
}
#endif

#endif /* ZOXCC_H */
