// AVX2 kernels of the gray family: the 8u reducers by 16-bit lanes, the others the members' rows
// vectorised by the compiler.
#include "frame/ops_avx2.hpp"
#include "frame/layouts.hpp"
#include "pointops/gray_table.hpp"

namespace zox::avx2 {
#include "frame/io_simd.inl"
#include "pointops/float_lanes.inl"
#include "pointops/gray_simd.inl"

ZOX_GRAY_MEMBERS(ZOX_INSTANTIATE_GRAY)
} // namespace zox::avx2
