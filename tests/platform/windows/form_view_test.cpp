#include "tests/platform/windows/test_document.h"

#include "platform/framework/dialog.h"

namespace {

using kota::test::TestDocument;
using testing::IsEmpty;

enum : UINT { FormId = 600, FirstEdit = 10, SecondEdit };

constexpr kota::DialogItem formItems[] = {kota::field("First", FirstEdit), kota::field("Second", SecondEdit)};
constexpr kota::DialogTemplate forms[] = {{.id = FormId, .caption = "Form", .items = formItems}};

const kota::Module& formModule() {
    static const kota::Module module("form test", {.dialogs = forms});
    return module;
}

class TestForm : public CFormView {
    DECLARE_DYNCREATE(TestForm)
public:
    TestForm() : CFormView(FormId) {}
};
IMPLEMENT_DYNCREATE(TestForm, CFormView, formModule)

class FormlessForm : public CFormView {
    DECLARE_DYNCREATE(FormlessForm)
public:
    FormlessForm() : CFormView(FormId + 1) {}
};
IMPLEMENT_DYNCREATE(FormlessForm, CFormView, formModule)

class Form : public kota::test::WithDocuments {
protected:
    static std::unique_ptr<CMultiDocTemplate> formTemplate(const CRuntimeClass* view) {
        return std::make_unique<CMultiDocTemplate>(1, RUNTIME_CLASS(TestDocument),
                                                   RUNTIME_CLASS(CMDIChildWnd), view);
    }
};

TEST_F(Form, IsMadeOfTheControlsOfItsTemplate) {
    const CDocument& document = *openWith(*formTemplate(RUNTIME_CLASS(TestForm)).release(), nullptr);

    const CWnd* const edit = document.Views()[0]->GetDlgItem(SecondEdit);

    ASSERT_NE(edit, nullptr);
    EXPECT_EQ(edit->State()->label, "Second");
    EXPECT_EQ(edit->GetParentFrame(), &frameOf(document));
}

TEST_F(Form, WithoutATemplateIsNotMade) {
    EXPECT_EQ(openWith(*formTemplate(RUNTIME_CLASS(FormlessForm)).release(), nullptr), nullptr);

    EXPECT_THAT(frames(), IsEmpty());
}

TEST_F(Form, GivesTheFocusToItsFirstControl) {
    const CDocument& document = *openWith(*formTemplate(RUNTIME_CLASS(TestForm)).release(), nullptr);

    EXPECT_EQ(CWnd::GetFocus(), document.Views()[0]->GetDlgItem(FirstEdit));
}

TEST_F(Form, GivesTheFocusToTheControlThatHadItLast) {
    CMultiDocTemplate& docTemplate = *formTemplate(RUNTIME_CLASS(TestForm)).release();
    const CDocument& first = *openWith(docTemplate, nullptr);
    CWnd* const edit = first.Views()[0]->GetDlgItem(SecondEdit);
    edit->SetFocus();
    const CDocument& second = *openWith(docTemplate, nullptr);
    ASSERT_EQ(CWnd::GetFocus(), second.Views()[0]->GetDlgItem(FirstEdit));

    frameOf(first).ActivateFrame();

    EXPECT_EQ(CWnd::GetFocus(), edit);
}

TEST_F(Form, GivesTheFocusToItsFirstControlOnceTheLastOneIsHidden) {
    CMultiDocTemplate& docTemplate = *formTemplate(RUNTIME_CLASS(TestForm)).release();
    const CDocument& first = *openWith(docTemplate, nullptr);
    CWnd* const edit = first.Views()[0]->GetDlgItem(SecondEdit);
    edit->SetFocus();
    openWith(docTemplate, nullptr);
    edit->ShowWindow(FALSE);

    frameOf(first).ActivateFrame();

    EXPECT_EQ(CWnd::GetFocus(), first.Views()[0]->GetDlgItem(FirstEdit));
}

} // namespace
