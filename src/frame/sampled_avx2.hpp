// AVX2 side of the sampled conversions: thirty-two pixels a turn, then one group of sixteen through this
// set's 128-bit forms. Included only by *_avx2.cpp files, after a family has given its unit forms to both
// namespaces.
#pragma once

#include "frame/conv_avx2.hpp"
#include "frame/sampled.hpp"

namespace zox::avx2::half {
#include "frame/sampled_simd.inl"
} // namespace zox::avx2::half

namespace zox::avx2 {

#include "frame/sampled_simd.inl"

template <class C>
int sampledUnits(const SourcePass<typename C::Src>& s, const SampledPass& d, int from, int n, bool remainder)
{
    return half::sampledFormGroups<C>(s, d, sampledFormGroups<C>(s, d, from, n, remainder), n, remainder);
}

} // namespace zox::avx2
