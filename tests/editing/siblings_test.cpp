#include "platform/framework/messages.h"
#include "tests/support/document_window.h"

#include <gmock/gmock.h>

using namespace kota::test;

namespace {

using kota::headless::User;
using testing::ElementsAre;
using testing::IsEmpty;

// A view of another editor.
class ForeignView : public CView {
public:
    ForeignView() { Create(); }
};

class ASiblingsPackage : public DocumentWindow {
protected:
    ASiblingsPackage() {
        openProject();
        item.riverName = "JAMES";
        item.chainage = 125.0;
        item.dataType = 5;
        items.AddTail(&item);
        package.items = &items;
    }

    LRESULT send(CKota0_adDoc& document, WPARAM code) {
        return viewOf(document).SendMessage(communicationMessage(), code, reinterpret_cast<LPARAM>(&package));
    }

    CK31_CBE_ModelDataItem item;
    CObList items;
    CKHComm_Package package;
};

TEST_F(ASiblingsPackage, FromAnyViewOfThisEditorIsIgnored) {
    CKota0_adDoc& document = createDispersion();
    CKota0_adDoc& another = create();
    settle(document);

    for (CView* const sender : {&viewOf(document), &viewOf(another)})
        for (const WPARAM code : {42U, 62U, 82U}) {
            package.sender = sender;
            EXPECT_EQ(send(document, code), 0);
        }

    EXPECT_THAT(riversOf(document), ElementsAre("MISSOURI", "PLATTE"));
    EXPECT_FALSE(document.IsModified());
    EXPECT_THAT(told(), IsEmpty());
    EXPECT_THAT(boxes(), IsEmpty());
}

TEST_F(ASiblingsPackage, IsAnsweredWithNothingWhateverItsCode) {
    CKota0_adDoc& document = createDispersion();
    ForeignView sibling;

    for (CView* const sender : {static_cast<CView*>(nullptr), static_cast<CView*>(&sibling)})
        for (const WPARAM code : {42U, 0U, 1U, 61U, 63U, 503U, 523U}) {
            package.sender = sender;
            EXPECT_EQ(send(document, code), 0) << code;
        }

    EXPECT_THAT(riversOf(document), ElementsAre("MISSOURI", "PLATTE"));
    EXPECT_FALSE(document.IsModified());
    EXPECT_THAT(boxes(), IsEmpty());
}

TEST_F(ASiblingsPackage, MayBeMissing) {
    CKota0_adDoc& document = createDispersion();

    for (const WPARAM code : {42U, 62U, 82U, 7U})
        EXPECT_EQ(viewOf(document).SendMessage(communicationMessage(), code, 0), 0);

    EXPECT_THAT(riversOf(document), ElementsAre("MISSOURI", "PLATTE"));
    EXPECT_FALSE(document.IsModified());
}

TEST_F(ASiblingsPackage, MayComeWithoutItems) {
    CKota0_adDoc& document = createDispersion();
    package.items = nullptr;

    for (const WPARAM code : {42U, 62U, 82U})
        EXPECT_EQ(send(document, code), 0);
    CObList none;
    package.items = &none;
    for (const WPARAM code : {42U, 62U, 82U})
        EXPECT_EQ(send(document, code), 0);

    EXPECT_THAT(riversOf(document), ElementsAre("MISSOURI", "PLATTE"));
    EXPECT_FALSE(document.IsModified());
}

TEST_F(ASiblingsPackage, StaysItsSenders) {
    CKota0_adDoc& document = createDispersion();
    ForeignView sibling;
    package.sender = &sibling;

    for (const WPARAM code : {42U, 62U, 82U})
        send(document, code);

    EXPECT_EQ(items.GetCount(), 1);
    EXPECT_EQ(item.riverName, "JAMES");
}

class TheShellsProjectMessages : public DocumentWindow {};

TEST_F(TheShellsProjectMessages, AreAnsweredWithNothingAndChangeNothing) {
    openProject();
    CKota0_adDoc& document = createDispersion();
    const UINT message = RegisterWindowMessage("KOTAHubProjectManagement");

    for (const WPARAM code : {0U, 1U, 2U, 3U, 25U})
        EXPECT_EQ(viewOf(document).SendMessage(message, code, 0), 0);

    EXPECT_EQ(document.projectHandle, projectHandle);
    EXPECT_FALSE(document.IsModified());
    EXPECT_THAT(told(), IsEmpty());
}

} // namespace
