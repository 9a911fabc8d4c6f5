#include <algorithm>
#include <vector>

#include <gtest/gtest.h>

#include "VORLists.h"
#include "VORScratchList.h"
#include "VORSmallSet.h"

namespace {

class Node : public VORBaseUnknown {
  VOR_DECLARE_CLASS(Node, VORBaseUnknown)
};

VORBaseUnknown_var MakeNode() {
  return VORBaseUnknown_var::Adopt(new Node());
}

TEST(ListTest, PositionsAreOneBasedAndLocateSaysZeroWhenAbsent) {
  VORRawCollint ints;
  for (int v : {10, 20, 30, 20})
    ints.Append(v);
  EXPECT_EQ(ints[1], 10);
  EXPECT_EQ(ints[4], 20);
  EXPECT_EQ(ints.Locate(20), 2);
  EXPECT_EQ(ints.Locate(20, 3), 4);
  EXPECT_EQ(ints.Locate(99), 0);
  EXPECT_EQ(ints.RemoveValue(20), 2);
  EXPECT_EQ(ints.Size(), 3);
  EXPECT_EQ(ints[2], 30);
  ints.RemovePosition(1);
  EXPECT_EQ(ints[1], 30);
  ints.InsertAt(1, 5);
  ints.Swap(1, 3);
  EXPECT_EQ(ints[1], 20);
  EXPECT_EQ(ints[3], 5);
  ints.RemoveAll();
  EXPECT_TRUE(ints.IsEmpty());
}

TEST(ListTest, HandleListsFindObjectsByIdentityNotByHandle) {
  VORBaseUnknown_var a = MakeNode(), b = MakeNode();
  VORListValVORBaseUnknown_var list;
  list.Append(a);
  list.Append(b);
  VORBaseUnknown_var sameAsA(a.get());
  EXPECT_EQ(list.Locate(sameAsA), 1);
  EXPECT_EQ(list.Locate(MakeNode()), 0);
}

TEST(ListTest, RemoveDuplicatesKeepsTheFirstOccurrenceInOrder) {
  VORBaseUnknown_var a = MakeNode(), b = MakeNode(), c = MakeNode();
  VORListValVORBaseUnknown_var list;
  for (auto& h : {b, a, b, c, a, b})
    list.Append(h);
  list.RemoveDuplicates();
  ASSERT_EQ(list.Size(), 3);
  EXPECT_TRUE(list[1] == b);
  EXPECT_TRUE(list[2] == a);
  EXPECT_TRUE(list[3] == c);

  VORListValVORUnicodeString names;
  for (const char* n : {"x", "y", "x"})
    names.Append(n);
  names.RemoveDuplicates();
  EXPECT_EQ(names.Size(), 2);

  // Short lists are compared in place, long ones through a set: both keep the same values.
  for (int length : {16, 17, 40}) {
    VORRawCollint numbers;
    for (int i = 0; i < length; ++i)
      numbers.Append((i * 7) % 11);
    numbers.RemoveDuplicates();
    std::vector<int> kept(numbers.begin(), numbers.end());
    std::vector<int> expected;
    for (int i = 0; i < length; ++i) {
      if (std::find(expected.begin(), expected.end(), (i * 7) % 11) == expected.end())
        expected.push_back((i * 7) % 11);
    }
    EXPECT_EQ(kept, expected) << length;
  }
}

TEST(ListTest, IntersectionFollowsTheReceiversOrderAndAppends) {
  VORBaseUnknown_var a = MakeNode(), b = MakeNode(), c = MakeNode(), d = MakeNode();
  VORListValVORBaseUnknown_var successors, nextLevel, result;
  for (auto& h : {c, a, d})
    successors.Append(h);
  for (auto& h : {a, b, c})
    nextLevel.Append(h);
  result.Append(b);
  successors.Intersection(nextLevel, result);
  ASSERT_EQ(result.Size(), 3);
  EXPECT_TRUE(result[1] == b);
  EXPECT_TRUE(result[2] == c);
  EXPECT_TRUE(result[3] == a);
}

TEST(ListTest, ListsHoldReferencesUntilEmptied) {
  Node* raw = new Node();
  VORBaseUnknown_var h = VORBaseUnknown_var::Adopt(raw);
  {
    VORListValVORBaseUnknown_var list;
    list.Append(h);
    list.Append(h);
    EXPECT_EQ(raw->RefCount(), 3u);
    list.RemoveNulls();
    EXPECT_EQ(list.Size(), 2);
  }
  EXPECT_EQ(raw->RefCount(), 1u);
}

TEST(ListDeathTest, PositionOutOfRangeIsFatalWithTheCondition) {
  VORRawCollint ints;
  ints.Append(1);
  EXPECT_DEATH(ints[0], "AssertionFailed:position >= 1");
  EXPECT_DEATH(ints.RemovePosition(2), "AssertionFailed:position >= 1 && position <= Size\\(\\)");
}

TEST(SmallSetTest, AnswersAlikeInlineAndOnceItHashes) {
  VORSmallSet<int, 4> set;
  std::vector<int> inserted;
  for (int i = 0; i < 30; ++i) {
    const int value = (i * 5) % 13;
    const bool fresh = std::find(inserted.begin(), inserted.end(), value) == inserted.end();
    EXPECT_EQ(set.Insert(value), fresh) << i;
    if (fresh)
      inserted.push_back(value);
    EXPECT_TRUE(set.Contains(value));
    EXPECT_EQ(set.Size(), inserted.size());
  }
  EXPECT_FALSE(set.Contains(99));
}

TEST(ScratchListTest, NestedBorrowersGetTheirOwnEmptyListAndReleaseWhatTheyHeld) {
  VORBaseUnknown_var a = MakeNode();
  VORListValVORBaseUnknown_var* first = nullptr;
  {
    VORScratchList outer;
    first = &*outer;
    outer->Append(a);
    {
      VORScratchList inner;
      EXPECT_NE(&*inner, &*outer);
      EXPECT_TRUE(inner->IsEmpty());
      inner->Append(a);
    }
    EXPECT_EQ(outer->Size(), 1);
  }
  // What the borrowers held is released with their scope; a list given back comes back empty.
  EXPECT_EQ(a->AddRef(), 2u);
  a->Release();
  VORScratchList again;
  EXPECT_TRUE(again->IsEmpty());
  EXPECT_EQ(&*again, first) << "the most recently returned list is reused";
}

}  // namespace
