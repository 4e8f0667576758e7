// AVX2 kernels of the word to chroma-sampled members (the 128-bit forms serve the last group of sixteen).
#include "frame/sampled_avx2.hpp"
#include "packed/words_tosampled_table.hpp"

namespace zox::avx2::half {
#include "sampling/tosampled_simd.inl"
#include "packed/words_io.inl"
} // namespace zox::avx2::half

namespace zox::avx2 {
#include "sampling/tosampled_simd.inl"
#include "packed/words_io.inl"

ZOX_WORDS_TO_SAMPLED_OWN(ZOX_INSTANTIATE_SAMPLED)
} // namespace zox::avx2
