#include "tests/plugin/failing_buttons.h"

#include "platform/foundation/toolbar.h"

#include <dlfcn.h>

namespace {

bool fails = false;

} // namespace

kota::test::FailingButtons::FailingButtons() {
    fails = true;
}
kota::test::FailingButtons::~FailingButtons() {
    fails = false;
}

// Stands before the platform's for all libraries, and hands on to it.
BOOL CKhFlatToolBar::LoadToolBar(const kota::Module& module, UINT id) {
    using Platforms = BOOL(CKhFlatToolBar*, const kota::Module&, UINT);
    void* const platforms = dlsym(RTLD_NEXT, "_ZN14CKhFlatToolBar11LoadToolBarERKN4kota6ModuleEj");
    return platforms && !fails ? reinterpret_cast<Platforms*>(platforms)(this, module, id) : FALSE;
}
