#pragma once

#include <QLineEdit>

#include <functional>

namespace kota::hub {

// A line of text that tells when it is clicked, which alone gives it no focus.
class ClickedLine : public QLineEdit {
public:
    std::function<void()> onPress;

protected:
    void mousePressEvent(QMouseEvent* event) override {
        onPress();
        QLineEdit::mousePressEvent(event);
    }
};

} // namespace kota::hub
