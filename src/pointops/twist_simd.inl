// Colour twist kernels, written once against the vector vocabulary and included inside the namespace of
// each instruction set (after io_simd.inl). Pixels travel as single-precision lanes, one vector a
// channel, through the same operations in the same order as the scalar sums. The integer members run
// with the rounding mode set to nearest, so the conversion takes the mode; the upper limit is a minimum
// (a NaN takes it) and the lower one the saturation of the packs that follow (minus infinity converts to
// the integer indefinite, which saturates to the bottom). A member without a SIMD form of its own runs
// its scalar row compiled with this set's flags, vectorised by the compiler (every call inside inlined,
// so that no shared inline function is emitted with this set's instructions).

template <class M>
struct TwistKernel {
    [[gnu::flatten]] static int run(const uint8_t* const* s, uint8_t* const* d, int w, const twist::Matrix& m)
    {
        M::row(s, d, 0, w, m);
        return w;
    }
};

// The three rows of a matrix as splats, once a call.
struct MatrixLanes {
    VF m[3][4];
    explicit MatrixLanes(const twist::Matrix& t)
    {
#pragma GCC unroll 3
        for (int i = 0; i < 3; ++i)
#pragma GCC unroll 4
            for (int j = 0; j < 4; ++j)
                m[i][j] = splatF(t.m[i][j]);
    }
};

template <class Sum>
inline VF sumLanes(const VF* m, VF c0, VF c1, VF c2)
{
    if constexpr (std::is_same_v<Sum, twist::OffsetFirst>)
        return addF(addF(m[3], mulF(c0, m[0])), addF(mulF(c2, m[2]), mulF(c1, m[1])));
    else
        return addF(addF(addF(mulF(c0, m[0]), mulF(c1, m[1])), mulF(c2, m[2])), m[3]);
}

// One channel's sums of a depth converted to 32-bit lanes, limited from above.
template <class T>
inline V limitedInt(const MatrixLanes& t, int i, VF c0, VF c1, VF c2)
{
    using Dp = twist::Depth<T>;
    return toIntInMode(minF(sumLanes<typename Dp::Sum>(t.m[i], c0, c1, c2), splatF(Dp::hi)));
}

// Pixels of four bytes whose fourth is kept: the results staged as three-byte pixels, then three bytes a
// pixel.
struct OutKeep8 {
    using Row = OutPacked<4, Order::Rgb, Fourth::Keep>::Row;
    static void put(const Row& d, int x, const V3& a, const V3& b, const Ctx& ctx)
    {
        alignas(32) uint8_t staged[3 * kGroupPixels];
        GroupIo<OutPacked<3, Order::Rgb, Fourth::None>>::put({{staged}}, 0, a, b, ctx);
        putThreeOfFour<1>(d.p[0] + static_cast<std::size_t>(x) * 4, staged, kGroupPixels);
    }
};

// 8u and 8s: sixteen pixels a lane through the group readers, in 16-bit lanes, widened to 32-bit lanes
// within each 128-bit lane (the pack undoes it). 8s is sign-extended on the way in, and on the way out
// saturated through 16 bits to 8 and written as its low bytes.
template <class T, class In, class Out>
struct Twist8Lanes {
    static constexpr bool isSigned = std::is_signed_v<T>;
    static VF lo(V x) { return toFloat(isSigned ? shr32<16>(unpackLo16(zero(), x)) : unpackLo16(x, zero())); }
    static VF hi(V x) { return toFloat(isSigned ? shr32<16>(unpackHi16(zero(), x)) : unpackHi16(x, zero())); }
    static V out(V v)
    {
        if constexpr (isSigned)
            return and_(min16(max16(v, splat16(-128)), splat16(127)), splat16(255));
        else
            return v;
    }
    static void apply(V3& v, const MatrixLanes& t)
    {
        const V x0 = isSigned ? shr<8>(shl<8>(v.c[0])) : v.c[0];
        const V x1 = isSigned ? shr<8>(shl<8>(v.c[1])) : v.c[1];
        const V x2 = isSigned ? shr<8>(shl<8>(v.c[2])) : v.c[2];
        const VF l0 = lo(x0), l1 = lo(x1), l2 = lo(x2), h0 = hi(x0), h1 = hi(x1), h2 = hi(x2);
        v.c[0] = out(packs32(limitedInt<T>(t, 0, l0, l1, l2), limitedInt<T>(t, 0, h0, h1, h2)));
        v.c[1] = out(packs32(limitedInt<T>(t, 1, l0, l1, l2), limitedInt<T>(t, 1, h0, h1, h2)));
        v.c[2] = out(packs32(limitedInt<T>(t, 2, l0, l1, l2), limitedInt<T>(t, 2, h0, h1, h2)));
    }
    static int run(const typename In::Row& s, const typename Out::Row& d, int w, const twist::Matrix& m)
    {
        const MatrixLanes t(m);
        int x = 0;
        for (; x + kGroupPixels <= w; x += kGroupPixels) {
            V3 a, b;
            GroupIo<In>::template get<0>(s, x, a, b);
            apply(a, t);
            apply(b, t);
            if constexpr (std::is_same_v<Out, OutKeep8>)
                Out::put(d, x, a, b, Ctx{});
            else
                GroupIo<Out>::put(d, x, a, b, Ctx{});
        }
        return x;
    }
};

