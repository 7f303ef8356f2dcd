#pragma once

#include "tests/platform/kvs/kvs_files.h"

#include <filesystem>
#include <string>
#include <vector>

// What the tests of appending share.
namespace kvs_test {

namespace fs = std::filesystem;

// A folder, and the path of a file in it that is appended to.
class AppendTest : public FileLibrary {
protected:
    std::string path() const { return folder.file("f.ad31"); }

    std::vector<std::string> names() const {
        std::vector<std::string> names;
        for (const auto& entry : fs::directory_iterator(folder.path()))
            names.push_back(entry.path().filename().string());
        return names;
    }

    TempFolder folder;
};

// A file of one target of that name.
class TargetFile : public Built {
public:
    explicit TargetFile(const char* name) { kvsAddTarget(file(), name); }

    int append(const std::string& path) const { return kvsAppend(file(), path.c_str()); }
};

// A file of about `bytes` bytes.
class LargeFile : public BuiltSection {
public:
    explicit LargeFile(std::size_t bytes) {
        const std::string line(1000, 'x');
        for (std::size_t written = 0; written < bytes; written += line.size()) {
            kvsAddKeyword(file(), "k");
            kvsAddString(file(), line);
        }
    }

    int append(const std::string& path) const { return kvsAppend(file(), path.c_str()); }
};

} // namespace kvs_test
