// The byte-moving routines, over 16-byte vectors (the x86-64 baseline) where a route needs its own
// moves: the destination's alignment, non-temporal stores, rows run backwards. The forward bulk of the
// plain routes is the C library's copy or fill of the aligned part, which picks the widest moves the
// processor has; every route gives the same bytes.
#include "frame/planes.hpp"

#include "frame/layouts.hpp"
#include "zoxcore.h"

#include <cpuid.h>
#include <emmintrin.h>

#include <cstring>

namespace zox {

namespace {

using V = __m128i;

inline V loadU(const uint8_t* p) { return _mm_loadu_si128(reinterpret_cast<const V*>(p)); }
inline V loadA(const uint8_t* p) { return _mm_load_si128(reinterpret_cast<const V*>(p)); }
inline void storeU(uint8_t* p, V v) { _mm_storeu_si128(reinterpret_cast<V*>(p), v); }
inline void storeA(uint8_t* p, V v) { _mm_store_si128(reinterpret_cast<V*>(p), v); }
inline void storeNT(uint8_t* p, V v) { _mm_stream_si128(reinterpret_cast<V*>(p), v); }
inline bool aligned16(const void* p) { return (reinterpret_cast<uintptr_t>(p) & 15) == 0; }

// Fewer than 64 bytes (or the rest of a row): 8 bytes at a time, then one group each of 4, 2 and 1.
void copySmall(const uint8_t* s, uint8_t* d, std::size_t n)
{
    for (; n >= 8; n -= 8, s += 8, d += 8)
        std::memcpy(d, s, 8);
    if (n & 4) {
        std::memcpy(d, s, 4);
        s += 4;
        d += 4;
    }
    if (n & 2) {
        std::memcpy(d, s, 2);
        s += 2;
        d += 2;
    }
    if (n & 1)
        *d = *s;
}

// A destination that is no multiple of 16: its first 16 bytes unaligned, then on to the next boundary
// (a few bytes are written twice).
void alignDestination(const uint8_t*& s, uint8_t*& d, std::size_t& n)
{
    const std::size_t off = reinterpret_cast<uintptr_t>(d) & 15;
    if (off == 0)
        return;
    storeU(d, loadU(s));
    s += 16 - off;
    d += 16 - off;
    n -= 16 - off;
}

// 64-byte groups to an aligned destination, forwards.
template <bool AlignedSource, bool Streaming>
void bulkForward(const uint8_t*& s, uint8_t*& d, std::size_t& n)
{
    for (; n >= 64; n -= 64, s += 64, d += 64)
        for (int k = 0; k < 64; k += 16) {
            const V v = AlignedSource ? loadA(s + k) : loadU(s + k);
            if constexpr (Streaming)
                storeNT(d + k, v);
            else
                storeA(d + k, v);
        }
}

// The whole 64-byte groups through the C library's copy.
void bulkLibrary(const uint8_t*& s, uint8_t*& d, std::size_t& n)
{
    const std::size_t bulk = n & ~std::size_t{63};
    std::memcpy(d, s, bulk);
    s += bulk;
    d += bulk;
    n -= bulk;
}

// Plain rows of at least 64 bytes: the destination aligned, then the bulk; an aligned source whose page
// offset lies just below the destination's (or far above it) runs backwards, so that no load waits on
// a store to the same offset of another page.
void copyRowNormal(const uint8_t* s, uint8_t* d, std::size_t n)
{
    alignDestination(s, d, n);
    if (n < 64) {
        copySmall(s, d, n);
        return;
    }
    if (!aligned16(s)) {
        bulkLibrary(s, d, n);
        copySmall(s, d, n);
        return;
    }
    const int pageDelta = static_cast<int>(reinterpret_cast<uintptr_t>(s) & 4095) - static_cast<int>(reinterpret_cast<uintptr_t>(d) & 4095);
    if (pageDelta >= 3936 || (pageDelta >= -160 && pageDelta <= -1)) {
        const std::size_t groups = n / 64, rest = n % 64;
        copySmall(s + groups * 64, d + groups * 64, rest);
        for (std::size_t g = groups; g-- > 0;)
            for (int k = 48; k >= 0; k -= 16)
                storeA(d + g * 64 + k, loadA(s + g * 64 + k));
        return;
    }
    bulkLibrary(s, d, n);
    copySmall(s, d, n);
}

// The plane copy's streaming route, one row: single bytes to a 16-byte boundary of the destination,
// then chunks of 256 KiB, each first read one byte a 64-byte line (so that the chunk comes into the
// cache), then copied with non-temporal stores. The caller fences after the last row.
void copyRowStreaming(const uint8_t* s, uint8_t* d, std::size_t n)
{
    for (; n > 0 && !aligned16(d); --n)
        *d++ = *s++;
    constexpr std::size_t chunk = 262144;
    while (n >= 16) {
        const std::size_t c = n < chunk ? n & ~std::size_t{15} : chunk;
        volatile uint8_t sink = 0;
        for (std::size_t i = 0; i < c; i += 64)
            sink = sink + s[i];
        for (std::size_t i = 0; i < c; i += 16)
            storeNT(d + i, loadU(s + i));
        s += c;
        d += c;
        n -= c;
    }
    for (; n > 0; --n)
        *d++ = *s++;
}

// Rows below 64 bytes in a plane: groups of 32, 16, 8 and 4 as the length's bits ask, then up to three
// single bytes from the end of the row.
void copyRowPlain(const uint8_t* s, uint8_t* d, std::size_t n)
{
    std::size_t i = 0;
    if (n & 32) {
        storeU(d + i, loadU(s + i));
        storeU(d + i + 16, loadU(s + i + 16));
        i += 32;
    }
    if (n & 16) {
        storeU(d + i, loadU(s + i));
        i += 16;
    }
    if (n & 8) {
        std::memcpy(d + i, s + i, 8);
        i += 8;
    }
    if (n & 4) {
        std::memcpy(d + i, s + i, 4);
        i += 4;
    }
    for (std::size_t j = n; j > i; --j)
        d[j - 1] = s[j - 1];
}

// Cache descriptors of CPUID leaf 2 and the sizes they stand for, largest first.
struct CacheDescriptor {
    uint8_t code;
    int32_t bytes;
};
constexpr int32_t KiB = 1024, MiB = 1024 * 1024;
constexpr CacheDescriptor kCacheDescriptors[] = {
    {0xEC, 24 * MiB}, {0xEB, 18 * MiB}, {0x4D, 16 * MiB}, {0xEA, 12 * MiB}, {0x4C, 12 * MiB}, {0xE4, 8 * MiB},
    {0xDE, 8 * MiB},  {0x4B, 8 * MiB},  {0x47, 8 * MiB},  {0x4E, 6 * MiB},  {0x4A, 6 * MiB},  {0xE3, 4 * MiB},
    {0xDD, 4 * MiB},  {0xD8, 4 * MiB},  {0x49, 4 * MiB},  {0x29, 4 * MiB},  {0x46, 4 * MiB},  {0x48, 3 * MiB},
    {0xE2, 2 * MiB},  {0xDC, 2 * MiB},  {0xD7, 2 * MiB},  {0xD2, 2 * MiB},  {0x25, 2 * MiB},  {0x7D, 2 * MiB},
    {0x85, 2 * MiB},  {0x45, 2 * MiB},  {0xD6, 1 * MiB},  {0xD1, 1 * MiB},  {0x23, 1 * MiB},  {0x87, 1 * MiB},
    {0x7C, 1 * MiB},  {0x78, 1 * MiB},  {0x84, 1 * MiB},  {0x44, 1 * MiB},  {0xD0, 512 * KiB}, {0x22, 512 * KiB},
    {0x7B, 512 * KiB}, {0x80, 512 * KiB}, {0x86, 512 * KiB}, {0x3E, 512 * KiB}, {0x7F, 512 * KiB}, {0x83, 512 * KiB},
    {0x43, 512 * KiB},
};
static_assert(sizeof(kCacheDescriptors) / sizeof(kCacheDescriptors[0]) == 43);

// The size from leaf 2 of a processor of the vendor the descriptors are defined by; 0 when it reports
// more than one round or no listed descriptor.
int64_t descriptorCacheSize()
{
    unsigned a = 0, b = 0, c = 0, d = 0;
    if (!__get_cpuid(2, &a, &b, &c, &d) || (a & 0xFF) != 1)
        return 0;
    uint8_t bytes[16] = {};
    const unsigned regs[4] = {a & ~0xFFu, b, c, d}; // the first register's low byte is the round count
    for (int r = 0; r < 4; ++r)
        if ((regs[r] & 0x80000000u) == 0)
            std::memcpy(bytes + 4 * r, &regs[r], 4);
    for (const CacheDescriptor& e : kCacheDescriptors)
        for (uint8_t v : bytes)
            if (v == e.code)
                return e.bytes;
    return 0;
}

bool vendorUsesDescriptors()
{
    unsigned a = 0, b = 0, c = 0, d = 0;
    if (!__get_cpuid(0, &a, &b, &c, &d) || a < 2)
        return false;
    char vendor[12];
    std::memcpy(vendor, &b, 4);
    std::memcpy(vendor + 4, &d, 4);
    std::memcpy(vendor + 8, &c, 4);
    return std::memcmp(vendor, "GenuineIntel", 12) == 0;
}

// What the processor's descriptors say, read once while the library loads: CPUID is slow where it
// traps to a hypervisor, and the answer never changes.
bool gDescriptorVendor = false;
int64_t gDescriptorCacheSize = 0;

} // namespace

void probeCacheDescriptors()
{
    gDescriptorVendor = vendorUsesDescriptors();
    gDescriptorCacheSize = gDescriptorVendor ? descriptorCacheSize() : 0;
}

void copyRow(const uint8_t* s, uint8_t* d, std::size_t n, bool streaming)
{
    if (n >= 64) {
        alignDestination(s, d, n);
        if (n >= 64) {
            const uint32_t delta = static_cast<uint32_t>(reinterpret_cast<uintptr_t>(s) - reinterpret_cast<uintptr_t>(d)) & 0xFFFF;
            if (streaming && (delta < 0xFEC0 || delta > 0xFFF0)) {
                bulkForward<false, true>(s, d, n);
                _mm_sfence();
            } else {
                bulkLibrary(s, d, n);
            }
        }
    }
    copySmall(s, d, n);
}

int64_t planeCopyCacheSize()
{
    if (gDescriptorVendor)
        return gDescriptorCacheSize;
    // Other processors: the core services' answer.
    int32_t size = 0;
    return zoxGetMaxCacheSizeB(&size) == 0 && size > 0 ? size : 0;
}

zoxStatus copyPlane(const uint8_t* src, int srcStep, uint8_t* dst, int dstStep, ImageSize roi)
{
    if (!src || !dst)
        return zoxStatusNullPointer;
    if (roi.width < 1 || roi.height < 1)
        return zoxStatusBadSize;
    std::size_t width = static_cast<std::size_t>(roi.width);
    int rows = roi.height;
    if (roi.width == srcStep && roi.width == dstStep) { // one contiguous run
        width *= static_cast<std::size_t>(roi.height);
        rows = 1;
    }
    if (width < 64) {
        for (int r = 0; r < rows; ++r)
            copyRowPlain(rowAddress(src, srcStep, r), rowAddress(dst, dstStep, r), width);
        return zoxStatusOk;
    }
    const int64_t total = static_cast<int64_t>(roi.width) * roi.height;
    bool streaming = total > INT32_MAX; // a product that overflows 32 bits streams without asking
    if (!streaming && total >= 1048576) {
        const int64_t cache = planeCopyCacheSize();
        streaming = cache > 0 && total >= cache / 2;
    }
    for (int r = 0; r < rows; ++r) {
        const uint8_t* s = rowAddress(src, srcStep, r);
        uint8_t* d = rowAddress(dst, dstStep, r);
        if (streaming)
            copyRowStreaming(s, d, width);
        else
            copyRowNormal(s, d, width);
    }
    if (streaming)
        _mm_sfence();
    return zoxStatusOk;
}

void fillRow(const uint8_t (&pattern)[16], uint8_t* d, std::size_t n, bool streaming)
{
    const V p = loadU(pattern);
    if (n >= 64 && !aligned16(d)) {
        storeU(d, p);
        const std::size_t step = 16 - (reinterpret_cast<uintptr_t>(d) & 15);
        d += step;
        n -= step;
    }
    if (n >= 64) {
        const std::size_t bulk = n & ~std::size_t{63};
        if (streaming) {
            for (std::size_t i = 0; i < bulk; i += 16)
                storeNT(d + i, p);
            _mm_sfence();
        } else {
            std::memset(d, pattern[0], bulk);
        }
        d += bulk;
        n -= bulk;
    }
    for (; n >= 16; n -= 16, d += 16)
        storeU(d, p);
    std::memset(d, pattern[0], n);
}

zoxStatus fillPlane(uint8_t value, uint8_t* dst, int dstStep, int width, int height)
{
    if (!dst)
        return zoxStatusNullPointer;
    if (width < 1 || height < 1)
        return zoxStatusBadSize;
    std::size_t length = static_cast<std::size_t>(width);
    int rows = height;
    if (width == dstStep) {
        length *= static_cast<std::size_t>(height);
        rows = 1;
    }
    const int64_t pixels = static_cast<int64_t>(width) * height;
    bool streaming = false;
    if (pixels > 1048576) {
        int32_t size = 0;
        if (zoxGetMaxCacheSizeB(&size) == 0)
            streaming = pixels >= size;
    }
    uint8_t pattern[16];
    std::memset(pattern, value, sizeof pattern);
    for (int r = 0; r < rows; ++r)
        fillRow(pattern, rowAddress(dst, dstStep, r), length, streaming);
    return zoxStatusOk;
}

} // namespace zox
