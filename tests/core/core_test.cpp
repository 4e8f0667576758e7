// The real core services.
#include "core/cpu_features.hpp"
#include "zoxcore.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <thread>
#include <vector>

TEST(Core, MallocAlignsAndRejectsEmpty)
{
    EXPECT_EQ(zoxMalloc(0), nullptr);
    EXPECT_EQ(zoxMalloc(-1), nullptr);
    for (int32_t n : {1, 63, 64, 131072}) {
        void* p = zoxMalloc(n);
        ASSERT_NE(p, nullptr);
        EXPECT_EQ(reinterpret_cast<uintptr_t>(p) % 64, 0u);
        static_cast<unsigned char*>(p)[n - 1] = 1;
        zoxFree(p);
    }
    zoxFree(nullptr);
}

TEST(Core, CacheSizeAndFeatures)
{
    int32_t size = 0;
    if (zoxGetMaxCacheSizeB(&size) == 0) {
        EXPECT_GT(size, 0);
    }
    const uint64_t f = zoxGetEnabledCpuFeatures();
    EXPECT_TRUE(f & zoxCpuSse2);
    EXPECT_EQ(ownGetFeature(128, 0) != 0, (f & zoxCpuAvx2) != 0);
    EXPECT_EQ(ownGetFeature(128, 1), 0);
}

TEST(Core, ManyThreads)
{
    std::vector<std::thread> threads;
    for (int t = 0; t < 8; ++t)
        threads.emplace_back([] {
            for (int i = 0; i < 1000; ++i) {
                void* p = zoxMalloc(100 + i);
                ASSERT_NE(p, nullptr);
                zoxFree(p);
                (void)ownGetFeature(128, 0);
            }
        });
    for (auto& t : threads)
        t.join();
}

// The decoding of the feature registers, on made-up values: a vector extension counts only with the
// operating system saving its state.
TEST(Core, FeatureWordFromRegisters)
{
    using zox::core::CpuidWords;
    const uint32_t sse = bit_SSE3 | bit_SSSE3 | bit_SSE4_1 | bit_SSE4_2 | bit_POPCNT;
    const uint32_t avx = sse | bit_OSXSAVE | bit_AVX;
    const uint64_t baseline = zoxCpuSse2 | zoxCpuSse3 | zoxCpuSsse3 | zoxCpuSse41 | zoxCpuSse42 | zoxCpuPopcnt;
    struct Row {
        const char* what;
        CpuidWords w;
        uint64_t want;
    } rows[] = {
        {"nothing", {}, 0},
        {"SSE4.2 machine", {sse, bit_SSE2, 0, 0}, baseline},
        {"AVX2, OS saves YMM", {avx, bit_SSE2, bit_AVX2, 0x7}, baseline | zoxCpuAvx | zoxCpuAvx2},
        {"AVX2, OS saves XMM only", {avx, bit_SSE2, bit_AVX2, 0x3}, baseline},
        {"AVX2 without OSXSAVE", {avx & ~bit_OSXSAVE, bit_SSE2, bit_AVX2, 0x7}, baseline},
        {"AVX2 bit without AVX", {avx & ~bit_AVX, bit_SSE2, bit_AVX2, 0x7}, baseline},
        {"AVX-512F, no ZMM state", {avx, bit_SSE2, bit_AVX2 | bit_AVX512F, 0x7}, baseline | zoxCpuAvx | zoxCpuAvx2},
        {"AVX-512F, ZMM state", {avx, bit_SSE2, bit_AVX2 | bit_AVX512F, 0xE7}, baseline | zoxCpuAvx | zoxCpuAvx2 | zoxCpuAvx512f},
    };
    for (const Row& r : rows)
        EXPECT_EQ(zox::core::featureWordOf(r.w), r.want) << r.what;
    EXPECT_EQ(zox::core::featureWordOf(zox::core::readCpuidWords()), zoxGetEnabledCpuFeatures());
}
