#pragma once

#include "platform/framework/module.h"

namespace kota {

// What the platform itself says to the user. Behind a name stand the arguments of its text, in their order: C
// strings, int, unsigned for lines and columns, std::size_t for other counts.
enum class PlatformText : UINT {
    InvalidArgument = 1, // what is invalid
    NoHelp,
    NoPrinting,
    IntegerRequired,
    SaveChanges, // the document's title
    TheDocument, // in place of a title

    CannotOpen,       // path, reason
    SaveInterrupted,  // path, path of the version before
    OpenElsewhere,    // path
    ReplaceFile,      // path
    NotKept,          // path, reason
    NotSaved,         // reason
    NotAFile,         // a reason
    SomethingNotFile, // path; a reason
    TooLarge,         // a reason
    NoMemoryToRead,   // path

    UnitOf, // a unit's symbol

    NotAPlugIn,    // path
    BuiltForOther, // path, its version, the platform's version
    DoesNotExport, // path, name

    OneNotPasted,
    NotPasted,    // number
    RefusedValue, // line, column, text, reason
    MoreRefused,  // number
    CellIsReadOnly,
    ZeroOrOne,
    NotAChoice,
    NoSuchColumn,
    NoSuchLine,

    // What a file's text should have, and what it has.
    SyntaxError, // expected, found
    EndOfFile,
    EndOfLine,
    CommaOrEndOfLine,
    ClosingQuote,
    KnownEscape,
    Value,
    ExponentDigits,
    WholeNumber,
    NumberInRange,
    TargetName,
    SectionName,
    SectionOrEnd,
    SectionKeywordOrEnd,
    MostBraces, // number

    Count // none of them
};

// Its number in the string tables.
constexpr UINT idOf(PlatformText text) {
    return static_cast<UINT>(text);
}

// The text in the user's language, in English where there is none, filled in with its arguments.
KOTA_API CString platformText(PlatformText id, ...);

// The record of the platform's own library, through which its language library is found.
KOTA_API AFX_EXTENSION_MODULE& platformRecord();

} // namespace kota
