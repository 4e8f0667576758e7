// Values that pin the roundings and column rules of RGB <-> YUV.
#include "lumachroma/yuv_forms.hpp"
#include "support/conv_sweep.hpp"
#include "zoxcc.h"

#include <gtest/gtest.h>

#include <array>

using namespace zox;

namespace {

using Triple = std::array<int, 3>;

template <class Form>
Triple run(Triple in)
{
    const Px p = Form::apply(Px{{in[0], in[1], in[2]}, 0});
    return {p.c[0], p.c[1], p.c[2]};
}

Triple rgbToYuv(Triple in, int x, int w)
{
    return zt::pixelAt<InC3, OutC3>(zoxiRGBToYUV_8u_C3R, in, x, w);
}
Triple yuvToRgb(Triple in, int x, int w)
{
    return zt::pixelAt<InC3, OutC3>(zoxiYUVToRGB_8u_C3R, in, x, w);
}

} // namespace

TEST(YuvForms, WhiteAndBlackInEveryForwardForm)
{
    struct Row {
        const char* form;
        Triple white, black;
    } rows[] = {
        {"matrix", run<YuvFromRgbMatrix>({255, 255, 255}), run<YuvFromRgbMatrix>({0, 0, 0})},
        {"difference low", run<YuvFromRgbDifferenceLow>({255, 255, 255}), run<YuvFromRgbDifferenceLow>({0, 0, 0})},
        {"difference full", run<YuvFromRgbDifferenceFull>({255, 255, 255}), run<YuvFromRgbDifferenceFull>({0, 0, 0})},
        {"plane", run<YuvFromRgbPlane>({255, 255, 255}), run<YuvFromRgbPlane>({0, 0, 0})},
        {"half", run<YuvFromRgbHalf>({255, 255, 255}), run<YuvFromRgbHalf>({0, 0, 0})},
    };
    const Triple wantWhite[] = {{254, 127, 127}, {255, 128, 128}, {255, 128, 128}, {254, 128, 128}, {255, 128, 128}};
    const Triple wantBlack[] = {{0, 128, 128}, {0, 128, 128}, {0, 128, 128}, {0, 128, 128}, {0, 127, 127}};
    for (int i = 0; i < 5; ++i) {
        EXPECT_EQ(rows[i].white, wantWhite[i]) << rows[i].form;
        EXPECT_EQ(rows[i].black, wantBlack[i]) << rows[i].form;
    }
}

TEST(YuvExports, ColumnDecidesTheForm)
{
    // Pure green: 150 with full rounding (AC4R), 149 at a remainder column of C3R.
    uint8_t ac4[4] = {0, 255, 0, 77}, out[4] = {0, 0, 0, 91};
    ASSERT_EQ(zoxiRGBToYUV_8u_AC4R(ac4, 4, out, 4, ImageSize{1, 1}), zoxStatusOk);
    EXPECT_EQ(out[0], 150);
    EXPECT_EQ(out[3], 91);
    EXPECT_EQ(rgbToYuv( {0, 255, 0}, 0, 1)[0], 149);
    // White: block column 254,127,127; remainder column 255,128,128 (width 17: column 16 is behind the block).
    EXPECT_EQ(rgbToYuv( {255, 255, 255}, 15, 17), (Triple{254, 127, 127}));
    EXPECT_EQ(rgbToYuv( {255, 255, 255}, 16, 17), (Triple{255, 128, 128}));
    // (128, 255, 255) back to RGB: green 3 in a block, 4 at a remainder column.
    EXPECT_EQ(yuvToRgb( {128, 255, 255}, 0, 8)[1], 3);
    EXPECT_EQ(yuvToRgb( {128, 255, 255}, 0, 7)[1], 4);
}

TEST(YuvForms, GrayStaysGrayInEveryInverseForm)
{
    for (int y = 0; y < 256; ++y) {
        const Triple gray{y, y, y};
        for (Triple got : {run<RgbFromYuvBlock8>({y, 128, 128}), run<RgbFromYuvBlock16>({y, 128, 128}),
                           run<RgbFromYuvBlock128>({y, 128, 128}), run<RgbFromYuvRounded>({y, 128, 128}),
                           run<RgbFromYuvRoundedGreenLow>({y, 128, 128}), run<RgbFromYuvTruncated>({y, 128, 128})})
            ASSERT_EQ(got, gray) << "Y " << y;
    }
}
