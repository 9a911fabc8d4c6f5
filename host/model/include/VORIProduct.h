// The product tree ("ASMPRODUCT"): parts, sub-assemblies, and resources (which are products).
#pragma once

#include "VORHandle.h"
#include "VORLists.h"

class VORIProduct : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORIProduct)
 public:
  // Null handle and S_FALSE for a root product.
  virtual HRESULT GetFatherProduct(VORBaseUnknown_var& father) = 0;
  // The product this one is an instance of; the product itself when it has no other.
  virtual HRESULT GetReferenceProduct(VORBaseUnknown_var& reference) = 0;
  // New list the caller deletes: direct children in order. type "VORIProduct" (or null) for
  // every child, "Resource" for the children that are resources.
  virtual HRESULT GetChildren(VORListValVORBaseUnknown_var*& children,
                              const char* type = "VORIProduct") = 0;
  // Adds a new child product at the end.
  virtual HRESULT AddChild(const VORUnicodeString& name, VORBaseUnknown_var& child) = 0;
  // Removes a direct child with its subtree and every link to them. E_INVALIDARG when it is
  // not a child.
  virtual HRESULT RemoveChild(VORBaseUnknown* child) = 0;
  virtual HRESULT GetPartNumber(VORUnicodeString& name) = 0;
  virtual HRESULT SetPartNumber(const VORUnicodeString& name) = 0;
};
VOR_DECLARE_HANDLE(VORIProduct);
