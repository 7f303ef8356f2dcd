#include "platform/framework/input.h"
#include "resources/ids.h"
#include "tests/support/document_window.h"
#include "tests/support/temp_folder.h"

#include <gmock/gmock.h>

using namespace kota::test;

namespace {

using kota::headless::User;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

class Keys : public DocumentWindow {
protected:
    UINT commandOf(WPARAM key, bool control, bool shift = false, bool alt = false) {
        return shell().CommandOf({.key = key, .control = control, .shift = shift, .alt = alt});
    }
    // A saved document with a line that is not in its file yet.
    CKota0_adDoc& createChanged() {
        CKota0_adDoc& document = create();
        session.saveAs(document, folder.file("river.ad31"));
        addDispersion(document, "PLATTE", 2000.0);
        document.SetModifiedFlag();
        return document;
    }

    TempFolder folder;
};

TEST_F(Keys, RunTheCommandsOfTheDocumentInFront) {
    EXPECT_EQ(commandOf('S', true), 0U);

    create();

    EXPECT_EQ(commandOf('S', true), 57603U);
    EXPECT_EQ(commandOf('N', true), 57600U);
    EXPECT_EQ(commandOf(VK_INSERT, true), 57634U);
    EXPECT_EQ(commandOf(VK_INSERT, false, true), 57637U);
    EXPECT_EQ(commandOf(VK_DELETE, false, true), 57635U);
    EXPECT_EQ(commandOf(VK_BACK, false, false, true), 57643U);
    EXPECT_EQ(commandOf(VK_F6, false), 57680U);
    EXPECT_EQ(commandOf(VK_F6, false, true), 57681U);
}

TEST_F(Keys, RunNothingWithOtherModifiersThanTheirOwn) {
    create();

    EXPECT_EQ(commandOf('S', false), 0U);
    EXPECT_EQ(commandOf('S', true, true), 0U);
    EXPECT_EQ(commandOf('S', true, false, true), 0U);
    EXPECT_EQ(commandOf(VK_INSERT, false), 0U);
    EXPECT_EQ(commandOf(VK_F6, true), 0U);
}

TEST_F(Keys, SaveTheDocumentByControlS) {
    CKota0_adDoc& document = createChanged();

    EXPECT_TRUE(User(session).key('S', {.control = true}));

    EXPECT_THAT(folder.read("river.AD31"), HasSubstr("PLATTE"));
    EXPECT_FALSE(document.IsModified());
}

TEST_F(Keys, SaveWhatIsBeingTyped) {
    createChanged();
    User user(session);
    user.selectTab("Dispersion");
    user.putCursor(1, 1);
    user.type("KANSAS");

    EXPECT_TRUE(user.key('S', {.control = true}));

    EXPECT_THAT(folder.read("river.AD31"), HasSubstr("KANSAS"));
}

TEST_F(Keys, DoNotSaveByControlShiftS) {
    CKota0_adDoc& document = createChanged();

    User(session).key('S', {.shift = true, .control = true});

    EXPECT_THAT(folder.read("river.AD31"), Not(HasSubstr("PLATTE")));
    EXPECT_TRUE(document.IsModified());
}

TEST_F(Keys, SaveTheDocumentInFrontAndNoOther) {
    CKota0_adDoc& behind = createChanged();
    CKota0_adDoc& inFront = create();
    session.saveAs(inFront, folder.file("front.ad31"));
    inFront.SetModifiedFlag();

    EXPECT_TRUE(User(session).key('S', {.control = true}));

    EXPECT_FALSE(inFront.IsModified());
    EXPECT_TRUE(behind.IsModified());
    EXPECT_THAT(folder.read("river.AD31"), Not(HasSubstr("PLATTE")));
}

// A window inside a view that notes the keys that reach it.
class Noting : public CWnd {
public:
    explicit Noting(CView& around) {
        Create({.parent = around.GetSafeHwnd()});
        CWnd::SetFocus();
    }
    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override {
        if (message == WM_KEYDOWN)
            reached.push_back(wParam);
        return CWnd::WindowProc(message, wParam, lParam);
    }

    std::vector<WPARAM> reached;
};

TEST_F(Keys, GoNoFurtherWhenNobodyHandlesTheirCommand) {
    Noting window(viewOf(create()));
    ASSERT_FALSE(kota::input::canCommand(57600));
    ASSERT_FALSE(kota::input::canCommand(57601));

    kota::input::key('N', {.control = true});
    kota::input::key('O', {.control = true});

    kota::input::key(VK_DELETE, {.shift = true});

    EXPECT_THAT(window.reached, IsEmpty());
}

TEST_F(Keys, GoNoFurtherWhenTheirCommandWasRun) {
    Noting window(viewOf(createChanged()));

    EXPECT_TRUE(kota::input::key('S', {.control = true}));

    EXPECT_THAT(window.reached, IsEmpty());
}

TEST_F(Keys, GoNoFurtherWhenTheirCommandIsGreyed) {
    CKota0_adDoc& document = createChanged();
    Noting window(viewOf(document));
    shell().GetMenu()->EnableMenuItem(ID_FILE_SAVE, MF_BYCOMMAND | MF_GRAYED);

    kota::input::key('S', {.control = true});

    EXPECT_THAT(window.reached, IsEmpty());
    EXPECT_TRUE(document.IsModified());
}

TEST_F(Keys, GoToTheWindowWhenTheyAreNone) {
    Noting window(viewOf(create()));

    kota::input::key('K', {.control = true});

    EXPECT_THAT(window.reached, ElementsAre(WPARAM{'K'}));
}

constexpr kota::Accelerator ownKeys[] = {
    {.key = 'W', .command = ID_FILE_CLOSE, .control = true},
    {.key = 'S', .command = ID_FILE_CLOSE, .control = true},
};
constexpr kota::AcceleratorTable ownTable{.id = 1, .keys = ownKeys};

TEST_F(Keys, OfTheShellComeBehindTheDocuments) {
    shell().LoadAccelerators(ownTable);
    EXPECT_EQ(commandOf('S', true), 57602U);

    create();

    EXPECT_EQ(commandOf('S', true), 57603U);
    EXPECT_EQ(commandOf('W', true), 57602U);
    EXPECT_TRUE(kota::input::key('W', {.control = true}));
    EXPECT_EQ(shell().MDIGetActive(), nullptr);
}

} // namespace
