// SSE4.1 loop of the repacking family: the compiler's vectorisation of its one loop.
#include "sampling/repack.hpp"

namespace zox::sse41 {
#include "sampling/repack_moves.inl"
ZOX_REPACK_MOVES
ZOX_REPACK_BUILDERS
} // namespace zox::sse41
