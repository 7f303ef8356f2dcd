#pragma once

#include "hub/screen/part.h"

#include <QDialog>

namespace kota::hub {

class Parts;

// A window of the desktop around one of the platform's. It closes when that one is gone, and asks the
// platform to close it when the user wants to.
class TopWindow : public QDialog {
public:
    TopWindow(Parts& parts, Part& shown, QWidget* owner);

    void reject() override;

private:
    Parts& parts_;
    HWND window_;
};

} // namespace kota::hub
