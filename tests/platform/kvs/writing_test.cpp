#include "tests/platform/kvs/kvs_files.h"

#include <gmock/gmock.h>

// The text that is built, and what has no place in it.
namespace {

using namespace kvs_test;

using testing::AllOf;
using testing::HasSubstr;
using testing::StartsWith;

class Writing : public FileLibrary {};

TEST_F(Writing, IndentsByTwoBlanks) {
    const Built built;
    void* const file = built.file();

    kvsAddTarget(file, "KOTA0_AD");
    kvsAddSection(file, "Global_Variables");
    kvsAddKeyword(file, "LastSelected");
    kvsAddInt(file, 0);
    kvsAddSection(file, "KOTA32_Additional");
    kvsPutListParam(file, "Mass", "iiii", 0, 1, 0, 1);
    kvsEndSection(file);
    kvsAddKeyword(file, "G_Coli");
    kvsAddBool(file, false);
    kvsEndSection(file);
    kvsAddSection(file, "InitList");
    kvsAddKeyword(file, "DATA");
    kvsAddInt(file, 1);
    kvsAddDouble(file, 12.5);
    kvsAddBool(file, true);
    kvsAddString(file, "MISSOURI");
    kvsEndSection(file);
    kvsEndSection(file);

    EXPECT_EQ(built.text(), R"(target KOTA0_AD {
  section Global_Variables {
    LastSelected = 0
    section KOTA32_Additional {
      Mass = 0, 1, 0, 1
    }
    G_Coli = false
  }
  section InitList {
    DATA = 1, 12.5, true, "MISSOURI"
  }
}
)");
}

TEST_F(Writing, WritesEmptySectionsKeywordsAndFiles) {
    const Built nothing;
    EXPECT_EQ(nothing.text(), "");

    const BuiltSection built;
    kvsAddKeyword(built.file(), "none");
    kvsAddSection(built.file(), "Inner");
    kvsEndSection(built.file());
    EXPECT_EQ(built.lines(), "none =\nsection Inner {\n}\n");
}

TEST_F(Writing, WritesTargetsBesideEachOther) {
    const Built built;

    kvsAddTarget(built.file(), "T");
    kvsEndSection(built.file());
    kvsAddTarget(built.file(), "U");
    kvsEndSection(built.file());

    EXPECT_EQ(built.text(), "target T {\n}\ntarget U {\n}\n");
}

TEST_F(Writing, ClosesWhatIsStillOpen) {
    const Built built;

    kvsAddTarget(built.file(), "T");
    kvsAddSection(built.file(), "S");
    kvsAddSection(built.file(), "Inner");
    kvsAddKeyword(built.file(), "a");
    kvsAddInt(built.file(), 1);

    EXPECT_EQ(built.text(), "target T {\n  section S {\n    section Inner {\n      a = 1\n    }\n  }\n}\n");
}

TEST_F(Writing, ATargetClosesTheOneBefore) {
    const Built built;

    kvsAddTarget(built.file(), "T");
    kvsAddSection(built.file(), "S");
    kvsAddTarget(built.file(), "U");

    EXPECT_EQ(built.text(), "target T {\n  section S {\n  }\n}\ntarget U {\n}\n");
}

// What has no place, added to a file in which it has none.
struct Misuse {
    const char* name;
    void (*add)(void* file);
    const char* told;
};

TEST_F(Writing, WhatHasNoPlaceMakesTheAppendFail) {
    constexpr Misuse rows[] = {
        {"a section outside a target", [](void* file) { kvsAddSection(file, "Lost"); }, "section 'Lost'"},
        {"a keyword outside a target", [](void* file) { kvsAddKeyword(file, "Lost"); }, "keyword 'Lost'"},
        {"a keyword outside a section",
         [](void* file) {
             kvsAddTarget(file, "T");
             kvsAddKeyword(file, "Lost");
         },
         "keyword 'Lost'"},
        {"a section behind the target",
         [](void* file) {
             kvsAddTarget(file, "T");
             kvsEndSection(file);
             kvsAddSection(file, "Lost");
         },
         "section 'Lost'"},
        {"an int without a keyword",
         [](void* file) {
             kvsAddTarget(file, "T");
             kvsAddSection(file, "S");
             kvsAddInt(file, 1);
         },
         "parameter"},
        {"a double behind a section's end",
         [](void* file) {
             kvsAddTarget(file, "T");
             kvsAddSection(file, "S");
             kvsAddKeyword(file, "a");
             kvsAddSection(file, "Inner");
             kvsEndSection(file);
             kvsAddDouble(file, 1);
         },
         "parameter"},
        {"a bool in an empty file", [](void* file) { kvsAddBool(file, true); }, "parameter"},
        {"a string behind a misplaced keyword",
         [](void* file) {
             kvsAddTarget(file, "T");
             kvsAddKeyword(file, "Lost");
             kvsAddString(file, "x");
         },
         "keyword 'Lost'"},
    };
    for (const Misuse& row : rows) {
        SCOPED_TRACE(row.name);
        const TempFolder folder;
        const Handle file(kvsCreate());
        row.add(file);

        EXPECT_EQ(kvsAppend(file, folder.file("f.ad31").c_str()), 0);

        EXPECT_THAT(errorText(), HasSubstr(row.told));
        EXPECT_NE(kvsGetErrorGlb(), 0);
        EXPECT_FALSE(folder.has("f.ad31"));
    }
}

TEST_F(Writing, TheFirstThatHasNoPlaceIsTold) {
    const Built built;
    kvsAddSection(built.file(), "First");
    kvsAddSection(built.file(), "Second");

    EXPECT_THAT(built.text(), AllOf(StartsWith("append failed: "), HasSubstr("First")));
}

TEST_F(Writing, AnEndTooManyIsNoFailure) {
    const Built built;
    kvsEndSection(built.file());
    kvsAddTarget(built.file(), "T");
    kvsEndSection(built.file());
    kvsEndSection(built.file());

    EXPECT_EQ(built.text(), "target T {\n}\n");
}

TEST_F(Writing, SixtyFourBracesMayStandInEachOther) {
    const Built built;
    kvsAddTarget(built.file(), "T");
    for (int brace = 2; brace <= 64; ++brace)
        kvsAddSection(built.file(), "s");

    EXPECT_FALSE(Loaded(built.text()).failed());
}

TEST_F(Writing, SixtyFiveBracesMayNot) {
    const Built built;
    kvsAddTarget(built.file(), "T");
    for (int brace = 2; brace <= 64; ++brace)
        kvsAddSection(built.file(), "s");
    kvsAddSection(built.file(), "Deep");

    EXPECT_THAT(built.text(), AllOf(StartsWith("append failed: "), HasSubstr("Deep")));
}

} // namespace
