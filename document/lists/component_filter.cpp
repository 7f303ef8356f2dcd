#include "document/lists/component_filter.h"

#include "document/lists/record_lists.h"
#include "document/records/component.h"

bool passesKindFilter(int kind, int kindFilter) {
    switch (kindFilter) {
    case AllKinds:
        return true;
    case CohesiveKinds:
        return kind == 1 || kind == 2;
    case NonCohesiveKinds:
        return kind == 3;
    case SedimentKinds:
        return kind != 0;
    default:
        return false;
    }
}

CString GetFilteredCompName(const CCompList& components, int n, int kindFilter) {
    const AD_Component* component = nullptr;
    for (POSITION position = components.GetHeadPosition(); position && n > 0;) {
        component = components.NextRecord(position);
        if (passesKindFilter(component->kind, kindFilter))
            --n;
    }
    return component ? component->name : CString();
}
