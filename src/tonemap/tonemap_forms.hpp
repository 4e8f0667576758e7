// Tone mapping of one-channel float images to bytes: the scalar forms of the statistics and of the
// per-sample mapping. The kernels of each set (tonemap_simd.inl) are fast paths of these forms.
#pragma once

#include <algorithm>
#include <cstdint>
#include <cstring>

namespace zox::tonemap {

// Sample x of a row; a row need not start on a 4-byte boundary, so samples are read as bytes.
inline float at(const float* s, int x)
{
    float v;
    std::memcpy(&v, reinterpret_cast<const unsigned char*>(s) + 4 * static_cast<std::ptrdiff_t>(x), 4);
    return v;
}

// The maximum starts from the most negative finite float; samples that are not numbers never win.
inline constexpr float kMaxStart = -3.4028235e38f;
// The smallest normal float: a statistic not above it maps the image to black.
inline constexpr float kTinyLinear = 1.1754944e-38f;
inline constexpr double kTinyMean = 1.1754943508222875e-38;

// Float to 32-bit integer by truncation, as the processor converts: a value outside the 32-bit range,
// or not a number, gives the most negative integer.
inline int32_t truncateToInt32(float v)
{
    if (v >= -2147483648.0f && v < 2147483648.0f)
        return static_cast<int32_t>(v);
    return INT32_MIN;
}

inline float rowMax(const float* s, int width, float m)
{
    for (int x = 0; x < width; ++x) {
        const float v = at(s, x);
        m = v > m ? v : m;
    }
    return m;
}

// Where the samples of a row go among the sixteen single-precision partial sums: a row that starts on a
// 4-byte boundary but not on a 16-byte one puts its first samples, up to the next 16-byte boundary, in
// the lanes of their places in that 16-byte block; from the boundary on (from the first sample, for
// other rows) sample i goes to lane i mod 16.
struct RowLanes {
    int head;      // samples before the boundary
    int headLane;  // lane of the first of them
};
inline RowLanes rowLanes(const float* s, int width)
{
    const uintptr_t a = reinterpret_cast<uintptr_t>(s);
    if (a % 4 != 0 || a % 16 == 0)
        return {0, 0};
    return {std::min(static_cast<int>((16 - a % 16) / 4), width), static_cast<int>(a % 16 / 4)};
}

// The sixteen partial sums folded: the four accumulators of four lanes added pairwise, the four lanes
// folded to two, and the two added to the total one after the other.
inline void foldIntoTotal(const float (&p)[16], double& total)
{
    float q[4];
    for (int j = 0; j < 4; ++j)
        q[j] = (p[j] + p[4 + j]) + (p[8 + j] + p[12 + j]);
    const float r0 = q[0] + q[2], r1 = q[1] + q[3];
    total += r0;
    total += r1;
}

inline void addRowSum(const float* s, int width, double& total)
{
    float p[16] = {};
    const RowLanes lanes = rowLanes(s, width);
    int x = 0;
    for (; x < lanes.head; ++x)
        p[lanes.headLane + x] += at(s, x);
    for (int i = 0; x < width; ++x, ++i)
        p[i % 16] += at(s, x);
    foldIntoTotal(p, total);
}

// The mappings of one sample: the low byte of the truncated product, or the truncated product limited
// to 0..255.
struct Linear {
    static uint8_t map(float s, float scale) { return static_cast<uint8_t>(static_cast<uint32_t>(truncateToInt32(s * scale))); }
};
struct Mean {
    static uint8_t map(float s, float scale) { return static_cast<uint8_t>(std::clamp(truncateToInt32(s * scale), 0, 255)); }
};

} // namespace zox::tonemap
