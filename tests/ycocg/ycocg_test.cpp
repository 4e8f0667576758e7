// RGB <-> YCoCg: values that pin the forms and the column rule, the round trips the reversible forms
// promise, and which members reject an empty size.
#include "support/conv_sweep.hpp"
#include "ycocg/ycocg_table.hpp"
#include "zoxcc.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <cstring>
#include <random>
#include <set>
#include <string>
#include <vector>

using namespace zox;

namespace {

using Triple = std::array<int, 3>;

// One BGR pixel (given as R, G, B) at column x of a row of width w, through a forward member.
template <class Src, class Dst, class F>
Triple forward(F f, Triple rgb, int x, int w)
{
    return zt::pixelAt<Src, Dst>(f, rgb, x, w);
}

} // namespace

TEST(YCoCgForms, PinnedValues)
{
    struct Row {
        const char* what;
        Triple rgb, want; // want: Y, Co, Cg
    } rows[] = {
        {"plain loses the low bits of Y", {1, 0, 0}, {0, 1, 0}},
        {"Co rounds (0 - 1 + 1) >> 1", {0, 0, 1}, {0, 0, 0}},
        {"negative sums shift toward minus infinity", {0, 0, 4}, {1, -2, -1}},
    };
    for (const Row& r : rows)
        EXPECT_EQ((forward<InBGR8, OutP3_16s>(zoxiBGRToYCoCg_8u16s_C3P3R, r.rgb, 0, 1)), r.want) << r.what;
    // Biased bytes: Co + 128 limited to 255, Cg + 128 clamped.
    EXPECT_EQ((forward<InRGB8, OutP3_8>(zoxiRGBToYCoCg_8u_C3P3R, {255, 0, 0}, 0, 1)), (Triple{64, 255, 64}));
    EXPECT_EQ((forward<InRGB8, OutP3_8>(zoxiRGBToYCoCg_8u_C3P3R, {0, 255, 0}, 0, 1)), (Triple{128, 128, 255}));
}

// Cg of (R, G, B) = (-32768, 32767, -32768) is 32768: a block saturates it, a remainder column wraps it.
TEST(YCoCgForms, SixteenBitBlocksSaturateTailsWrap)
{
    const Triple px{-32768, 32767, -32768};
    for (int w : {5, 6, 7}) {
        EXPECT_EQ((forward<InBGR16s, OutP3_16s>(zoxiSBGRToYCoCg_16s_C3P3R, px, 0, w))[2], 32767) << "block, width " << w;
        EXPECT_EQ((forward<InBGR16s, OutP3_16s>(zoxiSBGRToYCoCg_16s_C3P3R, px, 4, w))[2], -32768) << "tail, width " << w;
    }
    EXPECT_EQ((forward<InBGRX16s, OutP3_16s>(zoxiSBGRToYCoCg_16s_C4P3R, px, 3, 4))[2], 32767);
    EXPECT_EQ((forward<InBGR16s, OutP3_32s>(zoxiSBGRToYCoCg_16s32s_C3P3R, px, 0, 4))[2], 32768);
}

// Every 24-bit BGR value through the reversible 8-bit pair comes back exactly, also through four
// channels with alpha.
TEST(YCoCgRoundTrip, EveryEightBitColourThroughTheReversiblePair)
{
    const int w = 4096, h = 4096;
    std::vector<uint8_t> bgr(static_cast<std::size_t>(w) * h * 3), back(bgr.size());
    for (std::size_t i = 0; i < bgr.size() / 3; ++i)
        for (int k = 0; k < 3; ++k)
            bgr[3 * i + k] = static_cast<uint8_t>(i >> (8 * k));
    std::vector<int16_t> planes(static_cast<std::size_t>(w) * h * 3);
    int16_t* p[3] = {planes.data(), planes.data() + std::size_t(w) * h, planes.data() + 2 * std::size_t(w) * h};
    const ImageSize roi{w, h};
    ASSERT_EQ(zoxiBGRToYCoCg_Rev_8u16s_C3P3R(bgr.data(), 3 * w, p, 2 * w, roi), zoxStatusOk);
    const int16_t* q[3] = {p[0], p[1], p[2]};
    ASSERT_EQ(zoxiYCoCgToBGR_Rev_16s8u_P3C3R(q, 2 * w, back.data(), 3 * w, roi), zoxStatusOk);
    EXPECT_TRUE(bgr == back);

    std::vector<uint8_t> bgra(static_cast<std::size_t>(w) * 4, 0), out(bgra.size());
    for (int x = 0; x < w; ++x)
        std::memcpy(&bgra[4 * x], &bgr[3 * (x * 4099 % (w * h))], 3);
    ASSERT_EQ(zoxiBGRToYCoCg_Rev_8u16s_C4P3R(bgra.data(), 4 * w, p, 2 * w, ImageSize{w, 1}), zoxStatusOk);
    ASSERT_EQ(zoxiYCoCgToBGR_Rev_16s8u_P3C4R(q, 2 * w, out.data(), 4 * w, ImageSize{w, 1}, 200), zoxStatusOk);
    for (int x = 0; x < w; ++x)
        ASSERT_TRUE(std::equal(&out[4 * x], &out[4 * x + 3], &bgra[4 * x]) && out[4 * x + 3] == 200) << "pixel " << x;
}

