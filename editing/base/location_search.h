#pragma once

#include "platform/framework/text.h"

#include <string_view>

// How a search tests a line's river name and chainage. The numbers are those of the search dialog's buttons.
struct LocationSearch {
    enum ChainageTest { Below = 0, Equal = 1, Above = 2 }; // any other: not used
    enum TextTest { Partial = 0, Full = 1 };               // any other: not used

    // An empty text fits every name. A partial match is one at the start of the name; letters must agree in
    // their case.
    bool FitsName(std::string_view name) const {
        if (text.IsEmpty())
            return true;
        return textTest == Partial ? name.starts_with(text.View()) : textTest != Full || name == text.View();
    }
    bool FitsChainage(double value) const {
        switch (chainageTest) {
        case Below:
            return value < chainage;
        case Equal:
            return value == chainage;
        case Above:
            return value > chainage;
        default:
            return true;
        }
    }

    CString text;
    double chainage = 0.0; // in the display unit
    int chainageTest = 3;
    int textTest = Full;
};
