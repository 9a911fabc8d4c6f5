// The one text metric of the product: fixed pitch, so text extents are exact and the same
// headless, in SVG and on screen.
//
// A label of n characters (code points) with height h occupies a box n * 0.6 * h wide and h high.
// The box bottom is the baseline (no descent is reserved). The height of labels defaults to the
// graph editor's label height (QELPertParameters::PERT_LABEL_HEIGHT is this same variable).
#pragma once

#include "VORMath2D.h"

class VORUnicodeString;

namespace VORTextMetric {
// Advance of one character as a fraction of the text height.
inline constexpr double kCharWidthRatio = 0.6;

// The process-wide label height (2.0 until changed); a reference so that the graph-editor
// parameter can alias it.
double& LabelHeight();

double TextWidth(int characterCount, double height);
inline double CharacterWidth(double height) {
  return kCharWidthRatio * height;
}

// Anchor codes of text reps: where the anchor point sits on the text box.
//   0  start: the text begins at the anchor, baseline through it (labels right of a point)
//   1  middle: centre of the baseline
//   2  centre: centre of the box, horizontally and vertically (node labels)
//   3  end: the text ends at the anchor, baseline through it (labels left of a point)
//   4  start, vertically centred
//   5  end, vertically centred
// Other codes are treated as 0.
VORBox2D TextBox(double anchorX, double anchorY, int characterCount, double height, int anchor);

// The text as drawn within maxWidth (<= 0: no limit): whole when it fits, else its first
// characters followed by an ellipsis, as many as fit (at least the ellipsis).
VORUnicodeString Elide(const VORUnicodeString& text, double height, double maxWidth);
VORBox2D TextBox(double anchorX, double anchorY, const VORUnicodeString& text, double height,
                 int anchor);
}  // namespace VORTextMetric
