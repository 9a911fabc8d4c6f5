// The undo and redo history of one open document. While the stack lives, every change made
// through the document's door is recorded; the changes between two step boundaries (the end
// of a command, the end of a user event with no command running) make one undo step, so that
// one user command is undone and redone as a whole. Undoing runs the inverses through the door,
// so the document is marked modified and every view follows through the door's notifications.
#pragma once

#include <deque>

#include "VORDocument.h"
#include "VORModelDoor.h"

class VORFrmUndoStack {
 public:
  // Older steps are forgotten beyond this many.
  static constexpr int kMaxSteps = 200;

  // Starts recording the document's changes (null: a stack that records nothing).
  explicit VORFrmUndoStack(VORProcess* document);
  ~VORFrmUndoStack();
  VORFrmUndoStack(const VORFrmUndoStack&) = delete;
  VORFrmUndoStack& operator=(const VORFrmUndoStack&) = delete;

  // Ends the current step: the changes recorded since the last boundary become one undo step
  // and the redo history is dropped. Nothing happens when nothing changed.
  void EndStep();
  // Undoes the last step (after ending the current one); false when there is nothing to undo.
  bool Undo();
  // Redoes the last undone step; false when there is nothing to redo.
  bool Redo();
  bool CanUndo() const { return !_undo.empty() || !_pending.IsEmpty(); }
  bool CanRedo() const { return !_redo.empty() && _pending.IsEmpty(); }
  int UndoCount() const { return static_cast<int>(_undo.size()) + (_pending.IsEmpty() ? 0 : 1); }
  int RedoCount() const { return static_cast<int>(_redo.size()); }
  // Forgets every step (a document saved as another file keeps its history; a reload does not).
  void Clear();

 private:
  VORProcess_var _document;
  VORChangeLog _pending;
  std::deque<VORChangeLog> _undo;
  std::deque<VORChangeLog> _redo;
};
