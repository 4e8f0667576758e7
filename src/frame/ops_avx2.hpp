// The fixed-point vocabulary over 256-bit vectors of sixteen 16-bit lanes (AVX2 files only): the same
// names as the SSE4.1 set, so that one definition of each SIMD form serves both flavours.
#pragma once

#include <immintrin.h>

#include <cstdint>

namespace zox::avx2 {

using V = __m256i;

// A constant in every lane, loaded from constant data (a broadcast from a general register costs more
// inside the loops).
template <int K>
struct Lanes16 {
    static constexpr int16_t k = static_cast<int16_t>(K); // the lane pattern of K, also of an unsigned gain
    alignas(32) static constexpr int16_t v[16] = {k, k, k, k, k, k, k, k, k, k, k, k, k, k, k, k};
};
template <int K>
inline V splat16()
{
    return _mm256_load_si256(reinterpret_cast<const V*>(Lanes16<K>::v));
}
inline V mulHigh(V a, V k) { return _mm256_mulhi_epi16(a, k); }
inline V mulHighU(V a, V k) { return _mm256_mulhi_epu16(a, k); }
inline V mulRound(V a, V k) { return _mm256_mulhrs_epi16(a, k); }
inline V add(V a, V b) { return _mm256_add_epi16(a, b); }
inline V sub(V a, V b) { return _mm256_sub_epi16(a, b); }
template <int S> inline V shl(V a) { return _mm256_slli_epi16(a, S); }
template <int S> inline V shr(V a) { return _mm256_srai_epi16(a, S); }
template <int S> inline V shrU(V a) { return _mm256_srli_epi16(a, S); }

} // namespace zox::avx2
