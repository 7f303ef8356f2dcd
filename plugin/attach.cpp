#include "platform/framework/extension.h"
#include "platform/language/language.h"
#include "plugin/entry_point.h"
#include "resources/module.h"

int kota::plugInAbiVersion() {
    return abiVersion;
}

namespace {

// What happens when the library comes into a process and leaves it. Nothing that fails stops it: without the
// language library the module's own texts serve.
class Attachment {
public:
    Attachment() {
        AfxInitExtensionModule(kota0AdRecord, kota::libraryAt(&kota0AdRecord));
        language_ = orZero([] { return KhLangLoadResDll("Kota0_ad", &kota0AdRecord.resources, 0); });
        orZero([] { new CDynLinkLibrary(kota0AdRecord, FALSE); }); // the framework's
    }
    ~Attachment() {
        if (language_)
            FreeLibrary(language_);
    }
    Attachment(const Attachment&) = delete;
    Attachment& operator=(const Attachment&) = delete;

private:
    HINSTANCE language_ = nullptr;
};

const Attachment attachment;

} // namespace
