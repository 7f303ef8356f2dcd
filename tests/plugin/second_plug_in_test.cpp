#include "platform/foundation/plug_in.h"
#include "platform/framework/input.h"
#include "platform/framework/messages.h"
#include "platform/framework/turn.h"
#include "resources/ids.h"
#include "tests/plugin/second/ids.h"
#include "tests/plugin/second_library.h"
#include "tests/support/editor.h"

#include <gmock/gmock.h>

using namespace kota::test;

namespace {

using testing::ElementsAre;

constexpr kota::MenuItemTemplate fileItems[] = {{ID_FILE_CLOSE, "&Close"}};
constexpr kota::MenuItemTemplate editItems[] = {{ID_EDIT_UNDO, "&Undo"}, {}, {ID_EDIT_CUT, "Cu&t"}};
constexpr kota::MenuItemTemplate viewItems[] = {{ID_VIEW_STATUS_BAR, "&Status Bar"}};
constexpr kota::MenuItemTemplate windowItems[] = {{ID_WINDOW_NEW, "&New Window"}, {}};
constexpr kota::MenuItemTemplate helpItems[] = {{ID_APP_ABOUT, "&About"}};
constexpr kota::MenuPopupTemplate shellPopups[] = {{"&File", fileItems},
                                                   {"&Edit", editItems},
                                                   {"&View", viewItems},
                                                   {"&Window", windowItems},
                                                   {"&Help", helpItems}};
constexpr kota::MenuTemplate shellMenu{.id = 1, .popups = shellPopups};

// A shell that has loaded the plug-in and the second one, whose texts a language library translates in part.
class TwoPlugIns : public Editor {
protected:
    TwoPlugIns() {
        secondPlugIn(); // with its language library
        session.load(KOTA_SECOND);
        shell().LoadMenu(shellMenu);
    }

