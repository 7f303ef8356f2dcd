#pragma once

#include "document/lists/gen_list.h"
#include "platform/kvs/kvs.h"
#include "tests/support/temp_folder.h"

#include <stdexcept>
#include <string>
#include <string_view>

namespace kota::test {

// The text that `save(file)` adds to an open target, behind a first line break: the target's own two lines
// are left out.
template <class Save>
std::string savedTextOf(const Save& save) {
    const TempFolder folder;
    const std::string path = folder.file("saved");
    void* file = kvsCreate();
    kvsAddTarget(file, "T");
    save(file);
    kvsAppend(file, path.c_str());
    kvsClose(&file);
    constexpr std::string_view opening = "target T {";
    constexpr std::string_view closing = "}\n";
    const std::string text = readFile(path);
    if (!text.starts_with(opening) || !text.ends_with(closing))
        return text;
    return text.substr(opening.size(), text.size() - opening.size() - closing.size());
}

// The same for what a list saves.
inline std::string savedText(CGenList& list) {
    return savedTextOf([&](void* file) { list.Save(file); });
}

// A target that holds the given text, parsed. A text that cannot be parsed is a std::runtime_error.
class ParsedTarget {
public:
    explicit ParsedTarget(const std::string& content) {
        const TempFolder folder;
        const std::string path = folder.write("parsed", "target T {\n" + content + "\n}\n");
        file_ = kvsLoadFile(path.c_str(), 1);
        if (kvsGetErrorGlb() == 0)
            return;
        CString error;
        kvsGetSyntaxErr(file_, nullptr, nullptr, &error);
        kvsClose(&file_);
        throw std::runtime_error(std::string(error.View()));
    }

    ~ParsedTarget() { kvsClose(&file_); }

    ParsedTarget(const ParsedTarget&) = delete;
    ParsedTarget& operator=(const ParsedTarget&) = delete;

    void* handle() const { return kvsTargetByNameNum(file_, "T", 1); }
    void* section(const char* name) const { return kvsSectionByNameNum(handle(), name, 1); }

private:
    void* file_ = nullptr;
};

// Loads a list from a target that holds the given text.
inline void loadText(CGenList& list, const std::string& content) {
    const ParsedTarget target(content);
    list.Load(target.handle());
}

} // namespace kota::test
