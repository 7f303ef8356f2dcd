#include "platform/framework/path.h"

namespace {

#if defined(_WIN32)
constexpr std::string_view separators = "/\\";
constexpr bool hasDrives = true;
#else
constexpr std::string_view separators = "/";
constexpr bool hasDrives = false;
#endif

} // namespace

PathParts SplitPath(const char* path) {
    std::string_view rest = path ? path : "";
    PathParts parts;
    if (hasDrives && rest.size() >= 2 && rest[1] == ':') {
        parts.drive = rest.substr(0, 2);
        rest.remove_prefix(2);
    }
    const auto nameStart = rest.find_last_of(separators) + 1; // npos + 1 is 0: no directory
    parts.directory = rest.substr(0, nameStart);
    rest.remove_prefix(nameStart);
    const auto dot = rest.rfind('.');
    parts.fileName = rest.substr(0, dot);
    if (dot != std::string_view::npos)
        parts.extension = rest.substr(dot);
    return parts;
}
