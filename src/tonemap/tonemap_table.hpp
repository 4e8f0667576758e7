// Tone-mapping exports: one row an export.
//   X(name, map)
// Both take a one-channel float source and a byte destination; the map names the statistic and the
// mapping of each sample.
#pragma once

#include "zoxcc.h"

namespace zox {
struct LinearMap;
struct MeanMap;
template <class Map>
zoxStatus toneMap(const float* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roi);
} // namespace zox

#define ZOX_DEFINE_TONEMAP(name, Map)                                                                     \
    ZOXCC_API zoxStatus name(const float* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize) \
    {                                                                                                     \
        return ::zox::toneMap<::zox::Map>(src, srcStep, dst, dstStep, roiSize);                           \
    }

#define ZOX_TONEMAP_TABLE(X)                      \
    X(zoxiToneMapLinear_32f8u_C1R, LinearMap)     \
    X(zoxiToneMapMean_32f8u_C1R, MeanMap)
