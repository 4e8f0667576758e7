// AVX2 kernels of the RGB to chroma-sampled family (the 128-bit forms serve the last group of sixteen).
#include "frame/sampled_avx2.hpp"
#include "sampling/tosampled_table.hpp"

namespace zox::avx2::half {
#include "sampling/tosampled_simd.inl"
} // namespace zox::avx2::half

namespace zox::avx2 {
#include "sampling/tosampled_simd.inl"

ZOX_TO_SAMPLED_OWN_TABLE(ZOX_INSTANTIATE_SAMPLED)
} // namespace zox::avx2
