// PNG pictures of a viewer's scene, painted by the same routine as the window. Works without a
// window: when no Qt application exists yet, an offscreen one is made for the fonts.
#pragma once

#include <QImage>
#include <string>

#include "VORRenderList.h"

class VORViewer;

namespace VORQtImageExport {

struct Options {
  double pixelsPerUnit = 10.0;  // as the SVG writer's default
  double margin = 2.0;          // model units around the scene
  int maxPixels = 8192;         // longest side; larger scenes are scaled down to fit
  bool antialias = true;
};

// The whole scene (its bounding box plus margin) on the background colour (r, g, b in 0..1).
QImage Render(const VORRenderList& list, float r, float g, float b, const Options& options = {});
QImage Render(VORViewer& viewer, const Options& options = {});
// Writes the viewer's scene to path as PNG, atomically; false with a reason in error.
bool WritePNG(VORViewer& viewer, const std::string& path, std::string& error,
              const Options& options = {});
// Makes sure a Qt GUI application exists (an offscreen one when there is none).
void EnsureGuiApplication();

}  // namespace VORQtImageExport
