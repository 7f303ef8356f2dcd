#include "tests/hub/shown_editor.h"
#include "tests/support/owned.h"

#include <QAbstractItemView>
#include <QComboBox>

#include <stdexcept>

namespace {

using kota::test::ShownEditor;

// The decay tab in a project of two rivers, with its first river cell current.
class AShownRiverCell : public ShownEditor {
protected:
    AShownRiverCell() : ShownEditor({"MISSOURI", "OHIO"}) {
        clickTab("Decay");
        clickCell(1, 3); // the line is no longer global
        clickCell(1, riverCol);
    }
    const AD_Decay& firstDecay() { return kota::test::recordOf(document.decayList); }
    QComboBox* box() { return gridView().findChild<QComboBox*>(); }
    void clickEntry(int entry) {
        const QAbstractItemView& list = *box()->view();
        QTest::mouseClick(list.viewport(), Qt::LeftButton, {},
                          list.visualRect(list.model()->index(entry, 0)).center());
        settle();
    }
    void openList() {
        press(Qt::Key_Down, Qt::AltModifier);
        if (!box() || !box()->view()->isVisible())
            throw std::runtime_error("the list has not opened");
    }

    static constexpr ROWCOL riverCol = 4;
};

TEST_F(AShownRiverCell, OffersTheRiversOfTheProject) {
    openList();
    ASSERT_EQ(box()->count(), 2);
    EXPECT_EQ(box()->itemText(0), "MISSOURI");
    EXPECT_EQ(box()->itemText(1), "OHIO");
}

TEST_F(AShownRiverCell, StoresATypedTextAtTab) {
    type("x");
    press(Qt::Key_Tab);
    EXPECT_EQ(firstDecay().riverName, "x");
    EXPECT_EQ(user.cursor(), std::make_pair(1U, riverCol + 1));
    EXPECT_EQ(QApplication::focusWidget(), &gridView());
}

TEST_F(AShownRiverCell, StoresATypedTextAtTabBackwards) {
    type("x");
    press(Qt::Key_Backtab, Qt::ShiftModifier);
    EXPECT_EQ(firstDecay().riverName, "x");
    EXPECT_EQ(user.cursor(), std::make_pair(1U, riverCol - 1));
}

TEST_F(AShownRiverCell, StoresATypedTextAtEnter) {
    type("tributary");
    press(Qt::Key_Return);
    EXPECT_EQ(firstDecay().riverName, "tributary");
    EXPECT_FALSE(user.grid().IsEditing());
}

TEST_F(AShownRiverCell, TakesATypedTextBackAtEscape) {
    type("x");
    press(Qt::Key_Escape);
    press(Qt::Key_Tab);
    EXPECT_EQ(firstDecay().riverName, "");
    EXPECT_EQ(user.cursor(), std::make_pair(1U, riverCol + 1));
}

TEST_F(AShownRiverCell, StoresAnEntryOfItsListAtTab) {
    openList();
    clickEntry(1);
    EXPECT_EQ(displayed(1, riverCol), "OHIO");
    press(Qt::Key_Tab);
    EXPECT_EQ(firstDecay().riverName, "OHIO");
    EXPECT_EQ(user.cursor(), std::make_pair(1U, riverCol + 1));
}

TEST_F(AShownRiverCell, StoresAnEntryThatIsStillTypedOn) {
    openList();
    clickEntry(1);
    type("2");
    press(Qt::Key_Tab);
    EXPECT_EQ(firstDecay().riverName, "OHIO2");
}

TEST_F(AShownRiverCell, LeavesTheNextCellAloneWhenARiverWasTypedInFull) {
    type("OHIO");
    press(Qt::Key_Backtab, Qt::ShiftModifier);
    EXPECT_EQ(firstDecay().riverName, "OHIO");
    EXPECT_FALSE(user.grid().IsEditing()) << "nothing was chosen in the cell before";

    clickCell(1, riverCol);
    press(Qt::Key_F2);
    press(Qt::Key_A, Qt::ControlModifier);
    type("MISSOURI");
    clickCell(1, 1);
    EXPECT_EQ(firstDecay().riverName, "MISSOURI");
    EXPECT_EQ(firstDecay().componentNum, 0);
    EXPECT_FALSE(user.grid().IsEditing());
}

} // namespace
