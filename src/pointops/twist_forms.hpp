// Colour twist, scalar side: the matrix of a call, the sum of each depth, the limits and conversion of
// each depth, and one member type per layout. Each member's `row` is the definition of its row in plain
// scalar code; a kernel may do a prefix of the pixels and leave the rest to `row`. Every pixel is read
// whole before it is written, so that the in-place members run the same rows with source and
// destination equal.
#pragma once

#include "frame/layouts.hpp"
#include "frame/ops.hpp"

#include <cstdint>
#include <type_traits>

namespace zox::twist {

// The coefficients of a call: row i makes output channel i from inputs 0..2 (columns 0..2) and an offset
// in sample units (column 3). The 4x4 member has four rows and no offset.
// `stream`: the call's rows are many (the 32f three-channel member then writes past the caches; the
// samples are the same).
struct Matrix {
    float m[4][4] = {};
    bool stream = false;
};

inline Matrix matrixOf(const float* twist, int rows)
{
    Matrix t;
    for (int i = 0; i < rows; ++i)
        for (int j = 0; j < 4; ++j)
            t.m[i][j] = twist[4 * i + j];
    return t;
}

// The grouping of the sum of one output channel, in single precision with each step rounded.
struct OffsetFirst { // (m3 + c0 x m0) + (c2 x m2 + c1 x m1)
    static float sum(const float* m, float c0, float c1, float c2) { return (m[3] + c0 * m[0]) + (c2 * m[2] + c1 * m[1]); }
};
struct OffsetLast { // ((c0 x m0 + c1 x m1) + c2 x m2) + m3
    static float sum(const float* m, float c0, float c1, float c2) { return ((c0 * m[0] + c1 * m[1]) + c2 * m[2]) + m[3]; }
};

// Limits from above and below as the processor's minimum and maximum take them: a NaN takes the limit.
inline float limitAbove(float v, float hi)
{
    return v < hi ? v : hi;
}
inline float limitBelow(float v, float lo)
{
    return v > lo ? v : lo;
}

// Each depth: its sum, and how a sum becomes a sample. The integer depths limit the sum, convert it to
// nearest with ties to even and keep the low bits; 8s limits from above only, and its 32-bit integer is
// saturated to 16 and then 8 bits (which limits it from below, minus infinity included).
template <class T>
struct Depth;
template <>
struct Depth<uint8_t> {
    using Sum = OffsetFirst;
    static constexpr float lo = 0.0f, hi = 255.0f;
    static uint8_t out(float v) { return static_cast<uint8_t>(roundToInt32(limitBelow(limitAbove(v, hi), lo))); }
};
template <>
struct Depth<uint16_t> {
    using Sum = OffsetFirst;
    static constexpr float lo = 0.0f, hi = 65535.0f;
    static uint16_t out(float v) { return static_cast<uint16_t>(roundToInt32(limitBelow(limitAbove(v, hi), lo))); }
};
template <>
struct Depth<int16_t> {
    using Sum = OffsetFirst;
    static constexpr float lo = -32768.0f, hi = 32767.0f;
    static int16_t out(float v) { return static_cast<int16_t>(roundToInt32(limitBelow(limitAbove(v, hi), lo))); }
};
template <>
struct Depth<int8_t> {
    using Sum = OffsetLast;
    static constexpr float hi = 127.0f;
    static int8_t out(float v)
    {
        const int32_t i = roundToInt32(limitAbove(v, hi));
        const int32_t w = i < -32768 ? -32768 : (i > 32767 ? 32767 : i);
        return static_cast<int8_t>(w < -128 ? -128 : (w > 127 ? 127 : w));
    }
};
template <>
struct Depth<float> {
    using Sum = OffsetFirst;
    static float out(float v) { return v; }
};

// Interleaved pixels of Stride samples (3, or 4 with the fourth neither read nor written), or three planes.
struct C3 {
    static constexpr int stride = 3, planes = 1;
};
struct AC4 {
    static constexpr int stride = 4, planes = 1;
};
struct P3 {
    static constexpr int stride = 1, planes = 3;
};

// Sample k of pixel x of a row whose planes start at p.
template <class L, class T, class P>
inline auto* sampleAddress(P* const* p, int x, int k)
{
    if constexpr (L::planes == 1)
        return p[0] + (static_cast<std::size_t>(x) * L::stride + k) * sizeof(T);
    else
        return p[k] + static_cast<std::size_t>(x) * sizeof(T);
}

// The 3x4 twist of depth T over layout L.
template <class T, class L>
struct Twist3 {
    using Sample = T;
    using Layout = L;
    static constexpr int rows = 3;
    static void row(const uint8_t* const* s, uint8_t* const* d, int x, int w, const Matrix& t)
    {
        using Dp = Depth<T>;
        for (; x < w; ++x) {
            float c[3];
            for (int k = 0; k < 3; ++k)
                c[k] = static_cast<float>(loadSample<T>(sampleAddress<L, T>(s, x, k)));
            for (int i = 0; i < 3; ++i)
                storeSample<T>(sampleAddress<L, T>(d, x, i), Dp::out(Dp::Sum::sum(t.m[i], c[0], c[1], c[2])));
        }
    }
};

// The 4x4 map of four 32f channels: ((c0 x m0 + c1 x m1) + c2 x m2) + c3 x m3, no offset.
struct Twist4 {
    using Sample = float;
    struct Layout {
        static constexpr int stride = 4, planes = 1;
    };
    static constexpr int rows = 4;
    static void row(const uint8_t* const* s, uint8_t* const* d, int x, int w, const Matrix& t)
    {
        for (; x < w; ++x) {
            float c[4];
            for (int k = 0; k < 4; ++k)
                c[k] = loadSample<float>(s[0] + (static_cast<std::size_t>(x) * 4 + k) * 4);
            for (int i = 0; i < 4; ++i) {
                const float* m = t.m[i];
                storeSample<float>(d[0] + (static_cast<std::size_t>(x) * 4 + i) * 4,
                                   ((c[0] * m[0] + c[1] * m[1]) + c[2] * m[2]) + c[3] * m[3]);
            }
        }
    }
};

} // namespace zox::twist
