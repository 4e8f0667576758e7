// The SSE4.1 vocabulary: 128-bit vectors (SSE4.1 files only).
#pragma once

#include "frame/shuffle_masks.hpp"

#include <smmintrin.h>

#include <cstddef>
#include <cstdint>

namespace zox::sse41 {
#include "frame/ops128.inl"
} // namespace zox::sse41
