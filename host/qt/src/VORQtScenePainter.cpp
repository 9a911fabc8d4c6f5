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
  return QColor(240, 140, 20);
}

QColor VORQtSelectedColor() {
  return QColor(220, 30, 30);
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
  const int key = static_cast<int>(std::lround(pixelHeight * 10.0));
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
  if (!(cellSize > 0.0) || cellSize * view.scale < 6.0 || area.isEmpty())
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
  // Line widths and markers may stick out of an item's model box by a few pixels.
  const VORBox2D visible = view.ToModel(target.adjusted(-4.0, -4.0, 4.0, 4.0));
  _penWidth = -1.0;
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
    width += 1.0;
  } else if (item.highlight & VORHighlightPreselected) {
    stroke = VORQtPreselectedColor();
    width += 1.0;
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
        _penWidth = -1.0;
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
      const int start16 =
          static_cast<int>(std::lround(item.startAngle * 180.0 / std::numbers::pi * 16.0));
      const int span16 = static_cast<int>(std::lround(span * 180.0 / std::numbers::pi * 16.0));
      SetPen(painter, stroke, width, item.lineType);
      if (item.closed) {
        SetBrush(painter, fill);
        if (span >= 2.0 * std::numbers::pi - 1e-6)
          painter.drawEllipse(rect);
        else
          painter.drawChord(rect, start16, span16);
      } else if (span >= 2.0 * std::numbers::pi - 1e-6) {
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
      const double h = std::max(1.5, item.markerSize * view.scale * 0.5);
      const bool highlighted = item.highlight != VORHighlightNone;
      switch (item.marker) {
        case 4:
          painter.setPen(Qt::NoPen);
          _penWidth = -1.0;
          SetBrush(painter, highlighted ? stroke : fill);
          painter.drawEllipse(QPointF(x, y), h, h);
          return;
        case 5:
          painter.fillRect(QRectF(x - h, y - h, 2 * h, 2 * h), highlighted ? stroke : fill);
          return;
        case 6: {
          const QPointF triangle[3] = {{x - h, y + h}, {x + h, y + h}, {x, y - h}};
          painter.setPen(Qt::NoPen);
          _penWidth = -1.0;
          SetBrush(painter, highlighted ? stroke : fill);
          painter.drawPolygon(triangle, 3);
          return;
        }
        default: {
          const bool plus = item.marker == 1 || item.marker == 3;
          const bool cross = item.marker == 2 || item.marker == 3;
          if (!plus && !cross) {
            painter.setPen(Qt::NoPen);
            _penWidth = -1.0;
            SetBrush(painter, stroke);
            painter.drawEllipse(QPointF(x, y), h * 0.3 + 0.5, h * 0.3 + 0.5);
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
        painter.fillRect(QRectF(left, baseline - h * 0.7, std::max(w, 0.5), std::max(h * 0.5, 0.5)),
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
