#pragma once

#include "platform/framework/message_box.h"
#include "platform/headless/session.h"
#include "tests/support/owned.h"
#include "tests/support/temp_folder.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <csignal>
#include <sys/resource.h>

namespace kota::test {

// A document, a folder to save it in, and a user.
class Saving : public testing::Test {
protected:
    BOOL save(const std::string& name) { return document.DoSave(folder.file(name).c_str()); }

    // The document with so many decay lines, whose text is the longer the more there are.
    void fillDecay(int lines, double decayConst = 0.5) {
        document.decayList.DeleteAll();
        for (int i = 0; i < lines; ++i)
            addLocal(document.decayList, 1, "MISSOURI", i).decayConst = decayConst;
    }

    // The check of the cohesive list refuses to save this.
    void makeCheckFail() {
        addLocal(document.globalList, 1, "R", 1.0);
        addLocal(document.globalList, 1, "R", 2.0);
    }

    // The text of the boxes shown since the last time.
    std::vector<std::string> toldNow() {
        const auto& boxes = session.screen().boxes();
        std::vector<std::string> texts;
        for (; seenBoxes < boxes.size(); ++seenBoxes)
            texts.emplace_back(boxes[seenBoxes].text.View());
        return texts;
    }

    std::vector<std::string> filesInFolder() const {
        std::vector<std::string> names;
        for (const auto& entry : std::filesystem::directory_iterator(folder.path()))
            names.push_back(entry.path().filename().string());
        std::ranges::sort(names);
        return names;
    }

    kota::headless::Session session{[](const std::string& text) { ADD_FAILURE() << text; }};
    TempFolder folder;
    OwnedDocument document;
    std::size_t seenBoxes = 0;
};

// For as long as it lives no file can grow beyond a size, as on a full disk.
class FileSizeLimit {
public:
    explicit FileSizeLimit(rlim_t bytes) : handlerBefore_(std::signal(SIGXFSZ, SIG_IGN)) {
        getrlimit(RLIMIT_FSIZE, &before_);
        const rlimit limit{bytes, before_.rlim_max};
        setrlimit(RLIMIT_FSIZE, &limit);
    }
    ~FileSizeLimit() {
        setrlimit(RLIMIT_FSIZE, &before_);
        std::signal(SIGXFSZ, handlerBefore_);
    }
    FileSizeLimit(const FileSizeLimit&) = delete;
    FileSizeLimit& operator=(const FileSizeLimit&) = delete;

private:
    rlimit before_{};
    void (*handlerBefore_)(int);
};

} // namespace kota::test
