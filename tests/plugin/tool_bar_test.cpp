#include "platform/foundation/frames.h"
#include "platform/headless/session.h"
#include "tests/plugin/allocations.h"
#include "tests/plugin/failing_buttons.h"
#include "tests/plugin/plug_in.h"

#include <gmock/gmock.h>

using namespace kota::test;

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

constexpr unsigned style = 0x50002000;
constexpr unsigned barId = 59407;

// A shell's main window, at which nothing was docked yet.
class ToolBar : public testing::Test {
protected:
    ToolBar() { plugIn(); } // loaded before anything is counted

    static std::unique_ptr<CKhToolBarEx> create(CKhMDIFrameWnd* at, int index = 0) {
        using Create = CKhToolBarEx*(CKhMDIFrameWnd*, unsigned, unsigned, int);
        return std::unique_ptr<CKhToolBarEx>(exported<Create>("KhCreateToolbar")(at, style, barId, index));
    }
    static int init(CKhToolBarEx* bar, CKhMDIFrameWnd* at, unsigned index = 0) {
        using Init = int(CKhToolBarEx*, CKhMDIFrameWnd*, unsigned, unsigned, unsigned);
        return exported<Init>("KhInitToolbar")(bar, at, style, barId, index);
    }
    static void expectSetUp(const CKhToolBarEx& bar) {
        EXPECT_EQ(bar.GetDlgCtrlID(), barId);
        EXPECT_EQ(bar.GetStyle(), style);
        EXPECT_EQ(bar.GetBarStyle(), 0x34U);
        EXPECT_EQ(bar.DockingSides(), 0xF000U);
        ASSERT_NE(bar.Buttons(), nullptr);
        EXPECT_EQ(bar.Buttons()->id, 4787U);
        EXPECT_THAT(bar.Buttons()->commands, ElementsAre(42550U, 42551U));
    }
    // Neither a window nor buttons, nor a place at the frame.
    void expectUntouched(const CKhToolBarEx& bar) {
        EXPECT_EQ(bar.GetSafeHwnd(), nullptr);
        EXPECT_EQ(bar.Buttons(), nullptr);
        EXPECT_EQ(bar.GetBarStyle(), 0U);
        EXPECT_EQ(bar.DockingSides(), 0U);
        EXPECT_THAT(frame.DockedBars(), IsEmpty());
        EXPECT_EQ(frame.DockingSides(), 0U);
    }

    kota::headless::Session session{[](const std::string& text) { ADD_FAILURE() << text; }};
    CKhMDIFrameWnd& frame = session.mainWindow();
};

TEST_F(ToolBar, IsMadeAtTheFrameWithItsButtonsAndDocked) {
    const auto bar = create(&frame);

    ASSERT_NE(bar, nullptr);
    expectSetUp(*bar);
    EXPECT_EQ(bar->GetParent(), &frame);
    EXPECT_THAT(frame.DockedBars(), ElementsAre(bar.get()));
    EXPECT_EQ(frame.DockingSides(), 0xF000U);
}

TEST_F(ToolBar, OfTheCallersIsSetUpTheSameWay) {
    CKhToolBarEx bar;

    EXPECT_EQ(init(&bar, &frame), 1);

    expectSetUp(bar);
    EXPECT_EQ(bar.GetParent(), &frame);
    EXPECT_THAT(frame.DockedBars(), ElementsAre(&bar));
    EXPECT_EQ(frame.DockingSides(), 0xF000U);
}

TEST_F(ToolBar, KeepsTheStyleThatTheCallerGaveIt) {
    CKhToolBarEx bar;
    bar.SetBarStyle(0x100);

    EXPECT_EQ(init(&bar, &frame), 1);

    EXPECT_EQ(bar.GetBarStyle(), 0x134U);
}

TEST_F(ToolBar, HasButtonsOfSixteenByFifteenPixelsWithPrompts) {
    const auto bar = create(&frame);

    ASSERT_NE(bar, nullptr);
    EXPECT_EQ(bar->Buttons()->buttonWidth, 16);
    EXPECT_EQ(bar->Buttons()->buttonHeight, 15);
    EXPECT_TRUE(bar->HasCommand(42550));
    EXPECT_TRUE(bar->HasCommand(42551));
    EXPECT_FALSE(bar->HasCommand(42561));
    EXPECT_EQ(bar->ResourceModule(), &plugInModule());
    EXPECT_EQ(bar->ResourceModule()->string(42550), "Search for river name/topo ID.\nSearch");
    EXPECT_EQ(bar->ResourceModule()->string(42551),
              "Search for next occurence of river name/ topo ID.\nFind Next");
}

TEST_F(ToolBar, IsAnotherOneForEachCall) {
    const auto first = create(&frame);
    const auto second = create(&frame);

    ASSERT_TRUE(first && second);
    EXPECT_NE(first, second);
    EXPECT_THAT(frame.DockedBars(), ElementsAre(first.get(), second.get()));
}

TEST_F(ToolBar, IsTheCallersToDelete) {
    create(&frame).reset();
    const int before = allocationsHeld();

    auto bar = create(&frame);
    EXPECT_GT(allocationsHeld(), before);
    bar.reset();

    EXPECT_EQ(allocationsHeld(), before);
    EXPECT_THAT(frame.DockedBars(), IsEmpty());
}

