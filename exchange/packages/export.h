#pragma once

#include "platform/framework/export.h"

#if defined(KOTA_PACKAGES_BUILD)
#define KOTA_PACKAGES_API KOTA_EXPORT
#else
#define KOTA_PACKAGES_API KOTA_IMPORT
#endif
