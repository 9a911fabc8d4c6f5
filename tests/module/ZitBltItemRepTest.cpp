// The geometry of list items: arrow heads and orthogonal links, label placement and links per
// location keyword, the display-status icon of product inputs, and the output label.
#include <cmath>

#include "QELArrowRepAdapter.h"
#include "QELPFViewerItemRepComponent.h"
#include "QELZitBltRep.h"
#include "VOR2DCustomRep.h"
#include "VOR2DImagePixelRep.h"
#include "VOR2DTextRep.h"
#include "VORDocument.h"
#include "VORIVisProperties.h"
#include "VORModelDoor.h"
#include "ZitBltListVisuTestSupport.h"
#include "ZitBltTestSupport.h"

namespace {

std::vector<VORMathPoint2Df> Points(VOR2DPolylineGP* polyline) {
  std::unique_ptr<VOR2DPolylineGP> owned(polyline);
  return owned ? owned->GetPoints() : std::vector<VORMathPoint2Df>();
}

void ExpectNear(const VORMathPoint2Df& p, float x, float y, const char* what) {
  EXPECT_NEAR(p.x, x, 1e-4) << what;
  EXPECT_NEAR(p.y, y, 1e-4) << what;
}

TEST(ArrowRepAdapterTest, OrthogonalLinkTurnsAtTheMiddleColumn) {
  const auto link = Points(QELArrowRepAdapter::CreateOrthogonalLink({0, 0}, {10, 4}));
  ASSERT_EQ(link.size(), 4u);
  EXPECT_EQ(link[0], VORMathPoint2Df(0, 0));
  EXPECT_EQ(link[1], VORMathPoint2Df(5, 0));
  EXPECT_EQ(link[2], VORMathPoint2Df(5, 4));
  EXPECT_EQ(link[3], VORMathPoint2Df(10, 4));
  // Same column: the link degenerates to a vertical segment.
  const auto vertical = Points(QELArrowRepAdapter::CreateOrthogonalLink({3, 1}, {3, 9}));
  EXPECT_EQ(vertical[1], VORMathPoint2Df(3, 1));
  EXPECT_EQ(vertical[2], VORMathPoint2Df(3, 9));
}

TEST(ArrowRepAdapterTest, ArrowHeadSitsAtTheEndWithBarbsOfLengthTwoMirroredToTheLeft) {
  const auto right = Points(QELArrowRepAdapter::CreateArrow({0, 0}, {10, 0}));
  ASSERT_EQ(right.size(), 3u);
  ExpectNear(right[0], 8.0979f, -0.6180f, "clockwise barb first");
  EXPECT_EQ(right[1], VORMathPoint2Df(10, 0));
  ExpectNear(right[2], 8.0979f, 0.6180f, "counter-clockwise barb");
  const auto left = Points(QELArrowRepAdapter::CreateArrow({10, 3}, {0, 3}));
  ExpectNear(left[0], 1.9021f, 3.6180f, "mirrored");
  EXPECT_EQ(left[1], VORMathPoint2Df(0, 3));
  ExpectNear(left[2], 1.9021f, 2.3820f, "mirrored");
}

class ItemRepTest : public ::testing::Test {
 protected:
  void TearDown() override {
    // The item rep stands for its component, which keeps the rep: whoever drops the rep breaks
    // the pair.
    for (auto& component : components) {
      if (VOR2DRep* rep = component->GetRep())
        rep->SetObject(nullptr);
      component->ForgetRep();
    }
    components.clear();
    VORDeferredDeletion::Drain();
    QELZitBltRep::ForgetIcons();
  }
  QELPFViewerItemRepComponent* Make(VORBaseUnknown* item, const char* location, int index,
                                    unsigned int code = 249) {
    auto component = VORHandle<QELPFViewerItemRepComponent>::Adopt(
        new QELPFViewerItemRepComponent(nullptr, item, code));
    component->SetItemPos(index, location);
    components.push_back(component);
    return component.get();
  }
  static VOR2DCustomRep* Link(VOR2DRep* rep) {
    auto* arrow = dynamic_cast<VOR2DBagRep*>(dynamic_cast<VOR2DBagRep*>(rep)->GetChild(2));
    return arrow ? dynamic_cast<VOR2DCustomRep*>(arrow->GetChild(1)) : nullptr;
  }
  std::vector<VORHandle<QELPFViewerItemRepComponent>> components;
};

TEST_F(ItemRepTest, LabelAndLinkFollowTheLocationKeyword) {
  struct Case {
    const char* location;
    int index;
    float x, y;
    int anchor;
    float ax, ay, bx, by;
  } cases[] = {
      {"lefttop", 3, -17.0f, 5.5f, 3, -9.0f, 5.5f, -4.0f, -2.0f},
      {"leftmiddle", 1, -17.0f, 0.5f, 3, -9.0f, 0.5f, -4.0f, -2.0f},
      {"leftbottom", 2, -17.0f, -7.0f, 3, -9.0f, -7.0f, -4.0f, -2.0f},
      {"righttop", 2, 8.0f, 3.0f, 0, 9.0f, 3.0f, 4.0f, -2.0f},
      {"rightmiddle", 1, 8.0f, 0.5f, 0, 9.0f, 0.5f, 4.0f, -2.0f},
      {"rightbottom", 1, 8.0f, -4.5f, 0, 9.0f, -4.5f, 4.0f, -2.0f},
      {"topleft", 2, -15.0f, 10.0f, 3, -5.0f, 10.0f, -2.0f, 2.0f},
      {"topmiddle", 1, -15.0f, 7.5f, 3, -5.0f, 7.5f, -2.0f, 2.0f},
      {"topright", 1, 8.0f, 7.5f, 0, 5.0f, 7.5f, 2.0f, 2.0f},
      {"bottomleft", 1, -15.0f, -7.5f, 3, -5.0f, -7.5f, -2.0f, -2.0f},
      {"bottommiddle", 4, -15.0f, -15.0f, 3, -5.0f, -15.0f, -2.0f, -2.0f},
      {"bottomright", 1, 8.0f, -7.5f, 0, 5.0f, -7.5f, 2.0f, -2.0f},
      {"TopLeft", 1, 0.0f, 0.0f, 3, 0.0f, 0.0f, 0.0f, 0.0f},
  };
  auto item = MakeItem("Panel");
  for (const Case& c : cases) {
    auto rep = VOR2DRep_var::Adopt(Make(item, c.location, c.index)->BuildRep());
    auto* bag = dynamic_cast<VOR2DBagRep*>(rep.get());
    ASSERT_NE(bag, nullptr);
    ASSERT_EQ(bag->GetSize(), 2) << c.location;
    EXPECT_EQ(ChildTranslation(bag, 1), VORMathPoint2D(c.x, c.y)) << c.location;
    auto* label = dynamic_cast<VOR2DBagRep*>(bag->GetChild(1));
    auto* text = dynamic_cast<VOR2DTextRep*>(label->GetChild(1));
    ASSERT_NE(text, nullptr);
    EXPECT_EQ(text->GetText(), VORUnicodeString("Panel"));
    EXPECT_EQ(text->GetAnchor(), c.anchor) << c.location;
    VOR2DCustomRep* link = Link(rep);
    ASSERT_NE(link, nullptr);
    ASSERT_EQ(link->GetPrimitiveCount(), 2);
    const auto& path = static_cast<const VOR2DPolylineGP*>(link->GetPrimitive(1))->GetPoints();
    EXPECT_EQ(path.front(), VORMathPoint2Df(c.ax, c.ay)) << c.location;
    EXPECT_EQ(path.back(), VORMathPoint2Df(c.bx, c.by)) << c.location;
    const auto& head = static_cast<const VOR2DPolylineGP*>(link->GetPrimitive(2))->GetPoints();
    EXPECT_EQ(head[1], VORMathPoint2Df(c.bx, c.by)) << "the head sits at the button";
  }
}

TEST_F(ItemRepTest, LinkCarriesThePackedColourWordAndPicksBackToTheItem) {
  auto item = MakeItem("Panel");
  auto kept = VOR2DRep_var::Adopt(Make(item, "lefttop", 1, 247)->BuildRep());
  EXPECT_EQ(Link(kept)->GetAttribute(1).word, 0xF7041400u);
  EXPECT_EQ(Link(kept)->GetAttribute(2).word, 0xF7041400u);
  EXPECT_EQ(Link(kept)->GetAttribute(1).alpha, 255);
  auto wide = VOR2DRep_var::Adopt(Make(item, "lefttop", 1, 300)->BuildRep());
  EXPECT_EQ(Link(wide)->GetAttribute(1).word, 0xFD041400u);
  // The item bag stands for the component, the label for the item.
  QELPFViewerItemRepComponent* component = components.back().get();
  EXPECT_EQ(wide->GetObject()->GetIdentity(), component->GetIdentity());
  EXPECT_EQ(dynamic_cast<VOR2DBagRep*>(wide.get())->GetChild(1)->GetObject(), item.get());
  EXPECT_EQ(component->GetRep(), wide.get());
}

TEST_F(ItemRepTest, ItemsWithoutANameShowItem) {
  auto nameless = VORBaseUnknown_var::Adopt(new FakeListItem("", false));
  auto notAnItem = VORBaseUnknown_var::Adopt(new VORPathElement());
  for (VORBaseUnknown* item : {nameless.get(), notAnItem.get()}) {
    auto rep = VOR2DRep_var::Adopt(Make(item, "righttop", 1)->BuildRep());
    auto* label = dynamic_cast<VOR2DBagRep*>(dynamic_cast<VOR2DBagRep*>(rep.get())->GetChild(1));
    EXPECT_EQ(dynamic_cast<VOR2DTextRep*>(label->GetChild(1))->GetText(), VORUnicodeString("Item"));
  }
}

// Product inputs built in a real document: their display status comes from the parts.
class ProductInputIconTest : public ItemRepTest {
 protected:
  ProductInputIconTest() {
    doc = VORProcess_var::Adopt(VORProcess::CreateNew("Line"));
    door().CreateNode(doc->GetRootProcess(), "BIWActivityStation", station);
  }
  ~ProductInputIconTest() override {
    station = NULL_var;
    doc = NULL_var;
    VORDeferredDeletion::Drain();
  }
  VORModelDoor& door() { return doc->GetDoor(); }
  // An assembly with one child per entry (true: shown), consumed by the station.
  VORBaseUnknown_var InputOf(std::vector<bool> shown) {
    VORBaseUnknown_var assembly;
    door().CreateProduct(doc->GetRootProduct(), "Assy", assembly);
    for (bool s : shown) {
      VORBaseUnknown_var part;
      door().CreateProduct(assembly, "Part", part);
      door().SetShown(part, s);
    }
    VORBaseUnknown_var io;
    door().AddProductIO(station, assembly, true, io);
    return io;
  }
  static std::string IconOf(QELPFViewerItemRepComponent* c) {
    return c->GetIconName().ConvertToUTF8();
  }

