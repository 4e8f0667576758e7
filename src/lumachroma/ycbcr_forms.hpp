// RGB <-> studio-range YCbCr at full resolution: the per-pixel forms.
#pragma once

#include "frame/layouts.hpp"
#include "frame/ops.hpp"
#include "lumachroma/coefficients.hpp"

namespace zox {

// ---- forward forms ----------------------------------------------------------------------------------

// Matrix block form: luma from unsigned multiply-highs of 256 x sample, chroma from signed ones of
// 128 x sample, each product truncated, then rounded by half a unit before the shift.
struct YccFromRgbMatrix {
    static constexpr YccForwardGains K = YccForward;
    static Px apply(const Px& p)
    {
        const int r = p.c[0], g = p.c[1], b = p.c[2];
        const int y = ((mulHighU(256 * r, K.yR) + mulHighU(256 * g, K.yG) + mulHighU(256 * b, K.yB) + 128) >> 8) + 16;
        const int cb = ((mulHigh(128 * r, K.cbR) + mulHigh(128 * g, K.cbG) + mulHigh(128 * b, K.cbB) + 64) >> 7) + 128;
        const int cr = ((mulHigh(128 * r, K.crR) + mulHigh(128 * g, K.crG) + mulHigh(128 * b, K.crB) + 64) >> 7) + 128;
        return {{clip8(y), clip8(cb), clip8(cr)}, p.extra};
    }
};

// Round block form: every product rounds by itself and the sum rounds down, so it reads low by one unit
// on many inputs. 1026 and 8194 are 16 and 128 in units of 1/64, each with 2 for rounding. Products
// with negative gains are formed with the positive gain and subtracted.
struct YccFromRgbRound {
    static constexpr YccForwardMagnitudes K = YccForwardRound;
    static Px apply(const Px& p)
    {
        const int a = 128 * p.c[0], b = 128 * p.c[1], c = 128 * p.c[2];
        const int y = (mulRound(a, K.yR) + mulRound(b, K.yG) + mulRound(c, K.yB) + 1026) >> 6;
        const int cb = (mulRound(c, K.cbB) - mulRound(b, K.cbG) - mulRound(a, K.cbR) + 8194) >> 6;
        const int cr = (mulRound(a, K.crR) - mulRound(b, K.crG) - mulRound(c, K.crB) + 8194) >> 6;
        return {{clip8(y), clip8(cb), clip8(cr)}, p.extra};
    }
};

// Pixel remainder form: whole-sample products, rounded; the results stay inside 16..240 unlimited.
struct YccFromRgbPixel {
    static constexpr YccForwardGains K = YccForward;
    static Px apply(const Px& p)
    {
        const int r = p.c[0], g = p.c[1], b = p.c[2];
        return {{((K.yR * r + K.yG * g + K.yB * b + 32768) >> 16) + 16, ((K.cbR * r + K.cbG * g + K.cbB * b + 32768) >> 16) + 128,
                 ((K.crR * r + K.crG * g + K.crB * b + 32768) >> 16) + 128},
                p.extra};
    }
};

// ---- inverse forms ----------------------------------------------------------------------------------

// How green gathers its two chroma products in a block form.
enum class Green {
    Sum,       // A + mulHigh(a, u to G) + mulHigh(b, v to G)
    Difference // A - mulHigh(b, -(v to G)) - mulHigh(a, -(u to G)): each floor falls the other way
};

enum class Rounding { Truncated, Rounded };

// Block sets: A = mulHigh(128 y, luma gain), chroma as 128 u and 128 v, the sum divided by 16 after
// the bias (8 rounded, 0 truncated).
template <const YccInverseGains& K, Rounding Rd, Green G>
struct RgbFromYccBlock {
    static constexpr int bias = Rd == Rounding::Rounded ? 8 : 0;
    static Px apply(const Px& p)
    {
        constexpr int R = bias;
        const int A = mulHigh(128 * (p.c[0] - 16), K.y), a = 128 * (p.c[1] - 128), b = 128 * (p.c[2] - 128);
        const int green = G == Green::Sum ? A + mulHigh(a, K.uG) + mulHigh(b, K.vG) : A - mulHigh(b, -K.vG) - mulHigh(a, -K.uG);
        return {{clip8((A + mulHigh(b, K.vR) + R) >> 4), clip8((green + R) >> 4), clip8((A + mulHigh(a, K.uB) + R) >> 4)}, p.extra};
    }
};

// Whole-sample sets in 1/65536, R = 32768 rounded or 0 truncated; a full-range set's gain acts on Y.
template <const YccInverseGains& K, int R>
struct RgbFromYccPixel {
    static Px apply(const Px& p)
    {
        const int y = K.y * (K.full ? p.c[0] : p.c[0] - 16), u = p.c[1] - 128, v = p.c[2] - 128;
        return {{clip8((y + K.vR * v + R) >> 16), clip8((y + K.uG * u + K.vG * v + R) >> 16), clip8((y + K.uB * u + R) >> 16)}, p.extra};
    }
};

using RgbFromYccBlockARounded = RgbFromYccBlock<YccInverseBlockA, Rounding::Rounded, Green::Sum>;
using RgbFromYccBlockATruncated = RgbFromYccBlock<YccInverseBlockA, Rounding::Truncated, Green::Sum>;
using RgbFromYccBlockBSum = RgbFromYccBlock<YccInverseBlockB, Rounding::Rounded, Green::Sum>;
using RgbFromYccBlockBDifference = RgbFromYccBlock<YccInverseBlockB, Rounding::Rounded, Green::Difference>;
using RgbFromYcc709Sum = RgbFromYccBlock<Ycc709InverseBlock, Rounding::Rounded, Green::Sum>;
using RgbFromYcc709Difference = RgbFromYccBlock<Ycc709InverseBlock, Rounding::Rounded, Green::Difference>;
using RgbFromYccPixelATruncated = RgbFromYccPixel<YccInversePixelA, 0>;
using RgbFromYccPixelARounded = RgbFromYccPixel<YccInversePixelA, 32768>;
using RgbFromYccPixelBTruncated = RgbFromYccPixel<YccInversePixelB, 0>;
using RgbFromYccPixelBRounded = RgbFromYccPixel<YccInversePixelB, 32768>;

} // namespace zox
