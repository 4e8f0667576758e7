// SSE4.1 side of the sampled conversions: sixteen pixels a turn. Included only by *_sse41.cpp files.
#pragma once

#include "frame/conv_sse41.hpp"
#include "frame/sampled.hpp"

namespace zox::sse41 {

#include "frame/sampled_simd.inl"

template <class C>
int sampledUnits(const SourcePass<typename C::Src>& s, const SampledPass& d, int from, int n, bool remainder)
{
    return sampledFormGroups<C>(s, d, from, n, remainder);
}

} // namespace zox::sse41