    CDocTemplate& secondTemplate() { return *session.application().Templates().at(1); }
    const kota::Module& secondModule() { return secondTemplate().Module(); }
    CDocument& createSecond() {
        const kota::Turn turn;
        return *secondTemplate().OpenDocumentFile(nullptr);
    }
    static CMDIChildWnd& frameOf(const CDocument& document) {
        return static_cast<CMDIChildWnd&>(*document.Views().at(0)->GetParentFrame());
    }
    std::vector<std::string> menuBar() {
        std::vector<std::string> texts;
        for (const CMenu::Entry& entry : shell().GetMenu()->Entries())
            texts.emplace_back(entry.text.View());
        return texts;
    }
    static int secondCommandsRun() { return exported<int()>("SecondCommandsRun", secondPlugIn())(); }
};

TEST_F(TwoPlugIns, AreAskedForTheirCountsBeforeAnythingElse) {
    auto& calls = exported<std::vector<std::string>&()>("SecondCalls", secondPlugIn())();
    calls.clear();

    session.load(KOTA_SECOND);

    EXPECT_THAT(calls, ElementsAre("count of templates", "count of tool bars", "template 0", "tool bar 0"));
}

TEST_F(TwoPlugIns, HaveModulesOfTheirOwn) {
    EXPECT_NE(&secondModule(), &plugInModule());
    EXPECT_STREQ(secondModule().name(), "second");
    EXPECT_STREQ(plugInModule().name(), "Kota0_ad");
}

TEST_F(TwoPlugIns, GiveTheirOwnNamesThroughExportsOfTheSameNames) {
    const kota::PlugIn first(KOTA_PLUG_IN);
    const kota::PlugIn second(KOTA_SECOND);

    EXPECT_EQ(first.editorName(), "AD Parameters");
    EXPECT_EQ(second.editorName(), "Translated name");
    EXPECT_EQ(first.toolBarName(0), " KOTA 31 AD Tools");
    EXPECT_EQ(second.toolBarName(0), "Plain tools");
}

TEST_F(TwoPlugIns, FindTheirOwnStringsUnderTheSameNumbers) {
    EXPECT_EQ(plugInModule().string(Second::Command), "Search for river name/topo ID.\nSearch");
    EXPECT_EQ(secondModule().string(Second::Command), "Translated prompt.\nTranslated tip");
    EXPECT_EQ(secondModule().string(4899), "") << "a number of the first one alone";
    EXPECT_EQ(plugInModule().string(Second::OwnCommand), "") << "a number of the second one alone";
}

TEST_F(TwoPlugIns, FallBackToTheModulesTextWhereTheLanguageLibraryHasNone) {
    EXPECT_EQ(secondModule().string(Second::EditorName), "Translated name");
    EXPECT_EQ(secondModule().string(Second::ToolBarName), "Plain tools");
    EXPECT_EQ(secondModule().string(Second::OwnCommand), "Plain prompt of its own.");
}

TEST_F(TwoPlugIns, FallBackToTheModulesOtherResources) {
    ASSERT_NE(secondModule().toolBar(Second::Document), nullptr);
    EXPECT_THAT(secondModule().toolBar(Second::Document)->commands,
                ElementsAre(Second::Command, Second::OwnCommand));
    EXPECT_EQ(secondModule().bitmap(4793), nullptr) << "a picture of the first one alone";
}

TEST_F(TwoPlugIns, NameTheirDocumentsByTheirOwnTemplates) {
    using Part = CDocTemplate::DocString;
    CDocTemplate& first = *session.application().Templates().at(0);
    ASSERT_EQ(first.Id(), secondTemplate().Id());

    EXPECT_EQ(first.GetDocString(Part::FilterExtension), ".ad31");
    EXPECT_EQ(secondTemplate().GetDocString(Part::FilterExtension), ".second");
    EXPECT_EQ(create().GetTitle(), "ADPar1");
    EXPECT_EQ(createSecond().GetTitle(), "Second1");
}

TEST_F(TwoPlugIns, OpenTheFilesOfTheirOwnExtensions) {
    const CDocument* const document = session.open("/rivers/missouri.second");

    ASSERT_NE(document, nullptr);
    EXPECT_EQ(document->GetDocTemplate(), &secondTemplate());
}

TEST_F(TwoPlugIns, HaveClassesOfTheirOwnUnderTheSameNames) {
    for (const char* name : {"CKota0_adDoc", "CDlgFrame", "CKota0_adView"}) {
        const CRuntimeClass* const first = CRuntimeClass::FromName(name, &plugInModule());
        const CRuntimeClass* const second = CRuntimeClass::FromName(name, &secondModule());
        ASSERT_TRUE(first && second) << name;
        EXPECT_NE(first, second) << name;
        EXPECT_EQ(&first->Module(), &plugInModule()) << name;
        EXPECT_EQ(&second->Module(), &secondModule()) << name;
    }
    EXPECT_EQ(CRuntimeClass::FromName("CKota0_ad", &secondModule()), nullptr);
}

TEST_F(TwoPlugIns, MakeObjectsOfTheirOwnClassesByName) {
    const std::unique_ptr<CObject> first(CRuntimeClass::CreateObject("CKota0_adDoc", &plugInModule()));
    const std::unique_ptr<CObject> second(CRuntimeClass::CreateObject("CKota0_adDoc", &secondModule()));

    ASSERT_TRUE(first && second);
    EXPECT_TRUE(first->IsKindOf(RUNTIME_CLASS(CKota0_adDoc)));
    EXPECT_FALSE(second->IsKindOf(RUNTIME_CLASS(CKota0_adDoc)));
    EXPECT_EQ(&second->GetRuntimeClass()->Module(), &secondModule());
}

TEST_F(TwoPlugIns, MakeDocumentsFramesAndViewsOfTheirOwn) {
    const CDocument& first = create();
    const CDocument& second = createSecond();

    for (const auto& [document, module] :
         {std::pair(&first, &plugInModule()), std::pair(&second, &secondModule())}) {
        EXPECT_EQ(&document->GetRuntimeClass()->Module(), module);
        EXPECT_EQ(&document->Views().at(0)->GetRuntimeClass()->Module(), module);
        EXPECT_EQ(&frameOf(*document).GetRuntimeClass()->Module(), module);
    }
}

TEST_F(TwoPlugIns, ShowTheirOwnMenusInFront) {
    CKota0_adDoc& first = create();
    const CDocument& second = createSecond();
    EXPECT_THAT(menuBar(), ElementsAre("&File", "&Edit", "&Translated", "&View", "&Window", "&Help"));

    EXPECT_TRUE(kota::input::activate(frameOf(first)));
    EXPECT_THAT(menuBar(), ElementsAre("&File", "&Edit", "&Grid", "&View", "&Window", "&Help"));

    EXPECT_TRUE(kota::input::activate(frameOf(second)));
    EXPECT_THAT(menuBar(), ElementsAre("&File", "&Edit", "&Translated", "&View", "&Window", "&Help"));
}

TEST_F(TwoPlugIns, HaveTheirOwnMenusThirdInEveryLanguage) {
    const kota::MenuTemplate& translated = *secondModule().menu(Second::Document);
    ASSERT_EQ(translated.popups.size(), 6U);
    for (const kota::MenuPopupTemplate& popup : translated.popups)
        for (const kota::MenuPopupTemplate& own : shellPopups)
            ASSERT_STRNE(popup.text, own.text);

    createSecond();

    ASSERT_EQ(shell().GetMenu()->GetMenuItemCount(), 6);
    EXPECT_EQ(shell().GetMenu()->Entries()[2].submenu->Entries()[0].id, Second::Command);
}

TEST_F(TwoPlugIns, KeepTheMenuOfAnotherEnabledThatStandsInAGreyedOnesPlace) {
    CKota0_adDoc& first = create();
    kota::headless::User(session).selectTab("Additional output");
    ASSERT_FALSE(shell().GetMenu()->Entries().at(2).enabled);

    createSecond();
    EXPECT_TRUE(shell().GetMenu()->Entries().at(2).enabled);

    EXPECT_TRUE(kota::input::activate(frameOf(first)));
    EXPECT_FALSE(shell().GetMenu()->Entries().at(2).enabled);
}

TEST_F(TwoPlugIns, GiveTheirOwnPromptsInFront) {
    CKota0_adDoc& first = create();
    createSecond();
    EXPECT_EQ(shell().GetMessageString(Second::Command), "Translated prompt.\nTranslated tip");
    EXPECT_EQ(shell().GetMessageString(Second::OwnCommand), "Plain prompt of its own.");

    kota::input::activate(frameOf(first));
    EXPECT_EQ(shell().GetMessageString(Second::Command), "Search for river name/topo ID.\nSearch");
    EXPECT_EQ(shell().GetMessageString(Second::OwnCommand), "");
}

TEST_F(TwoPlugIns, HearTheirOwnKeysInFront) {
    CKota0_adDoc& first = create();
    createSecond();
    const int before = secondCommandsRun();

    EXPECT_TRUE(kota::input::key('S', {.control = true}));
    EXPECT_EQ(secondCommandsRun(), before + 1);

    kota::input::activate(frameOf(first));
    EXPECT_EQ(shell().CommandOf({.key = 'S', .control = true}), 57603U);
    kota::input::key(VK_F6);
    EXPECT_EQ(secondCommandsRun(), before + 1);
}

TEST_F(TwoPlugIns, HaveToolBarsOfTheirOwnUnderTheSameNumber) {
    ASSERT_EQ(session.toolBars().size(), 2U);
    const CKhToolBarEx& first = *session.toolBars()[0];
    const CKhToolBarEx& second = *session.toolBars()[1];

    EXPECT_EQ(first.ResourceModule(), &plugInModule());
    EXPECT_EQ(second.ResourceModule(), &secondModule());
    EXPECT_TRUE(first.HasCommand(CommandId::FindNext));
    EXPECT_FALSE(second.HasCommand(CommandId::FindNext));
    EXPECT_TRUE(second.HasCommand(Second::OwnCommand));
}

TEST_F(TwoPlugIns, ShowTheirOwnToolBarForACommandOfBoth) {
    CKhToolBarEx& first = *session.toolBars()[0];
    CKhToolBarEx& second = *session.toolBars()[1];
    ASSERT_TRUE(first.HasCommand(Second::Command) && second.HasCommand(Second::Command));
    CKota0_adDoc& document = create();

    shell().ShowToolBar(Second::Command, false);
    EXPECT_FALSE(first.IsWindowVisible() || second.IsWindowVisible());

    shell().ShowToolBar(Second::Command, true);
    EXPECT_TRUE(first.IsWindowVisible());
    EXPECT_FALSE(second.IsWindowVisible());

    createSecond();
    shell().ShowToolBar(Second::Command, false);
    shell().ShowToolBar(Second::Command, true);
    EXPECT_FALSE(first.IsWindowVisible());
    EXPECT_TRUE(second.IsWindowVisible());

    kota::input::activate(frameOf(document));
    shell().ShowToolBar(Second::OwnCommand, false);
    shell().ShowToolBar(Second::Command, true);
    EXPECT_TRUE(first.IsWindowVisible());
    EXPECT_FALSE(second.IsWindowVisible());
}

TEST_F(TwoPlugIns, ShowNoToolBarWithoutADocumentInFront) {
    shell().ShowToolBar(Second::Command, false);

    shell().ShowToolBar(Second::Command, true);

    for (const auto& bar : session.toolBars())
        EXPECT_FALSE(bar->IsWindowVisible());
}

} // namespace
