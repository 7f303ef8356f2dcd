#pragma once

#include "document/kota0_ad_doc.h"
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

#include <stdexcept>
#include <vector>

namespace kota::test {

// What a test needs of a document and its lists, with all record classes.

// A record list that deletes its records when it goes.
template <class List>
class Owned : public List {
public:
    ~Owned() override { List::DeleteAll(); }
};

// A document that is emptied before it goes.
class OwnedDocument : public CKota0_adDoc {
public:
    ~OwnedDocument() override { CKota0_adDoc::DeleteContents(); }
};

// Adds a new record, as its constructor makes it, at the tail.
template <class Record>
Record& addTo(RecordList<Record>& list) {
    auto* record = new Record;
    list.AddTail(record);
    return *record;
}

// Adds a local record of a component.
template <class Record>
Record& addLocal(RecordList<Record>& list, int component, const char* river, double chainage) {
    Record& record = addTo(list);
    record.componentNum = component;
    record.isGlobal = 0;
    record.riverName = river;
    record.chainage = chainage;
    return record;
}

// Adds a global record of a component.
template <class Record>
Record& addGlobal(RecordList<Record>& list, int component) {
    Record& record = addTo(list);
    record.componentNum = component;
    record.isGlobal = 1;
    record.chainage = 0.0;
    return record;
}

template <class List>
void addComponent(List& list, int number, const char* name, int kind) {
    AD_Component& component = addTo(list);
    component.number = number;
    component.name = name;
    component.units = 1;
    component.kind = kind;
}

// The twelve lists in the document's order.
inline std::vector<const CObList*> allLists(const CKota0_adDoc& document) {
    return {&document.initList,    &document.initStraList,   &document.nonCohesList, &document.decayList,
            &document.dispersList, &document.k32DispersList, &document.iceDataList,  &document.globalList,
            &document.compList,    &document.boundList,      &document.k32BoundList, &document.layerList};
}

// The records in list order.
template <class Record>
std::vector<Record*> recordsOf(const RecordList<Record>& list) {
    std::vector<Record*> records;
    for (POSITION position = list.GetHeadPosition(); position;)
        records.push_back(list.NextRecord(position));
    return records;
}

// The n-th record, from 1. A shorter list is a std::out_of_range.
template <class Record>
Record& recordOf(const RecordList<Record>& list, std::size_t n = 1) {
    return *recordsOf(list).at(n - 1);
}

} // namespace kota::test
