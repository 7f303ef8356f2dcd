#pragma once

#include "platform/framework/module.h"

#include <span>

// The pictures of the tool bar's buttons and of the editor, and the icons of the document and the editor.
std::span<const kota::BitmapResource> bitmaps();
std::span<const kota::BitmapResource> icons();
