// The real core services.
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
