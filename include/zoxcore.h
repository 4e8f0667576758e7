/*
 * zoxcore: the core services beside zoxcc. Working memory, the largest cache size and two processor
 * feature queries. Every function is safe to call from many threads at once.
 */
#ifndef ZOXCORE_H
#define ZOXCORE_H

#include <stdint.h>

#if defined(__GNUC__)
#define ZOXCORE_API __attribute__((visibility("default")))
#else
#define ZOXCORE_API
#endif

#ifdef __cplusplus
extern "C" {
#endif

/* Feature bits of zoxGetEnabledCpuFeatures and masks of ownGetFeature: a bit is set when the processor
 * has the extension and the operating system has enabled its register state. */
enum {
    zoxCpuSse2 = 1 << 0,
    zoxCpuSse3 = 1 << 1,
    zoxCpuSsse3 = 1 << 2,
    zoxCpuSse41 = 1 << 3,
    zoxCpuSse42 = 1 << 4,
    zoxCpuAvx = 1 << 5,
    zoxCpuPopcnt = 1 << 6,
    zoxCpuAvx2 = 1 << 7, /* 128: the feature the version query asks about */
    zoxCpuAvx512f = 1 << 8
};

/* A block of at least `length` bytes, aligned to 64 bytes, or null (also for a length below 1). */
ZOXCORE_API void* zoxMalloc(int32_t length);

/* Releases a block from zoxMalloc; null is accepted and ignored. */
ZOXCORE_API void zoxFree(void* ptr);

/* Stores the size in bytes of the largest cache in *size and returns 0; returns non-zero and leaves
 * *size alone when no size is known. */
ZOXCORE_API int32_t zoxGetMaxCacheSizeB(int32_t* size);

/* Non-zero when every bit of `mask` is among the enabled features; `reserved` must be 0. Feature 128
 * asks for AVX2: the processor can run more than the SSE4.1 baseline this build was made for. */
ZOXCORE_API int32_t ownGetFeature(int64_t mask, int32_t reserved);

/* The word of enabled feature bits above. */
ZOXCORE_API uint64_t zoxGetEnabledCpuFeatures(void);

#ifdef __cplusplus
}
#endif

#endif /* ZOXCORE_H */
