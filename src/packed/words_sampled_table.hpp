// Chroma-sampled Y, Cb, Cr (or Y, U, V) images to sixteen-bit RGB words, plain and dithered: one row an
// export of the sampled-source frame.
//   X(name, shape, Src, Dst, limit, block form, remainder form, last-pixel form, rules)
// Plain members:
//   packed 4:2:2: block colour below w & ~7, folded colour up to w & ~1; a last odd column pixel colour
//     with its own Cb and the Cr just ahead of its Y; width 1 folded colour, its one chroma byte as both.
//   4:2:2 planes: block colour everywhere; a region one pixel wide is not written.
//   4:2:0 planes: block colour everywhere, a last odd column and row included.
//   4:1:1 planes: rounded block colour below w & ~3, rounded pixel colour for the last w & 3 columns on
//     the last whole group's chroma.
//   YUV 4:2:0 planes: YUV block colour; a last odd column and row YUV pixel colour; a region one pixel
//     wide or high is not written.
// Dither members: block colour (YUV block colour) for every pixel, edges included; a packed 4:2:2 last
// odd column or width 1 takes its one chroma byte as both Cb and Cr.
#pragma once

#include "frame/fromsampled.hpp"
#include "packed/words_table.hpp"
#include "sampling/fromsampled_table.hpp"

namespace zox {
using LastC2Words = LastPixel<words::PixelColour, words::FoldedColour>;
using LastBlockNotAlone = LastPixel<words::BlockColour, Unwritten>;
using LastYuvPixelNotThin = LastPixel<words::YuvPixelColour, Unwritten>;
using WordsRules = SampledRules<PlanesLast, 1, 1, OddWarn::Never>;
using Words411Rules = SampledRules<PlanesFirst, 4, 1, OddWarn::WidthNotMultipleOf4>;
} // namespace zox

#define ZOX_WORDS_FROM_SAMPLED_TABLE(X) \
    X(zoxiYCbCr422ToBGR444_8u16u_C2C3R, ZOX_SHAPE_FROM_C2, InYCbCr422, OutWord444Low2, Limit::L8, words::BlockColour, words::FoldedColour, LastC2Words, WordsRules) \
    X(zoxiYCbCr422ToBGR555_8u16u_C2C3R, ZOX_SHAPE_FROM_C2, InYCbCr422, OutWord555Low2, Limit::L8, words::BlockColour, words::FoldedColour, LastC2Words, WordsRules) \
    X(zoxiYCbCr422ToBGR565_8u16u_C2C3R, ZOX_SHAPE_FROM_C2, InYCbCr422, OutWord565Low2, Limit::L8, words::BlockColour, words::FoldedColour, LastC2Words, WordsRules) \
    X(zoxiYCbCr422ToRGB444_8u16u_C2C3R, ZOX_SHAPE_FROM_C2, InYCbCr422, OutWord444Low0, Limit::L8, words::BlockColour, words::FoldedColour, LastC2Words, WordsRules) \
    X(zoxiYCbCr422ToRGB555_8u16u_C2C3R, ZOX_SHAPE_FROM_C2, InYCbCr422, OutWord555Low0, Limit::L8, words::BlockColour, words::FoldedColour, LastC2Words, WordsRules) \
    X(zoxiYCbCr422ToRGB565_8u16u_C2C3R, ZOX_SHAPE_FROM_C2, InYCbCr422, OutWord565Low0, Limit::L8, words::BlockColour, words::FoldedColour, LastC2Words, WordsRules) \
    X(zoxiYCbCr422ToBGR444_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP422, OutWord444Low2, Limit::All, words::BlockColour, words::BlockColour, LastBlockNotAlone, WordsRules) \
    X(zoxiYCbCr422ToBGR555_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP422, OutWord555Low2, Limit::All, words::BlockColour, words::BlockColour, LastBlockNotAlone, WordsRules) \
    X(zoxiYCbCr422ToBGR565_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP422, OutWord565Low2, Limit::All, words::BlockColour, words::BlockColour, LastBlockNotAlone, WordsRules) \
    X(zoxiYCbCr422ToRGB444_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP422, OutWord444Low0, Limit::All, words::BlockColour, words::BlockColour, LastBlockNotAlone, WordsRules) \
    X(zoxiYCbCr422ToRGB555_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP422, OutWord555Low0, Limit::All, words::BlockColour, words::BlockColour, LastBlockNotAlone, WordsRules) \
    X(zoxiYCbCr422ToRGB565_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP422, OutWord565Low0, Limit::All, words::BlockColour, words::BlockColour, LastBlockNotAlone, WordsRules) \
    X(zoxiYCbCr420ToBGR444_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutWord444Low2, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::BlockColour>, WordsRules) \
    X(zoxiYCbCr420ToBGR555_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutWord555Low2, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::BlockColour>, WordsRules) \
    X(zoxiYCbCr420ToBGR565_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutWord565Low2, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::BlockColour>, WordsRules) \
    X(zoxiYCbCr420ToRGB444_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutWord444Low0, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::BlockColour>, WordsRules) \
    X(zoxiYCbCr420ToRGB555_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutWord555Low0, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::BlockColour>, WordsRules) \
    X(zoxiYCbCr420ToRGB565_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutWord565Low0, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::BlockColour>, WordsRules) \
    X(zoxiYCbCr411ToBGR555_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP411, OutWord555Low2, Limit::L4, words::RoundedBlockColour, words::RoundedPixelColour, Unwritten, Words411Rules) \
    X(zoxiYCbCr411ToBGR565_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP411, OutWord565Low2, Limit::L4, words::RoundedBlockColour, words::RoundedPixelColour, Unwritten, Words411Rules) \
    X(zoxiYUV420ToBGR444_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutWord444Low2, Limit::All, words::YuvBlockColour, words::YuvBlockColour, LastYuvPixelNotThin, WordsRules) \
    X(zoxiYUV420ToBGR555_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutWord555Low2, Limit::All, words::YuvBlockColour, words::YuvBlockColour, LastYuvPixelNotThin, WordsRules) \
    X(zoxiYUV420ToBGR565_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutWord565Low2, Limit::All, words::YuvBlockColour, words::YuvBlockColour, LastYuvPixelNotThin, WordsRules) \
    X(zoxiYUV420ToRGB444_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutWord444Low0, Limit::All, words::YuvBlockColour, words::YuvBlockColour, LastYuvPixelNotThin, WordsRules) \
    X(zoxiYUV420ToRGB555_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutWord555Low0, Limit::All, words::YuvBlockColour, words::YuvBlockColour, LastYuvPixelNotThin, WordsRules) \
    X(zoxiYUV420ToRGB565_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutWord565Low0, Limit::All, words::YuvBlockColour, words::YuvBlockColour, LastYuvPixelNotThin, WordsRules)

