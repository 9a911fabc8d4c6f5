#include "VORTextMetric.h"

#include <algorithm>

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

VORUnicodeString Elide(const VORUnicodeString& text, double height, double maxWidth) {
  const int length = text.GetLengthInChar();
  if (maxWidth <= 0.0 || height <= 0.0 || TextWidth(length, height) <= maxWidth)
    return text;
  // A hair of tolerance: a width made of whole characters fits exactly.
  const int fit = static_cast<int>(maxWidth / CharacterWidth(height) + 1e-9);
  const int kept = std::max(fit - 1, 0);
  return text.SubString(0, kept) + VORUnicodeString("\u2026");
}

VORBox2D TextBox(double x, double y, const VORUnicodeString& text, double height, int anchor) {
  return TextBox(x, y, text.GetLengthInChar(), height, anchor);
}

}  // namespace VORTextMetric
