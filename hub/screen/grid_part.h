#pragma once

#include "hub/screen/cell_editor.h"
#include "hub/screen/grid_delegate.h"
#include "hub/screen/grid_model.h"
#include "hub/screen/grid_sizes.h"
#include "hub/screen/part.h"

#include <QPersistentModelIndex>

namespace kota::hub {

class GridView;

// A grid with the editor of its current cell, which is open for as long as the platform edits that cell.
class GridPart : public Part {
public:
    GridPart(Parts& parts, HWND window);

    bool isTall() const override { return true; }
    QWidget* focusTarget() const override;
    bool takeKey(QKeyEvent& key) override;
    void takeComposition(QInputMethodEvent& composition) override;

protected:
    void refresh(const WindowState& state) override;
    QString name(const WindowState& /*state*/) const override { return nameAround(); }

private:
    GridView& view() const;
    // Queues an input for the grid, which is dropped if the grid is gone by then.
    void queueInput(std::function<void(CGXGridCore&)> action) const;
    void connectMouse();
    void connectEditor();
    QWidget* openEditor(const QModelIndex& index);

    // Each takes what the user did to a living grid.
    void press(CGXGridCore& grid, const QModelIndex& index);
    void openList(CGXGridCore& grid);
    bool typeOver(CGXGridCore& grid, const QString& text);
    bool chooseByLetter(CGXGridCore& grid, const QString& text);
    bool takeEditorKey(CGXGridCore& grid, QKeyEvent& key);
    // Hands the editor's text on, if it is another than the platform's.
    void tellText(CGXGridCore& grid);
    void tellViewed(CGXGridCore& grid);

    void showEditor(const CGXGridCore& grid);

    GridModel model_;
    GridDelegate delegate_;
    GridSizes sizes_;
    CellEditor editor_;
    QPersistentModelIndex editedAt_;
    bool composing_ = false; // an input method is at work on the editor's text
};

} // namespace kota::hub
