#include "resources/ids.h"
#include "resources/strings.h"

namespace {

constexpr kota::StringResource strings[] = {
    {StringId::SedimentGlobalsMissing,
     "Global values not specified for Component %s in Cohesive ST property page."},
    {StringId::NonCohesiveGlobalsMissing,
     "Global values not specified for Component %s in Non-Cohesive property page."},
    {StringId::UnsupportedFileFormat, "Unsupported file format"},
};

} // namespace

std::span<const kota::StringResource> englishStrings() {
    return strings;
}
