// Paints a viewer's render list with QPainter: the one drawing routine of the window, the PNG
// export and the paint benchmark. Coordinates follow the viewer's viewpoint (model y up, pixel y
// down); line widths stay in pixels whatever the zoom. Text uses the product's fixed-pitch
// metric: a label starts at the left end of its box on the box's bottom (the baseline) and each
// character advances 0.6 times the text height, so what is painted matches the boxes that picking,
// tests and the SVG writer use.
#pragma once

#include <QColor>
#include <QFont>
#include <QRectF>
#include <map>
#include <vector>

#include "VORMath2D.h"
#include "VORRenderList.h"

class QPainter;
class VORViewer;

// Model <-> pixel mapping of one paint: the viewpoint's centre and scale and the device size.
struct VORQtViewTransform {
  double centreX = 0.0;
  double centreY = 0.0;
  double scale = 1.0;  // pixels per model unit
  double width = 0.0;
  double height = 0.0;

  // The viewer's current viewpoint and graphic size.
  static VORQtViewTransform FromViewer(const VORViewer& viewer);
  // Fits box with margin (pixels) into a device of width x height.
  static VORQtViewTransform Fitting(const VORBox2D& box, double width, double height,
                                    double margin);

  double PixelX(double x) const { return (x - centreX) * scale + width * 0.5; }
  double PixelY(double y) const { return height * 0.5 - (y - centreY) * scale; }
  VORMathPoint2D ToModel(double px, double py) const {
    return {centreX + (px - width * 0.5) / scale, centreY - (py - height * 0.5) / scale};
  }
  // The pixel rectangle of a model box / the model box of a pixel rectangle.
  QRectF ToPixels(const VORBox2D& box) const;
  VORBox2D ToModel(const QRectF& rect) const;
};

struct VORQtPaintStatistics {
  int items = 0;         // in the list
  int drawn = 0;         // painted
  int culled = 0;        // outside the painted area
  int greekedTexts = 0;  // texts too small to read, drawn as a bar
};

// Colours of highlighted items (as the SVG writer draws them).
QColor VORQtPreselectedColor();
QColor VORQtSelectedColor();

class VORQtScenePainter {
 public:
  // Texts lower than this many pixels are drawn as a thin bar instead of glyphs.
  static constexpr double kMinReadableTextPixels = 4.0;

  VORQtScenePainter();

  // Paints the items whose box meets area (pixels; an empty rect paints everything on the
  // device) in drawing order. The background is not painted.
  VORQtPaintStatistics Paint(QPainter& painter, const VORRenderList& list,
                             const VORQtViewTransform& view, const QRectF& area = QRectF());
  // Fills area with colour (r, g, b in 0..1).
  static void PaintBackground(QPainter& painter, const QRectF& area, float r, float g, float b);
  // Dotted grid lines every cellSize model units over area (pixels); nothing when the cells
  // would be closer than 6 pixels.
  static void PaintGrid(QPainter& painter, const VORQtViewTransform& view, const QRectF& area,
                        double cellSize, const QColor& color);

  // The font of a text whose box is pixelHeight high: monospace, em = box height, letters
  // spaced so that each character advances exactly 0.6 * pixelHeight.
  const QFont& FontFor(double pixelHeight);

 private:
  void PaintItem(QPainter& painter, const VORRenderItem& item, const VORQtViewTransform& view,
                 VORQtPaintStatistics& stats);
  void SetPen(QPainter& painter, const QColor& color, double width, int lineType);
  void SetBrush(QPainter& painter, const QColor& color);

  std::map<int, QFont> _fonts;   // by pixel size in tenths of a pixel
  std::vector<QPointF> _points;  // scratch
  // Last pen and brush set, to skip redundant state changes.
  QColor _penColor;
  double _penWidth = -1.0;
  int _penType = -1;
  QColor _brushColor;
  bool _brushSet = false;
};
