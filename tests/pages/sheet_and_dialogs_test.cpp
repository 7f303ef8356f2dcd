#include "editing/dlg_property_sheet.h"
#include "editing/search_dialogs.h"
#include "platform/framework/input.h"
#include "platform/framework/message_box.h"
#include "platform/framework/messages.h"
#include "platform/headless/session.h"
#include "resources/ids.h"

#include <gtest/gtest.h>

#include <set>

namespace {

class TheSearchDialog : public testing::Test {
protected:
    // The controls that are greyed where the user may give those terms.
    std::set<UINT> greyed(CSearchDlg::Mode terms) {
        std::set<UINT> controls;
        session.screen().answerDialog([&](CDialog& dialog) {
            for (UINT id = ControlId::SearchRiverName; id <= ControlId::SearchNotUsed; ++id)
                if (const CWnd* const control = dialog.GetDlgItem(id); control && !control->IsWindowEnabled())
                    controls.insert(id);
            dialog.EndDialog(IDCANCEL);
        });
        CSearchDlg(1, "", 0.0, 3, 0, terms, &session.mainWindow()).DoModal();
        return controls;
    }

    kota::headless::Session session{[](const std::string& text) { ADD_FAILURE() << text; }};
};

TEST_F(TheSearchDialog, TakesTheTermsThatThePageHas) {
    EXPECT_EQ(greyed(CSearchDlg::AllTerms), std::set<UINT>());
    EXPECT_EQ(greyed(CSearchDlg::NoComponent), std::set<UINT>({1096}));
    EXPECT_EQ(greyed(CSearchDlg::ComponentOnly), std::set<UINT>({1088, 1089, 1090, 1091, 1092, 1093, 1094}));
}

// A sheet in a window that is no view.
class ASheet : public testing::Test {
protected:
    ASheet() {
        window.Create({.parent = session.mainWindow().GetSafeHwnd(), .kind = kota::WindowKind::View});
        placeholder.Create({.parent = window.GetSafeHwnd(), .id = 7, .kind = kota::WindowKind::Plain});
        placeholder.SetWindowRect({30, 40, 50, 60});
    }

    kota::headless::Session session{[](const std::string& text) { ADD_FAILURE() << text; }};
    CWnd window;
    CWnd placeholder;
    CDlgPropertySheet sheet{"Sheet"};
};

TEST_F(ASheet, TakesThePlaceOfItsPlaceholder) {
    sheet.EmbedInView(&window, 7);

    EXPECT_EQ(placeholder.GetSafeHwnd(), nullptr);
    EXPECT_EQ(sheet.GetWindowRect().left, 30);
    EXPECT_EQ(sheet.GetWindowRect().top, 40);
}

TEST_F(ASheet, LeavesAllWhereItIsWithoutAPlaceholder) {
    sheet.EmbedInView(&window, 0xFFFFFFFF);

    EXPECT_NE(placeholder.GetSafeHwnd(), nullptr);
    EXPECT_EQ(sheet.GetWindowRect().left, 0);
    EXPECT_EQ(sheet.GetParent(), &window);
}

TEST_F(ASheet, TakesTheKeyThatClosesADocumentWithoutAViewToo) {
    sheet.EmbedInView(&window, 7);
    ASSERT_EQ(sheet.ownerView, nullptr);
    sheet.GetTabControl()->SetFocus();

    EXPECT_FALSE(kota::input::key(VK_F4)) << "Ctrl is not held";
    EXPECT_TRUE(kota::input::key(VK_F4, {.control = true}));
}

} // namespace
