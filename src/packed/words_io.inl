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
    // One channel quantised against the thresholds t: q = (n c) >> 8 as the high half of c times 256 n,
    // e = (c << 8) - s q, and q + 1 where e is above the threshold. e lies in 0..4352, so a signed compare
    // serves, and its all-ones lanes subtract as 1.
    template <int Bits>
    static V quantised(V c, V t)
    {
        using Ch = dither::Channel<Bits>;
        const V q = mulHighU(c, splat16(Ch::n << 8));
        const V e = sub(shl<8>(c), mulLo(q, splat16(Ch::s)));
        return sub(q, cmpGt16(e, Ch::thresholdShift ? shrU<1>(t) : t));
    }
    // Eight dithered words, channels limited to 0..255 first.
    template <int LowChannel>
    static V ditheredWord(const V3& v, V t)
    {
        auto clip = [](V x) { return max16(min16(x, splat16(255)), zero()); };
        const V lo = quantised<F::low>(clip(v.c[LowChannel]), t);
        const V mid = quantised<F::mid>(clip(v.c[1]), t);
        const V hi = quantised<F::high>(clip(v.c[2 - LowChannel]), t);
        return or_(or_(lo, shl<F::low>(mid)), shl<F::low + F::mid>(hi));
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
    static void put(const typename OutWord<F, LowChannel>::Row& row, int x, const V3& a, const V3& b, const Ctx&)
    {
        uint8_t* q = row.p[0] + 2 * static_cast<std::size_t>(x);
        storeLanes(q, 32, WordLanes<F>::template word<LowChannel>(a));
        storeLanes(q + 16, 32, WordLanes<F>::template word<LowChannel>(b));
    }
};

template <class F, int LowChannel>
struct GroupIo<OutDitherWord<F, LowChannel>> {
    using D = OutDitherWord<F, LowChannel>;
    static void put(const typename D::Row& row, int x, const V3& a, const V3& b, const Ctx&)
    {
        uint8_t* q = row.p[0] + 2 * static_cast<std::size_t>(x);
        const V t = ditherLanes<D>(row, x);
        storeLanes(q, 32, WordLanes<F>::template ditheredWord<LowChannel>(a, t));
        storeLanes(q + 16, 32, WordLanes<F>::template ditheredWord<LowChannel>(b, t));
    }
};
