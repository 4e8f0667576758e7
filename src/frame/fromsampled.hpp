// Conversions from a chroma-sampled image to full-resolution pixels: every pixel of a unit (2x2 for
// 4:2:0, 2x1 for 4:2:2, 4x1 for 4:1:1) takes its own Y and the unit's chroma pair unchanged, and the one
// pass walk and validating layer that all such exports share.
//
// Column rule: pixels before the row's limit column take the block form, the others the remainder form.
// A 4:2:0 image goes by row pairs and whole units; a last odd column (both rows of each pair) and a last
// odd row take the member's edge form with the chroma sample they fall on, or are not written. In 4:2:2
// the pixel of an odd width's half unit takes the member's last-pixel form; in 4:1:1 the pixels behind
// the last whole unit take that unit's chroma. Each form is defined once, in scalar code; a SIMD kernel is a
// checked fast path of it over a prefix of the units.
#pragma once

#include "frame/sampled.hpp"

namespace zox {

// The source planes of one call, Y first: three planes (Y, Cb, Cr), or Y and the plane of chroma pairs,
// or one plane of 4:2:2 groups.
struct SampledImage {
    const uint8_t* plane[3];
    std::ptrdiff_t step[3];
};

// The source rows of one pass: the luma rows of its unit height, and the chroma row.
struct SampledRows {
    const uint8_t* y[2];
    const uint8_t* c0; // Cb plane, pair plane or group row
    const uint8_t* c1; // Cr plane (three planes only)
};

struct ChromaPair {
    int cb, cr;
};

// Y, Cb and Cr planes, one chroma sample a unit; with CrFirst the call names Cr's plane and step before
// Cb's.
template <Sampling S, bool CrFirst = false>
struct InSampledP3 {
    static constexpr Sampling sampling = S;
    static constexpr int planes = 3;
    using Arg = const uint8_t* const*;
    static SampledImage image(const uint8_t* const* p, const int* step)
    {
        constexpr int a = CrFirst ? 2 : 1, b = CrFirst ? 1 : 2;
        return {{p[0], p[a], p[b]}, {step[0], step[a], step[b]}};
    }
    static SampledRows pass(const SampledImage& f, int j)
    {
        constexpr int uh = unitHeight(S);
        return {{rowAddress(f.plane[0], f.step[0], uh * j), rowAddress(f.plane[0], f.step[0], uh * j + uh - 1)},
                rowAddress(f.plane[1], f.step[1], j), rowAddress(f.plane[2], f.step[2], j)};
    }
    static int luma(const SampledRows& s, int dy, int x) { return s.y[dy][x]; }
    static ChromaPair chroma(const SampledRows& s, int u) { return {s.c0[u], s.c1[u]}; }
    // An odd 4:2:2 width's last pixel: its chroma planes hold a sample for it.
    static ChromaPair halfUnit(const SampledRows& s, int u, bool) { return chroma(s, u); }
};

// A 4:2:0 Y plane and a plane of chroma pairs, Cb first or (CrFirst) Cr first.
template <bool CrFirst>
struct InSampledP2 {
    static constexpr Sampling sampling = Sampling::S420;
    static constexpr int planes = 2;
    static SampledRows pass(const SampledImage& f, int j)
    {
        return {{rowAddress(f.plane[0], f.step[0], 2 * j), rowAddress(f.plane[0], f.step[0], 2 * j + 1)},
                rowAddress(f.plane[1], f.step[1], j), nullptr};
    }
    static int luma(const SampledRows& s, int dy, int x) { return s.y[dy][x]; }
    static ChromaPair chroma(const SampledRows& s, int u)
    {
        const int first = s.c0[2 * static_cast<std::size_t>(u)], second = s.c0[2 * static_cast<std::size_t>(u) + 1];
        return CrFirst ? ChromaPair{second, first} : ChromaPair{first, second};
    }
};

// One plane of 4-byte groups, two pixels a group.
template <const GroupOrder& G>
struct InSampledC2 {
    static constexpr Sampling sampling = Sampling::S422;
    static constexpr int planes = 1;
    static constexpr const GroupOrder& order = G;
    static SampledRows pass(const SampledImage& f, int j)
    {
        const uint8_t* row = rowAddress(f.plane[0], f.step[0], j);
        return {{row, row}, row, nullptr};
    }
    static int luma(const SampledRows& s, int, int x)
    {
        return s.y[0][static_cast<std::size_t>(x >> 1) * 4 + ((x & 1) ? G.y1 : G.y0)];
    }
    static ChromaPair chroma(const SampledRows& s, int u)
    {
        const uint8_t* q = s.c0 + static_cast<std::size_t>(u) * 4;
        return {q[G.cb], q[G.cr]};
    }
    // The half group of an odd width holds Y and the group's first chroma byte; the other chroma byte
    // comes from the group before, or at width 1 (no group before) is the same byte.
    static ChromaPair halfUnit(const SampledRows& s, int u, bool single)
    {
        const uint8_t* q = s.c0 + static_cast<std::size_t>(u) * 4;
        const bool cbOwn = G.cb < 2;
        const int own = q[cbOwn ? G.cb : G.cr];
        const int other = single ? own : q[static_cast<std::ptrdiff_t>(cbOwn ? G.cr : G.cb) - 4];
        return cbOwn ? ChromaPair{own, other} : ChromaPair{other, own};
    }
};

// The form of an odd 4:2:2 width's last pixel (Odd), and of the one pixel of width 1 (Single). In 4:2:0
// the edge form of a last odd column and row (Odd), and of a region one pixel wide or high (Single).
template <class Odd_, class Single_ = Odd_>
struct LastPixel {
    using Odd = Odd_;
    using Single = Single_;
};
// Pixels left unwritten: as a member's last-pixel form, an odd 4:2:2 width's last pixel and the 4:2:0
// edges; inside LastPixel, the pixels that form would serve.
struct Unwritten {};

template <class Src_, class Dst_, Limit L_, class Block_, class Rem_, class Last_, int Variant_ = 0>
struct FromSampled {
    static constexpr int variant = Variant_;
    using Src = Src_;
    using Dst = Dst_;
    using Block = Block_;
    using Rem = Rem_;
    using Last = Last_;
    static constexpr Limit limit = L_;
    static constexpr Sampling sampling = Src::sampling;
    static constexpr int uw = unitWidth(sampling), uh = unitHeight(sampling);
};

// The destination rows of one pass.
template <class Dst>
struct PixelRows {
    typename Dst::Row r[2];
};

template <class C, class Form>
inline void storePixel(const SampledRows& s, const PixelRows<typename C::Dst>& d, int dy, int x, ChromaPair ch, const Ctx& ctx)
{
    C::Dst::store(d.r[dy], x, Form::apply(Px{{C::Src::luma(s, dy, x), ch.cb, ch.cr}, 0}), ctx);
}

// A pixel of an odd size's edge, unless its form says it is not written.
template <class C, class Form>
inline void storeEdgePixel(const SampledRows& s, const PixelRows<typename C::Dst>& d, int dy, int x, ChromaPair ch, const Ctx& ctx)
{
    if constexpr (!std::is_same_v<Form, Unwritten>)
        storePixel<C, Form>(s, d, dy, x, ch, ctx);
}

// A form over units [from, to): the oracle of the SIMD kernels.
template <class C, class Form>
void scalarPixelUnits(const SampledRows& s, const PixelRows<typename C::Dst>& d, int from, int to, const Ctx& ctx)
{
    for (int u = from; u < to; ++u) {
        const ChromaPair ch = C::Src::chroma(s, u);
        #pragma GCC unroll 2
        for (int dy = 0; dy < C::uh; ++dy)
            #pragma GCC unroll 4
            for (int k = 0; k < C::uw; ++k)
                storePixel<C, Form>(s, d, dy, u * C::uw + k, ch, ctx);
    }
}

// SIMD kernels of each set: the block form (or the remainder form) over a prefix of units [from, n) of a
// pass; return the first unit not done.
namespace sse41 {
template <class C>
int pixelUnits(const SampledRows& s, const PixelRows<typename C::Dst>& d, int from, int n, bool remainder, const Ctx& ctx);
}
namespace avx2 {
template <class C>
int pixelUnits(const SampledRows& s, const PixelRows<typename C::Dst>& d, int from, int n, bool remainder, const Ctx& ctx);
}

template <class C, KernelSet K>
int kernelPixelUnits(const SampledRows& s, const PixelRows<typename C::Dst>& d, int from, int n, bool remainder, const Ctx& ctx)
{
    if constexpr (K == KernelSet::Avx2)
        return avx2::pixelUnits<C>(s, d, from, n, remainder, ctx);
    else if constexpr (K == KernelSet::Sse41)
        return sse41::pixelUnits<C>(s, d, from, n, remainder, ctx);
    else
        return from;
}

template <class F>
struct LastOf {
    using Odd = F;
    using Single = F;
};
template <class O, class S>
struct LastOf<LastPixel<O, S>> {
    using Odd = O;
    using Single = S;
};

// One pass (a row, or a row pair in 4:2:0) through kernel set K.
template <class C, KernelSet K>
void convertPixelPass(const SampledRows& s, const PixelRows<typename C::Dst>& d, int width, const Ctx& ctx)
{
    const int units = width / C::uw, limit = limitColumn(C::limit, width);
    const int nb = limit / C::uw < units ? limit / C::uw : units;
    scalarPixelUnits<C, typename C::Block>(s, d, kernelPixelUnits<C, K>(s, d, 0, nb, false, ctx), nb, ctx);
    scalarPixelUnits<C, typename C::Rem>(s, d, kernelPixelUnits<C, K>(s, d, nb, units, true, ctx), units, ctx);
    if constexpr (C::sampling == Sampling::S411) { // the last whole unit's chroma, the form by the limit
        for (int x = units * 4; units > 0 && x < width; ++x) {
            const ChromaPair ch = C::Src::chroma(s, units - 1);
            if (x < limit)
                storePixel<C, typename C::Block>(s, d, 0, x, ch, ctx);
            else
                storePixel<C, typename C::Rem>(s, d, 0, x, ch, ctx);
        }
    } else if constexpr (C::sampling == Sampling::S422 && !std::is_same_v<typename C::Last, Unwritten>) {
        if (width & 1) {
            const ChromaPair ch = C::Src::halfUnit(s, units, width == 1);
            if (width == 1)
                storeEdgePixel<C, typename LastOf<typename C::Last>::Single>(s, d, 0, 0, ch, ctx);
            else
                storeEdgePixel<C, typename LastOf<typename C::Last>::Odd>(s, d, 0, width - 1, ch, ctx);
        }
    }
}

// The edges of a 4:2:0 image in the edge form: a last odd column in every row pair, then a last odd row
// (its corner included), each pixel with the chroma sample it falls on.
template <class C, class Form>
void convertEdges420(const SampledImage& src, typename C::Dst::Arg dst, std::ptrdiff_t dstStep, ImageSize roi, const Ctx& ctx)
{
    if constexpr (!std::is_same_v<Form, Unwritten>) {
        const int passes = roi.height / 2, last = roi.width - 1;
        for (int j = 0; (roi.width & 1) && j < passes; ++j) {
            const SampledRows s = C::Src::pass(src, j);
            PixelRows<typename C::Dst> d;
            d.r[0] = C::Dst::row(dst, dstStep, 2 * j);
            d.r[1] = C::Dst::row(dst, dstStep, 2 * j + 1);
            const ChromaPair ch = C::Src::chroma(s, last >> 1);
            storePixel<C, Form>(s, d, 0, last, ch, ctx);
            storePixel<C, Form>(s, d, 1, last, ch, ctx);
        }
        if (roi.height & 1) {
            SampledRows s = C::Src::pass(src, passes);
            s.y[1] = s.y[0];
            PixelRows<typename C::Dst> d;
            d.r[0] = d.r[1] = C::Dst::row(dst, dstStep, roi.height - 1);
            for (int x = 0; x < roi.width; ++x)
                storePixel<C, Form>(s, d, 0, x, C::Src::chroma(s, x >> 1), ctx);
        }
    }
}

template <class C, KernelSet K>
void convertPixelPasses(const SampledImage& src, typename C::Dst::Arg dst, std::ptrdiff_t dstStep, ImageSize roi, const Ctx& ctx)
{
    const int passes = roi.height / C::uh;
    for (int j = 0; j < passes; ++j) {
        PixelRows<typename C::Dst> d;
        d.r[0] = C::Dst::row(dst, dstStep, C::uh * j);
        d.r[1] = C::Dst::row(dst, dstStep, C::uh * j + C::uh - 1);
        convertPixelPass<C, K>(C::Src::pass(src, j), d, roi.width, ctx);
    }
    if constexpr (C::sampling == Sampling::S420 && !std::is_same_v<typename C::Last, Unwritten>) {
        using L = LastOf<typename C::Last>;
        if (roi.width == 1 || roi.height == 1)
            convertEdges420<C, typename L::Single>(src, dst, dstStep, roi, ctx);
        else
            convertEdges420<C, typename L::Odd>(src, dst, dstStep, roi, ctx);
    }
}

template <class C>
void convertFromSampled(const SampledImage& src, typename C::Dst::Arg dst, std::ptrdiff_t dstStep, ImageSize roi, const Ctx& ctx)
{
    if constexpr (kChosenAtLoad) {
        if (activeKernelSet() == KernelSet::Avx2)
            convertPixelPasses<C, KernelSet::Avx2>(src, dst, dstStep, roi, ctx);
        else
            convertPixelPasses<C, KernelSet::Sse41>(src, dst, dstStep, roi, ctx);
    } else {
        convertPixelPasses<C, kBuiltKernelSet>(src, dst, dstStep, roi, ctx);
    }
}

// A table row: its conversion for aligned rows and for others (the same type unless a form depends on it).
template <class Src, class Dst, Limit L, class Block, class Rem, class Last>
struct FromSampledRow {
    static constexpr bool dependsOnAlignment = byAlignment<Block> || byAlignment<Rem>;
    using Aligned = FromSampled<Src, Dst, L, typename FormFor<Block, true>::type, typename FormFor<Rem, true>::type, Last,
                                dependsOnAlignment ? 1 : 0>;
    using Other = FromSampled<Src, Dst, L, typename FormFor<Block, false>::type, typename FormFor<Rem, false>::type, Last>;
    // The second kernel instance of the row: the aligned one, or an empty placeholder.
    using Spare = FromSampled<Src, Dst, L, typename FormFor<Block, true>::type, typename FormFor<Rem, true>::type, Last,
                              dependsOnAlignment ? 1 : 2>;
};

// Aligned rows: every plane pointer, the destination and every step a multiple of 16.
template <class Dst>
bool pixelRowsAligned(const SampledImage& src, int planes, typename Dst::Arg dst, std::ptrdiff_t dstStep)
{
    uintptr_t bits = static_cast<uintptr_t>(dstStep);
    for (int i = 0; i < planes; ++i)
        bits |= reinterpret_cast<uintptr_t>(src.plane[i]) | static_cast<uintptr_t>(src.step[i]);
    if constexpr (Dst::planes == 1)
        bits |= reinterpret_cast<uintptr_t>(dst);
    else
        for (int i = 0; i < Dst::planes; ++i)
            bits |= reinterpret_cast<uintptr_t>(dst[i]);
    return (bits & 15) == 0;
}

template <class Row>
void runFromSampled(const SampledImage& src, typename Row::Other::Dst::Arg dst, std::ptrdiff_t dstStep, ImageSize roi,
                    const Ctx& ctx, bool mayAlign = true)
{
    using C = typename Row::Other;
    if constexpr (Row::dependsOnAlignment)
        if (mayAlign && pixelRowsAligned<typename C::Dst>(src, C::Src::planes, dst, dstStep))
            return convertFromSampled<typename Row::Aligned>(src, dst, dstStep, roi, ctx);
    convertFromSampled<C>(src, dst, dstStep, roi, ctx);
}

// Packed planes (the members without R): source steps width, and width / 2 (4:2:0) or width / 2 rounded
// up (4:2:2) for chroma; destination steps width (planes) or 3 width. A 4:2:2 image of even width and
// 256 pixels or more goes as one row of width x height pixels, in pieces of whole blocks of 16 (so that
// each piece takes the block form exactly where the whole run would).
template <class Row>
void runPackedFromSampled(const uint8_t* const* src, typename Row::Other::Dst::Arg dst, ImageSize roi)
{
    using C = typename Row::Other;
    using Dst = typename C::Dst;
    const std::ptrdiff_t w = roi.width, cw = C::sampling == Sampling::S420 ? w / 2 : w / 2 + w % 2;
    const int64_t pixels = static_cast<int64_t>(roi.width) * roi.height;
    if (C::sampling != Sampling::S422 || w % 2 != 0 || pixels < 256)
        return runFromSampled<Row>(SampledImage{{src[0], src[1], src[2]}, {w, cw, cw}}, dst, w * Dst::bytesPerPixel, roi, {});
    constexpr int64_t piece = int64_t{1} << 30;
    for (int64_t done = 0; done < pixels; done += piece) {
        const int n = static_cast<int>(pixels - done < piece ? pixels - done : piece);
        const SampledImage run{{src[0] + done, src[1] + done / 2, src[2] + done / 2}, {0, 0, 0}};
        if constexpr (Dst::planes == 1) {
            runFromSampled<Row>(run, dst + done * Dst::bytesPerPixel, 0, ImageSize{n, 1}, {}, false);
        } else {
            uint8_t* const p[3] = {dst[0] + done, dst[1] + done, dst[2] + done};
            runFromSampled<Row>(run, p, 0, ImageSize{n, 1}, {}, false);
        }
    }
}

// The calls of each export shape, over a table row and its rules.
// src[3], srcStep[3] (Y, Cb, Cr or Y, Cr, Cb), dst, dstStep
template <class Row, class R>
zoxStatus fromPlanes3(const uint8_t* const* src, const int* srcStep, typename Row::Other::Dst::Arg dst, int dstStep,
                      ImageSize roi, Ctx ctx)
{
    using C = typename Row::Other;
    return checkedSampled<R>(src && srcStep && dst, [&] { return src[0] && src[1] && src[2] && C::Dst::planesValid(dst); }, roi,
                             [&] { runFromSampled<Row>(C::Src::image(src, srcStep), dst, wholeSampleStep<typename C::Dst>(dstStep), roi, ctx); });
}

// srcY, srcYStep, srcCbCr, srcCbCrStep, dst, dstStep; or one plane of groups (second pointer null)
template <class Row, class R>
zoxStatus fromPlanes(const uint8_t* p0, int step0, const uint8_t* p1, int step1, typename Row::Other::Dst::Arg dst, int dstStep,
                     ImageSize roi, Ctx ctx)
{
    using C = typename Row::Other;
    constexpr bool two = C::Src::planes == 2;
    return checkedSampled<R>(p0 && (!two || p1) && dst, [&] { return C::Dst::planesValid(dst); }, roi, [&] {
        runFromSampled<Row>(SampledImage{{p0, p1, nullptr}, {step0, step1, 0}}, dst, wholeSampleStep<typename C::Dst>(dstStep), roi, ctx);
    });
}

// src[3], dst: packed planes
template <class Row, class R>
zoxStatus fromPackedPlanes3(const uint8_t* const* src, typename Row::Other::Dst::Arg dst, ImageSize roi)
{
    using C = typename Row::Other;
    return checkedSampled<R>(src && dst, [&] { return src[0] && src[1] && src[2] && C::Dst::planesValid(dst); }, roi,
                             [&] { runPackedFromSampled<Row>(src, dst, roi); });
}

} // namespace zox

