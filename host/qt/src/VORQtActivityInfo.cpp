#include "VORQtActivityInfo.h"

#include <QObject>

#include "QELIBIWActivityStation.h"
#include "QELPertActivityColors.h"
#include "VORISPPAbstractActivity.h"
#include "VORISPPActivity.h"
#include "VORQtStrings.h"

namespace VORQtActivityInfo {

VORBaseUnknown* ActivityOf(const std::vector<VORPathElement_var>& paths) {
  for (const VORPathElement_var& path : paths) {
    if (!path)
      continue;
    if (VORISPPActivity_var activity = path->SearchElement<VORISPPActivity>(); activity)
      return VORBaseUnknown_var(activity).get();
  }
  return nullptr;
}

QString Name(VORBaseUnknown* activity) {
  VORISPPAbstractActivity_var abstract{VORBaseUnknown_var(activity)};
  VORUnicodeString label;
  if (!abstract || FAILED(abstract->GetLabel(label)))
    return QString();
  return VORQtString(label);
}

QString Summary(VORBaseUnknown* activity) {
  VORISPPActivity_var typed{VORBaseUnknown_var(activity)};
  if (!typed)
    return QString();
  const std::string type = typed->GetActivityType().str();
  QString text = Name(activity) + " - " +
                 QString::fromLatin1(QELPertActivityColors::KindOf(type).name) + " (" +
                 QString::fromStdString(type) + ")";
  double time = 0.0;
  if (QELIBIWActivityStation_var station{VORBaseUnknown_var(activity)};
      station && SUCCEEDED(station->GetStationCycleTime(time)))
    return text + QObject::tr(", cycle time %1 s").arg(time);
  if (VORISPPAbstractActivity_var abstract{VORBaseUnknown_var(activity)};
      abstract && SUCCEEDED(abstract->GetActivityTime(time)))
    return text + QObject::tr(", time %1 s").arg(time);
  return text;
}

}  // namespace VORQtActivityInfo
