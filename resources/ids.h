#pragma once

#include "platform/framework/types.h"

// The numbers of the plug-in's resources, each named once. Shells and siblings may rely on them.

namespace StringId {
inline constexpr UINT ConcentrationUnits = 4756; // entries, one a line
inline constexpr UINT ComponentKinds = 4758;     // entries, one a line
inline constexpr UINT AcceleratorName = 4786;
inline constexpr UINT DocTemplate = 4787; // seven parts, one a line
inline constexpr UINT ApplicationTitle = 57344;
inline constexpr UINT UndefinedChoice = 4829;
inline constexpr UINT UndefinedEntry = 4832; // the first entry in front of the components'
inline constexpr UINT HeadDispersionFactor = 4833;
inline constexpr UINT HeadExponent = 4834;
inline constexpr UINT HeadMinimumCoef = 4835;
inline constexpr UINT HeadMaximumCoef = 4836;
inline constexpr UINT MaximumBelowMinimum = 4837;
inline constexpr UINT SedimentGlobalsMissing = 4838;    // %s: the component's name
inline constexpr UINT NonCohesiveGlobalsMissing = 4839; // %s: the component's name
inline constexpr UINT UnsupportedFileFormat = 4840;
inline constexpr UINT EditorName = 4896;
inline constexpr UINT ToolbarName = 4897;
inline constexpr UINT SheetCaption = 4899;
inline constexpr UINT InvalidValue = 4828;
inline constexpr UINT ErrorInChainage = 4907;
// The page that a data change of a sibling cannot be shown on: Layer, Init, Sediment, Non Cohesive,
// Decay, Dispersion, Ice Data, Boundary.
inline constexpr UINT DeletedBehindError = 4873;  // and the seven that follow
inline constexpr UINT InsertedBehindError = 4881; // and the six that follow: none for a layer
inline constexpr UINT CannotSelect = 4888;        // and the seven that follow
inline constexpr UINT ProbeRiver = 4903;
inline constexpr UINT IntegerBetween = 4906; // %d, %d: the bounds
inline constexpr UINT SearchPrompt = 42550;
inline constexpr UINT FindNextPrompt = 42551;
inline constexpr UINT InsertLinePrompt = 42561;
inline constexpr UINT DeleteLinePrompt = 42562;
inline constexpr UINT GotoLinePrompt = 42563;
inline constexpr UINT InsertProbePrompt = 42565;
// Texts that no shell asks for, under numbers of the plug-in's own.
inline constexpr UINT HeadComponent = 5001;
inline constexpr UINT HeadUnits = 5002;
inline constexpr UINT HeadType = 5003;
inline constexpr UINT HeadDecayConstant = 5004;
inline constexpr UINT HeadGlobal = 5005;
inline constexpr UINT HeadRiverName = 5006;
inline constexpr UINT HeadChainage = 5007;
inline constexpr UINT DoubleRequired = 5008;
inline constexpr UINT InvalidNumber = 5009;
inline constexpr UINT NotFound = 5010;
inline constexpr UINT LastAlreadyFound = 5011;
inline constexpr UINT LineNumberTooSmall = 5012;
inline constexpr UINT IncompleteLines = 5013; // for shells and siblings: a save itself does not ask
inline constexpr UINT HeadIceThickness = 5014;
inline constexpr UINT HeadIceWidth = 5015;
inline constexpr UINT HeadIceQuality = 5016;
} // namespace StringId

namespace MenuId {
inline constexpr UINT Document = 4787;     // also the tool bar's, its bitmap's, and the document's icon
inline constexpr UINT Accelerators = 4786; // also the editor's icon
inline constexpr UINT EditorBitmap = 4793;
} // namespace MenuId

namespace DialogId {
inline constexpr UINT Dispersion = 4771;
inline constexpr UINT Cohesive = 4772;
inline constexpr UINT Components = 4773;
inline constexpr UINT InitialConditions = 4775;
inline constexpr UINT Decay = 4776;
inline constexpr UINT Boundary = 4777;
inline constexpr UINT SedimentLayers = 4778;
inline constexpr UINT NonCohesive = 4780;
inline constexpr UINT Goto = 4783;
inline constexpr UINT Search = 4784;
inline constexpr UINT Form = 4785;
inline constexpr UINT AdditionalOutput = 4794;
inline constexpr UINT K32AdditionalOutput = 4795;
inline constexpr UINT K32Boundary = 4796;
inline constexpr UINT K32Dispersion = 4797;
} // namespace DialogId

// The numbers of controls, each dialog's by itself.
namespace ControlId {
inline constexpr UINT DispersionFactor = 1008;
inline constexpr UINT DispersionExponent = 1010;
inline constexpr UINT MinimumDispersion = 1012;
inline constexpr UINT MaximumDispersion = 1015;
inline constexpr UINT ComponentGrid = 1064;
inline constexpr UINT DispersionGrid = 1080;
inline constexpr UINT DecayGrid = 1084;
inline constexpr UINT SheetPlaceholder = 1086;
inline constexpr UINT LineNumber = 1087;
inline constexpr UINT SearchRiverName = 1088;
inline constexpr UINT SearchPartialMatch = 1089;
inline constexpr UINT SearchFullMatch = 1090;
inline constexpr UINT SearchChainage = 1091;
inline constexpr UINT SearchBelow = 1092;
inline constexpr UINT SearchEqual = 1093;
inline constexpr UINT SearchAbove = 1094;
inline constexpr UINT SearchComponent = 1096;
inline constexpr UINT SearchNotUsed = 1102;
} // namespace ControlId

namespace CommandId {
inline constexpr UINT Search = 42550;
inline constexpr UINT FindNext = 42551;
inline constexpr UINT InsertLine = 42561;
inline constexpr UINT DeleteLine = 42562;
inline constexpr UINT GotoLine = 42563;
inline constexpr UINT InsertProbe = 42565;
inline constexpr UINT DataUtility = 32773;
} // namespace CommandId
