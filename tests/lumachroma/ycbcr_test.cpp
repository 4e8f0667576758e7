// Values that pin the roundings, coefficient sets and column rules of RGB <-> YCbCr. The sweep of the
// generic harness checks every export against its table forms; these check that the table names the
// right forms.
#include "lumachroma/ycbcr_forms.hpp"
#include "support/conv_sweep.hpp"
#include "zoxcc.h"

#include <gtest/gtest.h>

#include <array>
#include <functional>
#include <string>

using namespace zox;

namespace {

using Triple = std::array<int, 3>;
using Form = Px (*)(const Px&);
// One pixel at column x of a one-row image of width w through an export; see atColumn.
using Export = std::function<Triple(Triple, int, int)>;

Triple run(Form f, Triple in)
{
    const Px p = f(Px{{in[0], in[1], in[2]}, 0});
    return {p.c[0], p.c[1], p.c[2]};
}

template <class Src, class Dst, class F>
Export through(F f)
{
    return [f](Triple in, int x, int w) { return zt::pixelAt<Src, Dst>(f, in, x, w); };
}

struct ExportRow {
    const char* name;
    Export f;
    int n; // block width; 1: one form in every column
};

// Block column: the last of one whole block. Remainder column: the one behind it.
Triple atBlock(const ExportRow& e, Triple in) { return e.f(in, e.n - 1, e.n); }
Triple atRemainder(const ExportRow& e, Triple in) { return e.f(in, e.n, e.n + 1); }

const ExportRow kForward[] = {
    {"RGBToYCbCr C3R", through<InC3, OutC3>(zoxiRGBToYCbCr_8u_C3R), 16},
    {"RGBToYCbCr AC4R", through<InAC4, OutAC4>(zoxiRGBToYCbCr_8u_AC4R), 1},
    {"RGBToYCbCr C3P3R", through<InC3, OutP3>(zoxiRGBToYCbCr_8u_C3P3R), 16},
    {"RGBToYCbCr AC4P3R", through<InAC4, OutP3>(zoxiRGBToYCbCr_8u_AC4P3R), 8},
    {"RGBToYCbCr P3R", through<InP3, OutP3>(zoxiRGBToYCbCr_8u_P3R), 8},
};

const ExportRow kInverse[] = {
    {"YCbCrToRGB C3R", through<InC3, OutC3>(zoxiYCbCrToRGB_8u_C3R), 4},
    {"YCbCrToRGB AC4R", through<InAC4, OutAC4>(zoxiYCbCrToRGB_8u_AC4R), 1},
    {"YCbCrToRGB P3R", through<InP3, OutP3>(zoxiYCbCrToRGB_8u_P3R), 4},
    {"YCbCrToRGB P3C3R", through<InP3, OutC3>(zoxiYCbCrToRGB_8u_P3C3R), 8},
    {"YCbCrToRGB P3C4R", through<InP3, OutC4A>(zoxiYCbCrToRGB_8u_P3C4R), 8},
    {"YCbCrToBGR P3C3R", through<InP3, OutBGR3>(zoxiYCbCrToBGR_8u_P3C3R), 16},
    {"YCbCrToBGR P3C4R", through<InP3, OutBGR4A>(zoxiYCbCrToBGR_8u_P3C4R), 16},
    {"YCbCrToBGR 709CSC P3C3R", through<InP3, OutBGR3>(zoxiYCbCrToBGR_709CSC_8u_P3C3R), 16},
    {"YCbCrToBGR 709CSC P3C4R", through<InP3, OutBGR4A>(zoxiYCbCrToBGR_709CSC_8u_P3C4R), 16},
};

} // namespace

// ---- forward ------------------------------------------------------------------------------------------

TEST(YccForms, WhiteBlackAndGrayInEveryForwardForm)
{
    const struct {
        const char* name;
        Form f;
    } forms[] = {{"matrix", &YccFromRgbMatrix::apply}, {"round", &YccFromRgbRound::apply}, {"pixel", &YccFromRgbPixel::apply}};
    for (const auto& form : forms) {
        SCOPED_TRACE(form.name);
        EXPECT_EQ(run(form.f, {255, 255, 255}), (Triple{235, 128, 128}));
        EXPECT_EQ(run(form.f, {0, 0, 0}), (Triple{16, 128, 128}));
        EXPECT_EQ(run(form.f, {128, 128, 128}), (Triple{126, 128, 128}));
    }
}

