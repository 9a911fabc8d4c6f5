// Undo and redo through the driver: one step per user action, positions restored exactly, the
// redo history dropped by a new change, the document marked modified. (The undo and redo script
// steps are checked with the commands that use them.)
#include <gtest/gtest.h>

#include "SampleLine.h"
#include "TempDir.h"
#include "VORDriver.h"
#include "VORIGraphNodeLayout.h"

namespace {
class UndoTest : public ::testing::Test {
 protected:
  void SetUp() override {
    ASSERT_EQ(SaveSampleLine(file), "");
    ASSERT_TRUE(driver.OpenDocument(file));
    ASSERT_TRUE(driver.PickObject("Line"));
    ASSERT_TRUE(driver.StartCommand("PertChart"));
  }
  std::pair<double, double> Position(const char* label) {
    double x = -1.0, y = -1.0;
    VORIGraphNodeLayout_var(driver.FindObject(label))->GetPertPosition(x, y);
    return {x, y};
  }
  TempDir dir;
  std::string file = dir.Path() + "/line.pprx";
  VORDriver driver;
};
}  // namespace

TEST_F(UndoTest, EachDragIsOneStepUndoneAndRedoneExactly) {
  using P = std::pair<double, double>;
  ASSERT_TRUE(driver.Drag("", 62.5, 12.5, 62.5, 37.5));
  ASSERT_TRUE(driver.Drag("", 112.5, 12.5, 137.5, 62.5));
  EXPECT_EQ(Position("S2"), P(62.5, 37.5));
  EXPECT_EQ(Position("S3"), P(137.5, 62.5));
  driver.GetDocument()->SetModified(false);

  ASSERT_TRUE(driver.Undo());
  EXPECT_EQ(Position("S3"), P(112.5, 12.5)) << "the last drag goes first";
  EXPECT_EQ(Position("S2"), P(62.5, 37.5));
  EXPECT_TRUE(driver.GetDocument()->IsModified()) << "an undo is a change of the document";
  ASSERT_TRUE(driver.Undo());
  EXPECT_EQ(Position("S2"), P(62.5, 12.5));
  EXPECT_NE(driver.DescribeWindow("").find("node \"S2\" at (62.5, 12.5)"), std::string::npos)
      << driver.DescribeWindow("");
  EXPECT_FALSE(driver.Undo());
  EXPECT_EQ(driver.LastError(), "nothing to undo");

  ASSERT_TRUE(driver.Redo());
  EXPECT_EQ(Position("S2"), P(62.5, 37.5));
  ASSERT_TRUE(driver.Redo());
  EXPECT_EQ(Position("S3"), P(137.5, 62.5));
  EXPECT_FALSE(driver.Redo());
  EXPECT_EQ(driver.LastError(), "nothing to redo");
}

TEST_F(UndoTest, ANewChangeDropsTheRedoHistory) {
  ASSERT_TRUE(driver.Drag("", 62.5, 12.5, 62.5, 37.5));
  ASSERT_TRUE(driver.Undo());
  EXPECT_TRUE(driver.GetEditor()->GetUndoStack().CanRedo());
  ASSERT_TRUE(driver.Drag("", 12.5, 12.5, 12.5, 37.5));
  EXPECT_FALSE(driver.GetEditor()->GetUndoStack().CanRedo());
  EXPECT_FALSE(driver.Redo());
  EXPECT_EQ(driver.GetEditor()->GetUndoStack().UndoCount(), 1);
}

TEST_F(UndoTest, ChangesBetweenTwoBoundariesAreOneStep) {
  // Made outside any driver step (as a command would): one step until the next boundary.
  VORFrmUndoStack& stack = driver.GetEditor()->GetUndoStack();
  auto s1 = VORIGraphNodeLayout_var(driver.FindObject("S1"));
  auto s2 = VORIGraphNodeLayout_var(driver.FindObject("S2"));
  s1->SetPertPosition(0.0, 0.0);
  s2->SetPertPosition(1.0, 1.0);
  stack.EndStep();
  EXPECT_EQ(stack.UndoCount(), 1);
  ASSERT_TRUE(stack.Undo());
  EXPECT_EQ(Position("S1"), (std::pair<double, double>(12.5, 12.5)));
  EXPECT_EQ(Position("S2"), (std::pair<double, double>(62.5, 12.5)));
}
