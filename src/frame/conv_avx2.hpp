// AVX2 side of the generic conversion. The pixels move through the 128-bit readers and writers (in
// this flavour they are VEX-encoded), sixteen at a time, and the block form runs once over sixteen
// 16-bit lanes: the first eight pixels in the lower half of each vector, the next eight in the upper.
// Included only by *_avx2.cpp files.
#pragma once

#include "frame/conv_sse41.hpp"
#include "frame/ops_avx2.hpp"

namespace zox::avx2 {

// Sixteen pixels: three colour channels and the carried fourth byte, 16 bits a lane.
struct V3 {
    V c[3];
    V extra;
};

// A family's block form over sixteen lanes, in place (see sse41::Simd).
template <class Form>
struct Simd;

template <class Form>
constexpr int inputShiftOf()
{
    if constexpr (requires { Simd<Form>::inputShift; })
        return Simd<Form>::inputShift;
    else
        return 0;
}
template <class Form>
inline constexpr int inputShift = inputShiftOf<Form>();

inline V join(__m128i lo, __m128i hi)
{
    return _mm256_inserti128_si256(_mm256_castsi128_si256(lo), hi, 1);
}

inline V3 join(const sse41::V3& lo, const sse41::V3& hi)
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
inline void split(const V3& v, sse41::V3& lo, sse41::V3& hi)
{
    lo = {{lower(v.c[0]), lower(v.c[1]), lower(v.c[2])}, lower(v.extra)};
    hi = {{upper(v.c[0]), upper(v.c[1]), upper(v.c[2])}, upper(v.extra)};
}

template <class C>
void blocks(const typename C::Src::Row& s, const typename C::Dst::Row& d, int n, const Ctx& ctx)
{
    if constexpr (C::N > 1) {
        using In = sse41::Io<typename C::Src>;
        using Out = sse41::Io<typename C::Dst>;
        using F = Simd<typename C::Block>;
        constexpr int shift = inputShift<typename C::Block>;
        int x = 0;
        for (; x + 16 <= n; x += 16) {
            sse41::V3 a, b;
            In::template get16<shift>(s, x, a, b);
            V3 v = join(a, b);
            F::apply(v);
            split(v, a, b);
            Out::put16(d, x, a, b, ctx);
        }
        // Eight pixels, or four staged: the upper half of the vector repeats the lower one.
        auto run8 = [&](const typename C::Src::Row& s8, const typename C::Dst::Row& d8, int at) {
            sse41::V3 a = In::template get8<shift>(s8, at), b;
            V3 v = join(a, a);
            F::apply(v);
            split(v, a, b);
            Out::put8(d8, at, a, ctx);
        };
        if (x + 8 <= n) {
            run8(s, d, x);
            x += 8;
        }
        if (x < n)
            sse41::stagedGroup<C>(s, d, x, n - x, [&](const auto& s8, const auto& d8) { run8(s8, d8, 0); });
    }
}

} // namespace zox::avx2

// Table expansion for a family's *_avx2.cpp: instantiates the block kernel of every row.
#define ZOX_AVX2_INSTANTIATE(name, shape, Src, Dst, N, Block, Rem, Chk)                                  \
    template void blocks<::zox::Conv<Src, Dst, N, Block, Rem, Chk>>(const Src::Row&, const Dst::Row&, int, \
                                                                   const ::zox::Ctx&);
