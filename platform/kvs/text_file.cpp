#include "platform/kvs/text_file.h"

#include "platform/framework/platform_texts.h"

#include <cerrno>
#include <cstdio>
#include <filesystem>
#include <system_error>
#include <vector>

namespace kota::kvs {

namespace {

namespace fs = std::filesystem;

constexpr std::uintmax_t largestFile = 0xFFFFFFFF;

struct CloseFile {
    void operator()(std::FILE* file) const { std::fclose(file); }
};
using OpenFile = std::unique_ptr<std::FILE, CloseFile>;

std::string reasonFor(const fs::path& path, const std::string& reason) {
    return path.string() + ": " + reason;
}

std::string reasonFor(const fs::path& path, PlatformText reason) {
    return reasonFor(path, std::string(platformText(reason).View()));
}

std::string reasonFor(const fs::path& path, int error) {
    return reasonFor(path, std::generic_category().message(error));
}

// Writes into a file opened by `mode` and closes it. Gives 0 or the error's number.
int writeFile(const fs::path& path, const char* mode, std::span<const std::string_view> pieces) {
    OpenFile file(std::fopen(path.string().c_str(), mode));
    if (!file)
        return errno;
    std::setvbuf(file.get(), nullptr, _IONBF, 0);
    for (const std::string_view piece : pieces)
        if (std::fwrite(piece.data(), 1, piece.size(), file.get()) != piece.size())
            return errno;
    return std::fclose(file.release()) == 0 ? 0 : errno;
}

bool endsWithLineFeed(const fs::path& path) {
    const OpenFile file(std::fopen(path.string().c_str(), "rb"));
    return file && std::fseek(file.get(), -1, SEEK_END) == 0 && std::fgetc(file.get()) == '\n';
}

// Writes a new file beside `path` and puts it in its place when it is whole. False when there can be no file
// beside it.
bool replaceWhole(const fs::path& path, std::span<const std::string_view> pieces, std::string& error) {
    std::error_code failed;
    const fs::path target = fs::exists(path, failed) ? fs::canonical(path, failed) : path;
    const fs::path part = target.string() + ".part";
    if (OpenFile(std::fopen(part.string().c_str(), "wb")) == nullptr)
        return false;
    if (const int number = writeFile(part, "wb", pieces); number != 0) {
        error = reasonFor(path, number);
    } else {
        if (fs::exists(target, failed))
            fs::permissions(part, fs::status(target).permissions(), failed);
        fs::rename(part, target, failed);
        if (failed)
            error = reasonFor(path, failed.message());
    }
    if (!error.empty())
        fs::remove(part, failed);
    return true;
}

} // namespace

std::string InputFile::open(const char* path) {
    path_ = path;
    std::error_code failed;
    const fs::file_status status = fs::status(path, failed);
    if (fs::exists(status) && !fs::is_regular_file(status))
        return reasonFor(path, PlatformText::NotAFile);
    file_.reset(std::fopen(path, "rb"));
    if (!file_)
        return reasonFor(path, errno);
    const std::uintmax_t size = fs::file_size(path, failed);
    if (failed)
        return reasonFor(path, failed.message());
    if (size > largestFile)
        return reasonFor(path, PlatformText::TooLarge);
    size_ = size;
    std::setvbuf(file_.get(), nullptr, _IONBF, 0);
    return {};
}

std::size_t InputFile::read(char* to, std::size_t room) {
    const std::size_t length = std::fread(to, 1, room, file_.get());
    if (length < room && std::ferror(file_.get()))
        error_ = errno;
    return length;
}

std::string InputFile::error() const {
    return error_ == 0 ? std::string() : reasonFor(path_, error_);
}

std::string appendText(const char* path, std::span<const std::string_view> pieces) {
    std::error_code failed;
    const bool exists = fs::exists(path, failed);
    const bool regular = fs::is_regular_file(path, failed);
    const std::uintmax_t oldSize = regular ? fs::file_size(path, failed) : 0;

    std::string error;
    if ((!exists || (regular && oldSize == 0)) && replaceWhole(path, pieces, error))
        return error;
    std::vector<std::string_view> lines(pieces.begin(), pieces.end());
    if (oldSize > 0 && !endsWithLineFeed(path))
        lines.insert(lines.begin(), "\n");
    const int number = writeFile(path, "ab", lines);
    if (number == 0)
        return {};
    if (regular)
        fs::resize_file(path, oldSize, failed);
    return reasonFor(path, number);
}

} // namespace kota::kvs
