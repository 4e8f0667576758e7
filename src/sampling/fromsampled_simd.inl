// The vector parts (luma and chroma terms) of the sampled members' own inverse forms. Included inside
// the namespace of each instruction set after its vocabulary.

template <const YccFoldedGains& K>
struct InverseSimd<RgbFromYccFolded<K>> {
    static constexpr int shift = 3;
    static V luma(V y) { return mulHigh(shl<7>(y), splat16<K.y>()); }
    static InverseTerms chroma(V cb, V cr)
    {
        const V a = shl<7>(cb), b = shl<7>(cr);
        return {sub(mulHigh(b, splat16<K.crR>()), splat16<K.kR>()),
                sub(splat16<K.kG>(), add(mulHigh(a, splat16<K.cbG>()), mulHigh(b, splat16<K.crG>()))),
                sub(mulHigh(a, splat16<K.cbB>()), splat16<K.kB>())};
    }
};

template <const YccFoldedGains& K>
struct InverseSimd<RgbFromYccSplit<K>> {
    static constexpr int shift = 3;
    static V luma(V y) { return mulHigh(shl<7>(sub(y, splat16<16>())), splat16<K.y>()); }
    static InverseTerms chroma(V cb, V cr)
    {
        const V a = shl<7>(sub(cb, splat16<128>())), b = shl<7>(sub(cr, splat16<128>()));
        return {mulHigh(b, splat16<K.crR>()), sub(zero(), add(mulHigh(a, splat16<K.cbG>()), mulHigh(b, splat16<K.crG>()))),
                mulHigh(a, splat16<K.cbB>())};
    }
};

template <const YuvInverseGains& K, Green G, int R>
struct InverseSimd<RgbFromWide<K, G, R>> {
    static constexpr int shift = 4;
    static V luma(V y) { return R == 0 ? shl<4>(y) : add(shl<4>(y), splat16<R>()); }
    static InverseTerms chroma(V cb, V cr)
    {
        const V a = shl<7>(sub(cb, splat16<128>())), b = shl<7>(sub(cr, splat16<128>()));
        const V green = G == Green::Sum ? add(mulHigh(a, splat16<K.uG>()), mulHigh(b, splat16<K.vG>()))
                                        : sub(zero(), add(mulHigh(a, splat16<-K.uG>()), mulHigh(b, splat16<-K.vG>())));
        return {mulHigh(b, splat16<K.vR>()), green, mulHigh(a, splat16<K.uB>())};
    }
};
