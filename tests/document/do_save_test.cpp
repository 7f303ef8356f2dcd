#include "platform/framework/message_box.h"
#include "platform/headless/session.h"
#include "tests/support/owned.h"
#include "tests/support/temp_folder.h"

#include <gmock/gmock.h>

using namespace kota::test;
using testing::HasSubstr;

namespace {

class KeepingAFile : public testing::Test {
protected:
    BOOL save(const std::string& name) { return document.DoSave(folder.file(name).c_str()); }

    void makeCheckFail() {
        addLocal(document.globalList, 1, "R", 1.0);
        addLocal(document.globalList, 1, "R", 2.0);
    }

    kota::headless::Session session{[](const std::string& text) { ADD_FAILURE() << text; }};
    TempFolder folder;
    OwnedDocument document;
};

TEST_F(KeepingAFile, NamesTheDocumentAfterTheFileThatWasWritten) {
    EXPECT_EQ(save("river.ad31"), 1);

    EXPECT_EQ(document.GetPathName(), folder.file("river.AD31").c_str());
    EXPECT_EQ(document.GetTitle(), "river.AD31");
    EXPECT_FALSE(document.IsModified());
}

TEST_F(KeepingAFile, KeepsTheVersionBeforeOfTheFileThatIsWritten) {
    folder.write("river.AD31", "upper");
    folder.write("river.ad31", "lower");

    save("river.ad31");

    EXPECT_THAT(folder.read("river.AD31"), HasSubstr("target KOTA0_AD {"));
    EXPECT_EQ(folder.read("river.AD31~"), "upper");
    EXPECT_EQ(folder.read("river.ad31"), "lower");
    EXPECT_FALSE(folder.has("river.ad31~"));
}

TEST_F(KeepingAFile, LeavesNothingBehindWhereTheCheckRefuses) {
    makeCheckFail();
    session.screen().answerBox(IDOK);

    EXPECT_EQ(save("river.ad31"), 0);

    EXPECT_TRUE(std::filesystem::is_empty(folder.path()));
    EXPECT_TRUE(document.GetPathName().IsEmpty());
}

TEST_F(KeepingAFile, LeavesTheFileAsItWasWhereTheCheckRefuses) {
    folder.write("river.AD31", "as it was");
    makeCheckFail();
    session.screen().answerBox(IDOK);

    EXPECT_EQ(save("river.ad31"), 0);

    EXPECT_EQ(folder.read("river.AD31"), "as it was");
    EXPECT_FALSE(folder.has("river.AD31~"));
}

TEST_F(KeepingAFile, TellsTheUserWhereTheFileCannotBeWritten) {
    session.screen().answerBox(IDOK);

    EXPECT_EQ(save("missing/river.ad31"), 0);

    EXPECT_EQ(session.screen().boxes().size(), 1U);
    EXPECT_TRUE(document.IsModified());
}

} // namespace
