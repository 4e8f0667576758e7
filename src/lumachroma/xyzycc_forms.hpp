// RGB <-> XYZ and RGB <-> YCC at 8u, 16u, 16s and 32f: the per-pixel forms. 8u forms are integer; 16-bit
// and 32f forms are single precision, each product and sum rounded to single and sums taken left to
// right as written (the build never contracts them). 16s samples are lifted by 32768 into the 16u range
// and brought back at the end.
#pragma once

#include "frame/layouts.hpp"
#include "frame/ops.hpp"

#include <cmath>
#include <cstdint>

namespace zox::xyzycc {

// ---- shared pieces ------------------------------------------------------------------------------------

// Float to integer by cutting off the fraction (the values of these forms stay far inside 32 bits).
inline int trunc32(float v)
{
    return static_cast<int>(v);
}
// Float to integer to nearest in the processor's rounding mode: to nearest, ties to even, unless the
// caller has changed it (every kernel set converts the same way, so the bytes agree in any mode).
inline int nearestEven(float v)
{
    return static_cast<int>(std::rint(v));
}
// The depth a 16-bit form writes: 16u limited to 0..65535; 16s formed on the lifted scale, less 32768,
// limited to -32768..32767.
enum class Depth { U16, S16 };
template <Depth D>
constexpr int lift(int v)
{
    return D == Depth::S16 ? v + 32768 : v;
}
template <Depth D>
constexpr int limit16(int v)
{
    const int r = D == Depth::S16 ? v - 32768 : v;
    const int lo = D == Depth::S16 ? -32768 : 0, hi = D == Depth::S16 ? 32767 : 65535;
    return r < lo ? lo : (r > hi ? hi : r);
}
inline float lim01(float v)
{
    return v < 0.0f ? 0.0f : (v > 1.0f ? 1.0f : v);
}

// A 3x3 matrix, one row an output.
template <class T>
struct Mat3 {
    T k[3][3];
};
// Single-precision matrices.
inline constexpr Mat3<float> XyzForward{{{0.412453f, 0.35758f, 0.180423f}, {0.212671f, 0.71516f, 0.072169f}, {0.019334f, 0.119193f, 0.950227f}}};
inline constexpr Mat3<float> XyzInverse{{{3.240479f, -1.53715f, -0.498535f}, {-0.969256f, 1.875991f, 0.041556f}, {0.055648f, -0.204043f, 1.057311f}}};
// Integer matrices of the 8u functions, with their scales as shifts.
inline constexpr Mat3<int> XyzForwardBlock8{{{13515, 11717, 5912}, {6969, 23434, 2365}, {634, 3906, 31137}}};     // 1/32768
inline constexpr Mat3<int> XyzForwardPixel8{{{27030, 23434, 11824}, {13937, 46868, 4729}, {1267, 7811, 62274}}};  // 1/65536
inline constexpr Mat3<int> XyzInverseBlock8{{{26546, -12591, -4083}, {-7939, 15368, 340}, {456, -1671, 8661}}};   // 1/8192
inline constexpr Mat3<int> XyzInversePixel8{{{212368, -100738, -32671}, {-63521, 122944, 2723}, {3646, -13372, 69291}}}; // 1/65536

template <class T>
inline T row(const Mat3<T>& m, int i, T a, T b, T c)
{
    return m.k[i][0] * a + m.k[i][1] * b + m.k[i][2] * c;
}

// ---- 8u -------------------------------------------------------------------------------------------------

// XYZ both ways: clip8(floor(sum / 2^Shift)), no rounding term.
template <const Mat3<int>& M, int Shift>
struct Xyz8 {
    static Px apply(const Px& p)
    {
        const int a = p.c[0], b = p.c[1], c = p.c[2];
        return {{clip8(row(M, 0, a, b, c) >> Shift), clip8(row(M, 1, a, b, c) >> Shift), clip8(row(M, 2, a, b, c) >> Shift)}, 0};
    }
};
using XyzForwardBlock = Xyz8<XyzForwardBlock8, 15>;
using XyzForwardPixel = Xyz8<XyzForwardPixel8, 16>;
using XyzInverseBlock = Xyz8<XyzInverseBlock8, 13>;
using XyzInversePixel = Xyz8<XyzInversePixel8, 16>;

struct YccForwardBlock8 {
    static Px apply(const Px& p)
    {
        const int r = p.c[0], g = p.c[1], b = p.c[2];
        const int s = mulHighU(256 * r, 4898) + mulHighU(256 * g, 9617) + mulHighU(256 * b, 1867);
        return {{clip8(mulHigh(s, 2921) >> 2), clip8((mulHigh(64 * b - s, 1789) + 624) >> 2), clip8((mulHigh(64 * r - s, 2178) + 548) >> 2)}, 0};
    }
};
struct YccForwardRemainder8 {
    static Px apply(const Px& p)
    {
        const int r = p.c[0], g = p.c[1], b = p.c[2];
        const int t = 4898 * r + 9617 * g + 1867 * b;
        return {{((t >> 10) * 2921) >> 16, ((((16384 * b - t) >> 10) * 1789) >> 16) + 156, ((((16384 * r - t) >> 10) * 2178) >> 16) + 137}, 0};
    }
};
struct YccInverseBlock8 {
    static Px apply(const Px& p)
    {
        const int y = mulHighU(256 * p.c[0], 5563), u = mulHigh(128 * (p.c[1] - 156), 18168), v = mulHigh(128 * (p.c[2] - 137), 14921);
        return {{clip8((y + v) >> 4), clip8(((y >> 1) + mulHigh(u, -6357) + mulHigh(v, -16679)) >> 3), clip8((y + u) >> 4)}, 0};
    }
};
struct YccInverseRemainder8 {
    static Px apply(const Px& p)
    {
        const int a = 5564 * p.c[0], b = 9084 * p.c[1] - 1417104, c = 7460 * p.c[2] - 1022020;
        return {{clip8((a + c) >> 12), clip8((16 * a - 794 * (b >> 8) - 2084 * (c >> 8)) >> 16), clip8((a + b) >> 12)}, 0};
    }
};

// ---- 16u and 16s ----------------------------------------------------------------------------------------

template <const Mat3<float>& M, Depth D>
struct Xyz16 {
    static constexpr bool compilerVectorised = true;
    static Px apply(const Px& p)
    {
        const float a = static_cast<float>(lift<D>(p.c[0])), b = static_cast<float>(lift<D>(p.c[1])), c = static_cast<float>(lift<D>(p.c[2]));
        return {{limit16<D>(trunc32(row(M, 0, a, b, c))), limit16<D>(trunc32(row(M, 1, a, b, c))), limit16<D>(trunc32(row(M, 2, a, b, c)))}, 0};
    }
};

// RGB to YCC, block form: to nearest.
template <Depth D>
struct YccForwardBlock16 {
    static constexpr bool compilerVectorised = true;
    static Px apply(const Px& p)
    {
        const float r = static_cast<float>(lift<D>(p.c[0])), g = static_cast<float>(lift<D>(p.c[1])), b = static_cast<float>(lift<D>(p.c[2]));
        const float t = 0.299f * r + 0.587f * g + 0.114f * b;
        return {{limit16<D>(nearestEven(0.7132668f * t)), limit16<D>(nearestEven(0.4368627f * (b - t) + 40092.0f)),
                 limit16<D>(nearestEven(0.5319216f * (r - t) + 35209.0f))},
                0};
    }
};
// RGB to YCC remainder forms: 16s truncates with half added; 16u takes a direct matrix in its own order.
struct YccForwardRemainder16s {
    static constexpr bool compilerVectorised = true;
    static Px apply(const Px& p)
    {
        const float r = static_cast<float>(p.c[0] + 32768), g = static_cast<float>(p.c[1] + 32768), b = static_cast<float>(p.c[2] + 32768);
        const float t = 0.299f * r + 0.587f * g + 0.114f * b;
        return {{limit16<Depth::S16>(trunc32(0.7132668f * t + 0.49999f)), limit16<Depth::S16>(trunc32(0.4368627f * (b - t) + 40092.5f)),
                 limit16<Depth::S16>(trunc32(0.5319216f * (r - t) + 35209.5f))},
                0};
    }
};
struct YccForwardRemainder16u {
    static constexpr bool compilerVectorised = true;
    static Px apply(const Px& p)
    {
        const float r = static_cast<float>(p.c[0]), g = static_cast<float>(p.c[1]), b = static_cast<float>(p.c[2]);
        return {{limit16<Depth::U16>(trunc32(0.213267f * r + 0.49999f + 0.418688f * g + 0.0813124f * b)),
                 limit16<Depth::U16>(trunc32(-0.130621f * r + 40092.5f - 0.256437f * g + 0.387058f * b)),
                 limit16<Depth::U16>(trunc32(0.372876f * r + 35209.5f - 0.312237f * g - 0.0606389f * b))},
                0};
    }
};

// YCC to RGB, 16s: one form in block and remainder.
struct YccInverse16s {
    static constexpr bool compilerVectorised = true;
    static Px apply(const Px& p)
    {
        const float y = 1.3584f * static_cast<float>(p.c[0] + 32768), u = 2.2179f * static_cast<float>(p.c[1] - 7324),
                    v = 1.8215f * static_cast<float>(p.c[2] - 2441);
        return {{limit16<Depth::S16>(trunc32(y + v)), limit16<Depth::S16>(trunc32(y - 0.194f * u - 0.509f * v)), limit16<Depth::S16>(trunc32(y + u))}, 0};
    }
};
// YCC to RGB, 16u: block to nearest, remainder truncated from a shifted luma.
struct YccInverseBlock16u {
    static constexpr bool compilerVectorised = true;
    static Px apply(const Px& p)
    {
        const float y = 1.3584f * static_cast<float>(p.c[0]), u = 2.2179f * static_cast<float>(p.c[1] - 40092),
                    v = 1.8215f * static_cast<float>(p.c[2] - 35209);
        return {{limit16<Depth::U16>(nearestEven(y + v)), limit16<Depth::U16>(nearestEven(y - 0.194f * u - 0.509f * v)),
                 limit16<Depth::U16>(nearestEven(y + u))},
                0};
    }
};
struct YccInverseRemainder16u {
    static constexpr bool compilerVectorised = true;
    static Px apply(const Px& p)
    {
        const float y = 1.3584f * static_cast<float>(p.c[0]) + 0.49999f, u = static_cast<float>(p.c[1] - 40092),
                    v = static_cast<float>(p.c[2] - 35209);
        return {{limit16<Depth::U16>(trunc32(1.8215f * v + y)), limit16<Depth::U16>(trunc32(y - 0.4302726f * u - 0.92714345f * v)),
                 limit16<Depth::U16>(trunc32(y + 2.2179f * u))},
                0};
    }
};

// ---- 32f ------------------------------------------------------------------------------------------------

struct XyzForward32f {
    static constexpr bool compilerVectorised = true;
    static PxF apply(const PxF& p)
    {
        const float a = p.c[0], b = p.c[1], c = p.c[2];
        return {{row(XyzForward, 0, a, b, c), row(XyzForward, 1, a, b, c), lim01(row(XyzForward, 2, a, b, c))}, 0};
    }
};
struct XyzInverse32f {
    static constexpr bool compilerVectorised = true;
    static PxF apply(const PxF& p)
    {
        const float a = p.c[0], b = p.c[1], c = p.c[2];
        return {{lim01(row(XyzInverse, 0, a, b, c)), lim01(row(XyzInverse, 1, a, b, c)), lim01(row(XyzInverse, 2, a, b, c))}, 0};
    }
};
struct YccForward32f {
    static constexpr bool compilerVectorised = true;
    static PxF apply(const PxF& p)
    {
        const float r = p.c[0], g = p.c[1], b = p.c[2];
        const float t = 0.299f * r + 0.587f * g + 0.114f * b;
        return {{0.7132668f * t, 0.4368627f * (b - t) + 0.6117647f, 0.53192f * (r - t) + 0.5372549f}, 0};
    }
};
struct YccInverse32f {
    static constexpr bool compilerVectorised = true;
    static PxF apply(const PxF& p)
    {
        const float y = 1.3584f * p.c[0], u = 2.2179f * (p.c[1] - 0.6117647f), v = 1.8215f * (p.c[2] - 0.5372549f);
        return {{lim01(y + v), lim01(y - 0.194f * u - 0.509f * v), lim01(y + u)}, 0};
    }
};

} // namespace zox::xyzycc
