// The whole-row side of a conversion over 32-bit lanes, written once against the vocabulary of an
// instruction set and included inside its namespace: a row whose every column takes one form (N = 1)
// runs that form's exact 32-bit arithmetic on kWideLanes pixels a turn, and the columns behind the last
// whole turn take the scalar form. Samples travel as lane values 0..255; results leave unlimited and
// are written with clip8.
//
// The vocabulary: kWideLanes, splat32, add32, sub32, mul32, shl32, shr32, shrU32, and_, packs32, packUs,
// shuffle, maskOf, loadWidePixels4, loadWideBytes, storeWideBytes, forEachPair.

// The pixels of one turn: three channels in 32-bit lanes.
struct W3 {
    V c[3];
};

// A family's whole-row form over 32-bit lanes, in place.
template <class Form>
struct Wide;

// Readers and writers of kWideLanes pixels.
template <class L>
struct WideIo;

// Four bytes a pixel, one pixel a lane; the fourth byte is not used.
template <Order O>
struct WideIo<InPacked<4, O>> {
    static void get(const typename InPacked<4, O>::Row& row, int x, W3& w)
    {
        const V p = loadWidePixels4(row.p[0] + static_cast<std::size_t>(x) * 4);
        const V low = splat32<255>();
        w.c[0] = and_(shrU32<8 * channelByte(O, 0)>(p), low);
        w.c[1] = and_(shrU32<8 * channelByte(O, 1)>(p), low);
        w.c[2] = and_(shrU32<8 * channelByte(O, 2)>(p), low);
    }
};

template <int P>
struct WideIo<InPlanar<P>> {
    static void get(const typename InPlanar<P>::Row& row, int x, W3& w)
    {
        for (int k = 0; k < 3; ++k)
            w.c[k] = loadWideBytes(row.p[k] + x);
    }
};

// The three colour bytes of a pixel as one 16-bit and one 8-bit store.
inline void putColours(uint8_t* q, uint32_t px)
{
    const uint16_t low = static_cast<uint16_t>(px);
    __builtin_memcpy(q, &low, 2);
    q[2] = static_cast<uint8_t>(px >> 16);
}

// Four bytes a pixel whose fourth byte is neither read nor written: each pixel's colour bytes are
// stored on their own, never as a wider store over the fourth byte.
template <Order O>
struct WideIo<OutPacked<4, O, Fourth::Keep>> {
    static void put(const typename OutPacked<4, O, Fourth::Keep>::Row& row, int x, const W3& w, const Ctx&)
    {
        const V bytes = packUs(packs32(w.c[0], w.c[1]), packs32(w.c[2], w.c[2]));
        const V px = shuffle(bytes, maskOf(kPixelDwords<channelByte(O, 0), channelByte(O, 1), channelByte(O, 2)>));
        uint8_t* q = row.p[0] + static_cast<std::size_t>(x) * 4;
        forEachPair(px, [q](int i, uint64_t two) {
            putColours(q + 8 * i, static_cast<uint32_t>(two));
            putColours(q + 8 * i + 4, static_cast<uint32_t>(two >> 32));
        });
    }
};

template <int P>
struct WideIo<OutPlanar<P>> {
    static_assert(P == 3, "a fourth plane takes a source byte that the wide readers do not carry");
    static void put(const typename OutPlanar<P>::Row& row, int x, const W3& w, const Ctx&)
    {
        for (int k = 0; k < 3; ++k)
            storeWideBytes(row.p[k] + x, w.c[k]);
    }
};

// The whole-row kernel of a row with one form (N = 1): whole turns from column 0; returns the columns
// done, the rest being fewer than a turn. Rows with a block form have none.
template <class C>
int wideRow(const typename C::Src::Row& s, const typename C::Dst::Row& d, int width, const Ctx& ctx)
{
    if constexpr (C::N == 1) {
        int x = 0;
        for (; x + kWideLanes <= width; x += kWideLanes) {
            W3 w;
            WideIo<typename C::Src>::get(s, x, w);
            Wide<typename C::Rem>::apply(w);
            WideIo<typename C::Dst>::put(d, x, w, ctx);
        }
        return x;
    } else {
        return 0;
    }
}
