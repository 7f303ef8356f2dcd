#pragma once

#include "platform/framework/module.h"

#include <span>

// What the user reads, by language: the string table, the dialogs, the document's menu.
std::span<const kota::StringResource> englishStrings();
std::span<const kota::DialogTemplate> englishDialogs();
std::span<const kota::MenuTemplate> englishMenus();

std::span<const kota::StringResource> japaneseStrings();
std::span<const kota::DialogTemplate> japaneseDialogs();
std::span<const kota::MenuTemplate> japaneseMenus();
