// Pixel layouts of three-channel images, scalar side: how a row of a layout is found from its argument
// and step, and how one pixel is read from it or written to it. Samples are 8-bit unsigned unless a
// layout names another type (T: uint8_t, int16_t or int32_t); rows are found by byte steps.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <type_traits>

namespace zox {

// One pixel on its way through a form: three colour samples (ints, or floats for float layouts), and
// the fourth byte of a source that carries one (an AC4 source feeding a fourth plane).
template <class V>
struct PxOf {
    V c[3];
    uint8_t extra;
};
using Px = PxOf<int>;
using PxF = PxOf<float>;

// The value type a sample of type T travels as.
template <class T>
using ValueOf = std::conditional_t<std::is_floating_point_v<T>, float, int>;

// Per-call values a destination layout may need: the fourth channel's value, in the destination's
// sample type.
struct Ctx {
    int alpha = 0;
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
constexpr T* rowAddress(T* base, std::ptrdiff_t step, int r)
{
    return reinterpret_cast<T*>(reinterpret_cast<uintptr_t>(base) + static_cast<intptr_t>(r) * static_cast<intptr_t>(step));
}

constexpr int channelByte(Order o, int k)
{
    return o == Order::Rgb ? k : 2 - k;
}

// One sample of type T at byte address q, as its value type; and a value stored as T (an int keeps its
// low bits: an unsigned or signed narrowing keeps the value modulo the type's range).
template <class T>
inline ValueOf<T> loadSample(const uint8_t* q)
{
    if constexpr (sizeof(T) == 1) {
        return static_cast<T>(*q);
    } else {
        T v;
        std::memcpy(&v, q, sizeof(T));
        return v;
    }
}
template <class T>
inline void storeSample(uint8_t* q, ValueOf<T> v)
{
    const T t = static_cast<T>(v);
    if constexpr (sizeof(T) == 1)
        *q = static_cast<uint8_t>(t);
    else
        std::memcpy(q, &t, sizeof(T));
}

// Interleaved source: Ch samples a pixel (3, or 4 with a fourth 8-bit sample carried as `extra`).
template <int Ch, Order O = Order::Rgb, class T = uint8_t>
struct InPacked {
    using Pixel = PxOf<ValueOf<T>>;
    static constexpr int planes = 1;
    static constexpr int channels = Ch;
    static constexpr int bytesPerPixel = Ch * static_cast<int>(sizeof(T));
    static constexpr Order order = O;
    using Sample = T;
    using Arg = const T*;
    struct Row {
        const uint8_t* p[1];
    };
    static constexpr bool planesValid(Arg) { return true; }
    static Row row(Arg a, std::ptrdiff_t step, int r) { return {{rowAddress(reinterpret_cast<const uint8_t*>(a), step, r)}}; }
    static Pixel load(const Row& row, int x)
    {
        constexpr int z = sizeof(T);
        const uint8_t* q = row.p[0] + static_cast<std::size_t>(x) * bytesPerPixel;
        Pixel px{{loadSample<T>(q + z * channelByte(O, 0)), loadSample<T>(q + z * channelByte(O, 1)),
               loadSample<T>(q + z * channelByte(O, 2))},
              0};
        if constexpr (Ch == 4 && z == 1)
            px.extra = q[3];
        return px;
    }
};

// Planar source: one plane a channel, in channel order.
template <int P = 3, class T = uint8_t>
struct InPlanar {
    using Pixel = PxOf<ValueOf<T>>;
    static constexpr int planes = P;
    static constexpr int bytesPerPixel = static_cast<int>(sizeof(T));
    using Sample = T;
    using Arg = const T* const*;
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
    static Row row(Arg a, std::ptrdiff_t step, int r)
    {
        Row row;
        #pragma GCC unroll 4
        for (int i = 0; i < P; ++i)
            row.p[i] = rowAddress(reinterpret_cast<const uint8_t*>(a[i]), step, r);
        return row;
    }
    static Pixel load(const Row& row, int x)
    {
        const std::size_t at = static_cast<std::size_t>(x) * sizeof(T);
        Pixel px{{loadSample<T>(row.p[0] + at), loadSample<T>(row.p[1] + at), loadSample<T>(row.p[2] + at)}, 0};
        if constexpr (P == 4)
            px.extra = row.p[3][x];
        return px;
    }
};

// Interleaved destination; each sample is stored as T (8-bit ones arrive limited by clip8).
template <int Ch, Order O, Fourth F, class T = uint8_t>
struct OutPacked {
    using Pixel = PxOf<ValueOf<T>>;
    static_assert((Ch == 3) == (F == Fourth::None));
    static constexpr int planes = 1;
    static constexpr int channels = Ch;
    static constexpr int bytesPerPixel = Ch * static_cast<int>(sizeof(T));
    static constexpr Order order = O;
    static constexpr Fourth fourth = F;
    using Sample = T;
    using Arg = T*;
    struct Row {
        uint8_t* p[1];
    };
    static constexpr bool planesValid(Arg) { return true; }
    static Row row(Arg a, std::ptrdiff_t step, int r) { return {{rowAddress(reinterpret_cast<uint8_t*>(a), step, r)}}; }
    static void store(const Row& row, int x, const Pixel& px, const Ctx& ctx)
    {
        constexpr int z = sizeof(T);
        uint8_t* q = row.p[0] + static_cast<std::size_t>(x) * bytesPerPixel;
        #pragma GCC unroll 3
        for (int k = 0; k < 3; ++k)
            storeSample<T>(q + z * channelByte(O, k), px.c[k]);
        if constexpr (F == Fourth::Alpha)
            storeSample<T>(q + 3 * z, static_cast<ValueOf<T>>(ctx.alpha));
        else if constexpr (F == Fourth::Zero)
            storeSample<T>(q + 3 * z, ValueOf<T>{0});
        else if constexpr (F == Fourth::Extra)
            q[3] = px.extra;
    }
};

// Planar destination; a fourth plane takes the source pixel's fourth byte.
template <int P = 3, class T = uint8_t>
struct OutPlanar {
    using Pixel = PxOf<ValueOf<T>>;
    static constexpr int planes = P;
    static constexpr int bytesPerPixel = static_cast<int>(sizeof(T));
    using Sample = T;
    using Arg = T* const*;
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
    static Row row(Arg a, std::ptrdiff_t step, int r)
    {
        Row row;
        #pragma GCC unroll 4
        for (int i = 0; i < P; ++i)
            row.p[i] = rowAddress(reinterpret_cast<uint8_t*>(a[i]), step, r);
        return row;
    }
    static void store(const Row& row, int x, const Pixel& px, const Ctx&)
    {
        const std::size_t at = static_cast<std::size_t>(x) * sizeof(T);
        #pragma GCC unroll 3
        for (int k = 0; k < 3; ++k)
            storeSample<T>(row.p[k] + at, px.c[k]);
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
