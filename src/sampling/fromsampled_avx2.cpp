// AVX2 kernels of the chroma-sampled to RGB family (the 128-bit forms serve the last group of sixteen).
#include "frame/fromsampled_avx2.hpp"
#include "sampling/fromsampled_table.hpp"

namespace zox::avx2::half {
#include "lumachroma/inverse_simd.inl"
#include "sampling/fromsampled_simd.inl"
} // namespace zox::avx2::half

namespace zox::avx2 {
#include "lumachroma/inverse_simd.inl"
#include "sampling/fromsampled_simd.inl"

ZOX_FROM_SAMPLED_OWN_TABLE(ZOX_INSTANTIATE_FROM_SAMPLED)
} // namespace zox::avx2
