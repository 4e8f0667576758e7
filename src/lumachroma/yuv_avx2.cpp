// AVX2 block kernels of the RGB <-> YUV family.
#include "frame/conv_avx2.hpp"
#include "lumachroma/ycbcr_forms.hpp"
#include "lumachroma/yuv_table.hpp"

namespace zox::avx2 {
#include "lumachroma/inverse_simd.inl"
#include "lumachroma/yuv_simd.inl"

ZOX_YUV_TABLE(ZOX_INSTANTIATE_KERNELS)
} // namespace zox::avx2
