// RGB <-> YCoCg exports, expanded from the family table.
#include "frame/conv.hpp"
#include "ycocg/ycocg_table.hpp"

using namespace zox;

extern "C" {
ZOX_YCOCG_TABLE(ZOX_DEFINE_EXPORT)
}
