// What the window says about an activity under the pointer: its whole name (the tooltip, as
// a chart may elide it) and a one-line summary for the status bar: name, kind, type and time.
#pragma once

#include <QString>
#include <vector>

#include "VORPathElement.h"

namespace VORQtActivityInfo {
// The activity nearest the leaf of the first path that holds one, or null.
VORBaseUnknown* ActivityOf(const std::vector<VORPathElement_var>& paths);
QString Name(VORBaseUnknown* activity);
// "FF010 Front floor - Station (BIWActivityStation), cycle time 47 s".
QString Summary(VORBaseUnknown* activity);
}  // namespace VORQtActivityInfo
