// RGB <-> YUV block forms over 16-bit lanes. Samples sit in the upper byte of a lane (256 x) or
// one bit lower (128 x) so that one multiply-high does each scaling.
// Included inside the namespace of each instruction set, after its vector vocabulary (V, V3, Simd,
// add, mulHigh, ...): one definition of each SIMD block form for every flavour.

template <>
struct Simd<YuvFromRgbMatrix> {
    using K = YuvMatrixForward;
    static constexpr int inputShift = 8; // samples arrive at 256 x
    static void apply(V3& v)
    {
        const V r8 = v.c[0], g8 = v.c[1], b8 = v.c[2];
        const V r7 = shrU<1>(r8), g7 = shrU<1>(g8), b7 = shrU<1>(b8);
        // The luma sum stays below 65536, so plain 16-bit adds hold it.
        const V y = shrU<8>(add(add(mulHighU(r8, splat16<K::yR>()), mulHighU(g8, splat16<K::yG>())), mulHighU(b8, splat16<K::yB>())));
        auto chroma = [&]<int kr, int kg, int kb>() {
            const V s = add(add(mulHigh(r7, splat16<kr>()), mulHigh(g7, splat16<kg>())), mulHigh(b7, splat16<kb>()));
            return add(shr<6>(s), splat16<128>());
        };
        v.c[0] = y;
        v.c[1] = chroma.template operator()<K::uR, K::uG, K::uB>();
        v.c[2] = chroma.template operator()<K::vR, K::vG, K::vB>();
    }
};

template <>
struct Simd<YuvFromRgbHalf> {
    using K = YuvHalfForward;
    static void apply(V3& v)
    {
        const V r = v.c[0], g = v.c[1], b = v.c[2];
        const V s = add(add(add(mulHigh(shl<2>(r), splat16<K::yR>()), mulHigh(shl<2>(b), splat16<K::yB>())),
                            mulHigh(shl<2>(g), splat16<K::yG>())),
                        splat16<1>());
        v.c[0] = shr<1>(s);
        v.c[1] = add(mulHigh(sub(shl<1>(b), s), splat16<K::uGain>()), splat16<128>());
        v.c[2] = add(mulHigh(sub(shl<1>(r), s), splat16<K::vGain>()), splat16<128>());
    }
};

template <>
struct Simd<RgbFromYuvBlock8> {
    static constexpr YuvInverseGains K = YuvInverseBlock8;
    static void apply(V3& v)
    {
        const V y = v.c[0];
        const V a = shl<3>(sub(v.c[1], splat16<128>())), b = shl<3>(sub(v.c[2], splat16<128>()));
        v.c[0] = add(y, mulHigh(b, splat16<K.vR>()));
        v.c[1] = add(add(y, mulHigh(a, splat16<K.uG>())), mulHigh(b, splat16<K.vG>()));
        v.c[2] = add(y, mulHigh(a, splat16<K.uB>()));
    }
};

template <const YuvInverseGains& K>
struct Simd<RgbFromYuvBlock16With<K>> {
    static void apply(V3& v) { applyInverse<RgbFromYuvBlock16With<K>>(v); }
};

template <>
struct Simd<RgbFromYuvBlock128> {
    static constexpr YuvInverseGains K = YuvInverseBlock128;
    static void apply(V3& v)
    {
        const V y8 = add(shl<3>(v.c[0]), splat16<4>());
        const V a = shl<7>(sub(v.c[1], splat16<128>())), b = shl<7>(sub(v.c[2], splat16<128>()));
        v.c[0] = shr<3>(add(y8, mulHigh(b, splat16<K.vR>())));
        v.c[1] = shr<3>(sub(sub(y8, mulHigh(b, splat16<-K.vG>())), mulHigh(a, splat16<-K.uG>())));
        v.c[2] = shr<3>(add(y8, mulHigh(a, splat16<K.uB>())));
    }
};

// ---- whole-row forms over 32-bit lanes ----------------------------------------------------------------

template <bool FullRound>
struct Wide<YuvFromRgbDifference<FullRound>> {
    using K = YuvDifferenceForward;
    static void apply(W3& w)
    {
        const V r = w.c[0], g = w.c[1], b = w.c[2];
        const V t = add32(add32(mul32(r, splat32<K::yR>()), mul32(g, splat32<K::yG>())), mul32(b, splat32<K::yB>()));
        const V dBias = splat32<FullRound ? 32768 : 32767>();
        const V dB = shr32<16>(add32(sub32(shl32<16>(b), t), dBias));
        const V dR = shr32<16>(add32(sub32(shl32<16>(r), t), dBias));
        w.c[0] = shr32<16>(FullRound ? add32(t, splat32<32768>()) : t);
        w.c[1] = add32(shr32<16>(mul32(dB, splat32<K::uGain>())), splat32<128>());
        w.c[2] = add32(shr32<16>(mul32(dR, splat32<K::vGain>())), splat32<128>());
    }
};

template <const YuvInverseGains& K, int RB, int G>
struct Wide<RgbFromYuvPixel<K, RB, G>> {
    static void apply(W3& w)
    {
        const V y = shl32<16>(w.c[0]);
        const V u = sub32(w.c[1], splat32<128>()), v = sub32(w.c[2], splat32<128>());
        w.c[0] = shr32<16>(add32(add32(y, mul32(v, splat32<K.vR>())), splat32<RB>()));
        w.c[1] = shr32<16>(add32(add32(add32(y, mul32(u, splat32<K.uG>())), mul32(v, splat32<K.vG>())), splat32<G>()));
        w.c[2] = shr32<16>(add32(add32(y, mul32(u, splat32<K.uB>())), splat32<RB>()));
    }
};
