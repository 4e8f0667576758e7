// Tone mapping of one-channel float images to bytes: the statistic pass, the all-dark and negative
// cases, and the mapping pass, over the kernel set the library runs.
#include "frame/conv.hpp"
#include "frame/planes.hpp"
#include "tonemap/tonemap_kernels.hpp"
#include "tonemap/tonemap_table.hpp"

#include <cstdint>

namespace zox {
namespace {

// Source rows are found in whole floats: the byte offset of row r loses its low two bits.
const float* floatRow(const float* src, int srcStep, int r)
{
    const int64_t offset = (static_cast<int64_t>(r) * srcStep) & ~int64_t{3};
    return reinterpret_cast<const float*>(reinterpret_cast<uintptr_t>(src) + static_cast<intptr_t>(offset));
}

// The mapping pass, rows from top to bottom. A row of at most 6 samples, or whose source and
// destination ranges may overlap, goes strictly left to right, each sample read just before its byte is
// written (so that dst == src works); other rows take the set's kernel.
template <class Form, KernelSet K>
void mapRows(const float* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roi, float scale)
{
    const auto w = static_cast<uintptr_t>(roi.width);
    for (int r = 0; r < roi.height; ++r) {
        const float* s = floatRow(src, srcStep, r);
        uint8_t* d = rowAddress(dst, dstStep, r);
        const uintptr_t sa = reinterpret_cast<uintptr_t>(s), da = reinterpret_cast<uintptr_t>(d);
        const bool apart = (da > sa && da - sa >= 4 * w) || (da < sa && sa - da >= w);
        if (roi.width <= 6 || !apart) {
            for (int x = 0; x < roi.width; ++x) {
                const float v = tonemap::at(s, x);
                d[x] = Form::map(v, scale);
            }
        } else {
            ToneKernels<K>::template mapRow<Form>(s, d, roi.width, scale);
        }
    }
}

} // namespace

// The linear form: the maximum to 255, the low byte of each truncated product.
struct LinearMap {
    template <KernelSet K>
    static zoxStatus run(const float* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roi)
    {
        float m = tonemap::kMaxStart;
        for (int r = 0; r < roi.height; ++r)
            m = ToneKernels<K>::maxRow(floatRow(src, srcStep, r), roi.width, m);
        if (m < 0.0f)
            return zoxWarnNoOperation;
        if (!(m > tonemap::kTinyLinear))
            return fillPlane(0, dst, dstStep, roi.width, roi.height);
        const float scale = 255.0f / m;
        mapRows<tonemap::Linear, K>(src, srcStep, dst, dstStep, roi, scale);
        return zoxStatusOk;
    }
};

// The mean form: twice the mean to 255, each truncated product saturated.
struct MeanMap {
    template <KernelSet K>
    static zoxStatus run(const float* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roi)
    {
        double total = 0.0;
        for (int r = 0; r < roi.height; ++r)
            ToneKernels<K>::addRowSum(floatRow(src, srcStep, r), roi.width, total);
        const double average = total / static_cast<double>(static_cast<int64_t>(roi.width) * roi.height);
        const double twice = average + average;
        if (twice < 0.0)
            return zoxWarnNoOperation;
        // Not above the smallest normal value (a sum that is not a number included): black.
        if (!(twice > tonemap::kTinyMean)) {
            fillPlane(0, dst, dstStep, roi.width, roi.height);
            return zoxStatusOk;
        }
        const float scale = static_cast<float>(255.0 / twice);
        mapRows<tonemap::Mean, K>(src, srcStep, dst, dstStep, roi, scale);
        return zoxStatusOk;
    }
};

// The checks, then the form through the kernel set the library runs.
template <class Map>
zoxStatus toneMap(const float* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roi)
{
    if (!src || !dst)
        return zoxStatusNullPointer;
    if (roi.width < 1 || roi.height < 1)
        return zoxStatusBadSize;
    if constexpr (kChosenAtLoad) {
        if (activeKernelSet() == KernelSet::Avx2)
            return Map::template run<KernelSet::Avx2>(src, srcStep, dst, dstStep, roi);
        return Map::template run<KernelSet::Sse41>(src, srcStep, dst, dstStep, roi);
    } else {
        return Map::template run<kBuiltKernelSet>(src, srcStep, dst, dstStep, roi);
    }
}

} // namespace zox

extern "C" {
ZOX_TONEMAP_TABLE(ZOX_DEFINE_TONEMAP)
}
