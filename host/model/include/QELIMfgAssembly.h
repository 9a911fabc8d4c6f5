// A manufacturing assembly ("QELMfgAssy") of the "QELMBomNodesCont" container: a named set of
// components (products or other assemblies). It is an item (VORISPPItem) that activities can
// be assigned and consume.
#pragma once

#include "VORHandle.h"
#include "VORLists.h"

class QELIMfgAssembly : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(QELIMfgAssembly)
 public:
  // New list the caller deletes.
  virtual HRESULT GetComponents(VORListValVORBaseUnknown_var*& components) = 0;
  // Dispatches "MAModified" on the container. E_INVALIDARG for a cycle or a foreign object.
  virtual HRESULT AddComponent(VORBaseUnknown* component) = 0;
  virtual HRESULT RemoveComponent(VORBaseUnknown* component) = 0;
};
VOR_DECLARE_HANDLE(QELIMfgAssembly);
