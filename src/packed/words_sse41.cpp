// SSE4.1 kernels of the full-resolution word members: the block forms over 16-bit lanes through the word
// readers and writers.
#include "frame/conv_sse41.hpp"
#include "packed/words_table.hpp"

namespace zox::sse41 {
#include "packed/words_io.inl"
#include "packed/words_io8.inl"
#include "lumachroma/inverse_simd.inl"
#include "packed/words_simd.inl"

ZOX_WORDS_OWN(ZOX_INSTANTIATE_KERNELS)
} // namespace zox::sse41
