#include "tests/platform/grid/test_grid.h"

namespace {

using kota::CellKind;
namespace user = kota::grid;

TEST(ChoiceList, EndsItsEntriesByEitherLineEnd) {
    const CString list("Closed\r\nOpen\n\nLast");

    EXPECT_EQ(CGXControl::EntryOfChoiceList(0, list), "Closed");
    EXPECT_EQ(CGXControl::EntryOfChoiceList(1, list), "Open");
    EXPECT_EQ(CGXControl::EntryOfChoiceList(2, list), "");
    EXPECT_EQ(CGXControl::EntryOfChoiceList(3, list), "Last");
    EXPECT_EQ(CGXControl::EntryOfChoiceList(4, list), "");
    EXPECT_EQ(CGXControl::EntryOfChoiceList(-1, list), "");
}

TEST(ChoiceList, HasNoEntryBehindItsLastLineEnd) {
    EXPECT_EQ(CGXControl::FindStringInChoiceList("", "a\r\nb\r\n", TRUE), -1);
    EXPECT_EQ(CGXControl::FindStringInChoiceList("", "a\r\n\r\n", TRUE), 1);
    EXPECT_EQ(CGXControl::FindStringInChoiceList("", "", TRUE), -1);
}

TEST(ChoiceList, IsSearchedExactlyOrByTheStartOfAnEntry) {
    const CString list("Undefined\nOxygen\nOxide\n");

    EXPECT_EQ(CGXControl::FindStringInChoiceList("Oxide", list, TRUE), 2);
    EXPECT_EQ(CGXControl::FindStringInChoiceList("oxide", list, TRUE), -1);
    EXPECT_EQ(CGXControl::FindStringInChoiceList("Ox", list, TRUE), -1);
    EXPECT_EQ(CGXControl::FindStringInChoiceList("Ox", list, FALSE), 1);
    EXPECT_EQ(CGXControl::FindStringInChoiceList("xide", list, FALSE), -1);
}

class Controls : public testing::Test {
protected:
    TestGrid grid;
};

TEST_F(Controls, AreThoseThatTheCellsStylesName) {
    EXPECT_EQ(grid.GetControl(1, 1), grid.edit);
    EXPECT_EQ(grid.GetControl(4, 1), grid.edit);
    EXPECT_EQ(grid.GetControl(1, 2)->Kind(), CellKind::Choice);
    EXPECT_EQ(grid.GetControl(1, 3)->Kind(), CellKind::CheckBox);
    EXPECT_EQ(grid.GetControl(1, 4)->Kind(), CellKind::Choice);
    EXPECT_EQ(grid.GetControl(1, 5)->Kind(), CellKind::FreeChoice);
    EXPECT_EQ(grid.GetControl(0, 1)->Kind(), CellKind::Text);
    EXPECT_EQ(grid.edit->ItemId(), 7U);
    EXPECT_EQ(grid.edit->Grid(), &grid);
}

TEST_F(Controls, ThatNobodyRegisteredAreTextControls) {
    grid.SetStyleRange(CGXRange(1, 1), CGXStyle().SetControl(12345));

    EXPECT_EQ(grid.GetControl(1, 1)->Kind(), CellKind::Text);
}

TEST_F(Controls, AreReplacedByOnesRegisteredLater) {
    auto other = std::make_unique<CheckedEdit>(&grid);
    const CGXControl* const pointer = other.get();
    grid.goTo(1, 1);
    user::typeText(grid, "typed");

    EXPECT_TRUE(grid.RegisterControl(TestGrid::checkedEdit, std::move(other)));
    EXPECT_FALSE(grid.RegisterControl(TestGrid::checkedEdit, nullptr));

    EXPECT_EQ(grid.GetControl(1, 1), pointer);
    EXPECT_FALSE(grid.IsEditing());
}

TEST_F(Controls, OfTextShowTheValueAsItIs) {
    grid.write(1, 1, "1.50");

    EXPECT_EQ(grid.shown(1, 1), "1.50");
    EXPECT_EQ(grid.shown(9, 9), "");
}

class UpperEdit : public CGXEditControl {
public:
    explicit UpperEdit(CGXGridCore* grid) : CGXEditControl(grid, 0) {}
    CString GetDisplayText(const CString& value, const CGXStyle& style) override {
        return "<" + value + ">" + style.GetUserAttribute(1);
    }
    BOOL GetValue(CString& value) override {
        value = GetCurrentText() + "!";
        return value.GetLength() > 1;
    }
};

TEST_F(Controls, DecideWhatIsShownAndWhatIsStored) {
    grid.RegisterControl(99, std::make_unique<UpperEdit>(&grid));
    grid.SetStyleRange(CGXRange(1, 1), CGXStyle().SetControl(99).SetUserAttribute(1, "m"));
    grid.write(1, 1, "a");
    EXPECT_EQ(grid.shown(1, 1), "<a>m");
    grid.goTo(1, 1);

    user::typeText(grid, "b");
    EXPECT_EQ(grid.shown(1, 1), "b");
    user::commit(grid);

    EXPECT_EQ(grid.text(1, 1), "b!");
    EXPECT_EQ(grid.shown(1, 1), "<b!>m");
}

TEST_F(Controls, WithoutAValueStoreNothing) {
    grid.RegisterControl(99, std::make_unique<UpperEdit>(&grid));
    grid.SetStyleRange(CGXRange(1, 1), CGXStyle().SetControl(99));
    grid.write(1, 1, "a");
    grid.goTo(1, 1);

    user::typeText(grid, "");

    EXPECT_TRUE(user::commit(grid));
    EXPECT_EQ(grid.text(1, 1), "a");
}

TEST_F(Controls, OfChoicesShowTheEntryThatTheNumberNames) {
    grid.write(1, 2, "1");
    grid.write(1, 4, "1");

    EXPECT_EQ(grid.shown(1, 2), "Open");
    EXPECT_EQ(grid.shown(1, 4), "mg");
}

TEST_F(Controls, OfChoicesShowAValueThatNamesNoEntry) {
    for (const char* value : {"3", "-1", "x", "1x", "99999999999", ""}) {
        grid.write(1, 2, value);
        EXPECT_EQ(grid.shown(1, 2), value);
    }
    for (const char* value : {"0", "3", "-2147483648"}) {
        grid.write(1, 4, value);
        EXPECT_EQ(grid.shown(1, 4), value);
    }
}

TEST_F(Controls, OfChoicesStoreTheNumberOfTheEntry) {
    grid.goTo(1, 2);
    EXPECT_TRUE(user::typeText(grid, "Open"));
    EXPECT_TRUE(user::commit(grid));
    grid.goTo(1, 4);
    EXPECT_TRUE(user::typeText(grid, "kg"));
    EXPECT_TRUE(user::commit(grid));

    EXPECT_EQ(grid.text(1, 2), "1");
    EXPECT_EQ(grid.text(1, 4), "2");
}

TEST_F(Controls, OfChoicesTakeAnEntryInAnyCaseIfThereIsOne) {
    grid.SetStyleRange(CGXRange(1, 2), CGXStyle().SetChoiceList("Abc\nabc\nXyz\n"));
    grid.goTo(1, 2);

    EXPECT_TRUE(user::typeText(grid, "abc"));
    EXPECT_EQ(grid.shown(1, 2), "abc");
    EXPECT_FALSE(user::typeText(grid, "ABC"));
    EXPECT_EQ(grid.shown(1, 2), "abc");
    EXPECT_TRUE(user::typeText(grid, "xYZ"));
    EXPECT_EQ(grid.shown(1, 2), "Xyz");
}

TEST_F(Controls, OfChoicesTakeNoOtherText) {
    grid.write(1, 2, "0");
    grid.goTo(1, 2);

    EXPECT_FALSE(user::typeText(grid, "Ope"));
    EXPECT_FALSE(user::typeText(grid, ""));

    EXPECT_FALSE(grid.IsEditing());
    EXPECT_EQ(grid.shown(1, 2), "Closed");
    EXPECT_THAT(grid.calls, testing::Not(testing::Contains("OnModifyCell 1 2")));
}

TEST_F(Controls, OfChoicesBeginWithTheEntryThatIsStored) {
    grid.write(1, 2, "1");
    grid.goTo(1, 2);

    user::dropDown(grid, true);

    EXPECT_EQ(grid.GetControl(1, 2)->GetCurrentText(), "Open");
    EXPECT_TRUE(user::commit(grid));
    EXPECT_EQ(grid.text(1, 2), "1");
}

TEST_F(Controls, OfChoicesTellTwoEntriesOfOneNameApart) {
    grid.SetStyleRange(CGXRange(1, 2), CGXStyle().SetChoiceList("Undefined\nSame\nSame\n"));
    grid.goTo(1, 2);

    EXPECT_TRUE(user::chooseEntry(grid, 2));
    EXPECT_TRUE(user::commit(grid));

    EXPECT_EQ(grid.text(1, 2), "2");
}

TEST_F(Controls, OfChoicesHaveNoEntryBeyondTheList) {
    grid.goTo(1, 2);

    EXPECT_FALSE(user::chooseEntry(grid, 3));
    EXPECT_FALSE(user::chooseEntry(grid, -1));

    EXPECT_FALSE(grid.IsEditing());
}

TEST_F(Controls, OfFreeTextTakeEntriesAndAnyText) {
    grid.goTo(1, 5);
    EXPECT_TRUE(user::chooseEntry(grid, 1));
    EXPECT_EQ(grid.shown(1, 5), "OHIO");
    EXPECT_FALSE(user::chooseEntry(grid, 2));

    EXPECT_TRUE(user::typeText(grid, "Red River"));
    EXPECT_TRUE(user::commit(grid));

    EXPECT_EQ(grid.text(1, 5), "Red River");
}

TEST_F(Controls, OfPlainTextHaveNoEntries) {
    grid.SetStyleRange(CGXRange(1, 1), CGXStyle().SetChoiceList("a\nb\n"));
    grid.goTo(1, 1);

    EXPECT_FALSE(user::chooseEntry(grid, 0));
    EXPECT_FALSE(grid.IsEditing());
}

TEST_F(Controls, OfAListAreOpenUntilAnEntryIsChosen) {
    grid.goTo(1, 2);
    bool openWhenTold = true;
    grid.onModify = [&](ROWCOL row, ROWCOL col) {
        openWhenTold = grid.GetControl(row, col)->IsDroppedDown();
    };

    user::dropDown(grid, true);
    EXPECT_TRUE(grid.GetControl(1, 2)->IsDroppedDown());
    EXPECT_TRUE(grid.IsEditing());
    user::chooseEntry(grid, 1);

    EXPECT_FALSE(openWhenTold);
    EXPECT_FALSE(grid.GetControl(1, 2)->IsDroppedDown());
}

TEST_F(Controls, TellATextThatChangedWhileTheListWasOpenOnceMoreWhenItCloses) {
    grid.goTo(1, 5);
    std::vector<bool> open;
    grid.onModify = [&](ROWCOL row, ROWCOL col) {
        open.push_back(grid.GetControl(row, col)->IsDroppedDown());
    };
    user::dropDown(grid, true);
    user::typeText(grid, "O");

    user::dropDown(grid, false);
    user::dropDown(grid, false);

    EXPECT_THAT(open, testing::ElementsAre(true, false));
}

TEST_F(Controls, TellNoTextOnceMoreThatWasLoadedAnewWhileTheListWasOpen) {
    grid.goTo(1, 5);
    user::dropDown(grid, true);
    user::typeText(grid, "O");
    grid.RedrawRowCol(CGXRange(1, 5));
    grid.calls.clear();

    user::dropDown(grid, false);

    EXPECT_THAT(grid.calls, testing::IsEmpty());
    EXPECT_FALSE(grid.IsEditPending());
}

TEST_F(Controls, CloseTheirListWithTheEdit) {
    grid.goTo(1, 2);
    user::dropDown(grid, true);

    grid.SetCurrentCell(2, 1);

    EXPECT_FALSE(grid.GetControl(1, 2)->IsDroppedDown());
}

TEST_F(Controls, OfACellThatTakesNoInputOpenNoList) {
    grid.SetStyleRange(CGXRange(1, 2), CGXStyle().SetReadOnly(TRUE));
    grid.goTo(1, 2);

    user::dropDown(grid, true);

    EXPECT_FALSE(grid.GetControl(1, 2)->IsDroppedDown());
    EXPECT_FALSE(grid.IsEditing());
}

class CheckBox : public Controls {};

TEST_F(CheckBox, ShowsNoTextAndTakesNone) {
    grid.write(1, 3, "1");
    grid.goTo(1, 3);

    EXPECT_EQ(grid.shown(1, 3), "");
    EXPECT_FALSE(user::typeText(grid, "0"));
    EXPECT_EQ(grid.text(1, 3), "1");
    EXPECT_THAT(grid.calls, testing::IsEmpty());
}

TEST_F(CheckBox, ChangesItsStoredValueAtOnceAndTellsIt) {
    grid.goTo(1, 3);
    std::string storedWhenTold;
    grid.onModify = [&](ROWCOL row, ROWCOL col) { storedWhenTold = grid.text(row, col); };

    EXPECT_TRUE(user::toggle(grid));

    EXPECT_EQ(storedWhenTold, "1");
    EXPECT_EQ(grid.text(1, 3), "1");
    EXPECT_THAT(grid.calls, testing::ElementsAre("OnModifyCell 1 3", "OnClickedButtonRowCol 1 3 1"));
    EXPECT_FALSE(grid.IsEditing());
    EXPECT_TRUE(user::toggle(grid));
    EXPECT_EQ(grid.text(1, 3), "0");
}

TEST_F(CheckBox, IsCheckedByEveryNumberButZero) {
    for (const auto& [before, after] :
         {std::pair("", "1"), {"0", "1"}, {"x", "1"}, {"2", "0"}, {"-1", "0"}}) {
        grid.write(1, 3, before);
        grid.goTo(1, 3);
        user::toggle(grid);
        EXPECT_EQ(grid.text(1, 3), after) << "from " << before;
    }
}

TEST_F(CheckBox, BecomesCurrentByAClickAndThenChanges) {
    EXPECT_TRUE(user::clickCell(grid, 2, 3));

    EXPECT_THAT(grid.calls, testing::ElementsAre("SetCurrentCell 2 3 10", "OnModifyCell 2 3",
                                                 "OnClickedButtonRowCol 2 3 1"));
    EXPECT_EQ(grid.current(), "2,3");
}

TEST_F(CheckBox, StaysWhenTheCurrentCellRefusesToBeLeft) {
    grid.goTo(1, 1);
    user::typeText(grid, "bad");

    EXPECT_FALSE(user::clickCell(grid, 2, 3));

    EXPECT_EQ(grid.text(2, 3), "");
    EXPECT_EQ(grid.current(), "1,1");
}

TEST_F(CheckBox, ThatIsReadOnlyBecomesCurrentAndDoesNotChange) {
    grid.SetStyleRange(CGXRange(2, 3), CGXStyle().SetReadOnly(TRUE));

    EXPECT_TRUE(user::clickCell(grid, 2, 3));
    EXPECT_FALSE(user::toggle(grid));

    EXPECT_EQ(grid.text(2, 3), "");
    EXPECT_EQ(grid.current(), "2,3");
    EXPECT_THAT(grid.calls, testing::ElementsAre("SetCurrentCell 2 3 10"));
}

TEST_F(CheckBox, IsNothingThatATextCellHas) {
    grid.goTo(1, 1);

    EXPECT_FALSE(user::toggle(grid));

    EXPECT_EQ(grid.text(1, 1), "");
}

} // namespace
