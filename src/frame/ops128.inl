// The fixed-point vocabulary over 128-bit vectors of eight 16-bit lanes (or four 32-bit lanes), written
// once and included inside the namespace of each instruction set that uses 128-bit vectors: the SSE4.1
// set, and the AVX2 set for its shorter groups (compiled there with its own flags, in its own
// namespace, so that no inline function of one set is linked into the other).

using V = __m128i;

// A constant in every lane; the constant is a template argument so that it can live in constant data.
template <int K>
inline V splat16()
{
    return _mm_set1_epi16(static_cast<short>(K));
}
inline V splat16(int k) { return _mm_set1_epi16(static_cast<short>(k)); }
inline V mulHigh(V a, V k) { return _mm_mulhi_epi16(a, k); }
inline V mulHighU(V a, V k) { return _mm_mulhi_epu16(a, k); }
// pmulhrsw is exactly floor((a k + 16384) / 32768).
inline V mulRound(V a, V k) { return _mm_mulhrs_epi16(a, k); }
inline V add(V a, V b) { return _mm_add_epi16(a, b); }
inline V sub(V a, V b) { return _mm_sub_epi16(a, b); }
template <int S> inline V shl(V a) { return _mm_slli_epi16(a, S); }
template <int S> inline V shr(V a) { return _mm_srai_epi16(a, S); }   // arithmetic: floor division
template <int S> inline V shrU(V a) { return _mm_srli_epi16(a, S); }  // logical
// Eight 16-bit lanes of a and eight of b to sixteen bytes, each limited to 0..255: clip8.
inline V packUs(V a, V b) { return _mm_packus_epi16(a, b); }

// Shuffle mask from sixteen byte indices (-1 gives a zero byte).
constexpr uint64_t maskHalf(const int (&idx)[16], int from)
{
    uint64_t m = 0;
    for (int i = 7; i >= 0; --i)
        m = (m << 8) | static_cast<uint8_t>(idx[from + i] < 0 ? 0x80 : idx[from + i]);
    return m;
}
inline V shuffleMask(const int (&idx)[16])
{
    return _mm_set_epi64x(static_cast<long long>(maskHalf(idx, 8)), static_cast<long long>(maskHalf(idx, 0)));
}

inline V load16(const uint8_t* p) { return _mm_loadu_si128(reinterpret_cast<const V*>(p)); }
inline V load8(const uint8_t* p) { return _mm_loadl_epi64(reinterpret_cast<const V*>(p)); }
inline V load4(const uint8_t* p)
{
    int32_t v;
    __builtin_memcpy(&v, p, 4);
    return _mm_cvtsi32_si128(v);
}
inline void store16(uint8_t* p, V v) { _mm_storeu_si128(reinterpret_cast<V*>(p), v); }
inline void store8(uint8_t* p, V v) { _mm_storel_epi64(reinterpret_cast<V*>(p), v); }
inline void store4(uint8_t* p, V v)
{
    const int32_t x = _mm_cvtsi128_si32(v);
    __builtin_memcpy(p, &x, 4);
}

// The rest of the vocabulary of the generic readers and writers: one lane of sixteen pixels.
inline constexpr int kGroupPixels = 16;
inline V zero() { return _mm_setzero_si128(); }
inline V maskOf(const Bytes16& m) { return _mm_load_si128(reinterpret_cast<const V*>(m.b)); }
inline V shuffle(V a, V m) { return _mm_shuffle_epi8(a, m); }
inline V or_(V a, V b) { return _mm_or_si128(a, b); }
inline V unpackLo8(V a, V b) { return _mm_unpacklo_epi8(a, b); }
inline V unpackHi8(V a, V b) { return _mm_unpackhi_epi8(a, b); }
inline V unpackLo16(V a, V b) { return _mm_unpacklo_epi16(a, b); }
inline V unpackHi16(V a, V b) { return _mm_unpackhi_epi16(a, b); }
inline V unpackLo32(V a, V b) { return _mm_unpacklo_epi32(a, b); }
inline V unpackHi32(V a, V b) { return _mm_unpackhi_epi32(a, b); }
inline V loadLanes(const uint8_t* q, std::size_t) { return load16(q); }
// N parts of a run of groups that lie one after another: part i holds bytes 16i..16i+15 of each lane's
// group, the next group 16N bytes on.
template <int N>
inline void storeAdjacent(uint8_t* q, const V (&p)[N])
{
    #pragma GCC unroll 4
    for (int i = 0; i < N; ++i)
        store16(q + 16 * i, p[i]);
}
inline void storeLanes(uint8_t* q, std::size_t, V v) { store16(q, v); }

