#include "VORQtScenePainter.h"

#include <QFontMetricsF>
#include <QImage>
#include <QPainter>
#include <QPainterPath>
#include <QPolygonF>
#include <QString>
#include <algorithm>
#include <cmath>
#include <numbers>

#include "VORQtImages.h"
#include "VORQtStrings.h"
#include "VORTextMetric.h"
#include "VORViewer.h"

namespace {

// Marker symbols of VOR2DPointRep.
constexpr int kMarkerPlus = 1;
constexpr int kMarkerCross = 2;
constexpr int kMarkerStar = 3;  // plus and cross
constexpr int kMarkerDisc = 4;
constexpr int kMarkerSquare = 5;
constexpr int kMarkerTriangle = 6;
// The smallest half size of a marker in pixels, so that it stays visible when zoomed out.
constexpr double kMinMarkerHalfPixels = 1.5;
// The dot (symbol 0): its radius as a share of the half size, plus a fixed part in pixels.
constexpr double kDotRadiusShare = 0.3;
constexpr double kDotRadiusPixels = 0.5;

// The cached pen width after the pen was changed behind SetPen: the next SetPen sets it.
constexpr double kPenUnknown = -1.0;
// A selected or preselected item is drawn this many pixels wider.
constexpr double kHighlightExtraWidth = 1.0;
// Line widths and markers may stick out of an item's model box by a few pixels.
constexpr double kCullMarginPixels = 4.0;
// Grid lines closer than this (pixels) would only grey the background: no grid.
constexpr double kMinGridCellPixels = 6.0;
// Fonts are cached per tenth of a pixel of height.
constexpr double kFontKeyStepsPerPixel = 10.0;
// Qt measures angles in sixteenths of a degree.
constexpr double kQtAngleUnitsPerRadian = 180.0 / std::numbers::pi * 16.0;
// An arc spanning a full turn within this (radians) is drawn as a whole ellipse.
constexpr double kFullTurnTolerance = 1e-6;
// Greeked text: a bar from 0.7 to 0.2 of the text height above the baseline, at half the
// text's opacity, never thinner or narrower than half a pixel.
constexpr double kGreekBarTop = 0.7;
constexpr double kGreekBarHeight = 0.5;
constexpr double kGreekMinPixels = 0.5;

const QColor kPreselectedColor(240, 140, 20);  // orange
const QColor kSelectedColor(220, 30, 30);      // red

QColor ToQColor(const VORColorRGB& c, int alpha) {
  return QColor(c.r, c.g, c.b, std::clamp(alpha, 0, 255));
}

Qt::PenStyle PenStyleOf(int lineType) {
  switch (lineType) {
    case VORLineDashed:
      return Qt::DashLine;
    case VORLineDotted:
      return Qt::DotLine;
    case VORLineDashDot:
      return Qt::DashDotLine;
    default:
      return Qt::SolidLine;
  }
}

// Four (or five, closed) points that span an axis-aligned rectangle.
bool IsAxisAlignedRectangle(const std::vector<VORMathPoint2D>& p) {
  if (p.size() != 4 && !(p.size() == 5 && p[0] == p[4]))
    return false;
  for (int i = 0; i < 4; ++i) {
    const VORMathPoint2D& a = p[i];
    const VORMathPoint2D& b = p[(i + 1) % 4];
    if (a.x != b.x && a.y != b.y)
      return false;
  }
  return true;
}

}  // namespace

QColor VORQtPreselectedColor() {
  return kPreselectedColor;
}

QColor VORQtSelectedColor() {
  return kSelectedColor;
}

VORQtViewTransform VORQtViewTransform::FromViewer(const VORViewer& viewer) {
  VORQtViewTransform view;
  viewer.GetMain2DViewpoint()->GetCentre(view.centreX, view.centreY);
  view.scale = viewer.GetMain2DViewpoint()->GetScale();
  float w = 0.0f;
  float h = 0.0f;
  viewer.GetGraphicSize(w, h);
  view.width = w;
  view.height = h;
  return view;
}

