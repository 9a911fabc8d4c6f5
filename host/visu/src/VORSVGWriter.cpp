#include "VORSVGWriter.h"

#include <cmath>
#include <cstdio>
#include <numbers>
#include <sstream>

#include "VORFileIO.h"
#include "VORViewer.h"

namespace {

std::string Num(double v) {
  if (std::fabs(v) < 5e-7)
    v = 0.0;
  char buffer[32];
  std::snprintf(buffer, sizeof buffer, "%.6g", v);
  return buffer;
}

std::string Colour(const VORColorRGB& c) {
  char buffer[8];
  std::snprintf(buffer, sizeof buffer, "#%02x%02x%02x", c.r, c.g, c.b);
  return buffer;
}

std::string Escape(const std::string& text) {
  std::string out;
  for (char c : text) {
    switch (c) {
      case '&':
        out += "&amp;";
        break;
      case '<':
        out += "&lt;";
        break;
      case '>':
        out += "&gt;";
        break;
      case '"':
        out += "&quot;";
        break;
      default:
        out += c;
    }
  }
  return out;
}

std::string Base64(const std::string& bytes) {
  static const char* table = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
  std::string out;
  size_t i = 0;
  for (; i + 2 < bytes.size(); i += 3) {
    const unsigned v = (static_cast<unsigned char>(bytes[i]) << 16) |
                       (static_cast<unsigned char>(bytes[i + 1]) << 8) |
                       static_cast<unsigned char>(bytes[i + 2]);
    out += table[(v >> 18) & 63];
    out += table[(v >> 12) & 63];
    out += table[(v >> 6) & 63];
    out += table[v & 63];
  }
  if (i < bytes.size()) {
    unsigned v = static_cast<unsigned char>(bytes[i]) << 16;
    if (i + 1 < bytes.size())
      v |= static_cast<unsigned char>(bytes[i + 1]) << 8;
    out += table[(v >> 18) & 63];
    out += table[(v >> 12) & 63];
    out += i + 1 < bytes.size() ? table[(v >> 6) & 63] : '=';
    out += '=';
  }
  return out;
}

// Highlight colours drawn over an item's own colour.
const VORColorRGB kPreselected{240, 140, 20};
const VORColorRGB kSelected{220, 30, 30};

std::string Attributes(const VORRenderItem& item) {
  std::string classes = item.tag;
  if (item.highlight & VORHighlightPreselected)
    classes += classes.empty() ? "pso" : " pso";
  if (item.highlight & VORHighlightSelected)
    classes += classes.empty() ? "hso" : " hso";
  std::string out;
  if (!classes.empty())
    out += " class=\"" + Escape(classes) + "\"";
  return out;
}

std::string Stroke(const VORRenderItem& item) {
  VORColorRGB c = item.color;
  if (item.highlight & VORHighlightSelected)
    c = kSelected;
  else if (item.highlight & VORHighlightPreselected)
    c = kPreselected;
  std::string out = " stroke=\"" + Colour(c) + "\" stroke-width=\"" + Num(item.thickness) +
                    "\" vector-effect=\"non-scaling-stroke\"";
  if (item.alpha < 255)
    out += " stroke-opacity=\"" + Num(item.alpha / 255.0) + "\"";
  switch (item.lineType) {
    case VORLineDashed:
      out += " stroke-dasharray=\"6 3\"";
      break;
    case VORLineDotted:
      out += " stroke-dasharray=\"1 2\"";
      break;
    case VORLineDashDot:
      out += " stroke-dasharray=\"6 2 1 2\"";
      break;
    default:
      break;
  }
  return out;
}

std::string Fill(const VORRenderItem& item) {
  std::string out = " fill=\"" + Colour(item.color) + "\"";
  if (item.alpha < 255)
    out += " fill-opacity=\"" + Num(item.alpha / 255.0) + "\"";
  return out;
}

std::string Points(const VORRenderItem& item) {
  std::string out;
  for (const VORMathPoint2D& p : item.points) {
    if (!out.empty())
      out += ' ';
    out += Num(p.x) + "," + Num(-p.y);
  }
  return out;
}

void WriteMarker(std::ostringstream& os, const VORRenderItem& item) {
  const double x = item.points[0].x;
  const double y = -item.points[0].y;
  const double h = item.markerSize * 0.5;
  const std::string attrs = Attributes(item);
  switch (item.marker) {
    case 4:
      os << "<circle" << attrs << " cx=\"" << Num(x) << "\" cy=\"" << Num(y) << "\" r=\"" << Num(h)
         << "\"" << Fill(item) << "/>\n";
      break;
    case 5:
      os << "<rect" << attrs << " x=\"" << Num(x - h) << "\" y=\"" << Num(y - h) << "\" width=\""
         << Num(2 * h) << "\" height=\"" << Num(2 * h) << "\"" << Fill(item) << "/>\n";
      break;
    case 6:
      os << "<polygon" << attrs << " points=\"" << Num(x - h) << "," << Num(y + h) << " "
         << Num(x + h) << "," << Num(y + h) << " " << Num(x) << "," << Num(y - h) << "\""
         << Fill(item) << "/>\n";
      break;
    default: {
      std::string d;
      const bool plus = item.marker == 1 || item.marker == 3;
      const bool cross = item.marker == 2 || item.marker == 3;
      if (plus)
        d += "M" + Num(x - h) + " " + Num(y) + "H" + Num(x + h) + "M" + Num(x) + " " + Num(y - h) +
             "V" + Num(y + h);
      if (cross)
        d += "M" + Num(x - h) + " " + Num(y - h) + "L" + Num(x + h) + " " + Num(y + h) + "M" +
             Num(x - h) + " " + Num(y + h) + "L" + Num(x + h) + " " + Num(y - h);
      if (d.empty()) {
        os << "<circle" << attrs << " cx=\"" << Num(x) << "\" cy=\"" << Num(y) << "\" r=\""
           << Num(h * 0.3) << "\"" << Fill(item) << "/>\n";
      } else {
        os << "<path" << attrs << " d=\"" << d << "\" fill=\"none\"" << Stroke(item) << "/>\n";
      }
    }
  }
}

void WriteArc(std::ostringstream& os, const VORRenderItem& item) {
  const double cx = item.points[0].x;
  const double cy = item.points[0].y;
  const double r = item.radius;
  const std::string attrs = Attributes(item);
  const std::string fill = item.closed ? Fill(item) : std::string(" fill=\"none\"");
  const double span = item.endAngle - item.startAngle;
  if (span >= 2.0 * std::numbers::pi - 1e-6) {
    os << "<circle" << attrs << " cx=\"" << Num(cx) << "\" cy=\"" << Num(-cy) << "\" r=\"" << Num(r)
       << "\"" << fill << Stroke(item) << "/>\n";
    return;
  }
  const double x0 = cx + r * std::cos(item.startAngle);
  const double y0 = cy + r * std::sin(item.startAngle);
  const double x1 = cx + r * std::cos(item.endAngle);
  const double y1 = cy + r * std::sin(item.endAngle);
  // Counter-clockwise in model coordinates is clockwise once y is flipped: sweep flag 0.
  os << "<path" << attrs << " d=\"M" << Num(x0) << " " << Num(-y0) << "A" << Num(r) << " " << Num(r)
     << " 0 " << (span > std::numbers::pi ? 1 : 0) << " 0 " << Num(x1) << " " << Num(-y1)
     << (item.closed ? "Z" : "") << "\"" << fill << Stroke(item) << "/>\n";
}

void WriteImage(std::ostringstream& os, const VORRenderItem& item) {
  if (!item.image)
    return;
  std::string png;
  if (!item.alphaMode && item.image->GetFormat() == VORPixelImage::RGBA) {
    // Drawn opaque: drop the alpha channel from a copy.
    auto copy = VORPixelImage_var::Adopt(VORPixelImage::Create(
        item.image->GetWidth(), item.image->GetHeight(), VORPixelImage::RGBA));
    copy->Pixels() = item.image->GetPixels();
    copy->Convert(VORPixelImage::RGB);
    png = copy->EncodePNG();
  } else {
    png = item.image->EncodePNG();
  }
  os << "<image" << Attributes(item) << " x=\"" << Num(item.box.xmin) << "\" y=\""
     << Num(-item.box.ymax) << "\" width=\"" << Num(item.box.Width()) << "\" height=\""
     << Num(item.box.Height()) << "\" preserveAspectRatio=\"none\" href=\"data:image/png;base64,"
     << Base64(png) << "\"/>\n";
}

void WriteText(std::ostringstream& os, const VORRenderItem& item) {
  // The fixed-pitch box decides: start at its left end on its baseline, stretched to its width.
  os << "<text" << Attributes(item) << " x=\"" << Num(item.box.xmin) << "\" y=\""
     << Num(-item.box.ymin) << "\" font-family=\"monospace\" font-size=\"" << Num(item.textHeight)
     << "\" textLength=\"" << Num(item.box.Width()) << "\" lengthAdjust=\"spacingAndGlyphs\""
     << Fill(item) << ">" << Escape(item.text.ConvertToUTF8()) << "</text>\n";
}

}  // namespace

