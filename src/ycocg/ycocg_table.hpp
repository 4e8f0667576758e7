// RGB <-> YCoCg exports: one row an export.
//   X(name, shape, Src, Dst, N, block form, remainder form, checks)
// The colour side is interleaved (B, G, R in channels 0..2, or R, G, B in the two RGB members), the
// YCoCg side three planes Y, Co, Cg. Blocks are four pixels (rows whose pointers all lie on 16 bytes may
// run eight at a time, which covers the same columns: the block columns are width & ~3 either way);
// block and remainder forms are the same form but in the two 16-bit signed plain forward members,
// whose blocks saturate where their remainder columns keep the low 16 bits. Members without a size check convert nothing for a size below 1.
#pragma once

#include "ycocg/ycocg_forms.hpp"

namespace zox {
// Colour sides.
using InRGB8 = InPacked<3, Order::Rgb>;
using InBGR8 = InPacked<3, Order::Bgr>;
using InBGRX8 = InPacked<4, Order::Bgr>;
using InBGR16s = InPacked<3, Order::Bgr, int16_t>;
using InBGRX16s = InPacked<4, Order::Bgr, int16_t>;
using OutRGB8 = OutPacked<3, Order::Rgb, Fourth::None>;
using OutBGR8 = OutPacked<3, Order::Bgr, Fourth::None>;
using OutBGRA8 = OutPacked<4, Order::Bgr, Fourth::Alpha>;
using OutBGR16s = OutPacked<3, Order::Bgr, Fourth::None, int16_t>;
using OutBGRA16s = OutPacked<4, Order::Bgr, Fourth::Alpha, int16_t>;
// YCoCg planes.
using InP3_8 = InPlanar<3>;
using InP3_16s = InPlanar<3, int16_t>;
using InP3_32s = InPlanar<3, int32_t>;
using OutP3_8 = OutPlanar<3>;
using OutP3_16s = OutPlanar<3, int16_t>;
using OutP3_32s = OutPlanar<3, int32_t>;
namespace ycocg {
using RgbFromPlainKeep = RgbFromPlain<Out::Keep>;
using RgbFromPlainClamp8 = RgbFromPlain<Out::Wrap16Clamp8>;
using RgbFromLiftingKeep = RgbFromLifting<Out::Keep>;
using RgbFromLiftingClamp8 = RgbFromLifting<Out::Wrap16Clamp8>;
// The same values as Keep into 16-bit samples; these have SIMD forms over 16-bit lanes.
using RgbFromPlainWrap16 = RgbFromPlain<Out::Wrap16>;
using RgbFromLiftingWrap16 = RgbFromLifting<Out::Wrap16>;
} // namespace ycocg
} // namespace zox

