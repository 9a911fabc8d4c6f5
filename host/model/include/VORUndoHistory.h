// A document's user steps, undone and redone whole. A step collects every change made through
// the model's door between Begin and End; a Begin inside an open step joins it, so a command
// built from other commands' operations is still one step, and Abandon takes a refused step
// back. When a recorder was already attached at Begin (the window's undo stack), End hands the
// step to it instead of keeping it here. Owned by the document.
#pragma once

#include <string>
#include <vector>

#include "VORModelDoor.h"

class VORUndoHistory {
 public:
  explicit VORUndoHistory(VORModelDoor& door) : _door(door) {}
  VORUndoHistory(const VORUndoHistory&) = delete;
  VORUndoHistory& operator=(const VORUndoHistory&) = delete;

  // Opens a step named after the user command (the outermost name wins).
  void Begin(const std::string& name);
  // Closes it: a step that changed something becomes the newest undo step and empties redo.
  void End();
  // Closes it and undoes what it changed: a refused command leaves the document as it was.
  void Abandon();
  bool IsRecording() const { return _depth > 0; }

  bool CanUndo() const { return !_undo.empty() && _depth == 0; }
  bool CanRedo() const { return !_redo.empty() && _depth == 0; }
  // Name of the step Undo / Redo would replay (empty when none).
  std::string UndoName() const { return _undo.empty() ? std::string() : _undo.back().name; }
  std::string RedoName() const { return _redo.empty() ? std::string() : _redo.back().name; }
  int UndoCount() const { return static_cast<int>(_undo.size()); }
  int RedoCount() const { return static_cast<int>(_redo.size()); }
  // False when there is nothing to replay or a step is open.
  bool Undo();
  bool Redo();
  void Clear();

 private:
  struct Step {
    std::string name;
    VORChangeLog log;
  };

  VORModelDoor& _door;
  std::vector<Step> _undo;
  std::vector<Step> _redo;
  Step _open;
  VORChangeLog* _outer = nullptr;
  int _depth = 0;
};
