#include "document/lists/adder_list.h"

#include "document/records/width_height.h"

CAdderList::CAdderList() : RecordList("AdderList") {}
CAdderList::~CAdderList() = default;

void CAdderList::Load(void* section) {
    LoadKeywords(section);
}
