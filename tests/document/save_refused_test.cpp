#include "platform/framework/message_box.h"
#include "platform/headless/session.h"
#include "platform/kvs/kvs.h"
#include "tests/support/owned.h"
#include "tests/support/recording_view.h"
#include "tests/support/temp_folder.h"

#include <gmock/gmock.h>

using namespace kota::test;
using testing::ElementsAre;

namespace {

class SavingIsRefused : public testing::Test {
protected:
    SavingIsRefused() {
        addComponent(document.compList, 1, "SILT", 1);
        addComponent(document.compList, 2, "SAND", 3);
        addGlobal(document.decayList, 0);
        folder.write("file.AD31", "as it was");
    }

    template <class List>
    static void addTwoLocalLines(List& list) {
        addLocal(list, 1, "R", 1.0);
        addLocal(list, 1, "R", 2.0);
    }

    BOOL save() {
        session.screen().answerBox(IDOK);
        return document.OnSaveDocument(folder.file("file.AD31").c_str());
    }

    kota::headless::Session session{[](const std::string& text) { ADD_FAILURE() << text; }};
    TempFolder folder;
    OwnedDocument document;
    RecordingView view{document};
};

TEST_F(SavingIsRefused, WithoutAGlobalLineOfACohesiveComponent) {
    addTwoLocalLines(document.globalList);

    EXPECT_EQ(save(), 0);

    ASSERT_EQ(session.screen().boxes().size(), 1U);
    EXPECT_EQ(session.screen().boxes()[0].text,
              "Global values not specified for Component SILT in Cohesive ST property page.");
}

TEST_F(SavingIsRefused, WithoutAGlobalLineOfANonCohesiveComponent) {
    addTwoLocalLines(document.nonCohesList);

    EXPECT_EQ(save(), 0);

    ASSERT_EQ(session.screen().boxes().size(), 1U);
    EXPECT_EQ(session.screen().boxes()[0].text,
              "Global values not specified for Component SAND in Non-Cohesive property page.");
}

TEST_F(SavingIsRefused, ByTheNonCohesiveListFirstAndThenByNoOther) {
    addTwoLocalLines(document.globalList);
    addTwoLocalLines(document.nonCohesList);

    EXPECT_EQ(save(), 0);

    ASSERT_EQ(session.screen().boxes().size(), 1U);
    EXPECT_EQ(session.screen().boxes()[0].text,
              "Global values not specified for Component SAND in Non-Cohesive property page.");
}

TEST_F(SavingIsRefused, AndThenNothingIsDroppedFilledOrWritten) {
    addTwoLocalLines(document.globalList);

    save();

    EXPECT_EQ(document.decayList.GetCount(), 1);
    EXPECT_THAT(view.hints(), ElementsAre(1));
    EXPECT_EQ(folder.read("file.AD31"), "as it was");
}

TEST_F(SavingIsRefused, AndThenTheModifiedFlagStaysAsItWas) {
    addTwoLocalLines(document.globalList);

    save();
    EXPECT_FALSE(document.IsModified());

    document.SetModifiedFlag(1);
    save();
    EXPECT_TRUE(document.IsModified());
}

TEST_F(SavingIsRefused, BeforeTheIncompleteLinesThatCauseItAreDropped) {
    addLocal(document.globalList, 1, "", 1.0);
    addLocal(document.globalList, 1, "", 2.0);

    EXPECT_EQ(save(), 0);

    EXPECT_EQ(document.globalList.GetCount(), 2);
}

class UnwritableFile : public testing::Test {
protected:
    ~UnwritableFile() override { kvsGetErrorGlb(); }

    kota::headless::Session session{[](const std::string& text) { ADD_FAILURE() << text; }};
    TempFolder folder;
    OwnedDocument document;
};

TEST_F(UnwritableFile, IsNotNoticedByTheSave) {
    document.SetModifiedFlag(1);

    EXPECT_EQ(document.OnSaveDocument(folder.file("missing/file.AD31").c_str()), 1);

    EXPECT_FALSE(document.IsModified());
    EXPECT_NE(kvsPeekErrorGlb(), 0);
}

TEST_F(UnwritableFile, DoesNotBringTheDroppedLinesBack) {
    addGlobal(document.decayList, 0);
    addGlobal(document.decayList, 1);

    document.OnSaveDocument(folder.file("missing/file.AD31").c_str());

    EXPECT_EQ(document.decayList.GetCount(), 1);
}

} // namespace
