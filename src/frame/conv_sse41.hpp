// SSE4.1 side of the generic conversion: the generic readers and writers over 128-bit vectors (one
// lane: sixteen pixels a turn), the eight-pixel reader and writer of the shorter groups, the block
// kernel that runs a family's SIMD block form over them, and the whole-row kernel over 32-bit lanes.
// Included only by *_sse41.cpp files.
#pragma once

#include "frame/conv.hpp"
#include "frame/ops_sse41.hpp"

#include <cstring>

namespace zox::sse41 {

#include "frame/io_simd.inl"
#include "frame/conv128.inl"
#include "frame/wide_simd.inl"

// Groups of sixteen, then one of eight, then a staged group of four; n is a multiple of N.
template <class C>
void blocks(const typename C::Src::Row& s, const typename C::Dst::Row& d, int n, const Ctx& ctx)
{
    if constexpr (compilerVectorised<typename C::Block> || (C::N > 1 && !groupWritable<typename C::Dst>())) {
        compiledBlocks<C>(s, d, n, ctx);
    } else if constexpr (C::N > 1) {
        using F = Simd<typename C::Block>;
        constexpr int shift = inputShift<typename C::Block>;
        const int x = wholeGroups<C>(s, d, n, ctx);
        auto run8 = [&](const typename C::Src::Row& s8, const typename C::Dst::Row& d8, int at) {
            V3 v = Io8<typename C::Src>::template get<shift>(s8, at);
            F::apply(v);
            Io8<typename C::Dst>::put(d8, at, v, ctx);
        };
        eightThenStaged<C>(s, d, x, n, run8);
    }
}

} // namespace zox::sse41
