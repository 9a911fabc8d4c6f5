// The two polylines of an item's link in a ZitBlt list: an orthogonal three-segment link between
// two points and an arrow head at the second point. Stateless.
#pragma once

#include "VOR2DPolylineGP.h"
#include "VORBaseUnknown.h"
#include "VORMath2D.h"

class QELArrowRepAdapter : public VORBaseUnknown {
  VOR_DECLARE_CLASS(QELArrowRepAdapter, VORBaseUnknown)
 public:
  QELArrowRepAdapter() = default;

  // An open arrow head at `to` pointing along x, away from `from`: barb end, tip, barb end
  // (the end turned clockwise first). Barbs are 2.0 long at about 18 degrees from the shaft.
  // A new primitive for the caller; null when it cannot be allocated.
  static VOR2DPolylineGP* CreateArrow(const VORMathPoint2Df& from, const VORMathPoint2Df& to);
  // Horizontal from `from` to the middle column, vertical to `to`'s height, horizontal to `to`:
  // four points, open. A new primitive for the caller; null when it cannot be allocated.
  static VOR2DPolylineGP* CreateOrthogonalLink(const VORMathPoint2Df& from,
                                               const VORMathPoint2Df& to);

 protected:
  ~QELArrowRepAdapter() override = default;
};
