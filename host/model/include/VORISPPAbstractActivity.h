// Label, activity time and father of an activity.
#pragma once

#include "VORHandle.h"
#include "VORUnicodeString.h"

class VORISPPAbstractActivity : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORISPPAbstractActivity)
 public:
  virtual HRESULT GetLabel(VORUnicodeString& label) = 0;
  virtual HRESULT SetLabel(const VORUnicodeString& label) = 0;
  // The activity's own time value (the cycle time of a group, the time of a weld...).
  virtual HRESULT GetActivityTime(double& time) = 0;
  virtual HRESULT SetActivityTime(double time) = 0;
  // Null handle and S_FALSE for the root process.
  virtual HRESULT GetFatherActivity(VORBaseUnknown_var& father) = 0;
};
VOR_DECLARE_HANDLE(VORISPPAbstractActivity);
