#include "VOR2DViewpoint.h"

#include <algorithm>
#include <cmath>

#include "VORViewer.h"

void VOR2DViewpoint::Changed() {
  if (_viewer != nullptr)
    _viewer->ViewChanged();
}

void VOR2DViewpoint::SetCentre(double x, double y) {
  _cx = x;
  _cy = y;
  Changed();
}

void VOR2DViewpoint::SetScale(double pixelsPerUnit) {
  if (!(pixelsPerUnit > 0.0) || !std::isfinite(pixelsPerUnit))
    return;
  _scale = std::clamp(pixelsPerUnit, kMinScale, kMaxScale);
  Changed();
}

void VOR2DViewpoint::Pan(double dxPixels, double dyPixels) {
  _cx -= dxPixels / _scale;
  _cy += dyPixels / _scale;
  Changed();
}

void VOR2DViewpoint::Zoom(double factor, double px, double py) {
  if (!(factor > 0.0) || !std::isfinite(factor))
    return;
  const VORMathPoint2D fixed = PixelToModel(px, py);
  _scale = std::clamp(_scale * factor, kMinScale, kMaxScale);
  // Put the fixed model point back under the same pixel.
  const VORMathPoint2D moved = PixelToModel(px, py);
  _cx += fixed.x - moved.x;
  _cy += fixed.y - moved.y;
  Changed();
}

void VOR2DViewpoint::Reframe(const VORBox2D& box, double marginFraction) {
  float w = 0.0f;
  float h = 0.0f;
  if (_viewer != nullptr)
    _viewer->GetGraphicSize(w, h);
  if (box.IsEmpty() || w <= 0.0f || h <= 0.0f) {
    _cx = box.IsEmpty() ? 0.0 : box.CentreX();
    _cy = box.IsEmpty() ? 0.0 : box.CentreY();
    _scale = kDefaultScale;
    Changed();
    return;
  }
  _cx = box.CentreX();
  _cy = box.CentreY();
  const double usableW = w * (1.0 - 2.0 * marginFraction);
  const double usableH = h * (1.0 - 2.0 * marginFraction);
  // A point-sized box keeps the default scale.
  double sx = box.Width() > 0.0 ? usableW / box.Width() : kDefaultScale;
  double sy = box.Height() > 0.0 ? usableH / box.Height() : kDefaultScale;
  _scale = std::clamp(std::min(sx, sy), kMinScale, kMaxScale);
  Changed();
}

VORMathPoint2D VOR2DViewpoint::PixelToModel(double px, double py) const {
  float w = 0.0f;
  float h = 0.0f;
  if (_viewer != nullptr)
    _viewer->GetGraphicSize(w, h);
  return {_cx + (px - w * 0.5) / _scale, _cy - (py - h * 0.5) / _scale};
}

VORMathPoint2D VOR2DViewpoint::ModelToPixel(double x, double y) const {
  float w = 0.0f;
  float h = 0.0f;
  if (_viewer != nullptr)
    _viewer->GetGraphicSize(w, h);
  return {(x - _cx) * _scale + w * 0.5, h * 0.5 - (y - _cy) * _scale};
}

VORBox2D VOR2DViewpoint::VisibleBox() const {
  float w = 0.0f;
  float h = 0.0f;
  if (_viewer != nullptr)
    _viewer->GetGraphicSize(w, h);
  const VORMathPoint2D a = PixelToModel(0.0, h);
  const VORMathPoint2D b = PixelToModel(w, 0.0);
  return VORBox2D(a.x, a.y, b.x, b.y);
}
