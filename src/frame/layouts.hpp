// Pixel layouts of 8-bit three-channel images, scalar side: how a row of a layout is found from its
// argument and step, and how one pixel is read from it or written to it.
#pragma once

#include <cstddef>
#include <cstdint>

namespace zox {

// One pixel on its way through a form: three colour samples, and the fourth byte of a source that
// carries one (an AC4 source feeding a fourth plane).
struct Px {
    int c[3];
    uint8_t extra;
};

// Per-call values a destination layout may need.
struct Ctx {
    uint8_t alpha = 0;
};

// Channel order of an interleaved layout: channel k at byte k, or at byte 2 - k.
enum class Order { Rgb, Bgr };

// What an interleaved destination does with its fourth byte.
enum class Fourth {
    None,  // three bytes a pixel
    Keep,  // neither read nor written
    Alpha, // takes the call's alpha
    Zero,  // takes 0
    Extra  // takes the source pixel's fourth byte
};

// Address of row r: computed in 64 bits so that no width, height or step product wraps.
template <class T>
constexpr T* rowAddress(T* base, int step, int r)
{
    return reinterpret_cast<T*>(reinterpret_cast<uintptr_t>(base) + static_cast<intptr_t>(r) * step);
}

constexpr int channelByte(Order o, int k)
{
    return o == Order::Rgb ? k : 2 - k;
}

// Interleaved source: Bpp bytes a pixel (3, or 4 with a fourth byte that is carried as `extra`).
template <int Bpp, Order O = Order::Rgb>
struct InPacked {
    static constexpr int planes = 1;
    static constexpr int bytesPerPixel = Bpp;
    static constexpr Order order = O;
    using Arg = const uint8_t*;
    struct Row {
        const uint8_t* p[1];
    };
    static constexpr bool planesValid(Arg) { return true; }
    static Row row(Arg a, int step, int r) { return {{rowAddress(a, step, r)}}; }
    static Px load(const Row& row, int x)
    {
        const uint8_t* q = row.p[0] + static_cast<std::size_t>(x) * Bpp;
        Px px{{q[channelByte(O, 0)], q[channelByte(O, 1)], q[channelByte(O, 2)]}, 0};
        if constexpr (Bpp == 4)
            px.extra = q[3];
        return px;
    }
};

// Planar source: one plane a channel, in channel order.
template <int P = 3>
struct InPlanar {
    static constexpr int planes = P;
    static constexpr int bytesPerPixel = 1;
    using Arg = const uint8_t* const*;
    struct Row {
        const uint8_t* p[P];
    };
    static bool planesValid(Arg a)
    {
        for (int i = 0; i < P; ++i)
            if (!a[i])
                return false;
        return true;
    }
    static Row row(Arg a, int step, int r)
    {
        Row row;
        for (int i = 0; i < P; ++i)
            row.p[i] = rowAddress(a[i], step, r);
        return row;
    }
    static Px load(const Row& row, int x)
    {
        Px px{{row.p[0][x], row.p[1][x], row.p[2][x]}, 0};
        if constexpr (P == 4)
            px.extra = row.p[3][x];
        return px;
    }
};

// Interleaved destination. Samples arrive limited by clip8.
template <int Bpp, Order O, Fourth F>
struct OutPacked {
    static_assert((Bpp == 3) == (F == Fourth::None));
    static constexpr int planes = 1;
    static constexpr int bytesPerPixel = Bpp;
    static constexpr Order order = O;
    static constexpr Fourth fourth = F;
    using Arg = uint8_t*;
    struct Row {
        uint8_t* p[1];
    };
    static constexpr bool planesValid(Arg) { return true; }
    static Row row(Arg a, int step, int r) { return {{rowAddress(a, step, r)}}; }
    static void store(const Row& row, int x, const Px& px, const Ctx& ctx)
    {
        uint8_t* q = row.p[0] + static_cast<std::size_t>(x) * Bpp;
        for (int k = 0; k < 3; ++k)
            q[channelByte(O, k)] = static_cast<uint8_t>(px.c[k]);
        if constexpr (F == Fourth::Alpha)
            q[3] = ctx.alpha;
        else if constexpr (F == Fourth::Zero)
            q[3] = 0;
        else if constexpr (F == Fourth::Extra)
            q[3] = px.extra;
    }
};

// Planar destination; a fourth plane takes the source pixel's fourth byte.
template <int P = 3>
struct OutPlanar {
    static constexpr int planes = P;
    static constexpr int bytesPerPixel = 1;
    using Arg = uint8_t* const*;
    struct Row {
        uint8_t* p[P];
    };
    static bool planesValid(Arg a)
    {
        for (int i = 0; i < P; ++i)
            if (!a[i])
                return false;
        return true;
    }
    static Row row(Arg a, int step, int r)
    {
        Row row;
        for (int i = 0; i < P; ++i)
            row.p[i] = rowAddress(a[i], step, r);
        return row;
    }
    static void store(const Row& row, int x, const Px& px, const Ctx&)
    {
        for (int k = 0; k < 3; ++k)
            row.p[k][x] = static_cast<uint8_t>(px.c[k]);
        if constexpr (P == 4)
            row.p[3][x] = px.extra;
    }
};

using InC3 = InPacked<3>;
using InBGR3 = InPacked<3, Order::Bgr>;
using InAC4 = InPacked<4>;
using InP3 = InPlanar<3>;
using OutC3 = OutPacked<3, Order::Rgb, Fourth::None>;
using OutBGR3 = OutPacked<3, Order::Bgr, Fourth::None>;
using OutAC4 = OutPacked<4, Order::Rgb, Fourth::Keep>;
using OutC4A = OutPacked<4, Order::Rgb, Fourth::Alpha>;
using OutBGR4A = OutPacked<4, Order::Bgr, Fourth::Alpha>;
using OutP3 = OutPlanar<3>;
using OutP4 = OutPlanar<4>;

} // namespace zox
