// RGB to chroma-sampled images: which samples a call writes at odd sizes, the YCrCb members against
// their YCbCr sisters, the members without R against their R sisters, the aligned-row forms, and the
// numbers that pin a limit or a filter edge. Sweeps, validation and kernels come from the table.
#include "zoxcc.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <cstdint>
#include <random>
#include <vector>

namespace {

constexpr uint8_t kFill = 0xEE;

// Three destination planes of w x h bytes each, filled so that an unwritten sample shows.
struct Planes {
    std::array<std::vector<uint8_t>, 3> p;
    int step;
    explicit Planes(int w, int h) : step(w)
    {
        for (auto& v : p)
            v.assign(static_cast<std::size_t>(w) * h, kFill);
    }
    uint8_t* ptr[3] = {};
    uint8_t* const* arr()
    {
        for (int i = 0; i < 3; ++i)
            ptr[i] = p[i].data();
        return ptr;
    }
    int written(int plane) const
    {
        int n = 0;
        for (uint8_t b : p[plane])
            n += b != kFill;
        return n;
    }
};

std::vector<uint8_t> grey(int w, int h, int ch, uint8_t v = 100)
{
    return std::vector<uint8_t>(static_cast<std::size_t>(w) * h * ch, v);
}

std::vector<uint8_t> noise(int bytes, unsigned seed)
{
    std::mt19937 rng(seed);
    std::vector<uint8_t> v(bytes);
    for (auto& b : v)
        b = static_cast<uint8_t>(rng());
    return v;
}

TEST(ToSampled, OddSizesWriteWhatTheirRuleSays)
{
    { // 3x3 4:2:0 from planes: one unit; column 2 and row 2 keep their bytes.
        const auto s = grey(3, 3, 1);
        const uint8_t* src[3] = {s.data(), s.data(), s.data()};
        Planes d(3, 3);
        const int steps[3] = {3, 3, 3};
        EXPECT_EQ(zoxiRGBToYUV420_8u_P3R(src, 3, d.arr(), steps, {3, 3}), zoxWarnOddSize);
        EXPECT_EQ(d.written(0), 4);
        EXPECT_EQ(d.written(1), 1);
        EXPECT_EQ(d.written(2), 1);
    }
    for (ImageSize roi : {ImageSize{1, 4}, ImageSize{4, 1}}) { // one column or one row: nothing
        const auto s = grey(4, 4, 3);
        Planes d(4, 4);
        const int steps[3] = {4, 4, 4};
        EXPECT_EQ(zoxiRGBToYUV420_8u_C3P3R(s.data(), 12, d.arr(), steps, roi), zoxWarnOddSize);
        EXPECT_EQ(d.written(0) + d.written(1) + d.written(2), 0);
    }
    struct Row {
        const char* name;
        zoxStatus (*f)(const uint8_t*, int, uint8_t* const*, const int*, ImageSize);
        int ch, width, luma, chroma;
        zoxStatus status;
    };
    const Row rows[] = {
        {"RGBToYCbCr422 C3P3R", zoxiRGBToYCbCr422_8u_C3P3R, 3, 5, 4, 2, zoxWarnOddSize},
        {"BGRToYCbCr422 C3P3R", zoxiBGRToYCbCr422_8u_C3P3R, 3, 5, 5, 2, zoxStatusOk},
        {"BGRToYCbCr411 AC4P3R", zoxiBGRToYCbCr411_8u_AC4P3R, 4, 6, 6, 1, zoxWarnOddSize},
        {"BGRToYCbCr411 C3P3R", zoxiBGRToYCbCr411_8u_C3P3R, 3, 6, 4, 1, zoxWarnOddSize},
        {"RGBToYUV422 C3P3R", zoxiRGBToYUV422_8u_C3P3R, 3, 5, 5, 3, zoxStatusOk},
    };
    for (const Row& r : rows) {
        SCOPED_TRACE(r.name);
        const auto s = grey(r.width, 1, r.ch);
        Planes d(r.width, 1);
        const int steps[3] = {r.width, r.width, r.width};
        EXPECT_EQ(r.f(s.data(), r.width * r.ch, d.arr(), steps, {r.width, 1}), r.status);
        EXPECT_EQ(d.written(0), r.luma);
        EXPECT_EQ(d.written(1), r.chroma);
        EXPECT_EQ(d.written(2), r.chroma);
    }
}

// A single last pixel of a packed 4:2:2 row fills the first two bytes of its group: Y0 and the chroma
// byte its rule names, or Cb and Y0.
TEST(ToSampled, PackedLastPixelFillsTwoBytes)
{
    using C2 = zoxStatus (*)(const uint8_t*, int, uint8_t*, int, ImageSize);
    const std::pair<C2, int> rows[] = {{zoxiRGBToYUV422_8u_C3C2R, 3},    {zoxiRGBToYCbCr422_8u_C3C2R, 3},
                                       {zoxiRGBToYCrCb422_8u_C3C2R, 3},  {zoxiBGRToYCbCr422_8u_AC4C2R, 4},
                                       {zoxiBGRToCbYCr422_8u_AC4C2R, 4}, {zoxiRGBToCbYCr422_8u_C3C2R, 3}};
    for (auto [f, ch] : rows) {
        const auto s = grey(5, 1, ch, 90);
        std::vector<uint8_t> d(12, kFill);
        EXPECT_EQ(f(s.data(), 5 * ch, d.data(), 12, {5, 1}), zoxStatusOk);
        EXPECT_NE(d[8], kFill);
        EXPECT_NE(d[9], kFill);
        EXPECT_EQ(d[10], kFill);
        EXPECT_EQ(d[11], kFill);
    }
}

// The filter has no left neighbour at the start of a row: a flat colour's first chroma lies nearer 128.
TEST(ToSampled, FilterStartsWithoutLeftNeighbour)
{
    std::vector<uint8_t> s;
    for (int i = 0; i < 8; ++i)
        s.insert(s.end(), {200, 40, 30});
    std::vector<uint8_t> d(16);
    ASSERT_EQ(zoxiRGBToCbYCr422_8u_C3C2R(s.data(), 24, d.data(), 16, {8, 1}), zoxStatusOk);
    EXPECT_LT(std::abs(d[0] - 128), std::abs(d[4] - 128)); // Cb
    EXPECT_LT(std::abs(d[2] - 128), std::abs(d[6] - 128)); // Cr
    EXPECT_EQ(d[4], d[12]);
}

TEST(ToSampled, FullRangeSetsHoldSamplesTo1Through254)
{
    for (uint8_t v : {uint8_t{0}, uint8_t{255}}) {
        const auto s = grey(64, 2, 4, v);
        Planes d(64, 2);
        const int steps[3] = {64, 32, 32};
        EXPECT_EQ(zoxiBGRToYCbCr420_709HDTV_8u_AC4P3R(s.data(), 256, d.arr(), steps, {64, 2}), zoxStatusOk);
        EXPECT_EQ(d.p[0][0], v ? 254 : 1);
        EXPECT_EQ(d.p[0][63], v ? 254 : 1);
        std::vector<uint8_t> c2(128);
        EXPECT_EQ(zoxiBGRToCbYCr422_709HDTV_8u_C3C2R(s.data(), 192, c2.data(), 128, {64, 1}), zoxStatusOk);
        EXPECT_EQ(c2[1], v ? 254 : 1);
    }
}

// YCrCb members give their YCbCr sisters' planes with Cb and Cr exchanged.
TEST(ToSampled, CrFirstMembersExchangeTheSistersChroma)
{
    using P3 = zoxStatus (*)(const uint8_t*, int, uint8_t* const*, const int*, ImageSize);
    const std::pair<P3, P3> pairs[] = {{zoxiBGRToYCbCr420_8u_C3P3R, zoxiBGRToYCrCb420_8u_C3P3R},
                                       {zoxiBGRToYCbCr420_8u_AC4P3R, zoxiBGRToYCrCb420_8u_AC4P3R},
                                       {zoxiBGRToYCbCr420_709CSC_8u_C3P3R, zoxiBGRToYCrCb420_709CSC_8u_C3P3R},
                                       {zoxiBGRToYCbCr420_709CSC_8u_AC4P3R, zoxiBGRToYCrCb420_709CSC_8u_AC4P3R}};
    const int w = 45, h = 7;
    const auto s = noise(w * h * 4, 3);
    const int steps[3] = {w, w, w};
    for (auto [cb, cr] : pairs) {
        Planes a(w, h), b(w, h);
        EXPECT_EQ(cb(s.data(), w * 4, a.arr(), steps, {w, h}), zoxWarnOddSize);
        EXPECT_EQ(cr(s.data(), w * 4, b.arr(), steps, {w, h}), zoxWarnOddSize);
        EXPECT_EQ(a.p[0], b.p[0]);
        EXPECT_EQ(a.p[1], b.p[2]);
        EXPECT_EQ(a.p[2], b.p[1]);
    }
    using C2 = zoxStatus (*)(const uint8_t*, int, uint8_t*, int, ImageSize);
    for (auto [cb, cr] : {std::pair<C2, C2>{zoxiRGBToYCbCr422_8u_C3C2R, zoxiRGBToYCrCb422_8u_C3C2R}}) {
        std::vector<uint8_t> a(2 * w + 2), b(2 * w + 2);
        ASSERT_EQ(cb(s.data(), 0, a.data(), 0, {w - 1, 1}), zoxStatusOk);
        ASSERT_EQ(cr(s.data(), 0, b.data(), 0, {w - 1, 1}), zoxStatusOk);
        for (int g = 0; g < (w - 1) / 2; ++g) {
            EXPECT_EQ(a[4 * g], b[4 * g]);
            EXPECT_EQ(a[4 * g + 1], b[4 * g + 3]);
            EXPECT_EQ(a[4 * g + 3], b[4 * g + 1]);
        }
    }
}

// Members without R: the R member with packed steps, and at 4:2:2 the whole image as one row.
TEST(ToSampled, PackedPlaneMembersFollowTheirRSisters)
{
    for (ImageSize roi : {ImageSize{13, 5}, ImageSize{30, 4}, ImageSize{20, 20}, ImageSize{35, 10}}) {
        SCOPED_TRACE(std::to_string(roi.width) + "x" + std::to_string(roi.height));
        const int w = roi.width, h = roi.height;
        const auto s = noise(w * h * 3 + 1, 9);
        const uint8_t* sp[3] = {s.data(), s.data() + 1, s.data() + 2};
        { // 4:2:0
            Planes a(w, h), b(w, h);
            const int steps[3] = {w, w / 2, w / 2};
            EXPECT_EQ(zoxiRGBToYUV420_8u_C3P3(s.data(), a.arr(), roi), zoxiRGBToYUV420_8u_C3P3R(s.data(), 3 * w, b.arr(), steps, roi));
            EXPECT_EQ(a.p, b.p);
            Planes c(w, h), e(w, h);
            EXPECT_EQ(zoxiRGBToYUV420_8u_P3(sp, c.arr(), roi), zoxiRGBToYUV420_8u_P3R(sp, w, e.arr(), steps, roi));
            EXPECT_EQ(c.p, e.p);
        }
        { // 4:2:2: one row when the width is even and the image has 256 pixels or more
            const bool oneRow = w % 2 == 0 && w * h >= 256;
            const ImageSize r2 = oneRow ? ImageSize{w * h, 1} : roi;
            const int hw = w / 2 + w % 2;
            const int steps[3] = {r2.width, oneRow ? r2.width / 2 : hw, oneRow ? r2.width / 2 : hw};
            Planes a(w, h), b(w, h);
            // The R member's source one byte off 16, so that it takes its form for unaligned rows.
            std::vector<uint8_t> shifted(s.size() + 1);
            std::copy(s.begin(), s.end(), shifted.begin() + 1);
            EXPECT_EQ(zoxiRGBToYUV422_8u_C3P3(s.data(), a.arr(), roi),
                      zoxiRGBToYUV422_8u_C3P3R(shifted.data() + 1, 3 * r2.width, b.arr(), steps, r2));
            EXPECT_EQ(a.p, b.p);
            Planes c(w, h), e(w, h);
            EXPECT_EQ(zoxiRGBToYUV422_8u_P3(sp, c.arr(), roi), zoxiRGBToYUV422_8u_P3R(sp, r2.width, e.arr(), steps, r2));
            EXPECT_EQ(c.p, e.p);
        }
    }
}

// zoxiRGBToYUV422_8u_C3P3R: rows whose pointers and steps are multiples of 16 take other forms.
TEST(ToSampled, AlignedRowsTakeTheirOwnForms)
{
    const int w = 64, h = 2;
    const auto n = noise(3 * w * h, 5);
    alignas(16) static uint8_t src[3 * 64 * 2], y[2][64 * 2], u[2][32 * 2], v[2][32 * 2];
    std::copy(n.begin(), n.end(), src);
    std::vector<uint8_t> off(n.size() + 1); // the same pixels one byte off 16
    std::copy(n.begin(), n.end(), off.begin() + 1);
    uint8_t* a[3] = {y[0], u[0], v[0]};
    uint8_t* b[3] = {y[1], u[1], v[1]};
    const int steps[3] = {64, 32, 32};
    ASSERT_EQ(zoxiRGBToYUV422_8u_C3P3R(src, 3 * w, a, steps, {w, h}), zoxStatusOk);
    ASSERT_EQ(zoxiRGBToYUV422_8u_C3P3R(off.data() + 1, 3 * w, b, steps, {w, h}), zoxStatusOk);
    EXPECT_FALSE(std::equal(y[0], y[0] + 128, y[1]) && std::equal(u[0], u[0] + 64, u[1]) && std::equal(v[0], v[0] + 64, v[1]));
}

} // namespace
