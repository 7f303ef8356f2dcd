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
    testing::Values(
        Text{4786, "AD Parameters"}, Text{4896, "AD Parameters"}, Text{4897, " KOTA 31 AD Tools"},
        Text{4899, "Kota0 AD"}, Text{57344, "Kota0_AD"},
        Text{42550, "Search for river name/topo ID.\nSearch"},
        Text{42551, "Search for next occurence of river name/ topo ID.\nFind Next"},
        Text{4828, "Invalid floating point value!"}, Text{4903, "SDFG"},
        Text{4906, "Integer between %d and %d required"},
        Text{4907, "Error in chainage (not a floating point value)"}, Text{42565, "Test"},
        Text{4873,
             "Data deleted in Layer page, but to switch there, you must first repair error on active page"},
        Text{4874,
             "Data deleted in Init page, but to switch there, you must first repair error on active page"},
        Text{
            4875,
            "Data deleted in Sediment page, but to switch there, you must first repair error on active page"},
        Text{4876, "Data deleted in Non Cohesive page, but to switch there, you must first repair error on "
                   "active page"},
        Text{4877,
             "Data deleted in Decay page, but to switch there, you must first repair error on active page"},
        Text{4878, "Data deleted in Dispersion page, but to switch there, you must first repair error on "
                   "active page"},
        Text{
            4879,
            "Data deleted in Ice Data page, but to switch there, you must first repair error on active page"},
        Text{
            4880,
            "Data deleted in Boundary page, but to switch there, you must first repair error on active page"},
        Text{4881,
             "Data inserted in Init page, but to switch there, you must first repair error on active page"},
        Text{4882, "Data inserted in Sediment page, but to switch there, you must first repair error on "
                   "active page"},
        Text{4883, "Data inserted in Non Cohesive page, but to switch there, you must first repair error on "
                   "active page"},
        Text{4884,
             "Data inserted in Decay page, but to switch there, you must first repair error on active page"},
        Text{4885, "Data inserted in Dispersion page, but to switch there, you must first repair error on "
                   "active page"},
        Text{4886, "Data inserted in Ice Data page, but to switch there, you must first repair error on "
                   "active page"},
        Text{4887, "Data inserted in Boundary page, but to switch there, you must first repair error on "
                   "active page"},
        Text{4888, "Can't select Layer page because of error on active page"},
        Text{4889, "Can't select Init page because of error on active page"},
        Text{4890, "Can't select Sediment page because of error on active page"},
        Text{4891, "Can't select Non Cohesive page because of error on active page"},
        Text{4892, "Can't select Decay page because of error on active page"},
        Text{4893, "Can't select Dispersion page because of error on active page"},
        Text{4894, "Can't select Ice Data page because of error on active page"},
        Text{4895, "Can't select Boundary page because of error on active page"},
        Text{5013, "Lines in the editor data-tables with none or only partially\nfilled information will be "
                   "deleted when saving the editor file.\nProceed Yes/No ?"},
        Text{5014, "Ice Thickness"}, Text{5015, "Width of ice cover"}, Text{5016, "Quality"},
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
