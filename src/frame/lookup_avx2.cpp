// AVX2 lookup of byte tables.
#include "frame/byte_table.hpp"
#include "frame/ops_avx2.hpp"

namespace zox::avx2 {
#include "frame/lookup_simd.inl"
} // namespace zox::avx2
