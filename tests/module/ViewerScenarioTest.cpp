// The Product Flow Viewer as a planner uses it, through the headless driver: opening, re-use and
// refusal, titles, the organiser's levels, order, positions and cycle reports, placing new
// nodes, and the default-node-positions command around super nodes.
#include <gtest/gtest.h>

#include "RunProgram.h"

#include <cmath>
#include <cstdlib>
#include <random>
#include <string>
#include <vector>

#include <cstdio>
#include <fstream>
#include <iterator>
#include <regex>

#include "QELFpaProductFlowViewer.h"
#include "QELIFPAAdapters.h"
#include "QELIPertNode.h"
#include "QELIPertNodeExt.h"
#include "QELIPertWindow.h"
#include "QELPFVNodeOrganiser.h"
#include "QELPertNotifications.h"
#include "QELPertParameters.h"
#include "SampleLine.h"
#include "TempDir.h"
#include "VORDeferredDeletion.h"
#include "VORDocument.h"
#include "VORDriver.h"
#include "VORFileIO.h"
#include "VORFrmWindowKinds.h"
#include "VORIGraphNodeLayout.h"
#include "VORIModelEvents.h"
#include "VORISPPFlowMgt.h"
#include "VORModelDoor.h"
#include "VORTrace.h"

namespace {

// The graph editor's snapping: centres of 25-unit cells.
double Snap(double v) {
  const double c = QELPertParameters::PERT_GRID_CELL_SIZE;
  return std::floor((v - c / 2) / c + 0.5) * c + c / 2;
}

struct Point {
  double x;
  double y;
  bool operator==(const Point&) const = default;
};

// A document built through the model's door, saved, and opened through the driver.
class ViewerTest : public ::testing::Test {
 protected:
  void SetUp() override {
    unsetenv("ADL_ODT_OUT");
    doc = VORProcess_var::Adopt(VORProcess::CreateNew("Line"));
    root = doc->GetRootProcess();
  }
  void TearDown() override { unsetenv("ADL_ODT_OUT"); }

  VORBaseUnknown_var Node(VORBaseUnknown* father, const char* label,
                          const char* type = "BIWActivityStation") {
    VORBaseUnknown_var node;
    EXPECT_EQ(doc->GetDoor().CreateNode(father, type, node), S_OK);
    doc->GetDoor().SetLabel(node, VORUnicodeString(label));
    return node;
  }
  void Flow(const VORBaseUnknown_var& from, const VORBaseUnknown_var& to) {
    EXPECT_EQ(doc->GetDoor().AddFlow(from, to), S_OK);
  }
  // Activities labelled labels under root, each flowing into the next.
  void Chain(std::initializer_list<const char*> labels) {
    VORBaseUnknown_var previous;
    for (const char* label : labels) {
      VORBaseUnknown_var node = Node(root, label);
      if (previous)
        Flow(previous, node);
      previous = node;
    }
  }
  // Saves the document built so far and opens it; the driver's document replaces doc.
  void Open(const std::string& name = "line.pprx") {
    std::string error;
    const std::string file = dir.Path() + "/" + name;
    ASSERT_TRUE(doc->SaveAs(file, error)) << error;
    ASSERT_TRUE(driver.OpenDocument(file)) << driver.LastError();
    doc = driver.GetDocument();
    root = doc->GetRootProcess();
  }
  VORBaseUnknown* Find(const char* label) const { return driver.FindObject(label); }
  // Selects the activity, then starts the command, which takes the selection.
  bool OpenViewerOn(const char* label) {
    return driver.PickObject(label) && driver.StartCommand("QELFpaProductFlowViewerCmd");
  }
  std::vector<QELFpaProductFlowViewer*> Viewers() const {
    std::vector<QELFpaProductFlowViewer*> viewers;
    for (VORFrmWindow* w : VORFrmLayout::GetCurrentLayout()->GetWindowList()) {
      if (w->IsAKindOf(QELFpaProductFlowViewer::ClassName()))
        viewers.push_back(static_cast<QELFpaProductFlowViewer*>(w));
    }
    return viewers;
  }
  QELFpaProductFlowViewer* Viewer() const {
    auto v = Viewers();
    return v.empty() ? nullptr : v.front();
  }
  Point Position(const char* label) const {
    Point p{0, 0};
    VORIGraphNodeLayout_var(Find(label))->GetPertPosition(p.x, p.y);
    return p;
  }
  // Places the new nodes of the viewer's level with a fresh organiser.
  bool PositionNew(VORListValVORBaseUnknown_var& nodes) {
    auto* organiser = new QELPFVNodeOrganiser();
    VORListValVORBaseUnknown_var* list = &nodes;
    const bool placed = organiser->PositionNewNode(root, list, Viewer()->GetPertController());
    organiser->RequestDelayedDestruction();
    return placed;
  }
  // Runs an organiser on the viewer's level.
  bool Arrange(QELPFVNodeOrganiser*& organiser) {
    organiser = new QELPFVNodeOrganiser();
    return organiser->ArrangeNodes(Viewer()->GetRootNode(), Viewer()->GetPertController());
  }

