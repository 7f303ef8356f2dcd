#include "tests/platform/windows/test_document.h"

#include "platform/framework/input.h"

namespace {

using kota::Turn;
using kota::test::TestDocument;
using kota::test::TestTemplate;
using kota::test::TestView;
using testing::ElementsAre;
using testing::IsEmpty;

class Activation : public kota::test::WithDocuments {
protected:
    Activation() { TestView::activations.clear(); }

    CMDIChildWnd* front() { return session.mainWindow().MDIGetActive(); }

    TestTemplate& docTemplate = know();
    CDocument& first = *openWith(docTemplate, "/rivers/a.tst");
    CDocument& second = *openWith(docTemplate, "/rivers/b.tst");
    CView* const firstView = first.Views()[0];
    CView* const secondView = second.Views()[0];
};

TEST_F(Activation, TellsTheViewThatIsLeftAndThenTheOneThatIsEntered) {
    frameOf(first).ActivateFrame();

    EXPECT_THAT(TestView::activations,
                ElementsAre(TestView::Activation{secondView, false, secondView, secondView},
                            TestView::Activation{firstView, true, firstView, firstView}));
    EXPECT_EQ(front(), &frameOf(first));
    EXPECT_EQ(CWnd::GetFocus(), firstView);
}

TEST_F(Activation, TellsNobodyOfTheFrameInFront) {
    frameOf(second).ActivateFrame();

    EXPECT_THAT(TestView::activations, IsEmpty());
}

TEST_F(Activation, OfNoFrameTellsTheOneThatIsLeft) {
    session.mainWindow().MDIActivate(nullptr);

    EXPECT_THAT(TestView::activations,
                ElementsAre(TestView::Activation{secondView, false, secondView, secondView}));
    EXPECT_EQ(front(), nullptr);
}

TEST_F(Activation, GoesToAnotherFrameWhenTheOneInFrontIsClosed) {
    kota::input::close(frameOf(second));

    EXPECT_EQ(front(), &frameOf(first));
    EXPECT_EQ(CWnd::GetFocus(), firstView);
    ASSERT_EQ(TestView::activations.size(), 2U);
    EXPECT_EQ(TestView::activations[1], (TestView::Activation{firstView, true, firstView, firstView}));
}

TEST_F(Activation, StaysWhenAFrameBehindIsClosed) {
    kota::input::close(frameOf(first));

    EXPECT_EQ(front(), &frameOf(second));
    EXPECT_THAT(TestView::activations, IsEmpty());
}

TEST_F(Activation, MayCloseTheFrameThatIsLeft) {
    CFrameWnd& left = frameOf(second);
    TestView::onActivate = [&](const TestView& view, bool activate) {
        if (&view == secondView && !activate) {
            TestView::onActivate = nullptr;
            left.DestroyWindow();
        }
    };
    {
        const Turn turn;
        frameOf(first).ActivateFrame();
    }
    EXPECT_EQ(front(), &frameOf(first));
    EXPECT_EQ(TestDocument::living, 1);
}

TEST_F(Activation, MayCloseADocumentWhileItIsOpened) {
    TestView::onActivate = [&](const TestView& view, bool activate) {
        if (activate)
            view.GetParentFrame()->DestroyWindow();
    };

    EXPECT_EQ(openWith(docTemplate, "/rivers/c.tst"), nullptr);

    TestView::onActivate = nullptr;
    EXPECT_EQ(docTemplate.Documents().size(), 0U);
}

TEST_F(Activation, MayBringAThirdFrameToTheFront) {
    openWith(docTemplate, "/rivers/c.tst");
    TestView::onActivate = [&](const TestView& view, bool activate) {
        if (&view == firstView && activate)
            frameOf(second).ActivateFrame();
    };
    {
        const Turn turn;
        frameOf(first).ActivateFrame();
    }
    TestView::onActivate = nullptr;

    EXPECT_EQ(front(), &frameOf(second));
    EXPECT_EQ(CWnd::GetFocus(), secondView);
}

TEST_F(Activation, MayCloseTheFrameThatIsEntered) {
    CFrameWnd& entered = frameOf(first);
    TestView::onActivate = [&](const TestView& view, bool activate) {
        if (&view == firstView && activate)
            entered.DestroyWindow();
    };
    {
        const Turn turn;
        entered.ActivateFrame();
    }
    TestView::onActivate = nullptr;

    EXPECT_EQ(front(), &frameOf(second));
    EXPECT_EQ(CWnd::GetFocus(), secondView);
}

TEST_F(Activation, MayCloseTheMainWindow) {
    TestView::onActivate = [&](const TestView&, bool) {
        TestView::onActivate = nullptr;
        session.mainWindow().DestroyWindow();
    };

    session.closeMainWindow();

    EXPECT_EQ(session.mainWindow().GetSafeHwnd(), nullptr);
    EXPECT_EQ(TestDocument::living, 0);
}

TEST_F(Activation, WithinAFrameNamesBothViews) {
    const Turn turn;
    CFrameWnd& frame = frameOf(second);
    auto* const added = new TestView;
    added->CreateView(&frame, {.document = &second});

    frame.SetActiveView(added);

    EXPECT_THAT(TestView::activations, ElementsAre(TestView::Activation{secondView, false, added, secondView},
                                                   TestView::Activation{added, true, added, secondView}));
    EXPECT_EQ(frame.GetActiveView(), added);

    frame.SetActiveView(nullptr);
    EXPECT_EQ(frame.GetActiveView(), nullptr);
    EXPECT_EQ(frame.GetActiveDocument(), nullptr);
}

TEST_F(Activation, TellsWhichWindowsMayTakeTheFocus) {
    EXPECT_TRUE(secondView->MayTakeFocus());
    EXPECT_FALSE(firstView->MayTakeFocus());

    SetFocus(nullptr);
    EXPECT_TRUE(secondView->MayTakeFocus());
    EXPECT_FALSE(firstView->MayTakeFocus());
}

} // namespace
