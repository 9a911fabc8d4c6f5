// Grouping 100 consecutive stations of a 10,000-station level while the Product Flow Viewer
// shows it, timed from OK to the chart refreshed (deferred work drained); the picks and the
// undo that restores the level between iterations are not timed. Run with VORStartupPath set
// to resources/ and VOR_MODULE_PATH to the build's lib/.
#include <benchmark/benchmark.h>

#include <string>

#include "VORDocument.h"
#include "VORDriver.h"
#include "VORModelDoor.h"

namespace {

constexpr int kGroupStart = 5000;
constexpr int kGroupSize = 100;

std::string Label(int i) {
  return "S" + std::to_string(i);
}

// S0 -> S1 -> ... on one level, on the chart grid.
std::string ChainFile(int n) {
  const std::string file = "/tmp/pfv-grouping-bench-" + std::to_string(n) + ".pprx";
  VORProcess_var doc = VORProcess_var::Adopt(VORProcess::CreateNew("Line"));
  VORModelDoor& door = doc->GetDoor();
  VORBaseUnknown_var root = doc->GetRootProcess();
  VORBaseUnknown_var previous;
  for (int i = 0; i < n; ++i) {
    VORBaseUnknown_var station;
    door.CreateNode(root, "BIWActivityStation", station);
    door.SetLabel(station, VORUnicodeString(Label(i)));
    door.SetPertPosition(station, true, 12.5 + 50.0 * i, 12.5);
    door.SetStationCycleTime(station, 30.0 + i % 7);
    if (previous)
      door.AddFlow(previous, station);
    previous = station;
  }
  std::string error;
  doc->SaveAs(file, error);
  return file;
}

void BM_GroupConsecutiveStations(benchmark::State& state) {
  VORDriver driver;
  if (!driver.OpenDocument(ChainFile(static_cast<int>(state.range(0)))) ||
      !driver.PickObject("Line") || !driver.StartCommand("QELFpaProductFlowViewerCmd")) {
    state.SkipWithError(("cannot open the viewer: " + driver.LastError()).c_str());
    return;
  }
  for (auto _ : state) {
    state.PauseTiming();
    // The level picked to open the viewer stays selected; the first pick replaces it.
    bool picked = driver.StartCommand("QELFpaPertGrpActCmd");
    for (int i = kGroupStart; picked && i < kGroupStart + kGroupSize; ++i)
      picked = driver.PickObject(Label(i));
    state.ResumeTiming();
    if (!picked || !driver.PressOK("QELFpaActivityGroupDlg")) {
      state.SkipWithError(("cannot group: " + driver.LastError()).c_str());
      break;
    }
    driver.DrainDeferred();
    state.PauseTiming();
    if (!driver.Undo()) {
      state.SkipWithError("the grouping was not undoable");
      break;
    }
    driver.DrainDeferred();
    state.ResumeTiming();
  }
}

}  // namespace

BENCHMARK(BM_GroupConsecutiveStations)->Arg(10000)->Unit(benchmark::kMillisecond)->Iterations(5);
