// The vector prefix of the repacking loops that a kernel set has one for, written once against its
// vocabulary: groups reordered by one byte shuffle per sixteen bytes. Returns the groups done.

template <const GroupOrder& From, const GroupOrder& To>
constexpr Bytes16 reorderMask()
{
    Bytes16 m{};
    for (int j = 0; j < 16; ++j)
        m.b[j] = static_cast<int8_t>(j / 4 * 4 + groupSourceByte(From, To, j % 4));
    return m;
}
template <const GroupOrder& From, const GroupOrder& To>
inline constexpr Bytes16 kReorder = reorderMask<From, To>();

template <const GroupOrder& From, const GroupOrder& To>
int reorderGroupsFast(const uint8_t* s, uint8_t* d, int n)
{
    constexpr int per = kGroupPixels / 4; // groups a vector
    const V mask = maskOf(kReorder<From, To>);
    int k = 0;
    for (; k + per <= n; k += per)
        storeLanes(d + 4 * static_cast<std::size_t>(k), 16, shuffle(loadLanes(s + 4 * static_cast<std::size_t>(k), 16), mask));
    return k;
}
