// SSE4.1 lookup of byte tables.
#include "frame/byte_table.hpp"
#include "frame/ops_sse41.hpp"

namespace zox::sse41 {
#include "frame/lookup_simd.inl"
} // namespace zox::sse41
