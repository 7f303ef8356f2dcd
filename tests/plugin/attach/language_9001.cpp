#include "platform/framework/resources.h"

namespace {

// The name of the tool bar is left to the module.
constexpr kota::StringResource strings[] = {
    {4787, "K31_Help.chm\nADPar\nFoobar\nFoobar (*.ad31)\n.ad31\nADPar.Document\nADPar Document"},
    {4896, "Foo"},
};
constexpr kota::Resources resources{.strings = strings};

} // namespace

extern "C" KOTA_EXPORT const kota::Resources* KotaResources();

const kota::Resources* KotaResources() {
    return &resources;
}
