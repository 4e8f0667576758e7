// Repacking exports, expanded from the family table, and the portable build's loop.
#include "sampling/repack_table.hpp"

namespace zox::portable {
// No vector prefix here: the loops run whole.
template <const GroupOrder& From, const GroupOrder& To>
int reorderGroupsFast(const uint8_t*, uint8_t*, int)
{
    return 0;
}
#include "sampling/repack_moves.inl"
ZOX_REPACK_MOVES
ZOX_REPACK_BUILDERS
} // namespace zox::portable

using namespace zox;

extern "C" {
ZOX_REPACK_TABLE(ZOX_DEFINE_REPACK)
}
