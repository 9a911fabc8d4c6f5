// Curve-fastening activities ("BIWActivityArcWelding", "BIWActivityAdhesiveApplication",
// "BIWActivitySealantApplication"): their time follows from the seam they lay.
#pragma once

#include "VORHandle.h"

class QELIBIWCurveFasteningActivity : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(QELIBIWCurveFasteningActivity)
 public:
  // User attributes the cycle time is made of: the seam length and the speed it is laid at
  // (length units per second).
  static constexpr const char* SeamLengthAttribute = "SeamLength";
  static constexpr const char* SeamSpeedAttribute = "SeamSpeed";
  // Sets the activity time (through the model's door) to length / speed. S_FALSE and no change
  // when either is missing, not a number or not positive, or the time is already so.
  virtual HRESULT UpdateCycleTime() = 0;
};
VOR_DECLARE_HANDLE(QELIBIWCurveFasteningActivity);
