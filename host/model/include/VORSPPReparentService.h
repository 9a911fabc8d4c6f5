// Moves a resource product under another product.
#pragma once

#include "VORHandle.h"
#include "VORLists.h"

class VORSPPReparentService {
 public:
  // Makes resource a child of newFather (both products of one document; newFather not inside
  // resource). path, when given, is the chain of products from a root to newFather and must end
  // with it. Activity assignments of the resource stay. E_INVALIDARG on a bad argument.
  static HRESULT ReparentResource(VORBaseUnknown* resource, VORBaseUnknown* newFather,
                                  const VORListValVORBaseUnknown_var* path,
                                  VORBaseUnknown* processContainer);
  // New list the caller deletes: the products from the root down to product (both included).
  static VORListValVORBaseUnknown_var* GetPathOf(VORBaseUnknown* product);
};
