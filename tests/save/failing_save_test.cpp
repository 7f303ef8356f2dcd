#include "tests/save/saving_fixture.h"

#include "platform/kvs/kvs.h"

namespace kota::test {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
namespace fs = std::filesystem;

// A document of ten lines is saved, a version before it is kept, and then the document grows.
class FailingSave : public Saving {
protected:
    void SetUp() override {
        fillDecay(1);
        save("river.AD31");
        before = folder.read("river.AD31");
        fillDecay(10);
        save("river.AD31");
        old = folder.read("river.AD31");
        fillDecay(1000);
        document.SetModifiedFlag(1);
    }

    void expectNothingLost() {
        EXPECT_TRUE(document.IsModified());
        EXPECT_EQ(document.decayList.GetCount(), 1000);
        EXPECT_EQ(folder.read("river.AD31"), old);
        EXPECT_EQ(folder.read("river.AD31~"), before);
        EXPECT_THAT(filesInFolder(), ElementsAre("river.AD31", "river.AD31~"));
    }

    std::string before;
    std::string old;
};

TEST_F(FailingSave, OnAFullDiskPutsTheOldFileBackAndTellsWhy) {
    session.screen().answerBox(IDOK);
    {
        const FileSizeLimit full(old.size() + 100);
        EXPECT_EQ(save("river.AD31"), 0);
    }

    EXPECT_THAT(toldNow(), ElementsAre(HasSubstr("File too large")));
    expectNothingLost();
}

TEST_F(FailingSave, OnADiskTooFullForTheKeptVersionDoesNotBegin) {
    session.screen().answerBox(IDOK);
    {
        const FileSizeLimit full(old.size() / 2);
        EXPECT_EQ(save("river.AD31"), 0);
    }

    EXPECT_THAT(toldNow(), ElementsAre(HasSubstr("File too large")));
    expectNothingLost();
}

TEST_F(FailingSave, IsNotHeldAgainstTheNextLoad) {
    session.screen().answerBox(IDOK);
    {
        const FileSizeLimit full(old.size() + 100);
        save("river.AD31");
    }
    toldNow();
    OwnedDocument opened;

    EXPECT_EQ(opened.OnOpenDocument(folder.file("river.AD31").c_str()), 1);

    EXPECT_THAT(toldNow(), ElementsAre());
    EXPECT_EQ(opened.decayList.GetCount(), 10);
}

TEST_F(FailingSave, IsNotHeldAgainstTheNextSave) {
    session.screen().answerBox(IDOK);
    {
        const FileSizeLimit full(old.size() + 100);
        save("river.AD31");
    }

    EXPECT_EQ(save("river.AD31"), 1);

    EXPECT_FALSE(document.IsModified());
    EXPECT_EQ(folder.read("river.AD31~"), old);
}

TEST_F(FailingSave, WithAnOlderFailureUntoldIsNotBlamedForIt) {
    void* file = kvsLoadFile(folder.file("not there").c_str(), 1);
    kvsClose(&file);

    EXPECT_EQ(save("river.AD31"), 1);

    EXPECT_THAT(toldNow(), ElementsAre());
}

TEST_F(FailingSave, WhereAFolderStandsLeavesTheFolder) {
    fs::create_directory(folder.path() / "folder.AD31");
    session.screen().answerBox(IDOK);

    EXPECT_EQ(save("folder.AD31"), 0);

    EXPECT_THAT(toldNow(), ElementsAre(HasSubstr("Is a directory")));
    EXPECT_TRUE(document.IsModified());
    EXPECT_TRUE(fs::is_empty(folder.path() / "folder.AD31"));
    EXPECT_FALSE(folder.has("folder.AD31~"));
    EXPECT_EQ(document.GetTitle(), "river.AD31");
}

TEST_F(FailingSave, InAMissingFolderTellsWhy) {
    session.screen().answerBox(IDOK);

    EXPECT_EQ(save("missing/river.AD31"), 0);

    EXPECT_THAT(toldNow(), ElementsAre(HasSubstr("No such file or directory")));
    EXPECT_TRUE(document.IsModified());
}

TEST_F(FailingSave, WhereTheVersionBeforeCannotBeKeptDoesNotBegin) {
    fs::remove(folder.path() / "river.AD31~");
    fs::create_directory(folder.path() / "river.AD31~");
    folder.write("river.AD31~/something", "in the way");
    session.screen().answerBox(IDOK);

    EXPECT_EQ(save("river.AD31"), 0);

    EXPECT_THAT(toldNow(), ElementsAre(HasSubstr("could not be kept")));
    EXPECT_TRUE(document.IsModified());
    EXPECT_EQ(folder.read("river.AD31"), old);
    EXPECT_EQ(folder.read("river.AD31~/something"), "in the way");
    EXPECT_THAT(filesInFolder(), ElementsAre("river.AD31", "river.AD31~"));
}

TEST_F(FailingSave, LeavesAFileThatSomebodyElseWroteMeanwhile) {
    makeCheckFail();
    session.screen().answerBox(IDOK);
    session.screen().onBox = [&] { folder.write("river.AD31", "somebody else's"); };

    EXPECT_EQ(save("river.AD31"), 0);

    EXPECT_EQ(folder.read("river.AD31"), "somebody else's");
    EXPECT_EQ(folder.read("river.AD31~"), old);
}

TEST_F(FailingSave, LeavesANewFileThatSomebodyElseMadeMeanwhile) {
    makeCheckFail();
    session.screen().answerBox(IDOK);
    session.screen().onBox = [&] { folder.write("new.AD31", "somebody else's"); };

    EXPECT_EQ(save("new.AD31"), 0);

    EXPECT_EQ(folder.read("new.AD31"), "somebody else's");
}

TEST_F(FailingSave, OfANewFileLeavesNoFile) {
    session.screen().answerBox(IDOK);
    {
        const FileSizeLimit full(100);
        EXPECT_EQ(save("new.AD31"), 0);
    }

    EXPECT_FALSE(folder.has("new.AD31"));
    EXPECT_TRUE(document.IsModified());
}

} // namespace
} // namespace kota::test
