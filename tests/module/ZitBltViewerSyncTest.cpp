// The viewer keeps the ZitBlts of its level in step: opened on a level, after node drags, after
// a level switch, and when the model adds or removes children; the script step prints them.
#include <gtest/gtest.h>

#include <sstream>

#include "QELFpaProductFlowViewer.h"
#include "QELIPertNode.h"
#include "QELIZitBltMgr.h"
#include "QELZitBltRep.h"
#include "TempDir.h"
#include "VORDocument.h"
#include "VORDriver.h"
#include "VORFrmLayout.h"
#include "VORFrmPropertiesDlg.h"
#include "VORISPPItemMgt.h"
#include "VORModelDoor.h"
#include "VORModuleLoader.h"
#include "VORScript.h"
#include "ViewerTestSupport.h"
#include "ZitBltTestSupport.h"

namespace {

// The bundled configuration gives a station and a grouping four ZitBlts each: the input, output
// and resource lists and the status bar on the top edge (two interactive models per ZitBlt).
constexpr int kModelsPerNode = 2 * 4;
constexpr const char* kStatusBar = "BIWStationStatusBars";

class ZitBltViewerSyncTest : public ::testing::Test {
 protected:
  void SetUp() override {
    auto doc = VORProcess_var::Adopt(VORProcess::CreateNew("Line"));
    VORBaseUnknown_var root = doc->GetRootProcess();
    VORModelDoor& door = doc->GetDoor();
    VORBaseUnknown_var a = AddActivity(door, root, "A");
    door.AddFlow(a, AddActivity(door, root, "B"));
    AddActivity(door, AddActivity(door, root, "G", "BIWActivityGrouping"), "S1");
    OpenInViewer(driver, doc, dir.Path() + "/line.pprx");
  }
  void TearDown() override { driver.GetEditor() ? (void)driver.CloseWindow(Title()) : (void)0; }

  bool OpenViewerOn(const char* label) {
    return driver.PickObject(label) && driver.StartCommand("QELFpaProductFlowViewerCmd");
  }
  static QELFpaProductFlowViewer* Viewer() { return FindViewer(); }
  std::string Title() const { return Viewer() ? Viewer()->GetName().str() : std::string(); }
  VORBaseUnknown_var Object(const char* label) const {
    return VORBaseUnknown_var(driver.FindObject(label));
  }
  QELZitBltRep* StatusBar(const char* label) const {
    QELIZitBltMgr_var manager(Object(label));
    QELZitBltRep* rep = nullptr;
    if (manager)
      manager->GetZitBlt(kStatusBar, &rep);
    return rep;
  }
  // Where the status bar sits relative to the top middle of its node (0, 0 when on it).
  VORMathPoint2D OffsetFromTopMiddle(const char* label) const {
    double nx = 0, ny = 0, w = 0, h = 0, x = 0, y = 0;
    QELIPertNode_var node(Object(label));
    if (node->GetPosition(nx, ny, 1) == S_FALSE)  // drawn at its provisional place
      node->GetPosition(nx, ny, 0);
    node->GetSize(w, h);
    StatusBar(label)->GetPoDPosition(x, y);
    return {x - nx, y - (ny + h / 2)};
  }

