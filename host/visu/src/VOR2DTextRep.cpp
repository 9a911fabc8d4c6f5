#include "VOR2DTextRep.h"

#include "VORTextMetric.h"

VOR2DTextRep::VOR2DTextRep(const VORUnicodeString& text, const VORMathPoint2Df& at, int anchor,
                           double height)
    : _text(text),
      _at(at),
      _anchor(anchor),
      _height(height > 0.0 ? height : VORTextMetric::LabelHeight()) {}

void VOR2DTextRep::SetText(const VORUnicodeString& text) {
  _text = text;
  Invalidate();
}

void VOR2DTextRep::Modify(const VORMathPoint2Df& at) {
  _at = at;
  Invalidate();
}

void VOR2DTextRep::SetAnchor(int anchor) {
  _anchor = anchor;
  Invalidate();
}

void VOR2DTextRep::SetHeight(double height) {
  _height = height;
  Invalidate();
}

void VOR2DTextRep::SetMaxWidth(double width) {
  _maxWidth = width;
  Invalidate();
}

VORUnicodeString VOR2DTextRep::GetShownText() const {
  return VORTextMetric::Elide(_text, _height, _maxWidth);
}

bool VOR2DTextRep::HitTest(const VORMathPoint2D& p, double tolerance) const {
  return GetBoundingBox().Contains(p.x, p.y, tolerance);
}

VORBox2D VOR2DTextRep::ComputeBoundingBox() const {
  return VORTextMetric::TextBox(_at.x, _at.y, GetShownText(), _height, _anchor);
}

void VOR2DTextRep::FlattenShown(VORFlattenContext& context) const {
  if (_text.IsEmpty())
    return;
  VORRenderItem& item = AddItem(context, VORPrimitiveKind::Text);
  item.points = {context.matrix.Transform(_at.x, _at.y)};
  item.text = GetShownText();
  item.anchor = _anchor;
  item.textHeight = _height * context.matrix.ScaleFactor();
  item.box = VORTextMetric::TextBox(item.points[0].x, item.points[0].y, item.text, item.textHeight,
                                    _anchor);
}
