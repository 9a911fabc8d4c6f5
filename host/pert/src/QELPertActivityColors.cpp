#include "QELPertActivityColors.h"

#include "QELPertParameters.h"

namespace QELPertActivityColors {

namespace {
// Light tints of the colour cube (16 + 36r + 6g + b) so that black labels stay readable.
constexpr int kStationBlue = 16 + 36 * 3 + 6 * 4 + 5;    // 175, 215, 255
constexpr int kLoadingGreen = 16 + 36 * 4 + 6 * 5 + 3;   // 215, 255, 175
constexpr int kJoiningViolet = 16 + 36 * 4 + 6 * 4 + 5;  // 215, 215, 255
constexpr int kGroupingAmber = 16 + 36 * 5 + 6 * 4 + 2;  // 255, 215, 135
}  // namespace

const std::vector<QELPertActivityKind>& Legend() {
  static const std::vector<QELPertActivityKind> legend{{"Station", kStationBlue},
                                                       {"Loading", kLoadingGreen},
                                                       {"Joining", kJoiningViolet},
                                                       {"Grouping", kGroupingAmber},
                                                       {"Other", QELPertParameters::NodeFillColor}};
  return legend;
}

const QELPertActivityKind& KindOf(std::string_view type) {
  const auto& legend = Legend();
  if (type == "BIWActivityStation")
    return legend[0];
  if (type == "BIWActivityLoading")
    return legend[1];
  if (type == "BIWActivityGrouping")
    return legend[3];
  // Every other body-in-white operation joins parts (welding, clinching, gluing, sealing...).
  if (type.starts_with("BIWActivity") && type != "BIWActivityRoot")
    return legend[2];
  return legend[4];
}

int FillColorOf(std::string_view type) {
  return KindOf(type).colorIndex;
}

}  // namespace QELPertActivityColors