  TempDir dir;
  VORDriver driver;
};

TEST_F(ZitBltViewerSyncTest, EveryActivityOfTheLevelGetsItsZitBltsOnItsNode) {
  ASSERT_NE(Viewer(), nullptr);
  for (const char* label : {"A", "B"}) {
    ASSERT_NE(StatusBar(label), nullptr) << label;
    EXPECT_EQ(OffsetFromTopMiddle(label).x, 0.0) << label;
    EXPECT_EQ(OffsetFromTopMiddle(label).y, 0.0) << label;
    // Shown through the editor's interactive set, in the viewer's scene.
    EXPECT_TRUE(StatusBar(label)->GetZitBltBtn()->IsShown());
  }
  QELZitBltRep* groupingBar = nullptr;  // the grouping has its own status bar
  QELIZitBltMgr_var(Object("G"))->GetZitBlt("BIWGroupingStatusBars", &groupingBar);
  EXPECT_NE(groupingBar, nullptr);
  EXPECT_EQ(StatusBar("S1"), nullptr);  // inside a collapsed grouping: none
  EXPECT_EQ(driver.GetEditor()->GetISO()->GetElements().Size(), 3 * kModelsPerNode);
}

TEST_F(ZitBltViewerSyncTest, ZitBltsFollowANodeDraggedInTheChart) {
  double x = 0, y = 0;
  QELIPertNode_var(Object("A"))->GetPosition(x, y);
  double bx = 0, by = 0;
  StatusBar("B")->GetPoDPosition(bx, by);
  ASSERT_TRUE(driver.Drag(Title(), x, y, x + 60, y - 40)) << driver.LastError();
  double nx = 0, ny = 0;
  QELIPertNode_var(Object("A"))->GetPosition(nx, ny);
  ASSERT_NE(nx, x);
  EXPECT_EQ(OffsetFromTopMiddle("A").x, 0.0);
  EXPECT_EQ(OffsetFromTopMiddle("A").y, 0.0);
  // The other node's ZitBlts stayed.
  double cx = 0, cy = 0;
  StatusBar("B")->GetPoDPosition(cx, cy);
  EXPECT_EQ(cx, bx);
  EXPECT_EQ(cy, by);
}

TEST_F(ZitBltViewerSyncTest, LevelSwitchMovesTheZitBltsToTheNewLevel) {
  ASSERT_TRUE(OpenViewerOn("G")) << driver.LastError();  // re-uses the window
  EXPECT_EQ(StatusBar("A"), nullptr);
  EXPECT_EQ(StatusBar("B"), nullptr);
  ASSERT_NE(StatusBar("S1"), nullptr);
  EXPECT_EQ(OffsetFromTopMiddle("S1").x, 0.0);
  EXPECT_EQ(OffsetFromTopMiddle("S1").y, 0.0);
  EXPECT_EQ(driver.GetEditor()->GetISO()->GetElements().Size(), kModelsPerNode);
  ASSERT_TRUE(OpenViewerOn("Line")) << driver.LastError();
  EXPECT_EQ(StatusBar("S1"), nullptr);
  ASSERT_NE(StatusBar("A"), nullptr);
  EXPECT_EQ(OffsetFromTopMiddle("A").y, 0.0);
}

TEST_F(ZitBltViewerSyncTest, ChildrenAddedOrRemovedInTheModelGainOrLoseTheirZitBlts) {
  VORProcess* doc = driver.GetDocument();
  VORBaseUnknown_var c;
  ASSERT_EQ(doc->GetDoor().CreateNode(doc->GetRootProcess(), "BIWActivityStation", c), S_OK);
  doc->GetDoor().SetLabel(c, VORUnicodeString("C"));
  EXPECT_TRUE(Viewer()->GetPertController()->IsInChart(c));
  QELIZitBltMgr_var manager(c);
  QELZitBltRep* rep = nullptr;
  EXPECT_EQ(manager->GetZitBlt(kStatusBar, &rep), S_OK);
  VORListValVORBaseUnknown_var* waiting = new VORListValVORBaseUnknown_var;
  Viewer()->NodesForReArrangement(waiting);
  EXPECT_NE(waiting->Locate(c), 0);  // to be placed by the next organise
  delete waiting;

  ASSERT_EQ(doc->GetDoor().RemoveNode(c), S_OK);
  EXPECT_FALSE(Viewer()->GetPertController()->IsInChart(c));
  EXPECT_EQ(manager->GetZitBlt(kStatusBar, &rep), E_FAIL);
  driver.DrainDeferred();
  EXPECT_EQ(driver.GetEditor()->GetISO()->GetElements().Size(), 3 * kModelsPerNode);
}

TEST_F(ZitBltViewerSyncTest, AClickOnTheButtonOpensAndClosesItAndADragSlidesItAlongItsEdge) {
  QELZitBltRep* bar = StatusBar("A");
  ASSERT_NE(bar, nullptr);
  double x = 0, y = 0;
  bar->GetPoDPosition(x, y);
  // The status bar's icon stands above the top edge: click its middle.
  ASSERT_TRUE(driver.PickInChart(Title(), x, y + 2)) << driver.LastError();
  EXPECT_FALSE(bar->IsButtonCollapse());
  ASSERT_TRUE(driver.PickInChart(Title(), x, y + 2)) << driver.LastError();
  EXPECT_TRUE(bar->IsButtonCollapse());
  // A drag to the right along the top edge, then one far beyond the node's right end.
  ASSERT_TRUE(driver.Drag(Title(), x, y + 2, x + 6, y + 5)) << driver.LastError();
  double nx = 0, ny = 0;
  bar->GetPoDPosition(nx, ny);
  EXPECT_GT(nx, x);
  EXPECT_EQ(ny, y);
  double xmin = 0, ymin = 0, xmax = 0, ymax = 0;
  bar->GetPositioningLimits(xmin, ymin, xmax, ymax);
  ASSERT_TRUE(driver.Drag(Title(), nx, y + 2, nx + 500, y + 2)) << driver.LastError();
  bar->GetPoDPosition(nx, ny);
  EXPECT_LE(nx, xmax);
}

TEST_F(ZitBltViewerSyncTest, ScriptPrintsEveryZitBltOfANode) {
  driver.TakeEvents();
  std::ostringstream out;
  VORScript script(driver, out);
  double x = 0, y = 0;
  StatusBar("A")->GetPoDPosition(x, y);
  ASSERT_TRUE(script.Run("zitblts A\nzitblts Line\n")) << out.str();
  std::ostringstream expected;
  expected << "> zitblts A\n"
           << "ZitBlt \"ProductInput\": location \"lefttop\", translation (" << x - 10 << ", " << y
           << "), status 1, closed\n"
           << "ZitBlt \"ProductOutput\": location \"righttop\", translation (" << x + 10 << ", "
           << y << "), status 1, closed\n"
           << "ZitBlt \"Resource\": location \"bottommiddle\", translation (" << x << ", " << y - 10
           << "), status 1, closed\n"
           << "ZitBlt \"BIWStationStatusBars\": location \"topmiddle\", translation (" << x << ", "
           << y << "), status 1, closed\n> zitblts Line\nno ZitBlts\n";
  EXPECT_EQ(out.str(), expected.str());
  EXPECT_FALSE(script.Run("zitblts Nowhere\n"));
}

// Product and assembly changes refresh the list ZitBlts of the activities they concern: a
// configuration whose station lists are filled by the recording test command.
class ZitBltViewerRefreshTest : public ::testing::Test {
 protected:
  void SetUp() override {
    startup.WriteConfig(
        "<Config><ActivityZitBlt ActivityType=\"BIWActivityStation\">"
        "<ZitBlt Name=\"ProductInput\" Type=\"QELZitBltRep\" LoadModule=\"QELZitBltVisu\">"
        "<UpdateData CmdName=\"QELTestListZitBltCmd\" LoadModule=\"QELZitBltTestCmds\"/></ZitBlt>"
        "<ZitBlt Name=\"ProductOutput\" Type=\"QELZitBltRep\" LoadModule=\"QELZitBltVisu\">"
        "<UpdateData CmdName=\"QELTestListZitBltCmd\" LoadModule=\"QELZitBltTestCmds\"/></ZitBlt>"
        "</ActivityZitBlt></Config>");
    auto doc = VORProcess_var::Adopt(VORProcess::CreateNew("Line"));
    VORModelDoor& door = doc->GetDoor();
    VORBaseUnknown_var s = AddActivity(door, doc->GetRootProcess(), "S");
    AddActivity(door, doc->GetRootProcess(), "T");
    VORBaseUnknown_var part, assembly;
    door.CreateProduct(doc->GetRootProduct(), "Floor", part, "P1");
    door.AssignItem(s, part);
    door.CreateMfgAssembly("Floor assembly", assembly, "M1");
    door.AssignItem(s, assembly);
    OpenInViewer(driver, doc, dir.Path() + "/line.pprx");
    log = reinterpret_cast<std::vector<std::string>* (*)()>(
        VORModuleLoader::FindSymbol("QELZitBltTestCmds", "QELTestListZitBltLog"))();
    log->clear();
  }
  VORBaseUnknown* Object(const char* id) const { return driver.GetDocument()->FindObject(id); }

