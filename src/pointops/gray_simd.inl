// Gray kernels, written once against the vector vocabulary and included inside the namespace of each
// instruction set (after io_simd.inl). A member without a SIMD form of its own runs its scalar row
// compiled with this set's flags, vectorised by the compiler (every call inside inlined, so that no
// shared inline function is emitted with this set's instructions).

template <class M>
struct GrayKernel {
    [[gnu::flatten]] static int run(const uint8_t* s, uint8_t* d, int w, const gray::Params& p)
    {
        M::row(s, d, 0, w, p);
        return w;
    }
};

// The 8u block form by 16-bit lanes: each channel's sample in the high byte of a word times its weight's
// upper half, the three and 64 summed with unsigned saturation, shifted as signed words and packed with
// unsigned saturation. Whole groups of the block columns; the rest goes to the row.
template <int Ch>
struct GrayKernel<gray::Fixed8<Ch>> {
    static int run(const uint8_t* s, uint8_t* d, int w, const gray::Params& p)
    {
        const int nb = gray::Fixed8<Ch>::blockColumns(w);
        const V c0 = splat16(p.q15[0]), c1 = splat16(p.q15[1]), c2 = splat16(p.q15[2]), round = splat16(64);
        auto gray = [&](const V3& v) {
            V t = addSatU(mulHighU(v.c[0], c0), mulHighU(v.c[1], c1));
            t = addSatU(addSatU(t, mulHighU(v.c[2], c2)), round);
            return shr<7>(t);
        };
        const typename InPacked<Ch>::Row row{{s}};
        int x = 0;
        for (; x + kGroupPixels <= nb; x += kGroupPixels) {
            V3 a, b;
            GroupIo<InPacked<Ch>>::template get<8>(row, x, a, b);
            storeLanes(d + x, 16, packUs(gray(a), gray(b)));
        }
        return x;
    }
};

// 16-bit and 32f reducers: a turn of pixels as single-precision lanes. 16s samples plus 32768 (exact in
// single precision); 16-bit results rounded to nearest with ties to even, 16s minus 32768 and saturated
// (its blocks), 16u kept to the low 16 bits. Whole turns of the block columns (w & ~3).
template <class T, int Ch>
struct GrayKernel<gray::Float16<T, Ch>> {
    static int run(const uint8_t* s, uint8_t* d, int w, const gray::Params& p)
    {
        constexpr bool isSigned = std::is_signed_v<T>;
        const VF c0 = splatF(p.f[0]), c1 = splatF(p.f[1]), c2 = splatF(p.f[2]), bias = splatF(isSigned ? 32768.0f : 0.0f);
        const uint8_t* const sp[1] = {s};
        const int nb = gray::Float16<T, Ch>::blockColumns(w);
        int x = 0;
        for (; x + kFloatLanes <= nb; x += kFloatLanes) {
            VF v[3];
            FloatTurn<T, Ch, false>::get(sp, x, v);
            if constexpr (isSigned)
                for (VF& c : v)
                    c = addF(c, bias);
            const V r = toNearestInt(addF(addF(mulF(v[0], c0), mulF(v[1], c1)), mulF(v[2], c2)));
            const V out = isSigned ? packs32(sub32(r, splat32(32768)), sub32(r, splat32(32768)))
                                   : packs32(shr32<16>(shl32<16>(r)), shr32<16>(shl32<16>(r)));
            storeLowHalves(d + 2 * static_cast<std::size_t>(x), 8, out);
        }
        return x;
    }
};

template <int Ch>
struct GrayKernel<gray::Float32<Ch>> {
    static int run(const uint8_t* s, uint8_t* d, int w, const gray::Params& p)
    {
        const VF c0 = splatF(p.f[0]), c1 = splatF(p.f[1]), c2 = splatF(p.f[2]);
        const uint8_t* const sp[1] = {s};
        int x = 0;
        for (; x + kFloatLanes <= w; x += kFloatLanes) {
            VF v[3];
            FloatTurn<float, Ch, false>::get(sp, x, v);
            storeLanesF(d + 4 * static_cast<std::size_t>(x), 16, addF(addF(mulF(c0, v[0]), mulF(c1, v[1])), mulF(c2, v[2])));
        }
        return x;
    }
};

// Gray to four channels: the sample unpacked with itself and with alpha into whole pixels.
template <class T>
    requires(sizeof(T) < 4)
struct GrayKernel<gray::Spread<T, 4>> {
    static int run(const uint8_t* s, uint8_t* d, int w, const gray::Params& p)
    {
        constexpr int z = sizeof(T);
        {
            const V alpha = splat16(z == 1 ? (p.alphaI & 255) * 257 : p.alphaI);
            constexpr int turn = kGroupPixels / z; // pixels of 16 bytes a 128-bit lane
            int x = 0;
            for (; x + turn <= w; x += turn) {
                const V g = loadLanes(s + static_cast<std::size_t>(x) * z, 16);
                uint8_t* q = d + static_cast<std::size_t>(x) * 4 * z;
                constexpr std::size_t lane = 64;
                auto put = [&](int at, V gg, V ga) {
                    storeLanes(q + at, lane, z == 1 ? unpackLo16(gg, ga) : unpackLo32(gg, ga));
                    storeLanes(q + at + 16, lane, z == 1 ? unpackHi16(gg, ga) : unpackHi32(gg, ga));
                };
                if constexpr (z == 1) {
                    put(0, unpackLo8(g, g), unpackLo8(g, alpha));
                    put(32, unpackHi8(g, g), unpackHi8(g, alpha));
                } else {
                    put(0, unpackLo16(g, g), unpackLo16(g, alpha));
                    put(32, unpackHi16(g, g), unpackHi16(g, alpha));
                }
            }
            return x;
        }
    }
};

template <class M>
int grayKernel(const uint8_t* s, uint8_t* d, int w, const gray::Params& p)
{
    return GrayKernel<M>::run(s, d, w, p);
}
