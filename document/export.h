#pragma once

#include "platform/framework/export.h"

// What the plug-in hands out to sibling editors.
#if defined(KOTA0_AD_BUILD)
#define KOTA0_AD_API KOTA_EXPORT
#else
#define KOTA0_AD_API KOTA_IMPORT
#endif
