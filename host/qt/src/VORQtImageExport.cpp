#include "VORQtImageExport.h"

#include <QBuffer>
#include <QGuiApplication>
#include <QPainter>
#include <algorithm>
#include <cmath>
#include <memory>

#include "VORFileIO.h"
#include "VORQtScenePainter.h"
#include "VORViewer.h"

namespace VORQtImageExport {

void EnsureGuiApplication() {
  if (QCoreApplication::instance() != nullptr)
    return;
  if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
    qputenv("QT_QPA_PLATFORM", "offscreen");
  static int argc = 1;
  static char name[] = "pfv";
  static char* argv[] = {name, nullptr};
  static std::unique_ptr<QGuiApplication> app = std::make_unique<QGuiApplication>(argc, argv);
}

QImage Render(const VORRenderList& list, float r, float g, float b, const Options& options) {
  EnsureGuiApplication();
  VORBox2D box = list.GetBoundingBox();
  if (box.IsEmpty())
    box = VORBox2D(0.0, 0.0, 0.0, 0.0);
  box = box.Inflated(options.margin);
  double ppu = options.pixelsPerUnit > 0.0 ? options.pixelsPerUnit : 10.0;
  const double longest = std::max(box.Width(), box.Height()) * ppu;
  if (longest > options.maxPixels)
    ppu *= options.maxPixels / longest;
  const int limit = std::max(1, options.maxPixels);
  const int width = std::clamp(static_cast<int>(std::ceil(box.Width() * ppu)), 1, limit);
  const int height = std::clamp(static_cast<int>(std::ceil(box.Height() * ppu)), 1, limit);
  QImage image(width, height, QImage::Format_ARGB32_Premultiplied);
  if (image.isNull())
    return image;
  QPainter painter(&image);
  painter.setRenderHint(QPainter::Antialiasing, options.antialias);
  painter.setRenderHint(QPainter::TextAntialiasing, true);
  const QRectF all(0, 0, width, height);
  if (r >= 0.0f)
    VORQtScenePainter::PaintBackground(painter, all, r, g, b);
  else
    image.fill(Qt::transparent);
  VORQtViewTransform view;
  view.centreX = box.CentreX();
  view.centreY = box.CentreY();
  view.scale = ppu;
  view.width = width;
  view.height = height;
  VORQtScenePainter scene;
  scene.Paint(painter, list, view, all);
  painter.end();
  return image;
}

QImage Render(VORViewer& viewer, const Options& options) {
  float r = 1.0f;
  float g = 1.0f;
  float b = 1.0f;
  viewer.GetBackgroundColor(r, g, b);
  return Render(viewer.GetRenderList(), r, g, b, options);
}

bool WritePNG(VORViewer& viewer, const std::string& path, std::string& error,
              const Options& options) {
  const QImage image = Render(viewer, options);
  if (image.isNull()) {
    error = path + ": the picture is too large to be made";
    return false;
  }
  QByteArray bytes;
  QBuffer buffer(&bytes);
  buffer.open(QIODevice::WriteOnly);
  if (!image.save(&buffer, "PNG")) {
    error = path + ": PNG encoding failed";
    return false;
  }
  return VORWriteFileAtomically(path, bytes.toStdString(), error, false);
}

}  // namespace VORQtImageExport
