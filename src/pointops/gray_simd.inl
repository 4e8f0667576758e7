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

template <class M>
int grayKernel(const uint8_t* s, uint8_t* d, int w, const gray::Params& p)
{
    return GrayKernel<M>::run(s, d, w, p);
}
