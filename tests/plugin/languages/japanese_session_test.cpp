#include "platform/foundation/plug_in.h"
#include "platform/framework/message_box.h"
#include "platform/framework/messages.h"
#include "platform/framework/platform_texts.h"
#include "platform/headless/session.h"
#include "platform/headless/user.h"
#include "platform/language/language.h"
#include "tests/support/temp_folder.h"

#include <gmock/gmock.h>

#include <optional>

using namespace kota::headless;

namespace {

// A user whose language is Japanese, with the example open.
class InJapanese : public testing::Test {
protected:
    InJapanese() {
        kota::setLanguage(1041);
        session.emplace([](const std::string& text) { ADD_FAILURE() << text; });
        session->load(KOTA_PLUG_IN);
    }
    ~InJapanese() override {
        session.reset();
        kota::setLanguage(0);
    }

    void open() { document = session->open(KOTA_EXAMPLES "/missouri/missouri.AD31"); }

    std::optional<Session> session;
    CDocument* document = nullptr;
};

TEST_F(InJapanese, TheTabsAreCaptionedSo) {
    open();
    User user(*session);

    EXPECT_TRUE(user.selectTab("減衰"));

    EXPECT_EQ(user.tab(), "減衰");
    EXPECT_EQ(user.shown(0, 1), "成分");
}

TEST_F(InJapanese, AWarningIs) {
    open();
    User user(*session);
    user.selectTab("減衰");
    user.putCursor(1, 2);

    user.enter("x");

    EXPECT_EQ(user.warning(), "実数を入力してください");
}

TEST_F(InJapanese, ThePlatformsQuestionsAreAsked) {
    open();
    User user(*session);
    user.selectTab("減衰");
    user.putCursor(1, 2);
    user.enter("0.5");
    session->screen().answerBox(IDNO);

    user.command(ID_FILE_CLOSE);

    ASSERT_EQ(session->screen().boxes().size(), 1U);
    EXPECT_EQ(session->screen().boxes().front().text, "missouri.AD31 への変更を保存しますか?");
}

TEST_F(InJapanese, AFaultOfAFileIsTold) {
    const kota::test::TempFolder folder;
    kota::test::writeFile(folder.file("broken.ad31"), "target KOTA0_AD {\n  section A {\n    B 1\n  }\n}\n");
    session->screen().answerBox(IDOK);

    document = session->open(folder.file("broken.ad31"));

    ASSERT_EQ(session->screen().boxes().size(), 1U);
    EXPECT_THAT(std::string(session->screen().boxes().front().text.View()),
                testing::EndsWith("broken.ad31:3:7: '=' が必要ですが、'1' があります"));
}

TEST_F(InJapanese, TheToolBarIsNamed) {
    const kota::PlugIn plugIn(KOTA_PLUG_IN);

    EXPECT_EQ(plugIn.editorName(), "AD パラメータ");
    EXPECT_EQ(plugIn.toolBarName(0), " KOTA 31 AD ツール");
}

// A screen with a font for Japanese, and another one for what it does not know.
class ScreenWithFonts : public kota::Screen {
public:
    int showMessageBox(const kota::MessageBoxRequest&) override { return IDOK; }
    std::optional<CString> askSaveName(const CString&) override { return std::nullopt; }
    void showDialog(CDialog&) override {}
    CString fontFor(int language) const override { return language == 1041 ? "Kaisho" : ""; }
};

TEST_F(InJapanese, TheUsersFontIsTheScreensForIt) {
    ScreenWithFonts screen;
    kota::Screen* const before = kota::attachScreen(&screen);

    LOGFONT font{.face = "", .points = 9};
    KhLangGetUserFont({.message = font}, &font);
    kota::attachScreen(before);

    EXPECT_EQ(font.face, "Kaisho");
    EXPECT_EQ(font.points, 9);
}

TEST_F(InJapanese, TheTextsOfAnotherSessionAreEnglishAgain) {
    session.reset();
    kota::setLanguage(1033);
    session.emplace([](const std::string& text) { ADD_FAILURE() << text; });

    EXPECT_EQ(kota::platformText(kota::PlatformText::NoSuchLine), "there is no such line");
}

} // namespace
