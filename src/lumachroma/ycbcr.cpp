// RGB <-> YCbCr exports, expanded from the family table.
#include "frame/conv.hpp"
#include "lumachroma/ycbcr_table.hpp"

using namespace zox;

extern "C" {
ZOX_YCBCR_TABLE(ZOX_DEFINE_EXPORT)
}
