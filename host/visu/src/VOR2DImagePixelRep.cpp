#include "VOR2DImagePixelRep.h"

VOR2DImagePixelRep::VOR2DImagePixelRep(const VORMathPoint2Df& at, VORPixelImage* image,
                                       int sizeMode, int anchor, int flags, int alphaMode)
    : _at(at),
      _image(image),
      _sizeMode(sizeMode),
      _anchor(anchor),
      _flags(flags),
      _alphaMode(alphaMode) {}

void VOR2DImagePixelRep::Modify(const VORMathPoint2Df& at) {
  _at = at;
  Invalidate();
}

void VOR2DImagePixelRep::SetAlphaMode(int mode) {
  _alphaMode = mode;
  Touch();
}

bool VOR2DImagePixelRep::HitTest(const VORMathPoint2D& p, double tolerance) const {
  return (_flags & 1) == 0 && GetBoundingBox().Contains(p.x, p.y, tolerance);
}

VORBox2D VOR2DImagePixelRep::ComputeBoundingBox() const {
  if (!_image)
    return VORBox2D();
  const double unit = _sizeMode == 1 ? kModelPixelSize : 1.0;
  const double w = _image->GetWidth() * unit;
  const double h = _image->GetHeight() * unit;
  double x = _at.x;
  double y = _at.y;
  if (_anchor == 2) {
    x -= w * 0.5;
    y -= h * 0.5;
  }
  return VORBox2D(x, y, x + w, y + h);
}

void VOR2DImagePixelRep::FlattenShown(VORFlattenContext& context) const {
  if (!_image)
    return;
  const VORBox2D local = GetBoundingBox();
  VORRenderItem& item = AddItem(context, VORPrimitiveKind::Image);
  // Images stay upright: the box corners follow the matrix, rotation is not applied to pixels.
  item.box = context.matrix.TransformBox(local);
  item.points = {{item.box.xmin, item.box.ymin}, {item.box.xmax, item.box.ymax}};
  item.image = _image;
  item.alphaMode = _alphaMode != 0;
}
