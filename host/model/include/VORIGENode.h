// Graph node: everything drawn as a PERT node (activities and the Start/Stop control nodes).
#pragma once

#include "VORHandle.h"
#include "VORLists.h"

class VORIGENode : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORIGENode)
 public:
  // New list the caller deletes: the child graph nodes in document order.
  virtual HRESULT GetChildren(VORListValVORBaseUnknown_var*& children) = 0;
  virtual HRESULT GetLabel(VORUnicodeString& label) = 0;
  // Null (and S_FALSE) for the root.
  virtual HRESULT GetParentNode(VORBaseUnknown_var& parent) = 0;
};
VOR_DECLARE_HANDLE(VORIGENode);
