// Tone mapping: the values that pin the statistics and the conversion rule, the checks, every kernel set
// against the scalar forms, in place, and the guard bytes around the region.
#include "frame/exports.hpp"
#include "support/conv_sweep.hpp"
#include "tonemap/tonemap_kernels.hpp"

#include <gtest/gtest.h>

#include <cmath>
#include <cstring>
#include <limits>
#include <vector>

using namespace zox;

namespace {

using ToneFn = zoxStatus (*)(const float*, int, uint8_t*, int, ImageSize);

struct Result {
    zoxStatus status;
    std::vector<int> bytes;
};

// One row through f into a destination that starts at 77 everywhere.
Result oneRow(ToneFn f, const std::vector<float>& row)
{
    std::vector<uint8_t> out(row.size(), 77);
    Result r{f(row.data(), static_cast<int>(row.size() * 4), out.data(), static_cast<int>(row.size()), ImageSize{int(row.size()), 1}), {}};
    r.bytes.assign(out.begin(), out.end());
    return r;
}

constexpr float kNaN = std::numeric_limits<float>::quiet_NaN();
constexpr float kInf = std::numeric_limits<float>::infinity();

} // namespace

TEST(ToneMap, PinnedValues)
{
    struct Row {
        const char* what;
        ToneFn f;
        std::vector<float> in;
        zoxStatus status;
        std::vector<int> want;
    } rows[] = {
        {"linear: scale 63.75, -63.75 wraps to 193", zoxiToneMapLinear_32f8u_C1R, {4, -1, 2, 1}, zoxStatusOk, {255, 193, 127, 63}},
        {"mean: T 3, scale 85", zoxiToneMapMean_32f8u_C1R, {4, -1, 2, 1}, zoxStatusOk, {255, 0, 170, 85}},
        {"mean: T 4", zoxiToneMapMean_32f8u_C1R, {1, 1, 1, 5}, zoxStatusOk, {63, 63, 63, 255}},
        {"linear: all negative", zoxiToneMapLinear_32f8u_C1R, {-1, -2, -0.5f}, zoxWarnNoOperation, {77, 77, 77}},
        {"mean: negative sum", zoxiToneMapMean_32f8u_C1R, {-5, 1, 2}, zoxWarnNoOperation, {77, 77, 77}},
        {"linear: all zero is black", zoxiToneMapLinear_32f8u_C1R, {0, 0, 0}, zoxStatusOk, {0, 0, 0}},
        {"mean: below the smallest normal", zoxiToneMapMean_32f8u_C1R, {1e-39f, 0}, zoxStatusOk, {0, 0}},
        {"linear: 1.2e-38 overflows the scale", zoxiToneMapLinear_32f8u_C1R, {1.2e-38f, 0}, zoxStatusOk, {0, 0}},
        {"linear: flat", zoxiToneMapLinear_32f8u_C1R, {3, 3, 3}, zoxStatusOk, {255, 255, 255}},
        {"mean: flat", zoxiToneMapMean_32f8u_C1R, {3, 3, 3}, zoxStatusOk, {127, 127, 127}},
        {"linear: NaN is no maximum, and maps to 0", zoxiToneMapLinear_32f8u_C1R, {kNaN, 2, 1}, zoxStatusOk, {0, 255, 127}},
        {"mean: a NaN sum is black", zoxiToneMapMean_32f8u_C1R, {kNaN, 2, 1}, zoxStatusOk, {0, 0, 0}},
        {"linear: infinite maximum, scale 0", zoxiToneMapLinear_32f8u_C1R, {kInf, 2}, zoxStatusOk, {0, 0}},
    };
    // A NaN behind the maximum in the same lane of the sixteen leaves the maximum.
    std::vector<float> lane(32, 1.0f);
    lane[0] = 10.0f;
    lane[16] = kNaN;
    std::vector<int> laneWant(32, 25);
    laneWant[0] = 255;
    laneWant[16] = 0;
    const Row laneRow{"NaN behind the maximum", zoxiToneMapLinear_32f8u_C1R, lane, zoxStatusOk, laneWant};
    for (const Row& r : rows) {
        const Result got = oneRow(r.f, r.in);
        EXPECT_EQ(got.status, r.status) << r.what;
        EXPECT_EQ(got.bytes, r.want) << r.what;
    }
    EXPECT_EQ(oneRow(laneRow.f, laneRow.in).bytes, laneRow.want) << laneRow.what;
    // A product of 2^31 or more converts to the most negative integer: 0 in the mean form.
    EXPECT_EQ(tonemap::Mean::map(3e9f, 1.0f), 0);
    EXPECT_EQ(tonemap::Linear::map(-63.75f, 1.0f), 193);
}

TEST(ToneMap, Checks)
{
    float s[4] = {1, 2, 3, 4};
    uint8_t d[4] = {9, 9, 9, 9};
    for (ToneFn f : {zoxiToneMapLinear_32f8u_C1R, zoxiToneMapMean_32f8u_C1R}) {
        EXPECT_EQ(f(nullptr, 16, d, 4, ImageSize{0, 1}), zoxStatusNullPointer);
        EXPECT_EQ(f(s, 16, nullptr, 4, ImageSize{4, 1}), zoxStatusNullPointer);
        EXPECT_EQ(f(s, 16, d, 4, ImageSize{4, 0}), zoxStatusBadSize);
        EXPECT_EQ(f(s, 16, d, 4, ImageSize{-1, 1}), zoxStatusBadSize);
    }
    EXPECT_EQ(d[0], 9);
}

