// The gamma curve in scalar form: the piecewise power curve with a linear foot, forward (linear
// light to encoded) and inverse, as evaluated for 8u tables, 16u samples and 32f samples.
//
// Every constant is the exact double below; where a reciprocal stands it is multiplied, never
// divided by. The build keeps each operation on its own (no contraction, no fast-math), so the
// expressions here are written in the order they must be evaluated.
#pragma once

#include <bit>
#include <cmath>
#include <cstdint>
#include <cstring>

namespace zox::gamma {

inline constexpr double kFwdThreshold = std::bit_cast<double>(uint64_t{0x3F926E978D4FDF3B});  // 0.018
inline constexpr double kFwdSlope = 4.5;
inline constexpr double kFwdExponent = std::bit_cast<double>(uint64_t{0x3FDCCCCCCCCCCCCD});   // 0.45
inline constexpr double kGain = std::bit_cast<double>(uint64_t{0x3FF195810624DD2F});          // 1.099
inline constexpr double kOffset = std::bit_cast<double>(uint64_t{0x3FB95810624DD2F2});        // 0.099
// 0.0812, deliberately not 0.081 (= 4.5 * 0.018): the two segments do not meet exactly.
inline constexpr double kInvThreshold = std::bit_cast<double>(uint64_t{0x3FB4C985F06F6944});
inline constexpr double kInvSlope = std::bit_cast<double>(uint64_t{0x3FCC71C71C71C71C});      // 1/4.5
// Stands in for a division by 1.099; one ulp below the double nearest to 1/1.099.
inline constexpr double kInvGain = std::bit_cast<double>(uint64_t{0x3FED1E0C942633B6});
inline constexpr double kInvExponent = std::bit_cast<double>(uint64_t{0x4001C71C71C71C72});   // 1/0.45
inline constexpr double kNorm16u = std::bit_cast<double>(uint64_t{0x3EF0001000100010});       // 1/65535
inline constexpr double kScale16u = 65535.0;
inline constexpr double kScale8u = 255.0;

enum class Dir { Fwd, Inv };

// The curve scaled back to sample units. `s` is the sample in its own units (the 16u value, the
// 8u index, or the offset from rangeLow at 32f) and `x` the same sample normalised. The linear
// foot works on s; the power segment works on x and is multiplied by `scale` at the end. The
// comparison is strict: the foot is taken when the threshold is greater than x.
template <Dir D>
inline double curveScaled(double s, double x, double scale)
{
    if constexpr (D == Dir::Fwd) {
        if (kFwdThreshold > x)
            return s * kFwdSlope;
        return (std::pow(x, kFwdExponent) * kGain - kOffset) * scale;
    } else {
        if (kInvThreshold > x)
            return s * kInvSlope;
        return std::pow((x + kOffset) * kInvGain, kInvExponent) * scale;
    }
}

// Integer rounding of the integer depths: add 0.5 in double, narrow to float (to nearest), truncate.
// Half to even after narrowing: when t is odd and the narrowed sum equals t exactly, the value was
// a half, or close enough to t that the narrowing landed on it, and it takes the even integer
// below. Callers keep the low 16 (or 8) bits of the result.
inline int roundNarrowEven(double v)
{
    const float sum = static_cast<float>(v + 0.5);
    int t = static_cast<int>(sum);
    if ((t & 1) != 0 && static_cast<float>(t) == sum)
        t -= 1;
    return t;
}

// One 16u sample through the curve.
template <Dir D>
inline uint16_t eval16u(uint16_t s)
{
    const double sd = static_cast<double>(s);
    const double x = sd * kNorm16u;
    return static_cast<uint16_t>(roundNarrowEven(curveScaled<D>(sd, x, kScale16u)));
}

// One entry of the 8u table: as at 16u with 255 as scale and the reciprocal of 255 taken in double.
template <Dir D>
inline uint8_t entry8u(int i)
{
    const double sd = static_cast<double>(i);
    const double x = sd * (1.0 / 255.0);
    return static_cast<uint8_t>(roundNarrowEven(curveScaled<D>(sd, x, kScale8u)));
}

// One 32f sample. Per call: r32 = rangeHigh - rangeLow in float, r = (double)r32, q = 1.0 / r.
// The offset from rangeLow is taken in float, everything after in double, and the sum with
// rangeLow narrowed once. No clamp on either side: samples outside the range stay outside it.
template <Dir D>
inline float eval32f(float s, float rangeLow, float r32, double r, double q)
{
    (void)r32;
    const double d = static_cast<double>(s - rangeLow);
    const double x = q * d;
    const double v = curveScaled<D>(d, x, r);
    return static_cast<float>(v + static_cast<double>(rangeLow));
}

// The 8u tables, indexed by sample value: entry8u<Fwd> and entry8u<Inv> for 0..255.
// The forward table is also read by the gamma-corrected 4:2:2 packing.
inline constexpr uint8_t kGammaFwd8u[256] = {
      0,   4,   9,  14,  18,  23,  27,  30,  34,  37,  40,  43,  46,  48,  51,  53,
     55,  58,  60,  62,  64,  66,  68,  70,  72,  73,  75,  77,  78,  80,  82,  83,
     85,  86,  88,  89,  91,  92,  94,  95,  97,  98,  99, 101, 102, 103, 104, 106,
    107, 108, 109, 111, 112, 113, 114, 115, 116, 118, 119, 120, 121, 122, 123, 124,
    125, 126, 127, 128, 129, 130, 131, 132, 133, 134, 135, 136, 137, 138, 139, 140,
    141, 142, 143, 144, 145, 146, 147, 147, 148, 149, 150, 151, 152, 153, 154, 154,
    155, 156, 157, 158, 159, 159, 160, 161, 162, 163, 164, 164, 165, 166, 167, 168,
    168, 169, 170, 171, 171, 172, 173, 174, 174, 175, 176, 177, 177, 178, 179, 180,
    180, 181, 182, 182, 183, 184, 185, 185, 186, 187, 187, 188, 189, 189, 190, 191,
    191, 192, 193, 193, 194, 195, 195, 196, 197, 197, 198, 199, 199, 200, 201, 201,
    202, 203, 203, 204, 205, 205, 206, 206, 207, 208, 208, 209, 209, 210, 211, 211,
    212, 213, 213, 214, 214, 215, 216, 216, 217, 217, 218, 218, 219, 220, 220, 221,
    221, 222, 223, 223, 224, 224, 225, 225, 226, 227, 227, 228, 228, 229, 229, 230,
    230, 231, 232, 232, 233, 233, 234, 234, 235, 235, 236, 236, 237, 238, 238, 239,
    239, 240, 240, 241, 241, 242, 242, 243, 243, 244, 244, 245, 245, 246, 246, 247,
    247, 248, 248, 249, 249, 250, 251, 251, 252, 252, 253, 253, 254, 254, 255, 255,
};

inline constexpr uint8_t kGammaInv8u[256] = {
      0,   0,   0,   1,   1,   1,   1,   2,   2,   2,   2,   2,   3,   3,   3,   3,
      4,   4,   4,   4,   4,   5,   5,   5,   5,   6,   6,   6,   6,   7,   7,   7,
      7,   8,   8,   8,   9,   9,   9,  10,  10,  10,  11,  11,  11,  12,  12,  13,
     13,  13,  14,  14,  15,  15,  15,  16,  16,  17,  17,  18,  18,  19,  19,  20,
     20,  21,  21,  22,  22,  23,  23,  24,  24,  25,  25,  26,  27,  27,  28,  28,
     29,  30,  30,  31,  31,  32,  33,  33,  34,  35,  35,  36,  37,  37,  38,  39,
     40,  40,  41,  42,  43,  43,  44,  45,  46,  46,  47,  48,  49,  50,  51,  51,
     52,  53,  54,  55,  56,  57,  57,  58,  59,  60,  61,  62,  63,  64,  65,  66,
     67,  68,  69,  70,  71,  72,  73,  74,  75,  76,  77,  78,  79,  80,  81,  82,
     83,  84,  85,  86,  88,  89,  90,  91,  92,  93,  94,  96,  97,  98,  99, 100,
    102, 103, 104, 105, 107, 108, 109, 110, 112, 113, 114, 116, 117, 118, 119, 121,
    122, 124, 125, 126, 128, 129, 130, 132, 133, 135, 136, 138, 139, 140, 142, 143,
    145, 146, 148, 149, 151, 152, 154, 155, 157, 158, 160, 162, 163, 165, 166, 168,
    170, 171, 173, 174, 176, 178, 179, 181, 183, 184, 186, 188, 190, 191, 193, 195,
    197, 198, 200, 202, 204, 205, 207, 209, 211, 213, 214, 216, 218, 220, 222, 224,
    226, 228, 229, 231, 233, 235, 237, 239, 241, 243, 245, 247, 249, 251, 253, 255,
};

}  // namespace zox::gamma
