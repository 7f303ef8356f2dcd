#include "document/kota0_ad_doc.h"
#include "document/records/cohesive.h"
#include "platform/framework/message_box.h"
#include "platform/framework/screen.h"

#include <unistd.h>

#include <cstdint>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <string_view>

// Any bytes: what loads as a document is written, read and written again, and the second file is the first.

namespace {

namespace fs = std::filesystem;

// Counts the boxes and closes each with its button.
class SilentScreen : public kota::Screen {
public:
    SilentScreen() { kota::attachScreen(this); }
    ~SilentScreen() override { kota::attachScreen(nullptr); }

    int showMessageBox(const kota::MessageBoxRequest& /*request*/) override {
        ++boxes;
        return IDOK;
    }
    std::optional<CString> askSaveName(const CString& /*proposal*/) override { return std::nullopt; }
    void showDialog(CDialog& /*dialog*/) override { std::abort(); } // no file may open one

    int boxes = 0;
};

// A file of this process, in memory where the system has such a folder.
class ScratchFile {
public:
    explicit ScratchFile(const std::string& name) {
        const fs::path memory = "/dev/shm";
        const fs::path folder = fs::is_directory(memory) ? memory : fs::temp_directory_path();
        path_ = folder / ("fuzz_round_trip-" + std::to_string(getpid()) + "-" + name);
    }
    ~ScratchFile() {
        std::error_code ignored;
        fs::remove(path_, ignored);
    }
    ScratchFile(const ScratchFile&) = delete;
    ScratchFile& operator=(const ScratchFile&) = delete;

    const char* path() const { return path_.c_str(); }

    void write(std::string_view bytes) const {
        std::ofstream stream(path_, std::ios::binary);
        stream.write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
    }
    std::string read() const {
        std::ifstream stream(path_, std::ios::binary);
        return {std::istreambuf_iterator<char>(stream), {}};
    }

private:
    fs::path path_;
};

struct Document : CKota0_adDoc {
    ~Document() override { DeleteContents(); }
};

// A record of component -1 is written as an empty section, which reads as a record of zeros: the one case
// in which a file is not the file of what it reads as.
void keepAllCohesiveRecords(CGlobalList& list) {
    for (POSITION position = list.GetHeadPosition(); position;) {
        AD_Global_Const* record = list.NextRecord(position);
        if (record->componentNum == -1)
            record->componentNum = 0;
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static const ScratchFile input("input.ad31");
    static const ScratchFile first("first.AD31");
    static const ScratchFile second("second.AD31");
    SilentScreen screen;
    input.write({reinterpret_cast<const char*>(data), size});

    Document document;
    document.ReadData(input.path());
    if (screen.boxes > 1)
        std::abort();
    if (screen.boxes == 1)
        return 0;
    keepAllCohesiveRecords(document.globalList);
    document.WriteData(first.path());

    Document again;
    again.ReadData(first.path());
    again.WriteData(second.path());
    if (screen.boxes != 0 || first.read() != second.read())
        std::abort();
    return 0;
}
