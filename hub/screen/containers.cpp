#include "hub/screen/containers.h"

#include "hub/screen/text.h"

#include <QApplication>
#include <QBoxLayout>
#include <QFormLayout>
#include <QGroupBox>
#include <QScrollArea>

namespace kota::hub {

namespace {

void takeSpacerOff(QBoxLayout& layout) {
    const int last = layout.count() - 1;
    if (last >= 0 && layout.itemAt(last)->spacerItem())
        delete layout.takeAt(last);
}

} // namespace

ContainerPart::ContainerPart(Parts& parts, HWND window, QWidget* widget, QBoxLayout* layout)
    : Part(parts, window, widget), layout_(layout) {
    widget->setLayout(layout);
}

void ContainerPart::add(Part& child) {
    takeSpacerOff(*layout_);
    tall_ = tall_ || child.isTall();
    if (child.label()) {
        addLabelled(child);
    } else {
        form_ = nullptr;
        layout_->addWidget(child.widget(), child.isTall() ? 1 : 0);
    }
    if (!tall_)
        layout_->addStretch();
}

void ContainerPart::addLabelled(Part& child) {
    if (!form_) {
        form_ = new QFormLayout;
        form_->setFieldGrowthPolicy(QFormLayout::ExpandingFieldsGrow);
        layout_->addLayout(form_);
    }
    form_->addRow(child.label(), child.widget());
}

FormPart::FormPart(Parts& parts, HWND window) : ContainerPart(parts, window, new QWidget, new QVBoxLayout) {}

GroupPart::GroupPart(Parts& parts, HWND window)
    : ContainerPart(parts, window, new QGroupBox, new QVBoxLayout) {}

void GroupPart::refresh(const WindowState& state) {
    static_cast<QGroupBox*>(widget())->setTitle(toQt(state.text));
}

RowPart::RowPart(Parts& parts, HWND window) : ContainerPart(parts, window, new QWidget, new QHBoxLayout) {
    layout().setContentsMargins(0, 0, 0, 0);
}

void RowPart::add(Part& child) {
    QBoxLayout& row = layout();
    takeSpacerOff(row);
    if (child.label())
        row.addWidget(child.label());
    row.addWidget(child.widget());
    row.addStretch();
}

SheetPart::SheetPart(Parts& parts, HWND window)
    : ContainerPart(parts, window, new QWidget, new QVBoxLayout), pages_(new QVBoxLayout) {
    layout().setContentsMargins(0, 0, 0, 0);
    layout().setSpacing(0);
    auto* const pane = new QWidget;
    pane->setLayout(pages_);
    pages_->setContentsMargins(0, 0, 0, 0);
    auto* const room = new QScrollArea;
    room->setFrameShape(QFrame::StyledPanel);
    room->setFocusPolicy(Qt::NoFocus);
    room->setWidgetResizable(true);
    room->setWidget(pane);
    layout().addWidget(room, 1);
    QObject::connect(qApp, &QApplication::focusChanged, room, [room](const QWidget*, QWidget* focus) {
        if (focus && room->widget()->isAncestorOf(focus))
            room->ensureWidgetVisible(focus);
    });
}

void SheetPart::add(Part& child) {
    if (child.isTall())
        pages_->addWidget(child.widget());
    else
        layout().insertWidget(0, child.widget());
}

} // namespace kota::hub
