#include "resources/dialog_trees.h"
#include "resources/texts.h"

namespace {

constexpr DialogTexts english{
    .components = "Components",
    .dispersion = "Dispersion",
    .decay = "Decay",
    .boundary = "Boundary",
    .initialConditions = "Init.Cond.",
    .cohesive = "Cohesive ST",
    .nonCohesive = "Non-Cohesive ST",
    .sedimentLayers = "Sediment Layers",
    .additionalOutput = "Additional output",
    .k32AdditionalOutput = "KOTA 32 Additional output",
    .k32Boundary = "KOTA 32 Boundary",
    .k32Dispersion = "KOTA 32 Dispersion",
    .search = "Search",
    .gotoLine = "Go to grid line",
    .decayConstants = "Decay constants",
    .dispersionCoefficients = "Dispersion coeficients/factors",
    .globalValues = "Global values",
    .localValues = "Local values",
    .dispersionFactor = "Dispersion factor",
    .exponent = "Exponent",
    .minimumDispersion = "Minimum disp. coefficient",
    .maximumDispersion = "Maximum disp. coefficient",
    .notAvailableYet = "This page is not available yet.",
    .componentNumber = "Component number:",
    .riverName = "River Name:",
    .partialMatch = "Partial match",
    .fullMatch = "Full match",
    .chainage = "Chainage:",
    .chainageNotUsed = "Not Use",
    .lineNumber = "Line number:",
    .ok = "OK",
    .cancel = "Cancel",
};

} // namespace

std::span<const kota::DialogTemplate> englishDialogs() {
    return DialogTrees<english>::all;
}
