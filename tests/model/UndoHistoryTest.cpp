// The document's undo history: user steps recorded through the door, nested steps joined,
// abandoned steps rolled back, undo and redo as whole steps.
#include <gtest/gtest.h>

#include "ModelTestSupport.h"

namespace {

std::string Label(VORBaseUnknown* node) {
  VORISPPAbstractActivity_var a(node);
  VORUnicodeString label;
  if (a)
    a->GetLabel(label);
  return Utf8(label);
}

}  // namespace

TEST(UndoHistoryTest, OneStepUndoesAndRedoesEverythingItRecorded) {
  SmallLine l;
  VORModelDoor& door = l.doc->GetDoor();
  VORUndoHistory& history = l.doc->GetUndoHistory();
  const std::string before = l.doc->SaveToString();

  history.Begin("Rename and move");
  door.SetLabel(l.s1, VORUnicodeString("First"));
  history.Begin("inner command joins");
  door.SetPertPosition(l.s1, true, 50, 60);
  VORBaseUnknown_var created;
  ASSERT_EQ(door.CreateNode(l.root, "BIWActivityStation", created), S_OK);
  history.End();
  EXPECT_TRUE(history.IsRecording());
  EXPECT_FALSE(history.CanUndo());  // not while a step is open
  history.End();
  const std::string after = l.doc->SaveToString();

  ASSERT_EQ(history.UndoCount(), 1);
  EXPECT_EQ(history.UndoName(), "Rename and move");
  ASSERT_TRUE(history.Undo());
  EXPECT_EQ(l.doc->SaveToString(), before);
  EXPECT_FALSE(history.CanUndo());
  EXPECT_EQ(history.RedoName(), "Rename and move");

  ASSERT_TRUE(history.Redo());
  EXPECT_EQ(l.doc->SaveToString(), after);
  EXPECT_EQ(Label(l.s1), "First");
  ASSERT_TRUE(history.Undo());
  EXPECT_EQ(l.doc->SaveToString(), before);
  EXPECT_FALSE(history.Undo());  // nothing left
}

TEST(UndoHistoryTest, EmptyStepsAreDroppedAndANewStepEmptiesRedo) {
  SmallLine l;
  VORModelDoor& door = l.doc->GetDoor();
  VORUndoHistory& history = l.doc->GetUndoHistory();

  history.Begin("nothing");
  door.SetLabel(l.s1, VORUnicodeString("S1"));  // same label: no change
  history.End();
  EXPECT_EQ(history.UndoCount(), 0);

  history.Begin("a");
  door.SetLabel(l.s1, VORUnicodeString("A"));
  history.End();
  history.Undo();
  EXPECT_TRUE(history.CanRedo());
  history.Begin("b");
  door.SetLabel(l.s2, VORUnicodeString("B"));
  history.End();
  EXPECT_FALSE(history.CanRedo());
  EXPECT_EQ(history.UndoName(), "b");
}

TEST(UndoHistoryTest, AnAbandonedStepLeavesTheDocumentAsItWasAndRecordsNothing) {
  SmallLine l;
  VORModelDoor& door = l.doc->GetDoor();
  VORUndoHistory& history = l.doc->GetUndoHistory();
  const std::string before = l.doc->SaveToString();
  VORChangeLog outer;
  door.SetRecorder(&outer);

  history.Begin("refused");
  door.RemoveNode(l.s2);
  door.AddFlow(l.s3, l.s1);
  history.Begin("nested");
  history.Abandon();  // abandons the whole step, nested or not
  EXPECT_FALSE(history.IsRecording());
  EXPECT_EQ(l.doc->SaveToString(), before);
  EXPECT_EQ(history.UndoCount(), 0);
  EXPECT_EQ(door.GetRecorder(), &outer);  // the recorder that was attached before
  EXPECT_TRUE(outer.IsEmpty());
  door.SetRecorder(nullptr);
}
