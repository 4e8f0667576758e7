// RGB <-> YUV exports: one row an export.
//   X(name, shape, Src, Dst, N, block form, remainder form, checks)
#pragma once

#include "lumachroma/yuv_forms.hpp"

#define ZOX_YUV_TABLE(X)                                                                                              \
    X(zoxiRGBToYUV_8u_C3R, ZOX_SHAPE_SD, InC3, OutC3, 16, YuvFromRgbMatrix, YuvFromRgbDifferenceLow, PlanesLast)   \
    X(zoxiRGBToYUV_8u_C3P3R, ZOX_SHAPE_SD, InC3, OutP3, 8, YuvFromRgbMatrix, YuvFromRgbDifferenceLow, PlanesLast)  \
    X(zoxiRGBToYUV_8u_AC4R, ZOX_SHAPE_SD, InAC4, OutAC4, 1, NoBlock, YuvFromRgbDifferenceFull, PlanesLast)         \
    X(zoxiRGBToYUV_8u_AC4P4R, ZOX_SHAPE_SD, InAC4, OutP4, 8, YuvFromRgbHalf, YuvFromRgbDifferenceFull, PlanesLast) \
    X(zoxiRGBToYUV_8u_P3R, ZOX_SHAPE_SD, InP3, OutP3, 16, YuvFromRgbMatrix, YuvFromRgbPlane, PlanesLast)           \
    X(zoxiYUVToRGB_8u_C3R, ZOX_SHAPE_SD, InC3, OutC3, 8, RgbFromYuvBlock8, RgbFromYuvRoundedGreenLow, PlanesLast)  \
    X(zoxiYUVToRGB_8u_AC4R, ZOX_SHAPE_SD, InAC4, OutAC4, 1, NoBlock, RgbFromYuvRoundedGreenLow, PlanesLast)        \
    X(zoxiYUVToRGB_8u_C3C4R, ZOX_SHAPE_SD_ALPHA, InC3, OutC4A, 8, RgbFromYuvBlock128, RgbFromYuvRounded, PlanesLast) \
    X(zoxiYUVToRGB_8u_P3C3R, ZOX_SHAPE_SD, InP3, OutC3, 16, RgbFromYuvBlock16, RgbFromYuvTruncated, PlanesLast)    \
    X(zoxiYUVToRGB_8u_P3R, ZOX_SHAPE_SD, InP3, OutP3, 1, NoBlock, RgbFromYuvTruncated, PlanesLast)
