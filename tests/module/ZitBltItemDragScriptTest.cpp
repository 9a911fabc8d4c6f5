// Dragging list items in an open Product Flow Viewer with the bundled lists, through the
// headless driver and the script steps: the verdict said before the drop, refusals that change
// nothing, moves that both lists show, undo and redo, the item options dialog answered in a
// script, the cursor and balloon while dragging, "select", and what a picked line selects and
// hides.
#include <gtest/gtest.h>

#include "QELBaseScrollListZitBltRep.h"
#include "QELIZitBltMgr.h"
#include "QELScrollListDrop.h"
#include "TempDir.h"
#include "ViewerTestSupport.h"
#include "VORDocument.h"
#include "VORDriver.h"
#include "VORExtISelectShow.h"
#include "VORFrmWindow.h"
#include "VORISPPFlowMgt.h"
#include "VORISPPProductIO.h"
#include "VORIVisProperties.h"
#include "VORModelDoor.h"
#include "VORViewer.h"

namespace {

// The line: a grouping G (S1 -> S2 inside), stations S3 and S4, a loading L.
// G delivers "Sub"; S1 takes "Panel" and makes "Bracket"; S3 takes "Floor" and "Clip" and
// makes "Beam"; S4 already takes a part named "Clip"; S3 uses the robot "R1".
class ZitBltItemDragScriptTest : public ::testing::Test {
 protected:
  void SetUp() override {
    unsetenv("ScrollListRange");
    auto doc = VORProcess_var::Adopt(VORProcess::CreateNew("Line"));
    VORModelDoor& door = doc->GetDoor();
    VORBaseUnknown_var root = doc->GetRootProcess();
    auto node = [&](VORBaseUnknown* father, const char* label, const char* type, double x) {
      VORBaseUnknown_var n = AddActivity(door, father, label, type);
      door.SetPertPosition(n, true, x, 12.5);
      return n;
    };
    auto product = [&](const char* name) {
      VORBaseUnknown_var p;
      door.CreateProduct(doc->GetRootProduct(), VORUnicodeString(name), p);
      return p;
    };
    auto io = [&](VORBaseUnknown* activity, VORBaseUnknown* item, bool input) {
      VORBaseUnknown_var p;
      door.AddProductIO(activity, item, input, p);
      if (input)
        door.AssignItem(activity, item, p);
    };
    VORBaseUnknown_var g = node(root, "G", "BIWActivityGrouping", 12.5);
    VORBaseUnknown_var s1 = node(g, "S1", "BIWActivityStation", 12.5);
    VORBaseUnknown_var s2 = node(g, "S2", "BIWActivityStation", 62.5);
    door.AddFlow(s1, s2);
    VORBaseUnknown_var s3 = node(root, "S3", "BIWActivityStation", 212.5);
    VORBaseUnknown_var s4 = node(root, "S4", "BIWActivityStation", 312.5);
    node(root, "L", "BIWActivityLoading", 412.5);
    door.AddFlow(g, s3);
    door.AddFlow(s3, s4);
    io(g, product("Sub"), false);
    io(s1, product("Panel"), true);
    io(s1, product("Bracket"), false);
    io(s3, product("Floor"), true);
    io(s3, product("Clip"), true);
    io(s3, product("Beam"), false);
    io(s4, product("Clip"), true);
    VORBaseUnknown_var robot = product("R1");
    door.MakeResource(robot, "Robot", "");
    door.AssignResource(s3, robot);
    OpenInViewer(driver, doc, dir.Path() + "/line.pprx");
  }
  std::string Run(const std::string& steps, bool ok = true) { return RunSteps(driver, steps, ok); }
  std::string Saved() { return driver.GetDocument()->SaveToString(); }
  QELBaseScrollListZitBltRep* List(const char* node, const char* name) {
    return ScrollList(driver, node, name);
  }

