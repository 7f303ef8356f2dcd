#pragma once

#include "platform/framework/module.h"
#include "resources/ids.h"

// What the dialogs say in one language. "&" marks an access key.
struct DialogTexts {
    // The tabs, and what the other dialogs are headed with.
    const char* components;
    const char* dispersion;
    const char* decay;
    const char* boundary;
    const char* initialConditions;
    const char* cohesive;
    const char* nonCohesive;
    const char* sedimentLayers;
    const char* additionalOutput;
    const char* k32AdditionalOutput;
    const char* k32Boundary;
    const char* k32Dispersion;
    const char* search;
    const char* gotoLine;

    const char* decayConstants;
    const char* dispersionCoefficients;
    const char* globalValues;
    const char* localValues;
    const char* dispersionFactor;
    const char* exponent;
    const char* minimumDispersion;
    const char* maximumDispersion;
    const char* notAvailableYet;

    const char* componentNumber;
    const char* riverName;
    const char* partialMatch;
    const char* fullMatch;
    const char* chainage;
    const char* chainageNotUsed;
    const char* lineNumber;
    const char* ok;
    const char* cancel;
};

// The dialogs with the texts of a language.
template <const DialogTexts& text>
class DialogTrees {
    using DialogItem = kota::DialogItem;
    using WindowKind = kota::WindowKind;

    static constexpr DialogItem componentGrid[] = {kota::control(WindowKind::Grid, ControlId::ComponentGrid)};
    static constexpr DialogItem components[] = {kota::group(text.components, componentGrid)};

    static constexpr DialogItem decayGrid[] = {kota::control(WindowKind::Grid, ControlId::DecayGrid)};
    static constexpr DialogItem decay[] = {kota::group(text.decayConstants, decayGrid)};

    static constexpr DialogItem dispersionGlobals[] = {
        kota::field(text.dispersionFactor, ControlId::DispersionFactor),
        kota::field(text.exponent, ControlId::DispersionExponent),
        kota::field(text.minimumDispersion, ControlId::MinimumDispersion),
        kota::field(text.maximumDispersion, ControlId::MaximumDispersion),
    };
    static constexpr DialogItem dispersionLocals[] = {
        kota::control(WindowKind::Grid, ControlId::DispersionGrid)};
    static constexpr DialogItem dispersionGroups[] = {kota::group(text.globalValues, dispersionGlobals),
                                                      kota::group(text.localValues, dispersionLocals)};
    static constexpr DialogItem dispersion[] = {kota::group(text.dispersionCoefficients, dispersionGroups)};

    // The view's form holds the place where the sheet goes.
    static constexpr DialogItem form[] = {kota::control(WindowKind::Plain, ControlId::SheetPlaceholder)};

    static constexpr DialogItem notYet[] = {kota::label(text.notAvailableYet)};

    static constexpr DialogItem textMatch[] = {
        {.kind = WindowKind::RadioButton,
         .id = ControlId::SearchPartialMatch,
         .caption = text.partialMatch,
         .startsGroup = true},
        kota::control(WindowKind::RadioButton, ControlId::SearchFullMatch, text.fullMatch),
    };
    static constexpr DialogItem chainageMatch[] = {
        {.kind = WindowKind::RadioButton, .id = ControlId::SearchBelow, .caption = "<", .startsGroup = true},
        kota::control(WindowKind::RadioButton, ControlId::SearchEqual, "="),
        kota::control(WindowKind::RadioButton, ControlId::SearchAbove, ">"),
        kota::control(WindowKind::RadioButton, ControlId::SearchNotUsed, text.chainageNotUsed),
    };
    static constexpr UINT ok = 1;
    static constexpr UINT cancel = 2;
    static constexpr DialogItem okAndCancel[] = {kota::control(WindowKind::PushButton, ok, text.ok),
                                                 kota::control(WindowKind::PushButton, cancel, text.cancel)};
    static constexpr DialogItem search[] = {
        kota::field(text.componentNumber, ControlId::SearchComponent),
        kota::field(text.riverName, ControlId::SearchRiverName),
        kota::row(textMatch),
        kota::field(text.chainage, ControlId::SearchChainage),
        kota::row(chainageMatch),
        kota::row(okAndCancel),
    };
    static constexpr DialogItem gotoLine[] = {kota::field(text.lineNumber, ControlId::LineNumber),
                                              kota::row(okAndCancel)};

public:
    static constexpr kota::DialogTemplate all[] = {
        {DialogId::Dispersion, text.dispersion, dispersion},
        {DialogId::Cohesive, text.cohesive, notYet},
        {DialogId::Components, text.components, components},
        {DialogId::InitialConditions, text.initialConditions, notYet},
        {DialogId::Decay, text.decay, decay},
        {DialogId::Boundary, text.boundary, notYet},
        {DialogId::SedimentLayers, text.sedimentLayers, notYet},
        {DialogId::NonCohesive, text.nonCohesive, notYet},
        {DialogId::Goto, text.gotoLine, gotoLine},
        {DialogId::Search, text.search, search},
        {DialogId::Form, "", form},
        {DialogId::AdditionalOutput, text.additionalOutput, notYet},
        {DialogId::K32AdditionalOutput, text.k32AdditionalOutput, notYet},
        {DialogId::K32Boundary, text.k32Boundary, notYet},
        {DialogId::K32Dispersion, text.k32Dispersion, notYet},
    };
};
