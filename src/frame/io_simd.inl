// The generic SIMD side of a conversion, written once against the vocabulary of an instruction set and
// included inside its namespace: the pixel vectors, the hook for a family's block forms, and readers and
// writers that move sixteen pixels through each 128-bit lane of a vector. Samples travel in 16-bit lanes
// (values in the low byte, or at 256 x when a form asks), and are written back with unsigned
// saturation (clip8).
//
// The vocabulary: V, zero(), maskOf(Bytes16), shuffle, or_, packUs, unpackLo8/Hi8, unpackLo16/Hi16,
// splat16(int), loadLanes(q, g) / storeLanes(q, g, v), which move 16 bytes at q for the first lane
// and 16 bytes at q + g for the next one (the next group of sixteen pixels, g bytes on), and
// kGroupPixels, the pixels of one turn (sixteen a lane).

// The pixels of one vector: three colour channels and the carried fourth byte.
struct V3 {
    V c[3];
    V extra;
};

// A family's block form, in place; results leave in 16-bit lanes before clip8. A form that wants its
// samples at 256 x declares `static constexpr int inputShift = 8`.
template <class Form>
struct Simd;

template <class Form>
constexpr int inputShiftOf()
{
    if constexpr (requires { Simd<Form>::inputShift; })
        return Simd<Form>::inputShift;
    else
        return 0;
}
template <class Form>
inline constexpr int inputShift = inputShiftOf<Form>();

// A form from Y, Cb, Cr to R, G, B in two parts, so that chroma can be formed once for every pixel that
// shares it: `luma(y)` gives each pixel's luma term from Y, `chroma(cb, cr)` the R, G and B terms from
// the raw chroma samples (all in the low byte of 16-bit lanes), and each channel is (luma term + chroma
// term) >> shift before clip8.
struct InverseTerms {
    V r, g, b;
};

template <class Form>
struct InverseSimd;

template <class Form>
inline V inverseChannel(V luma, V term)
{
    constexpr int s = InverseSimd<Form>::shift;
    if constexpr (s == 0)
        return add(luma, term);
    else
        return shr<s>(add(luma, term));
}

// The form on whole pixels (full-resolution rows): Y, Cb, Cr in, R, G, B out before clip8.
template <class Form>
inline void applyInverse(V3& v)
{
    using F = InverseSimd<Form>;
    const InverseTerms t = F::chroma(v.c[1], v.c[2]);
    const V l = F::luma(v.c[0]);
    v.c[0] = inverseChannel<Form>(l, t.r);
    v.c[1] = inverseChannel<Form>(l, t.g);
    v.c[2] = inverseChannel<Form>(l, t.b);
}

// The kernel of a form that has no hand-written SIMD form (it declares `compilerVectorised`): the form
// itself over the block columns, compiled with this set's flags and vectorised by the compiler. Every
// call inside is inlined (flatten), so that no shared inline function is emitted with this set's
// instructions.
template <class Form>
inline constexpr bool compilerVectorised = requires { requires Form::compilerVectorised; };

// A destination the group writers serve: every layout but four-channel pixels whose fourth channel is
// neither read nor written (rows into those run the compiler's vectorisation of the block form).
template <class L>
consteval bool groupWritable()
{
    if constexpr (requires { L::fourth; })
        return L::fourth != Fourth::Keep;
    else
        return true;
}

template <class C, class Form = typename C::Block>
[[gnu::flatten]] void compiledBlocks(const typename C::Src::Row& sRow, const typename C::Dst::Row& dRow, int n,
                                     const Ctx& ctxIn)
{
    const typename C::Src::Row s = sRow;
    const typename C::Dst::Row d = dRow;
    const Ctx ctx = ctxIn;
    for (int x = 0; x < n; ++x)
        C::Dst::store(d, x, Form::apply(C::Src::load(s, x)), ctx);
}

// Readers and writers of sixteen pixels a lane: `a` holds pixels 0..7 of each lane's group, `b` 8..15.
template <class L>
struct GroupIo;

