#include "VOR2DPointRep.h"

VOR2DPointRep::VOR2DPointRep(const VORMathPoint2Df& at, int symbol) : _at(at), _symbol(symbol) {}

void VOR2DPointRep::Modify(const VORMathPoint2Df& at) {
  _at = at;
  Invalidate();
}

void VOR2DPointRep::SetSymbol(int symbol) {
  _symbol = symbol;
  Touch();
}

bool VOR2DPointRep::HitTest(const VORMathPoint2D& p, double tolerance) const {
  return GetBoundingBox().Contains(p.x, p.y, tolerance);
}

VORBox2D VOR2DPointRep::ComputeBoundingBox() const {
  const double h = kMarkerSize * 0.5;
  return VORBox2D(_at.x - h, _at.y - h, _at.x + h, _at.y + h);
}

void VOR2DPointRep::FlattenShown(VORFlattenContext& context) const {
  VORRenderItem& item = AddItem(context, VORPrimitiveKind::Marker);
  item.points = {context.matrix.Transform(_at.x, _at.y)};
  item.marker = _symbol;
  item.markerSize = kMarkerSize * context.matrix.ScaleFactor();
  const double h = item.markerSize * 0.5;
  item.box = VORBox2D(item.points[0].x - h, item.points[0].y - h, item.points[0].x + h,
                      item.points[0].y + h);
}
