#include "platform/framework/list.h"

#include "platform/framework/exception.h"

#include <new>
#include <type_traits>
#include <utility>

template <class Type, class Argument>
struct CList<Type, Argument>::Node : kota::ListNode {
    Type value{};
};

// Nodes allocated together, behind this head. They stay for new elements until the list goes.
template <class Type, class Argument>
struct CList<Type, Argument>::Block {
    Block* older;

    Node* nodes() { return reinterpret_cast<Node*>(this + 1); }
};

template <class Type, class Argument>
CList<Type, Argument>::CList(int blockSize) : blockSize_(blockSize > 0 ? blockSize : 1) {}

template <class Type, class Argument>
CList<Type, Argument>::~CList() {
    while (blocks_)
        ::operator delete(std::exchange(blocks_, blocks_->older));
}

template <class Type, class Argument>
int CList<Type, Argument>::GetCount() const {
    return count_;
}

template <class Type, class Argument>
bool CList<Type, Argument>::IsEmpty() const {
    return count_ == 0;
}

template <class Type, class Argument>
POSITION CList<Type, Argument>::GetHeadPosition() const {
    return head_;
}

template <class Type, class Argument>
POSITION CList<Type, Argument>::GetTailPosition() const {
    return tail_;
}

template <class Type, class Argument>
Type CList<Type, Argument>::GetHead() const {
    return Checked(head_, "GetHead")->value;
}

template <class Type, class Argument>
Type CList<Type, Argument>::GetTail() const {
    return Checked(tail_, "GetTail")->value;
}

template <class Type, class Argument>
Type CList<Type, Argument>::GetAt(POSITION position) const {
    return Checked(position, "GetAt")->value;
}

template <class Type, class Argument>
void CList<Type, Argument>::SetAt(POSITION position, Argument value) {
    Checked(position, "SetAt")->value = value;
}

template <class Type, class Argument>
Type CList<Type, Argument>::GetNext(POSITION& position) const {
    const Node* node = Checked(position, "GetNext");
    position = node->next;
    return node->value;
}

template <class Type, class Argument>
Type CList<Type, Argument>::GetPrev(POSITION& position) const {
    const Node* node = Checked(position, "GetPrev");
    position = node->previous;
    return node->value;
}

template <class Type, class Argument>
POSITION CList<Type, Argument>::Find(Argument value, POSITION after) const {
    POSITION position = after ? Checked(after, "Find")->next : head_;
    while (position && static_cast<Node*>(position)->value != value)
        position = position->next;
    return position;
}

template <class Type, class Argument>
POSITION CList<Type, Argument>::FindIndex(int index) const {
    if (index < 0 || index >= count_)
        return nullptr;
    POSITION position = head_;
    while (index-- > 0)
        position = position->next;
    return position;
}

template <class Type, class Argument>
POSITION CList<Type, Argument>::AddHead(Argument value) {
    return InsertBetween(nullptr, head_, value);
}

template <class Type, class Argument>
POSITION CList<Type, Argument>::AddTail(Argument value) {
    return InsertBetween(tail_, nullptr, value);
}

template <class Type, class Argument>
POSITION CList<Type, Argument>::InsertBefore(POSITION position, Argument value) {
    return InsertBetween(Checked(position, "InsertBefore")->previous, position, value);
}

template <class Type, class Argument>
POSITION CList<Type, Argument>::InsertAfter(POSITION position, Argument value) {
    return InsertBetween(position, Checked(position, "InsertAfter")->next, value);
}

template <class Type, class Argument>
Type CList<Type, Argument>::RemoveHead() {
    const Type value = GetHead();
    Unlink(head_);
    return value;
}

template <class Type, class Argument>
Type CList<Type, Argument>::RemoveTail() {
    const Type value = GetTail();
    Unlink(tail_);
    return value;
}

template <class Type, class Argument>
void CList<Type, Argument>::RemoveAt(POSITION position) {
    Unlink(Checked(position, "RemoveAt"));
}

template <class Type, class Argument>
void CList<Type, Argument>::RemoveAll() {
    while (head_)
        Unlink(head_);
}

// A node that is in the list is what its neighbour, or the list's head, points at.
template <class Type, class Argument>
typename CList<Type, Argument>::Node* CList<Type, Argument>::Checked(POSITION position,
                                                                     const char* operation) const {
    if (!position || (position->previous ? position->previous->next : head_) != position)
        AfxThrowInvalidArgException(operation);
    return static_cast<Node*>(position);
}

template <class Type, class Argument>
POSITION CList<Type, Argument>::InsertBetween(POSITION previous, POSITION next, Argument value) {
    if (!free_)
        AddBlock();
    Node* node = static_cast<Node*>(free_);
    free_ = node->next;
    node->value = value;
    node->next = next;
    node->previous = previous;
    (previous ? previous->next : head_) = node;
    (next ? next->previous : tail_) = node;
    ++count_;
    return node;
}

template <class Type, class Argument>
void CList<Type, Argument>::AddBlock() {
    static_assert(std::is_trivially_destructible_v<Node> && sizeof(Block) % alignof(Node) == 0);
    void* const room = ::operator new(sizeof(Block) + blockSize_ * sizeof(Node));
    blocks_ = new (room) Block{blocks_};
    int i = blockSize_;
    do {
        Node* node = new (blocks_->nodes() + --i) Node;
        node->next = free_;
        free_ = node;
    } while (i > 0);
}

template <class Type, class Argument>
void CList<Type, Argument>::Unlink(POSITION position) {
    --count_;
    (position->previous ? position->previous->next : head_) = position->next;
    (position->next ? position->next->previous : tail_) = position->previous;
    position->previous = position; // its own neighbour, which points elsewhere: seen by Checked
    position->next = free_;
    free_ = position;
}

template class CList<CObject*, CObject*>;
template class CList<int, int>;

IMPLEMENT_DYNAMIC(CObList, CObject, kota::platformModule)

CObList::CObList(int blockSize) : CList(blockSize) {}
CObList::~CObList() = default;
