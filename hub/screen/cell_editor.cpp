#include "hub/screen/cell_editor.h"

#include "hub/screen/clicked_line.h"

namespace kota::hub {

QWidget* CellEditor::open(CellKind kind, Qt::Alignment alignment, QWidget* parent) {
    close();
    if (kind == CellKind::Choice || kind == CellKind::FreeChoice) {
        widget_ = box_ = new DropBox;
        box_->setParent(parent);
        box_->setEditable(kind == CellKind::FreeChoice);
        box_->setInsertPolicy(QComboBox::NoInsert);
        line_ = box_->lineEdit();
        if (line_) {
            line_->setCompleter(nullptr);
            // The keys are to come to the line itself.
            box_->setFocusPolicy(Qt::NoFocus);
            line_->setFocusProxy(nullptr);
        }
    } else {
        auto* const line = new ClickedLine;
        line->setParent(parent);
        line->onPress = [this] {
            if (onLinePress)
                onLinePress();
        };
        widget_ = line_ = line;
        line_->setFrame(false);
    }
    if (line_)
        line_->setAlignment(alignment);
    widget_->setAutoFillBackground(true);
    focusTarget()->setFocusPolicy(Qt::TabFocus);
    return widget_;
}

QWidget* CellEditor::focusTarget() const {
    return line_ ? static_cast<QWidget*>(line_) : widget_.data();
}

QString CellEditor::text() const {
    return line_ ? line_->text() : QString();
}

void CellEditor::setText(const QString& text) {
    if (line_ && line_->text() != text)
        line_->setText(text);
}

void CellEditor::setEntries(const QStringList& entries) {
    if (!box_)
        return;
    box_->clear();
    box_->addItems(entries);
}

void CellEditor::close() {
    if (box_)
        box_->blockSignals(true); // it chooses the entry that is equal to its text when it loses the focus
    widget_ = nullptr;
    line_ = nullptr;
    box_ = nullptr;
}

} // namespace kota::hub
