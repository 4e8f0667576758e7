// SSE4.1 kernels of the full-resolution word members: their forms vectorised by the compiler.
#include "frame/conv_sse41.hpp"
#include "packed/words_table.hpp"

namespace zox::sse41 {
ZOX_WORDS_OWN(ZOX_INSTANTIATE_KERNELS)
} // namespace zox::sse41
