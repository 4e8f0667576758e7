// zoxcore: working memory, cache size and processor features for zoxcc.
#include "zoxcore.h"

#include <cpuid.h>
#include <unistd.h>

#include <cstdlib>
#include <initializer_list>

namespace {

constexpr std::size_t kAlignment = 64;

bool osSavesAvxState()
{
    unsigned a = 0, b = 0, c = 0, d = 0;
    if (!__get_cpuid(1, &a, &b, &c, &d) || !(c & bit_OSXSAVE))
        return false;
    unsigned lo = 0, hi = 0;
    __asm__("xgetbv" : "=a"(lo), "=d"(hi) : "c"(0));
    return (lo & 6u) == 6u; // XMM and YMM state
}

uint64_t detectFeatures()
{
    unsigned a = 0, b = 0, c = 0, d = 0;
    if (!__get_cpuid(1, &a, &b, &c, &d))
        return 0;
    uint64_t f = 0;
    if (d & bit_SSE2) f |= zoxCpuSse2;
    if (c & bit_SSE3) f |= zoxCpuSse3;
    if (c & bit_SSSE3) f |= zoxCpuSsse3;
    if (c & bit_SSE4_1) f |= zoxCpuSse41;
    if (c & bit_SSE4_2) f |= zoxCpuSse42;
    if (c & bit_POPCNT) f |= zoxCpuPopcnt;
    const bool avxState = osSavesAvxState();
    if (avxState && (c & bit_AVX)) f |= zoxCpuAvx;
    unsigned a7 = 0, b7 = 0, c7 = 0, d7 = 0;
    if (avxState && __get_cpuid_count(7, 0, &a7, &b7, &c7, &d7)) {
        if (b7 & bit_AVX2) f |= zoxCpuAvx2;
        unsigned lo = 0, hi = 0;
        __asm__("xgetbv" : "=a"(lo), "=d"(hi) : "c"(0));
        if ((b7 & bit_AVX512F) && (lo & 0xE0u) == 0xE0u) f |= zoxCpuAvx512f;
    }
    return f;
}

// Computed once; the first caller's thread runs the detection and the rest wait on it.
uint64_t features()
{
    static const uint64_t value = detectFeatures();
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
