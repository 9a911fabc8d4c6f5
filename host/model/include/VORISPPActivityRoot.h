// The root process of a document ("BIWActivityRoot").
#pragma once

#include "VORHandle.h"

class VORProcess;

class VORISPPActivityRoot : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORISPPActivityRoot)
 public:
  virtual VORProcess* GetProcessDocument() = 0;
};
VOR_DECLARE_HANDLE(VORISPPActivityRoot);
