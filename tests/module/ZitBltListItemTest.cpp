#include "QELIListZitBltItemState.h"
#include "ZitBltListTestSupport.h"

namespace {

class ZitBltListItemTest : public ::testing::Test {
 protected:
  void SetUp() override { ASSERT_NE(VORModuleLoader::LoadModule("QELZitBltModel"), nullptr); }
  ListTestLine line;
};

TEST_F(ZitBltListItemTest, InputsOutputsAndProductsShowTheNameOfTheirItem) {
  VORBaseUnknown_var in = line.Input(line.s1, line.panel);
  VORBaseUnknown_var out = line.Output(line.s1, line.floor);
  EXPECT_EQ(ItemText(in), "Panel");
  EXPECT_EQ(ItemText(out), "Floor");
  EXPECT_EQ(ItemText(line.robot), "Robot");
  EXPECT_EQ(ItemText(line.bracket), "Bracket");

  // An assembly reached as an input item shows its own name.
  VORBaseUnknown_var assembly;
  ASSERT_EQ(line.door().CreateMfgAssembly("Floor MA", assembly), S_OK);
  EXPECT_EQ(ItemText(assembly), "Floor MA");
  VORBaseUnknown_var assemblyIn = line.Input(line.s2, assembly);
  EXPECT_EQ(ItemText(assemblyIn), "Floor MA");

  // Renaming the product renames every line that shows it.
  line.door().SetPartNumber(line.panel, "Panel B");
  EXPECT_EQ(ItemText(in), "Panel B");

  // Activities are no list items.
  EXPECT_EQ(ItemText(line.s1), "(no list item)");
}

TEST_F(ZitBltListItemTest, AnInputWithoutItemFailsAnOutputWithoutItemDoesNot) {
  VORBaseUnknown_var in = line.Input(line.s1, line.panel);
  VORBaseUnknown_var out = line.Output(line.s1, line.floor);
  ASSERT_EQ(line.door().RemoveProductIO(in), S_OK);  // the removed ones have no item
  ASSERT_EQ(line.door().RemoveProductIO(out), S_OK);
  EXPECT_EQ(ItemText(in, "kept"), std::to_string(E_FAIL) + ":kept");
  EXPECT_LT(E_FAIL, 0);
  EXPECT_EQ(ItemText(out, "kept"), "1:kept");  // not negative: callers count it as found

  // A product with an empty name answers 0 with an empty text (the list draws "Item").
  VORBaseUnknown_var unnamed = line.Product("");
  EXPECT_EQ(ItemText(unnamed, "kept"), "");
}

TEST_F(ZitBltListItemTest, ModelObjectsDoNotKnowTheActivityTheyAreListedFor) {
  VORBaseUnknown_var in = line.Input(line.s1, line.panel);
  VORBaseUnknown_var out = line.Output(line.s1, line.floor);
  VORBaseUnknown* untouched = line.s3.get();
  VORBaseUnknown* activity = untouched;
  EXPECT_EQ(QELIListZitBltItem_var(in)->GetActivity(activity), 0);
  EXPECT_EQ(QELIListZitBltItem_var(out)->GetActivity(activity), 0);
  EXPECT_EQ(QELIListZitBltItem_var(line.robot)->GetActivity(activity), 1);
  EXPECT_EQ(activity, untouched);
}

TEST_F(ZitBltListItemTest, AnInputKeepsItsStateFromTwo) {
  VORBaseUnknown_var in = line.Input(line.s1, line.panel);
  VORBaseUnknown_var other = line.Input(line.s2, line.panel);
  QELIListZitBltItemState_var state(in);
  ASSERT_TRUE(state);
  QELIListZitBltItemState::AssignState s = QELIListZitBltItemState::Listed;
  EXPECT_EQ(state->GetState(s), 2);
  EXPECT_EQ(s, QELIListZitBltItemState::NoState);
  state->SetState(QELIListZitBltItemState::Direct);
  // The state lives with the input: a fresh query sees it, another input does not.
  EXPECT_EQ(QELIListZitBltItemState_var(in)->GetState(s), 1);
  EXPECT_EQ(QELIListZitBltItemState_var(other)->GetState(s), 2);
  EXPECT_FALSE(QELIListZitBltItemState_var(line.robot)) << "only inputs keep a state";
}

TEST_F(ZitBltListItemTest, StatesAreAssignableForStationsAndGroupingsWithoutAProcess) {
  VORBaseUnknown_var in = line.Input(line.s1, line.panel);
  QELIListZitBltItemState_var state(in);
  auto listedFor = [](VORBaseUnknown* activity) {
    return VORBaseUnknown_var::Adopt(new ListedForActivity(activity));
  };
  EXPECT_TRUE(state->CanAssignState(listedFor(line.s1)));
  EXPECT_TRUE(state->CanAssignState(listedFor(line.group)));
  VORBaseUnknown_var load = line.Node(line.s1, "L", "BIWActivityLoading");
  EXPECT_FALSE(state->CanAssignState(listedFor(load)));
  EXPECT_FALSE(state->CanAssignState(listedFor(line.panel))) << "not an activity";
  EXPECT_FALSE(state->CanAssignState(listedFor(nullptr)));
  EXPECT_FALSE(state->CanAssignState(in)) << "model objects give no activity";
  EXPECT_FALSE(state->CanAssignState(line.s1)) << "not a list item";
  EXPECT_FALSE(state->CanAssignState(nullptr));
}

}  // namespace
