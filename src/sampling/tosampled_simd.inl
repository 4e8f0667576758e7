// RGB to chroma-sampled images: the block forms over vectors, in 16-bit lanes (the 32-bit sums of the
// Mixed chroma through pair multiply-adds). Included inside the namespace of each instruction set after
// its vocabulary and the sampled kernel: one definition for every flavour.

// Luma terms through rounded products of 128 x sample (Round and R420 forms).
template <int kr, int kg, int kb>
inline V roundedLuma(const V3& v)
{
    return add(add(mulRound(shl<7>(v.c[0]), splat16<kr>()), mulRound(shl<7>(v.c[1]), splat16<kg>())),
               mulRound(shl<7>(v.c[2]), splat16<kb>()));
}

template <bool OffsetAfter>
struct SimdUnit<YccRoundBlock<OffsetAfter>> {
    static constexpr int pixels = 4;
    static constexpr YccForwardMagnitudes K = YccForwardRound;
    static V luma(const V3& v) { return roundedLuma<K.yR, K.yG, K.yB>(v); }
    static V lumaOut(V t)
    {
        return OffsetAfter ? add(shr<6>(t), splat16<16>()) : shr<6>(add(t, splat16<1026>()));
    }
    static V offset(V v) { return OffsetAfter ? add(shr<6>(v), splat16<128>()) : shr<6>(add(v, splat16<8194>())); }
    static void chroma(const V3& s, V, V& cb, V& cr)
    {
        const V sr = shl<5>(s.c[0]), sg = shl<5>(s.c[1]), sb = shl<5>(s.c[2]);
        cb = offset(sub(sub(mulRound(sb, splat16<K.cbB>()), mulRound(sg, splat16<K.cbG>())), mulRound(sr, splat16<K.cbR>())));
        cr = offset(sub(sub(mulRound(sr, splat16<K.crR>()), mulRound(sg, splat16<K.crG>())), mulRound(sb, splat16<K.crB>())));
    }
};

template <>
struct SimdUnit<YuvR420Block> {
    static constexpr int pixels = 4;
    static constexpr bool lumaSums = true;
    static V luma(const V3& v) { return roundedLuma<4899, 9617, 1868>(v); }
    static V lumaOut(V t) { return shr<6>(t); }
    // The four luma terms of a unit reach 65284: their sum wraps into the unsigned range, halved logically.
    static void chroma(const V3& s, V t, V& cb, V& cr)
    {
        const V h = shrU<1>(t);
        cb = add(shr<6>(mulRound(sub(shl<5>(s.c[2]), h), splat16<8061>())), splat16<128>());
        cr = add(shr<6>(mulRound(sub(shl<5>(s.c[0]), h), splat16<14369>())), splat16<128>());
    }
};

template <int n, int R>
struct SimdUnit<YuvHalfBlock<n, R>> {
    static constexpr int pixels = n;
    static constexpr bool lumaSums = true;
    using K = YuvHalfForward;
    static V luma(const V3& v)
    {
        return add(add(mulHigh(shl<2>(v.c[0]), splat16<K::yR>()), mulHigh(shl<2>(v.c[2]), splat16<K::yB>())),
                   mulHigh(shl<2>(v.c[1]), splat16<K::yG>()));
    }
    static V lumaOut(V t) { return shr<1>(R == 0 ? t : add(t, splat16<R>())); }
    static void chroma(const V3& s, V t, V& cb, V& cr)
    {
        const V d = n == 4 ? shr<2>(t) : shr<1>(t);
        cb = add(mulHigh(sub(n == 4 ? shr<1>(s.c[2]) : s.c[2], d), splat16<K::uGain>()), splat16<128>());
        cr = add(mulHigh(sub(n == 4 ? shr<1>(s.c[0]) : s.c[0], d), splat16<K::vGain>()), splat16<128>());
    }
};

