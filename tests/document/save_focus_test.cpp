#include "platform/headless/session.h"
#include "tests/support/owned.h"
#include "tests/support/recording_view.h"
#include "tests/support/temp_folder.h"

#include <gmock/gmock.h>

using namespace kota::test;

namespace {

// A window that notes who takes the focus from it.
class FocusedWindow : public CWnd {
public:
    FocusedWindow() { Create(); }

    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override {
        if (message == WM_KILLFOCUS) {
            ++losses;
            takenBy = reinterpret_cast<HWND>(wParam);
        }
        return CWnd::WindowProc(message, wParam, lParam);
    }

    int losses = 0;
    HWND takenBy = nullptr;
};

class FocusAtASave : public testing::Test {
protected:
    void save() { document.OnSaveDocument(folder.file("file.AD31").c_str()); }

    kota::headless::Session session{[](const std::string& text) { ADD_FAILURE() << text; }};
    TempFolder folder;
    OwnedDocument document;
    FocusedWindow edit;
};

TEST_F(FocusAtASave, GoesToTheMainWindowAndThenToNone) {
    edit.SetFocus();

    save();

    EXPECT_EQ(edit.losses, 1);
    EXPECT_EQ(edit.takenBy, session.mainWindow().GetSafeHwnd());
    EXPECT_EQ(GetFocus(), nullptr);
}

TEST_F(FocusAtASave, IsTakenAwayFromTheMainWindowToo) {
    session.mainWindow().SetFocus();

    save();

    EXPECT_EQ(GetFocus(), nullptr);
}

TEST_F(FocusAtASave, IsGoneBeforeTheViewsStore) {
    RecordingView view(document);
    edit.SetFocus();
    HWND atStore = edit.GetSafeHwnd();
    view.onUpdate = [&](LPARAM hint) {
        if (hint == UpdateHint::Store)
            atStore = GetFocus();
    };

    save();

    EXPECT_EQ(atStore, nullptr);
    EXPECT_EQ(edit.losses, 1);
}

TEST_F(FocusAtASave, GoesToNoneWhereThereIsNoMainWindow) {
    session.closeMainWindow();
    edit.SetFocus();

    save();

    EXPECT_EQ(edit.losses, 1);
    EXPECT_EQ(edit.takenBy, nullptr);
    EXPECT_EQ(GetFocus(), nullptr);
    EXPECT_TRUE(folder.has("file.AD31"));
}

TEST(FocusAtASaveWithoutAnApplication, GoesToNone) {
    const TempFolder folder;
    OwnedDocument document;
    FocusedWindow edit;
    edit.SetFocus();

    EXPECT_EQ(document.OnSaveDocument(folder.file("file.AD31").c_str()), 1);

    EXPECT_EQ(GetFocus(), nullptr);
    EXPECT_TRUE(folder.has("file.AD31"));
}

} // namespace