// Random and extreme 16-bit triples through the 16s pair (exact by wrap-around) and the 16s32s / 32s16s
// pair.
TEST(YCoCgRoundTrip, SixteenBitTriples)
{
    const int w = 1 << 16;
    std::vector<int16_t> sbgr(3 * w), back(3 * w), y16(3 * w);
    std::vector<int32_t> y32(3 * w);
    std::mt19937 rng(3);
    const int16_t extremes[] = {-32768, -32767, -1, 0, 1, 32766, 32767};
    for (int i = 0; i < 3 * w; ++i)
        sbgr[i] = i < 3 * 343 ? extremes[(i / 3 / (i % 3 == 0 ? 1 : i % 3 == 1 ? 7 : 49)) % 7] : static_cast<int16_t>(rng());
    const ImageSize roi{w, 1};
    int16_t* p16[3] = {&y16[0], &y16[w], &y16[2 * w]};
    int32_t* p32[3] = {&y32[0], &y32[w], &y32[2 * w]};
    const int16_t* c16[3] = {p16[0], p16[1], p16[2]};
    const int32_t* c32[3] = {p32[0], p32[1], p32[2]};
    ASSERT_EQ(zoxiSBGRToYCoCg_Rev_16s_C3P3R(sbgr.data(), 6 * w, p16, 2 * w, roi), zoxStatusOk);
    ASSERT_EQ(zoxiYCoCgToSBGR_Rev_16s_P3C3R(c16, 2 * w, back.data(), 6 * w, roi), zoxStatusOk);
    EXPECT_TRUE(back == sbgr) << "16s pair";
    ASSERT_EQ(zoxiSBGRToYCoCg_Rev_16s32s_C3P3R(sbgr.data(), 6 * w, p32, 4 * w, roi), zoxStatusOk);
    ASSERT_EQ(zoxiYCoCgToSBGR_Rev_32s16s_P3C3R(c32, 4 * w, back.data(), 6 * w, roi), zoxStatusOk);
    EXPECT_TRUE(back == sbgr) << "16s32s / 32s16s pair";
}

// Twelve members reject a size below 1; the other fourteen convert nothing and succeed.
TEST(YCoCgValidation, WhichMembersRejectAnEmptySize)
{
    const std::set<std::string> rejecting = {
        "zoxiRGBToYCoCg_8u_C3P3R",        "zoxiBGRToYCoCg_8u16s_C3P3R",       "zoxiBGRToYCoCg_8u16s_C4P3R",
        "zoxiBGRToYCoCg_Rev_8u16s_C3P3R", "zoxiBGRToYCoCg_Rev_8u16s_C4P3R",   "zoxiSBGRToYCoCg_16s_C3P3R",
        "zoxiSBGRToYCoCg_16s_C4P3R",      "zoxiSBGRToYCoCg_16s32s_C3P3R",     "zoxiSBGRToYCoCg_Rev_16s32s_C3P3R",
        "zoxiYCoCgToSBGR_16s_P3C4R",      "zoxiYCoCgToSBGR_32s16s_P3C3R",     "zoxiYCoCgToSBGR_32s16s_P3C4R"};
    int members = 0;
#define ZT_EMPTY(name, shape, Src, Dst, N, Block, Rem, Chk)                                                     \
    {                                                                                                            \
        ++members;                                                                                               \
        const bool rejects = Chk == Checks::PointersPlanesSizes;                                                 \
        EXPECT_EQ(rejects, rejecting.count(#name) == 1) << #name;                                                \
    }
    ZOX_YCOCG_TABLE(ZT_EMPTY)
#undef ZT_EMPTY
    EXPECT_EQ(members, 26);
}
