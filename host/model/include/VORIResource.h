// A product used as a resource. Products answer it only once they are resources.
#pragma once

#include "VORHandle.h"
#include "VORUnicodeString.h"

class VORIResource : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORIResource)
 public:
  // The planning type name ("Station", "Robot"...); empty when none.
  virtual HRESULT GetPlanTypeName(VORUnicodeString& planType) = 0;
  virtual HRESULT SetPlanTypeName(const VORUnicodeString& planType) = 0;
  // The resource class ("Resource", "Station", "Worker", "Transport", "Buffer", "Robot"...).
  virtual HRESULT GetResourceClass(VORUnicodeString& resourceClass) = 0;
  // The resource's name is its product's part number.
  virtual HRESULT GetName(VORUnicodeString& name) = 0;
  virtual HRESULT SetName(const VORUnicodeString& name) = 0;
};
VOR_DECLARE_HANDLE(VORIResource);
