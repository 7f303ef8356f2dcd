#pragma once

#include "platform/framework/resources.h"

#include <QString>

namespace kota::hub {

// What the user reads of a river network and its map. A text with %1, %2, ... is filled by QString::arg with
// all values in one call, since a value may hold a % itself.
enum class ProjectText {
    // Why a file cannot be read, with its place: the file, within it the feature, within that the value.
    FileNotReadable, // file, reason
    NotJson,         // file, line, column, reason
    Misfit,          // place, expected, found
    Within,          // place, place within it
    Feature,         // number
    NamedFeature,    // number, river
    // What was expected.
    AnObject,
    AList,
    AFeature,
    TwoPlaces,
    ALineOrMore,
    ACollectionOrFeature,
    ALine,
    AText,
    ANumber,
    ANumberInRange,
    ALongitude,
    ALatitude,
    AChainageInSpan,
    AChainageInOrder,
    // What was found.
    Nothing,
    SomeObject,
    SomeList,
    AnEmptyList,
    QuotedText, // text
    // The map.
    MapName,
    EmptyMap,
    Place,  // river, chainage
    Metres, // number
    Count_
};

// Its number in the string tables.
constexpr UINT idOf(ProjectText text) {
    return static_cast<UINT>(text);
}

// In the user's language once that is loaded, in English before.
QString projectText(ProjectText text);
// Takes the texts of the user's language. Called once, before anything is shown.
void loadProjectTexts();
// The table in English.
const Resources& englishProjectTexts();

} // namespace kota::hub
