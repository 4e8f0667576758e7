// Repacking of chroma-sampled images among samplings (4:2:2, 4:2:0, 4:1:1), layouts (groups, Y with
// pairs, planes) and chroma orders. Every output sample is a copy of one input sample: chroma is thinned
// by dropping samples or rows and widened by repeating them, so a member is a source format, a
// destination format and the rule that moves chroma between their grids.
//
// Region in use: width rounded down to 4 with 4:1:1 on either side (else to 2), height rounded down to
// 2 with 4:2:0 on either side. Columns and rows beyond it are neither read nor written.
#pragma once

#include "frame/conv.hpp"
#include "frame/kernel_set.hpp"
#include "frame/planes.hpp"
#include "frame/sampled.hpp"
#include "zoxcc.h"

#include <cstddef>
#include <cstdint>

namespace zox {

// Where sample i of a destination run comes from in its source run.
enum class SampleMap { Same, Drop, Repeat }; // i, 2i, i / 2

// The loops of the family, declared alike in each kernel set's namespace and explicitly instantiated in
// its files (repack_moves.inl): single runs for source strides 1, 2, 4 and destination strides 1, 2, 4,
// 8; rows of groups, pairs, quads; groups reordered.
#define ZOX_REPACK_LOOPS                                                                                            \
    template <int SS, int DS, SampleMap M>                                                                          \
    void moveSamples(const uint8_t* s, uint8_t* d, int n);                                                          \
    template <int SY, int SC, SampleMap M, int Y0, int CB, int CR>                                                  \
    void buildGroups(const uint8_t* y, const uint8_t* cb, const uint8_t* cr, uint8_t* d, int n);                    \
    template <int SC, SampleMap M>                                                                                  \
    void buildPairs(const uint8_t* cb, const uint8_t* cr, uint8_t* d, int n);                                       \
    template <int SC>                                                                                               \
    void buildQuads(const uint8_t* a, const uint8_t* b, const uint8_t* c, const uint8_t* e, uint8_t* d, int n);     \
    template <const GroupOrder& From, const GroupOrder& To>                                                         \
    void reorderGroups(const uint8_t* s, uint8_t* d, int n);
namespace portable {
ZOX_REPACK_LOOPS
}
namespace sse41 {
ZOX_REPACK_LOOPS
}
namespace avx2 {
ZOX_REPACK_LOOPS
}

template <KernelSet K, int SS, int DS, SampleMap M>
inline void moveRun(const uint8_t* s, uint8_t* d, int n)
{
    if (n <= 0)
        return;
    if constexpr (K == KernelSet::Avx2)
        avx2::moveSamples<SS, DS, M>(s, d, n);
    else if constexpr (K == KernelSet::Sse41)
        sse41::moveSamples<SS, DS, M>(s, d, n);
    else
        portable::moveSamples<SS, DS, M>(s, d, n);
}

// A row of 4:2:2 groups (order G) from luma and chroma runs, and a row of pairs from two chroma runs.
template <KernelSet K, int SY, int SC, SampleMap M, const GroupOrder& G>
inline void groupsRun(const uint8_t* y, const uint8_t* cb, const uint8_t* cr, uint8_t* d, int n)
{
    if (n <= 0)
        return;
    if constexpr (K == KernelSet::Avx2)
        avx2::buildGroups<SY, SC, M, G.y0, G.cb, G.cr>(y, cb, cr, d, n);
    else if constexpr (K == KernelSet::Sse41)
        sse41::buildGroups<SY, SC, M, G.y0, G.cb, G.cr>(y, cb, cr, d, n);
    else
        portable::buildGroups<SY, SC, M, G.y0, G.cb, G.cr>(y, cb, cr, d, n);
}
template <KernelSet K, int SC, SampleMap M>
inline void pairsRun(const uint8_t* cb, const uint8_t* cr, uint8_t* d, int n)
{
    if (n <= 0)
        return;
    if constexpr (K == KernelSet::Avx2)
        avx2::buildPairs<SC, M>(cb, cr, d, n);
    else if constexpr (K == KernelSet::Sse41)
        sse41::buildPairs<SC, M>(cb, cr, d, n);
    else
        portable::buildPairs<SC, M>(cb, cr, d, n);
}

template <KernelSet K, const GroupOrder& From, const GroupOrder& To>
inline void reorderRun(const uint8_t* s, uint8_t* d, int n)
{
    if (n <= 0)
        return;
    if constexpr (K == KernelSet::Avx2)
        avx2::reorderGroups<From, To>(s, d, n);
    else if constexpr (K == KernelSet::Sse41)
        sse41::reorderGroups<From, To>(s, d, n);
    else
        portable::reorderGroups<From, To>(s, d, n);
}
template <KernelSet K, int SC>
inline void quadsRun(const uint8_t* a, const uint8_t* b, const uint8_t* c, const uint8_t* e, uint8_t* d, int n)
{
    if (n <= 0)
        return;
    if constexpr (K == KernelSet::Avx2)
        avx2::buildQuads<SC>(a, b, c, e, d, n);
    else if constexpr (K == KernelSet::Sse41)
        sse41::buildQuads<SC>(a, b, c, e, d, n);
    else
        portable::buildQuads<SC>(a, b, c, e, d, n);
}

// The planes of one side of a call in Y, Cb, Cr order (Y and pairs: two; groups: one).
template <class T>
struct RepackSide {
    T* plane[3];
    std::ptrdiff_t step[3];
};

// Formats: where a row's luma and each chroma component sit, as a plane, a byte offset and a stride.
// Three planes; CrFirst: the call names Cr's plane (and step) before Cb's.
template <Sampling S, bool CrFirst = false>
struct FmtPlanes {
    static constexpr Sampling sampling = S;
    static constexpr int planes = 3, lumaStride = 1, lumaOffset = 0, chromaStride = 1;
    static constexpr bool crFirst = CrFirst;
    static constexpr int chromaPlane(int c) { return 1 + c; }
    static constexpr int chromaOffset(int) { return 0; }
};
// Y and a plane of pairs, Cb first.
template <Sampling S>
struct FmtPairs {
    static constexpr Sampling sampling = S;
    static constexpr int planes = 2, lumaStride = 1, lumaOffset = 0, chromaStride = 2;
    static constexpr bool crFirst = false;
    static constexpr int chromaPlane(int) { return 1; }
    static constexpr int chromaOffset(int c) { return c; }
};
// 4:2:2 groups of four bytes.
template <const GroupOrder& G>
struct FmtGroups {
    static constexpr Sampling sampling = Sampling::S422;
    static constexpr int planes = 1, lumaStride = 2, lumaOffset = G.y0, chromaStride = 4;
    static constexpr const GroupOrder& order = G;
    static constexpr bool crFirst = false;
    static constexpr int chromaPlane(int) { return 0; }
    static constexpr int chromaOffset(int c) { return c == 0 ? G.cb : G.cr; }
};

enum class ChromaRule { Copy, RowDrop, RowRepeat, SampleRepeat, SampleDrop, RowFold, RowUnfold };

// Size classes: the region below which zoxStatusBadSize is returned (E and F do not look at the height;
// G looks at the sizes twice, around its plane pointers).
enum class SizeClass { A, B, C, D, E, F, G };

template <class Src_, class Dst_, ChromaRule Rule_, SizeClass Class_, int64_t StreamAbove_ = 0>
struct Repack {
    using Src = Src_;
    using Dst = Dst_;
    static constexpr ChromaRule rule = Rule_;
    static constexpr SizeClass sizeClass = Class_;
    // Luma rows through the row copy stream when the region has more pixels than this (0: never).
    static constexpr int64_t streamAbove = StreamAbove_;
    static constexpr bool has420 = Src::sampling == Sampling::S420 || Dst::sampling == Sampling::S420;
    static constexpr bool has411 = Src::sampling == Sampling::S411 || Dst::sampling == Sampling::S411;
    static constexpr int passRows = has420 ? 2 : 1;
};

template <class F, class T>
inline T* lumaRow(const RepackSide<T>& s, int r)
{
    return rowAddress(s.plane[0], s.step[0], r) + F::lumaOffset;
}
template <class F, class T>
inline T* chromaRow(const RepackSide<T>& s, int c, int j)
{
    return rowAddress(s.plane[F::chromaPlane(c)], s.step[F::chromaPlane(c)], j) + F::chromaOffset(c);
}

// The samples of one chroma row of a sampling, in a region of width w.
constexpr int chromaPerRow(Sampling s, int w)
{
    return s == Sampling::S411 ? w / 4 : w / 2;
}

// One pass (a row, or a row pair with 4:2:0 on either side) of the region in use, through kernel set K.
template <class C, KernelSet K>
void repackPass(const RepackSide<const uint8_t>& s, const RepackSide<uint8_t>& d, int p, int w, bool streaming)
{
    using S = typename C::Src;
    using D = typename C::Dst;
    constexpr int SS = S::chromaStride, DS = D::chromaStride;
    constexpr ChromaRule R = C::rule;
    if constexpr (requires { D::order; }) { // groups: each row's luma and chroma in one pass
        constexpr SampleMap M = R == ChromaRule::SampleRepeat ? SampleMap::Repeat : SampleMap::Same;
        if constexpr (requires { S::order; }) { // groups to groups: a byte order to another
            reorderRun<K, S::order, D::order>(rowAddress(s.plane[0], s.step[0], p), rowAddress(d.plane[0], d.step[0], p), w / 2);
            return;
        }
        for (int k = 0; k < C::passRows; ++k) {
            const int r = p * C::passRows + k, j = R == ChromaRule::RowRepeat ? p : r;
            groupsRun<K, S::lumaStride, SS, M, D::order>(lumaRow<S>(s, r), chromaRow<S>(s, 0, j), chromaRow<S>(s, 1, j),
                                                          rowAddress(d.plane[0], d.step[0], r), w / 2);
        }
        return;
    }
    for (int k = 0; k < C::passRows; ++k) {
        const int r = p * C::passRows + k;
        if constexpr (S::lumaStride == 1 && D::lumaStride == 1)
            copyRow(lumaRow<S>(s, r), lumaRow<D>(d, r), static_cast<std::size_t>(w), streaming);
        else
            moveRun<K, S::lumaStride, D::lumaStride, SampleMap::Same>(lumaRow<S>(s, r), lumaRow<D>(d, r), w);
    }
    const int dn = chromaPerRow(D::sampling, w);
    // A run of dn samples of one row, by the row copy where both runs are plain bytes.
    auto run = [&](const uint8_t* from, uint8_t* to) {
        if constexpr (SS == 1 && DS == 1)
            copyRow(from, to, static_cast<std::size_t>(dn), streaming);
        else
            moveRun<K, SS, DS, SampleMap::Same>(from, to, dn);
    };
    if constexpr (R == ChromaRule::RowFold) { // 4:1:1 rows 2p and 2p + 1 interleave, sample by sample
        if constexpr (D::planes == 2)
            quadsRun<K, SS>(chromaRow<S>(s, 0, 2 * p), chromaRow<S>(s, 1, 2 * p), chromaRow<S>(s, 0, 2 * p + 1),
                            chromaRow<S>(s, 1, 2 * p + 1), rowAddress(d.plane[1], d.step[1], p), w / 4);
        else
            for (int c = 0; c < 2; ++c)
                pairsRun<K, SS, SampleMap::Same>(chromaRow<S>(s, c, 2 * p), chromaRow<S>(s, c, 2 * p + 1), chromaRow<D>(d, c, p), w / 4);
        return;
    } else if constexpr (D::planes == 2) { // pairs: both components in one pass
        auto pairs = [&]<SampleMap M>(int j, int at, int n, int offset) {
            pairsRun<K, SS, M>(chromaRow<S>(s, 0, j) + offset, chromaRow<S>(s, 1, j) + offset, rowAddress(d.plane[1], d.step[1], at), n);
        };
        if constexpr (R == ChromaRule::Copy)
            pairs.template operator()<SampleMap::Same>(p, p, dn, 0);
        else if constexpr (R == ChromaRule::RowDrop)
            pairs.template operator()<SampleMap::Same>(2 * p, p, dn, 0);
        else if constexpr (R == ChromaRule::SampleDrop)
            pairs.template operator()<SampleMap::Drop>(p, p, dn, 0);
        else if constexpr (R == ChromaRule::RowUnfold) {
            pairs.template operator()<SampleMap::Drop>(p, 2 * p, w / 4, 0);
            pairs.template operator()<SampleMap::Drop>(p, 2 * p + 1, w / 4, SS);
        } else
            static_assert(R == ChromaRule::Copy, "no other rule ends in pairs");
        return;
    }
    for (int c = 0; c < 2; ++c) {
        auto from = [&](int j) { return chromaRow<S>(s, c, j); };
        auto to = [&](int j) { return chromaRow<D>(d, c, j); };
        if constexpr (R == ChromaRule::Copy) {
            run(from(p), to(p));
        } else if constexpr (R == ChromaRule::RowDrop) { // 4:2:2 to 4:2:0: the even source rows
            run(from(2 * p), to(p));
        } else if constexpr (R == ChromaRule::RowRepeat) { // 4:2:0 to 4:2:2: each source row twice
            run(from(p), to(2 * p));
            run(from(p), to(2 * p + 1));
        } else if constexpr (R == ChromaRule::SampleRepeat) { // 4:1:1 to 4:2:2
            moveRun<K, SS, DS, SampleMap::Repeat>(from(p), to(p), dn);
        } else if constexpr (R == ChromaRule::SampleDrop) { // 4:2:2 to 4:1:1
            moveRun<K, SS, DS, SampleMap::Drop>(from(p), to(p), dn);
        } else { // 4:2:0 row p splits into 4:1:1 rows 2p (its even samples) and 2p + 1 (its odd ones)
            moveRun<K, SS, DS, SampleMap::Drop>(from(p), to(2 * p), w / 4);
            moveRun<K, SS, DS, SampleMap::Drop>(from(p) + SS, to(2 * p + 1), w / 4);
        }
    }
}

template <class C, KernelSet K>
void repackPasses(const RepackSide<const uint8_t>& s, const RepackSide<uint8_t>& d, ImageSize roi)
{
    const int w = roi.width & (C::has411 ? ~3 : ~1);
    const int h = C::has420 ? roi.height & ~1 : roi.height;
    const bool streaming = C::streamAbove > 0 && static_cast<int64_t>(roi.width) * roi.height > C::streamAbove;
    for (int p = 0; p < h / C::passRows; ++p)
        repackPass<C, K>(s, d, p, w, streaming);
}

template <class C>
void repackImage(const RepackSide<const uint8_t>& s, const RepackSide<uint8_t>& d, ImageSize roi)
{
    if constexpr (kChosenAtLoad) {
        if (activeKernelSet() == KernelSet::Avx2)
            repackPasses<C, KernelSet::Avx2>(s, d, roi);
        else
            repackPasses<C, KernelSet::Sse41>(s, d, roi);
    } else {
        repackPasses<C, kBuiltKernelSet>(s, d, roi);
    }
}

// The size checks of a class (G: the second, after its plane pointers).
template <SizeClass K>
constexpr bool sizeBad(ImageSize roi)
{
    const int w = roi.width, h = roi.height;
    switch (K) {
    case SizeClass::A: return w < 2 || h < 2;
    case SizeClass::B: return w < 4 || h < 2;
    case SizeClass::C: return w < 2 || h < 1;
    case SizeClass::D: return w < 4 || h < 1;
    case SizeClass::E: return w < 4;
    case SizeClass::F: return w < 2;
    case SizeClass::G: return w < 2 || h < 2;
    }
    return true;
}

// The validating layer: every pointer (plane elements included), then the size class; class G: the
// top-level pointers, a size below 1, the plane pointers, then its class. Never a warning.
template <class C>
zoxStatus checkedRepack(bool pointers, bool elements, ImageSize roi, const RepackSide<const uint8_t>& s, const RepackSide<uint8_t>& d)
{
    if constexpr (C::sizeClass == SizeClass::G) {
        if (!pointers)
            return zoxStatusNullPointer;
        if (roi.width < 1 || roi.height < 1)
            return zoxStatusBadSize;
        if (!elements)
            return zoxStatusNullPointer;
    } else if (!pointers || !elements) {
        return zoxStatusNullPointer;
    }
    if (sizeBad<C::sizeClass>(roi))
        return zoxStatusBadSize;
    repackImage<C>(s, d, roi);
    return zoxStatusOk;
}

// One side of a call from its arguments: three planes (exchanged to Y, Cb, Cr for a Cr-first format),
// Y and pairs, or one plane of groups.
template <class F, class T>
RepackSide<T> sideOfPlanes(T* const* p, const int* step)
{
    constexpr int a = F::crFirst ? 2 : 1, b = F::crFirst ? 1 : 2;
    return {{p[0], p[a], p[b]}, {step[0], step[a], step[b]}};
}
template <class T>
RepackSide<T> sideOf(T* p0, int step0, T* p1 = nullptr, int step1 = 0)
{
    return {{p0, p1, nullptr}, {step0, step1, 0}};
}

} // namespace zox

