// RGB <-> YCoCg SIMD forms over 16-bit lanes, for the members whose sums fit 16 bits or wrap there: the
// 8-bit colour sides and the reverse forms from 16-bit planes into bytes or four 16-bit channels. Included inside the namespace of each instruction set, after its vector vocabulary. Lane sums
// wrap at 16 bits as the forms' Wrap16 results do, and the unsigned saturating pack to bytes is their
// clamp to 0..255.

template <>
struct Simd<ycocg::PlainBiased> {
    static void apply(V3& v)
    {
        const V r = v.c[0], g = v.c[1], b = v.c[2];
        const V g2 = shl<1>(g);
        v.c[0] = shr<2>(add(add(add(r, g2), b), splat16<2>()));
        // Co + 128 never falls below 1, so the pack's clamp is the limit to 255.
        v.c[1] = add(shr<1>(add(sub(r, b), splat16<1>())), splat16<128>());
        v.c[2] = add(shr<2>(add(sub(sub(g2, r), b), splat16<2>())), splat16<128>());
    }
};

template <>
struct Simd<ycocg::RgbFromPlainBiased> {
    static void apply(V3& v)
    {
        const V y = v.c[0], co = v.c[1], cg = v.c[2];
        v.c[0] = sub(add(y, co), cg);
        v.c[1] = sub(add(y, cg), splat16<128>());
        v.c[2] = add(sub(sub(y, co), cg), splat16<256>());
    }
};

template <ycocg::Out O>
struct Simd<ycocg::RgbFromPlain<O>> {
    static_assert(O != ycocg::Out::Keep);
    static void apply(V3& v)
    {
        const V y = v.c[0], co = v.c[1], cg = v.c[2];
        v.c[0] = sub(add(y, co), cg);
        v.c[1] = add(y, cg);
        v.c[2] = sub(sub(y, co), cg);
    }
};

template <ycocg::Out O>
struct Simd<ycocg::RgbFromLifting<O>> {
    static_assert(O != ycocg::Out::Keep);
    static void apply(V3& v)
    {
        const V y = v.c[0], co = v.c[1], cg = v.c[2];
        const V t = sub(y, shr<1>(cg));
        const V b = sub(t, shr<1>(co));
        v.c[0] = add(b, co);
        v.c[1] = add(cg, t);
        v.c[2] = b;
    }
};