// Export shapes of the conversions from sampled images. A family table row names one of these:
//   X(exportName, shape, Src, Dst, Limit, Block, Rem, Last, Rules)
#define ZOX_FROM_SAMPLED_ROW(Src, Dst, Lim, Block, Rem, Last) ::zox::FromSampledRow<Src, Dst, Lim, Block, Rem, Last>
// src[3], srcStep[3], dst, dstStep, roiSize
#define ZOX_SHAPE_FROM_P3(name, Src, Dst, Lim, Block, Rem, Last, Rules)                                                          \
    ZOXCC_API zoxStatus name(const uint8_t* const src[3], const int srcStep[3], Dst::Arg dst, int dstStep, ImageSize roiSize)     \
    {                                                                                                                             \
        return ::zox::fromPlanes3<ZOX_FROM_SAMPLED_ROW(Src, Dst, Lim, Block, Rem, Last), Rules>(src, srcStep, dst, dstStep, roiSize, {}); \
    }
// src[3], srcStep[3], dst, dstStep, roiSize, alpha
#define ZOX_SHAPE_FROM_P3_ALPHA(name, Src, Dst, Lim, Block, Rem, Last, Rules)                                                    \
    ZOXCC_API zoxStatus name(const uint8_t* const src[3], const int srcStep[3], Dst::Arg dst, int dstStep, ImageSize roiSize,     \
                             uint8_t alpha)                                                                                       \
    {                                                                                                                             \
        return ::zox::fromPlanes3<ZOX_FROM_SAMPLED_ROW(Src, Dst, Lim, Block, Rem, Last), Rules>(src, srcStep, dst, dstStep, roiSize, \
                                                                                                 ::zox::Ctx{alpha});             \
    }
