#include "decay.h"

#include "document/lists/component_filter.h"
#include "document/records/decay.h"

#include <algorithm>
#include <cmath>

namespace water {

namespace {

// Calls `use` with each decay line of the component. A line knows its component by the place among those that
// the decay tab offers, which are all.
template <class Use>
void eachLine(const CKota0_adDoc& document, const CString& component, const Use& use) {
    for (POSITION position = document.decayList.GetHeadPosition(); position;) {
        AD_Decay& line = *document.decayList.NextRecord(position);
        if (GetFilteredCompName(document.compList, line.componentNum, AllKinds) == component)
            use(line);
    }
}

} // namespace

double decayFactor(double from, double to) {
    return std::pow(1.047, to - from);
}

DecaySummary summaryOf(const CKota0_adDoc& document, const CString& component) {
    DecaySummary summary;
    eachLine(document, component, [&](const AD_Decay& line) {
        const bool first = summary.lines++ == 0;
        summary.least = first ? line.decayConst : std::min(summary.least, line.decayConst);
        summary.most = first ? line.decayConst : std::max(summary.most, line.decayConst);
    });
    return summary;
}

std::optional<double> decayAt(const CKota0_adDoc& document, const CString& component, const CString& river,
                              double chainage) {
    std::optional<double> everywhere;
    std::optional<double> here;
    eachLine(document, component, [&](const AD_Decay& line) {
        if (line.isGlobal)
            everywhere = line.decayConst;
        else if (line.riverName == river && line.chainage == chainage)
            here = line.decayConst;
    });
    return here ? here : everywhere;
}

void multiplyDecay(CKota0_adDoc& document, const CString& component, double factor) {
    eachLine(document, component, [&](AD_Decay& line) { line.decayConst *= factor; });
}

} // namespace water
