// Harness for the conversions from sampled images: guarded sources of each sampled layout, the export
// sweep against the scalar forms (the portable pass walk), the validation rows, and every kernel set
// against the scalar forms.
#pragma once

#include "frame/fromsampled.hpp"
#include "support/conv_sweep.hpp"

#include <string_view>

namespace zt {

// How an export takes its source.
enum class FromShape { P3, P2, C2, Image };

constexpr FromShape fromShapeOf(std::string_view shape)
{
    return shape.starts_with("ZOX_SHAPE_FROM_P3")   ? FromShape::P3
           : shape.starts_with("ZOX_SHAPE_FROM_P2") ? FromShape::P2
           : shape.starts_with("ZOX_SHAPE_FROM_C2") ? FromShape::C2
                                                    : FromShape::Image;
}

// A conversion that reads the chroma of a 4:2:0 image's odd edges: its planes hold (w + 1) / 2 samples
// a row and (h + 1) / 2 rows.
template <class C>
inline constexpr bool readsOddEdges = C::sampling == zox::Sampling::S420 && !std::is_same_v<typename C::Last, zox::Unwritten>;

// The source planes of a call of width w and height h, in the call's order: rows and bytes a row of
// each, exactly the samples the layout holds (at least one, so that every plane exists).
template <class Src, bool Edges = false>
std::vector<std::pair<int, int>> sourcePlaneShapes(int w, int h)
{
    constexpr zox::Sampling S = Src::sampling;
    const int ch = std::max(1, S == zox::Sampling::S420 ? (Edges ? (h + 1) / 2 : h / 2) : h);
    const int cw = std::max(1, S == zox::Sampling::S420 ? (Edges ? (w + 1) / 2 : w / 2) : S == zox::Sampling::S422 ? (w + 1) / 2 : w / 4);
    if constexpr (Src::planes == 3)
        return {{h, w}, {ch, cw}, {ch, cw}};
    else if constexpr (Src::planes == 2)
        return {{h, w}, {ch, 2 * cw}};
    else
        return {{h, 2 * w}};
}

// A guarded sampled source: planes with their own steps and misalignments.
template <class Src, bool Edges = false>
struct SampledSource : PlaneSet {
    const uint8_t* ptr[3] = {};
    int step[3] = {};
    SampledSource(int w, int h, int stepKind, int misalign, Rng& rng)
    {
        const auto shapes = sourcePlaneShapes<Src, Edges>(w, h);
        for (std::size_t p = 0; p < shapes.size(); ++p) {
            const auto [rows, bytes] = shapes[p];
            const int s = pickStep(stepKind, rows, bytes, rng);
            planes.push_back(std::make_unique<Plane>(PlaneShape{rows, bytes, s, misalign < 0 ? -1 : (misalign + 7 * static_cast<int>(p)) % 16}, rng));
            ptr[p] = planes.back()->data();
            step[p] = s;
        }
    }
    zox::SampledImage image() const
    {
        if constexpr (Src::planes == 3)
            return Src::image(ptr, step);
        else
            return {{ptr[0], ptr[1], nullptr}, {step[0], step[1], 0}};
    }
};

template <class C>
void pixelPassesThrough(zox::KernelSet k, const zox::SampledImage& src, typename C::Dst::Arg dst, int dstStep, ImageSize roi,
                        const zox::Ctx& ctx)
{
    onKernelSet(k, [&]<zox::KernelSet K>() { zox::convertPixelPasses<C, K>(src, dst, dstStep, roi, ctx); });
}

// The scalar forms of a row, with the aligned-row forms where the member's rows are aligned.
template <class Row>
void expectedPixels(const zox::SampledImage& src, typename Row::Other::Dst::Arg dst, int dstStep, ImageSize roi, const zox::Ctx& ctx)
{
    using C = typename Row::Other;
    if (Row::dependsOnAlignment && zox::pixelRowsAligned<typename C::Dst>(src, C::Src::planes, dst, dstStep))
        pixelPassesThrough<typename Row::Aligned>(zox::KernelSet::Portable, src, dst, dstStep, roi, ctx);
    else
        pixelPassesThrough<C>(zox::KernelSet::Portable, src, dst, dstStep, roi, ctx);
}

// Null marks of a call: -1 none, 0.. a plane, 9 the pointer (or plane array) itself.
struct Nulls {
    int src = -1, dst = -1;
};

// One call of an export with its layout's arguments.
template <class Row, FromShape Sh, class F, class S, class D>
zoxStatus callFromSampled(F f, const S& src, D& dst, ImageSize roi, int alpha, Nulls n = {})
{
    using Dst = typename Row::Other::Dst;
    const uint8_t* p[3] = {src.ptr[0], src.ptr[1], src.ptr[2]};
    if (n.src >= 0 && n.src < 3)
        p[n.src] = nullptr;
    std::vector<typename Dst::Sample*> scratch;
    const auto d = dst.argWithNull(n.dst, scratch);
    auto call = [&](auto... a) {
        // A destination of wider samples gets its step plus the bytes short of a whole sample, which the
        // call drops.
        const int step = dst.step + static_cast<int>(sizeof(typename Dst::Sample)) - 1;
        if constexpr (std::is_invocable_v<F, decltype(a)..., typename Dst::Arg, int, ImageSize, uint8_t>)
            return f(a..., d, step, roi, static_cast<uint8_t>(alpha));
        else
            return f(a..., d, step, roi);
    };
    if constexpr (Sh == FromShape::P3)
        return call(n.src == 9 ? nullptr : p, src.step);
    else if constexpr (Sh == FromShape::P2)
        return call(p[0], src.step[0], p[1], src.step[1]);
    else if constexpr (Sh == FromShape::C2)
        return call(n.src == 9 ? nullptr : p[0], src.step[0]);
    else
        return f(n.src == 9 ? nullptr : p, d, roi);
}

// Widths 1..70, heights 1..5, step kinds and misalignments cycling (-1: the region ends the mapping):
// the export against the scalar forms on a copy of the same destination, its status against its rules;
// nothing outside the region written, the source unchanged and nothing outside its samples read.
template <class Row, class Rules, FromShape Sh, class F>
void sweepFromSampled(const char* name, F f)
{
    using C = typename Row::Other;
    using Dst = typename C::Dst;
    static_assert(Sh != FromShape::Image);
    Rng rng(4343);
    for (int w = 1; w <= 70; ++w)
        for (int h = 1; h <= 5; ++h) {
            const int kind = (w + h) % 3 == 1 && h > 1 ? 1 : (w + h) % 3 == 2 ? 2 : 0;
            const int mis = (w + 3 * h) % 17 - 1;
            const ImageSize roi{w, h};
            SampledSource<typename C::Src, readsOddEdges<C>> src(w, h, kind, mis, rng);
            Side<Dst> dst(h, w, zox::wholeSampleStep<Dst>(pickStep(kind, h, w * Dst::bytesPerPixel, rng)), (mis * 7 + 3) % 16, rng);
            const auto srcBefore = src.bytes();
            const auto dstBefore = dst.bytes();
            const int alpha = static_cast<int>(rng() & 255);
            SCOPED_TRACE(std::string(name) + " width " + std::to_string(w) + " height " + std::to_string(h) + " step kind " +
                         std::to_string(kind) + " misalign " + std::to_string(mis));
            const zoxStatus st = callFromSampled<Row, Sh>(f, src, dst, roi, alpha);
            ASSERT_EQ(st, w < Rules::minWidth || h < Rules::minHeight ? zoxStatusBadSize
                          : Rules::warns(roi)                          ? zoxWarnOddSize
                                                                       : zoxStatusOk);
            ASSERT_EQ(src.bytes(), srcBefore) << "the source changed";
            const auto got = dst.bytes();
            dst.restore(dstBefore);
            if (st >= 0)
                expectedPixels<Row>(src.image(), dst.arg(), dst.step, roi, zox::Ctx{alpha});
            for (std::size_t p = 0; p < dst.planes.size(); ++p) {
                ASSERT_EQ(dst.planes[p]->firstGuardChange(dstBefore[p]), -1) << "plane " << p << " written outside";
                const auto want = dst.planes[p]->bytes();
                for (std::size_t i = 0; i < got[p].size(); ++i)
                    ASSERT_EQ(int(got[p][i]), int(want[i])) << "plane " << p << " byte " << i;
            }
        }
}

// Validation rows: each bad argument alone and with a size below the minimum, where the order shows;
// nothing written.
template <class Row, class Rules, FromShape Sh, class F>
void checkFromSampledValidation(const char* name, F f)
{
    using Src = typename Row::Other::Src;
    using Dst = typename Row::Other::Dst;
    Rng rng(7);
    const int w = 8, h = 4;
    SampledSource<Src, readsOddEdges<typename Row::Other>> src(w, h, 0, 0, rng);
    Side<Dst> dst(h, w, w * Dst::bytesPerPixel, 0, rng);
    const auto before = dst.bytes();
    // The status a call gets from a null top-level pointer, a null array element and a bad size.
    auto want = [](bool top, bool element, bool badSize) {
        switch (Rules::checks) {
        case zox::Checks::SizesPointersPlanes:
            return badSize ? zoxStatusBadSize : top || element ? zoxStatusNullPointer : zoxStatusOk;
        case zox::Checks::PointersSizesPlanes:
            return top ? zoxStatusNullPointer : badSize ? zoxStatusBadSize : element ? zoxStatusNullPointer : zoxStatusOk;
        default:
            return top || element ? zoxStatusNullPointer : badSize ? zoxStatusBadSize : zoxStatusOk;
        }
    };
    struct Case {
        std::string what;
        Nulls nulls;
        bool top, element;
    };
    std::vector<Case> cases = {{"none null", {}, false, false}, {"src null", {9, -1}, true, false}, {"dst null", {-1, 9}, true, false}};
    if (Sh == FromShape::P2) {
        cases[1] = {"srcY null", {0, -1}, true, false};
        cases.push_back({"srcCbCr null", {1, -1}, true, false});
    }
    for (int p = 0; p < 3 && (Sh == FromShape::P3 || Sh == FromShape::Image); ++p)
        cases.push_back({"src plane " + std::to_string(p) + " null", {p, -1}, false, true});
    for (int p = 0; p < Dst::planes && Dst::planes > 1; ++p)
        cases.push_back({"dst plane " + std::to_string(p) + " null", {-1, p}, false, true});
    const ImageSize sizes[] = {{w, h}, {Rules::minWidth - 1, h}, {w, Rules::minHeight - 1}, {-1, h}, {w, INT32_MIN}};
    for (const Case& c : cases)
        for (const ImageSize roi : sizes) {
            const bool bad = roi.width < Rules::minWidth || roi.height < Rules::minHeight;
            if (!c.top && !c.element && !bad)
                continue;
            SCOPED_TRACE(std::string(name) + ": " + c.what + ", size " + std::to_string(roi.width) + "x" + std::to_string(roi.height));
            const zoxStatus st = callFromSampled<Row, Sh>(f, src, dst, roi, 0, c.nulls);
            EXPECT_EQ(st, want(c.top, c.element, bad));
            EXPECT_EQ(dst.bytes(), before) << "written before validation passed";
        }
}

// Every kernel set the processor runs against the scalar forms: one pass of widths 1..70 and a few wider,
// every source misalignment (-1: it ends at a PROT_NONE page), random data with corner values.
template <class C>
void diffFromSampledKernels()
{
    using Src = typename C::Src;
    using Dst = typename C::Dst;
    const std::vector<zox::KernelSet> sets = runnableKernelSets();
    if (sets.empty())
        GTEST_SKIP() << "no SIMD kernels in this build";
    Rng rng(98);
    const uint8_t corners[] = {0, 1, 15, 16, 17, 127, 128, 129, 235, 240, 254, 255};
    for (int i = 0; i < 76; ++i) {
        const int width = i < 70 ? i + 1 : 71 + static_cast<int>(rng() % 700);
        const int h = C::uh;
        for (int mis = -1; mis < 16; ++mis) {
            SampledSource<Src, readsOddEdges<C>> src(width, h, 0, mis, rng);
            if (mis % 3 == 0)
                for (auto& plane : src.planes)
                    for (int r = 0; r < plane->shape().rows; ++r)
                        for (int x = 0; x < plane->shape().rowBytes; ++x)
                            plane->row(r)[x] = corners[rng() % 12];
            Side<Dst> want(h, width, width * Dst::bytesPerPixel, (mis * 5 + width) % 16, rng);
            const auto before = want.bytes();
            const zox::Ctx ctx{static_cast<int>(rng() & 255)};
            pixelPassesThrough<C>(zox::KernelSet::Portable, src.image(), want.arg(), want.step, {width, h}, ctx);
            const auto expected = want.bytes();
            for (zox::KernelSet k : sets) {
                want.restore(before);
                pixelPassesThrough<C>(k, src.image(), want.arg(), want.step, {width, h}, ctx);
                ASSERT_EQ(want.bytes(), expected) << zox::kernelSetName(k) << ": width " << width << " misalign " << mis;
            }
        }
    }
}

} // namespace zt
