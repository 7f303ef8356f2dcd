#pragma once

#include "document/lists/record_list.h"

class AD_Bondary;
class AD_Boundary_K32;
class AD_Cohesiv_ST_Init_Cond;
class AD_Component;
class AD_Decay;
class AD_Dispersion;
class AD_Dispersion_K32;
class AD_Global_Const;
class AD_Ice_Data;
class AD_Init_cond;
class AD_Init_cond_stra;
class AD_NonCohesiv_ST_Data;

// The twelve lists of a document, in the document's order.

class KOTA0_AD_API CInitList : public RecordList<AD_Init_cond> {
public:
    CInitList();
    ~CInitList() override;
};

class KOTA0_AD_API CInitStraList : public RecordList<AD_Init_cond_stra> {
public:
    CInitStraList();
    ~CInitStraList() override;
};

class CCompList;

class KOTA0_AD_API CNonCohesList : public RecordList<AD_NonCohesiv_ST_Data> {
public:
    CNonCohesList();
    ~CNonCohesList() override;

    // Whether every component used in the list has a global line; if not, tells the user which one has not
    // and gives 0. Lines without a component, and a component that first occurs in the last line, are not
    // looked at.
    virtual int CheckGlobalsPresent(CCompList* components);
};

class KOTA0_AD_API CDecayList : public RecordList<AD_Decay> {
public:
    CDecayList();
    ~CDecayList() override;
};

class KOTA0_AD_API CDispersList : public RecordList<AD_Dispersion> {
public:
    CDispersList();
    ~CDispersList() override;
};

class KOTA0_AD_API CK32DispersList : public RecordList<AD_Dispersion_K32> {
public:
    CK32DispersList();
    ~CK32DispersList() override;
};

class KOTA0_AD_API CIceDataList : public RecordList<AD_Ice_Data> {
public:
    CIceDataList();
    ~CIceDataList() override;
};

// Each record is a section of its own inside the list's.
class KOTA0_AD_API CGlobalList : public RecordList<AD_Global_Const> {
public:
    CGlobalList();
    ~CGlobalList() override;

    // A record with component -1 leaves an empty section.
    void Save(void* file) override;
    void Load(void* target) override;

    // Whether every component used in the list has a global line; if not, tells the user which one has not
    // and gives 0. Lines without a component, and a component that first occurs in the last line, are not
    // looked at.
    virtual int CheckGlobalsPresent(CCompList* components);
};

class KOTA0_AD_API CCompList : public RecordList<AD_Component> {
public:
    CCompList();
    ~CCompList() override;
};

// The document neither saves nor loads the two boundary lists: they live while it is open.
class KOTA0_AD_API CBoundList : public RecordList<AD_Bondary> {
public:
    CBoundList();
    ~CBoundList() override;
};

class KOTA0_AD_API CK32BoundList : public RecordList<AD_Boundary_K32> {
public:
    CK32BoundList();
    ~CK32BoundList() override;
};

// Each record's keyword is followed by the section of its table: the n-th table belongs to the n-th record.
class KOTA0_AD_API CLayerList : public RecordList<AD_Cohesiv_ST_Init_Cond> {
public:
    CLayerList();
    ~CLayerList() override;

    // A record with component -1 is left out, its table with it.
    void Save(void* file) override;
    void Load(void* target) override;
    // Cleans the tables of the records that stay as well.
    int RemoveEmptyLines(int* changed) override;
};
