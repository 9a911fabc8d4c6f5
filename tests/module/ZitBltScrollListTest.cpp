// The scroll list rep: which items are shown and where as the list scrolls, the clamps of the
// scroller, the hidden scroll bar, the context-menu entry, the balloon, the location keyword
// following a slide round the node, the scroll range from the environment, and selection.
#include <cstdlib>

#include "QELBaseScrollListZitBltRep.h"
#include "VORDlgContextualMenu.h"
#include "VORDocument.h"
#include "VORISPPAbstractActivity.h"
#include "VORModelDoor.h"
#include "VORExtIVisu.h"
#include "ZitBltListVisuTestSupport.h"
#include "ZitBltTestSupport.h"

namespace {

class ScrollListTest : public ::testing::Test {
 protected:
  void SetUp() override {
    unsetenv("ScrollListRange");
    startup.WriteIcon("I_Test", 16, 8);  // a 4 x 2 button
    viewer = VORViewer_var::Adopt(new VORViewer(nullptr, "v", 0, 800, 500, 0));
  }
  void TearDown() override {
    for (QELBaseScrollListZitBltRep* rep : reps)
      rep->RequestDelayedDestruction();
    reps.clear();
    items.clear();
    viewer = NULL_var;
    VORDeferredDeletion::Drain();
    QELZitBltRep::ForgetIcons();
    unsetenv("ScrollListRange");
  }
  // A built list of n items at location, placed on the node (-10, -5) .. (10, 5).
  QELBaseScrollListZitBltRep* Make(const char* location, int n, int state = 0,
                                   const char* name = "ProductInput") {
    auto* rep = new QELBaseScrollListZitBltRep(nullptr, 5);
    reps.push_back(rep);
    rep->SetName(name);
    rep->SetLocation(location);
    rep->SetIcon("I_Test");
    for (int i = 1; i <= n; ++i) {
      items.push_back(MakeItem("Part" + std::to_string(i)));
      rep->AppendItem(items.back(), state);
    }
    rep->BuildRep(viewer);
    rep->SetPositioningLimits(-10, -5, 10, 5);
    return rep;
  }
  static VOR2DBagRep* ItemRep(QELBaseScrollListZitBltRep* rep, int i) {
    VORIVisu_var visu{VORBaseUnknown_var(rep->GetItemVisual(i))};
    return visu ? dynamic_cast<VOR2DBagRep*>(visu->GetRep()) : nullptr;
  }
  static VORMathPoint2D Label(QELBaseScrollListZitBltRep* rep, int i) {
    return ChildTranslation(ItemRep(rep, i), 1);
  }
  static bool LabelShown(QELBaseScrollListZitBltRep* rep, int i) {
    return ItemRep(rep, i)->GetChild(1)->IsShown();
  }
  static bool LinkShown(QELBaseScrollListZitBltRep* rep, int i) {
    return ItemRep(rep, i)->GetChild(2)->IsShown();
  }
  // The scroll manipulation as a drag leaves it: the manipulator at y, then the notification.
  static void ScrollTo(QELBaseScrollListZitBltRep* rep, double y) {
    VOR2DManipulator* m = rep->GetScrollManipulator();
    VORMathAxis2D axis;
    m->GetPosition(axis);
    m->PointerPress(nullptr, {0.0, axis.origin.y}, 0, rep->GetScroller());
    m->PointerDrag({0.0, y}, 0);
    m->PointerRelease({0.0, y}, 0);
  }
  static double ScrollPosition(QELBaseScrollListZitBltRep* rep) {
    VORMathAxis2D axis;
    rep->GetScrollManipulator()->GetPosition(axis);
    return axis.origin.y;
  }

