// Gray exports: every member's kernels and export against its scalar rows, the values that pin the
// fixed point and the rounding, and the check order.
#include "frame/exports.hpp"
#include "support/point_sweep.hpp"

#include <gtest/gtest.h>

#include <cmath>
#include <vector>

using namespace zox;

namespace {

// The export with the call's weights or alpha where it takes them, and the parameters it must then use.
template <class M, class F>
zoxStatus callGray(F f, const zt::PointImages& im, ImageSize roi, const float* wf, const double* wd, typename M::D alpha)
{
    auto* s = reinterpret_cast<const typename M::S*>(im.srcPtr[0]);
    auto* d = reinterpret_cast<typename M::D*>(im.dstPtr[0]);
    if constexpr (std::is_invocable_v<F, decltype(s), int, decltype(d), int, ImageSize, const float*>)
        return f(s, im.srcStep, d, im.dstStep, roi, wf);
    else if constexpr (std::is_invocable_v<F, decltype(s), int, decltype(d), int, ImageSize, const double*>)
        return f(s, im.srcStep, d, im.dstStep, roi, wd);
    else if constexpr (std::is_invocable_v<F, decltype(s), int, decltype(d), int, ImageSize, typename M::D>)
        return f(s, im.srcStep, d, im.dstStep, roi, alpha);
    else
        return f(s, im.srcStep, d, im.dstStep, roi);
}

template <class M, class F>
gray::Params paramsFor(F, const float* wf, const double* wd, typename M::D alpha)
{
    using S = const typename M::S*;
    using D = typename M::D*;
    if constexpr (std::is_invocable_v<F, S, int, D, int, ImageSize, const float*>)
        return gray::paramsOf(wf);
    else if constexpr (std::is_invocable_v<F, S, int, D, int, ImageSize, const double*>)
        return gray::paramsOf(wd);
    else if constexpr (std::is_invocable_v<F, S, int, D, int, ImageSize, typename M::D>)
        return gray::paramsWithAlpha(alpha);
    return gray::paramsOf(static_cast<const float*>(nullptr));
}

template <class M, class F>
void sweep(F f)
{
    zt::Rng rng(77);
    // Weights around the fixed set, sometimes negative or summing above 1 (saturation in the blocks).
    float wf[3];
    double wd[3];
    for (int k = 0; k < 3; ++k) {
        wf[k] = static_cast<float>(static_cast<int>(rng() % 1400) - 200) / 1000.0f;
        wd[k] = wf[k];
    }
    const auto alpha = static_cast<typename M::D>(rng() % 200);
    const gray::Params p = paramsFor<M>(f, wf, wd, alpha);
    zt::pointSweep(zt::pointSide<typename M::S>(1, M::stride), zt::pointSide<typename M::D>(1, M::outStride), false, true,
                   [&](zt::PointImages& im, ImageSize roi, zt::PointRun run, KernelSet k) {
                       if (run == zt::PointRun::Export)
                           ASSERT_EQ(callGray<M>(f, im, roi, wf, wd, alpha), zoxStatusOk);
                       else
                           zt::onKernelSet(k, [&]<KernelSet K>() {
                               grayRows<M, K>(im.srcPtr[0], im.srcStep, im.dstPtr[0], im.dstStep, roi, p);
                           });
                   });
}

#define ZT_GRAY_SWEEP(name, shape, M) \
    TEST(GraySweep, name) { sweep<M>(name); }
ZOX_GRAY_TABLE(ZT_GRAY_SWEEP)
#undef ZT_GRAY_SWEEP

// One pixel of an 8u reducer at column x of a row of `w` equal pixels.
template <class F>
uint8_t gray8(F f, int ch, int w, int x, std::array<uint8_t, 3> px, const float* coeffs = nullptr)
{
    std::vector<uint8_t> src(static_cast<std::size_t>(w) * ch), dst(w);
    for (int i = 0; i < w; ++i)
        for (int k = 0; k < 3; ++k)
            src[static_cast<std::size_t>(i) * ch + k] = px[k];
    zoxStatus st;
    if constexpr (std::is_invocable_v<F, const uint8_t*, int, uint8_t*, int, ImageSize, const float*>)
        st = f(src.data(), w * ch, dst.data(), w, ImageSize{w, 1}, coeffs);
    else
        st = f(src.data(), w * ch, dst.data(), w, ImageSize{w, 1});
    EXPECT_EQ(st, zoxStatusOk);
    return dst[x];
}

TEST(GrayPinned, FixedPointBlocksAndTails)
{
    // From C3 the block columns are w & ~3: at width 11 columns 8..10 are the tail, at 12 none is.
    for (int x : {0, 7, 10}) {
        EXPECT_EQ(gray8(zoxiRGBToGray_8u_C3C1R, 3, 11, x, {255, 255, 255}), 255);
        EXPECT_EQ(gray8(zoxiRGBToGray_8u_C3C1R, 3, 11, x, {0, 0, 0}), 0);
        EXPECT_EQ(gray8(zoxiRGBToGray_8u_C3C1R, 3, 11, x, {1, 1, 1}), 1);
    }
    EXPECT_EQ(gray8(zoxiRGBToGray_8u_C3C1R, 3, 11, 3, {0, 6, 70}), 11);  // block
    EXPECT_EQ(gray8(zoxiRGBToGray_8u_C3C1R, 3, 11, 9, {0, 6, 70}), 12);  // tail
    EXPECT_EQ(gray8(zoxiRGBToGray_8u_C3C1R, 3, 12, 9, {0, 6, 70}), 11);  // the block of 4
    EXPECT_EQ(gray8(zoxiRGBToGray_8u_AC4C1R, 4, 12, 9, {0, 6, 70}), 12); // AC4: blocks of 8 only
    // Weights adding up to 1.5 on white: a block's sum passes 32767 and reads as negative; the tail
    // keeps the low byte of the exact result (255 x 49152 + 16384) >> 15 = 383.
    const float heavy[3] = {0.5f, 0.5f, 0.5f};
    EXPECT_EQ(gray8(zoxiColorToGray_8u_C3C1R, 3, 9, 0, {255, 255, 255}, heavy), 0);
    EXPECT_EQ(gray8(zoxiColorToGray_8u_C3C1R, 3, 9, 8, {255, 255, 255}, heavy), 383 & 255);
    // A negative weight counts as a large positive one in Q15.
    EXPECT_EQ(gray::q15Of(-0.5f), 0xC001); // -16383.5 truncated towards 0
    EXPECT_EQ(gray::q15Of(1e20f), 0);
}

TEST(GrayPinned, DepthsAndWeights)
{
    const int16_t black[3] = {-32768, -32768, -32768};
    int16_t g16 = 0;
    ASSERT_EQ(zoxiRGBToGray_16s_C3C1R(black, 6, &g16, 2, {1, 1}), zoxStatusOk);
    EXPECT_EQ(g16, -32768);
    const float px[6] = {0.25f, 0.5f, 0.75f, 1.0f, 2.0f, 3.0f};
    float fixed[2], viaNull[2];
    ASSERT_EQ(zoxiRGBToGray_32f_C3C1R(px, 12, fixed, 8, {2, 1}), zoxStatusOk);
    ASSERT_EQ(zoxiColorToGray_32f_C3C1R(px, 12, viaNull, 8, {2, 1}, nullptr), zoxStatusOk);
    EXPECT_EQ(std::memcmp(fixed, viaNull, sizeof fixed), 0);
    // 64f from C3, destination off 16 bytes: pixel 0 alone, then pairs whose second sums the last two
    // products first. 1 x 1 + (2^-53 x 1 + 2^-53 x 1) = 1 + 2^-52, the other grouping 1.
    alignas(16) double out[4];
    const double e = std::ldexp(1.0, -53);
    const double src[9] = {1, e, e, 1, e, e, 1, e, e};
    const double ones[3] = {1, 1, 1};
    ASSERT_EQ(zoxiColorToGray_64f_C3C1R(src, 24, out + 1, 24, {3, 1}, ones), zoxStatusOk);
    EXPECT_EQ(out[1], 1.0);
    EXPECT_EQ(out[2], 1.0);
    EXPECT_EQ(out[3], 1.0 + 2 * e);
    ASSERT_EQ(zoxiColorToGray_64f_C3C1R(src, 24, out, 24, {3, 1}, ones), zoxStatusOk);
    EXPECT_EQ(out[0], 1.0);
    EXPECT_EQ(out[1], 1.0 + 2 * e);
    EXPECT_EQ(out[2], 1.0);
    // Null weights at 64f: the fixed set widened from C3, rejected from AC4.
    ASSERT_EQ(zoxiColorToGray_64f_C3C1R(src, 24, out, 24, {1, 1}, nullptr), zoxStatusOk);
    EXPECT_EQ(out[0], (1.0 * 0.29899999499320984 + e * 0.5870000123977661) + e * 0.11400000005960464);
    EXPECT_EQ(zoxiColorToGray_64f_AC4C1R(src, 32, out, 8, {1, 1}, nullptr), zoxStatusNullPointer);
    // Gray to colour with alpha, block and tail alike; luma bytes of 4:2:2.
    const uint8_t g[9] = {1, 2, 3, 4, 5, 6, 7, 8, 9};
    uint8_t rgba[36];
    ASSERT_EQ(zoxiGrayToRGB_8u_C1C4R(g, 9, rgba, 36, {9, 1}, 200), zoxStatusOk);
    for (int x = 0; x < 9; ++x)
        EXPECT_EQ((std::array<int, 4>{rgba[4 * x], rgba[4 * x + 1], rgba[4 * x + 2], rgba[4 * x + 3]}),
                  (std::array<int, 4>{x + 1, x + 1, x + 1, 200}));
    const uint8_t yuyv[6] = {10, 128, 20, 128, 30, 128};
    uint8_t y[3];
    ASSERT_EQ(zoxiYCbCr422ToGray_8u_C2C1R(yuyv, 6, y, 3, {3, 1}), zoxStatusOk);
    EXPECT_EQ((std::array<int, 3>{y[0], y[1], y[2]}), (std::array<int, 3>{10, 20, 30}));
}

TEST(GrayValidation, PointersThenSizes)
{
    uint8_t s[12] = {}, d[4] = {7, 7, 7, 7};
    const float c[3] = {1, 0, 0};
    EXPECT_EQ(zoxiRGBToGray_8u_C3C1R(nullptr, 3, d, 1, {0, 0}), zoxStatusNullPointer);
    EXPECT_EQ(zoxiRGBToGray_8u_C3C1R(s, 3, nullptr, 1, {1, 1}), zoxStatusNullPointer);
    EXPECT_EQ(zoxiRGBToGray_8u_C3C1R(s, 3, d, 1, {0, 1}), zoxStatusBadSize);
    EXPECT_EQ(zoxiColorToGray_8u_AC4C1R(s, 4, d, 1, {1, 0}, c), zoxStatusBadSize);
    EXPECT_EQ(zoxiGrayToRGB_8u_C1C4R(nullptr, 1, d, 4, {1, 1}, 1), zoxStatusNullPointer);
    EXPECT_EQ(zoxiYCbCr422ToGray_8u_C2C1R(s, 2, d, 1, {1, -1}), zoxStatusBadSize);
    EXPECT_EQ((std::array<int, 4>{d[0], d[1], d[2], d[3]}), (std::array<int, 4>{7, 7, 7, 7}));
}

} // namespace
