// RGB <-> YCbCr block forms over 16-bit lanes. Samples sit in the upper byte of a lane (256 x)
// or one bit lower (128 x) so that one multiply-high, or one rounded multiply, does each scaling.
// Included inside the namespace of each instruction set, after its vector vocabulary (V, V3, Simd,
// add, mulHigh, ...): one definition of each SIMD block form for every flavour.

template <>
struct Simd<YccFromRgbMatrix> {
    static constexpr const YccForwardGains& K = YccForward;
    static constexpr int inputShift = 8; // samples arrive at 256 x
    static void apply(V3& v)
    {
        const V r8 = v.c[0], g8 = v.c[1], b8 = v.c[2];
        const V r7 = shrU<1>(r8), g7 = shrU<1>(g8), b7 = shrU<1>(b8);
        // The luma sum with its rounding unit stays below 65536: plain adds and a logical shift hold it.
        const V ys = add(add(add(mulHighU(r8, splat16<K.yR>()), mulHighU(g8, splat16<K.yG>())), mulHighU(b8, splat16<K.yB>())),
                         splat16<128>());
        auto chroma = [&]<int kr, int kg, int kb>() {
            const V s = add(add(add(mulHigh(r7, splat16<kr>()), mulHigh(g7, splat16<kg>())), mulHigh(b7, splat16<kb>())),
                            splat16<64>());
            return add(shr<7>(s), splat16<128>());
        };
        v.c[0] = add(shrU<8>(ys), splat16<16>());
        v.c[1] = chroma.template operator()<K.cbR, K.cbG, K.cbB>();
        v.c[2] = chroma.template operator()<K.crR, K.crG, K.crB>();
    }
};

template <>
struct Simd<YccFromRgbRound> {
    static constexpr const YccForwardMagnitudes& K = YccForwardRound;
    static void apply(V3& v)
    {
        const V a = shl<7>(v.c[0]), b = shl<7>(v.c[1]), c = shl<7>(v.c[2]);
        const V y = add(add(add(mulRound(a, splat16<K.yR>()), mulRound(b, splat16<K.yG>())), mulRound(c, splat16<K.yB>())),
                        splat16<1026>());
        const V cb = sub(sub(add(mulRound(c, splat16<K.cbB>()), splat16<8194>()), mulRound(b, splat16<K.cbG>())),
                         mulRound(a, splat16<K.cbR>()));
        const V cr = sub(sub(add(mulRound(a, splat16<K.crR>()), splat16<8194>()), mulRound(b, splat16<K.crG>())),
                         mulRound(c, splat16<K.crB>()));
        v.c[0] = shr<6>(y);
        v.c[1] = shr<6>(cb);
        v.c[2] = shr<6>(cr);
    }
};

// ---- whole-row forms over 32-bit lanes ----------------------------------------------------------------

template <>
struct Wide<YccFromRgbPixel> {
    static constexpr const YccForwardGains& K = YccForward;
    static void apply(W3& w)
    {
        const V r = w.c[0], g = w.c[1], b = w.c[2];
        auto sum = [&]<int kr, int kg, int kb, int offset>() {
            const V s = add32(add32(mul32(r, splat32<kr>()), mul32(g, splat32<kg>())), mul32(b, splat32<kb>()));
            return add32(shr32<16>(add32(s, splat32<32768>())), splat32<offset>());
        };
        w.c[0] = sum.template operator()<K.yR, K.yG, K.yB, 16>();
        w.c[1] = sum.template operator()<K.cbR, K.cbG, K.cbB, 128>();
        w.c[2] = sum.template operator()<K.crR, K.crG, K.crB, 128>();
    }
};

template <const YccInverseGains& K, int R>
struct Wide<RgbFromYccPixel<K, R>> {
    static void apply(W3& w)
    {
        const V y = mul32(sub32(w.c[0], splat32<16>()), splat32<K.y>());
        const V u = sub32(w.c[1], splat32<128>()), v = sub32(w.c[2], splat32<128>());
        w.c[0] = shr32<16>(add32(add32(y, mul32(v, splat32<K.vR>())), splat32<R>()));
        w.c[1] = shr32<16>(add32(add32(add32(y, mul32(u, splat32<K.uG>())), mul32(v, splat32<K.vG>())), splat32<R>()));
        w.c[2] = shr32<16>(add32(add32(y, mul32(u, splat32<K.uB>())), splat32<R>()));
    }
};
