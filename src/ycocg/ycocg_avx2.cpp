// AVX2 kernels of the RGB <-> YCoCg family: SIMD forms where written, the others vectorised by the compiler.
#include "frame/conv_avx2.hpp"
#include "ycocg/ycocg_table.hpp"

namespace zox::avx2 {
#include "ycocg/ycocg_simd.inl"

ZOX_YCOCG_TABLE(ZOX_INSTANTIATE_KERNELS)
} // namespace zox::avx2
