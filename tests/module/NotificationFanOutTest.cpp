// What one change costs on an open viewer must not depend on the size of the level: a node
// dragged in the chart and an item assigned to one station reach the same callbacks (and
// rebuild as many links and boxes) on a level of 200 stations as on one of 2,000, and an
// organise rebuilds each link and box once (bundled ZitBlt configuration, every station with one
// input, one output and one resource).
#include <gtest/gtest.h>

#include "QELFpaProductFlowViewer.h"
#include "QELIPertNode.h"
#include "QELPFVNodeOrganiser.h"
#include "VOR2DRep.h"
#include "VORDeferredDeletion.h"
#include "TempDir.h"
#include "VORDocument.h"
#include "VORDriver.h"
#include "VOREventPublisher.h"
#include "VORFrmLayout.h"
#include "VORModelDoor.h"
#include "VORModelGenerator.h"
#include "ViewerTestSupport.h"

namespace {

struct Reach {
  unsigned long long move = 0;
  unsigned long long change = 0;
  int zitBltElements = 0;  // what the viewer shows besides the chart
};

// Opens the viewer on a generated level and counts the callbacks that one drag of station "S20"
// (inside its lane, with a cross flow in and out) and one assignment to it reach.
Reach Measure(int stations) {
  Reach reach;
  TempDir dir;
  const std::string file = dir.Path() + "/level.pprx";
  auto generated =
      VORProcess_var::Adopt(VORModelGenerator::GenerateFlatLevel(stations, true, "Line"));
  VORDriver driver;
  OpenInViewer(driver, generated, file);
  QELFpaProductFlowViewer* viewer = FindViewer();
  if (viewer == nullptr)
    return reach;
  reach.zitBltElements = driver.GetEditor()->GetISO()->GetElements().Size();
  VORBaseUnknown_var station(driver.FindObject("S20"));
  double x = 0.0, y = 0.0;
  QELIPertNode_var(station)->GetPosition(x, y);
  // The same close-up at both sizes, so that the drag crosses the same pixels.
  viewer->GetViewer()->GetMain2DViewpoint()->SetCentre(x, y);
  viewer->GetViewer()->GetMain2DViewpoint()->SetScale(4.0);

  unsigned long long before = VOREventPublisher::CallbacksRun();
  EXPECT_TRUE(driver.Drag(viewer->GetName().str(), x, y, x + 40.0, y - 20.0)) << driver.LastError();
  reach.move = VOREventPublisher::CallbacksRun() - before;
  double nx = 0.0, ny = 0.0;
  QELIPertNode_var(station)->GetPosition(nx, ny);
  EXPECT_NE(nx, x) << "the drag did not move the station";

  VORModelDoor& door = driver.GetDocument()->GetDoor();
  VORBaseUnknown_var part;
  door.CreateProduct(driver.GetDocument()->GetRootProduct(), VORUnicodeString("Extra"), part);
  before = VOREventPublisher::CallbacksRun();
  EXPECT_EQ(door.AssignItem(station, part), S_OK);
  reach.change = VOREventPublisher::CallbacksRun() - before;
  driver.CloseWindow(viewer->GetName().str());
  driver.DrainDeferred();
  return reach;
}

TEST(NotificationFanOutTest, OneMoveAndOneChangeReachAsManyCallbacksOn200As2000Stations) {
  const Reach small = Measure(200);
  const Reach large = Measure(2000);
  ASSERT_GT(small.zitBltElements, 0) << "no ZitBlts: the bundled configuration was not found";
  EXPECT_EQ(large.zitBltElements, 10 * small.zitBltElements);
  EXPECT_GT(small.move, 0u);
  EXPECT_GT(small.change, 0u);
  EXPECT_EQ(small.move, large.move);
  EXPECT_EQ(small.change, large.change);
}

// Links rebuilt and boxes computed again by one drag of station "S20" and by one organise of
// the whole level, on an open viewer.
struct Touched {
  unsigned long dragLinks = 0;
  unsigned long long dragBoxes = 0;
  unsigned long organiseLinks = 0;
  unsigned long long organiseBoxes = 0;
  int links = 0;  // links in the chart
};

Touched MeasureRefresh(int stations) {
  Touched touched;
  TempDir dir;
  const std::string file = dir.Path() + "/level.pprx";
  std::string error;
  auto generated =
      VORProcess_var::Adopt(VORModelGenerator::GenerateFlatLevel(stations, true, "Line"));
  EXPECT_TRUE(generated->SaveAs(file, error)) << error;
  VORDriver driver;
  EXPECT_TRUE(driver.OpenDocument(file) && driver.PickObject("Line") &&
              driver.StartCommand("QELFpaProductFlowViewerCmd"))
      << driver.LastError();
  QELFpaProductFlowViewer* viewer = FindViewer();
  if (viewer == nullptr)
    return touched;
  QELPertController* chart = viewer->GetPertController();
  touched.links = chart->GetLinkCount();
  VORBaseUnknown_var station(driver.FindObject("S20"));
  double x = 0.0, y = 0.0;
  QELIPertNode_var(station)->GetPosition(x, y);
  viewer->GetViewer()->GetMain2DViewpoint()->SetCentre(x, y);
  viewer->GetViewer()->GetMain2DViewpoint()->SetScale(4.0);

  unsigned long links = chart->GetLinkRebuildCount();
  unsigned long long boxes = VOR2DRep::BoxesComputed();
  EXPECT_TRUE(driver.Drag(viewer->GetName().str(), x, y, x + 40.0, y - 20.0)) << driver.LastError();
  touched.dragLinks = chart->GetLinkRebuildCount() - links;
  touched.dragBoxes = VOR2DRep::BoxesComputed() - boxes;

  links = chart->GetLinkRebuildCount();
  boxes = VOR2DRep::BoxesComputed();
  auto organiser = VORHandle<QELPFVNodeOrganiser>::Adopt(new QELPFVNodeOrganiser());
  EXPECT_TRUE(organiser->ArrangeNodes(viewer->GetRootNode(), chart));
  touched.organiseLinks = chart->GetLinkRebuildCount() - links;
  touched.organiseBoxes = VOR2DRep::BoxesComputed() - boxes;
  double nx = 0.0, ny = 0.0;
  QELIPertNode_var(station)->GetPosition(nx, ny);
  EXPECT_EQ(nx, x) << "the organise puts the dragged station back";
  EXPECT_EQ(ny, y);
  organiser = nullptr;
  driver.CloseWindow(viewer->GetName().str());
  driver.DrainDeferred();
  return touched;
}

TEST(NotificationFanOutTest, ADragRebuildsTheStationsLinksAndAnOrganiseEachLinkOnce) {
  const Touched small = MeasureRefresh(200);
  const Touched large = MeasureRefresh(2000);
  ASSERT_GT(small.links, 0);
  EXPECT_GT(small.dragLinks, 0u);
  EXPECT_EQ(small.dragLinks, large.dragLinks);
  EXPECT_EQ(small.dragBoxes, large.dragBoxes);
  // Every station moves, and every link is rebuilt once, not once per end.
  EXPECT_EQ(small.organiseLinks, static_cast<unsigned long>(small.links));
  EXPECT_EQ(large.organiseLinks, static_cast<unsigned long>(large.links));
  // Each box (a station's node, its links, its ZitBlt buttons, and the scene's few) is computed
  // once: a bounded number per station at both sizes, never one per moved node and station.
  EXPECT_GT(small.organiseBoxes, 200u);
  EXPECT_LE(small.organiseBoxes, 7u * 200u);
  EXPECT_LE(large.organiseBoxes, 7u * 2000u);
}

}  // namespace
