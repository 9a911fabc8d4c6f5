#include <gtest/gtest.h>

#include <memory>
#include <vector>

#include "SampleLine.h"
#include "VORCCP_Actor.h"
#include "VORModelChecker.h"
#include "VORSelectionContext.h"

namespace {
class CCPActorTest : public ::testing::Test {
 protected:
  void SetUp() override {
    VORCCP_Actor::OpenClipboard();
    VORSelectionContext::Set(cso, nullptr, nullptr, nullptr);
  }
  void TearDown() override {
    VORCCP_Actor::OpenClipboard();
    VORSelectionContext::Set(nullptr, nullptr, nullptr, nullptr);
  }
  VORBaseUnknown_var Child(VORBaseUnknown* parent, int position) {
    VORISPPChildManagement_var children{VORBaseUnknown_var(parent)};
    VORListValVORBaseUnknown_var* list = nullptr;
    children->GetChildren(list, "Activity");
    std::unique_ptr<VORListValVORBaseUnknown_var> owned(list);
    return position <= list->Size() ? (*list)[position] : VORBaseUnknown_var();
  }
  int ChildCount(VORBaseUnknown* parent) {
    return VORISPPChildManagement_var(VORBaseUnknown_var(parent))->GetNumberOfChildren();
  }
  void Select(std::initializer_list<VORBaseUnknown*> objects) {
    cso->Empty();
    for (VORBaseUnknown* o : objects)
      cso->AddElement(o);
  }
  void ExpectModelHolds() {
    std::vector<std::string> problems;
    EXPECT_TRUE(VORModelChecker::Check(document, problems))
        << (problems.empty() ? "" : problems.front());
  }

  VORProcess_var document = MakeSampleLine();
  VORBaseUnknown_var root = document->GetRootProcess();
  VORCSO_var cso = VORCSO_var::Adopt(new VORCSO());
  VORCCP_Actor_var actor = VORCCP_Actor_var::Adopt(new VORCCP_Actor());
};
}  // namespace

TEST_F(CCPActorTest, CopyAndPasteIntoMakeDeepCopiesThatBecomeTheSelection) {
  VORBaseUnknown_var s1 = Child(root, 1), s2 = Child(root, 2), s3 = Child(root, 3);
  Select({s1, s2});
  ASSERT_TRUE(actor->Initialize());
  actor->SetType(VORCCP_Actor::CopyType);
  actor->ReadCSO();
  ASSERT_TRUE(actor->CanCopy());
  ASSERT_TRUE(actor->Copy());
  VORListValVORBaseUnknown_var targets;
  targets.Append(VORBaseUnknown_var(VORMakePath(s3).get()));
  EXPECT_FALSE(actor->CanPaste(targets)) << "the type must be paste-into";
  actor->SetType(VORCCP_Actor::PasteIntoType);
  ASSERT_TRUE(actor->Paste(targets));

  ASSERT_EQ(ChildCount(s3), 2);
  ASSERT_EQ(cso->GetSize(), 2);
  VORBaseUnknown_var copy1 = Child(s3, 1), copy2 = Child(s3, 2);
  EXPECT_TRUE(cso->GetElement(1)->GetLeaf() == copy1.get());
  EXPECT_FALSE(copy1 == s1);
  std::unique_ptr<VORListValVORBaseUnknown_var> next;
  VORListValVORBaseUnknown_var* raw = nullptr;
  VORISPPFlowMgt_var(copy1)->GetNextActivities(raw);
  next.reset(raw);
  ASSERT_EQ(next->Size(), 1);
  EXPECT_TRUE((*next)[1] == copy2) << "the flow between copied nodes is copied";
  ExpectModelHolds();
}

TEST_F(CCPActorTest, RefusesTheRootNonActivitiesAndPastingIntoASource) {
  VORBaseUnknown_var s1 = Child(root, 1);
  Select({root});
  actor->ReadCSO();
  EXPECT_FALSE(actor->CanCopy());
  EXPECT_FALSE(actor->CanCut());
  Select({document->GetRootProduct()});
  actor->ReadCSO();
  EXPECT_FALSE(actor->CanCopy());
  Select({});
  actor->ReadCSO();
  EXPECT_FALSE(actor->Copy());

  Select({s1});
  actor->ReadCSO();
  ASSERT_TRUE(actor->Copy());
  actor->SetType(VORCCP_Actor::PasteIntoType);
  VORListValVORBaseUnknown_var intoItself;
  intoItself.Append(s1);
  EXPECT_FALSE(actor->Paste(intoItself));
  const std::string before = document->SaveToString();
  VORCCP_Actor::CloseClipboard();
  VORCCP_Actor::OpenClipboard();
  VORListValVORBaseUnknown_var intoRoot;
  intoRoot.Append(root);
  EXPECT_FALSE(actor->Paste(intoRoot)) << "re-opening empties the clipboard";
  EXPECT_EQ(document->SaveToString(), before);
}

TEST_F(CCPActorTest, CutRemovesTheActivitiesWithTheirFlowsAndDeselectsThem) {
  VORBaseUnknown_var s2 = Child(root, 2), s3 = Child(root, 3);
  Select({s2, s3});
  actor->SetType(VORCCP_Actor::CopyType);  // the grouping commands cut with type 1
  actor->ReadCSO();
  ASSERT_TRUE(actor->CanCut());
  ASSERT_TRUE(actor->Cut());
  EXPECT_EQ(ChildCount(root), 2);
  EXPECT_TRUE(cso->IsEmpty());
  std::unique_ptr<VORListValVORBaseUnknown_var> next;
  VORListValVORBaseUnknown_var* raw = nullptr;
  VORISPPFlowMgt_var(Child(root, 1))->GetNextActivities(raw);
  next.reset(raw);
  EXPECT_EQ(next->Size(), 0) << "S1's flow to the removed S2 is gone";
  ExpectModelHolds();
}
