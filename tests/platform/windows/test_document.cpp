#include "tests/platform/windows/test_document.h"

namespace kota::test {

namespace {

constexpr StringResource strings[] = {
    {1, "Window\nSheet\nNew sheet\nSheets (*.TST)\n.TST\nTest.Sheet\nTest sheet"},
    {2, "Window\nOther\nNew other\nOthers (*.oth)\n.oth\nTest.Other\nTest other"},
};

const Module& documentModule() {
    static const Module module("document test", {.strings = strings});
    return module;
}

void reset() {
    TestDocument::emptied = 0;
    TestDocument::newWorks = true;
    TestDocument::saveWorks = true;
    TestDocument::saved.clear();
    TestView::initialUpdates = 0;
    TestView::creationWorks = true;
    TestView::activations.clear();
    TestView::onActivate = nullptr;
}

} // namespace

IMPLEMENT_DYNCREATE(TestDocument, CDocument, documentModule)
IMPLEMENT_DYNCREATE(TestView, CView, documentModule)

TestTemplate::TestTemplate(UINT id)
    : CMultiDocTemplate(id, RUNTIME_CLASS(TestDocument), RUNTIME_CLASS(CMDIChildWnd),
                        RUNTIME_CLASS(TestView)) {
    ++living;
}

WithDocuments::WithDocuments() {
    reset();
}

WithDocuments::~WithDocuments() {
    session.closeMainWindow();
    EXPECT_EQ(TestDocument::living, 0);
    EXPECT_EQ(TestView::living, 0);
    reset();
}

} // namespace kota::test
