#pragma once

#include "platform/framework/export.h"
#include "platform/framework/text.h"

#include <span>
#include <string_view>

// The keyed-section file library.
//
// A file holds targets, a target sections, a section further sections and keywords, a keyword an ordered list
// of parameters, each an int, a double, a bool or a string. Names may repeat: the n-th element of a name
// among its siblings has number n, from 1; keywords and sections are numbered apart. A parameter is known by
// its place, from 1. The text form of a file is told in docs/file-format.md.
//
// Handles are opaque. What is asked of a null handle, or for something that is not there, gives null or the
// value's zero (kvsGetListParam leaves its address alone instead), and what is added to a null handle goes
// nowhere; neither is a failure. A handle other than a
// file's belongs to its file and dies with it. Nothing here is meant for more than one thread.

namespace kota::kvs {

// Where a value read from a list goes to: an int or a double of the caller's.
struct Destination {
    Destination(int* address) : format('i'), intAddress(address) {}
    Destination(double* address) : format('d'), doubleAddress(address) {}

    char format; // the letter that goes with it
    int* intAddress = nullptr;
    double* doubleAddress = nullptr;
};

// A value to be written into a list.
struct Source {
    Source(int value) : format('i'), intValue(value) {}
    Source(double value) : format('d'), doubleValue(value) {}

    char format;
    int intValue = 0;
    double doubleValue = 0;
};

} // namespace kota::kvs

// --- Reading ---

// Reads the file at `path` and gives its handle, also when that fails: then the handle holds no target, the
// global error state is set, and kvsGetSyntaxErr tells why. `mode` is 1. Clears the error of an earlier call.
KOTA_API void* kvsLoadFile(const char* path, int mode);

// The global error state: 0, or not 0 when the last load or append failed. kvsGetErrorGlb clears it.
KOTA_API int kvsPeekErrorGlb();
KOTA_API int kvsGetErrorGlb();
// The text that goes with the global error state, fit to be shown to the user; empty when there is no error.
KOTA_API CString kvsPeekErrorTextGlb();

// Why the load of `file` failed: the line and the column, from 1 (0 when the file could not be read at all),
// and a text fit to be shown, "file:line:column: what was expected and what stands there". Addresses may be
// null. Gives 1, or 0 with zeros and an empty text when the load did not fail.
KOTA_API int kvsGetSyntaxErr(void* file, int* line, int* column, CString* text);

// The target, the section of a target or section, or the keyword of a section, of that name and number.
KOTA_API void* kvsTargetByNameNum(void* file, const char* name, int number);
KOTA_API void* kvsSectionByNameNum(void* targetOrSection, const char* name, int number);
KOTA_API void* kvsKeywordByNameNum(void* section, const char* name, int number);
KOTA_API void* kvsParamByNum(void* keyword, int place);

// A parameter's value. A parameter of another type gives its natural value: an int as a double, a bool as 0
// or 1, a number equal to 0 or 1 as a bool, a double truncated to an int where it is in range; otherwise
// zero, false or an empty string. The string stays the file's.
KOTA_API int kvsGetInt(void* parameter);
KOTA_API double kvsGetDouble(void* parameter);
KOTA_API bool kvsGetBool(void* parameter);
KOTA_API const CString& kvsGetString(void* parameter);

namespace kota::kvs {
// What kvsGetListParam does, for a list of addresses made beforehand.
KOTA_API int getListParam(void* section, const char* keyword, int number, std::string_view format,
                          std::span<const Destination> destinations);
// What kvsPutListParam does, for a list of values made beforehand.
KOTA_API void putListParam(void* file, const char* keyword, std::string_view format,
                           std::span<const Source> values);
} // namespace kota::kvs

// Fills the addresses, one for each letter of `format` ("i" an int*, "d" a double*), from the keyword's
// parameters in their order. An address whose parameter is missing, or that does not fit its letter, stays as
// it was. Gives how many were filled.
template <class... Address>
int kvsGetListParam(void* section, const char* keyword, int number, const char* format,
                    Address... addresses) {
    const kota::kvs::Destination destinations[] = {addresses...};
    return kota::kvs::getListParam(section, keyword, number, format, destinations);
}

// Frees the file and nulls the caller's handle.
KOTA_API void kvsClose(void** file);

// --- Writing ---

// A new file in memory, empty. kvsClose frees it.
KOTA_API void* kvsCreate();
// Open a target in the file, and a section inside the target or section that is open.
KOTA_API void kvsAddTarget(void* file, const char* name);
KOTA_API void kvsAddSection(void* file, const char* name);
// Closes the open section or, at the outermost level, the target.
KOTA_API void kvsEndSection(void* file);
// Starts a keyword in the open section; parameters added next belong to it.
KOTA_API void kvsAddKeyword(void* file, const char* name);
KOTA_API void kvsAddInt(void* file, int value);
KOTA_API void kvsAddDouble(void* file, double value);
KOTA_API void kvsAddBool(void* file, bool value);
KOTA_API void kvsAddString(void* file, std::string_view value);

// Starts the keyword and appends its parameters, one value for each letter of `format`.
template <class... Value>
void kvsPutListParam(void* file, const char* keyword, const char* format, Value... values) {
    const kota::kvs::Source sources[] = {values...};
    kota::kvs::putListParam(file, keyword, format, sources);
}

// Appends the text of what was built to the file at `path`, all or nothing; what is still open is closed
// first. Gives 1, 0 for a null handle, or 0 with the global error state set: the file cannot be written (it
// then is as it was), or something was added where the form has no place for it. Clears the error of an
// earlier call.
KOTA_API int kvsAppend(void* file, const char* path);