  ZitBltStartupDir startup;
  VORViewer_var viewer;
  std::vector<QELBaseScrollListZitBltRep*> reps;
  std::vector<VORBaseUnknown_var> items;
};

// A list that fits its range, and one whose scroll bar is hidden after a scroll, show every item
// at its resting place from the first, without a scroller.
TEST_F(ScrollListTest, WithoutAScrollerEveryItemShowsFromTheFirst) {
  QELBaseScrollListZitBltRep* fits = Make("lefttop", 5);
  EXPECT_EQ(fits->GetItemVisualCount(), 5);
  QELBaseScrollListZitBltRep* hidden = Make("lefttop", 7);
  ScrollTo(hidden, 3.0);
  hidden->SetZitbltScrollBarHideState(1);
  EXPECT_EQ(hidden->GetScrollTrack(), nullptr);
  EXPECT_EQ(hidden->GetItemVisualCount(), 7);
  for (QELBaseScrollListZitBltRep* rep : {fits, hidden}) {
    EXPECT_EQ(rep->GetFirst(), 1);
    EXPECT_EQ(rep->GetScroller(), nullptr);
    for (int i = 1; i <= rep->GetItemVisualCount(); ++i) {
      EXPECT_TRUE(LabelShown(rep, i) && LinkShown(rep, i)) << i;
      EXPECT_EQ(Label(rep, i), VORMathPoint2D(-17.0, 2.5 * i - 2.0)) << i;
    }
  }
}

TEST_F(ScrollListTest, AHiddenListThatDoesNotScrollIsDrawnWhenShownOrLookedAt) {
  QELBaseScrollListZitBltRep* opened = Make("lefttop", 3);
  QELBaseScrollListZitBltRep* looked = Make("lefttop", 3, 0, "ProductOutput");
  for (QELBaseScrollListZitBltRep* rep : {opened, looked}) {
    EXPECT_TRUE(rep->IsDrawingDeferred());
    EXPECT_EQ(rep->GetZitBltExpanded()->GetSize(), 0);
    EXPECT_FALSE(rep->IsButtonGrey()) << "the button tells the list has items all the same";
  }
  opened->ChangeBtnState();
  EXPECT_FALSE(opened->IsDrawingDeferred());
  EXPECT_EQ(opened->GetZitBltExpanded()->GetSize(), 3) << "drawn before it is shown";
  ASSERT_EQ(looked->GetItemVisualCount(), 3);
  EXPECT_FALSE(looked->IsDrawingDeferred());
  for (int i = 1; i <= 3; ++i) {
    EXPECT_EQ(Label(opened, i), Label(looked, i)) << i;
    EXPECT_TRUE(LabelShown(opened, i) && LinkShown(opened, i)) << i;
  }

  // Shown by its status while closed, a list is drawn too; one that scrolls is never deferred.
  QELBaseScrollListZitBltRep* shown = Make("leftbottom", 2);
  shown->SetStatus(0);
  shown->SetStatus(1);
  EXPECT_EQ(shown->GetZitBltExpanded()->GetSize(), 2);
  QELBaseScrollListZitBltRep* scrolling = Make("lefttop", 7);
  EXPECT_FALSE(scrolling->IsDrawingDeferred());
  EXPECT_GT(scrolling->GetZitBltExpanded()->GetSize(), 7) << "items, track and scroller";

  // A button greyed while the drawing waits stays grey when it is carried out, as it would
  // after a drawing made at once.
  QELBaseScrollListZitBltRep* greyed = Make("lefttop", 2, 0, "Resource");
  greyed->SetZitbltButtonGrey(1);
  EXPECT_EQ(greyed->GetItemVisualCount(), 2);
  EXPECT_TRUE(greyed->IsButtonGrey());
}

TEST_F(ScrollListTest, ScrollingToTheThirdOfSevenShiftsEveryLabelTwiceAndPlacesTheScroller) {
  QELBaseScrollListZitBltRep* rep = Make("lefttop", 7);
  ASSERT_NE(rep->GetScroller(), nullptr);
  EXPECT_TRUE(rep->GrowsUp());
  ScrollTo(rep, 3.0);
  EXPECT_EQ(rep->GetFirst(), 3);
  EXPECT_EQ(rep->GetPreviousFirst(), 3);
  for (int i = 1; i <= 7; ++i) {
    EXPECT_EQ(Label(rep, i), VORMathPoint2D(-17.0, 2.5 * i - 2.0 - 5.0)) << i;
    EXPECT_EQ(LabelShown(rep, i), i >= 3) << i;
    EXPECT_EQ(LinkShown(rep, i), i <= 5) << "links stay with the first five slots";
  }
  // t = 2 x 5 x 3 / 2 = 15 on a track 15 long.
  EXPECT_EQ(rep->GetScroller()->GetStart(), VORMathPoint2Df(-5.75f, 15.0f));
  EXPECT_EQ(rep->GetScroller()->GetEnd(), VORMathPoint2Df(-4.05f, 15.0f));
  const std::vector<VORMathPoint2Df> track = {
      {-5.0f, 0.0f}, {-4.8f, 0.0f}, {-4.8f, 15.0f}, {-5.0f, 15.0f}};
  EXPECT_EQ(rep->GetScrollTrack()->GetPoints(), track);

  // One step back moves the labels by one pitch, as a fresh drawing at that place would.
  ScrollTo(rep, 2.0);
  EXPECT_EQ(rep->GetFirst(), 2);
  for (int i = 1; i <= 7; ++i) {
    EXPECT_EQ(Label(rep, i), VORMathPoint2D(-17.0, 2.5 * i - 2.0 - 2.5)) << i;
    EXPECT_EQ(LabelShown(rep, i), i >= 2 && i <= 6) << i;
  }
  EXPECT_DOUBLE_EQ(rep->GetScroller()->GetStart().y, 7.5);
}

TEST_F(ScrollListTest, ADownwardListScrollsTheOtherWay) {
  QELBaseScrollListZitBltRep* rep = Make("bottommiddle", 7);
  EXPECT_FALSE(rep->GrowsUp());
  ScrollTo(rep, -3.0);  // read negated
  EXPECT_EQ(rep->GetFirst(), 3);
  EXPECT_EQ(Label(rep, 3), VORMathPoint2D(-15.0, -5.0 - 7.5 + 5.0));
  EXPECT_EQ(rep->GetScroller()->GetStart(), VORMathPoint2Df(-0.75f, -20.0f));
}

TEST_F(ScrollListTest, TheScrollerSnapsBackBelowOneAndPastTheLastWindow) {
  QELBaseScrollListZitBltRep* rep = Make("righttop", 7);
  ScrollTo(rep, 0.3);
  EXPECT_EQ(rep->GetFirst(), 1);
  EXPECT_DOUBLE_EQ(ScrollPosition(rep), 1.0);

  ScrollTo(rep, 2.0);
  ASSERT_EQ(rep->GetFirst(), 2);
  const int draws = viewer->GetDrawRequestCount();
  ScrollTo(rep, 9.0);
  EXPECT_EQ(rep->GetFirst(), 3) << "N - R + 1";
  EXPECT_DOUBLE_EQ(ScrollPosition(rep), 3.0);
  EXPECT_EQ(rep->GetPreviousFirst(), 2) << "the snap is no accepted scroll";
  EXPECT_EQ(viewer->GetDrawRequestCount(), draws) << "and draws nothing";
  EXPECT_TRUE(LabelShown(rep, 6));
  ScrollTo(rep, 1e30);  // no overflow on absurd positions
  EXPECT_EQ(rep->GetFirst(), 3);
}

TEST_F(ScrollListTest, MiddleListsShowTheirRangeButOfferNoScroller) {
  QELBaseScrollListZitBltRep* rep = Make("leftmiddle", 7);
  EXPECT_EQ(rep->GetScroller(), nullptr);
  EXPECT_TRUE(LabelShown(rep, 5));
  EXPECT_FALSE(LabelShown(rep, 6));
}

TEST_F(ScrollListTest, ContextMenuOffersTheScrollBarEntryOnlyWhenThereIsSomethingToScroll) {
  auto contextOn = [](QELBaseScrollListZitBltRep* rep) {
    auto context = VORHandle<VORContext>::Adopt(new VORContext(nullptr, 0, 0));
    VORDlgContextualMenu* menu = VORDlgContextualMenu::FromContext(context);
    new VORDlgPushItem(menu, "CenterGraph");  // what the window offered before
    rep->GetManipulator()->Context(nullptr, context);
    return context;
  };
  auto names = [](VORContext* context) {
    std::string text;
    for (VORDlgControl* c :
         static_cast<VORDlgControl*>(context->GetContextualMenu())->GetControls())
      text += c->GetName().str() + "=" + c->GetTitle().ConvertToUTF8() + " ";
    return text;
  };
  EXPECT_EQ(names(contextOn(Make("lefttop", 5))), "CenterGraph= ");

  QELBaseScrollListZitBltRep* rep = Make("lefttop", 6);
  auto context = contextOn(rep);
  EXPECT_EQ(names(context), "HideShowScrollBar=HideScrollBar ");
  auto* entry = dynamic_cast<VORDlgPushItem*>(
      static_cast<VORDlgControl*>(context->GetContextualMenu())->GetControls().front());
  ASSERT_TRUE(entry->UserActivate());
  EXPECT_EQ(rep->GetZitbltScrollBarHideState(), 1);
  EXPECT_EQ(rep->GetScroller(), nullptr);
  EXPECT_EQ(names(contextOn(rep)), "HideShowScrollBar=ShowScrollBar ");
}

TEST_F(ScrollListTest, TheBalloonTellsTheSizeWhileThePointerRestsOnTheScrollBar) {
  QELBaseScrollListZitBltRep* rep = Make("lefttop", 7);
  rep->GetScrollManipulator()->Preactivate(viewer, {0, 0}, 0);
  ASSERT_NE(rep->GetBalloon(), nullptr);
  EXPECT_TRUE(rep->GetBalloon()->IsVisible());
  EXPECT_EQ(rep->GetBalloon()->GetText(), VORUnicodeString("Size = 7"));
  rep->GetScrollManipulator()->EndPreactivate(viewer, {0, 0}, 0);
  EXPECT_FALSE(rep->GetBalloon()->IsVisible());
}

TEST_F(ScrollListTest, SlidingRoundTheNodeRederivesTheLocationAndRelaysTheList) {
  // Limits of the 4 x 2 button on the node: x in [-12, 12], y in [-4, 6]; centre (0, 1).
  auto slide = [](QELBaseScrollListZitBltRep* rep, std::vector<VORMathPoint2D> points) {
    VOR2DManipulator* m = rep->GetManipulator();
    m->PointerPress(nullptr, points.front(), 0, rep->GetZitBltBtn());
    for (size_t i = 1; i < points.size(); ++i)
      m->PointerDrag(points[i], 0);
    m->PointerRelease(points.back(), 0);
    return rep->GetLocation().ConvertToUTF8();
  };
  QELBaseScrollListZitBltRep* left = Make("lefttop", 2);
  left->SetPoDPosition(-10, 5);
  EXPECT_EQ(slide(left, {{-10, 5}, {-10, 4}, {-10, -2}}), "leftbottom");
  EXPECT_EQ(Label(left, 1), VORMathPoint2D(-17.0, -4.5)) << "the list now grows downwards";
  EXPECT_EQ(slide(left, {{-10, -1}, {-10, 0}, {-10, 1}}), "leftmiddle") << "on the centre line";

  QELBaseScrollListZitBltRep* top = Make("topmiddle", 2);
  top->SetPoDPosition(0, 5);
  EXPECT_EQ(slide(top, {{0, 5}, {1, 5}, {4, 5}}), "topright") << "came from the top edge";
  EXPECT_EQ(slide(top, {{3, 5}, {2, 5}, {0, 5}}), "topmiddle");
  EXPECT_EQ(slide(top, {{0, 5}, {-1, 5}, {-6, 5}}), "topleft");

  QELBaseScrollListZitBltRep* corner = Make("topleft", 2);
  corner->SetPoDPosition(-10, 5);
  EXPECT_EQ(slide(corner, {{-10, 5}, {-10, 4}, {-10, 3}}), "topleft") << "the same corner";
}

TEST_F(ScrollListTest, ScrollRangeComesFromTheEnvironmentAndBadValuesKeepTheDefault) {
  for (const char* bad : {"0", "-3", "abc", "3x", "", "99999999999999999999", "1001"}) {
    setenv("ScrollListRange", bad, 1);
    QELBaseScrollListZitBltRep* rep = Make("lefttop", 7);
    EXPECT_EQ(rep->GetScrollRange(), 5) << '"' << bad << '"';
    EXPECT_FALSE(LabelShown(rep, 6)) << '"' << bad << '"';
  }
  setenv("ScrollListRange", "3", 1);
  QELBaseScrollListZitBltRep* rep = Make("lefttop", 7);
  EXPECT_EQ(rep->GetScrollRange(), 3);
  EXPECT_TRUE(LabelShown(rep, 3));
  EXPECT_FALSE(LabelShown(rep, 4));
  EXPECT_DOUBLE_EQ(rep->GetScrollTrack()->GetPoints()[2].y, 9.0) << "3 units per visible item";
  rep->SetScrollRange(0);
  EXPECT_EQ(rep->GetScrollRange(), 1) << "a range of nothing is refused";
}

TEST_F(ScrollListTest, ItemsAreKeptOnceWithTheirKindsAndStates) {
  QELBaseScrollListZitBltRep* rep = Make("lefttop", 0);
  auto a = MakeItem("A");
  auto b = MakeItem("B");
  rep->AppendItem(a, 1);
  rep->AppendItem(a, 0);  // refused, its kind recorded all the same
  rep->AppendItem(nullptr, 0);
  rep->AppendItem(b, 2);  // a resource: no kind
  EXPECT_EQ(rep->GetItems().Size(), 2);
  EXPECT_EQ(rep->GetItemKinds(), (std::vector<int>{2, 1, 1}));
  EXPECT_EQ(rep->GetItemState(1), 1);
  EXPECT_EQ(rep->GetItemState(2), 2);
  rep->DrawScrollList();
  // Kinds cover the last visible index: the kept item's link is 247, the other's 249.
  EXPECT_EQ(rep->GetItemVisual(1)->GetTypeCode(), 247u);
  EXPECT_EQ(rep->GetItemVisual(2)->GetTypeCode(), 249u);
  rep->RemoveAllItems(1);
  EXPECT_EQ(rep->GetItems().Size(), 0);
  EXPECT_EQ(rep->GetItemVisualCount(), 0);
  EXPECT_EQ(rep->GetZitBltExpanded()->GetSize(), 0);
}

TEST_F(ScrollListTest, SelectedItemsOfThisListRideOnTheItemManipulator) {
  QELBaseScrollListZitBltRep* rep = Make("lefttop", 3);
  QELBaseScrollListZitBltRep* other = Make("lefttop", 3, 0, "ProductOutput");
  auto cso = VORCSO_var::Adopt(new VORCSO());
  auto pathTo = [](QELBaseScrollListZitBltRep* list, int i) {
    auto path = VORPathElement_var::Adopt(new VORPathElement());
    path->AddChildElement(list->GetItemVisual(i));
    path->AddChildElement(list->GetItemVisual(i)->GetAssociatedPFItem());
    return path;
  };
  cso->AddElement(pathTo(rep, 2));
  cso->AddElement(pathTo(other, 1));
  rep->InitCSOElem(cso, 0);
  ASSERT_EQ(rep->GetItemManipulator()->GetElementCount(), 1);
  EXPECT_EQ(rep->GetItemManipulator()->GetElements().front().get(), ItemRep(rep, 2));

  auto removed = VORListValVORBaseUnknown_var();
  removed.Append(VORBaseUnknown_var(cso->GetElement(1)));
  auto change = VORHandle<VORCSOChangeNotification>::Adopt(
      new VORCSOChangeNotification(cso, VORListValVORBaseUnknown_var(), removed));
  rep->OnCSONotif(change);
  EXPECT_EQ(rep->GetItemManipulator()->GetElementCount(), 0);
}

}  // namespace

