// AVX2 kernels of the full-resolution word members: their forms vectorised by the compiler.
#include "frame/conv_avx2.hpp"
#include "packed/words_table.hpp"

namespace zox::avx2 {
ZOX_WORDS_OWN(ZOX_INSTANTIATE_KERNELS)
} // namespace zox::avx2
