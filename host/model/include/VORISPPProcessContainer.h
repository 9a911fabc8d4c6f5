// The process container ("VORSPPProcessCont") of a document.
#pragma once

#include "VORHandle.h"
#include "VORLists.h"

class VORISPPProcessContainer : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORISPPProcessContainer)
 public:
  // New list the caller deletes; the first entry is the root process (VORISPPActivityRoot).
  virtual HRESULT GetListOfProcesses(VORListValVORBaseUnknown_var*& processes) = 0;
  // Takes a resource out of the process: unassigns it (and its sub-resources) from every
  // activity. S_FALSE when it was assigned nowhere.
  virtual HRESULT RemoveResource(VORBaseUnknown* resource) = 0;
};
VOR_DECLARE_HANDLE(VORISPPProcessContainer);
