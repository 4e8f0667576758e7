// RGB <-> XYZ and RGB <-> YCC 8u block forms over 16-bit lanes. Included inside the namespace of each
// instruction set, after its vector vocabulary. The XYZ sums are pairwise multiply-adds into 32-bit
// lanes, shifted and packed back; the YCC forms are multiply-highs as their scalar forms say.

template <const xyzycc::Mat3<int>& M, int Shift>
struct Simd<xyzycc::Xyz8<M, Shift>> {
    // One output channel: sum of the three products, floored by the shift, back in 16-bit lanes.
    template <int Row>
    static V output(V rgLo, V rgHi, V bLo, V bHi)
    {
        const V kRG = splat32<(M.k[Row][0] & 0xFFFF) | (M.k[Row][1] << 16)>(), kB = splat32<M.k[Row][2] & 0xFFFF>();
        const V lo = shr32<Shift>(add32(madd16(rgLo, kRG), madd16(bLo, kB)));
        const V hi = shr32<Shift>(add32(madd16(rgHi, kRG), madd16(bHi, kB)));
        return packs32(lo, hi);
    }
    static void apply(V3& v)
    {
        const V rgLo = unpackLo16(v.c[0], v.c[1]), rgHi = unpackHi16(v.c[0], v.c[1]);
        const V bLo = unpackLo16(v.c[2], zero()), bHi = unpackHi16(v.c[2], zero());
        v.c[0] = output<0>(rgLo, rgHi, bLo, bHi);
        v.c[1] = output<1>(rgLo, rgHi, bLo, bHi);
        v.c[2] = output<2>(rgLo, rgHi, bLo, bHi);
    }
};

template <>
struct Simd<xyzycc::YccForwardBlock8> {
    static constexpr int inputShift = 8; // samples arrive at 256 x
    static void apply(V3& v)
    {
        const V r8 = v.c[0], g8 = v.c[1], b8 = v.c[2];
        const V s = add(add(mulHighU(r8, splat16<4898>()), mulHighU(g8, splat16<9617>())), mulHighU(b8, splat16<1867>()));
        v.c[0] = shr<2>(mulHigh(s, splat16<2921>()));
        v.c[1] = shr<2>(add(mulHigh(sub(shrU<2>(b8), s), splat16<1789>()), splat16<624>()));
        v.c[2] = shr<2>(add(mulHigh(sub(shrU<2>(r8), s), splat16<2178>()), splat16<548>()));
    }
};

template <>
struct Simd<xyzycc::YccInverseBlock8> {
    static void apply(V3& v)
    {
        const V y = mulHighU(shl<8>(v.c[0]), splat16<5563>());
        const V u = mulHigh(shl<7>(sub(v.c[1], splat16<156>())), splat16<18168>());
        const V w = mulHigh(shl<7>(sub(v.c[2], splat16<137>())), splat16<14921>());
        v.c[0] = shr<4>(add(y, w));
        v.c[1] = shr<3>(add(add(shrU<1>(y), mulHigh(u, splat16<-6357>())), mulHigh(w, splat16<-16679>())));
        v.c[2] = shr<4>(add(y, u));
    }
};
