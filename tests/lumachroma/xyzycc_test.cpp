// Values that pin the forms and column rules of RGB <-> XYZ and RGB <-> YCC.
#include "lumachroma/xyzycc_table.hpp"
#include "support/conv_sweep.hpp"
#include "zoxcc.h"

#include <gtest/gtest.h>

#include <array>
#include <cmath>

using namespace zox;

namespace {

using Triple = std::array<int, 3>;

// The pixel at column x of a row of width w (all others black) through an 8u C3R member.
template <class F>
Triple at8u(F f, Triple in, int x, int w)
{
    return zt::pixelAt<InC3, OutC3>(f, in, x, w);
}

std::array<float, 3> one32f(zoxStatus (*f)(const float*, int, float*, int, ImageSize), std::array<float, 3> in)
{
    std::array<float, 3> out{};
    EXPECT_EQ(f(in.data(), 12, out.data(), 12, ImageSize{1, 1}), zoxStatusOk);
    return out;
}

} // namespace

TEST(XyzYcc8u, BlockAndRemainderColumns)
{
    struct Row {
        const char* what;
        zoxStatus (*f)(const uint8_t*, int, uint8_t*, int, ImageSize);
        Triple in, block, remainder;
    } rows[] = {
        {"XYZ of white: Z cut from 277", zoxiRGBToXYZ_8u_C3R, {255, 255, 255}, {242, 255, 255}, {242, 254, 255}},
        {"XYZ of red", zoxiRGBToXYZ_8u_C3R, {255, 0, 0}, {105, 54, 4}, {105, 54, 4}},
        {"YCC of white", zoxiRGBToYCC_8u_C3R, {255, 255, 255}, {181, 156, 137}, {181, 156, 137}},
        {"YCC of black", zoxiRGBToYCC_8u_C3R, {0, 0, 0}, {0, 156, 137}, {0, 156, 137}},
        {"YCC of red", zoxiRGBToYCC_8u_C3R, {255, 0, 0}, {54, 122, 232}, {54, 122, 232}},
        {"YCC of blue", zoxiRGBToYCC_8u_C3R, {0, 0, 255}, {20, 254, 121}, {20, 254, 121}},
        {"white's YCC back does not reach 255", zoxiYCCToRGB_8u_C3R, {182, 156, 137}, {247, 247, 247}, {247, 247, 247}},
    };
    for (const Row& r : rows) {
        EXPECT_EQ(at8u(r.f, r.in, 0, 8), r.block) << r.what << ": block column";
        EXPECT_EQ(at8u(r.f, r.in, 8, 9), r.remainder) << r.what << ": remainder column";
    }
}

TEST(XyzYcc16, NearestTiesToEven)
{
    const struct {
        float v;
        int want;
    } rows[] = {{2.5f, 2}, {3.5f, 4}, {-2.5f, -2}, {-3.5f, -4}, {0.49999f, 0}, {40092.5f, 40092}, {40093.5f, 40094}, {1.5f, 2}};
    for (const auto& r : rows)
        EXPECT_EQ(xyzycc::nearestEven(r.v), r.want) << r.v;
}

TEST(XyzYcc32f, OnlyTheStatedLimits)
{
    const auto white = one32f(zoxiRGBToXYZ_32f_C3R, {1, 1, 1});
    EXPECT_EQ(white[2], 1.0f) << "Z is limited";
    EXPECT_NEAR(white[0], 0.950456f, 1e-6f);
    const auto twice = one32f(zoxiRGBToXYZ_32f_C3R, {2, 2, 2});
    EXPECT_GT(twice[0], white[0]);
    EXPECT_GT(twice[1], white[1]);
    EXPECT_EQ(twice[2], 1.0f);
    const auto back = one32f(zoxiYCCToRGB_32f_C3R, {2, 0, 2});
    for (float v : back)
        EXPECT_TRUE(v >= 0.0f && v <= 1.0f) << v;
    const auto ycc = one32f(zoxiRGBToYCC_32f_C3R, {-1, 2, 3});
    EXPECT_GT(ycc[1], 1.0f) << "RGBToYCC limits nothing";
}