  TempDir dir;
  VORDriver driver;
  VORProcess_var doc;
  VORBaseUnknown_var root;
};

}  // namespace

// --- Opening, re-use and refusal -----------------------------------------------------------

TEST_F(ViewerTest, OpensOnAPickedActivityShowsItsChildrenAndRegistersTheChart) {
  auto a = Node(root, "A");
  auto b = Node(root, "B");
  Node(root, "Start", "Start");
  Flow(a, b);
  Open();
  ASSERT_TRUE(OpenViewerOn("Line")) << driver.LastError();
  const std::vector<std::string> events = driver.TakeEvents();
  ASSERT_FALSE(events.empty());
  EXPECT_EQ(events.back(), "command QELFpaProductFlowViewerCmd ended");
  ASSERT_EQ(Viewers().size(), 1u);
  QELFpaProductFlowViewer* viewer = Viewer();
  EXPECT_EQ(viewer->GetName().str(), "LineProduct Flow Viewer");
  EXPECT_EQ(viewer->GetRootNode(), root);
  EXPECT_EQ(VORFrmLayout::GetCurrentLayout()->GetCurrentWindow(), viewer);
  // Every child graph node is drawn, control nodes included.
  ASSERT_NE(viewer->GetPertController(), nullptr);
  EXPECT_EQ(viewer->GetPertController()->GetNodeCount(), 3);
  EXPECT_EQ(QELIPertWindow_var(static_cast<VORFrmWindow*>(viewer))->GetPertController(),
            viewer->GetPertController());
  // All nodes were new: the whole level was laid out (A before B, one column each).
  EXPECT_LT(Position("A").x, Position("B").x);
  // The root process knows the chart.
  QELIFPAAdapters_var adapters(root);
  ASSERT_TRUE(adapters);
  EXPECT_NE(adapters->GetPertAdapter(), nullptr);
  EXPECT_EQ(adapters->GetPertController(), viewer->GetPertController());
  double x = 0, y = 0;
  EXPECT_EQ(adapters->GetPertAdapter()->GetStoredNodePosition(Find("B"), x, y), S_OK);
  EXPECT_EQ((Point{x, y}), Position("B"));
  // Closing the window lets the root process forget the controller.
  ASSERT_TRUE(driver.CloseWindow(viewer->GetTitle().ConvertToUTF8()));
  EXPECT_EQ(adapters->GetPertController(), nullptr);
  EXPECT_TRUE(Viewers().empty());
}

TEST_F(ViewerTest, OneViewerPerDocumentIsReusedAndSwitchesLevels) {
  auto a = Node(root, "A");
  auto g = Node(root, "G", "BIWActivityGrouping");
  Node(g, "G1");
  Node(g, "G2");
  Node(g, "G3");
  Open();
  ASSERT_TRUE(OpenViewerOn("Line"));
  QELFpaProductFlowViewer* viewer = Viewer();
  // The same level again: the window is only made current.
  ASSERT_TRUE(driver.ActivateWindow("line.pprx"));
  ASSERT_TRUE(OpenViewerOn("Line"));
  EXPECT_EQ(Viewers().size(), 1u);
  EXPECT_EQ(VORFrmLayout::GetCurrentLayout()->GetCurrentWindow(), viewer);
  // Another level: the same window shows the group's children.
  ASSERT_TRUE(OpenViewerOn("G"));
  ASSERT_EQ(Viewers().size(), 1u);
  EXPECT_EQ(Viewer(), viewer);
  EXPECT_EQ(viewer->GetRootNode().Identity(), Find("G"));
  EXPECT_EQ(viewer->GetPertController()->GetNodeCount(), 3);
  EXPECT_TRUE(viewer->GetPertController()->IsInChart(Find("G2")));
  EXPECT_FALSE(viewer->GetPertController()->IsInChart(Find("A")));
  EXPECT_NE(viewer->GetWindowTitle().ConvertToUTF8().find("Line\\G"), std::string::npos);
}

