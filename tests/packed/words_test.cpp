// Sixteen-bit RGB words: the pinned fields, the column rule of the colour forms, the odd sizes of the
// sampled sources and the dither tile. Sweeps, validation and kernels come from the tables
// (conv_exports_test, fromsampled_exports_test).
#include "frame/exports.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <functional>
#include <string>
#include <type_traits>
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

// One flat Y, Cb, Cr colour through a word member of each source layout, over a region of w x h.
struct FlatCall {
    const char* name;
    std::function<zoxStatus(int y, int cb, int cr, uint16_t* dst, int dstStep, ImageSize roi)> call;
};

std::vector<uint8_t> filled(std::size_t n, int v)
{
    return std::vector<uint8_t>(n, static_cast<uint8_t>(v));
}

template <auto F>
FlatCall pixelsCall(const char* name)
{
    return {name, [](int y, int cb, int cr, uint16_t* d, int ds, ImageSize roi) {
                std::vector<uint8_t> src(3 * static_cast<std::size_t>(roi.width * roi.height));
                for (std::size_t i = 0; i < src.size(); i += 3)
                    src[i] = static_cast<uint8_t>(y), src[i + 1] = static_cast<uint8_t>(cb), src[i + 2] = static_cast<uint8_t>(cr);
                return F(src.data(), 3 * roi.width, d, ds, roi);
            }};
}
template <auto F>
FlatCall groupsCall(const char* name) // packed 4:2:2
{
    return {name, [](int y, int cb, int cr, uint16_t* d, int ds, ImageSize roi) {
                std::vector<uint8_t> src(2 * static_cast<std::size_t>(roi.width * roi.height));
                for (std::size_t i = 0; i < src.size(); i += 2) // Y, then Cb in even columns and Cr in odd ones
                    src[i] = static_cast<uint8_t>(y), src[i + 1] = static_cast<uint8_t>(i / 2 % roi.width % 2 ? cr : cb);
                return F(src.data(), 2 * roi.width, d, ds, roi);
            }};
}
template <auto F>
FlatCall planesCall(const char* name) // planes of any sampling, each as wide as the image
{
    return {name, [](int y, int cb, int cr, uint16_t* d, int ds, ImageSize roi) {
                const std::size_t n = static_cast<std::size_t>(roi.width * roi.height);
                const auto py = filled(n, y), pb = filled(n, cb), pr = filled(n, cr);
                const uint8_t* src[3] = {py.data(), pb.data(), pr.data()};
                const int steps[3] = {roi.width, roi.width, roi.width};
                if constexpr (std::is_invocable_v<decltype(F), const uint8_t* const*, int, uint16_t*, int, ImageSize>)
                    return F(src, roi.width, d, ds, roi);
                else
                    return F(src, steps, d, ds, roi);
            }};
}

int field(uint16_t w, int shift, int bits)
{
    return (w >> shift) & ((1 << bits) - 1);
}

TEST(WordsDither, FlatColoursShowTheTile)
{
    // Y 235 on neutral chroma gives 254 in every channel: 555 fields are 31 but where the tile entry (1957
    // or 2097) is not below e = 1874, there 30. Y 255 gives 255: 565 green is 62 only at row 3, column
    // 0, where the halved entry 1048 equals e. The tile starts at the region's first pixel.
    const FlatCall calls555[] = {
        pixelsCall<zoxiYCbCrToBGR555Dither_8u16u_C3R>("C3R"), planesCall<zoxiYCbCrToRGB555Dither_8u16u_P3C3R>("P3C3R"),
        groupsCall<zoxiYCbCr422ToBGR555Dither_8u16u_C2C3R>("422 C2C3R"), planesCall<zoxiYCbCr422ToRGB555Dither_8u16u_P3C3R>("422 P3C3R"),
        planesCall<zoxiYCbCr420ToBGR555Dither_8u16u_P3C3R>("420 P3C3R")};
    for (const FlatCall& c : calls555) {
        SCOPED_TRACE(c.name);
        std::vector<uint16_t> out(30, 0xAAAA);
        ASSERT_EQ(c.call(235, 128, 128, out.data(), 12, {5, 5}), zoxStatusOk);
        for (int y = 0; y < 5; ++y)
            for (int x = 0; x < 5; ++x) {
                const int entry = dither::kTile5.lanes[y & 3][0][x & 3];
                const int want = entry == 1957 || entry == 2097 ? 30 : 31;
                const uint16_t w = out[6 * y + x];
                EXPECT_EQ(field(w, 0, 5), want) << x << "," << y;
                EXPECT_EQ(field(w, 5, 5), want) << x << "," << y;
                EXPECT_EQ(field(w, 10, 6), want) << x << "," << y;
            }
        EXPECT_EQ(out[5], 0xAAAA);
    }
    const FlatCall calls565[] = {pixelsCall<zoxiYCbCrToRGB565Dither_8u16u_C3R>("C3R"),
                                 planesCall<zoxiYUV420ToBGR565Dither_8u16u_P3C3R>("YUV420 P3C3R")};
    for (const FlatCall& c : calls565) {
        SCOPED_TRACE(c.name);
        std::vector<uint16_t> out(16);
        ASSERT_EQ(c.call(255, 128, 128, out.data(), 8, {4, 4}), zoxStatusOk);
        for (int i = 0; i < 16; ++i) {
            EXPECT_EQ(field(out[i], 5, 6), i == 12 ? 62 : 63) << i;
            EXPECT_EQ(field(out[i], 0, 5) + field(out[i], 11, 5), 62) << i;
        }
    }
}

