// SIMD forms of the word members over 16-bit lanes, included inside the namespace of each instruction
// set. Results leave unlimited; the word writer limits them to 0..255 before reducing.

template <>
struct Simd<words::Copy> {
    static void apply(V3&) {}
};

template <>
struct Simd<words::BlockColour> {
    static void apply(V3& v)
    {
        const V a = mulHigh(shl<7>(sub(v.c[0], splat16(16))), splat16(9535));
        const V u = shl<7>(sub(v.c[1], splat16(128))), w = shl<7>(sub(v.c[2], splat16(128)));
        v.c[0] = shr<4>(add(a, mulHigh(w, splat16(13074))));
        v.c[1] = shr<4>(sub(sub(a, mulHigh(w, splat16(6660))), mulHigh(u, splat16(3211))));
        v.c[2] = shr<4>(add(a, mulHigh(u, splat16(16523))));
    }
};
