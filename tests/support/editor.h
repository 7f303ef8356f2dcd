#pragma once

#include "document/kota0_ad_doc.h"
#include "platform/headless/session.h"
#include "platform/headless/user.h"

#include <gtest/gtest.h>

namespace kota::test {

// A shell that has loaded the plug-in, with a user who looks for what went against the script.
class Editor : public testing::Test {
protected:
    static constexpr std::intptr_t projectHandle = 4711;

    Editor() { session.load(KOTA_PLUG_IN); }

    // A new document, outside a project unless one is open.
    CKota0_adDoc& create() { return *static_cast<CKota0_adDoc*>(session.create()); }
    CKota0_adDoc& open(const std::string& path) { return *static_cast<CKota0_adDoc*>(session.open(path)); }
    void openProject() { session.mainWindow().openProject(projectHandle); }
    headless::MainWindow& shell() { return session.mainWindow(); }
    // The words of the boxes shown so far.
    std::vector<std::string> boxes() {
        std::vector<std::string> words;
        for (const auto& box : session.screen().boxes())
            words.emplace_back(box.text.View());
        return words;
    }

    headless::Session session{[](const std::string& text) { ADD_FAILURE() << text; }};
};

} // namespace kota::test
