// The one loop of the repacking family, included inside the namespace of each kernel set (and of the
// portable build): n samples moved from a run of stride SS bytes to a run of stride DS bytes, sample i
// of the destination taking sample i (Same), 2i (Drop) or i / 2 (Repeat) of the source. Each set's
// files vectorise it with their own instructions.

template <int SS, int DS, SampleMap M>
void moveSamples(const uint8_t* __restrict s, uint8_t* __restrict d, int n)
{
    constexpr std::ptrdiff_t ss = SS, ds = DS;
    if constexpr (M == SampleMap::Repeat) { // each source sample to two neighbours
        const int pairs = n / 2;
        for (int k = 0; k < pairs; ++k) {
            const uint8_t v = s[ss * k];
            d[ds * 2 * k] = v;
            d[ds * (2 * k + 1)] = v;
        }
        if (n & 1)
            d[ds * (n - 1)] = s[ss * pairs];
    } else {
        for (int i = 0; i < n; ++i)
            d[ds * i] = s[ss * (M == SampleMap::Same ? i : 2 * i)];
    }
}

// Groups to groups of another byte order: each destination byte takes its sample's byte of the same
// group. A vector prefix (reorderGroupsFast) where the set has one.
constexpr int groupSourceByte(const GroupOrder& from, const GroupOrder& to, int j)
{
    return j == to.y0 ? from.y0 : j == to.y1 ? from.y1 : j == to.cb ? from.cb : from.cr;
}

template <const GroupOrder& From, const GroupOrder& To>
void reorderGroups(const uint8_t* __restrict s, uint8_t* __restrict d, int n)
{
    constexpr int b0 = groupSourceByte(From, To, 0), b1 = groupSourceByte(From, To, 1), b2 = groupSourceByte(From, To, 2),
                  b3 = groupSourceByte(From, To, 3);
    for (int k = reorderGroupsFast<From, To>(s, d, n); k < n; ++k) {
        const uint8_t* g = s + 4 * static_cast<std::ptrdiff_t>(k);
        uint8_t* o = d + 4 * static_cast<std::ptrdiff_t>(k);
        o[0] = g[b0];
        o[1] = g[b1];
        o[2] = g[b2];
        o[3] = g[b3];
    }
}

#define ZOX_REPACK_REORDERS                                                                       \
    template void reorderGroups<CbYCrY, YCbYCr>(const uint8_t*, uint8_t*, int);                  \
    template void reorderGroups<YCbYCr, CbYCrY>(const uint8_t*, uint8_t*, int);                  \
    template void reorderGroups<YCbYCr, YCrYCb>(const uint8_t*, uint8_t*, int);

#define ZOX_REPACK_MOVE(SS, DS, M) template void moveSamples<SS, DS, SampleMap::M>(const uint8_t*, uint8_t*, int);
#define ZOX_REPACK_MOVES_DS(SS, DS) ZOX_REPACK_MOVE(SS, DS, Same) ZOX_REPACK_MOVE(SS, DS, Drop) ZOX_REPACK_MOVE(SS, DS, Repeat)
#define ZOX_REPACK_MOVES_SS(SS) ZOX_REPACK_MOVES_DS(SS, 1) ZOX_REPACK_MOVES_DS(SS, 2) ZOX_REPACK_MOVES_DS(SS, 4) ZOX_REPACK_MOVES_DS(SS, 8)
#define ZOX_REPACK_MOVES ZOX_REPACK_MOVES_SS(1) ZOX_REPACK_MOVES_SS(2) ZOX_REPACK_MOVES_SS(4)

// A row of 4:2:2 groups built in one pass: n groups from luma (stride SY) and chroma runs (stride SC,
// group k taking chroma sample k, or k / 2 with Repeat), the bytes of each group at the order's places.
template <int SY, int SC, SampleMap M, int Y0, int CB, int CR>
void buildGroups(const uint8_t* __restrict y, const uint8_t* __restrict cb, const uint8_t* __restrict cr, uint8_t* __restrict d, int n)
{
    constexpr std::ptrdiff_t sy = SY, sc = SC;
    auto group = [&](int k, int at) {
        uint8_t* g = d + 4 * static_cast<std::ptrdiff_t>(k);
        g[Y0] = y[sy * 2 * k];
        g[Y0 + 2] = y[sy * (2 * k + 1)];
        g[CB] = cb[sc * at];
        g[CR] = cr[sc * at];
    };
    if constexpr (M == SampleMap::Repeat) { // two groups a chroma sample
        const int pairs = n / 2;
        for (int k = 0; k < pairs; ++k) {
            const uint8_t b = cb[sc * k], r = cr[sc * k];
            uint8_t* g = d + 8 * static_cast<std::ptrdiff_t>(k);
            g[Y0] = y[sy * 4 * k];
            g[Y0 + 2] = y[sy * (4 * k + 1)];
            g[Y0 + 4] = y[sy * (4 * k + 2)];
            g[Y0 + 6] = y[sy * (4 * k + 3)];
            g[CB] = g[CB + 4] = b;
            g[CR] = g[CR + 4] = r;
        }
        if (n & 1)
            group(n - 1, pairs);
    } else {
        for (int k = 0; k < n; ++k)
            group(k, k);
    }
}

