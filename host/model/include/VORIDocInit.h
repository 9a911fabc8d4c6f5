// The document's init object: the way to its root container (the process container).
#pragma once

#include "VORHandle.h"

class VORIDocInit : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORIDocInit)
 public:
  // The process container (answers VORISPPProcessContainer).
  virtual HRESULT GetRootContainer(VORBaseUnknown_var& container) = 0;
};
VOR_DECLARE_HANDLE(VORIDocInit);
