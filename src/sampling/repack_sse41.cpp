// SSE4.1 loop of the repacking family: the compiler's vectorisation of its one loop.
#include "frame/ops_sse41.hpp"
#include "sampling/repack.hpp"

namespace zox::sse41 {
constexpr int groupSourceByte(const GroupOrder& from, const GroupOrder& to, int j);
#include "sampling/repack_simd.inl"
#include "sampling/repack_moves.inl"
ZOX_REPACK_MOVES
ZOX_REPACK_BUILDERS
} // namespace zox::sse41
