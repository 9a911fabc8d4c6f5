// The cycle-time interfaces of the joining activities, as code extensions of their late types.
#include "VORJoiningCycleTime.h"

#include "QELIBIWCurveFasteningActivity.h"
#include "QELIBIWWeldingActivity.h"
#include "VORExtensionRegistry.h"
#include "VORISPPAbstractActivity.h"
#include "VORIUserAttributes.h"
#include "VORModelTypes.h"

namespace {

// A positive number held by the activity's attribute name, or 0.
double PositiveAttribute(VORBaseUnknown* activity, const char* name) {
  VORIUserAttributes_var attributes{VORBaseUnknown_var(activity)};
  VORAttributeValue value;
  if (!attributes || attributes->GetAttributeValue(name, value) != S_OK)
    return 0;
  const double number = value.type == VORAttributeLong     ? static_cast<double>(value.longValue)
                        : value.type == VORAttributeDouble ? value.doubleValue
                                                           : 0.0;
  return number > 0 ? number : 0;
}

HRESULT SetTime(VORBaseUnknown* activity, double time) {
  VORISPPAbstractActivity_var spp{VORBaseUnknown_var(activity)};
  double current = 0;
  if (!spp || time <= 0 || FAILED(spp->GetActivityTime(current)))
    return S_FALSE;
  if (current == time)
    return S_FALSE;
  return spp->SetActivityTime(time);
}

class VORWeldingCycleTime : public VORExtension, public QELIBIWWeldingActivity {
  VOR_DECLARE_CLASS(VORWeldingCycleTime, VORExtension)
 public:
  HRESULT UpdateCycleTime() override {
    VORBaseUnknown* activity = GetExtendedObject();
    return SetTime(activity, PositiveAttribute(activity, PointsAttribute) *
                                 PositiveAttribute(activity, TimePerPointAttribute));
  }

 protected:
  ~VORWeldingCycleTime() override = default;
};

class VORCurveFasteningCycleTime : public VORExtension, public QELIBIWCurveFasteningActivity {
  VOR_DECLARE_CLASS(VORCurveFasteningCycleTime, VORExtension)
 public:
  HRESULT UpdateCycleTime() override {
    VORBaseUnknown* activity = GetExtendedObject();
    const double speed = PositiveAttribute(activity, SeamSpeedAttribute);
    return speed > 0 ? SetTime(activity, PositiveAttribute(activity, SeamLengthAttribute) / speed)
                     : S_FALSE;
  }

 protected:
  ~VORCurveFasteningCycleTime() override = default;
};

}  // namespace

void VORRegisterJoiningCycleTimes() {
  using namespace VORModelLateTypes;
  for (const char* type : {SpotWelding, StudWelding, SpotGluing, Clinching})
    VORExtensionRegistry::Register(
        type, QELIBIWWeldingActivity::IID(),
        []() -> VORExtension* { return new VORWeldingCycleTime(); }, VORExtensionKind::Code);
  for (const char* type : {ArcWelding, AdhesiveApplication, SealantApplication})
    VORExtensionRegistry::Register(
        type, QELIBIWCurveFasteningActivity::IID(),
        []() -> VORExtension* { return new VORCurveFasteningCycleTime(); }, VORExtensionKind::Code);
}
