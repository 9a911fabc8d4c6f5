// A circular arc from a start angle to an end angle (radians, counter-clockwise, y up). A span of
// 2*pi or more is the full circle. A closed arc is closed by its chord and hit inside as well.
#pragma once

#include "VOR2DRep.h"

class VOR2DArcCircleRep : public VOR2DRep {
  VOR_DECLARE_CLASS(VOR2DArcCircleRep, VOR2DRep)
 public:
  VOR2DArcCircleRep(const VORMathPoint2Df& centre, float radius, float startAngle, float endAngle,
                    int closed = 0);

  const VORMathPoint2Df& GetCentre() const { return _centre; }
  float GetRadius() const { return _radius; }
  void Modify(const VORMathPoint2Df& centre, float radius);
  bool IsFullCircle() const;

  bool HitTest(const VORMathPoint2D& p, double tolerance) const override;

 protected:
  VORBox2D ComputeBoundingBox() const override;
  void FlattenShown(VORFlattenContext& context) const override;

 private:
  // True when angle (radians) lies on the arc.
  bool OnArc(double angle) const;

  VORMathPoint2Df _centre;
  float _radius;
  float _start;
  float _end;
  int _closed;
};
VOR_DECLARE_HANDLE(VOR2DArcCircleRep);
