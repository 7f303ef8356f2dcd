#include "platform/foundation/frames.h"
#include "platform/foundation/plug_in.h"
#include "platform/language/language.h"
#include "tests/plugin/allocations.h"
#include "tests/plugin/plug_in.h"

#include <gmock/gmock.h>

using namespace kota::test;

namespace {

using testing::HasSubstr;

TEST(Exports, StandInTheLibraryUndecorated) {
    ASSERT_NE(plugIn(), nullptr);
    for (const char* name :
         {"KhGetNumDocTemplates", "KhGetDocTemplatePtr", "KhGetNumToolbars", "KhCreateToolbar",
          "KhInitToolbar", "KhGetBitmapId", "KhGetEditorString", "KhGetToolbarString", "K31MSGGetData",
          "K31MSGInsertData", "K31MSGDeleteData", "K31MSGSelectData"})
        EXPECT_NE(kota::symbolOf(plugIn(), name), nullptr) << name;
}

TEST(Exports, AreNoMoreThanTheLibraryHas) {
    EXPECT_EQ(kota::symbolOf(plugIn(), "KhGetNumDocTemplate"), nullptr);
    EXPECT_EQ(kota::symbolOf(plugIn(), "kota0AdRecord"), nullptr) << "the record is the library's own";
    EXPECT_EQ(kota::symbolOf(plugIn(), "_Z13kota0AdModulev"), nullptr) << "the module is the library's own";
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

TEST(Exports, AllocateNothingForATemplateThatThereIsNot) {
    auto& getTemplate = exported<CMultiDocTemplate*(int)>("KhGetDocTemplatePtr");
    for (const int index : {1, 2, -1, 4787}) {
        const int before = allocationsMade();
        EXPECT_EQ(getTemplate(index), nullptr) << index;
        EXPECT_EQ(allocationsMade(), before) << index;
    }
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

// The words with which a library was refused; empty when it was not.
std::string refusal(const std::string& path) {
    try {
        const kota::PlugIn plugIn(path);
        return {};
    } catch (const std::runtime_error& error) {
        return error.what();
    }
}

TEST(APlugIn, IsNoneWithoutItsLibraryOrWithoutTheExports) {
    EXPECT_THAT(refusal("/no/such/library.so"), HasSubstr("/no/such/library.so"));
    EXPECT_THAT(refusal(KOTA_SECOND_LANGUAGE), HasSubstr("does not export KhGetNumDocTemplates"));
    EXPECT_EQ(refusal(KOTA_PLUG_IN), "");
}

} // namespace
