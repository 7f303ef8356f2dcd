#include "tests/platform/kvs/kvs_files.h"

#include <gmock/gmock.h>

// A text that breaks the form is told by its place and by what was expected.
namespace {

using namespace kvs_test;

using testing::EndsWith;
using testing::HasSubstr;
using testing::StartsWith;

class SyntaxErrors : public FileLibrary {};

TEST_F(SyntaxErrors, ReadFileLineColumnExpectedFound) {
    const Loaded loaded("target T {\n  keyword = 1\n}\n");

    EXPECT_TRUE(loaded.failed());
    EXPECT_EQ(loaded.error().text, loaded.path() + ":2:3: expected 'section' or '}', found 'keyword'");
}

TEST_F(SyntaxErrors, GiveLineAndColumnAsNumbersToo) {
    const Loaded loaded("target T {\n  keyword = 1\n}\n");
    int line = 0;
    int column = 0;
    CString text;

    EXPECT_EQ(kvsGetSyntaxErr(loaded.file(), &line, &column, &text), 1);

    EXPECT_EQ(line, 2);
    EXPECT_EQ(column, 3);
}

TEST_F(SyntaxErrors, SetTheGlobalErrorState) {
    const TempFolder folder;
    const Handle file(kvsLoadFile(folder.write("f.ad31", "{").c_str(), 1));

    EXPECT_NE(kvsPeekErrorGlb(), 0);
    EXPECT_THAT(errorText(), EndsWith(":1:1: expected 'target', found '{'"));
    EXPECT_NE(kvsGetErrorGlb(), 0);
    EXPECT_EQ(kvsPeekErrorGlb(), 0);
    EXPECT_EQ(kvsGetErrorGlb(), 0);
    EXPECT_EQ(errorText(), "");
}

TEST_F(SyntaxErrors, StayWithTheirFileWhenTheStateIsCleared) {
    const Loaded broken("{");
    const Loaded good("target T {\n}\n");

    EXPECT_EQ(broken.message(), ":1:1: expected 'target', found '{'");
    EXPECT_EQ(kvsGetSyntaxErr(good.file(), nullptr, nullptr, nullptr), 0);
    EXPECT_EQ(good.error().text, "");
    EXPECT_EQ(good.error().line, 0);
    EXPECT_EQ(good.error().column, 0);
}

TEST_F(SyntaxErrors, AreClearedByTheNextLoad) {
    const TempFolder folder;
    const Handle broken(kvsLoadFile(folder.write("broken.ad31", "{").c_str(), 1));
    ASSERT_NE(kvsPeekErrorGlb(), 0);

    const Handle good(kvsLoadFile(folder.write("good.ad31", "").c_str(), 1));

    EXPECT_EQ(kvsPeekErrorGlb(), 0);
}

TEST_F(SyntaxErrors, LeaveNothingOfWhatStoodBeforeThem) {
    const Loaded loaded("target T {\n}\nrubbish");

    EXPECT_TRUE(loaded.failed());
    EXPECT_EQ(loaded.target(), nullptr);
}

struct Broken {
    const char* text;
    int line;
    int column;
    const char* found;
};

TEST_F(SyntaxErrors, CountLinesAndColumnsFromOne) {
    const Broken rows[] = {
        {"?", 1, 1, "'?'"},
        {"\n\n ?", 3, 2, "'?'"},
        {"\r\n\r\n?", 3, 1, "'?'"},
        {"# one\n# two\n   ?", 3, 4, "'?'"},
        {"target", 1, 7, "the end of the file"},
        {"target T {\n", 2, 1, "the end of the file"},
        {"target T {", 1, 11, "the end of the file"},
        {"target T {\nsection S {\na = 1,\n\n2,\n?", 6, 1, "'?'"},
        {"target T {\nsection S {\na = \"x\n", 3, 7, "the end of the line"},
    };
    for (const Broken& row : rows) {
        SCOPED_TRACE(row.text);
        const SyntaxError error = Loaded(row.text).error();
        EXPECT_EQ(error.line, row.line);
        EXPECT_EQ(error.column, row.column);
        EXPECT_THAT(error.text, EndsWith(std::string(", found ") + row.found));
    }
}

TEST_F(SyntaxErrors, CountColumnsInCharacters) {
    const Broken rows[] = {
        {"\t\t?", 1, 3, ""},
        {"target \"\xC3\x85\" ?", 1, 12, ""},         // two bytes a letter
        {"target \"\xE5\xB7\x9D\" ?", 1, 12, ""},     // three
        {"target \"\xF0\x9F\x8C\x8A\" ?", 1, 12, ""}, // four
        {"target \"\xFF\xFE\" ?", 1, 13, ""},         // no letters: each byte counts
        {"target \"\xC3\" ?", 1, 12, ""},             // the front of a letter
        {"\xEF\xBB\xBF?", 1, 1, ""},                  // the mark is no character of the line
        {"\xEF\xBB\xBF\n  ?", 2, 3, ""},
    };
    for (const Broken& row : rows) {
        SCOPED_TRACE(row.text);
        const SyntaxError error = Loaded(row.text).error();
        EXPECT_EQ(error.line, row.line);
        EXPECT_EQ(error.column, row.column);
    }
}

std::string valueMessage(const std::string& value) {
    return Loaded("target T {\nsection S {\nv = " + value + "\n}\n}\n").message();
}

TEST_F(SyntaxErrors, AnIntBeyondThirtyTwoBitsIsOne) {
    for (const char* value : {"2147483648", "-2147483649", "4294967296", "9223372036854775808",
                              "18446744073709551617", "100000000000000000000000000000000000000000"}) {
        EXPECT_THAT(valueMessage(value),
                    StartsWith(":3:5: expected a whole number from -2147483648 to 2147483647"))
            << value;
    }
}

TEST_F(SyntaxErrors, ADoubleBeyondItsRangeIsOne) {
    for (const char* value : {"1e999", "-1e999", "1.8e308", "1e99999999999999999999"})
        EXPECT_THAT(valueMessage(value),
                    StartsWith(":3:5: expected a number within the range of a double, or inf"))
            << value;
}

TEST_F(SyntaxErrors, AnUnknownEscapeIsOne) {
    for (const char* escape : {"\\d", "\\X41", "\\x", "\\x4", "\\x4g", "\\u0041", "\\ ", "\\'", "\\N"})
        EXPECT_THAT(
            valueMessage("\"ab" + std::string(escape) + "\""),
            StartsWith(":3:8: expected one of \\\" \\\\ \\n \\r \\t and \\x with two hexadecimal digits"))
            << escape;
}

TEST_F(SyntaxErrors, AnythingThatIsNoValueIsOne) {
    for (const char* value :
         {"True", "NaN", "Inf",      "infinity", "-nan", "+1", "-",    "--1",       ".",         "-.", "'x'",
          "x",    "?",   "\xC3\xA5", "{",        "=",    "e5", "1,,2", "-infinity", "truefalse", "- 1"})
        EXPECT_THAT(valueMessage(value), HasSubstr(": expected a value (")) << value;
}

TEST_F(SyntaxErrors, WhateverFollowsAValueButACommaOrTheEndOfTheLineIsOne) {
    for (const char* value : {"1 2", "1x", "0x10", "1.2.3", "1e5.", "1;", "1.5f", "true false", "\"a\" \"b\"",
                              "\"a\"b", "1\r2", "1{", "nan=", "1-2", "1_000"})
        EXPECT_THAT(valueMessage(value), HasSubstr(": expected ',' or the end of the line")) << value;
}

TEST_F(SyntaxErrors, ShowABadByteAsAnEscape) {
    EXPECT_THAT(valueMessage("\x01"), EndsWith("found '\\x01'"));
    EXPECT_THAT(valueMessage("\x7F"), EndsWith("found '\\x7F'"));
    EXPECT_THAT(valueMessage("\xFF"), EndsWith("found '\\xFF'"));
    EXPECT_THAT(valueMessage(std::string(1, '\0')), EndsWith("found '\\x00'"));
    EXPECT_THAT(valueMessage("\xE5\xB7\x9D"), EndsWith("found '\xE5\xB7\x9D'"));
}

TEST_F(SyntaxErrors, ShowNoMoreThanTheBeginningOfALongWord) {
    const std::string message = valueMessage(std::string(100'000, 'x'));

    EXPECT_THAT(message, EndsWith("x...'"));
    EXPECT_LT(message.size(), 200u);
}

TEST_F(SyntaxErrors, FarInsideAFileKnowTheirPlace) {
    std::string text = "target T {\nsection S {\n";
    for (int line = 3; line < 50'000; ++line)
        text += "DATA = 1, 12.5, false, \"MISSOURI\", 227000.0\n";
    text += "DATA = 1, 12.5, false, \"MISSOURI\", 227000.0 ?\n}\n}\n";

    EXPECT_EQ(Loaded(text).message(), ":50000:45: expected ',' or the end of the line, found '?'");
}

TEST_F(SyntaxErrors, FarInsideALineKnowTheirPlace) {
    std::string text = "target T {\nsection S {\nv = ";
    for (int value = 0; value < 100'000; ++value)
        text += "0, ";

    EXPECT_THAT(Loaded(text + "?\n}\n}\n").message(), StartsWith(":3:300005: expected a value"));
}

} // namespace
