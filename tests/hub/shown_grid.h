#pragma once

#include "hub/screen/grid_view.h"
#include "hub/screen/qt_screen.h"
#include "platform/framework/input.h"
#include "platform/framework/turn.h"
#include "platform/grid/grid.h"

#include <QApplication>
#include <QDir>
#include <QHeaderView>
#include <QLineEdit>
#include <QScrollBar>
#include <QTest>

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <utility>

namespace kota::test {

// A grid in a window of its own, with a user at mouse and keyboard.
class ShownGrid : public testing::Test {
protected:
    explicit ShownGrid(ROWCOL lines = 100, ROWCOL columns = 12) : before_(attachScreen(&screen)) {
        grid.Create({.kind = WindowKind::Grid});
        grid.Initialize();
        grid.SetColCount(columns);
        grid.SetRowCount(lines);
        for (ROWCOL col = 1; col <= columns; ++col)
            grid.SetValueRange(CGXRange(0, col), ("Column " + std::to_string(col)).c_str());
    }
    ~ShownGrid() override {
        grid.DestroyWindow();
        tellScreen();
        attachScreen(before_);
    }

    void show(QSize size = {600, 400}) {
        window = screen.makeWindow(grid);
        window->resize(size);
        window->show();
        window->activateWindow();
        ASSERT_TRUE(QTest::qWaitForWindowActive(window));
        settle();
    }
    // Changes the grid as a program does.
    template <class Action>
    void change(Action action) {
        screen.perform(action);
        settle();
    }
    static void settle() {
        for (int round = 0; round < 5; ++round)
            QCoreApplication::processEvents();
    }
    hub::GridView& view() { return *static_cast<hub::GridView*>(screen.widgetOf(grid)); }
    QModelIndex index(ROWCOL row, ROWCOL col) {
        return view().model()->index(static_cast<int>(row) - 1, static_cast<int>(col) - 1);
    }
    // Where a cell is in the view, and the widget that is seen there.
    QPoint centre(ROWCOL row, ROWCOL col) {
        return view().viewport()->mapTo(&view(), view().visualRect(index(row, col)).center());
    }
    QWidget& at(QPoint place) {
        QWidget* const there = view().childAt(place);
        if (!there)
            throw std::runtime_error("out of view");
        return *there;
    }
    void click(ROWCOL row, ROWCOL col, Qt::KeyboardModifiers held = {}) {
        QWidget& there = at(centre(row, col));
        QTest::mouseClick(&there, Qt::LeftButton, held, there.mapFrom(&view(), centre(row, col)));
        settle();
    }
    static void press(Qt::Key key, Qt::KeyboardModifiers held = {}) {
        QTest::keyClick(QApplication::focusWidget(), key, held);
        settle();
    }
    static void type(const char* text) {
        QTest::keyClicks(QApplication::focusWidget(), text);
        settle();
    }
    std::pair<ROWCOL, ROWCOL> cursor() const {
        ROWCOL row = 0;
        ROWCOL col = 0;
        grid.GetCurrentCell(&row, &col);
        return {row, col};
    }
    std::string held(ROWCOL row, ROWCOL col) const { return std::string(grid.CellText(row, col)); }
    // Leaves a picture of the window in the build tree.
    bool takePicture(const char* name) {
        const QDir folder(KOTA_PICTURES);
        return folder.mkpath(".") && window->grab().save(folder.filePath(QString(name) + ".png"));
    }
    QImage picture() { return view().grab().toImage(); }

    CGXGridWnd grid;
    hub::QtScreen screen;
    QWidget* window = nullptr;

private:
    Screen* before_;
};

} // namespace kota::test