// 32-bit lanes, for the whole-row forms whose products need more than 16 bits: four lanes.
inline constexpr int kWideLanes = 4;
template <int K>
inline V splat32()
{
    return _mm_set1_epi32(K);
}
inline V add32(V a, V b) { return _mm_add_epi32(a, b); }
inline V sub32(V a, V b) { return _mm_sub_epi32(a, b); }
inline V mul32(V a, V b) { return _mm_mullo_epi32(a, b); } // the low 32 bits of the product
template <int S> inline V shl32(V a) { return _mm_slli_epi32(a, S); }
template <int S> inline V shr32(V a) { return _mm_srai_epi32(a, S); } // arithmetic: floor division
template <int S> inline V shrU32(V a) { return _mm_srli_epi32(a, S); }
inline V and_(V a, V b) { return _mm_and_si128(a, b); }
inline V packs32(V a, V b) { return _mm_packs_epi32(a, b); } // to 16 bits, saturating
// Bytes of a plane widened to 16-bit lanes, N of them a lane (8, or 4 in the lane's low half).
template <int N>
inline V loadUnits(const uint8_t* q)
{
    if constexpr (N == 8)
        return _mm_cvtepu8_epi16(load8(q));
    else
        return _mm_cvtepu8_epi16(load4(q));
}
// Four-byte pixels, one a lane: four of them.
inline V loadWidePixels4(const uint8_t* q) { return load16(q); }
// Bytes of a plane widened to 32-bit lanes, and 32-bit lanes limited to 0..255 (clip8) back to bytes,
// in pixel order: M = 1 moves kWideLanes bytes, M = 4 four times as many.
template <int M>
inline void widenBytes(const uint8_t* q, V (&v)[M])
{
    if constexpr (M == 1) {
        v[0] = _mm_cvtepu8_epi32(load4(q));
    } else {
        static_assert(M == 4);
        const V x = load16(q);
        v[0] = _mm_cvtepu8_epi32(x);
        v[1] = _mm_cvtepu8_epi32(_mm_srli_si128(x, 4));
        v[2] = _mm_cvtepu8_epi32(_mm_srli_si128(x, 8));
        v[3] = _mm_cvtepu8_epi32(_mm_srli_si128(x, 12));
    }
}
template <int M>
inline void narrowBytes(uint8_t* q, const V (&v)[M])
{
    if constexpr (M == 1) {
        const V p = packs32(v[0], v[0]);
        store4(q, packUs(p, p));
    } else {
        static_assert(M == 4);
        store16(q, packUs(packs32(v[0], v[1]), packs32(v[2], v[3])));
    }
}
// The 128-bit halves of a vector, in address order.
template <class F>
inline void forEachHalf(V v, F&& f)
{
    f(0, v);
}

// Bytes: the lookup of byte tables.
template <int K>
inline V splat8()
{
    return _mm_set1_epi8(static_cast<char>(K));
}
inline V sub8(V a, V b) { return _mm_sub_epi8(a, b); }
inline V xor_(V a, V b) { return _mm_xor_si128(a, b); }
// The bytes of b where the byte of m has its top bit set, else those of a.
inline V selectByTopBit(V a, V b, V m) { return _mm_blendv_epi8(a, b, m); }

// Pairs of 16-bit lanes multiplied and added into 32-bit lanes (pmaddwd).
inline V madd16(V a, V b) { return _mm_madd_epi16(a, b); }

// Sampled images: sums of neighbouring 16-bit lanes (wrapping), the 8-byte halves of each lane stored on
// their own (the next lane's g bytes on), and 16-bit limits.
inline V hadd(V a, V b) { return _mm_hadd_epi16(a, b); }
inline V hadd32(V a, V b) { return _mm_hadd_epi32(a, b); }
// Filters over neighbouring 32-bit lanes: lanes 1 and 3 of a then of b; lane 3 of prev followed by lanes
// 0..2 of v; the vector of the previous group (of the previous turn, one lane a turn here); a constant
// of alternating lanes E, O; a runtime constant.
inline V oddLanes32(V a, V b) { return _mm_castps_si128(_mm_shuffle_ps(_mm_castsi128_ps(a), _mm_castsi128_ps(b), 0xDD)); }
inline V shiftIn32(V v, V prev) { return _mm_alignr_epi8(v, prev, 12); }
inline V previousGroup(V lastTurn, V) { return lastTurn; }
template <int E, int O>
inline V alternate32() { return _mm_set_epi32(O, E, O, E); }
inline V splat32(int k) { return _mm_set1_epi32(k); }
inline void storeLowHalves(uint8_t* q, std::size_t, V v) { _mm_storel_epi64(reinterpret_cast<V*>(q), v); }
inline void storeHighHalves(uint8_t* q, std::size_t, V v) { _mm_storel_epi64(reinterpret_cast<V*>(q), _mm_unpackhi_epi64(v, v)); }
template <int Byte>
inline void storeQuarters(uint8_t* q, std::size_t, V v) { store4(q, _mm_srli_si128(v, Byte)); }
inline V min16(V a, V b) { return _mm_min_epi16(a, b); }
inline V max16(V a, V b) { return _mm_max_epi16(a, b); }

