#include "module.h"

#include "platform/foundation/frames.h"
#include "platform/framework/template.h"
#include "platform/language/language.h"
#include "temperature_doc.h"
#include "temperature_view.h"

// --- Resources ---

namespace {

using kota::control;
using kota::DialogItem;
using kota::field;
using kota::group;
using kota::row;
using kota::WindowKind;

constexpr kota::StringResource strings[] = {
    {Id::DocTemplate, "\n" // no window title
                      "Water\n"
                      "Water Temperature\n"
                      "Water Temperatures (*.wtemp)\n"
                      ".wtemp\n"
                      "Water.Document\n"
                      "Water Temperature"},
    {Id::EditorName, "Water Temperature"},
};

constexpr DialogItem values[] = {field("AD document", Id::AdName), field("Component", Id::Component),
                                 field("Water temperature (degrees Celsius)", Id::Temperature)};
constexpr DialogItem decay[] = {control(WindowKind::Label, Id::Decay), control(WindowKind::Label, Id::Place)};
constexpr DialogItem buttons[] = {control(WindowKind::PushButton, Id::OpenAdDocument, "&Open AD document"),
                                  control(WindowKind::PushButton, Id::Correct, "&Correct decay"),
                                  control(WindowKind::PushButton, Id::SaveBoth, "&Save both")};
constexpr DialogItem form[] = {group("Temperature", values), group("Decay", decay), row(buttons)};
constexpr kota::DialogTemplate dialogs[] = {{.id = Id::Form, .items = form}};

constinit AFX_EXTENSION_MODULE record;

} // namespace

const kota::Module& temperatureModule() {
    static const kota::Module module("Water_temperature", {.strings = strings, .dialogs = dialogs}, &record);
    return module;
}

// --- Attach and detach ---

int kota::plugInAbiVersion() {
    return abiVersion;
}

namespace {

class Attachment {
public:
    Attachment() {
        AfxInitExtensionModule(record, kota::libraryAt(&record));
        language_ = KhLangLoadResDll("Water_temperature", &record.resources, 0);
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

// --- What a shell asks for: one template, no tool bar ---

extern "C" {

KOTA_EXPORT int KhGetNumDocTemplates() {
    return 1;
}
KOTA_EXPORT CMultiDocTemplate* KhGetDocTemplatePtr(int index) {
    if (index != 0)
        return nullptr;
    return new CMultiDocTemplate(Id::DocTemplate, RUNTIME_CLASS(CTemperatureDoc),
                                 RUNTIME_CLASS(CKhMDIChildWnd), RUNTIME_CLASS(CTemperatureView));
}
KOTA_EXPORT int KhGetNumToolbars() {
    return 0;
}
KOTA_EXPORT CKhToolBarEx* KhCreateToolbar(CKhMDIFrameWnd*, unsigned, unsigned, int) {
    return nullptr;
}
KOTA_EXPORT int KhInitToolbar(CKhToolBarEx*, CKhMDIFrameWnd*, unsigned, unsigned, unsigned) {
    return 0;
}
KOTA_EXPORT unsigned KhGetBitmapId() {
    return 0; // none
}
KOTA_EXPORT int KhGetEditorString(CString* out) {
    if (!out)
        return 0;
    *out = temperatureModule().string(Id::EditorName);
    return 1;
}
KOTA_EXPORT int KhGetToolbarString(CString*, int) {
    return 0;
}
}
