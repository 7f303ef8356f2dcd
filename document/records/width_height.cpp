#include "document/records/width_height.h"

#include "document/records/parameters.h"

namespace {
constexpr auto parameters = kota::fileForm(&AD_ST_Init_Cond_data::width, &AD_ST_Init_Cond_data::layerHeight);
} // namespace

AD_ST_Init_Cond_data::AD_ST_Init_Cond_data() = default;
AD_ST_Init_Cond_data::~AD_ST_Init_Cond_data() = default;

void AD_ST_Init_Cond_data::Save(void* file) {
    kota::saveKeyword(file, dataKeyword, *this, parameters);
}
void AD_ST_Init_Cond_data::Load(void* keyword) {
    kota::loadKeyword(keyword, *this, parameters);
}
