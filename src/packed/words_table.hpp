// Sixteen-bit RGB words from and to 8-bit pixels at full resolution: one row an export.
//   X(name, shape, Src, Dst, N, block form, remainder form, checks)
// Words <-> 8-bit RGB: byte 0 of a pixel is the word's low field, whatever the names say (the BGR and
// RGB members are one routine). Y, Cb, Cr bytes to words: BGR names put red in the high field, RGB names
// blue; pixels take block colour below w & ~7 and pixel colour for the last w & 7 columns, planes
// block colour everywhere; the Dither members block colour everywhere, quantised by the tile. Word steps
// are taken in whole words.
#pragma once

#include "frame/conv.hpp"
#include "packed/words_forms.hpp"

namespace zox {
using InWord565 = InWord<Fields565>;
using OutWord565Low0 = OutWord<Fields565, 0>;
using OutWord444Low0 = OutWord<Fields444, 0>;
using OutWord555Low0 = OutWord<Fields555, 0>;
using OutWord444Low2 = OutWord<Fields444, 2>;
using OutWord555Low2 = OutWord<Fields555, 2>;
using OutWord565Low2 = OutWord<Fields565, 2>;
using OutDither444Low0 = OutDitherWord<Fields444, 0>;
using OutDither555Low0 = OutDitherWord<Fields555, 0>;
using OutDither565Low0 = OutDitherWord<Fields565, 0>;
using OutDither444Low2 = OutDitherWord<Fields444, 2>;
using OutDither555Low2 = OutDitherWord<Fields555, 2>;
using OutDither565Low2 = OutDitherWord<Fields565, 2>;
} // namespace zox

