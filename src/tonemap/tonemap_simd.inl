// Tone-mapping kernels, written once and included inside the namespace of each kernel set: the
// maximum, the row sum in its sixteen lanes, and the mapping of rows whose source and destination lie
// apart. Sixteen floats a turn: four 128-bit vectors in the SSE4.1 set, two 256-bit ones in the AVX2
// set (whose eight lanes are two of the sixteen partial sums' groups of four, in order).

#if defined(__AVX2__)
using VF = __m256;
inline constexpr int kFloats = 8;
inline VF loadF(const float* p) { return _mm256_loadu_ps(p); }
inline VF splatF(float v) { return _mm256_set1_ps(v); }
inline VF maxF(VF a, VF b) { return _mm256_max_ps(a, b); }
inline VF addF(VF a, VF b) { return _mm256_add_ps(a, b); }
inline void storeF(float* p, VF v) { _mm256_storeu_ps(p, v); }
// Sixteen products truncated to 32-bit integers (out of range and NaN: the most negative), narrowed
// to bytes with the low byte (Linear) or saturation (Mean), in order.
inline __m128i bytes16(const float* s, float scale, bool lowByte)
{
    const __m256 k = _mm256_set1_ps(scale);
    __m256i a = _mm256_cvttps_epi32(_mm256_mul_ps(_mm256_loadu_ps(s), k));
    __m256i b = _mm256_cvttps_epi32(_mm256_mul_ps(_mm256_loadu_ps(s + 8), k));
    __m256i w;
    if (lowByte) {
        const __m256i low = _mm256_set1_epi32(255);
        w = _mm256_packus_epi32(_mm256_and_si256(a, low), _mm256_and_si256(b, low));
    } else {
        w = _mm256_packs_epi32(a, b);
    }
    // Lanes: 0..3, 8..11 | 4..7, 12..15; after the byte pack the dwords 0, 4, 1, 5 hold them in order.
    const __m256i bytes = _mm256_packus_epi16(w, w);
    return _mm256_castsi256_si128(_mm256_permutevar8x32_epi32(bytes, _mm256_setr_epi32(0, 4, 1, 5, 0, 4, 1, 5)));
}
#else
using VF = __m128;
inline constexpr int kFloats = 4;
inline VF loadF(const float* p) { return _mm_loadu_ps(p); }
inline VF splatF(float v) { return _mm_set1_ps(v); }
inline VF maxF(VF a, VF b) { return _mm_max_ps(a, b); }
inline VF addF(VF a, VF b) { return _mm_add_ps(a, b); }
inline void storeF(float* p, VF v) { _mm_storeu_ps(p, v); }
inline __m128i bytes16(const float* s, float scale, bool lowByte)
{
    const __m128 k = _mm_set1_ps(scale);
    __m128i v[4];
    #pragma GCC unroll 4
    for (int i = 0; i < 4; ++i)
        v[i] = _mm_cvttps_epi32(_mm_mul_ps(_mm_loadu_ps(s + 4 * i), k));
    if (lowByte) {
        const __m128i low = _mm_set1_epi32(255);
        return _mm_packus_epi16(_mm_packus_epi32(_mm_and_si128(v[0], low), _mm_and_si128(v[1], low)),
                                _mm_packus_epi32(_mm_and_si128(v[2], low), _mm_and_si128(v[3], low)));
    }
    return _mm_packus_epi16(_mm_packs_epi32(v[0], v[1]), _mm_packs_epi32(v[2], v[3]));
}
#endif
inline constexpr int kAcc = 16 / kFloats; // accumulators of the sixteen lanes

// max(sample, running): a sample that is not a number leaves the running maximum.
float maxRow(const float* s, int width, float m)
{
    VF acc[kAcc];
    #pragma GCC unroll 4
    for (int k = 0; k < kAcc; ++k)
        acc[k] = splatF(m);
    int x = 0;
    for (; x + 16 <= width; x += 16)
        #pragma GCC unroll 4
        for (int k = 0; k < kAcc; ++k)
            acc[k] = maxF(loadF(s + x + kFloats * k), acc[k]);
    alignas(32) float lanes[16];
    #pragma GCC unroll 4
    for (int k = 0; k < kAcc; ++k)
        storeF(lanes + kFloats * k, acc[k]);
    for (float v : lanes)
        m = v > m ? v : m;
    return tonemap::rowMax(reinterpret_cast<const float*>(reinterpret_cast<uintptr_t>(s) + 4 * static_cast<uintptr_t>(x)),
                           width - x, m);
}

// The sixteen partial sums in the order of the scalar form: the head first (one by one), then whole
// turns of sixteen in the vectors, then the rest one by one, each sample to its lane.
void addRowSum(const float* s, int width, double& total)
{
    alignas(32) float p[16] = {};
    const tonemap::RowLanes lanes = tonemap::rowLanes(s, width);
    int x = 0;
    for (; x < lanes.head; ++x)
        p[lanes.headLane + x] += tonemap::at(s, x);
    VF acc[kAcc];
    #pragma GCC unroll 4
    for (int k = 0; k < kAcc; ++k)
        acc[k] = loadF(p + kFloats * k);
    for (; x + 16 <= width; x += 16)
        #pragma GCC unroll 4
        for (int k = 0; k < kAcc; ++k)
            acc[k] = addF(acc[k], loadF(s + x + kFloats * k));
    #pragma GCC unroll 4
    for (int k = 0; k < kAcc; ++k)
        storeF(p + kFloats * k, acc[k]);
    for (int i = 0; x < width; ++x, ++i)
        p[i] += tonemap::at(s, x);
    tonemap::foldIntoTotal(p, total);
}

// A row whose source and destination lie apart: one by one up to the destination's 16-byte boundary,
// then sixteen a turn with one aligned store, then one by one (a row too short for a whole turn after
// the boundary goes one by one throughout).
template <class Form>
void mapRow(const float* s, uint8_t* d, int width, float scale)
{
    const int lead = static_cast<int>((16 - (reinterpret_cast<uintptr_t>(d) & 15)) & 15);
    int x = 0;
    if (width - lead >= 16) {
        for (; x < lead; ++x)
            d[x] = Form::map(tonemap::at(s, x), scale);
        for (; x + 16 <= width; x += 16)
            _mm_store_si128(reinterpret_cast<__m128i*>(d + x), bytes16(s + x, scale, std::is_same_v<Form, tonemap::Linear>));
    }
    for (; x < width; ++x)
        d[x] = Form::map(tonemap::at(s, x), scale);
}
