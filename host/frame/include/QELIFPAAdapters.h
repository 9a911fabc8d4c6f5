// The adapters of a process model's root process ("BIWActivityRoot"): the PERT adapter through
// which the process keeps its chart data, and the controller of the chart that currently shows
// one of its levels. Answered by every root process once VORInitFrame has run.
#pragma once

#include "VORHandle.h"

class QELPertController;

// The PERT adapter of a root process. In this platform the chart data of a node lives in the
// document itself, through the model's VORIGraphNodeLayout, so that it is saved, notified and
// undoable with the rest of the process: the adapter reads and writes node positions and node
// states of the graph nodes of its own process there. Positions written through
// QELIPertNode::SetPosition (index 1) end up in the same place.
class QELFpaPertAdapter : public VORBaseUnknown {
  VOR_DECLARE_CLASS(QELFpaPertAdapter, VORBaseUnknown)
 public:
  // root: the root process (not held: the adapter lives in the root's extension).
  explicit QELFpaPertAdapter(VORBaseUnknown* root) : _root(root) {}

  VORBaseUnknown* GetRootProcess() const { return _root; }
  // E_INVALIDARG for an object that is no graph node of this process.
  HRESULT StoreNodePosition(VORBaseUnknown* node, double x, double y);
  // S_FALSE and (0, 0) when the node has no stored position.
  HRESULT GetStoredNodePosition(VORBaseUnknown* node, double& x, double& y);
  // 0 none, 1 expanded super node, 2 collapsed.
  HRESULT StoreNodeState(VORBaseUnknown* node, int state);
  HRESULT GetStoredNodeState(VORBaseUnknown* node, int& state);

 protected:
  ~QELFpaPertAdapter() override = default;

 private:
  bool Owns(VORBaseUnknown* node) const;
  VORBaseUnknown* _root;
};
VOR_DECLARE_HANDLE(QELFpaPertAdapter);

class QELIFPAAdapters : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(QELIFPAAdapters)
 public:
  // A new PERT adapter of this root process (one reference, the caller's); E_FAIL and null
  // when the object is no root process.
  virtual HRESULT CreatePertAdapter(QELFpaPertAdapter*& adapter) = 0;
  // The adapter the root process keeps (held; null forgets it).
  virtual HRESULT SetPertAdapter(QELFpaPertAdapter* adapter) = 0;
  virtual QELFpaPertAdapter* GetPertAdapter() = 0;
  // The controller of the chart that shows a level of this process; not held: the window
  // owning the controller sets null before it deletes it.
  virtual HRESULT SetPertController(QELPertController* controller) = 0;
  virtual QELPertController* GetPertController() = 0;
};
VOR_DECLARE_HANDLE(QELIFPAAdapters);

// Registers QELIFPAAdapters on "BIWActivityRoot" (VORInitFrame).
void QELRegisterFPAAdapters();
