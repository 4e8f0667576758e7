// The fixed-point vocabulary of the per-pixel forms, in plain scalar C++, with the exact semantics of the
// 16-bit lane instructions they stand for. Arguments are the lane values; results are ints.
#pragma once

#include <cstdint>

namespace zox {

// floor(a * k / 65536) of two signed 16-bit values: the upper half of the signed product.
constexpr int mulHigh(int a, int k)
{
    return (a * k) >> 16;
}

// The same for two unsigned 16-bit values.
constexpr int mulHighU(int a, int k)
{
    return static_cast<int>((static_cast<uint32_t>(a) * static_cast<uint32_t>(k)) >> 16);
}

// floor((a * k + 16384) / 32768): the rounded upper half of a signed product.
constexpr int mulRound(int a, int k)
{
    return (a * k + 16384) >> 15;
}

// Limits x to 0..255 (an unsigned saturating pack).
constexpr uint8_t clip8(int x)
{
    return static_cast<uint8_t>(x < 0 ? 0 : (x > 255 ? 255 : x));
}

// Holds x to 1..254: the limit of the full-range sampled sets.
constexpr uint8_t limit1(int x)
{
    return static_cast<uint8_t>(x < 1 ? 1 : (x > 254 ? 254 : x));
}

// A float to a 32-bit integer as the processor's conversion with rounding to nearest gives it: ties to
// even, and the integer indefinite (INT32_MIN) for NaN and for values out of range.
inline int32_t roundToInt32(float v)
{
    if (!(v >= -2147483648.0f && v < 2147483648.0f))
        return INT32_MIN;
    return static_cast<int32_t>(__builtin_roundevenf(v));
}

// The same conversion truncating, from double.
inline int32_t truncateToInt32(double v)
{
    if (!(v > -2147483649.0 && v < 2147483648.0))
        return INT32_MIN;
    return static_cast<int32_t>(v);
}

// The unsigned 16-bit saturating sum.
constexpr int addSatU16(int a, int b)
{
    return a + b > 65535 ? 65535 : a + b;
}

} // namespace zox