// The luma terms are the lumas themselves, so that their unit sums come with them.
template <>
struct SimdUnit<YuvSumBlock> {
    static constexpr int pixels = 4;
    static constexpr bool lumaSums = true;
    using F = YuvSumBlock;
    static V luma(const V3& v)
    {
        return shr<7>(add(add(add(mulHighU(shl<8>(v.c[0]), splat16<F::yR>()), mulHighU(shl<8>(v.c[1]), splat16<F::yG>())),
                              mulHighU(shl<8>(v.c[2]), splat16<F::yB>())),
                          splat16<64>()));
    }
    static V lumaOut(V t) { return t; }
    static void chroma(const V3& s, V t, V& cb, V& cr)
    {
        const V sy = shl<5>(t);
        cb = shr<6>(add(mulHigh(sub(shl<5>(s.c[2]), sy), splat16<F::uGain>()), splat16<8224>()));
        cr = shr<6>(add(mulHigh(sub(shl<5>(s.c[0]), sy), splat16<F::vGain>()), splat16<8224>()));
    }
};

// Held to 1..254 in full range; clip8 comes with the pack.
template <bool Full>
inline V limitLanes(V v)
{
    if constexpr (Full)
        return max16(min16(v, splat16<254>()), splat16<1>());
    else
        return v;
}

template <const YccForwardMagnitudes& K, SumChroma Kind>
struct SimdUnit<YccSumBlock<K, Kind>> {
    using F = YccSumBlock<K, Kind>;
    static constexpr int pixels = F::n;
    static V luma(const V3& v)
    {
        constexpr int c = K.full ? 64 : 2112;
        return add(add(add(mulHighU(shl<8>(v.c[0]), splat16<K.yR>()), mulHighU(shl<8>(v.c[1]), splat16<K.yG>())),
                       mulHighU(shl<8>(v.c[2]), splat16<K.yB>())),
                   splat16<c>());
    }
    static V lumaOut(V t) { return limitLanes<K.full>(shr<7>(t)); }
    static void chroma(const V3& s, V, V& cb, V& cr)
    {
        constexpr int up = F::scale == 64 ? 6 : 5;
        const V sr = shl<up>(s.c[0]), sg = shl<up>(s.c[1]), sb = shl<up>(s.c[2]);
        V vb, vr;
        if constexpr (Kind == SumChroma::Signed) {
            vb = add(add(add(mulHigh(sr, splat16<-K.cbR>()), mulHigh(sg, splat16<-K.cbG>())), mulHigh(sb, splat16<K.cbB>())),
                     splat16<F::c>());
            vr = add(add(add(mulHigh(sr, splat16<K.crR>()), mulHigh(sg, splat16<-K.crG>())), mulHigh(sb, splat16<-K.crB>())),
                     splat16<F::c>());
        } else {
            vb = sub(sub(add(mulHighU(sb, splat16<K.cbB>()), splat16<F::c>()), mulHighU(sr, splat16<K.cbR>())),
                     mulHighU(sg, splat16<K.cbG>()));
            vr = sub(sub(add(mulHighU(sr, splat16<K.crR>()), splat16<F::c>()), mulHighU(sg, splat16<K.crG>())),
                     mulHighU(sb, splat16<K.crB>()));
        }
        cb = limitLanes<K.full>(shr<F::shift>(vb));
        cr = limitLanes<K.full>(shr<F::shift>(vr));
    }
};

