// A straight segment between two points.
#pragma once

#include "VOR2DRep.h"

class VOR2DLineRep : public VOR2DRep {
  VOR_DECLARE_CLASS(VOR2DLineRep, VOR2DRep)
 public:
  VOR2DLineRep(const VORMathPoint2Df& from, const VORMathPoint2Df& to);
  VOR2DLineRep(float x1, float y1, float x2, float y2)
      : VOR2DLineRep(VORMathPoint2Df(x1, y1), VORMathPoint2Df(x2, y2)) {}

  void Modify(const VORMathPoint2Df& from, const VORMathPoint2Df& to);
  const VORMathPoint2Df& GetStart() const { return _from; }
  const VORMathPoint2Df& GetEnd() const { return _to; }

  bool HitTest(const VORMathPoint2D& p, double tolerance) const override;

 protected:
  VORBox2D ComputeBoundingBox() const override;
  void FlattenShown(VORFlattenContext& context) const override;

 private:
  VORMathPoint2Df _from;
  VORMathPoint2Df _to;
};
VOR_DECLARE_HANDLE(VOR2DLineRep);