TEST_F(ViewerTest, IsRefusedWhileTheDocumentsPertChartIsOpenButNotForAnotherDocument) {
  Node(root, "A");
  Open("first.pprx");
  ASSERT_TRUE(driver.PickObject("Line"));
  ASSERT_TRUE(driver.StartCommand("PertChart"));
  driver.TakeEvents();
  ASSERT_TRUE(OpenViewerOn("Line"));
  EXPECT_TRUE(Viewers().empty());
  ASSERT_FALSE(driver.Notifications().empty());
  EXPECT_EQ(driver.Notifications().back().title, "Error");
  EXPECT_EQ(driver.Notifications().back().text, "Please Close the PERT Chart and Try.");

  // A second document without a PERT chart opens its viewer all the same.
  doc = VORProcess_var::Adopt(VORProcess::CreateNew("Other"));
  root = doc->GetRootProcess();
  Node(root, "B");
  Open("second.pprx");
  const size_t shown = driver.Notifications().size();
  ASSERT_TRUE(OpenViewerOn("Other"));
  EXPECT_EQ(Viewers().size(), 1u);
  EXPECT_EQ(driver.Notifications().size(), shown);
}

TEST_F(ViewerTest, OnlyActivitiesCanBePicked) {
  Node(root, "A");
  VORBaseUnknown_var panel;
  ASSERT_EQ(doc->GetDoor().CreateProduct(doc->GetRootProduct(), "Side panel", panel), S_OK);
  Open();
  ASSERT_TRUE(driver.StartCommand("QELFpaProductFlowViewerCmd"));
  driver.PickObject("Side panel");  // a product: refused, the command waits
  EXPECT_NE(driver.GetRunningCommand(), nullptr);
  EXPECT_TRUE(Viewers().empty());
  ASSERT_TRUE(driver.PickObject("A"));
  EXPECT_EQ(driver.GetRunningCommand(), nullptr);
  ASSERT_EQ(Viewers().size(), 1u);
  EXPECT_EQ(Viewer()->GetRootNode().Identity(), Find("A"));
}

TEST_F(ViewerTest, ClosingRestoresTheGraphEditorParametersAndTracesTheWindowsSteps) {
  Node(root, "A");
  Open();
  std::vector<std::string> lines;
  VORTrace::SetEnabledChannels("QELProductFlowViewerTrace,QELFpaViewerCmdsTrace");
  VORTrace::SetSink([&](const std::string& channel, const std::string& line) {
    lines.push_back(channel + ": " + line);
  });
  ASSERT_TRUE(OpenViewerOn("Line"));
  QELPertParameters::PERT_GRID_CELL_SIZE = 40.0;
  QELPertParameters::PERT_LABEL_HEIGHT = 3.5;
  ASSERT_TRUE(driver.CloseWindow(Viewer()->GetTitle().ConvertToUTF8()));
  driver.DrainDeferred();
  VORTrace::SetSink({});
  VORTrace::SetEnabledChannels("");
  EXPECT_EQ(QELPertParameters::PERT_GRID_CELL_SIZE, 25.0);
  EXPECT_EQ(QELPertParameters::PERT_LABEL_HEIGHT, 2.0);
  auto has = [&](const std::string& line) {
    return std::find(lines.begin(), lines.end(), line) != lines.end();
  };
  EXPECT_TRUE(has("QELFpaViewerCmdsTrace:  \n  QELFpaProductFlowViewerCmd::BuildGraph -->"));
  EXPECT_TRUE(has("QELFpaViewerCmdsTrace: Created the PERT Adapter"));
  EXPECT_TRUE(has("QELProductFlowViewerTrace: QELFpaProductFlowViewer::Constructor <--"));
  EXPECT_TRUE(has("QELProductFlowViewerTrace: QELFpaProductFlowViewer::DeleteWindow <--"));
  EXPECT_TRUE(has("QELProductFlowViewerTrace: QELPFVNodeOrganiser::ArrangeNodes -->"));
  EXPECT_TRUE(has("QELProductFlowViewerTrace: QELPFVNodeOrganiser::GetViewerOrSuperNodeSize -->"));
  EXPECT_TRUE(has("QELProductFlowViewerTrace: QELPFVNodeOrganiser::DispatchNotif -->"));
  EXPECT_EQ(std::count(lines.begin(), lines.end(),
                       "QELProductFlowViewerTrace: QELFpaProductFlowViewer::Destructor -->"),
            2);
}

// --- Titles --------------------------------------------------------------------------------

