// Sixteen-bit RGB words at full resolution, expanded from the family table.
#include "frame/conv.hpp"
#include "packed/words_table.hpp"

using namespace zox;

extern "C" {
ZOX_WORDS_TABLE(ZOX_DEFINE_EXPORT)
}
