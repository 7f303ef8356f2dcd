#include "platform/framework/dialog.h"
#include "platform/framework/message_box.h"
#include "platform/framework/messages.h"
#include "resources/ids.h"
#include "tests/support/document_window.h"

#include <gmock/gmock.h>

using namespace kota::test;

namespace {

using kota::headless::User;
using testing::ElementsAre;
using testing::IsEmpty;

constexpr const char* notFound = "Searched item not found";
constexpr const char* lastFound = "The last occurence of searched item already found";

// What a user gives in the search dialog: texts by their controls, and the radio buttons that are clicked.
struct Terms {
    std::vector<std::pair<UINT, std::string>> texts = {};
    std::vector<UINT> buttons = {};
};

class Search : public DocumentWindow {
protected:
    CKota0_adDoc& createRivers(const std::vector<std::pair<const char*, double>>& places) {
        CKota0_adDoc& document = create();
        for (const auto& [river, chainage] : places)
            addDispersion(document, river, chainage);
        User(session).selectTab("Dispersion");
        return document;
    }

    void search(const Terms& terms, UINT answer = IDOK) {
        session.screen().answerDialog([terms, answer](CDialog& dialog) {
            for (const auto& [id, text] : terms.texts)
                kota::input::typeText(*dialog.GetDlgItem(id), text.c_str());
            for (const UINT id : terms.buttons)
                kota::input::click(*dialog.GetDlgItem(id));
            kota::input::click(*dialog.GetDlgItem(answer));
        });
        EXPECT_TRUE(User(session).command(CommandId::Search));
    }
    void look(const std::function<void(CDialog&)>& at) {
        session.screen().answerDialog(at);
        User(session).command(CommandId::Search);
    }
    void expectBox(int count = 1) {
        for (; count > 0; --count)
            session.screen().answerBox(IDOK);
    }
    ROWCOL line() { return User(session).cursor().first; }

