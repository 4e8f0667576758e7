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
        else
            return Twist8Lanes<T, InPlanar<3>, OutPlanar<3>>::run({{s[0], s[1], s[2]}}, {{d[0], d[1], d[2]}}, w, m);
    }
};

// Three channels of four interleaved 32-bit lanes a 128-bit lane, to and from one vector a channel: blends
// and in-lane permutes.
struct Split3 {
    static void split(VF a, VF b, VF c, VF (&v)[3])
    {
        v[0] = permuteF<_MM_SHUFFLE(1, 2, 3, 0)>(blendF<0b0010>(blendF<0b0100>(a, b), c)); // a0 a3 b2 c1
        v[1] = permuteF<_MM_SHUFFLE(2, 3, 0, 1)>(blendF<0b0100>(blendF<0b1001>(a, b), c)); // a1 b0 b3 c2
        v[2] = permuteF<_MM_SHUFFLE(3, 0, 1, 2)>(blendF<0b1001>(blendF<0b0010>(a, b), c)); // a2 b1 c0 c3
    }
    static void join(VF v0, VF v1, VF v2, VF& a, VF& b, VF& c)
    {
        const VF t0 = permuteF<_MM_SHUFFLE(1, 2, 3, 0)>(v0); // x0 x3 x2 x1
        const VF t1 = permuteF<_MM_SHUFFLE(2, 3, 0, 1)>(v1); // y1 y0 y3 y2
        const VF t2 = permuteF<_MM_SHUFFLE(3, 0, 1, 2)>(v2); // z2 z1 z0 z3
        a = blendF<0b0100>(blendF<0b0010>(t0, t1), t2);
        b = blendF<0b0100>(blendF<0b0010>(t1, t2), t0);
        c = blendF<0b0100>(blendF<0b0010>(t2, t0), t1);
    }
};

// The pixels of one turn (four a 128-bit lane, the upper lane's four next in the row) as one float vector
// a channel, read from and written to a layout of 16-bit or 32f samples.
template <class T, class L>
struct FloatTurn {
    static constexpr bool planar = L::planes == 3;
    static constexpr std::size_t z = sizeof(T);
    static constexpr std::size_t lane = planar ? 4 * z : 12 * z; // bytes of one lane's four pixels
    static VF widened(const uint8_t* q)
    {
        if constexpr (std::is_same_v<T, float>)
            return planar ? loadF(q) : loadLanesF(q, lane);
        else
            return toFloat(loadWidened16<std::is_signed_v<T>>(q, lane));
    }
    static void get(const uint8_t* const* s, int x, VF (&c)[3])
    {
        if constexpr (planar) {
#pragma GCC unroll 3
            for (int k = 0; k < 3; ++k)
                c[k] = widened(s[k] + static_cast<std::size_t>(x) * z);
        } else {
            const uint8_t* q = s[0] + static_cast<std::size_t>(x) * 3 * z;
            Split3::split(widened(q), widened(q + 4 * z), widened(q + 8 * z), c);
        }
    }
    // 32-bit lanes of 16-bit results to 16 bits with the depth's saturation.
    static V pack(V a, V b) { return std::is_signed_v<T> ? packs32(a, b) : packus32(a, b); }
    template <bool Stream>
    static void put(uint8_t* const* d, int x, VF o0, VF o1, VF o2)
    {
        if constexpr (planar) {
            const VF o[3] = {o0, o1, o2};
#pragma GCC unroll 3
            for (int k = 0; k < 3; ++k) {
                uint8_t* q = d[k] + static_cast<std::size_t>(x) * z;
                if constexpr (std::is_same_v<T, float>)
                    storeF(q, o[k]);
                else
                    storeLowHalves(q, lane, pack(asInt(o[k]), asInt(o[k])));
            }
        } else {
            uint8_t* q = d[0] + static_cast<std::size_t>(x) * 3 * z;
            VF a, b, c;
            Split3::join(o0, o1, o2, a, b, c);
            if constexpr (std::is_same_v<T, float>) {
                if constexpr (Stream) {
                    streamLanesF(q, lane, a);
                    streamLanesF(q + 16, lane, b);
                    streamLanesF(q + 32, lane, c);
                } else {
                    storeLanesF(q, lane, a);
                    storeLanesF(q + 16, lane, b);
                    storeLanesF(q + 32, lane, c);
                }
            } else {
                storeLanes(q, lane, pack(asInt(a), asInt(b)));
                storeLowHalves(q + 16, lane, pack(asInt(c), asInt(c)));
            }
        }
    }
};

// 16-bit and 32f rows of three interleaved channels or three planes. A 32f row of a streaming call
// writes singly up to 16 bytes, then whole turns past the caches.
template <class T, class L>
struct TwistFloatLanes {
    using Turn = FloatTurn<T, L>;
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
    static int run(const uint8_t* const* s, uint8_t* const* d, int w, const twist::Matrix& m)
    {
        const MatrixLanes t(m);
        if constexpr (std::is_same_v<T, float> && !Turn::planar) {
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
    requires(sizeof(T) == 1 && !std::is_same_v<L, twist::AC4>)
struct TwistKernel<twist::Twist3<T, L>> : Twist8For<T, L> {};
template <class T, class L>
    requires(sizeof(T) > 1 && !std::is_same_v<L, twist::AC4>)
struct TwistKernel<twist::Twist3<T, L>> : TwistFloatLanes<T, L> {};

template <class M>
int twistKernel(const uint8_t* const* s, uint8_t* const* d, int w, const twist::Matrix& m)
{
    return TwistKernel<M>::run(s, d, w, m);
}
