#include "tests/support/kvs_text.h"
#include "tests/support/owned.h"

#include <gtest/gtest.h>

#include <memory>

// No document goes through an archive, so that the framework only names the class.
class CArchive {};

using namespace kota::test;

namespace {

// One line in each list.
void fill(CKota0_adDoc& document) {
    addGlobal(document.initList, 1);
    addGlobal(document.initStraList, 1);
    addGlobal(document.nonCohesList, 1);
    addGlobal(document.decayList, 1);
    addLocal(document.dispersList, 1, "R", 1.0);
    addLocal(document.k32DispersList, 1, "R", 1.0);
    addLocal(document.iceDataList, 1, "R", 1.0);
    addGlobal(document.globalList, 1);
    addComponent(document.compList, 1, "SILT", 1);
    addLocal(document.boundList, 1, "R", 1.0);
    addLocal(document.k32BoundList, 1, "R", 1.0);
    addTo(addGlobal(document.layerList, 1).adderList).width = 1.0;
}

TEST(DocumentClass, IsMadeByItsName) {
    const std::unique_ptr<CObject> object(CRuntimeClass::CreateObject("CKota0_adDoc"));

    ASSERT_NE(object, nullptr);
    EXPECT_NE(dynamic_cast<CKota0_adDoc*>(object.get()), nullptr);
    EXPECT_STREQ(object->GetRuntimeClass()->Name(), "CKota0_adDoc");
    EXPECT_TRUE(object->IsKindOf(RUNTIME_CLASS(CKhDoc)));
    EXPECT_TRUE(object->IsKindOf(RUNTIME_CLASS(CDocument)));
}

TEST(NewDocument, HasTheDefaultsAndEmptyLists) {
    OwnedDocument document;

    EXPECT_EQ(document.OnNewDocument(), 1);

    for (const CObList* list : allLists(document))
        EXPECT_TRUE(list->IsEmpty());
    EXPECT_TRUE(document.filePath.IsEmpty());
    EXPECT_TRUE(document.emptyName.IsEmpty());
    EXPECT_EQ(document.projectHandle, 0);
    EXPECT_EQ(document.globalVar.G_Ice_visibility, 25.0);
    EXPECT_EQ(document.globalVar.G_Ice_latitude, 51.0);
    EXPECT_EQ(document.globalVar.G_thetac, 0.056);
    EXPECT_EQ(document.globalVar.model_type, 1);
    EXPECT_FALSE(document.IsModified());
}

TEST(DeletingContents, EmptiesAllTwelveLists) {
    OwnedDocument document;
    fill(document);

    document.DeleteContents();

    for (const CObList* list : allLists(document))
        EXPECT_TRUE(list->IsEmpty());
}

TEST(DeletingContents, LeavesTheSingleValuesThePathAndTheProjectAlone) {
    OwnedDocument document;
    document.globalVar.LastSelected = 3;
    document.globalVar.G_thetac = 0.5;
    document.globalVar.K32_exponent[1] = 2.5;
    document.filePath = "here.ad31";
    document.projectHandle = 17;

    document.DeleteContents();

    EXPECT_EQ(document.globalVar.LastSelected, 3);
    EXPECT_EQ(document.globalVar.G_thetac, 0.5);
    EXPECT_EQ(document.globalVar.K32_exponent[1], 2.5);
    EXPECT_EQ(document.filePath, "here.ad31");
    EXPECT_EQ(document.projectHandle, 17);
}

// Keeps its lines when it goes, for whoever still holds them.
TEST(DeletingContents, IsNotDoneByTheDestructor) {
    AD_Decay line;
    {
        CKota0_adDoc document;
        document.decayList.AddTail(&line);
    }

    EXPECT_EQ(line.isGlobal, 1);
}

TEST(Serializing, DoesNothing) {
    const TempFolder folder;
    OwnedDocument document;
    fill(document);
    document.WriteData(folder.file("before").c_str());
    CArchive archive;

    document.Serialize(archive);

    document.WriteData(folder.file("after").c_str());
    EXPECT_EQ(folder.read("after"), folder.read("before"));
    EXPECT_FALSE(document.IsModified());
}

} // namespace
