// Gray conversions: the validating layer and the row walk of all 25 exports. Each row runs the active
// kernel set's kernel over as many columns as it takes, then the member's scalar row from there on.
#pragma once

#include "frame/kernel_set.hpp"
#include "pointops/gray_forms.hpp"
#include "zoxcc.h"

namespace zox {

// Kernels of each set, explicitly instantiated for every member: a prefix of the row, the columns done
// returned.
namespace sse41 {
template <class M>
int grayKernel(const uint8_t* s, uint8_t* d, int w, const gray::Params& p);
} // namespace sse41
namespace avx2 {
template <class M>
int grayKernel(const uint8_t* s, uint8_t* d, int w, const gray::Params& p);
} // namespace avx2

template <class M, KernelSet K>
void grayRow(const uint8_t* s, uint8_t* d, int w, const gray::Params& p)
{
    int x = 0;
    if constexpr (K == KernelSet::Avx2)
        x = avx2::grayKernel<M>(s, d, w, p);
    else if constexpr (K == KernelSet::Sse41)
        x = sse41::grayKernel<M>(s, d, w, p);
    if (x < w)
        M::row(s, d, x, w, p);
}

// The 16-bit and 32f members take their steps in whole samples (rounded down); 8u and 64f as they come.
template <class T>
constexpr int grayStep(int step)
{
    return sizeof(T) == 2 || sizeof(T) == 4 ? step & ~(static_cast<int>(sizeof(T)) - 1) : step;
}

template <class M, KernelSet K>
void grayRows(const void* src, int srcStep, void* dst, int dstStep, ImageSize roi, const gray::Params& p)
{
    const int ss = grayStep<typename M::S>(srcStep), ds = grayStep<typename M::D>(dstStep);
    for (int r = 0; r < roi.height; ++r)
        grayRow<M, K>(rowAddress(static_cast<const uint8_t*>(src), ss, r), rowAddress(static_cast<uint8_t*>(dst), ds, r),
                      roi.width, p);
}

// Checks: src and dst (and weights a member cannot do without), then the sizes. Steps are not examined.
template <class M>
zoxStatus grayRun(const void* src, int srcStep, void* dst, int dstStep, ImageSize roi, const gray::Params& p,
                  bool pointersOk = true)
{
    if (!src || !dst || !pointersOk)
        return zoxStatusNullPointer;
    if (roi.width < 1 || roi.height < 1)
        return zoxStatusBadSize;
    withActiveKernelSet([&](auto k) { grayRows<M, decltype(k)::value>(src, srcStep, dst, dstStep, roi, p); });
    return zoxStatusOk;
}

} // namespace zox

// Export shapes: the fixed weights; the caller's float weights (null: the fixed set); the caller's
// double weights, null taken as the fixed set widened or rejected; gray to colour with alpha.
#define ZOX_GRAY_ARGS(M) const M::S *src, int srcStep, M::D *dst, int dstStep, ImageSize roiSize
#define ZOX_GRAY_FIXED(name, M)                                                                          \
    ZOXCC_API zoxStatus name(ZOX_GRAY_ARGS(M))                                                            \
    {                                                                                                     \
        return ::zox::grayRun<M>(src, srcStep, dst, dstStep, roiSize, ::zox::gray::paramsOf(static_cast<const float*>(nullptr))); \
    }
#define ZOX_GRAY_WEIGHTS(name, M)                                                                        \
    ZOXCC_API zoxStatus name(ZOX_GRAY_ARGS(M), const float coeffs[3])                                    \
    {                                                                                                     \
        return ::zox::grayRun<M>(src, srcStep, dst, dstStep, roiSize, ::zox::gray::paramsOf(coeffs));    \
    }
#define ZOX_GRAY_WEIGHTS64_OR_FIXED(name, M)                                                             \
    ZOXCC_API zoxStatus name(ZOX_GRAY_ARGS(M), const double coeffs[3])                                   \
    {                                                                                                     \
        return ::zox::grayRun<M>(src, srcStep, dst, dstStep, roiSize, ::zox::gray::paramsOf(coeffs));    \
    }
#define ZOX_GRAY_WEIGHTS64(name, M)                                                                      \
    ZOXCC_API zoxStatus name(ZOX_GRAY_ARGS(M), const double coeffs[3])                                   \
    {                                                                                                     \
        return ::zox::grayRun<M>(src, srcStep, dst, dstStep, roiSize, ::zox::gray::paramsOf(coeffs), coeffs != nullptr); \
    }
#define ZOX_GRAY_ALPHA(name, M)                                                                          \
    ZOXCC_API zoxStatus name(ZOX_GRAY_ARGS(M), M::D alpha)                                               \
    {                                                                                                     \
        return ::zox::grayRun<M>(src, srcStep, dst, dstStep, roiSize, ::zox::gray::paramsWithAlpha(alpha)); \
    }

#define ZOX_DEFINE_GRAY(name, shape, M) shape(name, M)
#define ZOX_INSTANTIATE_GRAY(M) template int grayKernel<M>(const uint8_t*, uint8_t*, int, const ::zox::gray::Params&);
