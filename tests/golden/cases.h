#pragma once

#include <algorithm>
#include <filesystem>
#include <set>
#include <string>
#include <string_view>
#include <vector>

// A folder of golden cases: NAME.ad31, and beside it the partner NAME + `suffix` that holds what is expected.
// The cases are found, not listed: a new case is two new files.
namespace golden {

namespace fs = std::filesystem;

inline constexpr std::string_view caseExtension = ".ad31";

struct Case {
    std::string name;
    fs::path file;
    fs::path expected;
};

struct Folder {
    std::vector<Case> cases; // by name
    std::vector<std::string> problems;
};

inline Folder discover(const fs::path& path, const std::string& suffix) {
    std::set<std::string> files;
    for (const auto& entry : fs::directory_iterator(path))
        if (const std::string name = entry.path().filename().string(); !name.starts_with('.'))
            files.insert(name);

    Folder folder;
    while (!files.empty()) {
        const std::string file = files.extract(files.begin()).value();
        const bool isCase = file.ends_with(caseExtension);
        const std::string_view ending = isCase ? caseExtension : std::string_view(suffix);
        if (!file.ends_with(ending)) {
            folder.problems.push_back(file + " is neither a case nor a case's partner");
            continue;
        }
        const std::string name = file.substr(0, file.size() - ending.size());
        const std::string partner = isCase ? name + suffix : name + std::string(caseExtension);
        if (files.erase(partner) == 0)
            folder.problems.push_back(file + " has no partner " + partner);
        else
            folder.cases.push_back(
                {name, path / (name + std::string(caseExtension)), path / (name + suffix)});
    }
    std::ranges::sort(folder.cases, {}, &Case::name);
    if (folder.cases.empty())
        folder.problems.push_back(path.string() + " holds no case");
    return folder;
}

} // namespace golden
