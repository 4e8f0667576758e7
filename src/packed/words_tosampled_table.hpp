// Sixteen-bit RGB words to chroma-sampled images: one row an export of the sampled-destination frame.
//   X(name, shape, Src, Dst, limit, block form, remainder form, tail form, rules)
// BGR words read red from the high field, RGB565 words from the low one. Studio-range YCbCr: block forms
// below the limit column, pixel forms up to w & ~1; the tail writes pixel luma (and in the packed 4:2:2
// member the one-pixel Cb) of a last odd column, and in 4:2:0 of a last odd row; 4:1:1 from BGR565 leaves
// the last w & 3 columns unwritten. YUV: a last odd column and row are not written; the 4:2:0 members
// from BGR words find the second row of a pair at srcStep & ~1 past the first. Source steps are taken as
// they come.
#pragma once

#include "frame/sampled.hpp"
#include "packed/words_forms.hpp"
#include "sampling/tosampled_table.hpp"

namespace zox {
using InWordBgr555 = InWord<Fields555, 2>;
using InWordBgr565 = InWord<Fields565, 2>;
using InWordRgb565 = InWord<Fields565, 0>;
// Half forms with the luma rounded.
using YuvHalf420Rounded = YuvHalfBlock<4, 1>;
using YuvHalf422Rounded = YuvHalfBlock<2, 1>;
using Rules420TwoQuiet = SampledRules<PlanesFirst, 2, 2, OddWarn::Never>;
using Rules422AnyOdd = SampledRules<PlanesLast, 1, 1, OddWarn::WidthOdd>;
} // namespace zox

// The rows with kernels of their own, and the YCrCb twins that run their YCbCr sisters' kernels with the
// chroma planes exchanged on the way in.
#define ZOX_WORDS_TO_SAMPLED_OWN(X) \
    X(zoxiBGR555ToYCbCr411_16u8u_C3P3R, ZOX_SHAPE_TO_P3, InWordBgr555, ToP411, Limit::L4, Ycc601Sum, Ycc601Sum, TailY, Rules411) \
    X(zoxiBGR565ToYCbCr411_16u8u_C3P3R, ZOX_SHAPE_TO_P3, InWordBgr565, ToP411, Limit::L4, Ycc601Sum, Ycc601Sum, NoTail, Rules411) \
    X(zoxiBGR555ToYCbCr420_16u8u_C3P3R, ZOX_SHAPE_TO_P3, InWordBgr555, ToP420, Limit::LB, Ycc601Sum, YccPixel4<YccForward>, TailY, Rules420TwoQuiet) \
    X(zoxiBGR565ToYCbCr420_16u8u_C3P3R, ZOX_SHAPE_TO_P3, InWordBgr565, ToP420, Limit::LB, Ycc601Sum, YccPixel4<YccForward>, TailY, Rules420TwoQuiet) \
    X(zoxiBGR555ToYCbCr422_16u8u_C3C2R, ZOX_SHAPE_TO_C2, InWordBgr555, ToYCbCr422, Limit::LC, Ycc601Sum2, YccPixel2<YccForward>, TailYCb8192, Rules422Two) \
    X(zoxiBGR565ToYCbCr422_16u8u_C3C2R, ZOX_SHAPE_TO_C2, InWordBgr565, ToYCbCr422, Limit::LC, Ycc601Sum2, YccPixel2<YccForward>, TailYCb8192, Rules422Two) \
    X(zoxiBGR555ToYCbCr422_16u8u_C3P3R, ZOX_SHAPE_TO_P3, InWordBgr555, ToP422, Limit::LC, Ycc601Sum2, YccPixel2<YccForward>, TailY, Rules422Two) \
    X(zoxiBGR565ToYCbCr422_16u8u_C3P3R, ZOX_SHAPE_TO_P3, InWordBgr565, ToP422, Limit::LC, Ycc601Sum2, YccPixel2<YccForward>, TailY, Rules422Two) \
    X(zoxiBGR555ToYUV420_16u8u_C3P3R, ZOX_SHAPE_TO_P3, InEvenPairStep<InWordBgr555>, ToP420, Limit::L4, YuvSumBlock, YuvY16RoundedUnit, NoTail, Rules420Two) \
    X(zoxiBGR565ToYUV420_16u8u_C3P3R, ZOX_SHAPE_TO_P3, InEvenPairStep<InWordBgr565>, ToP420, Limit::L4, YuvSumBlock, YuvY16RoundedUnit, NoTail, Rules420Two) \
    X(zoxiRGB565ToYUV420_16u8u_C3P3R, ZOX_SHAPE_TO_P3, InWordRgb565, ToP420, Limit::L16, YuvHalf420Rounded, YuvY16Unit, NoTail, Rules420Any) \
    X(zoxiRGB565ToYUV422_16u8u_C3P3R, ZOX_SHAPE_TO_P3, InWordRgb565, ToP422, Limit::L16, YuvHalf422Rounded, YuvD422Unit<false>, NoTail, Rules422AnyOdd)
#define ZOX_WORDS_TO_SAMPLED_TWINS(X) \
    X(zoxiBGR555ToYCrCb420_16u8u_C3P3R, ZOX_SHAPE_TO_P3_CR_FIRST, InWordBgr555, ToP420, Limit::LB, Ycc601Sum, YccPixel4<YccForward>, TailY, Rules420TwoQuiet) \
    X(zoxiBGR565ToYCrCb420_16u8u_C3P3R, ZOX_SHAPE_TO_P3_CR_FIRST, InWordBgr565, ToP420, Limit::LB, Ycc601Sum, YccPixel4<YccForward>, TailY, Rules420TwoQuiet)
#define ZOX_WORDS_TO_SAMPLED_TABLE(X) ZOX_WORDS_TO_SAMPLED_OWN(X) ZOX_WORDS_TO_SAMPLED_TWINS(X)
