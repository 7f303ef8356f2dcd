#include "platform/framework/extension.h"
#include "platform/language/language.h"
#include "resources/module.h"

namespace {

// What happens when the library comes into a process and leaves it. That the language library is missing
// stops nothing: the module's own texts serve.
class Attachment {
public:
    Attachment() {
        AfxInitExtensionModule(kota0AdRecord, nullptr);
        language_ = KhLangLoadResDll("Kota0_ad", &kota0AdRecord.resources, 0);
        new CDynLinkLibrary(kota0AdRecord, FALSE); // the framework's
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
