// A window whose viewer shows one node: clicks, context clicks and drags made through the
// driver reach the viewer and come back as picks, menus and manipulator gestures.
#include <gtest/gtest.h>

#include "SampleLine.h"
#include "TempDir.h"
#include "VOR2DPolygonRep.h"
#include "VORDlgContextualMenu.h"
#include "VORDriver.h"
#include "VORFileIO.h"
#include "VORFrmWindowKinds.h"
#include "VORManipulator.h"
#include "VORViewer.h"

namespace {
class ViewerRoutingTest : public ::testing::Test {
 protected:
  void SetUp() override {
    ASSERT_EQ(SaveSampleLine(file), "");
    ASSERT_TRUE(driver.OpenDocument(file));
    window = new VORFrmWindow("Chart", driver.GetEditor());
    viewer = VORViewer_var::Adopt(new VORViewer(window->GetViewerFrame(), "V", 0, 800, 500, 0));
    viewer->SetViewerSelectable(true);
    const float box[] = {0, 0, 20, 0, 20, 10, 0, 10};
    rep = VORHandle<VOR2DPolygonRep>::Adopt(new VOR2DPolygonRep(box, 4, 1));
    rep->SetObject(driver.FindObject("S1"));
    viewer->AddRep(rep);
    viewer->Reframe();
  }
  void TearDown() override { window->DeleteWindow(); }

  TempDir dir;
  std::string file = dir.Path() + "/line.pprx";
  VORDriver driver;
  VORFrmWindow* window = nullptr;
  VORViewer_var viewer;
  VORHandle<VOR2DPolygonRep> rep;
};
}  // namespace

TEST_F(ViewerRoutingTest, AClickInTheViewerSelectsWhatItShowsAndTheBackgroundClears) {
  ASSERT_EQ(window->GetViewer(), viewer.get()) << "found in the viewer frame";
  ASSERT_TRUE(driver.PickInChart("Chart", 10, 5)) << driver.LastError();
  EXPECT_EQ(driver.DescribeCSO(), "cso: S1\n");
  ASSERT_TRUE(driver.PickInChart("Chart", 200, 200));
  EXPECT_EQ(driver.DescribeCSO(), "cso:\n");
}

TEST_F(ViewerRoutingTest, AContextClickOffersTheItemsSubscribersAddAndRunsTheChosenOne) {
  auto subscriber = VORCommand_var::Adopt(new VORCommand());
  subscriber->AddCallback(
      viewer->GetEventPublisher(), "VORContext", [](VORBaseUnknown*, VORNotification* n, void*) {
        VORDlgContextualMenu* menu = VORDlgContextualMenu::FromContext(static_cast<VORContext*>(n));
        auto* item = new VORDlgPushItem(menu, "ProductSpace");
        item->SetTitle("Open the product space");
        item->SetCommandHeader(VORCommandHeader::Find("ProductSpace"));
      });
  ASSERT_TRUE(driver.OpenContextMenu("Chart", 10, 5)) << driver.LastError();
  EXPECT_EQ(driver.DescribeMenu(),
            "ContextualMenu \"ContextualMenu\"\n"
            "  PushItem \"ProductSpace\" title=\"Open the product space\" at 0,0\n");
  ASSERT_TRUE(driver.ChooseMenuItem("Open the product space"));
  EXPECT_NE(driver.FindWindow("line.pprx - Product Space"), nullptr);
  EXPECT_FALSE(driver.ChooseMenuItem("ProductSpace")) << "the menu closed with the choice";
}

TEST_F(ViewerRoutingTest, ADragMovesTheManipulatorThroughTheViewer) {
  auto manipulator = VORHandle<VORManipulator>::Adopt(new VORManipulator(nullptr, "Move", 0));
  manipulator->AddElement(rep);
  int steps = 0, ends = 0;
  auto subscriber = VORCommand_var::Adopt(new VORCommand());
  subscriber->AddCallback(manipulator->GetEventPublisher(), VORManipulator::kVORManipulate,
                          [&](VORBaseUnknown*, VORNotification*, void*) { ++steps; });
  subscriber->AddCallback(manipulator->GetEventPublisher(), VORManipulator::kVOREndManipulate,
                          [&](VORBaseUnknown*, VORNotification*, void*) { ++ends; });
  ASSERT_TRUE(driver.Drag("Chart", 10, 5, 30, 5)) << driver.LastError();
  EXPECT_GT(steps, 0);
  EXPECT_EQ(ends, 1);
  EXPECT_FALSE(driver.Drag("Chart", 300, 300, 310, 300));
  manipulator->RemoveAllElements();
}

TEST_F(ViewerRoutingTest, AScriptExportsTheViewerSceneAsSVG) {
  const std::string svg = dir.Path() + "/chart.svg";
  ASSERT_TRUE(driver.ExportWindow("Chart", svg)) << driver.LastError();
  std::string text, error;
  ASSERT_TRUE(VORReadFile(svg, text, error)) << error;
  EXPECT_NE(text.find("<svg"), std::string::npos);
  EXPECT_NE(text.find("<polygon"), std::string::npos) << text;
  EXPECT_FALSE(driver.ExportWindow("line.pprx", svg));
  EXPECT_EQ(driver.LastError(), "\"line.pprx\" has no viewer to export");
}
