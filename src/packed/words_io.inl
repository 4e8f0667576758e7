// Readers and writers of word images for the generic block kernels, written once against the vector
// vocabulary and included inside the namespace of each instruction set (and, for AVX2, of its 128-bit
// half). Words travel as 16-bit lanes: a group of sixteen a lane, a = words 0..7, b = 8..15.

template <class F>
struct WordLanes {
    // The three fields of eight words, each at the top of the low byte of its lane (bare shift).
    static V3 fields(V w)
    {
        V3 v;
        v.c[0] = shl<8 - F::low>(and_(w, splat16((1 << F::low) - 1)));
        v.c[1] = shl<8 - F::mid>(and_(shrU<F::low>(w), splat16((1 << F::mid) - 1)));
        v.c[2] = shl<8 - F::high>(and_(shrU<F::low + F::mid>(w), splat16((1 << F::high) - 1)));
        v.extra = zero();
        return v;
    }
    // Eight words from channels limited to 0..255 and reduced by truncating shifts.
    template <int LowChannel>
    static V word(const V3& v)
    {
        auto clip = [](V x) { return max16(min16(x, splat16(255)), zero()); };
        const V lo = shrU<8 - F::low>(clip(v.c[LowChannel]));
        const V mid = shrU<8 - F::mid>(clip(v.c[1]));
        const V hi = shrU<8 - F::high>(clip(v.c[2 - LowChannel]));
        return or_(or_(lo, shl<F::low>(mid)), shl<F::low + F::mid>(hi));
    }
    // One channel at 256 x (c8 = c << 8, c in 0..255) quantised against the thresholds t: q = (n c) >> 8 as
    // the high half of c8 times n, e = (c << 8) - s q, and q + 1 where e is above the threshold. e lies in
    // 0..4352, so a signed compare serves, and its all-ones lanes subtract as 1.
    template <int Bits>
    static V quantised(V c8, V t)
    {
        using Ch = dither::Channel<Bits>;
        const V q = mulHighU(c8, splat16(Ch::n));
        const V e = sub(c8, mulLo(q, splat16(Ch::s)));
        return sub(q, cmpGt16(e, Ch::thresholdShift ? shrU<1>(t) : t));
    }
    template <int LowChannel>
    static V fieldsToWord(const V (&f)[3])
    {
        return or_(or_(f[LowChannel], shl<F::low>(f[1])), shl<F::low + F::mid>(f[2 - LowChannel]));
    }
    // Sixteen dithered words from two vectors of pixels: each channel limited to 0..255 by packing it to
    // bytes, and unpacked again to 256 x.
    template <int LowChannel>
    [[gnu::always_inline]] static void ditheredWords(const V3& a, const V3& b, V t, V& wa, V& wb)
    {
        V fa[3], fb[3];
        auto channel = [&]<int K, int Bits>() {
            const V bytes = packUs(a.c[K], b.c[K]);
            fa[K] = quantised<Bits>(unpackLo8(zero(), bytes), t);
            fb[K] = quantised<Bits>(unpackHi8(zero(), bytes), t);
        };
        channel.template operator()<LowChannel, F::low>();
        channel.template operator()<1, F::mid>();
        channel.template operator()<2 - LowChannel, F::high>();
        wa = fieldsToWord<LowChannel>(fa);
        wb = fieldsToWord<LowChannel>(fb);
    }
};

// The thresholds of the eight columns from x, for every group of a row: groups start a multiple of 8
// columns apart, so one rotation of the tile row serves all lanes.
template <class L>
inline V ditherLanes(const typename L::Row& row, int x)
{
    return loadLanes(reinterpret_cast<const uint8_t*>(row.lanes[x & 3]), 0);
}

// The fields of eight words with the low field in channel L.
template <class F, int L>
inline V3 wordChannels(V w)
{
    V3 v = WordLanes<F>::fields(w);
    if constexpr (L == 2)
        std::swap(v.c[0], v.c[2]);
    return v;
}

template <class F, int L>
struct GroupIo<InWord<F, L>> {
    template <int Shift>
    static void get(const typename InWord<F, L>::Row& row, int x, V3& a, V3& b)
    {
        static_assert(Shift == 0, "words fill the low byte of their lanes");
        const uint8_t* q = row.p[0] + 2 * static_cast<std::size_t>(x);
        a = wordChannels<F, L>(loadLanes(q, 32));
        b = wordChannels<F, L>(loadLanes(q + 16, 32));
    }
};

template <class Src>
struct GroupIo<InEvenPairStep<Src>> : GroupIo<Src> {};

template <class F, int LowChannel>
struct GroupIo<OutWord<F, LowChannel>> {
    [[gnu::always_inline]] static void put(const typename OutWord<F, LowChannel>::Row& row, int x, const V3& a, const V3& b, const Ctx&)
    {
        uint8_t* q = row.p[0] + 2 * static_cast<std::size_t>(x);
        storeLanes(q, 32, WordLanes<F>::template word<LowChannel>(a));
        storeLanes(q + 16, 32, WordLanes<F>::template word<LowChannel>(b));
    }
};

template <class F, int LowChannel>
struct GroupIo<OutDitherWord<F, LowChannel>> {
    using D = OutDitherWord<F, LowChannel>;
    [[gnu::always_inline]] static void put(const typename D::Row& row, int x, const V3& a, const V3& b, const Ctx&)
    {
        uint8_t* q = row.p[0] + 2 * static_cast<std::size_t>(x);
        V wa, wb;
        WordLanes<F>::template ditheredWords<LowChannel>(a, b, ditherLanes<D>(row, x), wa, wb);
        storeLanes(q, 32, wa);
        storeLanes(q + 16, 32, wb);
    }
};
