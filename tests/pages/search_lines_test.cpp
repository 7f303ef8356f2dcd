#include "editing/base/gen_grid.h"
#include "tests/pages/on_a_page.h"

#include <gmock/gmock.h>

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

enum ChainageTest { Below, Equal, Above, NotUsed };
enum TextTest { Partial, Full, NoTest };

// What is searched for; from the start every line fits.
struct Terms {
    unsigned component = anyComponent;
    const char* text = "";
    int textTest = Partial;
    double chainage = 0.0;
    int chainageTest = NotUsed;
};

class ASearch : public kota::test::OnAPage {
protected:
    using OnAPage::OnAPage;

    // One step; gives the line where the next one starts, 0 when there was no hit.
    unsigned next(const Terms& terms, unsigned line) {
        page().SearchLine(0, line, terms.component, terms.text, terms.chainage, terms.chainageTest,
                          terms.textTest);
        return line;
    }
    // The lines that fit, in the order in which the cursor goes to them.
    std::vector<unsigned> hits(const Terms& terms) {
        std::vector<unsigned> lines;
        for (unsigned line = next(terms, 0); line != 0 && lines.size() < 10; line = next(terms, line)) {
            EXPECT_EQ(user->cursor().first + 1, line) << "the next search starts behind the hit";
            lines.push_back(line - 1);
        }
        return lines;
    }
};

class ASearchForPlaces : public ASearch {
protected:
    ASearchForPlaces() : ASearch("Dispersion") {
        document().dispersList.DeleteAll();
        add("ABC", 10.0);
        add("CAB", 20.0);
        add("AB", 20.0004);
        add("", notGiven);
        add("ABD", 30.0);
        fill();
    }

    void add(const char* river, double chainage) {
        kota::test::addLocal(document().dispersList, 0, river, chainage);
    }
};

TEST_F(ASearchForPlaces, StepsThroughAllLinesWithoutTerms) {
    EXPECT_THAT(hits({}), ElementsAre(1, 2, 3, 4, 5));
}

TEST_F(ASearchForPlaces, FindsAPartialNameAtItsStart) {
    EXPECT_THAT(hits({.text = "AB"}), ElementsAre(1, 3, 5));
    EXPECT_THAT(hits({.text = "ab"}), IsEmpty());
    EXPECT_THAT(hits({.text = "ABCD"}), IsEmpty());
}

TEST_F(ASearchForPlaces, FindsAFullNameAlone) {
    EXPECT_THAT(hits({.text = "AB", .textTest = Full}), ElementsAre(3));
    EXPECT_THAT(hits({.text = "", .textTest = Full}), ElementsAre(1, 2, 3, 4, 5));
}

TEST_F(ASearchForPlaces, SkipsAnyOtherTestOfTheName) {
    EXPECT_THAT(hits({.text = "AB", .textTest = NoTest}), ElementsAre(1, 2, 3, 4, 5));
    EXPECT_THAT(hits({.text = "AB", .textTest = -1}), ElementsAre(1, 2, 3, 4, 5));
}

TEST_F(ASearchForPlaces, TestsTheChainage) {
    EXPECT_THAT(hits({.chainage = 20.0, .chainageTest = Below}), ElementsAre(1, 4));
    EXPECT_THAT(hits({.chainage = 20.0, .chainageTest = Equal}), ElementsAre(2));
    EXPECT_THAT(hits({.chainage = 20.0, .chainageTest = Above}), ElementsAre(3, 5));
    EXPECT_THAT(hits({.chainage = 0.0, .chainageTest = Equal}), ElementsAre(4)) << "a blank counts as 0";
    EXPECT_THAT(hits({.chainage = 20.0, .chainageTest = -1}), ElementsAre(1, 2, 3, 4, 5));
}

TEST_F(ASearchForPlaces, NeedsBothTestsToPass) {
    EXPECT_THAT(hits({.text = "AB", .chainage = 20.0, .chainageTest = Above}), ElementsAre(3, 5));
}

TEST_F(ASearchForPlaces, ReadsNoComponent) {
    EXPECT_THAT(hits({.component = 7, .text = "CAB"}), ElementsAre(2));
}

TEST_F(ASearchForPlaces, EndsBeyondTheLastLineAndLeavesTheCursor) {
    ASSERT_TRUE(user->putCursor(2, 3));
    EXPECT_EQ(next({}, 6), 0U);
    EXPECT_EQ(next({.text = "ABC"}, 2), 0U);
    EXPECT_EQ(user->cursor(), std::make_pair(2U, 3U));
}

TEST_F(ASearchForPlaces, StartsFromTheFirstLineForNoLine) {
    EXPECT_EQ(next({.text = "AB"}, 0), 2U);
    EXPECT_EQ(next({.text = "AB"}, 1), 2U);
    EXPECT_EQ(user->cursor(), std::make_pair(1U, 1U));
}

TEST_F(ASearchForPlaces, IsNoMoveToALineOfAKnownNumber) {
    page().GotoLine(3);
    EXPECT_EQ(user->cursor(), std::make_pair(3U, 1U));
    page().GotoLine(4711);
    EXPECT_EQ(user->cursor(), std::make_pair(5U, 1U));
}

class ASearchForDecay : public ASearch {
protected:
    ASearchForDecay() : ASearch("Decay") {
        document().decayList.DeleteAll();
        kota::test::addLocal(document().decayList, 1, "ABC", 10.0);
        kota::test::addGlobal(document().decayList, 1);
        kota::test::addLocal(document().decayList, 2, "AB", 20.0);
        kota::test::addGlobal(document().decayList, 2);
        fill();
    }
};

TEST_F(ASearchForDecay, FindsTheLinesOfAComponent) {
    EXPECT_THAT(hits({.component = 1}), ElementsAre(1, 2));
    EXPECT_THAT(hits({.component = 3}), IsEmpty());
    EXPECT_THAT(hits({}), ElementsAre(1, 2, 3, 4));
}

TEST_F(ASearchForDecay, FindsGlobalLinesWhateverTheirPlace) {
    EXPECT_THAT(hits({.text = "AB", .textTest = Full}), ElementsAre(2, 3, 4));
    EXPECT_THAT(hits({.component = 1, .text = "X"}), ElementsAre(2));
}

TEST_F(ASearchForDecay, TestsNameAndChainageOfLocalLines) {
    EXPECT_THAT(hits({.text = "AB"}), ElementsAre(1, 2, 3, 4));
    EXPECT_THAT(hits({.chainage = 15.0, .chainageTest = Above}), ElementsAre(2, 3, 4));
    EXPECT_THAT(hits({.component = 1, .text = "AB", .chainage = 15.0, .chainageTest = Below}),
                ElementsAre(1, 2));
}

class ASearchForComponents : public ASearch {
protected:
    ASearchForComponents() : ASearch("Components") {}
};

TEST_F(ASearchForComponents, DoesNothing) {
    EXPECT_EQ(next({}, 4), 4U);
}

TEST_F(ASearchForComponents, IsNoReasonToAddALineAtAPlace) {
    page().InsertLocatedLine("NILE", "1");
    EXPECT_EQ(user->grid().GetRowCount(), 1U);
}

} // namespace
