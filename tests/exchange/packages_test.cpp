#include "exchange/packages/packages.h"

#include "platform/framework/window.h"

#include <gtest/gtest.h>

namespace {

TEST(Package, IsOfTheEditorsKindAndOtherwiseEmpty) {
    const CKHComm_Package package;

    EXPECT_EQ(package.sender, nullptr);
    EXPECT_TRUE(package.documentName.IsEmpty());
    EXPECT_EQ(package.packageKind, 5);
    EXPECT_EQ(package.project, 0);
    EXPECT_EQ(package.items, nullptr);
}

TEST(PackageItem, IsEmpty) {
    const CK31_CBE_ModelDataItem item;

    EXPECT_TRUE(item.riverName.IsEmpty());
    EXPECT_EQ(item.dataType, 0);
    EXPECT_TRUE(item.secondText.IsEmpty());
    EXPECT_EQ(item.flag, 0);
}

TEST(Package, TravelsAsTheSameBaseAsItsItems) {
    CKHComm_Package package;
    CK31_CBE_ModelDataItem item;

    EXPECT_NE(dynamic_cast<CKhCBEItem*>(static_cast<CObject*>(&package)), nullptr);
    EXPECT_NE(dynamic_cast<CKhCBEItem*>(static_cast<CObject*>(&item)), nullptr);
}

TEST(PackageItem, NamesWhatItStandsForByANumber) {
    EXPECT_EQ(static_cast<int>(DataType::Init), 0);
    EXPECT_EQ(static_cast<int>(DataType::Sediment), 1);
    EXPECT_EQ(static_cast<int>(DataType::NonCohesive), 2);
    EXPECT_EQ(static_cast<int>(DataType::Layer), 3);
    EXPECT_EQ(static_cast<int>(DataType::Decay), 4);
    EXPECT_EQ(static_cast<int>(DataType::Dispersion), 5);
    EXPECT_EQ(static_cast<int>(DataType::IceData), 6);
    EXPECT_EQ(static_cast<int>(DataType::Boundary), 7);
}

TEST(PackageMessages, AreTheOnesRegisteredByTheirNames) {
    EXPECT_EQ(communicationMessage(), RegisterWindowMessage("KOTAHubCommunicationBetweenEditors"));
    EXPECT_EQ(switchBoardMessage(), RegisterWindowMessage("KOTAHubSwitchBoardSevice"));
    EXPECT_EQ(projectMessage(), RegisterWindowMessage("KOTAHubProjectManagement"));
    EXPECT_EQ(showToolbarMessage(), RegisterWindowMessage("KOTAHubShowToolbar"));
    EXPECT_EQ(hideToolbarMessage(), RegisterWindowMessage("KOTAHubHideToolbar"));
    EXPECT_NE(communicationMessage(), switchBoardMessage());
}

TEST(PackageMessages, HaveTheirCodes) {
    EXPECT_EQ(CommunicationCode::GetData, 42U);
    EXPECT_EQ(CommunicationCode::InsertData, 62U);
    EXPECT_EQ(CommunicationCode::DeleteData, 82U);
    EXPECT_EQ(CommunicationCode::LocationChanged, 503U);
    EXPECT_EQ(CommunicationCode::DataChanged, 523U);
    EXPECT_EQ(SwitchBoardCode::LeaveProject, 24U);
    EXPECT_EQ(SwitchBoardCode::JoinProject, 25U);
    EXPECT_EQ(SwitchBoardCode::OfferRivers, 52U);
    EXPECT_EQ(SwitchBoardCode::OfferLocation, 200U);
}

} // namespace
