// The 2D viewpoint of a viewer: which model point is at the centre of the window and how many
// pixels one model unit spans. Model y points up, pixel y points down from the top-left corner.
#pragma once

#include "VORBaseUnknown.h"
#include "VORHandle.h"
#include "VORMath2D.h"

class VORViewer;

class VOR2DViewpoint : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VOR2DViewpoint, VORBaseUnknown)
 public:
  explicit VOR2DViewpoint(VORViewer* viewer) : _viewer(viewer) {}

  VORViewer* GetViewer() const { return _viewer; }

  void SetCentre(double x, double y);
  void GetCentre(double& x, double& y) const {
    x = _cx;
    y = _cy;
  }
  // Pixels per model unit (> 0; other values are ignored).
  void SetScale(double pixelsPerUnit);
  double GetScale() const { return _scale; }

  // Moves the view by a pixel offset (the content follows the pointer).
  void Pan(double dxPixels, double dyPixels);
  // Multiplies the scale by factor, keeping the model point under the pixel (px, py) in place.
  void Zoom(double factor, double px, double py);
  // Fits box into the window with a margin of marginFraction of the window on each side.
  // An empty box centres on the origin at the default scale.
  void Reframe(const VORBox2D& box, double marginFraction = 0.05);

  VORMathPoint2D PixelToModel(double px, double py) const;
  VORMathPoint2D ModelToPixel(double x, double y) const;
  // The model box visible in the window.
  VORBox2D VisibleBox() const;

  static constexpr double kDefaultScale = 4.0;
  static constexpr double kMinScale = 1e-4;
  static constexpr double kMaxScale = 1e4;

 private:
  void Changed();
  VORViewer* _viewer;
  double _cx = 0.0;
  double _cy = 0.0;
  double _scale = kDefaultScale;
};
VOR_DECLARE_HANDLE(VOR2DViewpoint);
