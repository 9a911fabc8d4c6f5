// Point-fastening activities ("BIWActivitySpotWelding", "BIWActivityStudWelding",
// "BIWActivitySpotGluing", "BIWActivityClinching"): their time follows from their joints.
#pragma once

#include "VORHandle.h"

class QELIBIWWeldingActivity : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(QELIBIWWeldingActivity)
 public:
  // User attributes the cycle time is made of: the number of joints and the seconds per joint.
  static constexpr const char* PointsAttribute = "NumberOfPoints";
  static constexpr const char* TimePerPointAttribute = "TimePerPoint";
  // Sets the activity time (through the model's door) to points x time per point. S_FALSE and
  // no change when either is missing, not a number or not positive, or the time is already so.
  virtual HRESULT UpdateCycleTime() = 0;
};
VOR_DECLARE_HANDLE(QELIBIWWeldingActivity);
