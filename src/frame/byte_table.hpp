// Byte-to-byte tables of 256 entries, and their lookup over runs of bytes: scalar, or by byte shuffles
// in the kernel sets. The shuffle form holds the table as sixteen 16-byte parts: part k (k < 8) is
// rows k and k - 1 of the lower half XORed (row r: entries 16 r .. 16 r + 15), part 8 + k the same of
// the upper half. A byte x < 128 then XORs part k at index x - 16 k for k = 0..7; every index below 0
// has its top bit set and gives 0, so the parts of rows 0..x/16 telescope to row x/16 itself. Bytes
// from 128 on do the same with x - 128 on the upper parts, and the top bit of x picks the half.
#pragma once

#include "frame/kernel_set.hpp"
#include "frame/shuffle_masks.hpp"

#include <cstddef>
#include <cstdint>

namespace zox {

struct ShuffleTable {
    Bytes16 part[16];
};

constexpr ShuffleTable shuffleTableOf(const uint8_t (&t)[256])
{
    ShuffleTable s{};
    for (int half = 0; half < 2; ++half)
        for (int k = 0; k < 8; ++k)
            for (int l = 0; l < 16; ++l) {
                const int at = 128 * half + 16 * k + l;
                s.part[8 * half + k].b[l] = static_cast<int8_t>(k == 0 ? t[at] : t[at] ^ t[at - 16]);
            }
    return s;
}

// The lookup kernel: whole vectors from the start of the run; returns the bytes done. AVX2 only: with
// sixteen bytes a vector the shuffles measured slower than one table load a byte, so the SSE4.1 set
// looks bytes up one at a time.
namespace avx2 {
std::size_t lookupRun(const uint8_t* s, uint8_t* d, std::size_t n, const ShuffleTable& t);
}

// d[i] = table[s[i]] for n bytes; d may be s.
template <KernelSet K>
void lookupBytesWith(const uint8_t* s, uint8_t* d, std::size_t n, const uint8_t* table, const ShuffleTable& t)
{
    std::size_t i = 0;
    if constexpr (K == KernelSet::Avx2)
        i = avx2::lookupRun(s, d, n, t);
    for (; i < n; ++i)
        d[i] = table[s[i]];
}

inline void lookupBytes(const uint8_t* s, uint8_t* d, std::size_t n, const uint8_t* table, const ShuffleTable& t)
{
    if constexpr (kChosenAtLoad) {
        if (activeKernelSet() == KernelSet::Avx2)
            lookupBytesWith<KernelSet::Avx2>(s, d, n, table, t);
        else
            lookupBytesWith<KernelSet::Sse41>(s, d, n, table, t);
    } else {
        lookupBytesWith<kBuiltKernelSet>(s, d, n, table, t);
    }
}

} // namespace zox
