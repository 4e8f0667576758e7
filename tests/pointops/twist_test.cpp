// Colour twist exports: every member's kernels and export against its scalar rows (in place too), the
// values that pin the limits and the rounding, the caller's rounding mode, and the check order.
#include "frame/exports.hpp"
#include "support/point_sweep.hpp"

#include <gtest/gtest.h>

#include <cfenv>
#include <cmath>
#include <limits>
#include <vector>

using namespace zox;

namespace {

template <class M, class T, class F>
zoxStatus callTwist(F f, const zt::PointImages& im, ImageSize roi, const float (*t)[4])
{
    if constexpr (std::is_invocable_v<F, const T*, int, T*, int, ImageSize, const float(*)[4]>)
        return f(reinterpret_cast<const T*>(im.srcPtr[0]), im.srcStep, reinterpret_cast<T*>(im.dstPtr[0]), im.dstStep, roi, t);
    else if constexpr (std::is_invocable_v<F, T*, int, ImageSize, const float(*)[4]>)
        return f(reinterpret_cast<T*>(im.srcPtr[0]), im.srcStep, roi, t);
    else if constexpr (std::is_invocable_v<F, const T* const*, int, T* const*, int, ImageSize, const float(*)[4]>)
        return f(reinterpret_cast<const T* const*>(im.srcPtr.data()), im.srcStep, reinterpret_cast<T* const*>(im.dstPtr.data()),
                 im.dstStep, roi, t);
    else
        return f(reinterpret_cast<T* const*>(im.srcPtr.data()), im.srcStep, roi, t);
}

template <class M, class T, class F>
void sweep(F f)
{
    using L = typename M::Layout;
    constexpr bool inPlace = std::is_invocable_v<F, T*, int, ImageSize, const float(*)[4]> ||
                             std::is_invocable_v<F, T* const*, int, ImageSize, const float(*)[4]>;
    // A matrix that mixes the channels and reaches past both limits of the integer depths.
    const double range = std::is_same_v<T, float> ? 1.0 : std::is_same_v<T, uint8_t> || std::is_same_v<T, int8_t> ? 255.0 : 65535.0;
    zt::Rng rng(5);
    float t[4][4];
    for (auto& row : t) {
        for (int j = 0; j < 3; ++j)
            row[j] = static_cast<float>(static_cast<int>(rng() % 3000) - 1000) / 1000.0f;
        row[3] = static_cast<float>((static_cast<int>(rng() % 1000) - 400) / 1000.0 * range);
    }
    const twist::Matrix m = twist::matrixOf(t[0], M::rows);
    const int planes = L::planes;
    const auto side = zt::pointSide<T>(planes, planes == 3 ? 1 : L::stride);
    zt::pointSweep(side, side, inPlace, false, [&](zt::PointImages& im, ImageSize roi, zt::PointRun run, KernelSet k) {
        if (run == zt::PointRun::Export) {
            ASSERT_EQ((callTwist<M, T>(f, im, roi, t)), zoxStatusOk);
            return;
        }
        std::vector<const uint8_t*> s(im.srcPtr.begin(), im.srcPtr.end());
        zt::onKernelSet(k, [&]<KernelSet K>() { twistRows<M, K>(s.data(), im.srcStep, im.dstPtr.data(), im.dstStep, roi, m); });
    });
}

#define ZT_TWIST_SWEEP(name, shape, T, M) \
    TEST(TwistSweep, name) { sweep<M, T>(name); }
ZOX_TWIST_TABLE(ZT_TWIST_SWEEP)
#undef ZT_TWIST_SWEEP

// Pixel 0 of a C3 row of `w` equal pixels through an out-of-place member.
template <class T, class F>
std::array<T, 3> twistOne(F f, std::array<T, 3> px, const float (&t)[3][4], int w = 1)
{
    std::vector<T> src(3 * static_cast<std::size_t>(w)), dst(src.size());
    for (int i = 0; i < w; ++i)
        for (int k = 0; k < 3; ++k)
            src[3 * static_cast<std::size_t>(i) + k] = px[k];
    const int step = w * 3 * static_cast<int>(sizeof(T));
    EXPECT_EQ(f(src.data(), step, dst.data(), step, ImageSize{w, 1}, t), zoxStatusOk);
    for (int i = 1; i < w; ++i)
        for (int k = 0; k < 3; ++k)
            EXPECT_EQ(std::memcmp(&dst[3 * static_cast<std::size_t>(i) + k], &dst[k], sizeof(T)), 0) << "pixel " << i;
    return {dst[0], dst[1], dst[2]};
}

constexpr float kIdentity[3][4] = {{1, 0, 0, 0}, {0, 1, 0, 0}, {0, 0, 1, 0}};

TEST(TwistPinned, LimitsAndRounding)
{
    // Identity at every depth; 40 pixels run through the kernels and the scalar rows alike.
    EXPECT_EQ(twistOne<uint8_t>(zoxiColorTwist32f_8u_C3R, {0, 128, 255}, kIdentity, 40), (std::array<uint8_t, 3>{0, 128, 255}));
    EXPECT_EQ(twistOne<int8_t>(zoxiColorTwist32f_8s_C3R, {-128, 0, 127}, kIdentity, 40), (std::array<int8_t, 3>{-128, 0, 127}));
    EXPECT_EQ(twistOne<uint16_t>(zoxiColorTwist32f_16u_C3R, {0, 40000, 65535}, kIdentity, 40),
              (std::array<uint16_t, 3>{0, 40000, 65535}));
    EXPECT_EQ(twistOne<int16_t>(zoxiColorTwist32f_16s_C3R, {-32768, 5, 32767}, kIdentity, 40),
              (std::array<int16_t, 3>{-32768, 5, 32767}));
    EXPECT_EQ(twistOne<float>(zoxiColorTwist_32f_C3R, {-0.5f, 1e30f, 3.25f}, kIdentity, 40),
              (std::array<float, 3>{-0.5f, 1e30f, 3.25f}));
    // Halves round to even; offsets saturate; 8s goes through the integer saturation.
    const float half[3][4] = {{0.5f, 0, 0, 0}, {0, 0.5f, 0, 0}, {0, 0, 0, 1000}};
    EXPECT_EQ(twistOne<uint8_t>(zoxiColorTwist32f_8u_C3R, {1, 3, 0}, half, 40), (std::array<uint8_t, 3>{0, 2, 255}));
    const float down[3][4] = {{0, 0, 0, -1000}, {0, 0, 0, -1e20f}, {0, 0, 0, 1e20f}};
    EXPECT_EQ(twistOne<uint8_t>(zoxiColorTwist32f_8u_C3R, {9, 9, 9}, down, 40), (std::array<uint8_t, 3>{0, 0, 255}));
    EXPECT_EQ(twistOne<int8_t>(zoxiColorTwist32f_8s_C3R, {9, 9, 9}, down, 40), (std::array<int8_t, 3>{-128, -128, 127}));
    // A NaN sum takes the upper limit; infinities the limit of their sign.
    const float nan = std::numeric_limits<float>::quiet_NaN(), inf = std::numeric_limits<float>::infinity();
    const float odd[3][4] = {{nan, 0, 0, 0}, {0, 0, 0, inf}, {0, 0, 0, -inf}};
    EXPECT_EQ(twistOne<uint8_t>(zoxiColorTwist32f_8u_C3R, {1, 1, 1}, odd, 40), (std::array<uint8_t, 3>{255, 255, 0}));
    EXPECT_EQ(twistOne<int8_t>(zoxiColorTwist32f_8s_C3R, {1, 1, 1}, odd, 40), (std::array<int8_t, 3>{127, 127, -128}));
    EXPECT_EQ(twistOne<uint16_t>(zoxiColorTwist32f_16u_C3R, {1, 1, 1}, odd, 40), (std::array<uint16_t, 3>{65535, 65535, 0}));
    EXPECT_EQ(twistOne<int16_t>(zoxiColorTwist32f_16s_C3R, {1, 1, 1}, odd, 40), (std::array<int16_t, 3>{32767, 32767, -32768}));
    // The 8s grouping adds the offset last: (1e8 x 1 + 1 x 1) + -1e8 is 0, the other grouping 1.
    const float big[3][4] = {{1e8f, 1, 0, -1e8f}, {0, 1, 0, 0}, {0, 0, 1, 0}};
    EXPECT_EQ(twistOne<int8_t>(zoxiColorTwist32f_8s_C3R, {1, 1, 1}, big)[0], 0);
    EXPECT_EQ(twistOne<uint8_t>(zoxiColorTwist32f_8u_C3R, {1, 1, 1}, big)[0], 1);
}

TEST(TwistPinned, CallersRoundingMode)
{
    // Integer depths round to nearest whatever the mode and put the mode back; 32f follows it.
    const float half[3][4] = {{0.5f, 0, 0, 0}, {0, 1, 0, 0}, {0, 0, 1, 0}};
    const float tenth[3][4] = {{0.1f, 0, 0, 0.5f}, {0, 1, 0, 0}, {0, 0, 1, 0}};
    for (int mode : {FE_UPWARD, FE_DOWNWARD, FE_TOWARDZERO}) {
        ASSERT_EQ(std::fesetround(mode), 0);
        const auto a = twistOne<uint8_t>(zoxiColorTwist32f_8u_C3R, {3, 0, 0}, half, 40);
        const auto b = twistOne<float>(zoxiColorTwist_32f_C3R, {1, 0, 0}, tenth, 40);
        EXPECT_EQ(std::fegetround(), mode);
        volatile float x = 0.5f, y = 0.1f;
        const float inMode = (x + y) + 0.0f; // 0.5 + 0.1f is not a float: the mode decides
        std::fesetround(FE_TONEAREST);
        EXPECT_EQ(a[0], 2) << mode; // 1.5 to even
        EXPECT_EQ(b[0], inMode) << mode;
    }
}

TEST(TwistPinned, StreamingRowsGiveTheSameSamples)
{
    // 130 x 100 pixels pass 34992 samples: written past the caches, from destinations off 16 bytes too.
    const int w = 130, h = 100;
    zt::Rng rng(3);
    std::vector<float> src(static_cast<std::size_t>(w + 1) * 3 * h);
    for (float& v : src)
        v = static_cast<float>(rng() % 1000) / 7.0f;
    const float t[3][4] = {{0.5f, 0.25f, 0.125f, 1}, {1, 2, 3, 4}, {-1, 0.5f, 0.75f, -2}};
    for (int pad : {0, 12})
        for (int off : {0, 4, 8, 12}) {
            const int step = w * 12 + pad;
            std::vector<uint8_t> got(static_cast<std::size_t>(step) * h + 16), want(got.size());
            const uint8_t* s[1] = {reinterpret_cast<const uint8_t*>(src.data())};
            uint8_t* d[1] = {want.data() + off};
            twistRows<twist::Twist32fC3, KernelSet::Portable>(s, step, d, step, {w, h}, twist::matrixOf(t[0], 3));
            ASSERT_EQ(zoxiColorTwist_32f_C3R(src.data(), step, reinterpret_cast<float*>(got.data() + off), step, {w, h}, t),
                      zoxStatusOk);
            EXPECT_EQ(got, want) << "pad " << pad << " offset " << off;
        }
}

// Each in-place member against its out-of-place twin on the same random image (41 x 3, steps padded).
template <class T, class Out, class In>
void inPlaceTwin(Out out, In in, int samples) // samples a pixel; 1: three planes
{
    const bool planar = samples == 1;
    const int w = 41, h = 3;
    zt::Rng rng(9);
    const int count = planar ? 3 : 1, rowSamples = w * samples + 5, step = rowSamples * static_cast<int>(sizeof(T));
    std::vector<T> src(static_cast<std::size_t>(rowSamples) * h * count), dst(src.size(), T{}), self;
    for (T& v : src)
        v = std::is_floating_point_v<T> ? static_cast<T>(rng() % 512) : static_cast<T>(rng());
    self = src;
    const float t[3][4] = {{0.5f, 0.75f, -0.25f, 3}, {1.5f, 0, 0.5f, -7}, {0.25f, 0.25f, 0.25f, 1}};
    if (planar) {
        const std::size_t plane = src.size() / 3;
        const T* s[3] = {src.data(), src.data() + plane, src.data() + 2 * plane};
        T* d[3] = {dst.data(), dst.data() + plane, dst.data() + 2 * plane};
        T* io[3] = {self.data(), self.data() + plane, self.data() + 2 * plane};
        if constexpr (std::is_invocable_v<Out, const T* const*, int, T* const*, int, ImageSize, const float(*)[4]>) {
            ASSERT_EQ(out(s, step, d, step, {w, h}, t), zoxStatusOk);
            ASSERT_EQ(in(io, step, {w, h}, t), zoxStatusOk);
        }
    } else if constexpr (std::is_invocable_v<Out, const T*, int, T*, int, ImageSize, const float(*)[4]>) {
        dst = src; // the fourth sample of AC4 is kept on both sides
        ASSERT_EQ(out(src.data(), step, dst.data(), step, {w, h}, t), zoxStatusOk);
        ASSERT_EQ(in(self.data(), step, {w, h}, t), zoxStatusOk);
    }
    // Row padding is written by neither.
    for (std::size_t i = 0; i < src.size(); ++i)
        if (i % rowSamples >= static_cast<std::size_t>(rowSamples - 5))
            dst[i] = src[i];
    EXPECT_EQ(std::memcmp(dst.data(), self.data(), dst.size() * sizeof(T)), 0);
}

TEST(TwistPinned, InPlaceEqualsOutOfPlace)
{
    inPlaceTwin<uint8_t>(zoxiColorTwist32f_8u_C3R, zoxiColorTwist32f_8u_C3IR, 3);
    inPlaceTwin<uint8_t>(zoxiColorTwist32f_8u_AC4R, zoxiColorTwist32f_8u_AC4IR, 4);
    inPlaceTwin<uint8_t>(zoxiColorTwist32f_8u_P3R, zoxiColorTwist32f_8u_IP3R, 1);
    inPlaceTwin<int8_t>(zoxiColorTwist32f_8s_C3R, zoxiColorTwist32f_8s_C3IR, 3);
    inPlaceTwin<int8_t>(zoxiColorTwist32f_8s_P3R, zoxiColorTwist32f_8s_IP3R, 1);
    inPlaceTwin<uint16_t>(zoxiColorTwist32f_16u_AC4R, zoxiColorTwist32f_16u_AC4IR, 4);
    inPlaceTwin<int16_t>(zoxiColorTwist32f_16s_C3R, zoxiColorTwist32f_16s_C3IR, 3);
    inPlaceTwin<float>(zoxiColorTwist_32f_C3R, zoxiColorTwist_32f_C3IR, 3);
    inPlaceTwin<float>(zoxiColorTwist_32f_AC4R, zoxiColorTwist_32f_AC4IR, 4);
    inPlaceTwin<float>(zoxiColorTwist_32f_P3R, zoxiColorTwist_32f_IP3R, 1);
}

TEST(TwistPinned, FourByFour)
{
    // Channel 3 summed into channel 0; channel 3 transformed by the fourth row.
    const float m[4][4] = {{1, 0, 0, 2}, {0, 1, 0, 0}, {0, 0, 1, 0}, {0, 0, 0, 0.5f}};
    const float src[8] = {1, 2, 3, 4, 5, 6, 7, 8};
    float dst[8];
    ASSERT_EQ(zoxiColorTwist_32f_C4R(src, 32, dst, 32, {2, 1}, m), zoxStatusOk);
    const float want[8] = {9, 2, 3, 2, 21, 6, 7, 4};
    EXPECT_EQ(std::memcmp(dst, want, sizeof want), 0);
}

TEST(TwistValidation, PointersSizesSteps)
{
    uint8_t s[16] = {}, d[16] = {5, 5, 5};
    uint8_t* planes[3] = {d, d + 4, nullptr};
    EXPECT_EQ(zoxiColorTwist32f_8u_C3R(s, 0, d, 0, {0, 0}, nullptr), zoxStatusNullPointer);
    EXPECT_EQ(zoxiColorTwist32f_8u_C3R(nullptr, 3, d, 3, {1, 1}, kIdentity), zoxStatusNullPointer);
    EXPECT_EQ(zoxiColorTwist32f_8u_IP3R(planes, 0, {0, 0}, kIdentity), zoxStatusNullPointer);
    EXPECT_EQ(zoxiColorTwist32f_8u_IP3R(nullptr, 3, {1, 1}, kIdentity), zoxStatusNullPointer);
    EXPECT_EQ(zoxiColorTwist32f_8u_C3R(s, 0, d, 0, {0, 1}, kIdentity), zoxStatusBadSize);
    EXPECT_EQ(zoxiColorTwist32f_8u_C3R(s, 0, d, 3, {1, 1}, kIdentity), zoxStatusBadStep);
    EXPECT_EQ(zoxiColorTwist32f_16s_AC4IR(reinterpret_cast<int16_t*>(d), -8, {1, 1}, kIdentity), zoxStatusBadStep);
    EXPECT_EQ(zoxiColorTwist_32f_C4R(reinterpret_cast<float*>(s), 16, reinterpret_cast<float*>(d), 0, {1, 1},
                                     reinterpret_cast<const float(*)[4]>(kIdentity)),
              zoxStatusBadStep);
    EXPECT_EQ((std::array<int, 3>{d[0], d[1], d[2]}), (std::array<int, 3>{5, 5, 5}));
}

} // namespace
