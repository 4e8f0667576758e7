// Gamma exports: every member against the curve evaluated sample by sample, the check order, the 16u
// table path and its working memory.
#include "frame/exports.hpp"
#include "support/guarded.hpp"
#include "support/test_core.hpp"

#include <gtest/gtest.h>

#include <cmath>
#include <cstring>
#include <limits>
#include <memory>
#include <vector>

using namespace zox;

namespace {

template <class T, gamma::Dir D>
T expected(T s, GammaRange range)
{
    if constexpr (std::is_same_v<T, uint8_t>)
        return gamma::entry8u<D>(s); // the curve itself, not the stored table
    else if constexpr (std::is_same_v<T, uint16_t>)
        return gamma::eval16u<D>(s);
    else {
        const float r32 = range.high - range.low;
        return gamma::eval32f<D>(s, range.low, r32, r32, 1.0 / static_cast<double>(r32));
    }
}

template <class T>
void fillSamples(zt::Plane& p, zt::Rng& rng)
{
    const auto& s = p.shape();
    for (int r = 0; r < s.rows; ++r) {
        auto* row = reinterpret_cast<T*>(p.row(r));
        for (std::size_t i = 0; i < s.rowBytes / sizeof(T); ++i) {
            if constexpr (std::is_same_v<T, float>)
                row[i] = std::uniform_real_distribution<float>(-0.25f, 1.5f)(rng);
            else
                row[i] = static_cast<T>(rng());
        }
    }
}

// Calls an export of any gamma shape on planes built from `srcPlanes` (out of place) or in place.
template <class T, class F>
zoxStatus call(F f, std::vector<T*>& src, int srcStep, std::vector<T*>& dst, int dstStep, ImageSize roi, GammaRange range)
{
    constexpr bool ranged = std::is_same_v<T, float>;
    auto finish = [&](auto&&... args) -> zoxStatus {
        if constexpr (ranged)
            return f(args..., range.low, range.high);
        else
            return f(args...);
    };
    using CSrc = const T* const*;
    if constexpr (std::is_invocable_v<F, const T*, int, T*, int, ImageSize> ||
                  std::is_invocable_v<F, const T*, int, T*, int, ImageSize, float, float>)
        return finish(static_cast<const T*>(src[0]), srcStep, dst[0], dstStep, roi);
    else if constexpr (std::is_invocable_v<F, CSrc, int, T* const*, int, ImageSize> ||
                       std::is_invocable_v<F, CSrc, int, T* const*, int, ImageSize, float, float>)
        return finish(static_cast<CSrc>(src.data()), srcStep, static_cast<T* const*>(dst.data()), dstStep, roi);
    else if constexpr (std::is_invocable_v<F, T*, int, ImageSize> || std::is_invocable_v<F, T*, int, ImageSize, float, float>)
        return finish(src[0], srcStep, roi);
    else
        return finish(static_cast<T* const*>(src.data()), srcStep, roi);
}

template <class F, class T>
constexpr bool inPlace = std::is_invocable_v<F, T*, int, ImageSize> || std::is_invocable_v<F, T*, int, ImageSize, float, float> ||
                         std::is_invocable_v<F, T* const*, int, ImageSize> ||
                         std::is_invocable_v<F, T* const*, int, ImageSize, float, float>;

template <class T, gamma::Dir D, class L, class F>
void sweep(const char* name, F f)
{
    zt::Rng rng(5);
    const GammaRange range{-0.5f, 1.25f};
    // Misalignments that keep every sample on its own type's alignment (-1: the region ends the page).
    auto aligned = [](int m) { return m < 0 ? m : m / static_cast<int>(sizeof(T)) * static_cast<int>(sizeof(T)); };
    for (int w : {1, 2, 3, 7, 16, 17, 33, 70})
        for (int h : {1, 2, 3}) {
            SCOPED_TRACE(std::string(name) + " " + std::to_string(w) + "x" + std::to_string(h));
            const int rowBytes = w * L::stride * static_cast<int>(sizeof(T));
            std::vector<std::unique_ptr<zt::Plane>> srcP, dstP;
            std::vector<T*> src, dst;
            for (int p = 0; p < L::planes; ++p) {
                srcP.push_back(std::make_unique<zt::Plane>(zt::PlaneShape{h, rowBytes, rowBytes + 4, aligned((w + p) % 17 - 1)}, rng));
                fillSamples<T>(*srcP.back(), rng);
                src.push_back(reinterpret_cast<T*>(srcP.back()->data()));
                dstP.push_back(std::make_unique<zt::Plane>(zt::PlaneShape{h, rowBytes, rowBytes + 8, aligned((w * 3 + p) % 16)}, rng));
                dst.push_back(reinterpret_cast<T*>(dstP.back()->data()));
            }
            std::vector<std::vector<uint8_t>> srcBefore, dstBefore;
            for (int p = 0; p < L::planes; ++p) {
                srcBefore.push_back(srcP[p]->bytes());
                dstBefore.push_back(dstP[p]->bytes());
            }
            const bool ip = inPlace<F, T>;
            auto& outP = ip ? srcP : dstP;
            auto& outBefore = ip ? srcBefore : dstBefore;
            ASSERT_EQ(call<T>(f, src, srcP[0]->shape().step, dst, dstP[0]->shape().step, ImageSize{w, h}, range), zoxStatusOk);
            for (int p = 0; p < L::planes; ++p) {
                if (!ip) {
                    ASSERT_EQ(srcP[p]->bytes(), srcBefore[p]) << "source changed";
                }
                ASSERT_EQ(outP[p]->firstGuardChange(outBefore[p]), -1) << "written outside the region";
                const auto& sp = srcP[p]->shape();
                for (int r = 0; r < h; ++r) {
                    const uint8_t* before = outBefore[p].data() + (outP[p]->row(r) - outP[p]->blockBegin());
                    const uint8_t* inBytes = srcBefore[p].data() + (srcP[p]->row(r) - srcP[p]->blockBegin());
                    const T* out = reinterpret_cast<const T*>(outP[p]->row(r));
                    for (int i = 0; i < w * L::stride; ++i) {
                        T in, old;
                        std::memcpy(&in, inBytes + i * sizeof(T), sizeof(T));
                        std::memcpy(&old, before + i * sizeof(T), sizeof(T));
                        const T want = (L::stride == 4 && i % 4 == 3) ? old : expected<T, D>(in, range);
                        ASSERT_EQ(std::memcmp(&out[i], &want, sizeof(T)), 0) << "plane " << p << " row " << r << " sample " << i;
                    }
                }
                (void)sp;
            }
        }
}

} // namespace

