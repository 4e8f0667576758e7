// Colour twist kernels, written once against the vector vocabulary and included inside the namespace of
// each instruction set (after io_simd.inl). Pixels travel as single-precision lanes, one vector a
// channel, through the same operations in the same order as the scalar sums; a member without a SIMD
// form of its own runs its scalar row compiled with this set's flags, vectorised by the compiler (every
// call inside inlined, so that no shared inline function is emitted with this set's instructions).

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
        for (int i = 0; i < 3; ++i)
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

// 8u: the pixels of a turn come in 16-bit lanes through the group readers, are widened to 32-bit lanes
// (within each 128-bit lane, undone by the pack), limited to 0..255, converted and packed back.
template <class In, class Out>
struct Twist8Lanes {
    static V channelOf(const MatrixLanes& t, int i, const VF (&lo)[3], const VF (&hi)[3])
    {
        const VF top = splatF(255.0f), bottom = splatF(0.0f);
        auto limit = [&](VF v) { return toNearestInt(maxF(minF(v, top), bottom)); };
        return packs32(limit(sumLanes<twist::OffsetFirst>(t.m[i], lo[0], lo[1], lo[2])),
                       limit(sumLanes<twist::OffsetFirst>(t.m[i], hi[0], hi[1], hi[2])));
    }
    static void apply(V3& v, const MatrixLanes& t)
    {
        VF lo[3], hi[3];
        for (int k = 0; k < 3; ++k) {
            lo[k] = toFloat(unpackLo16(v.c[k], zero()));
            hi[k] = toFloat(unpackHi16(v.c[k], zero()));
        }
        for (int i = 0; i < 3; ++i)
            v.c[i] = channelOf(t, i, lo, hi);
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

template <>
struct TwistKernel<twist::Twist8uC3> {
    static int run(const uint8_t* const* s, uint8_t* const* d, int w, const twist::Matrix& m)
    {
        using Out = OutPacked<3, Order::Rgb, Fourth::None>;
        return Twist8Lanes<InPacked<3>, Out>::run({{s[0]}}, {{d[0]}}, w, m);
    }
};

template <>
struct TwistKernel<twist::Twist8uP3> {
    static int run(const uint8_t* const* s, uint8_t* const* d, int w, const twist::Matrix& m)
    {
        return Twist8Lanes<InPlanar<3>, OutPlanar<3>>::run({{s[0], s[1], s[2]}}, {{d[0], d[1], d[2]}}, w, m);
    }
};

// 32f: each channel's lanes straight from planes, or from interleaved pixels by blends and in-lane
// permutes (four pixels a 128-bit lane, the next four 48 bytes on).
struct Float3 {
    static void split(VF a, VF b, VF c, VF (&v)[3])
    {
        v[0] = permuteF<_MM_SHUFFLE(1, 2, 3, 0)>(blendF<0b0010>(blendF<0b0100>(a, b), c)); // a0 a3 b2 c1
        v[1] = permuteF<_MM_SHUFFLE(2, 3, 0, 1)>(blendF<0b0100>(blendF<0b1001>(a, b), c)); // a1 b0 b3 c2
        v[2] = permuteF<_MM_SHUFFLE(3, 0, 1, 2)>(blendF<0b1001>(blendF<0b0010>(a, b), c)); // a2 b1 c0 c3
    }
    static void join(const VF (&v)[3], VF& a, VF& b, VF& c)
    {
        const VF t0 = permuteF<_MM_SHUFFLE(1, 2, 3, 0)>(v[0]); // x0 x3 x2 x1
        const VF t1 = permuteF<_MM_SHUFFLE(2, 3, 0, 1)>(v[1]); // y1 y0 y3 y2
        const VF t2 = permuteF<_MM_SHUFFLE(3, 0, 1, 2)>(v[2]); // z2 z1 z0 z3
        a = blendF<0b0100>(blendF<0b0010>(t0, t1), t2);
        b = blendF<0b0100>(blendF<0b0010>(t1, t2), t0);
        c = blendF<0b0100>(blendF<0b0010>(t2, t0), t1);
    }
};

template <class L>
struct Twist32Lanes {
    static int run(const uint8_t* const* s, uint8_t* const* d, int w, const twist::Matrix& m)
    {
        {
            const MatrixLanes t(m);
            int x = 0;
            for (; x + kFloatLanes <= w; x += kFloatLanes) {
                VF in[3], out[3];
                if constexpr (std::is_same_v<L, twist::C3>) {
                    const uint8_t* q = s[0] + static_cast<std::size_t>(x) * 12;
                    Float3::split(loadLanesF(q, 48), loadLanesF(q + 16, 48), loadLanesF(q + 32, 48), in);
                } else {
                    for (int k = 0; k < 3; ++k)
                        in[k] = loadF(s[k] + static_cast<std::size_t>(x) * 4);
                }
                for (int i = 0; i < 3; ++i)
                    out[i] = sumLanes<twist::OffsetFirst>(t.m[i], in[0], in[1], in[2]);
                if constexpr (std::is_same_v<L, twist::C3>) {
                    uint8_t* q = d[0] + static_cast<std::size_t>(x) * 12;
                    VF a, b, c;
                    Float3::join(out, a, b, c);
                    storeLanesF(q, 48, a);
                    storeLanesF(q + 16, 48, b);
                    storeLanesF(q + 32, 48, c);
                } else {
                    for (int i = 0; i < 3; ++i)
                        storeF(d[i] + static_cast<std::size_t>(x) * 4, out[i]);
                }
            }
            return x;
        }
    }
};

template <>
struct TwistKernel<twist::Twist32fC3> : Twist32Lanes<twist::C3> {};
template <>
struct TwistKernel<twist::Twist32fP3> : Twist32Lanes<twist::P3> {};

template <class M>
int twistKernel(const uint8_t* const* s, uint8_t* const* d, int w, const twist::Matrix& m)
{
    return TwistKernel<M>::run(s, d, w, m);
}
