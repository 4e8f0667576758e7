// A conversion of one pixel layout into another through a per-pixel block form and remainder form, and
// the one row walk and validating layer that all such exports share.
//
// Row rule: the columns below the width rounded down to N take the block form (through the active
// instruction set's block kernel), the columns from there on take the remainder form, in scalar code,
// in every build. N = 1 means one form for the whole row.
#pragma once

#include "frame/layouts.hpp"
#include "zoxcc.h"

#include <type_traits>

namespace zox {

// Marks a conversion that has no block form (N = 1).
struct NoBlock {};

// Order of the argument checks of the generic layer.
enum class Checks {
    PointersSizesPlanes, // src/dst null, sizes, then every plane pointer
    PointersPlanesSizes  // src/dst and every plane pointer, then sizes
};
// Short names for the table rows.
inline constexpr Checks PlanesLast = Checks::PointersSizesPlanes;
inline constexpr Checks PlanesFirst = Checks::PointersPlanesSizes;

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

// Block kernels of each instruction set; n is a multiple of N. Explicitly instantiated per family.
namespace sse41 {
template <class C>
void blocks(const typename C::Src::Row& s, const typename C::Dst::Row& d, int n, const Ctx& ctx);
}
namespace avx2 {
template <class C>
void blocks(const typename C::Src::Row& s, const typename C::Dst::Row& d, int n, const Ctx& ctx);
}
namespace portable {
template <class C>
void blocks(const typename C::Src::Row& s, const typename C::Dst::Row& d, int n, const Ctx& ctx)
{
    scalarBlocks<C>(s, d, n, ctx);
}
} // namespace portable

// The flavour is chosen when building, never at run time.
#if defined(ZOX_ISA_AVX2)
namespace isa = avx2;
#elif defined(ZOX_ISA_SSE41)
namespace isa = sse41;
#else
namespace isa = portable;
#endif

template <class C>
constexpr int blockColumns(int width)
{
    return C::N > 1 ? width / C::N * C::N : 0;
}

template <class C>
void convertRow(const typename C::Src::Row& s, const typename C::Dst::Row& d, int width, const Ctx& ctx)
{
    const int nb = blockColumns<C>(width);
    if constexpr (C::N > 1)
        if (nb > 0)
            isa::blocks<C>(s, d, nb, ctx);
    for (int x = nb; x < width; ++x)
        C::Dst::store(d, x, C::Rem::apply(C::Src::load(s, x)), ctx);
}

// The validating layer and row walk. Steps are taken as they come: any value walks rows at that distance.
template <class C>
zoxStatus convert(typename C::Src::Arg src, int srcStep, typename C::Dst::Arg dst, int dstStep, ImageSize roi,
                  Ctx ctx)
{
    using Src = typename C::Src;
    using Dst = typename C::Dst;
    if (!src || !dst)
        return zoxStatusNullPointer;
    if constexpr (C::checks == Checks::PointersPlanesSizes)
        if (!Src::planesValid(src) || !Dst::planesValid(dst))
            return zoxStatusNullPointer;
    if (roi.width < 1 || roi.height < 1)
        return zoxStatusBadSize;
    if constexpr (C::checks == Checks::PointersSizesPlanes)
        if (!Src::planesValid(src) || !Dst::planesValid(dst))
            return zoxStatusNullPointer;
    for (int r = 0; r < roi.height; ++r)
        convertRow<C>(Src::row(src, srcStep, r), Dst::row(dst, dstStep, r), roi.width, ctx);
    return zoxStatusOk;
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
// src, srcStep, dst, dstStep, roiSize, alpha
#define ZOX_SHAPE_SD_ALPHA(name, Src, Dst, N, Block, Rem, Chk)                                            \
    ZOXCC_API zoxStatus name(Src::Arg src, int srcStep, Dst::Arg dst, int dstStep, ImageSize roiSize,     \
                             uint8_t alpha)                                                                \
    {                                                                                                       \
        return ::zox::convert<::zox::Conv<Src, Dst, N, Block, Rem, Chk>>(src, srcStep, dst, dstStep,      \
                                                                          roiSize, ::zox::Ctx{alpha});     \
    }

// Table expansion for a family's exports: each row through its shape.
#define ZOX_DEFINE_EXPORT(name, shape, Src, Dst, N, Block, Rem, Chk) shape(name, Src, Dst, N, Block, Rem, Chk)
