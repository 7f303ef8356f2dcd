#include "tests/support/owned.h"

#include <gtest/gtest.h>

using namespace kota::test;

namespace {

class ComponentNames : public testing::Test {
protected:
    ComponentNames() {
        addComponent(document.compList, 1, "BOD", 0);
        addComponent(document.compList, 2, "SILT", 1);
        addComponent(document.compList, 2, "CLAY", 2);
        addComponent(document.compList, 4, "SILT", 3);
    }

    OwnedDocument document;
};

TEST_F(ComponentNames, AreFoundByTheNumberOfTheFirstThatHasIt) {
    EXPECT_EQ(document.GetCompName(1), "BOD");
    EXPECT_EQ(document.GetCompName(2), "SILT");
    EXPECT_EQ(document.GetCompName(4), "SILT");
}

TEST_F(ComponentNames, AreHandedOutByReference) {
    EXPECT_EQ(&document.GetCompName(1), &recordOf(document.compList, 1).name);
    EXPECT_EQ(&document.GetCompName(2), &recordOf(document.compList, 2).name);
}

TEST_F(ComponentNames, AreTheEmptyNameForANumberThatNoneHas) {
    for (const int number : {0, 3, 5, -1}) {
        EXPECT_EQ(&document.GetCompName(number), &document.emptyName) << number;
        EXPECT_TRUE(document.GetCompName(number).IsEmpty()) << number;
    }
}

TEST_F(ComponentNames, AreTheEmptyNameInAnEmptyDocument) {
    OwnedDocument empty;

    EXPECT_EQ(&empty.GetCompName(1), &empty.emptyName);
    EXPECT_EQ(empty.GetCompNum("BOD"), 0);
    EXPECT_EQ(empty.GetCompNum(""), 0);
}

TEST_F(ComponentNames, GiveTheNumberOfTheFirstThatHasTheName) {
    EXPECT_EQ(document.GetCompNum("BOD"), 1);
    EXPECT_EQ(document.GetCompNum("SILT"), 2);
    EXPECT_EQ(document.GetCompNum("CLAY"), 2);
}

TEST_F(ComponentNames, AreComparedExactly) {
    for (const char* name : {"bod", "Bod", "BO", "BODY", "BOD ", ""})
        EXPECT_EQ(document.GetCompNum(name), 0) << name;
}

} // namespace
