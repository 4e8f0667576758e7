// The fixed-point vocabulary over 256-bit vectors of sixteen 16-bit lanes (AVX2 files only): the same
// names as the SSE4.1 set, so that one definition of each SIMD form serves both flavours.
#pragma once

#include "frame/shuffle_masks.hpp"

#include <immintrin.h>

#include <array>
#include <cstddef>
#include <cstdint>
#include <cstring>

namespace zox::avx2 {

using V = __m256i;

// A constant in every lane of type T, loaded from constant data (a broadcast from a general register
// costs more inside the loops). K is taken as T: the lane pattern of K, also of an unsigned gain.
template <class T, int K>
struct Lanes {
    static constexpr std::array<T, 32 / sizeof(T)> fill()
    {
        std::array<T, 32 / sizeof(T)> a{};
        for (T& x : a)
            x = static_cast<T>(K);
        return a;
    }
    alignas(32) static constexpr std::array<T, 32 / sizeof(T)> v = fill();
};
template <int K>
inline V splat16()
{
    return _mm256_load_si256(reinterpret_cast<const V*>(Lanes<int16_t, K>::v.data()));
}
inline V mulHigh(V a, V k) { return _mm256_mulhi_epi16(a, k); }
inline V mulHighU(V a, V k) { return _mm256_mulhi_epu16(a, k); }
inline V mulRound(V a, V k) { return _mm256_mulhrs_epi16(a, k); }
inline V add(V a, V b) { return _mm256_add_epi16(a, b); }
inline V sub(V a, V b) { return _mm256_sub_epi16(a, b); }
template <int S> inline V shl(V a) { return _mm256_slli_epi16(a, S); }
template <int S> inline V shr(V a) { return _mm256_srai_epi16(a, S); }
template <int S> inline V shrU(V a) { return _mm256_srli_epi16(a, S); }

inline V splat16(int k) { return _mm256_set1_epi16(static_cast<short>(k)); }

// The rest of the vocabulary of the generic readers and writers: two lanes, each a group of sixteen
// pixels, the second group g bytes after the first. Byte shuffles and unpacks work within a lane.
inline constexpr int kGroupPixels = 32;
inline V zero() { return _mm256_setzero_si256(); }
inline V maskOf(const Bytes16& m) { return _mm256_broadcastsi128_si256(_mm_load_si128(reinterpret_cast<const __m128i*>(m.b))); }
inline V shuffle(V a, V m) { return _mm256_shuffle_epi8(a, m); }
inline V or_(V a, V b) { return _mm256_or_si256(a, b); }
inline V packUs(V a, V b) { return _mm256_packus_epi16(a, b); }
inline V unpackLo8(V a, V b) { return _mm256_unpacklo_epi8(a, b); }
inline V unpackHi8(V a, V b) { return _mm256_unpackhi_epi8(a, b); }
inline V unpackLo16(V a, V b) { return _mm256_unpacklo_epi16(a, b); }
inline V unpackHi16(V a, V b) { return _mm256_unpackhi_epi16(a, b); }
inline V unpackLo32(V a, V b) { return _mm256_unpacklo_epi32(a, b); }
inline V unpackHi32(V a, V b) { return _mm256_unpackhi_epi32(a, b); }
// Contiguous lanes (a plane's bytes, g = 16) move as one 256-bit access.
inline V loadLanes(const uint8_t* q, std::size_t g)
{
    if (g == 16)
        return _mm256_loadu_si256(reinterpret_cast<const V*>(q));
    return _mm256_loadu2_m128i(reinterpret_cast<const __m128i*>(q + g), reinterpret_cast<const __m128i*>(q));
}
inline void storeLanes(uint8_t* q, std::size_t g, V v)
{
    if (g == 16)
        _mm256_storeu_si256(reinterpret_cast<V*>(q), v);
    else
        _mm256_storeu2_m128i(reinterpret_cast<__m128i*>(q + g), reinterpret_cast<__m128i*>(q), v);
}

// N parts of a run of groups that lie one after another (part i: bytes 16i..16i+15 of each lane's group,
// the upper lane's group 16N bytes on): the halves rejoined in address order into whole 256-bit stores.
template <int N>
inline void storeAdjacent(uint8_t* q, const V (&p)[N])
{
    auto put = [q](int at, V v) { _mm256_storeu_si256(reinterpret_cast<V*>(q + at), v); };
    if constexpr (N == 3) {
        put(0, _mm256_permute2x128_si256(p[0], p[1], 0x20));
        put(32, _mm256_permute2x128_si256(p[2], p[0], 0x30));
        put(64, _mm256_permute2x128_si256(p[1], p[2], 0x31));
    } else {
        static_assert(N == 4);
        put(0, _mm256_permute2x128_si256(p[0], p[1], 0x20));
        put(32, _mm256_permute2x128_si256(p[2], p[3], 0x20));
        put(64, _mm256_permute2x128_si256(p[0], p[1], 0x31));
        put(96, _mm256_permute2x128_si256(p[2], p[3], 0x31));
    }
}

// 32-bit lanes, for the whole-row forms whose products need more than 16 bits: eight lanes.
inline constexpr int kWideLanes = 8;
template <int K>
inline V splat32()
{
    return _mm256_load_si256(reinterpret_cast<const V*>(Lanes<int32_t, K>::v.data()));
}
inline V add32(V a, V b) { return _mm256_add_epi32(a, b); }
inline V sub32(V a, V b) { return _mm256_sub_epi32(a, b); }
inline V mul32(V a, V b) { return _mm256_mullo_epi32(a, b); }
template <int S> inline V shl32(V a) { return _mm256_slli_epi32(a, S); }
template <int S> inline V shr32(V a) { return _mm256_srai_epi32(a, S); }
template <int S> inline V shrU32(V a) { return _mm256_srli_epi32(a, S); }
inline V and_(V a, V b) { return _mm256_and_si256(a, b); }
// Within each 128-bit lane, as the 128-bit set: pixels 0..3 stay in the lower lane, 4..7 in the upper.
inline V packs32(V a, V b) { return _mm256_packs_epi32(a, b); }
// Bytes of a plane widened to 16-bit lanes, N of them a lane (8, or 4 in the lane's low half): the
// first N bytes to the lower lane, the next N to the upper one.
template <int N>
inline V loadUnits(const uint8_t* q)
{
    if constexpr (N == 8) {
        return _mm256_cvtepu8_epi16(_mm_loadu_si128(reinterpret_cast<const __m128i*>(q)));
    } else {
        const __m128i x = _mm_loadl_epi64(reinterpret_cast<const __m128i*>(q));
        return _mm256_cvtepu8_epi16(_mm_unpacklo_epi64(x, _mm_srli_si128(x, 4)));
    }
}
inline V loadWidePixels4(const uint8_t* q) { return _mm256_loadu_si256(reinterpret_cast<const V*>(q)); }
template <int M>
inline void widenBytes(const uint8_t* q, V (&v)[M])
{
    if constexpr (M == 1) {
        v[0] = _mm256_cvtepu8_epi32(_mm_loadl_epi64(reinterpret_cast<const __m128i*>(q)));
    } else {
        static_assert(M == 4);
        const __m128i lo = _mm_loadu_si128(reinterpret_cast<const __m128i*>(q));
        const __m128i hi = _mm_loadu_si128(reinterpret_cast<const __m128i*>(q + 16));
        v[0] = _mm256_cvtepu8_epi32(lo);
        v[1] = _mm256_cvtepu8_epi32(_mm_srli_si128(lo, 8));
        v[2] = _mm256_cvtepu8_epi32(hi);
        v[3] = _mm256_cvtepu8_epi32(_mm_srli_si128(hi, 8));
    }
}
// The saturating packs work within 128-bit lanes; a dword permutation puts the bytes in pixel order.
template <int M>
inline void narrowBytes(uint8_t* q, const V (&v)[M])
{
    if constexpr (M == 1) {
        const V p = packs32(v[0], v[0]);
        const V b = packUs(p, p); // bytes 0..3 of each 128-bit lane: lanes 0..3, 4..7
        const __m128i lo = _mm256_castsi256_si128(b), hi = _mm256_extracti128_si256(b, 1);
        _mm_storel_epi64(reinterpret_cast<__m128i*>(q), _mm_unpacklo_epi32(lo, hi));
    } else {
        static_assert(M == 4);
        const V b = packUs(packs32(v[0], v[1]), packs32(v[2], v[3])); // dwords: pixels 0, 8, 16, 24 | 4, 12, 20, 28
        _mm256_storeu_si256(reinterpret_cast<V*>(q), _mm256_permutevar8x32_epi32(b, _mm256_setr_epi32(0, 4, 1, 5, 2, 6, 3, 7)));
    }
}
template <class F>
inline void forEachHalf(V v, F&& f)
{
    f(0, _mm256_castsi256_si128(v));
    f(1, _mm256_extracti128_si256(v, 1));
}

// Bytes: the lookup of byte tables.
template <int K>
inline V splat8()
{
    return _mm256_set1_epi8(static_cast<char>(K));
}
inline V sub8(V a, V b) { return _mm256_sub_epi8(a, b); }
inline V xor_(V a, V b) { return _mm256_xor_si256(a, b); }
inline V selectByTopBit(V a, V b, V m) { return _mm256_blendv_epi8(a, b, m); }

inline V madd16(V a, V b) { return _mm256_madd_epi16(a, b); }

// Sampled images: sums of neighbouring 16-bit lanes within each 128-bit lane (wrapping), the 8-byte
// halves of each 128-bit lane stored on their own (the upper lane's g bytes on), and 16-bit limits.
inline V hadd(V a, V b) { return _mm256_hadd_epi16(a, b); }
inline V hadd32(V a, V b) { return _mm256_hadd_epi32(a, b); }
// Filters over neighbouring 32-bit lanes, within each 128-bit lane: lanes 1 and 3 of a then of b; lane 3
// of prev followed by lanes 0..2 of v; the vector of the previous group (the upper lane of the last turn,
// then the lower lane of this one); a constant of alternating lanes E, O; a runtime constant.
inline V oddLanes32(V a, V b) { return _mm256_castps_si256(_mm256_shuffle_ps(_mm256_castsi256_ps(a), _mm256_castsi256_ps(b), 0xDD)); }
inline V shiftIn32(V v, V prev) { return _mm256_alignr_epi8(v, prev, 12); }
inline V previousGroup(V lastTurn, V thisTurn) { return _mm256_permute2x128_si256(lastTurn, thisTurn, 0x21); }
template <int E, int O>
inline V alternate32() { return _mm256_set_epi32(O, E, O, E, O, E, O, E); }
inline V splat32(int k) { return _mm256_set1_epi32(k); }
inline void storeLowHalves(uint8_t* q, std::size_t g, V v)
{
    _mm_storel_epi64(reinterpret_cast<__m128i*>(q), _mm256_castsi256_si128(v));
    _mm_storel_epi64(reinterpret_cast<__m128i*>(q + g), _mm256_extracti128_si256(v, 1));
}
inline void storeHighHalves(uint8_t* q, std::size_t g, V v)
{
    const V h = _mm256_unpackhi_epi64(v, v);
    _mm_storel_epi64(reinterpret_cast<__m128i*>(q), _mm256_castsi256_si128(h));
    _mm_storel_epi64(reinterpret_cast<__m128i*>(q + g), _mm256_extracti128_si256(h, 1));
}
// Four bytes from byte Byte of each 128-bit lane.
template <int Byte>
inline void storeQuarters(uint8_t* q, std::size_t g, V v)
{
    const int lo = _mm_extract_epi32(_mm_srli_si128(_mm256_castsi256_si128(v), Byte), 0);
    const int hi = _mm_extract_epi32(_mm_srli_si128(_mm256_extracti128_si256(v, 1), Byte), 0);
    std::memcpy(q, &lo, 4);
    std::memcpy(q + g, &hi, 4);
}
inline V min16(V a, V b) { return _mm256_min_epi16(a, b); }
inline V max16(V a, V b) { return _mm256_max_epi16(a, b); }

inline V addSatU(V a, V b) { return _mm256_adds_epu16(a, b); }
inline V mulLo(V a, V b) { return _mm256_mullo_epi16(a, b); }
inline V cmpGt16(V a, V b) { return _mm256_cmpgt_epi16(a, b); }

// Single precision, eight lanes (see the SSE4.1 set); blendF and permuteF act within each 128-bit lane, and
// the pixel-group loads and stores take the upper lane g bytes on.
using VF = __m256;
inline constexpr int kFloatLanes = 8;
inline VF splatF(float v) { return _mm256_set1_ps(v); }
inline VF addF(VF a, VF b) { return _mm256_add_ps(a, b); }
inline VF mulF(VF a, VF b) { return _mm256_mul_ps(a, b); }
inline VF minF(VF a, VF b) { return _mm256_min_ps(a, b); }
inline VF maxF(VF a, VF b) { return _mm256_max_ps(a, b); }
inline VF toFloat(V i32) { return _mm256_cvtepi32_ps(i32); }
inline V toNearestInt(VF v) { return _mm256_cvtps_epi32(_mm256_round_ps(v, _MM_FROUND_TO_NEAREST_INT | _MM_FROUND_NO_EXC)); }
template <int M>
inline VF blendF(VF a, VF b) { return _mm256_blend_ps(a, b, M | (M << 4)); }
template <int I>
inline VF permuteF(VF a) { return _mm256_permute_ps(a, I); }
inline VF loadF(const uint8_t* q) { return _mm256_loadu_ps(reinterpret_cast<const float*>(q)); }
inline void storeF(uint8_t* q, VF v) { _mm256_storeu_ps(reinterpret_cast<float*>(q), v); }
inline VF loadLanesF(const uint8_t* q, std::size_t g)
{
    return _mm256_loadu2_m128(reinterpret_cast<const float*>(q + g), reinterpret_cast<const float*>(q));
}
inline void storeLanesF(uint8_t* q, std::size_t g, VF v)
{
    _mm256_storeu2_m128(reinterpret_cast<float*>(q + g), reinterpret_cast<float*>(q), v);
}
inline V toIntInMode(VF v) { return _mm256_cvtps_epi32(v); }
inline VF asFloat(V v) { return _mm256_castsi256_ps(v); }
inline V asInt(VF v) { return _mm256_castps_si256(v); }
inline V packus32(V a, V b) { return _mm256_packus_epi32(a, b); }
template <bool Signed>
inline V loadWidened16(const uint8_t* q, std::size_t g)
{
    const __m128i x = _mm_unpacklo_epi64(_mm_loadl_epi64(reinterpret_cast<const __m128i*>(q)),
                                         _mm_loadl_epi64(reinterpret_cast<const __m128i*>(q + g)));
    return Signed ? _mm256_cvtepi16_epi32(x) : _mm256_cvtepu16_epi32(x);
}
inline void streamLanesF(uint8_t* q, std::size_t g, VF v)
{
    _mm_stream_ps(reinterpret_cast<float*>(q), _mm256_castps256_ps128(v));
    _mm_stream_ps(reinterpret_cast<float*>(q + g), _mm256_extractf128_ps(v, 1));
}
inline void streamFence() { _mm_sfence(); }
inline VF unpackLoF(VF a, VF b) { return _mm256_unpacklo_ps(a, b); }
inline VF unpackHiF(VF a, VF b) { return _mm256_unpackhi_ps(a, b); }
inline VF unpackLo64F(VF a, VF b) { return _mm256_castpd_ps(_mm256_unpacklo_pd(_mm256_castps_pd(a), _mm256_castps_pd(b))); }
inline VF unpackHi64F(VF a, VF b) { return _mm256_castpd_ps(_mm256_unpackhi_pd(_mm256_castps_pd(a), _mm256_castps_pd(b))); }

} // namespace zox::avx2
