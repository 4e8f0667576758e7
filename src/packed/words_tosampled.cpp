// Sixteen-bit RGB words to chroma-sampled images, expanded from the family table.
#include "frame/sampled.hpp"
#include "packed/words_tosampled_table.hpp"

using namespace zox;

extern "C" {
ZOX_WORDS_TO_SAMPLED_TABLE(ZOX_DEFINE_SAMPLED)
}
