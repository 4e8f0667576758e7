// Chroma-sampled images to RGB: one row an export.
//   X(name, shape, Src, Dst, limit, block form, remainder form, last-pixel form, rules)
// The last-pixel form serves an odd 4:2:2 width's half unit (and the one pixel of width 1); 4:2:0 leaves
// an odd last column and row unwritten, and 4:1:1 gives the pixels behind its last whole unit that
// unit's chroma and the form of their column.
#pragma once

#include "frame/fromsampled.hpp"
#include "sampling/fromsampled_forms.hpp"

namespace zox {

using InP420 = InSampledP3<Sampling::S420>;
using InP420CrFirst = InSampledP3<Sampling::S420, true>;
using InP422 = InSampledP3<Sampling::S422>;
using InP411 = InSampledP3<Sampling::S411>;
using InCbCrPairs = InSampledP2<false>;
using InCrCbPairs = InSampledP2<true>;
using InYCbCr422 = InSampledC2<YCbYCr>; // also Y0 U Y1 V
using InYCrCb422 = InSampledC2<YCrYCb>;
using InCbYCr422 = InSampledC2<CbYCrY>;
using OutAC4Zero = OutPacked<4, Order::Rgb, Fourth::Zero>;

using FoldedA = RgbFromYccFolded<YccFoldedA>;
using FoldedB = RgbFromYccFolded<YccFoldedB>;
using FoldedC = RgbFromYccFolded<YccFoldedC>;
using SplitA = RgbFromYccSplit<YccSplitA>;
using SplitOrBlockB = ByAlignment<RgbFromYccSplit<YccSplitB>, RgbFromYccBlockBSum>;
using Wide709FullSum = RgbFromWide<Ycc709FullInverseBlock, Green::Sum>;
using Wide709FullDifference = RgbFromWide<Ycc709FullInverseBlock, Green::Difference>;
using WideMixedDifference = RgbFromWide<YuvInverseBlockMixed, Green::Difference>;
using YuvBlock16Gains8 = RgbFromYuvBlock16With<YuvInverseBlock8>;
using YuvRoundedGainsTruncated = RgbFromYuvPixel<YuvInverseRounded, 0, 0>;
using RgbFromYccPixel709 = RgbFromYccPixel<YccInversePixel709, 32768>;
using RgbFromYccPixel709Full = RgbFromYccPixel<YccInversePixel709Full, 32768>;
using RgbFromYccPixel411 = RgbFromYccPixel<YccInversePixel411, 32768>;
// Width 1 of the YUV 4:2:2 groups: the one chroma byte through the truncated gains.
using LastYuv422 = LastPixel<RgbFromYuvRounded, YuvRoundedGainsTruncated>;
using LastScale13 = LastPixel<RgbFromYuvScale13>;

using From420 = SampledRules<PlanesLast, 1, 1, OddWarn::WidthOrHeightOdd>;
using From420SizesFirst = SampledRules<SizesFirst, 1, 1, OddWarn::WidthOrHeightOdd>;
using From420Two = SampledRules<PlanesLast, 2, 2, OddWarn::WidthOrHeightOdd>;
using From422 = SampledRules<PlanesLast, 1, 1, OddWarn::Never>;
using From422Two = SampledRules<PlanesLast, 2, 1, OddWarn::Never>;
using From422TwoPlanesFirst = SampledRules<PlanesFirst, 2, 1, OddWarn::Never>;
using From411 = SampledRules<PlanesFirst, 4, 1, OddWarn::Never>;

} // namespace zox