template <>
struct SimdUnit<YccMixedBlock> {
    static constexpr int pixels = 2;
    static constexpr YccForwardGains K = YccForward;
    // Up to 56074 before the shift: an unsigned sum.
    static V luma(const V3& v)
    {
        return add(add(mulHighU(shl<8>(v.c[0]), splat16<K.yR>()), mulHighU(shl<8>(v.c[1]), splat16<K.yG>())),
                   mulHighU(shl<8>(v.c[2]), splat16<K.yB>()));
    }
    static V lumaOut(V t) { return add(shrU<8>(t), splat16<16>()); }
    // floor((kr SumR + kg SumG + kb SumB + 65536) / 131072) + 128 in 32-bit lanes: (SumR, SumG) and
    // (SumB, 4) pairs against (kr, kg) and (kb, 16384).
    template <int kr, int kg, int kb>
    static V part(const V3& s)
    {
        const V rg = splat32<(kr & 0xFFFF) | (kg << 16)>(), b1 = splat32<(kb & 0xFFFF) | (16384 << 16)>();
        const V four = splat16<4>();
        auto half = [&](V x, V z) { return shr32<17>(add32(madd16(x, rg), madd16(z, b1))); };
        const V lo = half(unpackLo16(s.c[0], s.c[1]), unpackLo16(s.c[2], four));
        const V hi = half(unpackHi16(s.c[0], s.c[1]), unpackHi16(s.c[2], four));
        return add(packs32(lo, hi), splat16<128>());
    }
    static void chroma(const V3& s, V, V& cb, V& cr)
    {
        cb = part<K.cbR, K.cbG, K.cbB>(s);
        cr = part<K.crR, K.crG, K.crB>(s);
    }
};

// Q14: each pixel's luma term floor((9798 R + 19235 G) / 16384) + floor(3736 B / 16384) (+ 1), the
// first through pair multiply-adds in 32-bit lanes.
template <bool Plus1>
struct SimdUnit<YuvQ14Block<Plus1>> {
    static constexpr int pixels = 2;
    static constexpr bool lumaSums = true;
    using K = YuvHalfForward;
    static V luma(const V3& v)
    {
        const V rg = splat32<(K::yR & 0xFFFF) | (K::yG << 16)>();
        const V lo = shr32<14>(madd16(unpackLo16(v.c[0], v.c[1]), rg)), hi = shr32<14>(madd16(unpackHi16(v.c[0], v.c[1]), rg));
        return add(add(packs32(lo, hi), mulHigh(shl<2>(v.c[2]), splat16<K::yB>())), splat16<Plus1 ? 1 : 0>());
    }
    static V lumaOut(V t) { return shr<1>(t); }
    static void chroma(const V3& s, V t, V& cb, V& cr)
    {
        const V m = shr<1>(t);
        cb = add(mulHigh(sub(s.c[2], m), splat16<K::uGain>()), splat16<128>());
        cr = add(mulHigh(sub(s.c[0], m), splat16<K::vGain>()), splat16<128>());
    }
};

// R422: R420's luma terms; chroma of 64 x sums less both terms.
template <>
struct SimdUnit<YuvR422Block> {
    static constexpr int pixels = 2;
    static constexpr bool lumaSums = true;
    static V luma(const V3& v) { return roundedLuma<4899, 9617, 1868>(v); }
    static V lumaOut(V t) { return shr<6>(t); }
    static void chroma(const V3& s, V t, V& cb, V& cr)
    {
        cb = add(shr<6>(mulRound(sub(shl<6>(s.c[2]), t), splat16<8061>())), splat16<128>());
        cr = add(shr<6>(mulRound(sub(shl<6>(s.c[0]), t), splat16<14369>())), splat16<128>());
    }
};

// D257: each sample first widened to floor(257 x / 64), which is 4 x + floor(x / 64); the unit sums are
// of the widened samples.
template <>
struct SimdUnit<YuvD257Block> {
    static constexpr int pixels = 2;
    static constexpr bool lumaSums = true;
    using K = YuvHalfForward;
    static void prepare(V3& v)
    {
        #pragma GCC unroll 3
        for (int k = 0; k < 3; ++k)
            v.c[k] = add(shl<2>(v.c[k]), shrU<6>(v.c[k]));
    }
    static V luma(const V3& v)
    {
        return add(add(mulHigh(v.c[0], splat16<K::yR>()), mulHigh(v.c[1], splat16<K::yG>())), mulHigh(v.c[2], splat16<K::yB>()));
    }
    static V lumaOut(V t) { return shr<1>(t); }
    static void chroma(const V3& s, V t, V& cb, V& cr)
    {
        cb = add(shr<1>(mulHigh(sub(shr<1>(s.c[2]), t), splat16<K::uGain>())), splat16<128>());
        cr = add(shr<1>(mulHigh(sub(shr<1>(s.c[0]), t), splat16<K::vGain>())), splat16<128>());
    }
};