template <int Bpp, Order O>
struct GroupIo<InPacked<Bpp, O>> {
    // Lanes of the pixels whose bytes start at `First` of the register pair lo (at Base), hi (Base + 16).
    template <int First, int Base, int Shift>
    static V gather(V lo, V hi)
    {
        return or_(shuffle(lo, maskOf(kGather<First, Bpp, Base, Shift>)),
                   shuffle(hi, maskOf(kGather<First, Bpp, Base + 16, Shift>)));
    }
    template <int Start, int Base, int Shift>
    static V3 split(V lo, V hi)
    {
        return {{gather<Start + channelByte(O, 0), Base, Shift>(lo, hi), gather<Start + channelByte(O, 1), Base, Shift>(lo, hi),
                 gather<Start + channelByte(O, 2), Base, Shift>(lo, hi)},
                Bpp == 4 ? gather<Start + 3, Base, 0>(lo, hi) : zero()};
    }
    template <int Shift>
    static void get(const typename InPacked<Bpp, O>::Row& row, int x, V3& a, V3& b)
    {
        constexpr std::size_t g = 16 * Bpp;
        const uint8_t* q = row.p[0] + static_cast<std::size_t>(x) * Bpp;
        const V r0 = loadLanes(q, g), r1 = loadLanes(q + 16, g), r2 = loadLanes(q + 32, g);
        a = split<0, 0, Shift>(r0, r1);
        if constexpr (Bpp == 3)
            b = split<24, 16, Shift>(r1, r2); // pixels 8..15: bytes 24..47
        else
            b = split<32, 32, Shift>(r2, loadLanes(q + 48, g));
    }
};

template <int P>
struct GroupIo<InPlanar<P>> {
    template <int Shift>
    static V widenLo(V x)
    {
        return Shift == 0 ? unpackLo8(x, zero()) : unpackLo8(zero(), x);
    }
    template <int Shift>
    static V widenHi(V x)
    {
        return Shift == 0 ? unpackHi8(x, zero()) : unpackHi8(zero(), x);
    }
    template <int Shift>
    static void get(const typename InPlanar<P>::Row& row, int x, V3& a, V3& b)
    {
        #pragma GCC unroll 3
        for (int k = 0; k < 3; ++k) {
            const V r = loadLanes(row.p[k] + x, 16);
            a.c[k] = widenLo<Shift>(r);
            b.c[k] = widenHi<Shift>(r);
        }
        if constexpr (P == 4) {
            const V r = loadLanes(row.p[3] + x, 16);
            a.extra = widenLo<0>(r);
            b.extra = widenHi<0>(r);
        } else {
            a.extra = b.extra = zero();
        }
    }
};

// Planes of 16-bit signed samples, taken as they are into the lanes (no shift).
template <int P>
struct GroupIo<InPlanar<P, int16_t>> {
    static_assert(P == 3);
    template <int Shift>
    static void get(const typename InPlanar<P, int16_t>::Row& row, int x, V3& a, V3& b)
    {
        static_assert(Shift == 0, "16-bit samples fill their lanes");
        constexpr std::size_t g = 32; // the next group of sixteen samples
#pragma GCC unroll 3
        for (int k = 0; k < 3; ++k) {
            const uint8_t* q = row.p[k] + 2 * static_cast<std::size_t>(x);
            a.c[k] = loadLanes(q, g);
            b.c[k] = loadLanes(q + 16, g);
        }
        a.extra = b.extra = zero();
    }
};

