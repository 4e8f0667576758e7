// RGB <-> YUV at full resolution: the per-pixel forms over the Yuv coefficient sets.
//
// Y = 0.299 R + 0.587 G + 0.114 B at full range, U = 0.492 (B - Y) + 128, V = 0.877 (R - Y) + 128.
// Every form is one pixel in, one pixel out; the block forms are the arithmetic of the 16-bit lane
// kernels and differ from the remainder forms by at most one unit.
#pragma once

#include "frame/layouts.hpp"
#include "frame/ops.hpp"
#include "lumachroma/coefficients.hpp"

namespace zox {

// ---- forward forms ----------------------------------------------------------------------------------

// Matrix block form: each product truncated before the sum; Y never exceeds 254 here.
struct YuvFromRgbMatrix {
    using K = YuvMatrixForward;
    static Px apply(const Px& p)
    {
        const int r = p.c[0], g = p.c[1], b = p.c[2];
        const int y = (mulHighU(256 * r, K::yR) + mulHighU(256 * g, K::yG) + mulHighU(256 * b, K::yB)) >> 8;
        const int u = ((mulHigh(128 * r, K::uR) + mulHigh(128 * g, K::uG) + mulHigh(128 * b, K::uB)) >> 6) + 128;
        const int v = ((mulHigh(128 * r, K::vR) + mulHigh(128 * g, K::vG) + mulHigh(128 * b, K::vB)) >> 6) + 128;
        return {{y, clip8(u), clip8(v)}, p.extra};
    }
};

// Half block form: s is twice the luma plus the rounding unit, and the differences subtract it.
struct YuvFromRgbHalf {
    using K = YuvHalfForward;
    static Px apply(const Px& p)
    {
        const int r = p.c[0], g = p.c[1], b = p.c[2];
        const int s = mulHigh(4 * r, K::yR) + mulHigh(4 * b, K::yB) + mulHigh(4 * g, K::yG) + 1;
        return {{clip8(s >> 1), clip8(mulHigh(2 * b - s, K::uGain) + 128), clip8(mulHigh(2 * r - s, K::vGain) + 128)},
                p.extra};
    }
};

// Difference remainder form, with full rounding (FullRound) or low rounding.
template <bool FullRound>
struct YuvFromRgbDifference {
    using K = YuvDifferenceForward;
    static Px apply(const Px& p)
    {
        const int r = p.c[0], g = p.c[1], b = p.c[2];
        const int t = K::yR * r + K::yG * g + K::yB * b;
        const int yBias = FullRound ? 32768 : 0;
        const int dBias = FullRound ? 32768 : 32767;
        const int y = (t + yBias) >> 16;
        const int dB = (65536 * b - t + dBias) >> 16;
        const int dR = (65536 * r - t + dBias) >> 16;
        // U cannot leave 0..255; V can, since R - Y reaches +-179.
        return {{y, ((K::uGain * dB) >> 16) + 128, clip8(((K::vGain * dR) >> 16) + 128)}, p.extra};
    }
};
using YuvFromRgbDifferenceFull = YuvFromRgbDifference<true>;
using YuvFromRgbDifferenceLow = YuvFromRgbDifference<false>;

// Plane remainder form: the matrix gains applied to whole samples.
struct YuvFromRgbPlane {
    using K = YuvMatrixForward;
    static Px apply(const Px& p)
    {
        const int r = p.c[0], g = p.c[1], b = p.c[2];
        const int y = (K::yR * r + K::yG * g + K::yB * b) >> 16;
        const int u = ((K::uR * r + K::uG * g + K::uB * b) >> 15) + 128;
        const int v = ((K::vR * r + K::vG * g + K::vB * b) >> 15) + 128;
        return {{y, u, clip8(v)}, p.extra};
    }
};

// ---- inverse forms ----------------------------------------------------------------------------------

// Block 8: chroma scaled by 8, gains in 1/8192.
struct RgbFromYuvBlock8 {
    static constexpr YuvInverseGains K = YuvInverseBlock8;
    static Px apply(const Px& p)
    {
        const int y = p.c[0], a = 8 * (p.c[1] - 128), b = 8 * (p.c[2] - 128);
        return {{clip8(y + mulHigh(b, K.vR)), clip8(y + mulHigh(a, K.uG) + mulHigh(b, K.vG)), clip8(y + mulHigh(a, K.uB))},
                p.extra};
    }
};

// Block 16: chroma scaled by 16, luma doubled, the sum halved (gains in 1/8192).
template <const YuvInverseGains& K>
struct RgbFromYuvBlock16With {
    static Px apply(const Px& p)
    {
        const int y2 = 2 * p.c[0], a = 16 * (p.c[1] - 128), b = 16 * (p.c[2] - 128);
        return {{clip8((y2 + mulHigh(b, K.vR)) >> 1), clip8((y2 + mulHigh(a, K.uG) + mulHigh(b, K.vG)) >> 1),
                 clip8((y2 + mulHigh(a, K.uB)) >> 1)},
                p.extra};
    }
};
using RgbFromYuvBlock16 = RgbFromYuvBlock16With<YuvInverseBlock16>;

// Block 128: chroma scaled by 128, luma by 8, rounded. Green subtracts products formed with positive
// gains, so each of its floors falls the other way from a negative gain.
struct RgbFromYuvBlock128 {
    static constexpr YuvInverseGains K = YuvInverseBlock128;
    static Px apply(const Px& p)
    {
        const int y8 = 8 * p.c[0], a = 128 * (p.c[1] - 128), b = 128 * (p.c[2] - 128);
        return {{clip8((y8 + mulHigh(b, K.vR) + 4) >> 3), clip8((y8 - mulHigh(b, -K.vG) - mulHigh(a, -K.uG) + 4) >> 3),
                 clip8((y8 + mulHigh(a, K.uB) + 4) >> 3)},
                p.extra};
    }
};

// Whole-sample forms in 1/65536: rounded (green rounded only when GreenRound) or truncated.
template <const YuvInverseGains& K, int RB, int G>
struct RgbFromYuvPixel {
    static Px apply(const Px& p)
    {
        const int y = 65536 * p.c[0], u = p.c[1] - 128, v = p.c[2] - 128;
        return {{clip8((y + K.vR * v + RB) >> 16), clip8((y + K.uG * u + K.vG * v + G) >> 16), clip8((y + K.uB * u + RB) >> 16)},
                p.extra};
    }
};
using RgbFromYuvRoundedGreenLow = RgbFromYuvPixel<YuvInverseRounded, 32768, 0>;
using RgbFromYuvRounded = RgbFromYuvPixel<YuvInverseRounded, 32768, 32768>;
using RgbFromYuvTruncated = RgbFromYuvPixel<YuvInverseTruncated, 0, 0>;

} // namespace zox
