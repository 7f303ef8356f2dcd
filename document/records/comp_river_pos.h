#pragma once

#include "document/export.h"
#include "platform/framework/object.h"
#include "platform/framework/text.h"

// Marks a value that was not given: a blank chainage, width or layer height. Compared for exact equality.
inline constexpr double notGiven = 1e10;

// The keyword of a record in its list's section.
inline constexpr const char* dataKeyword = "DATA";

// The base of all records that hold a value at one place of a river, or everywhere. Values are in base units;
// Save and Load convert nothing.
class KOTA0_AD_API AD_Comp_RiverPos : public CObject {
public:
    AD_Comp_RiverPos();
    ~AD_Comp_RiverPos() override;

    // Adds the record's keyword to the open section of a file that is being built.
    virtual void Save(void* file);
    // Reads the record from its keyword (AD_Global_Const: from its section).
    virtual void Load(void* keyword);
    // Adds the location triple to the open keyword: global or not, river name, chainage; a global record's
    // name and chainage as "" and 0.0.
    virtual void SaveLocation(void* file);

    // The members below, by the names of the contract.
    int GetComponentNum() const;
    CString GetRiverName() const;
    void SetRiverName(CString name);
    double GetChainage() const;
    void SetChainage(double value);

    // 0: no component chosen; n: the n-th component that the record's page offers, by the class's KindFilter
    // (GetFilteredCompName gives its name); -1 marks a cohesive or a layer record that is not to be written.
    int componentNum = 0;
    // Not 0: the record holds everywhere, and riverName and chainage do not count.
    int isGlobal = 0;
    CString riverName;
    double chainage = 0.0; // m; notGiven for a blank cell
};
