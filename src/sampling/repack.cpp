// Repacking exports, expanded from the family table, and the portable build's loop.
#include "sampling/repack_table.hpp"

namespace zox::portable {
#include "sampling/repack_moves.inl"
ZOX_REPACK_MOVES
ZOX_REPACK_BUILDERS
} // namespace zox::portable

using namespace zox;

extern "C" {
ZOX_REPACK_TABLE(ZOX_DEFINE_REPACK)
}
