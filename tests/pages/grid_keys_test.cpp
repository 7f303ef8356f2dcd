#include "tests/pages/tabs.h"

namespace {

using kota::test::recordOf;
using testing::ElementsAre;
using testing::IsEmpty;

using Cell = std::pair<ROWCOL, ROWCOL>;
constexpr kota::input::Modifiers shift{.shift = true};

// A grid of three local lines and five columns.
class AGrid : public kota::test::OnThreeLines {
protected:
    bool addToSelection(ROWCOL row) {
        return kota::grid::clickLineHeader(grid(), row, kota::grid::Selecting::Add);
    }
};

struct Step {
    const char* name;
    WPARAM key;
    kota::input::Modifiers modifiers;
    Cell from;
    Cell to;
};

class AStepInAGrid : public AGrid, public testing::WithParamInterface<Step> {};

TEST_P(AStepInAGrid, GoesToTheNextCell) {
    const Step& step = GetParam();
    ASSERT_TRUE(user->putCursor(step.from.first, step.from.second));
    EXPECT_TRUE(user->key(step.key, step.modifiers));
    EXPECT_EQ(user->cursor(), step.to);
    EXPECT_EQ(rivers(), "ABC");
}

INSTANTIATE_TEST_SUITE_P(
    ByKey, AStepInAGrid,
    testing::Values(Step{"TabToTheRight", VK_TAB, {}, {1, 1}, {1, 2}},
                    Step{"EnterToTheRight", VK_RETURN, {}, {2, 4}, {2, 5}},
                    Step{"TabToTheNextLine", VK_TAB, {}, {1, 5}, {2, 1}},
                    Step{"EnterToTheNextLine", VK_RETURN, {}, {2, 5}, {3, 1}},
                    Step{"ShiftTabToTheLeft", VK_TAB, shift, {2, 2}, {2, 1}},
                    Step{"ShiftEnterToTheLeft", VK_RETURN, shift, {3, 5}, {3, 4}},
                    Step{"ShiftTabToTheEndOfTheLineAbove", VK_TAB, shift, {2, 1}, {1, 5}},
                    Step{"ShiftEnterToTheEndOfTheLineAbove", VK_RETURN, shift, {3, 1}, {2, 5}},
                    Step{"ShiftTabStaysInTheFirstCell", VK_TAB, shift, {1, 1}, {1, 1}},
                    Step{"ShiftTabToTheFirstCell", VK_TAB, shift, {1, 2}, {1, 1}},
                    Step{"DownByTheArrow", VK_DOWN, {}, {1, 2}, {2, 2}}),
    [](const auto& step) { return std::string(step.param.name); });

class TheLastCellOfAGrid : public AGrid, public testing::WithParamInterface<WPARAM> {};

TEST_P(TheLastCellOfAGrid, LeadsToTheStartOfANewLine) {
    ASSERT_TRUE(user->putCursor(3, 5));
    EXPECT_TRUE(user->key(GetParam()));
    EXPECT_EQ(rivers(), "ABC-");
    EXPECT_EQ(user->cursor(), Cell(4, 1));
}

TEST_P(TheLastCellOfAGrid, LeadsToTheLineAtThePlaceThatTheShellOffers) {
    shell().project().offers.push_back({.riverName = "D"});
    ASSERT_TRUE(user->putCursor(3, 5));
    EXPECT_TRUE(user->key(GetParam()));
    EXPECT_EQ(rivers(), "ABCD");
    EXPECT_EQ(user->cursor(), Cell(4, 1));
}

TEST_P(TheLastCellOfAGrid, IsStoredOnTheWayToANewLine) {
    ASSERT_TRUE(user->putCursor(3, 5));
    ASSERT_TRUE(user->type("77"));
    EXPECT_TRUE(user->key(GetParam()));
    EXPECT_EQ(rivers(), "ABC-");
    EXPECT_EQ(recordOf(document().decayList, 3).chainage, 77.0);
}

INSTANTIATE_TEST_SUITE_P(ByKey, TheLastCellOfAGrid, testing::Values(VK_TAB, VK_RETURN),
                         [](const auto& key) { return key.param == VK_TAB ? "Tab" : "Enter"; });

TEST_F(AGrid, KeepsTheCellOfABadNumber) {
    ASSERT_TRUE(user->putCursor(2, 2));
    ASSERT_TRUE(user->type("1e"));
    EXPECT_TRUE(user->key(VK_TAB));
    EXPECT_EQ(user->cursor(), Cell(2, 2));
    EXPECT_EQ(user->warning(), "Double number required");
}

TEST_F(AGrid, TakesABlankForANumber) {
    ASSERT_TRUE(user->putCursor(2, 5));
    EXPECT_TRUE(user->enter(""));
    EXPECT_EQ(recordOf(document().decayList, 2).chainage, notGiven);
}

TEST_F(AGrid, KeepsWhatWasTypedAndShowsItRounded) {
    put(2, 2, "0.98765");
    EXPECT_EQ(user->held(2, 2), "0.98765");
    EXPECT_EQ(user->shown(2, 2), "0.988");
    put(2, 5, "2.5e1");
    EXPECT_EQ(user->held(2, 5), "2.5e1");
    EXPECT_EQ(user->shown(2, 5), "25");
}

TEST_F(AGrid, AddsALineAtTheEndWhateverIsSelected) {
    ASSERT_TRUE(user->selectLines(2, 2));
    EXPECT_TRUE(user->key(VK_INSERT));
    EXPECT_EQ(rivers(), "ABC-");
    EXPECT_EQ(user->cursor(), Cell(4, 1));
}

TEST_F(AGrid, DeletesTheLinesThatAreSelectedByTheirHeaders) {
    ASSERT_TRUE(user->selectLines(1, 2));
    EXPECT_TRUE(user->key(VK_DELETE));
    EXPECT_EQ(rivers(), "C");
    EXPECT_EQ(user->held(1, 0), "1");
    EXPECT_EQ(document().decayList.GetCount(), 1);
    EXPECT_TRUE(document().IsModified());
}

TEST_F(AGrid, DeletesNothingWithTheCursorInACellAndNoLineSelected) {
    ASSERT_TRUE(user->putCursor(2, 1));
    EXPECT_TRUE(user->key(VK_DELETE));
    EXPECT_EQ(rivers(), "ABC");
    EXPECT_EQ(document().decayList.GetCount(), 3);
}

TEST_F(AGrid, DeletesNothingForSelectedCells) {
    ASSERT_TRUE(kota::grid::selectCells(grid(), CGXRange(1, 1, 2, 5)));
    EXPECT_TRUE(user->key(VK_DELETE));
    EXPECT_EQ(rivers(), "ABC");
}

TEST_F(AGrid, DeletesNothingForTwoSeparateSelections) {
    ASSERT_TRUE(user->selectLines(1, 1));
    ASSERT_TRUE(addToSelection(3));
    EXPECT_TRUE(user->key(VK_DELETE));
    EXPECT_EQ(rivers(), "ABC");
}

TEST_F(AGrid, LeavesOneLineWhenAllAreDeleted) {
    ASSERT_TRUE(user->selectLines(1, 3));
    EXPECT_TRUE(user->key(VK_DELETE));
    EXPECT_EQ(rivers(), "-");
}

TEST_F(AGrid, IsShownInTheOrderOfTheList) {
    document().decayList.AddHead(document().decayList.RemoveTail());
    fill();
    EXPECT_EQ(rivers(), "CAB");
    put(1, 4, "X");
    EXPECT_EQ(recordOf(document().decayList, 1).riverName, "X");
    EXPECT_EQ(recordOf(document().decayList, 3).riverName, "B");
}

TEST_F(AGrid, GoesBackToItsCellAfterAFillAndToTheLastLineWhenThatIsGone) {
    ASSERT_TRUE(user->putCursor(3, 4));
    fill();
    EXPECT_EQ(user->cursor(), Cell(3, 4));
    delete document().decayList.RemoveTail();
    fill();
    EXPECT_EQ(user->cursor(), Cell(2, 4));
}

TEST_F(AGrid, GoesToTheFirstCellAfterAFillWhenNoneWasCurrent) {
    shell().project().offers.push_back({.riverName = "D"});
    ASSERT_TRUE(user->key(VK_INSERT));
    ASSERT_EQ(user->cursor(), Cell(0, 0));
    fill();
    EXPECT_EQ(user->cursor(), Cell(1, 1));
    EXPECT_EQ(rivers(), "ABCD");
}

TEST_F(AGrid, TellsTheShellOfAnEditByTheColumnThatIsEntered) {
    openProject();
    document().projectHandle = projectHandle;
    ASSERT_TRUE(user->putCursor(1, 4));
    ASSERT_TRUE(user->type("NILE"));
    shell().forgetReceived();
    ASSERT_TRUE(user->putCursor(1, 5));
    EXPECT_THAT(shell().received(523), IsEmpty());
    ASSERT_TRUE(user->type("8"));
    ASSERT_TRUE(user->putCursor(1, 2));
    EXPECT_EQ(shell().received(523).size(), 1U);
}

} // namespace
