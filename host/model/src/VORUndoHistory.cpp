// User steps over the door's change log.
#include "VORUndoHistory.h"

#include <utility>

void VORUndoHistory::Begin(const std::string& name) {
  if (_depth++ > 0)
    return;
  _open = Step{name, VORChangeLog()};
  _outer = _door.SetRecorder(&_open.log);
}

void VORUndoHistory::End() {
  if (_depth == 0 || --_depth > 0)
    return;
  _door.SetRecorder(_outer);
  VORChangeLog* outer = _outer;
  _outer = nullptr;
  if (_open.log.IsEmpty())
    return;
  if (outer != nullptr) {
    // Someone records around this step (the window's undo stack): the step joins its log, so
    // the user undoes it there, as one step with the command that made it.
    outer->Append(std::move(_open.log));
    _open = Step();
    return;
  }
  _undo.push_back(std::move(_open));
  _open = Step();
  _redo.clear();
}

void VORUndoHistory::Abandon() {
  if (_depth == 0)
    return;
  _depth = 0;
  _door.SetRecorder(_outer);
  _outer = nullptr;
  _door.Undo(_open.log);
  _open = Step();
}

bool VORUndoHistory::Undo() {
  if (!CanUndo())
    return false;
  Step step = std::move(_undo.back());
  _undo.pop_back();
  Step redo{step.name, VORChangeLog()};
  _door.Undo(step.log, &redo.log);
  _redo.push_back(std::move(redo));
  return true;
}

bool VORUndoHistory::Redo() {
  if (!CanRedo())
    return false;
  Step step = std::move(_redo.back());
  _redo.pop_back();
  Step undo{step.name, VORChangeLog()};
  _door.Undo(step.log, &undo.log);
  _undo.push_back(std::move(undo));
  return true;
}

void VORUndoHistory::Clear() {
  _undo.clear();
  _redo.clear();
}
