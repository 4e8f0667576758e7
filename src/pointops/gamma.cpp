// Gamma exports, expanded from the family table.
#include "pointops/gamma_table.hpp"

using namespace zox;

extern "C" {
ZOX_GAMMA_TABLE(ZOX_DEFINE_GAMMA)
}
