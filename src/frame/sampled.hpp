// Conversions from full-resolution pixels to a chroma-sampled image: luma for every pixel, one chroma
// pair for each unit of pixels (2x2 for 4:2:0, 2x1 for 4:2:2, 4x1 for 4:1:1), and the one pass walk
// and validating layer that all such exports share.
//
// Column rule: units that begin before the row's limit column take the block form, the others the
// remainder form; the pixels behind the last whole unit take the tail form, which says which of Y, Cb
// and Cr it writes. A 4:2:0 image goes by row pairs; its tail form, where it has one, writes the luma
// of a last odd column in both rows of each pair and of every pixel of a last odd row, else those are
// not converted. Each form is defined once, in scalar code; a SIMD kernel is a checked fast path of the
// block form over a prefix of the block units.
#pragma once

#include "frame/conv.hpp"
#include "frame/kernel_set.hpp"
#include "frame/ops.hpp"
#include "frame/layouts.hpp"
#include "zoxcc.h"

#include <cstddef>
#include <cstdint>
#include <type_traits>

namespace zox {

enum class Sampling { S420, S422, S411 };

constexpr int unitWidth(Sampling s)
{
    return s == Sampling::S411 ? 4 : 2;
}
constexpr int unitHeight(Sampling s)
{
    return s == Sampling::S420 ? 2 : 1;
}

// The pixels of one unit in row order (a 2x2 unit: top left, top right, bottom left, bottom right), and
// for filters the pixel left of the unit, where the row has one.
struct Unit {
    Px p[4];
    Px left;
    bool hasLeft;
};
// Luma of each pixel of a unit, in the same order, and the unit's chroma pair.
struct UnitOut {
    int y[4];
    int cb, cr;
};

// The column before which units take the block form, from the width W.
enum class Limit {
    None, // no block form
    All,  // one form in every column
    L16,  // W rounded down to 16
    L8,   // W rounded down to 8
    L4,   // W rounded down to 4
    L4P3, // W rounded down to 4, plus 3 when W mod 4 is 3
    Even, // W rounded down to 2
    LB,   // W rounded down to 16, plus 4 when W mod 8 is at least 4
    LC    // W rounded down to 32, plus 8 when W mod 16 is at least 8
};
constexpr int limitColumn(Limit l, int w)
{
    switch (l) {
    case Limit::None: return 0;
    case Limit::All: return w;
    case Limit::L16: return w & ~15;
    case Limit::L8: return w & ~7;
    case Limit::L4: return w & ~3;
    case Limit::L4P3: return (w & ~3) + ((w & 3) == 3 ? 3 : 0);
    case Limit::Even: return w & ~1;
    case Limit::LB: return (w & ~15) + ((w & 7) >= 4 ? 4 : 0);
    case Limit::LC: return (w & ~31) + ((w & 15) >= 8 ? 8 : 0);
    }
    return 0;
}

// Which samples a tail form writes.
enum TailWrites { WritesY = 1, WritesCb = 2, WritesCr = 4 };

// Tail that writes nothing.
struct NoTail {
    static constexpr int writes = 0;
    static Px apply(const Px& p) { return p; }
};

// The destination planes of one call, Y first: three planes (Y, Cb, Cr), or Y and the plane of
// Cb, Cr pairs, or one plane of 4:2:2 groups.
struct SampledFrame {
    uint8_t* plane[3];
    std::ptrdiff_t step[3];
};

// The destination rows of one pass: the luma rows of its unit height, and the chroma row.
struct SampledPass {
    uint8_t* y[2];
    uint8_t* c0; // Cb plane, pair plane or group row
    uint8_t* c1; // Cr plane (three planes only)
};

// Y, Cb and Cr planes; chroma planes hold one sample a unit. The frame's planes come in Y, Cb, Cr order
// (a member that names Cr first exchanges them on the way in).
template <Sampling S>
struct OutSampledP3 {
    static constexpr Sampling sampling = S;
    static constexpr int planes = 3;
    static SampledPass pass(const SampledFrame& f, int j)
    {
        constexpr int uh = unitHeight(S);
        return {{rowAddress(f.plane[0], f.step[0], uh * j), rowAddress(f.plane[0], f.step[0], uh * j + uh - 1)},
                rowAddress(f.plane[1], f.step[1], j), rowAddress(f.plane[2], f.step[2], j)};
    }
    static void storeY(const SampledPass& d, int dy, int x, int v) { d.y[dy][x] = clip8(v); }
    static void storeCb(const SampledPass& d, int u, int v) { d.c0[u] = clip8(v); }
    static void storeCr(const SampledPass& d, int u, int v) { d.c1[u] = clip8(v); }
};

// Y plane and a plane of Cb, Cr pairs.
template <Sampling S>
struct OutSampledP2 {
    static constexpr Sampling sampling = S;
    static constexpr int planes = 2;
    static SampledPass pass(const SampledFrame& f, int j)
    {
        constexpr int uh = unitHeight(S);
        return {{rowAddress(f.plane[0], f.step[0], uh * j), rowAddress(f.plane[0], f.step[0], uh * j + uh - 1)},
                rowAddress(f.plane[1], f.step[1], j), nullptr};
    }
    static void storeY(const SampledPass& d, int dy, int x, int v) { d.y[dy][x] = clip8(v); }
    static void storeCb(const SampledPass& d, int u, int v) { d.c0[2 * u] = clip8(v); }
    static void storeCr(const SampledPass& d, int u, int v) { d.c0[2 * u + 1] = clip8(v); }
};

// Byte positions of the four samples of a 4:2:2 group of two pixels.
struct GroupOrder {
    int y0, cb, y1, cr;
};
inline constexpr GroupOrder YCbYCr{0, 1, 2, 3}; // Y0 Cb Y1 Cr
inline constexpr GroupOrder YCrYCb{0, 3, 2, 1}; // Y0 Cr Y1 Cb
inline constexpr GroupOrder CbYCrY{1, 0, 3, 2}; // Cb Y0 Cr Y1

// One plane of 4-byte groups, two pixels a group.
template <const GroupOrder& G>
struct OutSampledC2 {
    static constexpr Sampling sampling = Sampling::S422;
    static constexpr int planes = 1;
    static constexpr const GroupOrder& order = G;
    static SampledPass pass(const SampledFrame& f, int j)
    {
        uint8_t* row = rowAddress(f.plane[0], f.step[0], j);
        return {{row, row}, row, nullptr};
    }
    static void storeY(const SampledPass& d, int, int x, int v)
    {
        d.y[0][static_cast<std::size_t>(x >> 1) * 4 + ((x & 1) ? G.y1 : G.y0)] = clip8(v);
    }
    static void storeCb(const SampledPass& d, int u, int v) { d.c0[static_cast<std::size_t>(u) * 4 + G.cb] = clip8(v); }
    static void storeCr(const SampledPass& d, int u, int v) { d.c0[static_cast<std::size_t>(u) * 4 + G.cr] = clip8(v); }
};

// A source whose samples go through an 8-bit table first.
template <class Src, class Map_>
struct InMapped : Src {
    using Base = Src;
    using Map = Map_;
    static Px load(const typename Src::Row& row, int x)
    {
        Px p = Src::load(row, x);
        for (int k = 0; k < 3; ++k)
            p.c[k] = Map_::apply(p.c[k]);
        return p;
    }
};

// The warning a call returns with its finished result.
enum class OddWarn { Never, WidthOrHeightOdd, WidthOdd, WidthNotMultipleOf4 };

// The argument checks of a member: pointer order, minimum size, warning.
template <Checks C_, int MinW_, int MinH_, OddWarn W_>
struct SampledRules {
    static constexpr Checks checks = C_;
    static constexpr int minWidth = MinW_, minHeight = MinH_;
    static constexpr OddWarn warn = W_;
    static constexpr bool warns(ImageSize roi)
    {
        switch (W_) {
        case OddWarn::Never: return false;
        case OddWarn::WidthOrHeightOdd: return (roi.width & 1) || (roi.height & 1);
        case OddWarn::WidthOdd: return roi.width & 1;
        case OddWarn::WidthNotMultipleOf4: return roi.width & 3;
        }
        return false;
    }
};

// Variant: 0, or 1 for the aligned-row forms of a member whose forms depend on alignment; 2 marks the
// unused aligned slot of the others (its kernels are empty).
template <class Src_, class Dst_, Limit L_, class Block_, class Rem_, class Tail_, int Variant_ = 0>
struct ToSampled {
    static constexpr int variant = Variant_;
    using Src = Src_;
    using Dst = Dst_;
    using Block = Block_;
    using Rem = Rem_;
    using Tail = Tail_;
    static constexpr Limit limit = L_;
    static constexpr Sampling sampling = Dst::sampling;
    static constexpr int uw = unitWidth(sampling), uh = unitHeight(sampling);
};

// The source rows of one pass.
template <class Src>
struct SourcePass {
    typename Src::Row r[2];
};

template <class C>
inline Unit loadUnit(const SourcePass<typename C::Src>& s, int u)
{
    Unit unit;
    #pragma GCC unroll 4
    for (int k = 0; k < C::uw * C::uh; ++k)
        unit.p[k] = C::Src::load(s.r[k / C::uw], u * C::uw + k % C::uw);
    if constexpr (requires { C::Block::readsLeft; }) {
        unit.hasLeft = u > 0;
        if (u > 0)
            unit.left = C::Src::load(s.r[0], u * C::uw - 1);
    }
    return unit;
}

template <class C>
inline void storeUnit(const SampledPass& d, int u, const UnitOut& o)
{
    #pragma GCC unroll 4
    for (int k = 0; k < C::uw * C::uh; ++k)
        C::Dst::storeY(d, k / C::uw, u * C::uw + k % C::uw, o.y[k]);
    C::Dst::storeCb(d, u, o.cb);
    C::Dst::storeCr(d, u, o.cr);
}

// The block form over units [from, to): the oracle of the SIMD kernels.
template <class C, class Form>
void scalarUnits(const SourcePass<typename C::Src>& s, const SampledPass& d, int from, int to)
{
    for (int u = from; u < to; ++u)
        storeUnit<C>(d, u, Form::apply(loadUnit<C>(s, u)));
}

// SIMD kernels of each set: the block form (or the remainder form) over a prefix of units [from, n) of a
// pass; return the first unit not done.
namespace sse41 {
template <class C>
int sampledUnits(const SourcePass<typename C::Src>& s, const SampledPass& d, int from, int n, bool remainder);
}
namespace avx2 {
template <class C>
int sampledUnits(const SourcePass<typename C::Src>& s, const SampledPass& d, int from, int n, bool remainder);
}

template <class C, KernelSet K>
int kernelUnits(const SourcePass<typename C::Src>& s, const SampledPass& d, int from, int n, bool remainder)
{
    if constexpr (K == KernelSet::Avx2)
        return avx2::sampledUnits<C>(s, d, from, n, remainder);
    else if constexpr (K == KernelSet::Sse41)
        return sse41::sampledUnits<C>(s, d, from, n, remainder);
    else
        return from;
}

template <class C>
constexpr int blockUnits(int width)
{
    if constexpr (C::limit == Limit::None)
        return 0;
    else
        return limitColumn(C::limit, width) / C::uw;
}

// One pass (a row, or a row pair in 4:2:0) through kernel set K.
template <class C, KernelSet K>
void convertPass(const SourcePass<typename C::Src>& s, const SampledPass& d, int width)
{
    const int units = width / C::uw;
    const int nb = blockUnits<C>(width) < units ? blockUnits<C>(width) : units;
    if constexpr (C::limit != Limit::None)
        scalarUnits<C, typename C::Block>(s, d, kernelUnits<C, K>(s, d, 0, nb, false), nb);
    scalarUnits<C, typename C::Rem>(s, d, kernelUnits<C, K>(s, d, nb, units, true), units);
    if constexpr (C::Tail::writes != 0) {
        static_assert(C::sampling != Sampling::S420 || C::Tail::writes == WritesY, "a 4:2:0 tail writes luma only");
        #pragma GCC unroll 2
        for (int dy = 0; dy < C::uh; ++dy)
            for (int x = units * C::uw; x < width; ++x) {
                const Px o = C::Tail::apply(C::Src::load(s.r[dy], x));
                if constexpr (C::Tail::writes & WritesY)
                    C::Dst::storeY(d, dy, x, o.c[0]);
                if constexpr (C::Tail::writes & WritesCb)
                    C::Dst::storeCb(d, units, o.c[1]);
                if constexpr (C::Tail::writes & WritesCr)
                    C::Dst::storeCr(d, units, o.c[2]);
            }
    }
}

template <class C, KernelSet K>
void convertPasses(typename C::Src::Arg src, std::ptrdiff_t srcStep, const SampledFrame& dst, ImageSize roi)
{
    const int passes = roi.height / C::uh;
    for (int j = 0; j < passes; ++j) {
        SourcePass<typename C::Src> s;
        s.r[0] = C::Src::row(src, srcStep, C::uh * j);
        s.r[1] = C::Src::row(src, srcStep, C::uh * j + C::uh - 1);
        convertPass<C, K>(s, C::Dst::pass(dst, j), roi.width);
    }
    if constexpr (C::sampling == Sampling::S420 && C::Tail::writes != 0)
        if (roi.height & 1) { // a last odd row: the tail form in every column
            const typename C::Src::Row s = C::Src::row(src, srcStep, roi.height - 1);
            const SampledPass d = C::Dst::pass(dst, passes);
            for (int x = 0; x < roi.width; ++x)
                C::Dst::storeY(d, 0, x, C::Tail::apply(C::Src::load(s, x)).c[0]);
        }
}

template <class C>
void convertSampledImage(typename C::Src::Arg src, std::ptrdiff_t srcStep, const SampledFrame& dst, ImageSize roi)
{
    if constexpr (kChosenAtLoad) {
        if (activeKernelSet() == KernelSet::Avx2)
            convertPasses<C, KernelSet::Avx2>(src, srcStep, dst, roi);
        else
            convertPasses<C, KernelSet::Sse41>(src, srcStep, dst, roi);
    } else {
        convertPasses<C, kBuiltKernelSet>(src, srcStep, dst, roi);
    }
}

// The validating layer: the member's argument checks and minimum size; then the conversion, and the
// member's warning with the finished result.
template <class R, class Elements, class Run>
zoxStatus checkedSampled(bool pointers, Elements elements, ImageSize roi, Run run)
{
    const zoxStatus st =
        checkArguments<R::checks>(pointers, elements, roi.width >= R::minWidth && roi.height >= R::minHeight);
    if (st != zoxStatusOk)
        return st;
    run();
    return R::warns(roi) ? zoxWarnOddSize : zoxStatusOk;
}

// A form pair of a member whose kernel, and so its values, depend on whether its rows are aligned.
template <class AlignedForm, class OtherForm>
struct ByAlignment {
    using Aligned = AlignedForm;
    using Other = OtherForm;
};
template <class F, bool Aligned>
struct FormFor {
    using type = F;
};
template <class A, class O, bool Aligned>
struct FormFor<ByAlignment<A, O>, Aligned> {
    using type = std::conditional_t<Aligned, A, O>;
};
template <class F>
inline constexpr bool byAlignment = !std::is_same_v<typename FormFor<F, true>::type, typename FormFor<F, false>::type>;

// A table row: its conversion for aligned rows and for others (the same type unless a form depends on it).
template <class Src, class Dst, Limit L, class Block, class Rem, class Tail>
struct SampledRow {
    static constexpr bool dependsOnAlignment = byAlignment<Block> || byAlignment<Rem>;
    using Aligned = ToSampled<Src, Dst, L, typename FormFor<Block, true>::type, typename FormFor<Rem, true>::type, Tail,
                              dependsOnAlignment ? 1 : 0>;
    using Other = ToSampled<Src, Dst, L, typename FormFor<Block, false>::type, typename FormFor<Rem, false>::type, Tail>;
    // The second kernel instance of the row: the aligned one, or an empty placeholder.
    using Spare = ToSampled<Src, Dst, L, typename FormFor<Block, true>::type, typename FormFor<Rem, true>::type, Tail,
                            dependsOnAlignment ? 1 : 2>;
};

// Aligned rows: every row pointer and step a multiple of 16.
inline bool rowsAligned(const void* src, std::ptrdiff_t srcStep, const SampledFrame& f, int planes)
{
    uintptr_t bits = reinterpret_cast<uintptr_t>(src) | static_cast<uintptr_t>(srcStep);
    for (int i = 0; i < planes; ++i)
        bits |= reinterpret_cast<uintptr_t>(f.plane[i]) | static_cast<uintptr_t>(f.step[i]);
    return (bits & 15) == 0;
}

template <class Row, class SrcArg>
void runSampled(SrcArg src, std::ptrdiff_t srcStep, const SampledFrame& dst, ImageSize roi, bool mayAlign = true)
{
    if constexpr (Row::dependsOnAlignment)
        if (mayAlign && rowsAligned(src, srcStep, dst, Row::Aligned::Dst::planes))
            return convertSampledImage<typename Row::Aligned>(src, srcStep, dst, roi);
    convertSampledImage<typename Row::Other>(src, srcStep, dst, roi);
}

// An image of packed 4:2:2 planes taken as one run of pixels, in pieces of whole blocks of 16 (so that
// each piece takes the block form exactly where the whole run would).
template <class Row, class SrcArg>
void runAsOneRow(SrcArg src, const SampledFrame& dst, int64_t pixels)
{
    using Src = typename Row::Other::Src;
    constexpr int64_t piece = int64_t{1} << 30;
    for (int64_t done = 0; done < pixels; done += piece) {
        const int n = static_cast<int>(pixels - done < piece ? pixels - done : piece);
        const SampledFrame f{{dst.plane[0] + done, dst.plane[1] + done / 2, dst.plane[2] + done / 2}, {0, 0, 0}};
        if constexpr (Src::planes == 1) {
            runSampled<Row>(rowAddress(src, static_cast<std::ptrdiff_t>(done) * Src::bytesPerPixel, 1), 0, f, ImageSize{n, 1}, false);
        } else {
            const uint8_t* p[3] = {src[0] + done, src[1] + done, src[2] + done};
            runSampled<Row>(p, 0, f, ImageSize{n, 1}, false);
        }
    }
}

// The calls of each export shape, over a table row and its rules.
// src, srcStep, dst[3], dstStep[3]: Y, Cb, Cr, or with CrFirst Y, Cr, Cb (exchanged on the way in).
template <class Row, class R, bool CrFirst, class SrcArg>
zoxStatus toPlanes3(SrcArg src, int srcStep, uint8_t* const* dst, const int* step, ImageSize roi)
{
    using Src = typename Row::Other::Src;
    return checkedSampled<R>(src && dst && step, [&] { return Src::planesValid(src) && dst[0] && dst[1] && dst[2]; }, roi, [&] {
        const int a = CrFirst ? 2 : 1, b = CrFirst ? 1 : 2;
        runSampled<Row>(src, srcStep, SampledFrame{{dst[0], dst[a], dst[b]}, {step[0], step[a], step[b]}}, roi);
    });
}

// src, srcStep, and two planes (Y and Cb,Cr pairs) or one (4:2:2 groups, second pointer null).
template <class Row, class R, class SrcArg>
zoxStatus toPlanes(SrcArg src, int srcStep, uint8_t* p0, int step0, uint8_t* p1, int step1, ImageSize roi)
{
    using Src = typename Row::Other::Src;
    constexpr bool two = Row::Other::Dst::planes == 2;
    return checkedSampled<R>(src && p0 && (!two || p1), [&] { return Src::planesValid(src); }, roi,
                             [&] { runSampled<Row>(src, srcStep, SampledFrame{{p0, p1, nullptr}, {step0, step1, 0}}, roi); });
}

// src, dst[3]: packed planes, source rows of width pixels, chroma steps width / 2 (4:2:0) or width / 2
// rounded up (4:2:2). A 4:2:2 image of even width and 256 pixels or more goes as one row of width x
// height pixels, in the forms for unaligned rows.
template <class Row, class R, class SrcArg>
zoxStatus toPackedPlanes3(SrcArg src, uint8_t* const* dst, ImageSize roi)
{
    using Src = typename Row::Other::Src;
    return checkedSampled<R>(src && dst, [&] { return Src::planesValid(src) && dst[0] && dst[1] && dst[2]; }, roi, [&] {
        const std::ptrdiff_t w = roi.width, cw = Row::Other::sampling == Sampling::S420 ? w / 2 : w / 2 + w % 2;
        const SampledFrame f{{dst[0], dst[1], dst[2]}, {w, cw, cw}};
        const int64_t pixels = static_cast<int64_t>(roi.width) * roi.height;
        if (Row::Other::sampling == Sampling::S422 && w % 2 == 0 && pixels >= 256)
            runAsOneRow<Row>(src, f, pixels);
        else
            runSampled<Row>(src, w * Src::bytesPerPixel, f, roi);
    });
}

} // namespace zox

