// The ungrouping command through the headless driver: the group's activities back on its level
// linked by position to its outside neighbours, the resources handed back, hub-mode refusal,
// and undo and redo of the whole change.
#include "GroupingTestSupport.h"

#include "VORIResource.h"

namespace {

constexpr const char* Ungrouping = "QELFpaPertUngroupActCmd";

class UngroupingCommandTest : public GroupingTest {
 protected:
  // G (grouping) holding Start -> A -> B -> Stop, its grouping resource GR (under Cell) holding
  // R1 and R2, used by A and B.
  void MakeGroup() {
    g = Node(root, "G", "BIWActivityGrouping", 112.5, 12.5);
    auto start = Node(g, "Start", "Start");
    auto a = Node(g, "A", "BIWActivityStation", 100, 10);
    auto b = Node(g, "B", "BIWActivityStation", 150, 10);
    auto stop = Node(g, "Stop", "Stop");
    Flow(start, a);
    Flow(a, b);
    Flow(b, stop);
    cell = Resource(doc->GetResourceRoot(), "Cell", "CellType");
    auto gr = Resource(cell, "GR", "StationType");
    auto r1 = Resource(gr, "R1", "RobotType");
    auto r2 = Resource(gr, "R2", "RobotType");
    Door().AssignResource(g, gr);
    Door().AssignResource(a, r1);
    Door().AssignResource(b, r2);
  }
  void Ungroup() {
    StartAndPick(Ungrouping, {"G"});
    EXPECT_EQ(driver.GetRunningCommand(), nullptr) << "the command ends after one group";
  }

  VORBaseUnknown_var g, cell;
};

}  // namespace

TEST_F(UngroupingCommandTest, OnlyGroupingActivitiesCanBePicked) {
  MakeGroup();
  Node(root, "S");
  Open();
  StartAndPick(Ungrouping, {"S"});
  EXPECT_EQ(LastEvent(), "pick of \"S\" refused");
  EXPECT_NE(driver.GetRunningCommand(), nullptr);
  driver.CancelCommand();
}

// X -> G -> Y: the chain, the resources and the one undo step of the whole change.
TEST_F(UngroupingCommandTest, AChainComesBackBetweenItsNeighboursWithItsResourcesAsOneStep) {
  MakeGroup();
  auto x = Node(root, "X");
  auto y = Node(root, "Y");
  Flow(x, g);
  Flow(g, y);
  Open();
  const std::string before = doc->SaveToString();
  Ungroup();
  EXPECT_EQ(Children(root), "X Y A B");
  EXPECT_EQ(Next(Find("X")), "A");
  EXPECT_EQ(Next(ChildNamed(root, "A")), "B");
  EXPECT_EQ(Next(ChildNamed(root, "B")), "Y");
  EXPECT_EQ(Find("G"), nullptr);
  EXPECT_TRUE(Messages().empty());
  // The group's resources go back to the cell; the grouping resource disappears.
  EXPECT_EQ(ChildProducts(Find("Cell")), "R1 R2");
  EXPECT_EQ(Find("GR"), nullptr);
  EXPECT_EQ(ResourceNames(ChildNamed(root, "A")), "R1");
  EXPECT_EQ(ResourceNames(ChildNamed(root, "B")), "R2");

  const std::string after = doc->SaveToString();
  ASSERT_TRUE(driver.Undo()) << driver.LastError();
  EXPECT_EQ(doc->SaveToString(), before) << "one ungrouping, one step";
  EXPECT_EQ(Next(Find("X")), "G");
  ASSERT_TRUE(driver.Redo()) << driver.LastError();
  EXPECT_EQ(doc->SaveToString(), after);
}

TEST_F(UngroupingCommandTest, TwoPredecessorsBothLeadToTheFirstActivity) {
  MakeGroup();
  auto x1 = Node(root, "X1");
  auto x2 = Node(root, "X2");
  auto y = Node(root, "Y");
  Flow(x1, g);
  Flow(x2, g);
  Flow(g, y);
  Open();
  Ungroup();
  EXPECT_EQ(Next(Find("X1")), "A");
  EXPECT_EQ(Next(Find("X2")), "A");
  EXPECT_EQ(Previous(ChildNamed(root, "A")), "X1 X2");
}

TEST_F(UngroupingCommandTest, WithoutPredecessorNothingOutsideIsLinked) {
  MakeGroup();
  auto y = Node(root, "Y");
  Flow(g, y);
  Open();
  Ungroup();
  EXPECT_EQ(Children(root), "Y A B");
  EXPECT_EQ(Next(ChildNamed(root, "A")), "B");
  EXPECT_EQ(Next(ChildNamed(root, "B")), "");
  EXPECT_EQ(Previous(Find("Y")), "") << "the group's own link went with the group";
}

namespace {
class HubUngroupingTest : public UngroupingCommandTest {
 protected:
  HubUngroupingTest() { hub = true; }
};
}  // namespace

TEST_F(HubUngroupingTest, ResourcesThatTheParentCannotHoldRefuseTheUngroupingUnchanged) {
  auto cellType = PlanType("CellType");
  auto stationType = PlanType("StationType");
  PlanType("RobotType");
  Child(cellType, stationType);
  MakeGroup();
  auto x = Node(root, "X");
  Flow(x, g);
  Open();
  const std::string before = doc->SaveToString();
  StartAndPick(Ungrouping, {"G"});
  EXPECT_EQ(Messages(), std::vector<std::string>{"Error: Assigned resources are violating PTS"});
  EXPECT_EQ(doc->SaveToString(), before);
  driver.CancelCommand();
}

TEST_F(HubUngroupingTest, ResourcesTheParentAllowsAreHandedBack) {
  auto cellType = PlanType("CellType");
  auto robotType = PlanType("RobotType");
  Child(cellType, robotType);
  MakeGroup();
  Open();
  Ungroup();
  EXPECT_TRUE(Messages().empty());
  EXPECT_EQ(ChildProducts(Find("Cell")), "R1 R2");
}
