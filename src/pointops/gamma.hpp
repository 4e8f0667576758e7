// Gamma correction: the validating layer and the walks shared by all 36 exports. A call maps every
// colour sample of its region through one curve: a constant table at 8u, the curve in double
// precision (per sample, or through a table built for the call) at 16u, the curve against the caller's
// range at 32f.
#pragma once

#include "frame/byte_table.hpp"
#include "frame/layouts.hpp"
#include "pointops/gamma_forms.hpp"
#include "zoxcc.h"
#include "zoxcore.h"

#include <cstddef>
#include <cstdint>
#include <type_traits>

namespace zox {

// The 8u tables, by direction, for the other families that read them.
inline constexpr const uint8_t* gammaFwdTable8u = gamma::kGammaFwd8u;

inline constexpr gamma::Dir GammaFwd = gamma::Dir::Fwd;
inline constexpr gamma::Dir GammaInv = gamma::Dir::Inv;

// Sample layouts: pixel stride in samples, colour samples a pixel, planes.
struct GammaC3 {
    static constexpr int stride = 3, colours = 3, planes = 1;
};
struct GammaAC4 {
    static constexpr int stride = 4, colours = 3, planes = 1;
};
struct GammaP3 {
    static constexpr int stride = 1, colours = 1, planes = 3;
};

// The 32f range of a call; unused at the integer depths.
struct GammaRange {
    float low = 0, high = 0;
};

// Working memory through the core services, counted in 16-bit units; null for a count below 1.
inline uint16_t* mallocUnits16(int count)
{
    return count < 1 ? nullptr : static_cast<uint16_t*>(zoxMalloc(count * 2));
}
inline void freeUnits(void* p)
{
    zoxFree(p);
}

// How one call maps a sample, once prepared.
template <class T, gamma::Dir D>
struct GammaMap;

// The 8u tables in the form of the byte-shuffle lookup.
template <gamma::Dir D>
inline constexpr ShuffleTable kGammaShuffled8u =
    shuffleTableOf(D == gamma::Dir::Fwd ? gamma::kGammaFwd8u : gamma::kGammaInv8u);

template <gamma::Dir D>
struct GammaMap<uint8_t, D> {
    const uint8_t* table = D == gamma::Dir::Fwd ? gamma::kGammaFwd8u : gamma::kGammaInv8u;
    zoxStatus prepare(long long, GammaRange) { return zoxStatusOk; }
    uint8_t operator()(uint8_t s) const { return table[s]; }
    template <class Walk>
    void run(Walk&& walk) const { walk(*this); }
    void release() {}
};

template <gamma::Dir D>
struct GammaMap<uint16_t, D> {
    uint16_t* table = nullptr;
    // n is width x 3 x height as a signed 32-bit product (the fourth channel of AC4 not counted). Above
    // 65536 samples a table of every value is cheaper than evaluating each sample.
    zoxStatus prepare(int32_t n, GammaRange)
    {
        if (n <= 65536)
            return zoxStatusOk;
        table = mallocUnits16(65536);
        if (!table)
            return zoxStatusNoMemory;
        for (int s = 0; s < 65536; ++s)
            table[s] = gamma::eval16u<D>(static_cast<uint16_t>(s));
        return zoxStatusOk;
    }
    // The walk runs with the one mapping this call chose, so that no sample asks again.
    template <class Walk>
    void run(Walk&& walk) const
    {
        if (table)
            walk([t = table](uint16_t s) { return t[s]; });
        else
            walk([](uint16_t s) { return gamma::eval16u<D>(s); });
    }
    void release() { freeUnits(table); }
};

template <gamma::Dir D>
struct GammaMap<float, D> {
    float low = 0, r32 = 0;
    double r = 0, q = 0;
    zoxStatus prepare(int32_t, GammaRange range)
    {
        low = range.low;
        r32 = range.high - range.low;
        r = r32;
        q = 1.0 / r;
        return zoxStatusOk;
    }
    float operator()(float s) const { return gamma::eval32f<D>(s, low, r32, r, q); }
    template <class Walk>
    void run(Walk&& walk) const { walk(*this); }
    void release() {}
};

// A run of n contiguous samples, source and destination possibly the same.
template <class Map, class T>
void mapSamples(const Map& map, const T* s, T* d, std::size_t n)
{
#pragma GCC unroll 8
    for (std::size_t i = 0; i < n; ++i)
        d[i] = map(s[i]);
}

// Contiguous 8u samples through the table by byte shuffles, where the kernel set has them.
template <gamma::Dir D>
void mapSamples(const GammaMap<uint8_t, D>& map, const uint8_t* s, uint8_t* d, std::size_t n)
{
    lookupBytes(s, d, n, map.table, kGammaShuffled8u<D>);
}

// Stand-in for a null plane array, so that the walk can index it; the null itself is reported first.
template <class T>
inline T* const kNoPlanes[3] = {nullptr, nullptr, nullptr};

// The checks in their order (range at 32f, pointers source side first, sizes, steps), then the walk:
// one plane over all its rows before the next. src and dst are arrays of L::planes pointers (for the
// in-place forms the same array).
template <class T, gamma::Dir D, class L>
zoxStatus gammaRun(const T* const* src, bool srcArrayNull, int srcStep, T* const* dst, bool dstArrayNull, int dstStep,
                   ImageSize roi, GammaRange range)
{
    if constexpr (std::is_same_v<T, float>) {
        // A NaN difference is not rejected.
        if (range.high - range.low <= 0.0f)
            return zoxStatusBadRange;
    }
    if (srcArrayNull)
        return zoxStatusNullPointer;
    for (int p = 0; p < L::planes; ++p)
        if (!src[p])
            return zoxStatusNullPointer;
    if (dstArrayNull)
        return zoxStatusNullPointer;
    for (int p = 0; p < L::planes; ++p)
        if (!dst[p])
            return zoxStatusNullPointer;
    if (roi.width < 1 || roi.height < 1)
        return zoxStatusBadSize;
    if (srcStep < 1 || dstStep < 1)
        return zoxStatusBadStep;

    // The sample count wraps as a 32-bit product would.
    const auto n = static_cast<int32_t>(static_cast<uint32_t>(roi.width) * 3u * static_cast<uint32_t>(roi.height));
    GammaMap<T, D> map;
    if (const zoxStatus st = map.prepare(n, range); st != zoxStatusOk)
        return st;
    map.run([&](const auto& f) {
        for (int p = 0; p < L::planes; ++p)
            for (int r = 0; r < roi.height; ++r) {
                const T* s = rowAddress(src[p], srcStep, r);
                T* d = rowAddress(dst[p], dstStep, r);
                if constexpr (L::stride == L::colours)
                    mapSamples(f, s, d, static_cast<std::size_t>(roi.width) * L::colours);
                else
                    for (int x = 0; x < roi.width; ++x) {
                        const std::size_t at = static_cast<std::size_t>(x) * L::stride;
                        for (int c = 0; c < L::colours; ++c)
                            d[at + c] = f(s[at + c]);
                    }
            }
    });
    map.release();
    return zoxStatusOk;
}

} // namespace zox

