// Pixels of 16-bit and 32f samples as single-precision lanes, one vector a channel: the readers and
// writers of the gray and colour twist kernels, written once against the vector vocabulary and
// included inside the namespace of each instruction set.

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

// Four 32-bit lanes of four vectors transposed within each 128-bit lane: pixels of four channels to one
// vector a channel, and back.
inline void transpose4(VF (&r)[4])
{
    const VF t0 = unpackLoF(r[0], r[1]), t1 = unpackLoF(r[2], r[3]), t2 = unpackHiF(r[0], r[1]), t3 = unpackHiF(r[2], r[3]);
    r[0] = unpackLo64F(t0, t1);
    r[1] = unpackHi64F(t0, t1);
    r[2] = unpackLo64F(t2, t3);
    r[3] = unpackHi64F(t2, t3);
}

// Three samples of Z bytes a pixel written into n pixels of four whose fourth is kept.
template <std::size_t Z>
inline void putThreeOfFour(uint8_t* q, const uint8_t* staged, int n)
{
    for (int i = 0; i < n; ++i)
        std::memcpy(q + 4 * Z * static_cast<std::size_t>(i), staged + 3 * Z * static_cast<std::size_t>(i), 3 * Z);
}

// The pixels of one turn (four a 128-bit lane, the upper lane's four next in the row) as one float vector
// a channel, read from interleaved pixels of Stride samples (3, or 4 whose fourth is loaded but never
// used) or from three planes, of 16-bit or 32f samples; and written to three channels or planes.
template <class T, int Stride, bool Planar>
struct FloatTurn {
    static constexpr std::size_t z = sizeof(T);
    static constexpr std::size_t lane = Planar ? 4 * z : 4 * Stride * z; // bytes of one lane's four pixels
    static constexpr bool isSigned = std::is_signed_v<T>;
    static VF widened(const uint8_t* q)
    {
        if constexpr (std::is_same_v<T, float>)
            return Planar ? loadF(q) : loadLanesF(q, lane);
        else
            return toFloat(loadWidened16<isSigned>(q, lane));
    }
    // 16-bit lanes 0..3 or 4..7 of each 128-bit lane widened to 32 bits.
    static VF lowFour(V x) { return toFloat(isSigned ? shr32<16>(unpackLo16(zero(), x)) : unpackLo16(x, zero())); }
    static VF highFour(V x) { return toFloat(isSigned ? shr32<16>(unpackHi16(zero(), x)) : unpackHi16(x, zero())); }
    static void get(const uint8_t* const* s, int x, VF (&c)[3])
    {
        if constexpr (Planar) {
#pragma GCC unroll 3
            for (int k = 0; k < 3; ++k)
                c[k] = widened(s[k] + static_cast<std::size_t>(x) * z);
        } else if constexpr (Stride == 3) {
            const uint8_t* q = s[0] + static_cast<std::size_t>(x) * 3 * z;
            Split3::split(widened(q), widened(q + 4 * z), widened(q + 8 * z), c);
        } else if constexpr (std::is_same_v<T, float>) {
            const uint8_t* q = s[0] + static_cast<std::size_t>(x) * 16;
            VF r[4] = {loadLanesF(q, lane), loadLanesF(q + 16, lane), loadLanesF(q + 32, lane), loadLanesF(q + 48, lane)};
            transpose4(r);
            c[0] = r[0];
            c[1] = r[1];
            c[2] = r[2];
        } else {
            const uint8_t* q = s[0] + static_cast<std::size_t>(x) * 8;
            const V r0 = loadLanes(q, lane), r1 = loadLanes(q + 16, lane); // pixels 0, 1 and 2, 3
            const V lo = unpackLo16(r0, r1), hi = unpackHi16(r0, r1);
            const V c01 = unpackLo16(lo, hi), c23 = unpackHi16(lo, hi); // channels 0, 1 and 2, 3 of pixels 0..3
            c[0] = lowFour(c01);
            c[1] = highFour(c01);
            c[2] = lowFour(c23);
        }
    }
    // 32-bit lanes of 16-bit results to 16 bits with the depth's saturation.
    static V pack(V a, V b) { return isSigned ? packs32(a, b) : packus32(a, b); }
    // Three channels to planes or to three interleaved samples a pixel (32f results as floats, 16-bit
    // ones as 32-bit integers).
    template <bool Stream = false>
    static void put(uint8_t* const* d, int x, VF o0, VF o1, VF o2)
    {
        if constexpr (Stride == 4) {
            alignas(32) uint8_t staged[3 * kFloatLanes * z];
            uint8_t* const b[1] = {staged};
            FloatTurn<T, 3, false>::put(b, 0, o0, o1, o2);
            putThreeOfFour<z>(d[0] + static_cast<std::size_t>(x) * 4 * z, staged, kFloatLanes);
        } else if constexpr (Planar) {
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
