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

// A family's block form over eight lanes, in place; results leave in 16-bit lanes before clip8. A form
// that wants its samples at 256 x declares `static constexpr int inputShift = 8`.
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

// Sixteen shuffle-control bytes as constant data (-1: a zero byte).
struct alignas(16) Bytes16 {
    int8_t b[16];
};

inline V maskOf(const Bytes16& m)
{
    return _mm_load_si128(reinterpret_cast<const V*>(m.b));
}

// Gather mask that takes, for lane i, the byte at `first + stride * i - base` of a 16-byte register,
// when it lies inside it, into the lane's low byte (shift 0: the value) or high byte (shift 8: 256 x).
constexpr Bytes16 gatherMask(int first, int stride, int base, int shift)
{
    Bytes16 m{};
    for (int i = 0; i < 8; ++i) {
        const int b = first + stride * i - base;
        const int8_t pick = static_cast<int8_t>((b >= 0 && b < 16) ? b : -1);
        m.b[2 * i] = shift == 0 ? pick : int8_t{-1};
        m.b[2 * i + 1] = shift == 0 ? int8_t{-1} : pick;
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

template <int First, int Stride, int Base, int Shift>
inline constexpr Bytes16 kGather = gatherMask(First, Stride, Base, Shift);
template <int Bpp, int Base, int Slot, int At>
inline constexpr Bytes16 kScatter = scatterMask(Bpp, Base, Slot, At);

template <class L>
struct Io;

// Readers take eight or sixteen pixels; Shift 8 places each sample in the upper byte of its lane
// (256 x), Shift 0 in the lower. The carried fourth byte always sits in the lower byte.
template <int Bpp, Order O>
struct Io<InPacked<Bpp, O>> {
    // Lanes of the pixels whose bytes start at `first` of the pair of registers (lo at base, hi at base + 16).
    template <int First, int Base, int Shift>
    static V gather(V lo, V hi)
    {
        return _mm_or_si128(_mm_shuffle_epi8(lo, maskOf(kGather<First, Bpp, Base, Shift>)),
                            _mm_shuffle_epi8(hi, maskOf(kGather<First, Bpp, Base + 16, Shift>)));
    }
    template <int Start, int Base, int Shift>
    static V3 split(V lo, V hi)
    {
        V3 v;
        v.c[0] = gather<Start + channelByte(O, 0), Base, Shift>(lo, hi);
        v.c[1] = gather<Start + channelByte(O, 1), Base, Shift>(lo, hi);
        v.c[2] = gather<Start + channelByte(O, 2), Base, Shift>(lo, hi);
        v.extra = Bpp == 4 ? gather<Start + 3, Base, 0>(lo, hi) : _mm_setzero_si128();
        return v;
    }
    template <int Shift>
    static V3 get8(const typename InPacked<Bpp, O>::Row& row, int x)
    {
        const uint8_t* q = row.p[0] + static_cast<std::size_t>(x) * Bpp;
        return split<0, 0, Shift>(load16(q), Bpp == 4 ? load16(q + 16) : load8(q + 16));
    }
    template <int Shift>
    static void get16(const typename InPacked<Bpp, O>::Row& row, int x, V3& a, V3& b)
    {
        const uint8_t* q = row.p[0] + static_cast<std::size_t>(x) * Bpp;
        const V r0 = load16(q), r1 = load16(q + 16), r2 = load16(q + 32);
        a = split<0, 0, Shift>(r0, r1);
        if constexpr (Bpp == 3)
            b = split<24, 16, Shift>(r1, r2); // pixels 8..15: bytes 24..47
        else
            b = split<32, 32, Shift>(r2, load16(q + 48));
    }
};

template <int P>
struct Io<InPlanar<P>> {
    template <int Shift>
    static V widenLo(V x)
    {
        return Shift == 0 ? _mm_cvtepu8_epi16(x) : _mm_unpacklo_epi8(_mm_setzero_si128(), x);
    }
    template <int Shift>
    static V widenHi(V x)
    {
        return Shift == 0 ? _mm_unpackhi_epi8(x, _mm_setzero_si128()) : _mm_unpackhi_epi8(_mm_setzero_si128(), x);
    }
    template <int Shift>
    static V3 get8(const typename InPlanar<P>::Row& row, int x)
    {
        V3 v;
        for (int k = 0; k < 3; ++k)
            v.c[k] = widenLo<Shift>(load8(row.p[k] + x));
        v.extra = P == 4 ? widenLo<0>(load8(row.p[3] + x)) : _mm_setzero_si128();
        return v;
    }
    template <int Shift>
    static void get16(const typename InPlanar<P>::Row& row, int x, V3& a, V3& b)
    {
        for (int k = 0; k < 3; ++k) {
            const V r = load16(row.p[k] + x);
            a.c[k] = widenLo<Shift>(r);
            b.c[k] = widenHi<Shift>(r);
        }
        if constexpr (P == 4) {
            const V r = load16(row.p[3] + x);
            a.extra = widenLo<0>(r);
            b.extra = widenHi<0>(r);
        } else {
            a.extra = b.extra = _mm_setzero_si128();
        }
    }
};

template <int Bpp, Order O, Fourth F>
struct Io<OutPacked<Bpp, O, F>> {
    static_assert(F != Fourth::Keep, "a kept fourth byte is never written: such rows have no block kernel");
    // The fourth byte of each pixel, in 16-bit lanes.
    static V fourthOf(const V3& v, const Ctx& ctx)
    {
        if constexpr (F == Fourth::Alpha)
            return splat16(ctx.alpha);
        else if constexpr (F == Fourth::Zero)
            return _mm_setzero_si128();
        else
            return v.extra;
    }
    static void put8(const typename OutPacked<Bpp, O, F>::Row& row, int x, const V3& v, const Ctx& ctx)
    {
        uint8_t* q = row.p[0] + static_cast<std::size_t>(x) * Bpp;
        // a holds channels 0 and 1 (bytes 0..7, 8..15), b channel 2 and the fourth byte (0..7, 8..15).
        const V a = packUs(v.c[0], v.c[1]);
        const V b = packUs(v.c[2], fourthOf(v, ctx));
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
    // Sixteen pixels: each channel packed once to sixteen bytes, then interleaved.
    static void put16(const typename OutPacked<Bpp, O, F>::Row& row, int x, const V3& a, const V3& b, const Ctx& ctx)
    {
        uint8_t* q = row.p[0] + static_cast<std::size_t>(x) * Bpp;
        V ch[3];
        for (int k = 0; k < 3; ++k)
            ch[k] = packUs(a.c[channelByte(O, k)], b.c[channelByte(O, k)]); // ch[slot]: bytes of slot `slot`
        if constexpr (Bpp == 3) {
            auto part = [&]<int Base>() {
                return _mm_or_si128(_mm_or_si128(_mm_shuffle_epi8(ch[0], maskOf(kScatter<3, Base, 0, 0>)),
                                                 _mm_shuffle_epi8(ch[1], maskOf(kScatter<3, Base, 1, 0>))),
                                    _mm_shuffle_epi8(ch[2], maskOf(kScatter<3, Base, 2, 0>)));
            };
            store16(q, part.template operator()<0>());
            store16(q + 16, part.template operator()<16>());
            store16(q + 32, part.template operator()<32>());
        } else {
            const V c3 = packUs(fourthOf(a, ctx), fourthOf(b, ctx));
            const V lo01 = _mm_unpacklo_epi8(ch[0], ch[1]), hi01 = _mm_unpackhi_epi8(ch[0], ch[1]);
            const V lo23 = _mm_unpacklo_epi8(ch[2], c3), hi23 = _mm_unpackhi_epi8(ch[2], c3);
            store16(q, _mm_unpacklo_epi16(lo01, lo23));
            store16(q + 16, _mm_unpackhi_epi16(lo01, lo23));
            store16(q + 32, _mm_unpacklo_epi16(hi01, hi23));
            store16(q + 48, _mm_unpackhi_epi16(hi01, hi23));
        }
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
    static void put16(const typename OutPlanar<P>::Row& row, int x, const V3& a, const V3& b, const Ctx&)
    {
        for (int k = 0; k < 3; ++k)
            store16(row.p[k] + x, packUs(a.c[k], b.c[k]));
        if constexpr (P == 4)
            store16(row.p[3] + x, packUs(a.extra, b.extra));
    }
};

// A group of fewer than eight pixels (the 4-pixel blocks of N = 4 rows): staged through small buffers
// so that no vector access leaves the region. run8(src, dst) converts the eight pixels at the start of
// the staged rows.
template <class C, class Run8>
void stagedGroup(const typename C::Src::Row& s, const typename C::Dst::Row& d, int x, int count, Run8&& run8)
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
    run8(ls, ld);
    for (int p = 0; p < Dst::planes; ++p)
        std::memcpy(d.p[p] + static_cast<std::size_t>(x) * Dst::bytesPerPixel, out[p],
                    static_cast<std::size_t>(count) * Dst::bytesPerPixel);
}

template <class C>
void blocks(const typename C::Src::Row& s, const typename C::Dst::Row& d, int n, const Ctx& ctx)
{
    if constexpr (C::N > 1) {
        using In = Io<typename C::Src>;
        using Out = Io<typename C::Dst>;
        using F = Simd<typename C::Block>;
        constexpr int shift = inputShift<typename C::Block>;
        int x = 0;
        for (; x + 16 <= n; x += 16) {
            V3 a, b;
            In::template get16<shift>(s, x, a, b);
            F::apply(a);
            F::apply(b);
            Out::put16(d, x, a, b, ctx);
        }
        auto run8 = [&](const typename C::Src::Row& s8, const typename C::Dst::Row& d8, int at) {
            V3 v = In::template get8<shift>(s8, at);
            F::apply(v);
            Out::put8(d8, at, v, ctx);
        };
        if (x + 8 <= n) {
            run8(s, d, x);
            x += 8;
        }
        if (x < n)
            stagedGroup<C>(s, d, x, n - x, [&](const auto& s8, const auto& d8) { run8(s8, d8, 0); });
    }
}

} // namespace zox::sse41

// Table expansion for a family's *_sse41.cpp: instantiates the block kernel of every row.
#define ZOX_SSE41_INSTANTIATE(name, shape, Src, Dst, N, Block, Rem, Chk)                                 \
    template void blocks<::zox::Conv<Src, Dst, N, Block, Rem, Chk>>(                                    \
        const Src::Row&, const Dst::Row&, int, const ::zox::Ctx&);