TEST_F(ViewerTest, TheTitleNamesFileAndLevelPathAndShortensToTheWindowWidth) {
  auto g = Node(root, "Framing group", "BIWActivityGrouping");
  Node(g, "S1");
  Open("underbody.pprx");
  ASSERT_TRUE(OpenViewerOn("Framing group"));
  QELFpaProductFlowViewer* viewer = Viewer();
  const std::string full = "underbody.pprx\\Line\\Framing group - Product Flow Viewer";
  EXPECT_EQ(viewer->GetWindowTitle().ConvertToUTF8(), full);
  EXPECT_EQ(viewer->GetTitle().ConvertToUTF8(), full) << "wide enough: shown whole";
  // 200 pixels for 55 characters: the first and last 10 around "...".
  viewer->SetRectangle(VORRectangle{0, 0, 200, 300});
  EXPECT_EQ(viewer->GetTitle().ConvertToUTF8(),
            full.substr(0, 10) + "..." + full.substr(full.size() - 10));
  // Growing the window shows it whole again.
  viewer->SetRectangle(VORRectangle{0, 0, 1000, 300});
  EXPECT_EQ(viewer->GetTitle().ConvertToUTF8(), full);
  // Before the window is placed, the viewer's width (800) decides.
  viewer->SetRectangle(VORRectangle{0, 0, 0, 0});
  viewer->SetPFWindowName(VORIGENode_var(root));
  EXPECT_EQ(viewer->GetWindowTitle().ConvertToUTF8(), "underbody.pprx\\Line - Product Flow Viewer");
  EXPECT_EQ(viewer->GetTitle(), viewer->GetWindowTitle());
}

// --- The organiser: levels, order, positions and cycles --------------------------------------

TEST_F(ViewerTest, AChainTakesOneColumnPerLevelAndIndependentNodesShareOne) {
  Chain({"A", "B", "C"});
  Open();
  ASSERT_TRUE(OpenViewerOn("Line"));
  // Levels 0, 1, 2: square side 100, 50 between columns, y = 50; snapped as it goes.
  const double x0 = Snap(0.0);
  const double x1 = Snap(x0 + 50.0);
  const double x2 = Snap(x1 + 50.0);
  EXPECT_EQ(Position("A"), (Point{x0, Snap(50.0)}));
  EXPECT_EQ(Position("B"), (Point{x1, Snap(50.0)}));
  EXPECT_EQ(Position("C"), (Point{x2, Snap(50.0)}));
  // The chart's boxes follow the document.
  double bx = 0, by = 0;
  QELIPertNodeExt_var(Find("B"))->GetPosition(bx, by, 1);
  EXPECT_EQ((Point{bx, by}), Position("B"));
}

TEST_F(ViewerTest, ThreeIndependentNodesSpreadOverTheSquareInOneColumn) {
  Node(root, "P");
  Node(root, "Q");
  Node(root, "R");
  Open();
  ASSERT_TRUE(OpenViewerOn("Line"));
  // Side 150, rows at 25, 75, 125, each snapped and the next row added to the snapped value.
  const double y0 = Snap(25.0);
  const double y1 = Snap(y0 + 50.0);
  const double y2 = Snap(y1 + 50.0);
  EXPECT_EQ(Position("P"), (Point{Snap(0.0), y0}));
  EXPECT_EQ(Position("Q"), (Point{Snap(0.0), y1}));
  EXPECT_EQ(Position("R"), (Point{Snap(0.0), y2}));
}

TEST_F(ViewerTest, UnequalBranchesThatMeetAgainAreReportedAtTheMeetingNodeAndNothingMoves) {
  auto a = Node(root, "A");
  auto b = Node(root, "B");
  auto c = Node(root, "C");
  auto d = Node(root, "D");
  auto e = Node(root, "E");
  Flow(a, b);
  Flow(b, d);
  Flow(a, c);
  Flow(c, e);
  Flow(e, d);
  Open();
  ASSERT_TRUE(OpenViewerOn("Line"));
  ASSERT_FALSE(driver.Notifications().empty());
  const VORDlgNotifyRecord& warning = driver.Notifications().back();
  EXPECT_EQ(warning.title, "Cyclic Precedence");
  ASSERT_GE(warning.text.size(), 2u);
  EXPECT_EQ(warning.text.substr(warning.text.size() - 2), " D");
  for (const char* label : {"A", "B", "C", "D", "E"})
    EXPECT_FALSE(VORIGraphNodeLayout_var(Find(label))->HasPertPosition()) << label;
}

