#include "tests/platform/kvs/append_files.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <atomic>
#include <cstdint>
#include <thread>
#include <vector>

// How what was built gets into a file.
namespace {

using namespace kvs_test;

using testing::ElementsAre;

class Append : public AppendTest {};

TEST_F(Append, MakesAFileThatIsNotThere) {
    EXPECT_EQ(TargetFile("T").append(path()), 1);

    EXPECT_EQ(kvsPeekErrorGlb(), 0);
    EXPECT_EQ(folder.read("f.ad31"), "target T {\n}\n");
    EXPECT_THAT(names(), ElementsAre("f.ad31"));
}

TEST_F(Append, FillsAFileThatIsEmpty) {
    folder.write("f.ad31", "");

    EXPECT_EQ(TargetFile("T").append(path()), 1);

    EXPECT_EQ(folder.read("f.ad31"), "target T {\n}\n");
    EXPECT_THAT(names(), ElementsAre("f.ad31"));
}

TEST_F(Append, AddsToTheEndOfAFile) {
    folder.write("f.ad31", "# by hand\n");

    EXPECT_EQ(TargetFile("T").append(path()), 1);
    EXPECT_EQ(TargetFile("U").append(path()), 1);

    EXPECT_EQ(folder.read("f.ad31"), "# by hand\ntarget T {\n}\ntarget U {\n}\n");
    EXPECT_THAT(names(), ElementsAre("f.ad31"));
}

TEST_F(Append, BeginsALineOfItsOwn) {
    folder.write("f.ad31", "# a comment without a line's end");

    EXPECT_EQ(TargetFile("T").append(path()), 1);

    EXPECT_EQ(folder.read("f.ad31"), "# a comment without a line's end\ntarget T {\n}\n");
}

TEST_F(Append, OfTheSameFileTwiceGivesItsTextTwice) {
    const TargetFile target("T");

    target.append(path());
    target.append(path());

    EXPECT_EQ(folder.read("f.ad31"), "target T {\n}\ntarget T {\n}\n");
}

TEST_F(Append, WritesFarMoreThanOneBuffer) {
    constexpr std::size_t size = 5'000'000;

    EXPECT_EQ(LargeFile(size).append(path()), 1);

    const std::string text = folder.read("f.ad31");
    EXPECT_GT(text.size(), size);
    EXPECT_EQ(static_cast<std::size_t>(std::ranges::count(text, 'x')), size);
    EXPECT_FALSE(Loaded(text).failed());
}

TEST_F(Append, KeepsTheRightsOfTheFile) {
    folder.write("f.ad31", "");
    const fs::perms rights = fs::perms::owner_read | fs::perms::owner_write | fs::perms::group_read;
    fs::permissions(path(), rights);

    EXPECT_EQ(TargetFile("T").append(path()), 1);

    EXPECT_EQ(fs::status(path()).permissions(), rights);
}

TEST_F(Append, WritesThroughALink) {
    const std::string real = folder.write("real.ad31", "");
    fs::create_symlink(real, path());

    EXPECT_EQ(TargetFile("T").append(path()), 1);

    EXPECT_TRUE(fs::is_symlink(path()));
    EXPECT_EQ(folder.read("real.ad31"), "target T {\n}\n");
}

// Looks at a file's size again and again while something happens to it.
class Watch {
public:
    explicit Watch(fs::path path) : thread_([this, path = std::move(path)] { look(path); }) {
        while (looks_ == 0)
            std::this_thread::yield();
    }
    ~Watch() {
        if (thread_.joinable())
            seen();
    }
    Watch(const Watch&) = delete;
    Watch& operator=(const Watch&) = delete;

    // The sizes that were seen, each once; a missing file has size 0.
    const std::vector<std::uintmax_t>& seen() {
        stop_ = true;
        thread_.join();
        return sizes_;
    }

private:
    void look(const fs::path& path) {
        for (bool last = false; !last; ++looks_) {
            last = stop_;
            std::error_code missing;
            const std::uintmax_t size = fs::file_size(path, missing);
            const std::uintmax_t shown = missing ? 0 : size;
            if (std::ranges::find(sizes_, shown) == sizes_.end())
                sizes_.push_back(shown);
        }
    }

    std::atomic<bool> stop_ = false;
    std::atomic<int> looks_ = 0;
    std::vector<std::uintmax_t> sizes_;
    std::thread thread_;
};

TEST_F(Append, ToAnEmptyFileNeverShowsAPart) {
    folder.write("f.ad31", "");
    const LargeFile large(30'000'000);
    Watch watch(path());

    EXPECT_EQ(large.append(path()), 1);

    EXPECT_THAT(watch.seen(), ElementsAre(0u, fs::file_size(path())));
}

TEST_F(Append, ToAMissingFileNeverShowsAPart) {
    const LargeFile large(30'000'000);
    Watch watch(path());

    EXPECT_EQ(large.append(path()), 1);

    EXPECT_THAT(watch.seen(), ElementsAre(0u, fs::file_size(path())));
}

} // namespace
