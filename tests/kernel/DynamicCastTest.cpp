#include <gtest/gtest.h>

#include <vector>

#include "VORDynamicCast.h"

namespace {

struct Root {
  virtual ~Root() = default;
  int root = 0;
};
struct Left : Root {
  int left = 1;
};
struct Right : Root {
  int right = 2;
};
struct Target {
  virtual ~Target() = default;
  int target = 3;
};
struct Both : Left, Right, Target {};
// Two Left subobjects: what a Root pointer casts to depends on which one it points into.
struct FirstLeft : Left {};
struct SecondLeft : Left {};
struct Twice : FirstLeft, SecondLeft, Target {};
struct Lone : Root {};

struct Shared {
  virtual ~Shared() = default;
};
struct ViaA : virtual Shared {
  int a = 4;
};
struct ViaB : virtual Shared {
  int b = 5;
};
struct Diamond : ViaA, ViaB, Target {};

// Every remembered way must answer what dynamic_cast answers, whatever cast came before.
template <class T, class From>
void ExpectSameAsDynamicCast(const std::vector<From*>& objects) {
  for (int round = 0; round < 3; ++round) {
    for (From* object : objects)
      EXPECT_EQ(VORDynamicCast<T>(object), dynamic_cast<T*>(object));
  }
}

}  // namespace

TEST(DynamicCastTest, AnswersAsDynamicCastForEveryTypeAndSubobject) {
  Both both;
  Twice twice;
  Lone lone;
  Diamond diamond;
  ViaA viaA;
  const std::vector<Root*> roots{static_cast<Left*>(&both),
                                 static_cast<Right*>(&both),
                                 &lone,
                                 static_cast<FirstLeft*>(&twice),
                                 static_cast<SecondLeft*>(&twice),
                                 static_cast<Right*>(&both)};
  ExpectSameAsDynamicCast<Left>(roots);
  ExpectSameAsDynamicCast<Right>(roots);
  ExpectSameAsDynamicCast<Target>(roots);
  ExpectSameAsDynamicCast<Both>(roots);

  const std::vector<Shared*> shared{static_cast<Shared*>(&diamond), static_cast<Shared*>(&viaA)};
  ExpectSameAsDynamicCast<ViaB>(shared);
  ExpectSameAsDynamicCast<Target>(shared);
  ExpectSameAsDynamicCast<Diamond>(shared);

  EXPECT_EQ(VORDynamicCast<Left>(static_cast<Root*>(nullptr)), nullptr);
}

TEST(DynamicCastTest, AnObjectOfAKnownTypeIsCastAtItsOwnAddress) {
  // Two objects of one type share the remembered way, not the answer.
  Both first;
  Both second;
  Root* a = static_cast<Right*>(&first);
  Root* b = static_cast<Right*>(&second);
  EXPECT_EQ(VORDynamicCast<Target>(a), static_cast<Target*>(&first));
  EXPECT_EQ(VORDynamicCast<Target>(b), static_cast<Target*>(&second));
  EXPECT_EQ(VORDynamicCast<Left>(b), static_cast<Left*>(&second));
}
