// SSE4.1 side of the generic conversion: every layout read as three vectors of eight 16-bit lanes
// (values 0..255 in the low byte) and written back from them with unsigned saturation (clip8), and the
// block kernel that runs a family's SIMD block form over them. Included only by *_sse41.cpp files.
#pragma once

#include "frame/conv.hpp"
#include "frame/ops_sse41.hpp"

#include <cstring>

namespace zox::sse41 {

// Eight pixels: three colour channels and the carried fourth byte, 16 bits a lane.
struct V3 {
    V c[3];
    V extra;
};

// A family's block form over eight lanes, in place; results leave in 16-bit lanes before clip8.
template <class Form>
struct Simd;

// Sixteen shuffle-control bytes as constant data (-1: a zero byte).
struct alignas(16) Bytes16 {
    int8_t b[16];
};

inline V maskOf(const Bytes16& m)
{
    return _mm_load_si128(reinterpret_cast<const V*>(m.b));
}

// Gather mask that takes, for lane i, the byte at `first + stride * i - base` of a 16-byte register,
// when it lies inside it, into the lane's low byte.
constexpr Bytes16 gatherMask(int first, int stride, int base)
{
    Bytes16 m{};
    for (int i = 0; i < 8; ++i) {
        const int b = first + stride * i - base;
        m.b[2 * i] = static_cast<int8_t>((b >= 0 && b < 16) ? b : -1);
        m.b[2 * i + 1] = -1;
    }
    return m;
}

// Scatter mask for output bytes base..base+15 of an interleaved row of Bpp bytes a pixel, taking slot
// `slot` of each pixel from a register that holds lane i of the slot's channel at byte `at + i`.
constexpr Bytes16 scatterMask(int Bpp, int base, int slot, int at)
{
    Bytes16 m{};
    for (int j = 0; j < 16; ++j) {
        const int b = base + j;
        m.b[j] = static_cast<int8_t>((b % Bpp == slot) ? at + b / Bpp : -1);
    }
    return m;
}

template <int First, int Stride, int Base>
inline constexpr Bytes16 kGather = gatherMask(First, Stride, Base);
template <int Bpp, int Base, int Slot, int At>
inline constexpr Bytes16 kScatter = scatterMask(Bpp, Base, Slot, At);

template <class L>
struct Io;

template <int Bpp, Order O>
struct Io<InPacked<Bpp, O>> {
    template <int Byte>
    static V gather(V lo, V hi)
    {
        return _mm_or_si128(_mm_shuffle_epi8(lo, maskOf(kGather<Byte, Bpp, 0>)),
                            _mm_shuffle_epi8(hi, maskOf(kGather<Byte, Bpp, 16>)));
    }
    static V3 get8(const typename InPacked<Bpp, O>::Row& row, int x)
    {
        const uint8_t* q = row.p[0] + static_cast<std::size_t>(x) * Bpp;
        const V lo = load16(q);
        const V hi = Bpp == 4 ? load16(q + 16) : load8(q + 16);
        V3 v;
        v.c[0] = gather<channelByte(O, 0)>(lo, hi);
        v.c[1] = gather<channelByte(O, 1)>(lo, hi);
        v.c[2] = gather<channelByte(O, 2)>(lo, hi);
        v.extra = Bpp == 4 ? gather<3>(lo, hi) : _mm_setzero_si128();
        return v;
    }
};

template <int P>
struct Io<InPlanar<P>> {
    static V3 get8(const typename InPlanar<P>::Row& row, int x)
    {
        V3 v;
        for (int k = 0; k < 3; ++k)
            v.c[k] = _mm_cvtepu8_epi16(load8(row.p[k] + x));
        v.extra = P == 4 ? _mm_cvtepu8_epi16(load8(row.p[3] + x)) : _mm_setzero_si128();
        return v;
    }
};

template <int Bpp, Order O, Fourth F>
struct Io<OutPacked<Bpp, O, F>> {
    static_assert(F != Fourth::Keep, "a kept fourth byte is never written: such rows have no block kernel");
    static void put8(const typename OutPacked<Bpp, O, F>::Row& row, int x, const V3& v, const Ctx& ctx)
    {
        uint8_t* q = row.p[0] + static_cast<std::size_t>(x) * Bpp;
        // a holds channels 0 and 1 (bytes 0..7, 8..15), b channel 2 and the fourth byte (0..7, 8..15).
        const V a = packUs(v.c[0], v.c[1]);
        V fourth = v.extra;
        if constexpr (F == Fourth::Alpha)
            fourth = splat16(ctx.alpha);
        else if constexpr (F == Fourth::Zero)
            fourth = _mm_setzero_si128();
        const V b = packUs(v.c[2], fourth);
        auto part = [&]<int Base>() {
            V r = _mm_or_si128(_mm_shuffle_epi8(a, maskOf(kScatter<Bpp, Base, channelByte(O, 0), 0>)),
                               _mm_shuffle_epi8(a, maskOf(kScatter<Bpp, Base, channelByte(O, 1), 8>)));
            r = _mm_or_si128(r, _mm_shuffle_epi8(b, maskOf(kScatter<Bpp, Base, channelByte(O, 2), 0>)));
            if constexpr (Bpp == 4)
                r = _mm_or_si128(r, _mm_shuffle_epi8(b, maskOf(kScatter<4, Base, 3, 8>)));
            return r;
        };
        store16(q, part.template operator()<0>());
        if constexpr (Bpp == 4)
            store16(q + 16, part.template operator()<16>());
        else
            store8(q + 16, part.template operator()<16>());
    }
};

template <int P>
struct Io<OutPlanar<P>> {
    static void put8(const typename OutPlanar<P>::Row& row, int x, const V3& v, const Ctx&)
    {
        for (int k = 0; k < 3; ++k)
            sse41::store8(row.p[k] + x, packUs(v.c[k], v.c[k]));
        if constexpr (P == 4)
            sse41::store8(row.p[3] + x, packUs(v.extra, v.extra));
    }
};

// A group of fewer than eight pixels (the 4-pixel blocks of N = 4 rows): staged through small buffers
// so that no vector access leaves the region.
template <class C>
void stagedGroup(const typename C::Src::Row& s, const typename C::Dst::Row& d, int x, int count, const Ctx& ctx)
{
    using Src = typename C::Src;
    using Dst = typename C::Dst;
    alignas(16) uint8_t in[Src::planes][32] = {};
    alignas(16) uint8_t out[Dst::planes][32] = {};
    typename Src::Row ls;
    typename Dst::Row ld;
    for (int p = 0; p < Src::planes; ++p) {
        std::memcpy(in[p], s.p[p] + static_cast<std::size_t>(x) * Src::bytesPerPixel,
                    static_cast<std::size_t>(count) * Src::bytesPerPixel);
        ls.p[p] = in[p];
    }
    for (int p = 0; p < Dst::planes; ++p)
        ld.p[p] = out[p];
    V3 v = Io<Src>::get8(ls, 0);
    Simd<typename C::Block>::apply(v);
    Io<Dst>::put8(ld, 0, v, ctx);
    for (int p = 0; p < Dst::planes; ++p)
        std::memcpy(d.p[p] + static_cast<std::size_t>(x) * Dst::bytesPerPixel, out[p],
                    static_cast<std::size_t>(count) * Dst::bytesPerPixel);
}

template <class C>
void blocks(const typename C::Src::Row& s, const typename C::Dst::Row& d, int n, const Ctx& ctx)
{
    if constexpr (C::N > 1) {
        int x = 0;
        for (; x + 8 <= n; x += 8) {
            V3 v = Io<typename C::Src>::get8(s, x);
            Simd<typename C::Block>::apply(v);
            Io<typename C::Dst>::put8(d, x, v, ctx);
        }
        if (x < n)
            stagedGroup<C>(s, d, x, n - x, ctx);
    }
}

} // namespace zox::sse41

// Table expansion for a family's *_sse41.cpp: instantiates the block kernel of every row.
#define ZOX_SSE41_INSTANTIATE(name, shape, Src, Dst, N, Block, Rem, Chk)                                 \
    template void blocks<::zox::Conv<Src, Dst, N, Block, Rem, Chk>>(                                    \
        const Src::Row&, const Dst::Row&, int, const ::zox::Ctx&);
