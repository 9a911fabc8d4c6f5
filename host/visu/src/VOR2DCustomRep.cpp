#include "VOR2DCustomRep.h"

bool VOR2DCustomRep::AddPrimitive(VOR2DGP* primitive, const VOR2DGraphicAttribute& attribute) {
  if (primitive == nullptr)
    return false;
  _primitives.push_back({std::unique_ptr<VOR2DGP>(primitive), attribute});
  Invalidate();
  return true;
}

void VOR2DCustomRep::RemoveAllPrimitives() {
  _primitives.clear();
  Invalidate();
}

bool VOR2DCustomRep::ModifyPolyline(int position, const VORMathPoint2Df* points, int count) {
  if (position < 1 || position > GetPrimitiveCount())
    return false;
  auto* polyline = dynamic_cast<VOR2DPolylineGP*>(
      _primitives[static_cast<size_t>(position - 1)].primitive.get());
  if (polyline == nullptr)
    return false;
  polyline->SetPoints(points, count);
  Invalidate();
  return true;
}

const VOR2DGP* VOR2DCustomRep::GetPrimitive(int position) const {
  if (position < 1 || position > GetPrimitiveCount())
    return nullptr;
  return _primitives[static_cast<size_t>(position - 1)].primitive.get();
}

VOR2DGraphicAttribute VOR2DCustomRep::GetAttribute(int position) const {
  if (position < 1 || position > GetPrimitiveCount())
    return {};
  return _primitives[static_cast<size_t>(position - 1)].attribute;
}

bool VOR2DCustomRep::HitTest(const VORMathPoint2D& p, double tolerance) const {
  for (const Entry& e : _primitives) {
    if (e.attribute.Pickable() && e.primitive->HitTest(p, tolerance))
      return true;
  }
  return false;
}

VORBox2D VOR2DCustomRep::ComputeBoundingBox() const {
  VORBox2D box;
  for (const Entry& e : _primitives)
    box.Extend(e.primitive->GetBoundingBox());
  return box;
}

void VOR2DCustomRep::FlattenShown(VORFlattenContext& context) const {
  for (const Entry& e : _primitives) {
    const auto* polyline = dynamic_cast<const VOR2DPolylineGP*>(e.primitive.get());
    if (polyline == nullptr || polyline->GetPointCount() == 0)
      continue;
    const bool filled = e.attribute.Filled() && polyline->IsClosed();
    VORRenderItem& item =
        AddItem(context, filled || polyline->IsClosed() ? VORPrimitiveKind::Polygon
                                                        : VORPrimitiveKind::Polyline);
    item.closed = polyline->IsClosed();
    item.filled = filled;
    item.color = VORColorFromIndex(e.attribute.ColorIndex());
    item.alpha = e.attribute.alpha;
    item.thickness = e.attribute.ThicknessPixels();
    item.lineType = e.attribute.LineType();
    for (const VORMathPoint2Df& p : polyline->GetPoints()) {
      item.points.push_back(context.matrix.Transform(p.x, p.y));
      item.box.Extend(item.points.back().x, item.points.back().y);
    }
  }
}
