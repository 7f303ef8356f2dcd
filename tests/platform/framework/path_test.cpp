#include "platform/framework/path.h"

#include <gtest/gtest.h>

namespace {

TEST(SplitPath, GivesTheParts) {
    const struct {
        const char* path;
        const char* directory;
        const char* fileName;
        const char* extension;
    } rows[] = {
        {"/rivers/missouri.ad31", "/rivers/", "missouri", ".ad31"}, //
        {"missouri.ad31", "", "missouri", ".ad31"},                 //
        {"/rivers.d/missouri", "/rivers.d/", "missouri", ""},       //
        {"/rivers/", "/rivers/", "", ""},                           //
        {"a.b.AD31", "", "a.b", ".AD31"},                           //
        {".ad31", "", "", ".ad31"},                                 //
        {"river.", "", "river", "."},                               //
        {"", "", "", ""},                                           //
        {nullptr, "", "", ""},
    };
    for (const auto& row : rows) {
        SCOPED_TRACE(row.path ? row.path : "null");
        const PathParts parts = SplitPath(row.path);
        EXPECT_EQ(parts.drive, "");
        EXPECT_EQ(parts.directory, row.directory);
        EXPECT_EQ(parts.fileName, row.fileName);
        EXPECT_EQ(parts.extension, row.extension);
    }
}

} // namespace
