#pragma once

#include "platform/framework/module.h"

#include <span>

// The string table, by language.
std::span<const kota::StringResource> englishStrings();