    static Terms river(const char* name, UINT match) {
        return {.texts = {{ControlId::SearchRiverName, name}}, .buttons = {match, ControlId::SearchNotUsed}};
    }
};

TEST_F(Search, ByAPartialMatchFindsWhatBeginsWithTheTextAlone) {
    createRivers({{"CAB", 1}, {"ABC", 2}, {"AB", 3}, {"abX", 4}, {"XAB", 5}});
    User user(session);

    search(river("AB", ControlId::SearchPartialMatch));
    EXPECT_EQ(line(), 2U);
    user.command(CommandId::FindNext);
    EXPECT_EQ(line(), 3U);
    expectBox();
    user.command(CommandId::FindNext);

    EXPECT_EQ(line(), 3U) << "letters count by their case, and the cursor stays where nothing is found";
    EXPECT_THAT(boxes(), ElementsAre(notFound));
}

TEST_F(Search, ByAFullMatchFindsTheWholeNameAlone) {
    createRivers({{"ABC", 1}, {"AB", 2}, {"ABC", 3}});

    search(river("AB", ControlId::SearchFullMatch));

    EXPECT_EQ(line(), 2U);
}

TEST_F(Search, ForNothingStepsThroughAllLinesAndThenSaysSoTwice) {
    createRivers({{"ABC", 1}, {"", 2}, {"CAB", 3}});
    User user(session);

    search(river("", ControlId::SearchFullMatch));
    EXPECT_EQ(line(), 1U);
    user.key(VK_F3);
    EXPECT_EQ(line(), 2U);
    user.key(VK_F3);
    EXPECT_EQ(line(), 3U);
    expectBox(3);
    user.key(VK_F3);
    user.key(VK_F3);
    user.key(VK_F3);

    EXPECT_THAT(boxes(), ElementsAre(notFound, lastFound, lastFound));
    EXPECT_EQ(line(), 3U);
}

TEST_F(Search, ForTheNextWithoutAFirstFindsNothing) {
    CKota0_adDoc& document = createRivers({{"ABC", 1}});
    expectBox();

    User(session).command(CommandId::FindNext);

    ASSERT_THAT(boxes(), ElementsAre(lastFound));
    EXPECT_EQ(session.screen().boxes()[0].owner, viewOf(document).GetSafeHwnd());
    EXPECT_FALSE(session.screen().boxes()[0].caption.has_value());
}

TEST_F(Search, ForAChainageTestsItBelowEqualAndAbove) {
    createRivers({{"A", 100}, {"B", 200}, {"C", 300}});
    const auto chainage = [](UINT test) {
        return Terms{.texts = {{ControlId::SearchChainage, "200"}}, .buttons = {test}};
    };

    search(chainage(ControlId::SearchAbove));
    EXPECT_EQ(line(), 3U);
    search(chainage(ControlId::SearchEqual));
    EXPECT_EQ(line(), 2U);
    search(chainage(ControlId::SearchBelow));
    EXPECT_EQ(line(), 1U);
    expectBox();
    User(session).command(CommandId::FindNext);
    EXPECT_THAT(boxes(), ElementsAre(notFound)) << "only one is below";
}

TEST_F(Search, ForAnEqualChainageComparesWithWhatTheCellHolds) {
    createRivers({{"A", 1000.0000001}});
    User user(session);
    expectBox();

    search({.texts = {{ControlId::SearchChainage, "1000.0000001"}}});
    EXPECT_THAT(boxes(), ElementsAre(notFound)) << "the cell has rounded its value";

    user.putCursor(1, 3);
    search({.texts = {{ControlId::SearchChainage, "1000"}}});
    EXPECT_EQ(boxes().size(), 1U);
    EXPECT_EQ(user.cursor(), std::make_pair(1U, user.grid().GetLeftCol()));
}

TEST_F(Search, ForAChainageIsInTheUsersUnit) {
    const UnitChoice feet(100143, 1);
    createRivers({{"A", 3048}, {"B", 304.8}});

    search({.texts = {{ControlId::SearchChainage, "1000"}}});

    EXPECT_EQ(line(), 2U);
    look([](CDialog& dialog) {
        EXPECT_EQ(dialog.GetDlgItem(ControlId::SearchChainage)->GetWindowText(), "1000.000000");
    });
}

TEST_F(Search, OpensItsDialogWithTheTermsOfAFirstSearch) {
    create();
    User(session).selectTab("Dispersion");

    look([](CDialog& dialog) {
        EXPECT_EQ(dialog.GetWindowText(), "Search");
        const auto text = [&](UINT id) { return std::string(dialog.GetDlgItem(id)->GetWindowText().View()); };
        EXPECT_EQ(text(ControlId::SearchRiverName), "");
        EXPECT_EQ(text(ControlId::SearchChainage), "0.000000");
        EXPECT_EQ(text(ControlId::SearchComponent), "1");
        for (const UINT id : {1092U, 1093U, 1094U, 1102U, 1089U, 1090U})
            EXPECT_EQ(dialog.GetDlgItem(id)->GetCheck(), id == 1093U || id == 1090U) << id;
    });
}

TEST_F(Search, RemembersItsTermsWhenItWasNotCancelled) {
    createRivers({{"ABC", 100}});
    search({.texts = {{ControlId::SearchRiverName, "AB"}, {ControlId::SearchChainage, "50"}},
            .buttons = {ControlId::SearchPartialMatch, ControlId::SearchAbove}});
    search({.texts = {{ControlId::SearchRiverName, "OTHER"}, {ControlId::SearchChainage, "7"}},
            .buttons = {ControlId::SearchFullMatch, ControlId::SearchBelow}},
           IDCANCEL);

    look([](CDialog& dialog) {
        EXPECT_EQ(dialog.GetDlgItem(ControlId::SearchRiverName)->GetWindowText(), "AB");
        EXPECT_EQ(dialog.GetDlgItem(ControlId::SearchChainage)->GetWindowText(), "50.000000");
        EXPECT_TRUE(dialog.GetDlgItem(ControlId::SearchPartialMatch)->GetCheck());
        EXPECT_TRUE(dialog.GetDlgItem(ControlId::SearchAbove)->GetCheck());
    });
    EXPECT_THAT(boxes(), IsEmpty());
}

TEST_F(Search, ThatIsCancelledLeavesTheNextOneWhereItWas) {
    createRivers({{"A", 1}, {"B", 2}, {"C", 3}});
    User user(session);
    search(river("", ControlId::SearchFullMatch));
    user.command(CommandId::FindNext);

    search(river("A", ControlId::SearchFullMatch), IDCANCEL);
    user.command(CommandId::FindNext);

    EXPECT_EQ(line(), 3U);
}

TEST_F(Search, OffersTheComponentOnTheTabsWhosePlacesSaySo) {
    create();
    User user(session);

    for (const std::size_t tab : {1U, 2U, 3U, 4U, 5U, 6U, 8U}) { // the Grid menu is greyed on the other two
        user.selectTab(tabCaptions[tab]);
        const bool offered = tab != 1 && tab != 4 && tab != 8;
        look([&](CDialog& dialog) {
            EXPECT_EQ(dialog.GetDlgItem(1096)->IsWindowEnabled() != 0, offered) << tabCaptions[tab];
            for (const UINT id : {1088U, 1089U, 1090U, 1091U, 1092U, 1093U, 1094U, 1102U})
                EXPECT_TRUE(dialog.GetDlgItem(id)->IsWindowEnabled()) << tabCaptions[tab] << id;
        });
    }
}

TEST_F(Search, IsNoneOnTheComponentsTab) {
    create();
    User user(session);

    EXPECT_TRUE(user.command(CommandId::Search));
    EXPECT_TRUE(user.key(VK_F7));

    EXPECT_THAT(boxes(), IsEmpty());
}

TEST_F(Search, KeepsAComponentThatWasTypedToItself) {
    create();
    User user(session);
    user.selectTab("KOTA 32 Dispersion");
    expectBox();
    search({.texts = {{ControlId::SearchComponent, "2"}}});

    look([](CDialog& dialog) {
        EXPECT_EQ(dialog.GetDlgItem(ControlId::SearchComponent)->GetWindowText(), "1");
    });
    EXPECT_THAT(boxes(), ElementsAre(notFound));
}

TEST_F(Search, OnDecayLooksForTheFirstComponentAndTakesItsGlobalLines) {
    CKota0_adDoc& document = create();
    addGlobal(document.decayList, 2);
    addLocal(document.decayList, 1, "PLATTE", 1000.0);
    addGlobal(document.decayList, 1);
    addLocal(document.decayList, 1, "MISSOURI", 1000.0);
    User user(session);
    user.selectTab("Decay");

    search(river("MISSOURI", ControlId::SearchFullMatch));
    EXPECT_EQ(line(), 3U) << "a global line needs no place";
    user.command(CommandId::FindNext);
    EXPECT_EQ(line(), 4U);
    expectBox();
    user.command(CommandId::FindNext);
    EXPECT_THAT(boxes(), ElementsAre(notFound));
}

TEST_F(Search, GoesOnFromTheSameLineOnAnotherTab) {
    CKota0_adDoc& document = createRivers({{"A", 1}, {"B", 2}});
    addGlobal(document.decayList, 1);
    addGlobal(document.decayList, 1);
    User user(session);
    search(river("", ControlId::SearchFullMatch));

    user.selectTab("Decay");
    user.command(CommandId::FindNext);

    EXPECT_EQ(line(), 2U);
}

TEST_F(Search, FromALineBeyondTheLastMovesNothing) {
    createRivers({{"A", 1}, {"B", 2}, {"C", 3}});
    User user(session);
    search(river("C", ControlId::SearchFullMatch));
    user.selectTab("Decay");
    user.putCursor(1, 2);
    expectBox(2);

    user.command(CommandId::FindNext);
    user.command(CommandId::FindNext);

    EXPECT_EQ(user.cursor(), std::make_pair(1U, 2U));
    EXPECT_THAT(boxes(), ElementsAre(notFound, lastFound));
}

TEST_F(Search, KeepsItsDialogOnAChainageThatIsNoNumber) {
    createRivers({{"A", 1}, {"B", 2}});
    expectBox();

    session.screen().answerDialog([](CDialog& dialog) {
        kota::input::typeText(*dialog.GetDlgItem(ControlId::SearchChainage), "2x");
        kota::input::click(*dialog.GetDlgItem(IDOK));
        EXPECT_FALSE(dialog.IsEnded());
        kota::input::typeText(*dialog.GetDlgItem(ControlId::SearchChainage), "2");
        kota::input::key(VK_RETURN);
        EXPECT_TRUE(dialog.IsEnded());
    });
    User(session).command(CommandId::Search);

    EXPECT_EQ(line(), 2U);
    EXPECT_THAT(boxes(), ElementsAre("Invalid floating point number!"));
}

TEST_F(Search, GivesTheFocusBackToTheGrid) {
    createRivers({{"A", 1}, {"B", 2}});
    User user(session);
    user.putCursor(1, 1);

    search(river("B", ControlId::SearchFullMatch));

    EXPECT_EQ(CWnd::GetFocus(), &user.grid());
}

TEST_F(Search, CommitsTheEditThatIsUnderWay) {
    CKota0_adDoc& document = createRivers({{"A", 1}, {"B", 2}});
    User user(session);
    user.putCursor(1, 3);
    user.type("0.5");

    search(river("B", ControlId::SearchFullMatch));

    EXPECT_EQ(recordOf(document.dispersList).dispFactor, 0.5);
    EXPECT_EQ(line(), 2U);
}

} // namespace