// Export shapes, by the layouts of the two sides: C2 (src/dst, step), P2 (Y, step, CbCr, step), P3
// (arrays of planes and steps). A family table row names one of these:
//   X(exportName, shape, Src, Dst, Rule, Class, StreamAbove)
#define ZOX_REPACK(Src, Dst, Rule, Class, Stream) ::zox::Repack<Src, Dst, ::zox::ChromaRule::Rule, ::zox::SizeClass::Class, Stream>
#define ZOX_REPACK_ELEMENTS3(p) ((p)[0] && (p)[1] && (p)[2])

#define ZOX_SHAPE_REPACK_C2C2(name, Src, Dst, Rule, Class, Stream)                                                   \
    ZOXCC_API zoxStatus name(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roiSize)         \
    {                                                                                                                 \
        return ::zox::checkedRepack<ZOX_REPACK(Src, Dst, Rule, Class, Stream)>(src && dst, true, roiSize,          \
                                                                               ::zox::sideOf(src, srcStep), ::zox::sideOf(dst, dstStep)); \
    }
#define ZOX_SHAPE_REPACK_C2P3(name, Src, Dst, Rule, Class, Stream)                                                   \
    ZOXCC_API zoxStatus name(const uint8_t* src, int srcStep, uint8_t* const dst[3], const int dstStep[3], ImageSize roiSize) \
    {                                                                                                                 \
        if (!src || !dst || !dstStep || !ZOX_REPACK_ELEMENTS3(dst))                                                  \
            return zoxStatusNullPointer;                                                                              \
        return ::zox::checkedRepack<ZOX_REPACK(Src, Dst, Rule, Class, Stream)>(                                     \
            true, true, roiSize, ::zox::sideOf(src, srcStep), ::zox::sideOfPlanes<Dst>(dst, dstStep));              \
    }
