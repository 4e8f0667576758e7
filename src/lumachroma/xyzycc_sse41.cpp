// SSE4.1 kernels of the RGB <-> XYZ / YCC family: SIMD block forms at 8u, the others vectorised by the compiler.
#include "frame/conv_sse41.hpp"
#include "lumachroma/xyzycc_table.hpp"

namespace zox::sse41 {
#include "lumachroma/xyzycc_simd.inl"

ZOX_XYZYCC_TABLE(ZOX_INSTANTIATE_KERNELS)
} // namespace zox::sse41
