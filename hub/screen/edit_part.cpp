#include "hub/screen/edit_part.h"

#include "hub/screen/clicked_line.h"
#include "hub/screen/parts.h"
#include "hub/screen/text.h"

#include <QLineEdit>

#include <algorithm>

namespace kota::hub {

namespace {

constexpr int usualLength = 30;
constexpr int noLimit = 32767; // the toolkit's own

} // namespace

EditPart::EditPart(Parts& parts, HWND window) : Part(parts, window, new ClickedLine) {
    if (const CWnd* const shown = CWnd::FromHandle(window); !shown->State()->label.IsEmpty())
        setLabel(new QLabel(toQt(shown->State()->label)));
    line().setFocusPolicy(Qt::TabFocus);
    parts.keyboard().watch(line());
    static_cast<ClickedLine&>(line()).onPress = [this] { queue([](CWnd& edit) { input::focus(edit); }); };
    QObject::connect(&line(), &QLineEdit::textEdited, &line(),
                     [this] { queue([this](CWnd&) { tellText(); }); });
}

QLineEdit& EditPart::line() const {
    return *static_cast<QLineEdit*>(widget());
}

void EditPart::refresh(const WindowState& state) {
    const int length = state.textLimit > 0 ? state.textLimit : usualLength;
    const QString text = toQt(state.text);
    // The limit is the user's: what the program shows may be longer, and stays whole.
    const int limit =
        std::max(state.textLimit > 0 ? state.textLimit : noLimit, static_cast<int>(text.size()));
    if (line().maxLength() != limit)
        line().setMaxLength(limit);
    line().setMaximumWidth((length + 2) * line().fontMetrics().averageCharWidth());
    if (!composing_ && line().text() != text)
        line().setText(text);
}

void EditPart::tellText() {
    CWnd* const edit = CWnd::FromHandle(window());
    if (!edit || composing_ || line().text() == toQt(edit->GetWindowText()))
        return;
    if (!input::typeText(*edit, toPlatform(line().text())))
        update();
}

bool EditPart::takeKey(QKeyEvent& key) {
    if (!isForLineOfText(key))
        return false;
    parts().keyboard().pass(line(), key);
    tellText();
    return true;
}

void EditPart::takeComposition(QInputMethodEvent& composition) {
    composing_ = !composition.preeditString().isEmpty();
    parts().keyboard().pass(line(), composition);
    tellText();
}

} // namespace kota::hub
