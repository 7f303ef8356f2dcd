#pragma once

#include "platform/grid/style.h"

#include <cstddef>
#include <cstdint>
#include <unordered_map>
#include <vector>

namespace kota::grid {

// The number of a style in a pool; 0 is the style in which nothing is set.
using StyleId = std::uint32_t;

// Each style of a grid's cells and lines once, so that a cell needs no more than its number. A style stays
// for as long as the pool does.
class StylePool {
public:
    StylePool();

    const CGXStyle& operator[](StyleId id) const { return styles_[id]; }
    // The style that `upper` laid over the style `lower` makes.
    StyleId layOver(StyleId lower, const CGXStyle& upper);

private:
    StyleId intern(const CGXStyle& style);

    std::vector<CGXStyle> styles_;
    std::unordered_multimap<std::size_t, StyleId> byHash_;
    // The last answer: cells are mostly given the same style one after the other.
    StyleId lastLower_ = 0;
    CGXStyle lastUpper_;
    StyleId lastResult_ = 0;
};

} // namespace kota::grid