TEST_F(ToolBar, IsNotMadeForAnotherIndexThanZero) {
    for (const int index : {1, 2, -1}) {
        const int before = allocationsMade();
        EXPECT_EQ(create(&frame, index), nullptr) << index;
        EXPECT_EQ(allocationsMade(), before) << index;
    }
    EXPECT_THAT(frame.DockedBars(), IsEmpty());
    EXPECT_EQ(frame.DockingSides(), 0U);
}

TEST_F(ToolBar, OfTheCallersIsNotCreatedForAnIndexAboveZero) {
    for (const unsigned index : {1U, 2U, 0xFFFFFFFFU}) {
        CKhToolBarEx bar;
        EXPECT_EQ(init(&bar, &frame, index), 0) << index;
        expectUntouched(bar);
        EXPECT_EQ(init(nullptr, &frame, index), 0) << index;
        EXPECT_EQ(init(nullptr, nullptr, index), 0) << index;
    }
}

TEST_F(ToolBar, ThatCannotBeMadeLeavesNothingBehind) {
    CKhMDIFrameWnd withoutWindow;
    for (CKhMDIFrameWnd* const at : {static_cast<CKhMDIFrameWnd*>(nullptr), &withoutWindow}) {
        EXPECT_EQ(create(at), nullptr);
        const int before = allocationsHeld();
        EXPECT_EQ(create(at), nullptr);
        EXPECT_EQ(allocationsHeld(), before);
    }
    EXPECT_THAT(withoutWindow.DockedBars(), IsEmpty());
}

TEST_F(ToolBar, IsNotMadeWhenItOrItsWindowCannotBeAllocated) {
    create(&frame).reset();
    const int before = allocationsHeld();
    for (const int spared : {0, 1}) {
        const FailingAllocations failing(spared);
        EXPECT_EQ(create(&frame), nullptr) << spared;
        EXPECT_TRUE(failing.done()) << spared;
    }
    EXPECT_EQ(allocationsHeld(), before);
    EXPECT_THAT(frame.DockedBars(), IsEmpty());
}

TEST_F(ToolBar, OfTheCallersIsNotCreatedWhenItsWindowCannotBeAllocated) {
    CKhToolBarEx bar;
    const FailingAllocations failing(0);

    EXPECT_EQ(init(&bar, &frame), 0);

    EXPECT_TRUE(failing.done());
    expectUntouched(bar);
}

TEST_F(ToolBar, OfTheCallersStaysAsItIsWhenItCannotBeCreated) {
    CKhMDIFrameWnd withoutWindow;
    CKhToolBarEx bar;

    EXPECT_EQ(init(&bar, nullptr), 0);
    EXPECT_EQ(init(&bar, &withoutWindow), 0);
    EXPECT_EQ(init(nullptr, &frame), 0);

    expectUntouched(bar);
    EXPECT_EQ(init(&bar, &frame), 1) << "and may be created later";
}

TEST_F(ToolBar, IsDeletedAgainWithoutButtons) {
    create(&frame).reset();
    const FailingButtons failing;
    const int before = allocationsHeld();

    EXPECT_EQ(create(&frame), nullptr);

    EXPECT_EQ(allocationsHeld(), before);
    EXPECT_THAT(frame.DockedBars(), IsEmpty());
}

TEST_F(ToolBar, OfTheCallersKeepsItsWindowWithoutButtons) {
    CKhToolBarEx bar;
    const FailingButtons failing;

    EXPECT_EQ(init(&bar, &frame), 0);

    EXPECT_EQ(bar.GetParent(), &frame);
    EXPECT_EQ(bar.GetBarStyle(), 0U);
    EXPECT_EQ(bar.DockingSides(), 0U);
    EXPECT_THAT(frame.DockedBars(), IsEmpty());
    EXPECT_EQ(frame.DockingSides(), 0U);
}

TEST_F(ToolBar, ThatHasAWindowAlreadyIsLeftAlone) {
    CKhToolBarEx bar;
    ASSERT_TRUE(bar.Create(&frame, 0, 1234));
    const HWND window = bar.GetSafeHwnd();

    EXPECT_EQ(init(&bar, &frame), 0);

    EXPECT_EQ(bar.GetSafeHwnd(), window);
    EXPECT_EQ(bar.GetDlgCtrlID(), 1234U);
    EXPECT_EQ(bar.GetStyle(), 0U);
    EXPECT_EQ(bar.Buttons(), nullptr);
    EXPECT_EQ(bar.GetBarStyle(), 0U);
    EXPECT_THAT(frame.DockedBars(), IsEmpty());
}

TEST_F(ToolBar, IsNotInitialisedTwice) {
    CKhToolBarEx bar;
    ASSERT_EQ(init(&bar, &frame), 1);

    EXPECT_EQ(init(&bar, &frame), 0);

    expectSetUp(bar);
    EXPECT_THAT(frame.DockedBars(), ElementsAre(&bar));
}

TEST_F(ToolBar, ComesWithThePlugInThatASessionLoads) {
    session.load(KOTA_PLUG_IN);

    ASSERT_EQ(session.toolBars().size(), 1U);
    EXPECT_THAT(frame.DockedBars(), ElementsAre(session.toolBars()[0].get()));
}

} // namespace
