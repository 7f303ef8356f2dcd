#pragma once

#include "hub/screen/part.h"

class QLineEdit;

namespace kota::hub {

// An edit of a dialog, with its label.
class EditPart : public Part {
public:
    EditPart(Parts& parts, HWND window);
    bool takeKey(QKeyEvent& key) override;
    void takeComposition(QInputMethodEvent& composition) override;

protected:
    void refresh(const WindowState& state) override;

private:
    // Hands the text on, if it is another than the platform's.
    void tellText();
    QLineEdit& line() const;

    bool composing_ = false; // an input method is at work on the text
};

} // namespace kota::hub
