#include "tests/hub/shown_editor.h"
#include "tests/support/owned.h"

#include <QAbstractItemView>
#include <QComboBox>

namespace {

using kota::test::ShownEditor;

// The decay tab of a document with these components, in front of its first component cell.
class AShownChoice : public ShownEditor {
protected:
    void showComponents(const std::vector<const char*>& names) {
        for (const char* name : names)
            kota::test::addComponent(document.compList, 0, name, 0);
        document.UpdateAllViews(nullptr, UpdateHint::Fill);
        clickTab("Decay");
        clickCell(1, 1);
    }
    // The list box of the cell that is edited; null when there is none.
    QComboBox* box() { return gridView().findChild<QComboBox*>(); }
    QStringList entries() {
        QStringList all;
        for (int i = 0; box() && i < box()->count(); ++i)
            all.append(box()->itemText(i));
        return all;
    }
    void openList() { press(Qt::Key_Down, Qt::AltModifier); }
    void clickEntry(int entry) {
        const QAbstractItemView& list = *box()->view();
        QTest::mouseClick(list.viewport(), Qt::LeftButton, {},
                          list.visualRect(list.model()->index(entry, 0)).center());
        settle();
    }
    // The component of the line, once the cell was left.
    int storedComponent() {
        press(Qt::Key_Tab);
        return kota::test::recordOf(document.decayList).componentNum;
    }
};

TEST_F(AShownChoice, OffersAComponentWithABlankNameToo) {
    showComponents({"", "SALT"});
    openList();

    EXPECT_EQ(entries(), QStringList({"Undefined", "", "SALT"}));
    ASSERT_TRUE(box());
    EXPECT_EQ(box()->currentIndex(), 0);
}

TEST_F(AShownChoice, StoresTheEntryThatIsClickedBehindABlankOne) {
    showComponents({"", "SALT"});
    openList();
    ASSERT_TRUE(box() && box()->view()->isVisible());
    ASSERT_EQ(entries().last(), "SALT");
    clickEntry(static_cast<int>(entries().size()) - 1);

    EXPECT_EQ(displayed(1, 1), "SALT");
    EXPECT_EQ(storedComponent(), 2);
}

TEST_F(AShownChoice, StepsOverABlankEntryByKeys) {
    showComponents({"", "SALT"});
    press(Qt::Key_F2);
    press(Qt::Key_Down);
    ASSERT_TRUE(box());
    EXPECT_EQ(box()->currentIndex(), 1);
    press(Qt::Key_Down);

    EXPECT_EQ(box()->currentIndex(), 2);
    EXPECT_EQ(storedComponent(), 2);
}

TEST_F(AShownChoice, StepsFromOneOfTwoEqualNamesToTheOther) {
    showComponents({"A", "A", "B"});
    press(Qt::Key_F2);
    press(Qt::Key_Down);
    press(Qt::Key_Down);
    ASSERT_TRUE(box());
    EXPECT_EQ(box()->currentIndex(), 2);
    press(Qt::Key_Down);

    EXPECT_EQ(displayed(1, 1), "B");
    EXPECT_EQ(storedComponent(), 3);
}

TEST_F(AShownChoice, StepsBackThroughEqualNames) {
    showComponents({"A", "A", "B"});
    press(Qt::Key_F2);
    for (int step = 0; step < 3; ++step)
        press(Qt::Key_Down);
    press(Qt::Key_Up);

    EXPECT_EQ(storedComponent(), 2);
}

} // namespace
