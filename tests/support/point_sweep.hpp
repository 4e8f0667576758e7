// Harness for the per-pixel operators whose rows are kernel prefixes plus a scalar row (gray, colour
// twist): guarded images over widths 1..70, the portable rows as the reference, every kernel set the
// processor runs and the export itself checked against them byte for byte, guards included.
#pragma once

#include "support/conv_sweep.hpp"
#include "support/guarded.hpp"

#include <gtest/gtest.h>

#include <cstring>
#include <memory>
#include <type_traits>
#include <vector>

namespace zt {

// One side of a call: planes, bytes a pixel of each, and the sample type's size; float samples are filled
// with finite values (what a NaN payload becomes is not promised).
struct PointSide {
    int planes = 1;
    int bytesPerPixel = 1;
    int sampleBytes = 1;
    bool floats = false;
};

template <class T>
PointSide pointSide(int planes, int samplesPerPixel)
{
    return {planes, samplesPerPixel * static_cast<int>(sizeof(T)), static_cast<int>(sizeof(T)), std::is_floating_point_v<T>};
}

struct PointImages {
    PlaneSet src, dst;
    std::vector<uint8_t*> srcPtr, dstPtr;
    int srcStep = 0, dstStep = 0;
};

// The runs of one case: the reference (the portable rows), a kernel set's rows, the export.
enum class PointRun { Kernels, Export };

// run(images, roi, run kind, kernel set) calls the member; in place, dst is src. Steps: positive padded
// only (members that reject others), or also zero and negative ones.
template <class Run>
void pointSweep(const PointSide& in, const PointSide& out, bool inPlace, bool anyStep, Run run)
{
    Rng rng(1234);
    for (int w = 1; w <= 70; ++w) {
        const int h = 1 + w % 3;
        const int kind = anyStep ? w % 3 : 0;
        auto side = [&](const PointSide& s, std::vector<uint8_t*>& ptr, PlaneSet& set) {
            const int rowBytes = w * s.bytesPerPixel;
            int step = pickStep(kind, h, rowBytes, rng);
            const int z = s.sampleBytes;
            step = step > 0 ? (step + z - 1) / z * z : -((-step + z - 1) / z * z);
            for (int p = 0; p < s.planes; ++p) {
                const int m = (w * 7 + 5 * p) % 16 / z * z;
                set.planes.push_back(std::make_unique<Plane>(PlaneShape{h, rowBytes, step, w % 5 == 0 ? -1 : m}, rng));
                Plane& pl = *set.planes.back();
                if (s.floats)
                    for (int r = 0; r < h; ++r)
                        for (int i = 0; i < rowBytes / z; ++i) {
                            const double v = static_cast<double>(rng() % 8192) / 16.0 - 64.0;
                            if (z == 4) {
                                const float f = static_cast<float>(v);
                                std::memcpy(pl.row(r) + 4 * i, &f, 4);
                            } else {
                                std::memcpy(pl.row(r) + 8 * i, &v, 8);
                            }
                        }
                ptr.push_back(pl.data());
            }
            return step;
        };
        PointImages im;
        im.srcStep = side(in, im.srcPtr, im.src);
        if (inPlace) {
            im.dstPtr = im.srcPtr;
            im.dstStep = im.srcStep;
        } else {
            im.dstStep = side(out, im.dstPtr, im.dst);
        }
        const ImageSize roi{w, h};
        const auto srcBefore = im.src.bytes();
        const auto dstBefore = im.dst.bytes();
        run(im, roi, PointRun::Kernels, zox::KernelSet::Portable);
        const auto wantSrc = im.src.bytes();
        const auto wantDst = im.dst.bytes();
        PlaneSet& written = inPlace ? im.src : im.dst;
        const auto& before = inPlace ? srcBefore : dstBefore;
        for (std::size_t p = 0; p < written.planes.size(); ++p)
            ASSERT_EQ(written.planes[p]->firstGuardChange(before[p]), -1) << "width " << w << " plane " << p;
        if (!inPlace) {
            ASSERT_EQ(wantSrc, srcBefore) << "width " << w << ": the source changed";
        }
        auto again = [&](PointRun r, zox::KernelSet k, const char* what) {
            im.src.restore(srcBefore);
            im.dst.restore(dstBefore);
            run(im, roi, r, k);
            ASSERT_EQ(im.src.bytes(), wantSrc) << what << " width " << w;
            ASSERT_EQ(im.dst.bytes(), wantDst) << what << " width " << w;
        };
        for (zox::KernelSet k : runnableKernelSets())
            again(PointRun::Kernels, k, zox::kernelSetName(k));
        again(PointRun::Export, zox::KernelSet::Portable, "export");
    }
}

} // namespace zt
