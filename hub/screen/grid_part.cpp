#include "hub/screen/grid_part.h"

#include "hub/screen/grid_view.h"
#include "hub/screen/parts.h"
#include "hub/screen/text.h"
#include "platform/framework/messages.h"
#include "platform/grid/user.h"

#include <algorithm>
#include <utility>

namespace kota::hub {

namespace {

grid::Selecting selectingBy(Qt::KeyboardModifiers held) {
    if (held.testFlag(Qt::ShiftModifier))
        return grid::Selecting::Extend;
    return held.testFlag(Qt::ControlModifier) ? grid::Selecting::Add : grid::Selecting::Anew;
}

QStringList entriesOf(const CGXGridCore& grid, const QModelIndex& index) {
    CGXStyle style;
    grid.ComposeStyleRowCol(GridModel::rowOf(index), GridModel::colOf(index), &style);
    QStringList entries = toQt(style.GetChoiceList()).remove('\r').split('\n');
    if (entries.last().isEmpty()) // each entry is ended by a line feed, which the last one may lack
        entries.removeLast();
    return entries;
}

// That of the standard style.
QFont fontOf(const CGXGridCore& grid) {
    CGXStyle style;
    grid.ComposeStyleRowCol(0, 0, &style);
    const CGXFont wanted = style.GetFont();
    QFont font;
    if (!wanted.face.IsEmpty())
        font.setFamily(toQt(wanted.face));
    if (wanted.points > 0)
        font.setPointSize(wanted.points);
    return font;
}

// What is a header is not selected.
void selectBetween(CGXGridCore& grid, const QModelIndex& from, const QModelIndex& to) {
    grid::selectCells(grid, CGXRange(GridModel::rowOf(from), GridModel::colOf(from),
                                     std::max(GridModel::rowOf(to), grid.GetHeaderRows() + 1),
                                     std::max(GridModel::colOf(to), grid.GetHeaderCols() + 1)));
}

} // namespace

GridPart::GridPart(Parts& parts, HWND window)
    : Part(parts, window, new GridView), model_(window),
      delegate_(model_, [this](const QModelIndex& index) { return openEditor(index); }) {
    view().showGrid(model_);
    view().setItemDelegate(&delegate_);
    parts.keyboard().watch(view());
    connectMouse();
}

GridView& GridPart::view() const {
    return *static_cast<GridView*>(widget());
}

void GridPart::queueInput(std::function<void(CGXGridCore&)> action) const {
    queue([act = std::move(action)](CWnd& window) {
        if (auto* const grid = dynamic_cast<CGXGridCore*>(&window))
            act(*grid);
    });
}

void GridPart::connectMouse() {
    view().onPress = [this](const QModelIndex& index) {
        queueInput([this, at = QPersistentModelIndex(index)](CGXGridCore& grid) { press(grid, at); });
    };
    view().onDoubleClick = [this](const QModelIndex& index) {
        queueInput([this, at = QPersistentModelIndex(index)](CGXGridCore& grid) { press(grid, at); });
    };
    view().onSelect = [this](const QModelIndex& from, const QModelIndex& to) {
        queueInput(
            [first = QPersistentModelIndex(from), last = QPersistentModelIndex(to)](CGXGridCore& grid) {
                if (first.isValid() && last.isValid())
                    selectBetween(grid, first, last);
            });
    };
    view().onLinePress = [this](int line, Qt::KeyboardModifiers held) {
        queueInput([=](CGXGridCore& grid) {
            grid::clickLineHeader(grid, static_cast<ROWCOL>(line + 1), selectingBy(held));
        });
    };
    view().onViewed = [this] { queueInput([this](CGXGridCore& grid) { tellViewed(grid); }); };
}

// A cell that is current already is opened.
void GridPart::press(CGXGridCore& grid, const QModelIndex& index) {
    if (!index.isValid())
        return;
    const CellLook cell = model_.look(GridModel::rowOf(index), GridModel::colOf(index));
    const bool wasCurrent = index == model_.currentIndex() && ::GetFocus() == window();
    const bool taken = grid::clickCell(grid, GridModel::rowOf(index), GridModel::colOf(index));
    if (!taken || !wasCurrent || cell.kind == CellKind::CheckBox)
        return;
    if (cell.kind == CellKind::Text)
        input::key(VK_F2);
    else
        openList(grid);
}

void GridPart::openList(CGXGridCore& grid) {
    grid::dropDown(grid, true);
    if (editor_.box() && editor_.box()->count() > 0)
        editor_.box()->showPopup();
}

void GridPart::tellViewed(CGXGridCore& grid) {
    const int top = view().rowAt(0);
    const int left = view().columnAt(0);
    grid.SetPageRows(static_cast<ROWCOL>(view().pageLines()));
    if (top >= 0 && grid.GetTopRow() != static_cast<ROWCOL>(top + 1))
        grid.SetTopRow(static_cast<ROWCOL>(top + 1));
    if (left >= 0 && grid.GetLeftCol() != static_cast<ROWCOL>(left + 1))
        grid.SetLeftCol(static_cast<ROWCOL>(left + 1));
}

QWidget* GridPart::focusTarget() const {
    return editor_.isOpen() ? editor_.focusTarget() : widget();
}

bool GridPart::takeKey(QKeyEvent& key) {
    CGXGridCore* const grid = model_.grid();
    if (!grid)
        return false;
    const bool selectsLine = key.key() == Qt::Key_Space && key.modifiers().testFlag(Qt::ShiftModifier);
    const bool list = key.key() == Qt::Key_Down && key.modifiers().testFlag(Qt::AltModifier);
    if (list)
        openList(*grid);
    else if (editor_.isOpen())
        return takeEditorKey(*grid, key);
    else if (!typedText(key).isEmpty() && !selectsLine)
        return typeOver(*grid, typedText(key));
    return list;
}

bool GridPart::takeEditorKey(CGXGridCore& grid, QKeyEvent& key) {
    const int step = key.key() == Qt::Key_Down ? 1 : key.key() == Qt::Key_Up ? -1 : 0;
    if (editor_.box() && step != 0) {
        grid::chooseEntry(grid, grid::chosenEntry(grid) + step);
        return true;
    }
    if (!editor_.line())
        return !typedText(key).isEmpty() && chooseByLetter(grid, typedText(key));
    if (!isForLineOfText(key))
        return false;
    parts().keyboard().pass(*editor_.line(), key);
    tellText(grid);
    return true;
}

// A text typed at a cell that is not open takes the place of what the cell holds.
bool GridPart::typeOver(CGXGridCore& grid, const QString& text) {
    const QModelIndex current = model_.currentIndex();
    switch (model_.look(GridModel::rowOf(current), GridModel::colOf(current)).kind) {
    case CellKind::CheckBox:
        return text == " " && grid::toggle(grid);
    case CellKind::Choice:
        return chooseByLetter(grid, text);
    case CellKind::Text:
    case CellKind::FreeChoice:
        break;
    }
    grid::typeText(grid, toPlatform(text));
    return true;
}

// The next entry that begins with the text, from the one that is chosen, round the end.
bool GridPart::chooseByLetter(CGXGridCore& grid, const QString& text) {
    const QStringList entries = entriesOf(grid, model_.currentIndex());
    const int chosen = grid::chosenEntry(grid);
    for (qsizetype i = 1; i <= entries.size(); ++i) {
        const qsizetype place = (chosen + i) % entries.size();
        if (entries[place].startsWith(text, Qt::CaseInsensitive))
            return grid::chooseEntry(grid, static_cast<int>(place));
    }
    return false;
}

void GridPart::takeComposition(QInputMethodEvent& composition) {
    CGXGridCore* const grid = model_.grid();
    const bool isEmpty = composition.preeditString().isEmpty() && composition.commitString().isEmpty();
    if (grid && !editor_.isOpen() && !isEmpty) // an input method that is reset sends an empty one
        input::key(VK_F2);
    if (!grid || !editor_.line())
        return;
    composing_ = !composition.preeditString().isEmpty();
    parts().keyboard().pass(*editor_.line(), composition);
    tellText(*grid);
}

void GridPart::tellText(CGXGridCore& grid) {
    if (!editor_.line() || composing_ || !editedAt_.isValid())
        return;
    const QString typed = editor_.text();
    if (typed == model_.look(GridModel::rowOf(editedAt_), GridModel::colOf(editedAt_)).text)
        return;
    if (!grid::typeText(grid, toPlatform(typed)))
        update();
}

QWidget* GridPart::openEditor(const QModelIndex& index) {
    const CellLook cell = model_.look(GridModel::rowOf(index), GridModel::colOf(index));
    QWidget* const opened = editor_.open(cell.kind, cell.alignment, &view().widgetAt(index));
    if (const CGXGridCore* const grid = model_.grid())
        editor_.setEntries(entriesOf(*grid, index));
    editor_.focusTarget()->setAccessibleName(model_.heading(GridModel::colOf(index)));
    parts().keyboard().watch(*editor_.focusTarget());
    connectEditor();
    return opened;
}

void GridPart::connectEditor() {
    if (QLineEdit* const line = editor_.line())
        QObject::connect(line, &QLineEdit::textEdited, line,
                         [this] { queueInput([this](CGXGridCore& grid) { tellText(grid); }); });
    editor_.onLinePress = [this] { queueInput([](CGXGridCore& grid) { input::focus(grid); }); };
    DropBox* const box = editor_.box();
    if (!box)
        return;
    box->onPress = [this] { queueInput([this](CGXGridCore& grid) { openList(grid); }); };
    box->onClosed = [this] { queueInput([](CGXGridCore& grid) { grid::dropDown(grid, false); }); };
    QObject::connect(box, &QComboBox::activated, box, [this](int entry) {
        queueInput([this, entry](CGXGridCore& grid) {
            grid::chooseEntry(grid, entry);
            update();
        });
    });
}

void GridPart::refresh(const WindowState& /*state*/) {
    CGXGridCore* const grid = model_.grid();
    if (!grid)
        return;
    const GridChanges changes = grid->TakeChanges();
    model_.follow(changes);
    if (changes.layout) {
        view().setFont(fontOf(*grid));
        sizes_.show(*grid, view());
    }
    if (changes.current || changes.selection)
        view().redraw();
    const QModelIndex current = model_.currentIndex();
    view().selectionModel()->setCurrentIndex(current, QItemSelectionModel::NoUpdate);
    if (changes.scroll && current.isValid())
        view().scrollTo(current);
    showEditor(*grid);
    const GridWarning& warning = grid->Warning();
    view().showWarning(model_.indexOf(warning.row, warning.col), toQt(warning.text));
}

// Opens or closes the editor as the platform began or ended the edit, and loads its text.
void GridPart::showEditor(const CGXGridCore& grid) {
    const QModelIndex edited = grid.IsEditing() ? model_.currentIndex() : QModelIndex();
    const bool isNew = edited.isValid() && (edited != editedAt_ || !editor_.isOpen());
    if (edited != editedAt_ || isNew) {
        editor_.close();
        if (editedAt_.isValid())
            view().closePersistentEditor(editedAt_);
        editedAt_ = edited;
        composing_ = false;
    }
    if (!edited.isValid()) {
        editor_.close();
        return;
    }
    if (isNew)
        view().openPersistentEditor(edited);
    if (editor_.box() && !editor_.line())
        editor_.box()->setCurrentIndex(grid::chosenEntry(grid));
    else if (!composing_)
        editor_.setText(model_.look(GridModel::rowOf(edited), GridModel::colOf(edited)).text);
    if (isNew && editor_.line() && !grid.IsEditPending())
        editor_.line()->selectAll();
}

} // namespace kota::hub