  TempDir dir;
  VORDriver driver;
};

TEST_F(ZitBltItemDragScriptTest, ARefusedDropSaysWhyAndChangesNothing) {
  Run("expand S3 ProductInput\nexpand S4 ProductInput\n");
  const std::string lists = Run("print list S3 ProductInput\nprint list S4 ProductInput\n");
  const std::string before = Saved();
  EXPECT_EQ(Run("drag-item S3 ProductInput Clip S4\n"),
            "drop on \"S4\": refused: This product is already assigned\n");
  // A station never takes what it makes itself.
  Run("expand S3 ProductOutput\n");
  EXPECT_EQ(Run("drag-item S3 ProductOutput Beam L\n"),
            "drop on \"L\": refused: Item cannot be dropped on this activity\n");
  EXPECT_EQ(Saved(), before);
  EXPECT_EQ(Run("print check\n"), "model check: ok\n");
  EXPECT_EQ(Run("print list S3 ProductInput\nprint list S4 ProductInput\n"), lists);
  EXPECT_EQ(Run("print cso\n"), "cso:\n");
  EXPECT_NE(Run("undo\n", false).find("nothing to undo"), std::string::npos);
  // Back on its own node the line simply goes back: nothing to say.
  EXPECT_EQ(Run("drag-item S3 ProductInput Floor S3\n"), "");
  EXPECT_NE(Run("drag-item S3 ProductInput Nothing S4\n", false).find("has no item \"Nothing\""),
            std::string::npos);
  EXPECT_NE(Run("drag-item S3 ProductInput Floor Nowhere\n", false).find("no object \"Nowhere\""),
            std::string::npos);
}

TEST_F(ZitBltItemDragScriptTest, AnInputMovesBothListsShowItAndUndoRestoresThemExactly) {
  Run("expand S3 ProductInput\nexpand S4 ProductInput\n");
  const std::string lists = Run("print list S3 ProductInput\nprint list S4 ProductInput\n");
  const std::string before = Saved();
  EXPECT_EQ(Run("drag-item S3 ProductInput Floor S4\n"), "drop on \"S4\": allowed\n");
  EXPECT_EQ(List("S3", "ProductInput")->GetItems().Size(), 1);
  const std::string s4 = Run("print list S4 ProductInput\n");
  EXPECT_NE(s4.find("2 items"), std::string::npos) << s4;
  EXPECT_NE(s4.find("item 2 \"Floor\": kind 2, state 1, shown"), std::string::npos) << s4;
  EXPECT_EQ(Run("print check\n"), "model check: ok\n");
  Run("undo\n");
  EXPECT_EQ(Saved(), before);
  EXPECT_EQ(Run("print list S3 ProductInput\nprint list S4 ProductInput\n"), lists);
  Run("redo\n");
  EXPECT_EQ(Run("print list S4 ProductInput\n"), s4);
}

TEST_F(ZitBltItemDragScriptTest, TheItemOptionsDialogIsAnsweredInAScript) {
  // G's output handed to its own station S1, as a drop inside the open group does it.
  VORBaseUnknown* g = driver.FindObject("G");
  VORBaseUnknown* s1 = driver.FindObject("S1");
  VORListValVORBaseUnknown_var* outputs = nullptr;
  VORISPPFlowMgt_var(VORBaseUnknown_var(g))->GetProductOutputs(outputs);
  ASSERT_EQ(outputs->Size(), 1);
  const VORBaseUnknown_var sub = (*outputs)[1];
  delete outputs;
  auto drop = [&]() {
    QELScrollListDrop::UndoStep step(g);
    return QELScrollListDrop::Reassign(sub, g, s1);
  };
  const std::string before = Saved();
  ASSERT_EQ(drop(), S_FALSE) << "waits for the planner";
  EXPECT_NE(Run("print dialog \"Select Item\"\n").find("SelectorList \"ItemSelectorList\""),
            std::string::npos);
  EXPECT_EQ(Run("print combo \"Select Item\" ItemSelectorList\n"),
            "  line 1 \"Panel\" [selected]\n  line 2 \"Bracket\"\n");
  Run("cancel-dialog\n");
  EXPECT_EQ(Saved(), before);
  ASSERT_EQ(drop(), S_FALSE);
  Run("close-dialog \"Select Item\"\n");
  EXPECT_EQ(Saved(), before);
  ASSERT_EQ(drop(), S_FALSE);
  Run("choose \"Select Item\" ItemSelectorList Bracket\n");
  EXPECT_EQ(Run("print combo \"Select Item\" ItemSelectorList\n"),
            "  line 1 \"Panel\"\n  line 2 \"Bracket\" [selected]\n");
  Run("ok\n");
  VORListValVORBaseUnknown_var* made = nullptr;
  VORISPPFlowMgt_var(VORBaseUnknown_var(s1))->GetProductOutputs(made);
  ASSERT_EQ(made->Size(), 1);
  VORBaseUnknown_var item;
  VORISPPProductIO_var((*made)[1])->GetItem(item);
  delete made;
  EXPECT_EQ(item.Identity(), driver.FindObject("Sub")->GetIdentity()) << "Bracket replaced";
  Run("undo\n");
  EXPECT_EQ(Saved(), before);
}

TEST_F(ZitBltItemDragScriptTest, WhileDraggingTheCursorAndABalloonTellTheVerdict) {
  Run("expand S3 ProductInput\npick-item S3 ProductInput Clip\n");
  QELBaseScrollListZitBltRep* list = List("S3", "ProductInput");
  VOR2DManipulator* m = list->GetItemManipulator();
  ASSERT_EQ(m->GetElementCount(), 1);
  VORViewer* viewer = list->GetViewer();
  const VORBox2D box = m->GetElements().front()->GetBoundingBox();
  const VORMathPoint2D start{box.CentreX(), box.CentreY()};
  m->PointerPress(viewer, start, 0, m->GetElements().front().get());
  m->PointerDrag({262.5, 30.0}, 0);  // over nothing
  m->PointerDrag({312.5, 12.5}, 0);  // over S4, which has a Clip
  EXPECT_EQ(viewer->GetCursor(), VORCursorDragging);
  EXPECT_EQ(list->GetDropRefusal(), VORUnicodeString("This product is already assigned"));
  bool shown = false;
  for (VORPVBalloon* balloon : viewer->GetBalloons())
    shown = shown || (balloon->IsVisible() &&
                      balloon->GetText() == VORUnicodeString("This product is already assigned"));
  EXPECT_TRUE(shown);
  m->PointerDrag({412.5, 12.5}, 0);  // over L, which takes it
  EXPECT_EQ(viewer->GetCursor(), VORCursorDropAllowed);
  EXPECT_TRUE(list->GetDropRefusal().IsEmpty());
  m->PointerDrag({262.5, 30.0}, 0);
  m->PointerRelease({262.5, 30.0}, 0);  // dropped on nothing: back in place
  EXPECT_EQ(viewer->GetCursor(), VORCursorSelect);
  for (VORPVBalloon* balloon : viewer->GetBalloons())
    EXPECT_FALSE(balloon->IsVisible());
  EXPECT_TRUE(driver.TakeEvents().empty());
}

TEST_F(ZitBltItemDragScriptTest, SelectMakesTheSelectionExactlyTheseObjectsInOrder) {
  EXPECT_EQ(Run("select S4 S3 G\nprint cso\n"), "cso: S4, S3, G\n");
  EXPECT_EQ(Run("select S3\nprint cso\n"), "cso: S3\n");
  EXPECT_NE(Run("select S4 Nowhere\n", false).find("no object \"Nowhere\""), std::string::npos);
  EXPECT_EQ(Run("print cso\n"), "cso: S3\n") << "an unknown object changes nothing";
  EXPECT_NE(Run("select\n", false).find("usage: select"), std::string::npos);
}

TEST_F(ZitBltItemDragScriptTest, APickedLineSelectsItsItemAndHidesItsProduct) {
  Run("expand S3 ProductInput\nexpand S3 Resource\npick-item S3 ProductInput Floor\n");
  VORCSO* cso = driver.GetEditor()->GetCSO();
  ASSERT_EQ(cso->GetSize(), 1);
  VORPathElement* path = cso->GetElement(1);
  QELIScrollListZitBltItemVisu_var visual{
      VORBaseUnknown_var(path->GetElement(path->GetSize() - 1))};
  ASSERT_TRUE(visual) << "the line's component is the father of the selected item";
  EXPECT_EQ(VORBaseUnknown_var(path->GetLeaf()).Identity(),
            VORBaseUnknown_var(visual->GetAssociatedPFItem()).Identity());
  // Hide/show of an input acts on its product.
  VORBaseUnknown_var floor = VORSelectShow::ElementForHideShow(path);
  EXPECT_EQ(floor.Identity(), driver.FindObject("Floor")->GetIdentity());
  VORISelectShow_var component{VORBaseUnknown_var(visual.get())};
  ASSERT_TRUE(component);
  EXPECT_EQ(component->GetSelectShowInterface(), VORISelectShow::IID());
  VORBaseUnknown* element = nullptr;
  int flag = 7;
  EXPECT_EQ(component->GetElementForHideShow(nullptr, element, flag), E_FAIL);
  EXPECT_EQ(element, nullptr);
  EXPECT_EQ(flag, 7);
  // Of a resource, on the resource itself.
  Run("pick-item S3 Resource R1\n");
  VORBaseUnknown_var robot = VORSelectShow::ElementForHideShow(cso->GetElement(1));
  EXPECT_EQ(robot.Identity(), driver.FindObject("R1")->GetIdentity());
  // The host's hide/show command hides the product of the selected line.
  Run("start ProductSpace\npick-item S3 ProductInput Floor\nstart HideShow\n");
  VORIVisProperties_var shown{VORBaseUnknown_var(driver.FindObject("Floor"))};
  ASSERT_TRUE(shown);
  EXPECT_FALSE(shown->IsShown());
}

}  // namespace
