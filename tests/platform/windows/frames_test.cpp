#include "tests/platform/windows/test_document.h"

#include "platform/framework/input.h"
#include "platform/framework/message_box.h"

namespace {

using kota::Turn;
using kota::test::TestDocument;
using kota::test::TestTemplate;
using kota::test::TestView;
using testing::ElementsAre;
using testing::IsEmpty;

class ClosingAFrame : public kota::test::WithDocuments {
protected:
    CDocument& open() { return *openWith(docTemplate, "/rivers/platte.tst"); }

    TestTemplate& docTemplate = know();
};

TEST_F(ClosingAFrame, EndsADocumentWithoutChangesUnasked) {
    CDocument& document = open();

    EXPECT_TRUE(kota::input::close(frameOf(document)));

    EXPECT_EQ(TestDocument::living, 0);
    EXPECT_EQ(TestDocument::emptied, 1);
    EXPECT_EQ(TestView::living, 0);
    EXPECT_THAT(docTemplate.Documents(), IsEmpty());
    EXPECT_THAT(frames(), IsEmpty());
    EXPECT_EQ(session.mainWindow().MDIGetActive(), nullptr);
    EXPECT_EQ(GetFocus(), nullptr);
}

TEST_F(ClosingAFrame, SavesTheChangesOnYes) {
    CDocument& document = open();
    document.SetModifiedFlag();
    session.screen().answerBox(IDYES);

    EXPECT_TRUE(kota::input::close(frameOf(document)));

    EXPECT_THAT(TestDocument::saved, ElementsAre("/rivers/platte.tst"));
    EXPECT_EQ(TestDocument::living, 0);
}

TEST_F(ClosingAFrame, DropsTheChangesOnNo) {
    CDocument& document = open();
    document.SetModifiedFlag();
    session.screen().answerBox(IDNO);

    EXPECT_TRUE(kota::input::close(frameOf(document)));

    EXPECT_THAT(TestDocument::saved, IsEmpty());
    EXPECT_EQ(TestDocument::living, 0);
}

TEST_F(ClosingAFrame, IsNotDoneOnCancel) {
    CDocument& document = open();
    document.SetModifiedFlag();
    session.screen().answerBox(IDCANCEL);

    EXPECT_FALSE(kota::input::close(frameOf(document)));

    EXPECT_EQ(TestDocument::living, 1);
    EXPECT_EQ(frames().size(), 1U);
    EXPECT_EQ(CWnd::GetFocus(), document.Views()[0]);
}

TEST_F(ClosingAFrame, IsNotDoneWhenTheSaveFails) {
    CDocument& document = open();
    document.SetModifiedFlag();
    TestDocument::saveWorks = false;
    session.screen().answerBox(IDYES);

    EXPECT_FALSE(kota::input::close(frameOf(document)));

    EXPECT_EQ(TestDocument::living, 1);
}

TEST_F(ClosingAFrame, OfTwoAsksNothingAndKeepsTheDocument) {
    CDocument& document = open();
    kota::input::command(ID_WINDOW_NEW);
    document.SetModifiedFlag();

    EXPECT_TRUE(kota::input::close(frameOf(document, 0)));

    EXPECT_EQ(TestDocument::living, 1);
    ASSERT_EQ(document.Views().size(), 1U);
    EXPECT_THAT(frames(), ElementsAre(&frameOf(document)));

    session.screen().answerBox(IDNO);
    EXPECT_TRUE(kota::input::close(frameOf(document)));
    EXPECT_EQ(TestDocument::living, 0);
}

TEST_F(ClosingAFrame, LeavesTheDocumentToTheEndOfTheTurn) {
    CDocument& document = open();
    {
        const Turn turn;
        kota::input::close(frameOf(document));
        EXPECT_EQ(TestDocument::living, 1);
        EXPECT_EQ(TestView::living, 1);
    }
    EXPECT_EQ(TestDocument::living, 0);
}

TEST_F(ClosingAFrame, IsDoneByTheFilesCommandForAllFramesOfTheDocument) {
    CDocument& document = open();
    kota::input::command(ID_WINDOW_NEW);
    const CDocument& other = *openWith(docTemplate, nullptr);
    static_cast<CMDIChildWnd&>(frameOf(document)).ActivateFrame();

    EXPECT_TRUE(kota::input::command(ID_FILE_CLOSE));

    EXPECT_THAT(docTemplate.Documents(), ElementsAre(&other));
    EXPECT_THAT(frames(), ElementsAre(&frameOf(other)));
}

TEST_F(ClosingAFrame, MayHappenWhileTheUserIsAsked) {
    CDocument& document = open();
    CFrameWnd& frame = frameOf(document);
    document.SetModifiedFlag();
    session.screen().onBox = [&] { frame.DestroyWindow(); };
    session.screen().answerBox(IDNO);

    EXPECT_TRUE(kota::input::close(frame));

    EXPECT_EQ(TestDocument::living, 0);
}

TEST_F(ClosingAFrame, IsDoneByControlF4InItsView) {
    CDocument& document = open();
    ASSERT_EQ(CWnd::GetFocus(), document.Views()[0]);

    EXPECT_FALSE(kota::input::key(VK_F4));
    EXPECT_EQ(TestDocument::living, 1);

    EXPECT_TRUE(kota::input::key(VK_F4, {.control = true}));
    EXPECT_EQ(TestDocument::living, 0);
}

// A window inside a view that hands Ctrl+F4 on to it.
class HandingOn : public CWnd {
public:
    BOOL PreTranslateMessage(MSG* message) override {
        return GetParent()->PostMessage(message->message, message->wParam, message->lParam);
    }
};

TEST_F(ClosingAFrame, IsDoneByControlF4PostedToItsView) {
    CDocument& document = open();
    HandingOn inside;
    inside.Create({.parent = document.Views()[0]->GetSafeHwnd()});
    inside.SetFocus();

    EXPECT_TRUE(kota::input::key(VK_F4, {.control = true}));

    EXPECT_EQ(TestDocument::living, 0);
}

class Keeping : public CWnd {
public:
    bool LetFocusGo() override { return false; }
};

TEST_F(ClosingAFrame, IsNotDoneWhileWhatTheUserTypedIsRefused) {
    CDocument& document = open();
    Keeping edit;
    edit.Create({.parent = document.Views()[0]->GetSafeHwnd(), .kind = kota::WindowKind::Edit});
    edit.SetFocus();
    document.SetModifiedFlag();

    EXPECT_FALSE(kota::input::close(frameOf(document)));

    EXPECT_EQ(CWnd::GetFocus(), &edit);
    EXPECT_EQ(TestDocument::living, 1);
}

TEST_F(ClosingAFrame, IsNotDoneForAHiddenOne) {
    CFrameWnd& frame = frameOf(open());
    frame.ShowWindow(FALSE);

    EXPECT_FALSE(kota::input::close(frame));

    EXPECT_EQ(TestDocument::living, 1);
}

class ClosingTheMainWindow : public kota::test::WithDocuments {
protected:
    ClosingTheMainWindow() {
        first.SetModifiedFlag();
        second.SetModifiedFlag();
    }

