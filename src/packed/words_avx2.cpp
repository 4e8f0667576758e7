// AVX2 kernels of the full-resolution word members: the block forms over 16-bit lanes through the word
// readers and writers (and their 128-bit halves for the shorter groups).
#include "frame/conv_avx2.hpp"
#include "packed/words_table.hpp"

namespace zox::avx2::half {
#include "packed/words_io.inl"
#include "packed/words_io8.inl"
} // namespace zox::avx2::half

namespace zox::avx2 {
#include "packed/words_io.inl"
#include "lumachroma/inverse_simd.inl"
#include "packed/words_simd.inl"

ZOX_WORDS_OWN(ZOX_INSTANTIATE_KERNELS)
} // namespace zox::avx2
