// Sixteen-bit RGB words, scalar side: the word layouts (fields expanded by bare left shifts, reduced by
// truncating right shifts) and the colour forms of the members that write words from Y, Cb, Cr bytes.
#pragma once

#include "frame/layouts.hpp"
#include "frame/ops.hpp"

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

// A source of words: channel 0 the low field, 1 the middle, 2 the high one, each shifted up to 8 bits
// with zeros below (a 5-bit 31 gives 248).
template <class F>
struct InWord {
    using Fields = F;
    using Pixel = Px;
    static constexpr int planes = 1;
    static constexpr int bytesPerPixel = 2;
    using Sample = uint16_t;
    using Arg = const uint16_t*;
    struct Row {
        const uint8_t* p[1];
    };
    static constexpr bool planesValid(Arg) { return true; }
    static Row row(Arg a, std::ptrdiff_t step, int r) { return {{rowAddress(reinterpret_cast<const uint8_t*>(a), step, r)}}; }
    static Pixel load(const Row& row, int x)
    {
        uint16_t w;
        std::memcpy(&w, row.p[0] + 2 * static_cast<std::size_t>(x), 2);
        const int lo = w & ((1 << F::low) - 1);
        const int mid = (w >> F::low) & ((1 << F::mid) - 1);
        const int hi = (w >> (F::low + F::mid)) & ((1 << F::high) - 1);
        return {{lo << (8 - F::low), mid << (8 - F::mid), hi << (8 - F::high)}, 0};
    }
};

// A destination of words: the low field takes channel LowChannel (0 or 2), the middle one channel 1,
// the high one the other, each reduced from 0..255 by a truncating shift.
template <class F, int LowChannel>
struct OutWord {
    using Pixel = Px;
    static constexpr int planes = 1;
    static constexpr int bytesPerPixel = 2;
    using Sample = uint16_t;
    using Arg = uint16_t*;
    struct Row {
        uint8_t* p[1];
    };
    static constexpr bool planesValid(Arg) { return true; }
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

// Y, Cb, Cr to R, G, B at studio range, in 16-bit lanes: a = mulHigh((Y - 16) << 7, 9535), each
// channel a plus its chroma terms, shifted right by 4.
struct BlockColour {
    static Px apply(const Px& p)
    {
        const int a = mulHigh((p.c[0] - 16) << 7, 9535), u = (p.c[1] - 128) << 7, v = (p.c[2] - 128) << 7;
        return {{clip8((a + mulHigh(v, 13074)) >> 4), clip8((a - mulHigh(v, 6660) - mulHigh(u, 3211)) >> 4),
                 clip8((a + mulHigh(u, 16523)) >> 4)},
                0};
    }
};

// The same in 32 bits: a = 76284 (Y - 16), each channel (a + terms) >> 16.
struct PixelColour {
    static constexpr bool compilerVectorised = true;
    static Px apply(const Px& p)
    {
        const int a = 76284 * (p.c[0] - 16), u = p.c[1] - 128, v = p.c[2] - 128;
        return {{clip8((a + 104595 * v) >> 16), clip8((a - 25690 * u - 53281 * v) >> 16), clip8((a + 132186 * u) >> 16)}, 0};
    }
};

} // namespace words
} // namespace zox
