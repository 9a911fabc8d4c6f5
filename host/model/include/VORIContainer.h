// A named compound container of a document: "VORSPPPPRCont" (root products, the product
// aliased "PPRProduct" and the resource root aliased "PPRResources"), "QELMBomNodesCont"
// (manufacturing assemblies), "VORSPPProcessCont" (processes).
#pragma once

#include "VORHandle.h"
#include "VORLists.h"
#include "VORString.h"

class VORIContainer : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORIContainer)
 public:
  virtual VORString GetContainerName() = 0;
  // New list the caller deletes: the members that answer iid, in order.
  virtual HRESULT ListMembers(const VORInterfaceId& iid,
                              VORListValVORBaseUnknown_var*& members) = 0;
};
VOR_DECLARE_HANDLE(VORIContainer);
