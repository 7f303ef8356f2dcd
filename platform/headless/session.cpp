#include "platform/headless/session.h"

#include "platform/foundation/plug_in.h"
#include "platform/framework/document.h"
#include "platform/framework/template.h"
#include "platform/framework/turn.h"
#include "platform/language/language.h"

#include <cstdio>
#include <cstdlib>
#include <filesystem>

namespace kota::headless {

Session::Session(std::function<void(const std::string&)> fail) : fail_(std::move(fail)), screen_(fail_) {
    loadPlatformTexts();
    mainWindow_.Create({.parent = nullptr, .kind = WindowKind::Frame});
    application_.SetMainWnd(&mainWindow_);
    screenBefore_ = attachScreen(&screen_);
}

Session::~Session() {
    closeMainWindow();
    attachScreen(screenBefore_);
    if (screen_.hasUnusedAnswers())
        fail_("the script has answers that nothing asked for");
}

void Session::load(const std::string& path) {
    addLanguageFolder((std::filesystem::path(path).parent_path() / "languages").c_str());
    const PlugIn plugIn(path);
    for (auto& docTemplate : plugIn.makeTemplates())
        application_.AddDocTemplate(std::move(docTemplate));
    for (int index = 0; index < plugIn.toolBarCount(); ++index)
        if (auto toolBar =
                plugIn.makeToolBar(mainWindow_, 0, firstToolBar + static_cast<UINT>(toolBars_.size()), index))
            toolBars_.push_back(std::move(toolBar));
}

CDocument* Session::open(const std::string& path) {
    const Turn turn;
    return application_.OpenDocumentFile(path.c_str());
}

CDocument* Session::create() {
    const Turn turn;
    const auto& templates = application_.Templates();
    return templates.empty() ? nullptr : templates.front()->OpenDocumentFile(nullptr);
}

bool Session::save(CDocument& document) {
    return saveAs(document, std::string(document.GetPathName().View()));
}

bool Session::saveAs(CDocument& document, const std::string& path) {
    const Turn turn;
    return document.DoSave(path.c_str()) != 0;
}

void Session::closeMainWindow() {
    const Turn turn;
    mainWindow_.DestroyWindow();
}

void Session::abortWith(const std::string& text) {
    std::fprintf(stderr, "headless session: %s\n", text.c_str());
    std::abort();
}

} // namespace kota::headless
