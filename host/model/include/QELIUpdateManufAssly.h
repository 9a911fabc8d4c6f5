// On the root process: whether a manufacturing-assembly update is in progress.
#pragma once

#include "VORHandle.h"

class QELIUpdateManufAssly : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(QELIUpdateManufAssly)
 public:
  virtual bool IsUpdateInProgress() = 0;
  virtual void SetUpdateInProgress(bool inProgress) = 0;
};
VOR_DECLARE_HANDLE(QELIUpdateManufAssly);
