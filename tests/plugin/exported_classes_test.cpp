#include "plugin/Kota0_ad.h"
#include "tests/plugin/failing_buttons.h"
#include "tests/plugin/plug_in.h"
#include "tests/support/owned.h"

#include <string>
#include <typeinfo>

using namespace kota::test;

namespace {

// Whether the plug-in's library hands out a class to other libraries: its type and its virtual functions.
template <class Class>
void expectExported() {
    const std::string name = typeid(Class).name();
    EXPECT_NE(kota::symbolOf(plugIn(), ("_ZTI" + name).c_str()), nullptr) << "the type of " << name;
    EXPECT_NE(kota::symbolOf(plugIn(), ("_ZTV" + name).c_str()), nullptr) << "the functions of " << name;
}

TEST(ExportedClasses, AreTheDocumentAndThePlugInsNamespace) {
    expectExported<CKota0_ad>();
    expectExported<CKota0_adDoc>();
}

TEST(ExportedClasses, AreAllRecords) {
    expectExported<AD_Bondary>();
    expectExported<AD_Boundary_K32>();
    expectExported<AD_Cohesiv_ST_Init_Cond>();
    expectExported<AD_Comp_RiverPos>();
    expectExported<AD_Component>();
    expectExported<AD_Decay>();
    expectExported<AD_Dispersion>();
    expectExported<AD_Dispersion_K32>();
    expectExported<AD_Global_Const>();
    expectExported<AD_Global_Var>();
    expectExported<AD_Ice_Data>();
    expectExported<AD_Init_cond>();
    expectExported<AD_Init_cond_stra>();
    expectExported<AD_NonCohesiv_ST_Data>();
    expectExported<AD_ST_Init_Cond_data>();
}

TEST(ExportedFunctions, AreThoseThatNameTheComponentOfARecord) {
    EXPECT_NE(kota::symbolOf(plugIn(), "_Z16passesKindFilterii"), nullptr);
    EXPECT_NE(kota::symbolOf(plugIn(), "_Z19GetFilteredCompNameRK9CCompListii"), nullptr);
}

TEST(ExportedClasses, LetASiblingWorkWithADocument) {
    OwnedDocument document;
    addComponent(document.compList, 7, "BOD", 1);
    addLocal(document.decayList, 7, "MISSOURI", 1000.0);

    EXPECT_EQ(document.GetCompName(7), "BOD");
    EXPECT_EQ(document.GetCompNum("BOD"), 7);
    EXPECT_EQ(document.GetCompNum("Salt"), 0);
    EXPECT_EQ(recordOf(document.decayList).riverName, "MISSOURI");
}

TEST(ExportedClasses, AreKnownByNameInThePlugInsModule) {
    EXPECT_EQ(CRuntimeClass::FromName("CKota0_adDoc", &plugInModule()), RUNTIME_CLASS(CKota0_adDoc));
    EXPECT_EQ(CRuntimeClass::FromName("CKota0_ad", &plugInModule()), RUNTIME_CLASS(CKota0_ad));
    EXPECT_EQ(CRuntimeClass::FromName("CKota0_adDoc", &kota::platformModule()), nullptr);
    EXPECT_EQ(&RUNTIME_CLASS(CKota0_adDoc)->Module(), &plugInModule());
}

TEST(TheNamespaceOfThePlugIn, IsAWindowThatDoesNothingByItself) {
    CKota0_ad instance;

    EXPECT_TRUE(instance.IsKindOf(RUNTIME_CLASS(CWnd)));
    EXPECT_EQ(instance.GetSafeHwnd(), nullptr);
    EXPECT_EQ(sizeof(CKota0_ad), sizeof(CWnd)) << "no data of its own";
    for (const UINT command : {42550U, 42551U, 42561U, 42562U, 42563U})
        EXPECT_FALSE(instance.OnCmdMsg(command, 0)) << command;
}

TEST(TheNamespaceOfThePlugIn, MakesANewTemplateForEachCall) {
    const std::unique_ptr<CMultiDocTemplate> first(CKota0_ad::CreateMainDlg());
    const std::unique_ptr<CMultiDocTemplate> second(CKota0_ad::CreateMainDlg());

    ASSERT_TRUE(first && second);
    EXPECT_NE(first, second);
    EXPECT_EQ(first->Id(), 4787U);
    EXPECT_EQ(first->DocumentClass(), RUNTIME_CLASS(CKota0_adDoc));
}

TEST(TheNamespaceOfThePlugIn, SetsUpAToolBarAsTheExportDoes) {
    CKhMDIFrameWnd frame;
    frame.Create();
    CKhToolBarEx bar;

    EXPECT_EQ(CKota0_ad::InitToolBar(&bar, &frame, 0x2000UL, 59407), 1);

    EXPECT_EQ(bar.GetDlgCtrlID(), 59407U);
    EXPECT_EQ(bar.GetStyle(), 0x2000U);
    EXPECT_EQ(bar.GetBarStyle(), 0x34U);
    EXPECT_EQ(bar.DockingSides(), 0xF000U);
    EXPECT_EQ(frame.DockingSides(), 0xF000U);
    EXPECT_EQ(frame.DockedBars(), std::vector<CControlBar*>{&bar});
}

TEST(TheNamespaceOfThePlugIn, LeavesAToolBarWithoutButtonsItsWindow) {
    CKhMDIFrameWnd frame;
    frame.Create();
    CKhToolBarEx bar;
    const FailingButtons failing;

    EXPECT_EQ(CKota0_ad::InitToolBar(&bar, &frame, 0, 59407), 0);

    EXPECT_EQ(bar.GetParent(), &frame);
    EXPECT_TRUE(frame.DockedBars().empty());
}

TEST(TheNamespaceOfThePlugIn, LeavesAToolBarThatCannotBeCreated) {
    CKhMDIFrameWnd withoutWindow;
    CKhToolBarEx bar;

    EXPECT_EQ(CKota0_ad::InitToolBar(&bar, &withoutWindow, 0, 59407), 0);

    EXPECT_EQ(bar.GetSafeHwnd(), nullptr);
    EXPECT_EQ(bar.Buttons(), nullptr);
}

} // namespace
