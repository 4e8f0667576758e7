// SSE4.1 kernels of the colour twist: 8u and 32f three-channel rows in single-precision lanes,
// the others the members' rows vectorised by the compiler.
#include "frame/ops_sse41.hpp"
#include "frame/layouts.hpp"
#include "pointops/twist_table.hpp"

namespace zox::sse41 {
#include "frame/io_simd.inl"
#include "pointops/float_lanes.inl"
#include "pointops/twist_simd.inl"

ZOX_TWIST_MEMBERS(ZOX_INSTANTIATE_TWIST)
} // namespace zox::sse41
