#include "VOR2DPolygonRep.h"
#include "VOR2DTextRep.h"
#include "VORHSO.h"
#include "VORModelForRep2D.h"
#include "VORPSO.h"
#include "VORPVBalloon.h"
#include "VORSelectionContext.h"
#include "VORViewer.h"
#include "VORVisManager.h"
#include "VisuTestSupport.h"

namespace {

using ViewerTest = VisuTest;

VORHandle<VOR2DBagRep> NodeAt(float x, float y, VORBaseUnknown* object) {
  auto bag = Make<VOR2DBagRep>();
  const float xy[8] = {-5, -5, 5, -5, 5, 5, -5, 5};
  bag->AddChild(Make<VOR2DPolygonRep>(xy, 4, 1));
  bag->SetMatrix(VOR3x3Matrix::Translation(x, y));
  bag->SetObject(object);
  return bag;
}

TEST_F(ViewerTest, ViewpointConvertsBothWaysZoomsAboutThePointerAndReframes) {
  auto viewer = Make<VORViewer>(nullptr, "v", 0, 800, 500, 8);
  VOR2DViewpoint* vp = viewer->GetMain2DViewpoint();
  vp->SetCentre(10.0, 20.0);
  vp->SetScale(4.0);
  // y up in the model, down in pixels.
  const VORMathPoint2D top = vp->PixelToModel(400.0, 0.0);
  EXPECT_DOUBLE_EQ(top.x, 10.0);
  EXPECT_DOUBLE_EQ(top.y, 20.0 + 250.0 / 4.0);
  const VORMathPoint2D back = vp->ModelToPixel(top.x, top.y);
  EXPECT_DOUBLE_EQ(back.x, 400.0);
  EXPECT_DOUBLE_EQ(back.y, 0.0);

  const VORMathPoint2D before = vp->PixelToModel(123.0, 77.0);
  viewer->OnMouseWheel(123.0, 77.0, 240);
  EXPECT_NEAR(vp->GetScale(), 4.0 * 1.25 * 1.25, 1e-12) << "two notches of 1.25";
  const VORMathPoint2D after = vp->PixelToModel(123.0, 77.0);
  EXPECT_NEAR(after.x, before.x, 1e-9);
  EXPECT_NEAR(after.y, before.y, 1e-9);

  // Middle drag pans: the point under the pointer follows it.
  const VORMathPoint2D grabbed = vp->PixelToModel(100.0, 100.0);
  viewer->OnMousePress(100.0, 100.0, VORMouseMiddle);
  viewer->OnMouseMove(130.0, 90.0);
  viewer->OnMouseRelease(130.0, 90.0, VORMouseMiddle);
  const VORMathPoint2D moved = vp->PixelToModel(130.0, 90.0);
  EXPECT_NEAR(moved.x, grabbed.x, 1e-9);
  EXPECT_NEAR(moved.y, grabbed.y, 1e-9);

  // Reframe: the scene fits with 5 % margins, limited by the tighter axis.
  viewer->AddRep(NodeAt(0.0f, 0.0f, nullptr));
  viewer->AddRep(NodeAt(95.0f, 15.0f, nullptr));
  viewer->Reframe();
  EXPECT_DOUBLE_EQ(vp->GetScale(), 800.0 * 0.9 / 105.0);
  double cx = 0.0;
  double cy = 0.0;
  vp->GetCentre(cx, cy);
  EXPECT_DOUBLE_EQ(cx, 47.5);
  EXPECT_DOUBLE_EQ(cy, 7.5);
  const VORBox2D visible = vp->VisibleBox();
  EXPECT_TRUE(visible.Contains(-5.0, -5.0) && visible.Contains(100.0, 20.0));
  float w = 0.0f;
  float h = 0.0f;
  viewer->GetGraphicSize(w, h);
  EXPECT_EQ(w, 800.0f);
  EXPECT_EQ(h, 500.0f);
}

TEST_F(ViewerTest, PreselectionFollowsThePointerAndHighlightsReachTheRenderList) {
  auto viewer = Make<VORViewer>(nullptr, "v", 0, 100, 100, 0);
  viewer->GetMain2DViewpoint()->SetScale(1.0);
  auto a = Make<PickedThing>(1);
  auto b = Make<PickedThing>(2);
  viewer->AddRep(NodeAt(-20.0f, 0.0f, a));
  viewer->AddRep(NodeAt(20.0f, 0.0f, b));
  auto pso = Make<VORPSO>();
  auto hso = Make<VORHSO>();
  VORVisManager* manager = VORVisManager::GetVisManager();
  manager->AttachPSOTo(pso, viewer->GetMain2DViewpoint());
  manager->AttachHSOTo(hso, viewer->GetMain2DViewpoint());
  EXPECT_TRUE(manager->IsAttached(viewer->GetMain2DViewpoint()));

  viewer->OnMouseMove(30.0, 50.0);  // over a
  ASSERT_EQ(pso->GetSize(), 1);
  EXPECT_EQ(pso->GetElement(1)->GetLeaf(), a.get());
  viewer->OnMouseMove(31.0, 50.0);  // same object: the set is not rebuilt
  EXPECT_EQ(pso->GetSize(), 1);
  hso->AddElement(b);
  const VORRenderList& list = viewer->GetRenderList();
  ASSERT_EQ(list.Size(), 2);
  EXPECT_EQ(list.Items()[0].highlight, VORHighlightPreselected);
  EXPECT_EQ(list.Items()[1].highlight, VORHighlightSelected);
  viewer->OnMouseMove(50.0, 90.0);  // background
  EXPECT_TRUE(pso->IsEmpty());
  EXPECT_EQ(viewer->GetRenderList().Items()[0].highlight, VORHighlightNone);

  // Mode 1 keeps the sets attached, mode 0 detaches them.
  viewer->OnMouseMove(30.0, 50.0);
  manager->DetachFrom(viewer->GetMain2DViewpoint(), 1);
  EXPECT_TRUE(pso->IsEmpty());
  EXPECT_EQ(viewer->GetHighlightSet(), hso.get());
  const int draws = viewer->GetDrawRequestCount();
  manager->Commit();
  EXPECT_EQ(viewer->GetDrawRequestCount(), draws + 1);
  manager->DetachFrom(viewer->GetMain2DViewpoint(), 0);
  EXPECT_EQ(viewer->GetHighlightSet(), nullptr);
  EXPECT_FALSE(manager->IsAttached(viewer->GetMain2DViewpoint()));
}

TEST_F(ViewerTest, AnEditorSetThatListsTheViewerIsShownUntilItRemovesIt) {
  auto viewer = Make<VORViewer>(nullptr, "v", 0, 100, 100, 0);
  auto iso = Make<VORISO>();
  VORSelectionContext::Set(nullptr, nullptr, nullptr, iso);
  auto model = Make<VORModelForRep2D>();
  model->SetRep(NodeAt(0.0f, 0.0f, nullptr));
  iso->AddElement(model);
  EXPECT_EQ(viewer->GetRenderList().Size(), 0);
  iso->AddViewer(viewer.get());
  EXPECT_EQ(viewer->GetRenderList().Size(), 1);
  iso->RemoveElement(model);
  EXPECT_EQ(viewer->GetRenderList().Size(), 0);
  iso->AddElement(model);
  iso->RemoveViewer(viewer.get());
  EXPECT_EQ(viewer->GetRenderList().Size(), 0);
  EXPECT_TRUE(viewer->GetAttachedISOs().empty());
  VORSelectionContext::Set(nullptr, nullptr, nullptr, nullptr);
}

TEST_F(ViewerTest, CursorBalloonAndBackgroundAreKeptForThePainter) {
  auto viewer = Make<VORViewer>(nullptr, "ProductFlow Viewer ", 0x40000, 800, 500, 8);
  EXPECT_EQ(viewer->GetStyle(), 0x40000);
  EXPECT_EQ(viewer->GetCursor(), VORCursorDefault);
  viewer->SetCursor(VORCursorDropAllowed);
  EXPECT_EQ(viewer->GetCursor(), 8);
  viewer->SetBackgroundColor(0.5f, 0.25f, 1.0f);
  float r = 0, g = 0, b = 0;
  viewer->GetBackgroundColor(r, g, b);
  EXPECT_EQ(g, 0.25f);
  {
    auto balloon = Make<VORPVBalloon>(viewer.get());
    balloon->Show(VORUnicodeString("Size = 7"));
    EXPECT_FALSE(balloon->IsVisible());  // visibility not allowed yet
    balloon->SetVisibility(1);
    viewer->OnMouseMove(500.0, 250.0);
    balloon->Show(VORUnicodeString("Size = 7"));
    EXPECT_TRUE(balloon->IsVisible());
    EXPECT_DOUBLE_EQ(balloon->GetPosition().x, 100.0 / 4.0);
    ASSERT_EQ(viewer->GetBalloons().size(), 1u);
    balloon->Hide(1);
    EXPECT_FALSE(balloon->IsVisible());
  }
  EXPECT_TRUE(viewer->GetBalloons().empty());
}

}  // namespace
