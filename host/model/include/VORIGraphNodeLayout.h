// Chart data that the document stores per graph node. Setters go through the model's door
// (saved, notified with VORModify on the node, undoable).
#pragma once

#include "VORHandle.h"

class VORIGraphNodeLayout : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORIGraphNodeLayout)
 public:
  enum PertNodeState { StateNone = 0, StateExpanded = 1, StateCollapsed = 2 };

  virtual bool HasPertPosition() = 0;
  // (0, 0) when the node has no position.
  virtual void GetPertPosition(double& x, double& y) = 0;
  virtual void SetPertPosition(double x, double y) = 0;
  // Forgets the position (HasPertPosition becomes false).
  virtual void ClearPertPosition() = 0;
  // 0 none, 1 expanded super node, 2 collapsed.
  virtual int GetPertNodeState() = 0;
  virtual void SetPertNodeState(int state) = 0;
  // (0, 0) until set.
  virtual void GetPertNodeSize(double& w, double& h) = 0;
  virtual void SetPertNodeSize(double w, double h) = 0;
};
VOR_DECLARE_HANDLE(VORIGraphNodeLayout);
