// RGB <-> YUV exports, expanded from the family table.
#include "frame/conv.hpp"
#include "lumachroma/yuv_table.hpp"

using namespace zox;

extern "C" {
ZOX_YUV_TABLE(ZOX_DEFINE_EXPORT)
}
