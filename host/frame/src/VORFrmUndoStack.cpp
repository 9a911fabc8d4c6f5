#include "VORFrmUndoStack.h"

VORFrmUndoStack::VORFrmUndoStack(VORProcess* document) : _document(document) {
  if (_document)
    _document->GetDoor().SetRecorder(&_pending);
}

VORFrmUndoStack::~VORFrmUndoStack() {
  if (_document && _document->GetDoor().GetRecorder() == &_pending)
    _document->GetDoor().SetRecorder(nullptr);
}

void VORFrmUndoStack::EndStep() {
  if (_pending.IsEmpty())
    return;
  _undo.push_back(std::move(_pending));
  _pending = VORChangeLog();
  if (static_cast<int>(_undo.size()) > kMaxSteps)
    _undo.pop_front();
  _redo.clear();
}

bool VORFrmUndoStack::Undo() {
  EndStep();
  if (_undo.empty() || !_document)
    return false;
  VORChangeLog step = std::move(_undo.back());
  _undo.pop_back();
  VORChangeLog redo;
  _document->GetDoor().Undo(step, &redo);
  _redo.push_back(std::move(redo));
  return true;
}

bool VORFrmUndoStack::Redo() {
  EndStep();
  if (_redo.empty() || !_document)
    return false;
  VORChangeLog step = std::move(_redo.back());
  _redo.pop_back();
  VORChangeLog undo;
  _document->GetDoor().Undo(step, &undo);
  _undo.push_back(std::move(undo));
  return true;
}

void VORFrmUndoStack::Clear() {
  _pending.Clear();
  _undo.clear();
  _redo.clear();
}
