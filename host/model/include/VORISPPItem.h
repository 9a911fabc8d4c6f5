// An item: something an activity consumes, produces or uses (products, resources, assemblies).
#pragma once

#include "VORHandle.h"
#include "VORUnicodeString.h"

class VORISPPItem : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORISPPItem)
 public:
  // The display name.
  virtual HRESULT GetName(VORUnicodeString& name) = 0;
  virtual VORUnicodeString GetDisplayName() = 0;
};
VOR_DECLARE_HANDLE(VORISPPItem);
