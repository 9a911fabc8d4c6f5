// The grouping command as a planner uses it, through the headless driver: the dialog, the picks
// and their toggling, every message with its trigger, the graph rules on small charts, the group
// built on a chain with its links, place, cycle time and grouping resource, hub mode, and undo.
#include "GroupingTestSupport.h"

#include <map>
#include <sstream>

#include "VORDlgCombo.h"
#include "VORDlgDialog.h"
#include "VORIResource.h"
#include "VORScript.h"

namespace {

constexpr const char* Grouping = "QELFpaPertGrpActCmd";
constexpr const char* Dialog = "QELFpaActivityGroupDlg";

std::string Lines(const VORDlgDialog* dialog, const char* combo) {
  const auto* c = dynamic_cast<const VORDlgCombo*>(dialog->FindControl(combo));
  std::string text;
  for (int i = 0; c != nullptr && i < c->GetLineCount(); ++i)
    text += (text.empty() ? "" : "|") + c->GetLine(i).ConvertToUTF8();
  return text;
}

std::string Value(const VORDlgDialog* dialog, const char* control) {
  const VORDlgControl* c = dialog->FindControl(control);
  return c ? c->GetValueText().ConvertToUTF8() : "(missing)";
}

class GroupingCommandTest : public GroupingTest {
 protected:
  // P -> A -> B -> N, stations on the grid; A and B carry robots R1, R2 of cell "Cell".
  void MakeChain() {
    p = Node(root, "P", "BIWActivityStation", 12.5, 12.5);
    a = Node(root, "A", "BIWActivityStation", 100, 10);
    b = Node(root, "B", "BIWActivityStation", 200, 40);
    n = Node(root, "N", "BIWActivityStation", 312.5, 12.5);
    Flow(p, a);
    Flow(a, b);
    Flow(b, n);
    Door().SetStationCycleTime(a, 30);
    Door().SetStationCycleTime(b, 45);
    cell = Resource(doc->GetResourceRoot(), "Cell", "CellType");
    r1 = Resource(cell, "R1", "RobotType");
    r2 = Resource(cell, "R2", "RobotType");
    Door().AssignResource(a, r1);
    Door().AssignResource(b, r2);
  }
  VORDlgDialog* GroupDialog() const { return driver.FindDialog(Dialog); }
  bool PressOK() { return driver.PressOK(Dialog); }

  VORBaseUnknown_var p, a, b, n, cell, r1, r2;
};

}  // namespace

// --- The dialog and the picks --------------------------------------------------------------

TEST_F(GroupingCommandTest, DialogTakesItsLabelsFromTheCatalogueAndTheNameDecidesOK) {
  MakeChain();
  Open();
  StartAndPick(Grouping, {"A"});
  VORDlgDialog* dialog = GroupDialog();
  ASSERT_NE(dialog, nullptr) << "the first pick shows the dialog";
  const VORDlgControl* frame = dialog->FindControl("FrameActivityDlg");
  ASSERT_NE(frame, nullptr);
  for (const char* key : {"EnterActivityName", "EnterResourceName", "SelectResourceType",
                          "SelectActivityType", "SelectCycleTime"}) {
    const VORDlgControl* label = frame->FindControl(key);
    ASSERT_NE(label, nullptr) << key;
    EXPECT_NE(label->GetTitle().ConvertToUTF8(), key) << "text from the catalogue";
  }
  EXPECT_EQ(frame->FindControl("EnterActivityName")->GetTitle().ConvertToUTF8(), "Activity name");
  EXPECT_EQ(Lines(dialog, "ComboActivityType"), "Grouping Activity");
  EXPECT_EQ(Lines(dialog, "ComboCycleTime"), "children|parent");
  EXPECT_EQ(Value(dialog, "ComboCycleTime"), "children");

  // The activity name alone decides OK while the user types.
  ASSERT_TRUE(driver.TypeText(Dialog, "EditorActivityName", ""));
  EXPECT_FALSE(dialog->GetOKSensitivity());
  ASSERT_TRUE(driver.TypeText(Dialog, "EditorActivityName", "G"));
  EXPECT_TRUE(dialog->GetOKSensitivity());
}

