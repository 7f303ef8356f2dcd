#include "platform/framework/messages.h"
#include "tests/plugin/plug_in.h"

#include <gmock/gmock.h>

#include <map>
#include <string>
#include <vector>

using namespace kota::test;

namespace {

using testing::ElementsAre;
using testing::UnorderedElementsAre;

// The entries of a menu of the plug-in's menu bar, as "57603 &Save", a separator as "-".
std::vector<std::string> entriesOf(std::size_t place) {
    std::vector<std::string> entries;
    for (const kota::MenuItemTemplate& item : plugInModule().menu(4787)->popups[place].items)
        entries.push_back(item.id == 0 ? "-" : std::to_string(item.id) + " " + item.text);
    return entries;
}

TEST(TheMenu, HasSixMenus) {
    ASSERT_NE(plugInModule().menu(4787), nullptr);

    std::vector<std::string> texts;
    for (const kota::MenuPopupTemplate& popup : plugInModule().menu(4787)->popups)
        texts.emplace_back(popup.text);

    EXPECT_THAT(texts, ElementsAre("&File", "&Edit", "&View", "&Grid", "&Window", "&Help"));
}

TEST(TheMenu, HasTheCommandsOfFiles) {
    EXPECT_THAT(entriesOf(0),
                ElementsAre("57600 &New\tCtrl+N", "57601 &Open...\tCtrl+O", "57602 &Close",
                            "57603 &Save\tCtrl+S", "57604 Save &As...", "-", "57607 &Print...\tCtrl+P",
                            "57609 Print Pre&view", "57606 P&rint Setup...", "-", "57616 Recent File", "-",
                            "32773 Data Utility...", "-", "57665 E&xit"));
}

TEST(TheMenu, HasTheCommandsOfEditingAndTheView) {
    EXPECT_THAT(entriesOf(1), ElementsAre("57643 &Undo\tCtrl+Z", "-", "57635 Cu&t\tCtrl+X",
                                          "57634 &Copy\tCtrl+C", "57637 &Paste\tCtrl+V"));
    EXPECT_THAT(entriesOf(2), ElementsAre("59392 &Toolbar...", "59393 &Status Bar"));
}

TEST(TheMenu, HasTheCommandsOfTheGrid) {
    EXPECT_THAT(entriesOf(3), ElementsAre("42561 &Insert line\tIns", "42562 &Delete line\tDel", "-",
                                          "42550 &Search\tF7", "42551 Find &next\tF3", "42563 Go &to..."));
}

TEST(TheMenu, HasTheCommandsOfWindowsAndHelp) {
    EXPECT_THAT(entriesOf(4),
                ElementsAre("57648 &New Window", "57650 &Cascade", "57651 &Tile", "57649 &Arrange Icons"));
    EXPECT_THAT(entriesOf(5), ElementsAre("57667 &Help Topics...", "-", "57664 &About KOTAHub..."));
}

TEST(TheMenu, HasTheRecentFileAloneGreyed) {
    std::vector<UINT> greyed;
    for (const kota::MenuPopupTemplate& popup : plugInModule().menu(4787)->popups)
        for (const kota::MenuItemTemplate& item : popup.items)
            if (item.greyed)
                greyed.push_back(item.id);

    EXPECT_THAT(greyed, ElementsAre(57616U));
}

// A key and its command, as "Ctrl+C 57634".
std::string textOf(const kota::Accelerator& entry) {
    static const std::map<WPARAM, std::string> names = {
        {VK_INSERT, "Insert"}, {VK_DELETE, "Delete"}, {VK_BACK, "Backspace"}, {VK_F6, "F6"}};
    const auto name = names.find(entry.key);
    return std::string(entry.control ? "Ctrl+" : "") + (entry.shift ? "Shift+" : "") +
           (entry.alt ? "Alt+" : "") +
           (name == names.end() ? std::string(1, static_cast<char>(entry.key)) : name->second) + " " +
           std::to_string(entry.command);
}

TEST(TheAccelerators, AreOneTableOfAllKeys) {
    ASSERT_EQ(plugInModule().accelerators().size(), 1U);
    const kota::AcceleratorTable& table = plugInModule().accelerators()[0];

    std::vector<std::string> keys;
    for (const kota::Accelerator& entry : table.keys)
        keys.push_back(textOf(entry));

    EXPECT_EQ(table.id, 4786U);
    EXPECT_THAT(keys,
                UnorderedElementsAre("Ctrl+C 57634", "Ctrl+Insert 57634", "Ctrl+V 57637",
                                     "Shift+Insert 57637", "Ctrl+X 57635", "Shift+Delete 57635",
                                     "Ctrl+Z 57643", "Alt+Backspace 57643", "Ctrl+N 57600", "Ctrl+O 57601",
                                     "Ctrl+P 57607", "Ctrl+S 57603", "F6 57680", "Shift+F6 57681"));
}

} // namespace
