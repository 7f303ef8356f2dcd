#include "platform/framework/command.h"
#include "platform/framework/input.h"
#include "tests/platform/grid/test_grid.h"

namespace {

class SelectionKeys : public testing::Test {
protected:
    SelectionKeys() {
        grid.SetFocus();
        grid.goTo(2, 2);
    }
    void press(WPARAM key, kota::input::Modifiers held = {.shift = true}) {
        EXPECT_TRUE(kota::input::key(key, held));
    }

    TestGrid grid;
};

TEST_F(SelectionKeys, ExtendTheSelectionFromTheCurrentCell) {
    press(VK_RIGHT);
    EXPECT_EQ(grid.selected(), "cells 2,2-2,3");
    press(VK_DOWN);
    EXPECT_EQ(grid.selected(), "cells 2,2-3,3");
    press(VK_LEFT);
    press(VK_LEFT);
    EXPECT_EQ(grid.selected(), "cells 2,1-3,2");
    press(VK_UP);
    press(VK_UP);
    EXPECT_EQ(grid.selected(), "cells 1,1-2,2");
    EXPECT_EQ(grid.current(), "2,2");
}

TEST_F(SelectionKeys, ExtendItToTheEdges) {
    press(VK_END, {.shift = true, .control = true});
    EXPECT_EQ(grid.selected(), "cells 2,2-4,5");
}

TEST_F(SelectionKeys, SelectTheLineBySpaceAndMoreByTheArrows) {
    press(VK_SPACE);
    EXPECT_EQ(grid.selected(), "rows 2-2");
    press(VK_DOWN);
    EXPECT_EQ(grid.selected(), "rows 2-3");
    press(VK_UP);
    press(VK_UP);
    EXPECT_EQ(grid.selected(), "rows 1-2");
}

TEST_F(SelectionKeys, SelectAllCellsButNoLines) {
    press('A', {.control = true});
    EXPECT_EQ(grid.selected(), "cells 1,1-4,5");
}

TEST_F(SelectionKeys, EndTheSelectionWithoutShift) {
    press(VK_RIGHT);
    press(VK_DOWN, {});
    EXPECT_EQ(grid.selected(), "");
    EXPECT_EQ(grid.current(), "3,2");
}

TEST_F(SelectionKeys, SelectNothingWithoutACurrentCell) {
    grid.goTo(0, 0);
    press(VK_RIGHT);
    EXPECT_FALSE(kota::input::key(VK_SPACE, {.shift = true}));
    EXPECT_EQ(grid.selected(), "");
}

} // namespace
