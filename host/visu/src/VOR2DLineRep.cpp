#include "VOR2DLineRep.h"

VOR2DLineRep::VOR2DLineRep(const VORMathPoint2Df& from, const VORMathPoint2Df& to)
    : _from(from), _to(to) {}

void VOR2DLineRep::Modify(const VORMathPoint2Df& from, const VORMathPoint2Df& to) {
  _from = from;
  _to = to;
  Invalidate();
}

bool VOR2DLineRep::HitTest(const VORMathPoint2D& p, double tolerance) const {
  return VORDistanceToSegment(p, _from.x, _from.y, _to.x, _to.y) <= tolerance;
}

VORBox2D VOR2DLineRep::ComputeBoundingBox() const {
  return VORBox2D(_from.x, _from.y, _to.x, _to.y);
}

void VOR2DLineRep::FlattenShown(VORFlattenContext& context) const {
  VORRenderItem& item = AddItem(context, VORPrimitiveKind::Line);
  item.points = {context.matrix.Transform(_from.x, _from.y),
                 context.matrix.Transform(_to.x, _to.y)};
  item.box = VORBox2D(item.points[0].x, item.points[0].y, item.points[1].x, item.points[1].y);
}
