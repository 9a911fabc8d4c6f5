// The list script steps on a viewer whose station lists its seven product inputs: opening and
// closing, printing, scrolling with its clamps, the balloon, the button's context menu, picking
// an item and sliding the ZitBlt round its node.
#include <gtest/gtest.h>

#include <sstream>

#include "QELBaseScrollListZitBltRep.h"
#include "QELIZitBltMgr.h"
#include "TempDir.h"
#include "ViewerTestSupport.h"
#include "VORDocument.h"
#include "QELIPertNode.h"
#include "VORDriver.h"
#include "VORExtIVisu.h"
#include "VORManipulator.h"
#include "VORModelDoor.h"
#include "ZitBltTestSupport.h"

namespace {

class ZitBltListScriptTest : public ::testing::Test {
 protected:
  void SetUp() override {
    unsetenv("ScrollListRange");
    startup.WriteConfig(
        "<Config><ActivityZitBlt ActivityType=\"BIWActivityStation\">"
        "<ZitBlt Name=\"ProductInput\" Type=\"QELBaseScrollListZitBltRep\" "
        "LoadModule=\"QELZitBltVisu\" Location=\"lefttop\" IconFile=\"I_ZitBltProductInput\">"
        "<UpdateData CmdName=\"QELTestInputListZitBltCmd\" LoadModule=\"QELZitBltTestCmds\"/>"
        "</ZitBlt>"
        "<ZitBlt Name=\"Empty\" Type=\"QELBaseScrollListZitBltRep\" LoadModule=\"QELZitBltVisu\" "
        "Location=\"righttop\" IconFile=\"I_ZitBltProductOutput\"/>"
        "</ActivityZitBlt></Config>");
    auto doc = VORProcess_var::Adopt(VORProcess::CreateNew("Line"));
    VORModelDoor& door = doc->GetDoor();
    VORBaseUnknown_var s = AddActivity(door, doc->GetRootProcess(), "S");
    door.AddFlow(s, AddActivity(door, doc->GetRootProcess(), "T"));
    for (int i = 1; i <= 7; ++i) {
      VORBaseUnknown_var part, io;
      door.CreateProduct(doc->GetRootProduct(), VORUnicodeString("P" + std::to_string(i)), part);
      door.AddProductIO(s, part, true, io);
    }
    OpenInViewer(driver, doc, dir.Path() + "/line.pprx");
  }
  std::string Run(const std::string& steps, bool ok = true) { return RunSteps(driver, steps, ok); }
  QELBaseScrollListZitBltRep* List() { return ScrollList(driver, "S", "ProductInput"); }

