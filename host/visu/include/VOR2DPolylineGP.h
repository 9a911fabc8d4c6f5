// Graphic primitives of custom reps. A primitive is a plain value owned by whoever created it
// until it is handed to a VOR2DCustomRep, which then owns it.
#pragma once

#include <vector>

#include "VORMath2D.h"

class VOR2DGP {
 public:
  virtual ~VOR2DGP() = default;
  virtual VORBox2D GetBoundingBox() const = 0;
  virtual bool HitTest(const VORMathPoint2D& p, double tolerance) const = 0;
};

// A polyline from count points. Mode 1: open; mode 2: closed (last point joined to the first).
// Other modes are treated as open.
class VOR2DPolylineGP : public VOR2DGP {
 public:
  VOR2DPolylineGP(const VORMathPoint2Df* points, int count, int mode);
  VOR2DPolylineGP(const float* xy, int count, int mode);

  const std::vector<VORMathPoint2Df>& GetPoints() const { return _points; }
  int GetPointCount() const { return static_cast<int>(_points.size()); }
  int GetMode() const { return _mode; }
  bool IsClosed() const { return _mode == 2; }
  // New points, the mode kept; the storage is reused when it is large enough.
  void SetPoints(const VORMathPoint2Df* points, int count);

  VORBox2D GetBoundingBox() const override;
  bool HitTest(const VORMathPoint2D& p, double tolerance) const override;

 private:
  std::vector<VORMathPoint2Df> _points;
  int _mode;
};
