// RGB to chroma-sampled images: one row an export.
//   X(name, shape, Src, Dst, limit, block form, remainder form, tail form, rules)
// Rules: the pointer order, minimum width and height, and when the finished result warns.
#pragma once

#include "pointops/gamma.hpp"
#include "sampling/tosampled_forms.hpp"

namespace zox {

using ToP420 = OutSampledP3<Sampling::S420>;
using ToP422 = OutSampledP3<Sampling::S422>;
using ToP411 = OutSampledP3<Sampling::S411>;
using ToP2_420 = OutSampledP2<Sampling::S420>;
using ToYCbCr422 = OutSampledC2<YCbYCr>;
using ToYCrCb422 = OutSampledC2<YCrYCb>;
using ToCbYCr422 = OutSampledC2<CbYCrY>;
using InBGR4 = InPacked<4, Order::Bgr>;
// RGB samples through the forward gamma table first.
struct GammaFwd8u {
    static constexpr int apply(int s) { return gammaFwdTable8u[s]; }
};
using InC3Gamma = InMapped<InC3, GammaFwd8u>;

// 4:2:0 members that look at src and dst, then sizes, then the planes; others look at every pointer first.
using Rules420Any = SampledRules<PlanesLast, 1, 1, OddWarn::WidthOrHeightOdd>;
using Rules420AnyPairs = SampledRules<PlanesFirst, 1, 1, OddWarn::WidthOrHeightOdd>;
using Rules420Two = SampledRules<PlanesFirst, 2, 2, OddWarn::WidthOrHeightOdd>;
using Rules411 = SampledRules<PlanesFirst, 4, 1, OddWarn::WidthNotMultipleOf4>;
using Rules422Yuv = SampledRules<PlanesLast, 1, 1, OddWarn::Never>;
using Rules422Two = SampledRules<PlanesFirst, 2, 1, OddWarn::Never>;
using Rules422TwoOdd = SampledRules<PlanesFirst, 2, 1, OddWarn::WidthOdd>;
using Rules422 = SampledRules<PlanesFirst, 1, 1, OddWarn::Never>;

using Ycc601Sum = YccSumBlock<YccSum601, SumChroma::Sum>;
using Ycc709Sum = YccSumBlock<YccSum709, SumChroma::Sum>;
using Ycc709FullSum = YccSumBlock<YccSum709Full, SumChroma::Sum>;
using Ycc601Sum2 = YccSumBlock<YccSum601, SumChroma::Sum2>;
using Ycc601Signed = YccSumBlock<YccSum601, SumChroma::Signed>;
using Ycc709FullSigned = YccSumBlock<YccSum709Full, SumChroma::Signed>;
using Ycc709FullSum64 = YccSumBlock<YccSum709Full, SumChroma::Sum64>;
using YuvR422OrQ14 = ByAlignment<YuvR422Block, YuvQ14Block<false>>;
using YuvQ14OrD422 = ByAlignment<YuvQ14Block<false>, YuvD422Unit<false>>;
using YuvHalfTailRounded = YuvHalfTail<16383, 32767>;
using YuvHalfTailTruncated = YuvHalfTail<0, 0>;
using TailY = YccPixelTail<YccForward, 32768, WritesY>;
using TailYCb = YccPixelTail<YccForward, 32768, WritesY | WritesCb>;
using TailYCr = YccPixelTail<YccForward, 32768, WritesY | WritesCr>;
using TailYCb8192 = YccPixelTail<YccForward, 8192, WritesY | WritesCb>;
using Tail709FullYCb = YccPixelTail<YccPixel709Full, 32768, WritesY | WritesCb>;

} // namespace zox

