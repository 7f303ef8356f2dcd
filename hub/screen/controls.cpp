#include "hub/screen/controls.h"

#include "hub/screen/parts.h"
#include "hub/screen/text.h"
#include "platform/framework/property_sheet.h"

#include <QCheckBox>
#include <QLabel>
#include <QMouseEvent>
#include <QPushButton>
#include <QRadioButton>
#include <QTabBar>

#include <vector>

namespace kota::hub {

namespace {

// A toolkit's button that leaves it to the platform to change.
template <class Button>
class PassiveButton : public Button {
protected:
    void nextCheckState() override {}
};

class PassiveTabBar : public QTabBar {
public:
    std::function<void(int)> onPress;

protected:
    void mousePressEvent(QMouseEvent* event) override {
        const int tab = tabAt(event->position().toPoint());
        if (event->button() == Qt::LeftButton && tab >= 0)
            onPress(tab);
    }
    void wheelEvent(QWheelEvent* event) override { event->ignore(); }
};

// A tab's text with no access key in it, which the toolkit would act on by itself.
QString tabText(const CString& caption) {
    return toQt(caption).replace('&', "&&");
}

} // namespace

LabelPart::LabelPart(Parts& parts, HWND window) : Part(parts, window, new QLabel) {}

void LabelPart::refresh(const WindowState& state) {
    static_cast<QLabel*>(widget())->setText(toQt(state.text));
}

ButtonPart::ButtonPart(Parts& parts, HWND window, QAbstractButton* button) : Part(parts, window, button) {
    button->setFocusPolicy(Qt::TabFocus);
    parts.keyboard().watch(*button);
    QObject::connect(button, &QAbstractButton::clicked, button,
                     [this] { queue([](CWnd& clicked) { input::click(clicked); }); });
}

void ButtonPart::refresh(const WindowState& state) {
    auto* const button = static_cast<QAbstractButton*>(widget());
    button->setText(toQt(state.text));
    if (button->isCheckable())
        button->setChecked(state.checked);
}

bool ButtonPart::takeKey(QKeyEvent& key) {
    if (key.key() != Qt::Key_Space || !IsWindow(window()))
        return false;
    input::click(*CWnd::FromHandle(window()));
    return true;
}

PushButtonPart::PushButtonPart(Parts& parts, HWND window) : ButtonPart(parts, window, new QPushButton) {
    static_cast<QPushButton*>(widget())->setAutoDefault(false);
}

CheckBoxPart::CheckBoxPart(Parts& parts, HWND window)
    : ButtonPart(parts, window, new PassiveButton<QCheckBox>) {}

RadioButtonPart::RadioButtonPart(Parts& parts, HWND window)
    : ButtonPart(parts, window, new PassiveButton<QRadioButton>) {
    static_cast<QRadioButton*>(widget())->setAutoExclusive(false);
}

void DropBox::mousePressEvent(QMouseEvent* event) {
    if (event->button() == Qt::LeftButton && onPress)
        onPress();
}

void DropBox::wheelEvent(QWheelEvent* event) {
    event->ignore();
}

void DropBox::hidePopup() {
    QComboBox::hidePopup();
    if (onClosed)
        onClosed();
}

ComboBoxPart::ComboBoxPart(Parts& parts, HWND window) : Part(parts, window, new DropBox) {
    DropBox& own = box();
    if (const CWnd* const shown = CWnd::FromHandle(window); !shown->State()->label.IsEmpty())
        setLabel(new QLabel(toQt(shown->State()->label)));
    own.setFocusPolicy(Qt::TabFocus);
    parts.keyboard().watch(own);
    own.onPress = [this] {
        queue([this](CWnd& clicked) {
            if (input::focus(clicked))
                box().showPopup();
        });
    };
    QObject::connect(&own, &QComboBox::activated, &own, [this](int entry) {
        queue([this, entry](CWnd& chosen) {
            input::choose(chosen, entry);
            update();
        });
    });
}

DropBox& ComboBoxPart::box() const {
    return *static_cast<DropBox*>(widget());
}

void ComboBoxPart::refresh(const WindowState& state) {
    QStringList entries;
    for (const CString& choice : state.choices)
        entries.append(toQt(choice));
    QStringList shown;
    for (int i = 0; i < box().count(); ++i)
        shown.append(box().itemText(i));
    if (entries != shown) {
        box().clear();
        box().addItems(entries);
    }
    box().setCurrentIndex(state.chosen);
}

bool ComboBoxPart::takeKey(QKeyEvent& key) {
    CWnd* const own = CWnd::FromHandle(window());
    const int step = key.key() == Qt::Key_Down ? 1 : key.key() == Qt::Key_Up ? -1 : 0;
    if (!own || step == 0)
        return false;
    input::choose(*own, own->State()->chosen + step);
    return true;
}

TabsPart::TabsPart(Parts& parts, HWND window) : Part(parts, window, new PassiveTabBar) {
    bar().setFocusPolicy(Qt::TabFocus);
    bar().setDrawBase(false);
    parts.keyboard().watch(bar());
    static_cast<PassiveTabBar&>(bar()).onPress = [this](int tab) {
        queue([this, tab](CWnd&) { select(tab); });
    };
}

QTabBar& TabsPart::bar() const {
    return *static_cast<QTabBar*>(widget());
}

void TabsPart::refresh(const WindowState& state) {
    const int count = static_cast<int>(state.choices.size());
    while (bar().count() > count)
        bar().removeTab(bar().count() - 1);
    for (int i = 0; i < count; ++i) {
        const QString text = tabText(state.choices[static_cast<std::size_t>(i)]);
        if (i >= bar().count())
            bar().addTab(text);
        else if (bar().tabText(i) != text)
            bar().setTabText(i, text);
    }
    bar().setCurrentIndex(state.chosen);
}

void TabsPart::select(int index) const {
    CWnd* const tabs = CWnd::FromHandle(window());
    auto* const sheet = tabs ? dynamic_cast<CPropertySheet*>(tabs->GetParent()) : nullptr;
    if (sheet)
        input::selectTab(*sheet, index);
}

bool TabsPart::takeKey(QKeyEvent& key) {
    const CWnd* const tabs = CWnd::FromHandle(window());
    const int step = key.key() == Qt::Key_Right ? 1 : key.key() == Qt::Key_Left ? -1 : 0;
    if (!tabs || step == 0)
        return false;
    select(tabs->State()->chosen + step);
    return true;
}

} // namespace kota::hub
