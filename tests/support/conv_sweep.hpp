// Harness for the generic conversions: guarded sides built from a layout, the column-rule walker that
// uses scalar forms only, the export sweep, the validation rows and the block-kernel differential.
#pragma once

#include "frame/conv.hpp"
#include "support/guarded.hpp"

#include <gtest/gtest.h>

#include <array>
#include <cstdint>
#include <cstring>
#include <memory>
#include <string>
#include <type_traits>
#include <vector>

namespace zt {

// Guarded planes, whose bytes can be taken and put back.
struct PlaneSet {
    std::vector<std::unique_ptr<Plane>> planes;
    std::vector<std::vector<uint8_t>> bytes() const
    {
        std::vector<std::vector<uint8_t>> b;
        for (const auto& p : planes)
            b.push_back(p->bytes());
        return b;
    }
    void restore(const std::vector<std::vector<uint8_t>>& b)
    {
        for (std::size_t i = 0; i < planes.size(); ++i)
            planes[i]->restore(b[i]);
    }
};

// The planes of one side of a call.
template <class L>
struct Side : PlaneSet {
    using T = typename L::Sample;
    std::vector<T*> ptrs; // the planes' first samples, typed
    int step = 0;

    Side(int rows, int width, int step_, int misalign, Rng& rng) : step(step_)
    {
        for (int p = 0; p < L::planes; ++p) {
            // Planes of one side share the step but not their alignment.
            const int m = misalign < 0 ? -1 : (misalign + 5 * p) % 16;
            planes.push_back(std::make_unique<Plane>(PlaneShape{rows, width * L::bytesPerPixel, step, m}, rng));
            ptrs.push_back(reinterpret_cast<T*>(planes.back()->data()));
            // Float samples: finite values around 0..1 (what a NaN gives is not promised).
            if constexpr (std::is_floating_point_v<T>)
                for (int r = 0; r < rows; ++r)
                    for (int i = 0; i < width * L::bytesPerPixel / 4; ++i) {
                        const float v = static_cast<float>(rng() % 8192) / 4096.0f - 0.5f;
                        std::memcpy(planes.back()->row(r) + 4 * i, &v, 4);
                    }
        }
    }
    typename L::Arg arg() { return argOf(ptrs); }
    // The argument with one plane (0..) or the pointer itself (9) null; -1: as it is. `scratch` holds
    // the plane array it points into.
    typename L::Arg argWithNull(int which, std::vector<T*>& scratch) const
    {
        scratch = ptrs;
        if (which >= 0 && which < 9)
            scratch[which] = nullptr;
        return which == 9 ? nullptr : argOf(scratch);
    }

private:
    static typename L::Arg argOf(std::vector<T*>& p)
    {
        if constexpr (L::planes == 1 && !std::is_pointer_v<std::remove_pointer_t<typename L::Arg>>)
            return p[0];
        else
            return p.data();
    }
};

// The column rule, with scalar forms only: block form below the width rounded down to N.
template <class C>
void walk(Side<typename C::Src>& src, Side<typename C::Dst>& dst, ImageSize roi, const zox::Ctx& ctx)
{
    using Src = typename C::Src;
    using Dst = typename C::Dst;
    const int nb = C::N > 1 ? roi.width / C::N * C::N : 0;
    for (int r = 0; r < roi.height; ++r) {
        const auto s = Src::row(src.arg(), src.step, r);
        const auto d = Dst::row(dst.arg(), dst.step, r);
        for (int x = 0; x < roi.width; ++x) {
            const auto px = Src::load(s, x);
            if constexpr (C::N > 1)
                if (x < nb) {
                    Dst::store(d, x, C::Block::apply(px), ctx);
                    continue;
                }
            Dst::store(d, x, C::Rem::apply(px), ctx);
        }
    }
}

template <class F, class C>
constexpr bool takesAlpha = std::is_invocable_v<F, typename C::Src::Arg, int, typename C::Dst::Arg, int, ImageSize, uint8_t>;

template <class C, class F>
zoxStatus callExport(F f, typename C::Src::Arg s, int ss, typename C::Dst::Arg d, int ds, ImageSize roi, int alpha)
{
    if constexpr (takesAlpha<F, C>)
        return f(s, ss, d, ds, roi, static_cast<typename C::Dst::Sample>(alpha));
    else
        return f(s, ss, d, ds, roi);
}

// A random value of the fourth channel in the destination's sample type (no float member takes one).
template <class L>
int randomAlpha(Rng& rng)
{
    if constexpr (std::is_floating_point_v<typename L::Sample>)
        return 0;
    else
        return static_cast<typename L::Sample>(rng());
}

struct SweepCase {
    int width, height, stepKind, misalign;
};

// One call of the export against the walker on a copy of the same destination.
template <class C, class F>
void checkCase(const char* name, F f, const SweepCase& k, Rng& rng, bool wholeSteps)
{
    using Src = typename C::Src;
    using Dst = typename C::Dst;
    const ImageSize roi{k.width, k.height};
    // An export that takes its steps in whole samples is handed steps up to one sample short of the next
    // whole one, which it must round down to the planes' own.
    auto stepOf = [&]<class L>(int picked) { return wholeSteps ? zox::wholeSampleStep<L>(picked) : picked; };
    Side<Src> src(k.height, k.width, stepOf.template operator()<Src>(pickStep(k.stepKind, k.height, k.width * Src::bytesPerPixel, rng)),
                  k.misalign, rng);
    Side<Dst> dst(k.height, k.width, stepOf.template operator()<Dst>(pickStep(k.stepKind, k.height, k.width * Dst::bytesPerPixel, rng)),
                  (k.misalign * 7 + 3) % 16, rng);
    const int srcArgStep = src.step + (wholeSteps ? static_cast<int>(sizeof(typename Src::Sample)) - 1 : 0);
    const int dstArgStep = dst.step + (wholeSteps ? static_cast<int>(sizeof(typename Dst::Sample)) - 1 : 0);
    Side<Dst> want(k.height, k.width, dst.step, (k.misalign * 7 + 3) % 16, rng);
    const auto srcBefore = src.bytes();
    const auto dstBefore = dst.bytes();
    want.restore(dstBefore);
    const int alpha = randomAlpha<Dst>(rng);
    const zox::Ctx ctx{alpha};

    SCOPED_TRACE(std::string(name) + " width " + std::to_string(k.width) + " height " + std::to_string(k.height) +
                 " steps " + std::to_string(src.step) + "/" + std::to_string(dst.step) + " misalign " +
                 std::to_string(k.misalign));
    ASSERT_EQ(callExport<C>(f, src.arg(), srcArgStep, dst.arg(), dstArgStep, roi, alpha), zoxStatusOk);
    walk<C>(src, want, roi, ctx);

    ASSERT_EQ(src.bytes(), srcBefore) << "the source changed";
    for (int p = 0; p < Dst::planes; ++p) {
        const long g = dst.planes[p]->firstGuardChange(dstBefore[p]);
        ASSERT_EQ(g, -1) << "plane " << p << ": byte outside the region written";
        const auto got = dst.planes[p]->bytes();
        const auto exp = want.planes[p]->bytes();
        for (std::size_t i = 0; i < got.size(); ++i)
            ASSERT_EQ(int(got[i]), int(exp[i])) << "plane " << p << " byte " << i;
    }
    if constexpr (requires { Dst::fourth; })
        if constexpr (Dst::fourth == zox::Fourth::Keep)
            for (int r = 0; r < k.height; ++r)
                for (int x = 0; x < k.width; ++x) {
                    constexpr int z = sizeof(typename Dst::Sample);
                    const std::size_t at = static_cast<std::size_t>(dst.planes[0]->data() + static_cast<std::ptrdiff_t>(r) * dst.step +
                                                                    Dst::bytesPerPixel * x + 3 * z - dst.planes[0]->blockBegin());
                    for (int b = 0; b < z; ++b)
                        ASSERT_EQ(dst.planes[0]->bytes()[at + b], dstBefore[0][at + b]) << "fourth channel of pixel " << x;
                }
}

// Widths 1..70, heights 1..3, every step kind, misalignments cycling through 0..15 and page-end.
// wholeSteps: the export takes its steps rounded down to whole samples.
template <class C, class F>
void sweepExport(const char* name, F f, bool wholeSteps = false)
{
    Rng rng(12345);
    for (int w = 1; w <= 70; ++w)
        for (int h = 1; h <= 3; ++h)
            for (int kind = 0; kind < 3; ++kind) {
                if (kind == 1 && h == 1)
                    continue;
                const int mis = (w + 3 * h + kind) % 17 - 1; // -1: the region ends the mapping
                checkCase<C>(name, f, SweepCase{w, h, kind, mis}, rng, wholeSteps);
                if (::testing::Test::HasFatalFailure())
                    return;
            }
}

// Validation rows: each bad argument alone and in the combinations whose order matters; nothing written.
template <class C, class F>
void checkValidation(const char* name, F f)
{
    using Src = typename C::Src;
    using Dst = typename C::Dst;
    Rng rng(7);
    Side<Src> src(2, 8, 8 * Src::bytesPerPixel, 0, rng);
    Side<Dst> dst(2, 8, 8 * Dst::bytesPerPixel, 0, rng);
    const auto before = dst.bytes();
    const bool planesFirst = C::checks != zox::Checks::PointersSizesPlanes;
    // Members that take an empty size as nothing to do.
    const zoxStatus badSize = C::checks == zox::Checks::PointersPlanesEmpty ? zoxStatusOk : zoxStatusBadSize;
    struct Row {
        const char* what;
        int srcNull, dstNull; // -1 none, 0.. plane index, 9 the pointer itself
        ImageSize roi;
        zoxStatus want;
    };
    std::vector<Row> rows = {
        {"src null", 9, -1, {8, 2}, zoxStatusNullPointer},
        {"dst null", -1, 9, {8, 2}, zoxStatusNullPointer},
        {"width 0", -1, -1, {0, 2}, badSize},
        {"height 0", -1, -1, {8, 0}, badSize},
        {"width -1", -1, -1, {-1, 2}, badSize},
        {"height INT32_MIN", -1, -1, {8, INT32_MIN}, badSize},
        {"src null, width 0", 9, -1, {0, 2}, zoxStatusNullPointer},
        {"dst null, height -5", -1, 9, {8, -5}, zoxStatusNullPointer},
    };
    for (int p = 0; p < Src::planes && Src::planes > 1; ++p) {
        rows.push_back({"src plane null", p, -1, {8, 2}, zoxStatusNullPointer});
        rows.push_back({"src plane null, width 0", p, -1, {0, 2}, planesFirst ? zoxStatusNullPointer : badSize});
    }
    for (int p = 0; p < Dst::planes && Dst::planes > 1; ++p) {
        rows.push_back({"dst plane null", -1, p, {8, 2}, zoxStatusNullPointer});
        rows.push_back({"dst plane null, height 0", -1, p, {8, 0}, planesFirst ? zoxStatusNullPointer : badSize});
    }
    for (const Row& row : rows) {
        SCOPED_TRACE(std::string(name) + ": " + row.what);
        std::vector<typename Src::Sample*> sp;
        std::vector<typename Dst::Sample*> dp;
        EXPECT_EQ(callExport<C>(f, src.argWithNull(row.srcNull, sp), src.step, dst.argWithNull(row.dstNull, dp), dst.step, row.roi, 0),
                  row.want);
        EXPECT_EQ(dst.bytes(), before) << "written before validation passed";
    }
}

// Writes one source pixel through the layout's own sample positions.
template <class L>
void putPx(const typename L::Row& row, int x, int c0, int c1, int c2, int extra)
{
    using T = typename L::Sample;
    constexpr int z = sizeof(T);
    const int c[3] = {c0, c1, c2};
    if constexpr (requires { typename L::Fields; }) { // a word: each channel's top bits in its field
        using F = typename L::Fields;
        const int w = (c0 & 255) >> (8 - F::low) | ((c1 & 255) >> (8 - F::mid)) << F::low |
                      ((c2 & 255) >> (8 - F::high)) << (F::low + F::mid);
        zox::storeSample<T>(const_cast<uint8_t*>(row.p[0]) + static_cast<std::size_t>(x) * 2, w);
    } else if constexpr (L::planes == 1) {
        uint8_t* q = const_cast<uint8_t*>(row.p[0]) + static_cast<std::size_t>(x) * L::bytesPerPixel;
        for (int k = 0; k < 3; ++k)
            zox::storeSample<T>(q + z * zox::channelByte(L::order, k), c[k]);
        if constexpr (L::channels == 4)
            zox::storeSample<T>(q + 3 * z, extra);
    } else {
        for (int k = 0; k < 3; ++k)
            zox::storeSample<T>(const_cast<uint8_t*>(row.p[k]) + static_cast<std::size_t>(x) * z, c[k]);
        if constexpr (L::planes == 4)
            const_cast<uint8_t*>(row.p[3])[x] = static_cast<uint8_t>(extra);
    }
}

// Rows of 65536 words, each row every word once (row r in the order of (2r + 1) i + 12345 r).
template <class L>
void putEveryWord(Side<L>& side)
{
    for (int r = 0; r < side.planes[0]->shape().rows; ++r)
        for (int i = 0; i < 65536; ++i)
            zox::storeSample<uint16_t>(side.planes[0]->row(r) + 2 * static_cast<std::size_t>(i), static_cast<uint16_t>((2 * r + 1) * i + 12345 * r));
}

// A sample of type T spread from a byte: 0..255 as they are for 8-bit samples; for wider ones the byte
// scaled across the whole range (0 the most negative value, 255 the most positive), so that byte patterns
// reach the extremes.
template <class T>
int spreadByte(int v)
{
    if constexpr (sizeof(T) == 1)
        return v;
    else if constexpr (sizeof(T) == 2)
        return v * 257 - 32768;
    else
        return static_cast<int>(static_cast<uint32_t>(v) * 0x01010101u ^ 0x80000000u);
}

// The pixel `in` (channel order) at column x of a one-row image of width w, all other pixels zero,
// through export f; returns the destination's bytes 0..2 of that pixel (planes 0..2 when planar), so a
// BGR destination reads back reversed.
template <class Src, class Dst, class F>
std::array<int, 3> pixelAt(F f, std::array<int, 3> in, int x, int w)
{
    Rng rng(1);
    Side<Src> src(1, w, w * Src::bytesPerPixel, 0, rng);
    Side<Dst> dst(1, w, w * Dst::bytesPerPixel, 0, rng);
    const auto row = Src::row(src.arg(), src.step, 0);
    for (int i = 0; i < w; ++i)
        putPx<Src>(row, i, 0, 0, 0, 0);
    putPx<Src>(row, x, in[0], in[1], in[2], 0);
    const ImageSize roi{w, 1};
    if constexpr (std::is_invocable_v<F, typename Src::Arg, int, typename Dst::Arg, int, ImageSize, uint8_t>)
        EXPECT_EQ(f(src.arg(), src.step, dst.arg(), dst.step, roi, typename Dst::Sample{0}), zoxStatusOk);
    else
        EXPECT_EQ(f(src.arg(), src.step, dst.arg(), dst.step, roi), zoxStatusOk);
    using T = typename Dst::Sample;
    std::array<int, 3> out;
    for (int k = 0; k < 3; ++k)
        out[k] = Dst::planes == 1 ? zox::loadSample<T>(dst.planes[0]->data() + x * Dst::bytesPerPixel + k * sizeof(T))
                                  : zox::loadSample<T>(dst.planes[k]->data() + x * sizeof(T));
    return out;
}

// The kernel sets this build holds that this processor runs.
inline std::vector<zox::KernelSet> runnableKernelSets()
{
    std::vector<zox::KernelSet> sets;
    if (zox::kHaveSse41)
        sets.push_back(zox::KernelSet::Sse41);
    if (zox::kHaveAvx2 && __builtin_cpu_supports("avx2"))
        sets.push_back(zox::KernelSet::Avx2);
    return sets;
}

// Runs f.template operator()<K>() for kernel set k: the set's kernels where the build holds them, else the
// portable forms.
template <class F>
void onKernelSet(zox::KernelSet k, F&& f)
{
    if constexpr (zox::kHaveAvx2)
        if (k == zox::KernelSet::Avx2)
            return f.template operator()<zox::KernelSet::Avx2>();
    if constexpr (zox::kHaveSse41)
        if (k == zox::KernelSet::Sse41)
            return f.template operator()<zox::KernelSet::Sse41>();
    f.template operator()<zox::KernelSet::Portable>();
}

template <class C>
void rowThrough(zox::KernelSet k, const typename C::Src::Row& s, const typename C::Dst::Row& d, int width, const zox::Ctx& ctx)
{
    onKernelSet(k, [&]<zox::KernelSet K>() { zox::convertRow<C, K>(s, d, width, ctx); });
}

// Every kernel set the processor runs against the scalar forms (the portable row): one row of widths
// 1..70 and a few wider, every misalignment of the source (-1: it ends at a PROT_NONE page) and
// shifting ones of the destination, random and corner data; then every possible three-channel input
// once. Block kernels, whole-row kernels and the scalar columns behind them alike.
template <class C>
void diffKernels()
{
    using Src = typename C::Src;
    using Dst = typename C::Dst;
    const std::vector<zox::KernelSet> sets = runnableKernelSets();
    if (sets.empty())
        GTEST_SKIP() << "no SIMD kernels in this build";
    Rng rng(99);
    using T = typename Src::Sample;
    const int corners[] = {spreadByte<T>(0), spreadByte<T>(1), 16, 127, 128, 129, 235, 240, spreadByte<T>(254), spreadByte<T>(255),
                           -1, 0, 1};
    auto compare = [&](Side<Src>& src, int width, int dstMis) {
        Side<Dst> want(1, width, width * Dst::bytesPerPixel, dstMis, rng);
        Side<Dst> got(1, width, width * Dst::bytesPerPixel, dstMis, rng);
        const auto before = want.bytes();
        const zox::Ctx ctx{randomAlpha<Dst>(rng)};
        const auto s = Src::row(src.arg(), src.step, 0);
        rowThrough<C>(zox::KernelSet::Portable, s, Dst::row(want.arg(), want.step, 0), width, ctx);
        for (zox::KernelSet k : sets) {
            got.restore(before);
            rowThrough<C>(k, s, Dst::row(got.arg(), got.step, 0), width, ctx);
            for (int p = 0; p < Dst::planes; ++p)
                ASSERT_EQ(got.planes[p]->bytes(), want.planes[p]->bytes())
                    << zox::kernelSetName(k) << ": width " << width << " plane " << p;
        }
    };
    for (int i = 0; i < 76; ++i) {
        const int width = i < 70 ? i + 1 : 71 + static_cast<int>(rng() % 500);
        for (int mis = -1; mis < 16; ++mis) {
            Side<Src> src(1, width, width * Src::bytesPerPixel, mis, rng);
            if (mis % 4 == 0) {
                const auto row = Src::row(src.arg(), src.step, 0);
                for (int x = 0; x < width; ++x)
                    putPx<Src>(row, x, corners[rng() % 13], corners[rng() % 13], corners[rng() % 13], static_cast<int>(rng() & 255));
            }
            compare(src, width, (mis * 5 + width + 17) % 17 - 1);
            if (::testing::Test::HasFatalFailure())
                return;
        }
    }
    // Every input: a word source takes every word once.
    if constexpr (requires { typename Src::Fields; }) {
        Side<Src> words(1, 65536, 65536 * 2, 0, rng);
        putEveryWord<Src>(words);
        compare(words, 65536, 3);
        return;
    }
    // Every input: one row of 65536 pixels for each value of the first channel. Wider samples take the
    // same grid spread over their range, for every 17th value of the first channel (0 and 255, the
    // extremes, among them).
    Side<Src> src(1, 65536, 65536 * Src::bytesPerPixel, 0, rng);
    const auto row = Src::row(src.arg(), src.step, 0);
    // Under the sanitizers (which check memory, not values) the 17th values only.
#if defined(__SANITIZE_ADDRESS__)
    constexpr int c0Step = 17;
#else
    constexpr int c0Step = sizeof(T) == 1 ? 1 : 17;
#endif
    for (int c0 = 0; c0 < 256; c0 += c0Step) {
        for (int i = 0; i < 65536; ++i)
            putPx<Src>(row, i, spreadByte<T>(c0), spreadByte<T>(i >> 8), spreadByte<T>(i & 255), (i * 7) & 255);
        compare(src, 65536, c0 % 16);
        if (::testing::Test::HasFatalFailure())
            return;
    }
}

} // namespace zt