#define ZOX_FROM_SAMPLED_420_TABLE(X)                                                                                                                                        \
    X(zoxiYCbCr420ToBGR_8u_P2C3R, ZOX_SHAPE_FROM_P2, InCbCrPairs, OutBGR3, Limit::All, FoldedA, FoldedA, Unwritten, From420)                                    \
    X(zoxiYCbCr420ToBGR_8u_P2C4R, ZOX_SHAPE_FROM_P2_ALPHA, InCbCrPairs, OutBGR4A, Limit::All, FoldedA, FoldedA, Unwritten, From420)                             \
    X(zoxiYCbCr420ToRGB_8u_P2C3R, ZOX_SHAPE_FROM_P2, InCbCrPairs, OutC3, Limit::All, FoldedA, FoldedA, Unwritten, From420)                                      \
    X(zoxiYCbCr420ToRGB_8u_P2C4R, ZOX_SHAPE_FROM_P2_ALPHA, InCbCrPairs, OutC4A, Limit::All, FoldedA, FoldedA, Unwritten, From420)                               \
    X(zoxiYCbCr420ToBGR_8u_P3C4R, ZOX_SHAPE_FROM_P3_ALPHA, InP420, OutBGR4A, Limit::All, FoldedA, FoldedA, Unwritten, From420)                                  \
    X(zoxiYCrCb420ToBGR_8u_P2C3R, ZOX_SHAPE_FROM_P2, InCrCbPairs, OutBGR3, Limit::All, FoldedB, FoldedB, Unwritten, From420)                                    \
    X(zoxiYCrCb420ToBGR_8u_P2C4R, ZOX_SHAPE_FROM_P2_ALPHA, InCrCbPairs, OutBGR4A, Limit::All, FoldedB, FoldedB, Unwritten, From420SizesFirst)                   \
    X(zoxiYCrCb420ToRGB_8u_P2C3R, ZOX_SHAPE_FROM_P2, InCrCbPairs, OutC3, Limit::All, FoldedB, FoldedB, Unwritten, From420)                                      \
    X(zoxiYCrCb420ToRGB_8u_P2C4R, ZOX_SHAPE_FROM_P2_ALPHA, InCrCbPairs, OutC4A, Limit::All, FoldedB, FoldedB, Unwritten, From420SizesFirst)                     \
    X(zoxiYCbCr420ToBGR_8u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutBGR3, Limit::L8, SplitOrBlockB, RgbFromYccPixelARounded, Unwritten, From420)                    \
    X(zoxiYCbCr420ToRGB_8u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutC3, Limit::L8, RgbFromYccBlockBSum, RgbFromYccPixelARounded, Unwritten, From420)                \
    X(zoxiYCrCb420ToRGB_8u_P3C4R, ZOX_SHAPE_FROM_P3_ALPHA, InP420CrFirst, OutC4A, Limit::L8, RgbFromYccBlockBDifference, RgbFromYccPixelARounded, Unwritten, From420) \
    X(zoxiYCbCr420ToBGR_709CSC_8u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutBGR3, Limit::L8, RgbFromYcc709Sum, RgbFromYccPixel709, Unwritten, From420)               \
    X(zoxiYCbCr420ToBGR_709HDTV_8u_P3C4R, ZOX_SHAPE_FROM_P3_ALPHA, InP420, OutBGR4A, Limit::L8, Wide709FullDifference, RgbFromYccPixel709Full, Unwritten, From420) \
    X(zoxiYUV420ToBGR_8u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutBGR3, Limit::All, YuvBlock16Gains8, YuvBlock16Gains8, Unwritten, From420Two)                      \
    X(zoxiYUV420ToRGB_8u_P3R, ZOX_SHAPE_FROM_P3, InP420, OutP3, Limit::All, YuvRoundedGainsTruncated, YuvRoundedGainsTruncated, Unwritten, From420)             \
    X(zoxiYUV420ToRGB_8u_P3C3R, ZOX_SHAPE_FROM_P3, InP420, OutC3, Limit::All, RgbFromYuvBlock16, RgbFromYuvBlock16, Unwritten, From420)                         \
    X(zoxiYUV420ToRGB_8u_P3AC4R, ZOX_SHAPE_FROM_P3, InP420, OutAC4Zero, Limit::L4, WideMixedDifference, RgbFromYuvRounded, Unwritten, From420)

