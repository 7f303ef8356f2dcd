#include "platform/foundation/kept_file.h"

#include "platform/framework/platform_texts.h"

#include <cerrno>
#include <cstdio>
#include <memory>
#include <system_error>
#include <vector>

namespace kota {

namespace fs = std::filesystem;

namespace {

fs::path withoutLinks(const fs::path& file) {
    std::error_code failed;
    fs::path real = fs::canonical(file, failed);
    return failed ? file : real;
}

fs::path withMark(const fs::path& file) {
    return file.string() + "~";
}

bool isEmptyFile(const fs::path& file) {
    std::error_code failed;
    return fs::is_regular_file(file, failed) && fs::file_size(file, failed) == 0;
}

struct CloseFile {
    void operator()(std::FILE* file) const { std::fclose(file); }
};
using OpenFile = std::unique_ptr<std::FILE, CloseFile>;

// Copies content and permissions. Gives why it failed, or an empty text.
std::string copyFile(const fs::path& from, const fs::path& to) {
    const auto reason = [] { return std::generic_category().message(errno); };
    const OpenFile source(std::fopen(from.string().c_str(), "rb"));
    OpenFile copy(source ? std::fopen(to.string().c_str(), "wb") : nullptr);
    if (!copy)
        return reason();
    constexpr std::size_t pieceSize = std::size_t{1} << 20;
    std::vector<char> piece(pieceSize);
    std::setvbuf(copy.get(), nullptr, _IONBF, 0);
    while (const std::size_t length = std::fread(piece.data(), 1, piece.size(), source.get()))
        if (std::fwrite(piece.data(), 1, length, copy.get()) != length)
            return reason();
    if (std::ferror(source.get()) || std::fclose(copy.release()) != 0)
        return reason();
    std::error_code failed;
    fs::permissions(to, fs::status(from, failed).permissions(), failed);
    return {};
}

} // namespace

KeptFile::KeptFile(const fs::path& file)
    : file_(withoutLinks(file)), kept_(withMark(file_)), older_(withMark(kept_)) {
    std::error_code failed;
    if (!fs::exists(file_, failed)) {
        state_ = State::NoFile;
    } else if (fs::is_regular_file(file_, failed)) {
        size_ = fs::file_size(file_, failed);
        time_ = fs::last_write_time(file_, failed);
        if (size_ > 0)
            keep();
    }
}

KeptFile::~KeptFile() {
    std::error_code ignored;
    if (state_ == State::Kept)
        takeBack();
    else if (state_ == State::NoFile && isEmptyFile(withoutLinks(file_)))
        fs::remove(withoutLinks(file_), ignored);
}

fs::path KeptFile::keptName(const fs::path& file) {
    return withMark(withoutLinks(file));
}

void KeptFile::written() {
    std::error_code ignored;
    if (hasOlder_)
        fs::remove(older_, ignored);
    state_ = State::Written;
}

// A copy, not a renaming: the file stays in its place for whoever looks at it until it is written.
void KeptFile::keep() {
    std::error_code failed;
    const fs::file_status inTheWay = fs::status(kept_, failed);
    if (fs::exists(inTheWay) && !fs::is_regular_file(inTheWay)) {
        const CString problem = platformText(PlatformText::SomethingNotFile, kept_.c_str());
        error_ = problem.View();
        return;
    }
    const fs::path copy = kept_.string() + ".part";
    error_ = copyFile(file_, copy);
    if (error_.empty()) {
        fs::rename(kept_, older_, failed);
        hasOlder_ = !failed;
        fs::rename(copy, kept_, failed);
        error_ = failed ? failed.message() : "";
    }
    if (error_.empty()) {
        state_ = State::Kept;
        return;
    }
    fs::remove(copy, failed);
    if (hasOlder_)
        fs::rename(older_, kept_, failed);
}

void KeptFile::takeBack() {
    std::error_code ignored;
    if (!fs::exists(file_, ignored) || isEmptyFile(file_))
        fs::rename(kept_, file_, ignored);
    else if (isUntouched())
        fs::remove(kept_, ignored);
    else
        return; // somebody else's: NAME~ keeps the old content
    if (hasOlder_)
        fs::rename(older_, kept_, ignored);
}

bool KeptFile::isUntouched() const {
    std::error_code failed;
    return fs::file_size(file_, failed) == size_ && fs::last_write_time(file_, failed) == time_;
}

} // namespace kota
