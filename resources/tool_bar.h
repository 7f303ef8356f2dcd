#pragma once

#include "platform/framework/module.h"

#include <span>

// The document's tool bar and keys, the same in every language.
std::span<const kota::ToolBarTemplate> toolBars();
std::span<const kota::AcceleratorTable> acceleratorTables();