template <class T, class L>
struct Twist8For {
    static int run(const uint8_t* const* s, uint8_t* const* d, int w, const twist::Matrix& m)
    {
        if constexpr (std::is_same_v<L, twist::C3>)
            return Twist8Lanes<T, InPacked<3>, OutPacked<3, Order::Rgb, Fourth::None>>::run({{s[0]}}, {{d[0]}}, w, m);
        else if constexpr (std::is_same_v<L, twist::AC4>)
            return Twist8Lanes<T, InPacked<4>, OutKeep8>::run({{s[0]}}, {{d[0]}}, w, m);
        else
            return Twist8Lanes<T, InPlanar<3>, OutPlanar<3>>::run({{s[0], s[1], s[2]}}, {{d[0], d[1], d[2]}}, w, m);
    }
};

// 16-bit and 32f rows of three interleaved channels or three planes. A 32f row of a streaming call
// writes singly up to 16 bytes, then whole turns past the caches.
template <class T, class L>
struct TwistFloatLanes {
    using Turn = FloatTurn<T, L::stride, L::planes == 3>;
    template <bool Stream>
    static int turns(const uint8_t* const* s, uint8_t* const* d, int x, int w, const MatrixLanes& t)
    {
        for (; x + kFloatLanes <= w; x += kFloatLanes) {
            VF c[3];
            Turn::get(s, x, c);
            if constexpr (std::is_same_v<T, float>) {
                Turn::template put<Stream>(d, x, sumLanes<twist::OffsetFirst>(t.m[0], c[0], c[1], c[2]),
                                           sumLanes<twist::OffsetFirst>(t.m[1], c[0], c[1], c[2]),
                                           sumLanes<twist::OffsetFirst>(t.m[2], c[0], c[1], c[2]));
            } else {
                Turn::template put<false>(d, x, asFloat(limitedInt<T>(t, 0, c[0], c[1], c[2])),
                                          asFloat(limitedInt<T>(t, 1, c[0], c[1], c[2])),
                                          asFloat(limitedInt<T>(t, 2, c[0], c[1], c[2])));
            }
        }
        return x;
    }
    // Flattened: the scalar lead pixels are inlined here, so that no shared inline function is emitted
    // with this set's instructions.
    [[gnu::flatten]] static int run(const uint8_t* const* s, uint8_t* const* d, int w, const twist::Matrix& m)
    {
        const MatrixLanes t(m);
        if constexpr (std::is_same_v<T, float> && L::stride == 3) {
            const auto at = reinterpret_cast<uintptr_t>(d[0]);
            if (m.stream && at % 4 == 0) {
                // Pixels of 12 bytes: at most three singly before the destination lies on 16 bytes.
                const int lead = static_cast<int>((16 - at % 16) % 16 / 4 * 3 % 4);
                if (lead >= w)
                    return 0;
                twist::Twist3<T, L>::row(s, d, 0, lead, m);
                const int x = turns<true>(s, d, lead, w, t);
                streamFence();
                return x;
            }
        }
        return turns<false>(s, d, 0, w, t);
    }
};

template <class T, class L>
    requires(sizeof(T) == 1)
struct TwistKernel<twist::Twist3<T, L>> : Twist8For<T, L> {};
template <class T, class L>
    requires(sizeof(T) > 1)
struct TwistKernel<twist::Twist3<T, L>> : TwistFloatLanes<T, L> {};

// The 4x4 map: four pixels a 128-bit lane transposed to one vector a channel and back.
template <>
struct TwistKernel<twist::Twist4> {
    static int run(const uint8_t* const* s, uint8_t* const* d, int w, const twist::Matrix& t)
    {
        VF m[4][4];
#pragma GCC unroll 4
        for (int i = 0; i < 4; ++i)
#pragma GCC unroll 4
            for (int j = 0; j < 4; ++j)
                m[i][j] = splatF(t.m[i][j]);
        int x = 0;
        for (; x + kFloatLanes <= w; x += kFloatLanes) {
            const uint8_t* q = s[0] + static_cast<std::size_t>(x) * 16;
            VF c[4] = {loadLanesF(q, 64), loadLanesF(q + 16, 64), loadLanesF(q + 32, 64), loadLanesF(q + 48, 64)};
            transpose4(c);
            VF o[4];
#pragma GCC unroll 4
            for (int i = 0; i < 4; ++i)
                o[i] = addF(addF(addF(mulF(c[0], m[i][0]), mulF(c[1], m[i][1])), mulF(c[2], m[i][2])), mulF(c[3], m[i][3]));
            transpose4(o);
            uint8_t* p = d[0] + static_cast<std::size_t>(x) * 16;
#pragma GCC unroll 4
            for (int k = 0; k < 4; ++k)
                storeLanesF(p + 16 * k, 64, o[k]);
        }
        return x;
    }
};

template <class M>
int twistKernel(const uint8_t* const* s, uint8_t* const* d, int w, const twist::Matrix& m)
{
    return TwistKernel<M>::run(s, d, w, m);
}