TEST_F(ViewerTest, ATrueCycleNamesTheFirstNodeMetAgainAndTheWarningCanBeSilenced) {
  auto a = Node(root, "A");
  auto b = Node(root, "B");
  Flow(a, b);
  Flow(b, a);
  Open();
  ASSERT_TRUE(OpenViewerOn("Line"));
  ASSERT_FALSE(driver.Notifications().empty());
  const std::string text = driver.Notifications().back().text;
  EXPECT_EQ(text.substr(text.size() - 2), " A");

  setenv("ADL_ODT_OUT", "1", 1);
  const size_t shown = driver.Notifications().size();
  QELPFVNodeOrganiser* organiser = nullptr;
  EXPECT_TRUE(Arrange(organiser));
  EXPECT_TRUE(organiser->IsCyclic());
  EXPECT_EQ(organiser->GetCyclicActivityName().ConvertToUTF8(), "A");
  organiser->RequestDelayedDestruction();
  EXPECT_EQ(driver.Notifications().size(), shown) << "no dialog under ADL_ODT_OUT";
}

TEST_F(ViewerTest, EveryMoveIsAnnouncedOnTheChartRoot) {
  Chain({"A", "B"});
  Open();
  ASSERT_TRUE(OpenViewerOn("Line"));
  std::vector<std::string> moved;
  VORIModelEvents_var events(root);
  const VORCallbackId id = events->GetEventPublisher()->AddCallback(
      "QELPertPositionNotify",
      [&](VORBaseUnknown*, const std::string&, VORNotification* n, void*, VORCallbackId) {
        auto* p = static_cast<QELPertPositionNotify*>(n);
        VORUnicodeString label;
        VORIGENode_var(p->GetNode())->GetLabel(label);
        moved.push_back(label.ConvertToUTF8());
      });
  QELPFVNodeOrganiser* organiser = nullptr;
  EXPECT_TRUE(Arrange(organiser));
  organiser->RequestDelayedDestruction();
  events->GetEventPublisher()->RemoveCallback(id);
  EXPECT_EQ(moved, (std::vector<std::string>{"A", "B"}));
}

TEST_F(ViewerTest, BadArgumentsAreRefusedAndEmptyLevelsAreNoError) {
  Node(root, "A");
  Open();
  ASSERT_TRUE(OpenViewerOn("Line"));
  auto* organiser = new QELPFVNodeOrganiser();
  EXPECT_FALSE(organiser->ArrangeNodes(NULL_var, Viewer()->GetPertController()));
  EXPECT_FALSE(organiser->ArrangeNodes(root, nullptr));
  EXPECT_TRUE(organiser->ArrangeNodes(Find("A"), Viewer()->GetPertController())) << "no children";
  VORListValVORBaseUnknown_var* none = nullptr;
  EXPECT_FALSE(organiser->PositionNewNode(root, none, Viewer()->GetPertController()));
  organiser->RequestDelayedDestruction();
}

// --- PositionNewNode ------------------------------------------------------------------------

TEST_F(ViewerTest, ANewNodeLandsWhereAFullLayoutPutsItWithEverythingDownstream) {
  Chain({"A", "B", "C"});
  Open();
  ASSERT_TRUE(OpenViewerOn("Line"));
  const Point before[] = {Position("A"), Position("B"), Position("C")};
  // A new node N after A, leading to C.
  VORBaseUnknown_var n = Node(root, "N");
  Flow(Find("A"), n);
  Flow(n, Find("C"));
  VORBaseUnknown_var added(n);
  Viewer()->GetPertController()->AddChildNode(added);

  VORListValVORBaseUnknown_var newNodes;
  newNodes.Append(n);
  EXPECT_TRUE(PositionNew(newNodes));
  // Levels: A 0, B and N 1, C 2; side 100, two rows on level 1 (25, 75), one on level 2.
  // N's columns start one step right of A's position; B keeps its place, C moves with N.
  const double x1 = before[0].x + 50.0;
  const double yB = Snap(25.0);
  const double yN = Snap(yB + 50.0);
  EXPECT_EQ(Position("A"), before[0]);
  EXPECT_EQ(Position("B"), before[1]);
  EXPECT_EQ(Position("N"), (Point{Snap(x1), yN}));
  EXPECT_EQ(Position("C"), (Point{Snap(Snap(x1) + 50.0), Snap(50.0)}));
}