// Unsigned 16-bit saturating sums.
inline V addSatU(V a, V b) { return _mm_adds_epu16(a, b); }
// The low 16 bits of each product; all-ones lanes where a is above b (signed).
inline V mulLo(V a, V b) { return _mm_mullo_epi16(a, b); }
inline V cmpGt16(V a, V b) { return _mm_cmpgt_epi16(a, b); }

// Single precision, four lanes: each operation rounded on its own in the caller's rounding mode. minF and
// maxF are the processor's: a NaN in a gives b. toNearestInt rounds to nearest with ties to even whatever
// the mode, and gives INT32_MIN for NaN and values out of range. The pixel-group loads and stores move
// 16 bytes at q (and, in wider sets, 16 bytes at q + g for the next group of four).
using VF = __m128;
inline constexpr int kFloatLanes = 4;
inline VF splatF(float v) { return _mm_set1_ps(v); }
inline VF addF(VF a, VF b) { return _mm_add_ps(a, b); }
inline VF mulF(VF a, VF b) { return _mm_mul_ps(a, b); }
inline VF minF(VF a, VF b) { return _mm_min_ps(a, b); }
inline VF maxF(VF a, VF b) { return _mm_max_ps(a, b); }
inline VF toFloat(V i32) { return _mm_cvtepi32_ps(i32); }
inline V toNearestInt(VF v) { return _mm_cvtps_epi32(_mm_round_ps(v, _MM_FROUND_TO_NEAREST_INT | _MM_FROUND_NO_EXC)); }
template <int M>
inline VF blendF(VF a, VF b) { return _mm_blend_ps(a, b, M); }
template <int I>
inline VF permuteF(VF a) { return _mm_shuffle_ps(a, a, I); }
inline VF loadF(const uint8_t* q) { return _mm_loadu_ps(reinterpret_cast<const float*>(q)); }
inline void storeF(uint8_t* q, VF v) { _mm_storeu_ps(reinterpret_cast<float*>(q), v); }
inline VF loadLanesF(const uint8_t* q, std::size_t) { return loadF(q); }
inline void storeLanesF(uint8_t* q, std::size_t, VF v) { storeF(q, v); }
// The conversion in the processor's rounding mode (callers that need nearest set it for the call).
inline V toIntInMode(VF v) { return _mm_cvtps_epi32(v); }
inline VF asFloat(V v) { return _mm_castsi128_ps(v); }
inline V asInt(VF v) { return _mm_castps_si128(v); }
inline V packus32(V a, V b) { return _mm_packus_epi32(a, b); } // to 16 bits, unsigned saturation
// Four 16-bit samples at q (and, in wider sets, four at q + g for the upper lane) widened to 32-bit lanes.
template <bool Signed>
inline V loadWidened16(const uint8_t* q, std::size_t)
{
    const V x = load8(q);
    return Signed ? _mm_cvtepi16_epi32(x) : _mm_cvtepu16_epi32(x);
}
// A stream store of 16 bytes at q (16-byte aligned), past the caches; and the fence that ends a run of them.
inline void streamLanesF(uint8_t* q, std::size_t, VF v) { _mm_stream_ps(reinterpret_cast<float*>(q), v); }
inline void streamFence() { _mm_sfence(); }
// Interleaving of 32-bit and 64-bit halves of float vectors (within each 128-bit lane).
inline VF unpackLoF(VF a, VF b) { return _mm_unpacklo_ps(a, b); }
inline VF unpackHiF(VF a, VF b) { return _mm_unpackhi_ps(a, b); }
inline VF unpackLo64F(VF a, VF b) { return _mm_castpd_ps(_mm_unpacklo_pd(_mm_castps_pd(a), _mm_castps_pd(b))); }
inline VF unpackHi64F(VF a, VF b) { return _mm_castpd_ps(_mm_unpackhi_pd(_mm_castps_pd(a), _mm_castps_pd(b))); }
