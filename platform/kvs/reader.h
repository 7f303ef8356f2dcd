#pragma once

#include "platform/kvs/line_buffer.h"
#include "platform/kvs/tree.h"

#include <stdexcept>
#include <string>

namespace kota::kvs {

// The text breaks the form: where, counted from 1, and what was expected and what stands there.
struct SyntaxError : std::runtime_error {
    SyntaxError(int atLine, int atColumn, const std::string& message)
        : std::runtime_error(message), line(atLine), column(atColumn) {}

    int line;
    int column; // in characters
};

// Reads a text and builds the tree from it, up to where it can be found in. Throws SyntaxError.
void readText(const ByteSource& source, Tree& tree);

} // namespace kota::kvs
