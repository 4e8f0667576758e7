// The byte-shuffle lookup of a 256-entry table (see byte_table.hpp), written against the vector
// vocabulary and included inside the namespace of a kernel set (the AVX2 set: see byte_table.hpp).

inline V lookup256(V x, const ShuffleTable& t)
{
    const V sixteen = splat8<16>();
    V low = x, high = xor_(x, splat8<-128>());
    V a = zero(), b = zero();
#pragma GCC unroll 8
    for (int k = 0; k < 8; ++k) {
        a = xor_(a, shuffle(maskOf(t.part[k]), low));
        b = xor_(b, shuffle(maskOf(t.part[8 + k]), high));
        low = sub8(low, sixteen);
        high = sub8(high, sixteen);
    }
    return selectByTopBit(a, b, x);
}

std::size_t lookupRun(const uint8_t* s, uint8_t* d, std::size_t n, const ShuffleTable& t)
{
    constexpr std::size_t step = sizeof(V);
    std::size_t i = 0;
    for (; i + step <= n; i += step)
        storeLanes(d + i, 16, lookup256(loadLanes(s + i, 16), t));
    return i;
}