TEST(WordsSampled, OddSizesWriteWhatTheirRuleSays)
{
    struct Case {
        FlatCall call;
        ImageSize roi;
        zoxStatus status;
        int written; // words of the region written
    };
    const Case cases[] = {
        {planesCall<zoxiYCbCr422ToBGR565_8u16u_P3C3R>("422 planes, width 1"), {1, 3}, zoxStatusOk, 0},
        {planesCall<zoxiYCbCr422ToBGR565Dither_8u16u_P3C3R>("422 planes dithered, width 1"), {1, 3}, zoxStatusOk, 3},
        {planesCall<zoxiYCbCr422ToBGR565_8u16u_P3C3R>("422 planes, width 3"), {3, 2}, zoxStatusOk, 6},
        {planesCall<zoxiYUV420ToRGB444_8u16u_P3C3R>("YUV 420, height 1"), {5, 1}, zoxStatusOk, 0},
        {planesCall<zoxiYUV420ToRGB444_8u16u_P3C3R>("YUV 420, width 1"), {1, 5}, zoxStatusOk, 0},
        {planesCall<zoxiYUV420ToRGB444_8u16u_P3C3R>("YUV 420, 3x3"), {3, 3}, zoxStatusOk, 9},
        {planesCall<zoxiYCbCr420ToBGR565_8u16u_P3C3R>("420, 3x3"), {3, 3}, zoxStatusOk, 9},
        {planesCall<zoxiYCbCr420ToBGR565_8u16u_P3C3R>("420, 1x1"), {1, 1}, zoxStatusOk, 1},
        {planesCall<zoxiYCbCr411ToBGR565_8u16u_P3C3R>("411, width 6"), {6, 2}, zoxWarnOddSize, 12},
        {groupsCall<zoxiYCbCr422ToRGB555_8u16u_C2C3R>("packed 422, width 1"), {1, 2}, zoxStatusOk, 2},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.call.name);
        // Y 200 on neutral chroma has no zero field in any form, so every written word shows.
        std::vector<uint16_t> out(static_cast<std::size_t>(c.roi.width * c.roi.height), 0);
        ASSERT_EQ(c.call.call(200, 128, 128, out.data(), 2 * c.roi.width, c.roi), c.status);
        EXPECT_EQ(std::count_if(out.begin(), out.end(), [](uint16_t w) { return w != 0; }), c.written);
    }
}

TEST(WordsSampled, PackedLastOddColumnTakesTheCrBehindIt)
{
    // Y0 Cb Y1 Cr Y2 Cb': the third pixel takes pixel colour of (Y2, Cb', Cr); the dithered member takes
    // block colour of (Y2, Cb', Cb'). Width 1 takes folded colour of (Y0, Cb, Cb).
    const uint8_t src[6] = {90, 60, 120, 200, 150, 170};
    auto word = [](const Px& c) { return static_cast<uint16_t>((c.c[2] >> 3) | (c.c[1] >> 2) << 5 | (c.c[0] >> 3) << 11); };
    std::array<uint16_t, 3> out{};
    ASSERT_EQ(zoxiYCbCr422ToBGR565_8u16u_C2C3R(src, 6, out.data(), 6, {3, 1}), zoxStatusOk);
    EXPECT_EQ(out[2], word(words::PixelColour::apply({{150, 170, 200}, 0})));
    ASSERT_EQ(zoxiYCbCr422ToBGR565_8u16u_C2C3R(src, 6, out.data(), 6, {1, 1}), zoxStatusOk);
    EXPECT_EQ(out[0], word(words::FoldedColour::apply({{90, 60, 60}, 0})));
    const Px dithered = words::BlockColour::apply({{150, 170, 170}, 0});
    ASSERT_EQ(zoxiYCbCr422ToBGR565Dither_8u16u_C2C3R(src, 6, out.data(), 6, {3, 1}), zoxStatusOk);
    EXPECT_EQ(field(out[2], 11, 5), dither::Channel<5>::apply(dithered.c[0], 279));
    EXPECT_EQ(field(out[2], 5, 6), dither::Channel<6>::apply(dithered.c[1], 279));
}

