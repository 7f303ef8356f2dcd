#include "platform/framework/message_box.h"
#include "platform/headless/session.h"
#include "tests/support/owned.h"

#include <gtest/gtest.h>

using namespace kota::test;

namespace {

enum Reach { Local = 0, Global = 1 };

struct Line {
    int component;
    Reach reach;
};

// What a list class is checked by: the kind of the components that count for it, and its message.
struct CohesiveCheck {
    using List = CGlobalList;
    static constexpr int kind = 1;
    static CString message(const char* name) {
        return CString("Global values not specified for Component ") + name +
               " in Cohesive ST property page.";
    }
};

struct NonCohesiveCheck {
    using List = CNonCohesList;
    static constexpr int kind = 3;
    static CString message(const char* name) {
        return CString("Global values not specified for Component ") + name +
               " in Non-Cohesive property page.";
    }
};

template <class Check>
class GlobalLinesCheck : public testing::Test {
protected:
    // Components 1 to 3 of the kind that counts, among others that do not.
    GlobalLinesCheck() {
        addComponent(components, 1, "OTHER", 0);
        addComponent(components, 2, "ONE", Check::kind);
        addComponent(components, 3, "TWO", Check::kind);
        addComponent(components, 4, "ANOTHER", 0);
        addComponent(components, 5, "THREE", Check::kind);
        addComponent(components, 6, "LAST", 0);
    }

    void fill(std::initializer_list<Line> lines) {
        list.DeleteAll();
        for (const Line& line : lines) {
            if (line.reach == Global)
                addGlobal(list, line.component);
            else
                addLocal(list, line.component, "R", 5.0);
        }
    }

    // The check passes, and says nothing.
    void expectPassed(std::initializer_list<Line> lines) {
        fill(lines);
        EXPECT_EQ(list.CheckGlobalsPresent(&components), 1);
        EXPECT_EQ(session.screen().boxes().size(), 0U);
    }

    // The check fails, and names that component.
    void expectFailed(std::initializer_list<Line> lines, const char* name) {
        fill(lines);
        session.screen().answerBox(IDOK);
        const std::size_t before = session.screen().boxes().size();

        EXPECT_EQ(list.CheckGlobalsPresent(&components), 0);

        ASSERT_EQ(session.screen().boxes().size(), before + 1);
        const kota::MessageBoxRequest& box = session.screen().boxes().back();
        EXPECT_EQ(box.text, Check::message(name));
        EXPECT_EQ(box.type, MB_OK);
        EXPECT_FALSE(box.caption.has_value());
    }

