// Dragging list items onto other activities, rule by rule, on the model alone: the checks with
// their texts, the moves of inputs, outputs and resources, the item options dialog, and that a
// refused or failed reassignment leaves the document as it was.
#include <memory>

#include "QELIListZitBltItemDD.h"
#include "VORDlgDialog.h"
#include "VORDlgSelectorList.h"
#include "VORISPPActivity.h"
#include "VORISPPFlowMgt.h"
#include "VORISPPItemMgt.h"
#include "VORISPPResourceManagement.h"
#include "VORISpecObject.h"
#include "VORModelChecker.h"
#include "VORUndoHistory.h"
#include "ZitBltListTestSupport.h"

namespace {

// A station that offers no item management (its item list cannot be read).
class StationWithoutItems : public virtual VORISPPActivity, public virtual VORISpecObject {
 public:
  HRESULT GetName(VORUnicodeString& name) override {
    name = "Bare";
    return S_OK;
  }
  HRESULT GetActivityType(VORString& type) override {
    type = "BIWActivityStation";
    return S_OK;
  }
  VORString GetActivityType() override { return "BIWActivityStation"; }
  HRESULT GetFatherActivity(VORBaseUnknown_var&) override { return S_FALSE; }
  HRESULT GetRootActivity(VORBaseUnknown_var&) override { return E_FAIL; }
  HRESULT GetTypeName(VORUnicodeString& type) override {
    type = "BIWActivityStation";
    return S_OK;
  }
  VORString GetId() override { return "Bare"; }
  VORProcess* GetDocument() override { return nullptr; }
};

std::vector<std::string> Names(VORListValVORBaseUnknown_var* list) {
  std::vector<std::string> names;
  if (list != nullptr) {
    for (const VORBaseUnknown_var& entry : *list)
      names.push_back(ItemText(entry));
    delete list;
  }
  return names;
}

std::vector<std::string> Inputs(VORBaseUnknown* activity) {
  VORListValVORBaseUnknown_var* list = nullptr;
  VORISPPFlowMgt_var(VORBaseUnknown_var(activity))->GetProductInputs(list);
  return Names(list);
}

std::vector<std::string> Outputs(VORBaseUnknown* activity) {
  VORListValVORBaseUnknown_var* list = nullptr;
  VORISPPFlowMgt_var(VORBaseUnknown_var(activity))->GetProductOutputs(list);
  return Names(list);
}

std::vector<std::string> Assigned(VORBaseUnknown* activity) {
  VORListValVORBaseUnknown_var* list = nullptr;
  VORISPPItemMgt_var(VORBaseUnknown_var(activity))->GetAssignedItems(list);
  return Names(list);
}

std::vector<std::string> Resources(VORBaseUnknown* activity) {
  VORListValVORBaseUnknown_var* list = nullptr;
  VORISPPResourceManagement_var(VORBaseUnknown_var(activity))->GetResources(list);
  return Names(list);
}

using Strings = std::vector<std::string>;

class ZitBltItemDDTest : public ::testing::Test {
 protected:
  void SetUp() override {
    ASSERT_NE(VORModuleLoader::LoadModule("QELZitBltModel"), nullptr);
    s4 = line.Node(line.root, "S4", "BIWActivityStation");
    load = line.Node(line.root, "L", "BIWActivityLoading");
    weld = line.Node(line.root, "W", "BIWActivitySpotWelding");
  }
  void TearDown() override {
    // Whatever a case did, the document keeps its invariants.
    std::vector<std::string> problems;
    EXPECT_TRUE(VORModelChecker::Check(line.doc, problems)) << problems.front();
    s4 = load = weld = NULL_var;
  }
  // The check's verdict and text, the text starting as "untouched".
  std::string Check(VORBaseUnknown* dragged, VORBaseUnknown* from, VORBaseUnknown* to) {
    QELIListZitBltItemDD_var dd{VORBaseUnknown_var(dragged)};
    if (!dd)
      return "(no drag-and-drop)";
    VORUnicodeString message("untouched");
    const int ok = dd->CheckReassignment(from, to, message);
    return std::to_string(ok) + " " + message.ConvertToUTF8();
  }
  HRESULT Reassign(VORBaseUnknown* dragged, VORBaseUnknown* from, VORBaseUnknown* to) {
    return QELIListZitBltItemDD_var {
      VORBaseUnknown_var(dragged)
      } -> Reassign(from, to);
  }
  // A user step around a reassignment, as the list does it.
  HRESULT Drop(VORBaseUnknown* dragged, VORBaseUnknown* from, VORBaseUnknown* to) {
    VORUndoHistory& history = line.doc->GetUndoHistory();
    history.Begin("Reassign Item");
    const HRESULT hr = Reassign(dragged, from, to);
    history.End();
    return hr;
  }
  VORDlgDialog* OptionsDialog() { return VORDlgDialog::FindShown("Select Item"); }