// Words to sampled planes: the BGR555 word of R 8, G 64, B 104 has block luma 60 and pixel luma 61, so a
// flat image of it shows which columns took the block form; bit 15 changes nothing.
TEST(WordsToSampled, ColumnsTakeTheirForm)
{
    const uint16_t probe = 13 | 8 << 5 | 1 << 10;
    struct Case {
        int width, blockColumns;
    };
    for (const Case c : {Case{8, 0}, Case{12, 4}, Case{24, 16}, Case{40, 32}, Case{44, 36}}) {
        SCOPED_TRACE("width " + std::to_string(c.width));
        std::vector<uint16_t> src(2 * static_cast<std::size_t>(c.width), probe);
        for (std::size_t i = 0; i < src.size(); i += 3)
            src[i] |= 0x8000;
        std::vector<uint8_t> y(2 * static_cast<std::size_t>(c.width)), cb(c.width / 2), cr(c.width / 2);
        uint8_t* dst[3] = {y.data(), cb.data(), cr.data()};
        const int steps[3] = {c.width, c.width / 2, c.width / 2};
        ASSERT_EQ(zoxiBGR555ToYCbCr420_16u8u_C3P3R(src.data(), 2 * c.width, dst, steps, {c.width, 2}), zoxStatusOk);
        for (int x = 0; x < c.width; ++x) {
            EXPECT_EQ(y[x], x < c.blockColumns ? 60 : 61) << x;
            EXPECT_EQ(y[c.width + x], y[x]) << x;
        }
    }
}

TEST(WordsToSampled, OddSizesWriteWhatTheirRuleSays)
{
    struct Case {
        const char* name;
        zoxStatus (*f)(const uint16_t*, int, uint8_t* const*, const int*, ImageSize);
        ImageSize roi;
        zoxStatus status;
        int y, cb, cr; // samples written in each plane
    };
    const Case cases[] = {
        {"BGR555 to 4:2:2 planes, width 3", zoxiBGR555ToYCbCr422_16u8u_C3P3R, {3, 1}, zoxStatusOk, 3, 1, 1},
        {"BGR555 to 4:2:0, 3x3", zoxiBGR555ToYCbCr420_16u8u_C3P3R, {3, 3}, zoxStatusOk, 9, 1, 1},
        {"BGR565 to 4:1:1, width 6", zoxiBGR565ToYCbCr411_16u8u_C3P3R, {6, 1}, zoxWarnOddSize, 4, 1, 1},
        {"BGR555 to 4:1:1, width 6", zoxiBGR555ToYCbCr411_16u8u_C3P3R, {6, 1}, zoxWarnOddSize, 6, 1, 1},
        {"BGR565 to YUV 4:2:0, 3x3", zoxiBGR565ToYUV420_16u8u_C3P3R, {3, 3}, zoxWarnOddSize, 4, 1, 1},
        {"RGB565 to YUV 4:2:0, width 1", zoxiRGB565ToYUV420_16u8u_C3P3R, {1, 2}, zoxWarnOddSize, 0, 0, 0},
        {"RGB565 to YUV 4:2:2, width 3", zoxiRGB565ToYUV422_16u8u_C3P3R, {3, 1}, zoxWarnOddSize, 2, 1, 1},
    };
    constexpr uint8_t kFill = 0xEE; // no form gives it from mid gray
    for (const Case& c : cases) {
        SCOPED_TRACE(c.name);
        const std::size_t n = static_cast<std::size_t>(c.roi.width * c.roi.height);
        const std::vector<uint16_t> src(n, 0x4210); // 16 in every field
        std::vector<uint8_t> planes[3] = {std::vector<uint8_t>(n, kFill), std::vector<uint8_t>(n, kFill), std::vector<uint8_t>(n, kFill)};
        uint8_t* dst[3] = {planes[0].data(), planes[1].data(), planes[2].data()};
        const int steps[3] = {c.roi.width, c.roi.width, c.roi.width};
        ASSERT_EQ(c.f(src.data(), 2 * c.roi.width, dst, steps, c.roi), c.status);
        const int want[3] = {c.y, c.cb, c.cr};
        for (int p = 0; p < 3; ++p)
            EXPECT_EQ(std::count_if(planes[p].begin(), planes[p].end(), [](uint8_t b) { return b != kFill; }), want[p]) << "plane " << p;
    }
    // The packed 4:2:2 member gives a last odd column its luma and, in its second byte, the one-pixel Cb.
    const std::vector<uint16_t> src(3, 0x4210);
    std::vector<uint8_t> groups(6, kFill);
    ASSERT_EQ(zoxiBGR555ToYCbCr422_16u8u_C3C2R(src.data(), 6, groups.data(), 6, {3, 1}), zoxStatusOk);
    EXPECT_EQ(std::count(groups.begin(), groups.end(), kFill), 0);
}

} // namespace
