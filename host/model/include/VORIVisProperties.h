// Visual properties of a product: shown or hidden. A change dispatches VORShowNotif on the
// product and on each of its ancestors.
#pragma once

#include "VORHandle.h"

class VORIVisProperties : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORIVisProperties)
 public:
  virtual bool IsShown() = 0;
  virtual HRESULT SetShown(bool shown) = 0;
};
VOR_DECLARE_HANDLE(VORIVisProperties);
