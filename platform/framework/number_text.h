#pragma once

#include "platform/framework/text.h"

#include <array>
#include <charconv>
#include <string_view>

// Numbers from and to text, as the C library reads and prints them in the "C" locale, whatever the
// program's locale is.
namespace kota {

// The number at the start of `text`, as atof: white space, a sign, then decimal digits with point and
// exponent, hexadecimal digits behind 0x, "inf", "infinity" or "nan". The longest start that is a number
// counts, and what follows it is ignored; 0.0 when there is none. Too large a number gives an infinity, too
// small a one 0, both with the number's sign.
KOTA_API double textToDouble(std::string_view text);

// The whole number at the start of `text`, as atoi: white space, a sign, then decimal digits; 0 when there is
// none. A number beyond an int gives the int nearest to it.
KOTA_API int textToInt(std::string_view text);

// Where a NumberFormat prints to: long enough for every number in every valid format.
using NumberBuffer = std::array<char, 512>;

// A printf format of one double, parsed once and much faster than printf afterwards: text, then "%", any
// number of "-", a precision such as ".3", an "l", one of the letters f, F, e, E, g and G, and text; all but
// "%" and the letter may be missing. "%%" in a text stands for "%". Any other format, and one whose texts and
// precision come to 200 or more together, is invalid and prints like "%f".
class KOTA_API NumberFormat {
public:
    explicit NumberFormat(std::string_view format = "%f");

    // What printf prints for `value` in the "C" locale.
    CString operator()(double value) const;
    // The same, in `buffer`: the text lives as long as the buffer does, and no NUL ends it.
    std::string_view print(double value, NumberBuffer& buffer) const;

private:
    bool Parse(std::string_view format);
    bool ParseConversion(std::string_view& format);

    CString before_;
    CString after_;
    std::chars_format notation_ = std::chars_format::fixed;
    bool upperCase_ = false;
    int precision_ = 6;
};

} // namespace kota
