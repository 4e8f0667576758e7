// Harness for the sampled conversions: guarded images of each destination layout, the export sweep
// against the scalar forms (the portable pass walk), the validation rows, and every kernel set against
// the scalar forms.
#pragma once

#include "frame/sampled.hpp"
#include "support/conv_sweep.hpp"

#include <string_view>

namespace zt {

// How an export takes its destination.
enum class SampledShape { P3, P3CrFirst, P2, C2, Image };

constexpr SampledShape sampledShapeOf(std::string_view shape)
{
    return shape == "ZOX_SHAPE_TO_P3"            ? SampledShape::P3
           : shape == "ZOX_SHAPE_TO_P3_CR_FIRST" ? SampledShape::P3CrFirst
           : shape == "ZOX_SHAPE_TO_P2"          ? SampledShape::P2
           : shape == "ZOX_SHAPE_TO_C2"          ? SampledShape::C2
                                                 : SampledShape::Image;
}

// The destination planes of a call of width w and height h: each plane's rows and bytes a row, chroma
// planes wide enough for a unit behind the last whole one.
template <class Dst>
std::vector<std::pair<int, int>> sampledPlaneShapes(int w, int h)
{
    constexpr zox::Sampling S = Dst::sampling;
    const int uw = zox::unitWidth(S), ch = S == zox::Sampling::S420 ? std::max(1, h / 2) : h;
    const int units = (w + uw - 1) / uw;
    if constexpr (Dst::planes == 3)
        return {{h, w}, {ch, units}, {ch, units}};
    else if constexpr (Dst::planes == 2)
        return {{h, w}, {ch, 2 * units}};
    else
        return {{h, 4 * units}};
}

// A guarded destination: planes with their own steps and misalignments.
template <class Dst>
struct SampledSide : PlaneSet {
    uint8_t* ptr[3] = {};
    int step[3] = {};
    SampledSide(int w, int h, int stepKind, int misalign, Rng& rng)
    {
        const auto shapes = sampledPlaneShapes<Dst>(w, h);
        for (std::size_t p = 0; p < shapes.size(); ++p) {
            const auto [rows, bytes] = shapes[p];
            const int s = pickStep(stepKind, rows, bytes, rng);
            planes.push_back(std::make_unique<Plane>(PlaneShape{rows, bytes, s, misalign < 0 ? -1 : (misalign + 7 * static_cast<int>(p)) % 16}, rng));
            ptr[p] = planes.back()->data();
            step[p] = s;
        }
    }
    zox::SampledFrame frame(bool crFirst = false) const
    {
        if constexpr (Dst::planes == 3) {
            const int a = crFirst ? 2 : 1, b = crFirst ? 1 : 2;
            return {{ptr[0], ptr[a], ptr[b]}, {step[0], step[a], step[b]}};
        } else
            return {{ptr[0], ptr[1], nullptr}, {step[0], step[1], 0}};
    }
};

template <class C>
void passesThrough(zox::KernelSet k, typename C::Src::Arg src, std::ptrdiff_t srcStep, const zox::SampledFrame& f, ImageSize roi)
{
    onKernelSet(k, [&]<zox::KernelSet K>() { zox::convertPasses<C, K>(src, srcStep, f, roi); });
}

// The scalar forms of a row, with the aligned-row forms where the member's rows are aligned.
template <class Row>
void expectedImage(typename Row::Other::Src::Arg src, std::ptrdiff_t srcStep, const zox::SampledFrame& f, ImageSize roi)
{
    if (Row::dependsOnAlignment && zox::rowsAligned(src, srcStep, f, Row::Other::Dst::planes))
        passesThrough<typename Row::Aligned>(zox::KernelSet::Portable, src, srcStep, f, roi);
    else
        passesThrough<typename Row::Other>(zox::KernelSet::Portable, src, srcStep, f, roi);
}

// One call of an export with its layout's arguments; null marks: -1 none, 0.. a plane, 9 the pointer.
template <class Row, SampledShape Sh, class F, class SrcArg, class D>
zoxStatus callSampled(F f, SrcArg src, int srcStep, const D& dst, ImageSize roi, int dstNull = -1)
{
    uint8_t* p[3] = {dst.ptr[0], dst.ptr[1], dst.ptr[2]};
    if (dstNull >= 0 && dstNull < 3)
        p[dstNull] = nullptr;
    if constexpr (Sh == SampledShape::P3 || Sh == SampledShape::P3CrFirst)
        return f(src, srcStep, dstNull == 9 ? nullptr : p, dst.step, roi);
    else if constexpr (Sh == SampledShape::P2)
        return f(src, srcStep, p[0], dst.step[0], p[1], dst.step[1], roi);
    else if constexpr (Sh == SampledShape::C2)
        return f(src, srcStep, dstNull == 9 ? nullptr : p[0], dst.step[0], roi);
    else
        return f(src, dstNull == 9 ? nullptr : p, roi);
}

// Widths 1..70, heights 1..5, step kinds and misalignments cycling (-1: the region ends the mapping):
// the export against the scalar forms on a copy of the same destination, its status against its rules;
// nothing outside the region and the sampled planes written, the source unchanged.
template <class Row, class Rules, SampledShape Sh, class F>
void sweepSampled(const char* name, F f)
{
    using C = typename Row::Other;
    using Src = typename C::Src;
    using Dst = typename C::Dst;
    static_assert(Sh != SampledShape::Image);
    Rng rng(4242);
    for (int w = 1; w <= 70; ++w)
        for (int h = 1; h <= 5; ++h) {
            const int kind = (w + h) % 3 == 1 && h > 1 ? 1 : (w + h) % 3 == 2 ? 2 : 0;
            const int mis = (w + 3 * h) % 17 - 1;
            const ImageSize roi{w, h};
            Side<Src> src(h, w, pickStep(kind, h, w * Src::bytesPerPixel, rng), mis, rng);
            SampledSide<Dst> dst(w, h, kind, (mis * 7 + 3) % 16, rng);
            const auto srcBefore = src.bytes();
            const auto dstBefore = dst.bytes();
            SCOPED_TRACE(std::string(name) + " width " + std::to_string(w) + " height " + std::to_string(h) + " step kind " +
                         std::to_string(kind) + " misalign " + std::to_string(mis));
            const zoxStatus st = callSampled<Row, Sh>(f, src.arg(), src.step, dst, roi);
            ASSERT_EQ(st, w < Rules::minWidth || h < Rules::minHeight ? zoxStatusBadSize
                          : Rules::warns(roi)                          ? zoxWarnOddSize
                                                                       : zoxStatusOk);
            ASSERT_EQ(src.bytes(), srcBefore) << "the source changed";
            const auto got = dst.bytes();
            dst.restore(dstBefore);
            if (st >= 0)
                expectedImage<Row>(src.arg(), src.step, dst.frame(Sh == SampledShape::P3CrFirst), roi);
            for (std::size_t p = 0; p < dst.planes.size(); ++p) {
                ASSERT_EQ(dst.planes[p]->firstGuardChange(dstBefore[p]), -1) << "plane " << p << " written outside";
                const auto want = dst.planes[p]->bytes();
                for (std::size_t i = 0; i < got[p].size(); ++i)
                    ASSERT_EQ(int(got[p][i]), int(want[i])) << "plane " << p << " byte " << i;
            }
        }
}

// Validation rows: each bad argument alone and where the order matters; nothing written.
template <class Row, class Rules, SampledShape Sh, class F>
void checkSampledValidation(const char* name, F f)
{
    using Src = typename Row::Other::Src;
    using Dst = typename Row::Other::Dst;
    Rng rng(7);
    const int w = 8, h = 4;
    Side<Src> src(h, w, w * Src::bytesPerPixel, 0, rng);
    SampledSide<Dst> dst(w, h, 0, 0, rng);
    const auto before = dst.bytes();
    const bool elementsFirst = Rules::checks != zox::Checks::PointersSizesPlanes;
    const ImageSize ok{w, h}, narrow{Rules::minWidth - 1, h}, low{w, Rules::minHeight - 1};
    struct Case {
        std::string what;
        int srcNull, dstNull;
        ImageSize roi;
        zoxStatus want;
    };
    std::vector<Case> cases = {
        {"src null", 9, -1, ok, zoxStatusNullPointer},
        {"src null, width below minimum", 9, -1, narrow, zoxStatusNullPointer},
        {"width below minimum", -1, -1, narrow, zoxStatusBadSize},
        {"height below minimum", -1, -1, low, zoxStatusBadSize},
        {"width -1", -1, -1, {-1, h}, zoxStatusBadSize},
        {"height INT32_MIN", -1, -1, {w, INT32_MIN}, zoxStatusBadSize},
    };
    if (Sh != SampledShape::P2)
        cases.push_back({"dst null, height below minimum", -1, 9, low, zoxStatusNullPointer});
    for (int p = 0; p < Dst::planes && (Dst::planes > 1); ++p) {
        const bool array = Sh != SampledShape::P2; // dstY and dstCbCr are pointers of their own
        cases.push_back({"dst plane " + std::to_string(p) + " null", -1, p, ok, zoxStatusNullPointer});
        cases.push_back({"dst plane " + std::to_string(p) + " null, width below minimum", -1, p, narrow,
                         !array || elementsFirst ? zoxStatusNullPointer : zoxStatusBadSize});
    }
    for (int p = 0; p < Src::planes && Src::planes > 1; ++p)
        cases.push_back({"src plane " + std::to_string(p) + " null, width below minimum", p, -1, narrow,
                         elementsFirst ? zoxStatusNullPointer : zoxStatusBadSize});
    for (const Case& c : cases) {
        SCOPED_TRACE(std::string(name) + ": " + c.what);
        std::vector<typename Src::Sample*> sp;
        const zoxStatus st = callSampled<Row, Sh>(f, src.argWithNull(c.srcNull, sp), src.step, dst, c.roi, c.dstNull);
        EXPECT_EQ(st, c.want);
        EXPECT_EQ(dst.bytes(), before) << "written before validation passed";
    }
}

// Every kernel set the processor runs against the scalar forms: one pass of widths 1..70 and a few wider,
// every source misalignment (-1: it ends at a PROT_NONE page), random data with corner values.
template <class C>
void diffSampledKernels()
{
    using Src = typename C::Src;
    using Dst = typename C::Dst;
    const std::vector<zox::KernelSet> sets = runnableKernelSets();
    if (sets.empty())
        GTEST_SKIP() << "no SIMD kernels in this build";
    Rng rng(99);
    const int corners[] = {0, 1, 2, 127, 128, 129, 253, 254, 255};
    for (int i = 0; i < 76; ++i) {
        const int width = i < 70 ? i + 1 : 71 + static_cast<int>(rng() % 700);
        const int h = C::uh;
        for (int mis = -1; mis < 16; ++mis) {
            Side<Src> src(h, width, width * Src::bytesPerPixel, mis, rng);
            if (mis % 3 == 0)
                for (int r = 0; r < h; ++r) {
                    const auto row = Src::row(src.arg(), src.step, r);
                    for (int x = 0; x < width; ++x)
                        putPx<Src>(row, x, corners[rng() % 9], corners[rng() % 9], corners[rng() % 9], static_cast<int>(rng() & 255));
                }
            SampledSide<Dst> want(width, h, 0, (mis * 5 + width) % 16, rng);
            const auto before = want.bytes();
            passesThrough<C>(zox::KernelSet::Portable, src.arg(), src.step, want.frame(), {width, h});
            const auto expected = want.bytes();
            for (zox::KernelSet k : sets) {
                want.restore(before);
                passesThrough<C>(k, src.arg(), src.step, want.frame(), {width, h});
                ASSERT_EQ(want.bytes(), expected) << zox::kernelSetName(k) << ": width " << width << " misalign " << mis;
            }
        }
    }
    if constexpr (requires { typename Src::Fields; }) { // every word once in each row
        Side<Src> src(C::uh, 65536, 65536 * 2, 0, rng);
        putEveryWord<Src>(src);
        SampledSide<Dst> want(65536, C::uh, 0, 5, rng);
        const auto before = want.bytes();
        passesThrough<C>(zox::KernelSet::Portable, src.arg(), src.step, want.frame(), {65536, C::uh});
        const auto expected = want.bytes();
        for (zox::KernelSet k : sets) {
            want.restore(before);
            passesThrough<C>(k, src.arg(), src.step, want.frame(), {65536, C::uh});
            ASSERT_EQ(want.bytes(), expected) << zox::kernelSetName(k) << ": every word";
        }
    }
}

} // namespace zt
