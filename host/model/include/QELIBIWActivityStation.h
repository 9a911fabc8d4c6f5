// Station data of a "BIWActivityStation".
#pragma once

#include "VORHandle.h"

class QELIBIWActivityStation : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(QELIBIWActivityStation)
 public:
  virtual HRESULT GetStationCycleTime(double& cycleTime) = 0;
  virtual HRESULT SetStationCycleTime(double cycleTime) = 0;
};
VOR_DECLARE_HANDLE(QELIBIWActivityStation);
