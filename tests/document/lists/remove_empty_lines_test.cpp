#include "tests/support/owned.h"

#include <gmock/gmock.h>

#include <cmath>
#include <limits>

using namespace kota::test;
using testing::ElementsAre;

namespace {

constexpr double nan = std::numeric_limits<double>::quiet_NaN();
constexpr double infinity = std::numeric_limits<double>::infinity();
const double besideNotGiven = std::nextafter(1e10, infinity);

enum class Fate { Stays, Goes };

struct Line {
    int component;
    int isGlobal;
    const char* river;
    double chainage;
    Fate fate;
};

// Cleans a list of that one line alone, and checks the flag and the result with it.
template <class List>
void expectFate(const Line& line) {
    Owned<List> list;
    auto& record = addTo(list);
    record.componentNum = line.component;
    record.isGlobal = line.isGlobal;
    record.riverName = line.river;
    record.chainage = line.chainage;
    int changed = 0;

    const int result = list.RemoveEmptyLines(&changed);

    const bool goes = line.fate == Fate::Goes;
    EXPECT_EQ(list.IsEmpty(), goes) << line.component << ", " << line.isGlobal << ", \"" << line.river
                                    << "\", " << line.chainage;
    EXPECT_EQ(changed, goes ? 1 : 0);
    EXPECT_EQ(result, 1);
}

template <class List>
class LinesOfAComponent : public testing::Test {};
using ListsOfComponents =
    testing::Types<CInitList, CInitStraList, CNonCohesList, CDecayList, CGlobalList, CLayerList>;
TYPED_TEST_SUITE(LinesOfAComponent, ListsOfComponents);

// clang-format off

TYPED_TEST(LinesOfAComponent, NeedAComponentAndWhenLocalAPlace) {
    const Line lines[] = {
        // component, global, river, chainage
        {1,  0, "R", 5.0,            Fate::Stays},
        {1,  0, "R", 0.0,            Fate::Stays},
        {-1, 0, "R", 5.0,            Fate::Stays},
        {0,  0, "R", 5.0,            Fate::Goes},
        {1,  0, "",  5.0,            Fate::Goes},
        {1,  0, "R", 1e10,           Fate::Goes},
        {1,  0, "",  1e10,           Fate::Goes},
        {1,  0, "R", nan,            Fate::Stays},
        {1,  0, "R", infinity,       Fate::Stays},
        {1,  0, "R", -1e10,          Fate::Stays},
        {1,  0, "R", besideNotGiven, Fate::Stays},
        {1,  0, " ", 5.0,            Fate::Stays},
    };

    for (const Line& line : lines)
        expectFate<TypeParam>(line);
}

TYPED_TEST(LinesOfAComponent, StayWhenGlobalWithoutAPlace) {
    const Line lines[] = {
        {1, 1, "",  5.0,  Fate::Stays},
        {1, 1, "R", 1e10, Fate::Stays},
        {1, 1, "",  1e10, Fate::Stays},
        {1, 2, "",  1e10, Fate::Stays},
        {0, 1, "R", 5.0,  Fate::Goes},
        {0, 1, "",  1e10, Fate::Goes},
    };

    for (const Line& line : lines)
        expectFate<TypeParam>(line);
}

template<class List>
class LinesOfAPlace : public testing::Test {};
using ListsOfPlaces =
    testing::Types<CDispersList, CK32DispersList, CIceDataList, CBoundList, CK32BoundList>;
TYPED_TEST_SUITE(LinesOfAPlace, ListsOfPlaces);

TYPED_TEST(LinesOfAPlace, NeedAPlaceWhateverTheirFlagAndComponent) {
    const Line lines[] = {
        {0, 0, "R", 5.0,            Fate::Stays},
        {0, 0, "R", 0.0,            Fate::Stays},
        {0, 0, "",  5.0,            Fate::Goes},
        {0, 0, "R", 1e10,           Fate::Goes},
        {0, 0, "R", nan,            Fate::Stays},
        {0, 0, "R", besideNotGiven, Fate::Stays},
        {1, 1, "",  5.0,            Fate::Goes},
        {1, 1, "R", 1e10,           Fate::Goes},
        {1, 1, "R", 5.0,            Fate::Stays},
    };

    for (const Line& line : lines)
        expectFate<TypeParam>(line);
}

// clang-format on

TEST(IncompleteLines, OfComponentsAreThoseWithoutAName) {
    Owned<CCompList> list;
    addComponent(list, 1, "", 3);
    addComponent(list, 0, "SAND", 0);
    addComponent(list, 3, "", 1);
    int changed = 0;

    EXPECT_EQ(list.RemoveEmptyLines(&changed), 1);

    ASSERT_EQ(list.GetCount(), 1);
    EXPECT_EQ(recordOf(list).name, "SAND");
    EXPECT_EQ(changed, 1);
}

TEST(IncompleteLines, OfALayersTableAreThoseWithoutBothValues) {
    Owned<CAdderList> list;
    const double values[][2] = {{1.0, 2.0}, {1e10, 3.0}, {4.0, 1e10}, {1e10, 1e10}, {nan, 0.0}, {-1.0, nan}};
    for (const auto& [width, height] : values) {
        AD_ST_Init_Cond_data& line = addTo(list);
        line.width = width;
        line.layerHeight = height;
    }
    int changed = 0;

    EXPECT_EQ(list.RemoveEmptyLines(&changed), 1);

    ASSERT_EQ(list.GetCount(), 3);
    EXPECT_EQ(recordOf(list, 1).width, 1.0);
    EXPECT_EQ(recordOf(list, 2).layerHeight, 0.0);
    EXPECT_EQ(recordOf(list, 3).width, -1.0);
    EXPECT_EQ(changed, 1);
}

TEST(IncompleteLines, OfATableGoWhileTheirLayerStays) {
    Owned<CLayerList> list;
    AD_Cohesiv_ST_Init_Cond& layer = addGlobal(list, 1);
    addTo(layer.adderList).layerHeight = 0.5;
    AD_ST_Init_Cond_data& whole = addTo(layer.adderList);
    whole.width = 10.0;
    whole.layerHeight = 0.5;
    addTo(layer.adderList);
    int changed = 0;

    EXPECT_EQ(list.RemoveEmptyLines(&changed), 1);

    ASSERT_EQ(list.GetCount(), 1);
    ASSERT_EQ(layer.adderList.GetCount(), 1);
    EXPECT_EQ(recordOf(layer.adderList).width, 10.0);
    EXPECT_EQ(changed, 1);
}

TEST(IncompleteLines, AreTakenFromEveryPlaceInAList) {
    Owned<CDecayList> list;
    for (const int component : {0, 1, 0, 0, 2, 3, 0})
        addGlobal(list, component);
    int changed = 0;

    list.RemoveEmptyLines(&changed);

    std::vector<int> left;
    for (const AD_Decay* record : recordsOf(list))
        left.push_back(record->componentNum);
    EXPECT_THAT(left, ElementsAre(1, 2, 3));
}

TEST(IncompleteLines, AreJudgedByNoOtherValue) {
    Owned<CInitList> list;
    addGlobal(list, 1).concentration = 1e10;
    int changed = 0;

    list.RemoveEmptyLines(&changed);

    EXPECT_EQ(list.GetCount(), 1);
    EXPECT_EQ(changed, 0);
}

TEST(IncompleteLines, SetTheFlagOnlyWhereItIsZero) {
    Owned<CInitList> list;
    addGlobal(list, 0);
    int changed = 5;

    list.RemoveEmptyLines(&changed);

    EXPECT_EQ(changed, 5);
}

TEST(IncompleteLines, LeaveASetFlagAloneWhereThereAreNone) {
    Owned<CInitList> list;
    addGlobal(list, 1);
    int changed = 1;

    EXPECT_EQ(list.RemoveEmptyLines(&changed), 1);

    EXPECT_EQ(changed, 1);
}

} // namespace