#define ZOX_FROM_SAMPLED_422_TABLE(X)                                                                                                                                        \
    X(zoxiYCbCr422ToRGB_8u_C2C4R, ZOX_SHAPE_FROM_C2_ALPHA, InYCbCr422, OutC4A, Limit::L8, FoldedC, RgbFromYccPixelARounded, RgbFromYccPixelARounded, From422)   \
    X(zoxiYCrCb422ToRGB_8u_C2C4R, ZOX_SHAPE_FROM_C2_ALPHA, InYCrCb422, OutC4A, Limit::L8, FoldedC, RgbFromYccPixelARounded, RgbFromYccPixelARounded, From422)   \
    X(zoxiYCrCb422ToBGR_8u_C2C4R, ZOX_SHAPE_FROM_C2_ALPHA, InYCrCb422, OutBGR4A, Limit::L8, FoldedC, RgbFromYccPixelARounded, RgbFromYccPixelARounded, From422) \
    X(zoxiYCrCb422ToRGB_8u_C2C3R, ZOX_SHAPE_FROM_C2, InYCrCb422, OutC3, Limit::L8, FoldedC, RgbFromYccPixelARounded, RgbFromYccPixelARounded, From422)          \
    X(zoxiYCrCb422ToBGR_8u_C2C3R, ZOX_SHAPE_FROM_C2, InYCrCb422, OutBGR3, Limit::L8, FoldedC, RgbFromYccPixelARounded, RgbFromYccPixelARounded, From422)        \
    X(zoxiYCbCr422ToBGR_8u_C2C3R, ZOX_SHAPE_FROM_C2, InYCbCr422, OutBGR3, Limit::Even, RgbFromYccBlockBSum, RgbFromYccBiased, RgbFromYccBiased, From422Two)     \
    X(zoxiYCbCr422ToBGR_8u_C2C4R, ZOX_SHAPE_FROM_C2_ALPHA, InYCbCr422, OutBGR4A, Limit::L8, SplitA, RgbFromYccBiased, RgbFromYccBiased, From422Two)             \
    X(zoxiYCbCr422ToRGB_8u_C2C3R, ZOX_SHAPE_FROM_C2, InYCbCr422, OutC3, Limit::L4, RgbFromYccBlockATruncated, RgbFromYccBiased, RgbFromYccBiased, From422)      \
    X(zoxiYCbCr422ToRGB_8u_C2P3R, ZOX_SHAPE_FROM_C2, InYCbCr422, OutP3, Limit::L4, RgbFromYccBlockATruncated, RgbFromYccBiased, RgbFromYccBiased, From422)      \
    X(zoxiYCrCb422ToRGB_8u_C2P3R, ZOX_SHAPE_FROM_C2, InYCrCb422, OutP3, Limit::L4, RgbFromYccBlockATruncated, RgbFromYccBiased, RgbFromYccBiased, From422)      \
    X(zoxiCbYCr422ToBGR_709HDTV_8u_C2C3R, ZOX_SHAPE_FROM_C2, InCbYCr422, OutBGR3, Limit::L8, Wide709FullSum, RgbFromYccPixel709Full, RgbFromYccPixel709Full, From422) \
    X(zoxiCbYCr422ToBGR_709HDTV_8u_C2C4R, ZOX_SHAPE_FROM_C2_ALPHA, InCbYCr422, OutBGR4A, Limit::L8, Wide709FullSum, RgbFromYccPixel709Full, RgbFromYccPixel709Full, From422) \
    X(zoxiCbYCr422ToBGR_8u_C2C4R, ZOX_SHAPE_FROM_C2_ALPHA, InCbYCr422, OutBGR4A, Limit::L8, RgbFromYccBlockBSum, RgbFromYccPixelBRounded, RgbFromYccPixelBRounded, From422) \
    X(zoxiCbYCr422ToRGB_8u_C2C3R, ZOX_SHAPE_FROM_C2, InCbYCr422, OutC3, Limit::L8, RgbFromYccBlockBSum, RgbFromYccPixelBRounded, RgbFromYccPixelBRounded, From422) \
    X(zoxiYCbCr422ToBGR_8u_P3C3R, ZOX_SHAPE_FROM_P3, InP422, OutBGR3, Limit::L8, RgbFromYccBlockBSum, RgbFromYccBiased, Unwritten, From422TwoPlanesFirst)      \
    X(zoxiYCbCr422ToRGB_8u_P3C3R, ZOX_SHAPE_FROM_P3, InP422, OutC3, Limit::L8, SplitOrBlockB, RgbFromYccPixelBTruncated, RgbFromYccPixelBTruncated, From422)    \
    X(zoxiYUV422ToRGB_8u_C2C3R, ZOX_SHAPE_FROM_C2, InYCbCr422, OutC3, Limit::L16, RgbFromYuvBlock16, RgbFromYuvRounded, LastYuv422, From422)                    \
    X(zoxiYUV422ToRGB_8u_P3R, ZOX_SHAPE_FROM_P3, InP422, OutP3, Limit::L16, RgbFromYuvBlock16, YuvRoundedGainsTruncated, LastScale13, From422)                  \
    X(zoxiYUV422ToRGB_8u_P3C3R, ZOX_SHAPE_FROM_P3, InP422, OutC3, Limit::L16, RgbFromYuvBlock16, YuvRoundedGainsTruncated, YuvRoundedGainsTruncated, From422)  \
    X(zoxiYUV422ToRGB_8u_P3AC4R, ZOX_SHAPE_FROM_P3, InP422, OutAC4Zero, Limit::L4, WideMixedDifference, YuvRoundedGainsTruncated, YuvRoundedGainsTruncated, From422)

