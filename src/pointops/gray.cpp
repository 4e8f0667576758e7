// Gray exports, expanded from the family table.
#include "pointops/gray_table.hpp"

extern "C" {
ZOX_GRAY_TABLE(ZOX_DEFINE_GRAY)
}
