#include "platform/framework/message_box.h"
#include "platform/framework/messages.h"
#include "platform/framework/template.h"
#include "resources/ids.h"
#include "tests/support/document_window.h"
#include "tests/support/temp_folder.h"

#include <gmock/gmock.h>

using namespace kota::test;

namespace {

using kota::headless::Received;
using kota::headless::User;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

// The ways in which a user closes a window, which is the only one of its document.
struct Way {
    const char* name;
    void (*close)(User& user);
};

constexpr Way ways[] = {
    {"ByItsButton", [](User& user) { user.closeWindow(); }},
    {"ByItsKey", [](User& user) { user.key(VK_F4, {.control = true}); }},
    {"WithItsDocument", [](User& user) { user.command(ID_FILE_CLOSE); }},
};

class AWindowClosed : public DocumentWindow, public testing::WithParamInterface<Way> {
protected:
    static void close(User& user) { GetParam().close(user); }
    bool isOpen() { return shell().MDIGetActive() != nullptr; }

    TempFolder folder;
};

TEST_P(AWindowClosed, AsksAboutATextThatIsTypedInACell) {
    create();
    User user(session);
    user.putCursor(1, 1);
    user.type("BOD");
    session.screen().answerBox(IDCANCEL);

    close(user);

    EXPECT_THAT(boxes(), ElementsAre(HasSubstr("Save changes")));
    ASSERT_TRUE(isOpen());
    EXPECT_EQ(user.held(1, 1), "BOD");
}

TEST_P(AWindowClosed, SavesATextThatIsTypedInACell) {
    create();
    User user(session);
    user.putCursor(1, 1);
    user.type("BOD");
    session.screen().answerBox(IDYES);
    session.screen().answerSaveName(folder.file("river.ad31").c_str());

    close(user);

    EXPECT_FALSE(isOpen());
    EXPECT_THAT(folder.read("river.AD31"), HasSubstr("\"BOD\""));
}

TEST_P(AWindowClosed, StaysWithATextThatIsRefused) {
    create();
    User user(session);
    user.selectTab("Decay");
    user.putCursor(1, 2);
    user.type("x");

    close(user);

    ASSERT_TRUE(isOpen());
    EXPECT_EQ(user.warning(), "Double number required");
    EXPECT_TRUE(user.grid().IsEditPending()) << "the text is still there";
    EXPECT_THAT(boxes(), IsEmpty());
}

TEST_P(AWindowClosed, AsksAboutANumberThatIsTypedIntoAnEdit) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    user.typeInto(ControlId::DispersionFactor, "0.625");
    ASSERT_FALSE(document.IsModified());
    session.screen().answerBox(IDCANCEL);

    close(user);

    EXPECT_THAT(boxes(), ElementsAre(HasSubstr("Save changes")));
    EXPECT_TRUE(isOpen());
}

TEST_P(AWindowClosed, SavesANumberThatIsTypedIntoAnEdit) {
    createDispersion();
    User user(session);
    user.typeInto(ControlId::DispersionFactor, "0.625");
    session.screen().answerBox(IDYES);
    session.screen().answerSaveName(folder.file("river.ad31").c_str());

    close(user);

    EXPECT_FALSE(isOpen());
    EXPECT_THAT(folder.read("river.AD31"), HasSubstr("G_disp_factor = 0.625"));
}

TEST_P(AWindowClosed, AsksNothingWhereNothingIsTyped) {
    createDispersion();
    User user(session);
    user.putCursor(1, 3);

    close(user);

    EXPECT_FALSE(isOpen());
    EXPECT_THAT(boxes(), IsEmpty());
}

INSTANTIATE_TEST_SUITE_P(InEachWay, AWindowClosed, testing::ValuesIn(ways),
                         [](const auto& given) { return given.param.name; });

class AShellThatEndsTheDocument : public DocumentWindow {
protected:
    AShellThatEndsTheDocument() { openProject(); }

    // Ends the document when it says for the first time that its data changed.
    void listen(CKota0_adDoc& document) {
        shell().onMessage = [this, &document](const Received& received) {
            if (received.code == 523 && !ended) {
                ended = true;
                document.OnCloseDocument();
            }
        };
    }
    void expectNothingIsLeft() {
        EXPECT_TRUE(ended);
        EXPECT_THAT(shell().Children(), IsEmpty());
        EXPECT_TRUE(session.application().Templates().front()->Documents().empty());
        EXPECT_THAT(boxes(), IsEmpty());
    }

