#include "PertTestSupport.h"
#include "QELIPertNode.h"
#include "QELIPertNodeExt.h"
#include "QELIPertPosition.h"
#include "QELPertController.h"
#include "QELPertNodeTraverser.h"
#include "QELPertViewer.h"
#include "VORIGENode.h"
#include "VORIGraphNodeLayout.h"

namespace {

class SuperNodeTest : public PertTest {
 protected:
  void SetUp() override {
    PertTest::SetUp();
    group = Node(root, "Group", 100.0, 0.0, "BIWActivityGrouping");
    other = Node(root, "Other", 0.0, 0.0);
    inner1 = Node(group, "S1", 0.0, 0.0);
    inner2 = Node(group, "S2", 50.0, 0.0);
    doc->GetDoor().AddFlow(inner1, inner2);
    doc->GetDoor().AddFlow(other, group);
    viewer = VORHandle<QELPertViewer>::Adopt(new QELPertViewer(nullptr, "v", 0, 400, 400, 0));
    controller = VORHandle<QELPertController>::Adopt(new QELPertController(
        nullptr, root, viewer, PertViewerProductFlow, PertModeEditable, true, NULL_var));
  }
  void TearDown() override {
    notes.Stop();
    controller->RemoveAllPertNodes();
    controller = NULL_var;
    viewer = NULL_var;
    group = other = inner1 = inner2 = NULL_var;
    PertTest::TearDown();
  }
  void AddAll() {
    for (VORBaseUnknown_var* n : {&other, &group})
      controller->AddChildNode(*n);
  }
  VORBaseUnknown_var group, other, inner1, inner2;
  VORHandle<QELPertViewer> viewer;
  VORHandle<QELPertController> controller;
  ChartNotifications notes;
};

TEST_F(SuperNodeTest, AnExpandedSuperNodeDrawsItsInnerChartInsideAnEnlargedBox) {
  doc->GetDoor().SetPertNodeState(group, PertNodeExpanded);
  notes.Listen(root);
  AddAll();
  EXPECT_EQ(controller->GetNodeCount(), 4);
  EXPECT_EQ(notes.Count("info", 0), 4);      // inner nodes are announced as well
  EXPECT_EQ(controller->GetLinkCount(), 2);  // one per level
  // The inner chart is centred on the super node: S1 at 75, S2 at 125.
  double x = 0.0;
  double y = 0.0;
  QELIPertNode_var(inner1)->GetPosition(x, y, 1);
  EXPECT_EQ(x, 75.0);
  EXPECT_EQ(y, 0.0);
  // Box: inner boxes (65..135) plus a 5-unit margin, label height on top and bottom.
  const VORBox2D box = controller->GetNodeRep(group)->GetBoundingBox();
  EXPECT_EQ(box, VORBox2D(60.0, -12.0, 140.0, 12.0));
  double w = 0.0;
  double h = 0.0;
  QELIPertNode_var(group)->GetSize(w, h);
  EXPECT_EQ(w, 80.0);
  EXPECT_EQ(h, 24.0);
  // Inner nodes report the chart root as their reference object.
  VORBaseUnknown_var reference;
  QELIPertPosition_var(inner1)->GetReferenceObject(reference);
  EXPECT_EQ(reference.Identity(), root.Identity());

  // Picking an inner box gives the super node, then the inner node.
  viewer->Reframe();
  const VORMathPoint2D p = viewer->GetMain2DViewpoint()->ModelToPixel(125.0, 0.0);
  std::vector<VORPathElement_var> paths = viewer->PickPaths(p.x, p.y);
  ASSERT_FALSE(paths.empty());
  EXPECT_EQ(paths[0]->GetSize(), 2);
  EXPECT_EQ(paths[0]->GetRoot(), group.Identity());
  EXPECT_EQ(paths[0]->GetLeaf(), inner2.Identity());
  EXPECT_EQ(viewer->NodeAt(p.x, p.y).Identity(), inner2.Identity());

  // Moving the super node carries its inner chart.
  QELIPertNodeExt_var(group)->SetPosition(100.0, 50.0, 1);
  controller->RefreshNodePositionInPert(group, false);
  QELIPertNode_var(inner2)->GetPosition(x, y, 1);
  EXPECT_EQ(x, 125.0);
  EXPECT_EQ(y, 50.0);
  EXPECT_EQ(controller->GetNodeRep(group)->GetBoundingBox(), VORBox2D(60.0, 38.0, 140.0, 62.0));
}

TEST_F(SuperNodeTest, CollapsingAndExpandingThroughTheTraverser) {
  doc->GetDoor().SetPertNodeState(group, PertNodeExpanded);
  AddAll();
  notes.Listen(root);
  auto traverser = VORHandle<QELPertNodeTraverser>::Adopt(new QELPertNodeTraverser(controller));
  VORIGENode_var node(group);

  ASSERT_EQ(traverser->HideChildrenNodes(node), S_OK);
  traverser->SetModelNode(node);
  ASSERT_EQ(traverser->ChangePertNodeShape(PertNodeCollapsed), S_OK);
  EXPECT_EQ(VORIGraphNodeLayout_var(group)->GetPertNodeState(), PertNodeCollapsed);
  EXPECT_EQ(controller->GetNodeCount(), 2);
  EXPECT_EQ(controller->GetLinkCount(), 1);
  EXPECT_EQ(notes.Count("info", 1), 2);
  EXPECT_TRUE(QELIPertNodeExt_var(inner1)->GetHiddenFlag());
  EXPECT_FALSE(QELIPertNodeExt_var(group)->GetHiddenFlag());
  // Back to a normal box (label "Group": 5 * 1.2 + 4 < 20), drawn with a heavier border.
  EXPECT_EQ(controller->GetNodeRep(group)->GetBoundingBox(), VORBox2D(90.0, -5.0, 110.0, 5.0));
  EXPECT_EQ(traverser->HideChildrenNodes(node), S_FALSE);

  ASSERT_EQ(traverser->ShowChildrenNodes(node), S_OK);
  ASSERT_EQ(traverser->ChangePertNodeShape(PertNodeExpanded), S_OK);
  EXPECT_EQ(controller->GetNodeCount(), 4);
  EXPECT_EQ(notes.Count("info", 0), 2);
  EXPECT_FALSE(QELIPertNodeExt_var(inner1)->GetHiddenFlag());
  EXPECT_EQ(controller->GetNodeRep(group)->GetBoundingBox(), VORBox2D(60.0, -12.0, 140.0, 12.0));
  EXPECT_EQ(QELIPertNodeExt_var(group)->GetState(1), PertNodeExpanded);

  // A traverser without controller or model node refuses.
  auto idle = VORHandle<QELPertNodeTraverser>::Adopt(new QELPertNodeTraverser(nullptr));
  EXPECT_EQ(idle->ShowChildrenNodes(node), E_FAIL);
  EXPECT_EQ(idle->ChangePertNodeShape(PertNodeCollapsed), E_FAIL);
}

TEST_F(SuperNodeTest, ACollapsedSuperNodeShowsNoInnerNodesAndInnerNodesWithoutPlaceGetARow) {
  doc->GetDoor().SetPertNodeState(group, PertNodeCollapsed);
  doc->GetDoor().SetPertPosition(inner1, false, 0.0, 0.0);
  doc->GetDoor().SetPertPosition(inner2, false, 0.0, 0.0);
  AddAll();
  EXPECT_EQ(controller->GetNodeCount(), 2);
  EXPECT_FALSE(controller->IsInChart(inner1));
  // Expanded later: the two unplaced inner nodes get a row two cells apart, centred.
  ASSERT_EQ(controller->ShowInnerNodes(group), S_OK);
  double x1 = 0.0, y1 = 0.0, x2 = 0.0, y2 = 0.0;
  QELIPertNode_var(inner1)->GetPosition(x1, y1, 1);
  QELIPertNode_var(inner2)->GetPosition(x2, y2, 1);
  EXPECT_EQ(x1, 75.0);
  EXPECT_EQ(x2, 125.0);
  EXPECT_EQ(y1, 0.0);
  EXPECT_EQ(controller->ShowInnerNodes(group), S_FALSE);
}

}  // namespace
