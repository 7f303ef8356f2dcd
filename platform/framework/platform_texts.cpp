#include "platform/framework/platform_texts.h"

#include <cstdarg>
#include <iterator>

namespace kota {

namespace {

constexpr UINT id(PlatformText text) {
    return static_cast<UINT>(text);
}

constexpr StringResource english[] = {
    {id(PlatformText::InvalidArgument), "An operation was given an invalid argument (%s)."},
    {id(PlatformText::NoHelp), "There is no help for this."},
    {id(PlatformText::NoPrinting), "Printing is not available."},
    {id(PlatformText::IntegerRequired), "Please enter an integer."},
    {id(PlatformText::SaveChanges), "Save changes to %s?"},
    {id(PlatformText::TheDocument), "the document"},
    {id(PlatformText::CannotOpen), "%s cannot be opened: %s."},
    {id(PlatformText::SaveInterrupted),
     "%s is empty: a save of it was interrupted. The version before is in %s."},
    {id(PlatformText::OpenElsewhere), "%s is open in another window. Close it there first."},
    {id(PlatformText::ReplaceFile), "%s exists already. Do you want to replace it?"},
    {id(PlatformText::NotKept), "%s was not saved, since the version before could not be kept: %s."},
    {id(PlatformText::NotSaved), "The document was not saved: %s."},
    {id(PlatformText::NotAFile), "not a file"},
    {id(PlatformText::SomethingNotFile), "%s is not a file"},
    {id(PlatformText::TooLarge), "larger than 4 GiB"},
    {id(PlatformText::NoMemoryToRead), "%s: not enough memory to read it"},
    {id(PlatformText::UnitOf), "Unit: %s"},
    {id(PlatformText::NotAPlugIn), "%s is not a plug-in of this program"},
    {id(PlatformText::BuiltForOther), "%s was built for version %d of the platform; this is version %d"},
    {id(PlatformText::DoesNotExport), "%s does not export %s"},
    {id(PlatformText::OneNotPasted), "1 value could not be pasted:"},
    {id(PlatformText::NotPasted), "%zu values could not be pasted:"},
    {id(PlatformText::RefusedValue), "Line %u, column %u: \"%s\" - %s"},
    {id(PlatformText::MoreRefused), "and %zu more"},
    {id(PlatformText::CellIsReadOnly), "the cell cannot be changed"},
    {id(PlatformText::ZeroOrOne), "0 or 1 required"},
    {id(PlatformText::NotAChoice), "not one of the choices"},
    {id(PlatformText::NoSuchColumn), "there is no such column"},
    {id(PlatformText::NoSuchLine), "there is no such line"},
    {id(PlatformText::SyntaxError), "expected %s, found %s"},
    {id(PlatformText::EndOfFile), "the end of the file"},
    {id(PlatformText::EndOfLine), "the end of the line"},
    {id(PlatformText::CommaOrEndOfLine), "',' or the end of the line"},
    {id(PlatformText::ClosingQuote), "'\"' to close the string"},
    {id(PlatformText::KnownEscape), "one of \\\" \\\\ \\n \\r \\t and \\x with two hexadecimal digits"},
    {id(PlatformText::Value), "a value (a number, true, false, nan, inf, -inf or a string in double quotes)"},
    {id(PlatformText::ExponentDigits), "digits behind the exponent's 'e'"},
    {id(PlatformText::WholeNumber),
     "a whole number from -2147483648 to 2147483647, or a number with a point"},
    {id(PlatformText::NumberInRange), "a number within the range of a double, or inf"},
    {id(PlatformText::TargetName), "the target's name"},
    {id(PlatformText::SectionName), "the section's name"},
    {id(PlatformText::SectionOrEnd), "'section' or '}'"},
    {id(PlatformText::SectionKeywordOrEnd), "'section', a keyword's name or '}'"},
    {id(PlatformText::MostBraces), "at most %d braces in each other"},
};
static_assert(std::size(english) == id(PlatformText::Count) - 1, "a row for each text");

} // namespace

AFX_EXTENSION_MODULE& platformRecord() {
    static constinit AFX_EXTENSION_MODULE record;
    return record;
}

const Module& platformModule() {
    static const Module module("kota_platform", {.strings = english}, &platformRecord());
    return module;
}

CString platformText(PlatformText text, ...) {
    CString filled;
    va_list arguments;
    va_start(arguments, text);
    filled.FormatV(platformModule().string(id(text)), arguments);
    va_end(arguments);
    return filled;
}

} // namespace kota
