// RGB <-> XYZ and RGB <-> YCC exports at 8u, 16u, 16s and 32f: one row an export.
//   X(name, shape, Src, Dst, N, block form, remainder form, checks)
// N: 8u C3R 8, 8u AC4R 4, 16-bit 4 (the forms differ only in YCC), 32f one form in all columns. The
// 16- and 32-bit members take their steps in whole samples. AC4R: the fourth channel is neither read
// for a value nor written, at every depth.
#pragma once

#include "lumachroma/xyzycc_forms.hpp"

namespace zox {
using In3_16u = InPacked<3, Order::Rgb, uint16_t>;
using In4_16u = InPacked<4, Order::Rgb, uint16_t>;
using Out3_16u = OutPacked<3, Order::Rgb, Fourth::None, uint16_t>;
using Out4_16u = OutPacked<4, Order::Rgb, Fourth::Keep, uint16_t>;
using In3_16s = InPacked<3, Order::Rgb, int16_t>;
using In4_16s = InPacked<4, Order::Rgb, int16_t>;
using Out3_16s = OutPacked<3, Order::Rgb, Fourth::None, int16_t>;
using Out4_16s = OutPacked<4, Order::Rgb, Fourth::Keep, int16_t>;
using In3_32f = InPacked<3, Order::Rgb, float>;
using In4_32f = InPacked<4, Order::Rgb, float>;
using Out3_32f = OutPacked<3, Order::Rgb, Fourth::None, float>;
using Out4_32f = OutPacked<4, Order::Rgb, Fourth::Keep, float>;
namespace xyzycc {
using XyzForward16u = Xyz16<XyzForward, Depth::U16>;
using XyzForward16s = Xyz16<XyzForward, Depth::S16>;
using XyzInverse16u = Xyz16<XyzInverse, Depth::U16>;
using XyzInverse16s = Xyz16<XyzInverse, Depth::S16>;
using YccForwardBlock16u = YccForwardBlock16<Depth::U16>;
using YccForwardBlock16s = YccForwardBlock16<Depth::S16>;
} // namespace xyzycc
} // namespace zox