// srcY, srcYStep, srcCbCr, srcCbCrStep, dst, dstStep, roiSize
#define ZOX_SHAPE_FROM_P2(name, Src, Dst, Lim, Block, Rem, Last, Rules)                                                          \
    ZOXCC_API zoxStatus name(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, Dst::Arg dst, int dstStep, \
                             ImageSize roiSize)                                                                                   \
    {                                                                                                                             \
        return ::zox::fromPlanes<ZOX_FROM_SAMPLED_ROW(Src, Dst, Lim, Block, Rem, Last), Rules>(srcY, srcYStep, srcCbCr, srcCbCrStep, \
                                                                                                dst, dstStep, roiSize, {});      \
    }
// srcY, srcYStep, srcCbCr, srcCbCrStep, dst, dstStep, roiSize, alpha
#define ZOX_SHAPE_FROM_P2_ALPHA(name, Src, Dst, Lim, Block, Rem, Last, Rules)                                                    \
    ZOXCC_API zoxStatus name(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, Dst::Arg dst, int dstStep, \
                             ImageSize roiSize, uint8_t alpha)                                                                    \
    {                                                                                                                             \
        return ::zox::fromPlanes<ZOX_FROM_SAMPLED_ROW(Src, Dst, Lim, Block, Rem, Last), Rules>(srcY, srcYStep, srcCbCr, srcCbCrStep, \
                                                                                                dst, dstStep, roiSize,           \
                                                                                                ::zox::Ctx{alpha});              \
    }
