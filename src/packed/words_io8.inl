// Eight words at a time, for the shorter groups of the 128-bit block kernels (after conv128.inl).

template <class F, int L>
struct Io8<InWord<F, L>> {
    template <int Shift>
    static V3 get(const typename InWord<F, L>::Row& row, int x)
    {
        static_assert(Shift == 0, "words fill the low byte of their lanes");
        return wordChannels<F, L>(load16(row.p[0] + 2 * static_cast<std::size_t>(x)));
    }
};

template <class F, int LowChannel>
struct Io8<OutWord<F, LowChannel>> {
    static void put(const typename OutWord<F, LowChannel>::Row& row, int x, const V3& v, const Ctx&)
    {
        store16(row.p[0] + 2 * static_cast<std::size_t>(x), WordLanes<F>::template word<LowChannel>(v));
    }
};

template <class F, int LowChannel>
struct Io8<OutDitherWord<F, LowChannel>> {
    using D = OutDitherWord<F, LowChannel>;
    static void put(const typename D::Row& row, int x, const V3& v, const Ctx&)
    {
        V w, unused;
        WordLanes<F>::template ditheredWords<LowChannel>(v, v, ditherLanes<D>(row, x), w, unused);
        store16(row.p[0] + 2 * static_cast<std::size_t>(x), w);
    }
};
