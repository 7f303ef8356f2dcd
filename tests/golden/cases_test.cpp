#include "tests/golden/cases.h"

#include "tests/support/temp_folder.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using testing::ElementsAre;
using testing::EndsWith;
using testing::IsEmpty;

constexpr const char* suffix = ".becomes.AD31";

class GoldenFolder : public testing::Test {
protected:
    void add(const std::string& name) { folder.write(name, ""); }
    golden::Folder discovered() const { return golden::discover(folder.path(), suffix); }

    kota::test::TempFolder folder;
};

TEST_F(GoldenFolder, ACaseIsAFileWithItsPartner) {
    add("one.ad31");
    add("one.becomes.AD31");
    add("another.ad31");
    add("another.becomes.AD31");
    add(".gitattributes");

    const golden::Folder found = discovered();

    EXPECT_THAT(found.problems, IsEmpty());
    ASSERT_EQ(found.cases.size(), 2u);
    EXPECT_EQ(found.cases[0].name, "another");
    EXPECT_EQ(found.cases[1].name, "one");
    EXPECT_EQ(found.cases[1].file, folder.file("one.ad31"));
    EXPECT_EQ(found.cases[1].expected, folder.file("one.becomes.AD31"));
}

TEST_F(GoldenFolder, ACaseWithoutItsPartnerIsAProblem) {
    add("one.ad31");
    add("one.becomes.AD31");
    add("two.ad31");

    EXPECT_THAT(discovered().problems, ElementsAre("two.ad31 has no partner two.becomes.AD31"));
}

TEST_F(GoldenFolder, APartnerWithoutItsCaseIsAProblem) {
    add("one.ad31");
    add("one.becomes.AD31");
    add("two.becomes.AD31");

    EXPECT_THAT(discovered().problems, ElementsAre("two.becomes.AD31 has no partner two.ad31"));
}

TEST_F(GoldenFolder, AFileThatIsNeitherIsAProblem) {
    add("one.ad31");
    add("one.becomes.AD31");
    add("one.message.txt");

    EXPECT_THAT(discovered().problems, ElementsAre("one.message.txt is neither a case nor a case's partner"));
}

TEST_F(GoldenFolder, AFolderWithoutACaseIsAProblem) {
    EXPECT_THAT(discovered().problems, ElementsAre(EndsWith("holds no case")));
}

} // namespace
