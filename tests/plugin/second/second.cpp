#include "platform/foundation/frames.h"
#include "platform/framework/document.h"
#include "platform/framework/extension.h"
#include "platform/framework/messages.h"
#include "platform/framework/template.h"
#include "platform/language/language.h"
#include "tests/plugin/second/ids.h"

#include <memory>
#include <string>
#include <vector>

#ifndef VERSIONS_AHEAD
#define VERSIONS_AHEAD 0
#endif
int kota::plugInAbiVersion() {
    return abiVersion + VERSIONS_AHEAD;
}

// A plug-in that does next to nothing, with the numbers and the class names of the first one.
namespace {

constinit AFX_EXTENSION_MODULE record;

constexpr kota::StringResource strings[] = {
    {Second::Document,
     "Second.chm\nSecond\nNew second\nSeconds (*.second)\n.second\nSecond.Document\nA second"},
    {Second::EditorName, "Plain name"},
    {Second::ToolBarName, "Plain tools"},
    {Second::Command, "Plain prompt.\nPlain tip"},
    {Second::OwnCommand, "Plain prompt of its own."},
};

constexpr kota::MenuItemTemplate files[] = {{ID_FILE_CLOSE, "&Close"}};
constexpr kota::MenuItemTemplate items[] = {{Second::Command, "&Plain command"}};
constexpr kota::MenuPopupTemplate popups[] = {{"&File", files}, {"&Plain", items}};
constexpr kota::MenuTemplate menus[] = {{.id = Second::Document, .popups = popups}};

constexpr kota::Accelerator keys[] = {
    {.key = VK_F6, .command = Second::Command},
    {.key = 'S', .command = Second::Command, .control = true},
};
constexpr kota::AcceleratorTable tables[] = {{.id = Second::Keys, .keys = keys}};

constexpr UINT commands[] = {Second::Command, Second::OwnCommand};
constexpr kota::ToolBarTemplate bars[] = {
    {.id = Second::Document, .buttonWidth = 16, .buttonHeight = 15, .commands = commands}};

const kota::Module& secondModule() {
    static const kota::Module module(
        "second", {.strings = strings, .menus = menus, .accelerators = tables, .toolBars = bars}, &record);
    return module;
}

int commandsRun = 0;
std::vector<std::string> calls; // of the exports that a shell makes its templates and tool bars by

class CKota0_adDoc : public CDocument {
    DECLARE_DYNCREATE(CKota0_adDoc)
public:
    BOOL OnOpenDocument(const char* /*path*/) override { return TRUE; }
    BOOL OnSaveDocument(const char* /*path*/) override { return TRUE; }
    BOOL DoSave(const char* /*path*/) override { return TRUE; }
};
IMPLEMENT_DYNCREATE(CKota0_adDoc, CDocument, secondModule)

class CDlgFrame : public CKhMDIChildWnd {
    DECLARE_DYNCREATE(CDlgFrame)
};
IMPLEMENT_DYNCREATE(CDlgFrame, CKhMDIChildWnd, secondModule)

class CKota0_adView : public CView {
    DECLARE_DYNCREATE(CKota0_adView)
public:
    BOOL OnCmdMsg(UINT id, int notification) override {
        static constexpr auto map =
            kota::commandMap<CKota0_adView>({{Second::Command, 0, &CKota0_adView::OnCommand}});
        return kota::runCommand(*this, map, id, notification) || CView::OnCmdMsg(id, notification);
    }

private:
    void OnCommand() { ++commandsRun; }
};
IMPLEMENT_DYNCREATE(CKota0_adView, CView, secondModule)

class Attachment {
public:
    Attachment() {
        AfxInitExtensionModule(record, kota::libraryAt(&record));
        language_ = KhLangLoadResDll("Second", &record.resources, 0);
        new CDynLinkLibrary(record); // the framework's
    }
    ~Attachment() { FreeLibrary(language_); }
    Attachment(const Attachment&) = delete;
    Attachment& operator=(const Attachment&) = delete;

private:
    HINSTANCE language_ = nullptr;
};
const Attachment attachment;

} // namespace

extern "C" {

KOTA_EXPORT int KhGetNumDocTemplates() {
    calls.emplace_back("count of templates");
    return 1;
}
KOTA_EXPORT CMultiDocTemplate* KhGetDocTemplatePtr(int index) {
    calls.push_back("template " + std::to_string(index));
    return index == 0 ? new CMultiDocTemplate(Second::Document, RUNTIME_CLASS(CKota0_adDoc),
                                              RUNTIME_CLASS(CDlgFrame), RUNTIME_CLASS(CKota0_adView))
                      : nullptr;
}
KOTA_EXPORT int KhGetNumToolbars() {
    calls.emplace_back("count of tool bars");
    return 1;
}
KOTA_EXPORT CKhToolBarEx* KhCreateToolbar(CKhMDIFrameWnd* frame, unsigned style, unsigned id, int index) {
    calls.push_back("tool bar " + std::to_string(index));
    auto bar = std::make_unique<CKhToolBarEx>();
    if (!bar->Create(frame, style, id) || !bar->LoadToolBar(secondModule(), Second::Document))
        return nullptr;
    frame->DockControlBar(bar.get(), 0);
    return bar.release();
}
KOTA_EXPORT int KhInitToolbar(CKhToolBarEx*, CKhMDIFrameWnd*, unsigned, unsigned, unsigned) {
    return 0;
}
KOTA_EXPORT unsigned KhGetBitmapId() {
    return 0;
}
KOTA_EXPORT int KhGetEditorString(CString* out) {
    *out = secondModule().string(Second::EditorName);
    return 1;
}
KOTA_EXPORT int KhGetToolbarString(CString* out, int /*index*/) {
    *out = secondModule().string(Second::ToolBarName);
    return 1;
}

// For tests.
KOTA_EXPORT AFX_EXTENSION_MODULE* SecondRecord() {
    return &record;
}
KOTA_EXPORT int SecondCommandsRun() {
    return commandsRun;
}
KOTA_EXPORT std::vector<std::string>& SecondCalls() {
    return calls;
}
}
