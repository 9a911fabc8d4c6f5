#include "VOR2DPolylineGP.h"

#include "VOR2DRep.h"

VOR2DPolylineGP::VOR2DPolylineGP(const VORMathPoint2Df* points, int count, int mode) : _mode(mode) {
  if (points != nullptr && count > 0)
    _points.reserve(static_cast<size_t>(count));
  for (int i = 0; points != nullptr && i < count; ++i)
    _points.push_back(points[i]);
}

VOR2DPolylineGP::VOR2DPolylineGP(const float* xy, int count, int mode) : _mode(mode) {
  if (xy != nullptr && count > 0)
    _points.reserve(static_cast<size_t>(count));
  for (int i = 0; xy != nullptr && i < count; ++i)
    _points.emplace_back(xy[2 * i], xy[2 * i + 1]);
}

void VOR2DPolylineGP::SetPoints(const VORMathPoint2Df* points, int count) {
  if (points == nullptr || count < 0)
    count = 0;
  _points.assign(points, points + count);
}

VORBox2D VOR2DPolylineGP::GetBoundingBox() const {
  VORBox2D box;
  for (const VORMathPoint2Df& p : _points)
    box.Extend(p.x, p.y);
  return box;
}

bool VOR2DPolylineGP::HitTest(const VORMathPoint2D& p, double tolerance) const {
  const size_t n = _points.size();
  if (n == 1)
    return VORDistanceToSegment(p, _points[0].x, _points[0].y, _points[0].x, _points[0].y) <=
           tolerance;
  const size_t segments = IsClosed() && n > 2 ? n : n - 1;
  for (size_t i = 0; n > 1 && i < segments; ++i) {
    const VORMathPoint2Df& a = _points[i];
    const VORMathPoint2Df& b = _points[(i + 1) % n];
    if (VORDistanceToSegment(p, a.x, a.y, b.x, b.y) <= tolerance)
      return true;
  }
  return false;
}
