// A conversion of one pixel layout into another through a per-pixel block form and remainder form, and
// the one row walk and validating layer that all such exports share.
//
// Row rule: the columns below the width rounded down to N take the block form, the columns from there
// on take the remainder form. N = 1 means one form for the whole row. Each form is defined once, in
// scalar code; any kernel, block or whole-row, is a checked fast path of it.
#pragma once

#include "frame/kernel_set.hpp"
#include "frame/layouts.hpp"
#include "zoxcc.h"

#include <type_traits>

namespace zox {

// Marks a conversion that has no block form (N = 1).
struct NoBlock {};

// Order of the argument checks of the generic layer.
enum class Checks {
    PointersSizesPlanes, // src/dst null, sizes, then every plane pointer
    PointersPlanesSizes, // src/dst and every plane pointer, then sizes
    PointersPlanesEmpty, // src/dst and every plane pointer; a size below 1 converts nothing and is no error
    SizesPointersPlanes  // sizes, then src/dst and every plane pointer
};
// Short names for the table rows.
inline constexpr Checks PlanesLast = Checks::PointersSizesPlanes;
inline constexpr Checks PlanesFirst = Checks::PointersPlanesSizes;
inline constexpr Checks PlanesFirstEmptyOk = Checks::PointersPlanesEmpty;
inline constexpr Checks SizesFirst = Checks::SizesPointersPlanes;

template <class Src_, class Dst_, int N_, class Block_, class Rem_, Checks C_>
struct Conv {
    using Src = Src_;
    using Dst = Dst_;
    using Block = Block_;
    using Rem = Rem_;
    static constexpr int N = N_;
    static constexpr Checks checks = C_;
    static_assert((N == 1) == std::is_same_v<Block, NoBlock>);
};

// The block form in a loop: the oracle of every SIMD block kernel and the kernel of a portable build.
template <class C>
void scalarBlocks(const typename C::Src::Row& s, const typename C::Dst::Row& d, int n, const Ctx& ctx)
{
    if constexpr (C::N > 1)
        for (int x = 0; x < n; ++x)
            C::Dst::store(d, x, C::Block::apply(C::Src::load(s, x)), ctx);
}

// Kernels of each instruction set, explicitly instantiated per family for every row. blocks: the block
// form over n columns, n a multiple of N (rows with N > 1). wideRow: the one form of a row with N = 1
// over a prefix of its width; returns the columns done.
namespace sse41 {
template <class C>
void blocks(const typename C::Src::Row& s, const typename C::Dst::Row& d, int n, const Ctx& ctx);
template <class C>
int wideRow(const typename C::Src::Row& s, const typename C::Dst::Row& d, int width, const Ctx& ctx);
} // namespace sse41
namespace avx2 {
template <class C>
void blocks(const typename C::Src::Row& s, const typename C::Dst::Row& d, int n, const Ctx& ctx);
template <class C>
int wideRow(const typename C::Src::Row& s, const typename C::Dst::Row& d, int width, const Ctx& ctx);
} // namespace avx2

template <class C>
constexpr int blockColumns(int width)
{
    return C::N > 1 ? width / C::N * C::N : 0;
}

// One row through kernel set K: the set's block kernel below the width rounded down to N, or its
// whole-row kernel over as many columns as it takes; the scalar remainder form from there on. Every
// kernel is a fast path of a scalar form and gives its bytes.
template <class C, KernelSet K>
void convertRow(const typename C::Src::Row& s, const typename C::Dst::Row& d, int width, const Ctx& ctx)
{
    int x = 0;
    if constexpr (C::N > 1) {
        x = blockColumns<C>(width);
        if (x > 0) {
            if constexpr (K == KernelSet::Avx2)
                avx2::blocks<C>(s, d, x, ctx);
            else if constexpr (K == KernelSet::Sse41)
                sse41::blocks<C>(s, d, x, ctx);
            else
                scalarBlocks<C>(s, d, x, ctx);
        }
    } else if constexpr (K == KernelSet::Avx2) {
        x = avx2::wideRow<C>(s, d, width, ctx);
    } else if constexpr (K == KernelSet::Sse41) {
        x = sse41::wideRow<C>(s, d, width, ctx);
    }
    for (; x < width; ++x)
        C::Dst::store(d, x, C::Rem::apply(C::Src::load(s, x)), ctx);
}

template <class C, KernelSet K>
void convertRows(typename C::Src::Arg src, int srcStep, typename C::Dst::Arg dst, int dstStep, ImageSize roi,
                 const Ctx& ctx)
{
    for (int r = 0; r < roi.height; ++r)
        convertRow<C, K>(C::Src::row(src, srcStep, r), C::Dst::row(dst, dstStep, r), roi.width, ctx);
}

// The argument checks in the order of C: the top-level pointers, the elements of pointer arrays
// (`elements`, called only once the pointers are known) and the sizes. zoxStatusOk when the call may go on.
template <Checks C, class Elements>
zoxStatus checkArguments(bool pointers, Elements elements, bool sizesOk)
{
    if constexpr (C == Checks::SizesPointersPlanes)
        if (!sizesOk)
            return zoxStatusBadSize;
    if (!pointers)
        return zoxStatusNullPointer;
    if constexpr (C != Checks::PointersSizesPlanes)
        if (!elements())
            return zoxStatusNullPointer;
    if (!sizesOk)
        return zoxStatusBadSize;
    if constexpr (C == Checks::PointersSizesPlanes)
        if (!elements())
            return zoxStatusNullPointer;
    return zoxStatusOk;
}

// The validating layer and row walk. Steps are taken as they come: any value walks rows at that distance.
template <class C>
zoxStatus convert(typename C::Src::Arg src, int srcStep, typename C::Dst::Arg dst, int dstStep, ImageSize roi,
                  Ctx ctx)
{
    using Src = typename C::Src;
    using Dst = typename C::Dst;
    const zoxStatus st = checkArguments<C::checks>(
        src && dst, [&] { return Src::planesValid(src) && Dst::planesValid(dst); }, roi.width >= 1 && roi.height >= 1);
    if (st != zoxStatusOk) // an empty size is nothing to do where the member says so
        return st == zoxStatusBadSize && C::checks == Checks::PointersPlanesEmpty ? zoxStatusOk : st;
    if constexpr (kChosenAtLoad) {
        if (activeKernelSet() == KernelSet::Avx2)
            convertRows<C, KernelSet::Avx2>(src, srcStep, dst, dstStep, roi, ctx);
        else
            convertRows<C, KernelSet::Sse41>(src, srcStep, dst, dstStep, roi, ctx);
    } else {
        convertRows<C, kBuiltKernelSet>(src, srcStep, dst, dstStep, roi, ctx);
    }
    return zoxStatusOk;
}

// Steps rounded down to whole samples of the side's type (floor: -5 bytes of 16-bit samples are -6).
template <class L>
constexpr int wholeSampleStep(int step)
{
    return step & ~(static_cast<int>(sizeof(typename L::Sample)) - 1);
}

} // namespace zox