// Y16, unit of 4: whole-sample luma terms t in 32-bit lanes, through pair multiply-adds (38470 green as
// two halves of 19235); the units' sums of t carried in 32-bit lanes to the differences
// d = floor((65536 Sum - sum of t + 131071) / 65536), which fit 16 bits. U = floor(32244 d / 262144) + 128,
// and V with 57475 d formed as 65536 d - 8061 d.
template <>
struct SimdUnit<YuvY16Unit> {
    static constexpr int pixels = 4;
    struct Acc {
        V lo, hi; // sums of t of units 0..3 and 4..7 of each lane
    };
    // t of pixels 0..3 and 4..7 of v; returns Y of all eight.
    static V terms(const V3& v, V& lo, V& hi)
    {
        const V rg = splat32<19595 | (19235 << 16)>(), bg = splat32<7471 | (19235 << 16)>();
        lo = add32(madd16(unpackLo16(v.c[0], v.c[1]), rg), madd16(unpackLo16(v.c[2], v.c[1]), bg));
        hi = add32(madd16(unpackHi16(v.c[0], v.c[1]), rg), madd16(unpackHi16(v.c[2], v.c[1]), bg));
        return packs32(shr32<16>(lo), shr32<16>(hi));
    }
    static V row(Acc& acc, int r, const V3& a, const V3& b)
    {
        V a0, a1, b0, b1;
        const V ya = terms(a, a0, a1), yb = terms(b, b0, b1);
        const V lo = hadd32(a0, a1), hi = hadd32(b0, b1);
        acc.lo = r == 0 ? lo : add32(acc.lo, lo);
        acc.hi = r == 0 ? hi : add32(acc.hi, hi);
        return packUs(ya, yb);
    }
    static V difference(V sum, const Acc& acc)
    {
        auto part = [](V s32, V t) { return shr32<16>(add32(sub32(shl32<16>(s32), t), splat32<131071>())); };
        return packs32(part(unpackLo16(sum, zero()), acc.lo), part(unpackHi16(sum, zero()), acc.hi));
    }
    static void chroma(const V3& s, const Acc& acc, V& cb, V& cr)
    {
        const V db = difference(s.c[2], acc), dr = difference(s.c[0], acc);
        cb = add(shr<2>(mulHigh(db, splat16<32244>())), splat16<128>());
        cr = add(shr<2>(add(dr, mulHigh(dr, splat16<-8061>()))), splat16<128>());
    }
};

// The three-tap filter: luma and the full and half chroma terms of each pixel in 32-bit lanes through
// pair multiply-adds (full terms in even lanes, half terms in odd ones), summed per pair; the left half
// term of a pair is the odd lane of the pair before, carried across groups (none at the start of a row).
// Three-byte RGB sources, or such samples through a table (each turn's bytes mapped into a buffer first).
// The source a mapped source reads (void for others).
template <class S>
struct MappedBase {
    using type = void;
};
template <class S, class M>
struct MappedBase<InMapped<S, M>> {
    using type = S;
};

