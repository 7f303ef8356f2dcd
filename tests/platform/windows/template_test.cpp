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

class Template : public kota::test::WithDocuments {};

TEST_F(Template, GivesThePartsOfItsString) {
    const TestTemplate docTemplate;
    using Part = CDocTemplate::DocString;

    EXPECT_EQ(docTemplate.GetDocString(Part::WindowTitle), "Window");
    EXPECT_EQ(docTemplate.GetDocString(Part::DocName), "Sheet");
    EXPECT_EQ(docTemplate.GetDocString(Part::FilterExtension), ".TST");
    EXPECT_EQ(docTemplate.GetDocString(Part::RegFileTypeName), "Test sheet");
    EXPECT_EQ(TestTemplate(99).GetDocString(Part::DocName), "");
}

TEST_F(Template, MakesANewDocumentInAFrameOfItsOwn) {
    TestTemplate& docTemplate = know();

    CDocument* const document = openWith(docTemplate, nullptr);

    ASSERT_NE(document, nullptr);
    EXPECT_EQ(document->GetDocTemplate(), &docTemplate);
    EXPECT_THAT(docTemplate.Documents(), ElementsAre(document));
    ASSERT_EQ(document->Views().size(), 1U);
    EXPECT_EQ(TestView::initialUpdates, 1);
    EXPECT_THAT(frames(), ElementsAre(&frameOf(*document)));
    EXPECT_EQ(frameOf(*document).GetActiveView(), document->Views()[0]);
    EXPECT_EQ(frameOf(*document).GetActiveDocument(), document);
    EXPECT_EQ(CWnd::GetFocus(), document->Views()[0]);
}

TEST_F(Template, NumbersItsNewDocuments) {
    TestTemplate& docTemplate = know();

    const CDocument& first = *openWith(docTemplate, nullptr);
    const CDocument& second = *openWith(docTemplate, nullptr);

    EXPECT_EQ(first.GetTitle(), "Sheet1");
    EXPECT_EQ(first.GetPathName(), "");
    EXPECT_EQ(second.GetTitle(), "Sheet2");
    EXPECT_EQ(frameOf(second).GetWindowText(), "Sheet2");
}

TEST_F(Template, NamesADocumentAndItsFrameByItsFile) {
    CDocument* const document = openWith(know(), "/rivers/platte.tst");

    ASSERT_NE(document, nullptr);
    EXPECT_EQ(document->GetPathName(), "/rivers/platte.tst");
    EXPECT_EQ(frameOf(*document).GetWindowText(), "platte.tst");

    document->SetPathName("/rivers/missouri.tst");
    EXPECT_EQ(frameOf(*document).GetWindowText(), "missouri.tst");
}

TEST_F(Template, MakesAFrameThatIsNotToBeSeenYet) {
    const Turn turn;

    CDocument* const document = know().OpenDocumentFile("/rivers/platte.tst", FALSE);

    ASSERT_NE(document, nullptr);
    EXPECT_FALSE(frameOf(*document).IsWindowVisible());
    EXPECT_EQ(session.mainWindow().MDIGetActive(), nullptr);
    EXPECT_EQ(GetFocus(), nullptr);
    EXPECT_EQ(TestView::initialUpdates, 1);
}

TEST_F(Template, LeavesNothingOfAFileThatCannotBeOpened) {
    TestTemplate& docTemplate = know();

    EXPECT_EQ(openWith(docTemplate, "/rivers/bad.tst"), nullptr);

    EXPECT_THAT(docTemplate.Documents(), IsEmpty());
    EXPECT_THAT(frames(), IsEmpty());
    EXPECT_EQ(TestDocument::living, 0);
    EXPECT_EQ(TestDocument::emptied, 1);
}

TEST_F(Template, LeavesNothingOfANewDocumentThatFails) {
    TestDocument::newWorks = false;

    EXPECT_EQ(openWith(know(), nullptr), nullptr);

    EXPECT_EQ(TestDocument::living, 0);
}

TEST_F(Template, LeavesNothingOfADocumentWhoseViewFails) {
    TestView::creationWorks = false;

    EXPECT_EQ(openWith(know(), "/rivers/platte.tst"), nullptr);

    EXPECT_EQ(TestDocument::living, 0);
    EXPECT_EQ(TestView::living, 0);
    EXPECT_THAT(frames(), IsEmpty());
}

TEST_F(Template, LeavesADocumentAsItWasWhenASecondViewFails) {
    const CDocument& document = *openWith(know(), "/rivers/platte.tst");
    TestView::creationWorks = false;

    kota::input::command(ID_WINDOW_NEW);

    EXPECT_EQ(document.Views().size(), 1U);
    EXPECT_EQ(frames().size(), 1U);
    EXPECT_EQ(TestView::living, 1);
}