// Export shapes of the sampled conversions. A family table row names one of these:
//   X(exportName, shape, Src, Dst, Limit, Block, Rem, Tail, Rules)
#define ZOX_SAMPLED_ROW(Src, Dst, Lim, Block, Rem, Tail) ::zox::SampledRow<Src, Dst, Lim, Block, Rem, Tail>
// src, srcStep, dst[3], dstStep[3], roiSize (Y, Cb, Cr)
#define ZOX_SHAPE_TO_P3(name, Src, Dst, Lim, Block, Rem, Tail, Rules)                                              \
    ZOXCC_API zoxStatus name(Src::Arg src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize) \
    {                                                                                                               \
        return ::zox::toPlanes3<ZOX_SAMPLED_ROW(Src, Dst, Lim, Block, Rem, Tail), Rules, false>(src, srcStep, dst, dstStep, roiSize); \
    }
// The same with Cr before Cb in both arrays.
#define ZOX_SHAPE_TO_P3_CR_FIRST(name, Src, Dst, Lim, Block, Rem, Tail, Rules)                                     \
    ZOXCC_API zoxStatus name(Src::Arg src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize) \
    {                                                                                                               \
        return ::zox::toPlanes3<ZOX_SAMPLED_ROW(Src, Dst, Lim, Block, Rem, Tail), Rules, true>(src, srcStep, dst, dstStep, roiSize); \
    }
