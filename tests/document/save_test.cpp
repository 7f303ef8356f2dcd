#include "platform/framework/message_box.h"
#include "platform/headless/session.h"
#include "platform/kvs/kvs.h"
#include "tests/support/owned.h"
#include "tests/support/recording_view.h"
#include "tests/support/temp_folder.h"

#include <gmock/gmock.h>

using namespace kota::test;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::Not;

namespace {

class SavingADocument : public testing::Test {
protected:
    BOOL save(const std::string& name = "file.AD31") {
        return document.OnSaveDocument(folder.file(name).c_str());
    }

    // Two local lines of a component, which the check refuses.
    template <class List>
    void makeCheckFail(List& list) {
        addComponent(document.compList, 1, "SILT", 1);
        addComponent(document.compList, 2, "SAND", 3);
        addLocal(list, 1, "R", 1.0);
        addLocal(list, 1, "R", 2.0);
    }

    kota::headless::Session session{[](const std::string& text) { ADD_FAILURE() << text; }};
    TempFolder folder;
    OwnedDocument document;
    RecordingView view{document};
};

TEST_F(SavingADocument, WritesTheExtensionInUpperCaseWhateverWasGiven) {
    std::filesystem::create_directory(folder.path() / "dir.x");
    const char* const names[][2] = {
        {"a.ad31", "a.AD31"}, {"b.AD31", "b.AD31"},        {"c", "c.AD31"},      {"d.e.txt", "d.e.AD31"},
        {"f.", "f.AD31"},     {"dir.x/g", "dir.x/g.AD31"}, {"h.ad31~", "h.AD31"}};
    for (const auto& [given, written] : names) {
        EXPECT_EQ(save(given), 1) << given;

        EXPECT_TRUE(folder.has(written)) << given;
    }
    EXPECT_FALSE(folder.has("a.ad31"));
    EXPECT_FALSE(folder.has("c"));
    EXPECT_FALSE(folder.has("d.e.txt"));
}

TEST_F(SavingADocument, LeavesAFileOfTheLowerCaseExtensionAlone) {
    folder.write("a.ad31", "as it was");

    save("a.ad31");

    EXPECT_EQ(folder.read("a.ad31"), "as it was");
    EXPECT_THAT(folder.read("a.AD31"), HasSubstr("target KOTA0_AD {"));
}

TEST_F(SavingADocument, WritesWhatWriteDataWrites) {
    addGlobal(document.decayList, 1);

    save("a.AD31");
    document.WriteData(folder.file("b").c_str());

    EXPECT_EQ(folder.read("a.AD31"), folder.read("b"));
    EXPECT_THAT(folder.read("b"), HasSubstr("DATA = 1, 0.0, true"));
}

TEST_F(SavingADocument, LetsTheViewsStoreThenFill) {
    EXPECT_EQ(save(), 1);

    EXPECT_THAT(view.hints(), ElementsAre(1, 2));
    EXPECT_EQ(view.updates[0].sender, nullptr);
    EXPECT_EQ(view.updates[0].hintObject, nullptr);
    EXPECT_EQ(view.updates[1].sender, nullptr);
    EXPECT_EQ(view.updates[1].hintObject, nullptr);
}

TEST_F(SavingADocument, WritesWhatAViewStoresOnTheFirstHint) {
    view.onUpdate = [&](LPARAM hint) {
        if (hint == UpdateHint::Store)
            addGlobal(document.decayList, 7);
    };

    save();

    EXPECT_THAT(folder.read("file.AD31"), HasSubstr("DATA = 7, 0.0, true"));
}

TEST_F(SavingADocument, ChecksWhatAViewStoresOnTheFirstHint) {
    view.onUpdate = [&](LPARAM) { makeCheckFail(document.globalList); };
    session.screen().answerBox(IDOK);

    EXPECT_EQ(save(), 0);
}

TEST_F(SavingADocument, FillsTheViewsFromCleanedListsBeforeTheFileIsWritten) {
    addLocal(document.dispersList, 0, "", 5.0);
    int countAtStore = -1;
    int countAtFill = -1;
    bool writtenAtFill = true;
    BOOL modifiedAtFill = 0;
    document.SetModifiedFlag(1);
    view.onUpdate = [&](LPARAM hint) {
        (hint == UpdateHint::Store ? countAtStore : countAtFill) = document.dispersList.GetCount();
        writtenAtFill = folder.has("file.AD31");
        modifiedAtFill = document.IsModified();
    };

    save();

    EXPECT_EQ(countAtStore, 1);
    EXPECT_EQ(countAtFill, 0);
    EXPECT_FALSE(writtenAtFill);
    EXPECT_TRUE(modifiedAtFill);
    EXPECT_TRUE(folder.has("file.AD31"));
    EXPECT_FALSE(document.IsModified());
}

TEST_F(SavingADocument, DropsADispersionLineWithoutARiverOrAChainage) {
    addLocal(document.dispersList, 0, "", 5.0);
    addLocal(document.dispersList, 0, "R", 1e10);
    addLocal(document.dispersList, 0, "R", 0.0);

    save();

    ASSERT_EQ(document.dispersList.GetCount(), 1);
    EXPECT_EQ(recordOf(document.dispersList).chainage, 0.0);
    EXPECT_THAT(folder.read("file.AD31"), Not(HasSubstr("DATA = \"\"")));
}

TEST_F(SavingADocument, DropsALocalInitialConditionWithoutARiver) {
    addLocal(document.initList, 1, "", 5.0);

    save();

    EXPECT_TRUE(document.initList.IsEmpty());
    EXPECT_THAT(folder.read("file.AD31"), HasSubstr("section InitList {\n  }\n"));
}

TEST_F(SavingADocument, DropsATableLineThatWasNotFilledIn) {
    AD_Cohesiv_ST_Init_Cond& layer = addGlobal(document.layerList, 1);
    addTo(layer.adderList);

    save();

    EXPECT_EQ(document.layerList.GetCount(), 1);
    EXPECT_TRUE(layer.adderList.IsEmpty());
    EXPECT_THAT(folder.read("file.AD31"), HasSubstr("section AdderList {\n    }\n"));
}

TEST_F(SavingADocument, CleansAllTwelveLists) {
    addTo(document.initList).componentNum = 0;
    addTo(document.initStraList).componentNum = 0;
    addTo(document.nonCohesList).componentNum = 0;
    addTo(document.decayList).componentNum = 0;
    addLocal(document.dispersList, 0, "", 1.0);
    addLocal(document.k32DispersList, 0, "", 1.0);
    addLocal(document.iceDataList, 0, "", 1.0);
    addTo(document.globalList).componentNum = 0;
    addComponent(document.compList, 1, "", 0);
    addLocal(document.boundList, 0, "", 1.0);
    addLocal(document.k32BoundList, 0, "", 1.0);
    addTo(document.layerList).componentNum = 0;

    EXPECT_EQ(save(), 1);

    for (const CObList* list : allLists(document))
        EXPECT_TRUE(list->IsEmpty());
    EXPECT_EQ(session.screen().boxes().size(), 0U);
}

TEST_F(SavingADocument, KeepsWholeBoundariesInMemoryButNotInTheFile) {
    addLocal(document.boundList, 1, "MISSOURI", 5.0);
    addLocal(document.k32BoundList, 1, "MISSOURI", 5.0);

    save();

    EXPECT_EQ(document.boundList.GetCount(), 1);
    EXPECT_EQ(document.k32BoundList.GetCount(), 1);
    EXPECT_THAT(folder.read("file.AD31"), Not(HasSubstr("MISSOURI")));
    document.OnOpenDocument(folder.file("file.AD31").c_str());
    EXPECT_TRUE(document.boundList.IsEmpty());
    EXPECT_TRUE(document.k32BoundList.IsEmpty());
}

} // namespace
