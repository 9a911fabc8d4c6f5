#include <cmath>
#include <functional>
#include <numbers>

#include "VOR2DArcCircleRep.h"
#include "VOR2DCustomRep.h"
#include "VOR2DLineRep.h"
#include "VOR2DPointRep.h"
#include "VOR2DPolygonRep.h"
#include "VOR2DTextRep.h"
#include "VOR3x3Matrix.h"
#include "VORTextMetric.h"
#include "VisuTestSupport.h"

namespace {

TEST(MatrixTest, CompositionAppliesTheRightHandMatrixFirst) {
  const VOR3x3Matrix t = VOR3x3Matrix::Translation(10.0, 0.0);
  const VOR3x3Matrix r = VOR3x3Matrix::Rotation(std::numbers::pi / 2.0);
  // Rotate then translate: (1, 0) -> (0, 1) -> (10, 1).
  const VORMathPoint2D a = (t * r).Transform(1.0, 0.0);
  EXPECT_NEAR(a.x, 10.0, 1e-12);
  EXPECT_NEAR(a.y, 1.0, 1e-12);
  // Translate then rotate: (1, 0) -> (11, 0) -> (0, 11).
  const VORMathPoint2D b = (r * t).Transform(1.0, 0.0);
  EXPECT_NEAR(b.x, 0.0, 1e-12);
  EXPECT_NEAR(b.y, 11.0, 1e-12);
  // The module's matrix layout: columns (cos, sin) and (-sin, cos).
  const VOR3x3Matrix q = VOR3x3Matrix::Rotation(0.5, 3.0, 4.0);
  EXPECT_DOUBLE_EQ(q.Get(0, 0), std::cos(0.5));
  EXPECT_DOUBLE_EQ(q.Get(1, 0), std::sin(0.5));
  EXPECT_DOUBLE_EQ(q.Get(0, 1), -std::sin(0.5));
  EXPECT_DOUBLE_EQ(q.Get(0, 2), 3.0);
  EXPECT_DOUBLE_EQ(q.Get(2, 2), 1.0);
}

TEST(MatrixTest, InverseUndoesAndSingularMatricesAreRefused) {
  const VOR3x3Matrix m = VOR3x3Matrix::Translation(5.0, -2.0) * VOR3x3Matrix::Rotation(0.7) *
                         VOR3x3Matrix::Scaling(2.0, 3.0);
  VOR3x3Matrix inverse;
  ASSERT_TRUE(m.Invert(inverse));
  const VORMathPoint2D p = (inverse * m).Transform(1.25, -7.5);
  EXPECT_NEAR(p.x, 1.25, 1e-12);
  EXPECT_NEAR(p.y, -7.5, 1e-12);
  VOR3x3Matrix untouched = VOR3x3Matrix::Translation(1.0, 1.0);
  EXPECT_FALSE(VOR3x3Matrix::Scaling(0.0, 1.0).Invert(untouched));
  EXPECT_EQ(untouched, VOR3x3Matrix::Translation(1.0, 1.0));
}

TEST(MatrixTest, TranslationsKeepFloatInputsExactAndComposeInDouble) {
  // A float handed in reads back as the same float: nothing is rounded on the way in.
  VOR3x3Matrix m;
  m.SetTranslation(0.1f, -2.7f);
  double tx = 0.0;
  double ty = 0.0;
  m.GetTranslation(tx, ty);
  EXPECT_EQ(static_cast<float>(tx), 0.1f);
  EXPECT_EQ(tx, static_cast<double>(0.1f));
  EXPECT_EQ(ty, static_cast<double>(-2.7f));

  // Ten steps of 0.1 composed in double differ from the float sum the module's drag code makes:
  // the matrix must not silently narrow to float.
  VOR3x3Matrix sum;
  float floatSum = 0.0f;
  for (int i = 0; i < 10; ++i) {
    sum = VOR3x3Matrix::Translation(0.1, 0.0) * sum;
    floatSum += 0.1f;
  }
  sum.GetTranslation(tx, ty);
  EXPECT_EQ(tx, 0.1 + 0.1 + 0.1 + 0.1 + 0.1 + 0.1 + 0.1 + 0.1 + 0.1 + 0.1);
  EXPECT_NE(tx, static_cast<double>(floatSum));

  // Boxes through pure translations are exact sums (no multiplications by 1.0 and 0.0 that
  // could round differently).
  const VORBox2D box =
      VOR3x3Matrix::Translation(0.1, 0.2).TransformBox(VORBox2D(0.2, 0.1, 1.0, 1.0));
  EXPECT_EQ(box.xmin, 0.2 + 0.1);
  EXPECT_EQ(box.ymin, 0.1 + 0.2);
}

using RepBoxTest = VisuTest;

TEST_F(RepBoxTest, NestedBagsMapChildBoxesThroughEveryMatrixAndIgnoreHiddenChildren) {
  auto root = Make<VOR2DBagRep>();
  auto inner = Make<VOR2DBagRep>();
  auto line = Make<VOR2DLineRep>(0.0f, 0.0f, 4.0f, 2.0f);
  auto far = Make<VOR2DPointRep>(100.0f, 100.0f, 4);
  inner->AddChild(line);
  inner->AddChild(far);
  inner->SetMatrix(VOR3x3Matrix::Translation(10.0, 20.0));
  root->AddChild(inner);
  root->SetMatrix(VOR3x3Matrix::Scaling(2.0, 2.0));

  far->SetShowMode(1);
  EXPECT_EQ(root->GetBoundingBox(), VORBox2D(20.0, 40.0, 28.0, 44.0));

  // Changes deep in the tree reach the root's cached box.
  line->Modify({0.0f, 0.0f}, {6.0f, 2.0f});
  EXPECT_EQ(root->GetBoundingBox(), VORBox2D(20.0, 40.0, 32.0, 44.0));
  far->SetShowMode(0);
  EXPECT_EQ(root->GetBoundingBox(), VORBox2D(20.0, 40.0, 221.0, 241.0));
  // Rotation: the box holds the rotated corners.
  inner->SetMatrix(VOR3x3Matrix::Rotation(std::numbers::pi / 2.0));
  far->SetShowMode(1);
  const VORBox2D rotated = root->GetBoundingBox();
  EXPECT_NEAR(rotated.xmin, -4.0, 1e-12);
  EXPECT_NEAR(rotated.xmax, 0.0, 1e-12);
  EXPECT_NEAR(rotated.ymax, 12.0, 1e-12);

  // A hidden bag still answers its own box; its father ignores it.
  inner->SetShowMode(1);
  EXPECT_TRUE(root->GetBoundingBox().IsEmpty());
  EXPECT_FALSE(inner->GetBoundingBox().IsEmpty());
}

TEST_F(RepBoxTest, BagsMovedByTheirMatrixAnswerTheBoxOfAFreshComputationOverRandomChanges) {
  // A moved bag maps its children's box again without visiting them: whatever mix of moves,
  // child changes and reads, the root's box is the box computed from scratch.
  auto root = Make<VOR2DBagRep>();
  auto inner = Make<VOR2DBagRep>();
  auto line = Make<VOR2DLineRep>(0.0f, 0.0f, 4.0f, 2.0f);
  auto point = Make<VOR2DPointRep>(9.0f, -3.0f, 4);
  inner->AddChild(line);
  inner->AddChild(point);
  root->AddChild(inner);
  std::function<VORBox2D(const VOR2DRep*)> fresh = [&](const VOR2DRep* rep) {
    const auto* bag = dynamic_cast<const VOR2DBagRep*>(rep);
    if (bag == nullptr)
      return rep->GetBoundingBox();
    VORBox2D box;
    for (const VOR2DRep_var& child : bag->GetChildren()) {
      if (child->IsShown())
        box.Extend(fresh(child.get()));
    }
    return bag->GetMatrix() != nullptr ? bag->GetMatrix()->TransformBox(box) : box;
  };
  unsigned state = 99;
  auto next = [&](unsigned n) {
    state = state * 1103515245u + 12345u;
    return (state >> 8) % n;
  };
  for (int step = 0; step < 500; ++step) {
    const double dx = static_cast<double>(next(40)) - 20.0;
    const double dy = static_cast<double>(next(40)) - 20.0;
    switch (next(6)) {
      case 0:
        inner->SetMatrix(VOR3x3Matrix::Translation(dx, dy));
        break;
      case 1:
        root->SetMatrix(VOR3x3Matrix::Translation(dx, dy));
        break;
      case 2:
        line->Modify({0.0f, 0.0f}, {static_cast<float>(dx), static_cast<float>(dy)});
        break;
      case 3:
        point->SetShowMode(point->IsShown() ? 1 : 0);
        break;
      case 4:
        (void)inner->GetBoundingBox();  // a read between changes caches the inner box only
        break;
      default:
        inner->ResetMatrix();
        break;
    }
    if (next(3) == 0) {
      EXPECT_EQ(root->GetBoundingBox(), fresh(root.get())) << "step " << step;
    }
  }
}

TEST_F(RepBoxTest, BagsRefuseCyclesAndMoveChildrenBetweenFathers) {
  auto a = Make<VOR2DBagRep>();
  auto b = Make<VOR2DBagRep>();
  auto leaf = Make<VOR2DPointRep>(1.0f, 1.0f, 0);
  ASSERT_TRUE(a->AddChild(b));
  EXPECT_FALSE(b->AddChild(a));
  EXPECT_FALSE(a->AddChild(a));
  a->AddChild(leaf);
  b->AddChild(leaf);
  EXPECT_EQ(a->GetSize(), 1);
  EXPECT_EQ(leaf->GetFather(), b.get());
  EXPECT_TRUE(b->DestroyChild(leaf));
  EXPECT_EQ(leaf->GetFather(), nullptr);
  EXPECT_EQ(b->GetSize(), 0);
  EXPECT_EQ(b->GetChild(1), nullptr);
}

TEST_F(RepBoxTest, TextBoxesFollowTheFixedPitchMetricAndAnchorCodes) {
  const double h = VORTextMetric::LabelHeight();
  ASSERT_EQ(h, 2.0);
  // Anchor 0: the label starts at its point; anchor 3: it ends there.
  auto starts = Make<VOR2DTextRep>(VORUnicodeString("Weld"), VORMathPoint2Df(8.0f, 7.5f), 0);
  auto ends = Make<VOR2DTextRep>(VORUnicodeString("Weld"), VORMathPoint2Df(-17.0f, 5.5f), 3);
  EXPECT_EQ(starts->GetBoundingBox(), VORBox2D(8.0, 7.5, 8.0 + 4 * 0.6 * h, 7.5 + h));
  EXPECT_EQ(ends->GetBoundingBox(), VORBox2D(-17.0 - 4 * 0.6 * h, 5.5, -17.0, 5.5 + h));
  // Width counts code points, not UTF-8 bytes.
  auto accented = Make<VOR2DTextRep>(VORUnicodeString("Stütze"), VORMathPoint2Df(), 2);
  EXPECT_DOUBLE_EQ(accented->GetBoundingBox().Width(), 6 * 0.6 * h);
  EXPECT_DOUBLE_EQ(accented->GetBoundingBox().CentreY(), 0.0);
  // The label height is read when the label is made.
  VORTextMetric::LabelHeight() = 4.0;
  auto tall = Make<VOR2DTextRep>(VORUnicodeString("ab"), VORMathPoint2Df(), 0);
  VORTextMetric::LabelHeight() = 2.0;
  EXPECT_EQ(tall->GetBoundingBox(), VORBox2D(0.0, 0.0, 4.8, 4.0));
}

TEST_F(RepBoxTest, ALabelTooWideForItsRoomIsDrawnElidedAndMeasuredAsDrawn) {
  using VORTextMetric::Elide;
  const VORUnicodeString name("FF010 Front floor");  // 17 characters of 1.2 at height 2
  EXPECT_EQ(Elide(name, 2.0, 0.0), name) << "no limit";
  EXPECT_EQ(Elide(name, 2.0, 17 * 1.2), name) << "exactly as wide as the room";
  EXPECT_EQ(Elide(name, 2.0, 17 * 1.2 - 0.01).ConvertToUTF8(), "FF010 Front flo\u2026");
  EXPECT_EQ(Elide(name, 2.0, 6.0).ConvertToUTF8(), "FF01\u2026") << "five characters fit";
  EXPECT_EQ(Elide(name, 2.0, 0.5).ConvertToUTF8(), "\u2026") << "at least the ellipsis";
  EXPECT_EQ(Elide(VORUnicodeString("St\u00fctzenbock"), 2.0, 6.0).ConvertToUTF8(),
            "St\u00fct\u2026")
      << "cut between code points";

  // The rep keeps the whole text; what is drawn, picked and written is the elided one.
  auto label = Make<VOR2DTextRep>(name, VORMathPoint2Df(0.0f, 0.0f), 2, 2.0);
  label->SetMaxWidth(6.0);
  EXPECT_EQ(label->GetText(), name);
  EXPECT_EQ(label->GetShownText().ConvertToUTF8(), "FF01\u2026");
  EXPECT_DOUBLE_EQ(label->GetBoundingBox().Width(), 6.0);
  VORRenderList list;
  VORFlattenContext context;
  context.list = &list;
  label->Flatten(context);
  ASSERT_EQ(list.Items().size(), 1u);
  EXPECT_EQ(list.Items()[0].text.ConvertToUTF8(), "FF01\u2026");
  EXPECT_DOUBLE_EQ(list.Items()[0].box.Width(), 6.0);
}

TEST_F(RepBoxTest, ArcsBoundOnlyTheQuadrantsTheyCross) {
  auto quarter = Make<VOR2DArcCircleRep>(VORMathPoint2Df(1.0f, 1.0f), 2.0f, 0.0f,
                                         static_cast<float>(std::numbers::pi / 2.0));
  const VORBox2D q = quarter->GetBoundingBox();
  EXPECT_NEAR(q.xmin, 1.0, 1e-6);
  EXPECT_NEAR(q.ymin, 1.0, 1e-6);
  EXPECT_NEAR(q.xmax, 3.0, 1e-6);
  EXPECT_NEAR(q.ymax, 3.0, 1e-6);
  // The module's full circle: 0 to 6.2831855 rad, closed.
  auto circle = Make<VOR2DArcCircleRep>(VORMathPoint2Df(5.0f, 1.0f), 0.5f, 0.0f, 6.2831855f, 1);
  EXPECT_TRUE(circle->IsFullCircle());
  EXPECT_EQ(circle->GetBoundingBox(), VORBox2D(4.5, 0.5, 5.5, 1.5));
  // Crossing the negative x axis from above to below.
  auto left = Make<VOR2DArcCircleRep>(VORMathPoint2Df(), 1.0f, 3.0f, 3.5f);
  EXPECT_NEAR(left->GetBoundingBox().xmin, -1.0, 1e-12);
}

TEST_F(RepBoxTest, CustomRepPrimitivesCarryTheirPackedAttributes) {
  auto custom = Make<VOR2DCustomRep>();
  const VORMathPoint2Df link[4] = {{0, 0}, {5, 0}, {5, 4}, {10, 4}};
  const std::uint32_t word = (247u << 24) | 0x041400u;
  ASSERT_TRUE(custom->AddPrimitive(new VOR2DPolylineGP(link, 4, 1), word, 255));
  EXPECT_FALSE(custom->AddPrimitive(nullptr, word, 255));
  const VOR2DGraphicAttribute a = custom->GetAttribute(1);
  EXPECT_EQ(a.ColorIndex(), 247);
  EXPECT_EQ(a.ThicknessIndex(), 4);
  EXPECT_DOUBLE_EQ(a.ThicknessPixels(), 1.0);
  EXPECT_TRUE(a.RoundEnds());
  EXPECT_EQ(a.LineType(), VORLineSolid);
  EXPECT_FALSE(a.Filled());
  EXPECT_TRUE(a.Pickable());
  EXPECT_EQ(VOR2DGraphicAttribute(0xFD041400u, 255).ColorIndex(), 0xFD);
  EXPECT_EQ(VOR2DGraphicAttribute::Pack(247, 4, 1, 4, false, true), word);
  EXPECT_EQ(custom->GetBoundingBox(), VORBox2D(0.0, 0.0, 10.0, 4.0));
  // Grey ramp: the two item-link codes are distinct mid greys.
  EXPECT_EQ(VORColorFromIndex(247), (VORColorRGB{158, 158, 158}));
  EXPECT_EQ(VORColorFromIndex(249), (VORColorRGB{178, 178, 178}));
}

}  // namespace