VORQtViewTransform VORQtViewTransform::Fitting(const VORBox2D& box, double width, double height,
                                               double margin) {
  VORQtViewTransform view;
  view.width = width;
  view.height = height;
  if (box.IsEmpty())
    return view;
  view.centreX = box.CentreX();
  view.centreY = box.CentreY();
  const double usableW = std::max(1.0, width - 2.0 * margin);
  const double usableH = std::max(1.0, height - 2.0 * margin);
  const double sx = box.Width() > 0.0 ? usableW / box.Width() : 1.0;
  const double sy = box.Height() > 0.0 ? usableH / box.Height() : 1.0;
  view.scale = std::min(sx, sy);
  return view;
}

QRectF VORQtViewTransform::ToPixels(const VORBox2D& box) const {
  if (box.IsEmpty())
    return QRectF();
  return QRectF(QPointF(PixelX(box.xmin), PixelY(box.ymax)),
                QPointF(PixelX(box.xmax), PixelY(box.ymin)));
}

VORBox2D VORQtViewTransform::ToModel(const QRectF& rect) const {
  const VORMathPoint2D a = ToModel(rect.left(), rect.bottom());
  const VORMathPoint2D b = ToModel(rect.right(), rect.top());
  return VORBox2D(a.x, a.y, b.x, b.y);
}

VORQtScenePainter::VORQtScenePainter() = default;

const QFont& VORQtScenePainter::FontFor(double pixelHeight) {
  const int key = static_cast<int>(std::lround(pixelHeight * kFontKeyStepsPerPixel));
  auto it = _fonts.find(key);
  if (it != _fonts.end())
    return it->second;
  QFont font(QStringLiteral("DejaVu Sans Mono"));
  font.setStyleHint(QFont::TypeWriter);
  font.setFixedPitch(true);
  font.setKerning(false);
  font.setHintingPreference(QFont::PreferNoHinting);
  font.setPixelSize(std::max(1, static_cast<int>(std::lround(pixelHeight))));
  const double natural = QFontMetricsF(font).horizontalAdvance(QLatin1Char('M'));
  font.setLetterSpacing(QFont::AbsoluteSpacing,
                        VORTextMetric::CharacterWidth(pixelHeight) - natural);
  return _fonts.emplace(key, font).first->second;
}

void VORQtScenePainter::SetPen(QPainter& painter, const QColor& color, double width, int lineType) {
  if (color == _penColor && width == _penWidth && lineType == _penType)
    return;
  _penColor = color;
  _penWidth = width;
  _penType = lineType;
  QPen pen(color, width <= 0.0 ? 0.0 : width, PenStyleOf(lineType), Qt::RoundCap, Qt::RoundJoin);
  pen.setCosmetic(true);
  painter.setPen(pen);
}

void VORQtScenePainter::SetBrush(QPainter& painter, const QColor& color) {
  if (_brushSet && color == _brushColor)
    return;
  _brushSet = true;
  _brushColor = color;
  painter.setBrush(color);
}

void VORQtScenePainter::PaintBackground(QPainter& painter, const QRectF& area, float r, float g,
                                        float b) {
  painter.fillRect(area, QColor::fromRgbF(std::clamp(r, 0.0f, 1.0f), std::clamp(g, 0.0f, 1.0f),
                                          std::clamp(b, 0.0f, 1.0f)));
}

void VORQtScenePainter::PaintGrid(QPainter& painter, const VORQtViewTransform& view,
                                  const QRectF& area, double cellSize, const QColor& color) {
  if (!(cellSize > 0.0) || cellSize * view.scale < kMinGridCellPixels || area.isEmpty())
    return;
  const VORBox2D box = view.ToModel(area);
  QPen pen(color, 0.0, Qt::DotLine);
  pen.setCosmetic(true);
  painter.save();
  painter.setPen(pen);
  std::vector<QLineF> lines;
  for (double x = std::ceil(box.xmin / cellSize) * cellSize; x <= box.xmax; x += cellSize)
    lines.emplace_back(view.PixelX(x), area.top(), view.PixelX(x), area.bottom());
  for (double y = std::ceil(box.ymin / cellSize) * cellSize; y <= box.ymax; y += cellSize)
    lines.emplace_back(area.left(), view.PixelY(y), area.right(), view.PixelY(y));
  painter.drawLines(lines.data(), static_cast<int>(lines.size()));
  painter.restore();
}

