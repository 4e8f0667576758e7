// The byte-moving routines against memcpy and memset: every length to 300 at every alignment of both
// pointers, with and without streaming stores; planes contiguous and padded, on both sides of the
// streaming threshold, on the backward route; the guard bytes around every region.
#include "frame/planes.hpp"
#include "support/guarded.hpp"
#include "support/test_core.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <vector>

namespace {

std::vector<uint8_t> randomBytes(std::size_t n, unsigned seed)
{
    zt::Rng rng(seed);
    std::vector<uint8_t> v(n);
    std::generate(v.begin(), v.end(), [&] { return static_cast<uint8_t>(rng()); });
    return v;
}

} // namespace

TEST(PlaneRoutines, CopyRowAndFillRowAreMemcpyAndMemset)
{
    const std::vector<uint8_t> src = randomBytes(400, 1);
    const std::vector<uint8_t> guard = randomBytes(400, 2);
    std::vector<uint8_t> got, want;
    const uint8_t pattern[16] = {0x5A, 0x5A, 0x5A, 0x5A, 0x5A, 0x5A, 0x5A, 0x5A, 0x5A, 0x5A, 0x5A, 0x5A, 0x5A, 0x5A, 0x5A, 0x5A};
    for (std::size_t n = 0; n <= 300; ++n)
        for (int so = 0; so < 16; ++so)
            for (int dOff = 0; dOff < 16; ++dOff)
                for (bool streaming : {false, true}) {
                    alignas(16) uint8_t buf[400];
                    std::memcpy(buf, guard.data(), 400);
                    zox::copyRow(src.data() + so + 32, buf + 32 + dOff, n, streaming);
                    want = guard;
                    std::memcpy(want.data() + 32 + dOff, src.data() + so + 32, n);
                    ASSERT_EQ(0, std::memcmp(buf, want.data(), 400)) << "copy n " << n << " src+" << so << " dst+" << dOff;
                    if (so != 0)
                        continue;
                    std::memcpy(buf, guard.data(), 400);
                    zox::fillRow(pattern, buf + 32 + dOff, n, streaming);
                    want = guard;
                    std::memset(want.data() + 32 + dOff, 0x5A, n);
                    ASSERT_EQ(0, std::memcmp(buf, want.data(), 400)) << "fill n " << n << " dst+" << dOff;
                }
}

// Planes of w x h bytes with the given steps, source and destination at the given page offsets.
struct PlaneCase {
    int width, height, srcPad, dstPad, srcOffset, dstOffset;
};

TEST(PlaneRoutines, CopyPlaneAndFillPlaneOverTheirRoutes)
{
    const PlaneCase cases[] = {
        {1000, 1000, 0, 0, 0, 0},        // contiguous: one row, below the threshold
        {1000, 1000, 1, 0, 3, 5},        // padded source: row by row
        {63, 7, 2, 1, 1, 0},             // rows below 64 bytes
        {1024, 1024, 0, 0, 0, 7},        // 1 MiB contiguous: the streaming route
        {1024, 1024, 16, 16, 0, 16},     // 1 MiB in rows: the streaming route row by row
        {500, 50, 16, 16, 0, 16},        // the destination's page offset just above the source's: backwards
        {200, 9, 16, 16, 4096 - 100, 0}, // the source's page offset far above: backwards
        {200, 9, 16, 16, 8, 0},          // a source misaligned by 8
    };
    for (const PlaneCase& c : cases) {
        SCOPED_TRACE(std::to_string(c.width) + "x" + std::to_string(c.height));
        const int ss = c.width + c.srcPad, ds = c.width + c.dstPad;
        const std::size_t srcBytes = std::size_t(ss) * c.height + 8192, dstBytes = std::size_t(ds) * c.height + 8192;
        std::vector<uint8_t> srcMem = randomBytes(srcBytes, 3), dstMem = randomBytes(dstBytes, 4);
        // Page-aligned origins, then the requested offsets.
        auto pageAligned = [](std::vector<uint8_t>& v) { return v.data() + (4096 - reinterpret_cast<uintptr_t>(v.data()) % 4096) % 4096; };
        const uint8_t* src = pageAligned(srcMem) + c.srcOffset;
        uint8_t* dst = pageAligned(dstMem) + c.dstOffset;
        std::vector<uint8_t> want = dstMem;
        for (int r = 0; r < c.height; ++r)
            std::memcpy(want.data() + (dst - dstMem.data()) + std::size_t(r) * ds, src + std::size_t(r) * ss, c.width);
        ASSERT_EQ(zox::copyPlane(src, ss, dst, ds, ImageSize{c.width, c.height}), zoxStatusOk);
        ASSERT_TRUE(dstMem == want) << "copy";
        for (int r = 0; r < c.height; ++r)
            std::memset(want.data() + (dst - dstMem.data()) + std::size_t(r) * ds, 0xC3, c.width);
        ASSERT_EQ(zox::fillPlane(0xC3, dst, ds, c.width, c.height), zoxStatusOk);
        ASSERT_TRUE(dstMem == want) << "fill";
    }
}

TEST(PlaneRoutines, ChecksAndCacheQueries)
{
    zt::core::Scope scope;
    uint8_t a[64] = {}, b[64] = {};
    EXPECT_EQ(zox::copyPlane(nullptr, 8, b, 8, ImageSize{8, 8}), zoxStatusNullPointer);
    EXPECT_EQ(zox::copyPlane(a, 8, nullptr, 8, ImageSize{0, 8}), zoxStatusNullPointer);
    EXPECT_EQ(zox::copyPlane(a, 8, b, 8, ImageSize{8, 0}), zoxStatusBadSize);
    EXPECT_EQ(zox::fillPlane(1, nullptr, 8, 8, 8), zoxStatusNullPointer);
    EXPECT_EQ(zox::fillPlane(1, b, 8, -1, 8), zoxStatusBadSize);

    // Below 1 MiB samples neither routine asks for the cache size; the fill asks above it, and still
    // fills when no size is known.
    std::vector<uint8_t> big(2 << 20, 1), out(2 << 20, 0);
    ASSERT_EQ(zox::copyPlane(big.data(), 1024, out.data(), 1024, ImageSize{1024, 1023}), zoxStatusOk);
    ASSERT_EQ(zox::fillPlane(7, out.data(), 1024, 1024, 1024), zoxStatusOk);
    EXPECT_EQ(zt::core::cacheSizeCalls.load(), 0);
    zt::core::cacheSizeFails = 1;
    ASSERT_EQ(zox::fillPlane(9, out.data(), 2048, 2048, 1024), zoxStatusOk);
    EXPECT_EQ(zt::core::cacheSizeCalls.load(), 1);
    EXPECT_EQ(out.front(), 9);
    EXPECT_EQ(out.back(), 9);
}
