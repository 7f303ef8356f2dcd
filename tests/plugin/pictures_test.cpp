#include "tests/plugin/plug_in.h"

#include <set>
#include <sstream>
#include <string>
#include <string_view>

using namespace kota::test;

namespace {

struct Size {
    int width = 0;
    int height = 0;
    int colours = 0;
    int perPixel = 0; // characters
};

// What a picture says of itself in its first row.
Size claimed(const kota::BitmapResource& picture) {
    Size size;
    std::istringstream(picture.rows[0]) >> size.width >> size.height >> size.colours >> size.perPixel;
    return size;
}

// Checks that a picture's rows and colours are those of its first row.
void expectWhole(const kota::BitmapResource& picture) {
    const Size size = claimed(picture);
    ASSERT_GT(size.width, 0);
    ASSERT_GT(size.height, 0);
    ASSERT_EQ(size.perPixel, 1);
    ASSERT_EQ(picture.rows.size(), static_cast<std::size_t>(1 + size.colours + size.height));
    std::set<char> colours;
    for (const std::string_view row : picture.rows.subspan(1, static_cast<std::size_t>(size.colours))) {
        EXPECT_EQ(row.substr(1, 3), " c ") << row;
        EXPECT_TRUE(row.substr(4) == "None" || (row.size() == 11 && row[4] == '#')) << row;
        EXPECT_TRUE(colours.insert(row[0]).second) << "twice: " << row;
    }
    for (const std::string_view row : picture.rows.subspan(static_cast<std::size_t>(1 + size.colours))) {
        EXPECT_EQ(row.size(), static_cast<std::size_t>(size.width)) << row;
        for (const char pixel : row)
            EXPECT_TRUE(colours.contains(pixel)) << "no colour for " << pixel;
    }
}

// Whether the pixels from one column to before another show anything.
bool isDrawn(const kota::BitmapResource& picture, int from, int to) {
    for (const std::string_view row :
         picture.rows.subspan(static_cast<std::size_t>(1 + claimed(picture).colours)))
        if (row.substr(static_cast<std::size_t>(from), static_cast<std::size_t>(to - from))
                .find_first_not_of('.') != std::string_view::npos)
            return true;
    return false;
}

TEST(Pictures, OfTheToolBarHaveAButtonForEachCommand) {
    const kota::BitmapResource* const picture = plugInModule().bitmap(4787);
    const kota::ToolBarTemplate* const bar = plugInModule().toolBar(4787);

    ASSERT_TRUE(picture && bar);
    expectWhole(*picture);
    const Size size = claimed(*picture);
    EXPECT_EQ(size.width, bar->buttonWidth * static_cast<int>(bar->commands.size()));
    EXPECT_EQ(size.height, bar->buttonHeight);
    EXPECT_TRUE(isDrawn(*picture, 0, 16));
    EXPECT_TRUE(isDrawn(*picture, 16, 32));
}

TEST(Pictures, IncludeTheEditorsBitmapUnderTheNumberThatTheShellGets) {
    const kota::BitmapResource* const picture =
        plugInModule().bitmap(exported<unsigned()>("KhGetBitmapId")());

    ASSERT_NE(picture, nullptr);
    EXPECT_EQ(picture, plugInModule().bitmap(4793));
    expectWhole(*picture);
    EXPECT_TRUE(isDrawn(*picture, 0, claimed(*picture).width));
}

TEST(Pictures, IncludeTheIconsOfTheDocumentAndTheEditor) {
    for (const UINT id : {4787U, 4786U}) {
        const kota::BitmapResource* const icon = plugInModule().icon(id);
        ASSERT_NE(icon, nullptr) << id;
        expectWhole(*icon);
        EXPECT_EQ(claimed(*icon).width, claimed(*icon).height) << id;
        EXPECT_TRUE(isDrawn(*icon, 0, claimed(*icon).width)) << id;
    }
    EXPECT_NE(plugInModule().icon(4787), plugInModule().icon(4786));
}

TEST(Pictures, AreNoneOfOneKindUnderTheNumberOfAnother) {
    EXPECT_EQ(plugInModule().bitmap(4786), nullptr);
    EXPECT_EQ(plugInModule().icon(4793), nullptr);
    EXPECT_EQ(plugInModule().toolBar(4793), nullptr);
    EXPECT_EQ(plugInModule().menu(4786), nullptr);
}

} // namespace
