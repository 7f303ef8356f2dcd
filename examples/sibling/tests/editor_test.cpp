#include "document/kota0_ad_doc.h"
#include "document/records/decay.h"
#include "exchange/packages/packages.h"
#include "platform/framework/message_box.h"
#include "platform/headless/session.h"
#include "platform/headless/user.h"

#include "module.h"

#include <gmock/gmock.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <unistd.h>
#include <vector>

using kota::headless::Session;
using kota::headless::User;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

namespace {

namespace fs = std::filesystem;

constexpr const char* adText = R"(target KOTA0_AD {
  section DecayList {
    DATA = 1, 0.02, true, "", 0.0
    DATA = 1, 0.04, false, "MISSOURI", 187328.0
    DATA = 2, 0.5, true, "", 0.0
  }
  section DispersList {
    DATA = "MISSOURI", 0.0, 1486.0, 0.0, 0.0, 2000.0
    DATA = "MISSOURI", 187328.0, 1486.0, 0.0, 0.0, 2000.0
  }
  section CompList {
    DATA = 1, "BOD", 6, 0
    DATA = 2, "DYE", 5, 0
  }
}
)";

constexpr const char* temperatureText = R"(target WATER_TEMPERATURE {
  section Run {
    Document = "river.AD31"
    Component = "BOD"
    Temperature = 20.0
  }
}
)";

// A shell without a screen that has loaded the AD editor and this one, with a project, and a folder with a
// document of each.
class WaterTemperature : public testing::Test {
protected:
    WaterTemperature() {
        session.load(AD_PLUG_IN);
        session.load(THIS_PLUG_IN);
        session.mainWindow().openProject(4711);
        fs::remove_all(folder);
        fs::create_directories(folder);
        write("river.AD31", adText);
        write("river.wtemp", temperatureText);
    }
    ~WaterTemperature() override { fs::remove_all(folder); }

