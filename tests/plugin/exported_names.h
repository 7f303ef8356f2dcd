#pragma once

#include <set>
#include <string>

namespace kota::test {

// The names that a library hands out, as they stand in its own table of dynamic symbols.
std::set<std::string> exportedNames(const std::string& path);

} // namespace kota::test
