// The one loop of the repacking family, included inside the namespace of each kernel set (and of the
// portable build): n samples moved from a run of stride SS bytes to a run of stride DS bytes, sample i
// of the destination taking sample i (Same), 2i (Drop) or i / 2 (Repeat) of the source. Each set's
// files vectorise it with their own instructions.

template <int SS, int DS, SampleMap M>
void moveSamples(const uint8_t* __restrict s, uint8_t* __restrict d, int n)
{
    for (int i = 0; i < n; ++i) {
        const int at = M == SampleMap::Same ? i : M == SampleMap::Drop ? 2 * i : i >> 1;
        d[static_cast<std::ptrdiff_t>(DS) * i] = s[static_cast<std::ptrdiff_t>(SS) * at];
    }
}

#define ZOX_REPACK_MOVE(SS, DS, M) template void moveSamples<SS, DS, SampleMap::M>(const uint8_t*, uint8_t*, int);
#define ZOX_REPACK_MOVES_DS(SS, DS) ZOX_REPACK_MOVE(SS, DS, Same) ZOX_REPACK_MOVE(SS, DS, Drop) ZOX_REPACK_MOVE(SS, DS, Repeat)
#define ZOX_REPACK_MOVES_SS(SS) ZOX_REPACK_MOVES_DS(SS, 1) ZOX_REPACK_MOVES_DS(SS, 2) ZOX_REPACK_MOVES_DS(SS, 4) ZOX_REPACK_MOVES_DS(SS, 8)
#define ZOX_REPACK_MOVES ZOX_REPACK_MOVES_SS(1) ZOX_REPACK_MOVES_SS(2) ZOX_REPACK_MOVES_SS(4)
