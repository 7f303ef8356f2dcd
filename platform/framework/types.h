#pragma once

#include <cstdint>

// The framework's plain types. Results of operations are 1 and 0 where a BOOL is named.
using BOOL = int;
using UINT = unsigned int;
using WPARAM = std::uintptr_t;
using LPARAM = std::intptr_t;
using LRESULT = std::intptr_t;

inline constexpr BOOL TRUE = 1;
inline constexpr BOOL FALSE = 0;
