// Colour twist exports, expanded from the family table.
#include "pointops/twist_table.hpp"

extern "C" {
ZOX_TWIST_TABLE(ZOX_DEFINE_TWIST)
}
