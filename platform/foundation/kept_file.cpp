#include "platform/foundation/kept_file.h"

#include <system_error>

namespace kota {

namespace fs = std::filesystem;

namespace {

fs::path withoutLinks(const fs::path& file) {
    std::error_code failed;
    fs::path real = fs::canonical(file, failed);
    return failed ? file : real;
}

} // namespace

KeptFile::KeptFile(const fs::path& file)
    : file_(withoutLinks(file)), kept_(keptName(file_)), older_(keptName(kept_)) {
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
    if (state_ == State::Kept) {
        if (changed())
            fs::rename(kept_, file_, ignored);
        else
            fs::remove(kept_, ignored);
        if (hasOlder_)
            fs::rename(older_, kept_, ignored);
    } else if (state_ == State::NoFile && fs::is_regular_file(file_, ignored)) {
        fs::remove(file_, ignored);
    }
}

fs::path KeptFile::keptName(const fs::path& file) {
    return file.string() + "~";
}

void KeptFile::written() {
    std::error_code ignored;
    if (hasOlder_)
        fs::remove(older_, ignored);
    state_ = State::Written;
}

// A copy, not a renaming: the file stays in its place for whoever looks at it until it is written.
void KeptFile::keep() {
    const fs::path copy = kept_.string() + ".part";
    std::error_code failed;
    fs::copy_file(file_, copy, fs::copy_options::overwrite_existing, failed);
    if (!failed) {
        std::error_code none;
        fs::rename(kept_, older_, none);
        hasOlder_ = !none;
        fs::rename(copy, kept_, failed);
    }
    if (!failed) {
        state_ = State::Kept;
        return;
    }
    error_ = failed.message();
    fs::remove(copy, failed);
    if (hasOlder_)
        fs::rename(older_, kept_, failed);
}

bool KeptFile::changed() const {
    std::error_code failed;
    return fs::file_size(file_, failed) != size_ || fs::last_write_time(file_, failed) != time_;
}

} // namespace kota
