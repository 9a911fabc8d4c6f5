// Writes a viewer's render list as an SVG document: one element per primitive, in drawing order,
// model y flipped to SVG's downward y, images embedded as PNG data. Each element carries the
// class of its rep's tag (and "pso"/"hso" when highlighted), so tests and style sheets can find
// node boxes, links and labels.
#pragma once

#include <string>

#include "VORRenderList.h"

class VORViewer;

struct VORSVGOptions {
  double pixelsPerUnit = 10.0;  // width/height attributes = model extent * pixelsPerUnit
  double margin = 2.0;          // model units around the scene
  bool background = true;       // paint the viewer's background colour
};

namespace VORSVGWriter {
// The SVG text of the viewer's scene.
std::string ToString(VORViewer& viewer, const VORSVGOptions& options = {});
// The SVG text of a render list on a background colour (r, g, b in 0..1; negative: none).
std::string ToString(const VORRenderList& list, const VORSVGOptions& options, float r = -1.0f,
                     float g = 0.0f, float b = 0.0f);
// Writes the viewer's scene to path atomically; false with a reason in error.
bool WriteFile(VORViewer& viewer, const std::string& path, std::string& error,
               const VORSVGOptions& options = {});
}  // namespace VORSVGWriter