#define ZOX_SHAPE_REPACK_C2P2(name, Src, Dst, Rule, Class, Stream)                                                   \
    ZOXCC_API zoxStatus name(const uint8_t* src, int srcStep, uint8_t* dstY, int dstYStep, uint8_t* dstCbCr, int dstCbCrStep, \
                             ImageSize roiSize)                                                                      \
    {                                                                                                                 \
        return ::zox::checkedRepack<ZOX_REPACK(Src, Dst, Rule, Class, Stream)>(                                     \
            src && dstY && dstCbCr, true, roiSize, ::zox::sideOf(src, srcStep), ::zox::sideOf(dstY, dstYStep, dstCbCr, dstCbCrStep)); \
    }
#define ZOX_SHAPE_REPACK_P3C2(name, Src, Dst, Rule, Class, Stream)                                                   \
    ZOXCC_API zoxStatus name(const uint8_t* const src[3], const int srcStep[3], uint8_t* dst, int dstStep, ImageSize roiSize) \
    {                                                                                                                 \
        if (!src || !srcStep || !dst || !ZOX_REPACK_ELEMENTS3(src))                                                  \
            return zoxStatusNullPointer;                                                                              \
        return ::zox::checkedRepack<ZOX_REPACK(Src, Dst, Rule, Class, Stream)>(                                     \
            true, true, roiSize, ::zox::sideOfPlanes<Src>(src, srcStep), ::zox::sideOf(dst, dstStep));              \
    }
