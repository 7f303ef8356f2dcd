#include "hub/screen/pictures.h"

#include <vector>

namespace kota::hub {

QPixmap pictureOf(const BitmapResource* bitmap) {
    if (!bitmap)
        return {};
    std::vector<const char*> rows(bitmap->rows.begin(), bitmap->rows.end());
    return QPixmap(rows.data());
}

QPixmap buttonPicture(const BitmapResource* bitmap, const ToolBarTemplate& bar, int button) {
    return pictureOf(bitmap).copy(button * bar.buttonWidth, 0, bar.buttonWidth, bar.buttonHeight);
}

} // namespace kota::hub
