// Painting a 10,000-node chart into an image the size of a large chart window: the full repaint
// the window does after a pan or a zoom (target: under 50 ms), the repaint of one node's area as
// a hover or a drag step asks for, and the flattening of the scene into the render list.
#include <benchmark/benchmark.h>

#include <QImage>
#include <QPainter>
#include <string>

#include "VOR2DBagRep.h"
#include "VOR2DLineRep.h"
#include "VOR2DPolygonRep.h"
#include "VOR2DTextRep.h"
#include "VORQtImageExport.h"
#include "VORQtScenePainter.h"
#include "VORViewer.h"

namespace {

constexpr int kWidth = 1600;
constexpr int kHeight = 1000;

// Nodes on a square grid 40 units apart, each a filled box with a border and a label, linked to
// the next node of its row: what the chart of a very long line draws.
VORViewer_var MakeChart(int nodes) {
  VORQtImageExport::EnsureGuiApplication();
  auto viewer = VORViewer_var::Adopt(new VORViewer(nullptr, "Bench", 0, kWidth, kHeight, 0));
  const int columns = 100;
  for (int i = 0; i < nodes; ++i) {
    const float x = 40.0f * (i % columns);
    const float y = -40.0f * (i / columns);
    auto bag = VORHandle<VOR2DBagRep>::Adopt(new VOR2DBagRep());
    bag->SetMatrix(VOR3x3Matrix::Translation(x, y));
    const float box[] = {-10, -5, 10, -5, 10, 5, -10, 5};
    auto fill = VORHandle<VOR2DPolygonRep>::Adopt(new VOR2DPolygonRep(box, 4, 1));
    fill->SetColorIndex(12);
    auto border = VORHandle<VOR2DPolygonRep>::Adopt(new VOR2DPolygonRep(box, 4, 0));
    border->SetColorIndex(13);
    auto label = VORHandle<VOR2DTextRep>::Adopt(
        new VOR2DTextRep("ST" + std::to_string(10000 + i), VORMathPoint2Df(0.0f, 0.0f), 2, 2.0));
    label->SetColorIndex(0);
    bag->AddChild(fill);
    bag->AddChild(border);
    bag->AddChild(label);
    viewer->AddRep(bag);
    if (i % columns != columns - 1) {
      auto link = VORHandle<VOR2DLineRep>::Adopt(new VOR2DLineRep(x + 10, y, x + 30, y));
      link->SetColorIndex(14);
      viewer->AddRep(link);
    }
  }
  return viewer;
}

VORViewer& Chart() {
  static VORViewer_var chart = MakeChart(10000);
  return *chart;
}

// scale 0: the whole chart fitted into the image; else that zoom centred on node 5050.
void Repaint(benchmark::State& state, double scale, bool antialias, const QRectF& area) {
  VORViewer& viewer = Chart();
  const VORRenderList& list = viewer.GetRenderList();
  const VORBox2D box = list.GetBoundingBox();
  VORQtViewTransform view = VORQtViewTransform::Fitting(box, kWidth, kHeight, 10.0);
  if (scale > 0.0) {
    view.scale = scale;
    view.centreX = 40.0 * 50;
    view.centreY = -40.0 * 50;
  }
  QImage image(kWidth, kHeight, QImage::Format_ARGB32_Premultiplied);
  VORQtScenePainter painter;
  VORQtPaintStatistics stats;
  const QRectF target = area.isEmpty() ? QRectF(0, 0, kWidth, kHeight) : area;
  for (auto _ : state) {
    QPainter p(&image);
    p.setRenderHint(QPainter::Antialiasing, antialias);
    p.setClipRect(target);
    VORQtScenePainter::PaintBackground(p, target, 1.0f, 1.0f, 1.0f);
    stats = painter.Paint(p, list, view, target);
    p.end();
    benchmark::DoNotOptimize(image.constBits());
  }
  state.counters["items"] = stats.items;
  state.counters["drawn"] = stats.drawn;
  state.counters["greeked"] = stats.greekedTexts;
  state.counters["scale"] = view.scale;
}

// The whole chart on screen (labels too small to read are drawn as bars).
void BM_FullRepaintWholeChart(benchmark::State& state) {
  Repaint(state, 0.0, true, QRectF());
}
// The same without antialiasing.
void BM_FullRepaintWholeChartNoAntialias(benchmark::State& state) {
  Repaint(state, 0.0, false, QRectF());
}
// Zoomed so that labels are just readable (6-pixel labels, about 100 nodes on screen): culling
// skips the rest.
void BM_FullRepaintReadableLabels(benchmark::State& state) {
  Repaint(state, 3.0, true, QRectF());
}
// Zoomed in on a dozen nodes (20-pixel labels).
void BM_FullRepaintCloseUp(benchmark::State& state) {
  Repaint(state, 10.0, true, QRectF());
}
// The area one node covers at the close-up zoom, as a hover highlight or a drag step repaints it.
void BM_PartialRepaintOneNode(benchmark::State& state) {
  Repaint(state, 10.0, true, QRectF(690, 440, 220, 120));
}

// Flattening the scene into the render list after a change (the viewer's part of a repaint).
void BM_RenderListRebuild(benchmark::State& state) {
  VORViewer& viewer = Chart();
  for (auto _ : state) {
    viewer.SetBackgroundColor(1.0f, 1.0f, 1.0f);  // marks the list dirty
    benchmark::DoNotOptimize(viewer.GetRenderList().Size());
  }
}

}  // namespace

BENCHMARK(BM_FullRepaintWholeChart)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_FullRepaintWholeChartNoAntialias)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_FullRepaintReadableLabels)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_FullRepaintCloseUp)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_PartialRepaintOneNode)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_RenderListRebuild)->Unit(benchmark::kMillisecond);
