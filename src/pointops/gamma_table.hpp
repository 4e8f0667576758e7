// Gamma exports: one row an export.
//   X(name, shape, sample type, direction, layout)
// Layouts: C3 and AC4 (three of four channels, the fourth neither read nor written), planar P3; the
// shapes say whether source and destination are one image (in place) and whether the call takes the
// 32f range.
#pragma once

#include "pointops/gamma.hpp"

// Table expansion into the exports: each row through its shape.
#define ZOX_DEFINE_GAMMA(name, shape, T, D, L) shape(name, T, D, L)

// Written out row by row so that every name can be found as it stands.
#define ZOX_GAMMA_TABLE(X)                                                                                        \
    X(zoxiGammaFwd_8u_C3R, ZOX_GAMMA_SD, uint8_t, GammaFwd, GammaC3)                                              \
    X(zoxiGammaFwd_8u_C3IR, ZOX_GAMMA_I, uint8_t, GammaFwd, GammaC3)                                              \
    X(zoxiGammaFwd_8u_AC4R, ZOX_GAMMA_SD, uint8_t, GammaFwd, GammaAC4)                                            \
    X(zoxiGammaFwd_8u_AC4IR, ZOX_GAMMA_I, uint8_t, GammaFwd, GammaAC4)                                            \
    X(zoxiGammaFwd_8u_P3R, ZOX_GAMMA_P, uint8_t, GammaFwd, GammaP3)                                               \
    X(zoxiGammaFwd_8u_IP3R, ZOX_GAMMA_IP, uint8_t, GammaFwd, GammaP3)                                             \
    X(zoxiGammaFwd_16u_C3R, ZOX_GAMMA_SD, uint16_t, GammaFwd, GammaC3)                                            \
    X(zoxiGammaFwd_16u_C3IR, ZOX_GAMMA_I, uint16_t, GammaFwd, GammaC3)                                            \
    X(zoxiGammaFwd_16u_AC4R, ZOX_GAMMA_SD, uint16_t, GammaFwd, GammaAC4)                                          \
    X(zoxiGammaFwd_16u_AC4IR, ZOX_GAMMA_I, uint16_t, GammaFwd, GammaAC4)                                          \
    X(zoxiGammaFwd_16u_P3R, ZOX_GAMMA_P, uint16_t, GammaFwd, GammaP3)                                             \
    X(zoxiGammaFwd_16u_IP3R, ZOX_GAMMA_IP, uint16_t, GammaFwd, GammaP3)                                           \
    X(zoxiGammaFwd_32f_C3R, ZOX_GAMMA_SD_RANGE, float, GammaFwd, GammaC3)                                         \
    X(zoxiGammaFwd_32f_C3IR, ZOX_GAMMA_I_RANGE, float, GammaFwd, GammaC3)                                         \
    X(zoxiGammaFwd_32f_AC4R, ZOX_GAMMA_SD_RANGE, float, GammaFwd, GammaAC4)                                       \
    X(zoxiGammaFwd_32f_AC4IR, ZOX_GAMMA_I_RANGE, float, GammaFwd, GammaAC4)                                       \
    X(zoxiGammaFwd_32f_P3R, ZOX_GAMMA_P_RANGE, float, GammaFwd, GammaP3)                                          \
    X(zoxiGammaFwd_32f_IP3R, ZOX_GAMMA_IP_RANGE, float, GammaFwd, GammaP3)                                        \
    X(zoxiGammaInv_8u_C3R, ZOX_GAMMA_SD, uint8_t, GammaInv, GammaC3)                                              \
    X(zoxiGammaInv_8u_C3IR, ZOX_GAMMA_I, uint8_t, GammaInv, GammaC3)                                              \
    X(zoxiGammaInv_8u_AC4R, ZOX_GAMMA_SD, uint8_t, GammaInv, GammaAC4)                                            \
    X(zoxiGammaInv_8u_AC4IR, ZOX_GAMMA_I, uint8_t, GammaInv, GammaAC4)                                            \
    X(zoxiGammaInv_8u_P3R, ZOX_GAMMA_P, uint8_t, GammaInv, GammaP3)                                               \
    X(zoxiGammaInv_8u_IP3R, ZOX_GAMMA_IP, uint8_t, GammaInv, GammaP3)                                             \
    X(zoxiGammaInv_16u_C3R, ZOX_GAMMA_SD, uint16_t, GammaInv, GammaC3)                                            \
    X(zoxiGammaInv_16u_C3IR, ZOX_GAMMA_I, uint16_t, GammaInv, GammaC3)                                            \
    X(zoxiGammaInv_16u_AC4R, ZOX_GAMMA_SD, uint16_t, GammaInv, GammaAC4)                                          \
    X(zoxiGammaInv_16u_AC4IR, ZOX_GAMMA_I, uint16_t, GammaInv, GammaAC4)                                          \
    X(zoxiGammaInv_16u_P3R, ZOX_GAMMA_P, uint16_t, GammaInv, GammaP3)                                             \
    X(zoxiGammaInv_16u_IP3R, ZOX_GAMMA_IP, uint16_t, GammaInv, GammaP3)                                           \
    X(zoxiGammaInv_32f_C3R, ZOX_GAMMA_SD_RANGE, float, GammaInv, GammaC3)                                         \
    X(zoxiGammaInv_32f_C3IR, ZOX_GAMMA_I_RANGE, float, GammaInv, GammaC3)                                         \
    X(zoxiGammaInv_32f_AC4R, ZOX_GAMMA_SD_RANGE, float, GammaInv, GammaAC4)                                       \
    X(zoxiGammaInv_32f_AC4IR, ZOX_GAMMA_I_RANGE, float, GammaInv, GammaAC4)                                       \
    X(zoxiGammaInv_32f_P3R, ZOX_GAMMA_P_RANGE, float, GammaInv, GammaP3)                                          \
    X(zoxiGammaInv_32f_IP3R, ZOX_GAMMA_IP_RANGE, float, GammaInv, GammaP3)