// The rows with kernels of their own, and the twins that share a row's kernels (same layouts and forms).
#define ZOX_WORDS_OWN(X) \
    X(zoxiBGR565ToBGR_16u8u_C3R, ZOX_SHAPE_SD_SAMPLES, InWord565, OutC3, 8, words::Copy, words::Copy, PlanesLast)                          \
    X(zoxiBGRToBGR565_8u16u_C3R, ZOX_SHAPE_SD_SAMPLES, InC3, OutWord565Low0, 8, words::Copy, words::Copy, PlanesLast)                      \
    X(zoxiYCbCrToBGR444_8u16u_C3R, ZOX_SHAPE_SD_SAMPLES, InC3, OutWord444Low2, 8, words::BlockColour, words::PixelColour, PlanesLast)  \
    X(zoxiYCbCrToBGR555_8u16u_C3R, ZOX_SHAPE_SD_SAMPLES, InC3, OutWord555Low2, 8, words::BlockColour, words::PixelColour, PlanesLast)  \
    X(zoxiYCbCrToBGR565_8u16u_C3R, ZOX_SHAPE_SD_SAMPLES, InC3, OutWord565Low2, 8, words::BlockColour, words::PixelColour, PlanesLast)  \
    X(zoxiYCbCrToRGB444_8u16u_C3R, ZOX_SHAPE_SD_SAMPLES, InC3, OutWord444Low0, 8, words::BlockColour, words::PixelColour, PlanesLast)  \
    X(zoxiYCbCrToRGB555_8u16u_C3R, ZOX_SHAPE_SD_SAMPLES, InC3, OutWord555Low0, 8, words::BlockColour, words::PixelColour, PlanesLast)  \
    X(zoxiYCbCrToRGB565_8u16u_C3R, ZOX_SHAPE_SD_SAMPLES, InC3, OutWord565Low0, 8, words::BlockColour, words::PixelColour, PlanesLast)  \
    X(zoxiYCbCrToBGR444_8u16u_P3C3R, ZOX_SHAPE_SD_SAMPLES, InP3, OutWord444Low2, 8, words::BlockColour, words::BlockColour, PlanesLast)           \
    X(zoxiYCbCrToBGR555_8u16u_P3C3R, ZOX_SHAPE_SD_SAMPLES, InP3, OutWord555Low2, 8, words::BlockColour, words::BlockColour, PlanesLast)           \
    X(zoxiYCbCrToBGR565_8u16u_P3C3R, ZOX_SHAPE_SD_SAMPLES, InP3, OutWord565Low2, 8, words::BlockColour, words::BlockColour, PlanesLast)           \
    X(zoxiYCbCrToRGB444_8u16u_P3C3R, ZOX_SHAPE_SD_SAMPLES, InP3, OutWord444Low0, 8, words::BlockColour, words::BlockColour, PlanesLast)           \
    X(zoxiYCbCrToRGB555_8u16u_P3C3R, ZOX_SHAPE_SD_SAMPLES, InP3, OutWord555Low0, 8, words::BlockColour, words::BlockColour, PlanesLast)           \
    X(zoxiYCbCrToRGB565_8u16u_P3C3R, ZOX_SHAPE_SD_SAMPLES, InP3, OutWord565Low0, 8, words::BlockColour, words::BlockColour, PlanesLast) \
    X(zoxiYCbCrToBGR444Dither_8u16u_C3R, ZOX_SHAPE_SD_SAMPLES, InC3, OutDither444Low2, 8, words::BlockColour, words::BlockColour, PlanesLast) \
    X(zoxiYCbCrToBGR555Dither_8u16u_C3R, ZOX_SHAPE_SD_SAMPLES, InC3, OutDither555Low2, 8, words::BlockColour, words::BlockColour, PlanesLast) \
    X(zoxiYCbCrToBGR565Dither_8u16u_C3R, ZOX_SHAPE_SD_SAMPLES, InC3, OutDither565Low2, 8, words::BlockColour, words::BlockColour, PlanesLast) \
    X(zoxiYCbCrToRGB444Dither_8u16u_C3R, ZOX_SHAPE_SD_SAMPLES, InC3, OutDither444Low0, 8, words::BlockColour, words::BlockColour, PlanesLast) \
    X(zoxiYCbCrToRGB555Dither_8u16u_C3R, ZOX_SHAPE_SD_SAMPLES, InC3, OutDither555Low0, 8, words::BlockColour, words::BlockColour, PlanesLast) \
    X(zoxiYCbCrToRGB565Dither_8u16u_C3R, ZOX_SHAPE_SD_SAMPLES, InC3, OutDither565Low0, 8, words::BlockColour, words::BlockColour, PlanesLast) \
    X(zoxiYCbCrToBGR444Dither_8u16u_P3C3R, ZOX_SHAPE_SD_SAMPLES, InP3, OutDither444Low2, 8, words::BlockColour, words::BlockColour, PlanesLast) \
    X(zoxiYCbCrToBGR555Dither_8u16u_P3C3R, ZOX_SHAPE_SD_SAMPLES, InP3, OutDither555Low2, 8, words::BlockColour, words::BlockColour, PlanesLast) \
    X(zoxiYCbCrToBGR565Dither_8u16u_P3C3R, ZOX_SHAPE_SD_SAMPLES, InP3, OutDither565Low2, 8, words::BlockColour, words::BlockColour, PlanesLast) \
    X(zoxiYCbCrToRGB444Dither_8u16u_P3C3R, ZOX_SHAPE_SD_SAMPLES, InP3, OutDither444Low0, 8, words::BlockColour, words::BlockColour, PlanesLast) \
    X(zoxiYCbCrToRGB555Dither_8u16u_P3C3R, ZOX_SHAPE_SD_SAMPLES, InP3, OutDither555Low0, 8, words::BlockColour, words::BlockColour, PlanesLast) \
    X(zoxiYCbCrToRGB565Dither_8u16u_P3C3R, ZOX_SHAPE_SD_SAMPLES, InP3, OutDither565Low0, 8, words::BlockColour, words::BlockColour, PlanesLast)
#define ZOX_WORDS_TWINS(X) \
    X(zoxiRGB565ToRGB_16u8u_C3R, ZOX_SHAPE_SD_SAMPLES, InWord565, OutC3, 8, words::Copy, words::Copy, PlanesLast)      \
    X(zoxiRGBToRGB565_8u16u_C3R, ZOX_SHAPE_SD_SAMPLES, InC3, OutWord565Low0, 8, words::Copy, words::Copy, PlanesLast)
#define ZOX_WORDS_TABLE(X) ZOX_WORDS_OWN(X) ZOX_WORDS_TWINS(X)
