// The fill colour of a chart node by the kind of its activity (stations, loading, joining
// operations, groupings, the rest), from the palette of VORGraphicAttribute.h, and the legend
// that names them.
#pragma once

#include <string_view>
#include <vector>

struct QELPertActivityKind {
  const char* name;  // as the legend shows it
  int colorIndex;
};

namespace QELPertActivityColors {
// The kind of an activity type ("BIWActivityStation" ...); "Other" for control nodes and
// unknown types.
const QELPertActivityKind& KindOf(std::string_view activityType);
int FillColorOf(std::string_view activityType);
// Every kind, in legend order.
const std::vector<QELPertActivityKind>& Legend();
}  // namespace QELPertActivityColors