    void write(const char* name, const char* text) { std::ofstream(folder / name) << text; }
    std::string read(const char* name) {
        std::ifstream file(folder / name);
        return {std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
    }

    CKota0_adDoc& openAd(const char* name = "river.AD31") {
        return *static_cast<CKota0_adDoc*>(session.open(folder / name));
    }
    // The view of this editor's document.
    CView& open() { return *session.open(folder / "river.wtemp")->Views().front(); }

    static std::string shown(CView& view, UINT id) {
        return std::string(view.GetDlgItem(id)->GetWindowText().View());
    }
    static bool correct(CView& view, const char* temperature) {
        return kota::input::typeText(*view.GetDlgItem(Id::Temperature), temperature) &&
               kota::input::click(*view.GetDlgItem(Id::Correct));
    }

    static void bringToFront(const CView& view) {
        kota::input::activate(*static_cast<CMDIChildWnd*>(view.GetParentFrame()));
    }

    // The decay constants, in the order of the list.
    static std::vector<double> decayOf(const CKota0_adDoc& ad) {
        std::vector<double> constants;
        for (POSITION position = ad.decayList.GetHeadPosition(); position;)
            constants.push_back(ad.decayList.NextRecord(position)->decayConst);
        return constants;
    }

    const fs::path folder = fs::temp_directory_path() / ("water_temperature_" + std::to_string(getpid()));
    Session session{[](const std::string& text) { ADD_FAILURE() << text; }};
};

TEST_F(WaterTemperature, OpensTheAdDocumentInItsOwnEditor) {
    CView& view = open();
    EXPECT_EQ(shown(view, Id::Decay), "The AD document is not open.");

    EXPECT_TRUE(kota::input::click(*view.GetDlgItem(Id::OpenAdDocument)));

    EXPECT_EQ(shown(view, Id::Decay), "2 lines, 0.0200 to 0.0400 1/h");
    EXPECT_EQ(session.mainWindow().FrontDocument()->GetTitle(), "river.AD31");
}

TEST_F(WaterTemperature, TellsWhyTheAdDocumentCannotBeOpened) {
    CView& view = open();
    fs::remove(folder / "river.AD31");
    session.screen().answerBox(IDOK);

    kota::input::click(*view.GetDlgItem(Id::OpenAdDocument));

    ASSERT_EQ(session.screen().boxes().size(), 1U);
    EXPECT_THAT(std::string(session.screen().boxes()[0].text.View()),
                HasSubstr("river.AD31 cannot be opened"));
    EXPECT_EQ(shown(view, Id::Decay), "The AD document is not open.");
}

TEST_F(WaterTemperature, CorrectsTheConstantsOfItsComponent) {
    CKota0_adDoc& ad = openAd();
    User user(session);
    user.selectTab("Decay");
    CView& view = open();
    session.mainWindow().forgetReceived();

    EXPECT_TRUE(correct(view, "21"));

    EXPECT_THAT(decayOf(ad), ElementsAre(0.02 * 1.047, 0.04 * 1.047, 0.5));
    EXPECT_TRUE(ad.IsModified());
    EXPECT_EQ(user.held(1, 2), "0.020940") << "the AD editor shows it";
    EXPECT_EQ(shown(view, Id::Decay), "2 lines, 0.0209 to 0.0419 1/h");
    EXPECT_EQ(shown(view, Id::Temperature), "21");
    ASSERT_EQ(session.mainWindow().received(CommunicationCode::DataChanged).size(), 1U);
}

TEST_F(WaterTemperature, CorrectsFromTheTemperatureThatTheConstantsAreFor) {
    CKota0_adDoc& ad = openAd();
    CView& view = open();

    correct(view, "25");
    correct(view, "20");

    EXPECT_NEAR(decayOf(ad)[0], 0.02, 1e-15);
}

TEST_F(WaterTemperature, CorrectsForNoTextThatIsNoNumber) {
    CKota0_adDoc& ad = openAd();
    CView& view = open();

    for (const char* text : {"", "warm", "21 C"}) {
        session.screen().answerBox(IDOK);
        correct(view, text);
    }

    EXPECT_EQ(session.screen().boxes().size(), 3U);
    EXPECT_THAT(decayOf(ad), ElementsAre(0.02, 0.04, 0.5));
    EXPECT_FALSE(ad.IsModified());
}

TEST_F(WaterTemperature, TakesOverWhatTheUserIsTypingInTheAdEditor) {
    CKota0_adDoc& ad = openAd();
    User user(session);
    user.selectTab("Decay");
    CView& view = open();
    user.putCursor(1, 2);
    user.type("0.1");

    EXPECT_TRUE(correct(view, "21"));

    EXPECT_EQ(decayOf(ad)[0], 0.1 * 1.047);
}

TEST_F(WaterTemperature, LeavesTheConstantsWhereTheUserStandsInARefusedCell) {
    CKota0_adDoc& ad = openAd();
    User user(session);
    user.selectTab("Decay");
    CView& view = open();
    user.putCursor(1, 2);
    user.type("fast");

    EXPECT_FALSE(kota::input::click(*view.GetDlgItem(Id::Correct)));

    EXPECT_THAT(decayOf(ad), ElementsAre(0.02, 0.04, 0.5));
    EXPECT_EQ(user.warning(), "Double number required");
}

TEST_F(WaterTemperature, HearsThatTheUserEditedTheAdDocument) {
    openAd();
    User user(session);
    user.selectTab("Decay");
    CView& view = open();
    user.putCursor(1, 2);
    user.type("0.1");

    user.putCursor(1, 1);

    EXPECT_EQ(session.mainWindow().received(CommunicationCode::DataChanged).size(), 1U);
    EXPECT_EQ(shown(view, Id::Decay), "2 lines, 0.0400 to 0.1000 1/h");
}

TEST_F(WaterTemperature, HearsOfNoOtherDocument) {
    openAd();
    write("another.AD31", adText);
    openAd("another.AD31");
    User user(session);
    user.selectTab("Decay");
    CView& view = open();
    user.putCursor(1, 2);
    user.type("0.1");

    user.putCursor(1, 1);

    EXPECT_EQ(shown(view, Id::Decay), "2 lines, 0.0200 to 0.0400 1/h");
}

TEST_F(WaterTemperature, LooksAgainWhenTheUserComesBackOutsideAProject) {
    session.mainWindow().openProject(0);
    openAd();
    User user(session);
    user.selectTab("Decay");
    CView& view = open();
    bringToFront(user.view());
    user.putCursor(1, 2);
    user.enter("0.1");
    ASSERT_THAT(session.mainWindow().received(CommunicationCode::DataChanged), IsEmpty());

    bringToFront(view);

    EXPECT_EQ(shown(view, Id::Decay), "2 lines, 0.0400 to 0.1000 1/h");
}

TEST_F(WaterTemperature, ShowsTheDecayOfThePlaceWhereTheUserIs) {
    openAd();
    User user(session);
    user.selectTab("Dispersion");
    CView& view = open();

    user.putCursor(2, 3);

    EXPECT_EQ(shown(view, Id::Place), "MISSOURI 187328 m: 0.0400 1/h");

    user.closeWindow();

    EXPECT_EQ(shown(view, Id::Place), "") << "no place is current any more";
}

TEST_F(WaterTemperature, SavesBothDocuments) {
    CKota0_adDoc& ad = openAd();
    CView& view = open();
    correct(view, "21");

    EXPECT_TRUE(kota::input::click(*view.GetDlgItem(Id::SaveBoth)));

    EXPECT_FALSE(ad.IsModified());
    EXPECT_FALSE(view.GetDocument()->IsModified());
    EXPECT_THAT(read("river.AD31"), HasSubstr("DATA = 1, 0.02094, true, \"\", 0.0\n"));
    EXPECT_EQ(read("river.AD31~"), adText) << "the version before is kept";
    EXPECT_THAT(read("river.wtemp"), HasSubstr("Temperature = 21.0\n"));
}

TEST_F(WaterTemperature, FollowsTheAdDocumentToTheNameThatItIsSavedUnder) {
    fs::rename(folder / "river.AD31", folder / "river.ad31");
    openAd("river.ad31");
    CView& view = open();
    kota::input::typeText(*view.GetDlgItem(Id::AdName), "river.ad31");

    kota::input::click(*view.GetDlgItem(Id::SaveBoth));

    EXPECT_EQ(shown(view, Id::AdName), "river.AD31");
    EXPECT_EQ(shown(view, Id::Decay), "2 lines, 0.0200 to 0.0400 1/h");
    EXPECT_EQ(read("river.wtemp"), temperatureText);
}

TEST_F(WaterTemperature, DoesNotOpenAFaultyFile) {
    write("river.wtemp", "target WATER_TEMPERATURE {");
    session.screen().answerBox(IDOK);

    EXPECT_EQ(session.open(folder / "river.wtemp"), nullptr);

    ASSERT_EQ(session.screen().boxes().size(), 1U);
    EXPECT_THAT(std::string(session.screen().boxes()[0].text.View()), HasSubstr("river.wtemp:"));
}

} // namespace