    bool ended = false;
};

TEST_F(AShellThatEndsTheDocument, WhenACellIsLeftForAnotherLineEndsItsWindow) {
    CKota0_adDoc& document = createDispersion();
    User user(session);
    user.putCursor(1, 1);
    user.type("JAMES");
    listen(document);

    EXPECT_FALSE(user.putCursor(2, 1));

    expectNothingIsLeft();
}

TEST_F(AShellThatEndsTheDocument, WhenACellIsLeftForAnotherLineEndsAllItsWindows) {
    CKota0_adDoc& document = createDispersion();
    User(session).newWindow();
    User user(session);
    user.selectTab("Dispersion");
    user.putCursor(1, 2);
    user.type("77");
    listen(document);

    EXPECT_FALSE(user.putCursor(2, 1));

    expectNothingIsLeft();
}

// Two changed documents, the second one in front.
class AShellThatEnds : public DocumentWindow {
protected:
    AShellThatEnds() {
        for (const char* name : {"A", "B"}) {
            create();
            User user(session);
            user.putCursor(1, 1);
            user.enter(name);
        }
    }
    void end() { kota::input::close(shell()); }

    TempFolder folder;
};

TEST_F(AShellThatEnds, LosesNothingWhenTheUserCancelsAtTheLastQuestion) {
    session.screen().answerBox(IDNO);
    session.screen().answerBox(IDCANCEL);

    end();

    ASSERT_EQ(shell().Children().size(), 2U);
    EXPECT_TRUE(shell().Children().front()->GetActiveDocument()->IsModified());
}

TEST_F(AShellThatEnds, BringsTheDocumentToTheFrontThatItAsksAbout) {
    std::vector<const CMDIChildWnd*> inFront;
    session.screen().onBox = [&] { inFront.push_back(shell().MDIGetActive()); };
    const auto frames = shell().Children();
    session.screen().answerBox(IDNO);
    session.screen().answerBox(IDCANCEL);

    end();

    EXPECT_THAT(inFront, ElementsAre(frames[0], frames[1]));
}

TEST_F(AShellThatEnds, ClosesAllOnceAllIsAnswered) {
    session.screen().answerBox(IDNO);
    session.screen().answerBox(IDNO);

    end();

    EXPECT_FALSE(shell().GetSafeHwnd());
    EXPECT_THAT(boxes(), testing::SizeIs(2));
}

class AWindowOfADocument : public DocumentWindow {
protected:
    TempFolder folder;
};

// An edit of a number that holds none.
class ABadNumberInAnEdit : public DocumentWindow {
protected:
    ABadNumberInAnEdit() {
        create();
        User user(session);
        user.selectTab("Dispersion");
        user.typeInto(ControlId::DispersionExponent, "1x");
    }

    TempFolder folder;
};

TEST_F(ABadNumberInAnEdit, KeepsItsWindowOpenWhenItWasTold) {
    session.screen().answerBox(IDOK);
    EXPECT_FALSE(User(session).closeWindow());
    EXPECT_THAT(boxes(), ElementsAre("Invalid floating point number!"));
    ASSERT_TRUE(shell().MDIGetActive());
    EXPECT_EQ(User(session).textOf(ControlId::DispersionExponent), "1x");
}

TEST_F(ABadNumberInAnEdit, IsToldOnceInASave) {
    session.screen().answerBox(IDOK);
    EXPECT_TRUE(session.saveAs(*shell().MDIGetActive()->GetActiveDocument(), folder.file("river.AD31")));
    EXPECT_THAT(boxes(), ElementsAre("Invalid floating point number!"));
}

TEST_F(ABadNumberInAnEdit, KeepsItsWindowInFrontOfANewOne) {
    session.screen().answerBox(IDOK);
    User(session).newWindow();
    EXPECT_EQ(shell().Children().size(), 1U);
}

TEST_F(AWindowOfADocument, IsNotSavedOverTheFileOfAnotherWindow) {
    ASSERT_TRUE(session.saveAs(create(), folder.file("river.AD31")));
    CKota0_adDoc& other = create();
    session.screen().answerBox(IDOK);

    EXPECT_FALSE(session.saveAs(other, folder.file("river.ad31")));

    EXPECT_THAT(boxes(), ElementsAre(HasSubstr("river.AD31 is open in another window.")));
    EXPECT_TRUE(other.GetPathName().IsEmpty());
}

} // namespace
