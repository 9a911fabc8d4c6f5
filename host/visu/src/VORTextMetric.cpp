#include "VORTextMetric.h"

#include "VORUnicodeString.h"

namespace VORTextMetric {

double& LabelHeight() {
  static double height = 2.0;
  return height;
}

double TextWidth(int characterCount, double height) {
  return characterCount <= 0 ? 0.0 : characterCount * (kCharWidthRatio * height);
}

VORBox2D TextBox(double x, double y, int characterCount, double height, int anchor) {
  const double w = TextWidth(characterCount, height);
  double left = x;
  double bottom = y;
  switch (anchor) {
    case 1:
      left = x - w * 0.5;
      break;
    case 2:
      left = x - w * 0.5;
      bottom = y - height * 0.5;
      break;
    case 3:
      left = x - w;
      break;
    case 4:
      bottom = y - height * 0.5;
      break;
    case 5:
      left = x - w;
      bottom = y - height * 0.5;
      break;
    default:
      break;
  }
  return VORBox2D(left, bottom, left + w, bottom + height);
}

VORBox2D TextBox(double x, double y, const VORUnicodeString& text, double height, int anchor) {
  return TextBox(x, y, text.GetLengthInChar(), height, anchor);
}

}  // namespace VORTextMetric
