// RGB <-> XYZ and RGB <-> YCC exports, expanded from the family table.
#include "frame/conv.hpp"
#include "lumachroma/xyzycc_table.hpp"

using namespace zox;

extern "C" {
ZOX_XYZYCC_TABLE(ZOX_DEFINE_EXPORT)
}
