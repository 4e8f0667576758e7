// Colour twist: the validating layer and the row walk of all 31 exports. The integer members run with the
// processor's rounding set to nearest (and the caller's mode put back); the 32f members run in the
// caller's mode. Rows whose steps both equal the row's bytes are walked as one long row, which gives the
// same samples.
#pragma once

#include "frame/kernel_set.hpp"
#include "pointops/twist_forms.hpp"
#include "zoxcc.h"

#include <cfenv>
#include <type_traits>

namespace zox {

// Kernels of each set, explicitly instantiated for every member: a prefix of the row, the pixels done
// returned. s and d hold the member's plane pointers.
namespace sse41 {
template <class M>
int twistKernel(const uint8_t* const* s, uint8_t* const* d, int w, const twist::Matrix& m);
} // namespace sse41
namespace avx2 {
template <class M>
int twistKernel(const uint8_t* const* s, uint8_t* const* d, int w, const twist::Matrix& m);
} // namespace avx2

template <class M, KernelSet K>
void twistRow(const uint8_t* const* s, uint8_t* const* d, int w, const twist::Matrix& m)
{
    int x = 0;
    if constexpr (K == KernelSet::Avx2)
        x = avx2::twistKernel<M>(s, d, w, m);
    else if constexpr (K == KernelSet::Sse41)
        x = sse41::twistKernel<M>(s, d, w, m);
    if (x < w)
        M::row(s, d, x, w, m);
}

template <class M, KernelSet K>
void twistRows(const uint8_t* const* src, int srcStep, uint8_t* const* dst, int dstStep, ImageSize roi,
               const twist::Matrix& m)
{
    constexpr int planes = M::Layout::planes;
    const long long rowBytes = static_cast<long long>(roi.width) * M::Layout::stride * static_cast<long long>(sizeof(typename M::Sample));
    if (planes == 1 && srcStep == dstStep && srcStep == rowBytes && static_cast<long long>(roi.width) * roi.height <= INT32_MAX)
        roi = {roi.width * roi.height, 1};
    for (int r = 0; r < roi.height; ++r) {
        const uint8_t* s[planes];
        uint8_t* d[planes];
        for (int p = 0; p < planes; ++p) {
            s[p] = rowAddress(src[p], srcStep, r);
            d[p] = rowAddress(dst[p], dstStep, r);
        }
        twistRow<M, K>(s, d, roi.width, m);
    }
}

// The processor's rounding set to nearest for the life of the object, and the caller's mode put back
// if it was another.
class NearestRounding {
public:
    NearestRounding() : saved_(std::fegetround())
    {
        if (saved_ != FE_TONEAREST)
            std::fesetround(FE_TONEAREST);
    }
    ~NearestRounding()
    {
        if (saved_ != FE_TONEAREST)
            std::fesetround(saved_);
    }
    NearestRounding(const NearestRounding&) = delete;
    NearestRounding& operator=(const NearestRounding&) = delete;

private:
    int saved_;
};

// Checks: an image pointer, a plane pointer or the matrix null; then sizes; then a step below 1. src and
// dst are arrays of the member's planes (null for a null plane array).
template <class M>
zoxStatus twistRun(const void* const* src, int srcStep, void* const* dst, int dstStep, ImageSize roi, const float* twist)
{
    constexpr int planes = M::Layout::planes;
    if (!src || !dst || !twist)
        return zoxStatusNullPointer;
    for (int p = 0; p < planes; ++p)
        if (!src[p] || !dst[p])
            return zoxStatusNullPointer;
    if (roi.width < 1 || roi.height < 1)
        return zoxStatusBadSize;
    if (srcStep < 1 || dstStep < 1)
        return zoxStatusBadStep;
    twist::Matrix m = twist::matrixOf(twist, M::rows);
    // Above 34992 samples a 32f image is written past the caches.
    m.stream = std::is_floating_point_v<typename M::Sample> &&
               static_cast<long long>(roi.width) * 3 * roi.height > 34992;
    const uint8_t* s[planes];
    uint8_t* d[planes];
    for (int p = 0; p < planes; ++p) {
        s[p] = static_cast<const uint8_t*>(src[p]);
        d[p] = static_cast<uint8_t*>(dst[p]);
    }
    auto run = [&] {
        withActiveKernelSet([&](auto k) { twistRows<M, decltype(k)::value>(s, srcStep, d, dstStep, roi, m); });
    };
    if constexpr (std::is_floating_point_v<typename M::Sample>) {
        run();
    } else {
        const NearestRounding nearest;
        run();
    }
    return zoxStatusOk;
}

// A plane array as the walk takes it: null stays null.
template <class P>
inline const void* const* planesOf(P* const* a)
{
    return reinterpret_cast<const void* const*>(a);
}

} // namespace zox

// Export shapes: interleaved out of place and in place, planar out of place and in place, and the 4x4
// member. The matrix is 3x4 (or 4x4) floats, row by row.
#define ZOX_TWIST_C(name, T, M)                                                                                  \
    ZOXCC_API zoxStatus name(const T* src, int srcStep, T* dst, int dstStep, ImageSize roiSize, const float twist[3][4]) \
    {                                                                                                           \
        const void* s[1] = {src};                                                                               \
        void* d[1] = {dst};                                                                                     \
        return ::zox::twistRun<M>(s, srcStep, d, dstStep, roiSize, twist ? twist[0] : nullptr);                 \
    }
#define ZOX_TWIST_CI(name, T, M)                                                                                 \
    ZOXCC_API zoxStatus name(T* srcDst, int srcDstStep, ImageSize roiSize, const float twist[3][4])             \
    {                                                                                                           \
        const void* s[1] = {srcDst};                                                                            \
        void* d[1] = {srcDst};                                                                                  \
        return ::zox::twistRun<M>(s, srcDstStep, d, srcDstStep, roiSize, twist ? twist[0] : nullptr);          \
    }
#define ZOX_TWIST_P(name, T, M)                                                                                  \
    ZOXCC_API zoxStatus name(const T* const src[3], int srcStep, T* const dst[3], int dstStep, ImageSize roiSize, \
                             const float twist[3][4])                                                            \
    {                                                                                                           \
        return ::zox::twistRun<M>(::zox::planesOf(src), srcStep, const_cast<void* const*>(::zox::planesOf(dst)), dstStep, \
                                  roiSize, twist ? twist[0] : nullptr);                                          \
    }
#define ZOX_TWIST_PI(name, T, M)                                                                                 \
    ZOXCC_API zoxStatus name(T* const srcDst[3], int srcDstStep, ImageSize roiSize, const float twist[3][4])     \
    {                                                                                                           \
        return ::zox::twistRun<M>(::zox::planesOf(srcDst), srcDstStep, const_cast<void* const*>(::zox::planesOf(srcDst)), \
                                  srcDstStep, roiSize, twist ? twist[0] : nullptr);                              \
    }
#define ZOX_TWIST_C4(name, T, M)                                                                                 \
    ZOXCC_API zoxStatus name(const T* src, int srcStep, T* dst, int dstStep, ImageSize roiSize, const float twist[4][4]) \
    {                                                                                                           \
        const void* s[1] = {src};                                                                               \
        void* d[1] = {dst};                                                                                     \
        return ::zox::twistRun<M>(s, srcStep, d, dstStep, roiSize, twist ? twist[0] : nullptr);                 \
    }

#define ZOX_DEFINE_TWIST(name, shape, T, M) shape(name, T, M)
#define ZOX_INSTANTIATE_TWIST(M) template int twistKernel<M>(const uint8_t* const*, uint8_t* const*, int, const ::zox::twist::Matrix&);
