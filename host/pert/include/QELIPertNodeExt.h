// The graph editor's own data on a node: the working position that the controller draws and
// links from, the node state, and whether the node currently has no rep in its chart.
#pragma once

#include "QELPertParameters.h"
#include "VORHandle.h"

class QELIPertNodeExt : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(QELIPertNodeExt)
 public:
  // Working position; until one was set, the document's position (S_FALSE and (0, 0) without).
  virtual HRESULT GetPosition(double& x, double& y, GE_POSITION_INDEX index = 1) = 0;
  virtual HRESULT SetPosition(double x, double y, GE_POSITION_INDEX index = 1) = 0;
  virtual bool HasPosition() = 0;
  // Drops the working position (the document's shows again).
  virtual void ResetPosition() = 0;
  // The node state kept in the document: 0 none, 1 expanded super node, 2 collapsed. The query
  // argument is accepted for the module's calls.
  virtual int GetState(int query = 1) = 0;
  virtual HRESULT SetState(int state) = 0;
  // True when the node has no rep in a chart although a chart showed it (hidden inside a
  // collapsed super node); false for nodes that are drawn.
  virtual bool GetHiddenFlag() = 0;
};
VOR_DECLARE_HANDLE(QELIPertNodeExt);
