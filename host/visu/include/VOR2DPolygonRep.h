// A closed polygon, outlined (fill mode 0) or filled with its colour and outlined (fill mode 1).
#pragma once

#include <vector>

#include "VOR2DRep.h"

class VOR2DPolygonRep : public VOR2DRep {
  VOR_DECLARE_CLASS(VOR2DPolygonRep, VOR2DRep)
 public:
  // count points from xy (x0, y0, x1, y1 ...); fewer than 0 points are treated as none.
  VOR2DPolygonRep(const float* xy, int count, int fillMode = 0);
  explicit VOR2DPolygonRep(std::vector<VORMathPoint2Df> points, int fillMode = 0);

  void SetFillMode(int mode);
  int GetFillMode() const { return _fillMode; }
  // Fill colour index when filled; -1 (default) fills with the line colour.
  void SetFillColorIndex(int index);
  int GetFillColorIndex() const { return _fillColor; }
  void Modify(std::vector<VORMathPoint2Df> points);
  const std::vector<VORMathPoint2Df>& GetPoints() const { return _points; }

  // Filled polygons are hit inside; every polygon is hit near its outline.
  bool HitTest(const VORMathPoint2D& p, double tolerance) const override;

 protected:
  VORBox2D ComputeBoundingBox() const override;
  void FlattenShown(VORFlattenContext& context) const override;

 private:
  std::vector<VORMathPoint2Df> _points;
  int _fillMode = 0;
  int _fillColor = -1;
};
VOR_DECLARE_HANDLE(VOR2DPolygonRep);
