// Planning hub (documents whose environment is "IPDDocEnv"): plan types with attributes and
// relations. The document answers VORIIPDAdapter, VORIIPDDataMgt and VORIIPDAttributeMgt
// only in hub mode.
#pragma once

#include "VORHandle.h"
#include "VORLists.h"
#include "VORUnicodeString.h"

class VORIIPDAdapter : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORIIPDAdapter)
 public:
  // The plan-type object of a product (from its resource's plan-type name). S_FALSE and a null
  // handle when it has none.
  virtual HRESULT GetPlanType(VORBaseUnknown* product, VORBaseUnknown_var& planType) = 0;
  // The plan type called name (attribute "name"); S_FALSE and null when unknown.
  virtual HRESULT FindPlanType(const VORUnicodeString& name, VORBaseUnknown_var& planType) = 0;
  // New list the caller deletes: every plan type, in document order.
  virtual HRESULT GetPlanTypes(VORListValVORBaseUnknown_var*& planTypes) = 0;
  // Deletes a hub object (VORIIPDDataMgt::GetHubObject) and its attributes.
  virtual HRESULT DeleteHubObject(VORBaseUnknown* hubObject) = 0;
};
VOR_DECLARE_HANDLE(VORIIPDAdapter);
