// Byte-shuffle controls of the SIMD readers and writers, as constant data shared by every instruction
// set (a 256-bit register uses the same sixteen bytes in each 128-bit lane).
#pragma once

#include <cstdint>

namespace zox {

// Sixteen shuffle-control bytes (-1: a zero byte).
struct alignas(16) Bytes16 {
    int8_t b[16];
};

// Gather mask that takes, for lane i, the byte at `first + stride * i - base` of a 16-byte register,
// when it lies inside it, into the lane's low byte (shift 0: the value) or high byte (shift 8: 256 x).
constexpr Bytes16 gatherMask(int first, int stride, int base, int shift)
{
    Bytes16 m{};
    for (int i = 0; i < 8; ++i) {
        const int b = first + stride * i - base;
        const int8_t pick = static_cast<int8_t>((b >= 0 && b < 16) ? b : -1);
        m.b[2 * i] = shift == 0 ? pick : int8_t{-1};
        m.b[2 * i + 1] = shift == 0 ? int8_t{-1} : pick;
    }
    return m;
}

// Scatter mask for output bytes base..base+15 of an interleaved row of Bpp bytes a pixel, taking slot
// `slot` of each pixel from a register that holds lane i of the slot's channel at byte `at + i`.
constexpr Bytes16 scatterMask(int Bpp, int base, int slot, int at)
{
    Bytes16 m{};
    for (int j = 0; j < 16; ++j) {
        const int b = base + j;
        m.b[j] = static_cast<int8_t>((b % Bpp == slot) ? at + b / Bpp : -1);
    }
    return m;
}

template <int First, int Stride, int Base, int Shift>
inline constexpr Bytes16 kGather = gatherMask(First, Stride, Base, Shift);
template <int Bpp, int Base, int Slot, int At>
inline constexpr Bytes16 kScatter = scatterMask(Bpp, Base, Slot, At);

} // namespace zox

namespace zox {

// Pixel dwords from a register that holds channel k of pixels 0..3 at bytes 4k..4k+3: byte slot[k] of
// pixel i takes byte 4k + i, the fourth byte of each pixel is zero.
constexpr Bytes16 pixelDwordMask(int slot0, int slot1, int slot2)
{
    Bytes16 m{};
    for (int j = 0; j < 16; ++j)
        m.b[j] = -1;
    const int slot[3] = {slot0, slot1, slot2};
    for (int i = 0; i < 4; ++i)
        for (int k = 0; k < 3; ++k)
            m.b[4 * i + slot[k]] = static_cast<int8_t>(4 * k + i);
    return m;
}

template <int Slot0, int Slot1, int Slot2>
inline constexpr Bytes16 kPixelDwords = pixelDwordMask(Slot0, Slot1, Slot2);

} // namespace zox
