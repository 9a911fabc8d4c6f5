#include "VOR2DArcCircleRep.h"

#include <cmath>
#include <numbers>

namespace {
constexpr double kTwoPi = 2.0 * std::numbers::pi;

double Normalised(double angle) {
  double a = std::fmod(angle, kTwoPi);
  return a < 0.0 ? a + kTwoPi : a;
}
}  // namespace

VOR2DArcCircleRep::VOR2DArcCircleRep(const VORMathPoint2Df& centre, float radius, float startAngle,
                                     float endAngle, int closed)
    : _centre(centre),
      _radius(std::fabs(radius)),
      _start(startAngle),
      _end(endAngle),
      _closed(closed) {}

void VOR2DArcCircleRep::Modify(const VORMathPoint2Df& centre, float radius) {
  _centre = centre;
  _radius = std::fabs(radius);
  Invalidate();
}

bool VOR2DArcCircleRep::IsFullCircle() const {
  // 6.2831855f, the float nearest 2*pi, is just above it: a full circle.
  return static_cast<double>(_end) - static_cast<double>(_start) >= kTwoPi - 1e-6;
}

bool VOR2DArcCircleRep::OnArc(double angle) const {
  if (IsFullCircle())
    return true;
  const double span = Normalised(static_cast<double>(_end) - _start);
  return Normalised(angle - _start) <= span;
}

bool VOR2DArcCircleRep::HitTest(const VORMathPoint2D& p, double tolerance) const {
  const double dx = p.x - _centre.x;
  const double dy = p.y - _centre.y;
  const double d = std::hypot(dx, dy);
  const bool onAngle = OnArc(std::atan2(dy, dx));
  if (onAngle && std::fabs(d - _radius) <= tolerance)
    return true;
  // A closed arc is a disc sector closed by the chord: inside counts.
  return _closed != 0 && onAngle && d <= _radius;
}

VORBox2D VOR2DArcCircleRep::ComputeBoundingBox() const {
  const double cx = _centre.x;
  const double cy = _centre.y;
  const double r = _radius;
  if (IsFullCircle())
    return VORBox2D(cx - r, cy - r, cx + r, cy + r);
  VORBox2D box;
  box.Extend(cx + r * std::cos(_start), cy + r * std::sin(_start));
  box.Extend(cx + r * std::cos(_end), cy + r * std::sin(_end));
  const double quarter = std::numbers::pi / 2.0;
  for (int k = 0; k < 4; ++k) {
    if (OnArc(k * quarter))
      box.Extend(cx + r * (k == 0 ? 1 : (k == 2 ? -1 : 0)),
                 cy + r * (k == 1 ? 1 : (k == 3 ? -1 : 0)));
  }
  return box;
}

void VOR2DArcCircleRep::FlattenShown(VORFlattenContext& context) const {
  const VOR3x3Matrix& m = context.matrix;
  VORRenderItem& item = AddItem(context, VORPrimitiveKind::Arc);
  item.points = {m.Transform(_centre.x, _centre.y)};
  item.radius = _radius * m.ScaleFactor();
  item.closed = _closed != 0;
  if (IsFullCircle()) {
    item.startAngle = 0.0;
    item.endAngle = kTwoPi;
  } else {
    // Angles follow the matrix; a mirror reverses the direction of travel.
    const VORMathPoint2D s = m.TransformVector(std::cos(_start), std::sin(_start));
    const VORMathPoint2D e = m.TransformVector(std::cos(_end), std::sin(_end));
    double a = std::atan2(s.y, s.x);
    double b = std::atan2(e.y, e.x);
    if (m.Determinant() < 0.0)
      std::swap(a, b);
    const double span = Normalised(static_cast<double>(_end) - _start);
    item.startAngle = a;
    item.endAngle = a + span;
  }
  item.box = m.TransformBox(GetBoundingBox());
  if (m.IsTranslation())
    return;
  // Under rotation the corners of the box overestimate; the circle's box is the safe bound.
  const double r = item.radius;
  VORBox2D circle(item.points[0].x - r, item.points[0].y - r, item.points[0].x + r,
                  item.points[0].y + r);
  VORBox2D clipped(std::max(item.box.xmin, circle.xmin), std::max(item.box.ymin, circle.ymin),
                   std::min(item.box.xmax, circle.xmax), std::min(item.box.ymax, circle.ymax));
  item.box = clipped;
}