// Export shapes. Interleaved: src, srcStep, dst, dstStep, roiSize; in place: srcDst, srcDstStep, roiSize;
// planar: arrays of three plane pointers. The _RANGE shapes add rangeLow, rangeHigh.
#define ZOX_GAMMA_SD_ARGS(T) const T *src, int srcStep, T *dst, int dstStep, ImageSize roiSize
#define ZOX_GAMMA_SD_CALL(T, D, L, range) ::zox::gammaRun<T, D, L>(&src, !src, srcStep, &dst, !dst, dstStep, roiSize, range)
#define ZOX_GAMMA_I_ARGS(T) T *srcDst, int srcDstStep, ImageSize roiSize
#define ZOX_GAMMA_I_CALL(T, D, L, range) \
    ::zox::gammaRun<T, D, L>(&srcDst, !srcDst, srcDstStep, &srcDst, !srcDst, srcDstStep, roiSize, range)
#define ZOX_GAMMA_P_ARGS(T) const T *const src[3], int srcStep, T *const dst[3], int dstStep, ImageSize roiSize
#define ZOX_GAMMA_P_CALL(T, D, L, range)                                                                  \
    ::zox::gammaRun<T, D, L>(src ? src : ::zox::kNoPlanes<const T>, !src, srcStep, dst ? dst : ::zox::kNoPlanes<T>, !dst, \
                             dstStep, roiSize, range)
