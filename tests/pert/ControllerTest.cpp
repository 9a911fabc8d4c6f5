#include <regex>

#include "PertTestSupport.h"
#include "QELIPertNode.h"
#include "QELIPertNodeExt.h"
#include "QELPertClientVisuServices.h"
#include "QELPertController.h"
#include "QELPertViewer.h"
#include "VOR2DCustomRep.h"
#include "VOR2DTextRep.h"
#include "VORIGraphNodeLayout.h"
#include "VORSVGWriter.h"

namespace {

class ControllerTest : public PertTest {
 protected:
  void SetUp() override {
    PertTest::SetUp();
    // A -> B, A -> C, B -> D, C -> D, and a node E without flows.
    a = Node(root, "A", 0.0, 0.0);
    b = Node(root, "B", 50.0, 25.0);
    c = Node(root, "C", 50.0, -25.0);
    d = Node(root, "D", 100.0, 0.0);
    e = Node(root, "Spot welding cell", 0.0, -50.0, "BIWActivitySpotWelding");
    VORModelDoor& door = doc->GetDoor();
    door.AddFlow(a, b);
    door.AddFlow(a, c);
    door.AddFlow(b, d);
    door.AddFlow(c, d);
    viewer = VORHandle<QELPertViewer>::Adopt(
        new QELPertViewer(nullptr, "ProductFlow Viewer ", QELPertParameters::PERT_VIEWER_STYLE, 800,
                          500, QELPertParameters::PERT_VIEWER_FLAGS));
  }
  void TearDown() override {
    notes.Stop();
    if (controller) {
      controller->RemoveNodeManipCmdCB();
      controller->RemoveAllPertNodes();
      controller = NULL_var;
    }
    viewer = NULL_var;
    a = b = c = d = e = NULL_var;
    PertTest::TearDown();
  }
  void Build(bool editable) {
    controller = VORHandle<QELPertController>::Adopt(new QELPertController(
        nullptr, root, viewer, PertViewerProductFlow, PertModeEditable, editable, NULL_var));
    for (VORBaseUnknown_var* n : {&a, &b, &c, &d, &e}) {
      ASSERT_EQ(controller->AddChildNode(*n), S_OK);
      controller->RefreshNodePositionInPert(*n, false);
    }
  }
  VORBaseUnknown_var a, b, c, d, e;
  VORHandle<QELPertViewer> viewer;
  VORHandle<QELPertController> controller;
  ChartNotifications notes;
};

TEST_F(ControllerTest, DrawsOneLabelledBoxPerNodeAndOneOrthogonalArrowPerFlow) {
  notes.Listen(root);
  Build(false);
  EXPECT_EQ(controller->GetNodeCount(), 5);
  EXPECT_EQ(controller->GetLinkCount(), 4);
  // Every node added was announced, in order, with remove flag 0.
  ASSERT_EQ(notes.Count("info", 0), 5);
  EXPECT_EQ(notes.entries[0].node, a.Identity());
  EXPECT_EQ(notes.entries[4].node, e.Identity());
  EXPECT_EQ(controller->AddChildNode(a), S_FALSE);

  // Box: the minimal node, widened for a long label (17 characters of 1.2 plus 2 * 2 margin).
  double w = 0.0;
  double h = 0.0;
  QELIPertNode_var(a)->GetSize(w, h);
  EXPECT_EQ(w, 20.0);
  EXPECT_EQ(h, 10.0);
  QELIPertNode_var(e)->GetSize(w, h);
  EXPECT_DOUBLE_EQ(w, 17 * 1.2 + 4.0);
  VOR2DBagRep* bagB = controller->GetNodeRep(b);
  ASSERT_NE(bagB, nullptr);
  EXPECT_EQ(bagB->GetBoundingBox(), VORBox2D(40.0, 20.0, 60.0, 30.0));
  auto* label = dynamic_cast<VOR2DTextRep*>(bagB->GetChild(2));
  ASSERT_NE(label, nullptr);
  EXPECT_EQ(label->GetText().ConvertToUTF8(), "B");

  // A -> B leaves A's right edge, turns at the middle column and enters B's left edge.
  const VORRenderList& list = viewer->GetRenderList();
  std::vector<std::vector<VORMathPoint2D>> links;
  for (const VORRenderItem& item : list.Items()) {
    if (item.tag == "PertLink" && item.kind == VORPrimitiveKind::Polyline &&
        item.points.size() == 4)
      links.push_back(item.points);
  }
  ASSERT_EQ(links.size(), 4u);
  const std::vector<VORMathPoint2D> ab = {{10, 0}, {25, 0}, {25, 25}, {40, 25}};
  EXPECT_NE(std::find(links.begin(), links.end(), ab), links.end());
  const std::vector<VORMathPoint2D> cd = {{60, -25}, {75, -25}, {75, 0}, {90, 0}};
  EXPECT_NE(std::find(links.begin(), links.end(), cd), links.end());

  // The chart as SVG: counted by structure.
  const std::string svg = VORSVGWriter::ToString(*viewer);
  auto count = [&svg](const std::string& pattern) {
    const std::regex re(pattern);
    return std::distance(std::sregex_iterator(svg.begin(), svg.end(), re), std::sregex_iterator());
  };
  EXPECT_EQ(count("<text class=\"PertLabel\""), 5);
  EXPECT_EQ(count("<polygon class=\"PertNode\""), 10);  // fill and border of each box
  EXPECT_EQ(count("<polyline class=\"PertLink\""), 8);  // route and arrow head of each flow
}

TEST_F(ControllerTest, LabelsFillTheirBoxAndWhatDoesNotFitIsElided) {
  // A box of the document's size: the label is half its height, or shrinks down to 0.9 of
  // that to show the whole name, else it is elided within a unit of margin each side.
  doc->GetDoor().SetPertNodeSize(b, 30.0, 15.0);
  doc->GetDoor().SetPertNodeSize(e, 30.0, 15.0);
  VORBaseUnknown_var tail = Node(root, "Hemming tail", 150.0, 0.0);
  doc->GetDoor().SetPertNodeSize(tail, 30.0, 15.0);
  VORBaseUnknown_var unsized = Node(root, "Underbody respot", 200.0, 0.0);
  Build(false);
  ASSERT_EQ(controller->AddChildNode(tail), S_OK);
  ASSERT_EQ(controller->AddChildNode(unsized), S_OK);
  auto labelOf = [this](VORBaseUnknown* node) {
    return dynamic_cast<VOR2DTextRep*>(controller->GetNodeRep(node)->GetChild(2));
  };
  VOR2DTextRep* short_ = labelOf(b);
  ASSERT_NE(short_, nullptr);
  EXPECT_DOUBLE_EQ(short_->GetHeight(), 7.5);
  EXPECT_EQ(short_->GetShownText().ConvertToUTF8(), "B");
  // 12 characters fit neither at 7.5 (54 wide) nor at the floor 6.75: six of 4.05 do.
  VOR2DTextRep* shrunk = labelOf(tail);
  EXPECT_DOUBLE_EQ(shrunk->GetHeight(), 6.75);
  EXPECT_EQ(shrunk->GetShownText().ConvertToUTF8(), "Hemmi\u2026");
  VOR2DTextRep* elided = labelOf(e);
  EXPECT_EQ(elided->GetText().ConvertToUTF8(), "Spot welding cell") << "the whole name is kept";
  EXPECT_EQ(elided->GetShownText().ConvertToUTF8(), "Spot \u2026");
  for (VORBaseUnknown* node : {b.get(), e.get(), tail.get(), unsized.get()}) {
    const VORBox2D box = controller->GetNodeRep(node)->GetBoundingBox();
    const VORBox2D text = labelOf(node)->GetBoundingBox();
    EXPECT_LE(text.Width(), box.Width() - 2.0);
    EXPECT_LE(text.Height(), box.Height());
  }
  // A node without a stored size keeps its box widened for a label of 2, and its label is
  // half the default height, or its floor 4.5 when the name fits no larger.
  EXPECT_DOUBLE_EQ(labelOf(a)->GetHeight(), 5.0);
  EXPECT_DOUBLE_EQ(labelOf(unsized)->GetHeight(), 4.5);
  EXPECT_EQ(labelOf(unsized)->GetShownText().ConvertToUTF8(), "Underb\u2026");
  const VORRenderList& list = viewer->GetRenderList();
  int elidedItems = 0;
  for (const VORRenderItem& item : list.Items())
    elidedItems += item.tag == "PertLabel" && item.text.ConvertToUTF8().ends_with("\u2026");
  EXPECT_EQ(elidedItems, 3) << "what is drawn is the elided text";
  controller->RemoveChildNode(tail);
  controller->RemoveChildNode(unsized);
}

TEST_F(ControllerTest, PickingFindsTheNodeUnderThePointerAndLinksFollowModelChanges) {
  Build(false);
  viewer->Reframe();
  const VORMathPoint2D centre = viewer->GetMain2DViewpoint()->ModelToPixel(50.0, 25.0);
  EXPECT_EQ(viewer->NodeAt(centre.x, centre.y).Identity(), b.Identity());
  const VORMathPoint2D empty = viewer->GetMain2DViewpoint()->ModelToPixel(25.0, 40.0);
  EXPECT_FALSE(viewer->NodeAt(empty.x, empty.y));

  doc->GetDoor().AddFlow(e, d);
  controller->RefreshLinks();
  EXPECT_EQ(controller->GetLinkCount(), 5);
  doc->GetDoor().RemoveFlow(a, b);
  controller->RefreshLinks();
  EXPECT_EQ(controller->GetLinkCount(), 4);
  // Taking a node out drops its links and announces it.
  notes.Listen(root);
  ASSERT_EQ(controller->RemoveChildNode(d), S_OK);
  EXPECT_EQ(controller->GetLinkCount(), 1);
  EXPECT_EQ(notes.Count("info", 1), 1);
  EXPECT_TRUE(QELIPertNodeExt_var(d)->GetHiddenFlag());
}

// The points of every link of the top level, in the order the chart holds them.
std::vector<std::vector<VORMathPoint2Df>> LinkPoints(QELPertController& chart) {
  std::vector<std::vector<VORMathPoint2Df>> points;
  auto* links = static_cast<VOR2DBagRep*>(chart.GetChartRep()->GetChild(1));
  for (int i = 1; i <= links->GetSize(); ++i) {
    auto* link = static_cast<VOR2DCustomRep*>(links->GetChild(i));
    for (int k = 1; k <= link->GetPrimitiveCount(); ++k)
      points.push_back(static_cast<const VOR2DPolylineGP*>(link->GetPrimitive(k))->GetPoints());
  }
  return points;
}

TEST_F(ControllerTest, BatchedMovesRebuildEachLinkOnceWhereUnbatchedMovesPutIt) {
  Build(false);
  auto moveAll = [this](double dx) {
    for (VORBaseUnknown_var* n : {&a, &b, &c, &d}) {
      double x = 0.0, y = 0.0;
      QELIPertNode_var(*n)->GetPosition(x, y);
      QELIPertNode_var(*n)->SetPosition(x + dx, y);
      controller->RefreshNodePositionInPert(*n, true);
    }
  };
  unsigned long rebuilt = controller->GetLinkRebuildCount();
  moveAll(10.0);
  EXPECT_EQ(controller->GetLinkRebuildCount() - rebuilt, 8u) << "each of 4 links once per end";
  const auto unbatched = LinkPoints(*controller);
  moveAll(-10.0);

  rebuilt = controller->GetLinkRebuildCount();
  const int draws = viewer->GetDrawRequestCount();
  controller->BeginMoves();
  controller->BeginMoves();
  moveAll(10.0);
  controller->EndMoves();
  EXPECT_EQ(controller->GetLinkRebuildCount(), rebuilt) << "nothing before the outer end";
  controller->EndMoves();
  EXPECT_EQ(controller->GetLinkRebuildCount() - rebuilt, 4u);
  EXPECT_EQ(viewer->GetDrawRequestCount(), draws + 1);
  EXPECT_EQ(LinkPoints(*controller), unbatched);

  // A node taken out during a batch takes its due links with it.
  controller->BeginMoves();
  moveAll(5.0);
  ASSERT_EQ(controller->RemoveChildNode(d), S_OK);
  controller->EndMoves();
  EXPECT_EQ(controller->GetLinkCount(), 2);

  // Moving through the chart writes the document and names the root as the node's reference.
  VORBaseUnknown* reference = nullptr;
  EXPECT_EQ(controller->MoveNodeTo(e, 30.0, 40.0, false, reference), S_OK);
  EXPECT_EQ(reference, root.Identity());
  double x = 0.0, y = 0.0;
  VORIGraphNodeLayout_var(e)->GetPertPosition(x, y);
  EXPECT_EQ(x, 30.0);
  EXPECT_EQ(y, 40.0);
  EXPECT_EQ(controller->MoveNodeTo(d, 1.0, 1.0, false, reference), E_FAIL) << "not in the chart";
}

TEST_F(ControllerTest, AChartFilledInOneBatchDrawsEachLinkOnceAsAChartFilledNodeByNode) {
  // E feeds every other node: E and A hold more links than a node keeps inline.
  for (VORBaseUnknown_var* n : {&a, &b, &c, &d})
    ASSERT_EQ(doc->GetDoor().AddFlow(e, *n), S_OK);
  Build(false);
  const auto nodeByNode = LinkPoints(*controller);
  ASSERT_EQ(controller->GetLinkCount(), 8);
  controller->RemoveNodeManipCmdCB();
  controller = NULL_var;

  controller = VORHandle<QELPertController>::Adopt(new QELPertController(
      nullptr, root, viewer, PertViewerProductFlow, PertModeEditable, false, NULL_var));
  controller->BeginMoves();
  for (VORBaseUnknown_var* n : {&a, &b, &c, &d, &e}) {
    ASSERT_EQ(controller->AddChildNode(*n), S_OK);
    controller->RefreshNodePositionInPert(*n, false);
  }
  EXPECT_EQ(controller->GetLinkRebuildCount(), 0u) << "nothing drawn before the batch ends";
  controller->EndMoves();
  EXPECT_EQ(controller->GetLinkRebuildCount(), 8u);
  EXPECT_EQ(LinkPoints(*controller), nodeByNode);

  // Taking the hubs out drops exactly their links, from both ends.
  ASSERT_EQ(controller->RemoveChildNode(a), S_OK);
  EXPECT_EQ(controller->GetLinkCount(), 5);
  ASSERT_EQ(controller->RemoveChildNode(e), S_OK);
  EXPECT_EQ(controller->GetLinkCount(), 2);
  ASSERT_EQ(controller->AddChildNode(e), S_OK);
  EXPECT_EQ(controller->GetLinkCount(), 5) << "E links again to B, C and D";
}

TEST(NotifySlotTest, OneNotificationServesARunOfDispatchesUnlessAListenerKeepsIt) {
  struct Events {
    bool keep = false;
    std::vector<VORNotification*> seen;
    std::vector<VORHandle<VORNotification>> kept;
    int Dispatch(VORNotification* n) {
      seen.push_back(n);
      if (keep)
        kept.emplace_back(n);
      return 0;
    }
  } events;
  const auto node = VORHandle<VORNotification>::Adopt(new VORNotification());  // any object
  const unsigned long references = node->RefCount();
  QELPertNotifySlot<QELPertPositionNotify> slot;
  slot.Dispatch(events, VORBaseUnknown_var(node.get()), 1.0, 2.0);
  slot.Dispatch(events, VORBaseUnknown_var(node.get()), 3.0, 4.0);
  EXPECT_EQ(events.seen[0], events.seen[1]);
  EXPECT_EQ(node->RefCount(), references) << "the node is not held between dispatches";

  events.keep = true;
  slot.Dispatch(events, VORBaseUnknown_var(node.get()), 5.0, 6.0);
  slot.Dispatch(events, VORBaseUnknown_var(node.get()), 7.0, 8.0);
  ASSERT_EQ(events.kept.size(), 2u);
  EXPECT_NE(events.kept[0].get(), events.kept[1].get());
  double x = 0.0, y = 0.0;
  static_cast<QELPertPositionNotify*>(events.kept[0].get())->GetPosition(x, y);
  EXPECT_EQ(x, 5.0) << "a kept notification still tells what it was sent for";
  EXPECT_EQ(static_cast<QELPertPositionNotify*>(events.kept[0].get())->GetNode().Identity(),
            node->GetIdentity());
}

TEST_F(ControllerTest, DraggingABoxMovesTheNodeSnapsItAndNotifiesTheRoot) {
  Build(true);
  notes.Listen(root);
  viewer->GetMain2DViewpoint()->SetScale(2.0);
  viewer->GetMain2DViewpoint()->SetCentre(0.0, 0.0);
  const VORMathPoint2D start = viewer->GetMain2DViewpoint()->ModelToPixel(0.0, 0.0);
  viewer->OnMousePress(start.x, start.y, VORMouseLeft);
  viewer->OnMouseMove(start.x + 20.0, start.y);         // +10 units in x
  viewer->OnMouseMove(start.x + 44.0, start.y - 30.0);  // +22, +15 in all
  double x = 0.0;
  double y = 0.0;
  QELIPertNode_var(a)->GetPosition(x, y, 1);
  EXPECT_DOUBLE_EQ(x, 22.0);
  EXPECT_DOUBLE_EQ(y, 15.0);
  // The document keeps the old position until the drag ends.
  VORIGraphNodeLayout_var layout(a);
  layout->GetPertPosition(x, y);
  EXPECT_EQ(x, 0.0);
  viewer->OnMouseRelease(start.x + 44.0, start.y - 30.0, VORMouseLeft);
  layout->GetPertPosition(x, y);
  EXPECT_EQ(x, 12.5);  // nearest cell centre of 22 with 25-unit cells
  EXPECT_EQ(y, 12.5);
  ASSERT_EQ(notes.Count("position"), 3);
  EXPECT_EQ(notes.entries[0].x, 10.0);
  EXPECT_EQ(notes.entries.back().x, 12.5);
  EXPECT_EQ(notes.entries.back().node, a.Identity());
  // The box and the link A -> B start from the new place.
  EXPECT_EQ(controller->GetNodeRep(a)->GetBoundingBox(), VORBox2D(2.5, 7.5, 22.5, 17.5));
  // A click without motion does not move anything.
  const VORMathPoint2D onB = viewer->GetMain2DViewpoint()->ModelToPixel(50.0, 25.0);
  viewer->OnMousePress(onB.x, onB.y, VORMouseLeft);
  viewer->OnMouseRelease(onB.x, onB.y, VORMouseLeft);
  QELIPertNode_var(b)->GetPosition(x, y, 1);
  EXPECT_EQ(x, 50.0);
  EXPECT_EQ(notes.Count("position"), 3);
}

TEST_F(ControllerTest, ANewRootEmptiesTheChartWithoutAnnouncements) {
  Build(true);
  notes.Listen(root);
  controller->RemoveAllPertNodes();
  EXPECT_EQ(controller->GetNodeCount(), 0);
  EXPECT_EQ(controller->GetNodeManipulator()->GetElementCount(), 0);
  EXPECT_TRUE(notes.entries.empty());
  controller->SetWindowRootNode(a, NULL_var);
  EXPECT_EQ(controller->GetWindowRootNode().Identity(), a.Identity());
  EXPECT_EQ(viewer->GetRenderList().Size(), 0);
  EXPECT_EQ(controller->AddChildNode(root), S_OK);  // any graph node may be drawn
  VORBaseUnknown_var notANode(doc->GetRootProduct());
  EXPECT_EQ(controller->AddChildNode(notANode), E_INVALIDARG);
}

}  // namespace
