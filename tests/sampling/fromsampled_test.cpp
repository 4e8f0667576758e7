// Chroma-sampled images to RGB: which pixels a call writes at odd sizes, where an odd 4:2:2 group and
// a 4:1:1 tail find their chroma, the fourth byte, the packed-plane 4:2:2 run as one row, the aligned
// rows' form, a few numbers worked out by hand, and a round trip. Sweeps, validation and kernels come
// from the table.
#include "zoxcc.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <cstdint>
#include <cstdlib>
#include <functional>
#include <random>
#include <string>
#include <vector>

namespace {

constexpr uint8_t kFill = 0xEE;
using Rgb = std::array<int, 3>;

std::vector<uint8_t> noise(std::size_t bytes, unsigned seed)
{
    std::mt19937 rng(seed);
    std::vector<uint8_t> v(bytes);
    for (auto& b : v)
        b = static_cast<uint8_t>(rng());
    return v;
}

int clip8(int v) { return std::clamp(v, 0, 255); }
int mulHigh(int a, int k) { return (a * k) >> 16; } // floored

// The forms the tests below pin, written out from their gains.
Rgb yuvBlock16(int y, int u, int v) // chroma at 16 x, luma doubled, the sum halved
{
    const int a = 16 * (u - 128), b = 16 * (v - 128);
    return {clip8((2 * y + mulHigh(b, 9338)) >> 1), clip8((2 * y + mulHigh(a, -3227) + mulHigh(b, -4759)) >> 1),
            clip8((2 * y + mulHigh(a, 16645)) >> 1)};
}
Rgb yuvWhole(int y, int u, int v) // whole samples in 1/65536, truncated
{
    u -= 128, v -= 128, y *= 65536;
    return {clip8((y + 74711 * v) >> 16), clip8((y - 25821 * u - 38076 * v) >> 16), clip8((y + 133169 * u) >> 16)};
}
Rgb yccSplit(int y, int cb, int cr) // over 8, no rounding
{
    const int l = mulHigh(128 * (y - 16), 4769), a = 128 * (cb - 128), b = 128 * (cr - 128);
    return {clip8((l + mulHigh(b, 6537)) >> 3), clip8((l - mulHigh(a, 1605) - mulHigh(b, 3330)) >> 3), clip8((l + mulHigh(a, 8263)) >> 3)};
}
Rgb yccBlockB(int y, int cb, int cr) // over 16, rounded
{
    const int l = mulHigh(128 * (y - 16), 9535), a = 128 * (cb - 128), b = 128 * (cr - 128);
    return {clip8((l + mulHigh(b, 13074) + 8) >> 4), clip8((l + mulHigh(a, -3211) + mulHigh(b, -6660) + 8) >> 4),
            clip8((l + mulHigh(a, 16523) + 8) >> 4)};
}

Rgb at(const uint8_t* p, bool bgr = false)
{
    return bgr ? Rgb{p[2], p[1], p[0]} : Rgb{p[0], p[1], p[2]};
}

int changed(const std::vector<uint8_t>& v)
{
    return static_cast<int>(std::count_if(v.begin(), v.end(), [](uint8_t b) { return b != kFill; }));
}

TEST(FromSampled, OddSizesWriteWhatTheirRuleSays)
{
    { // 3x3 4:2:0 to planes: the one whole unit; column 2 and row 2 keep their bytes.
        const std::vector<uint8_t> y(9, 100), c(4, 128);
        const uint8_t* src[3] = {y.data(), c.data(), c.data()};
        const int steps[3] = {3, 2, 2};
        std::array<std::vector<uint8_t>, 3> d;
        for (auto& p : d)
            p.assign(9, kFill);
        uint8_t* dst[3] = {d[0].data(), d[1].data(), d[2].data()};
        EXPECT_EQ(zoxiYUV420ToRGB_8u_P3R(src, steps, dst, 3, {3, 3}), zoxWarnOddSize);
        for (const auto& p : d)
            EXPECT_EQ(p, (std::vector<uint8_t>{100, 100, kFill, 100, 100, kFill, kFill, kFill, kFill}));
    }
    { // one row of 4:2:0 pairs: nothing
        const std::vector<uint8_t> y(8, 100), c(8, 128);
        std::vector<uint8_t> d(24, kFill);
        EXPECT_EQ(zoxiYCbCr420ToBGR_8u_P2C3R(y.data(), 8, c.data(), 8, d.data(), 24, {8, 1}), zoxWarnOddSize);
        EXPECT_EQ(changed(d), 0);
    }
    // 4:2:2 planes at width 5: the BGR member leaves the half unit, the RGB member converts it.
    using P3 = zoxStatus (*)(const uint8_t* const*, const int*, uint8_t*, int, ImageSize);
    for (auto [f, pixels] : {std::pair<P3, int>{zoxiYCbCr422ToBGR_8u_P3C3R, 4}, {zoxiYCbCr422ToRGB_8u_P3C3R, 5}}) {
        const std::vector<uint8_t> y(10, 120), c(6, 128);
        const uint8_t* src[3] = {y.data(), c.data(), c.data()};
        const int steps[3] = {5, 3, 3};
        std::vector<uint8_t> d(30, kFill);
        EXPECT_EQ(f(src, steps, d.data(), 15, {5, 2}), zoxStatusOk);
        for (int row = 0; row < 2; ++row)
            for (int i = 0; i < 15; ++i)
                EXPECT_EQ(d[15 * row + i] != kFill, i < 3 * pixels) << "row " << row << " byte " << i;
    }
}

// Width 6 of 4:1:1: one whole unit, and pixels 4 and 5 take its chroma (not the plane's next sample).
// The luma values are ones on which the block and the remainder columns agree.
TEST(FromSampled, FourOneOneTailTakesTheLastUnitsChroma)
{
    const std::vector<uint8_t> y{60, 90, 120, 200, 60, 90};
    const std::vector<uint8_t> cb{100, 200}, cr{170, 60};
    const uint8_t* src[3] = {y.data(), cb.data(), cr.data()};
    const int steps[3] = {6, 2, 2};
    std::vector<uint8_t> d(18, kFill);
    ASSERT_EQ(zoxiYCbCr411ToBGR_8u_P3C3R(src, steps, d.data(), 18, {6, 1}), zoxStatusOk);
    EXPECT_EQ(changed(d), 18);
    EXPECT_EQ(at(&d[12], true), at(&d[0], true));
    EXPECT_EQ(at(&d[15], true), at(&d[3], true));
    EXPECT_EQ(at(&d[0], true), (Rgb{118, 28, 0})); // Y 60 with Cb 100, Cr 170
}

// An odd width's half group Y4 Cb: Cb is its own, Cr the group before's; at width 1 its one chroma byte
// serves as both.
TEST(FromSampled, HalfGroupFindsItsChroma)
{
    {
        // Y0 Cb Y1 Cr | Y2 Cb Y3 Cr | Y4 Cb, then two bytes beyond the region.
        const std::vector<uint8_t> s{50, 30, 60, 20, 70, 30, 80, 200, 120, 100, 250, 10};
        std::vector<uint8_t> d(24, kFill);
        ASSERT_EQ(zoxiYCbCr422ToRGB_8u_C2C4R(s.data(), 12, d.data(), 24, {5, 1}, 9), zoxStatusOk);
        // R = (76284*104 + 104595*72 + 32768) >> 16, G = (76284*104 + 25690*28 - 53281*72 + 32768) >> 16,
        // B = (76284*104 - 132186*28 + 32768) >> 16.
        EXPECT_EQ(at(&d[16]), (Rgb{236, 73, 65}));
        EXPECT_EQ(d[19], 9);
        EXPECT_EQ(d[20], kFill);
    }
    {
        const std::vector<uint8_t> s{100, 150, 7, 7};
        std::vector<uint8_t> d(6, kFill);
        ASSERT_EQ(zoxiYUV422ToRGB_8u_C2C3R(s.data(), 4, d.data(), 6, {1, 1}), zoxStatusOk);
        // c = 22: R = (6553600 + 74711 c) >> 16, G = (6553600 - 63897 c) >> 16, B = (6553600 + 133169 c) >> 16.
        EXPECT_EQ(at(&d[0]), (Rgb{125, 78, 144}));
        EXPECT_EQ(d[3], kFill);
    }
}

// The folded form of the Cb,Cr pair members: black and white of studio range, and one colour.
TEST(FromSampled, FoldedFormNumbers)
{
    struct Case {
        uint8_t y, cb, cr;
        Rgb rgb;
    };
    // 100,150,90: y' = 931, tB = 209, tR = -630, tG = -34; (301, 965, 1140) >> 3.
    const Case cases[] = {{16, 128, 128, {0, 0, 0}}, {235, 128, 128, {255, 255, 255}}, {100, 150, 90, {37, 120, 142}}};
    for (const Case& c : cases) {
        const std::vector<uint8_t> y(4, c.y), pairs{c.cb, c.cr};
        std::vector<uint8_t> d(12, kFill);
        ASSERT_EQ(zoxiYCbCr420ToRGB_8u_P2C3R(y.data(), 2, pairs.data(), 2, d.data(), 6, {2, 2}), zoxStatusOk);
        for (int i = 0; i < 4; ++i)
            EXPECT_EQ(at(&d[3 * i]), c.rgb) << int{c.y} << "," << int{c.cb} << "," << int{c.cr} << " pixel " << i;
    }
}

// zoxiYUV422ToRGB_8u_P3 with 24x11 goes as one row of 264 pixels: 0..255 in the block form, 256..263 in
// the remainder form, which row by row would have been columns 16..23 of every row.
TEST(FromSampled, PackedPlanes422GoAsOneRow)
{
    const int w = 24, h = 11, n = w * h;
    const auto y = noise(n, 21), u = noise(n / 2, 22), v = noise(n / 2, 23);
    const uint8_t* src[3] = {y.data(), u.data(), v.data()};
    auto planes = [&] { return std::array<std::vector<uint8_t>, 3>{std::vector<uint8_t>(n, kFill), std::vector<uint8_t>(n, kFill),
                                                                    std::vector<uint8_t>(n, kFill)}; };
    auto packed = planes(), run = planes(), rows = planes();
    auto ptrs = [](std::array<std::vector<uint8_t>, 3>& p) { return std::array<uint8_t*, 3>{p[0].data(), p[1].data(), p[2].data()}; };
    ASSERT_EQ(zoxiYUV422ToRGB_8u_P3(src, ptrs(packed).data(), {w, h}), zoxStatusOk);
    const int runSteps[3] = {n, n / 2, n / 2}, rowSteps[3] = {w, w / 2, w / 2};
    ASSERT_EQ(zoxiYUV422ToRGB_8u_P3R(src, runSteps, ptrs(run).data(), n, {n, 1}), zoxStatusOk);
    ASSERT_EQ(zoxiYUV422ToRGB_8u_P3R(src, rowSteps, ptrs(rows).data(), w, {w, h}), zoxStatusOk);
    EXPECT_EQ(packed, run);
    EXPECT_NE(packed, rows); // row by row, columns 16..23 would differ on these data
    for (int i = 0; i < n; ++i) {
        const Rgb want = i < 256 ? yuvBlock16(y[i], u[i / 2], v[i / 2]) : yuvWhole(y[i], u[i / 2], v[i / 2]);
        EXPECT_EQ((Rgb{packed[0][i], packed[1][i], packed[2][i]}), want) << "pixel " << i;
    }
}

// AC4 writes 0 fourth; C4 writes alpha in every pixel it writes and leaves the others whole.
TEST(FromSampled, FourthByte)
{
    const auto y = noise(64, 31), c = noise(64, 32);
    const uint8_t* src[3] = {y.data(), c.data(), c.data() + 32};
    using Call = std::function<zoxStatus(uint8_t*, ImageSize)>; // destination step 32
    struct Row {
        const char* name;
        ImageSize roi;
        int wide, high; // the written block of pixels
        int fourth;
        Call f;
    };
    const int s420[3] = {8, 4, 4}, s422[3] = {8, 4, 4}, s411[3] = {8, 2, 2};
    const Row rows[] = {
        {"YUV420ToRGB P3AC4R", {8, 4}, 8, 4, 0, [&](uint8_t* d, ImageSize r) { return zoxiYUV420ToRGB_8u_P3AC4R(src, s420, d, 32, r); }},
        {"YUV422ToRGB P3AC4R", {7, 3}, 7, 3, 0, [&](uint8_t* d, ImageSize r) { return zoxiYUV422ToRGB_8u_P3AC4R(src, s422, d, 32, r); }},
        {"YCbCr420ToBGR P2C4R", {5, 3}, 4, 2, 77,
         [&](uint8_t* d, ImageSize r) { return zoxiYCbCr420ToBGR_8u_P2C4R(y.data(), 8, c.data(), 8, d, 32, r, 77); }},
        {"YCbCr411ToBGR P3C4R", {7, 2}, 7, 2, 78,
         [&](uint8_t* d, ImageSize r) { return zoxiYCbCr411ToBGR_8u_P3C4R(src, s411, d, 32, r, 78); }},
    };
    for (const Row& r : rows) {
        SCOPED_TRACE(r.name);
        std::vector<uint8_t> d(8 * 4 * 4, kFill);
        const zoxStatus st = r.f(d.data(), r.roi);
        EXPECT_TRUE(st == zoxStatusOk || st == zoxWarnOddSize);
        for (int row = 0; row < 4; ++row)
            for (int x = 0; x < 8; ++x) {
                const uint8_t* p = &d[32 * row + 4 * x];
                if (row < r.high && x < r.wide)
                    EXPECT_EQ(p[3], r.fourth) << row << "," << x;
                else
                    EXPECT_TRUE(std::all_of(p, p + 4, [](uint8_t b) { return b == kFill; })) << row << "," << x;
            }
    }
}

// zoxiYCbCr420ToBGR_8u_P3C3R and zoxiYCbCr422ToRGB_8u_P3C3R: rows whose pointers and steps are all
// multiples of 16 take the split form, others the rounded block form; width 16 is all block columns.
TEST(FromSampled, AlignedRowsTakeTheSplitForm)
{
    const auto n = noise(96, 41);
    alignas(16) static uint8_t y[32], cb[32], cr[32], dst[2 * 48 * 2 + 16];
    std::copy(n.begin(), n.begin() + 32, y);
    std::copy(n.begin() + 32, n.begin() + 64, cb);
    std::copy(n.begin() + 64, n.end(), cr);
    const uint8_t* src[3] = {y, cb, cr};
    const int steps[3] = {16, 16, 16};
    uint8_t* aligned = dst;
    uint8_t* off = dst + 96 + 1;
    for (bool is420 : {true, false}) {
        SCOPED_TRACE(is420 ? "YCbCr420ToBGR" : "YCbCr422ToRGB");
        auto call = is420 ? zoxiYCbCr420ToBGR_8u_P3C3R : zoxiYCbCr422ToRGB_8u_P3C3R;
        ASSERT_EQ(call(src, steps, aligned, 48, {16, 2}), zoxStatusOk);
        ASSERT_EQ(call(src, steps, off, 48, {16, 2}), zoxStatusOk);
        int differ = 0;
        for (int row = 0; row < 2; ++row)
            for (int x = 0; x < 16; ++x) {
                const int cy = y[16 * row + x], ci = is420 ? x / 2 : 16 * row + x / 2;
                const int i = 48 * row + 3 * x;
                EXPECT_EQ(at(aligned + i, is420), yccSplit(cy, cb[ci], cr[ci])) << row << "," << x;
                EXPECT_EQ(at(off + i, is420), yccBlockB(cy, cb[ci], cr[ci])) << row << "," << x;
                for (int k = 0; k < 3; ++k) {
                    EXPECT_LE(std::abs(aligned[i + k] - off[i + k]), 1);
                    differ += aligned[i + k] != off[i + k];
                }
            }
        EXPECT_GT(differ, 0);
    }
}

// RGB through each sampled layout and back on 64x32 images: a flat colour returns within 3 (the YUV
// forms truncate both ways), a gentle gradient (2 a column in R, 3 a row in G) within 6, the rest being
// the chroma a unit shares.
TEST(FromSampledRoundTrip, SmoothImagesComeBackClose)
{
    const int w = 64, h = 32;
    std::vector<uint8_t> rgb(3 * w * h), yp(w * h), c1(w * h), c2(w * h), group(2 * w * h);
    uint8_t* planes[3] = {yp.data(), c1.data(), c2.data()};
    const uint8_t* cplanes[3] = {yp.data(), c1.data(), c2.data()};
    const int s420[3] = {w, w / 2, w / 2}, s411[3] = {w, w / 4, w / 4};
    using Trip = std::function<bool(uint8_t*)>;
    const ImageSize roi{w, h};
    const std::pair<const char*, Trip> trips[] = {
        {"YCbCr 4:2:0", [&](uint8_t* out) {
             return zoxiRGBToYCbCr420_8u_C3P3R(rgb.data(), 3 * w, planes, s420, roi) == zoxStatusOk &&
                    zoxiYCbCr420ToRGB_8u_P3C3R(cplanes, s420, out, 3 * w, roi) == zoxStatusOk;
         }},
        {"YCbCr 4:2:2", [&](uint8_t* out) {
             return zoxiRGBToYCbCr422_8u_C3C2R(rgb.data(), 3 * w, group.data(), 2 * w, roi) == zoxStatusOk &&
                    zoxiYCbCr422ToRGB_8u_C2C3R(group.data(), 2 * w, out, 3 * w, roi) == zoxStatusOk;
         }},
        {"YCbCr 4:1:1", [&](uint8_t* out) {
             return zoxiBGRToYCbCr411_8u_C3P3R(rgb.data(), 3 * w, planes, s411, roi) == zoxStatusOk &&
                    zoxiYCbCr411ToBGR_8u_P3C3R(cplanes, s411, out, 3 * w, roi) == zoxStatusOk;
         }},
        {"YUV 4:2:0", [&](uint8_t* out) {
             return zoxiRGBToYUV420_8u_C3P3R(rgb.data(), 3 * w, planes, s420, roi) == zoxStatusOk &&
                    zoxiYUV420ToRGB_8u_P3C3R(cplanes, s420, out, 3 * w, roi) == zoxStatusOk;
         }},
    };
    for (bool flat : {true, false}) {
        for (int j = 0; j < h; ++j)
            for (int x = 0; x < w; ++x) {
                uint8_t* p = &rgb[3 * (w * j + x)];
                p[0] = static_cast<uint8_t>(flat ? 200 : 40 + 2 * x);
                p[1] = static_cast<uint8_t>(flat ? 150 : 60 + 3 * j);
                p[2] = static_cast<uint8_t>(flat ? 70 : 180 - x - 2 * j);
            }
        for (const auto& [name, trip] : trips) {
            SCOPED_TRACE(std::string(name) + (flat ? ", flat" : ", gradient"));
            std::vector<uint8_t> out(rgb.size(), kFill);
            ASSERT_TRUE(trip(out.data()));
            int worst = 0;
            for (std::size_t i = 0; i < rgb.size(); ++i)
                worst = std::max(worst, std::abs(out[i] - rgb[i]));
            EXPECT_LE(worst, flat ? 3 : 6);
        }
    }
}

} // namespace