#define ZOX_FROM_SAMPLED_411_TABLE(X)                                                                                                                                        \
    X(zoxiYCbCr411ToBGR_8u_P3C3R, ZOX_SHAPE_FROM_P3, InP411, OutBGR3, Limit::L4P3, RgbFromYccBlockARounded, RgbFromYccPixel411, Unwritten, From411)             \
    X(zoxiYCbCr411ToBGR_8u_P3C4R, ZOX_SHAPE_FROM_P3_ALPHA, InP411, OutBGR4A, Limit::L4P3, RgbFromYccBlockARounded, RgbFromYccPixel411, Unwritten, From411)

// The members without R: packed planes through the kernels of their R sisters above.
#define ZOX_FROM_SAMPLED_PACKED_TABLE(X)                                                                                                                                     \
    X(zoxiYUV420ToRGB_8u_P3, ZOX_SHAPE_FROM_IMAGE, InP420, OutP3, Limit::All, YuvRoundedGainsTruncated, YuvRoundedGainsTruncated, Unwritten, From420)           \
    X(zoxiYUV420ToRGB_8u_P3C3, ZOX_SHAPE_FROM_IMAGE, InP420, OutC3, Limit::All, RgbFromYuvBlock16, RgbFromYuvBlock16, Unwritten, From420)                       \
    X(zoxiYUV422ToRGB_8u_P3, ZOX_SHAPE_FROM_IMAGE, InP422, OutP3, Limit::L16, RgbFromYuvBlock16, YuvRoundedGainsTruncated, LastScale13, From422)               \
    X(zoxiYUV422ToRGB_8u_P3C3, ZOX_SHAPE_FROM_IMAGE, InP422, OutC3, Limit::L16, RgbFromYuvBlock16, YuvRoundedGainsTruncated, YuvRoundedGainsTruncated, From422)

// Members with kernels of their own: the kernels are instantiated from here.
#define ZOX_FROM_SAMPLED_OWN_TABLE(X) ZOX_FROM_SAMPLED_420_TABLE(X) ZOX_FROM_SAMPLED_422_TABLE(X) ZOX_FROM_SAMPLED_411_TABLE(X)
#define ZOX_FROM_SAMPLED_TABLE(X) ZOX_FROM_SAMPLED_OWN_TABLE(X) ZOX_FROM_SAMPLED_PACKED_TABLE(X)
