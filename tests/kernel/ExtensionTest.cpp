#include <gtest/gtest.h>

#include "TestInterfaces.h"
#include "VORExtensionRegistry.h"
#include "VORLateTypes.h"

namespace {

// A plain object whose late type is chosen per instance, as model objects do.
class TypedThing : public VORBaseUnknown {
  VOR_DECLARE_CLASS(TypedThing, VORBaseUnknown)
 public:
  explicit TypedThing(const char* lateType) : _lateType(lateType) {}
  const char* GetLateType() const override { return _lateType; }

 private:
  const char* _lateType;
};

int colourExtensionsAlive = 0;
class ColourDataExtension : public VORExtension, public ITestColour {
 public:
  ColourDataExtension() { ++colourExtensionsAlive; }
  ~ColourDataExtension() override { --colourExtensionsAlive; }
  int Colour() const override { return _colour; }
  void SetColour(int colour) override { _colour = colour; }

 private:
  int _colour = 7;
};

int shapeCodeExtensionsMade = 0;
class ShapeCodeExtension : public VORExtension, public ITestShape {
 public:
  ShapeCodeExtension() { ++shapeCodeExtensionsMade; }
  int Corners() const override { return 3; }
};

class ExtensionTest : public ::testing::Test {
 protected:
  void SetUp() override {
    VORLateTypes::Declare("Activity", "");
    VORLateTypes::Declare("PhysicalActivity", "Activity");
    VORLateTypes::Declare("Station", "PhysicalActivity");
    VORExtensionRegistry::Register(
        "PhysicalActivity", ITestColour::IID(),
        []() -> VORExtension* { return new ColourDataExtension(); }, VORExtensionKind::Data);
    VORExtensionRegistry::Register(
        "Activity", ITestShape::IID(), []() -> VORExtension* { return new ShapeCodeExtension(); },
        VORExtensionKind::Code);
    _live = VORBaseUnknown::LiveInstances();
  }
  void TearDown() override {
    VORExtensionRegistry::Unregister("PhysicalActivity", ITestColour::IID());
    VORExtensionRegistry::Unregister("Activity", ITestShape::IID());
    EXPECT_EQ(VORBaseUnknown::LiveInstances(), _live);
    EXPECT_EQ(colourExtensionsAlive, 0);
  }
  long _live = 0;
};

TEST_F(ExtensionTest, ExtensionsAreFoundThroughLateTypeInheritance) {
  VORBaseUnknown_var station = VORBaseUnknown_var::Adopt(new TypedThing("Station"));
  VORBaseUnknown_var activity = VORBaseUnknown_var::Adopt(new TypedThing("Activity"));
  EXPECT_TRUE(ITestColour_var(station));
  EXPECT_TRUE(ITestShape_var(station));
  // Registered on a descendant only: the ancestor does not answer.
  EXPECT_FALSE(ITestColour_var(activity));
  EXPECT_TRUE(ITestShape_var(activity));
  EXPECT_TRUE(VORLateTypes::IsKindOf("Station", "Activity"));
  EXPECT_FALSE(VORLateTypes::IsKindOf("Activity", "Station"));
}

TEST_F(ExtensionTest, DataExtensionIsCreatedOnceKeepsStateAndDiesWithTheObject) {
  TypedThing* raw = new TypedThing("Station");
  VORBaseUnknown_var station = VORBaseUnknown_var::Adopt(raw);
  {
    ITestColour_var first(station);
    first->SetColour(12);
    ITestColour_var second(station);
    EXPECT_EQ(second->Colour(), 12);
    EXPECT_EQ(first.get(), second.get());
    EXPECT_EQ(colourExtensionsAlive, 1);
    // The extension lends out the object's references.
    EXPECT_EQ(raw->RefCount(), 3u);
    // From the extension back to the object and to its other extensions.
    VORBaseUnknown_var back(first);
    EXPECT_EQ(back.get(), static_cast<VORBaseUnknown*>(raw));
    EXPECT_TRUE(ITestShape_var(first));
  }
  EXPECT_EQ(raw->RefCount(), 1u);
  // A handle to the extension alone keeps the object alive.
  ITestColour_var survivor(station);
  station = NULL_var;
  EXPECT_EQ(survivor->Colour(), 12);
  survivor = NULL_var;
  EXPECT_EQ(colourExtensionsAlive, 0);
}

TEST_F(ExtensionTest, CodeExtensionIsMadeAfreshAndHoldsTheObject) {
  TypedThing* raw = new TypedThing("Activity");
  VORBaseUnknown_var activity = VORBaseUnknown_var::Adopt(raw);
  const int before = shapeCodeExtensionsMade;
  ITestShape_var a(activity);
  ITestShape_var b(activity);
  EXPECT_EQ(shapeCodeExtensionsMade, before + 2);
  EXPECT_TRUE(a == b);  // same identity, different extension objects
  activity = NULL_var;
  EXPECT_EQ(a->Corners(), 3);  // the object is still alive through the extension
  EXPECT_EQ(raw->RefCount(), 2u);
}

TEST_F(ExtensionTest, ListsOfExtensionHandlesCompareByObject) {
  VORBaseUnknown_var station = VORBaseUnknown_var::Adopt(new TypedThing("Station"));
  ITestShape_var viaCode(station);
  ITestColour_var viaData(station);
  EXPECT_TRUE(VORBaseUnknown_var(viaCode) == VORBaseUnknown_var(viaData));
}

TEST(LateTypesTest, DeclarationCyclesDoNotHang) {
  VORLateTypes::Declare("LoopA", "LoopB");
  VORLateTypes::Declare("LoopB", "LoopA");
  EXPECT_FALSE(VORLateTypes::IsKindOf("LoopA", "Unrelated"));
  EXPECT_LE(VORLateTypes::Chain("LoopA").size(), 64u);
}

}  // namespace