// Export shapes of the generic layer. A family table row names one of these with the conversion's parts:
//   X(exportName, shape, Src, Dst, N, Block, Rem, Checks)
// src, srcStep, dst, dstStep, roiSize
#define ZOX_SHAPE_SD(name, Src, Dst, N, Block, Rem, Chk)                                                  \
    ZOXCC_API zoxStatus name(Src::Arg src, int srcStep, Dst::Arg dst, int dstStep, ImageSize roiSize)      \
    {                                                                                                       \
        return ::zox::convert<::zox::Conv<Src, Dst, N, Block, Rem, Chk>>(src, srcStep, dst, dstStep,      \
                                                                          roiSize, {});                    \
    }
// src, srcStep, dst, dstStep, roiSize; the steps taken in whole samples
#define ZOX_SHAPE_SD_SAMPLES(name, Src, Dst, N, Block, Rem, Chk)                                          \
    ZOXCC_API zoxStatus name(Src::Arg src, int srcStep, Dst::Arg dst, int dstStep, ImageSize roiSize)      \
    {                                                                                                       \
        return ::zox::convert<::zox::Conv<Src, Dst, N, Block, Rem, Chk>>(                                  \
            src, ::zox::wholeSampleStep<Src>(srcStep), dst, ::zox::wholeSampleStep<Dst>(dstStep), roiSize, {}); \
    }
// src, srcStep, dst, dstStep, roiSize, alpha (of the destination's sample type)
#define ZOX_SHAPE_SD_ALPHA(name, Src, Dst, N, Block, Rem, Chk)                                            \
    ZOXCC_API zoxStatus name(Src::Arg src, int srcStep, Dst::Arg dst, int dstStep, ImageSize roiSize,     \
                             Dst::Sample alpha)                                                            \
    {                                                                                                       \
        return ::zox::convert<::zox::Conv<Src, Dst, N, Block, Rem, Chk>>(src, srcStep, dst, dstStep,      \
                                                                          roiSize, ::zox::Ctx{alpha});     \
    }

// Table expansion for a family's *_sse41.cpp and *_avx2.cpp: instantiates the block kernel and the
// whole-row kernel of every row (one of the two is empty).
#define ZOX_INSTANTIATE_KERNELS(name, shape, Src, Dst, N, Block, Rem, Chk)                                 \
    template void blocks<::zox::Conv<Src, Dst, N, Block, Rem, Chk>>(const Src::Row&, const Dst::Row&, int,  \
                                                                   const ::zox::Ctx&);                   \
    template int wideRow<::zox::Conv<Src, Dst, N, Block, Rem, Chk>>(const Src::Row&, const Dst::Row&, int, \
                                                                    const ::zox::Ctx&);

// Table expansion for a family's exports: each row through its shape.
#define ZOX_DEFINE_EXPORT(name, shape, Src, Dst, N, Block, Rem, Chk) shape(name, Src, Dst, N, Block, Rem, Chk)
