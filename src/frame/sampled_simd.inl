// The SIMD side of the sampled conversions, written once against the vocabulary of an instruction set
// and included inside its namespace after io_simd.inl: a family's unit forms over vectors, the writers of
// each sampled destination, and the kernel that runs them over whole groups of sixteen pixels a lane
// (eight units of 2 x 1 or 2 x 2).

// A family's block form over vectors, in two parts so that a row's pixels are done with before the next
// row is read: `luma(v)` gives a luma term of each pixel of v (samples in the low byte of 16-bit lanes)
// and `lumaOut(t)` its Y before clip8; `chroma(sums, lumaSums, cb, cr)` gives the units' Cb and Cr from
// the channel sums of each unit and, where the form declares `lumaSums`, the sums of the luma terms.
// `pixels` is its unit's size (4: 2x2 or 4x1, 2: 2x1).
template <class Form>
struct SimdUnit;

template <class Form>
consteval int simdUnitPixels()
{
    if constexpr (requires { SimdUnit<Form>::pixels; })
        return SimdUnit<Form>::pixels;
    else
        return 0;
}

template <class Form>
consteval bool simdLumaSums()
{
    if constexpr (requires { SimdUnit<Form>::lumaSums; })
        return SimdUnit<Form>::lumaSums;
    else
        return false;
}

// Units' first and second chroma bytes interleaved: c0 c1 c0 c1 ... from a register of eight c0 then
// eight c1 in each lane.
inline constexpr Bytes16 kPairUp{{0, 8, 1, 9, 2, 10, 3, 11, 4, 12, 5, 13, 6, 14, 7, 15}};

template <class Dst>
struct SampledGroupOut;

// Writers: `luma` stores the sixteen lumas a lane of row r (as bytes), `chroma` the units' pairs.
template <Sampling S>
struct SampledGroupOut<OutSampledP3<S>> {
    static void luma(const SampledPass& d, int r, int x, V y) { storeLanes(d.y[r] + x, 16, y); }
    static void chroma(const SampledPass& d, int, int u, V cb, V cr, V)
    {
        const V c = packUs(cb, cr);
        if constexpr (S == Sampling::S411) { // four units a lane, repeated in the upper half of each part
            storeQuarters<0>(d.c0 + u, 4, c);
            storeQuarters<8>(d.c1 + u, 4, c);
        } else {
            storeLowHalves(d.c0 + u, 8, c);
            storeHighHalves(d.c1 + u, 8, c);
        }
    }
};

template <Sampling S>
struct SampledGroupOut<OutSampledP2<S>> {
    static void luma(const SampledPass& d, int r, int x, V y) { storeLanes(d.y[r] + x, 16, y); }
    static void chroma(const SampledPass& d, int, int u, V cb, V cr, V)
    {
        storeLanes(d.c0 + 2 * static_cast<std::size_t>(u), 16, shuffle(packUs(cb, cr), maskOf(kPairUp)));
    }
};

template <const GroupOrder& G>
struct SampledGroupOut<OutSampledC2<G>> {
    // The lumas go out with the chroma, in one pass over the group's bytes.
    static void luma(const SampledPass&, int, int, V) {}
    static void chroma(const SampledPass& d, int x, int, V cb, V cr, V luma)
    {
        const bool crFirst = G.cr < G.cb;
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

// A form over whole groups of units [u, n) of a pass; returns the first unit not done. Each row's lumas
// are stored as soon as they are formed; the channel sums of its units (pairs of neighbouring lanes)
// are carried to the chroma. A form that keeps sums of its own declares `Acc` and forms a row's lumas
// with `row(acc, r, a, b)`; the others give luma terms, and their sums where they declare `lumaSums`.
template <class C, class Form>
int sampledGroups(const SourcePass<typename C::Src>& sIn, const SampledPass& dIn, int u, int n)
{
    using F = SimdUnit<Form>;
    using Out = SampledGroupOut<typename C::Dst>;
    constexpr int rows = C::uh;
    if constexpr (requires { F::template groups<C>(sIn, dIn, u, n); }) { // a form with a walk of its own
        return F::template groups<C>(sIn, dIn, u, n);
    } else if constexpr (C::variant != 2 && simdUnitPixels<Form>() == C::uw * C::uh) {
        constexpr bool ownSums = requires { typename F::Acc; };
        using Acc = decltype([] {
            if constexpr (ownSums)
                return typename F::Acc{};
            else
                return V{};
        }());
        const SourcePass<typename C::Src> s = sIn;
        const SampledPass d = dIn;
        constexpr int per = kGroupPixels / C::uw;
        for (; u + per <= n; u += per) {
            const int x = C::uw * u;
            V sum[3], y = zero();
            Acc acc{};
            #pragma GCC unroll 2
            for (int r = 0; r < rows; ++r) {
                V3 a, b;
                GroupIo<typename C::Src>::template get<0>(s.r[r], x, a, b);
                if constexpr (requires { F::prepare(a); }) { // a form that first maps its samples
                    F::prepare(a);
                    F::prepare(b);
                }
                if constexpr (ownSums) {
                    y = F::row(acc, r, a, b);
                } else {
                    const V ta = F::luma(a), tb = F::luma(b);
                    y = packUs(F::lumaOut(ta), F::lumaOut(tb));
                    if constexpr (simdLumaSums<Form>())
                        acc = r == 0 ? hadd(ta, tb) : add(acc, hadd(ta, tb));
                }
                Out::luma(d, r, x, y);
                #pragma GCC unroll 3
                for (int k = 0; k < 3; ++k)
                    sum[k] = r == 0 ? hadd(a.c[k], b.c[k]) : add(sum[k], hadd(a.c[k], b.c[k]));
            }
            if constexpr (C::uw == 4) { // sums of four neighbouring lanes, each lane's four units twice
                #pragma GCC unroll 3
                for (int k = 0; k < 3; ++k)
                    sum[k] = hadd(sum[k], sum[k]);
                if constexpr (simdLumaSums<Form>())
                    acc = hadd(acc, acc);
            }
            V cb, cr;
            F::chroma(V3{{sum[0], sum[1], sum[2]}, zero()}, acc, cb, cr);
            Out::chroma(d, x, u, cb, cr, y);
        }
    }
    return u;
}

// The block form (or the remainder form) over whole groups of units [u, n).
template <class C>
int sampledFormGroups(const SourcePass<typename C::Src>& s, const SampledPass& d, int u, int n, bool remainder)
{
    return remainder ? sampledGroups<C, typename C::Rem>(s, d, u, n) : sampledGroups<C, typename C::Block>(s, d, u, n);
}
