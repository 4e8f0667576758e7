// SSE4.1 kernels of the chroma-sampled to RGB family.
#include "frame/fromsampled_sse41.hpp"
#include "sampling/fromsampled_table.hpp"

namespace zox::sse41 {
#include "lumachroma/inverse_simd.inl"
#include "sampling/fromsampled_simd.inl"

ZOX_FROM_SAMPLED_OWN_TABLE(ZOX_INSTANTIATE_FROM_SAMPLED)
} // namespace zox::sse41
