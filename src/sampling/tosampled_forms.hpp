// RGB to chroma-sampled YCbCr and YUV: the unit forms. A unit form takes the pixels of one chroma unit
// (2x2, 2x1 or 4x1) and gives each pixel's luma and the unit's chroma pair, from the plain sums of
// each channel over the unit; a tail form takes a pixel behind the last whole unit.
#pragma once

#include "frame/ops.hpp"
#include "frame/sampled.hpp"
#include "lumachroma/coefficients.hpp"
#include "lumachroma/yuv_forms.hpp"

namespace zox {

// The sums of each channel over the first n pixels of a unit.
template <int n>
struct UnitSums {
    int r = 0, g = 0, b = 0;
    explicit UnitSums(const Unit& u)
    {
        for (int k = 0; k < n; ++k) {
            r += u.p[k].c[0];
            g += u.p[k].c[1];
            b += u.p[k].c[2];
        }
    }
};

template <bool Full>
constexpr int limitOf(int x)
{
    return Full ? limit1(x) : clip8(x);
}

// ---- YCbCr block forms ---------------------------------------------------------------------------------

// Sum luma: unsigned multiply-highs of 256 x sample, rounded and offset by c (16 in 1/128 with the
// rounding unit; none in full range) before the division by 128.
template <const YccForwardMagnitudes& K>
constexpr int sumLuma(const Px& p)
{
    constexpr int c = K.full ? 64 : 2112;
    return limitOf<K.full>((mulHighU(256 * p.c[0], K.yR) + mulHighU(256 * p.c[1], K.yG) + mulHighU(256 * p.c[2], K.yB) + c) >> 7);
}

// How a block form takes its chroma from the unit's sums S (scaled by 32 or 64), with the offset c and
// divisor 2^shift.
enum class SumChroma {
    Sum,    // unit of 4: S = 32 Sum, unsigned products
    Sum2,   // unit of 2: S = 32 Sum, unsigned products
    Sum64,  // unit of 2: S = 64 Sum, unsigned products
    Signed  // unit of 2: S = 64 Sum, signed products of negated gains, so their floors fall the other way
};

template <const YccForwardMagnitudes& K, SumChroma Kind>
struct YccSumBlock {
    static constexpr int n = Kind == SumChroma::Sum ? 4 : 2;
    static constexpr int scale = Kind == SumChroma::Sum64 || Kind == SumChroma::Signed ? 64 : 32;
    static constexpr bool wide = K.full || Kind == SumChroma::Sum2 || Kind == SumChroma::Sum64;
    // 128 and the rounding unit, over 128 or 64.
    static constexpr int c = Kind == SumChroma::Sum2 ? 8200 : wide ? 8224 : Kind == SumChroma::Signed ? 16448 : 16400;
    static constexpr int shift = wide ? 6 : 7;
    static UnitOut apply(const Unit& u)
    {
        UnitOut o{};
        for (int k = 0; k < n; ++k)
            o.y[k] = sumLuma<K>(u.p[k]);
        const UnitSums<n> s(u);
        const int sr = scale * s.r, sg = scale * s.g, sb = scale * s.b;
        int cb, cr;
        if constexpr (Kind == SumChroma::Signed) {
            cb = mulHigh(sr, -K.cbR) + mulHigh(sg, -K.cbG) + mulHigh(sb, K.cbB) + c;
            cr = mulHigh(sr, K.crR) + mulHigh(sg, -K.crG) + mulHigh(sb, -K.crB) + c;
        } else {
            cb = mulHighU(sb, K.cbB) - mulHighU(sr, K.cbR) - mulHighU(sg, K.cbG) + c;
            cr = mulHighU(sr, K.crR) - mulHighU(sg, K.crG) - mulHighU(sb, K.crB) + c;
        }
        o.cb = limitOf<K.full>(cb >> shift);
        o.cr = limitOf<K.full>(cr >> shift);
        return o;
    }
};

// Round block form over a unit of 4: rounded products of 128 x sample and of 32 x sums. With
// OffsetAfter the 16 and 128 come after the division (the 4:1:1 member), else with the rounding unit
// before it.
template <bool OffsetAfter>
struct YccRoundBlock {
    static constexpr YccForwardMagnitudes K = YccForwardRound;
    static UnitOut apply(const Unit& u)
    {
        UnitOut o{};
        for (int k = 0; k < 4; ++k) {
            const Px& p = u.p[k];
            const int y = mulRound(128 * p.c[0], K.yR) + mulRound(128 * p.c[1], K.yG) + mulRound(128 * p.c[2], K.yB);
            o.y[k] = OffsetAfter ? clip8((y >> 6) + 16) : clip8((y + 1026) >> 6);
        }
        const UnitSums<4> s(u);
        const int sr = 32 * s.r, sg = 32 * s.g, sb = 32 * s.b;
        const int cb = mulRound(sb, K.cbB) - mulRound(sg, K.cbG) - mulRound(sr, K.cbR);
        const int cr = mulRound(sr, K.crR) - mulRound(sg, K.crG) - mulRound(sb, K.crB);
        o.cb = OffsetAfter ? clip8((cb >> 6) + 128) : clip8((cb + 8194) >> 6);
        o.cr = OffsetAfter ? clip8((cr >> 6) + 128) : clip8((cr + 8194) >> 6);
        return o;
    }
};

// Mixed block form over a pair: truncated luma of unsigned multiply-highs, chroma of whole-sample sums.
struct YccMixedBlock {
    static constexpr YccForwardGains K = YccForward;
    static constexpr int luma(const Px& p)
    {
        return ((mulHighU(256 * p.c[0], K.yR) + mulHighU(256 * p.c[1], K.yG) + mulHighU(256 * p.c[2], K.yB)) >> 8) + 16;
    }
    static constexpr int chroma(const UnitSums<2>& s, int kr, int kg, int kb)
    {
        return ((kr * s.r + kg * s.g + kb * s.b + 65536) >> 17) + 128;
    }
    static UnitOut apply(const Unit& u)
    {
        const UnitSums<2> s(u);
        return {{luma(u.p[0]), luma(u.p[1])}, chroma(s, K.cbR, K.cbG, K.cbB), chroma(s, K.crR, K.crG, K.crB)};
    }
};

// Its remainder form: the same chroma; the first pixel's luma rounded, the second's truncated.
struct YccMixedTail {
    static constexpr YccForwardGains K = YccForward;
    static UnitOut apply(const Unit& u)
    {
        auto luma = [](const Px& p, int round) { return ((K.yR * p.c[0] + K.yG * p.c[1] + K.yB * p.c[2] + round) >> 16) + 16; };
        const UnitSums<2> s(u);
        return {{luma(u.p[0], 32768), luma(u.p[1], 0)}, YccMixedBlock::chroma(s, K.cbR, K.cbG, K.cbB),
                YccMixedBlock::chroma(s, K.crR, K.crG, K.crB)};
    }
};

// ---- YCbCr remainder forms -----------------------------------------------------------------------------

// Pixel luma: rounded whole-sample products; 16 added behind the division, or held to 1..254 in full range.
template <const YccForwardGains& K>
constexpr int pixelLuma(const Px& p)
{
    const int t = (K.yR * p.c[0] + K.yG * p.c[1] + K.yB * p.c[2] + 32768) >> 16;
    return K.full ? limit1(t) : clip8(t + 16);
}

// Pixel form over a unit of n: chroma of the whole-sample sums, with its own rounding term per chroma
// (32768 for n = 4, 16384 for n = 2; 65536 and 65534 in the 62 form).
template <const YccForwardGains& K, int n, int eCb, int eCr>
struct YccPixelUnit {
    static constexpr int shift = n == 4 ? 18 : 17;
    static UnitOut apply(const Unit& u)
    {
        UnitOut o{};
        for (int k = 0; k < n; ++k)
            o.y[k] = pixelLuma<K>(u.p[k]);
        const UnitSums<n> s(u);
        o.cb = limitOf<K.full>(((K.cbR * s.r + K.cbG * s.g + K.cbB * s.b + eCb) >> shift) + 128);
        o.cr = limitOf<K.full>(((K.crR * s.r + K.crG * s.g + K.crB * s.b + eCr) >> shift) + 128);
        return o;
    }
};
template <const YccForwardGains& K>
using YccPixel4 = YccPixelUnit<K, 4, 32768, 32768>;
template <const YccForwardGains& K>
using YccPixel2 = YccPixelUnit<K, 2, 16384, 16384>;
template <const YccForwardGains& K>
using YccPixel62 = YccPixelUnit<K, 2, 65536, 65534>;

// A single pixel behind the last unit: pixel luma and whole-sample chroma rounded by e; Writes says
// which of them land.
template <const YccForwardGains& K, int e, int Writes>
struct YccPixelTail {
    static constexpr int writes = Writes;
    static Px apply(const Px& p)
    {
        auto chroma = [&](int kr, int kg, int kb) {
            return limitOf<K.full>(((kr * p.c[0] + kg * p.c[1] + kb * p.c[2] + e) >> 16) + 128);
        };
        return {{pixelLuma<K>(p), chroma(K.cbR, K.cbG, K.cbB), chroma(K.crR, K.crG, K.crB)}, 0};
    }
};

// ---- the three-tap chroma filter ---------------------------------------------------------------------

// Chroma of the pair at 2k, 2k+1 centred on 2k: the full terms of 2k and the half terms of 2k - 1 (none at
// the start of a row) and 2k + 1: taps 1/4, 1/2, 1/4.
struct YccTapFilter {
    static constexpr bool readsLeft = true;
    static constexpr int fb(const Px& p) { return -2426 * p.c[0] - 4769 * p.c[1] + 7193 * p.c[2]; }
    static constexpr int fr(const Px& p) { return 7193 * p.c[0] - 6030 * p.c[1] - 1164 * p.c[2]; }
    static constexpr int hb(const Px& p) { return -1213 * p.c[0] - 2385 * p.c[1] + 3596 * p.c[2]; }
    static constexpr int hr(const Px& p) { return 3596 * p.c[0] - 3015 * p.c[1] - 582 * p.c[2]; }
    static constexpr int luma(const Px& p) { return clip8((8422 * p.c[0] + 16515 * p.c[1] + 3212 * p.c[2] + 540672) >> 15); }
    static UnitOut apply(const Unit& u)
    {
        const int lb = u.hasLeft ? hb(u.left) : 0, lr = u.hasLeft ? hr(u.left) : 0;
        return {{luma(u.p[0]), luma(u.p[1])},
                clip8((fb(u.p[0]) + lb + hb(u.p[1]) + 4210687) >> 15),
                clip8((fr(u.p[0]) + lr + hr(u.p[1]) + 4210687) >> 15)};
    }
};

// ---- YUV forms -------------------------------------------------------------------------------------------

// R420, unit of 4: rounded products of 128 x sample; chroma from 32 x sums less half the four lumas.
struct YuvR420Block {
    static constexpr int y(const Px& p) { return mulRound(128 * p.c[0], 4899) + mulRound(128 * p.c[1], 9617) + mulRound(128 * p.c[2], 1868); }
    static UnitOut apply(const Unit& u)
    {
        UnitOut o{};
        int t = 0;
        for (int k = 0; k < 4; ++k) {
            const int v = y(u.p[k]);
            o.y[k] = clip8(v >> 6);
            t += v;
        }
        const UnitSums<4> s(u);
        const int h = t >> 1;
        o.cb = clip8((mulRound(32 * s.b - h, 8061) >> 6) + 128);
        o.cr = clip8((mulRound(32 * s.r - h, 14369) >> 6) + 128);
        return o;
    }
};

// Difference forms: whole-sample luma terms t in 2^-shift, Y = floor((t + yRound) / 2^shift), and the
// chroma of differences of the unit's sums against the sum of its terms,
// d = floor((2^shift Sum - sum of t + dBias) / 2^shift), U = floor(uGain d / 2^gainShift) + 128 (never
// outside 0..255), V likewise held to 0..255.
struct YuvY14Gains {
    static constexpr int yR = 4899, yG = 9617, yB = 1868, uGain = 8061, vGain = 14369;
};
template <int n, class K, int shift, int yRound, int dBias, int gainShift>
struct YuvDifferenceUnit {
    static UnitOut apply(const Unit& u)
    {
        UnitOut o{};
        int tt = 0;
        for (int k = 0; k < n; ++k) {
            const int t = K::yR * u.p[k].c[0] + K::yG * u.p[k].c[1] + K::yB * u.p[k].c[2];
            o.y[k] = (t + yRound) >> shift;
            tt += t;
        }
        const UnitSums<n> s(u);
        const int db = ((s.b << shift) - tt + dBias) >> shift, dr = ((s.r << shift) - tt + dBias) >> shift;
        o.cb = ((K::uGain * db) >> gainShift) + 128;
        o.cr = clip8(((K::vGain * dr) >> gainShift) + 128);
        return o;
    }
};
// Unit of 4 in 1/16384, truncated; in 1/65536 with the differences rounded up.
using YuvY14Unit = YuvDifferenceUnit<4, YuvY14Gains, 14, 0, 0, 16>;
using YuvY16Unit = YuvDifferenceUnit<4, YuvDifferenceForward, 16, 0, 131071, 18>;
using YuvY16RoundedUnit = YuvDifferenceUnit<4, YuvDifferenceForward, 16, 32768, 131071, 18>;
// Pairs in 1/65536: full rounding, or truncated luma with the differences rounded up.
template <bool Full>
using YuvD422Unit = YuvDifferenceUnit<2, YuvDifferenceForward, 16, Full ? 32768 : 0, Full ? 32768 : 65535, 17>;

// Half forms: each pixel's luma term y from multiply-highs of 4 x sample, Y = (y + R) >> 1; chroma of
// the unit's sums less its mean term, D = (sum of y) >> 2 against half sums over 4 pixels (H420), or
// (sum of y) >> 1 against whole sums over a pair.
template <int n, int R>
struct YuvHalfBlock {
    using K = YuvHalfForward;
    static UnitOut apply(const Unit& u)
    {
        UnitOut o{};
        int t = 0;
        for (int k = 0; k < n; ++k) {
            const Px& p = u.p[k];
            const int y = mulHigh(4 * p.c[0], K::yR) + mulHigh(4 * p.c[2], K::yB) + mulHigh(4 * p.c[1], K::yG);
            o.y[k] = clip8((y + R) >> 1);
            t += y;
        }
        const UnitSums<n> s(u);
        const int d = n == 4 ? t >> 2 : t >> 1;
        o.cb = clip8(mulHigh((n == 4 ? s.b >> 1 : s.b) - d, K::uGain) + 128);
        o.cr = clip8(mulHigh((n == 4 ? s.r >> 1 : s.r) - d, K::vGain) + 128);
        return o;
    }
};
using YuvH420Block = YuvHalfBlock<4, 0>;

// Sum form, unit of 4: each Y from unsigned multiply-highs of 256 x sample, rounded over 128; chroma of
// 32 x sums less 32 x the sum of the four Y through signed multiply-highs, with 128 and the rounding unit
// over 64.
struct YuvSumBlock {
    static constexpr int yR = 9798, yG = 19235, yB = 3736, uGain = 16122, vGain = 28737;
    static constexpr int luma(const Px& p)
    {
        return (mulHighU(256 * p.c[0], yR) + mulHighU(256 * p.c[1], yG) + mulHighU(256 * p.c[2], yB) + 64) >> 7;
    }
    static UnitOut apply(const Unit& u)
    {
        UnitOut o{};
        int sy = 0;
        for (int k = 0; k < 4; ++k)
            sy += o.y[k] = luma(u.p[k]);
        const UnitSums<4> s(u);
        o.cb = clip8((mulHigh(32 * s.b - 32 * sy, uGain) + 8224) >> 6);
        o.cr = clip8((mulHigh(32 * s.r - 32 * sy, vGain) + 8224) >> 6);
        return o;
    }
};

// Q14, pair: luma truncated in two parts (with one added where Plus1), chroma of sums less the mean.
template <bool Plus1>
struct YuvQ14Block {
    using K = YuvHalfForward;
    static UnitOut apply(const Unit& u)
    {
        int y[2];
        for (int k = 0; k < 2; ++k) {
            const Px& p = u.p[k];
            y[k] = ((K::yR * p.c[0] + K::yG * p.c[1]) >> 14) + ((K::yB * p.c[2]) >> 14) + (Plus1 ? 1 : 0);
        }
        const UnitSums<2> s(u);
        const int m = (y[0] + y[1]) >> 1;
        return {{clip8(y[0] >> 1), clip8(y[1] >> 1)}, clip8(mulHigh(s.b - m, K::uGain) + 128), clip8(mulHigh(s.r - m, K::vGain) + 128)};
    }
};

// R422, pair: R420's luma; chroma of 64 x sums less both lumas.
struct YuvR422Block {
    static UnitOut apply(const Unit& u)
    {
        const int y0 = YuvR420Block::y(u.p[0]), y1 = YuvR420Block::y(u.p[1]);
        const UnitSums<2> s(u);
        const int t = y0 + y1;
        return {{clip8(y0 >> 6), clip8(y1 >> 6)}, clip8((mulRound(64 * s.b - t, 8061) >> 6) + 128),
                clip8((mulRound(64 * s.r - t, 14369) >> 6) + 128)};
    }
};

// D257, pair: each sample first widened to floor(257 x / 64) (255 gives 1023).
struct YuvD257Block {
    using K = YuvHalfForward;
    static UnitOut apply(const Unit& u)
    {
        int w[2][3], y[2];
        for (int k = 0; k < 2; ++k) {
            for (int c = 0; c < 3; ++c)
                w[k][c] = (257 * u.p[k].c[c]) >> 6;
            y[k] = mulHigh(w[k][0], K::yR) + mulHigh(w[k][1], K::yG) + mulHigh(w[k][2], K::yB);
        }
        const int t = y[0] + y[1];
        const int db = ((w[0][2] + w[1][2]) >> 1) - t, dr = ((w[0][0] + w[1][0]) >> 1) - t;
        return {{clip8(y[0] >> 1), clip8(y[1] >> 1)}, clip8((mulHigh(db, K::uGain) >> 1) + 128),
                clip8((mulHigh(dr, K::vGain) >> 1) + 128)};
    }
};

// A single last pixel: Y and U of the difference form with full rounding.
struct YuvDifferenceTail {
    static constexpr int writes = WritesY | WritesCb;
    static Px apply(const Px& p) { return YuvFromRgbDifferenceFull::apply(p); }
};

// A single last pixel of the planar 4:2:2 members: halves of whole-sample differences, the inner
// numerators rounded by aB and aR.
template <int aB, int aR>
struct YuvHalfTail {
    using K = YuvHalfForward;
    static constexpr int writes = WritesY | WritesCb | WritesCr;
    static Px apply(const Px& p)
    {
        const int t = K::yR * p.c[0] + K::yG * p.c[1] + K::yB * p.c[2];
        const int db = (32768 * p.c[2] - t + aB) >> 15, dr = (32768 * p.c[0] - t + aR) >> 15;
        return {{t >> 15, ((K::uGain * db) >> 15) + 128, clip8(((K::vGain * dr) >> 15) + 128)}, 0};
    }
};

} // namespace zox
