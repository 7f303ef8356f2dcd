#include "platform/framework/message_box.h"
#include "platform/framework/messages.h"
#include "tests/support/document_window.h"
#include "tests/support/recording_view.h"
#include "tests/support/temp_folder.h"

#include <gmock/gmock.h>

using namespace kota::test;

namespace {

using kota::headless::User;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

class ASave : public DocumentWindow {
protected:
    TempFolder folder;
};

// A save of a document with an edit under way and an incomplete line, from the command to the file.
TEST_F(ASave, StoresCleansRefreshesAndWrites) {
    CKota0_adDoc& document = open(folder.write("river.ad31", "target KOTA0_AD {\n}\n"));
    addDispersion(document, "MISSOURI", 1000.0);
    addDispersion(document, "PLATTE", notGiven);
    addDispersion(document, "", 2000.0);
    addLocal(document.boundList, 1, "KANSAS", 5.0);
    User user(session);
    user.selectTab("Dispersion");
    RecordingView witness(document);
    std::vector<std::size_t> countAtHint;
    witness.onUpdate = [&](LPARAM) { countAtHint.push_back(recordsOf(document.dispersList).size()); };
    user.putCursor(1, 3);
    user.type("0.25");
    witness.updates.clear();

    EXPECT_TRUE(user.command(ID_FILE_SAVE));

    EXPECT_THAT(witness.hints(), ElementsAre(2, 1, 2)) << "the edit's own, store, and fill";
    EXPECT_EQ(countAtHint.at(1), 3U) << "hint 1 comes before the lines are dropped";
    EXPECT_EQ(countAtHint.at(2), 1U) << "hint 2 comes after";
    EXPECT_THAT(riversOf(document), ElementsAre("MISSOURI"));
    EXPECT_EQ(user.grid().GetRowCount(), 1U) << "the view shows what is left";
    EXPECT_FALSE(document.IsModified());
    EXPECT_TRUE(folder.has("river.AD31"));
    const std::string text = folder.read("river.AD31");
    EXPECT_THAT(text, HasSubstr("\"MISSOURI\", 1000.0, 0.25"));
    EXPECT_THAT(text, Not(HasSubstr("PLATTE")));
    EXPECT_THAT(text, Not(HasSubstr("KANSAS"))) << "boundaries are left out";
    EXPECT_EQ(document.GetTitle(), "river.AD31");
    EXPECT_EQ(folder.read("river.ad31"), "target KOTA0_AD {\n}\n") << "another file, which stays";
    EXPECT_THAT(boxes(), IsEmpty());
    document.RemoveView(&witness);
}

// The page of a section of a file, as it stands there.
std::string sectionOf(const std::string& file, const std::string& name) {
    const std::size_t start = file.find("  section " + name + " {");
    return file.substr(start, file.find("\n  }\n", start) - start);
}

TEST_F(ASave, KeepsTheGlobalValuesThatNoPageShows) {
    const std::string before = readFile(KOTA_TEST_DATA "/good/everything.becomes.AD31");
    CKota0_adDoc& document = open(folder.write("river.AD31", before));
    User user(session);
    for (const char* tab : {"Components", "Dispersion", "KOTA 32 Dispersion", "Decay", "Sediment Layers"})
        ASSERT_TRUE(user.selectTab(tab)) << tab;

    ASSERT_TRUE(session.save(document));

    ASSERT_FALSE(sectionOf(before, "Global_Variables").empty());
    EXPECT_EQ(sectionOf(folder.read("river.AD31"), "Global_Variables"),
              sectionOf(before, "Global_Variables"));
}

TEST_F(ASave, IsRefusedWithWordsWhereGlobalsAreMissing) {
    CKota0_adDoc& document = open(folder.write("river.ad31", "target KOTA0_AD {\n}\n"));
    addComponent(document.compList, 1, "CLAY", 1);
    addLocal(document.globalList, 1, "MISSOURI", 1000.0);
    addLocal(document.globalList, 1, "MISSOURI", 2000.0);
    addDispersion(document, "PLATTE", notGiven);
    document.UpdateAllViews(nullptr, UpdateHint::Fill);
    document.SetModifiedFlag(TRUE);
    session.screen().answerBox(IDOK);

    User(session).command(ID_FILE_SAVE);

    EXPECT_THAT(boxes(), ElementsAre("Global values not specified for Component CLAY in Cohesive ST property "
                                     "page."));
    EXPECT_FALSE(folder.has("river.AD31"));
    EXPECT_TRUE(document.IsModified());
    EXPECT_EQ(document.dispersList.GetCount(), 1) << "no line was dropped";
}

TEST_F(ASave, IsRefusedForNonCohesiveGlobalsFirst) {
    CKota0_adDoc& document = open(folder.write("river.ad31", "target KOTA0_AD {\n}\n"));
    addComponent(document.compList, 1, "CLAY", 1);
    addComponent(document.compList, 2, "SAND", 3);
    for (int line = 0; line < 2; ++line) {
        addLocal(document.globalList, 1, "MISSOURI", 1000.0);
        addLocal(document.nonCohesList, 1, "MISSOURI", 1000.0);
    }
    document.UpdateAllViews(nullptr, UpdateHint::Fill);
    session.screen().answerBox(IDOK);

    EXPECT_FALSE(session.save(document));

    EXPECT_THAT(boxes(),
                ElementsAre("Global values not specified for Component SAND in Non-Cohesive property "
                            "page."));
}

TEST_F(ASave, KeepsTheWholeDocumentWhileARefusedCellIsShown) {
    CKota0_adDoc& document = open(folder.write("river.ad31", "target KOTA0_AD {\n}\n"));
    addDispersion(document, "MISSOURI", 1000.0).dispFactor = 0.5;
    User user(session);
    user.selectTab("Dispersion");
    user.putCursor(1, 3);
    user.type("0.5x");

    EXPECT_TRUE(session.save(document));

    EXPECT_EQ(recordOf(document.dispersList).dispFactor, 0.5) << "a text that is no number is not stored";
    EXPECT_THAT(folder.read("river.AD31"), HasSubstr("\"MISSOURI\", 1000.0, 0.5"));
}

TEST_F(ASave, AsksForTheNameOfANewDocument) {
    CKota0_adDoc& document = create();
    session.screen().answerSaveName(folder.file("named.ad31").c_str());

    User(session).command(ID_FILE_SAVE);

    EXPECT_TRUE(folder.has("named.AD31"));
    EXPECT_EQ(document.GetTitle(), "named.AD31");
}

} // namespace
