#include "document/kota0_ad_doc.h"
#include "platform/framework/message_box.h"
#include "platform/headless/session.h"
#include "tests/golden/cases.h"
#include "tests/support/temp_folder.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using kota::test::readFile;
using testing::IsEmpty;

const golden::fs::path data = KOTA_TEST_DATA;

golden::Folder goodFiles() {
    return golden::discover(data / "good", ".becomes.AD31");
}
golden::Folder brokenFiles() {
    return golden::discover(data / "broken", ".message.txt");
}

struct Document : CKota0_adDoc {
    ~Document() override { DeleteContents(); }
};

void failTest(const std::string& text) {
    ADD_FAILURE() << text;
}

std::string written(CKota0_adDoc& document) {
    const kota::test::TempFolder folder;
    document.WriteData(folder.file("written.AD31").c_str());
    return folder.read("written.AD31");
}

std::string writtenAnew(const golden::fs::path& file) {
    Document document;
    document.ReadData(file.c_str());
    return written(document);
}

TEST(GoldenFiles, EveryFileHasItsPartner) {
    EXPECT_THAT(goodFiles().problems, IsEmpty());
    EXPECT_THAT(brokenFiles().problems, IsEmpty());
}

TEST(GoldenFiles, EveryGoodFileBecomesWhatStandsBesideIt) {
    const kota::headless::Session session(failTest);
    for (const golden::Case& good : goodFiles().cases) {
        SCOPED_TRACE(good.name);
        EXPECT_EQ(writtenAnew(good.file), readFile(good.expected));
    }
}

TEST(GoldenFiles, WhatAFileBecameStaysAsItIs) {
    const kota::headless::Session session(failTest);
    for (const golden::Case& good : goodFiles().cases) {
        // A cohesive record of component -1 is written empty, and read again it is a record of zeros.
        if (good.name == "component_minus_1")
            continue;
        SCOPED_TRACE(good.name);
        EXPECT_EQ(writtenAnew(good.expected), readFile(good.expected));
    }
}

TEST(GoldenFiles, EveryBrokenFileIsToldInOneBox) {
    for (const golden::Case& broken : brokenFiles().cases) {
        SCOPED_TRACE(broken.name);
        kota::headless::Session session(failTest);
        session.screen().answerBox(IDOK);
        Document document;

        document.ReadData(broken.file.c_str());

        ASSERT_EQ(session.screen().boxes().size(), 1u);
        const kota::MessageBoxRequest& box = session.screen().boxes().front();
        EXPECT_EQ(std::string(box.text.View()) + "\n", broken.file.string() + readFile(broken.expected));
        EXPECT_EQ(box.owner, nullptr);
        EXPECT_FALSE(box.caption.has_value());
        EXPECT_EQ(box.type, MB_OK);
    }
}

TEST(GoldenFiles, ABrokenFileLeavesTheDocumentAtItsDefaults) {
    Document untouched;
    const std::string defaults = written(untouched);
    for (const golden::Case& broken : brokenFiles().cases) {
        SCOPED_TRACE(broken.name);
        kota::headless::Session session(failTest);
        session.screen().answerBox(IDOK);
        EXPECT_EQ(writtenAnew(broken.file), defaults);
    }
}

} // namespace
