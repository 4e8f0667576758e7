// The inverse block forms (YCbCr or YUV to RGB) over 16-bit lanes, as luma and chroma parts (InverseSimd,
// see io_simd.inl). Rounding units sit in the chroma terms. No sum leaves the signed 16-bit range, and
// the 16-bit adds wrap alike in any order, so the parts give the form's values exactly. Included inside
// the namespace of each instruction set after its vocabulary.

template <const YccInverseGains& K, Rounding Rd, Green G>
struct InverseSimd<RgbFromYccBlock<K, Rd, G>> {
    static constexpr int shift = 4;
    static V luma(V y) { return mulHigh(shl<7>(sub(y, splat16<16>())), splat16<K.y>()); }
    static InverseTerms chroma(V cb, V cr)
    {
        constexpr int bias = RgbFromYccBlock<K, Rd, G>::bias;
        const V a = shl<7>(sub(cb, splat16<128>())), b = shl<7>(sub(cr, splat16<128>()));
        const V green = G == Green::Sum ? add(add(mulHigh(a, splat16<K.uG>()), mulHigh(b, splat16<K.vG>())), splat16<bias>())
                                        : sub(splat16<bias>(), add(mulHigh(b, splat16<-K.vG>()), mulHigh(a, splat16<-K.uG>())));
        return {add(mulHigh(b, splat16<K.vR>()), splat16<bias>()), green, add(mulHigh(a, splat16<K.uB>()), splat16<bias>())};
    }
};

// The same on whole pixels.
template <const YccInverseGains& K, Rounding Rd, Green G>
struct Simd<RgbFromYccBlock<K, Rd, G>> {
    static void apply(V3& v) { applyInverse<RgbFromYccBlock<K, Rd, G>>(v); }
};

template <const YuvInverseGains& K>
struct InverseSimd<RgbFromYuvBlock16With<K>> {
    static constexpr int shift = 1;
    static V luma(V y) { return shl<1>(y); }
    static InverseTerms chroma(V cb, V cr)
    {
        const V a = shl<4>(sub(cb, splat16<128>())), b = shl<4>(sub(cr, splat16<128>()));
        return {mulHigh(b, splat16<K.vR>()), add(mulHigh(a, splat16<K.uG>()), mulHigh(b, splat16<K.vG>())),
                mulHigh(a, splat16<K.uB>())};
    }
};

// Truncated whole-sample gains in 1/65536 with luma gain 65536: each chroma term is whole units plus a
// multiply-high, so Y adds as it is. R: vR = 65536 + r; B: uB = 131072 + b; G: 65536 Y - 65536 v +
// (uG u + (vG + 65536) v), the last sum from one pair multiply-add in 32 bits.
template <const YuvInverseGains& K>
struct InverseSimd<RgbFromYuvPixel<K, 0, 0>> {
    static constexpr int rExtra = K.vR - 65536, bExtra = K.uB - 131072, gV = K.vG + 65536;
    static_assert(rExtra >= 0 && rExtra < 32768 && bExtra >= 0 && bExtra < 32768 && gV >= 0 && gV < 32768 && K.uG >= -32768);
    static constexpr int shift = 0;
    static V luma(V y) { return y; }
    static InverseTerms chroma(V cb, V cr)
    {
        const V u = sub(cb, splat16<128>()), v = sub(cr, splat16<128>());
        constexpr int pair = static_cast<int>((static_cast<uint32_t>(gV) << 16) | static_cast<uint16_t>(K.uG));
        const V lo = shr32<16>(madd16(unpackLo16(u, v), splat32<pair>()));
        const V hi = shr32<16>(madd16(unpackHi16(u, v), splat32<pair>()));
        return {add(v, mulHigh(v, splat16<rExtra>())), sub(packs32(lo, hi), v), add(shl<1>(u), mulHigh(u, splat16<bExtra>()))};
    }
};