// src, srcStep, dst (or dst[3] with one step), dstStep, roiSize
#define ZOX_SHAPE_FROM_C2(name, Src, Dst, Lim, Block, Rem, Last, Rules)                                                          \
    ZOXCC_API zoxStatus name(const uint8_t* src, int srcStep, Dst::Arg dst, int dstStep, ImageSize roiSize)                       \
    {                                                                                                                             \
        return ::zox::fromPlanes<ZOX_FROM_SAMPLED_ROW(Src, Dst, Lim, Block, Rem, Last), Rules>(src, srcStep, nullptr, 0, dst,     \
                                                                                                dstStep, roiSize, {});           \
    }
// src, srcStep, dst, dstStep, roiSize, alpha
#define ZOX_SHAPE_FROM_C2_ALPHA(name, Src, Dst, Lim, Block, Rem, Last, Rules)                                                    \
    ZOXCC_API zoxStatus name(const uint8_t* src, int srcStep, Dst::Arg dst, int dstStep, ImageSize roiSize, uint8_t alpha)         \
    {                                                                                                                             \
        return ::zox::fromPlanes<ZOX_FROM_SAMPLED_ROW(Src, Dst, Lim, Block, Rem, Last), Rules>(src, srcStep, nullptr, 0, dst,     \
                                                                                                dstStep, roiSize,                \
                                                                                                ::zox::Ctx{alpha});              \
    }
