#pragma once

#include "platform/framework/module.h"

#include <span>

// The dialogs, by language.
std::span<const kota::DialogTemplate> englishDialogs();
