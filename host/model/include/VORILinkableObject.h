// Links between model objects: item and resource assignments, product IO references, assembly
// components. Each link goes from a source to a target and has a type.
#pragma once

#include "VORHandle.h"
#include "VORLists.h"

class VORILinkableObject : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORILinkableObject)
 public:
  // Link types the model itself creates.
  static constexpr const char* ItemLink = "AssignedItem";          // activity -> item
  static constexpr const char* ResourceLink = "AssignedResource";  // activity -> resource
  static constexpr const char* IOItemLink = "IOItem";              // product IO -> item
  static constexpr const char* ComponentLink = "Component";        // assembly -> product/assembly
  static constexpr const char* ReferenceLink = "Reference";        // product -> reference product

  // New lists the caller deletes. type null or "" means every type; no duplicates.
  // Objects at the other end of any link of this object (both directions).
  virtual HRESULT GetLinkedObjects(VORListValVORBaseUnknown_var*& objects,
                                   const char* type = nullptr) = 0;
  // Objects that link to this one.
  virtual HRESULT GetPointingObjects(VORListValVORBaseUnknown_var*& objects,
                                     const char* type = nullptr) = 0;
  // Objects this one links to.
  virtual HRESULT GetPointedObjects(VORListValVORBaseUnknown_var*& objects,
                                    const char* type = nullptr) = 0;
};
VOR_DECLARE_HANDLE(VORILinkableObject);
