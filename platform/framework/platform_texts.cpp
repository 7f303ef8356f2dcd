#include "platform/framework/platform_texts.h"

#include <cstdarg>
#include <iterator>

namespace kota {

namespace {

constexpr StringResource english[] = {
    {idOf(PlatformText::InvalidArgument), "An operation was given an invalid argument (%s)."},
    {idOf(PlatformText::NoHelp), "There is no help for this."},
    {idOf(PlatformText::NoPrinting), "Printing is not available."},
    {idOf(PlatformText::IntegerRequired), "Please enter an integer."},
    {idOf(PlatformText::SaveChanges), "Save changes to %s?"},
    {idOf(PlatformText::TheDocument), "the document"},
    {idOf(PlatformText::CannotOpen), "%s cannot be opened: %s."},
    {idOf(PlatformText::SaveInterrupted),
     "%s is empty: a save of it was interrupted. The version before is in %s."},
    {idOf(PlatformText::OpenElsewhere), "%s is open in another window. Close it there first."},
    {idOf(PlatformText::ReplaceFile), "%s exists already. Do you want to replace it?"},
    {idOf(PlatformText::NotKept), "%s was not saved, since the version before could not be kept: %s."},
    {idOf(PlatformText::NotSaved), "The document was not saved: %s."},
    {idOf(PlatformText::NotAFile), "not a file"},
    {idOf(PlatformText::SomethingNotFile), "%s is not a file"},
    {idOf(PlatformText::TooLarge), "larger than 4 GiB"},
    {idOf(PlatformText::NoMemoryToRead), "%s: not enough memory to read it"},
    {idOf(PlatformText::UnitOf), "Unit: %s"},
    {idOf(PlatformText::NotAPlugIn), "%s is not a plug-in of this program"},
    {idOf(PlatformText::BuiltForOther), "%s was built for version %d of the platform; this is version %d"},
    {idOf(PlatformText::DoesNotExport), "%s does not export %s"},
    {idOf(PlatformText::OneNotPasted), "1 value could not be pasted:"},
    {idOf(PlatformText::NotPasted), "%zu values could not be pasted:"},
    {idOf(PlatformText::RefusedValue), "Line %u, column %u: \"%s\" - %s"},
    {idOf(PlatformText::MoreRefused), "and %zu more"},
    {idOf(PlatformText::CellIsReadOnly), "the cell cannot be changed"},
    {idOf(PlatformText::ZeroOrOne), "0 or 1 required"},
    {idOf(PlatformText::NotAChoice), "not one of the choices"},
    {idOf(PlatformText::NoSuchColumn), "there is no such column"},
    {idOf(PlatformText::NoSuchLine), "there is no such line"},
    {idOf(PlatformText::SyntaxError), "expected %s, found %s"},
    {idOf(PlatformText::EndOfFile), "the end of the file"},
    {idOf(PlatformText::EndOfLine), "the end of the line"},
    {idOf(PlatformText::CommaOrEndOfLine), "',' or the end of the line"},
    {idOf(PlatformText::ClosingQuote), "'\"' to close the string"},
    {idOf(PlatformText::KnownEscape), "one of \\\" \\\\ \\n \\r \\t and \\x with two hexadecimal digits"},
    {idOf(PlatformText::Value),
     "a value (a number, true, false, nan, inf, -inf or a string in double quotes)"},
    {idOf(PlatformText::ExponentDigits), "digits behind the exponent's 'e'"},
    {idOf(PlatformText::WholeNumber),
     "a whole number from -2147483648 to 2147483647, or a number with a point"},
    {idOf(PlatformText::NumberInRange), "a number within the range of a double, or inf"},
    {idOf(PlatformText::TargetName), "the target's name"},
    {idOf(PlatformText::SectionName), "the section's name"},
    {idOf(PlatformText::SectionOrEnd), "'section' or '}'"},
    {idOf(PlatformText::SectionKeywordOrEnd), "'section', a keyword's name or '}'"},
    {idOf(PlatformText::MostBraces), "at most %d braces in each other"},
};
static_assert(std::size(english) == idOf(PlatformText::Count) - 1, "a row for each text");

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
    filled.FormatV(platformModule().string(idOf(text)), arguments);
    va_end(arguments);
    return filled;
}

} // namespace kota
