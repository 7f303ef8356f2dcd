#pragma once

#include "document/lists/record_list.h"

class AD_ST_Init_Cond_data;

// The table of widths and layer heights of one layer record, which owns it.
class KOTA0_AD_API CAdderList : public RecordList<AD_ST_Init_Cond_data> {
public:
    CAdderList();
    ~CAdderList() override;

    // Unlike the other lists', given its own section.
    void Load(void* section) override;
};
