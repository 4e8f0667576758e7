// The SIMD side of the conversions from sampled images, written once against the vocabulary of an
// instruction set and included inside its namespace after io_simd.inl: readers of each sampled source,
// and the kernel that runs a form's luma and chroma parts (InverseSimd) over whole groups of sixteen
// pixels a lane. Chroma terms are formed once a unit and spread to the unit's pixels by unpacking.

// Readers: `luma` gives the sixteen Y of row dy in a lane as pixels 0..7 and 8..15 in 16-bit lanes,
// `chroma` the Cb and Cr of the lane's units in 16-bit lanes (eight, or four for 4:1:1).
template <class Src>
struct SampledGroupIn;

template <Sampling S, bool CrFirst>
struct SampledGroupIn<InSampledP3<S, CrFirst>> {
    static void luma(const SampledRows& s, int dy, int x, V& a, V& b)
    {
        const V y = loadLanes(s.y[dy] + x, 16);
        a = unpackLo8(y, zero());
        b = unpackHi8(y, zero());
    }
    static void chroma(const SampledRows& s, int u, V& cb, V& cr)
    {
        constexpr int n = S == Sampling::S411 ? 4 : 8;
        cb = loadUnits<n>(s.c0 + u);
        cr = loadUnits<n>(s.c1 + u);
    }
};

template <bool CrFirst>
struct SampledGroupIn<InSampledP2<CrFirst>> {
    static void luma(const SampledRows& s, int dy, int x, V& a, V& b)
    {
        SampledGroupIn<InSampledP3<Sampling::S420>>::luma(s, dy, x, a, b);
    }
    static void chroma(const SampledRows& s, int u, V& cb, V& cr)
    {
        const V pairs = loadLanes(s.c0 + 2 * static_cast<std::size_t>(u), 16);
        const V first = and_(pairs, splat16<255>()), second = shrU<8>(pairs);
        cb = CrFirst ? second : first;
        cr = CrFirst ? first : second;
    }
};

template <const GroupOrder& G>
struct SampledGroupIn<InSampledC2<G>> {
    // Bytes y0, y0 + 2, ... of the group's two registers are the sixteen lumas.
    static void luma(const SampledRows& s, int, int x, V& a, V& b)
    {
        const uint8_t* q = s.y[0] + 2 * static_cast<std::size_t>(x);
        const V lo = loadLanes(q, 32), hi = loadLanes(q + 16, 32);
        a = G.y0 == 0 ? and_(lo, splat16<255>()) : shrU<8>(lo);
        b = G.y0 == 0 ? and_(hi, splat16<255>()) : shrU<8>(hi);
    }
    static void chroma(const SampledRows& s, int u, V& cb, V& cr)
    {
        const uint8_t* q = s.c0 + 4 * static_cast<std::size_t>(u);
        const V lo = loadLanes(q, 32), hi = loadLanes(q + 16, 32);
        cb = or_(shuffle(lo, maskOf(kGather<G.cb, 4, 0, 0>)), shuffle(hi, maskOf(kGather<G.cb, 4, 16, 0>)));
        cr = or_(shuffle(lo, maskOf(kGather<G.cr, 4, 0, 0>)), shuffle(hi, maskOf(kGather<G.cr, 4, 16, 0>)));
    }
};

template <class Form>
inline constexpr bool hasInverseSimd = requires { InverseSimd<Form>::shift; };

// A unit term to each pixel of its unit: pixels 0..7 of the lane in a, 8..15 in b.
template <int Uw>
inline void spread(V t, V& a, V& b)
{
    const V d = unpackLo16(t, t);
    if constexpr (Uw == 2) {
        a = d;
        b = unpackHi16(t, t);
    } else {
        a = unpackLo32(d, d);
        b = unpackHi32(d, d);
    }
}

// A form over whole groups of units [u, n) of a pass; returns the first unit not done. The rows and the
// call's values are copied first: the stores cannot change the copies, so they stay in registers.
template <class C, class Form>
int pixelGroups(const SampledRows& sIn, const PixelRows<typename C::Dst>& dIn, int u, int n, const Ctx& ctxIn)
{
    if constexpr (C::variant != 2 && hasInverseSimd<Form> && groupWritable<typename C::Dst>()) {
        using F = InverseSimd<Form>;
        using In = SampledGroupIn<typename C::Src>;
        const SampledRows s = sIn;
        const PixelRows<typename C::Dst> d = dIn;
        const Ctx ctx = ctxIn;
        constexpr int per = kGroupPixels / C::uw;
        for (; u + per <= n; u += per) {
            const int x = C::uw * u;
            V cb, cr;
            In::chroma(s, u, cb, cr);
            const InverseTerms t = F::chroma(cb, cr);
            V3 ta, tb;
            spread<C::uw>(t.r, ta.c[0], tb.c[0]);
            spread<C::uw>(t.g, ta.c[1], tb.c[1]);
            spread<C::uw>(t.b, ta.c[2], tb.c[2]);
            #pragma GCC unroll 2
            for (int dy = 0; dy < C::uh; ++dy) {
                V ya, yb;
                In::luma(s, dy, x, ya, yb);
                const V la = F::luma(ya), lb = F::luma(yb);
                V3 a, b;
                #pragma GCC unroll 3
                for (int k = 0; k < 3; ++k) {
                    a.c[k] = inverseChannel<Form>(la, ta.c[k]);
                    b.c[k] = inverseChannel<Form>(lb, tb.c[k]);
                }
                a.extra = b.extra = zero();
                GroupIo<typename C::Dst>::put(d.r[dy], x, a, b, ctx);
            }
        }
    }
    return u;
}

// The block form (or the remainder form) over whole groups of units [u, n).
template <class C>
int pixelFormGroups(const SampledRows& s, const PixelRows<typename C::Dst>& d, int u, int n, bool remainder, const Ctx& ctx)
{
    return remainder ? pixelGroups<C, typename C::Rem>(s, d, u, n, ctx) : pixelGroups<C, typename C::Block>(s, d, u, n, ctx);
}
