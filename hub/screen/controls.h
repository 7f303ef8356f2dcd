#pragma once

#include "hub/screen/part.h"

#include <QComboBox>

#include <functional>

class QAbstractButton;
class QTabBar;

namespace kota::hub {

class LabelPart : public Part {
public:
    LabelPart(Parts& parts, HWND window);

protected:
    void refresh(const WindowState& state) override;
};

// A button that changes by the platform's word alone.
class ButtonPart : public Part {
public:
    bool takeKey(QKeyEvent& key) override;

protected:
    ButtonPart(Parts& parts, HWND window, QAbstractButton* button);
    void refresh(const WindowState& state) override;
};

class PushButtonPart : public ButtonPart {
public:
    PushButtonPart(Parts& parts, HWND window);
};

class CheckBoxPart : public ButtonPart {
public:
    CheckBoxPart(Parts& parts, HWND window);
};

class RadioButtonPart : public ButtonPart {
public:
    RadioButtonPart(Parts& parts, HWND window);
};

// A combo box that opens its list when it is told to, and asks for it when it is clicked.
class DropBox : public QComboBox {
public:
    std::function<void()> onPress;
    std::function<void()> onClosed;

    void hidePopup() override;

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
};

class ComboBoxPart : public Part {
public:
    ComboBoxPart(Parts& parts, HWND window);
    bool takeKey(QKeyEvent& key) override;

protected:
    void refresh(const WindowState& state) override;

private:
    DropBox& box() const;
};

class TabsPart : public Part {
public:
    TabsPart(Parts& parts, HWND window);
    bool takeKey(QKeyEvent& key) override;

protected:
    void refresh(const WindowState& state) override;
    QString name(const WindowState& /*state*/) const override { return nameAround(); }

private:
    void select(int index) const;
    QTabBar& bar() const;
};

} // namespace kota::hub
