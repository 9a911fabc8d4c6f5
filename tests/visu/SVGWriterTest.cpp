#include <regex>
#include <string>

#include "VOR2DArcCircleRep.h"
#include "VOR2DCustomRep.h"
#include "VOR2DImagePixelRep.h"
#include "VOR2DLineRep.h"
#include "VOR2DPointRep.h"
#include "VOR2DPolygonRep.h"
#include "VOR2DTextRep.h"
#include "VORSVGWriter.h"
#include "VORViewer.h"
#include "VisuTestSupport.h"

namespace {

using SVGWriterTest = VisuTest;

int Count(const std::string& text, const std::string& pattern) {
  const std::regex re(pattern);
  return static_cast<int>(
      std::distance(std::sregex_iterator(text.begin(), text.end(), re), std::sregex_iterator()));
}

std::string Attribute(const std::string& text, const std::string& element,
                      const std::string& name) {
  std::smatch m;
  const std::regex re("<" + element + "[^>]*\\s" + name + "=\"([^\"]*)\"");
  return std::regex_search(text, m, re) ? m[1].str() : std::string();
}

TEST_F(SVGWriterTest, EveryRepKindBecomesOneElementInAFlippedViewBox) {
  auto viewer = Make<VORViewer>(nullptr, "v", 0, 100, 100, 0);
  auto node = Make<VOR2DBagRep>();
  node->SetTag("PertNode");
  node->SetMatrix(VOR3x3Matrix::Translation(10.0, 20.0));
  const float box[8] = {-5, -3, 5, -3, 5, 3, -5, 3};
  auto polygon = Make<VOR2DPolygonRep>(box, 4, 1);
  polygon->SetFillColorIndex(12);
  polygon->SetColorIndex(13);
  node->AddChild(polygon);
  node->AddChild(Make<VOR2DTextRep>(VORUnicodeString("A<&>"), VORMathPoint2Df(0, 0), 2));
  viewer->AddRep(node);
  viewer->AddRep(Make<VOR2DLineRep>(0.0f, 0.0f, 10.0f, 0.0f));
  viewer->AddRep(Make<VOR2DPointRep>(1.0f, 1.0f, 4));
  viewer->AddRep(Make<VOR2DArcCircleRep>(VORMathPoint2Df(0, 0), 1.0f, 0.0f, 1.0f));
  auto link = Make<VOR2DCustomRep>();
  link->SetTag("PertLink");
  const VORMathPoint2Df pts[4] = {{0, 0}, {5, 0}, {5, 4}, {10, 4}};
  link->AddPrimitive(new VOR2DPolylineGP(pts, 4, 1), (247u << 24) | 0x041400u, 255);
  viewer->AddRep(link);
  auto image = VORPixelImage_var::Adopt(VORPixelImage::Create(2, 2, VORPixelImage::RGBA, 200));
  viewer->AddRep(Make<VOR2DImagePixelRep>(VORMathPoint2Df(-2, -2), image, 1, 0, 0, 1));
  auto hidden = Make<VOR2DLineRep>(0.0f, 0.0f, 1000.0f, 1000.0f);
  hidden->SetShowMode(1);
  viewer->AddRep(hidden);

  const std::string svg = VORSVGWriter::ToString(*viewer);
  EXPECT_EQ(Count(svg, "<svg "), 1);
  EXPECT_EQ(Count(svg, "<polygon class=\"PertNode\""), 2);  // fill and outline
  EXPECT_EQ(Count(svg, "<text class=\"PertNode\""), 1);
  EXPECT_EQ(Count(svg, "<line "), 1);  // the hidden line is not written
  EXPECT_EQ(Count(svg, "<circle "), 1);
  EXPECT_EQ(Count(svg, "<path "), 1);
  EXPECT_EQ(Count(svg, "<polyline class=\"PertLink\""), 1);
  EXPECT_EQ(Count(svg, "<image [^>]*href=\"data:image/png;base64,iVBORw0KGgo"), 1);
  EXPECT_NE(svg.find(">A&lt;&amp;&gt;</text>"), std::string::npos);
  // The scene spans x -2..15 and y -2..23; with the 2-unit margin, y flipped.
  EXPECT_EQ(Attribute(svg, "svg", "viewBox"), "-4 -25 21 29");
  // Node label centred at (10, 20): the fixed-pitch box starts 4 * 1.2 / 2 left of it and its
  // baseline is one half height below.
  EXPECT_EQ(Attribute(svg, "text", "x"), "7.6");
  EXPECT_EQ(Attribute(svg, "text", "y"), "-19");
  EXPECT_EQ(Attribute(svg, "text", "textLength"), "4.8");
  EXPECT_EQ(Attribute(svg, "polyline", "points"), "0,0 5,0 5,-4 10,-4");
  EXPECT_EQ(Attribute(svg, "polyline", "stroke"), "#9e9e9e");
}

TEST_F(SVGWriterTest, AnEmptySceneIsStillAValidDocumentAndFilesAreWritten) {
  auto viewer = Make<VORViewer>(nullptr, "v", 0, 100, 100, 0);
  const std::string svg = VORSVGWriter::ToString(*viewer);
  EXPECT_EQ(Attribute(svg, "svg", "viewBox"), "-2 -2 4 4");
  EXPECT_NE(svg.find("</svg>"), std::string::npos);
  std::string error;
  EXPECT_FALSE(VORSVGWriter::WriteFile(*viewer, "/nonexistent-dir/x.svg", error));
  EXPECT_FALSE(error.empty());
}

}  // namespace
