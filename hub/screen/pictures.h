#pragma once

#include "platform/framework/resources.h"

#include <QPixmap>

namespace kota::hub {

// The picture of a resource, null for null; with light outlines where windows are dark.
QPixmap pictureOf(const BitmapResource* bitmap);
// That of one button among those of a tool bar.
QPixmap buttonPicture(const BitmapResource* bitmap, const ToolBarTemplate& bar, int button);

} // namespace kota::hub
