// Gray exports: one row an export.
//   X(name, shape, member)
// Reducers take the channels in memory order (channel k the k-th sample of a pixel; AC4 sources have a
// fourth that is never read) and share one member per depth and layout with their fixed-weight twins.
#pragma once

#include "pointops/gray.hpp"

namespace zox::gray {
using Gray8C3 = Fixed8<3>;
using Gray8AC4 = Fixed8<4>;
using Gray16uC3 = Float16<uint16_t, 3>;
using Gray16uAC4 = Float16<uint16_t, 4>;
using Gray16sC3 = Float16<int16_t, 3>;
using Gray16sAC4 = Float16<int16_t, 4>;
using Gray32fC3 = Float32<3>;
using Gray32fAC4 = Float32<4>;
using Gray64fC3 = Double64<3>;
using Gray64fAC4 = Double64<4>;
using Spread8C3 = Spread<uint8_t, 3>;
using Spread8C4 = Spread<uint8_t, 4>;
using Spread16uC3 = Spread<uint16_t, 3>;
using Spread16uC4 = Spread<uint16_t, 4>;
using Spread32fC3 = Spread<float, 3>;
using Spread32fC4 = Spread<float, 4>;
} // namespace zox::gray

// Every member once, for the kernel instantiations.
#define ZOX_GRAY_MEMBERS(X) \
    X(::zox::gray::Gray8C3) X(::zox::gray::Gray8AC4) X(::zox::gray::Gray16uC3) \
    X(::zox::gray::Gray16uAC4) X(::zox::gray::Gray16sC3) X(::zox::gray::Gray16sAC4) \
    X(::zox::gray::Gray32fC3) X(::zox::gray::Gray32fAC4) X(::zox::gray::Gray64fC3) \
    X(::zox::gray::Gray64fAC4) X(::zox::gray::Spread8C3) X(::zox::gray::Spread8C4) \
    X(::zox::gray::Spread16uC3) X(::zox::gray::Spread16uC4) X(::zox::gray::Spread32fC3) \
    X(::zox::gray::Spread32fC4) X(::zox::gray::LumaBytes)

#define ZOX_GRAY_TABLE(X)                                                                 \
    X(zoxiRGBToGray_8u_C3C1R, ZOX_GRAY_FIXED, ::zox::gray::Gray8C3)                       \
    X(zoxiRGBToGray_8u_AC4C1R, ZOX_GRAY_FIXED, ::zox::gray::Gray8AC4)                     \
    X(zoxiRGBToGray_16u_C3C1R, ZOX_GRAY_FIXED, ::zox::gray::Gray16uC3)                    \
    X(zoxiRGBToGray_16u_AC4C1R, ZOX_GRAY_FIXED, ::zox::gray::Gray16uAC4)                  \
    X(zoxiRGBToGray_16s_C3C1R, ZOX_GRAY_FIXED, ::zox::gray::Gray16sC3)                    \
    X(zoxiRGBToGray_16s_AC4C1R, ZOX_GRAY_FIXED, ::zox::gray::Gray16sAC4)                  \
    X(zoxiRGBToGray_32f_C3C1R, ZOX_GRAY_FIXED, ::zox::gray::Gray32fC3)                    \
    X(zoxiRGBToGray_32f_AC4C1R, ZOX_GRAY_FIXED, ::zox::gray::Gray32fAC4)                  \
    X(zoxiColorToGray_8u_C3C1R, ZOX_GRAY_WEIGHTS, ::zox::gray::Gray8C3)                   \
    X(zoxiColorToGray_8u_AC4C1R, ZOX_GRAY_WEIGHTS, ::zox::gray::Gray8AC4)                 \
    X(zoxiColorToGray_16u_C3C1R, ZOX_GRAY_WEIGHTS, ::zox::gray::Gray16uC3)                \
    X(zoxiColorToGray_16u_AC4C1R, ZOX_GRAY_WEIGHTS, ::zox::gray::Gray16uAC4)              \
    X(zoxiColorToGray_16s_C3C1R, ZOX_GRAY_WEIGHTS, ::zox::gray::Gray16sC3)                \
    X(zoxiColorToGray_16s_AC4C1R, ZOX_GRAY_WEIGHTS, ::zox::gray::Gray16sAC4)              \
    X(zoxiColorToGray_32f_C3C1R, ZOX_GRAY_WEIGHTS, ::zox::gray::Gray32fC3)                \
    X(zoxiColorToGray_32f_AC4C1R, ZOX_GRAY_WEIGHTS, ::zox::gray::Gray32fAC4)              \
    X(zoxiColorToGray_64f_C3C1R, ZOX_GRAY_WEIGHTS64_OR_FIXED, ::zox::gray::Gray64fC3)     \
    X(zoxiColorToGray_64f_AC4C1R, ZOX_GRAY_WEIGHTS64, ::zox::gray::Gray64fAC4)            \
    X(zoxiGrayToRGB_8u_C1C3R, ZOX_GRAY_FIXED, ::zox::gray::Spread8C3)                     \
    X(zoxiGrayToRGB_8u_C1C4R, ZOX_GRAY_ALPHA, ::zox::gray::Spread8C4)                     \
    X(zoxiGrayToRGB_16u_C1C3R, ZOX_GRAY_FIXED, ::zox::gray::Spread16uC3)                  \
    X(zoxiGrayToRGB_16u_C1C4R, ZOX_GRAY_ALPHA, ::zox::gray::Spread16uC4)                  \
    X(zoxiGrayToRGB_32f_C1C3R, ZOX_GRAY_FIXED, ::zox::gray::Spread32fC3)                  \
    X(zoxiGrayToRGB_32f_C1C4R, ZOX_GRAY_ALPHA, ::zox::gray::Spread32fC4)                  \
    X(zoxiYCbCr422ToGray_8u_C2C1R, ZOX_GRAY_FIXED, ::zox::gray::LumaBytes)
