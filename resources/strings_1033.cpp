#include "resources/ids.h"
#include "resources/strings.h"

namespace {

constexpr kota::StringResource strings[] = {
    {StringId::ConcentrationUnits, "my-g/m3\nmg/m3\ng/m3\nkg/m3\nmy-g/l\nmg/l\ng/l\nDeg. Cel.\n"
                                   "million/100 ml\nPSU\nper thousand"},
    {StringId::ComponentKinds, "Normal\nSingle Layer Cohesive\nMulti Layer Cohesive"},
    {StringId::AcceleratorName, "AD Parameters"},
    {StringId::DocTemplate, "K31_Help.chm\nADPar\nKOTA 31 AD Parameters\nKOTA 31 AD Parameters (*.ad31)\n"
                            ".ad31\nADPar.Document\nADPar Document"},
    {StringId::UndefinedChoice, "Undefined\r\n"},
    {StringId::UndefinedEntry, "Undefined\n"},
    {StringId::HeadDispersionFactor, "Dispersion factor"},
    {StringId::HeadExponent, "Exponent"},
    {StringId::HeadMinimumCoef, "Minimum coef."},
    {StringId::HeadMaximumCoef, "Maximum coef."},
    {StringId::MaximumBelowMinimum, "Maximum disp. coef. must be greater than minimum disp. coef."},
    {StringId::SedimentGlobalsMissing,
     "Global values not specified for Component %s in Cohesive ST property page."},
    {StringId::NonCohesiveGlobalsMissing,
     "Global values not specified for Component %s in Non-Cohesive property page."},
    {StringId::UnsupportedFileFormat, "Unsupported file format"},
    {StringId::EditorName, "AD Parameters"},
    {StringId::ToolbarName, " KOTA 31 AD Tools"},
    {StringId::SheetCaption, "Kota0 AD"},
    {StringId::ProbeRiver, "SDFG"},
    {StringId::IntegerBetween, "Integer between %d and %d required"},
    {StringId::SearchPrompt, "Search for river name/topo ID.\nSearch"},
    {StringId::FindNextPrompt, "Search for next occurence of river name/ topo ID.\nFind Next"},
    {StringId::InsertLinePrompt, "Insert line into local variable grid."},
    {StringId::DeleteLinePrompt, "Delete line from grid."},
    {StringId::GotoLinePrompt, "Go to line with specified number."},
    {StringId::InsertProbePrompt, "Test"},
    {StringId::HeadComponent, "Component"},
    {StringId::HeadUnits, "Units"},
    {StringId::HeadType, "Type"},
    {StringId::HeadDecayConstant, "Decay const t-1"},
    {StringId::HeadGlobal, "Global"},
    {StringId::HeadRiverName, "River Name"},
    {StringId::HeadChainage, "Chainage"},
    {StringId::DoubleRequired, "Double number required"},
    {StringId::InvalidNumber, "Invalid floating point number!"},
    {StringId::NotFound, "Searched item not found"},
    {StringId::LastAlreadyFound, "The last occurence of searched item already found"},
    {StringId::LineNumberTooSmall, "Line number must be greater than 0"},
};

} // namespace

std::span<const kota::StringResource> englishStrings() {
    return strings;
}
