#include "platform/grid/init.h"

namespace {
bool registered = false;
} // namespace

bool GXIsRegistered() {
    return registered;
}

void GXInit(UINT /*flags*/, void* /*controls*/, void* /*styles*/) {
    registered = true;
}