VORQtPaintStatistics VORQtScenePainter::Paint(QPainter& painter, const VORRenderList& list,
                                              const VORQtViewTransform& view, const QRectF& area) {
  VORQtPaintStatistics stats;
  stats.items = list.Size();
  QRectF target = area;
  if (target.isEmpty())
    target = QRectF(0.0, 0.0, view.width, view.height);
  const VORBox2D visible = view.ToModel(target.adjusted(-kCullMarginPixels, -kCullMarginPixels,
                                                        kCullMarginPixels, kCullMarginPixels));
  _penWidth = kPenUnknown;
  _brushSet = false;
  painter.setPen(Qt::NoPen);
  painter.setBrush(Qt::NoBrush);
  for (const VORRenderItem& item : list.Items()) {
    if (!item.box.Intersects(visible)) {
      ++stats.culled;
      continue;
    }
    PaintItem(painter, item, view, stats);
    ++stats.drawn;
  }
  return stats;
}

void VORQtScenePainter::PaintItem(QPainter& painter, const VORRenderItem& item,
                                  const VORQtViewTransform& view, VORQtPaintStatistics& stats) {
  QColor stroke = ToQColor(item.color, item.alpha);
  double width = item.thickness;
  if (item.highlight & VORHighlightSelected) {
    stroke = VORQtSelectedColor();
    width += kHighlightExtraWidth;
  } else if (item.highlight & VORHighlightPreselected) {
    stroke = VORQtPreselectedColor();
    width += kHighlightExtraWidth;
  }
  const QColor fill = ToQColor(item.color, item.alpha);
  auto toPixels = [&](const std::vector<VORMathPoint2D>& points) {
    _points.clear();
    for (const VORMathPoint2D& p : points)
      _points.emplace_back(view.PixelX(p.x), view.PixelY(p.y));
  };

  switch (item.kind) {
    case VORPrimitiveKind::Line:
      if (item.points.size() < 2)
        return;
      SetPen(painter, stroke, width, item.lineType);
      painter.drawLine(QPointF(view.PixelX(item.points[0].x), view.PixelY(item.points[0].y)),
                       QPointF(view.PixelX(item.points[1].x), view.PixelY(item.points[1].y)));
      return;
    case VORPrimitiveKind::Polyline:
      if (item.points.size() < 2)
        return;
      toPixels(item.points);
      SetPen(painter, stroke, width, item.lineType);
      if (item.closed)
        painter.drawPolygon(_points.data(), static_cast<int>(_points.size()));
      else
        painter.drawPolyline(_points.data(), static_cast<int>(_points.size()));
      return;
    case VORPrimitiveKind::Polygon: {
      if (item.points.size() < 2)
        return;
      const bool outline = !item.filled || item.highlight != VORHighlightNone;
      if (IsAxisAlignedRectangle(item.points)) {
        const QRectF rect = view.ToPixels(item.box);
        if (item.filled)
          painter.fillRect(rect, fill);
        if (outline) {
          SetPen(painter, stroke, width, item.lineType);
          painter.setBrush(Qt::NoBrush);
          _brushSet = false;
          painter.drawRect(rect);
        }
        return;
      }
      toPixels(item.points);
      if (item.filled) {
        painter.setPen(Qt::NoPen);
        _penWidth = kPenUnknown;
        SetBrush(painter, fill);
        painter.drawPolygon(_points.data(), static_cast<int>(_points.size()));
      }
      if (outline) {
        SetPen(painter, stroke, width, item.lineType);
        painter.setBrush(Qt::NoBrush);
        _brushSet = false;
        painter.drawPolygon(_points.data(), static_cast<int>(_points.size()));
      }
      return;
    }
    case VORPrimitiveKind::Arc: {
      if (item.points.empty())
        return;
      const double r = item.radius * view.scale;
      const QRectF rect(view.PixelX(item.points[0].x) - r, view.PixelY(item.points[0].y) - r,
                        2.0 * r, 2.0 * r);
      const double span = item.endAngle - item.startAngle;
      const int start16 = static_cast<int>(std::lround(item.startAngle * kQtAngleUnitsPerRadian));
      const int span16 = static_cast<int>(std::lround(span * kQtAngleUnitsPerRadian));
      const bool fullTurn = span >= 2.0 * std::numbers::pi - kFullTurnTolerance;
      SetPen(painter, stroke, width, item.lineType);
      if (item.closed) {
        SetBrush(painter, fill);
        if (fullTurn)
          painter.drawEllipse(rect);
        else
          painter.drawChord(rect, start16, span16);
      } else if (fullTurn) {
        painter.setBrush(Qt::NoBrush);
        _brushSet = false;
        painter.drawEllipse(rect);
      } else {
        painter.drawArc(rect, start16, span16);
      }
      return;
    }
    case VORPrimitiveKind::Marker: {
      if (item.points.empty())
        return;
      const double x = view.PixelX(item.points[0].x);
      const double y = view.PixelY(item.points[0].y);
      const double h = std::max(kMinMarkerHalfPixels, item.markerSize * view.scale / 2.0);
      const bool highlighted = item.highlight != VORHighlightNone;
      switch (item.marker) {
        case kMarkerDisc:
          painter.setPen(Qt::NoPen);
          _penWidth = kPenUnknown;
          SetBrush(painter, highlighted ? stroke : fill);
          painter.drawEllipse(QPointF(x, y), h, h);
          return;
        case kMarkerSquare:
          painter.fillRect(QRectF(x - h, y - h, 2 * h, 2 * h), highlighted ? stroke : fill);
          return;
        case kMarkerTriangle: {
          const QPointF triangle[3] = {{x - h, y + h}, {x + h, y + h}, {x, y - h}};
          painter.setPen(Qt::NoPen);
          _penWidth = kPenUnknown;
          SetBrush(painter, highlighted ? stroke : fill);
          painter.drawPolygon(triangle, 3);
          return;
        }
        default: {
          const bool plus = item.marker == kMarkerPlus || item.marker == kMarkerStar;
          const bool cross = item.marker == kMarkerCross || item.marker == kMarkerStar;
          if (!plus && !cross) {
            painter.setPen(Qt::NoPen);
            _penWidth = kPenUnknown;
            SetBrush(painter, stroke);
            const double r = h * kDotRadiusShare + kDotRadiusPixels;
            painter.drawEllipse(QPointF(x, y), r, r);
            return;
          }
          SetPen(painter, stroke, width, VORLineSolid);
          if (plus) {
            painter.drawLine(QPointF(x - h, y), QPointF(x + h, y));
            painter.drawLine(QPointF(x, y - h), QPointF(x, y + h));
          }
          if (cross) {
            painter.drawLine(QPointF(x - h, y - h), QPointF(x + h, y + h));
            painter.drawLine(QPointF(x - h, y + h), QPointF(x + h, y - h));
          }
          return;
        }
      }
    }
    case VORPrimitiveKind::Text: {
      if (item.text.IsEmpty())
        return;
      const double h = item.textHeight * view.scale;
      const double left = view.PixelX(item.box.xmin);
      const double baseline = view.PixelY(item.box.ymin);
      const QColor colour = item.highlight != VORHighlightNone ? stroke : fill;
      if (h < kMinReadableTextPixels) {
        // Unreadable: a bar of the text's width keeps the shape of the chart.
        ++stats.greekedTexts;
        const double w = item.box.Width() * view.scale;
        QColor bar = colour;
        bar.setAlpha(colour.alpha() / 2);
        painter.fillRect(QRectF(left, baseline - h * kGreekBarTop, std::max(w, kGreekMinPixels),
                                std::max(h * kGreekBarHeight, kGreekMinPixels)),
                         bar);
        return;
      }
      painter.setFont(FontFor(h));
      SetPen(painter, colour, 0.0, VORLineSolid);
      painter.drawText(QPointF(left, baseline), VORQtString(item.text));
      return;
    }
    case VORPrimitiveKind::Image: {
      if (!item.image)
        return;
      const QImage& image = VORQtImages::ToQImage(item.image.get(), item.alphaMode);
      if (image.isNull())
        return;
      painter.drawImage(view.ToPixels(item.box), image);
      return;
    }
  }
}
