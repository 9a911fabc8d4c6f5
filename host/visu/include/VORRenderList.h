// The flattened scene: every shown primitive in drawing order, in model coordinates, with its
// bounding box for culling. The SVG writer and the on-screen painter both draw from it, so what
// tests check is what is painted.
#pragma once

#include <string>
#include <vector>

#include "VORGraphicAttribute.h"
#include "VORMath2D.h"
#include "VORPixelImage.h"
#include "VORUnicodeString.h"

class VOR2DRep;

enum class VORPrimitiveKind { Line, Polyline, Polygon, Arc, Marker, Text, Image };

// Highlight flags of an item: its rep stands for an object of the preselected or highlighted set.
enum VORHighlight { VORHighlightNone = 0, VORHighlightPreselected = 1, VORHighlightSelected = 2 };

struct VORRenderItem {
  VORPrimitiveKind kind = VORPrimitiveKind::Line;
  // Line: 2 points; Polyline and Polygon: n points; Arc: centre; Marker: position; Text: anchor;
  // Image: lower-left and upper-right corners.
  std::vector<VORMathPoint2D> points;
  bool closed = false;  // polyline closed / arc closed by its chord
  bool filled = false;
  double radius = 0.0;      // arc
  double startAngle = 0.0;  // arc, radians, counter-clockwise in model coordinates
  double endAngle = 0.0;
  int marker = 0;           // marker symbol code
  double markerSize = 0.0;  // marker extent in model units
  VORUnicodeString text;    // text
  double textHeight = 0.0;  // text, model units
  int anchor = 0;           // text anchor code (VORTextMetric)
  VORPixelImage_var image;  // image
  bool alphaMode = false;   // image drawn with its alpha channel
  VORColorRGB color;
  int alpha = 255;
  double thickness = 1.0;  // pixels
  int lineType = VORLineSolid;
  int highlight = VORHighlightNone;
  VORBox2D box;                   // model coordinates
  const VOR2DRep* rep = nullptr;  // the leaf rep that produced the item
  std::string tag;                // tag of the nearest tagged rep (for styling and tests)
};

class VORRenderList {
 public:
  const std::vector<VORRenderItem>& Items() const { return _items; }
  int Size() const { return static_cast<int>(_items.size()); }
  void Clear() {
    _items.clear();
    _box = VORBox2D();
    _pendingBox = false;
  }
  // Appends an item (its box must be set by the caller before the next Add).
  VORRenderItem& Add(VORPrimitiveKind kind);
  void Close();  // finishes the last item (extends the list box)
  const VORBox2D& GetBoundingBox() const { return _box; }
  // Indexes of the items whose box meets area, in drawing order.
  std::vector<int> Cull(const VORBox2D& area) const;

 private:
  std::vector<VORRenderItem> _items;
  VORBox2D _box;
  bool _pendingBox = false;
};
