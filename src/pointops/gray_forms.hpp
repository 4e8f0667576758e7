// Gray conversions, scalar side: the weights of a call, and one member type per row routine. Each
// member's `row` is the definition of its row (block columns and tail) in plain scalar code; a kernel
// may do a prefix of the block columns and leave the rest to `row`.
//
// A member states its sample types (S in, D out), its pixel strides in samples and, where blocks and
// tail differ, `blockColumns(w)`.
#pragma once

#include "frame/layouts.hpp"
#include "frame/ops.hpp"

#include <bit>
#include <cstdint>

namespace zox::gray {

// The weights of one call in each form a routine uses, and the fourth channel of GrayToRGB C1C4.
struct Params {
    uint16_t q15[3] = {};
    float f[3] = {};
    double d[3] = {};
    float alphaF = 0;
    int alphaI = 0;
};

// The fixed set 0.299, 0.587, 0.114, as single-precision values and in Q15 (they add up to 32769).
inline constexpr uint32_t kFixedBits[3] = {0x3E991687u, 0x3F1645A2u, 0x3DE978D5u};
inline constexpr uint16_t kFixedQ15[3] = {9798, 19235, 3736};

inline float fixedWeight(int k)
{
    return std::bit_cast<float>(kFixedBits[k]);
}

// A caller's weight in Q15: widened to double, times 32768, plus 0.5, truncated, and the low 16 bits taken
// as unsigned (a negative weight counts as a large positive one; a weight out of 32-bit range as 0).
inline uint16_t q15Of(float c)
{
    return static_cast<uint16_t>(static_cast<uint32_t>(truncateToInt32(static_cast<double>(c) * 32768.0 + 0.5)));
}

// Weights from a caller's array, or the fixed set for a null one.
inline Params paramsOf(const float* coeffs)
{
    Params p;
    for (int k = 0; k < 3; ++k) {
        p.f[k] = coeffs ? coeffs[k] : fixedWeight(k);
        p.q15[k] = coeffs ? q15Of(coeffs[k]) : kFixedQ15[k];
        p.d[k] = p.f[k]; // the fixed set widened, for the 64f three-channel member
    }
    return p;
}
inline Params paramsOf(const double* coeffs)
{
    Params p = paramsOf(static_cast<const float*>(nullptr));
    if (coeffs)
        for (int k = 0; k < 3; ++k)
            p.d[k] = coeffs[k];
    return p;
}

// The fourth channel of gray to colour, in the member's sample type.
template <class T>
inline Params paramsWithAlpha(T alpha)
{
    Params p;
    if constexpr (std::is_floating_point_v<T>)
        p.alphaF = alpha;
    else
        p.alphaI = alpha;
    return p;
}

template <class T>
inline T sampleAt(const uint8_t* row, std::size_t i)
{
    return static_cast<T>(loadSample<T>(row + i * sizeof(T)));
}
template <class T>
inline void putSample(uint8_t* row, std::size_t i, T v)
{
    std::memcpy(row + i * sizeof(T), &v, sizeof(T));
}

// 8u reduction in fixed point. Blocks of 8 pixels (and, from three-channel pixels, one further block of
// 4 when the width has that bit: the block columns are w & ~3 there): each product the upper half of the
// sample in a word's high byte times the weight, the three summed with 16-bit unsigned saturation, 64
// added the same way, shifted right by 7 as a signed word and limited to 0..255. The tail sums the exact
// products in 32 bits and stores the low byte of (sum + 16384) >> 15.
template <int Ch>
struct Fixed8 {
    using S = uint8_t;
    using D = uint8_t;
    static constexpr int stride = Ch, outStride = 1;
    static constexpr int blockColumns(int w) { return Ch == 3 ? w & ~3 : w & ~7; }
    static uint8_t block(const uint8_t* px, const uint16_t* c)
    {
        int sum = 0;
        for (int k = 0; k < 3; ++k)
            sum = addSatU16(sum, mulHighU(px[k] << 8, c[k]));
        sum = addSatU16(sum, 64);
        return clip8(static_cast<int16_t>(sum) >> 7);
    }
    static uint8_t tail(const uint8_t* px, const uint16_t* c)
    {
        const uint32_t sum = px[0] * uint32_t{c[0]} + px[1] * uint32_t{c[1]} + px[2] * uint32_t{c[2]} + 16384u;
        return static_cast<uint8_t>(sum >> 15);
    }
    static void row(const uint8_t* s, uint8_t* d, int x, int w, const Params& p)
    {
        for (const int nb = blockColumns(w); x < nb; ++x)
            d[x] = block(s + static_cast<std::size_t>(x) * Ch, p.q15);
        for (; x < w; ++x)
            d[x] = tail(s + static_cast<std::size_t>(x) * Ch, p.q15);
    }
};

// 16-bit reduction in single precision: (s0 x c0 + s1 x c1) + s2 x c2 on the samples as floats (16s:
// plus 32768 first), rounded to nearest with ties to even. 16s subtracts 32768 again; its blocks of 4
// saturate the result to 16 bits where its tail keeps the low 16 bits. 16u keeps the low 16 bits.
template <class T, int Ch>
struct Float16 {
    using S = T;
    using D = T;
    static constexpr int stride = Ch, outStride = 1;
    static constexpr bool isSigned = std::is_signed_v<T>;
    static constexpr int blockColumns(int w) { return w & ~3; }
    static int32_t value(const uint8_t* s, std::size_t x, const float* c)
    {
        float v[3];
        for (int k = 0; k < 3; ++k)
            v[k] = static_cast<float>(sampleAt<T>(s, x * Ch + k) + (isSigned ? 32768 : 0));
        const int32_t r = roundToInt32((v[0] * c[0] + v[1] * c[1]) + v[2] * c[2]);
        return isSigned ? static_cast<int32_t>(static_cast<uint32_t>(r) - 32768u) : r;
    }
    static T block(int32_t r)
    {
        if constexpr (isSigned)
            return static_cast<T>(r < -32768 ? -32768 : (r > 32767 ? 32767 : r));
        else
            return static_cast<T>(r);
    }
    static void row(const uint8_t* s, uint8_t* d, int x, int w, const Params& p)
    {
        for (const int nb = blockColumns(w); x < nb; ++x)
            putSample<T>(d, x, block(value(s, x, p.f)));
        for (; x < w; ++x)
            putSample<T>(d, x, static_cast<T>(value(s, x, p.f)));
    }
};

// 32f reduction: (c0 x s0 + c1 x s1) + c2 x s2, the same in every column.
template <int Ch>
struct Float32 {
    using S = float;
    using D = float;
    static constexpr int stride = Ch, outStride = 1;
    static void row(const uint8_t* s, uint8_t* d, int x, int w, const Params& p)
    {
        for (; x < w; ++x) {
            const std::size_t i = static_cast<std::size_t>(x) * Ch;
            const float v = (p.f[0] * sampleAt<float>(s, i) + p.f[1] * sampleAt<float>(s, i + 1)) +
                            p.f[2] * sampleAt<float>(s, i + 2);
            putSample<float>(d, x, v);
        }
    }
};

// 64f reduction: (s0 x c0 + s1 x c1) + s2 x c2 in double precision. From three channels the row goes by
// pairs of destination samples: where the destination row is not on 16 bytes its first pixel goes alone,
// and the second pixel of each pair then sums s0 x c0 + (s1 x c1 + s2 x c2).
template <int Ch>
struct Double64 {
    using S = double;
    using D = double;
    static constexpr int stride = Ch, outStride = 1;
    static double first(const double* v, const double* c) { return (v[0] * c[0] + v[1] * c[1]) + v[2] * c[2]; }
    static double second(const double* v, const double* c) { return v[0] * c[0] + (v[1] * c[1] + v[2] * c[2]); }
    static void row(const uint8_t* s, uint8_t* d, int x, int w, const Params& p)
    {
        const int lead = Ch == 3 && reinterpret_cast<uintptr_t>(d) % 16 != 0 ? 1 : 0;
        for (; x < w; ++x) {
            const std::size_t i = static_cast<std::size_t>(x) * Ch;
            const double v[3] = {sampleAt<double>(s, i), sampleAt<double>(s, i + 1), sampleAt<double>(s, i + 2)};
            const bool inPairSecond = Ch == 3 && x >= lead && (x - lead) % 2 == 1;
            putSample<double>(d, x, inPairSecond ? second(v, p.d) : first(v, p.d));
        }
    }
};

// One channel to three, or to four with the call's alpha.
template <class T, int Out>
struct Spread {
    using S = T;
    using D = T;
    static constexpr int stride = 1, outStride = Out;
    static void row(const uint8_t* s, uint8_t* d, int x, int w, const Params& p)
    {
        T alpha;
        if constexpr (std::is_floating_point_v<T>)
            alpha = p.alphaF;
        else
            alpha = static_cast<T>(p.alphaI);
        for (; x < w; ++x) {
            const T v = sampleAt<T>(s, x);
            const std::size_t o = static_cast<std::size_t>(x) * Out;
            putSample<T>(d, o, v);
            putSample<T>(d, o + 1, v);
            putSample<T>(d, o + 2, v);
            if constexpr (Out == 4)
                putSample<T>(d, o + 3, alpha);
        }
    }
};

// The luma bytes of a packed 4:2:2 row: destination pixel x takes source byte 2x.
struct LumaBytes {
    using S = uint8_t;
    using D = uint8_t;
    static constexpr int stride = 2, outStride = 1;
    static void row(const uint8_t* s, uint8_t* d, int x, int w, const Params&)
    {
        for (; x < w; ++x)
            d[x] = s[2 * static_cast<std::size_t>(x)];
    }
};

} // namespace zox::gray
