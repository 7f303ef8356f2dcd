#include "document/lists/record_lists.h"

#include "document/lists/component_filter.h"
#include "document/records/cohesive.h"
#include "document/records/layer.h"
#include "document/records/non_cohesive.h"
#include "platform/framework/message_box.h"
#include "platform/kvs/kvs.h"
#include "resources/ids.h"
#include "resources/module.h"

CInitList::CInitList() : RecordList("InitList") {}
CInitList::~CInitList() = default;

CInitStraList::CInitStraList() : RecordList("InitStratified") {}
CInitStraList::~CInitStraList() = default;

CNonCohesList::CNonCohesList() : RecordList("NonCohesList") {}
CNonCohesList::~CNonCohesList() = default;

CDecayList::CDecayList() : RecordList("DecayList") {}
CDecayList::~CDecayList() = default;

CDispersList::CDispersList() : RecordList("DispersList") {}
CDispersList::~CDispersList() = default;

CK32DispersList::CK32DispersList() : RecordList("K32DispersList") {}
CK32DispersList::~CK32DispersList() = default;

CIceDataList::CIceDataList() : RecordList("IceDataList") {}
CIceDataList::~CIceDataList() = default;

CGlobalList::CGlobalList() : RecordList("Cohesive_ST") {}
CGlobalList::~CGlobalList() = default;

CCompList::CCompList() : RecordList("CompList") {}
CCompList::~CCompList() = default;

CBoundList::CBoundList() : RecordList("BoundList") {}
CBoundList::~CBoundList() = default;

CK32BoundList::CK32BoundList() : RecordList("K32BoundList") {}
CK32BoundList::~CK32BoundList() = default;

CLayerList::CLayerList() : RecordList("LayerList") {}
CLayerList::~CLayerList() = default;

namespace {

constexpr const char* cohesiveRecordSection = "Cohesive_ST_Record";
constexpr const char* adderListSection = "AdderList";
constexpr int notWritten = -1; // a record's componentNum

// A component that first occurs in the last record is not examined, and the name that is told is that of the
// last record's component, not of the one that lacks its global line: both are how the check is meant.
template <class Record>
int checkGlobalsPresent(const RecordList<Record>& list, const CCompList* components, int kindFilter,
                        UINT message) {
    CList<int, int> seen;
    POSITION position = list.GetHeadPosition();
    while (position) {
        const Record* record = list.NextRecord(position);
        if (seen.Find(record->componentNum))
            continue;
        if (!position)
            return 1;
        seen.AddTail(record->componentNum);
        if (record->componentNum == 0)
            continue;
        bool anyGlobal = record->isGlobal != 0;
        const Record* last = record;
        for (POSITION later = position; later;) {
            last = list.NextRecord(later);
            if (last->componentNum == record->componentNum)
                anyGlobal = anyGlobal || last->isGlobal;
        }
        if (anyGlobal)
            continue;
        const CString name =
            components ? GetFilteredCompName(*components, last->componentNum, kindFilter) : CString();
        CString text;
        text.Format(kota0AdModule().string(message), static_cast<const char*>(name));
        AfxMessageBox(text);
        return 0;
    }
    return 1;
}

} // namespace

int CNonCohesList::CheckGlobalsPresent(CCompList* components) {
    return checkGlobalsPresent(*this, components, NonCohesiveKinds, StringId::NonCohesiveGlobalsMissing);
}

int CGlobalList::CheckGlobalsPresent(CCompList* components) {
    return checkGlobalsPresent(*this, components, CohesiveKinds, StringId::SedimentGlobalsMissing);
}

void CGlobalList::Save(void* file) {
    kvsAddSection(file, Section());
    for (POSITION position = GetHeadPosition(); position;) {
        AD_Global_Const* record = NextRecord(position);
        kvsAddSection(file, cohesiveRecordSection);
        if (record->componentNum != notWritten)
            record->Save(file);
        kvsEndSection(file);
    }
    kvsEndSection(file);
}

void CGlobalList::Load(void* target) {
    void* const section = kvsSectionByNameNum(target, Section(), 1);
    for (int n = 1; void* const entry = kvsSectionByNameNum(section, cohesiveRecordSection, n); ++n) {
        auto* record = new AD_Global_Const;
        record->Load(entry);
        AddTail(record);
    }
}

void CLayerList::Save(void* file) {
    kvsAddSection(file, Section());
    for (POSITION position = GetHeadPosition(); position;) {
        AD_Cohesiv_ST_Init_Cond* record = NextRecord(position);
        if (record->componentNum == notWritten)
            continue;
        record->Save(file);
        record->adderList.Save(file);
    }
    kvsEndSection(file);
}

void CLayerList::Load(void* target) {
    void* const section = kvsSectionByNameNum(target, Section(), 1);
    for (int n = 1; void* const keyword = kvsKeywordByNameNum(section, dataKeyword, n); ++n) {
        auto* record = new AD_Cohesiv_ST_Init_Cond;
        record->Load(keyword);
        record->adderList.Load(kvsSectionByNameNum(section, adderListSection, n));
        AddTail(record);
    }
}

int CLayerList::RemoveEmptyLines(int* changed) {
    RecordList::RemoveEmptyLines(changed);
    for (POSITION position = GetHeadPosition(); position;)
        NextRecord(position)->adderList.RemoveEmptyLines(changed);
    return 1;
}