// Every kernel set the processor runs against the scalar forms: widths 1..70 and wider, each float
// offset in a 16-byte block (and a few not on 4 bytes), samples with extremes, NaN and infinities.
TEST(ToneMap, KernelsAgainstForms)
{
    zt::Rng rng(11);
    std::uniform_real_distribution<float> value(-100.0f, 1000.0f);
    const float specials[] = {0.0f, -0.0f, kNaN, kInf, -kInf, 3e9f, -3e9f, 1e-40f};
    std::vector<uint8_t> mem(4 * 700 + 64), a(700 + 32), b(700 + 32);
    for (zox::KernelSet k : zt::runnableKernelSets())
        for (int width : {1, 2, 3, 5, 6, 7, 15, 16, 17, 31, 33, 64, 70, 129, 555})
            for (int offset : {0, 4, 8, 12, 2, 7}) {
                SCOPED_TRACE(std::string(zox::kernelSetName(k)) + " width " + std::to_string(width) + " offset " + std::to_string(offset));
                float* s = reinterpret_cast<float*>(mem.data() + 16 - reinterpret_cast<uintptr_t>(mem.data()) % 16 + offset);
                for (int x = 0; x < width; ++x) {
                    const float v = rng() % 9 == 0 ? specials[rng() % 8] : value(rng);
                    std::memcpy(s + x, &v, 4);
                }
                double wantSum = 0.0, gotSum = 0.0;
                tonemap::addRowSum(s, width, wantSum);
                const float wantMax = tonemap::rowMax(s, width, tonemap::kMaxStart);
                float gotMax = 0;
                auto run = [&]<zox::KernelSet K>() {
                    ToneKernels<K>::addRowSum(s, width, gotSum);
                    gotMax = ToneKernels<K>::maxRow(s, width, tonemap::kMaxStart);
                    for (int dOff = 0; dOff < 16; dOff += 5) {
                        for (int x = 0; x < width; ++x)
                            a[dOff + x] = tonemap::Linear::map(tonemap::at(s, x), 0.37f), b[dOff + x] = tonemap::Mean::map(tonemap::at(s, x), 0.37f);
                        std::vector<uint8_t> ga(a.size(), 1), gb(b.size(), 1);
                        ToneKernels<K>::template mapRow<tonemap::Linear>(s, ga.data() + dOff, width, 0.37f);
                        ToneKernels<K>::template mapRow<tonemap::Mean>(s, gb.data() + dOff, width, 0.37f);
                        ASSERT_TRUE(std::equal(ga.begin() + dOff, ga.begin() + dOff + width, a.begin() + dOff)) << "linear";
                        ASSERT_TRUE(std::equal(gb.begin() + dOff, gb.begin() + dOff + width, b.begin() + dOff)) << "mean";
                        ASSERT_EQ(ga[dOff + width], 1) << "written past the row";
                    }
                };
                if constexpr (zox::kHaveAvx2)
                    if (k == zox::KernelSet::Avx2)
                        run.template operator()<zox::KernelSet::Avx2>();
                if constexpr (zox::kHaveSse41)
                    if (k == zox::KernelSet::Sse41)
                        run.template operator()<zox::KernelSet::Sse41>();
                ASSERT_TRUE(std::memcmp(&gotSum, &wantSum, sizeof(double)) == 0 || (std::isnan(gotSum) && std::isnan(wantSum)))
                    << gotSum << " " << wantSum;
                ASSERT_TRUE(gotMax == wantMax || (gotMax == 0 && wantMax == 0));
            }
}

// Whole images on guarded planes, over both mapping paths (widths 6/7, 16/17) and steps of any sign:
// nothing outside the region changes (nor is read: the source ends at a PROT_NONE page), and in place
// (dst == src) gives the bytes of the out-of-place call on the same rows.
TEST(ToneMap, ImagesGuardedAndInPlace)
{
    zt::Rng rng(5);
    std::uniform_real_distribution<float> value(-1.0f, 50.0f);
    for (ToneFn f : {zoxiToneMapLinear_32f8u_C1R, zoxiToneMapMean_32f8u_C1R})
        for (int width : {6, 7, 16, 17, 40})
            for (int kind = 0; kind < 3; ++kind) {
                const int height = 3;
                zt::Plane src(zt::PlaneShape{height, width * 4, zt::pickStep(kind, height, width * 4, rng) & ~3, -1}, rng);
                zt::Plane dst(zt::PlaneShape{height, width, zt::pickStep(kind, height, width, rng), width % 16}, rng);
                for (int r = 0; r < height; ++r)
                    for (int x = 0; x < width; ++x) {
                        const float v = value(rng);
                        std::memcpy(src.row(r) + 4 * x, &v, 4);
                    }
                const auto dstBefore = dst.bytes();
                const ImageSize roi{width, height};
                ASSERT_EQ(f(reinterpret_cast<const float*>(src.data()), src.shape().step, dst.data(), dst.shape().step, roi), zoxStatusOk);
                ASSERT_EQ(dst.firstGuardChange(dstBefore), -1);
                if (kind == 0) {
                    std::vector<float> img(std::size_t(width) * height);
                    for (int r = 0; r < height; ++r)
                        std::memcpy(&img[std::size_t(r) * width], src.row(r), 4 * width);
                    std::vector<uint8_t> ref(img.size());
                    ASSERT_EQ(f(img.data(), 4 * width, ref.data(), width, roi), zoxStatusOk);
                    ASSERT_EQ(f(img.data(), 4 * width, reinterpret_cast<uint8_t*>(img.data()), 4 * width, roi), zoxStatusOk);
                    for (int r = 0; r < height; ++r)
                        ASSERT_EQ(0, std::memcmp(reinterpret_cast<uint8_t*>(img.data()) + std::size_t(r) * 4 * width, &ref[std::size_t(r) * width], width))
                            << "in place, row " << r;
                }
            }
}