template <int Bpp, Order O, Fourth F>
struct GroupIo<OutPacked<Bpp, O, F>> {
    static_assert(F != Fourth::Keep, "a kept fourth byte is never written: such rows have no block kernel");
    // The fourth byte of each pixel, in 16-bit lanes.
    static V fourthOf(const V3& v, const Ctx& ctx)
    {
        if constexpr (F == Fourth::Alpha)
            return splat16(ctx.alpha);
        else if constexpr (F == Fourth::Zero)
            return zero();
        else
            return v.extra;
    }
    // Each channel packed once to sixteen bytes a lane, then interleaved.
    static void put(const typename OutPacked<Bpp, O, F>::Row& row, int x, const V3& a, const V3& b, const Ctx& ctx)
    {
        uint8_t* q = row.p[0] + static_cast<std::size_t>(x) * Bpp;
        V ch[3];
        #pragma GCC unroll 3
        for (int k = 0; k < 3; ++k)
            ch[k] = packUs(a.c[channelByte(O, k)], b.c[channelByte(O, k)]); // ch[slot]: bytes of that slot
        if constexpr (Bpp == 3) {
            auto part = [&]<int Base>() {
                return or_(or_(shuffle(ch[0], maskOf(kScatter<3, Base, 0, 0>)), shuffle(ch[1], maskOf(kScatter<3, Base, 1, 0>))),
                           shuffle(ch[2], maskOf(kScatter<3, Base, 2, 0>)));
            };
            const V parts[3] = {part.template operator()<0>(), part.template operator()<16>(), part.template operator()<32>()};
            storeAdjacent(q, parts);
        } else {
            const V c3 = packUs(fourthOf(a, ctx), fourthOf(b, ctx));
            const V lo01 = unpackLo8(ch[0], ch[1]), hi01 = unpackHi8(ch[0], ch[1]);
            const V lo23 = unpackLo8(ch[2], c3), hi23 = unpackHi8(ch[2], c3);
            const V parts[4] = {unpackLo16(lo01, lo23), unpackHi16(lo01, lo23), unpackLo16(hi01, hi23), unpackHi16(hi01, hi23)};
            storeAdjacent(q, parts);
        }
    }
};

// Four 16-bit signed samples a pixel, the fourth the call's alpha: each eight pixels are interleaved by
// 16- and 32-bit unpacks into four stores.
template <Order O>
struct GroupIo<OutPacked<4, O, Fourth::Alpha, int16_t>> {
    using L = OutPacked<4, O, Fourth::Alpha, int16_t>;
    // Pixels 0..7 of each lane's group from the lanes of v, at q (the next group g bytes on).
    static void put8(uint8_t* q, std::size_t g, const V3& v, V alpha)
    {
        const V s0 = v.c[channelByte(O, 0) == 0 ? 0 : 2], s1 = v.c[1], s2 = v.c[channelByte(O, 0) == 0 ? 2 : 0];
        const V lo01 = unpackLo16(s0, s1), hi01 = unpackHi16(s0, s1);
        const V lo23 = unpackLo16(s2, alpha), hi23 = unpackHi16(s2, alpha);
        storeLanes(q, g, unpackLo32(lo01, lo23));
        storeLanes(q + 16, g, unpackHi32(lo01, lo23));
        storeLanes(q + 32, g, unpackLo32(hi01, hi23));
        storeLanes(q + 48, g, unpackHi32(hi01, hi23));
    }
    static void put(const typename L::Row& row, int x, const V3& a, const V3& b, const Ctx& ctx)
    {
        constexpr std::size_t g = 16 * 8;
        uint8_t* q = row.p[0] + static_cast<std::size_t>(x) * 8;
        const V alpha = splat16(ctx.alpha);
        put8(q, g, a, alpha);
        put8(q + 64, g, b, alpha);
    }
};

template <int P>
struct GroupIo<OutPlanar<P>> {
    static void put(const typename OutPlanar<P>::Row& row, int x, const V3& a, const V3& b, const Ctx&)
    {
        #pragma GCC unroll 3
        for (int k = 0; k < 3; ++k)
            storeLanes(row.p[k] + x, 16, packUs(a.c[k], b.c[k]));
        if constexpr (P == 4)
            storeLanes(row.p[3] + x, 16, packUs(a.extra, b.extra));
    }
};

// The whole groups of a run of n block pixels; returns the pixels done, the rest being fewer than a group.
// The rows and the call's values are copied first: the stores cannot change the copies, so they stay in
// registers.
template <class C>
int wholeGroups(const typename C::Src::Row& sRow, const typename C::Dst::Row& dRow, int n, const Ctx& ctxIn)
{
    using F = Simd<typename C::Block>;
    const typename C::Src::Row s = sRow;
    const typename C::Dst::Row d = dRow;
    const Ctx ctx = ctxIn;
    int x = 0;
    for (; x + kGroupPixels <= n; x += kGroupPixels) {
        V3 a, b;
        GroupIo<typename C::Src>::template get<inputShift<typename C::Block>>(s, x, a, b);
        F::apply(a);
        F::apply(b);
        GroupIo<typename C::Dst>::put(d, x, a, b, ctx);
    }
    return x;
}
