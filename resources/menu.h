#pragma once

#include "platform/framework/module.h"

#include <span>

// The document's menu, by language, and its tool bar and keys.
std::span<const kota::MenuTemplate> englishMenus();
std::span<const kota::ToolBarTemplate> toolBars();
std::span<const kota::AcceleratorTable> acceleratorTables();