TEST_F(GroupingCommandTest, PicksAreFilteredAndToggleWithOKAndPresetNames) {
  MakeChain();
  Node(root, "L", "BIWActivityLoading");
  Open();
  StartAndPick(Grouping, {"L"});
  EXPECT_EQ(LastEvent(), "pick of \"L\" refused");
  EXPECT_EQ(GroupDialog(), nullptr);

  driver.PickObject("A");
  VORDlgDialog* dialog = GroupDialog();
  ASSERT_NE(dialog, nullptr);
  EXPECT_FALSE(dialog->GetOKSensitivity()) << "one pick";
  EXPECT_EQ(Value(dialog, "EditorActivityName"), "");
  EXPECT_EQ(Lines(dialog, "ComboResourceType"), "") << "a first single pick fills no combo";

  driver.PickObject("B");
  EXPECT_TRUE(dialog->GetOKSensitivity());
  EXPECT_EQ(Value(dialog, "EditorActivityName"), "GroupActivity");
  EXPECT_EQ(Value(dialog, "EditorResourceName"), "GroupResource");
  EXPECT_EQ(Lines(dialog, "ComboResourceType"), "DefaultResource");
  EXPECT_EQ(driver.DescribeCSO(), "cso: A, B\n");

  driver.PickObject("B");  // picked again: removed
  EXPECT_FALSE(dialog->GetOKSensitivity());
  EXPECT_EQ(driver.DescribeCSO(), "cso: A\n");
  driver.PickObject("B");
  EXPECT_TRUE(dialog->GetOKSensitivity());

  driver.PickObject("L");
  EXPECT_EQ(LastEvent(), "pick of \"L\" refused");
  EXPECT_TRUE(Messages().empty());
}

TEST_F(GroupingCommandTest, PicksOnAnotherLevelOrWithResourcesElsewhereAreReported) {
  MakeChain();
  auto g = Node(root, "G", "BIWActivityGrouping");
  Node(g, "Inner");
  auto other = Resource(doc->GetResourceRoot(), "OtherCell");
  auto r3 = Resource(other, "R3");
  auto c = Node(root, "C");
  Door().AssignResource(c, r3);
  Open();

  StartAndPick(Grouping, {"A", "Inner"});
  EXPECT_EQ(Messages(),
            std::vector<std::string>{"Error: Activities selected are not at same level."});
  // The offending activity stays picked until it is picked again.
  EXPECT_EQ(driver.DescribeCSO(), "cso: A, Inner\n");
  driver.PickObject("Inner");
  EXPECT_EQ(driver.DescribeCSO(), "cso: A\n");
  driver.PickObject("C");
  EXPECT_EQ(Messages(), std::vector<std::string>{
                            "Error: Resources Assigned to the Activities selected are not at same "
                            "level."});
  driver.CancelCommand();
}

// --- The graph rules -----------------------------------------------------------------------

namespace {
constexpr const char* kImproper = "Error: Improper selection of activities for grouping";
struct RuleCase {
  const char* name;
  std::vector<std::pair<const char*, const char*>> flows;
  std::vector<const char*> picks;
  const char* refusal;  // null when the selection is grouped
};
}  // namespace

// A refused selection leaves the document exactly as it was.
TEST_F(GroupingCommandTest, GraphRulesAcceptOnlyASingleEntrySingleExitSelection) {
  const std::vector<RuleCase> cases = {
      {"chain, middle two", {{"A", "B"}, {"B", "C"}, {"C", "D"}}, {"B", "C"}, nullptr},
      {"no outside successor", {{"A", "B"}, {"B", "C"}}, {"B", "C"}, kImproper},
      {"two start activities", {{"A", "C"}, {"B", "C"}}, {"A", "B"}, kImproper},
      {"A and C around B", {{"A", "B"}, {"B", "C"}, {"C", "D"}, {"X", "A"}}, {"A", "C"}, kImproper},
      {"two predecessors into one",
       {{"X", "B"}, {"Y", "B"}, {"B", "C"}, {"C", "D"}},
       {"B", "C"},
       nullptr},
      {"a predecessor that also leads elsewhere",
       {{"X", "B"}, {"Y", "B"}, {"X", "Z"}, {"B", "C"}, {"C", "D"}},
       {"B", "C"},
       kImproper},
      // The backward walk from P goes round P and Q once and never meets the selection.
      {"a cycle outside the selection",
       {{"Q", "P"}, {"P", "Q"}, {"P", "A"}, {"A", "B"}, {"B", "N"}},
       {"A", "B"},
       nullptr},
      // One outside predecessor and one outside successor, but the entry A has none at all.
      {"an entry without predecessor",
       {{"A", "B"}, {"X", "B"}, {"B", "Y"}},
       {"A", "B"},
       "Error: Selected Activities not linked properly."},
  };
  for (const RuleCase& rule : cases) {
    SCOPED_TRACE(rule.name);
    driver.CancelCommand();
    doc = VORProcess_var::Adopt(VORProcess::CreateNew("Line"));
    root = doc->GetRootProcess();
    std::map<std::string, VORBaseUnknown_var> nodes;
    auto node = [&](const char* label) {
      auto& h = nodes[label];
      if (!h)
        h = Node(root, label);
      return h;
    };
    for (auto [from, to] : rule.flows)
      Flow(node(from), node(to));
    Open();
    const std::string before = doc->SaveToString();
    StartAndPick(Grouping, rule.picks);
    ASSERT_TRUE(PressOK()) << driver.LastError();
    const std::vector<std::string> messages = Messages();
    EXPECT_EQ(ChildNamed(root, "GroupActivity") != nullptr, rule.refusal == nullptr);
    if (rule.refusal == nullptr) {
      EXPECT_TRUE(messages.empty());
    } else {
      EXPECT_EQ(messages, std::vector<std::string>{rule.refusal});
      EXPECT_EQ(doc->SaveToString(), before);
    }
  }
}

