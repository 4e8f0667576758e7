// AVX2 block kernels of the RGB <-> YCbCr family.
#include "frame/conv_avx2.hpp"
#include "lumachroma/ycbcr_table.hpp"
#include "lumachroma/yuv_forms.hpp"

namespace zox::avx2 {
#include "lumachroma/inverse_simd.inl"
#include "lumachroma/ycbcr_simd.inl"

ZOX_YCBCR_TABLE(ZOX_INSTANTIATE_KERNELS)
} // namespace zox::avx2
