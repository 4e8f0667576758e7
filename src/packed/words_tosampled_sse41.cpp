// SSE4.1 kernels of the word to chroma-sampled members: the unit forms over 16-bit lanes through the word
// readers.
#include "frame/sampled_sse41.hpp"
#include "packed/words_tosampled_table.hpp"

namespace zox::sse41 {
#include "sampling/tosampled_simd.inl"
#include "packed/words_io.inl"

ZOX_WORDS_TO_SAMPLED_OWN(ZOX_INSTANTIATE_SAMPLED)
} // namespace zox::sse41
