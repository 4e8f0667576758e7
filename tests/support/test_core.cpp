#include "support/test_core.hpp"

#include "core/cpu_features.hpp"
#include "zoxcore.h"

#include <cstdlib>

namespace zt::core {
std::atomic<int> mallocCalls{0};
std::atomic<int> freeCalls{0};
std::atomic<int> failAfter{-1};
std::atomic<int> feature128{0};
std::atomic<int> featureWordCalls{0};
std::atomic<int> cacheSizeCalls{0};
std::atomic<int> cacheSizeFails{0};

Scope::Scope()
{
    mallocCalls = 0;
    freeCalls = 0;
    failAfter = -1;
    cacheSizeCalls = 0;
    cacheSizeFails = 0;
}
Scope::~Scope()
{
    failAfter = -1;
    cacheSizeFails = 0;
}
} // namespace zt::core

using namespace zt::core;

extern "C" {

void* zoxMalloc(int32_t length)
{
    ++mallocCalls;
    if (length < 1)
        return nullptr;
    int left = failAfter.load();
    if (left == 0)
        return nullptr;
    if (left > 0)
        failAfter = left - 1;
    return std::aligned_alloc(64, (static_cast<std::size_t>(length) + 63) / 64 * 64);
}

void zoxFree(void* ptr)
{
    if (ptr)
        ++freeCalls;
    std::free(ptr);
}

int32_t zoxGetMaxCacheSizeB(int32_t* size)
{
    ++cacheSizeCalls;
    if (cacheSizeFails)
        return -1;
    *size = 1 << 20;
    return 0;
}

int32_t ownGetFeature(int64_t mask, int32_t reserved)
{
    return mask == 128 && reserved == 0 ? feature128.load() : 0;
}

uint64_t zoxGetEnabledCpuFeatures(void)
{
    ++featureWordCalls;
    return zox::core::featureWordOf(zox::core::readCpuidWords()); // the processor's own answer

}

} // extern "C"
