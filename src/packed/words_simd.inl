// SIMD forms of the word members over 16-bit lanes, included inside the namespace of each instruction
// set after the inverse forms. Results leave unlimited; the word writer limits them to 0..255 before
// reducing.

template <>
struct Simd<words::Copy> {
    static void apply(V3&) {}
};
