#pragma once

#include <cstdint>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <random>
#include <stdexcept>
#include <string>

namespace kota::test {

// A whole file, byte for byte. A file that cannot be opened is a std::runtime_error.
inline std::string readFile(const std::string& path) {
    std::ifstream file(path, std::ios::binary);
    if (!file)
        throw std::runtime_error("cannot read " + path);
    return {std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
}

// Writes a whole file, byte for byte, in place of what stood there.
inline void writeFile(const std::string& path, const std::string& content) {
    std::ofstream file(path, std::ios::binary | std::ios::trunc);
    file << content;
    file.close();
    if (!file)
        throw std::runtime_error("cannot write " + path);
}

// A fresh, empty folder, which goes with everything in it when the object goes.
class TempFolder {
public:
    TempFolder() {
        std::random_device random;
        do {
            const std::uint64_t number = (std::uint64_t{random()} << 32) | random();
            folder_ = std::filesystem::temp_directory_path() / ("kota_test_" + std::to_string(number));
        } while (!std::filesystem::create_directory(folder_));
    }

    ~TempFolder() {
        std::error_code ignored;
        std::filesystem::remove_all(folder_, ignored);
    }

    TempFolder(const TempFolder&) = delete;
    TempFolder& operator=(const TempFolder&) = delete;

    const std::filesystem::path& path() const { return folder_; }

    // The path of a file in the folder, whether or not it exists.
    std::string file(const std::string& name) const { return (folder_ / name).string(); }

    bool has(const std::string& name) const { return std::filesystem::exists(folder_ / name); }

    // Reads the file of that name.
    std::string read(const std::string& name) const { return readFile(file(name)); }

    // Writes the file of that name and gives its path.
    std::string write(const std::string& name, const std::string& content) const {
        writeFile(file(name), content);
        return file(name);
    }

private:
    std::filesystem::path folder_;
};

} // namespace kota::test
