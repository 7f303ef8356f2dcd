#include "hub/screen/parts.h"

#include "hub/screen/containers.h"
#include "hub/screen/controls.h"
#include "hub/screen/edit_part.h"
#include "hub/screen/grid_part.h"
#include "hub/screen/main_part.h"

#include <QApplication>
#include <QDockWidget>

#include <memory>
#include <utility>
#include <vector>

namespace kota::hub {

namespace {

std::unique_ptr<Part> makePart(Parts& parts, const CWnd& window) {
    const HWND handle = window.GetSafeHwnd();
    switch (window.State()->setup.kind) {
    case WindowKind::Plain:
        return nullptr;
    case WindowKind::Label:
        return std::make_unique<LabelPart>(parts, handle);
    case WindowKind::Group:
        return std::make_unique<GroupPart>(parts, handle);
    case WindowKind::Row:
        return std::make_unique<RowPart>(parts, handle);
    case WindowKind::Edit:
        return std::make_unique<EditPart>(parts, handle);
    case WindowKind::PushButton:
        return std::make_unique<PushButtonPart>(parts, handle);
    case WindowKind::CheckBox:
        return std::make_unique<CheckBoxPart>(parts, handle);
    case WindowKind::RadioButton:
        return std::make_unique<RadioButtonPart>(parts, handle);
    case WindowKind::ComboBox:
        return std::make_unique<ComboBoxPart>(parts, handle);
    case WindowKind::Tabs:
        return std::make_unique<TabsPart>(parts, handle);
    case WindowKind::Grid:
        return std::make_unique<GridPart>(parts, handle);
    case WindowKind::Sheet:
        return std::make_unique<SheetPart>(parts, handle);
    case WindowKind::Page:
    case WindowKind::Dialog:
    case WindowKind::View:
        return std::make_unique<FormPart>(parts, handle);
    case WindowKind::Frame:
        if (window.IsKindOf(RUNTIME_CLASS(CMDIFrameWnd)))
            return std::make_unique<MainPart>(parts, handle);
        return std::make_unique<FramePart>(parts, handle);
    case WindowKind::ToolBar:
        return std::make_unique<ToolBarPart>(parts, handle);
    }
    return nullptr;
}

// Whether a widget is in a panel beside the documents, where the user may stay.
bool isInPanel(const QWidget* widget) {
    while (widget && !qobject_cast<const QDockWidget*>(widget))
        widget = widget->parentWidget();
    return widget != nullptr;
}

} // namespace

Parts::Parts(InputQueue& queue) : queue_(queue), keyboard_(*this) {}
Parts::~Parts() {
    for (const auto& [window, part] : parts_)
        delete part;
}

Part* Parts::find(HWND window) const {
    const auto found = parts_.find(window);
    return found == parts_.end() ? nullptr : found->second;
}

Part* Parts::make(HWND handle) {
    if (Part* const there = find(handle))
        return there;
    const CWnd* const window = CWnd::FromHandle(handle);
    Part* const part = window ? makePart(*this, *window).release() : nullptr;
    if (!part)
        return nullptr;
    parts_[handle] = part;
    for (const HWND inside : std::vector<HWND>(window->State()->children))
        if (Part* const child = make(inside))
            part->add(*child);
    part->update();
    return part;
}

void Parts::change(const WindowChange& change) {
    Part* const part = find(change.window);
    if (part && IsWindow(change.window)) {
        part->update();
        return;
    }
    if (part) {
        parts_.erase(change.window);
        part->retire();
    }
    if (!IsWindow(change.window))
        return;
    Part* const around = find(CWnd::FromHandle(change.window)->State()->setup.parent);
    Part* const made = around ? make(change.window) : nullptr;
    if (!made)
        return;
    around->add(*made);
    made->update();
}

void Parts::settle() {
    const std::map<HWND, Part*> present = parts_;
    for (const auto& [window, shown] : present)
        shown->settle();
    const Part* const part = find(::GetFocus());
    QWidget* const target = part ? part->focusTarget() : nullptr;
    const bool hasMoved = std::exchange(focusBefore_, ::GetFocus()) != ::GetFocus();
    // A field that is reached by a key has its text selected.
    const bool byKey = keyboard_.takeWasLast() && dynamic_cast<const EditPart*>(part);
    if (target && !target->hasFocus() && (hasMoved || !isInPanel(QApplication::focusWidget())))
        target->setFocus(byKey ? Qt::TabFocusReason : Qt::OtherFocusReason);
}

} // namespace kota::hub