  ListTestLine line;
  VORBaseUnknown_var s4, load, weld;
};

TEST_F(ZitBltItemDDTest, RefusalsOfAnInputSayWhyAndChangeNothing) {
  VORBaseUnknown_var in = line.Input(line.s3, line.panel);
  line.Input(s4, line.bracket);
  const std::string before = line.doc->SaveToString();

  EXPECT_EQ(Check(in, line.s3, line.panel), "0 Item cannot be assigned to this activity .");
  EXPECT_EQ(Check(in, nullptr, s4), "0 Item cannot be assigned to this activity .");
  EXPECT_EQ(Check(in, line.s3, weld),
            "0 Product Input can not be ReAssigned from BIWActivityStation to "
            "BIWActivitySpotWelding");
  EXPECT_EQ(Check(in, weld, line.s3),
            "0 Product Input can not be ReAssigned from BIWActivitySpotWelding to "
            "BIWActivityStation");
  // Same name, another object: the name decides.
  VORBaseUnknown_var twin = line.Product("Panel");
  line.door().AssignItem(s4, twin);
  EXPECT_EQ(Check(in, line.s3, s4), "0 This product is already assigned");
  auto bare = VORBaseUnknown_var::Adopt(new StationWithoutItems());
  EXPECT_EQ(Check(in, line.s3, bare), "0 Item list is not obtained");
  // An activity never takes what it produces itself, or what its sub-activities produce.
  line.Output(load, line.panel);
  EXPECT_EQ(Check(in, line.s3, load), "0 This product is produced by this activity");
  line.Output(line.s2, line.floor);
  VORBaseUnknown_var floorIn = line.Input(line.s3, line.floor);
  EXPECT_EQ(Check(floorIn, line.s3, line.group), "0 This product is produced by this activity");

  // Onto a welding activity the move itself is refused too.
  line.door().UnassignItem(s4, twin);
  const std::string checked = line.doc->SaveToString();
  EXPECT_EQ(Drop(in, line.s3, weld), E_FAIL);
  EXPECT_EQ(Drop(in, nullptr, s4), E_FAIL);
  EXPECT_EQ(line.doc->SaveToString(), checked);
  EXPECT_FALSE(line.doc->GetUndoHistory().CanUndo());
  EXPECT_NE(before, checked);
}

TEST_F(ZitBltItemDDTest, AnAssemblyIsRefusedWhereOneOfItsComponentsIsAssigned) {
  VORBaseUnknown_var assembly, inner;
  ASSERT_EQ(line.door().CreateMfgAssembly("Floor MA", assembly), S_OK);
  ASSERT_EQ(line.door().CreateMfgAssembly("Tunnel MA", inner), S_OK);
  line.door().AddComponent(assembly, inner);
  line.door().AddComponent(inner, line.bracket);
  VORBaseUnknown_var in = line.Input(line.s3, assembly);
  EXPECT_EQ(Check(in, line.s3, s4), "1 Activities are valid");
  line.door().AssignItem(s4, line.bracket);  // two levels down
  EXPECT_EQ(Check(in, line.s3, s4), "0 A component of this assembly is already assigned");
}

TEST_F(ZitBltItemDDTest, AnInputMovesWithItsAssignmentAndIsUndoneAsOneStep) {
  VORBaseUnknown_var in = line.Input(line.s3, line.panel);
  line.Input(line.s3, line.bracket);
  const std::string before = line.doc->SaveToString();
  EXPECT_EQ(Check(in, line.s3, s4), "1 Activities are valid");
  ASSERT_EQ(Drop(in, line.s3, s4), S_OK);
  EXPECT_EQ(Inputs(line.s3), Strings{"Bracket"});
  EXPECT_EQ(Assigned(line.s3), Strings{"Bracket"}) << "the assignment left with the input";
  EXPECT_EQ(Inputs(s4), Strings{"Panel"});
  EXPECT_EQ(Assigned(s4), Strings{"Panel"});
  VORBaseUnknown_var via;
  VORISPPItemMgt_var(s4)->GetAssignmentInput(line.panel, via);
  VORListValVORBaseUnknown_var* inputs = nullptr;
  VORISPPFlowMgt_var(s4)->GetProductInputs(inputs);
  EXPECT_EQ(via.Identity(), (*inputs)[1].Identity()) << "assigned through the new input";
  delete inputs;

  ASSERT_TRUE(line.doc->GetUndoHistory().Undo());
  EXPECT_EQ(line.doc->SaveToString(), before);
  ASSERT_TRUE(line.doc->GetUndoHistory().Redo());
  EXPECT_EQ(Inputs(s4), Strings{"Panel"});
  EXPECT_EQ(Inputs(line.s3), Strings{"Bracket"});

  // A loading activity takes an input too; an assignment made without the input stays.
  VORBaseUnknown_var floorIn = line.Input(line.s3, line.floor, false);
  line.door().AssignItem(line.s3, line.floor);
  ASSERT_EQ(Drop(floorIn, line.s3, load), S_OK);
  EXPECT_EQ(Inputs(load), Strings{"Floor"});
  EXPECT_EQ(Assigned(load), Strings{"Floor"});
  EXPECT_EQ(Assigned(line.s3), (Strings{"Bracket", "Floor"}));
}

TEST_F(ZitBltItemDDTest, AnOutputIsTakenAsAnInputOfAStationOrGroupingButNotOfALoading) {
  VORBaseUnknown_var out = line.Output(line.s3, line.floor);
  EXPECT_EQ(Check(out, line.s3, s4), "1 Activities are valid");
  EXPECT_EQ(Check(out, line.s3, weld),
            "0 Product Input can not be ReAssigned from BIWActivityStation to "
            "BIWActivitySpotWelding");
  EXPECT_EQ(Check(out, load, s4),
            "0 Product Input can not be ReAssigned from BIWActivityLoading to BIWActivityStation");
  // A loading activity takes no listed output; the refusal has no text of its own.
  EXPECT_EQ(Check(out, line.s3, load), "0 untouched");
  EXPECT_EQ(Check(out, line.s3, line.s3), "0 untouched") << "not to itself";

  ASSERT_EQ(Drop(out, line.s3, s4), S_OK);
  EXPECT_EQ(Outputs(line.s3), Strings{"Floor"}) << "the producer keeps its output";
  EXPECT_EQ(Inputs(s4), Strings{"Floor"});
  EXPECT_EQ(Assigned(s4), Strings{"Floor"});
  EXPECT_EQ(Check(out, line.s3, s4), "0 This product is already assigned");
  EXPECT_EQ(Drop(out, line.s3, s4), E_FAIL) << "the item is assigned already";

  // A grouping hands on what its stations produce.
  VORBaseUnknown_var sub = line.Output(line.s2, line.sub);
  EXPECT_EQ(Check(sub, line.group, line.s3), "1 Activities are valid");
  ASSERT_EQ(Drop(sub, line.group, line.s3), S_OK);
  EXPECT_EQ(Inputs(line.s3), Strings{"Sub"});
}

TEST_F(ZitBltItemDDTest, AnOutputDroppedOnASubActivityAsksWhichItemItReplaces) {
  VORBaseUnknown_var out = line.Output(line.group, line.sub);
  line.Input(line.s1, line.panel);
  line.Output(line.s1, line.bracket);
  const std::string before = line.doc->SaveToString();
  ASSERT_EQ(Check(out, line.group, line.s1), "1 Activities are valid");
  ASSERT_EQ(Drop(out, line.group, line.s1), S_FALSE) << "waits for the planner";
  EXPECT_EQ(line.doc->SaveToString(), before);
  VORDlgDialog* dialog = OptionsDialog();
  ASSERT_NE(dialog, nullptr);
  auto* list = dynamic_cast<VORDlgSelectorList*>(dialog->FindControl("ItemSelectorList"));
  ASSERT_NE(list, nullptr);
  EXPECT_EQ(list->GetLineCount(), 2);
  EXPECT_EQ(list->GetLine(0), VORUnicodeString("Panel"));
  EXPECT_EQ(list->GetLine(1), VORUnicodeString("Bracket"));
  EXPECT_EQ(list->GetSelect(), std::vector<int>{0}) << "the first item is the default";
  EXPECT_EQ(list->GetVisibleColumns(), 15);
  EXPECT_EQ(list->GetVisibleLines(), 7);
  EXPECT_EQ(dialog->FindControl("Select Item To Replace")->GetTitle(),
            VORUnicodeString("Select Item To Replace"));

  // (Cancel and the close button are answered in the item drag script tests.)
  // OK: the chosen input carries the output's item, with its assignment.
  ASSERT_TRUE(dialog->UserPressOK());
  VORDeferredDeletion::Drain();
  EXPECT_EQ(OptionsDialog(), nullptr);
  EXPECT_EQ(Inputs(line.s1), Strings{"Sub"});
  EXPECT_EQ(Assigned(line.s1), Strings{"Sub"});
  EXPECT_EQ(Outputs(line.s1), Strings{"Bracket"});
  ASSERT_TRUE(line.doc->GetUndoHistory().Undo());
  EXPECT_EQ(line.doc->SaveToString(), before);

  // The second line replaces the output.
  ASSERT_EQ(Drop(out, line.group, line.s1), S_FALSE);
  dialog = OptionsDialog();
  auto* again = dynamic_cast<VORDlgSelectorList*>(dialog->FindControl("ItemSelectorList"));
  ASSERT_TRUE(again->UserSelect({1}));
  ASSERT_TRUE(dialog->UserPressOK());
  VORDeferredDeletion::Drain();
  EXPECT_EQ(Outputs(line.s1), Strings{"Sub"});
  EXPECT_EQ(Inputs(line.s1), Strings{"Panel"});

  // A sub-activity with nothing to replace takes the item at once.
  ASSERT_EQ(Drop(out, line.group, line.s2), S_OK);
  EXPECT_EQ(Inputs(line.s2), Strings{"Sub"});
  EXPECT_EQ(OptionsDialog(), nullptr);
}

TEST_F(ZitBltItemDDTest, AResourceGoesToAnyActivity) {
  line.door().AssignResource(line.s3, line.robot);
  line.door().AssignResource(line.s3, line.fixture);
  EXPECT_EQ(Check(line.robot, line.s3, weld), "1 Activities are valid");
  EXPECT_EQ(Check(line.robot, line.s3, line.panel), "0 Item cannot be assigned to this activity .");
  const std::string before = line.doc->SaveToString();
  ASSERT_EQ(Drop(line.robot, line.s3, weld), S_OK);
  EXPECT_EQ(Resources(line.s3), Strings{"Fixture"});
  EXPECT_EQ(Resources(weld), Strings{"Robot"});
  ASSERT_TRUE(line.doc->GetUndoHistory().Undo());
  EXPECT_EQ(line.doc->SaveToString(), before);

  // Nothing to move: not held by the from activity, or the same activity.
  EXPECT_EQ(Drop(line.robot, s4, weld), E_FAIL);
  EXPECT_EQ(Drop(line.robot, line.s3, line.s3), E_FAIL);
  EXPECT_EQ(line.doc->SaveToString(), before);

  // A part an input list shows without an input moves its assignment.
  line.door().AssignItem(line.s3, line.floor);
  ASSERT_EQ(Drop(line.floor, line.s3, s4), S_OK);
  EXPECT_EQ(Assigned(s4), Strings{"Floor"});
  EXPECT_TRUE(Assigned(line.s3).empty());
}

}  // namespace
