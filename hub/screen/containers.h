#pragma once

#include "hub/screen/part.h"

class QBoxLayout;
class QFormLayout;

namespace kota::hub {

// A window of other windows, below one another: controls with a label in front in two columns, grids over the
// room that is left.
class ContainerPart : public Part {
public:
    void add(Part& child) override;
    bool isTall() const override { return tall_; }

protected:
    // `layout` is new, and becomes that of the widget.
    ContainerPart(Parts& parts, HWND window, QWidget* widget, QBoxLayout* layout);

    QBoxLayout& layout() const { return *layout_; }

private:
    void addLabelled(Part& child);

    QBoxLayout* layout_;
    QFormLayout* form_ = nullptr; // the one that further labelled controls go into
    bool tall_ = false;
};

// A page, a dialog, a view, a frame.
class FormPart : public ContainerPart {
public:
    FormPart(Parts& parts, HWND window);
    bool isTall() const override { return true; }
};

class GroupPart : public ContainerPart {
public:
    GroupPart(Parts& parts, HWND window);

protected:
    void refresh(const WindowState& state) override;
};

// Windows beside one another.
class RowPart : public ContainerPart {
public:
    RowPart(Parts& parts, HWND window);
    void add(Part& child) override;
};

// The tabs, and below them the pages, of which the platform shows one. A page that has too little room is
// scrolled.
class SheetPart : public ContainerPart {
public:
    SheetPart(Parts& parts, HWND window);
    void add(Part& child) override;
    bool isTall() const override { return true; }

private:
    QBoxLayout* pages_;
};

} // namespace kota::hub
