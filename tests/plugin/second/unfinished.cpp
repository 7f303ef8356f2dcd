#include "platform/framework/extension.h"

// A library that would be a plug-in if it had any of the exports.
int kota::plugInAbiVersion() {
    return abiVersion;
}