TEST_F(ViewerTest, PositionNewNodeWithNothingNewOrAStrangerMovesNothing) {
  Chain({"A", "B"});
  Open();
  ASSERT_TRUE(OpenViewerOn("Line"));
  const Point pa = Position("A");
  const Point pb = Position("B");
  VORListValVORBaseUnknown_var list;
  EXPECT_TRUE(PositionNew(list));
  VORBaseUnknown_var stranger;
  ASSERT_EQ(doc->GetDoor().CreateNode(Find("A"), "BIWActivityStation", stranger), S_OK);
  list.Append(stranger);
  EXPECT_TRUE(PositionNew(list));
  EXPECT_EQ(Position("A"), pa);
  EXPECT_EQ(Position("B"), pb);
}

TEST_F(ViewerTest, TheChangeListKeepsDuplicatesOfNodesReachedTwice) {
  auto a = Node(root, "A");
  auto b = Node(root, "B");
  auto c = Node(root, "C");
  auto d = Node(root, "D");
  Flow(a, b);
  Flow(a, c);
  Flow(b, d);
  Flow(c, d);
  auto* organiser = new QELPFVNodeOrganiser();
  auto* list = new VORListValVORBaseUnknown_var;
  int entries = 0;
  VORTrace::SetEnabledChannels("QELProductFlowViewerTrace");
  VORTrace::SetSink([&](const std::string&, const std::string& line) {
    entries += line == "QELPFVNodeOrganiser::GetActListForPosChange -->";
  });
  organiser->GetActListForPosChange(a, list);
  VORTrace::SetSink({});
  VORTrace::SetEnabledChannels("");
  // One entry line per walk: A's, B's, D's (from B), C's, D's (from C).
  EXPECT_EQ(entries, 5);
  // A, its successors B C, then B's walk (B, D, D's walk: D), then C's (C, D, D).
  std::vector<std::string> labels;
  for (const VORBaseUnknown_var& o : *list) {
    VORUnicodeString label;
    VORIGENode_var(o)->GetLabel(label);
    labels.push_back(label.ConvertToUTF8());
  }
  EXPECT_EQ(labels, (std::vector<std::string>{"A", "B", "C", "B", "D", "D", "C", "D", "D"}));
  delete list;
  organiser->RequestDelayedDestruction();
  VORDeferredDeletion::Drain();
}

// --- The default-node-positions command around super nodes -----------------------------------

TEST_F(ViewerTest, OrganiseLaysOutAgainAndReExpandsOnlyTheSuperNodesItCollapsed) {
  auto a = Node(root, "A");
  auto open = Node(root, "Open group", "BIWActivityGrouping");
  auto shut = Node(root, "Shut group", "BIWActivityGrouping");
  Node(open, "O1");
  Node(open, "O2");
  Node(shut, "C1");
  Flow(a, open);
  Flow(open, shut);
  doc->GetDoor().SetPertNodeState(open, PertNodeExpanded);
  doc->GetDoor().SetPertNodeState(shut, PertNodeCollapsed);
  Open();
  ASSERT_TRUE(OpenViewerOn("Line"));
  QELPertController* controller = Viewer()->GetPertController();
  EXPECT_TRUE(controller->IsInChart(Find("O1")));
  EXPECT_FALSE(controller->IsInChart(Find("C1")));
  // Scatter the top level, then restore the default positions.
  for (const char* label : {"A", "Open group", "Shut group"}) {
    VORBaseUnknown_var node(Find(label));
    QELIPertNode_var(node)->SetPosition(500.0, 500.0, 1);
  }
  ASSERT_TRUE(driver.StartCommand("QELFpaNodeOrganizeCmd")) << driver.LastError();
  EXPECT_EQ(QELIPertNodeExt_var(Find("Open group"))->GetState(1), PertNodeExpanded);
  EXPECT_EQ(QELIPertNodeExt_var(Find("Shut group"))->GetState(1), PertNodeCollapsed);
  EXPECT_TRUE(controller->IsInChart(Find("O1")));
  EXPECT_FALSE(controller->IsInChart(Find("C1")));
  const double x0 = Snap(0.0);
  EXPECT_EQ(Position("A"), (Point{x0, Snap(50.0)}));
  EXPECT_EQ(Position("Open group"), (Point{Snap(x0 + 50.0), Snap(50.0)}));
  // Running it twice works the same (the collapsed list starts empty again).
  ASSERT_TRUE(driver.StartCommand("QELFpaNodeOrganizeCmd"));
  EXPECT_EQ(QELIPertNodeExt_var(Find("Open group"))->GetState(1), PertNodeExpanded);
  EXPECT_EQ(Position("A"), (Point{x0, Snap(50.0)}));
}