#define ZOX_SHAPE_REPACK_P3P3(name, Src, Dst, Rule, Class, Stream)                                                   \
    ZOXCC_API zoxStatus name(const uint8_t* const src[3], const int srcStep[3], uint8_t* const dst[3], const int dstStep[3], \
                             ImageSize roiSize)                                                                      \
    {                                                                                                                 \
        if (!src || !srcStep || !dst || !dstStep || !ZOX_REPACK_ELEMENTS3(src) || !ZOX_REPACK_ELEMENTS3(dst))        \
            return zoxStatusNullPointer;                                                                              \
        return ::zox::checkedRepack<ZOX_REPACK(Src, Dst, Rule, Class, Stream)>(                                     \
            true, true, roiSize, ::zox::sideOfPlanes<Src>(src, srcStep), ::zox::sideOfPlanes<Dst>(dst, dstStep));   \
    }
#define ZOX_SHAPE_REPACK_P3P2(name, Src, Dst, Rule, Class, Stream)                                                   \
    ZOXCC_API zoxStatus name(const uint8_t* const src[3], const int srcStep[3], uint8_t* dstY, int dstYStep, uint8_t* dstCbCr, \
                             int dstCbCrStep, ImageSize roiSize)                                                     \
    {                                                                                                                 \
        if (!src || !srcStep || !dstY || !dstCbCr || !ZOX_REPACK_ELEMENTS3(src))                                     \
            return zoxStatusNullPointer;                                                                              \
        return ::zox::checkedRepack<ZOX_REPACK(Src, Dst, Rule, Class, Stream)>(                                     \
            true, true, roiSize, ::zox::sideOfPlanes<Src>(src, srcStep), ::zox::sideOf(dstY, dstYStep, dstCbCr, dstCbCrStep)); \
    }
