#include "tests/platform/kvs/append_files.h"

#include <gmock/gmock.h>

#include <sys/resource.h>

#include <csignal>

// An append that fails says so, and leaves everything as it was.
namespace {

using namespace kvs_test;

using testing::ElementsAre;
using testing::IsEmpty;
using testing::StartsWith;

class FailedAppend : public AppendTest {};

// Files may grow to so many bytes, and no further, for as long as the object lives.
class FileSizeLimit {
public:
    explicit FileSizeLimit(rlim_t bytes) : handler_(std::signal(SIGXFSZ, SIG_IGN)) {
        getrlimit(RLIMIT_FSIZE, &before_);
        rlimit limit = before_;
        limit.rlim_cur = bytes;
        EXPECT_EQ(setrlimit(RLIMIT_FSIZE, &limit), 0);
    }
    ~FileSizeLimit() {
        setrlimit(RLIMIT_FSIZE, &before_);
        std::signal(SIGXFSZ, handler_);
    }
    FileSizeLimit(const FileSizeLimit&) = delete;
    FileSizeLimit& operator=(const FileSizeLimit&) = delete;

private:
    void (*handler_)(int);
    rlimit before_{};
};

TEST_F(FailedAppend, IsToldWhereAFolderIsInTheWay) {
    fs::create_directory(path());

    EXPECT_EQ(TargetFile("T").append(path()), 0);

    EXPECT_NE(kvsPeekErrorGlb(), 0);
    EXPECT_THAT(errorText(), StartsWith(path() + ": "));
    EXPECT_TRUE(fs::is_empty(path()));
    EXPECT_THAT(names(), ElementsAre("f.ad31"));
}

TEST_F(FailedAppend, IsToldWhereTheFolderIsMissing) {
    const std::string missing = folder.file("missing/f.ad31");

    EXPECT_EQ(TargetFile("T").append(missing), 0);

    EXPECT_THAT(errorText(), StartsWith(missing + ": "));
    EXPECT_THAT(names(), IsEmpty());
}

TEST_F(FailedAppend, IsToldWithoutAPath) {
    EXPECT_EQ(kvsAppend(TargetFile("T").file(), nullptr), 0);

    EXPECT_NE(kvsPeekErrorGlb(), 0);
    EXPECT_NE(errorText(), "");
}

TEST_F(FailedAppend, IsForgottenByTheNextAppendOrLoad) {
    const std::string missing = folder.file("missing/f.ad31");

    TargetFile("T").append(missing);
    ASSERT_NE(kvsPeekErrorGlb(), 0);
    TargetFile("T").append(path());
    EXPECT_EQ(kvsPeekErrorGlb(), 0);
    EXPECT_EQ(errorText(), "");

    TargetFile("T").append(missing);
    ASSERT_NE(kvsPeekErrorGlb(), 0);
    const Handle loaded(kvsLoadFile(path().c_str(), 1));
    EXPECT_EQ(kvsPeekErrorGlb(), 0);
}

TEST_F(FailedAppend, IsKeptUntilItIsTaken) {
    TargetFile("T").append(folder.file("missing/f.ad31"));

    EXPECT_NE(kvsPeekErrorGlb(), 0);
    EXPECT_NE(kvsPeekErrorGlb(), 0);
    EXPECT_NE(kvsGetErrorGlb(), 0);
    EXPECT_EQ(kvsPeekErrorGlb(), 0);
    EXPECT_EQ(errorText(), "");
}

TEST_F(FailedAppend, LeavesAFileAsItWas) {
    const std::string before(3000, '#');
    folder.write("f.ad31", before);
    const LargeFile large(3'000'000);
    {
        const FileSizeLimit limit(100'000);
        EXPECT_EQ(large.append(path()), 0);
    }

    EXPECT_THAT(errorText(), StartsWith(path() + ": "));
    EXPECT_EQ(folder.read("f.ad31"), before);
    EXPECT_THAT(names(), ElementsAre("f.ad31"));
}

TEST_F(FailedAppend, LeavesAnEmptyFileEmpty) {
    folder.write("f.ad31", "");
    const LargeFile large(3'000'000);
    {
        const FileSizeLimit limit(100'000);
        EXPECT_EQ(large.append(path()), 0);
    }

    EXPECT_EQ(folder.read("f.ad31"), "");
    EXPECT_THAT(names(), ElementsAre("f.ad31"));
}

TEST_F(FailedAppend, LeavesNoFileWhereNoneWas) {
    const LargeFile large(3'000'000);
    {
        const FileSizeLimit limit(100'000);
        EXPECT_EQ(large.append(path()), 0);
    }

    EXPECT_NE(kvsPeekErrorGlb(), 0);
    EXPECT_THAT(names(), IsEmpty());
}

} // namespace