namespace {

TEST(ScrollListCycleTimeTest, JoiningActivitiesRecomputeTheirTimeAndOthersAreLeftAlone) {
  auto doc = VORProcess_var::Adopt(VORProcess::CreateNew("Line"));
  VORModelDoor& door = doc->GetDoor();
  VORBaseUnknown_var weld, arc, station;
  door.CreateNode(doc->GetRootProcess(), "BIWActivitySpotWelding", weld);
  door.CreateNode(doc->GetRootProcess(), "BIWActivityArcWelding", arc);
  door.CreateNode(doc->GetRootProcess(), "BIWActivityStation", station);
  door.SetUserAttribute(weld, "NumberOfPoints", VORAttributeValue::Long(12));
  door.SetUserAttribute(weld, "TimePerPoint", VORAttributeValue::Double(2.5));
  door.SetUserAttribute(arc, "SeamLength", VORAttributeValue::Long(900));
  door.SetUserAttribute(arc, "SeamSpeed", VORAttributeValue::Double(50));
  VORISPPAbstractActivity_var(station)->SetActivityTime(7);
  auto* rep = new QELBaseScrollListZitBltRep(nullptr, 5);
  for (VORBaseUnknown* activity : {weld.get(), arc.get(), station.get()})
    rep->UpdateCycleTime(activity);
  auto time = [](VORBaseUnknown* a) {
    double t = 0.0;
    VORISPPAbstractActivity_var(VORBaseUnknown_var(a))->GetActivityTime(t);
    return t;
  };
  EXPECT_EQ(time(weld), 30.0);
  EXPECT_EQ(time(arc), 18.0);
  EXPECT_EQ(time(station), 7.0);
  rep->RequestDelayedDestruction();
  VORDeferredDeletion::Drain();
}

}  // namespace
