// A marker at a point. Symbols: 0 dot, 1 plus, 2 cross, 3 star, 4 filled circle, 5 square,
// 6 triangle. Every marker is VOR2DPointRep::kMarkerSize model units wide and high, so its box
// does not depend on the zoom.
#pragma once

#include "VOR2DRep.h"

class VOR2DPointRep : public VOR2DRep {
  VOR_DECLARE_CLASS(VOR2DPointRep, VOR2DRep)
 public:
  static constexpr double kMarkerSize = 1.0;

  VOR2DPointRep(const VORMathPoint2Df& at, int symbol);
  VOR2DPointRep(float x, float y, int symbol) : VOR2DPointRep(VORMathPoint2Df(x, y), symbol) {}

  void Modify(const VORMathPoint2Df& at);
  void SetSymbol(int symbol);
  int GetSymbol() const { return _symbol; }
  const VORMathPoint2Df& GetPoint() const { return _at; }

  bool HitTest(const VORMathPoint2D& p, double tolerance) const override;

 protected:
  VORBox2D ComputeBoundingBox() const override;
  void FlattenShown(VORFlattenContext& context) const override;

 private:
  VORMathPoint2Df _at;
  int _symbol;
};
VOR_DECLARE_HANDLE(VOR2DPointRep);
