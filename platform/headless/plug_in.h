#pragma once

#include <memory>
#include <string>
#include <vector>

class CDocTemplate;

namespace kota::headless {

// A plug-in as a shell loads it: by its file, through its exports. It stays loaded to the end of the program,
// since objects of it may live as long.
class PlugIn {
public:
    // An empty `path` looks the exports up in the program itself. Throws std::runtime_error, with the reason,
    // when the library or one of its exports is not there.
    explicit PlugIn(const std::string& path);

    // The templates that the plug-in offers, each new.
    std::vector<std::unique_ptr<CDocTemplate>> makeTemplates() const;

private:
    void* symbol(const char* name) const;

    std::string path_;
    void* library_ = nullptr;
};

} // namespace kota::headless
