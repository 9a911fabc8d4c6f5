// A one-line text label at an anchor point, measured with the fixed-pitch metric of
// VORTextMetric (anchor codes there: 0 starts at the point, 3 ends at it, 2 is centred).
// Labels stay horizontal under rotated bags; their height follows the bags' scale.
#pragma once

#include "VOR2DRep.h"
#include "VORUnicodeString.h"

class VOR2DTextRep : public VOR2DRep {
  VOR_DECLARE_CLASS(VOR2DTextRep, VOR2DRep)
 public:
  // height <= 0 takes the current label height (VORTextMetric::LabelHeight()) at construction.
  VOR2DTextRep(const VORUnicodeString& text, const VORMathPoint2Df& at, int anchor = 0,
               double height = 0.0);

  void SetText(const VORUnicodeString& text);
  const VORUnicodeString& GetText() const { return _text; }
  void Modify(const VORMathPoint2Df& at);
  const VORMathPoint2Df& GetPoint() const { return _at; }
  void SetAnchor(int anchor);
  int GetAnchor() const { return _anchor; }
  void SetHeight(double height);
  double GetHeight() const { return _height; }
  // Widest the label may be drawn (model units, 0: no limit); a longer text is drawn elided,
  // GetText() keeps it whole.
  void SetMaxWidth(double width);
  double GetMaxWidth() const { return _maxWidth; }
  // The text as drawn.
  VORUnicodeString GetShownText() const;

  bool HitTest(const VORMathPoint2D& p, double tolerance) const override;

 protected:
  VORBox2D ComputeBoundingBox() const override;
  void FlattenShown(VORFlattenContext& context) const override;

 private:
  VORUnicodeString _text;
  VORMathPoint2Df _at;
  int _anchor;
  double _height;
  double _maxWidth = 0.0;
};
VOR_DECLARE_HANDLE(VOR2DTextRep);
