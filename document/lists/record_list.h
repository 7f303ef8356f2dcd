#pragma once

#include "document/lists/gen_list.h"

// A list of one class of records, in a section of its own with a keyword a record. Compiled in the plug-in
// alone, for the record classes of the document.
template <class Record>
class KOTA0_AD_API RecordList : public CGenList {
public:
    ~RecordList() override;

    void Save(void* file) override;
    void Load(void* targetOrSection) override;
    void DeleteAll() override;
    int RemoveEmptyLines(int* changed) override;

    // GetNext, with the record's type.
    Record* NextRecord(POSITION& position) const { return static_cast<Record*>(GetNext(position)); }

protected:
    // `section` is the section's name and must outlive the list.
    explicit RecordList(const char* section);

    const char* Section() const { return section_; }
    // Adds a record for each keyword of the list's own section.
    void LoadKeywords(void* section);

private:
    const char* section_;
};
