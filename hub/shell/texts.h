#pragma once

#include "platform/framework/module.h"

namespace kota::hub {

// What the shell itself says. Behind a name stands what the text is filled in with, as %1 and %2.
enum class HubText : UINT {
    NoEditorFor = 1, // path
    New,
    WhatKind,
    About,
    VersionAndEditors, // version, names
    NoEditors,
    NotLoaded,  // file, reason
    NoEditorIn, // folder
    RecentFile, // in place of files

    RiverMap,
    Exchange,
    RiverNetworks,
    Filter,
    CopyMessages,
    ClearMessages,
    ColumnTime,
    ColumnCode,
    ColumnMeaning,
    ColumnSender,
    ColumnRiver,
    ColumnChainage,
    ColumnData,
    LeavesProject,
    JoinsProject,
    AsksForRivers,
    AsksForLocation,
    LocationChanged,
    DataChanged,
    ShowsToolBar,
    HidesToolBar,
    UnknownCode,
    DataInit,
    DataSediment,
    DataNonCohesive,
    DataLayer,
    DataDecay,
    DataDispersion,
    DataIce,
    DataBoundary,
    Settings,
    Language,
    LanguageOfEnvironment,
    DisplayUnits,
    UnitChainage,
    UnitWidth,
    UnitLayerHeight,
    UnitRate,
    AtNextStart,
};

// Its number in the string tables.
constexpr UINT idOf(HubText text) {
    return static_cast<UINT>(text);
}

// Strings, prompts and menu, by language.
const Resources& englishTexts();
const Resources& japaneseTexts();

} // namespace kota::hub
