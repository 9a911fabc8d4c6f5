#include "PertTestSupport.h"
#include "QELFpaPertServices.h"
#include "QELIPertNode.h"
#include "QELIPertNodeExt.h"
#include "QELIPertPosition.h"
#include "QELPertClientVisuServices.h"
#include "QELPertSessionSettings.h"
#include "QELPertViewer.h"
#include "VOR2DPolygonRep.h"
#include "VOR2DTextRep.h"
#include "VORIGraphNodeLayout.h"

namespace {

using NodeServicesTest = PertTest;

TEST(SnapTest, PositionsGoToTheNearestCellCentreHalfACellOffTheGrid) {
  double x = 0.0;
  double y = 24.9;
  ASSERT_EQ(QELPertClientVisuServices::CalculateSnapPositionInPert(x, y, 1, QELIPertNode_var()),
            S_OK);
  EXPECT_EQ(x, 12.5);
  EXPECT_EQ(y, 12.5);
  x = 25.0;  // midway between the centres 12.5 and 37.5: the upper one
  y = -0.1;
  QELPertClientVisuServices::CalculateSnapPositionInPert(x, y, 1, QELIPertNode_var());
  EXPECT_EQ(x, 37.5);
  EXPECT_EQ(y, -12.5);
  x = 37.5;  // a centre stays
  y = 150.0;
  QELPertClientVisuServices::CalculateSnapPositionInPert(x, y, 1, QELIPertNode_var());
  EXPECT_EQ(x, 37.5);
  EXPECT_EQ(y, 162.5);
  // The cell follows the parameter.
  QELPertParameters::PERT_GRID_CELL_SIZE = 10.0;
  x = 12.0;
  y = -3.0;
  QELPertClientVisuServices::CalculateSnapPositionInPert(x, y, 1, QELIPertNode_var());
  EXPECT_EQ(x, 15.0);
  EXPECT_EQ(y, -5.0);
  QELPertParameters::PERT_GRID_CELL_SIZE = 0.0;
  EXPECT_EQ(QELPertClientVisuServices::CalculateSnapPositionInPert(x, y, 1, QELIPertNode_var()),
            E_FAIL);
  QELPertParameters::Reset();
  EXPECT_EQ(QELPertParameters::PERT_GRID_CELL_SIZE, 25.0);
}

TEST(ParametersTest, LabelHeightIsTheSceneLayersLabelHeight) {
  EXPECT_EQ(QELPertParameters::PERT_LABEL_HEIGHT, 2.0);
  QELPertParameters::PERT_LABEL_HEIGHT = 3.0;
  EXPECT_EQ(VORTextMetric::LabelHeight(), 3.0);
  auto label = VORHandle<VOR2DTextRep>::Adopt(
      new VOR2DTextRep(VORUnicodeString("ab"), VORMathPoint2Df(), 0));
  EXPECT_EQ(label->GetBoundingBox().Height(), 3.0);
  QELPertParameters::Reset();
  EXPECT_EQ(VORTextMetric::LabelHeight(), 2.0);
}

TEST_F(NodeServicesTest, NodeInterfacesReadTheDocumentAndKeepAWorkingCopy) {
  VORBaseUnknown_var a = Node(root, "A", 10.0, 20.0);
  QELIPertNode_var node(a);
  QELIPertNodeExt_var ext(a);
  ASSERT_TRUE(node && ext);
  double x = 0.0;
  double y = 0.0;
  EXPECT_EQ(node->GetPosition(x, y, 1), S_OK);
  EXPECT_EQ(x, 10.0);
  EXPECT_EQ(node->GetPosition(x, y, 7), E_INVALIDARG);
  // The working copy shows without touching the document.
  ext->SetPosition(30.0, 40.0, 1);
  node->GetPosition(x, y, 1);
  EXPECT_EQ(x, 30.0);
  VORIGraphNodeLayout_var layout(a);
  layout->GetPertPosition(x, y);
  EXPECT_EQ(x, 10.0);
  // QELIPertNode writes both.
  doc->SetModified(false);
  node->SetPosition(50.0, 60.0, 1);
  layout->GetPertPosition(x, y);
  EXPECT_EQ(y, 60.0);
  EXPECT_TRUE(doc->IsModified());
  doc->SetModified(false);
  node->SetPosition(50.0, 60.0, 1);  // no change, no door call
  EXPECT_FALSE(doc->IsModified());
  // Sizes: default, then the document's.
  double w = 0.0;
  double h = 0.0;
  node->GetSize(w, h);
  EXPECT_EQ(w, QELPertParameters::PERT_NODE_WIDTH);
  EXPECT_EQ(node->SetSize(30.0, 12.0), S_OK);
  EXPECT_EQ(node->SetSize(-1.0, 12.0), E_INVALIDARG);
  node->GetSize(w, h);
  EXPECT_EQ(w, 30.0);
  // State goes to the document; out-of-range states are refused.
  EXPECT_EQ(ext->SetState(PertNodeCollapsed), S_OK);
  EXPECT_EQ(layout->GetPertNodeState(), PertNodeCollapsed);
  EXPECT_EQ(ext->SetState(5), E_INVALIDARG);
  // Outside a chart the reference object is the parent; the root answers itself.
  VORBaseUnknown_var reference;
  QELIPertPosition_var(a)->GetReferenceObject(reference);
  EXPECT_EQ(reference.Identity(), root.Identity());
  QELIPertPosition_var(root)->GetReferenceObject(reference);
  EXPECT_EQ(reference.Identity(), root.Identity());
  // Objects that are no graph nodes answer none of it.
  EXPECT_FALSE(QELIPertNode_var(doc->GetRootProduct()));
}

TEST_F(NodeServicesTest, ExtensionsAndProvisionalPositionsForNodesNeverPlaced) {
  VORBaseUnknown_var a = Node(root, "A", 10.0, 20.0);
  VORBaseUnknown_var b;
  VORBaseUnknown_var c;
  doc->GetDoor().CreateNode(root, "BIWActivityStation", b);
  doc->GetDoor().CreateNode(root, "BIWActivityStation", c);
  VORIGENode_var na(a), nb(b), nc(c);
  bool created = false;
  EXPECT_TRUE(QELFpaPertBaseServices::GetPertExtension(nc, created));
  EXPECT_TRUE(created);
  QELFpaPertBaseServices::GetPertExtension(nc, created);
  EXPECT_FALSE(created);
  // A node made where a deleted one was (as the heap likes to do) is new all the same.
  for (int round = 0; round < 3; ++round) {
    VORBaseUnknown_var d;
    doc->GetDoor().CreateNode(root, "BIWActivityStation", d);
    VORIGENode_var nd(d);
    QELFpaPertBaseServices::GetPertExtension(nd, created);
    EXPECT_TRUE(created) << "round " << round;
    nd = nullptr;
    doc->GetDoor().RemoveNode(d);
  }

  EXPECT_EQ(QELFpaPertBaseServices::InitNodePosition(na), S_FALSE);
  EXPECT_EQ(QELFpaPertBaseServices::InitNodePosition(nc), S_OK);
  double x = 0.0;
  double y = 0.0;
  EXPECT_EQ(QELIPertNode_var(c)->GetPosition(x, y, 0), S_OK);
  EXPECT_EQ(x, 112.5);  // third child: two cells per index, snapped
  EXPECT_EQ(y, 12.5);
  EXPECT_EQ(QELIPertNode_var(c)->GetPosition(x, y, 1), S_FALSE);

  // SetChildPertPositions drops working copies and places the unplaced children.
  QELIPertNodeExt_var(a)->SetPosition(99.0, 99.0, 1);
  VORIGENode_var rootNode(root);
  EXPECT_EQ(QELPertClientVisuServices::SetChildPertPositions(rootNode, 1), S_OK);
  QELIPertNode_var(a)->GetPosition(x, y, 1);
  EXPECT_EQ(x, 10.0);
  EXPECT_EQ(QELIPertNode_var(b)->GetPosition(x, y, 0), S_OK);
  EXPECT_EQ(x, 62.5);
  EXPECT_EQ(QELPertClientVisuServices::SetChildPertPositions(rootNode, 2), E_INVALIDARG);
}

TEST_F(NodeServicesTest, GridViewerNameAndSessionSettings) {
  auto viewer = VORHandle<QELPertViewer>::Adopt(new QELPertViewer(nullptr, "v", 0, 100, 100, 0));
  EXPECT_EQ(QELPertClientVisuServices::CreateGrid(nullptr), nullptr);
  VOR2DRep_var grid = VOR2DRep_var::Adopt(QELPertClientVisuServices::CreateGrid(viewer));
  ASSERT_TRUE(grid);
  EXPECT_EQ(viewer->GetRenderList().Size(), 0);  // nothing to cover yet
  const float xy[8] = {0, 0, 50, 0, 50, 50, 0, 50};
  viewer->AddRep(VORHandle<VOR2DPolygonRep>::Adopt(new VOR2DPolygonRep(xy, 4, 0)));
  int gridLines = 0;
  for (const VORRenderItem& item : viewer->GetRenderList().Items())
    gridLines += item.tag == "PertGrid";
  EXPECT_EQ(gridLines, 2 * 7);  // -50 .. 100 every 25, both ways
  // The grid neither counts for reframing nor is picked.
  EXPECT_EQ(viewer->GetSceneBox(), VORBox2D(0.0, 0.0, 50.0, 50.0));
  EXPECT_TRUE(viewer->PickReps(-25.0, -25.0, 1.0).empty());
  viewer->RemoveRep(grid);

  ViewerName name = PertViewerProductFlow;
  QELPertClientVisuServices::SetViewerName(name);
  EXPECT_EQ(QELPertClientVisuServices::GetViewerName(), PertViewerProductFlow);
  name = PertViewerClassic;
  QELPertClientVisuServices::SetViewerName(name);

  QELPertSessionSettings* settings = QELPertSessionSettings::Get();
  settings->SetGridShown(false);
  EXPECT_FALSE(settings->IsGridShown());
  settings->SetGridShown(true);
  double* rgb = reinterpret_cast<double*>(1);
  settings->ClearBackgroundColor();
  EXPECT_EQ(settings->GetBackgroundColor(rgb), E_FAIL);
  EXPECT_EQ(rgb, nullptr);
  settings->SetBackgroundColor(0.25, 0.5, 1.0);
  ASSERT_EQ(settings->GetBackgroundColor(rgb), S_OK);
  EXPECT_EQ(rgb[1], 0.5);
  delete[] rgb;
  settings->ClearBackgroundColor();
}

}  // namespace
