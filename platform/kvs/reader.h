#pragma once

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

// Reads the text that `tree` was given and builds the tree from it. Throws SyntaxError.
void readText(Tree& tree);

} // namespace kota::kvs