#define ZOX_WORDS_DITHER_FROM_SAMPLED_TABLE(X) \
    X(zoxiYCbCr422ToBGR444Dither_8u16u_C2C3R, ZOX_SHAPE_FROM_C2, InYCbCr422, OutDither444Low2, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::CbAsCr<words::BlockColour>>, WordsRules) \
    X(zoxiYCbCr422ToBGR555Dither_8u16u_C2C3R, ZOX_SHAPE_FROM_C2, InYCbCr422, OutDither555Low2, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::CbAsCr<words::BlockColour>>, WordsRules) \
    X(zoxiYCbCr422ToBGR565Dither_8u16u_C2C3R, ZOX_SHAPE_FROM_C2, InYCbCr422, OutDither565Low2, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::CbAsCr<words::BlockColour>>, WordsRules) \
    X(zoxiYCbCr422ToRGB444Dither_8u16u_C2C3R, ZOX_SHAPE_FROM_C2, InYCbCr422, OutDither444Low0, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::CbAsCr<words::BlockColour>>, WordsRules) \
    X(zoxiYCbCr422ToRGB555Dither_8u16u_C2C3R, ZOX_SHAPE_FROM_C2, InYCbCr422, OutDither555Low0, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::CbAsCr<words::BlockColour>>, WordsRules) \
    X(zoxiYCbCr422ToRGB565Dither_8u16u_C2C3R, ZOX_SHAPE_FROM_C2, InYCbCr422, OutDither565Low0, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::CbAsCr<words::BlockColour>>, WordsRules) \
    X(zoxiYCbCr422ToBGR444Dither_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP422, OutDither444Low2, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::BlockColour>, WordsRules) \
    X(zoxiYCbCr422ToBGR555Dither_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP422, OutDither555Low2, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::BlockColour>, WordsRules) \
    X(zoxiYCbCr422ToBGR565Dither_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP422, OutDither565Low2, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::BlockColour>, WordsRules) \
    X(zoxiYCbCr422ToRGB444Dither_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP422, OutDither444Low0, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::BlockColour>, WordsRules) \
    X(zoxiYCbCr422ToRGB555Dither_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP422, OutDither555Low0, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::BlockColour>, WordsRules) \
    X(zoxiYCbCr422ToRGB565Dither_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP422, OutDither565Low0, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::BlockColour>, WordsRules) \
    X(zoxiYCbCr420ToBGR444Dither_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutDither444Low2, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::BlockColour>, WordsRules) \
    X(zoxiYCbCr420ToBGR555Dither_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutDither555Low2, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::BlockColour>, WordsRules) \
    X(zoxiYCbCr420ToBGR565Dither_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutDither565Low2, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::BlockColour>, WordsRules) \
    X(zoxiYCbCr420ToRGB444Dither_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutDither444Low0, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::BlockColour>, WordsRules) \
    X(zoxiYCbCr420ToRGB555Dither_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutDither555Low0, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::BlockColour>, WordsRules) \
    X(zoxiYCbCr420ToRGB565Dither_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutDither565Low0, Limit::All, words::BlockColour, words::BlockColour, LastPixel<words::BlockColour>, WordsRules) \
    X(zoxiYUV420ToBGR444Dither_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutDither444Low2, Limit::All, words::YuvBlockColour, words::YuvBlockColour, LastPixel<words::YuvBlockColour>, WordsRules) \
    X(zoxiYUV420ToBGR555Dither_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutDither555Low2, Limit::All, words::YuvBlockColour, words::YuvBlockColour, LastPixel<words::YuvBlockColour>, WordsRules) \
    X(zoxiYUV420ToBGR565Dither_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutDither565Low2, Limit::All, words::YuvBlockColour, words::YuvBlockColour, LastPixel<words::YuvBlockColour>, WordsRules) \
    X(zoxiYUV420ToRGB444Dither_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutDither444Low0, Limit::All, words::YuvBlockColour, words::YuvBlockColour, LastPixel<words::YuvBlockColour>, WordsRules) \
    X(zoxiYUV420ToRGB555Dither_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutDither555Low0, Limit::All, words::YuvBlockColour, words::YuvBlockColour, LastPixel<words::YuvBlockColour>, WordsRules) \
    X(zoxiYUV420ToRGB565Dither_8u16u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutDither565Low0, Limit::All, words::YuvBlockColour, words::YuvBlockColour, LastPixel<words::YuvBlockColour>, WordsRules)

#define ZOX_WORDS_SAMPLED_TABLE(X) ZOX_WORDS_FROM_SAMPLED_TABLE(X) ZOX_WORDS_DITHER_FROM_SAMPLED_TABLE(X)
