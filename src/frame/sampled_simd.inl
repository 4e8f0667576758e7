// The SIMD side of the sampled conversions, written once against the vocabulary of an instruction set
// and included inside its namespace after io_simd.inl: a family's unit forms over vectors, the writers of
// each sampled destination, and the kernel that runs them over whole groups of sixteen pixels a lane
// (eight units of 2 x 1 or 2 x 2).

// A family's block form over the units of one group: a[r], b[r] hold pixels 0..7 and 8..15 of source row
// r (samples in the low byte of 16-bit lanes); the form gives each row's luma (y[r][0] for a, y[r][1]
// for b) and the eight units' Cb and Cr in 16-bit lanes, all before clip8. `rows` is its unit height.
template <class Form>
struct SimdUnit;

template <class Form>
consteval int simdUnitRows()
{
    if constexpr (requires { SimdUnit<Form>::rows; })
        return SimdUnit<Form>::rows;
    else
        return 0;
}

// The channel sums of each unit of a group: pairs of neighbouring lanes, over one or two rows.
template <int Rows>
inline V3 unitSums(const V3* a, const V3* b)
{
    V3 s;
    #pragma GCC unroll 3
    for (int k = 0; k < 3; ++k) {
        s.c[k] = hadd(a[0].c[k], b[0].c[k]);
        if constexpr (Rows == 2)
            s.c[k] = add(s.c[k], hadd(a[1].c[k], b[1].c[k]));
    }
    s.extra = zero();
    return s;
}

// Units' first and second chroma bytes interleaved: c0 c1 c0 c1 ... from a register of eight c0 then
// eight c1 in each lane.
inline constexpr Bytes16 kPairUp{{0, 8, 1, 9, 2, 10, 3, 11, 4, 12, 5, 13, 6, 14, 7, 15}};

template <class Dst>
struct SampledGroupOut;

template <Sampling S>
struct SampledGroupOut<OutSampledP3<S>> {
    template <int Rows>
    static void put(const SampledPass& d, int x, int u, const V (&y)[2][2], V cb, V cr)
    {
        #pragma GCC unroll 2
        for (int r = 0; r < Rows; ++r)
            storeLanes(d.y[r] + x, 16, packUs(y[r][0], y[r][1]));
        const V c = packUs(cb, cr);
        storeLowHalves(d.c0 + u, 8, c);
        storeHighHalves(d.c1 + u, 8, c);
    }
};

template <Sampling S>
struct SampledGroupOut<OutSampledP2<S>> {
    template <int Rows>
    static void put(const SampledPass& d, int x, int u, const V (&y)[2][2], V cb, V cr)
    {
        #pragma GCC unroll 2
        for (int r = 0; r < Rows; ++r)
            storeLanes(d.y[r] + x, 16, packUs(y[r][0], y[r][1]));
        storeLanes(d.c0 + 2 * static_cast<std::size_t>(u), 16, shuffle(packUs(cb, cr), maskOf(kPairUp)));
    }
};

template <const GroupOrder& G>
struct SampledGroupOut<OutSampledC2<G>> {
    template <int Rows>
    static void put(const SampledPass& d, int x, int, const V (&y)[2][2], V cb, V cr)
    {
        const bool crFirst = G.cr < G.cb;
        const V luma = packUs(y[0][0], y[0][1]);
        const V pairs = shuffle(crFirst ? packUs(cr, cb) : packUs(cb, cr), maskOf(kPairUp));
        uint8_t* q = d.y[0] + 2 * static_cast<std::size_t>(x);
        if constexpr (G.y0 == 0) {
            storeLanes(q, 32, unpackLo8(luma, pairs));
            storeLanes(q + 16, 32, unpackHi8(luma, pairs));
        } else {
            storeLanes(q, 32, unpackLo8(pairs, luma));
            storeLanes(q + 16, 32, unpackHi8(pairs, luma));
        }
    }
};

// The block form over whole groups of units [u, n) of a pass; returns the first unit not done.
template <class C>
int sampledGroups(const SourcePass<typename C::Src>& sIn, const SampledPass& dIn, int u, int n)
{
    using F = typename C::Block;
    constexpr int rows = simdUnitRows<F>();
    if constexpr (C::variant != 2 && rows == C::uh && C::uw == 2) {
        const SourcePass<typename C::Src> s = sIn;
        const SampledPass d = dIn;
        constexpr int per = kGroupPixels / 2;
        for (; u + per <= n; u += per) {
            const int x = 2 * u;
            V3 a[2], b[2];
            #pragma GCC unroll 2
            for (int r = 0; r < rows; ++r)
                GroupIo<typename C::Src>::template get<0>(s.r[r], x, a[r], b[r]);
            V y[2][2], cb, cr;
            SimdUnit<F>::apply(a, b, y, cb, cr);
            SampledGroupOut<typename C::Dst>::template put<rows>(d, x, u, y, cb, cr);
        }
    }
    return u;
}
