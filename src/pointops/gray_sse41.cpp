// SSE4.1 kernels of the gray family: the 8u reducers by 16-bit lanes, the others the members' rows
// vectorised by the compiler.
#include "frame/ops_sse41.hpp"
#include "frame/layouts.hpp"
#include "pointops/gray_table.hpp"

namespace zox::sse41 {
#include "frame/io_simd.inl"
#include "pointops/float_lanes.inl"
#include "pointops/gray_simd.inl"

ZOX_GRAY_MEMBERS(ZOX_INSTANTIATE_GRAY)
} // namespace zox::sse41