// src, srcStep, dstY, dstYStep, dstCbCr, dstCbCrStep, roiSize
#define ZOX_SHAPE_TO_P2(name, Src, Dst, Lim, Block, Rem, Tail, Rules)                                              \
    ZOXCC_API zoxStatus name(Src::Arg src, int srcStep, uint8_t* dstY, int dstYStep, uint8_t* dstCbCr, int dstCbCrStep, \
                             ImageSize roiSize)                                                                     \
    {                                                                                                               \
        return ::zox::toPlanes<ZOX_SAMPLED_ROW(Src, Dst, Lim, Block, Rem, Tail), Rules>(src, srcStep, dstY, dstYStep, dstCbCr, \
                                                                                          dstCbCrStep, roiSize);    \
    }
// src, srcStep, dst, dstStep, roiSize
#define ZOX_SHAPE_TO_C2(name, Src, Dst, Lim, Block, Rem, Tail, Rules)                                              \
    ZOXCC_API zoxStatus name(Src::Arg src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize)              \
    {                                                                                                               \
        return ::zox::toPlanes<ZOX_SAMPLED_ROW(Src, Dst, Lim, Block, Rem, Tail), Rules>(src, srcStep, dst, dstStep, nullptr, 0, \
                                                                                          roiSize);                 \
    }