TEST(YccExports, ForwardColumnsAndPureRed)
{
    // Pure red reads one unit low in the round block form of C3R; the matrix block form and the pixel
    // remainder form agree on it.
    const Triple low{81, 90, 239}, red{82, 90, 240};
    const Triple redInBlock[] = {low, red, red, red, red};
    for (int i = 0; i < 5; ++i) {
        const ExportRow& e = kForward[i];
        SCOPED_TRACE(e.name);
        for (auto column : {atBlock, atRemainder}) {
            if (e.n == 1 && column == atBlock)
                continue;
            EXPECT_EQ(column(e, {255, 255, 255}), (Triple{235, 128, 128}));
            EXPECT_EQ(column(e, {0, 0, 0}), (Triple{16, 128, 128}));
            EXPECT_EQ(column(e, {128, 128, 128}), (Triple{126, 128, 128}));
        }
        if (e.n > 1) {
            EXPECT_EQ(atBlock(e, {255, 0, 0}), redInBlock[i]);
        }
        EXPECT_EQ(atRemainder(e, {255, 0, 0}), red);
    }
}

// ---- inverse ------------------------------------------------------------------------------------------

TEST(YccExports, LumaEndsInEveryInverseColumn)
{
    // (235, 128, 128): 254 where the column's form truncates, 255 where it rounds.
    const int top[][2] = {{255, 254}, {0, 254}, {254, 255}, {255, 254}, {255, 255},
                          {255, 255}, {255, 255}, {255, 255}, {255, 255}};
    for (int i = 0; i < 9; ++i) {
        const ExportRow& e = kInverse[i];
        SCOPED_TRACE(e.name);
        if (e.n > 1) {
            EXPECT_EQ(atBlock(e, {235, 128, 128}), (Triple{top[i][0], top[i][0], top[i][0]}));
        }
        EXPECT_EQ(atRemainder(e, {235, 128, 128}), (Triple{top[i][1], top[i][1], top[i][1]}));
        // Y 16 is black, and so is everything below it: no wrap-around.
        for (int y = 0; y <= 16; ++y) {
            if (e.n > 1) {
                EXPECT_EQ(atBlock(e, {y, 128, 128}), (Triple{0, 0, 0})) << "Y " << y;
            }
            EXPECT_EQ(atRemainder(e, {y, 128, 128}), (Triple{0, 0, 0})) << "Y " << y;
        }
    }
}

TEST(YccExports, InverseRoundingAndSetPerColumn)
{
    // Each input tells two candidates apart: rounded against truncated, block set A against B, green by
    // sum against difference, pixel set A against B, BT.709 against BT.601. BGR rows read back B, G, R.
    enum { C3R, AC4R, P3R, P3C3R, P3C4R, BGR_P3C3R, BGR_P3C4R, BGR709_P3C3R, BGR709_P3C4R };
    const struct {
        int exp;
        bool block;
        Triple in, want;
    } rows[] = {
        {C3R, true, {145, 54, 34}, {0, 255, 1}},     // rounded block
        {C3R, false, {145, 54, 34}, {0, 255, 0}},    // truncated remainder
        {P3C3R, true, {145, 54, 34}, {0, 255, 1}},
        {P3C3R, false, {145, 54, 34}, {0, 255, 0}},
        {C3R, true, {100, 97, 94}, {43, 137, 35}},   // block set A
        {P3C3R, true, {100, 97, 94}, {43, 138, 35}}, // block set B
        {P3C3R, true, {100, 95, 95}, {45, 137, 31}}, // green by sum
        {P3C4R, true, {100, 95, 95}, {45, 138, 31}}, // green by difference
        {BGR_P3C3R, true, {100, 95, 95}, {31, 137, 45}},
        {BGR_P3C3R, false, {100, 95, 95}, {31, 137, 45}},
        {BGR_P3C4R, true, {100, 95, 95}, {31, 138, 45}},
        {BGR_P3C4R, false, {100, 95, 95}, {31, 138, 45}},
        {BGR709_P3C3R, true, {100, 97, 94}, {32, 122, 37}},
        {BGR709_P3C3R, false, {100, 97, 94}, {32, 122, 37}},
        {BGR709_P3C4R, true, {100, 97, 94}, {32, 123, 37}},
        {BGR709_P3C4R, false, {100, 97, 94}, {32, 123, 37}},
        {C3R, false, {100, 97, 107}, {64, 127, 35}},   // pixel set A, truncated
        {AC4R, false, {100, 97, 107}, {64, 127, 35}},
        {P3C3R, false, {100, 97, 107}, {64, 126, 35}}, // pixel set B, truncated
        {P3R, true, {100, 97, 107}, {64, 126, 35}},    // block set A, truncated
        {P3R, false, {100, 97, 107}, {64, 127, 35}},   // pixel set A, rounded
        {P3C4R, false, {100, 97, 94}, {44, 138, 35}},  // pixel set B, rounded
    };
    for (const auto& row : rows) {
        const ExportRow& e = kInverse[row.exp];
        SCOPED_TRACE(std::string(e.name) + (row.block ? " block" : " remainder"));
        EXPECT_EQ(row.block ? atBlock(e, row.in) : atRemainder(e, row.in), row.want)
            << row.in[0] << "," << row.in[1] << "," << row.in[2];
    }
}
