// Children of an activity: activities and control nodes, in document order.
#pragma once

#include "VORHandle.h"
#include "VORLists.h"

class VORISPPChildManagement : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORISPPChildManagement)
 public:
  // New list the caller deletes. filter null or "" gives every child; "Activity" the children
  // that are activities; any other text the children whose late type is (a kind of) it.
  virtual HRESULT GetChildren(VORListValVORBaseUnknown_var*& children,
                              const char* filter = nullptr) = 0;
  virtual int GetNumberOfChildren() = 0;
  // Creates a child of the given late type (an activity type, "Start" or "Stop") at the end.
  // E_INVALIDARG for an unknown or empty type. Emits kind 3.
  virtual HRESULT CreateChild(const char* type, VORBaseUnknown_var& child) = 0;
  // Removes the child with its subtree, its flows and every link to it (kinds 3 and 8).
  virtual HRESULT RemoveChild(VORBaseUnknown* child) = 0;
};
VOR_DECLARE_HANDLE(VORISPPChildManagement);
