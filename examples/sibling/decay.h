#pragma once

#include "document/kota0_ad_doc.h"

#include <optional>

// What the water's temperature has to do with the decay in an AD document. All constants are in 1/h, the base
// unit of the records.
namespace water {

// What a constant is multiplied with when the water is at `to` degrees Celsius instead of `from`: k grows
// by 4.7 per cent a degree, the coefficient that is usual for the decay of BOD.
double decayFactor(double from, double to);

// The decay lines of a component.
struct DecaySummary {
    int lines = 0;
    double least = 0.0; // of no line: 0
    double most = 0.0;
};
DecaySummary summaryOf(const CKota0_adDoc& document, const CString& component);

// The constant of the component that holds at a place: its own line's, or else the global one.
std::optional<double> decayAt(const CKota0_adDoc& document, const CString& component, const CString& river,
                              double chainage);

// Multiplies the constants of the component, and tells nobody.
void multiplyDecay(CKota0_adDoc& document, const CString& component, double factor);

} // namespace water
