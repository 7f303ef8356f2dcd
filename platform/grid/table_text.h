#pragma once

#include "platform/framework/export.h"

#include <string>
#include <string_view>
#include <vector>

// Tables as text, as spreadsheets put them on the clipboard: cells parted by tabs, lines by line ends; a cell
// with a tab, a line end or a quote in it stands in double quotes, its own quotes doubled.
namespace kota::grid {

using TableLine = std::vector<std::string>;

// Lines end with a line feed each.
KOTA_API std::string printTable(const std::vector<TableLine>& lines);
// Any line end ends a line; the last line may lack it. A quote that is not at the start of a cell, or that
// nothing closes, stands for itself.
KOTA_API std::vector<TableLine> readTable(std::string_view text);

} // namespace kota::grid
