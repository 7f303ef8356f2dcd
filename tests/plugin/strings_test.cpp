#include "tests/plugin/plug_in.h"

#include <ostream>
#include <string>

using namespace kota::test;

namespace {

struct Text {
    UINT id;
    const char* text;

    friend void PrintTo(const Text& row, std::ostream* out) { *out << row.id; }
};

class PlugInStrings : public testing::TestWithParam<Text> {};

TEST_P(PlugInStrings, StandUnderTheirNumbers) {
    EXPECT_EQ(plugInModule().string(GetParam().id), GetParam().text);
}

INSTANTIATE_TEST_SUITE_P(
    All, PlugInStrings,
    testing::Values(Text{4786, "AD Parameters"}, Text{4896, "AD Parameters"}, Text{4897, " KOTA 31 AD Tools"},
                    Text{4899, "Kota0 AD"}, Text{57344, "Kota0_AD"},
                    Text{42550, "Search for river name/topo ID.\nSearch"},
                    Text{42551, "Search for next occurence of river name/ topo ID.\nFind Next"},
                    Text{4787, "K31_Help.chm\nADPar\nKOTA 31 AD Parameters\nKOTA 31 AD Parameters (*.ad31)\n"
                               ".ad31\nADPar.Document\nADPar Document"}),
    [](const auto& row) { return std::to_string(row.param.id); });

TEST(OtherStrings, AreEmpty) {
    for (const UINT id : {0U, 4785U, 4788U, 4793U, 57345U})
        EXPECT_EQ(plugInModule().string(id), "") << id;
}

TEST(TheTemplatesString, HasSevenPartsInTheFrameworksOrder) {
    using Part = CDocTemplate::DocString;
    const auto docTemplate = makeTemplate();
    const struct {
        Part part;
        const char* text;
    } parts[] = {
        {Part::WindowTitle, "K31_Help.chm"}, // the help file's name, not a title
        {Part::DocName, "ADPar"},
        {Part::FileNewName, "KOTA 31 AD Parameters"},
        {Part::FilterName, "KOTA 31 AD Parameters (*.ad31)"},
        {Part::FilterExtension, ".ad31"},
        {Part::RegFileTypeId, "ADPar.Document"},
        {Part::RegFileTypeName, "ADPar Document"},
    };

    for (std::size_t i = 0; i < std::size(parts); ++i) {
        EXPECT_EQ(static_cast<std::size_t>(parts[i].part), i);
        EXPECT_EQ(docTemplate->GetDocString(parts[i].part), parts[i].text);
    }
    EXPECT_EQ(docTemplate->GetDocString(static_cast<Part>(7)), "") << "there is no eighth";
}

} // namespace