#define ZT_GAMMA_SWEEP(name, shape, T, D, L) \
    TEST(GammaSweep, name) { sweep<T, D, L>(#name, &name); }
ZOX_GAMMA_TABLE(ZT_GAMMA_SWEEP)

TEST(GammaValidation, OrderOfChecks)
{
    uint8_t b8[64] = {};
    float f32[64] = {};
    uint8_t* planes[3] = {b8, b8 + 16, nullptr};
    const uint8_t* cplanes[3] = {b8, b8 + 16, b8 + 32};
    const ImageSize ok{4, 2}, bad{0, 2};
    struct Row {
        const char* what;
        zoxStatus got, want;
    } rows[] = {
        {"32f equal range before null pointers", zoxiGammaFwd_32f_C3R(nullptr, 12, nullptr, 12, bad, 1.0f, 1.0f), zoxStatusBadRange},
        {"32f reversed range", zoxiGammaInv_32f_C3IR(f32, 48, ok, 1.0f, 0.5f), zoxStatusBadRange},
        {"32f NaN range accepted", zoxiGammaFwd_32f_C3IR(f32, 48, ok, 0.0f, std::numeric_limits<float>::quiet_NaN()), zoxStatusOk},
        {"null before size", zoxiGammaFwd_8u_C3R(nullptr, 12, b8, 12, bad), zoxStatusNullPointer},
        {"null plane before size", zoxiGammaFwd_8u_P3R(cplanes, 16, planes, 16, bad), zoxStatusNullPointer},
        {"null array", zoxiGammaFwd_8u_IP3R(nullptr, 16, ok), zoxStatusNullPointer},
        {"size before step", zoxiGammaFwd_8u_C3R(b8, 0, b8, 12, bad), zoxStatusBadSize},
        {"zero step", zoxiGammaInv_8u_AC4IR(b8, 0, ok), zoxStatusBadStep},
        {"negative destination step", zoxiGammaFwd_16u_C3R(reinterpret_cast<uint16_t*>(b8), 24, reinterpret_cast<uint16_t*>(b8), -24, ImageSize{1, 1}), zoxStatusBadStep},
        {"step 1 accepted", zoxiGammaFwd_8u_C3IR(b8, 1, ImageSize{1, 2}), zoxStatusOk},
    };
    for (const Row& r : rows)
        EXPECT_EQ(r.got, r.want) << r.what;
}

// 16u: n = width x 3 x height; up to 65536 samples each is evaluated, above that a table is built.
TEST(Gamma16u, PathsAllocationAndValues)
{
    zt::core::Scope scope;
    // One row holding every value 0..65535: n = 65538 takes the table path.
    std::vector<uint16_t> all(21846 * 3), out(all.size());
    for (std::size_t i = 0; i < all.size(); ++i)
        all[i] = static_cast<uint16_t>(i);
    ASSERT_EQ(zoxiGammaFwd_16u_C3R(all.data(), 21846 * 6, out.data(), 21846 * 6, ImageSize{21846, 1}), zoxStatusOk);
    EXPECT_EQ(zt::core::mallocCalls.load(), 1);
    EXPECT_EQ(zt::core::freeCalls.load(), 1);
    for (std::size_t i = 0; i < all.size(); ++i)
        ASSERT_EQ(out[i], gamma::eval16u<gamma::Dir::Fwd>(all[i])) << i;

    // n = 65535: direct, no allocation, the same values.
    zt::core::mallocCalls = 0;
    std::vector<uint16_t> direct(21845 * 3);
    ASSERT_EQ(zoxiGammaFwd_16u_C3R(all.data(), 21845 * 6, direct.data(), 21845 * 6, ImageSize{21845, 1}), zoxStatusOk);
    EXPECT_EQ(zt::core::mallocCalls.load(), 0);
    EXPECT_TRUE(std::equal(direct.begin(), direct.end(), out.begin()));

    // AC4 16384 x 2: n = 98304 counts three channels; the fourth stays.
    std::vector<uint16_t> ac4(16384 * 4 * 2, 77), ac4out(ac4.size(), 4242);
    ASSERT_EQ(zoxiGammaInv_16u_AC4R(ac4.data(), 16384 * 8, ac4out.data(), 16384 * 8, ImageSize{16384, 2}), zoxStatusOk);
    EXPECT_EQ(zt::core::mallocCalls.load(), 1);
    for (std::size_t i = 3; i < ac4out.size(); i += 4)
        ASSERT_EQ(ac4out[i], 4242);
}

TEST(Gamma16u, FailedAllocationLeavesImageUntouched)
{
    zt::core::Scope scope;
    zt::core::failAfter = 0;
    std::vector<uint16_t> img(30000 * 3, 1234);
    const auto before = img;
    EXPECT_EQ(zoxiGammaFwd_16u_C3IR(img.data(), 30000 * 6, ImageSize{30000, 1}), zoxStatusNoMemory);
    EXPECT_EQ(img, before);
    EXPECT_EQ(zt::core::freeCalls.load(), 0);
}
