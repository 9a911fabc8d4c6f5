// Small 2D value types of the scene layer: points and vectors in single and double precision,
// an axis (origin and two directions) and an axis-aligned box.
#pragma once

#include <algorithm>
#include <cmath>

// Rep geometry is stored in single precision, as the reps are built from float arithmetic.
struct VORMathPoint2Df {
  float x = 0.0f;
  float y = 0.0f;
  VORMathPoint2Df() = default;
  VORMathPoint2Df(float px, float py) : x(px), y(py) {}
  friend bool operator==(const VORMathPoint2Df&, const VORMathPoint2Df&) = default;
};

struct VORMathVector2Df {
  float x = 0.0f;
  float y = 0.0f;
  VORMathVector2Df() = default;
  VORMathVector2Df(float vx, float vy) : x(vx), y(vy) {}
  float Norm() const { return std::sqrt(x * x + y * y); }
  // Unit vector in the same direction; a null vector stays null.
  VORMathVector2Df Normalized() const {
    const float n = Norm();
    return n > 0.0f ? VORMathVector2Df(x / n, y / n) : VORMathVector2Df();
  }
  friend bool operator==(const VORMathVector2Df&, const VORMathVector2Df&) = default;
};

// Model-coordinate point after transformation: matrices work in double precision.
struct VORMathPoint2D {
  double x = 0.0;
  double y = 0.0;
  VORMathPoint2D() = default;
  VORMathPoint2D(double px, double py) : x(px), y(py) {}
  friend bool operator==(const VORMathPoint2D&, const VORMathPoint2D&) = default;
};

// A position with its frame: origin plus first and second direction.
struct VORMathAxis2D {
  VORMathPoint2D origin;
  VORMathVector2Df firstDirection{1.0f, 0.0f};
  VORMathVector2Df secondDirection{0.0f, 1.0f};
  VORMathAxis2D() = default;
  VORMathAxis2D(const VORMathPoint2D& o, const VORMathVector2Df& u, const VORMathVector2Df& v)
      : origin(o), firstDirection(u), secondDirection(v) {}
  void GetOrigin(float& x, float& y) const {
    x = static_cast<float>(origin.x);
    y = static_cast<float>(origin.y);
  }
};

// Axis-aligned box; a default box is empty and extending it with a point makes it that point.
struct VORBox2D {
  double xmin = 1.0;
  double ymin = 1.0;
  double xmax = -1.0;
  double ymax = -1.0;

  VORBox2D() = default;
  VORBox2D(double x0, double y0, double x1, double y1)
      : xmin(std::min(x0, x1)),
        ymin(std::min(y0, y1)),
        xmax(std::max(x0, x1)),
        ymax(std::max(y0, y1)) {}

  bool IsEmpty() const { return xmin > xmax || ymin > ymax; }
  double Width() const { return IsEmpty() ? 0.0 : xmax - xmin; }
  double Height() const { return IsEmpty() ? 0.0 : ymax - ymin; }
  double CentreX() const { return (xmin + xmax) * 0.5; }
  double CentreY() const { return (ymin + ymax) * 0.5; }

  void Extend(double x, double y) {
    if (IsEmpty()) {
      xmin = xmax = x;
      ymin = ymax = y;
      return;
    }
    xmin = std::min(xmin, x);
    ymin = std::min(ymin, y);
    xmax = std::max(xmax, x);
    ymax = std::max(ymax, y);
  }
  void Extend(const VORBox2D& other) {
    if (other.IsEmpty())
      return;
    Extend(other.xmin, other.ymin);
    Extend(other.xmax, other.ymax);
  }
  // Grows every side by margin (ignored on an empty box).
  VORBox2D Inflated(double margin) const {
    if (IsEmpty())
      return *this;
    return VORBox2D(xmin - margin, ymin - margin, xmax + margin, ymax + margin);
  }
  bool Contains(double x, double y, double tolerance = 0.0) const {
    return !IsEmpty() && x >= xmin - tolerance && x <= xmax + tolerance && y >= ymin - tolerance &&
           y <= ymax + tolerance;
  }
  bool Intersects(const VORBox2D& o) const {
    return !IsEmpty() && !o.IsEmpty() && o.xmin <= xmax && o.xmax >= xmin && o.ymin <= ymax &&
           o.ymax >= ymin;
  }
  friend bool operator==(const VORBox2D&, const VORBox2D&) = default;
};