// --- Group creation ------------------------------------------------------------------------

TEST_F(GroupingCommandTest, GroupingAChainBuildsTheGroupWithItsLinksPlaceCycleTimeAndResource) {
  MakeChain();
  Open();
  StartAndPick(Grouping, {"A", "B"});
  ASSERT_TRUE(driver.TypeText(Dialog, "EditorActivityName", "Body group"));
  ASSERT_TRUE(driver.TypeText(Dialog, "EditorResourceName", "Group cell"));
  ASSERT_TRUE(PressOK());
  EXPECT_TRUE(Messages().empty());
  EXPECT_EQ(LastEvent(), "command QELFpaPertGrpActCmd ended");

  EXPECT_EQ(Children(root), "P N Body group");
  VORBaseUnknown_var g = ChildNamed(root, "Body group");
  ASSERT_TRUE(g);
  EXPECT_EQ(Next(Find("P")), "Body group");
  EXPECT_EQ(Next(g), "N");
  EXPECT_EQ(Children(g), "Start Stop A B");
  EXPECT_EQ(Next(ChildNamed(g, "Start")), "A");
  EXPECT_EQ(Next(ChildNamed(g, "A")), "B");
  EXPECT_EQ(Next(ChildNamed(g, "B")), "Stop");

  // Place: x = snap(150) = 162.5, y = snap(25) = 37.5; Start and Stop beside the copies.
  double x = 0, y = 0;
  VORIGraphNodeLayout_var(g)->GetPertPosition(x, y);
  EXPECT_EQ(x, 162.5);
  EXPECT_EQ(y, 37.5);
  VORIGraphNodeLayout_var(ChildNamed(g, "Start"))->GetPertPosition(x, y);
  EXPECT_EQ(x, 75.0);
  EXPECT_EQ(y, 12.5);  // snap(50 / 4 children)
  VORIGraphNodeLayout_var(ChildNamed(g, "Stop"))->GetPertPosition(x, y);
  EXPECT_EQ(x, 225.0);

  double time = 0;
  VORISPPAbstractActivity_var(g)->GetActivityTime(time);
  EXPECT_EQ(time, 45.0) << "largest station cycle time of the children";

  // Resources: a new grouping resource under the cell holds the robots; the group uses it.
  VORBaseUnknown_var cellNow = Find("Cell");
  EXPECT_EQ(ChildProducts(cellNow), "Group cell");
  EXPECT_EQ(ResourceNames(g), "Group cell");
  EXPECT_EQ(ResourceNames(ChildNamed(g, "A")), "R1");
  EXPECT_EQ(ChildProducts(Find("Group cell")), "R1 R2");
  EXPECT_TRUE(VORIResource_var(Find("Group cell")));
}

TEST_F(GroupingCommandTest, ParentCycleTimeComesFromTheGroupsFather) {
  MakeChain();
  Door().SetActivityTime(root, 99);
  Open();
  StartAndPick(Grouping, {"A", "B"});
  ASSERT_TRUE(driver.ChooseComboLine(Dialog, "ComboCycleTime", "parent"));
  ASSERT_TRUE(PressOK());
  double time = 0;
  VORISPPAbstractActivity_var(ChildNamed(root, "GroupActivity"))->GetActivityTime(time);
  EXPECT_EQ(time, 99.0);
}

// --- Hub mode ------------------------------------------------------------------------------

namespace {
class HubGroupingTest : public GroupingCommandTest {
 protected:
  HubGroupingTest() { hub = true; }
};
}  // namespace

TEST_F(HubGroupingTest, OffersThePlantTypesThatCanHoldTheAssignedOnesAndUsesTheParentsClass) {
  auto cellType = PlanType("CellType", "lumocompplantstation");
  auto stationType = PlanType("StationType");
  auto bufferType = PlanType("BufferType");
  auto robotType = PlanType("RobotType");
  Child(cellType, stationType);
  Child(cellType, bufferType);
  Child(stationType, robotType);  // only a station can hold robots
  MakeChain();
  Open();
  StartAndPick(Grouping, {"A", "B"});
  EXPECT_EQ(Lines(GroupDialog(), "ComboResourceType"), "StationType");
  ASSERT_TRUE(PressOK());
  EXPECT_TRUE(Messages().empty());
  VORIResource_var made(Find("GroupResource"));
  ASSERT_TRUE(made);
  VORUnicodeString planType, resourceClass;
  made->GetPlanTypeName(planType);
  made->GetResourceClass(resourceClass);
  EXPECT_EQ(planType.ConvertToUTF8(), "StationType");
  EXPECT_EQ(resourceClass.ConvertToUTF8(), "Station");
}