TEST_F(ViewerTest, OrganiseDoesNothingWithoutAViewerAsCurrentWindow) {
  auto a = Node(root, "A");
  doc->GetDoor().SetPertPosition(a, true, 300.0, 300.0);
  Open();
  ASSERT_TRUE(driver.StartCommand("QELFpaNodeOrganizeCmd")) << driver.LastError();
  EXPECT_EQ(Position("A"), (Point{300.0, 300.0}));
  EXPECT_EQ(driver.GetRunningCommand(), nullptr);
}

// --- The same story as a script ---------------------------------------------------------------

TEST_F(ViewerTest, ExportLaysTheRootLevelOutWithTheOrganiserOnRequest) {
  auto a = Node(root, "A");
  auto b = Node(root, "B");
  Flow(a, b);
  doc->GetDoor().SetPertPosition(a, true, 512.5, 512.5);
  doc->GetDoor().SetPertPosition(b, true, 12.5, 12.5);
  std::string error;
  const std::string file = dir.Path() + "/export.pprx";
  ASSERT_TRUE(doc->SaveAs(file, error)) << error;
  int status = 0;
  const std::string stored = RunProgram(PFV_BINARY " export " + file + " 2>/dev/null", status);
  EXPECT_EQ(status, 0);
  const std::string organised =
      RunProgram(PFV_BINARY " export " + file + " --organise 2>/dev/null", status);
  EXPECT_EQ(status, 0);
  // The stored layout puts A far above and right of B; the organiser puts A left of B on one
  // row, which shrinks the picture.
  ASSERT_NE(stored.find("<svg"), std::string::npos) << stored;
  ASSERT_NE(organised.find("<svg"), std::string::npos) << organised;
  EXPECT_NE(stored, organised);
  EXPECT_LT(organised.size(), stored.size());
  // A cycle keeps the stored positions and says so.
  doc->GetDoor().AddFlow(b, a);
  ASSERT_TRUE(doc->SaveAs(file, error)) << error;
  const std::string cyclic = RunProgram(
      PFV_BINARY " export " + file + " --organise --out " + dir.Path() + "/c.svg 2>&1", status);
  EXPECT_EQ(status, 0);
  EXPECT_NE(cyclic.find("the flows are cyclic"), std::string::npos) << cyclic;
}

TEST(ViewerScriptTest, OpeningOrganisingAndSwitchingLevelsAsAScript) {
  TempDir dir;
  const std::string document = dir.Path() + "/line.pprx";
  ASSERT_EQ(SaveSampleLine(document), "");
  ::setenv("SCENARIO_DOC", document.c_str(), 1);
  ExpectScriptPrints(PFV_BINARY, VIEWER_DATA "/viewer_story.pfvs",
                     VIEWER_DATA "/viewer_story.expected", {{document, "SCENARIO_DOC"}});
}

// --- Invariants over generated levels ---------------------------------------------------------

