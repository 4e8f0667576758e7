// The 128-bit side of the block kernels, written once and included inside the namespace of each set
// that runs 128-bit groups (after io_simd.inl): the eight-pixel reader and writer, and the tail of a run
// of block pixels after its whole groups.

// Eight pixels: the first half of a group.
template <class L>
struct Io8;

template <int Bpp, Order O>
struct Io8<InPacked<Bpp, O>> {
    template <int Shift>
    static V3 get(const typename InPacked<Bpp, O>::Row& row, int x)
    {
        const uint8_t* q = row.p[0] + static_cast<std::size_t>(x) * Bpp;
        return GroupIo<InPacked<Bpp, O>>::template split<0, 0, Shift>(load16(q), Bpp == 4 ? load16(q + 16) : load8(q + 16));
    }
};

template <int P>
struct Io8<InPlanar<P>> {
    template <int Shift>
    static V3 get(const typename InPlanar<P>::Row& row, int x)
    {
        using G = GroupIo<InPlanar<P>>;
        V3 v;
        #pragma GCC unroll 3
        for (int k = 0; k < 3; ++k)
            v.c[k] = G::template widenLo<Shift>(load8(row.p[k] + x));
        v.extra = P == 4 ? G::template widenLo<0>(load8(row.p[3] + x)) : zero();
        return v;
    }
};

template <int P>
struct Io8<InPlanar<P, int16_t>> {
    template <int Shift>
    static V3 get(const typename InPlanar<P, int16_t>::Row& row, int x)
    {
        static_assert(Shift == 0, "16-bit samples fill their lanes");
        V3 v;
#pragma GCC unroll 3
        for (int k = 0; k < 3; ++k)
            v.c[k] = load16(row.p[k] + 2 * static_cast<std::size_t>(x));
        v.extra = zero();
        return v;
    }
};

template <int Bpp, Order O, Fourth F>
struct Io8<OutPacked<Bpp, O, F>> {
    static void put(const typename OutPacked<Bpp, O, F>::Row& row, int x, const V3& v, const Ctx& ctx)
    {
        uint8_t* q = row.p[0] + static_cast<std::size_t>(x) * Bpp;
        // a holds channels 0 and 1 (bytes 0..7, 8..15), b channel 2 and the fourth byte (0..7, 8..15).
        const V a = packUs(v.c[0], v.c[1]);
        const V b = packUs(v.c[2], GroupIo<OutPacked<Bpp, O, F>>::fourthOf(v, ctx));
        auto part = [&]<int Base>() {
            V r = or_(shuffle(a, maskOf(kScatter<Bpp, Base, channelByte(O, 0), 0>)),
                      shuffle(a, maskOf(kScatter<Bpp, Base, channelByte(O, 1), 8>)));
            r = or_(r, shuffle(b, maskOf(kScatter<Bpp, Base, channelByte(O, 2), 0>)));
            if constexpr (Bpp == 4)
                r = or_(r, shuffle(b, maskOf(kScatter<4, Base, 3, 8>)));
            return r;
        };
        store16(q, part.template operator()<0>());
        if constexpr (Bpp == 4)
            store16(q + 16, part.template operator()<16>());
        else
            store8(q + 16, part.template operator()<16>());
    }
};

template <Order O>
struct Io8<OutPacked<4, O, Fourth::Alpha, int16_t>> {
    static void put(const typename OutPacked<4, O, Fourth::Alpha, int16_t>::Row& row, int x, const V3& v, const Ctx& ctx)
    {
        GroupIo<OutPacked<4, O, Fourth::Alpha, int16_t>>::put8(row.p[0] + static_cast<std::size_t>(x) * 8, 0, v,
                                                               splat16(ctx.alpha));
    }
};

template <int P>
struct Io8<OutPlanar<P>> {
    static void put(const typename OutPlanar<P>::Row& row, int x, const V3& v, const Ctx&)
    {
        #pragma GCC unroll 3
        for (int k = 0; k < 3; ++k)
            store8(row.p[k] + x, packUs(v.c[k], v.c[k]));
        if constexpr (P == 4)
            store8(row.p[3] + x, packUs(v.extra, v.extra));
    }
};

// A group of fewer than eight pixels (the 4-pixel blocks of N = 4 rows): staged through small buffers
// so that no vector access leaves the region. run8(src, dst) converts the eight pixels at the start of
// the staged rows.
template <class C, class Run8>
void stagedGroup(const typename C::Src::Row& s, const typename C::Dst::Row& d, int x, int count, Run8&& run8)
{
    using Src = typename C::Src;
    using Dst = typename C::Dst;
    // Room for the eight pixels the run reads and writes.
    alignas(16) uint8_t in[Src::planes][8 * Src::bytesPerPixel] = {};
    alignas(16) uint8_t out[Dst::planes][8 * Dst::bytesPerPixel] = {};
    typename Src::Row ls;
    typename Dst::Row ld;
    for (int p = 0; p < Src::planes; ++p) {
        std::memcpy(in[p], s.p[p] + static_cast<std::size_t>(x) * Src::bytesPerPixel,
                    static_cast<std::size_t>(count) * Src::bytesPerPixel);
        ls.p[p] = in[p];
    }
    for (int p = 0; p < Dst::planes; ++p)
        ld.p[p] = out[p];
    run8(ls, ld);
    for (int p = 0; p < Dst::planes; ++p)
        std::memcpy(d.p[p] + static_cast<std::size_t>(x) * Dst::bytesPerPixel, out[p],
                    static_cast<std::size_t>(count) * Dst::bytesPerPixel);
}

// The tail of a run of block pixels after its whole groups, x on: one group of eight, then a staged
// group of four. run8(src, dst, at) converts the eight pixels at `at`.
template <class C, class Run8>
void eightThenStaged(const typename C::Src::Row& s, const typename C::Dst::Row& d, int x, int n, Run8&& run8)
{
    if (x + 8 <= n) {
        run8(s, d, x);
        x += 8;
    }
    if (x < n)
        stagedGroup<C>(s, d, x, n - x, [&](const auto& s8, const auto& d8) { run8(s8, d8, 0); });
}