// Members with kernels of their own, one row each: the kernels are instantiated from here.
#define ZOX_TO_SAMPLED_OWN_TABLE(X)                                                                                                                                                                  \
    X(zoxiRGBToYUV420_8u_C3P3R, ZOX_SHAPE_TO_P3, InC3, ToP420, Limit::L8, YuvR420Block, YuvY14Unit, NoTail, Rules420Any)                                             \
    X(zoxiRGBToYUV420_8u_P3R, ZOX_SHAPE_TO_P3, InP3, ToP420, Limit::None, NoBlock, YuvY16Unit, NoTail, Rules420Any)                                                  \
    X(zoxiBGRToYUV420_8u_AC4P3R, ZOX_SHAPE_TO_P3, InBGR4, ToP420, Limit::L16, YuvH420Block, YuvY16Unit, NoTail, Rules420Any)                                         \
    X(zoxiRGBToYCbCr420_8u_C3P3R, ZOX_SHAPE_TO_P3, InC3, ToP420, Limit::L8, YccRoundBlock<false>, YccPixel4<YccForward>, NoTail, Rules420Any)                        \
    X(zoxiRGBToYCbCr420_8u_C3P2R, ZOX_SHAPE_TO_P2, InC3, ToP2_420, Limit::L8, YccRoundBlock<false>, YccPixel4<YccForward>, NoTail, Rules420AnyPairs)                 \
    X(zoxiRGBToYCbCr420_8u_C4P2R, ZOX_SHAPE_TO_P2, InAC4, ToP2_420, Limit::L8, YccRoundBlock<false>, YccPixel4<YccForward>, NoTail, Rules420AnyPairs)                \
    X(zoxiBGRToYCbCr420_8u_C3P3R, ZOX_SHAPE_TO_P3, InBGR3, ToP420, Limit::LB, Ycc601Sum, YccPixel4<YccForward>, NoTail, Rules420Two)                                 \
    X(zoxiBGRToYCbCr420_8u_AC4P3R, ZOX_SHAPE_TO_P3, InBGR4, ToP420, Limit::LB, Ycc601Sum, YccPixel4<YccForward>, NoTail, Rules420Two)                                \
    X(zoxiRGBToYCrCb420_8u_AC4P3R, ZOX_SHAPE_TO_P3_CR_FIRST, InAC4, ToP420, Limit::LB, Ycc601Sum, YccPixel4<YccForward>, NoTail, Rules420Two)                        \
    X(zoxiBGRToYCbCr420_709CSC_8u_C3P3R, ZOX_SHAPE_TO_P3, InBGR3, ToP420, Limit::LB, Ycc709Sum, YccPixel4<YccPixel709>, NoTail, Rules420Two)                         \
    X(zoxiBGRToYCbCr420_709CSC_8u_AC4P3R, ZOX_SHAPE_TO_P3, InBGR4, ToP420, Limit::LB, Ycc709Sum, YccPixel4<YccPixel709>, NoTail, Rules420Two)                        \
    X(zoxiBGRToYCbCr420_709CSC_8u_C3P2R, ZOX_SHAPE_TO_P2, InBGR3, ToP2_420, Limit::L8, Ycc709Sum, YccPixel4<YccPixel709>, NoTail, Rules420Two)                       \
    X(zoxiBGRToYCbCr420_709HDTV_8u_AC4P3R, ZOX_SHAPE_TO_P3, InBGR4, ToP420, Limit::LB, Ycc709FullSum, YccPixel4<YccPixel709Full>, NoTail, Rules420Two)               \
    X(zoxiBGRToYCbCr411_8u_AC4P3R, ZOX_SHAPE_TO_P3, InBGR4, ToP411, Limit::LC, Ycc601Sum, YccPixel4<YccForward>, TailY, Rules411)                                    \
    X(zoxiBGRToYCbCr411_8u_C3P3R, ZOX_SHAPE_TO_P3, InBGR3, ToP411, Limit::L16, YccRoundBlock<true>, YccPixel4<YccForward>, NoTail, Rules411)                         \
    X(zoxiRGBToYUV422_8u_C3C2R, ZOX_SHAPE_TO_C2, InC3, ToYCbCr422, Limit::L16, YuvQ14Block<true>, YuvD422Unit<true>, YuvDifferenceTail, Rules422Yuv)                 \
    X(zoxiRGBToYUV422_8u_C3P3R, ZOX_SHAPE_TO_P3, InC3, ToP422, Limit::L16, YuvR422OrQ14, YuvQ14OrD422, YuvHalfTailRounded, Rules422Yuv)                              \
    X(zoxiRGBToYUV422_8u_P3R, ZOX_SHAPE_TO_P3, InP3, ToP422, Limit::L16, YuvD257Block, YuvD422Unit<false>, YuvHalfTailTruncated, Rules422Yuv)                        \
    X(zoxiBGRToYCbCr422_8u_C3C2R, ZOX_SHAPE_TO_C2, InBGR3, ToYCbCr422, Limit::LC, Ycc601Sum2, YccPixel2<YccForward>, TailYCb8192, Rules422Two)                       \
    X(zoxiBGRToYCbCr422_8u_AC4C2R, ZOX_SHAPE_TO_C2, InBGR4, ToYCbCr422, Limit::LC, Ycc601Sum2, YccPixel2<YccForward>, TailYCb8192, Rules422Two)                      \
    X(zoxiBGRToYCbCr422_8u_C3P3R, ZOX_SHAPE_TO_P3, InBGR3, ToP422, Limit::LC, Ycc601Sum2, YccPixel2<YccForward>, TailY, Rules422Two)                                 \
    X(zoxiBGRToYCbCr422_8u_AC4P3R, ZOX_SHAPE_TO_P3, InBGR4, ToP422, Limit::LC, Ycc601Sum2, YccPixel2<YccForward>, TailY, Rules422Two)                                \
    X(zoxiRGBToYCbCr422_8u_C3P3R, ZOX_SHAPE_TO_P3, InC3, ToP422, Limit::LC, Ycc601Sum2, YccPixel2<YccForward>, NoTail, Rules422TwoOdd)                               \
    X(zoxiRGBToYCbCr422_8u_C3C2R, ZOX_SHAPE_TO_C2, InC3, ToYCbCr422, Limit::L8, YccMixedBlock, YccMixedTail, TailYCb, Rules422)                                      \
    X(zoxiRGBToYCbCr422_8u_P3C2R, ZOX_SHAPE_TO_C2, InP3, ToYCbCr422, Limit::L8, YccMixedBlock, YccMixedTail, TailYCb, Rules422Yuv)                                   \
    X(zoxiRGBToYCrCb422_8u_C3C2R, ZOX_SHAPE_TO_C2, InC3, ToYCrCb422, Limit::L8, YccMixedBlock, YccMixedTail, TailYCr, Rules422)                                      \
    X(zoxiRGBToYCrCb422_8u_P3C2R, ZOX_SHAPE_TO_C2, InP3, ToYCrCb422, Limit::L8, YccMixedBlock, YccMixedTail, TailYCr, Rules422Yuv)                                   \
    X(zoxiBGRToCbYCr422_8u_AC4C2R, ZOX_SHAPE_TO_C2, InBGR4, ToCbYCr422, Limit::L8, Ycc601Signed, YccPixel62<YccForward>, TailYCb, Rules422)                          \
    X(zoxiBGRToCbYCr422_709HDTV_8u_AC4C2R, ZOX_SHAPE_TO_C2, InBGR4, ToCbYCr422, Limit::L8, Ycc709FullSigned, YccPixel62<YccPixel709Full>, Tail709FullYCb, Rules422)  \
    X(zoxiBGRToCbYCr422_709HDTV_8u_C3C2R, ZOX_SHAPE_TO_C2, InBGR3, ToCbYCr422, Limit::LC, Ycc709FullSum64, YccPixel62<YccPixel709Full>, Tail709FullYCb, Rules422)    \
    X(zoxiRGBToCbYCr422_8u_C3C2R, ZOX_SHAPE_TO_C2, InC3, ToCbYCr422, Limit::All, YccTapFilter, YccTapFilter, TailYCb, Rules422)                                      \
    X(zoxiRGBToCbYCr422Gamma_8u_C3C2R, ZOX_SHAPE_TO_C2, InC3Gamma, ToCbYCr422, Limit::All, YccTapFilter, YccTapFilter, TailYCb, Rules422)

