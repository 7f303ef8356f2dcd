#pragma once

// How a shared library hands a name out and how its users take it in. Each library has a macro of its own,
// made of these two: KOTA_API for the platform.
#if defined(_WIN32)
#define KOTA_EXPORT __declspec(dllexport)
#define KOTA_IMPORT __declspec(dllimport)
#else
#define KOTA_EXPORT __attribute__((visibility("default")))
#define KOTA_IMPORT __attribute__((visibility("default")))
#endif

#if defined(KOTA_PLATFORM_BUILD)
#define KOTA_API KOTA_EXPORT
#else
#define KOTA_API KOTA_IMPORT
#endif
