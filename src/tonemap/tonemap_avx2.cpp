// AVX2 tone-mapping kernels.
#include "tonemap/tonemap_kernels.hpp"

#include <immintrin.h>

#include <type_traits>

namespace zox::avx2 {
#include "tonemap/tonemap_simd.inl"

template void mapRow<tonemap::Linear>(const float*, uint8_t*, int, float);
template void mapRow<tonemap::Mean>(const float*, uint8_t*, int, float);
} // namespace zox::avx2
