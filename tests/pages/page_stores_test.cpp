#include "pages/comp_page.h"
#include "pages/decay_page.h"
#include "platform/framework/frame.h"
#include "platform/framework/turn.h"
#include "platform/grid/grid.h"
#include "resources/ids.h"
#include "tests/pages/on_a_page.h"

namespace {

using kota::test::recordOf;

// A page on a tab whose window the shell closes.
class AClosedPage : public kota::test::OnAPage {
protected:
    explicit AClosedPage(const char* tab = "Components") : OnAPage(tab) {}

    // Closes the window, changes the document, and has the page store what it shows. All in one turn: page
    // and document are there until its end.
    template <class Change, class Expect>
    void storeBehind(Change change, Expect expect) {
        const kota::Turn turn;
        CGenPropertyPage& closed = page();
        CKota0_adDoc& changed = document();
        user->view().GetParentFrame()->DestroyWindow();
        ASSERT_EQ(closed.GetSafeHwnd(), nullptr);
        change(changed);
        closed.StoreToDocument();
        expect(changed);
    }
};

TEST_F(AClosedPage, OfOneBlankComponentLineLeavesTheListAlone) {
    storeBehind([](CKota0_adDoc& changed) { kota::test::addComponent(changed.compList, 1, "SALT", 0); },
                [](CKota0_adDoc& changed) {
                    ASSERT_EQ(changed.compList.GetCount(), 1);
                    EXPECT_EQ(recordOf(changed.compList).name, "SALT");
                });
}

TEST_F(AClosedPage, OfComponentsLeavesNewerOnesAlone) {
    kota::test::addComponent(document().compList, 1, "OLD", 0);
    fill();
    storeBehind([](CKota0_adDoc& changed) { recordOf(changed.compList).name = "NEW"; },
                [](CKota0_adDoc& changed) { EXPECT_EQ(recordOf(changed.compList).name, "NEW"); });
}

class AClosedDecayPage : public AClosedPage {
protected:
    AClosedDecayPage() : AClosedPage("Decay") {}
};

TEST_F(AClosedDecayPage, LeavesTheListAlone) {
    storeBehind([](CKota0_adDoc& changed) { recordOf(changed.decayList).decayConst = 7.0; },
                [](CKota0_adDoc& changed) { EXPECT_EQ(recordOf(changed.decayList).decayConst, 7.0); });
}

// A page whose blanks cannot be repaired for now.
class RefusingPage : public CDecayPage {
public:
    using CDecayPage::CDecayPage;

    bool refuses = true;

protected:
    int RepairBlanks() override { return refuses ? 0 : CDecayPage::RepairBlanks(); }
};

// Such a page in front of another one, with a constant of 0.25 in the document and of 5 in its grid.
class APageThatRefusesToBeRepaired : public testing::Test {
protected:
    APageThatRefusesToBeRepaired() {
        kota::test::addGlobal(document.decayList, 1).decayConst = 0.25;
        sheet.AddPage(&page);
        sheet.AddPage(&other);
        sheet.Create(nullptr, 0, 0);
        auto* const grid = dynamic_cast<CGXGridCore*>(page.GetDlgItem(ControlId::DecayGrid));
        grid->SetValueRange(CGXRange(1, 2), "5");
    }
    double storedConstant() { return recordOf(document.decayList).decayConst; }

    kota::Turn turn; // at whose end the controls' plain objects are deleted
    kota::test::OwnedDocument document;
    CPropertySheet sheet;
    RefusingPage page{&document};
    CCompPage other{&document};
};

TEST_F(APageThatRefusesToBeRepaired, KeepsItsTabAndLeavesTheListAsItWas) {
    EXPECT_FALSE(sheet.SetActivePage(1));

    EXPECT_EQ(sheet.GetActivePage(), &page);
    ASSERT_EQ(document.decayList.GetCount(), 1);
    EXPECT_EQ(storedConstant(), 0.25);
}

TEST_F(APageThatRefusesToBeRepaired, StoresAndGoesOnceItIs) {
    page.refuses = false;

    EXPECT_TRUE(sheet.SetActivePage(1));

    EXPECT_EQ(sheet.GetActivePage(), &other);
    EXPECT_EQ(storedConstant(), 5.0);
}

} // namespace
