// SSE4.1 side of the conversions from sampled images: sixteen pixels a turn. Included only by *_sse41.cpp
// files, after a family has given its forms' vector parts.
#pragma once

#include "frame/conv_sse41.hpp"
#include "frame/fromsampled.hpp"

namespace zox::sse41 {

#include "frame/fromsampled_simd.inl"

template <class C>
int pixelUnits(const SampledRows& s, const PixelRows<typename C::Dst>& d, int from, int n, bool remainder, const Ctx& ctx)
{
    return pixelFormGroups<C>(s, d, from, n, remainder, ctx);
}

} // namespace zox::sse41
