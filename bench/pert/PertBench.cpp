// Building a 10,000-node chart and picking in it (targets: build < 200 ms, pick < 1 ms).
#include <benchmark/benchmark.h>

#include "QELPertChart.h"
#include "QELPertViewer.h"
#include "VORDeferredDeletion.h"
#include "VORDocument.h"
#include "VORModelDoor.h"

namespace {

// One level of n stations on a 100-column grid, each linked to its right neighbour.
struct Line {
  explicit Line(int n) {
    doc = VORProcess_var::Adopt(VORProcess::CreateNew("Bench"));
    root = doc->GetRootProcess();
    VORModelDoor& door = doc->GetDoor();
    VORBaseUnknown_var previous;
    for (int i = 0; i < n; ++i) {
      VORBaseUnknown_var node;
      door.CreateNode(root, "BIWActivityStation", node);
      door.SetLabel(node, VORUnicodeString("ST" + std::to_string(i)));
      door.SetPertPosition(node, true, 12.5 + 50.0 * (i % 100), 12.5 + 25.0 * (i / 100));
      if (previous && i % 100 != 0)
        door.AddFlow(previous, node);
      previous = node;
    }
  }
  VORProcess_var doc;
  VORBaseUnknown_var root;
};

Line& TenThousand() {
  static Line line(10000);
  return line;
}

VORHandle<QELPertViewer> NewViewer() {
  return VORHandle<QELPertViewer>::Adopt(new QELPertViewer(nullptr, "bench", 0, 800, 500, 0));
}

void BM_BuildChart10k(benchmark::State& state) {
  Line& line = TenThousand();
  auto viewer = NewViewer();
  for (auto _ : state) {
    auto controller =
        VORHandle<QELPertController>::Adopt(QELPertBuildChart(line.root, viewer, PertModeEditable));
    benchmark::DoNotOptimize(controller->GetNodeCount());
    state.PauseTiming();
    controller->RemoveAllPertNodes();
    controller = NULL_var;
    VORDeferredDeletion::Drain();
    state.ResumeTiming();
  }
  state.counters["nodes"] = 10000;
}
BENCHMARK(BM_BuildChart10k)->Unit(benchmark::kMillisecond);

struct Chart {
  Chart() {
    viewer = NewViewer();
    controller = VORHandle<QELPertController>::Adopt(
        QELPertBuildChart(TenThousand().root, viewer, PertModeEditable));
    viewer->Reframe();
    // Zoom on a node near the middle of the chart so that the pick tolerance is a few units.
    viewer->GetMain2DViewpoint()->SetScale(4.0);
    viewer->GetMain2DViewpoint()->SetCentre(12.5 + 50.0 * 50, 12.5 + 25.0 * 50);
  }
  VORHandle<QELPertViewer> viewer;
  VORHandle<QELPertController> controller;
};

Chart& TheChart() {
  static Chart chart;
  return chart;
}

void BM_PickInChart10k(benchmark::State& state) {
  Chart& chart = TheChart();
  size_t found = 0;
  for (auto _ : state) {
    std::vector<VORPathElement_var> paths = chart.viewer->PickPaths(400.0, 250.0);
    found = paths.size();
    benchmark::DoNotOptimize(found);
  }
  if (found != 1)
    state.SkipWithError("the pick did not find exactly one node");
}
BENCHMARK(BM_PickInChart10k)->Unit(benchmark::kMicrosecond);

void BM_PickBackground10k(benchmark::State& state) {
  Chart& chart = TheChart();
  for (auto _ : state) {
    // Between two rows: every node box is tested and none is hit.
    std::vector<VORPathElement_var> paths = chart.viewer->PickPaths(400.0, 250.0 - 50.0);
    benchmark::DoNotOptimize(paths.size());
  }
}
BENCHMARK(BM_PickBackground10k)->Unit(benchmark::kMicrosecond);

void BM_RenderList10k(benchmark::State& state) {
  Chart& chart = TheChart();
  for (auto _ : state) {
    chart.viewer->Draw();
    chart.controller->GetChartRep()->Invalidate();  // forces a rebuild
    benchmark::DoNotOptimize(chart.viewer->GetRenderList().Size());
  }
}
BENCHMARK(BM_RenderList10k)->Unit(benchmark::kMillisecond);

void BM_DragStep10k(benchmark::State& state) {
  Chart& chart = TheChart();
  VORViewer* viewer = chart.viewer;
  viewer->OnMousePress(400.0, 250.0, VORMouseLeft);
  double x = 400.0;
  for (auto _ : state) {
    x += (static_cast<int>(x) % 2 == 0) ? 5.0 : -5.0;
    viewer->OnMouseMove(x, 250.0);
  }
  viewer->OnMouseRelease(x, 250.0, VORMouseLeft);
}
BENCHMARK(BM_DragStep10k)->Unit(benchmark::kMicrosecond);

}  // namespace
