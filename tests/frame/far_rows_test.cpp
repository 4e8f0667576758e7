// Row offsets whose byte counts pass 32 bits: rows 1.5 GiB apart in an address range that is
// inaccessible but for the rows of the region. An offset computed in 32 bits lands elsewhere and faults.
#include "frame/exports.hpp"

#include <gtest/gtest.h>
#include <sys/mman.h>

#include <cstring>

namespace {

constexpr int kStep = 3 << 29; // 1.5 GiB: row 2 starts 3 GiB on
constexpr int kRows = 3;
constexpr std::size_t kPage = 4096;

// kRows accessible pages kStep bytes apart, inside one reserved range; positive or negative steps.
struct FarRows {
    uint8_t* base = nullptr;
    std::size_t size = static_cast<std::size_t>(kStep) * (kRows - 1) + kPage;
    explicit FarRows(uint8_t fill)
    {
        void* m = mmap(nullptr, size, PROT_NONE, MAP_PRIVATE | MAP_ANONYMOUS | MAP_NORESERVE, -1, 0);
        if (m == MAP_FAILED)
            return;
        base = static_cast<uint8_t*>(m);
        for (int r = 0; r < kRows; ++r) {
            mprotect(row(r), kPage, PROT_READ | PROT_WRITE);
            std::memset(row(r), fill + r, kPage);
        }
    }
    ~FarRows()
    {
        if (base)
            munmap(base, size);
    }
    uint8_t* row(int r) const { return base + static_cast<std::size_t>(r) * kStep; }
};

} // namespace

TEST(FarRows, OffsetsAreComputedIn64Bits)
{
    FarRows src(10), dst(100), planes[3] = {FarRows(20), FarRows(30), FarRows(40)};
    if (!src.base || !dst.base || !planes[2].base)
        GTEST_SKIP() << "no room for the address range";
    const ImageSize roi{64, kRows};
    // Forward from row 0, and backwards from the last row with a negative step.
    ASSERT_EQ(zoxiRGBToYUV_8u_C3R(src.row(0), kStep, dst.row(0), kStep, roi), zoxStatusOk);
    ASSERT_EQ(zoxiYCbCrToRGB_8u_C3R(src.row(kRows - 1), -kStep, dst.row(kRows - 1), -kStep, roi), zoxStatusOk);
    const uint8_t* in[3] = {planes[0].row(0), planes[1].row(0), planes[2].row(0)};
    ASSERT_EQ(zoxiYUVToRGB_8u_P3C3R(in, kStep, dst.row(0), kStep, roi), zoxStatusOk);
    uint16_t* g = reinterpret_cast<uint16_t*>(dst.row(0));
    ASSERT_EQ(zoxiGammaFwd_16u_C3IR(g, kStep, ImageSize{16, kRows}), zoxStatusOk);
    // Every row of the region was written: the last one too.
    for (int r = 0; r < kRows; ++r)
        EXPECT_NE(dst.row(r)[0], 100 + r) << "row " << r;
}
