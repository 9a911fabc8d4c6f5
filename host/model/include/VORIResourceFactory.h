// Makes products into resources. Answered by the planning container (VORIPDServices::
// GetPPRContainer). Two steps: describe the resource, then attach it to a product.
#pragma once

#include "VORHandle.h"
#include "VORUnicodeString.h"

class VORIResourceFactory : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORIResourceFactory)
 public:
  // A resource description of class resourceClass (empty gives "Resource") and plan type
  // planType meant for product (may be null); nothing changes in the document yet.
  virtual HRESULT CreateResource(const VORUnicodeString& resourceClass, VORBaseUnknown* product,
                                 const VORUnicodeString& planType,
                                 VORBaseUnknown_var& description) = 0;
  // Attaches a description to the reference product of product: from then on it answers
  // VORIResource. S_FALSE when it already is a resource (unchanged).
  virtual HRESULT AttachResource(VORBaseUnknown* product, VORBaseUnknown* description) = 0;
};
VOR_DECLARE_HANDLE(VORIResourceFactory);
