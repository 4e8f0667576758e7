// RGB to chroma-sampled image exports, expanded from the family table.
#include "frame/sampled.hpp"
#include "sampling/tosampled_table.hpp"

using namespace zox;

extern "C" {
ZOX_TO_SAMPLED_TABLE(ZOX_DEFINE_SAMPLED)
}