    kota::headless::Session session{[](const std::string& text) { ADD_FAILURE() << text; }};
    Owned<CCompList> components;
    Owned<typename Check::List> list;
};

using Checks = testing::Types<CohesiveCheck, NonCohesiveCheck>;
TYPED_TEST_SUITE(GlobalLinesCheck, Checks);

TYPED_TEST(GlobalLinesCheck, PassesAnEmptyList) {
    this->expectPassed({});
}

TYPED_TEST(GlobalLinesCheck, PassesASingleLocalLineSinceTheLastOneIsNotExamined) {
    this->expectPassed({{1, Local}});
}

TYPED_TEST(GlobalLinesCheck, PassesTwoLinesOfAComponentOfWhichOneIsGlobal) {
    this->expectPassed({{1, Local}, {1, Global}});
    this->expectPassed({{1, Global}, {1, Local}});
}

TYPED_TEST(GlobalLinesCheck, FailsForTwoLocalLinesOfAComponent) {
    this->expectFailed({{1, Local}, {1, Local}}, "ONE");
}

TYPED_TEST(GlobalLinesCheck, FindsAGlobalLineAnywhereBehind) {
    this->expectPassed({{1, Local}, {2, Global}, {1, Local}, {3, Global}, {1, Global}, {3, Local}});
}

TYPED_TEST(GlobalLinesCheck, DoesNotTakeAnotherComponentsGlobalLine) {
    this->expectFailed({{1, Local}, {2, Global}, {1, Local}}, "ONE");
}

TYPED_TEST(GlobalLinesCheck, NamesTheComponentOfTheLastLineAndNotTheOneThatFailed) {
    this->expectFailed({{1, Local}, {2, Global}}, "TWO");
    this->expectFailed({{2, Global}, {1, Local}, {3, Local}}, "THREE");
}

TYPED_TEST(GlobalLinesCheck, DoesNotExamineAComponentThatFirstOccursInTheLastLine) {
    this->expectPassed({{1, Global}, {2, Local}});
    this->expectPassed({{1, Global}, {1, Local}, {2, Local}});
}

TYPED_TEST(GlobalLinesCheck, GoesOnToTheEndWhereTheLastLinesAreOfComponentsSeenBefore) {
    this->expectPassed({{1, Global}, {2, Global}, {1, Local}, {2, Local}});
    this->expectFailed({{1, Global}, {2, Local}, {1, Local}, {2, Local}}, "TWO");
}

TYPED_TEST(GlobalLinesCheck, StopsAtTheFirstComponentThatFails) {
    this->expectFailed({{1, Local}, {2, Local}, {1, Local}, {2, Local}, {3, Local}}, "THREE");
}

TYPED_TEST(GlobalLinesCheck, NeverReportsLinesWithoutAComponent) {
    this->expectPassed({{0, Local}, {0, Local}});
    this->expectPassed({{0, Local}, {1, Global}, {0, Local}});
    this->expectFailed({{0, Local}, {1, Local}, {1, Local}}, "ONE");
}

TYPED_TEST(GlobalLinesCheck, NamesNoComponentWhereTheLastLineHasNone) {
    this->expectFailed({{1, Local}, {0, Local}}, "");
}

TYPED_TEST(GlobalLinesCheck, NamesTheListsLastComponentWhereTheNumberIsBeyondAll) {
    this->expectFailed({{9, Local}, {9, Local}}, "LAST");
}

TYPED_TEST(GlobalLinesCheck, LeavesTheListAsItIs) {
    this->fill({{1, Global}, {0, Local}, {2, Local}});

    this->list.CheckGlobalsPresent(&this->components);

    EXPECT_EQ(this->list.GetCount(), 3);
}

TYPED_TEST(GlobalLinesCheck, CanBeAskedAgain) {
    this->expectFailed({{1, Local}, {1, Local}}, "ONE");
    this->expectFailed({{1, Local}, {1, Local}}, "ONE");
}

// A component of each kind of sediment, and a second one of each that the check may count.
void addSediments(CCompList& components) {
    addComponent(components, 1, "SILT", 1);
    addComponent(components, 2, "SAND", 3);
    addComponent(components, 3, "CLAY", 2);
    addComponent(components, 4, "GRAVEL", 3);
}

// The text of the box when the second component that counts has no global line.
template <class List>
CString refusalOfTheSecond() {
    kota::headless::Session session([](const std::string& text) { ADD_FAILURE() << text; });
    session.screen().answerBox(IDOK);
    Owned<CCompList> components;
    addSediments(components);
    Owned<List> list;
    addLocal(list, 2, "R", 1.0);
    addLocal(list, 2, "R", 2.0);
    EXPECT_EQ(list.CheckGlobalsPresent(&components), 0);
    return session.screen().boxes().at(0).text;
}

TEST(GlobalLinesCheckKinds, OfCohesiveSedimentAreOneAndTwo) {
    EXPECT_EQ(refusalOfTheSecond<CGlobalList>(),
              "Global values not specified for Component CLAY in Cohesive ST property page.");
}

TEST(GlobalLinesCheckKinds, OfNonCohesiveSedimentIsThree) {
    EXPECT_EQ(refusalOfTheSecond<CNonCohesList>(),
              "Global values not specified for Component GRAVEL in Non-Cohesive property page.");
}

} // namespace