TEST_F(Template, LeavesNothingWhereItsClassesAreOfTheWrongKind) {
    CMultiDocTemplate noDocument(1, RUNTIME_CLASS(TestView), RUNTIME_CLASS(CMDIChildWnd),
                                 RUNTIME_CLASS(TestView));
    auto noView = std::make_unique<CMultiDocTemplate>(
        1, RUNTIME_CLASS(TestDocument), RUNTIME_CLASS(CMDIChildWnd), RUNTIME_CLASS(TestDocument));
    auto noFrame = std::make_unique<CMultiDocTemplate>(1, RUNTIME_CLASS(TestDocument),
                                                       RUNTIME_CLASS(TestView), RUNTIME_CLASS(TestView));

    EXPECT_EQ(openWith(noDocument, nullptr), nullptr);
    EXPECT_EQ(openWith(*noView.release(), nullptr), nullptr);
    EXPECT_EQ(openWith(*noFrame.release(), nullptr), nullptr);

    EXPECT_EQ(TestDocument::living, 0);
    EXPECT_EQ(TestView::living, 0);
}

class TemplateOwner : public kota::test::WithDocuments {};

TEST_F(TemplateOwner, IsTheCallerUntilTheFirstDocument) {
    {
        const TestTemplate docTemplate;
        EXPECT_EQ(TestTemplate::living, 1);
    }
    EXPECT_EQ(TestTemplate::living, 0);
}

TEST_F(TemplateOwner, IsTheApplicationFromTheFirstDocumentToTheLast) {
    auto* const docTemplate = new TestTemplate;
    CDocument* const first = openWith(*docTemplate, nullptr);
    CDocument* const second = openWith(*docTemplate, nullptr);

    kota::input::close(frameOf(*first));
    EXPECT_EQ(TestTemplate::living, 1);
    EXPECT_THAT(docTemplate->Documents(), ElementsAre(second));

    kota::input::close(frameOf(*second));
    EXPECT_EQ(TestTemplate::living, 0);
}

TEST_F(TemplateOwner, IsTheApplicationAfterADocumentThatFailed) {
    auto* const docTemplate = new TestTemplate;

    EXPECT_EQ(openWith(*docTemplate, "/rivers/bad.tst"), nullptr);

    EXPECT_EQ(TestTemplate::living, 0);
}

TEST_F(TemplateOwner, KeepsItForAFurtherDocumentOfTheSameTurn) {
    auto* const docTemplate = new TestTemplate;
    CDocument* document = nullptr;
    {
        const Turn turn;
        docTemplate->OpenDocumentFile("/rivers/bad.tst");
        document = docTemplate->OpenDocumentFile("/rivers/platte.tst");
    }
    ASSERT_NE(document, nullptr);
    EXPECT_EQ(TestTemplate::living, 1);
    EXPECT_EQ(document->GetDocTemplate(), docTemplate);

    kota::input::close(frameOf(*document));
    EXPECT_EQ(TestTemplate::living, 0);
}

TEST_F(TemplateOwner, IsTheApplicationToItsEndForAKnownOne) {
    TestTemplate& docTemplate = know();
    kota::input::close(frameOf(*openWith(docTemplate, nullptr)));

    EXPECT_EQ(TestTemplate::living, 1);
    EXPECT_THAT(session.application().Templates(), ElementsAre(&docTemplate));
    EXPECT_NE(openWith(docTemplate, nullptr), nullptr);
}

TEST_F(TemplateOwner, BecomesTheApplicationForAnAdoptedOneThatIsMadeKnown) {
    auto made = std::make_unique<TestTemplate>();
    TestTemplate& docTemplate = *made;
    CDocument* const document = openWith(docTemplate, nullptr);

    session.application().AddDocTemplate(std::move(made));
    kota::input::close(frameOf(*document));

    EXPECT_EQ(TestTemplate::living, 1);
}

class OpeningAFile : public kota::test::WithDocuments {
protected:
    CDocument* open(const char* path) {
        const Turn turn;
        return session.application().OpenDocumentFile(path);
    }

    TestTemplate& sheets = know(1);
    TestTemplate& others = know(2);
};

TEST_F(OpeningAFile, TakesTheTemplateOfItsExtensionInAnyCase) {
    EXPECT_EQ(open("/rivers/a.tst")->GetDocTemplate(), &sheets);
    EXPECT_EQ(open("/rivers/b.TST")->GetDocTemplate(), &sheets);
    EXPECT_EQ(open("/rivers/c.oth")->GetDocTemplate(), &others);
    EXPECT_EQ(open("/rivers/d.OtH")->GetDocTemplate(), &others);
}

TEST_F(OpeningAFile, FailsWithoutATemplateOfItsExtension) {
    EXPECT_EQ(open("/rivers/a.txt"), nullptr);
    EXPECT_EQ(open("/rivers/a"), nullptr);
    EXPECT_EQ(open("/rivers/bad.tst"), nullptr);

    EXPECT_THAT(frames(), IsEmpty());
}

TEST_F(OpeningAFile, BringsItToTheFrontWhenItIsOpen) {
    CDocument* const first = open("/rivers/a.tst");
    CDocument* const second = open("/rivers/b.tst");
    ASSERT_EQ(session.mainWindow().MDIGetActive(), &frameOf(*second));

    EXPECT_EQ(open("/rivers/a.tst"), first);

    EXPECT_EQ(frames().size(), 2U);
    EXPECT_EQ(session.mainWindow().MDIGetActive(), &frameOf(*first));
    EXPECT_EQ(CWnd::GetFocus(), first->Views()[0]);
}

} // namespace