    TestTemplate& docTemplate = know();
    CDocument& first = *openWith(docTemplate, "/rivers/a.tst");
    CDocument& second = *openWith(docTemplate, "/rivers/b.tst");
};

TEST_F(ClosingTheMainWindow, AsksForEachDocument) {
    session.screen().answerBox(IDYES);
    session.screen().answerBox(IDNO);

    EXPECT_TRUE(kota::input::close(session.mainWindow()));

    EXPECT_THAT(TestDocument::saved, ElementsAre("/rivers/a.tst"));
    EXPECT_EQ(TestDocument::living, 0);
    EXPECT_EQ(AfxGetMainWnd(), nullptr);
}

TEST_F(ClosingTheMainWindow, IsNotDoneWhenADocumentStays) {
    session.screen().answerBox(IDNO);
    session.screen().answerBox(IDCANCEL);

    EXPECT_FALSE(kota::input::close(session.mainWindow()));

    EXPECT_THAT(frames(), ElementsAre(&frameOf(first), &frameOf(second))) << "and so does the one before";
}

TEST_F(ClosingTheMainWindow, EndsAllWithoutAQuestionWhenTheShellDoesIt) {
    session.closeMainWindow();

    EXPECT_EQ(TestDocument::living, 0);
}

class NewWindow : public kota::test::WithDocuments {
protected:
    TestTemplate& docTemplate = know();
};

TEST_F(NewWindow, IsASecondViewOfTheSameDocumentInFront) {
    CDocument& document = *openWith(docTemplate, "/rivers/platte.tst");

    EXPECT_TRUE(kota::input::command(ID_WINDOW_NEW));

    ASSERT_EQ(document.Views().size(), 2U);
    EXPECT_EQ(docTemplate.Documents().size(), 1U);
    EXPECT_NE(&frameOf(document, 0), &frameOf(document, 1));
    EXPECT_EQ(session.mainWindow().MDIGetActive(), &frameOf(document, 1));
    EXPECT_EQ(frameOf(document, 0).GetWindowText(), "platte.tst:1");
    EXPECT_EQ(frameOf(document, 1).GetWindowText(), "platte.tst:2");
    EXPECT_EQ(TestView::initialUpdates, 2);

    document.SetPathName("/rivers/missouri.tst");
    EXPECT_EQ(frameOf(document, 0).GetWindowText(), "missouri.tst:1");
    EXPECT_EQ(frameOf(document, 1).GetWindowText(), "missouri.tst:2");

    kota::input::close(frameOf(document, 0));
    EXPECT_EQ(frameOf(document, 0).GetWindowText(), "missouri.tst");
}

TEST_F(NewWindow, ShowsTheMarkOfChangesAsTheFirstOneDoes) {
    CDocument& document = *openWith(docTemplate, "/rivers/platte.tst");
    document.SetModifiedFlag();
    kota::input::command(ID_WINDOW_NEW);
    EXPECT_TRUE(frameOf(document, 0).State()->modified);
    EXPECT_TRUE(frameOf(document, 1).State()->modified);

    document.SetModifiedFlag(FALSE);
    EXPECT_FALSE(frameOf(document, 0).State()->modified);
    EXPECT_FALSE(frameOf(document, 1).State()->modified);
}

TEST_F(NewWindow, IsNoneWithoutADocument) {
    kota::input::command(ID_WINDOW_NEW);

    EXPECT_THAT(frames(), IsEmpty());
}

} // namespace
