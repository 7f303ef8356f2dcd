#include "platform/grid/table_text.h"

#include <gmock/gmock.h>
#include <rapidcheck/gtest.h>

namespace {

using kota::grid::printTable;
using kota::grid::readTable;
using testing::ElementsAre;
using testing::IsEmpty;

TEST(TableText, PartsCellsByTabsAndLinesByLineFeeds) {
    EXPECT_EQ(printTable({{"a", "b"}, {"", "d"}}), "a\tb\n\td\n");
    EXPECT_THAT(readTable("a\tb\n\td\n"), ElementsAre(ElementsAre("a", "b"), ElementsAre("", "d")));
}

TEST(TableText, QuotesACellWithATabALineEndOrAQuote) {
    EXPECT_EQ(printTable({{"a\tb", "c\nd", "e\"f", "g h"}}), "\"a\tb\"\t\"c\nd\"\t\"e\"\"f\"\tg h\n");
}

TEST(TableText, ReadsAllLineEnds) {
    const auto three = ElementsAre(ElementsAre("1"), ElementsAre("2"), ElementsAre("3"));
    EXPECT_THAT(readTable("1\r\n2\r\n3\r\n"), three);
    EXPECT_THAT(readTable("1\n2\n3"), three);
    EXPECT_THAT(readTable("1\r2\r3"), three);
}

TEST(TableText, ReadsQuotedCells) {
    EXPECT_THAT(readTable("\"a\tb\"\t\"c\r\nd\"\r\n\"say \"\"hi\"\"\"\t\"\"\r\n"),
                ElementsAre(ElementsAre("a\tb", "c\r\nd"), ElementsAre("say \"hi\"", "")));
}

TEST(TableText, TakesAQuoteThatQuotesNothingForItself) {
    EXPECT_THAT(readTable("\"open\tb"), ElementsAre(ElementsAre("\"open", "b")));
    EXPECT_THAT(readTable("5\" pipe\t\"a\"b"), ElementsAre(ElementsAre("5\" pipe", "\"a\"b")));
    EXPECT_THAT(readTable("\""), ElementsAre(ElementsAre("\"")));
}

TEST(TableText, KeepsEmptyCellsAndLines) {
    EXPECT_THAT(readTable("\t\n\nx\t"),
                ElementsAre(ElementsAre("", ""), ElementsAre(""), ElementsAre("x", "")));
    EXPECT_THAT(readTable(""), IsEmpty());
}

RC_GTEST_PROP(TableText, ReadsWhatItPrinted, ()) {
    const auto cell = rc::gen::container<std::string>(rc::gen::element('a', '\t', '\n', '\r', '"', ' '));
    const auto line = rc::gen::nonEmpty(rc::gen::container<std::vector<std::string>>(cell));
    const auto lines = *rc::gen::container<std::vector<std::vector<std::string>>>(line);
    RC_ASSERT(readTable(printTable(lines)) == lines);
}

} // namespace
