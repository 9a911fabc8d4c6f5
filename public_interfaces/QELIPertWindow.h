// A window that shows a PERT chart: other commands reach its controller through it.
#pragma once

#include "VORHandle.h"

class QELPertController;

class QELIPertWindow : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(QELIPertWindow)
 public:
  // The window's controller (not held; null before the chart was built or after it closed).
  virtual QELPertController* GetPertController() = 0;
};
VOR_DECLARE_HANDLE(QELIPertWindow);
