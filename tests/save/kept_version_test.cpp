#include "tests/save/saving_fixture.h"

namespace kota::test {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
namespace fs = std::filesystem;

class KeptVersion : public Saving {};

TEST_F(KeptVersion, ASaveNamesTheDocumentAfterTheFileThatWasWritten) {
    EXPECT_EQ(save("river.ad31"), 1);

    EXPECT_EQ(document.GetPathName(), folder.file("river.AD31").c_str());
    EXPECT_EQ(document.GetTitle(), "river.AD31");
    EXPECT_FALSE(document.IsModified());
    EXPECT_THAT(filesInFolder(), ElementsAre("river.AD31"));
}

TEST_F(KeptVersion, IsThatOfTheFileThatIsWrittenNotOfTheOneNamed) {
    folder.write("river.AD31", "upper");
    folder.write("river.ad31", "lower");
    session.screen().answerBox(IDYES);

    EXPECT_TRUE(save("river.ad31"));

    EXPECT_THAT(toldNow(),
                ElementsAre(folder.file("river.AD31") + " exists already. Do you want to replace it?"));
    EXPECT_THAT(folder.read("river.AD31"), HasSubstr("target KOTA0_AD {"));
    EXPECT_EQ(folder.read("river.AD31~"), "upper");
    EXPECT_EQ(folder.read("river.ad31"), "lower");
    EXPECT_FALSE(folder.has("river.ad31~"));
}

TEST_F(KeptVersion, IsNotNeededWhereTheUserKeepsTheOtherFile) {
    folder.write("river.AD31", "another");
    document.SetModifiedFlag(TRUE);
    session.screen().answerBox(IDNO);

    EXPECT_FALSE(save("river.v2"));

    EXPECT_EQ(folder.read("river.AD31"), "another");
    EXPECT_TRUE(document.IsModified());
    EXPECT_THAT(filesInFolder(), ElementsAre("river.AD31"));
}

TEST_F(KeptVersion, IsTheOneBeforeTheLastSave) {
    fillDecay(1);
    save("river.AD31");
    const std::string first = folder.read("river.AD31");
    fillDecay(2);
    save("river.AD31");
    const std::string second = folder.read("river.AD31");
    fillDecay(3);

    save("river.AD31");

    EXPECT_NE(first, second);
    EXPECT_EQ(folder.read("river.AD31~"), second);
    EXPECT_THAT(filesInFolder(), ElementsAre("river.AD31", "river.AD31~"));
}

TEST_F(KeptVersion, OfAFaultyFileIsTheFaultyFile) {
    const std::string path = folder.write("river.AD31", "target KOTA0_AD {");
    session.screen().answerBox(IDOK);
    document.OnOpenDocument(path.c_str());

    save("river.AD31");

    EXPECT_EQ(folder.read("river.AD31~"), "target KOTA0_AD {");
    EXPECT_THAT(folder.read("river.AD31"), HasSubstr("section K32DispersList"));
}

TEST_F(KeptVersion, IsNotReplacedByAnEmptyFile) {
    folder.write("river.AD31", "");
    folder.write("river.AD31~", "kept");

    EXPECT_EQ(save("river.AD31"), 1);

    EXPECT_EQ(folder.read("river.AD31~"), "kept");
}

TEST_F(KeptVersion, AndFileStayAsTheyAreWhereTheCheckRefuses) {
    const std::string path = folder.write("river.AD31", "as it was");
    folder.write("river.AD31~", "before");
    const auto time = fs::last_write_time(path);
    makeCheckFail();
    session.screen().answerBox(IDOK);

    EXPECT_EQ(save("river.AD31"), 0);

    EXPECT_EQ(folder.read("river.AD31"), "as it was");
    EXPECT_EQ(fs::last_write_time(path), time);
    EXPECT_EQ(folder.read("river.AD31~"), "before");
    EXPECT_THAT(filesInFolder(), ElementsAre("river.AD31", "river.AD31~"));
}

TEST_F(KeptVersion, IsNoneWhereTheCheckRefusesANewFile) {
    makeCheckFail();
    session.screen().answerBox(IDOK);

    EXPECT_EQ(save("river.ad31"), 0);

    EXPECT_THAT(filesInFolder(), ElementsAre());
    EXPECT_TRUE(document.GetPathName().IsEmpty());
}

TEST_F(KeptVersion, StandsBesideTheFileThatALinkLeadsTo) {
    fs::create_directory(folder.path() / "shared");
    folder.write("shared/real.AD31", "old");
    fs::create_symlink("shared/real.AD31", folder.path() / "link.AD31");

    EXPECT_EQ(save("link.AD31"), 1);

    EXPECT_TRUE(fs::is_symlink(folder.path() / "link.AD31"));
    EXPECT_THAT(folder.read("shared/real.AD31"), HasSubstr("target KOTA0_AD"));
    EXPECT_EQ(folder.read("shared/real.AD31~"), "old");
}

TEST_F(KeptVersion, KeepsThePermissionsAsTheFileDoes) {
    const std::string path = folder.write("river.AD31", "old");
    const auto permissions = fs::perms::owner_read | fs::perms::owner_write | fs::perms::group_read;
    fs::permissions(path, permissions);

    save("river.AD31");

    EXPECT_EQ(fs::status(path).permissions(), permissions);
    EXPECT_EQ(fs::status(path + "~").permissions(), permissions);
}

TEST_F(KeptVersion, IsNotNeededForADocumentThatAsksForItsName) {
    session.screen().answerSaveName(CString(folder.file("new.ad31").c_str()));

    EXPECT_EQ(document.DoSave(""), 1);

    EXPECT_EQ(document.GetTitle(), "new.AD31");
    EXPECT_THAT(filesInFolder(), ElementsAre("new.AD31"));
}

TEST_F(KeptVersion, IsNotTouchedWhenTheUserNamesNoFile) {
    document.SetModifiedFlag(1);
    session.screen().answerSaveName(std::nullopt);

    EXPECT_EQ(document.DoSave(nullptr), 0);

    EXPECT_TRUE(document.IsModified());
    EXPECT_THAT(filesInFolder(), ElementsAre());
}

TEST_F(KeptVersion, IsNamedToTheUserWhereAnInterruptedSaveLeftTheFileEmpty) {
    const std::string path = folder.write("river.AD31", "");
    folder.write("river.AD31~", "target KOTA0_AD {\n}\n");
    session.screen().answerBox(IDOK);

    EXPECT_EQ(document.OnOpenDocument(path.c_str()), 1);

    EXPECT_THAT(toldNow(), ElementsAre(HasSubstr("river.AD31~")));
}

TEST_F(KeptVersion, IsNamedToTheUserAlsoBehindALink) {
    folder.write("real.AD31", "");
    folder.write("real.AD31~", "target KOTA0_AD {\n}\n");
    fs::create_symlink("real.AD31", folder.path() / "link.AD31");
    session.screen().answerBox(IDOK);

    EXPECT_EQ(document.OnOpenDocument(folder.file("link.AD31").c_str()), 1);

    EXPECT_THAT(toldNow(), ElementsAre(HasSubstr("real.AD31~")));
}

TEST_F(KeptVersion, IsNotSpokenOfWhereAnEmptyFileHasNone) {
    const std::string path = folder.write("river.AD31", "");

    EXPECT_EQ(document.OnOpenDocument(path.c_str()), 1);

    EXPECT_THAT(toldNow(), ElementsAre());
}

} // namespace
} // namespace kota::test
