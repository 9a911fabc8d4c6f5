#include <string>
#include <vector>

#include "VOR2DManipulator.h"
#include "VOR2DPolygonRep.h"
#include "VORViewer.h"
#include "VisuTestSupport.h"

namespace {

// The command that owns a manipulator: records what reaches AnalyseNotification.
class RecordingCommand : public VORCommand {
  VOR_DECLARE_CLASS(RecordingCommand, VORCommand)
 public:
  VORNotifPropagation AnalyseNotification(VORCommand* from, VORNotification* n) override {
    auto* m = dynamic_cast<VORManipulator*>(from);
    if (m == nullptr)
      seen.push_back("?");
    else if (n == m->GetVORActivate())
      seen.push_back("activate");
    else if (n == m->GetVORManipulate())
      seen.push_back("manipulate");
    else if (n == m->GetVOREndManipulate())
      seen.push_back("end-manipulate");
    else if (n == m->GetVORPreactivate())
      seen.push_back("preactivate");
    else if (n == m->GetVOREndPreactivate())
      seen.push_back("end-preactivate");
    else if (n->IsAKindOf("VORContext"))
      seen.push_back("context");
    return VORNotifDontPropagate;
  }
  std::vector<std::string> seen;
};

class ManipulatorTest : public VisuTest {
 protected:
  void SetUp() override {
    VisuTest::SetUp();
    // 100 x 100 pixels, one pixel per unit, model origin at the window centre.
    viewer = Make<VORViewer>(nullptr, "v", 0, 100, 100, 0);
    viewer->GetMain2DViewpoint()->SetScale(1.0);
    owner = Make<RecordingCommand>();
    bag = Make<VOR2DBagRep>();
    const float xy[8] = {-10, -10, 10, -10, 10, 10, -10, 10};
    bag->AddChild(Make<VOR2DPolygonRep>(xy, 4, 1));
    viewer->AddRep(bag);
  }
  void TearDown() override {
    manipulator = NULL_var;
    viewer = NULL_var;
    owner = NULL_var;
    bag = NULL_var;
    VisuTest::TearDown();
  }
  VORViewer_var viewer;
  VORHandle<RecordingCommand> owner;
  VOR2DBagRep_var bag;
  VOR2DManipulator_var manipulator;
};

TEST_F(ManipulatorTest, ClickAndDragGesturesNotifyInOrder) {
  manipulator = Make<VOR2DManipulator>(owner, "ActivManip", bag, 1, 0);
  std::vector<std::string> published;
  VORCallbackId id = manipulator->GetEventPublisher()->AddCallback(
      VORManipulator::kVORManipulate, [&](VORBaseUnknown*, const std::string& e, VORNotification*,
                                          void*, VORCallbackId) { published.push_back(e); });
  ASSERT_NE(id, 0u);

  viewer->OnMouseMove(80.0, 50.0);  // outside
  viewer->OnMouseMove(52.0, 50.0);  // enters the rep
  viewer->OnMouseMove(53.0, 50.0);  // still inside: no second preactivate
  viewer->OnMousePress(53.0, 50.0, VORMouseLeft);
  viewer->OnMouseRelease(53.0, 50.0, VORMouseLeft);  // a click
  viewer->OnMousePress(53.0, 50.0, VORMouseLeft);
  viewer->OnMouseMove(54.0, 50.0);  // below the drag threshold
  viewer->OnMouseMove(58.0, 50.0);
  viewer->OnMouseMove(60.0, 50.0);
  viewer->OnMouseRelease(60.0, 50.0, VORMouseLeft);
  viewer->OnMouseMove(90.0, 90.0);  // leaves
  EXPECT_EQ(owner->seen,
            (std::vector<std::string>{"preactivate", "activate", "manipulate", "manipulate",
                                      "end-manipulate", "end-preactivate"}));
  EXPECT_EQ(published.size(), 2u);
  // The first step measures from the press point, so no motion is lost to the threshold.
  VORMathAxis2D position;
  manipulator->GetPosition(position);
  EXPECT_DOUBLE_EQ(position.origin.x, 7.0);
  EXPECT_DOUBLE_EQ(position.origin.y, 0.0);
  // Option 0: the bag itself did not move.
  EXPECT_EQ(bag->GetMatrix(), nullptr);
}

TEST_F(ManipulatorTest, DirectionConstrainsEveryStepAndOptionOneMovesTheBag) {
  manipulator = Make<VOR2DManipulator>(owner, "ScrollManip", bag, 1, 1);
  manipulator->SetDirection(VORMathVector2Df(0.0f, 2.0f));  // normalised to (0, 1)
  manipulator->SetPosition(VORMathAxis2D({0.0, 1.0}, {1.0f, 0.0f}, {0.0f, 1.0f}));
  viewer->OnMousePress(50.0, 50.0, VORMouseLeft);
  viewer->OnMouseMove(60.0, 45.0);  // model step (10, 5): only y counts
  viewer->OnMouseMove(70.0, 47.0);  // model step (10, -2)
  VORMathAxis2D position;
  manipulator->GetPosition(position);
  EXPECT_DOUBLE_EQ(position.origin.x, 0.0);
  EXPECT_DOUBLE_EQ(position.origin.y, 4.0);
  auto* n = static_cast<VORManipulatorNotification*>(manipulator->GetVORManipulate());
  EXPECT_DOUBLE_EQ(n->GetDelta().x, 0.0);
  EXPECT_DOUBLE_EQ(n->GetDelta().y, -2.0);
  EXPECT_DOUBLE_EQ(n->GetPoint().x, 20.0);  // the pointer itself is reported unconstrained
  viewer->OnMouseRelease(70.0, 47.0, VORMouseLeft);
  ASSERT_NE(bag->GetMatrix(), nullptr);
  double tx = 1.0;
  double ty = 0.0;
  bag->GetMatrix()->GetTranslation(tx, ty);
  EXPECT_DOUBLE_EQ(tx, 0.0);
  EXPECT_DOUBLE_EQ(ty, 3.0);
  // A diagonal direction projects the step on it.
  manipulator->SetDirection(VORMathVector2Df(1.0f, 1.0f));
  manipulator->SetPosition(VORMathAxis2D());
  viewer->OnMousePress(50.0, 50.0, VORMouseLeft);
  viewer->OnMouseMove(60.0, 50.0);
  viewer->OnMouseRelease(60.0, 50.0, VORMouseLeft);
  manipulator->GetPosition(position);
  EXPECT_NEAR(position.origin.x, 5.0, 1e-6);
  EXPECT_NEAR(position.origin.y, 5.0, 1e-6);
}

TEST_F(ManipulatorTest, DragOnlyStyleLeavesClicksToSelectionAndContextFollowsTheViewer) {
  manipulator = Make<VOR2DManipulator>(owner, "ActivManip", bag, 2, 0);
  auto thing = Make<PickedThing>(3);
  bag->SetObject(thing);
  viewer->SetViewerSelectable(true);
  std::vector<std::string> order;
  int picks = 0;
  viewer->GetEventPublisher()->AddCallback(
      VORViewer::kPickEvent,
      [&](VORBaseUnknown*, const std::string&, VORNotification* n, void*, VORCallbackId) {
        ++picks;
        auto* pick = static_cast<VORViewerPickNotification*>(n);
        EXPECT_EQ(pick->GetPaths().size(), 1u);
      });
  viewer->GetEventPublisher()->AddCallback(
      "VORContext", [&](VORBaseUnknown*, const std::string&, VORNotification*, void*,
                        VORCallbackId) { order.push_back("viewer"); });
  manipulator->GetEventPublisher()->AddCallback(
      VORManipulator::kVORContext,
      [&](VORBaseUnknown*, const std::string&, VORNotification* n, void*, VORCallbackId) {
        order.push_back("manipulator");
        EXPECT_TRUE(n->IsAKindOf("VORContext"));
      });
  viewer->OnMousePress(50.0, 50.0, VORMouseLeft);
  viewer->OnMouseRelease(50.0, 50.0, VORMouseLeft);
  EXPECT_EQ(picks, 1);
  EXPECT_TRUE(owner->seen.empty());
  viewer->OnContextMenu(50.0, 50.0);
  EXPECT_EQ(order, (std::vector<std::string>{"viewer", "manipulator"}));
  EXPECT_EQ(owner->seen, (std::vector<std::string>{"context"}));
  // A click on the background still reports a pick, with no path.
  viewer->OnContextMenu(5.0, 5.0);
  EXPECT_EQ(order.size(), 3u);
}

TEST_F(ManipulatorTest, RepsAnswerOneManipulatorAndForgetItWhenItDies) {
  manipulator = Make<VOR2DManipulator>(owner, "A", bag, 1, 0);
  auto other = Make<VOR2DManipulator>(owner, "B", nullptr, 1, 0);
  other->AddElement(bag);
  EXPECT_EQ(bag->GetManipulator(), other.get());
  EXPECT_EQ(manipulator->GetElementCount(), 0);
  other = NULL_var;
  EXPECT_EQ(bag->GetManipulator(), nullptr);
  viewer->OnMousePress(50.0, 50.0, VORMouseLeft);
  viewer->OnMouseRelease(50.0, 50.0, VORMouseLeft);
  EXPECT_TRUE(owner->seen.empty());
}

}  // namespace