  ZitBltStartupDir startup;
  TempDir dir;
  VORDriver driver;
};

TEST_F(ZitBltListScriptTest, PrintListDescribesEveryItemWithItsGeometry) {
  const std::string text = Run("expand S ProductInput\nprint list S ProductInput\n");
  std::istringstream lines(text);
  std::string line;
  std::getline(lines, line);
  EXPECT_EQ(line, "list \"ProductInput\" of \"S\": 7 items, range 5, first 1, scroll bar shown");
  std::getline(lines, line);
  EXPECT_EQ(line,
            "  item 1 \"P1\": kind 1, state 0, shown, label (-17, 0.5), anchor 3, icon "
            "\"I_PODShownInputPart\", link (-9, 0.5) (-6.5, 0.5) (-6.5, -2) (-4, -2), arrow "
            "(-5.90212, -2.61802) (-4, -2) (-5.90212, -1.38198)");
  int items = 1;
  while (std::getline(lines, line))
    ++items;
  EXPECT_EQ(items, 7);
  EXPECT_NE(text.find("  item 6 \"P6\": kind 1, state 0, hidden, label (-17, 13)"),
            std::string::npos);
  EXPECT_EQ(Run("print list S Empty\n"),
            "list \"Empty\" of \"S\": 0 items, range 5, first 1, scroll bar none, grey\n");
}

TEST_F(ZitBltListScriptTest, ExpandAndCollapseAreClicksThatRefuseTheStateAlreadyShown) {
  Run("expand S ProductInput\n");
  EXPECT_FALSE(List()->IsButtonCollapse());
  EXPECT_NE(Run("expand S ProductInput\n", false).find("is already open"), std::string::npos);
  Run("collapse S ProductInput\n");
  EXPECT_TRUE(List()->IsButtonCollapse());
  EXPECT_NE(Run("collapse S ProductInput\n", false).find("is already closed"), std::string::npos);
  EXPECT_NE(Run("expand S Nothing\n", false).find("has no ZitBlt \"Nothing\""), std::string::npos);
}

TEST_F(ZitBltListScriptTest, ScrollMovesTheWindowAndClampsLikeAHandDrag) {
  Run("expand S ProductInput\nscroll S ProductInput 3\n");
  EXPECT_EQ(List()->GetFirst(), 3);
  const std::string text = Run("print list S ProductInput\n");
  EXPECT_NE(text.find("first 3, scroll bar shown"), std::string::npos);
  EXPECT_NE(text.find("item 1 \"P1\": kind 1, state 0, hidden, label (-17, -4.5)"),
            std::string::npos);
  EXPECT_NE(text.find("item 7 \"P7\": kind 1, state 0, shown, label (-17, 10.5)"),
            std::string::npos);
  Run("scroll S ProductInput 99\n");
  EXPECT_EQ(List()->GetFirst(), 3);
  Run("scroll S ProductInput 0\n");
  EXPECT_EQ(List()->GetFirst(), 1);
}

TEST_F(ZitBltListScriptTest, BalloonAndContextMenuOfAListThatScrolls) {
  Run("expand S ProductInput\n");
  EXPECT_EQ(Run("balloon S ProductInput\n"), "balloon: Size = 7\n");
  EXPECT_NE(Run("context-zitblt S ProductInput\nprint menu\n")
                .find("PushItem \"HideShowScrollBar\" title=\"HideScrollBar\""),
            std::string::npos);
  Run("menu HideScrollBar\n");
  EXPECT_NE(Run("print list S ProductInput\n").find("scroll bar hidden"), std::string::npos);
  EXPECT_NE(Run("context-zitblt S ProductInput\nprint menu\n").find("title=\"ShowScrollBar\""),
            std::string::npos);
  EXPECT_NE(Run("balloon S ProductInput\n", false).find("has no scroll bar"), std::string::npos);
}

TEST_F(ZitBltListScriptTest, AListMakesItsManipulatorsAndSelectionWatchOnlyWhenNeeded) {
  QELIZitBltMgr_var manager{VORBaseUnknown_var(driver.FindObject("T"))};
  QELZitBltRep* empty = nullptr;
  ASSERT_EQ(manager->GetZitBlt("Empty", &empty), S_OK);
  QELBaseScrollListZitBltRep* bare = empty->GetScrollListRep();
  EXPECT_FALSE(bare->HasScrollManipulator() || bare->HasItemManipulator());
  EXPECT_FALSE(bare->IsWatchingSelection()) << "nothing of an empty list can be picked";

  // Seven items drawn in a range of five: the scroll bar, and the watch of its item reps.
  QELBaseScrollListZitBltRep* list = List();
  EXPECT_TRUE(list->HasScrollManipulator());
  EXPECT_TRUE(list->IsWatchingSelection());
  EXPECT_FALSE(list->HasItemManipulator());
  EXPECT_NE(Run("pick-item S ProductInput P2\n", false).find("is closed"), std::string::npos);
  Run("expand S ProductInput\npick-item S ProductInput P2\n");
  EXPECT_EQ(driver.GetEditor()->GetCSO()->GetSize(), 1);
  ASSERT_TRUE(list->HasItemManipulator()) << "made when the pick reached the list";
  EXPECT_EQ(list->GetItemManipulator()->GetElementCount(), 1);
  EXPECT_NE(Run("pick-item S ProductInput P7\n", false).find("scrolled out of view"),
            std::string::npos);
  // A click elsewhere empties the selection: the item leaves the manipulator.
  driver.GetEditor()->GetCSO()->Empty(1);
  EXPECT_EQ(list->GetItemManipulator()->GetElementCount(), 0);
  EXPECT_EQ(Run("print list T Empty\n"),
            "list \"Empty\" of \"T\": 0 items, range 5, first 1, scroll bar none, grey\n");
  EXPECT_FALSE(bare->HasScrollManipulator() || bare->HasItemManipulator());
}

TEST_F(ZitBltListScriptTest, SlidingTheButtonDownTheLeftEdgeTurnsTheListDownwards) {
  Run("expand S ProductInput\nslide S ProductInput 0 -12\n");
  EXPECT_EQ(List()->GetLocation(), VORUnicodeString("leftbottom"));
  EXPECT_NE(Run("print list S ProductInput\n")
                .find("item 1 \"P1\": kind 1, state 0, shown, "
                      "label (-17, -4.5)"),
            std::string::npos);
}

TEST_F(ZitBltListScriptTest, ASelectedItemDraggedOverAnotherActivityIsDroppedThereOrComesBack) {
  Run("expand S ProductInput\npick-item S ProductInput P2\n");
  QELBaseScrollListZitBltRep* list = List();
  ASSERT_EQ(list->GetItemManipulator()->GetElementCount(), 1);
  auto* item = dynamic_cast<VOR2DBagRep*>(
      VORIVisu_var(VORBaseUnknown_var(list->GetItemVisual(2)))->GetRep());
  auto* label = dynamic_cast<VOR2DBagRep*>(item->GetChild(1));
  // The label's middle in model coordinates: through the item and expanded bags.
  VOR3x3Matrix toModel = *list->GetZitBltExpanded()->GetMatrix() * *label->GetMatrix();
  const VORBox2D box = toModel.TransformBox(label->GetChild(1)->GetBoundingBox());
  double tx = 0, ty = 0;
  QELIPertNode_var(VORBaseUnknown_var(driver.FindObject("T")))->GetPosition(tx, ty, 1);

  std::vector<VORBaseUnknown*> targets;
  std::vector<int> cursors;
  auto watcher = VORCommand_var::Adopt(new VORCommand());
  watcher->AddCallback(list->GetItemManipulator()->GetEventPublisher(),
                       VORManipulator::kVORManipulate,
                       [&](VORBaseUnknown*, VORNotification*, void*) {
                         targets.push_back(list->GetDropTarget());
                         cursors.push_back(list->GetViewer()->GetCursor());
                       });
  ASSERT_TRUE(driver.Drag("", box.CentreX(), box.CentreY(), tx, ty)) << driver.LastError();
  ASSERT_FALSE(targets.empty());
  EXPECT_EQ(targets.back(), driver.FindObject("T")) << "the activity under the pointer";
  EXPECT_EQ(cursors.back(), 8) << "T takes the input";
  EXPECT_EQ(list->GetViewer()->GetCursor(), 25) << "after the drag";
  EXPECT_EQ(list->GetDropTarget(), nullptr);
  EXPECT_EQ(driver.GetEditor()->GetCSO()->GetSize(), 0) << "the selection is emptied";
  EXPECT_EQ(driver.TakeEvents(), std::vector<std::string>{"drop on \"T\": allowed"});
  EXPECT_EQ(Run("print list S ProductInput\n").find("\"P2\""), std::string::npos)
      << "the input went to T";

  // Released over no activity, an item goes back to its place.
  Run("pick-item S ProductInput P3\n");
  ASSERT_TRUE(driver.Drag("", box.CentreX(), box.CentreY(), box.CentreX(), box.CentreY() - 40.0))
      << driver.LastError();
  EXPECT_TRUE(driver.TakeEvents().empty());
  EXPECT_NE(Run("print list S ProductInput\n")
                .find("item 2 \"P3\": kind 1, state 0, shown, "
                      "label (-17, 3)"),
            std::string::npos)
      << "back in its place";
}

}  // namespace
