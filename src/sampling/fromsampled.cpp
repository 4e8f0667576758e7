// Chroma-sampled image to RGB exports, expanded from the family table.
#include "frame/fromsampled.hpp"
#include "sampling/fromsampled_table.hpp"

using namespace zox;

extern "C" {
ZOX_FROM_SAMPLED_TABLE(ZOX_DEFINE_FROM_SAMPLED)
}
