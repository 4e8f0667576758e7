// SSE4.1 kernels of the chroma-sampled to word members: the inverse forms' luma and chroma parts over
// groups of sixteen pixels, through the word writers.
#include "frame/fromsampled_sse41.hpp"
#include "packed/words_sampled_table.hpp"

namespace zox::sse41 {
#include "lumachroma/inverse_simd.inl"
#include "sampling/fromsampled_simd.inl"
#include "packed/words_io.inl"

ZOX_WORDS_SAMPLED_TABLE(ZOX_INSTANTIATE_FROM_SAMPLED)
} // namespace zox::sse41
