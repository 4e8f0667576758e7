// AVX2 loop of the repacking family: the compiler's vectorisation of its one loop.
#include "sampling/repack.hpp"

namespace zox::avx2 {
#include "sampling/repack_moves.inl"
ZOX_REPACK_MOVES
ZOX_REPACK_BUILDERS
} // namespace zox::avx2