// src[3], dst (or dst[3]), imageSize: packed planes
#define ZOX_SHAPE_FROM_IMAGE(name, Src, Dst, Lim, Block, Rem, Last, Rules)                                                       \
    ZOXCC_API zoxStatus name(const uint8_t* const src[3], Dst::Arg dst, ImageSize imageSize)                                      \
    {                                                                                                                             \
        return ::zox::fromPackedPlanes3<ZOX_FROM_SAMPLED_ROW(Src, Dst, Lim, Block, Rem, Last), Rules>(src, dst, imageSize);       \
    }

// Table expansion for a family's *_sse41.cpp and *_avx2.cpp: the kernels of each row, for aligned rows and
// others.
#define ZOX_INSTANTIATE_FROM_SAMPLED(name, shape, Src, Dst, Lim, Block, Rem, Last, Rules)                                       \
    template int pixelUnits<ZOX_FROM_SAMPLED_ROW(Src, Dst, Lim, Block, Rem, Last)::Other>(                                     \
        const ::zox::SampledRows&, const ::zox::PixelRows<Dst>&, int, int, bool, const ::zox::Ctx&);                             \
    template int pixelUnits<ZOX_FROM_SAMPLED_ROW(Src, Dst, Lim, Block, Rem, Last)::Spare>(                                     \
        const ::zox::SampledRows&, const ::zox::PixelRows<Dst>&, int, int, bool, const ::zox::Ctx&);

#define ZOX_DEFINE_FROM_SAMPLED(name, shape, Src, Dst, Lim, Block, Rem, Last, Rules) shape(name, Src, Dst, Lim, Block, Rem, Last, Rules)
