#pragma once

#include "platform/framework/object.h"

namespace kota {

// What every node of a list begins with.
struct ListNode {
    ListNode* next = nullptr;
    ListNode* previous = nullptr;
};

} // namespace kota

// A place in a list; null is none. It stays valid until its element is removed.
using POSITION = kota::ListNode*;

// A doubly linked list of values, its nodes allocated in blocks. Compiled in the platform alone, for the
// element types that the system uses: CObject* (as CObList) and int.
//
// A null position raises the invalid-argument failure in every operation that takes one, and so does the
// position of an element that was removed, for as long as no new element took its room. Taking from an empty
// list raises it too. A position of another list is the caller's mistake, and mostly not seen.
template <class Type, class Argument>
class KOTA_API CList : public CObject {
public:
    explicit CList(int blockSize = 10);
    ~CList() override;

    int GetCount() const;
    bool IsEmpty() const;
    // Null when the list is empty.
    POSITION GetHeadPosition() const;
    POSITION GetTailPosition() const;
    Type GetHead() const;
    Type GetTail() const;
    Type GetAt(POSITION position) const;
    void SetAt(POSITION position, Argument value);
    // Give the value at `position` and move `position` to the neighbour, to null past the end.
    Type GetNext(POSITION& position) const;
    Type GetPrev(POSITION& position) const;
    // The first place from the head, or behind `after`, that holds `value`; null when there is none.
    POSITION Find(Argument value, POSITION after = nullptr) const;
    // The place of a zero-based index; null when the list is shorter.
    POSITION FindIndex(int index) const;

    // Each gives the place of the new element.
    POSITION AddHead(Argument value);
    POSITION AddTail(Argument value);
    POSITION InsertBefore(POSITION position, Argument value);
    POSITION InsertAfter(POSITION position, Argument value);
    Type RemoveHead();
    Type RemoveTail();
    void RemoveAt(POSITION position);
    void RemoveAll();

private:
    struct Node;
    struct Block;

    Node* Checked(POSITION position, const char* operation) const;
    POSITION InsertBetween(POSITION previous, POSITION next, Argument value);
    void AddBlock();
    void Unlink(POSITION position);

    POSITION head_ = nullptr;
    POSITION tail_ = nullptr;
    POSITION free_ = nullptr;
    Block* blocks_ = nullptr;
    int count_ = 0;
    int blockSize_;
};

// A list of objects. It does not own them: removing an element leaves the object alone.
class KOTA_API CObList : public CList<CObject*, CObject*> {
    DECLARE_DYNAMIC(CObList)
public:
    explicit CObList(int blockSize = 10);
    ~CObList() override;
};
