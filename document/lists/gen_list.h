#pragma once

#include "document/export.h"
#include "platform/framework/list.h"

// The base of a document's record lists. A list owns the records that are added to it, made by `new`, which
// DeleteAll and RemoveEmptyLines delete; its destructor does not, so its owner calls DeleteAll first. A
// record that is taken out in another way is its taker's to delete. List order is the order on screen and on
// file.
class KOTA0_AD_API CGenList : public CObList {
public:
    CGenList();
    ~CGenList() override;

    // Adds the list's section to a file that is being built, into the open target or section.
    virtual void Save(void* file) = 0;
    // Adds what the list's section holds at the tail; a missing section or keyword adds nothing. The handle
    // is that of the target, or of the section around.
    virtual void Load(void* targetOrSection) = 0;
    // Removes and deletes all records.
    virtual void DeleteAll() = 0;
    // Removes and deletes the records that are not filled in far enough to mean anything. If there were any
    // and `*changed`, which must not be null, is 0, it becomes 1. Always gives 1.
    virtual int RemoveEmptyLines(int* changed) = 0;
};
