// SSE4.1 kernels of the RGB to chroma-sampled family.
#include "frame/sampled_sse41.hpp"
#include "sampling/tosampled_table.hpp"

namespace zox::sse41 {
#include "sampling/tosampled_simd.inl"

ZOX_TO_SAMPLED_OWN_TABLE(ZOX_INSTANTIATE_SAMPLED)
} // namespace zox::sse41
