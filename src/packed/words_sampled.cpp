// Chroma-sampled images to sixteen-bit RGB words, expanded from the family table.
#include "frame/fromsampled.hpp"
#include "packed/words_sampled_table.hpp"

using namespace zox;

extern "C" {
ZOX_WORDS_SAMPLED_TABLE(ZOX_DEFINE_FROM_SAMPLED)
}