// src, dst[3], imageSize: packed planes
#define ZOX_SHAPE_TO_P3_IMAGE(name, Src, Dst, Lim, Block, Rem, Tail, Rules)                                        \
    ZOXCC_API zoxStatus name(Src::Arg src, uint8_t* const dst[3], ImageSize imageSize)                               \
    {                                                                                                               \
        return ::zox::toPackedPlanes3<ZOX_SAMPLED_ROW(Src, Dst, Lim, Block, Rem, Tail), Rules>(src, dst, imageSize); \
    }

// Table expansion for a family's *_sse41.cpp and *_avx2.cpp: the kernels of each row, for aligned rows and
// others.
#define ZOX_INSTANTIATE_SAMPLED(name, shape, Src, Dst, Lim, Block, Rem, Tail, Rules)                              \
    template int sampledUnits<ZOX_SAMPLED_ROW(Src, Dst, Lim, Block, Rem, Tail)::Other>(                            \
        const ::zox::SourcePass<Src>&, const ::zox::SampledPass&, int, int, bool);                                \
    template int sampledUnits<ZOX_SAMPLED_ROW(Src, Dst, Lim, Block, Rem, Tail)::Spare>(                            \
        const ::zox::SourcePass<Src>&, const ::zox::SampledPass&, int, int, bool);

#define ZOX_DEFINE_SAMPLED(name, shape, Src, Dst, Lim, Block, Rem, Tail, Rules) shape(name, Src, Dst, Lim, Block, Rem, Tail, Rules)