  VORProcess_var doc;
  VORBaseUnknown_var station;
};

TEST_F(ProductInputIconTest, DisplayStatusOfThePartsPicksTheIcon) {
  EXPECT_EQ(IconOf(Make(InputOf({false, false}), "lefttop", 1)), "I_PODHiddenInputPart");
  EXPECT_EQ(IconOf(Make(InputOf({true, false}), "lefttop", 1)), "I_PODPartiallyHiddenInputPart");
  EXPECT_EQ(IconOf(Make(InputOf({true, true}), "lefttop", 1)), "I_PODShownInputPart");
  // Without parts the product's own attribute counts.
  EXPECT_EQ(IconOf(Make(InputOf({}), "lefttop", 1)), "I_PODShownInputPart");
}

TEST_F(ProductInputIconTest, TheIconStandsBesideTheLabelAndAMissingFileLeavesItOut) {
  ZitBltStartupDir startup;
  startup.WriteIcon("I_PODHiddenInputPart", 16, 16);
  QELPFViewerItemRepComponent* hidden = Make(InputOf({false}), "lefttop", 1);
  ASSERT_EQ(hidden->GetItemType(), VORUnicodeString("ProductInput"));
  auto rep = VOR2DRep_var::Adopt(hidden->BuildRep());
  auto* label = dynamic_cast<VOR2DBagRep*>(dynamic_cast<VOR2DBagRep*>(rep.get())->GetChild(1));
  ASSERT_EQ(label->GetSize(), 2);
  // Right of a label that ends at its anchor, half size: 2 units square from x = 5.
  const VORBox2D icon = label->GetChild(2)->GetBoundingBox();
  EXPECT_DOUBLE_EQ(icon.xmin, 5.0);
  EXPECT_DOUBLE_EQ(icon.Width(), 2.0);
  EXPECT_DOUBLE_EQ(icon.Height(), 2.0);

  // The shown icon is not in the start-up directory: nor in the search path when only it is.
  setenv("VORStartupPath", startup.Path().c_str(), 1);
  QELZitBltRep::ForgetIcons();
  auto bare = VOR2DRep_var::Adopt(Make(InputOf({true}), "lefttop", 1)->BuildRep());
  auto* bareLabel = dynamic_cast<VOR2DBagRep*>(dynamic_cast<VOR2DBagRep*>(bare.get())->GetChild(1));
  EXPECT_EQ(bareLabel->GetSize(), 1) << "no icon file, no icon";
}

TEST_F(ProductInputIconTest, AnOutputShowsItsLabelWithALinkMarkAndNoArrow) {
  VORBaseUnknown_var product;
  door().CreateProduct(doc->GetRootProduct(), "Side", product);
  VORBaseUnknown_var output;
  door().AddProductIO(station, product, false, output);
  QELPFViewerItemRepComponent* component = Make(output, "righttop", 3, 247);
  ASSERT_EQ(component->GetItemType(), VORUnicodeString("ProductOutput"));
  auto rep = VOR2DRep_var::Adopt(component->BuildRep());
  auto* bag = dynamic_cast<VOR2DBagRep*>(rep.get());
  ASSERT_EQ(bag->GetSize(), 1);
  EXPECT_EQ(ChildTranslation(bag, 1), VORMathPoint2D(6.0, 6.0));
  auto* label = dynamic_cast<VOR2DBagRep*>(bag->GetChild(1));
  ASSERT_EQ(label->GetSize(), 3);  // text, line, dot
  EXPECT_EQ(label->GetChild(2)->GetColorIndex(), 247);
  EXPECT_EQ(label->GetChild(3)->GetColorIndex(), 247);
}

}  // namespace