// Y and pairs to planes; class G looks at its plane pointers between two size checks.
#define ZOX_SHAPE_REPACK_P2P3(name, Src, Dst, Rule, Class, Stream)                                                   \
    ZOXCC_API zoxStatus name(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* const dst[3], \
                             const int dstStep[3], ImageSize roiSize)                                                \
    {                                                                                                                 \
        const bool top = srcY && srcCbCr && dst && dstStep;                                                          \
        const bool elements = top && ZOX_REPACK_ELEMENTS3(dst);                                                      \
        return ::zox::checkedRepack<ZOX_REPACK(Src, Dst, Rule, Class, Stream)>(                                     \
            top, elements, roiSize, ::zox::sideOf(srcY, srcYStep, srcCbCr, srcCbCrStep),                             \
            top ? ::zox::sideOfPlanes<Dst>(dst, dstStep) : ::zox::RepackSide<uint8_t>{});                             \
    }
#define ZOX_SHAPE_REPACK_P2C2(name, Src, Dst, Rule, Class, Stream)                                                   \
    ZOXCC_API zoxStatus name(const uint8_t* srcY, int srcYStep, const uint8_t* srcCbCr, int srcCbCrStep, uint8_t* dst, int dstStep, \
                             ImageSize roiSize)                                                                      \
    {                                                                                                                 \
        return ::zox::checkedRepack<ZOX_REPACK(Src, Dst, Rule, Class, Stream)>(                                     \
            srcY && srcCbCr && dst, true, roiSize, ::zox::sideOf(srcY, srcYStep, srcCbCr, srcCbCrStep), ::zox::sideOf(dst, dstStep)); \
    }

#define ZOX_DEFINE_REPACK(name, shape, Src, Dst, Rule, Class, Stream) shape(name, Src, Dst, Rule, Class, Stream)
