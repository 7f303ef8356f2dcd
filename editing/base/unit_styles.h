#pragma once

#include "platform/foundation/edit_style.h"

#include <algorithm>
#include <memory>
#include <vector>

// A page's unit styles by their entry. Entries that no unit was given to are empty.
class UnitStyles {
public:
    // At least so many entries.
    void SetSize(std::size_t entries) { styles_.resize(std::max(entries, styles_.size())); }
    // Gives an entry a style, if it has none yet. The entry must be within the size: otherwise the
    // invalid-argument failure.
    CKhEditStyle& Bind(std::size_t entry, int unitItem, const char* format);
    // The style of an entry; beyond the size, and for an empty entry, the invalid-argument failure.
    CKhEditStyle& At(std::size_t entry) const;

private:
    std::vector<std::unique_ptr<CKhEditStyle>> styles_;
};
