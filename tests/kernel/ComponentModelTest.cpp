#include <gtest/gtest.h>

#include "TestInterfaces.h"

namespace {

class Square : public ITestShape, public ITestLabel {
  VOR_DECLARE_CLASS(Square, VORBaseUnknown)
 public:
  int Corners() const override { return 4; }
  const char* Label() const override { return "square"; }
};

class ColouredSquare : public Square {
  VOR_DECLARE_CLASS(ColouredSquare, Square)
};

class Circle : public ITestLabel {
  VOR_DECLARE_CLASS(Circle, VORBaseUnknown)
 public:
  const char* Label() const override { return "circle"; }
};

class ComponentModelTest : public ::testing::Test {
 protected:
  void SetUp() override { _live = VORBaseUnknown::LiveInstances(); }
  void TearDown() override {
    EXPECT_EQ(VORBaseUnknown::LiveInstances(), _live) << "leaked objects";
  }
  long _live = 0;
};

TEST_F(ComponentModelTest, HandleCastAnswersImplementedInterfacesAndIsNullOtherwise) {
  ITestLabel_var circle = ITestLabel_var::Adopt(new Circle());
  ITestShape_var shape(circle);
  EXPECT_EQ(shape, NULL_var);
  EXPECT_FALSE(shape);

  ITestLabel_var square = ITestLabel_var::Adopt(new Square());
  ITestShape_var squareShape(square);
  ASSERT_TRUE(squareShape);
  EXPECT_EQ(squareShape->Corners(), 4);
  // Two interfaces of one object are the same object.
  EXPECT_TRUE(squareShape == square);
  EXPECT_FALSE(square == circle);
  // A null handle casts to null.
  ITestShape_var none;
  EXPECT_EQ(ITestLabel_var(none), nullptr);
}

// A type cast to one interface and another in turn (a node asked for its layout, then its flows)
// keeps both answers at hand: the recent answers once took the same place for every interface of
// one library, and each such cast hashed type names again.
TEST_F(ComponentModelTest, CastsToTwoInterfacesInTurnAreAnsweredFromTheRecentAnswers) {
  ITestLabel_var square = ITestLabel_var::Adopt(new Square());
  const long before = VORBaseUnknown::CastAnswerLookups();
  for (int i = 0; i < 100; ++i) {
    ASSERT_TRUE(ITestShape_var(square));
    ASSERT_TRUE(ITestLabel_var(VORBaseUnknown_var(square)));
  }
  EXPECT_LE(VORBaseUnknown::CastAnswerLookups() - before, 2);
}

TEST_F(ComponentModelTest, HandlesShareOneReferenceCountAcrossInterfaces) {
  Square* raw = new Square();
  {
    ITestShape_var shape = ITestShape_var::Adopt(raw);
    EXPECT_EQ(raw->RefCount(), 1u);
    ITestLabel_var label(shape);
    VORBaseUnknown_var unknown(label);
    EXPECT_EQ(raw->RefCount(), 3u);
    label = NULL_var;
    EXPECT_EQ(raw->RefCount(), 2u);
    ITestShape_var moved(std::move(shape));
    EXPECT_EQ(raw->RefCount(), 2u);
  }
  // The last handle deleted it; the fixture checks no instance is left.
}

TEST_F(ComponentModelTest, RepeatedCastsOfMixedTypesKeepTheirOwnAnswers) {
  // Casts are remembered per (type, interface): interleaving types whose interfaces sit at
  // different offsets, and answers that are "no", must never hand one pair's answer to another.
  ITestLabel_var square = ITestLabel_var::Adopt(new Square());
  ITestLabel_var coloured = ITestLabel_var::Adopt(new ColouredSquare());
  ITestLabel_var circle = ITestLabel_var::Adopt(new Circle());
  for (int round = 0; round < 3; ++round) {
    for (const ITestLabel_var& label : {square, coloured, circle, coloured, square}) {
      ITestShape_var shape(label);
      ITestLabel_var back(shape);
      const bool isSquare = label.get() != circle.get();
      ASSERT_EQ(static_cast<bool>(shape), isSquare);
      if (isSquare) {
        EXPECT_EQ(shape->Corners(), 4);
        EXPECT_EQ(back.get(), label.get());
        EXPECT_STREQ(back->Label(), "square");
      }
      EXPECT_TRUE(!shape || shape == label);  // one object behind both interfaces
    }
  }
}

TEST_F(ComponentModelTest, MetaObjectsFollowClassInheritance) {
  VORBaseUnknown_var object = VORBaseUnknown_var::Adopt(new ColouredSquare());
  EXPECT_STREQ(object->IsA(), "ColouredSquare");
  EXPECT_TRUE(object->IsAKindOf("Square"));
  EXPECT_TRUE(object->IsAKindOf(Square::ClassName()));
  EXPECT_TRUE(object->IsAKindOf("VORBaseUnknown"));
  EXPECT_FALSE(object->IsAKindOf("Circle"));
  EXPECT_EQ(ColouredSquare::MetaObject()->Base(), Square::MetaObject());
  // The late type defaults to the class name.
  EXPECT_STREQ(object->GetLateType(), "ColouredSquare");
}

}  // namespace