TEST_F(ViewerTest, OnGeneratedLevelsFlowsGoRightAndNoTwoNodesShareAPlace) {
  std::mt19937 rng(11);
  int laidOut = 0;
  int refused = 0;
  for (int round = 0; round < 60; ++round) {
    doc = VORProcess_var::Adopt(VORProcess::CreateNew("Line"));
    root = doc->GetRootProcess();
    const int n = 2 + static_cast<int>(rng() % 20);
    std::vector<VORBaseUnknown_var> nodes;
    for (int i = 0; i < n; ++i)
      nodes.push_back(Node(root, ("N" + std::to_string(i)).c_str()));
    // Forward flows in a hidden order, children stored shuffled.
    std::vector<int> rank(static_cast<size_t>(n));
    for (int i = 0; i < n; ++i)
      rank[static_cast<size_t>(i)] = i;
    std::shuffle(rank.begin(), rank.end(), rng);
    for (int i = 0; i < n; ++i)
      for (int j = 0; j < n; ++j)
        if (rank[static_cast<size_t>(i)] < rank[static_cast<size_t>(j)] && rng() % 4 == 0)
          Flow(nodes[static_cast<size_t>(i)], nodes[static_cast<size_t>(j)]);
    VORFrmEditor* editor = VORApplicationFrame::GetApplicationFrame()->OpenDocument(doc);
    ASSERT_NE(editor, nullptr);
    auto* window = new QELFpaProductFlowViewer("Generated", editor, root);
    auto* organiser = new QELPFVNodeOrganiser();
    ASSERT_TRUE(organiser->ArrangeNodes(root, window->GetPertController()));
    const bool cyclic = organiser->IsCyclic();
    organiser->RequestDelayedDestruction();
    std::vector<Point> placed;
    for (int i = 0; i < n; ++i) {
      VORIGraphNodeLayout_var layout(nodes[static_cast<size_t>(i)]);
      if (cyclic) {
        EXPECT_FALSE(layout->HasPertPosition()) << "round " << round;
        continue;
      }
      if (!layout->HasPertPosition())
        continue;
      Point p{0, 0};
      layout->GetPertPosition(p.x, p.y);
      for (const Point& q : placed)
        EXPECT_FALSE(p == q) << "round " << round << ": two nodes at (" << p.x << ", " << p.y
                             << ")";
      placed.push_back(p);
      VORListValVORBaseUnknown_var* next = nullptr;
      VORISPPFlowMgt_var(nodes[static_cast<size_t>(i)])->GetNextActivities(next);
      for (const VORBaseUnknown_var& s : *next) {
        VORIGraphNodeLayout_var target(s);
        if (!target->HasPertPosition())
          continue;
        double x = 0, y = 0;
        target->GetPertPosition(x, y);
        EXPECT_LT(p.x, x) << "round " << round << ": a flow going left";
      }
      delete next;
    }
    (cyclic ? refused : laidOut)++;
    VORApplicationFrame::GetApplicationFrame()->CloseAll();
  }
  EXPECT_GT(laidOut, 10);
  EXPECT_GT(refused, 5);
}

TEST_F(ViewerTest, ExportOfAllLevelsWritesAContentsPageAndOnePagePerActivityWithChildren) {
  // Line > Body line > {S1 > {L1, J1}, S2, G > {S3 > {J2}}}: five levels have a chart.
  auto line = Node(root, "Body line");
  auto s1 = Node(line, "S1");
  Node(s1, "L1", "BIWActivityLoading");
  Node(s1, "J1", "BIWActivitySpotWelding");
  Node(line, "S2");
  auto group = Node(line, "G", "BIWActivityGrouping");
  auto s3 = Node(group, "S3");
  Node(s3, "J2", "BIWActivityClinching");
  std::string error;
  const std::string file = dir.Path() + "/nested.pprx";
  ASSERT_TRUE(doc->SaveAs(file, error)) << error;
  const std::string pdf = dir.Path() + "/plan.pdf";
  int status = 0;
  const std::string log =
      RunProgram(PFV_BINARY " export " + file + " --all-levels --out " + pdf + " 2>&1", status);
#ifndef PFV_WITH_QT
  // PDF is written by the Qt shell: a build without it says so.
  EXPECT_NE(status, 0);
  EXPECT_NE(log.find("which this build cannot write"), std::string::npos) << log;
  return;
#endif
  ASSERT_EQ(status, 0) << log;
  // Depth first, a parent before its children, each titled with its path.
  const std::string rootPath = VORFrmObjectLabel(root).ConvertToUTF8();
  const std::vector<std::string> expected{
      "page 2: " + rootPath + " (1 nodes)", "page 3: " + rootPath + " / Body line (3 nodes)",
      "page 4: " + rootPath + " / Body line / S1 (2 nodes)",
      "page 5: " + rootPath + " / Body line / G (1 nodes)",
      "page 6: " + rootPath + " / Body line / G / S3 (1 nodes)"};
  size_t at = 0;
  for (const std::string& want : expected) {
    const size_t found = log.find(want, at);
    ASSERT_NE(found, std::string::npos) << want << "\n" << log;
    at = found;
  }
  std::ifstream in(pdf, std::ios::binary);
  const std::string bytes((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
  ASSERT_EQ(bytes.rfind("%PDF", 0), 0u);
  const std::regex page("/Type\\s*/Page\\b");
  EXPECT_EQ(
      std::distance(std::sregex_iterator(bytes.begin(), bytes.end(), page), std::sregex_iterator()),
      6)
      << "the contents and five charts";

  // Without a PDF to write, or with one activity as well, the command says how to use it.
  RunProgram(PFV_BINARY " export " + file + " --all-levels 2>&1", status);
  EXPECT_NE(status, 0);
  const std::string svg = RunProgram(
      PFV_BINARY " export " + file + " --all-levels --out " + dir.Path() + "/p.svg 2>&1", status);
  EXPECT_NE(status, 0);
  EXPECT_NE(svg.find("writes a PDF"), std::string::npos) << svg;
}
