// RGB <-> YCoCg: the per-pixel forms. All arithmetic is integer and all right shifts are arithmetic.
// Forward forms take (R, G, B) in c[0..2] (each member's layout puts its channel order right) and give
// (Y, Co, Cg); reverse forms the other way. A result is stored as its destination's sample type keeps it
// (the low 16 bits into 16-bit samples) unless the form limits it.
//
// Forms marked `compilerVectorised` have no hand-written SIMD form: their kernels are the compiler's
// vectorisation of the forms themselves, compiled once per kernel set. The 8-bit biased pair and the
// reverse forms into bytes have SIMD forms over 16-bit lanes (ycocg_simd.inl).
#pragma once

#include "frame/layouts.hpp"

#include <algorithm>
#include <cstdint>

namespace zox::ycocg {

// The low 16 bits of v as a signed value.
constexpr int wrap16(int v)
{
    return static_cast<int16_t>(v);
}
// Sums of 32-bit samples wrap around: added as unsigned and taken back modulo 2^32.
constexpr int add32(int a, int b)
{
    return static_cast<int>(static_cast<uint32_t>(a) + static_cast<uint32_t>(b));
}
constexpr int sub32(int a, int b)
{
    return static_cast<int>(static_cast<uint32_t>(a) - static_cast<uint32_t>(b));
}
constexpr int clampTo(int v, int lo, int hi)
{
    return std::min(std::max(v, lo), hi);
}

// ---- forward ----------------------------------------------------------------------------------------

// The plain form, with its divisions by 2 and 4, in 32 bits.
struct Plain {
    static constexpr bool compilerVectorised = true;
    static Px apply(const Px& p)
    {
        const int r = p.c[0], g = p.c[1], b = p.c[2];
        return {{(r + 2 * g + b + 2) >> 2, (r - b + 1) >> 1, (2 * g - r - b + 2) >> 2}, 0};
    }
};

// The plain form saturated to 16 bits: the block form of the 16-bit signed members, whose Co and Cg
// reach 32768 (their remainder columns keep the low 16 bits instead).
struct PlainSaturated {
    static constexpr bool compilerVectorised = true;
    static Px apply(const Px& p)
    {
        const Px v = Plain::apply(p);
        return {{clampTo(v.c[0], -32768, 32767), clampTo(v.c[1], -32768, 32767), clampTo(v.c[2], -32768, 32767)}, 0};
    }
};

// The plain form with chroma biased by 128 into bytes: Co limited to at most 255, Cg to 0..255.
struct PlainBiased {
    static Px apply(const Px& p)
    {
        const Px v = Plain::apply(p);
        return {{v.c[0], std::min(v.c[1] + 128, 255), clampTo(v.c[2] + 128, 0, 255)}, 0};
    }
};

// The reversible lifting form in 32 bits.
struct Lifting {
    static constexpr bool compilerVectorised = true;
    static Px apply(const Px& p)
    {
        const int r = p.c[0], g = p.c[1], b = p.c[2];
        const int co = r - b;
        const int t = b + (co >> 1);
        const int cg = g - t;
        return {{t + (cg >> 1), co, cg}, 0};
    }
};

// The lifting form in 16 bits, wrapping at every step, so that its shifts see the 16-bit values the
// reverse conversion sees.
struct Lifting16 {
    static constexpr bool compilerVectorised = true;
    static Px apply(const Px& p)
    {
        const int r = p.c[0], g = p.c[1], b = p.c[2];
        const int co = wrap16(r - b);
        const int t = wrap16(b + (co >> 1));
        const int cg = wrap16(g - t);
        return {{wrap16(t + (cg >> 1)), co, cg}, 0};
    }
};

// ---- reverse ------------------------------------------------------------------------------------------

// What a reverse form does with its results: keep them (stored as the destination keeps them), take
// their low 16 bits (the same for 16-bit destinations, with a SIMD form over 16-bit lanes), or take
// the low 16 bits as a signed value and clamp that to 0..255 (8-bit destinations).
enum class Out { Keep, Wrap16, Wrap16Clamp8 };

template <Out O>
constexpr int finish(int v)
{
    return O == Out::Keep ? v : O == Out::Wrap16 ? wrap16(v) : clampTo(wrap16(v), 0, 255);
}

// The plain reverse form; sums wrap as 32-bit values, so 32-bit planes of any value are defined.
template <Out O>
struct RgbFromPlain {
    static constexpr bool compilerVectorised = O == Out::Keep;
    static Px apply(const Px& p)
    {
        const int y = p.c[0], co = p.c[1], cg = p.c[2];
        return {{finish<O>(sub32(add32(y, co), cg)), finish<O>(add32(y, cg)), finish<O>(sub32(sub32(y, co), cg))}, 0};
    }
};

// The reversible lifting reverse form; the shifts work on the planes' own values.
template <Out O>
struct RgbFromLifting {
    static constexpr bool compilerVectorised = O == Out::Keep;
    static Px apply(const Px& p)
    {
        const int y = p.c[0], co = p.c[1], cg = p.c[2];
        const int t = sub32(y, cg >> 1);
        const int g = add32(cg, t);
        const int b = sub32(t, co >> 1);
        return {{finish<O>(add32(b, co)), finish<O>(g), finish<O>(b)}, 0};
    }
};

// The biased 8-bit reverse form: R = Y + Co - Cg, G = Y + Cg - 128, B = Y - Co - Cg + 256, each
// clamped to 0..255.
struct RgbFromPlainBiased {
    static Px apply(const Px& p)
    {
        const int y = p.c[0], co = p.c[1], cg = p.c[2];
        return {{clampTo(y + co - cg, 0, 255), clampTo(y + cg - 128, 0, 255), clampTo(y - co - cg + 256, 0, 255)}, 0};
    }
};

} // namespace zox::ycocg
