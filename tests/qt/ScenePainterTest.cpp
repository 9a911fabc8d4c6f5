// The painter draws what the render list says, with the product's fixed-pitch text metric, and
// skips what is off screen; the PNG export paints the whole scene the same way.
#include <gtest/gtest.h>

#include <QImage>
#include <QPainter>

#include "TempDir.h"
#include "VORPixelImage.h"
#include "VORQtImageExport.h"
#include "VORQtScenePainter.h"
#include "VORTextMetric.h"

namespace {

VORRenderItem& AddBox(VORRenderList& list, double x0, double y0, double x1, double y1,
                      VORColorRGB colour) {
  VORRenderItem& item = list.Add(VORPrimitiveKind::Polygon);
  item.points = {{x0, y0}, {x1, y0}, {x1, y1}, {x0, y1}};
  item.filled = true;
  item.color = colour;
  item.box = VORBox2D(x0, y0, x1, y1);
  return item;
}

// The box of the pixels that differ from white.
QRect InkBounds(const QImage& image) {
  QRect ink;
  for (int y = 0; y < image.height(); ++y)
    for (int x = 0; x < image.width(); ++x)
      if (image.pixelColor(x, y) != QColor(Qt::white))
        ink |= QRect(x, y, 1, 1);
  return ink;
}

QImage Paint(const VORRenderList& list, const VORQtViewTransform& view,
             VORQtPaintStatistics* stats = nullptr) {
  QImage image(static_cast<int>(view.width), static_cast<int>(view.height), QImage::Format_RGB32);
  image.fill(Qt::white);
  QPainter painter(&image);
  VORQtScenePainter scene;
  const VORQtPaintStatistics s = scene.Paint(painter, list, view);
  if (stats != nullptr)
    *stats = s;
  return image;
}

VORQtViewTransform View(double cx, double cy, double scale, int w, int h) {
  VORQtViewTransform view;
  view.centreX = cx;
  view.centreY = cy;
  view.scale = scale;
  view.width = w;
  view.height = h;
  return view;
}

}  // namespace

TEST(ScenePainterTest, TextFillsItsFixedPitchBoxOnTheBaseline) {
  VORQtImageExport::EnsureGuiApplication();
  for (const char* text : {"MMMMMMMMMM", "Station 10", "WW"}) {
    VORRenderList list;
    VORRenderItem& item = list.Add(VORPrimitiveKind::Text);
    item.text = text;
    item.textHeight = 2.0;
    item.points = {{0.0, 0.0}};
    item.box = VORTextMetric::TextBox(0.0, 0.0, item.text, 2.0, 2);
    list.Close();
    const VORQtViewTransform view = View(0.0, 0.0, 12.0, 400, 100);
    const QRect ink = InkBounds(Paint(list, view));
    const QRectF box = view.ToPixels(item.box);
    ASSERT_FALSE(ink.isEmpty()) << text;
    // Glyphs sit inside their character cells: the ink spans the box less the side bearings.
    EXPECT_GE(ink.left(), box.left() - 1.0) << text;
    EXPECT_LE(ink.right(), box.right() + 1.0) << text;
    EXPECT_GT(ink.width(), box.width() - VORTextMetric::CharacterWidth(2.0) * 12.0) << text;
    EXPECT_LE(ink.bottom(), box.bottom() + 1.0) << text << ": nothing below the baseline";
    EXPECT_GE(ink.top(), box.top() - 2.0) << text;
  }
}

TEST(ScenePainterTest, OnlyWhatMeetsThePaintedAreaIsDrawn) {
  VORRenderList list;
  for (int i = 0; i < 1000; ++i)
    AddBox(list, i * 10.0, 0.0, i * 10.0 + 5.0, 5.0, {40, 80, 210});
  list.Close();
  VORQtPaintStatistics stats;
  // 100 pixels around x = 50 at one pixel per unit: boxes 0..9 and a neighbour at the edge.
  const QImage image = Paint(list, View(50.0, 2.5, 1.0, 100, 20), &stats);
  EXPECT_EQ(stats.items, 1000);
  EXPECT_LE(stats.drawn, 12);
  EXPECT_GE(stats.drawn, 10);
  EXPECT_EQ(stats.drawn + stats.culled, 1000);
  EXPECT_EQ(image.pixelColor(2, 10), QColor(40, 80, 210));
  EXPECT_EQ(image.pixelColor(7, 10), QColor(Qt::white));
}

TEST(ScenePainterTest, HighlightImagesAndMarkersArePainted) {
  VORQtImageExport::EnsureGuiApplication();
  VORRenderList list;
  VORRenderItem& line = list.Add(VORPrimitiveKind::Line);
  line.points = {{-40.0, 10.0}, {40.0, 10.0}};
  line.thickness = 3.0;
  line.highlight = VORHighlightSelected;
  line.box = VORBox2D(-40.0, 10.0, 40.0, 10.0);
  VORRenderItem& picture = list.Add(VORPrimitiveKind::Image);
  auto pixels = VORPixelImage_var::Adopt(VORPixelImage::Create(2, 2, VORPixelImage::RGB, 0));
  for (int i = 0; i < 4; ++i)
    pixels->Pixels()[3 * i] = 255;  // red
  picture.image = pixels;
  picture.points = {{-10.0, -20.0}, {10.0, -10.0}};
  picture.box = VORBox2D(-10.0, -20.0, 10.0, -10.0);
  VORRenderItem& marker = list.Add(VORPrimitiveKind::Marker);
  marker.marker = 5;
  marker.markerSize = 4.0;
  marker.points = {{30.0, -15.0}};
  marker.color = {30, 160, 60};
  marker.box = VORBox2D(28.0, -17.0, 32.0, -13.0);
  list.Close();
  const QImage image = Paint(list, View(0.0, 0.0, 2.0, 200, 100));
  EXPECT_EQ(image.pixelColor(100, 30), VORQtSelectedColor());
  EXPECT_EQ(image.pixelColor(100, 80), QColor(255, 0, 0));
  EXPECT_EQ(image.pixelColor(160, 80), QColor(30, 160, 60));
}

TEST(ScenePainterTest, ThePngExportCoversTheSceneAtTheRequestedResolution) {
  VORRenderList list;
  AddBox(list, 0.0, 0.0, 20.0, 10.0, {250, 250, 240});
  list.Close();
  VORQtImageExport::Options options;
  options.pixelsPerUnit = 5.0;
  options.margin = 2.0;
  const QImage image = VORQtImageExport::Render(list, 0.0f, 0.0f, 1.0f, options);
  EXPECT_EQ(image.size(), QSize(120, 70));
  EXPECT_EQ(image.pixelColor(1, 1), QColor(0, 0, 255)) << "background in the margin";
  EXPECT_EQ(image.pixelColor(60, 35), QColor(250, 250, 240));
  options.maxPixels = 60;
  EXPECT_EQ(VORQtImageExport::Render(list, 0.0f, 0.0f, 1.0f, options).width(), 60)
      << "a huge scene is scaled down";
}