#define ZOX_XYZYCC_TABLE(X) \
    X(zoxiRGBToXYZ_8u_C3R, ZOX_SHAPE_SD, InC3, OutC3, 8, xyzycc::XyzForwardBlock, xyzycc::XyzForwardPixel, PlanesLast)                            \
    X(zoxiRGBToXYZ_8u_AC4R, ZOX_SHAPE_SD, InAC4, OutAC4, 4, xyzycc::XyzForwardBlock, xyzycc::XyzForwardPixel, PlanesLast)                         \
    X(zoxiRGBToXYZ_16u_C3R, ZOX_SHAPE_SD_SAMPLES, In3_16u, Out3_16u, 4, xyzycc::XyzForward16u, xyzycc::XyzForward16u, PlanesLast)                 \
    X(zoxiRGBToXYZ_16u_AC4R, ZOX_SHAPE_SD_SAMPLES, In4_16u, Out4_16u, 4, xyzycc::XyzForward16u, xyzycc::XyzForward16u, PlanesLast)                \
    X(zoxiRGBToXYZ_16s_C3R, ZOX_SHAPE_SD_SAMPLES, In3_16s, Out3_16s, 4, xyzycc::XyzForward16s, xyzycc::XyzForward16s, PlanesLast)                 \
    X(zoxiRGBToXYZ_16s_AC4R, ZOX_SHAPE_SD_SAMPLES, In4_16s, Out4_16s, 4, xyzycc::XyzForward16s, xyzycc::XyzForward16s, PlanesLast)                \
    X(zoxiRGBToXYZ_32f_C3R, ZOX_SHAPE_SD_SAMPLES, In3_32f, Out3_32f, 1, NoBlock, xyzycc::XyzForward32f, PlanesLast)                               \
    X(zoxiRGBToXYZ_32f_AC4R, ZOX_SHAPE_SD_SAMPLES, In4_32f, Out4_32f, 1, NoBlock, xyzycc::XyzForward32f, PlanesLast)                              \
    X(zoxiXYZToRGB_8u_C3R, ZOX_SHAPE_SD, InC3, OutC3, 8, xyzycc::XyzInverseBlock, xyzycc::XyzInversePixel, PlanesLast)                            \
    X(zoxiXYZToRGB_8u_AC4R, ZOX_SHAPE_SD, InAC4, OutAC4, 4, xyzycc::XyzInverseBlock, xyzycc::XyzInversePixel, PlanesLast)                         \
    X(zoxiXYZToRGB_16u_C3R, ZOX_SHAPE_SD_SAMPLES, In3_16u, Out3_16u, 4, xyzycc::XyzInverse16u, xyzycc::XyzInverse16u, PlanesLast)                 \
    X(zoxiXYZToRGB_16u_AC4R, ZOX_SHAPE_SD_SAMPLES, In4_16u, Out4_16u, 4, xyzycc::XyzInverse16u, xyzycc::XyzInverse16u, PlanesLast)                \
    X(zoxiXYZToRGB_16s_C3R, ZOX_SHAPE_SD_SAMPLES, In3_16s, Out3_16s, 4, xyzycc::XyzInverse16s, xyzycc::XyzInverse16s, PlanesLast)                 \
    X(zoxiXYZToRGB_16s_AC4R, ZOX_SHAPE_SD_SAMPLES, In4_16s, Out4_16s, 4, xyzycc::XyzInverse16s, xyzycc::XyzInverse16s, PlanesLast)                \
    X(zoxiXYZToRGB_32f_C3R, ZOX_SHAPE_SD_SAMPLES, In3_32f, Out3_32f, 1, NoBlock, xyzycc::XyzInverse32f, PlanesLast)                               \
    X(zoxiXYZToRGB_32f_AC4R, ZOX_SHAPE_SD_SAMPLES, In4_32f, Out4_32f, 1, NoBlock, xyzycc::XyzInverse32f, PlanesLast)                              \
    X(zoxiRGBToYCC_8u_C3R, ZOX_SHAPE_SD, InC3, OutC3, 8, xyzycc::YccForwardBlock8, xyzycc::YccForwardRemainder8, PlanesLast)                      \
    X(zoxiRGBToYCC_8u_AC4R, ZOX_SHAPE_SD, InAC4, OutAC4, 4, xyzycc::YccForwardBlock8, xyzycc::YccForwardRemainder8, PlanesLast)                   \
    X(zoxiRGBToYCC_16u_C3R, ZOX_SHAPE_SD_SAMPLES, In3_16u, Out3_16u, 4, xyzycc::YccForwardBlock16u, xyzycc::YccForwardRemainder16u, PlanesLast)   \
    X(zoxiRGBToYCC_16u_AC4R, ZOX_SHAPE_SD_SAMPLES, In4_16u, Out4_16u, 4, xyzycc::YccForwardBlock16u, xyzycc::YccForwardRemainder16u, PlanesLast)  \
    X(zoxiRGBToYCC_16s_C3R, ZOX_SHAPE_SD_SAMPLES, In3_16s, Out3_16s, 4, xyzycc::YccForwardBlock16s, xyzycc::YccForwardRemainder16s, PlanesLast)   \
    X(zoxiRGBToYCC_16s_AC4R, ZOX_SHAPE_SD_SAMPLES, In4_16s, Out4_16s, 4, xyzycc::YccForwardBlock16s, xyzycc::YccForwardRemainder16s, PlanesLast)  \
    X(zoxiRGBToYCC_32f_C3R, ZOX_SHAPE_SD_SAMPLES, In3_32f, Out3_32f, 1, NoBlock, xyzycc::YccForward32f, PlanesLast)                               \
    X(zoxiRGBToYCC_32f_AC4R, ZOX_SHAPE_SD_SAMPLES, In4_32f, Out4_32f, 1, NoBlock, xyzycc::YccForward32f, PlanesLast)                              \
    X(zoxiYCCToRGB_8u_C3R, ZOX_SHAPE_SD, InC3, OutC3, 8, xyzycc::YccInverseBlock8, xyzycc::YccInverseRemainder8, PlanesLast)                      \
    X(zoxiYCCToRGB_8u_AC4R, ZOX_SHAPE_SD, InAC4, OutAC4, 4, xyzycc::YccInverseBlock8, xyzycc::YccInverseRemainder8, PlanesLast)                   \
    X(zoxiYCCToRGB_16u_C3R, ZOX_SHAPE_SD_SAMPLES, In3_16u, Out3_16u, 4, xyzycc::YccInverseBlock16u, xyzycc::YccInverseRemainder16u, PlanesLast)   \
    X(zoxiYCCToRGB_16u_AC4R, ZOX_SHAPE_SD_SAMPLES, In4_16u, Out4_16u, 4, xyzycc::YccInverseBlock16u, xyzycc::YccInverseRemainder16u, PlanesLast)  \
    X(zoxiYCCToRGB_16s_C3R, ZOX_SHAPE_SD_SAMPLES, In3_16s, Out3_16s, 4, xyzycc::YccInverse16s, xyzycc::YccInverse16s, PlanesLast)                 \
    X(zoxiYCCToRGB_16s_AC4R, ZOX_SHAPE_SD_SAMPLES, In4_16s, Out4_16s, 4, xyzycc::YccInverse16s, xyzycc::YccInverse16s, PlanesLast)                \
    X(zoxiYCCToRGB_32f_C3R, ZOX_SHAPE_SD_SAMPLES, In3_32f, Out3_32f, 1, NoBlock, xyzycc::YccInverse32f, PlanesLast)                               \
    X(zoxiYCCToRGB_32f_AC4R, ZOX_SHAPE_SD_SAMPLES, In4_32f, Out4_32f, 1, NoBlock, xyzycc::YccInverse32f, PlanesLast)                             
