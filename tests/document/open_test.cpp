#include "platform/framework/message_box.h"
#include "platform/headless/session.h"
#include "platform/kvs/kvs.h"
#include "tests/support/owned.h"
#include "tests/support/temp_folder.h"

#include <gmock/gmock.h>

using namespace kota::test;
using testing::EndsWith;
using testing::HasSubstr;

namespace {

const std::string smallFile = R"(target KOTA0_AD {
  section DecayList {
    DATA = 1, 0.5, true, "", 0.0
  }
}
)";

const std::string faultyFile = R"(target KOTA0_AD {
  section DecayList {
    DATA = 1, 0.5, true, "", 0.0
    DATA = 2, 0.5, true, , 0.0
  }
}
)";

class OpeningADocument : public testing::Test {
protected:
    const std::vector<kota::MessageBoxRequest>& boxes() { return session.screen().boxes(); }

    kota::headless::Session session{[](const std::string& text) { ADD_FAILURE() << text; }};
    TempFolder folder;
    OwnedDocument document;
};

TEST_F(OpeningADocument, TakesTheExtensionInLowerAndInUpperCase) {
    for (const char* name : {"a.ad31", "b.AD31", "two.dots.ad31"}) {
        const std::string path = folder.write(name, smallFile);

        EXPECT_EQ(document.OnOpenDocument(path.c_str()), 1) << name;

        EXPECT_EQ(document.decayList.GetCount(), 1) << name;
        EXPECT_EQ(document.filePath, path.c_str());
        EXPECT_FALSE(document.IsModified());
    }
    EXPECT_EQ(boxes().size(), 0U);
}

TEST_F(OpeningADocument, RefusesAnyOtherExtension) {
    for (const char* name : {"a.Ad31", "a.aD31", "a.txt", "a", "a.ad31.bak", "a.ad3", "a.ad311", "ad31"}) {
        const std::string path = folder.write(name, smallFile);
        session.screen().answerBox(IDOK);

        EXPECT_EQ(document.OnOpenDocument(path.c_str()), 0) << name;

        EXPECT_TRUE(document.decayList.IsEmpty()) << name;
        const kota::MessageBoxRequest& box = boxes().back();
        EXPECT_EQ(box.text, "Unsupported file format");
        EXPECT_EQ(box.owner, nullptr);
        EXPECT_FALSE(box.caption.has_value());
        EXPECT_EQ(box.type, MB_OK);
    }
    EXPECT_EQ(boxes().size(), 8U);
}

TEST_F(OpeningADocument, RefusesTheExtensionOfAFolderInThePath) {
    std::filesystem::create_directory(folder.path() / "folder.ad31");
    const std::string path = folder.write("folder.ad31/file", smallFile);
    session.screen().answerBox(IDOK);

    EXPECT_EQ(document.OnOpenDocument(path.c_str()), 0);
}

TEST_F(OpeningADocument, KeepsThePathThoughTheExtensionIsRefused) {
    const std::string path = folder.write("a.txt", smallFile);
    session.screen().answerBox(IDOK);

    document.OnOpenDocument(path.c_str());

    EXPECT_EQ(document.filePath, path.c_str());
}

TEST_F(OpeningADocument, FailsForAFileThatIsNotThereAndLeavesTheDocumentAlone) {
    document.filePath = "before";
    addGlobal(document.decayList, 1);
    session.screen().answerBox(IDOK);

    EXPECT_EQ(document.OnOpenDocument(folder.file("missing.ad31").c_str()), 0);

    EXPECT_EQ(document.filePath, "before");
    EXPECT_EQ(document.decayList.GetCount(), 1);
}

TEST_F(OpeningADocument, PutsTheFileInPlaceOfTheLinesBefore) {
    addGlobal(document.decayList, 5);
    addLocal(document.boundList, 0, "R", 1.0);

    document.OnOpenDocument(folder.write("a.ad31", smallFile).c_str());

    ASSERT_EQ(document.decayList.GetCount(), 1);
    EXPECT_EQ(recordOf(document.decayList).componentNum, 1);
    EXPECT_TRUE(document.boundList.IsEmpty());
}

