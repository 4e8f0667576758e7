// The tone-mapping kernels of each set, and their choice per kernel set.
#pragma once

#include "frame/kernel_set.hpp"
#include "tonemap/tonemap_forms.hpp"

namespace zox {

#define ZOX_TONEMAP_KERNEL_DECLS                                                  \
    float maxRow(const float* s, int width, float m);                             \
    void addRowSum(const float* s, int width, double& total);                     \
    template <class Form>                                                         \
    void mapRow(const float* s, uint8_t* d, int width, float scale);
namespace sse41 {
ZOX_TONEMAP_KERNEL_DECLS
}
namespace avx2 {
ZOX_TONEMAP_KERNEL_DECLS
}
#undef ZOX_TONEMAP_KERNEL_DECLS

// The row units of set K: its kernels, or the scalar forms.
template <KernelSet K>
struct ToneKernels {
    static float maxRow(const float* s, int w, float m)
    {
        if constexpr (K == KernelSet::Avx2)
            return avx2::maxRow(s, w, m);
        else if constexpr (K == KernelSet::Sse41)
            return sse41::maxRow(s, w, m);
        else
            return tonemap::rowMax(s, w, m);
    }
    static void addRowSum(const float* s, int w, double& total)
    {
        if constexpr (K == KernelSet::Avx2)
            avx2::addRowSum(s, w, total);
        else if constexpr (K == KernelSet::Sse41)
            sse41::addRowSum(s, w, total);
        else
            tonemap::addRowSum(s, w, total);
    }
    template <class Form>
    static void mapRow(const float* s, uint8_t* d, int w, float scale)
    {
        if constexpr (K == KernelSet::Avx2)
            avx2::mapRow<Form>(s, d, w, scale);
        else if constexpr (K == KernelSet::Sse41)
            sse41::mapRow<Form>(s, d, w, scale);
        else
            for (int x = 0; x < w; ++x)
                d[x] = Form::map(tonemap::at(s, x), scale);
    }
};

} // namespace zox
