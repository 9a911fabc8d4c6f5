// A pixel image placed at a point of the model. Size mode 1 draws each pixel
// VOR2DImagePixelRep::kModelPixelSize model units wide (a 16-pixel icon is 4 units), so icons keep
// their size relative to the chart; size mode 0 draws one model unit per pixel.
// Anchor 0 puts the image's lower-left corner on the point, anchor 2 its centre.
#pragma once

#include "VOR2DRep.h"
#include "VORPixelImage.h"

class VOR2DImagePixelRep : public VOR2DRep {
  VOR_DECLARE_CLASS(VOR2DImagePixelRep, VOR2DRep)
 public:
  static constexpr double kModelPixelSize = 0.25;

  // The image is held by the rep (null gives an empty rep). flags bit 0: not pickable.
  VOR2DImagePixelRep(const VORMathPoint2Df& at, VORPixelImage* image, int sizeMode = 1,
                     int anchor = 0, int flags = 0, int alphaMode = 0);

  // Moves the anchor point.
  void Modify(const VORMathPoint2Df& at);
  const VORMathPoint2Df& GetPoint() const { return _at; }
  VORPixelImage* GetPixelImage() const { return _image.get(); }
  // 1: the image is drawn with its alpha channel; 0: opaque.
  void SetAlphaMode(int mode);
  int GetAlphaMode() const { return _alphaMode; }

  bool HitTest(const VORMathPoint2D& p, double tolerance) const override;

 protected:
  VORBox2D ComputeBoundingBox() const override;
  void FlattenShown(VORFlattenContext& context) const override;

 private:
  VORMathPoint2Df _at;
  VORPixelImage_var _image;
  int _sizeMode;
  int _anchor;
  int _flags;
  int _alphaMode;
};
VOR_DECLARE_HANDLE(VOR2DImagePixelRep);