TEST_F(OpeningADocument, TellsASyntaxErrorInTheLibrarysWordsAndOpensItEmpty) {
    const std::string path = folder.write("faulty.ad31", faultyFile);
    addGlobal(document.decayList, 5);
    session.screen().answerBox(IDOK);

    EXPECT_EQ(document.OnOpenDocument(path.c_str()), 1);

    EXPECT_TRUE(document.decayList.IsEmpty());
    EXPECT_EQ(document.globalVar.G_thetac, 0.056);
    EXPECT_EQ(document.filePath, path.c_str());
    ASSERT_EQ(boxes().size(), 1U);
    EXPECT_THAT(std::string(boxes()[0].text.View()), HasSubstr("faulty.ad31:4:26: "));
    EXPECT_EQ(boxes()[0].owner, nullptr);
    EXPECT_FALSE(boxes()[0].caption.has_value());
    EXPECT_EQ(boxes()[0].type, MB_OK);
}

TEST_F(OpeningADocument, WithASyntaxErrorShowsTheTextOfTheFileLibrary) {
    const std::string path = folder.write("faulty.ad31", faultyFile);
    void* file = kvsLoadFile(path.c_str(), 1);
    CString expected;
    kvsGetSyntaxErr(file, nullptr, nullptr, &expected);
    kvsClose(&file);
    kvsGetErrorGlb();
    session.screen().answerBox(IDOK);

    document.OnOpenDocument(path.c_str());

    ASSERT_EQ(boxes().size(), 1U);
    EXPECT_FALSE(boxes()[0].text.IsEmpty());
    EXPECT_EQ(boxes()[0].text, expected);
}

TEST_F(OpeningADocument, WithASyntaxErrorTakesTheLibrarysErrorAway) {
    session.screen().answerBox(IDOK);

    document.OnOpenDocument(folder.write("faulty.ad31", faultyFile).c_str());

    EXPECT_EQ(kvsPeekErrorGlb(), 0);
}

TEST_F(OpeningADocument, WithASyntaxErrorAndSavingItOverwritesTheFaultyFile) {
    const std::string path = folder.write("faulty.AD31", faultyFile);
    session.screen().answerBox(IDOK);
    document.OnOpenDocument(path.c_str());

    EXPECT_EQ(document.OnSaveDocument(path.c_str()), 1);

    OwnedDocument empty;
    empty.WriteData(folder.file("empty").c_str());
    EXPECT_EQ(folder.read("faulty.AD31"), folder.read("empty"));
    EXPECT_THAT(folder.read("faulty.AD31"), EndsWith("  section K32DispersList {\n  }\n}\n"));
}

TEST_F(OpeningADocument, CanBeDoneAnewByItsOwnPath) {
    const std::string path = folder.write("a.ad31", "target KOTA0_AD {\n}\n");
    document.OnOpenDocument(path.c_str());
    document.SetPathName(path.c_str());

    EXPECT_EQ(document.OnOpenDocument(document.filePath), 1);
    document.SetPathName(document.GetPathName());

    EXPECT_EQ(document.filePath, path.c_str());
    EXPECT_EQ(document.GetTitle(), "a.ad31");
}

TEST_F(OpeningADocument, CanBeDoneAfterAFaultyFile) {
    session.screen().answerBox(IDOK);
    document.OnOpenDocument(folder.write("faulty.ad31", faultyFile).c_str());

    EXPECT_EQ(document.OnOpenDocument(folder.write("good.ad31", smallFile).c_str()), 1);

    EXPECT_EQ(document.decayList.GetCount(), 1);
    EXPECT_EQ(boxes().size(), 1U);
}

TEST_F(OpeningADocument, ReadDataOfAFaultyFileLeavesTheDocumentAsItWas) {
    document.globalVar.G_thetac = 0.5;
    addGlobal(document.decayList, 5);
    session.screen().answerBox(IDOK);

    document.ReadData(folder.write("faulty.ad31", faultyFile).c_str());

    EXPECT_EQ(document.globalVar.G_thetac, 0.5);
    ASSERT_EQ(document.decayList.GetCount(), 1);
    EXPECT_EQ(recordOf(document.decayList).componentNum, 5);
    EXPECT_EQ(boxes().size(), 1U);
}

} // namespace
