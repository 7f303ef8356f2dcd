#pragma once

#include "document/export.h"
#include "platform/framework/text.h"

class CCompList;

// Which components a page offers, by their kind (AD_Component::kind); each record's class says which one its
// componentNum goes by.
enum KindFilter : int {
    AllKinds = 0,
    CohesiveKinds = 1,    // kinds 1 and 2
    NonCohesiveKinds = 2, // kind 3
    SedimentKinds = 3,    // all but kind 0
};

// Whether a component of that kind passes a KindFilter; another value of the filter passes none.
KOTA0_AD_API bool passesKindFilter(int kind, int kindFilter);

// The name of the n-th component, from 1, that passes the filter; of the list's last component when the list
// ends before that. Empty for n below 1 and for an empty list.
KOTA0_AD_API CString GetFilteredCompName(const CCompList& components, int n, int kindFilter);
