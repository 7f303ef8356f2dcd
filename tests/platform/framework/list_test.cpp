#include "platform/framework/list.h"

#include "platform/framework/exception.h"

#include <gtest/gtest.h>

#include <vector>

namespace {

std::vector<int> valuesOf(const CList<int, int>& list) {
    std::vector<int> values;
    for (POSITION position = list.GetHeadPosition(); position;)
        values.push_back(list.GetNext(position));
    return values;
}

TEST(List, KeepsTheOrderOfInsertion) {
    CList<int, int> list;
    list.AddTail(2);
    const POSITION three = list.AddTail(3);
    list.AddHead(1);
    list.InsertAfter(three, 5);
    list.InsertBefore(list.GetTailPosition(), 4);

    EXPECT_EQ(valuesOf(list), (std::vector{1, 2, 3, 4, 5}));
    EXPECT_EQ(list.GetCount(), 5);
    EXPECT_EQ(list.GetHead(), 1);
    EXPECT_EQ(list.GetTail(), 5);
}

TEST(List, WalksBackwards) {
    CList<int, int> list;
    for (int value = 1; value <= 3; ++value)
        list.AddTail(value);
    std::vector<int> values;

    for (POSITION position = list.GetTailPosition(); position;)
        values.push_back(list.GetPrev(position));

    EXPECT_EQ(values, (std::vector{3, 2, 1}));
}

TEST(List, FindsAValueFromTheHeadOrBehindAPosition) {
    CList<int, int> list;
    const POSITION first = list.AddTail(7);
    list.AddTail(8);
    const POSITION second = list.AddTail(7);

    EXPECT_EQ(list.Find(7), first);
    EXPECT_EQ(list.Find(7, first), second);
    EXPECT_EQ(list.Find(7, second), nullptr);
    EXPECT_EQ(list.Find(9), nullptr);
}

TEST(List, GivesThePositionOfAnIndex) {
    CList<int, int> list;
    list.AddTail(10);
    const POSITION second = list.AddTail(11);

    EXPECT_EQ(list.FindIndex(1), second);
    EXPECT_EQ(list.FindIndex(2), nullptr);
    EXPECT_EQ(list.FindIndex(-1), nullptr);
}

TEST(List, ReusesTheRoomOfRemovedElements) {
    CList<int, int> list(2);
    for (int round = 0; round < 100; ++round) {
        list.AddTail(round);
        list.AddTail(round);
        list.RemoveHead();
    }

    EXPECT_EQ(list.GetCount(), 100);
    EXPECT_EQ(list.RemoveTail(), 99);
    EXPECT_EQ(list.RemoveHead(), 50);
    list.RemoveAll();
    EXPECT_TRUE(list.IsEmpty());
    EXPECT_EQ(list.GetHeadPosition(), nullptr);
}

TEST(List, ANullPositionIsTheInvalidArgumentFailure) {
    CList<int, int> list;
    list.AddTail(1);
    POSITION none = nullptr;

    EXPECT_THROW(list.GetAt(none), CInvalidArgException);
    EXPECT_THROW(list.GetNext(none), CInvalidArgException);
    EXPECT_THROW(list.GetPrev(none), CInvalidArgException);
    EXPECT_THROW(list.SetAt(none, 2), CInvalidArgException);
    EXPECT_THROW(list.RemoveAt(none), CInvalidArgException);
    EXPECT_THROW(list.InsertBefore(none, 2), CInvalidArgException);
    EXPECT_THROW(list.InsertAfter(none, 2), CInvalidArgException);
    EXPECT_EQ(valuesOf(list), std::vector{1});
}

TEST(List, ARemovedPositionIsTheInvalidArgumentFailure) {
    CList<int, int> list;
    const POSITION first = list.AddTail(1);
    const POSITION second = list.AddTail(2);
    list.AddTail(3);
    list.RemoveAt(first);
    list.RemoveAt(second);

    EXPECT_THROW(list.GetAt(first), CInvalidArgException);
    EXPECT_THROW(list.RemoveAt(second), CInvalidArgException);
    EXPECT_EQ(valuesOf(list), std::vector{3});
}

TEST(List, TheRemovedPositionOfTheLastElementIsTheInvalidArgumentFailure) {
    CList<int, int> list;
    const POSITION only = list.AddTail(1);
    list.RemoveAt(only);

    EXPECT_THROW(list.GetAt(only), CInvalidArgException);
    EXPECT_THROW(list.RemoveAt(only), CInvalidArgException);
    EXPECT_TRUE(list.IsEmpty());
}

TEST(List, PositionsOfAnEmptiedListAreTheInvalidArgumentFailure) {
    CList<int, int> list;
    const POSITION first = list.AddTail(1);
    const POSITION second = list.AddTail(2);
    list.RemoveAll();

    EXPECT_THROW(list.GetAt(first), CInvalidArgException);
    EXPECT_THROW(list.GetAt(second), CInvalidArgException);
}

TEST(List, AnotherListsHeadIsTheInvalidArgumentFailure) {
    CList<int, int> list;
    CList<int, int> other;
    list.AddTail(1);
    const POSITION foreign = other.AddTail(2);

    EXPECT_THROW(list.RemoveAt(foreign), CInvalidArgException);
    EXPECT_EQ(other.GetCount(), 1);
}

TEST(List, TakingFromAnEmptyListIsTheInvalidArgumentFailure) {
    CList<int, int> list;

    EXPECT_THROW(list.GetHead(), CInvalidArgException);
    EXPECT_THROW(list.GetTail(), CInvalidArgException);
    EXPECT_THROW(list.RemoveHead(), CInvalidArgException);
    EXPECT_THROW(list.RemoveTail(), CInvalidArgException);
}

TEST(List, AListOfObjectsDoesNotDeleteThem) {
    CObject object;
    {
        CObList list;
        list.AddTail(&object);
        EXPECT_TRUE(list.IsKindOf(RUNTIME_CLASS(CObList)));
    }

    EXPECT_TRUE(object.IsKindOf(RUNTIME_CLASS(CObject)));
}

} // namespace
