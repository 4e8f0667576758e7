// RGB <-> YCbCr exports: one row an export.
//   X(name, shape, Src, Dst, N, block form, remainder form, checks)
// The BGR members take the block form in every column: their remainder form is the block form, and
// N = 16 only says where the vector kernel stops.
// The inverse C3R and P3R rows name a block set and its rounding but no way of gathering green; they
// take the sum form, the one the block sets are defined by (the difference form is named where used).
#pragma once

#include "lumachroma/ycbcr_forms.hpp"

#define ZOX_YCBCR_TABLE(X)                                                                                                              \
    X(zoxiRGBToYCbCr_8u_C3R, ZOX_SHAPE_SD, InC3, OutC3, 16, YccFromRgbRound, YccFromRgbPixel, PlanesLast)                              \
    X(zoxiRGBToYCbCr_8u_AC4R, ZOX_SHAPE_SD, InAC4, OutAC4, 1, NoBlock, YccFromRgbPixel, PlanesLast)                                    \
    X(zoxiRGBToYCbCr_8u_C3P3R, ZOX_SHAPE_SD, InC3, OutP3, 16, YccFromRgbMatrix, YccFromRgbPixel, PlanesFirst)                          \
    X(zoxiRGBToYCbCr_8u_AC4P3R, ZOX_SHAPE_SD, InAC4, OutP3, 8, YccFromRgbMatrix, YccFromRgbPixel, PlanesFirst)                         \
    X(zoxiRGBToYCbCr_8u_P3R, ZOX_SHAPE_SD, InP3, OutP3, 8, YccFromRgbMatrix, YccFromRgbPixel, PlanesLast)                              \
    X(zoxiYCbCrToRGB_8u_C3R, ZOX_SHAPE_SD, InC3, OutC3, 4, RgbFromYccBlockARounded, RgbFromYccPixelATruncated, PlanesLast)             \
    X(zoxiYCbCrToRGB_8u_AC4R, ZOX_SHAPE_SD, InAC4, OutAC4, 1, NoBlock, RgbFromYccPixelATruncated, PlanesLast)                          \
    X(zoxiYCbCrToRGB_8u_P3R, ZOX_SHAPE_SD, InP3, OutP3, 4, RgbFromYccBlockATruncated, RgbFromYccPixelARounded, PlanesLast)             \
    X(zoxiYCbCrToRGB_8u_P3C3R, ZOX_SHAPE_SD, InP3, OutC3, 8, RgbFromYccBlockBSum, RgbFromYccPixelBTruncated, PlanesLast)               \
    X(zoxiYCbCrToRGB_8u_P3C4R, ZOX_SHAPE_SD_ALPHA, InP3, OutC4A, 8, RgbFromYccBlockBDifference, RgbFromYccPixelBRounded, PlanesLast)   \
    X(zoxiYCbCrToBGR_8u_P3C3R, ZOX_SHAPE_SD, InP3, OutBGR3, 16, RgbFromYccBlockBSum, RgbFromYccBlockBSum, PlanesFirst)                 \
    X(zoxiYCbCrToBGR_8u_P3C4R, ZOX_SHAPE_SD_ALPHA, InP3, OutBGR4A, 16, RgbFromYccBlockBDifference, RgbFromYccBlockBDifference, PlanesFirst) \
    X(zoxiYCbCrToBGR_709CSC_8u_P3C3R, ZOX_SHAPE_SD, InP3, OutBGR3, 16, RgbFromYcc709Sum, RgbFromYcc709Sum, PlanesFirst)               \
    X(zoxiYCbCrToBGR_709CSC_8u_P3C4R, ZOX_SHAPE_SD_ALPHA, InP3, OutBGR4A, 16, RgbFromYcc709Difference, RgbFromYcc709Difference, PlanesFirst)
