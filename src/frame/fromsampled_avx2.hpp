// AVX2 side of the conversions from sampled images: thirty-two pixels a turn, then one group of sixteen
// through this set's 128-bit forms. Included only by *_avx2.cpp files, after a family has given its
// forms' vector parts to both namespaces.
#pragma once

#include "frame/conv_avx2.hpp"
#include "frame/fromsampled.hpp"

namespace zox::avx2::half {
#include "frame/fromsampled_simd.inl"
} // namespace zox::avx2::half

namespace zox::avx2 {

#include "frame/fromsampled_simd.inl"

template <class C>
int pixelUnits(const SampledRows& s, const PixelRows<typename C::Dst>& d, int from, int n, bool remainder, const Ctx& ctx)
{
    return half::pixelFormGroups<C>(s, d, pixelFormGroups<C>(s, d, from, n, remainder, ctx), n, remainder, ctx);
}

} // namespace zox::avx2
