#include "VOR2DPolygonRep.h"

VOR2DPolygonRep::VOR2DPolygonRep(const float* xy, int count, int fillMode) : _fillMode(fillMode) {
  for (int i = 0; xy != nullptr && i < count; ++i)
    _points.emplace_back(xy[2 * i], xy[2 * i + 1]);
}

VOR2DPolygonRep::VOR2DPolygonRep(std::vector<VORMathPoint2Df> points, int fillMode)
    : _points(std::move(points)), _fillMode(fillMode) {}

void VOR2DPolygonRep::SetFillMode(int mode) {
  _fillMode = mode;
  Touch();
}

void VOR2DPolygonRep::SetFillColorIndex(int index) {
  _fillColor = index;
  Touch();
}

void VOR2DPolygonRep::Modify(std::vector<VORMathPoint2Df> points) {
  _points = std::move(points);
  Invalidate();
}

bool VOR2DPolygonRep::HitTest(const VORMathPoint2D& p, double tolerance) const {
  if (_points.empty())
    return false;
  if (_fillMode != 0 && VORPointInPolygon(p, _points))
    return true;
  for (size_t i = 0; i < _points.size(); ++i) {
    const VORMathPoint2Df& a = _points[i];
    const VORMathPoint2Df& b = _points[(i + 1) % _points.size()];
    if (VORDistanceToSegment(p, a.x, a.y, b.x, b.y) <= tolerance)
      return true;
  }
  return false;
}

VORBox2D VOR2DPolygonRep::ComputeBoundingBox() const {
  VORBox2D box;
  for (const VORMathPoint2Df& p : _points)
    box.Extend(p.x, p.y);
  return box;
}

void VOR2DPolygonRep::FlattenShown(VORFlattenContext& context) const {
  if (_points.empty())
    return;
  if (_fillMode != 0) {
    VORRenderItem& fill = AddItem(context, VORPrimitiveKind::Polygon);
    fill.filled = true;
    fill.closed = true;
    fill.thickness = 0.0;
    if (_fillColor >= 0)
      fill.color = VORColorFromIndex(_fillColor);
    for (const VORMathPoint2Df& p : _points) {
      fill.points.push_back(context.matrix.Transform(p.x, p.y));
      fill.box.Extend(fill.points.back().x, fill.points.back().y);
    }
    if (_fillColor < 0)
      return;  // one filled shape in the line colour
  }
  VORRenderItem& outline = AddItem(context, VORPrimitiveKind::Polygon);
  outline.closed = true;
  for (const VORMathPoint2Df& p : _points) {
    outline.points.push_back(context.matrix.Transform(p.x, p.y));
    outline.box.Extend(outline.points.back().x, outline.points.back().y);
  }
}
