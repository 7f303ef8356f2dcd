#include "tests/platform/kvs/kvs_files.h"

#include <gmock/gmock.h>

#include <unistd.h>

#include <cstdlib>
#include <iostream>
#include <random>

// Whatever is given as a file: it loads or it is told why not.
namespace {

using namespace kvs_test;

using testing::HasSubstr;
using testing::StartsWith;

class BadInput : public FileLibrary {
protected:
    // Loads and gives why it failed.
    static std::string failure(const char* path) {
        const Handle file(kvsLoadFile(path, 1));
        int line = -1;
        int column = -1;
        CString text;
        EXPECT_NE(kvsPeekErrorGlb(), 0);
        EXPECT_EQ(kvsGetSyntaxErr(file, &line, &column, &text), 1);
        EXPECT_EQ(kvsTargetByNameNum(file, "T", 1), nullptr);
        EXPECT_EQ(text, kvsPeekErrorTextGlb());
        EXPECT_EQ(line, 0);
        EXPECT_EQ(column, 0);
        return std::string(text.View());
    }
};

TEST_F(BadInput, AMissingFileIsToldWithItsPath) {
    const TempFolder folder;
    const std::string path = folder.file("missing.ad31");

    EXPECT_THAT(failure(path.c_str()), StartsWith(path + ": "));
}

TEST_F(BadInput, AFolderIsNoFile) {
    const TempFolder folder;
    const std::string path = folder.path().string();

    EXPECT_THAT(failure(path.c_str()), StartsWith(path + ": "));
}

TEST_F(BadInput, APathThroughAFileIsTold) {
    const TempFolder folder;
    const std::string path = folder.write("file", "") + "/f.ad31";

    EXPECT_THAT(failure(path.c_str()), StartsWith(path + ": "));
}

TEST_F(BadInput, ADeviceIsNoFile) {
    EXPECT_THAT(failure("/dev/zero"), StartsWith("/dev/zero: "));
}

TEST_F(BadInput, NoPathIsNoFile) {
    EXPECT_THAT(failure(nullptr), HasSubstr(": "));
    EXPECT_THAT(failure(""), HasSubstr(": "));
}

// As a user who may read nothing.
[[noreturn]] void loadWithoutRights(const std::string& path) {
    constexpr unsigned nobody = 65534;
    if (geteuid() == 0 && (setgid(nobody) != 0 || setuid(nobody) != 0))
        std::exit(2);
    const Handle file(kvsLoadFile(path.c_str(), 1));
    std::cerr << errorText();
    std::exit(kvsPeekErrorGlb() ? 0 : 1);
}

TEST_F(BadInput, AFileThatMayNotBeReadIsToldWithItsPath) {
    const TempFolder folder;
    const std::string path = folder.write("f.ad31", "target T {\n}\n");
    std::filesystem::permissions(path, std::filesystem::perms::none);

    EXPECT_EXIT(loadWithoutRights(path), testing::ExitedWithCode(0), "f.ad31: .*[Pp]ermission");
}

TEST_F(BadInput, AHundredMegabytesOfBracesAreAnError) {
    const Loaded loaded(std::string(100'000'000, '{'));

    EXPECT_TRUE(loaded.failed());
    EXPECT_THAT(loaded.message(), StartsWith(":1:1: expected 'target', found '{'"));
}

TEST_F(BadInput, RandomBytesAreAnError) {
    std::mt19937 random(20);
    for (int round = 0; round < 200; ++round) {
        std::string bytes(500, '\0');
        for (char& byte : bytes)
            byte = static_cast<char>(random());
        const Loaded loaded(bytes);
        EXPECT_TRUE(loaded.failed());
        EXPECT_THAT(loaded.message(), HasSubstr(": expected "));
    }
}

constexpr std::string_view everyPart = "\xEF\xBB\xBFtarget T {\r\n"
                                       "  section \"a section\" { # \xC3\xA5\n"
                                       "    i = -12, 3,\n"
                                       "        4\n"
                                       "    d = 1.5, 2e-3, .5, nan, -inf\n"
                                       "    b = true, false\n"
                                       "    s = \"\\\"\\x41\\\\\", \"\xE5\xB7\x9D\"\n"
                                       "    none =\n"
                                       "    section S { a.b = 1 }\n"
                                       "  }\n"
                                       "}\n"
                                       "target U {}";

TEST_F(BadInput, AFileCutOffAnywhereLoadsOrErrs) {
    int loads = 0;
    for (std::size_t length = 0; length <= everyPart.size(); ++length) {
        SCOPED_TRACE(length);
        const Loaded loaded{std::string(everyPart.substr(0, length))};
        const SyntaxError error = loaded.error();
        if (!loaded.failed()) {
            ++loads;
            EXPECT_EQ(error.text, "");
            continue;
        }
        EXPECT_EQ(loaded.target(), nullptr);
        EXPECT_GE(error.line, 1);
        EXPECT_GE(error.column, 1);
        EXPECT_THAT(loaded.message(), StartsWith(":" + std::to_string(error.line) + ":" +
                                                 std::to_string(error.column) + ": expected "));
    }
    // Before the first target, between the two, and behind the second: nowhere else is a file whole.
    const std::size_t secondTarget = everyPart.find("target U");
    EXPECT_EQ(loads, 2 + 2 + 1) << secondTarget;
}

TEST_F(BadInput, AFileWithAnyByteReplacedLoadsOrErrs) {
    const TempFolder folder;
    for (std::size_t at = 0; at < everyPart.size(); ++at) {
        for (const char byte : {'\0', '"', '\n', '}'}) {
            std::string text(everyPart);
            text[at] = byte;
            const Handle file(kvsLoadFile(folder.write("f.ad31", text).c_str(), 1));
            const bool failed = kvsGetErrorGlb() != 0;
            EXPECT_EQ(failed, kvsGetSyntaxErr(file, nullptr, nullptr, nullptr) != 0);
            EXPECT_EQ(failed, !kvsTargetByNameNum(file, "T", 1) && !kvsTargetByNameNum(file, "U", 1));
        }
    }
}

} // namespace
