#include "document/records/decay.h"

#include "document/records/parameters.h"

namespace {
constexpr auto parameters =
    kota::fileForm(&AD_Decay::componentNum, &AD_Decay::decayConst, kota::LocationTriple());
} // namespace

AD_Decay::AD_Decay() {
    isGlobal = 1;
}
AD_Decay::~AD_Decay() = default;

void AD_Decay::Save(void* file) {
    kota::saveKeyword(file, dataKeyword, *this, parameters);
}
void AD_Decay::Load(void* keyword) {
    kota::loadKeyword(keyword, *this, parameters);
}
