#include "tests/random/dice.h"

#include <array>

namespace kota::random_user {

namespace {

constexpr std::array numbers = {"0",
                                "1",
                                "2",
                                "-1",
                                "0.5",
                                "2.75",
                                "1e3",
                                "125",
                                "1000",
                                ".5",
                                "+7",
                                "-0",
                                "00012",
                                "1E-3",
                                "99999",
                                "0.0000001",
                                "1234.56789",
                                "1e10",
                                "10000000000",
                                "9999999999.9",
                                "-1e10",
                                "1e15",
                                "123456789.123456789",
                                "1e30"};

constexpr std::array badNumbers = {
    "1e",  "1.",  ".",    "-",    "+",     "e5",  "1e5.5", "12,5", "1 2",   " 3",     "3 ",
    "nan", "inf", "-inf", "0x10", "1.2.3", "--1", "1e+",   "abc",  "1e400", "1e-400", "999999999999999999999",
    "%s",  "٣"};

constexpr std::array names = {"BOD",  "bod", "Oxygen",    "NH4", "åäö", "ß",
                              "日本", "a b", "Undefined", "g/l", "1",   "-"};

constexpr std::array rivers = {"MISSOURI", "PLATTE", "OSAGE", "missouri", "Kansas", "", "JAMES RIVER", "ÅÄÖ"};

constexpr std::array strange = {"\"",          "\\",           "\"quoted\"", "{",    "}",    "target",
                                "section X {", "# no comment", "%d%n",       "a\tb", "a\nb", "\r\n",
                                "\x01\x7f",    "\xff\xfe",     "\xc3",       "🙂", "ǆ",    "'",
                                ";,;"};

std::string longText(Dice& dice) {
    return std::string(dice.between(20, 300), dice.onceIn(2) ? '9' : 'x');
}

std::string anyCell(Dice& dice) {
    // A tab or a line end makes another cell of it.
    const std::string text = anyText(dice);
    return text.find_first_of("\t\r\n") == std::string::npos || dice.onceIn(4) ? text : "x";
}

} // namespace

std::string anyText(Dice& dice) {
    const std::size_t kind = dice.below(100);
    if (kind < 50)
        return dice.one(numbers);
    if (kind < 65)
        return dice.one(badNumbers);
    if (kind < 77)
        return dice.one(rivers);
    if (kind < 87)
        return dice.one(names);
    if (kind < 92)
        return {};
    return kind < 98 ? dice.one(strange) : longText(dice);
}

std::string anyRiver(Dice& dice) {
    return dice.onceIn(10) ? std::string(dice.one(strange)) : dice.one(rivers);
}

std::string anyTable(Dice& dice) {
    const int lines = dice.onceIn(3) ? 1 : dice.between(1, 4);
    const int columns = dice.onceIn(3) ? 1 : dice.between(1, 7);
    std::string table;
    for (int line = 0; line < lines; ++line) {
        for (int column = 0; column < columns; ++column)
            table += (column > 0 ? "\t" : "") + anyCell(dice);
        if (line + 1 < lines || !dice.onceIn(3))
            table += dice.onceIn(4) ? "\r\n" : "\n";
    }
    return table;
}

} // namespace kota::random_user
