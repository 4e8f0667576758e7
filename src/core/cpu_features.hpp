// The processor's feature registers and their decoding into the feature word of zoxcore.h. The decoding
// is a pure function of the register values, so that it can be checked on made-up ones.
#pragma once

#include "zoxcore.h"

#include <cpuid.h>

#include <cstdint>

namespace zox::core {

// The registers the decoding reads: CPUID leaf 1 ECX and EDX, leaf 7 subleaf 0 EBX, and XCR0 (read
// only when the processor reports OSXSAVE; 0 otherwise).
struct CpuidWords {
    uint32_t leaf1Ecx = 0, leaf1Edx = 0, leaf7Ebx = 0;
    uint64_t xcr0 = 0;
};

inline CpuidWords readCpuidWords()
{
    CpuidWords w;
    unsigned a = 0, b = 0, c = 0, d = 0;
    if (!__get_cpuid(1, &a, &b, &c, &d))
        return w;
    w.leaf1Ecx = c;
    w.leaf1Edx = d;
    if (__get_cpuid_count(7, 0, &a, &b, &c, &d))
        w.leaf7Ebx = b;
    if (w.leaf1Ecx & bit_OSXSAVE) {
        unsigned lo = 0, hi = 0;
        __asm__("xgetbv" : "=a"(lo), "=d"(hi) : "c"(0));
        w.xcr0 = (static_cast<uint64_t>(hi) << 32) | lo;
    }
    return w;
}

// A vector extension counts only when the operating system saves its register state: AVX and AVX2
// need XMM and YMM state (XCR0 bits 1 and 2), AVX-512F also the opmask and upper ZMM state (5..7).
constexpr uint64_t featureWordOf(const CpuidWords& w)
{
    const uint32_t c = w.leaf1Ecx, d = w.leaf1Edx, b7 = w.leaf7Ebx;
    uint64_t f = 0;
    if (d & bit_SSE2) f |= zoxCpuSse2;
    if (c & bit_SSE3) f |= zoxCpuSse3;
    if (c & bit_SSSE3) f |= zoxCpuSsse3;
    if (c & bit_SSE4_1) f |= zoxCpuSse41;
    if (c & bit_SSE4_2) f |= zoxCpuSse42;
    if (c & bit_POPCNT) f |= zoxCpuPopcnt;
    const bool ymmState = (c & bit_OSXSAVE) && (w.xcr0 & 6u) == 6u;
    if (ymmState && (c & bit_AVX)) {
        f |= zoxCpuAvx;
        if (b7 & bit_AVX2) f |= zoxCpuAvx2;
        if ((b7 & bit_AVX512F) && (w.xcr0 & 0xE0u) == 0xE0u) f |= zoxCpuAvx512f;
    }
    return f;
}

} // namespace zox::core
