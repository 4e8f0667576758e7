// Chroma-sampled images to RGB: the per-pixel forms of the sampled members that the full-resolution
// conversions do not share. Every form takes one pixel's Y and its unit's Cb and Cr (c[0], c[1], c[2])
// and gives R, G, B.
#pragma once

#include "frame/layouts.hpp"
#include "frame/ops.hpp"
#include "lumachroma/coefficients.hpp"
#include "lumachroma/ycbcr_forms.hpp"
#include "lumachroma/yuv_forms.hpp"

namespace zox {

// Folded: the raw samples at 128 x into multiply-highs, the offsets of Y, Cb and Cr lying in the set's
// constants; the sums over 8, floored.
template <const YccFoldedGains& K>
struct RgbFromYccFolded {
    static Px apply(const Px& p)
    {
        const int y = mulHigh(128 * p.c[0], K.y), cb = 128 * p.c[1], cr = 128 * p.c[2];
        const int tB = mulHigh(cb, K.cbB) - K.kB, tR = mulHigh(cr, K.crR) - K.kR;
        const int tG = mulHigh(cb, K.cbG) + mulHigh(cr, K.crG) - K.kG;
        return {{clip8((y + tR) >> 3), clip8((y - tG) >> 3), clip8((y + tB) >> 3)}, p.extra};
    }
};

// Split: y, u and v at 128 x into multiply-highs, no rounding term; the sums over 8, floored.
template <const YccFoldedGains& K>
struct RgbFromYccSplit {
    static Px apply(const Px& p)
    {
        const int y = mulHigh(128 * (p.c[0] - 16), K.y), a = 128 * (p.c[1] - 128), b = 128 * (p.c[2] - 128);
        return {{clip8((y + mulHigh(b, K.crR)) >> 3), clip8((y - mulHigh(a, K.cbG) - mulHigh(b, K.crG)) >> 3),
                 clip8((y + mulHigh(a, K.cbB)) >> 3)},
                p.extra};
    }
};

// Wide: 16 Y with no offset, chroma at 128 x into multiply-highs, over 16 after the bias R (8 rounded, 0
// truncated). Green gathers its products as a sum, or subtracts those formed with the positive gains
// (each floor falls the other way).
template <const YuvInverseGains& K, Green G, int R = 8>
struct RgbFromWide {
    static Px apply(const Px& p)
    {
        const int y = 16 * p.c[0] + R, a = 128 * (p.c[1] - 128), b = 128 * (p.c[2] - 128);
        const int green = G == Green::Sum ? y + mulHigh(a, K.uG) + mulHigh(b, K.vG) : y - mulHigh(a, -K.uG) - mulHigh(b, -K.vG);
        return {{clip8((y + mulHigh(b, K.vR)) >> 4), clip8(green >> 4), clip8((y + mulHigh(a, K.uB)) >> 4)}, p.extra};
    }
};

// Biased: the whole-sample gains of YccInversePixelA on the raw samples, the offsets and a bias below the
// truncated form's (by 57, 14 and 13) in one constant a channel.
struct RgbFromYccBiased {
    static constexpr const YccInverseGains& K = YccInversePixelA;
    static Px apply(const Px& p)
    {
        const int y = K.y * p.c[0], cb = p.c[1], cr = p.c[2];
        return {{clip8((y + K.vR * cr - 14608761) >> 16), clip8((y + K.uG * cb + K.vG * cr + 8887730) >> 16),
                 clip8((y + K.uB * cb - 18140365) >> 16)},
                p.extra};
    }
};

// Scale 13: the 16-bit block gains on whole samples, in 1/8192, truncated.
struct RgbFromYuvScale13 {
    static constexpr const YuvInverseGains& K = YuvInverseBlock16;
    static Px apply(const Px& p)
    {
        const int y = 8192 * p.c[0], u = p.c[1] - 128, v = p.c[2] - 128;
        return {{clip8((y + K.vR * v) >> 13), clip8((y + K.uG * u + K.vG * v) >> 13), clip8((y + K.uB * u) >> 13)}, p.extra};
    }
};

} // namespace zox
