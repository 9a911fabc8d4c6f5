#include "VOR3x3Matrix.h"

#include <cmath>

VOR3x3Matrix VOR3x3Matrix::Rotation(double angle, double tx, double ty) {
  const double c = std::cos(angle);
  const double s = std::sin(angle);
  return VOR3x3Matrix(c, -s, tx, s, c, ty);
}

void VOR3x3Matrix::SetRotation(double angle) {
  const double c = std::cos(angle);
  const double s = std::sin(angle);
  _m[0] = c;
  _m[1] = -s;
  _m[3] = s;
  _m[4] = c;
}

double VOR3x3Matrix::Get(int row, int column) const {
  if (row == 2)
    return column == 2 ? 1.0 : 0.0;
  if (row < 0 || row > 1 || column < 0 || column > 2)
    return 0.0;
  return _m[row * 3 + column];
}

VOR3x3Matrix VOR3x3Matrix::operator*(const VOR3x3Matrix& o) const {
  const double* a = _m;
  const double* b = o._m;
  return VOR3x3Matrix(a[0] * b[0] + a[1] * b[3], a[0] * b[1] + a[1] * b[4],
                      a[0] * b[2] + a[1] * b[5] + a[2], a[3] * b[0] + a[4] * b[3],
                      a[3] * b[1] + a[4] * b[4], a[3] * b[2] + a[4] * b[5] + a[5]);
}

VORBox2D VOR3x3Matrix::TransformBox(const VORBox2D& box) const {
  VORBox2D out;
  if (box.IsEmpty())
    return out;
  if (IsTranslation()) {
    // Exact for the common case: no products, only the two additions.
    return VORBox2D(box.xmin + _m[2], box.ymin + _m[5], box.xmax + _m[2], box.ymax + _m[5]);
  }
  for (const VORMathPoint2D& p : {Transform(box.xmin, box.ymin), Transform(box.xmax, box.ymin),
                                  Transform(box.xmax, box.ymax), Transform(box.xmin, box.ymax)})
    out.Extend(p.x, p.y);
  return out;
}

double VOR3x3Matrix::ScaleFactor() const {
  return std::sqrt(std::fabs(Determinant()));
}

double VOR3x3Matrix::RotationAngle() const {
  return std::atan2(_m[3], _m[0]);
}

bool VOR3x3Matrix::Invert(VOR3x3Matrix& out) const {
  const double det = Determinant();
  if (det == 0.0 || !std::isfinite(det))
    return false;
  if (IsTranslation()) {
    out = Translation(-_m[2], -_m[5]);
    return true;
  }
  const double i0 = _m[4] / det;
  const double i1 = -_m[1] / det;
  const double i3 = -_m[3] / det;
  const double i4 = _m[0] / det;
  out = VOR3x3Matrix(i0, i1, -(i0 * _m[2] + i1 * _m[5]), i3, i4, -(i3 * _m[2] + i4 * _m[5]));
  return true;
}

bool VOR3x3Matrix::IsIdentity() const {
  return IsTranslation() && _m[2] == 0.0 && _m[5] == 0.0;
}
