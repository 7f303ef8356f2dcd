#include "editing/base/gen_grid.h"
#include "pages/comp_page.h"
#include "pages/decay_page.h"
#include "pages/dispers_page.h"
#include "resources/ids.h"
#include "tests/support/owned.h"

#include <gmock/gmock.h>

namespace {

using testing::ElementsAre;

constexpr int filters[] = {0, 1, 2, 3, 4, -1};

// A page of a document with these components: a number each, by their kinds.
class APage : public testing::Test {
protected:
    void addComponents(const std::vector<int>& kinds) {
        for (const int kind : kinds) {
            const int number = static_cast<int>(document.compList.GetCount()) + 1;
            kota::test::addComponent(document.compList, number, std::to_string(number).c_str(), kind);
        }
    }
    std::string choices(int filter) {
        CString out = "-\n";
        page.ComponentChoices(out, filter);
        return std::string(out.View());
    }
    // The places of the first, the second and so on, until there is none.
    std::vector<int> places(int filter) {
        std::vector<int> all;
        for (int n = 1; page.ComponentIndexOf(n, filter) != 0; ++n)
            all.push_back(page.ComponentIndexOf(n, filter));
        return all;
    }

    kota::test::OwnedDocument document;
    CGenPropertyPage page{&document, DialogId::Decay};
};

class APageOfSixComponents : public APage {
protected:
    APageOfSixComponents() { addComponents({0, 3, 1, 0, 2, 3}); }
};

TEST_F(APageOfSixComponents, OffersThoseThatPassTheFilter) {
    EXPECT_EQ(choices(0), "-\n1\n2\n3\n4\n5\n6\n");
    EXPECT_EQ(choices(1), "-\n3\n5\n");
    EXPECT_EQ(choices(2), "-\n2\n6\n");
    EXPECT_EQ(choices(3), "-\n2\n3\n5\n6\n");
    EXPECT_EQ(choices(4), "-\n");
    EXPECT_EQ(choices(-1), "-\n");
}

TEST_F(APageOfSixComponents, FindsTheirPlacesByTheirNumberAmongThoseThatPass) {
    EXPECT_THAT(places(0), ElementsAre(1, 2, 3, 4, 5, 6));
    EXPECT_THAT(places(1), ElementsAre(3, 5));
    EXPECT_THAT(places(2), ElementsAre(2, 6));
    EXPECT_THAT(places(3), ElementsAre(2, 3, 5, 6));
    EXPECT_THAT(places(4), ElementsAre());
    EXPECT_THAT(places(-1), ElementsAre());
}

TEST_F(APageOfSixComponents, FindsNoPlaceOutOfRange) {
    for (const int filter : filters)
        for (const int n : {0, -1, 7, 1000})
            EXPECT_EQ(page.ComponentIndexOf(n, filter), 0) << n << ", filter " << filter;
}

TEST_F(APageOfSixComponents, KnowsTheirKindsByTheirNumber) {
    const int kinds[] = {0, 0, 3, 1, 0, 2, 3, 0, 0};
    for (int n = 0; n <= 8; ++n)
        EXPECT_EQ(page.ComponentKindAt(n), kinds[n]) << n;
}

TEST_F(APage, OffersNothingWithoutComponents) {
    for (const int filter : filters) {
        EXPECT_EQ(choices(filter), "-\n");
        for (const int n : {-1, 0, 1})
            EXPECT_EQ(page.ComponentIndexOf(n, filter), 0);
    }
    EXPECT_EQ(page.ComponentKindAt(0), 0);
    EXPECT_EQ(page.ComponentKindAt(1), 0);
}

TEST_F(APage, OffersNothingOfAKindThatTheDocumentLacks) {
    addComponents({0, 1, 2});
    EXPECT_EQ(choices(2), "-\n");
    EXPECT_EQ(page.ComponentIndexOf(1, 2), 0);
}

TEST_F(APage, PassesKindsThatNoPageGivesByTheSameRule) {
    addComponents({4, -1});
    EXPECT_EQ(choices(0), "-\n1\n2\n");
    EXPECT_EQ(choices(1), "-\n");
    EXPECT_EQ(choices(2), "-\n");
    EXPECT_EQ(choices(3), "-\n1\n2\n");
}

TEST_F(APage, DoesNothingByItself) {
    addComponents({0});
    unsigned line = 5;
    page.InsertLocatedLine("NILE", "1");
    page.InsertDefaultLine();
    page.DeleteCurrentLine();
    page.GotoLine(1);
    page.SearchLine(0, line, 0, "NILE", 0.0, 3, 0);
    page.StoreToDocument();
    page.OnRowColumnChanged(1, 1);
    EXPECT_EQ(line, 5U);
    EXPECT_EQ(page.RecordFromRow(1), nullptr);
    EXPECT_EQ(document.compList.GetCount(), 1);
    EXPECT_FALSE(page.IsInitialised());
}

TEST_F(APage, RemembersItsActiveGrid) {
    CGenGrid grid;
    EXPECT_EQ(page.GetActiveGrid(), nullptr);
    page.SetActiveGrid(&grid);
    EXPECT_EQ(page.GetActiveGrid(), &grid);
}

TEST(Pages, DescendFromThePageBase) {
    for (const CRuntimeClass* page :
         {RUNTIME_CLASS(CCompPage), RUNTIME_CLASS(CDecayPage), RUNTIME_CLASS(CDispersPage)}) {
        EXPECT_TRUE(page->IsDerivedFrom(RUNTIME_CLASS(CGenPropertyPage)));
        EXPECT_TRUE(page->IsDerivedFrom(RUNTIME_CLASS(CPropertyPage)));
    }
}

} // namespace
