#pragma once

#include "platform/framework/export.h"

#include <cstdint>
#include <filesystem>
#include <string>

namespace kota {

// Keeps what a file holds while the file is written anew: NAME~ beside NAME holds the old content from the
// construction on, and afterwards as the version before.
//
// The old content is whole in the file, or in NAME~, at every moment, also when the program is ended in the
// middle. Unless `written` is called, the destructor puts file and NAME~ back as they were.
//
// A file that is empty or not there has nothing to keep: what an earlier, interrupted save left in NAME~
// stays.
class KOTA_API KeptFile {
public:
    explicit KeptFile(const std::filesystem::path& file);
    ~KeptFile();
    KeptFile(const KeptFile&) = delete;
    KeptFile& operator=(const KeptFile&) = delete;

    // Why the old content could not be kept; empty when all is well. The file must not be written otherwise.
    const std::string& error() const { return error_; }
    // The file was written: the old content stays in NAME~.
    void written();

    // NAME~ of a file.
    static std::filesystem::path keptName(const std::filesystem::path& file);

private:
    void keep();
    void takeBack();
    bool isUntouched() const;

    std::filesystem::path file_;  // without links
    std::filesystem::path kept_;  // NAME~
    std::filesystem::path older_; // NAME~~: what NAME~ held before, for as long as the save lasts
    std::uintmax_t size_ = 0;
    std::filesystem::file_time_type time_;
    enum class State { Nothing, NoFile, Kept, Written } state_ = State::Nothing;
    bool hasOlder_ = false;
    std::string error_;
};

} // namespace kota
