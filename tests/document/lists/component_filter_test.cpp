#include "document/lists/component_filter.h"

#include "tests/support/owned.h"

#include <gtest/gtest.h>

using namespace kota::test;

namespace {

// One component of each kind and a second of some, so that each filter counts otherwise.
class FilteredComponentName : public testing::Test {
protected:
    FilteredComponentName() {
        int number = 0;
        for (const auto& [name, kind] : {std::pair("BOD", 0), std::pair("SAND", 3), std::pair("SILT", 1),
                                         std::pair("CLAY", 2), std::pair("GRAVEL", 3), std::pair("DYE", 0)})
            addComponent(components, ++number, name, kind);
    }

    Owned<CCompList> components;
};

struct Row {
    int filter;
    int n;
    const char* name;
};

TEST_F(FilteredComponentName, IsCountedByTheKindsThatPass) {
    const Row rows[] = {
        {0, 1, "BOD"},  {0, 2, "SAND"},   {0, 6, "DYE"},                   // all
        {1, 1, "SILT"}, {1, 2, "CLAY"},                                    // kinds 1 and 2
        {2, 1, "SAND"}, {2, 2, "GRAVEL"},                                  // kind 3
        {3, 1, "SAND"}, {3, 2, "SILT"},   {3, 3, "CLAY"}, {3, 4, "GRAVEL"} // all but kind 0
    };

    for (const Row& row : rows)
        EXPECT_EQ(GetFilteredCompName(components, row.n, row.filter), row.name)
            << "filter " << row.filter << ", number " << row.n;
}

TEST_F(FilteredComponentName, IsThatOfTheLastComponentWhereTheListEndsFirst) {
    for (const Row& row : {Row{0, 7, "DYE"}, Row{1, 3, "DYE"}, Row{2, 3, "DYE"}, Row{3, 5, "DYE"}})
        EXPECT_EQ(GetFilteredCompName(components, row.n, row.filter), row.name) << "filter " << row.filter;
}

TEST_F(FilteredComponentName, CountsByTheListsOrderAndNotByTheComponentsNumbers) {
    for (AD_Component* component : recordsOf(components))
        component->number = 10 - component->number;

    EXPECT_EQ(GetFilteredCompName(components, 1, 2), "SAND");
}

TEST_F(FilteredComponentName, IsEmptyBelowOne) {
    EXPECT_EQ(GetFilteredCompName(components, 0, 0), "");
    EXPECT_EQ(GetFilteredCompName(components, -1, 0), "");
}

TEST(FilteredComponentNameOfNone, IsEmpty) {
    const CCompList none;

    EXPECT_EQ(GetFilteredCompName(none, 1, 0), "");
}

TEST_F(FilteredComponentName, CountsAKindThatNoPageKnowsForAllAndForSediment) {
    addComponent(components, 7, "UNKNOWN", 9);
    addComponent(components, 8, "LAST", 0);

    EXPECT_EQ(GetFilteredCompName(components, 7, 0), "UNKNOWN");
    EXPECT_EQ(GetFilteredCompName(components, 5, 3), "UNKNOWN");
    EXPECT_EQ(GetFilteredCompName(components, 3, 1), "LAST");
    EXPECT_EQ(GetFilteredCompName(components, 3, 2), "LAST");
}

} // namespace
