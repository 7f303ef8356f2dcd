#include "platform/foundation/frames.h"
#include "platform/foundation/plug_in.h"
#include "platform/language/language.h"
#include "tests/plugin/allocations.h"
#include "tests/plugin/exported_names.h"
#include "tests/plugin/plug_in.h"

#include <gmock/gmock.h>

#include <functional>
#include <set>
#include <string>

using namespace kota::test;

namespace {

using testing::UnorderedElementsAre;

// Those of C++, and those that linkers and sanitizers add.
bool isDecorated(const std::string& name) {
    static const std::set<std::string> added = {"_init", "_fini", "_edata", "_end"};
    return name.starts_with("_Z") || name.starts_with("__") || added.contains(name);
}

TEST(Exports, StandInTheLibraryUndecoratedAndNoOtherNameDoes) {
    std::set<std::string> names = exportedNames(KOTA_PLUG_IN);
    EXPECT_TRUE(names.contains("_ZTV9CKota0_ad")) << "the whole table is read";

    std::erase_if(names, isDecorated);

    EXPECT_THAT(names, UnorderedElementsAre("KhGetNumDocTemplates", "KhGetDocTemplatePtr", "KhGetNumToolbars",
                                            "KhCreateToolbar", "KhInitToolbar", "KhGetBitmapId",
                                            "KhGetEditorString", "KhGetToolbarString", "K31MSGGetData",
                                            "K31MSGInsertData", "K31MSGDeleteData", "K31MSGSelectData"));
}

TEST(Exports, AreTheLibrarysOwn) {
    EXPECT_EQ(kota::symbolOf(plugIn(), "_Z13kota0AdModulev"), nullptr) << "the module is not handed out";
    EXPECT_EQ(kota::symbolOf(plugIn(), "_ZTV4CWnd"), nullptr) << "it is the platform's";
    EXPECT_EQ(kota::symbolOf(nullptr, "KhGetNumDocTemplates"), nullptr);
}

TEST(Exports, CountOneTemplateAndOneToolBar) {
    EXPECT_EQ(exported<int()>("KhGetNumDocTemplates")(), 1);
    EXPECT_EQ(exported<int()>("KhGetNumToolbars")(), 1);
}

TEST(Exports, GiveANewTemplateForEachCall) {
    const auto first = makeTemplate();
    const auto second = makeTemplate();

    ASSERT_TRUE(first && second);
    EXPECT_NE(first, second);
    EXPECT_EQ(first->Id(), 4787U);
    EXPECT_EQ(second->Id(), 4787U);
}

TEST(Exports, GiveATemplateThatIsTheCallersToDelete) {
    makeTemplate();
    const int before = allocationsHeld();

    makeTemplate();

    EXPECT_EQ(allocationsHeld(), before);
}

TEST(Exports, GiveATemplateThatIsTheOneAllocationOfTheCall) {
    makeTemplate();
    const int madeBefore = allocationsMade();
    const int heldBefore = allocationsHeld();

    const auto docTemplate = makeTemplate();

    EXPECT_EQ(allocationsMade(), madeBefore + 1);
    EXPECT_EQ(allocationsHeld(), heldBefore + 1);
}

TEST(Exports, AllocateNothingForATemplateThatThereIsNot) {
    auto& getTemplate = exported<CMultiDocTemplate*(int)>("KhGetDocTemplatePtr");
    for (const int index : {1, 2, -1, 4787}) {
        const int before = allocationsMade();
        EXPECT_EQ(getTemplate(index), nullptr) << index;
        EXPECT_EQ(allocationsMade(), before) << index;
    }
}

TEST(Exports, GiveNoTemplateWhenItCannotBeAllocated) {
    auto& getTemplate = exported<CMultiDocTemplate*(int)>("KhGetDocTemplatePtr");
    const FailingAllocations failing(0);

    const std::unique_ptr<CMultiDocTemplate> docTemplate(getTemplate(0));

    EXPECT_TRUE(failing.done());
    EXPECT_EQ(docTemplate, nullptr);
}

TEST(Exports, GiveTheNumberOfTheEditorsBitmap) {
    EXPECT_EQ(exported<unsigned()>("KhGetBitmapId")(), 4793U);
}

TEST(Exports, GiveTheEditorsName) {
    CString name("before");

    EXPECT_EQ(exported<int(CString*)>("KhGetEditorString")(&name), 1);

    EXPECT_EQ(name, "AD Parameters");
}

TEST(Exports, GiveNoEditorsNameToNull) {
    EXPECT_EQ(exported<int(CString*)>("KhGetEditorString")(nullptr), 0);
}

TEST(Exports, GiveTheToolBarsNameWithItsLeadingBlank) {
    CString name("before");

    EXPECT_EQ(exported<int(CString*, int)>("KhGetToolbarString")(&name, 0), 1);

    EXPECT_EQ(name, " KOTA 31 AD Tools");
}

TEST(Exports, LeaveTheStringAsItWasForAToolBarThatThereIsNot) {
    for (const int index : {1, 2, -1}) {
        CString name("before");
        EXPECT_EQ(exported<int(CString*, int)>("KhGetToolbarString")(&name, index), 0) << index;
        EXPECT_EQ(name, "before") << index;
    }
}

// Calls an export with a string when the first allocation fails: 0, and the string as it was.
void expectNoText(const std::function<int(CString*)>& getText) {
    CString text("before");
    const FailingAllocations failing(0);

    const int result = getText(&text);

    EXPECT_TRUE(failing.done());
    EXPECT_EQ(result, 0);
    EXPECT_EQ(text, "before");
}

TEST(Exports, GiveNoTextThatCannotBeAllocated) {
    expectNoText(exported<int(CString*)>("KhGetEditorString"));
    auto& getToolBarText = exported<int(CString*, int)>("KhGetToolbarString");
    expectNoText([&](CString* text) { return getToolBarText(text, 0); });
}

TEST(APlugIn, OffersAShellWhatItExports) {
    const kota::PlugIn plugIn(KOTA_PLUG_IN);

    const auto templates = plugIn.makeTemplates();

    ASSERT_EQ(templates.size(), 1U);
    EXPECT_EQ(templates[0]->Id(), 4787U);
    EXPECT_EQ(plugIn.path(), KOTA_PLUG_IN);
    EXPECT_EQ(plugIn.editorName(), "AD Parameters");
    EXPECT_EQ(plugIn.bitmapId(), 4793U);
    EXPECT_EQ(plugIn.toolBarCount(), 1);
    EXPECT_EQ(plugIn.toolBarName(0), " KOTA 31 AD Tools");
    EXPECT_EQ(plugIn.toolBarName(1), "");
}

} // namespace