#define ZOX_YCOCG_TABLE(X)                                                                                                             \
    X(zoxiRGBToYCoCg_8u_C3P3R, ZOX_SHAPE_SD, InRGB8, OutP3_8, 4, ycocg::PlainBiased, ycocg::PlainBiased, PlanesFirst)                 \
    X(zoxiBGRToYCoCg_8u16s_C3P3R, ZOX_SHAPE_SD, InBGR8, OutP3_16s, 4, ycocg::Plain, ycocg::Plain, PlanesFirst)                        \
    X(zoxiBGRToYCoCg_8u16s_C4P3R, ZOX_SHAPE_SD, InBGRX8, OutP3_16s, 4, ycocg::Plain, ycocg::Plain, PlanesFirst)                       \
    X(zoxiSBGRToYCoCg_16s_C3P3R, ZOX_SHAPE_SD, InBGR16s, OutP3_16s, 4, ycocg::PlainSaturated, ycocg::Plain, PlanesFirst)              \
    X(zoxiSBGRToYCoCg_16s_C4P3R, ZOX_SHAPE_SD, InBGRX16s, OutP3_16s, 4, ycocg::PlainSaturated, ycocg::Plain, PlanesFirst)             \
    X(zoxiSBGRToYCoCg_16s32s_C3P3R, ZOX_SHAPE_SD, InBGR16s, OutP3_32s, 4, ycocg::Plain, ycocg::Plain, PlanesFirst)                    \
    X(zoxiSBGRToYCoCg_16s32s_C4P3R, ZOX_SHAPE_SD, InBGRX16s, OutP3_32s, 4, ycocg::Plain, ycocg::Plain, PlanesFirstEmptyOk)            \
    X(zoxiBGRToYCoCg_Rev_8u16s_C3P3R, ZOX_SHAPE_SD, InBGR8, OutP3_16s, 4, ycocg::Lifting, ycocg::Lifting, PlanesFirst)                \
    X(zoxiBGRToYCoCg_Rev_8u16s_C4P3R, ZOX_SHAPE_SD, InBGRX8, OutP3_16s, 4, ycocg::Lifting, ycocg::Lifting, PlanesFirst)               \
    X(zoxiSBGRToYCoCg_Rev_16s_C3P3R, ZOX_SHAPE_SD, InBGR16s, OutP3_16s, 4, ycocg::Lifting16, ycocg::Lifting16, PlanesFirstEmptyOk)    \
    X(zoxiSBGRToYCoCg_Rev_16s_C4P3R, ZOX_SHAPE_SD, InBGRX16s, OutP3_16s, 4, ycocg::Lifting16, ycocg::Lifting16, PlanesFirstEmptyOk)   \
    X(zoxiSBGRToYCoCg_Rev_16s32s_C3P3R, ZOX_SHAPE_SD, InBGR16s, OutP3_32s, 4, ycocg::Lifting, ycocg::Lifting, PlanesFirst)            \
    X(zoxiSBGRToYCoCg_Rev_16s32s_C4P3R, ZOX_SHAPE_SD, InBGRX16s, OutP3_32s, 4, ycocg::Lifting, ycocg::Lifting, PlanesFirstEmptyOk)    \
    X(zoxiYCoCgToRGB_8u_P3C3R, ZOX_SHAPE_SD, InP3_8, OutRGB8, 4, ycocg::RgbFromPlainBiased, ycocg::RgbFromPlainBiased,                \
      PlanesFirstEmptyOk)                                                                                                               \
    X(zoxiYCoCgToBGR_16s8u_P3C3R, ZOX_SHAPE_SD, InP3_16s, OutBGR8, 4, ycocg::RgbFromPlainClamp8, ycocg::RgbFromPlainClamp8,           \
      PlanesFirstEmptyOk)                                                                                                               \
    X(zoxiYCoCgToBGR_16s8u_P3C4R, ZOX_SHAPE_SD_ALPHA, InP3_16s, OutBGRA8, 4, ycocg::RgbFromPlainClamp8, ycocg::RgbFromPlainClamp8,    \
      PlanesFirstEmptyOk)                                                                                                               \
    X(zoxiYCoCgToSBGR_16s_P3C3R, ZOX_SHAPE_SD, InP3_16s, OutBGR16s, 4, ycocg::RgbFromPlainKeep, ycocg::RgbFromPlainKeep,              \
      PlanesFirstEmptyOk)                                                                                                               \
    X(zoxiYCoCgToSBGR_16s_P3C4R, ZOX_SHAPE_SD_ALPHA, InP3_16s, OutBGRA16s, 4, ycocg::RgbFromPlainWrap16, ycocg::RgbFromPlainWrap16,   \
      PlanesFirst)                                                                                                                      \
    X(zoxiYCoCgToSBGR_32s16s_P3C3R, ZOX_SHAPE_SD, InP3_32s, OutBGR16s, 4, ycocg::RgbFromPlainKeep, ycocg::RgbFromPlainKeep,           \
      PlanesFirst)                                                                                                                      \
    X(zoxiYCoCgToSBGR_32s16s_P3C4R, ZOX_SHAPE_SD_ALPHA, InP3_32s, OutBGRA16s, 4, ycocg::RgbFromPlainKeep, ycocg::RgbFromPlainKeep,    \
      PlanesFirst)                                                                                                                      \
    X(zoxiYCoCgToBGR_Rev_16s8u_P3C3R, ZOX_SHAPE_SD, InP3_16s, OutBGR8, 4, ycocg::RgbFromLiftingClamp8, ycocg::RgbFromLiftingClamp8,   \
      PlanesFirstEmptyOk)                                                                                                               \
    X(zoxiYCoCgToBGR_Rev_16s8u_P3C4R, ZOX_SHAPE_SD_ALPHA, InP3_16s, OutBGRA8, 4, ycocg::RgbFromLiftingClamp8,                         \
      ycocg::RgbFromLiftingClamp8, PlanesFirstEmptyOk)                                                                                  \
    X(zoxiYCoCgToSBGR_Rev_16s_P3C3R, ZOX_SHAPE_SD, InP3_16s, OutBGR16s, 4, ycocg::RgbFromLiftingKeep, ycocg::RgbFromLiftingKeep,      \
      PlanesFirstEmptyOk)                                                                                                               \
    X(zoxiYCoCgToSBGR_Rev_16s_P3C4R, ZOX_SHAPE_SD_ALPHA, InP3_16s, OutBGRA16s, 4, ycocg::RgbFromLiftingWrap16,                        \
      ycocg::RgbFromLiftingWrap16, PlanesFirstEmptyOk)                                                                                    \
    X(zoxiYCoCgToSBGR_Rev_32s16s_P3C3R, ZOX_SHAPE_SD, InP3_32s, OutBGR16s, 4, ycocg::RgbFromLiftingKeep, ycocg::RgbFromLiftingKeep,   \
      PlanesFirstEmptyOk)                                                                                                               \
    X(zoxiYCoCgToSBGR_Rev_32s16s_P3C4R, ZOX_SHAPE_SD_ALPHA, InP3_32s, OutBGRA16s, 4, ycocg::RgbFromLiftingKeep,                       \
      ycocg::RgbFromLiftingKeep, PlanesFirstEmptyOk)
