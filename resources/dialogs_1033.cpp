#include "resources/dialogs.h"
#include "resources/ids.h"

namespace {

using kota::control;
using kota::DialogItem;
using kota::field;
using kota::group;
using kota::label;
using kota::row;
using kota::WindowKind;

constexpr DialogItem componentGrid[] = {control(WindowKind::Grid, ControlId::ComponentGrid)};
constexpr DialogItem components[] = {group("Components", componentGrid)};

constexpr DialogItem decayGrid[] = {control(WindowKind::Grid, ControlId::DecayGrid)};
constexpr DialogItem decay[] = {group("Decay constants", decayGrid)};

constexpr DialogItem dispersionGlobals[] = {
    field("Dispersion factor", ControlId::DispersionFactor),
    field("Exponent", ControlId::DispersionExponent),
    field("Minimum disp. coefficient", ControlId::MinimumDispersion),
    field("Maximum disp. coefficient", ControlId::MaximumDispersion),
};
constexpr DialogItem dispersionLocals[] = {control(WindowKind::Grid, ControlId::DispersionGrid)};
constexpr DialogItem dispersionGroups[] = {group("Global values", dispersionGlobals),
                                           group("Local values", dispersionLocals)};
constexpr DialogItem dispersion[] = {group("Dispersion coeficients/factors", dispersionGroups)};

// The view's form holds the place where the sheet goes.
constexpr DialogItem form[] = {control(WindowKind::Plain, ControlId::SheetPlaceholder)};

constexpr DialogItem notYet[] = {label("This page is not available yet.")};

constexpr DialogItem textMatch[] = {
    {.kind = WindowKind::RadioButton,
     .id = ControlId::SearchPartialMatch,
     .caption = "Partial match",
     .startsGroup = true},
    control(WindowKind::RadioButton, ControlId::SearchFullMatch, "Full match"),
};
constexpr DialogItem chainageMatch[] = {
    {.kind = WindowKind::RadioButton, .id = ControlId::SearchBelow, .caption = "<", .startsGroup = true},
    control(WindowKind::RadioButton, ControlId::SearchEqual, "="),
    control(WindowKind::RadioButton, ControlId::SearchAbove, ">"),
    control(WindowKind::RadioButton, ControlId::SearchNotUsed, "Not Use"),
};
constexpr UINT ok = 1;
constexpr UINT cancel = 2;
constexpr DialogItem okAndCancel[] = {control(WindowKind::PushButton, ok, "OK"),
                                      control(WindowKind::PushButton, cancel, "Cancel")};
constexpr DialogItem search[] = {
    field("Component number:", ControlId::SearchComponent),
    field("River Name:", ControlId::SearchRiverName),
    row(textMatch),
    field("Chainage:", ControlId::SearchChainage),
    row(chainageMatch),
    row(okAndCancel),
};
constexpr DialogItem gotoLine[] = {field("Line number:", ControlId::LineNumber), row(okAndCancel)};

constexpr kota::DialogTemplate dialogs[] = {
    {DialogId::Dispersion, "Dispersion", dispersion},
    {DialogId::Cohesive, "Cohesive ST", notYet},
    {DialogId::Components, "Components", components},
    {DialogId::InitialConditions, "Init.Cond.", notYet},
    {DialogId::Decay, "Decay", decay},
    {DialogId::Boundary, "Boundary", notYet},
    {DialogId::SedimentLayers, "Sediment Layers", notYet},
    {DialogId::NonCohesive, "Non-Cohesive ST", notYet},
    {DialogId::Goto, "Go to grid line", gotoLine},
    {DialogId::Search, "Search", search},
    {DialogId::Form, "", form},
    {DialogId::AdditionalOutput, "Additional output", notYet},
    {DialogId::K32AdditionalOutput, "KOTA 32 Additional output", notYet},
    {DialogId::K32Boundary, "KOTA 32 Boundary", notYet},
    {DialogId::K32Dispersion, "KOTA 32 Dispersion", notYet},
};

} // namespace

std::span<const kota::DialogTemplate> englishDialogs() {
    return dialogs;
}
