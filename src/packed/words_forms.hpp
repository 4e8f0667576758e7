// Sixteen-bit RGB words, scalar side: the word layouts (fields expanded by bare left shifts, reduced by
// truncating right shifts) and the colour forms of the members that write words from Y, Cb, Cr bytes.
#pragma once

#include "frame/layouts.hpp"
#include "frame/ops.hpp"
#include "lumachroma/ycbcr_forms.hpp"
#include "sampling/fromsampled_forms.hpp"

#include <cstdint>
#include <cstring>

namespace zox {

// The widths of a word's low, middle and high fields, from bit 0; the bits above them are 0 when
// written and ignored when read.
template <int Low, int Mid, int High>
struct WordFields {
    static constexpr int low = Low, mid = Mid, high = High;
};
using Fields565 = WordFields<5, 6, 5>;
using Fields555 = WordFields<5, 5, 5>;
using Fields444 = WordFields<4, 4, 4>;

// What every side made of words shares: one plane of 16-bit samples, two bytes a pixel.
template <class F>
struct WordSide {
    using Fields = F;
    using Pixel = Px;
    static constexpr int planes = 1;
    static constexpr int bytesPerPixel = 2;
    using Sample = uint16_t;
    static constexpr bool planesValid(const void*) { return true; }
};

// A source of words: the low field goes to channel LowChannel (0 or 2), the middle one to channel 1, the
// high one to the other, each shifted up to 8 bits with zeros below (a 5-bit 31 gives 248).
template <class F, int LowChannel = 0>
struct InWord : WordSide<F> {
    using Pixel = Px;
    using Arg = const uint16_t*;
    struct Row {
        const uint8_t* p[1];
    };
    static Row row(Arg a, std::ptrdiff_t step, int r) { return {{rowAddress(reinterpret_cast<const uint8_t*>(a), step, r)}}; }
    static Pixel load(const Row& row, int x)
    {
        uint16_t w;
        std::memcpy(&w, row.p[0] + 2 * static_cast<std::size_t>(x), 2);
        const int lo = (w & ((1 << F::low) - 1)) << (8 - F::low);
        const int mid = ((w >> F::low) & ((1 << F::mid) - 1)) << (8 - F::mid);
        const int hi = ((w >> (F::low + F::mid)) & ((1 << F::high) - 1)) << (8 - F::high);
        return LowChannel == 0 ? Pixel{{lo, mid, hi}, 0} : Pixel{{hi, mid, lo}, 0};
    }
};

// A source read in row pairs whose second row lies the step rounded down to even bytes past the first
// (row 2j at 2j x step, row 2j + 1 at 2j x step + (step & ~1)).
template <class Src>
struct InEvenPairStep : Src {
    static typename Src::Row row(typename Src::Arg a, std::ptrdiff_t step, int r)
    {
        typename Src::Row first = Src::row(a, step, r & ~1);
        if (r & 1)
            first.p[0] += step & ~std::ptrdiff_t{1};
        return first;
    }
};

// A destination of words: the low field takes channel LowChannel (0 or 2), the middle one channel 1,
// the high one the other, each reduced from 0..255 by a truncating shift.
template <class F, int LowChannel>
struct OutWord : WordSide<F> {
    using Pixel = Px;
    using Arg = uint16_t*;
    struct Row {
        uint8_t* p[1];
    };
    static Row row(Arg a, std::ptrdiff_t step, int r) { return {{rowAddress(reinterpret_cast<uint8_t*>(a), step, r)}}; }
    static void store(const Row& row, int x, const Pixel& px, const Ctx&)
    {
        const int lo = px.c[LowChannel] >> (8 - F::low);
        const int mid = px.c[1] >> (8 - F::mid);
        const int hi = px.c[2 - LowChannel] >> (8 - F::high);
        const auto w = static_cast<uint16_t>(lo | mid << F::low | hi << (F::low + F::mid));
        std::memcpy(row.p[0] + 2 * static_cast<std::size_t>(x), &w, 2);
    }
};

namespace words {

// Samples as they come: words to bytes and bytes to words.
struct Copy {
    static Px apply(const Px& p) { return p; }
};

// Y, Cb, Cr to R, G, B at studio range. Block colour in 16-bit lanes: a = mulHigh((Y - 16) << 7, 9535),
// each channel a plus its chroma terms, shifted right by 4 (rounded: 8 added first). Pixel colour in 32
// bits: a = 76284 (Y - 16), each channel (a + terms) >> 16 (rounded: 0x8000 added first). Folded colour:
// the pixel gains on the raw samples with the offsets in one constant a channel.
using BlockColour = RgbFromYccBlock<YccInverseBlockB, Rounding::Truncated, Green::Difference>;
using RoundedBlockColour = RgbFromYccBlock<YccInverseBlockB, Rounding::Rounded, Green::Difference>;
using PixelColour = RgbFromYccPixelATruncated;
using RoundedPixelColour = RgbFromYccPixelARounded;
using FoldedColour = RgbFromYccBiased;
// Y, U, V to R, G, B: 16 Y and chroma at 128 x into multiply-highs over 16, no rounding term; the pixel
// form the rounded whole-sample gains, truncated.
using YuvBlockColour = RgbFromWide<YuvInverseBlockMixed, Green::Difference, 0>;
using YuvPixelColour = RgbFromYuvPixel<YuvInverseRounded, 0, 0>;

// A form fed with the one chroma byte of a half group as both Cb and Cr.
template <class Form>
struct CbAsCr {
    static Px apply(const Px& p) { return Form::apply(Px{{p.c[0], p.c[1], p.c[1]}, p.extra}); }
};

} // namespace words

// The ordered dither of word destinations: a 4 by 4 tile of thresholds anchored at the region's first
// pixel, one rank pattern in two scalings (289 k for 4-bit fields, floor(17 k 255 / 31) for 5- and 6-bit
// ones, the 6-bit field halving the entry). A channel c of 0..255 with n = 2^bits - 1 gives
// q = (n c) >> 8 and e = (c << 8) - s q, and the field q + 1 where e is above the threshold, else q.
namespace dither {

inline constexpr int kRank[4][4] = {{0, 8, 2, 10}, {12, 4, 14, 6}, {3, 11, 1, 9}, {15, 7, 13, 5}};

// For each tile row, the thresholds of eight consecutive columns starting at column r (0..3) of the tile:
// [row][r][i] is the entry at column (r + i) & 3. Rotation 0 serves single pixels, all four the lanes.
struct Tile {
    uint16_t lanes[4][4][8];
};
constexpr Tile tileOf(int fieldBits)
{
    Tile t{};
    for (int y = 0; y < 4; ++y)
        for (int r = 0; r < 4; ++r)
            for (int i = 0; i < 8; ++i) {
                const int k = kRank[y][(r + i) & 3];
                t.lanes[y][r][i] = static_cast<uint16_t>(fieldBits == 4 ? 289 * k : 17 * k * 255 / 31);
            }
    return t;
}
inline constexpr Tile kTile4 = tileOf(4);
inline constexpr Tile kTile5 = tileOf(5);

// The quantiser of one field width: levels factor n, step s, and the threshold taken as the 5-bit entry
// halved for 6-bit fields.
template <int Bits>
struct Channel {
    static constexpr int n = (1 << Bits) - 1;
    static constexpr int s = Bits == 4 ? 4352 : Bits == 5 ? 2105 : 1036;
    static constexpr int thresholdShift = Bits == 6 ? 1 : 0;
    static_assert(Bits >= 4 && Bits <= 6);
    static int apply(int c, int entry)
    {
        const int q = (n * c) >> 8, e = (c << 8) - s * q;
        return q + (e > (entry >> thresholdShift) ? 1 : 0);
    }
};

} // namespace dither

// A destination of dithered words: OutWord's fields, each quantised against the tile entry of the pixel's
// column and row in the region. A row knows its tile row.
template <class F, int LowChannel>
struct OutDitherWord : WordSide<F> {
    using Pixel = Px;
    using Arg = uint16_t*;
    static_assert(F::low == F::high && F::low <= F::mid);
    static constexpr const dither::Tile& tile = F::low == 4 ? dither::kTile4 : dither::kTile5;
    struct Row {
        uint8_t* p[1];
        const uint16_t (*lanes)[8]; // the tile row's four rotations
    };
    static Row row(Arg a, std::ptrdiff_t step, int r)
    {
        return {{rowAddress(reinterpret_cast<uint8_t*>(a), step, r)}, tile.lanes[r & 3]};
    }
    static void store(const Row& row, int x, const Pixel& px, const Ctx&)
    {
        const int t = row.lanes[0][x & 3];
        const int lo = dither::Channel<F::low>::apply(px.c[LowChannel], t);
        const int mid = dither::Channel<F::mid>::apply(px.c[1], t);
        const int hi = dither::Channel<F::high>::apply(px.c[2 - LowChannel], t);
        const auto w = static_cast<uint16_t>(lo | mid << F::low | hi << (F::low + F::mid));
        std::memcpy(row.p[0] + 2 * static_cast<std::size_t>(x), &w, 2);
    }
};

} // namespace zox
