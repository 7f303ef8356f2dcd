#include "editing/kota0_ad_view.h"
#include "platform/framework/template.h"
#include "plugin/Kota0_ad.h"
#include "tests/support/editor.h"

#include <memory>

namespace {

using DocString = CDocTemplate::DocString;

TEST(PlugIn, OffersOneTemplate) {
    EXPECT_EQ(KhGetNumDocTemplates(), 1);
    for (const int index : {-1, 1, 2, 4787})
        EXPECT_EQ(KhGetDocTemplatePtr(index), nullptr) << index;
}

TEST(PlugIn, MakesANewTemplateForEachCall) {
    const std::unique_ptr<CMultiDocTemplate> first(KhGetDocTemplatePtr(0));
    const std::unique_ptr<CMultiDocTemplate> second(KhGetDocTemplatePtr(0));
    const std::unique_ptr<CMultiDocTemplate> third(CKota0_ad::CreateMainDlg());

    ASSERT_TRUE(first && second && third);
    EXPECT_NE(first, second);
    EXPECT_NE(second, third);
}

TEST(PlugIn, IsForDocumentsOfItsOwnClass) {
    const std::unique_ptr<CMultiDocTemplate> docTemplate(KhGetDocTemplatePtr(0));

    EXPECT_EQ(docTemplate->Id(), 4787U);
    EXPECT_EQ(docTemplate->DocumentClass(), RUNTIME_CLASS(CKota0_adDoc));
}

TEST(PlugIn, NamesItsDocumentsInSevenParts) {
    const std::unique_ptr<CMultiDocTemplate> docTemplate(KhGetDocTemplatePtr(0));

    EXPECT_EQ(docTemplate->GetDocString(DocString::WindowTitle), "K31_Help.chm") << "the help file's name";
    EXPECT_EQ(docTemplate->GetDocString(DocString::DocName), "ADPar");
    EXPECT_EQ(docTemplate->GetDocString(DocString::FileNewName), "KOTA 31 AD Parameters");
    EXPECT_EQ(docTemplate->GetDocString(DocString::FilterName), "KOTA 31 AD Parameters (*.ad31)");
    EXPECT_EQ(docTemplate->GetDocString(DocString::FilterExtension), ".ad31");
    EXPECT_EQ(docTemplate->GetDocString(DocString::RegFileTypeId), "ADPar.Document");
    EXPECT_EQ(docTemplate->GetDocString(DocString::RegFileTypeName), "ADPar Document");
}

class PlugInInAShell : public kota::test::Editor {};

TEST_F(PlugInInAShell, MakesDocumentsWithItsOwnFrameAndView) {
    CKota0_adDoc& document = create();

    CFrameWnd* const frame = session.mainWindow().MDIGetActive();
    ASSERT_NE(frame, nullptr);
    EXPECT_STREQ(frame->GetRuntimeClass()->Name(), "CDlgFrame");
    EXPECT_TRUE(frame->GetActiveView()->IsKindOf(RUNTIME_CLASS(CKota0_adView)));
    EXPECT_EQ(frame->GetActiveDocument(), &document);
    EXPECT_EQ(document.GetTitle(), "ADPar1");
    EXPECT_EQ(frame->GetWindowText(), "ADPar1");
}

TEST_F(PlugInInAShell, OpensADocumentThroughATemplateThatNobodyElseKnows) {
    CMultiDocTemplate* const docTemplate = CKota0_ad::CreateMainDlg();

    const CDocument* const document = docTemplate->OpenDocumentFile(nullptr);

    ASSERT_NE(document, nullptr);
    EXPECT_EQ(document->GetDocTemplate(), docTemplate)
        << "the application deletes it after the last document";
}

} // namespace
