// SSE4.1 block kernels of the RGB <-> YCbCr family.
#include "frame/conv_sse41.hpp"
#include "lumachroma/ycbcr_table.hpp"
#include "lumachroma/yuv_forms.hpp"

namespace zox::sse41 {
#include "lumachroma/inverse_simd.inl"
#include "lumachroma/ycbcr_simd.inl"

ZOX_YCBCR_TABLE(ZOX_INSTANTIATE_KERNELS)
} // namespace zox::sse41