TEST_F(HubGroupingTest, NoPlantTypeForTheSelectionIsAViolationAndChangesNothing) {
  auto cellType = PlanType("CellType");
  auto bufferType = PlanType("BufferType");
  PlanType("RobotType");
  Child(cellType, bufferType);  // nothing below the cell can hold robots
  MakeChain();
  Open();
  const std::string before = doc->SaveToString();
  StartAndPick(Grouping, {"A", "B"});
  EXPECT_EQ(Lines(GroupDialog(), "ComboResourceType"), "");
  ASSERT_TRUE(PressOK());
  EXPECT_EQ(Messages(), std::vector<std::string>{
                            "Error: new Q9 resource type is not possible for this selection "
                            "(Violation of PTS Rules)"});
  EXPECT_EQ(doc->SaveToString(), before);
  EXPECT_NE(driver.GetRunningCommand(), nullptr) << "the command waits for another choice";
  driver.CancelCommand();
}

// --- The script steps a planner uses on it --------------------------------------------------

TEST_F(GroupingCommandTest, AScriptGroupsPrintsTheDialogAndUndoesAndRedoesTheStep) {
  MakeChain();
  Node(root, "L", "BIWActivityLoading");
  Open();
  const std::string before = doc->SaveToString();
  std::ostringstream out;
  VORScript script(driver, out);
  ASSERT_TRUE(
      script.Run("start QELFpaPertGrpActCmd\n"
                 "pick L\n"
                 "pick A\n"
                 "print dialog QELFpaActivityGroupDlg\n"
                 "pick B\n"
                 "print combo QELFpaActivityGroupDlg ComboCycleTime\n"
                 "print dialog QELFpaActivityGroupDlg\n"
                 "ok QELFpaActivityGroupDlg\n"
                 "undo\n"
                 "redo\n"))
      << out.str();
  const std::string text = out.str();
  auto has = [&](const std::string& part) { return text.find(part) != std::string::npos; };
  EXPECT_TRUE(has("> pick L\npick of \"L\" refused\n")) << text;
  EXPECT_TRUE(
      has("> pick A\n> print dialog QELFpaActivityGroupDlg\n"
          "Dialog \"QELFpaActivityGroupDlg\" title=\"Group Activities\" [OK insensitive]\n"))
      << text;
  EXPECT_TRUE(has("  line 1 \"children\" [selected]\n  line 2 \"parent\"\n")) << text;
  EXPECT_TRUE(has("Dialog \"QELFpaActivityGroupDlg\" title=\"Group Activities\" [OK sensitive]\n"))
      << text;
  EXPECT_EQ(Children(root), "P N L GroupActivity") << "undone, then redone";
  const std::string after = doc->SaveToString();
  ASSERT_TRUE(script.Run("undo\n")) << out.str();
  EXPECT_EQ(doc->SaveToString(), before) << "one grouping, one step";
  EXPECT_EQ(Children(root), "P A B N L");
  ASSERT_TRUE(script.Run("redo\n")) << out.str();
  EXPECT_EQ(doc->SaveToString(), after);
  EXPECT_FALSE(script.Run("redo\n"));
  EXPECT_TRUE(out.str().find("nothing to redo") != std::string::npos) << out.str();
}

TEST_F(GroupingCommandTest, PicksAfterOpeningTheViewerStartANewSelectionWithoutTheLevel) {
  MakeChain();
  Open();
  std::ostringstream out;
  VORScript script(driver, out);
  ASSERT_TRUE(
      script.Run("pick Line\n"
                 "start QELFpaProductFlowViewerCmd\n"
                 "print cso\n"
                 "start QELFpaPertGrpActCmd\n"
                 "pick A\n"
                 "pick B\n"
                 "print cso\n"
                 "print dialog QELFpaActivityGroupDlg\n"
                 "ok QELFpaActivityGroupDlg\n"))
      << out.str();
  const std::string text = out.str();
  auto has = [&](const std::string& part) { return text.find(part) != std::string::npos; };
  EXPECT_TRUE(has("> print cso\ncso: Line\n")) << "the viewer leaves its level selected";
  EXPECT_FALSE(has("notification")) << text;
  EXPECT_TRUE(has("> pick B\n> print cso\ncso: A, B\n")) << text;
  EXPECT_TRUE(has("title=\"Group Activities\" [OK sensitive]")) << text;
  EXPECT_EQ(Children(root), "P N GroupActivity");
}
