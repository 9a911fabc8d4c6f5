#include <numbers>
#include <random>

#include "VOR2DLineRep.h"
#include "VOR2DPointRep.h"
#include "VOR2DPolygonRep.h"
#include "VOR2DTextRep.h"
#include "VORModelForRep2D.h"
#include "VORViewer.h"
#include "VisuTestSupport.h"

namespace {

using PickTest = VisuTest;

VORHandle<VOR2DPolygonRep> Square(float x, float y, float size, int fill = 1) {
  const float xy[8] = {x, y, x + size, y, x + size, y + size, x, y + size};
  return Make<VOR2DPolygonRep>(xy, 4, fill);
}

int IdOf(VORBaseUnknown* o) {
  auto* thing = dynamic_cast<PickedThing*>(o);
  return thing ? thing->Id() : -1;
}

TEST_F(PickTest, PicksThroughNestedTransformedBagsFrontToBackSkippingHiddenReps) {
  auto viewer = Make<VORViewer>(nullptr, "v", 0, 200, 100, 0);
  auto level = Make<PickedThing>(1);
  auto nodeA = Make<PickedThing>(2);
  auto nodeB = Make<PickedThing>(3);
  auto hidden = Make<PickedThing>(4);

  // A level bag turned by a quarter turn and moved; two node bags inside it overlap.
  auto levelBag = Make<VOR2DBagRep>();
  levelBag->SetObject(level);
  levelBag->SetMatrix(VOR3x3Matrix::Rotation(std::numbers::pi / 2.0, 100.0, 0.0));
  auto bagA = Make<VOR2DBagRep>();
  bagA->SetObject(nodeA);
  bagA->SetMatrix(VOR3x3Matrix::Translation(10.0, 0.0));
  bagA->AddChild(Square(0, 0, 10));
  auto bagB = Make<VOR2DBagRep>();
  bagB->SetObject(nodeB);
  bagB->SetMatrix(VOR3x3Matrix::Translation(15.0, 0.0));
  bagB->AddChild(Square(0, 0, 10));
  auto bagHidden = Make<VOR2DBagRep>();
  bagHidden->SetObject(hidden);
  bagHidden->AddChild(Square(0, 0, 40));
  bagHidden->SetShowMode(1);
  levelBag->AddChild(bagA);
  levelBag->AddChild(bagB);
  levelBag->AddChild(bagHidden);
  viewer->AddRep(levelBag);

  // Local (17, 5) of the level is model (100 - 5, 17) after the quarter turn.
  std::vector<VORPickHit> hits = viewer->PickReps(95.0, 17.0, 0.0);
  ASSERT_EQ(hits.size(), 2u);
  EXPECT_EQ(hits[0].reps[1], bagB.get());  // added last: in front
  EXPECT_EQ(hits[1].reps[1], bagA.get());

  // The same through pixels and object paths: root first, leaf last.
  viewer->GetMain2DViewpoint()->SetScale(1.0);
  viewer->GetMain2DViewpoint()->SetCentre(95.0, 17.0);
  std::vector<VORPathElement_var> paths = viewer->PickPaths(100.0, 50.0);
  ASSERT_EQ(paths.size(), 2u);
  EXPECT_EQ(IdOf(paths[0]->GetRoot()), 1);
  EXPECT_EQ(IdOf(paths[0]->GetLeaf()), 3);
  EXPECT_EQ(IdOf(paths[1]->GetLeaf()), 2);
  std::unique_ptr<VORListValVORBaseUnknown_var> list(viewer->Pick(100.0, 50.0));
  EXPECT_EQ(list->Size(), 2);
  EXPECT_EQ(viewer->PickPathsAtModelPoint(95.0, 17.0).size(), 2u);

  // Hiding the front node leaves the one behind; hiding a leaf inside a shown bag works too.
  bagB->SetShowMode(1);
  paths = viewer->PickPaths(100.0, 50.0);
  ASSERT_EQ(paths.size(), 1u);
  EXPECT_EQ(IdOf(paths[0]->GetLeaf()), 2);
  bagA->GetChild(1)->SetShowMode(1);
  EXPECT_TRUE(viewer->PickPaths(100.0, 50.0).empty());
  // Outside every shown rep: nothing, even inside the hidden bag's square.
  EXPECT_TRUE(viewer->PickReps(100.0 - 30.0, 30.0, 0.0).empty());
}

TEST_F(PickTest, InteractiveSetRepsAreInFrontAndRepsWithoutObjectsAreNotReported) {
  auto viewer = Make<VORViewer>(nullptr, "v", 0, 100, 100, 0);
  auto iso = Make<VORISO>();
  viewer->AttachISO(iso);
  auto grid = Square(-50, -50, 100);  // no object: never reported
  viewer->AddRep(grid);
  auto node = Make<PickedThing>(7);
  auto nodeBag = Make<VOR2DBagRep>();
  nodeBag->SetObject(node);
  auto box = Square(-5, -5, 10);
  auto label = Make<VOR2DTextRep>(VORUnicodeString("A"), VORMathPoint2Df(0, 0), 2);
  nodeBag->AddChild(box);
  nodeBag->AddChild(label);
  viewer->AddRep(nodeBag);
  auto item = Make<PickedThing>(8);
  auto itemRep = Square(-1, -1, 2);
  itemRep->SetObject(item);
  auto model = Make<VORModelForRep2D>();
  model->SetRep(itemRep);
  iso->GetEventPublisher();  // the set exists before the model arrives
  ASSERT_TRUE(iso->AddElement(model));

  viewer->GetMain2DViewpoint()->SetScale(10.0);
  std::vector<VORPathElement_var> paths = viewer->PickPaths(50.0, 50.0);
  ASSERT_EQ(paths.size(), 2u);
  EXPECT_EQ(IdOf(paths[0]->GetLeaf()), 8);
  // The label and the box of one node give one path.
  EXPECT_EQ(IdOf(paths[1]->GetLeaf()), 7);
  // The tolerance is three pixels: 0.3 units at this scale.
  EXPECT_EQ(viewer->PickPaths(50.0 + 52.0, 50.0).size(), 1u);
  EXPECT_EQ(viewer->PickPaths(50.0 + 54.0, 50.0).size(), 0u);
  viewer->DetachISO(iso);
}

// Reference: test every shown leaf with its full matrix, no boxes, no culling.
void BruteForce(VOR2DRep* rep, const VOR3x3Matrix& toModel, std::vector<VOR2DRep*>& chain, double x,
                double y, std::vector<std::vector<VOR2DRep*>>& out) {
  if (!rep->IsShown())
    return;
  chain.push_back(rep);
  if (auto* bag = dynamic_cast<VOR2DBagRep*>(rep)) {
    VOR3x3Matrix m = toModel;
    if (bag->GetMatrix() != nullptr)
      m = toModel * *bag->GetMatrix();
    for (int i = bag->GetSize(); i >= 1; --i)
      BruteForce(bag->GetChild(i), m, chain, x, y, out);
  } else {
    VOR3x3Matrix inverse;
    if (toModel.Invert(inverse) && rep->HitTest(inverse.Transform(x, y), 0.0))
      out.push_back(chain);
  }
  chain.pop_back();
}

TEST_F(PickTest, CulledPickingMatchesAPlainScanOnGeneratedScenes) {
  // Even scenes pick by scanning the children, odd ones through the bags' grid index.
  const int threshold = VOR2DBagRep::GetIndexThreshold();
  std::mt19937 random(42);
  std::uniform_real_distribution<float> coord(-50.0f, 50.0f);
  std::uniform_real_distribution<double> angle(0.0, 6.28);
  for (int scene = 0; scene < 20; ++scene) {
    VOR2DBagRep::SetIndexThreshold(scene % 2 == 0 ? 1000 : 4);
    auto root = Make<VOR2DBagRep>();
    for (int i = 0; i < 30; ++i) {
      auto bag = Make<VOR2DBagRep>();
      bag->SetMatrix(VOR3x3Matrix::Translation(coord(random), coord(random)) *
                     VOR3x3Matrix::Rotation(angle(random)) *
                     VOR3x3Matrix::Scaling(1.0 + (i % 3), 1.0 + (i % 2)));
      bag->AddChild(Square(coord(random) / 5, coord(random) / 5, 6.0f + i % 4, i % 2));
      bag->AddChild(Make<VOR2DLineRep>(coord(random) / 5, coord(random) / 5, coord(random) / 5,
                                       coord(random) / 5));
      if (i % 7 == 0)
        bag->SetShowMode(1);
      if (i % 5 == 0)
        bag->GetChild(1)->SetShowMode(1);
      root->AddChild(bag);
    }
    for (int probe = 0; probe < 200; ++probe) {
      const double x = coord(random);
      const double y = coord(random);
      std::vector<VORPickHit> fast;
      std::vector<VOR2DRep*> chain;
      root->CollectPicks({x, y}, 0.0, chain, fast);
      std::vector<std::vector<VOR2DRep*>> slow;
      BruteForce(root, VOR3x3Matrix(), chain, x, y, slow);
      ASSERT_EQ(fast.size(), slow.size()) << "scene " << scene << " at " << x << "," << y;
      for (size_t k = 0; k < fast.size(); ++k)
        EXPECT_EQ(fast[k].reps, slow[k]);
    }
    // A change after the first pick must reach the index.
    VOR2DRep* moved = root->GetChild(3);
    static_cast<VOR2DBagRep*>(moved)->SetMatrix(VOR3x3Matrix::Translation(500.0, 500.0));
    std::vector<VORPickHit> hits;
    std::vector<VOR2DRep*> chain;
    root->CollectPicks({500.0 + 0.5, 500.0 + 0.5}, 50.0, chain, hits);
    ASSERT_FALSE(hits.empty());
    EXPECT_EQ(hits[0].reps[1], moved);
  }
  VOR2DBagRep::SetIndexThreshold(threshold);
}

}  // namespace