namespace VORSVGWriter {

std::string ToString(const VORRenderList& list, const VORSVGOptions& options, float r, float g,
                     float b) {
  VORBox2D box = list.GetBoundingBox();
  if (box.IsEmpty())
    box = VORBox2D(0.0, 0.0, 0.0, 0.0);
  box = box.Inflated(options.margin);
  std::ostringstream os;
  os << "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
     << "<svg xmlns=\"http://www.w3.org/2000/svg\" version=\"1.1\" viewBox=\"" << Num(box.xmin)
     << " " << Num(-box.ymax) << " " << Num(box.Width()) << " " << Num(box.Height())
     << "\" width=\"" << Num(box.Width() * options.pixelsPerUnit) << "\" height=\""
     << Num(box.Height() * options.pixelsPerUnit) << "\">\n";
  if (options.background && r >= 0.0f) {
    const VORColorRGB bg{static_cast<std::uint8_t>(std::lround(r * 255.0f)),
                         static_cast<std::uint8_t>(std::lround(g * 255.0f)),
                         static_cast<std::uint8_t>(std::lround(b * 255.0f))};
    os << "<rect class=\"background\" x=\"" << Num(box.xmin) << "\" y=\"" << Num(-box.ymax)
       << "\" width=\"" << Num(box.Width()) << "\" height=\"" << Num(box.Height()) << "\" fill=\""
       << Colour(bg) << "\"/>\n";
  }
  for (const VORRenderItem& item : list.Items()) {
    const std::string attrs = Attributes(item);
    switch (item.kind) {
      case VORPrimitiveKind::Line:
        os << "<line" << attrs << " x1=\"" << Num(item.points[0].x) << "\" y1=\""
           << Num(-item.points[0].y) << "\" x2=\"" << Num(item.points[1].x) << "\" y2=\""
           << Num(-item.points[1].y) << "\"" << Stroke(item) << "/>\n";
        break;
      case VORPrimitiveKind::Polyline:
        os << "<polyline" << attrs << " points=\"" << Points(item) << "\" fill=\"none\""
           << Stroke(item) << "/>\n";
        break;
      case VORPrimitiveKind::Polygon:
        if (item.filled)
          os << "<polygon" << attrs << " points=\"" << Points(item) << "\"" << Fill(item)
             << " stroke=\"none\"/>\n";
        else
          os << "<polygon" << attrs << " points=\"" << Points(item) << "\" fill=\"none\""
             << Stroke(item) << "/>\n";
        break;
      case VORPrimitiveKind::Arc:
        WriteArc(os, item);
        break;
      case VORPrimitiveKind::Marker:
        WriteMarker(os, item);
        break;
      case VORPrimitiveKind::Text:
        WriteText(os, item);
        break;
      case VORPrimitiveKind::Image:
        WriteImage(os, item);
        break;
    }
  }
  os << "</svg>\n";
  return os.str();
}

std::string ToString(VORViewer& viewer, const VORSVGOptions& options) {
  float r = 1.0f;
  float g = 1.0f;
  float b = 1.0f;
  viewer.GetBackgroundColor(r, g, b);
  return ToString(viewer.GetRenderList(), options, r, g, b);
}

bool WriteFile(VORViewer& viewer, const std::string& path, std::string& error,
               const VORSVGOptions& options) {
  return VORWriteFileAtomically(path, ToString(viewer, options), error, false);
}

}  // namespace VORSVGWriter
