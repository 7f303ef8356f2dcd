#pragma once

#include "document/export.h"
#include "platform/framework/object.h"
#include "platform/framework/text.h"

// One transported component of the document.
class KOTA0_AD_API AD_Component : public CObject {
public:
    AD_Component();
    ~AD_Component() override;

    virtual void Save(void* file);
    virtual void Load(void* keyword);

    CString name;
    int number = 0; // its line on the components page, from 1
    int units = 0;  // its place in the page's list of units, from 1
    int kind = 0;   // what the pages' component filters go by
};