template <>
struct SimdUnit<YccTapFilter> {
    using T = YccTapFilter;
    // Terms of pixels 0..7 of v: Y (16-bit lanes), and per pair k the full plus right half term of Cb and
    // Cr (units 0..3) and the odd pixels' half terms.
    struct Half {
        V y, cb, cr, hb, hr;
    };
    template <int fR, int fG, int fB, int hR, int hG, int hB>
    static void chroma(V rgLo, V rgHi, V bLo, V bHi, V& pairs, V& odd)
    {
        const V rg = alternate32<(fR & 0xFFFF) | (fG << 16), (hR & 0xFFFF) | (hG << 16)>(), b = alternate32<fB, hB>();
        const V lo = add32(madd16(rgLo, rg), madd16(bLo, b)), hi = add32(madd16(rgHi, rg), madd16(bHi, b));
        pairs = hadd32(lo, hi);
        odd = oddLanes32(lo, hi);
    }
    static Half terms(const V3& v)
    {
        const V rgLo = unpackLo16(v.c[0], v.c[1]), rgHi = unpackHi16(v.c[0], v.c[1]);
        const V bLo = unpackLo16(v.c[2], zero()), bHi = unpackHi16(v.c[2], zero());
        // Y: (R, G) and (B, 32) against (8422, 16515) and (3212, 16896): 16896 x 32 is the 540672.
        const V ky = splat32<8422 | (16515 << 16)>(), kb = splat32<3212 | (16896 << 16)>(), c32 = splat16<32>();
        const V ylo = shr32<15>(add32(madd16(rgLo, ky), madd16(unpackLo16(v.c[2], c32), kb)));
        const V yhi = shr32<15>(add32(madd16(rgHi, ky), madd16(unpackHi16(v.c[2], c32), kb)));
        Half h;
        h.y = packs32(ylo, yhi);
        chroma<-2426, -4769, 7193, -1213, -2385, 3596>(rgLo, rgHi, bLo, bHi, h.cb, h.hb);
        chroma<7193, -6030, -1164, 3596, -3015, -582>(rgLo, rgHi, bLo, bHi, h.cr, h.hr);
        return h;
    }
    static V finish(V pairs, V left) { return shr32<15>(add32(add32(pairs, left), splat32<4210687>())); }
    template <class C>
    static int groups(const SourcePass<typename C::Src>& sIn, const SampledPass& dIn, int u, int n)
    {
        using Src = typename C::Src;
        constexpr bool mapped = requires { typename Src::Map; };
        if constexpr (std::is_same_v<Src, InC3> || std::is_same_v<typename MappedBase<Src>::type, InC3>) {
            using Out = SampledGroupOut<typename C::Dst>;
            const SourcePass<typename C::Src> s = sIn;
            const SampledPass d = dIn;
            V lastB = zero(), lastR = zero(); // the half terms of the pixel left of this turn's first pair
            if (u > 0) {
                const Px left = C::Src::load(s.r[0], 2 * u - 1);
                lastB = splat32(T::hb(left));
                lastR = splat32(T::hr(left));
            }
            constexpr int per = kGroupPixels / 2;
            for (; u + per <= n; u += per) {
                const int x = 2 * u;
                V3 a, b;
                if constexpr (mapped) {
                    alignas(32) uint8_t bytes[3 * kGroupPixels];
                    const uint8_t* q = s.r[0].p[0] + 3 * static_cast<std::size_t>(x);
                    for (int i = 0; i < 3 * kGroupPixels; ++i)
                        bytes[i] = static_cast<uint8_t>(Src::Map::apply(q[i]));
                    GroupIo<InC3>::template get<0>(InC3::Row{{bytes}}, 0, a, b);
                } else {
                    GroupIo<InC3>::template get<0>(s.r[0], x, a, b);
                }
                const Half ha = terms(a), hb = terms(b);
                const V prevB = previousGroup(lastB, hb.hb), prevR = previousGroup(lastR, hb.hr);
                const V cb = packs32(finish(ha.cb, shiftIn32(ha.hb, prevB)), finish(hb.cb, shiftIn32(hb.hb, ha.hb)));
                const V cr = packs32(finish(ha.cr, shiftIn32(ha.hr, prevR)), finish(hb.cr, shiftIn32(hb.hr, ha.hr)));
                Out::chroma(d, x, u, cb, cr, packUs(ha.y, hb.y));
                lastB = hb.hb;
                lastR = hb.hr;
            }
        }
        return u;
    }
};
