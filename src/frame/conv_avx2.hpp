// AVX2 side of the generic conversion: the generic readers and writers over 256-bit vectors (two lanes:
// thirty-two pixels a turn, the second group of sixteen in the upper lane), the block kernel that runs
// a family's block form over sixteen 16-bit lanes, and the whole-row kernel over eight 32-bit lanes.
// The shorter groups at the end of a run go through 128-bit readers and writers of this set's own
// (namespace `half`, compiled with this set's flags), their halves joined into one vector. Included
// only by *_avx2.cpp files.
#pragma once

#include "frame/conv.hpp"
#include "frame/ops_avx2.hpp"

#include <cstring>

namespace zox::avx2::half {
#include "frame/ops128.inl"
#include "frame/io_simd.inl"
#include "frame/conv128.inl"
} // namespace zox::avx2::half

namespace zox::avx2 {

#include "frame/io_simd.inl"
#include "frame/wide_simd.inl"

inline V join(__m128i lo, __m128i hi)
{
    return _mm256_inserti128_si256(_mm256_castsi128_si256(lo), hi, 1);
}

inline V3 join(const half::V3& lo, const half::V3& hi)
{
    return {{join(lo.c[0], hi.c[0]), join(lo.c[1], hi.c[1]), join(lo.c[2], hi.c[2])}, join(lo.extra, hi.extra)};
}

inline __m128i lower(V v)
{
    return _mm256_castsi256_si128(v);
}
inline __m128i upper(V v)
{
    return _mm256_extracti128_si256(v, 1);
}

// Written out channel by channel: a loop here goes through memory.
inline void split(const V3& v, half::V3& lo, half::V3& hi)
{
    lo = {{lower(v.c[0]), lower(v.c[1]), lower(v.c[2])}, lower(v.extra)};
    hi = {{upper(v.c[0]), upper(v.c[1]), upper(v.c[2])}, upper(v.extra)};
}

// Groups of thirty-two, then sixteen, eight and a staged four; n is a multiple of N.
template <class C>
void blocks(const typename C::Src::Row& s, const typename C::Dst::Row& d, int n, const Ctx& ctx)
{
    if constexpr (compilerVectorised<typename C::Block> || (C::N > 1 && !groupWritable<typename C::Dst>())) {
        compiledBlocks<C>(s, d, n, ctx);
    } else if constexpr (C::N > 1) {
        using F = Simd<typename C::Block>;
        constexpr int shift = inputShift<typename C::Block>;
        int x = wholeGroups<C>(s, d, n, ctx);
        if (x + 16 <= n) {
            half::V3 a, b;
            half::GroupIo<typename C::Src>::template get<shift>(s, x, a, b);
            V3 v = join(a, b);
            F::apply(v);
            split(v, a, b);
            half::GroupIo<typename C::Dst>::put(d, x, a, b, ctx);
            x += 16;
        }
        // Eight pixels, or four staged: the upper half of the vector repeats the lower one.
        auto run8 = [&](const typename C::Src::Row& s8, const typename C::Dst::Row& d8, int at) {
            half::V3 a = half::Io8<typename C::Src>::template get<shift>(s8, at), b;
            V3 v = join(a, a);
            F::apply(v);
            split(v, a, b);
            half::Io8<typename C::Dst>::put(d8, at, a, ctx);
        };
        half::eightThenStaged<C>(s, d, x, n, run8);
    }
}

} // namespace zox::avx2
