// Grouping 100 consecutive stations of a 10,000-station level while the Product Flow Viewer
// shows it, timed from OK to the chart refreshed (deferred work drained); the picks and the
// undo that restores the level between iterations are not timed. Run with VORStartupPath set
// to resources/ and VOR_MODULE_PATH to the build's lib/.
#include <benchmark/benchmark.h>

#include <string>

#include "ChainLevel.h"

namespace {

constexpr int kGroupStart = 5000;
constexpr int kGroupSize = 100;

// S0 -> S1 -> ... with cycle times.
std::string ChainFile(int n) {
  return SaveChainLevel("/tmp/pfv-grouping-bench-" + std::to_string(n) + ".pprx", n,
                        [](VORModelDoor& door, VORProcess&, VORBaseUnknown_var& station, int i) {
                          door.SetStationCycleTime(station, 30.0 + i % 7);
                        });
}

void BM_GroupConsecutiveStations(benchmark::State& state) {
  VORDriver driver;
  if (!OpenInViewer(driver, ChainFile(static_cast<int>(state.range(0))))) {
    state.SkipWithError(("cannot open the viewer: " + driver.LastError()).c_str());
    return;
  }
  for (auto _ : state) {
    state.PauseTiming();
    // The level picked to open the viewer stays selected; the first pick replaces it.
    bool picked = driver.StartCommand("QELFpaPertGrpActCmd");
    for (int i = kGroupStart; picked && i < kGroupStart + kGroupSize; ++i)
      picked = driver.PickObject(StationLabel(i));
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
