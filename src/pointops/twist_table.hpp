// Colour twist exports: one row an export.
//   X(name, shape, sample type, member)
// Interleaved C3, AC4 (the fourth channel neither read nor written) and three planes with one step, out
// of place and in place; the 4x4 map of four 32f channels.
#pragma once

#include "pointops/twist.hpp"

namespace zox::twist {
using Twist8uC3 = Twist3<uint8_t, C3>;
using Twist8uAC4 = Twist3<uint8_t, AC4>;
using Twist8uP3 = Twist3<uint8_t, P3>;
using Twist8sC3 = Twist3<int8_t, C3>;
using Twist8sAC4 = Twist3<int8_t, AC4>;
using Twist8sP3 = Twist3<int8_t, P3>;
using Twist16uC3 = Twist3<uint16_t, C3>;
using Twist16uAC4 = Twist3<uint16_t, AC4>;
using Twist16uP3 = Twist3<uint16_t, P3>;
using Twist16sC3 = Twist3<int16_t, C3>;
using Twist16sAC4 = Twist3<int16_t, AC4>;
using Twist16sP3 = Twist3<int16_t, P3>;
using Twist32fC3 = Twist3<float, C3>;
using Twist32fAC4 = Twist3<float, AC4>;
using Twist32fP3 = Twist3<float, P3>;
} // namespace zox::twist

// Every member once, for the kernel instantiations.
#define ZOX_TWIST_MEMBERS(X) \
    X(::zox::twist::Twist8uC3) X(::zox::twist::Twist8uAC4) X(::zox::twist::Twist8uP3) \
    X(::zox::twist::Twist8sC3) X(::zox::twist::Twist8sAC4) X(::zox::twist::Twist8sP3) \
    X(::zox::twist::Twist16uC3) X(::zox::twist::Twist16uAC4) X(::zox::twist::Twist16uP3) \
    X(::zox::twist::Twist16sC3) X(::zox::twist::Twist16sAC4) X(::zox::twist::Twist16sP3) \
    X(::zox::twist::Twist32fC3) X(::zox::twist::Twist32fAC4) X(::zox::twist::Twist32fP3) \
    X(::zox::twist::Twist4)

#define ZOX_TWIST_TABLE(X) \
    X(zoxiColorTwist32f_8u_C3R, ZOX_TWIST_C, uint8_t, ::zox::twist::Twist8uC3)         \
    X(zoxiColorTwist32f_8u_C3IR, ZOX_TWIST_CI, uint8_t, ::zox::twist::Twist8uC3)       \
    X(zoxiColorTwist32f_8u_AC4R, ZOX_TWIST_C, uint8_t, ::zox::twist::Twist8uAC4)       \
    X(zoxiColorTwist32f_8u_AC4IR, ZOX_TWIST_CI, uint8_t, ::zox::twist::Twist8uAC4)     \
    X(zoxiColorTwist32f_8u_P3R, ZOX_TWIST_P, uint8_t, ::zox::twist::Twist8uP3)         \
    X(zoxiColorTwist32f_8u_IP3R, ZOX_TWIST_PI, uint8_t, ::zox::twist::Twist8uP3)       \
    X(zoxiColorTwist32f_8s_C3R, ZOX_TWIST_C, int8_t, ::zox::twist::Twist8sC3)          \
    X(zoxiColorTwist32f_8s_C3IR, ZOX_TWIST_CI, int8_t, ::zox::twist::Twist8sC3)        \
    X(zoxiColorTwist32f_8s_AC4R, ZOX_TWIST_C, int8_t, ::zox::twist::Twist8sAC4)        \
    X(zoxiColorTwist32f_8s_AC4IR, ZOX_TWIST_CI, int8_t, ::zox::twist::Twist8sAC4)      \
    X(zoxiColorTwist32f_8s_P3R, ZOX_TWIST_P, int8_t, ::zox::twist::Twist8sP3)          \
    X(zoxiColorTwist32f_8s_IP3R, ZOX_TWIST_PI, int8_t, ::zox::twist::Twist8sP3)        \
    X(zoxiColorTwist32f_16u_C3R, ZOX_TWIST_C, uint16_t, ::zox::twist::Twist16uC3)      \
    X(zoxiColorTwist32f_16u_C3IR, ZOX_TWIST_CI, uint16_t, ::zox::twist::Twist16uC3)    \
    X(zoxiColorTwist32f_16u_AC4R, ZOX_TWIST_C, uint16_t, ::zox::twist::Twist16uAC4)    \
    X(zoxiColorTwist32f_16u_AC4IR, ZOX_TWIST_CI, uint16_t, ::zox::twist::Twist16uAC4)  \
    X(zoxiColorTwist32f_16u_P3R, ZOX_TWIST_P, uint16_t, ::zox::twist::Twist16uP3)      \
    X(zoxiColorTwist32f_16u_IP3R, ZOX_TWIST_PI, uint16_t, ::zox::twist::Twist16uP3)    \
    X(zoxiColorTwist32f_16s_C3R, ZOX_TWIST_C, int16_t, ::zox::twist::Twist16sC3)       \
    X(zoxiColorTwist32f_16s_C3IR, ZOX_TWIST_CI, int16_t, ::zox::twist::Twist16sC3)     \
    X(zoxiColorTwist32f_16s_AC4R, ZOX_TWIST_C, int16_t, ::zox::twist::Twist16sAC4)     \
    X(zoxiColorTwist32f_16s_AC4IR, ZOX_TWIST_CI, int16_t, ::zox::twist::Twist16sAC4)   \
    X(zoxiColorTwist32f_16s_P3R, ZOX_TWIST_P, int16_t, ::zox::twist::Twist16sP3)       \
    X(zoxiColorTwist32f_16s_IP3R, ZOX_TWIST_PI, int16_t, ::zox::twist::Twist16sP3)     \
    X(zoxiColorTwist_32f_C3R, ZOX_TWIST_C, float, ::zox::twist::Twist32fC3)            \
    X(zoxiColorTwist_32f_C3IR, ZOX_TWIST_CI, float, ::zox::twist::Twist32fC3)          \
    X(zoxiColorTwist_32f_AC4R, ZOX_TWIST_C, float, ::zox::twist::Twist32fAC4)          \
    X(zoxiColorTwist_32f_AC4IR, ZOX_TWIST_CI, float, ::zox::twist::Twist32fAC4)        \
    X(zoxiColorTwist_32f_P3R, ZOX_TWIST_P, float, ::zox::twist::Twist32fP3)            \
    X(zoxiColorTwist_32f_IP3R, ZOX_TWIST_PI, float, ::zox::twist::Twist32fP3)          \
    X(zoxiColorTwist_32f_C4R, ZOX_TWIST_C4, float, ::zox::twist::Twist4)
