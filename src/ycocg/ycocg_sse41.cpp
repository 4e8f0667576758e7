// SSE4.1 kernels of the RGB <-> YCoCg family: SIMD forms where written, the others vectorised by the compiler.
#include "frame/conv_sse41.hpp"
#include "ycocg/ycocg_table.hpp"

namespace zox::sse41 {
#include "ycocg/ycocg_simd.inl"

ZOX_YCOCG_TABLE(ZOX_INSTANTIATE_KERNELS)
} // namespace zox::sse41
