// Sixteen-bit RGB words at full resolution: the pinned fields and the column rule of the colour forms.
// Sweeps, validation and kernels come from the table (conv_exports_test).
#include "frame/exports.hpp"

#include <gtest/gtest.h>

#include <array>
#include <vector>

using namespace zox;

namespace {

TEST(WordsPinned, FieldsShiftBare)
{
    const uint16_t white = 0xFFFF;
    uint8_t rgb[3];
    ASSERT_EQ(zoxiBGR565ToBGR_16u8u_C3R(&white, 2, rgb, 3, {1, 1}), zoxStatusOk);
    EXPECT_EQ((std::array<int, 3>{rgb[0], rgb[1], rgb[2]}), (std::array<int, 3>{248, 252, 248}));
    const uint8_t dark[3] = {7, 3, 7};
    uint16_t w = 1;
    ASSERT_EQ(zoxiBGRToBGR565_8u16u_C3R(dark, 3, &w, 2, {1, 1}), zoxStatusOk);
    EXPECT_EQ(w, 0);
    // Byte 0 is the low field in both twins.
    const uint8_t px[3] = {255, 0, 0};
    ASSERT_EQ(zoxiRGBToRGB565_8u16u_C3R(px, 3, &w, 2, {1, 1}), zoxStatusOk);
    EXPECT_EQ(w, 0x001F);
    // An odd word step of 21 walks rows 20 bytes apart.
    std::vector<uint16_t> out(30, 0x5555);
    const uint8_t two[6] = {255, 255, 255, 0, 0, 0};
    ASSERT_EQ(zoxiBGRToBGR565_8u16u_C3R(two, 3, out.data(), 21, {1, 2}), zoxStatusOk);
    EXPECT_EQ(out[0], 0xFFFF);
    EXPECT_EQ(out[10], 0x0000);
    EXPECT_EQ(out[1], 0x5555);
    EXPECT_EQ(out[9], 0x5555);
}

TEST(WordsPinned, BlockColourThenPixelColour)
{
    // A Y, Cb, Cr pixel whose block and pixel colours give different words: at width 11 columns 0..7
    // take the block form and 8..10 the pixel form; planes take the block form everywhere.
    auto word = [](const Px& c) {
        return static_cast<uint16_t>((c.c[2] >> 3) | (c.c[1] >> 2) << 5 | (c.c[0] >> 3) << 11);
    };
    Px p{};
    bool found = false;
    for (int y = 16; y < 236 && !found; ++y)
        for (int c = 16; c < 241 && !found; c += 7) {
            p = {{y, c, 255 - c}, 0};
            found = word(words::BlockColour::apply(p)) != word(words::PixelColour::apply(p));
        }
    ASSERT_TRUE(found);
    const uint16_t block = word(words::BlockColour::apply(p)), pixel = word(words::PixelColour::apply(p));
    std::vector<uint8_t> src(33), plane[3] = {std::vector<uint8_t>(11), std::vector<uint8_t>(11), std::vector<uint8_t>(11)};
    for (int x = 0; x < 11; ++x)
        for (int k = 0; k < 3; ++k) {
            src[3 * x + k] = static_cast<uint8_t>(p.c[k]);
            plane[k][x] = static_cast<uint8_t>(p.c[k]);
        }
    std::vector<uint16_t> out(11), fromPlanes(11);
    ASSERT_EQ(zoxiYCbCrToBGR565_8u16u_C3R(src.data(), 33, out.data(), 22, {11, 1}), zoxStatusOk);
    const uint8_t* planes[3] = {plane[0].data(), plane[1].data(), plane[2].data()};
    ASSERT_EQ(zoxiYCbCrToBGR565_8u16u_P3C3R(planes, 11, fromPlanes.data(), 22, {11, 1}), zoxStatusOk);
    for (int x = 0; x < 11; ++x) {
        EXPECT_EQ(out[x], x < 8 ? block : pixel) << x;
        EXPECT_EQ(fromPlanes[x], block) << x;
    }
}

} // namespace
