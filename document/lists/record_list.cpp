#include "document/lists/record_list.h"

#include "document/records/boundary.h"
#include "document/records/cohesive.h"
#include "document/records/component.h"
#include "document/records/decay.h"
#include "document/records/dispersion.h"
#include "document/records/ice_data.h"
#include "document/records/init_cond.h"
#include "document/records/layer.h"
#include "document/records/non_cohesive.h"
#include "document/records/width_height.h"
#include "platform/kvs/kvs.h"

namespace {

bool lacksPlace(const AD_Comp_RiverPos& record) {
    return record.riverName.IsEmpty() || record.chainage == notGiven;
}

// What makes a line incomplete: for most records the component, or the place of a local line.
bool isIncomplete(const AD_Comp_RiverPos& record) {
    return record.componentNum == 0 || (!record.isGlobal && lacksPlace(record));
}

// These have no component and are always local, whatever their flag says.
bool isIncomplete(const AD_Dispersion& record) {
    return lacksPlace(record);
}
bool isIncomplete(const AD_Dispersion_K32& record) {
    return lacksPlace(record);
}
bool isIncomplete(const AD_Ice_Data& record) {
    return lacksPlace(record);
}
bool isIncomplete(const AD_Bondary& record) {
    return lacksPlace(record);
}
bool isIncomplete(const AD_Boundary_K32& record) {
    return lacksPlace(record);
}

bool isIncomplete(const AD_Component& record) {
    return record.name.IsEmpty();
}

bool isIncomplete(const AD_ST_Init_Cond_data& record) {
    return record.layerHeight == notGiven || record.width == notGiven;
}

} // namespace

template <class Record>
RecordList<Record>::RecordList(const char* section) : section_(section) {}

template <class Record>
RecordList<Record>::~RecordList() = default;

template <class Record>
void RecordList<Record>::Save(void* file) {
    kvsAddSection(file, section_);
    for (POSITION position = GetHeadPosition(); position;)
        NextRecord(position)->Save(file);
    kvsEndSection(file);
}

template <class Record>
void RecordList<Record>::Load(void* targetOrSection) {
    LoadKeywords(kvsSectionByNameNum(targetOrSection, section_, 1));
}

template <class Record>
void RecordList<Record>::LoadKeywords(void* section) {
    void* keyword = kvsKeywordByNameNum(section, dataKeyword, 1);
    for (int n = 2; keyword; ++n) {
        auto* record = new Record;
        record->Load(keyword);
        AddTail(record);
        keyword = kvsKeywordByNameNum(section, dataKeyword, n);
    }
}

template <class Record>
void RecordList<Record>::DeleteAll() {
    while (!IsEmpty())
        delete RemoveTail();
}

template <class Record>
int RecordList<Record>::RemoveEmptyLines(int* changed) {
    for (POSITION position = GetHeadPosition(); position;) {
        const POSITION at = position;
        const Record* record = NextRecord(position);
        if (!isIncomplete(*record))
            continue;
        RemoveAt(at);
        delete record;
        if (*changed == 0)
            *changed = 1;
    }
    return 1;
}

template class RecordList<AD_Init_cond>;
template class RecordList<AD_Init_cond_stra>;
template class RecordList<AD_NonCohesiv_ST_Data>;
template class RecordList<AD_Decay>;
template class RecordList<AD_Dispersion>;
template class RecordList<AD_Dispersion_K32>;
template class RecordList<AD_Ice_Data>;
template class RecordList<AD_Global_Const>;
template class RecordList<AD_Component>;
template class RecordList<AD_Bondary>;
template class RecordList<AD_Boundary_K32>;
template class RecordList<AD_Cohesiv_ST_Init_Cond>;
template class RecordList<AD_ST_Init_Cond_data>;
