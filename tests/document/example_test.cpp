#include "platform/headless/session.h"
#include "tests/support/owned.h"
#include "tests/support/temp_folder.h"

#include <gtest/gtest.h>

using namespace kota::test;

namespace {

const std::string example = KOTA_EXAMPLES "/missouri/missouri.AD31";

TEST(ExampleDocument, OpensWithoutABoxAndIsWrittenBackByteForByte) {
    kota::headless::Session session([](const std::string& text) { ADD_FAILURE() << text; });
    const TempFolder folder;
    OwnedDocument document;

    EXPECT_EQ(document.OnOpenDocument(example.c_str()), 1);
    document.WriteData(folder.file("written").c_str());

    EXPECT_EQ(session.screen().boxes().size(), 0U);
    EXPECT_GT(document.compList.GetCount(), 0);
    EXPECT_EQ(folder.read("written"), readFile(example));
}

TEST(ExampleDocument, LosesNothingWhenItIsSaved) {
    kota::headless::Session session([](const std::string& text) { ADD_FAILURE() << text; });
    const TempFolder folder;
    OwnedDocument document;
    document.OnOpenDocument(example.c_str());

    EXPECT_EQ(document.OnSaveDocument(folder.file("saved.ad31").c_str()), 1);

    EXPECT_EQ(session.screen().boxes().size(), 0U);
    EXPECT_EQ(folder.read("saved.AD31"), readFile(example));
}

} // namespace