#define ZOX_GAMMA_IP_ARGS(T) T *const srcDst[3], int srcDstStep, ImageSize roiSize
#define ZOX_GAMMA_IP_CALL(T, D, L, range)                                                                          \
    ::zox::gammaRun<T, D, L>(srcDst ? srcDst : ::zox::kNoPlanes<T>, !srcDst, srcDstStep,                          \
                             srcDst ? srcDst : ::zox::kNoPlanes<T>, !srcDst, srcDstStep, roiSize, range)

#define ZOX_GAMMA_RANGE_ARGS , float rangeLow, float rangeHigh
#define ZOX_GAMMA_RANGE (::zox::GammaRange{rangeLow, rangeHigh})
#define ZOX_GAMMA_DEFINE(name, args, call) \
    ZOXCC_API zoxStatus name(args) { return call; }

#define ZOX_GAMMA_SD(name, T, D, L) ZOX_GAMMA_DEFINE(name, ZOX_GAMMA_SD_ARGS(T), ZOX_GAMMA_SD_CALL(T, D, L, {}))
#define ZOX_GAMMA_I(name, T, D, L) ZOX_GAMMA_DEFINE(name, ZOX_GAMMA_I_ARGS(T), ZOX_GAMMA_I_CALL(T, D, L, {}))
#define ZOX_GAMMA_P(name, T, D, L) ZOX_GAMMA_DEFINE(name, ZOX_GAMMA_P_ARGS(T), ZOX_GAMMA_P_CALL(T, D, L, {}))
#define ZOX_GAMMA_IP(name, T, D, L) ZOX_GAMMA_DEFINE(name, ZOX_GAMMA_IP_ARGS(T), ZOX_GAMMA_IP_CALL(T, D, L, {}))
#define ZOX_GAMMA_SD_RANGE(name, T, D, L) \
    ZOX_GAMMA_DEFINE(name, ZOX_GAMMA_SD_ARGS(T) ZOX_GAMMA_RANGE_ARGS, ZOX_GAMMA_SD_CALL(T, D, L, ZOX_GAMMA_RANGE))
#define ZOX_GAMMA_I_RANGE(name, T, D, L) \
    ZOX_GAMMA_DEFINE(name, ZOX_GAMMA_I_ARGS(T) ZOX_GAMMA_RANGE_ARGS, ZOX_GAMMA_I_CALL(T, D, L, ZOX_GAMMA_RANGE))
#define ZOX_GAMMA_P_RANGE(name, T, D, L) \
    ZOX_GAMMA_DEFINE(name, ZOX_GAMMA_P_ARGS(T) ZOX_GAMMA_RANGE_ARGS, ZOX_GAMMA_P_CALL(T, D, L, ZOX_GAMMA_RANGE))
#define ZOX_GAMMA_IP_RANGE(name, T, D, L) \
    ZOX_GAMMA_DEFINE(name, ZOX_GAMMA_IP_ARGS(T) ZOX_GAMMA_RANGE_ARGS, ZOX_GAMMA_IP_CALL(T, D, L, ZOX_GAMMA_RANGE))
