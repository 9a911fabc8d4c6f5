// Every public header of the model compiles on its own and together.
#include "VORModel.h"
#include "VORModelGenerator.h"
#include "VORXercesPlatform.h"

#include <gtest/gtest.h>

#include "VORLateTypes.h"

TEST(ModelLateTypesTest, StationsAndWeldsArePhysicalActivitiesAndControlNodesAreNot) {
  EXPECT_TRUE(VORLateTypes::IsKindOf("BIWActivityStation", "PhysicalActivity"));
  EXPECT_TRUE(VORLateTypes::IsKindOf("BIWActivityClinching", "SPPGraphNode"));
  EXPECT_TRUE(VORLateTypes::IsKindOf("Start", "SPPGraphNode"));
  EXPECT_FALSE(VORLateTypes::IsKindOf("Start", "SPPActivity"));
  EXPECT_FALSE(VORLateTypes::IsKindOf("BIWActivityRoot", "PhysicalActivity"));
  EXPECT_TRUE(VORModelLateTypes::IsActivityType("BIWActivityLoading"));
  EXPECT_FALSE(VORModelLateTypes::IsActivityType("PhysicalActivity"));
  EXPECT_TRUE(VORModelLateTypes::IsControlNodeType("Stop"));
  EXPECT_TRUE(VORModelLateTypes::IsWeldingType("BIWActivitySpotGluing"));
  EXPECT_FALSE(VORModelLateTypes::IsWeldingType("BIWActivityLoading"));
}
