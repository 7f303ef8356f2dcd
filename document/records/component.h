#pragma once

#include "document/export.h"
#include "platform/framework/object.h"
#include "platform/framework/text.h"

// One transported component of the document.
class KOTA0_AD_API AD_Component : public CObject {
public:
    AD_Component();
    ~AD_Component() override;

    // As those of AD_Comp_RiverPos.
    virtual void Save(void* file);
    virtual void Load(void* keyword);

    CString name;
    int number = 0; // its line on the components page, from 1
    int units = 0;  // its place in the page's list of units, from 1
    // 0 normal, 1 single layer cohesive, 2 multi layer cohesive, 3 non-cohesive (from a file alone). What a
    // KindFilter goes by.
    int kind = 0;
};
