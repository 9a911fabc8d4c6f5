// An activity of the process tree (not answered by the Start/Stop control nodes).
#pragma once

#include "VORHandle.h"
#include "VORString.h"

class VORISPPActivity : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORISPPActivity)
 public:
  virtual HRESULT GetName(VORUnicodeString& name) = 0;
  // The activity type, e.g. "BIWActivityStation" (the late type).
  virtual HRESULT GetActivityType(VORString& type) = 0;
  virtual VORString GetActivityType() = 0;
  // Null handle and S_FALSE for the root process.
  virtual HRESULT GetFatherActivity(VORBaseUnknown_var& father) = 0;
  // The root process of the tree the activity is in (itself for the root).
  virtual HRESULT GetRootActivity(VORBaseUnknown_var& root) = 0;
};
VOR_DECLARE_HANDLE(VORISPPActivity);