// Members that run the kernels of a sister above: YCrCb names with the chroma planes exchanged on the
// way in, and the members without R, which take packed planes (the 4:2:2 ones treat an even-width image
// of 256 pixels or more as one row, in their unaligned form).
#define ZOX_TO_SAMPLED_SISTER_TABLE(X)                                                                                                                                                     \
    X(zoxiBGRToYCrCb420_8u_C3P3R, ZOX_SHAPE_TO_P3_CR_FIRST, InBGR3, ToP420, Limit::LB, Ycc601Sum, YccPixel4<YccForward>, NoTail, Rules420Two)           \
    X(zoxiBGRToYCrCb420_8u_AC4P3R, ZOX_SHAPE_TO_P3_CR_FIRST, InBGR4, ToP420, Limit::LB, Ycc601Sum, YccPixel4<YccForward>, NoTail, Rules420Two)          \
    X(zoxiBGRToYCrCb420_709CSC_8u_C3P3R, ZOX_SHAPE_TO_P3_CR_FIRST, InBGR3, ToP420, Limit::LB, Ycc709Sum, YccPixel4<YccPixel709>, NoTail, Rules420Two)   \
    X(zoxiBGRToYCrCb420_709CSC_8u_AC4P3R, ZOX_SHAPE_TO_P3_CR_FIRST, InBGR4, ToP420, Limit::LB, Ycc709Sum, YccPixel4<YccPixel709>, NoTail, Rules420Two)  \
    X(zoxiRGBToYUV420_8u_C3P3, ZOX_SHAPE_TO_P3_IMAGE, InC3, ToP420, Limit::L8, YuvR420Block, YuvY14Unit, NoTail, Rules420Any)                        \
    X(zoxiRGBToYUV420_8u_P3, ZOX_SHAPE_TO_P3_IMAGE, InP3, ToP420, Limit::None, NoBlock, YuvY16Unit, NoTail, Rules420Any)                             \
    X(zoxiRGBToYUV422_8u_C3P3, ZOX_SHAPE_TO_P3_IMAGE, InC3, ToP422, Limit::L16, YuvR422OrQ14, YuvQ14OrD422, YuvHalfTailRounded, Rules422Yuv)         \
    X(zoxiRGBToYUV422_8u_P3, ZOX_SHAPE_TO_P3_IMAGE, InP3, ToP422, Limit::L16, YuvD257Block, YuvD422Unit<false>, YuvHalfTailTruncated, Rules422Yuv)

#define ZOX_TO_SAMPLED_TABLE(X) ZOX_TO_SAMPLED_OWN_TABLE(X) ZOX_TO_SAMPLED_SISTER_TABLE(X)
