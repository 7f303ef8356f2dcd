#pragma once

#include "platform/kvs/scanner.h"
#include "platform/kvs/tree.h"

namespace kota::kvs {

// Reads a text and builds the tree from it, up to where it can be found in. Throws SyntaxError.
void readText(const ByteSource& source, Tree& tree);

} // namespace kota::kvs
