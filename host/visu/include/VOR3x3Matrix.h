// Homogeneous 2D transformation: a 2x2 linear part and a translation, in double precision.
//
// Rounding: every coefficient is a double. Values handed in as floats are widened exactly, so a
// translation set from floats reads back as the same floats. Composition and point transformation
// round once per operation in double precision, never through float; callers that must follow
// single-precision arithmetic (the module's drag deltas) narrow explicitly. A rotation is built
// from std::cos/std::sin of the angle, so a quarter turn carries cos = 6.1e-17, not 0: compare
// rotated coordinates with a tolerance or round them where exactness matters.
#pragma once

#include "VORMath2D.h"

class VOR3x3Matrix {
 public:
  // Identity.
  VOR3x3Matrix() = default;
  // Rows (a11 a12 a13) and (a21 a22 a23); the third row is (0 0 1).
  VOR3x3Matrix(double a11, double a12, double a13, double a21, double a22, double a23)
      : _m{a11, a12, a13, a21, a22, a23} {}

  static VOR3x3Matrix Translation(double tx, double ty) {
    return VOR3x3Matrix(1.0, 0.0, tx, 0.0, 1.0, ty);
  }
  // Counter-clockwise rotation by angle (radians, y up): columns (cos, sin) and (-sin, cos).
  static VOR3x3Matrix Rotation(double angle, double tx = 0.0, double ty = 0.0);
  static VOR3x3Matrix Scaling(double sx, double sy) {
    return VOR3x3Matrix(sx, 0.0, 0.0, 0.0, sy, 0.0);
  }

  void SetTranslation(double tx, double ty) {
    _m[2] = tx;
    _m[5] = ty;
  }
  void GetTranslation(double& tx, double& ty) const {
    tx = _m[2];
    ty = _m[5];
  }
  // Replaces the linear part by a rotation, keeping the translation.
  void SetRotation(double angle);

  // Coefficient at row, column (both 0..2).
  double Get(int row, int column) const;

  // (A * B) applied to p is A applied to (B applied to p): B first.
  VOR3x3Matrix operator*(const VOR3x3Matrix& other) const;
  VOR3x3Matrix& operator*=(const VOR3x3Matrix& other) { return *this = *this * other; }

  VORMathPoint2D Transform(double x, double y) const {
    return {_m[0] * x + _m[1] * y + _m[2], _m[3] * x + _m[4] * y + _m[5]};
  }
  VORMathPoint2D Transform(const VORMathPoint2D& p) const { return Transform(p.x, p.y); }
  // Linear part only (directions).
  VORMathPoint2D TransformVector(double x, double y) const {
    return {_m[0] * x + _m[1] * y, _m[3] * x + _m[4] * y};
  }
  // The box that holds the four transformed corners of box.
  VORBox2D TransformBox(const VORBox2D& box) const;

  double Determinant() const { return _m[0] * _m[4] - _m[1] * _m[3]; }
  // Length scale of the linear part: sqrt(|det|), 1 for rigid motions.
  double ScaleFactor() const;
  // Rotation angle of the linear part (atan2 of the first column).
  double RotationAngle() const;
  // False (and out untouched) when the matrix is singular.
  bool Invert(VOR3x3Matrix& out) const;
  bool IsIdentity() const;
  bool IsTranslation() const {
    return _m[0] == 1.0 && _m[1] == 0.0 && _m[3] == 0.0 && _m[4] == 1.0;
  }

  friend bool operator==(const VOR3x3Matrix&, const VOR3x3Matrix&) = default;

 private:
  double _m[6] = {1.0, 0.0, 0.0, 0.0, 1.0, 0.0};
};