// Four runs of stride SC interleaved sample by sample into a row of n quads.
template <int SC>
void buildQuads(const uint8_t* __restrict a, const uint8_t* __restrict b, const uint8_t* __restrict c, const uint8_t* __restrict e,
                uint8_t* __restrict d, int n)
{
    constexpr std::ptrdiff_t sc = SC;
    for (int i = 0; i < n; ++i) {
        uint8_t* q = d + 4 * static_cast<std::ptrdiff_t>(i);
        q[0] = a[sc * i];
        q[1] = b[sc * i];
        q[2] = c[sc * i];
        q[3] = e[sc * i];
    }
}

// A row of Cb, Cr pairs built in one pass: n pairs from two chroma runs of stride SC, pair i taking
// sample i, 2i (Drop) or i / 2 (Repeat).
template <int SC, SampleMap M>
void buildPairs(const uint8_t* __restrict cb, const uint8_t* __restrict cr, uint8_t* __restrict d, int n)
{
    for (int i = 0; i < n; ++i) {
        const int at = M == SampleMap::Same ? i : M == SampleMap::Drop ? 2 * i : i >> 1;
        d[2 * static_cast<std::ptrdiff_t>(i)] = cb[static_cast<std::ptrdiff_t>(SC) * at];
        d[2 * static_cast<std::ptrdiff_t>(i) + 1] = cr[static_cast<std::ptrdiff_t>(SC) * at];
    }
}

#define ZOX_REPACK_GROUPS_ORDER(SY, SC, M)                                                                              \
    template void buildGroups<SY, SC, SampleMap::M, 0, 1, 3>(const uint8_t*, const uint8_t*, const uint8_t*, uint8_t*, int); \
    template void buildGroups<SY, SC, SampleMap::M, 0, 3, 1>(const uint8_t*, const uint8_t*, const uint8_t*, uint8_t*, int); \
    template void buildGroups<SY, SC, SampleMap::M, 1, 0, 2>(const uint8_t*, const uint8_t*, const uint8_t*, uint8_t*, int);
#define ZOX_REPACK_GROUPS_SC(SY, SC) ZOX_REPACK_GROUPS_ORDER(SY, SC, Same) ZOX_REPACK_GROUPS_ORDER(SY, SC, Repeat)
#define ZOX_REPACK_GROUPS_SY(SY) ZOX_REPACK_GROUPS_SC(SY, 1) ZOX_REPACK_GROUPS_SC(SY, 2) ZOX_REPACK_GROUPS_SC(SY, 4)
#define ZOX_REPACK_PAIRS(SC)                                                                                            \
    template void buildPairs<SC, SampleMap::Same>(const uint8_t*, const uint8_t*, uint8_t*, int);                    \
    template void buildPairs<SC, SampleMap::Drop>(const uint8_t*, const uint8_t*, uint8_t*, int);                    \
    template void buildPairs<SC, SampleMap::Repeat>(const uint8_t*, const uint8_t*, uint8_t*, int);
#define ZOX_REPACK_QUADS(SC) template void buildQuads<SC>(const uint8_t*, const uint8_t*, const uint8_t*, const uint8_t*, uint8_t*, int);
#define ZOX_REPACK_BUILDERS ZOX_REPACK_REORDERS ZOX_REPACK_QUADS(1) ZOX_REPACK_QUADS(2) ZOX_REPACK_GROUPS_SY(1) ZOX_REPACK_GROUPS_SY(2) ZOX_REPACK_PAIRS(1) ZOX_REPACK_PAIRS(2) ZOX_REPACK_PAIRS(4)
