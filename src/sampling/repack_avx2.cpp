// AVX2 loop of the repacking family: the compiler's vectorisation of its one loop.
#include "sampling/repack.hpp"

namespace zox::avx2 {
#include "sampling/repack_moves.inl"
ZOX_REPACK_MOVES
} // namespace zox::avx2
