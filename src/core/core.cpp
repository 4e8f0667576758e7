// zoxcore: working memory, cache size and processor features for zoxcc.
#include "zoxcore.h"

#include "core/cpu_features.hpp"

#include <unistd.h>

#include <cstdlib>
#include <initializer_list>

namespace {

constexpr std::size_t kAlignment = 64;

// Computed once; the first caller's thread runs the detection and the rest wait on it.
uint64_t features()
{
    static const uint64_t value = zox::core::featureWordOf(zox::core::readCpuidWords());
    return value;
}

} // namespace

extern "C" {

ZOXCORE_API void* zoxMalloc(int32_t length)
{
    if (length < 1)
        return nullptr;
    const std::size_t rounded = (static_cast<std::size_t>(length) + kAlignment - 1) / kAlignment * kAlignment;
    return std::aligned_alloc(kAlignment, rounded);
}

ZOXCORE_API void zoxFree(void* ptr)
{
    std::free(ptr);
}

ZOXCORE_API int32_t zoxGetMaxCacheSizeB(int32_t* size)
{
    if (!size)
        return -1;
    long best = 0;
    for (int name : {_SC_LEVEL1_DCACHE_SIZE, _SC_LEVEL2_CACHE_SIZE, _SC_LEVEL3_CACHE_SIZE, _SC_LEVEL4_CACHE_SIZE}) {
        const long v = sysconf(name);
        if (v > best)
            best = v;
    }
    if (best <= 0)
        return -1;
    *size = best > INT32_MAX ? INT32_MAX : static_cast<int32_t>(best);
    return 0;
}

ZOXCORE_API int32_t ownGetFeature(int64_t mask, int32_t reserved)
{
    if (reserved != 0 || mask <= 0)
        return 0;
    const uint64_t m = static_cast<uint64_t>(mask);
    return (features() & m) == m ? 1 : 0;
}

ZOXCORE_API uint64_t zoxGetEnabledCpuFeatures(void)
{
    return features();
}

} // extern "C"
