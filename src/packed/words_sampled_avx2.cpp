// AVX2 kernels of the chroma-sampled to word members (the 128-bit forms serve the last group of sixteen).
#include "frame/fromsampled_avx2.hpp"
#include "packed/words_sampled_table.hpp"

namespace zox::avx2::half {
#include "lumachroma/inverse_simd.inl"
#include "sampling/fromsampled_simd.inl"
#include "packed/words_io.inl"
} // namespace zox::avx2::half

namespace zox::avx2 {
#include "lumachroma/inverse_simd.inl"
#include "sampling/fromsampled_simd.inl"
#include "packed/words_io.inl"

ZOX_WORDS_SAMPLED_TABLE(ZOX_INSTANTIATE_FROM_SAMPLED)
} // namespace zox::avx2
