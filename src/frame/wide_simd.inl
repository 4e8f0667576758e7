// The whole-row side of a conversion over 32-bit lanes, written once against the vocabulary of an
// instruction set and included inside its namespace: a row whose every column takes one form (N = 1)
// runs that form's exact 32-bit arithmetic, four vectors of kWideLanes pixels a turn, then one vector
// a turn; the columns behind the last whole vector take the scalar form. Samples travel as lane values
// 0..255; results leave unlimited and are written with clip8.
//
// The vocabulary: kWideLanes, splat32, add32, sub32, mul32, shl32, shr32, shrU32, and_, packs32, packUs,
// shuffle, maskOf, loadWidePixels4, widenBytes<M>, narrowBytes<M>, forEachHalf.

// The pixels of one vector: three channels in 32-bit lanes.
struct W3 {
    V c[3];
};

// A family's whole-row form over 32-bit lanes, in place.
template <class Form>
struct Wide;

// Readers and writers of M vectors of pixels, M x kWideLanes pixels from column x.
template <class L>
struct WideIo;

// Four bytes a pixel, one pixel a lane; the fourth byte is not used.
template <Order O>
struct WideIo<InPacked<4, O>> {
    template <int M>
    static void get(const typename InPacked<4, O>::Row& row, int x, W3 (&w)[M])
    {
        const V low = splat32<255>();
        #pragma GCC unroll 4
        for (int m = 0; m < M; ++m) {
            const V p = loadWidePixels4(row.p[0] + (static_cast<std::size_t>(x) + m * kWideLanes) * 4);
            w[m].c[0] = and_(shrU32<8 * channelByte(O, 0)>(p), low);
            w[m].c[1] = and_(shrU32<8 * channelByte(O, 1)>(p), low);
            w[m].c[2] = and_(shrU32<8 * channelByte(O, 2)>(p), low);
        }
    }
};

template <int P>
struct WideIo<InPlanar<P>> {
    template <int M>
    static void get(const typename InPlanar<P>::Row& row, int x, W3 (&w)[M])
    {
        #pragma GCC unroll 3
        for (int k = 0; k < 3; ++k) {
            V v[M];
            widenBytes<M>(row.p[k] + x, v);
            #pragma GCC unroll 4
            for (int m = 0; m < M; ++m)
                w[m].c[k] = v[m];
        }
    }
};

// Four bytes a pixel whose fourth byte is neither read nor written: each pixel's colour bytes are
// stored on their own (a 16-bit and an 8-bit store straight from the vector), never as a wider store
// over the fourth byte.
template <Order O>
struct WideIo<OutPacked<4, O, Fourth::Keep>> {
    template <int M>
    static void put(const typename OutPacked<4, O, Fourth::Keep>::Row& row, int x, const W3 (&w)[M], const Ctx&)
    {
        #pragma GCC unroll 4
        for (int m = 0; m < M; ++m) {
            const V bytes = packUs(packs32(w[m].c[0], w[m].c[1]), packs32(w[m].c[2], w[m].c[2]));
            const V px = shuffle(bytes, maskOf(kPixelDwords<channelByte(O, 0), channelByte(O, 1), channelByte(O, 2)>));
            uint8_t* q = row.p[0] + (static_cast<std::size_t>(x) + m * kWideLanes) * 4;
            forEachHalf(px, [q](int h, __m128i v) {
                uint8_t* o = q + 16 * h;
                auto put = [&]<int i>() {
                    const uint16_t low = static_cast<uint16_t>(_mm_extract_epi16(v, 2 * i));
                    __builtin_memcpy(o + 4 * i, &low, 2);
                    o[4 * i + 2] = static_cast<uint8_t>(_mm_extract_epi8(v, 4 * i + 2));
                };
                put.template operator()<0>();
                put.template operator()<1>();
                put.template operator()<2>();
                put.template operator()<3>();
            });
        }
    }
};

template <int P>
struct WideIo<OutPlanar<P>> {
    static_assert(P == 3, "a fourth plane takes a source byte that the wide readers do not carry");
    template <int M>
    static void put(const typename OutPlanar<P>::Row& row, int x, const W3 (&w)[M], const Ctx&)
    {
        #pragma GCC unroll 3
        for (int k = 0; k < 3; ++k) {
            V v[M];
            #pragma GCC unroll 4
            for (int m = 0; m < M; ++m)
                v[m] = w[m].c[k];
            narrowBytes<M>(row.p[k] + x, v);
        }
    }
};

// The whole-row kernel of a row with one form (N = 1): whole vectors from column 0; returns the
// columns done, the rest being fewer than kWideLanes (a form the compiler vectorises does the whole
// row). Rows with a block form have none.
template <class C>
int wideRow(const typename C::Src::Row& sRow, const typename C::Dst::Row& dRow, int width, const Ctx& ctx)
{
    if constexpr (C::N == 1 && compilerVectorised<typename C::Rem>) {
        compiledBlocks<C, typename C::Rem>(sRow, dRow, width, ctx);
        return width;
    } else if constexpr (C::N == 1) {
        using Src = typename C::Src;
        using Dst = typename C::Dst;
        const typename Src::Row s = sRow; // local copies: the stores cannot change them
        const typename Dst::Row d = dRow;
        auto turn = [&]<int M>(int x) {
            W3 w[M];
            WideIo<Src>::template get<M>(s, x, w);
            #pragma GCC unroll 4
            for (int m = 0; m < M; ++m)
                Wide<typename C::Rem>::apply(w[m]);
            WideIo<Dst>::template put<M>(d, x, w, ctx);
        };
        int x = 0;
        for (; x + 4 * kWideLanes <= width; x += 4 * kWideLanes)
            turn.template operator()<4>(x);
        for (; x + kWideLanes <= width; x += kWideLanes)
            turn.template operator()<1>(x);
        return x;
    } else {
        return 0;
    }
}
