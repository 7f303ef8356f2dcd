#pragma once

#include "tests/platform/windows/test_windows.h"

#include "platform/framework/property_sheet.h"

#include <functional>
#include <string>
#include <vector>

namespace kota::test {

enum : UINT { FirstPage = 500, SecondPage, EmptyPage };
enum : UINT { ValueEdit = 10, OtherEdit };

// A page that notes what happens to it.
class NotingPage : public CPropertyPage {
    DECLARE_DYNAMIC(NotingPage)
public:
    NotingPage(UINT id, std::vector<std::string>& told) : CPropertyPage(id), told_(&told) {}

    BOOL OnInitDialog() override {
        Note("made");
        return CPropertyPage::OnInitDialog();
    }
    BOOL OnSetActive() override {
        Note("entered");
        if (onEnter)
            onEnter();
        return CPropertyPage::OnSetActive();
    }
    BOOL OnKillActive() override {
        Note("left");
        return onLeave ? onLeave() : CPropertyPage::OnKillActive();
    }
    void DoDataExchange(CDataExchange* exchange) override { DDX_Text(exchange, ValueEdit, value); }

    int value = 0;
    std::function<void()> onEnter;
    std::function<bool()> onLeave;

private:
    void Note(const char* what) { told_->push_back(std::string(GetCaption().View()) + " " + what); }

    std::vector<std::string>* told_;
};

// A sheet of three pages, not made yet.
class WithSheet : public testing::Test {
protected:
    WithSheet() {
        for (NotingPage* page : {&first, &second, &empty})
            sheet.AddPage(page);
    }

    void create() {
        ASSERT_TRUE(sheet.Create(&owner, 5, 7));
        told.clear();
    }
    CWnd& tabs() const { return *sheet.GetTabControl(); }
    // Nothing of the choice of the first page has changed.
    void expectFirstPage() const {
        EXPECT_EQ(sheet.GetActiveIndex(), 0);
        EXPECT_EQ(tabs().State()->chosen, 0);
        EXPECT_TRUE(first.IsWindowVisible());
        EXPECT_FALSE(second.IsWindowVisible());
    }

    WatchedScreen screen;
    std::vector<std::string> told;
    TestWindow owner;
    NotingPage first{FirstPage, told};
    NotingPage second{SecondPage, told};
    NotingPage empty{EmptyPage, told};
    NotingPage stranger{FirstPage, told};
    CPropertySheet sheet{"Pages"};
};

} // namespace kota::test