  ZitBltStartupDir startup;
  TempDir dir;
  VORDriver driver;
  std::vector<std::string>* log = nullptr;
};

TEST_F(ZitBltViewerRefreshTest, AShowChangeOfAnAssignedPartRefreshesOnlyTheInputList) {
  ASSERT_EQ(driver.GetDocument()->GetDoor().SetShown(Object("P1"), false), S_OK);
  EXPECT_EQ(*log, std::vector<std::string>{"S/ProductInput/none"});
}

TEST_F(ZitBltViewerRefreshTest, DeletingAnAssemblyUnassignsItAndRefreshesEveryList) {
  VORBaseUnknown_var s(Object("S"));
  VORBaseUnknown_var assembly(Object("M1"));
  ASSERT_EQ(driver.GetDocument()->GetDoor().DeleteMfgAssembly(assembly), S_OK);
  // The unassignment reaches the station's commands first (an unassignment refreshes twice),
  // then the viewer refreshes every ZitBlt of the station.
  EXPECT_EQ(*log, (std::vector<std::string>{"S/ProductInput/none", "S/ProductInput/none",
                                            "S/ProductOutput/none", "S/ProductOutput/none",
                                            "S/ProductInput/none", "S/ProductOutput/none"}));
  EXPECT_FALSE(VORISPPItemMgt_var(s)->IsItemAssigned(assembly));
}

TEST_F(ZitBltViewerRefreshTest, ContextMenuOnASelectedPartOffersThePartsItems) {
  const std::string viewer = driver.FindWindow("")->GetName().str();
  ASSERT_TRUE(driver.PickObject("Floor")) << driver.LastError();
  // Far from every node: nothing preselected, so the selected part counts.
  ASSERT_TRUE(driver.OpenContextMenu(viewer, -500, -500)) << driver.LastError();
  std::string menu = driver.DescribeMenu();
  EXPECT_NE(menu.find("QELFpaPreviewWindowManagerCmd"), std::string::npos) << menu;
  EXPECT_EQ(menu.find("CenterGraph"), std::string::npos) << menu;
  // With a product space of the document open, its navigation items come too, and the product
  // space becomes the current window.
  ASSERT_TRUE(driver.StartCommand("ProductSpace")) << driver.LastError();
  VORFrmWindow* space = VORFrmLayout::GetCurrentLayout()->GetCurrentWindow();
  ASSERT_TRUE(driver.ActivateWindow(viewer)) << driver.LastError();
  ASSERT_TRUE(driver.OpenContextMenu(viewer, -500, -500)) << driver.LastError();
  menu = driver.DescribeMenu();
  for (const char* item : {"CenterGraph", "ReframeOn", "HideShow", "QELFpaPreviewWindowManagerCmd"})
    EXPECT_NE(menu.find(item), std::string::npos) << item << "\n" << menu;
  EXPECT_EQ(VORFrmLayout::GetCurrentLayout()->GetCurrentWindow(), space);
}

TEST_F(ZitBltViewerRefreshTest, TheContextMenuAlwaysOffersThePropertiesOfThePickedObject) {
  const std::string viewer = driver.FindWindow("")->GetName().str();
  // The picked activity (the viewer's level) has no item of its own, but Properties is there.
  ASSERT_TRUE(driver.OpenContextMenu(viewer, -500, -500)) << driver.LastError();
  EXPECT_NE(driver.DescribeMenu().find("Properties"), std::string::npos) << driver.DescribeMenu();
  ASSERT_TRUE(driver.ChooseMenuItem("Properties")) << driver.LastError();
  ASSERT_NE(VORFrmPropertiesDlg::Current(), nullptr);
  EXPECT_EQ(VORFrmPropertiesDlg::Current()->GetFields().front().second, "Line");
  // A picked part: its properties, read-only.
  ASSERT_TRUE(driver.PickObject("Floor")) << driver.LastError();
  ASSERT_TRUE(driver.OpenContextMenu(viewer, -500, -500)) << driver.LastError();
  ASSERT_TRUE(driver.ChooseMenuItem("Properties")) << driver.LastError();
  VORFrmPropertiesDlg* shown = VORFrmPropertiesDlg::Current();
  ASSERT_NE(shown, nullptr);
  EXPECT_EQ(shown->GetObject(), Object("P1"));
  EXPECT_EQ(shown->GetFields().front().second, "Floor");
  EXPECT_TRUE(shown->UserPressOK());
  driver.DrainDeferred();
}

}  // namespace
