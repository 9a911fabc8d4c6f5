// Resources (products that are resources) assigned to an activity.
#pragma once

#include "VORHandle.h"
#include "VORLists.h"

class VORISPPResourceManagement : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORISPPResourceManagement)
 public:
  // New list the caller deletes (empty, never null, on success). filter "Resource" gives every
  // assigned resource; any other text keeps those of that resource class ("Robot", "Worker"...).
  virtual HRESULT GetResources(VORListValVORBaseUnknown_var*& resources,
                               const char* filter = "Resource") = 0;
  // As GetResources, appended to a list the caller holds.
  virtual HRESULT AppendResources(VORListValVORBaseUnknown_var& resources,
                                  const char* filter = "Resource") = 0;
  // S_FALSE when already assigned; E_INVALIDARG when resource is not a resource. Kind 15.
  virtual HRESULT AssignResource(VORBaseUnknown* resource) = 0;
  // S_FALSE when it was not assigned. Kind 16.
  virtual HRESULT UnassignResource(VORBaseUnknown* resource) = 0;
};
VOR_DECLARE_HANDLE(VORISPPResourceManagement);
