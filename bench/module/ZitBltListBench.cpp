// One model change under one activity of a level of stations whose list ZitBlts are all built
// (bundled configuration): an input added to one station refreshes that station's lists and its
// ancestors', and nothing else. Run with VORStartupPath set to resources/ and VOR_MODULE_PATH to
// the build's lib/.
#include <benchmark/benchmark.h>

#include <string>
#include <vector>

#include "QELBaseScrollListZitBltRep.h"
#include "QELIZitBltMgr.h"
#include "QELZitBltConfiguration.h"
#include "QELZitBltRep.h"
#include "VORDeferredDeletion.h"
#include "VORDocument.h"
#include "VORModelDoor.h"
#include "VORModuleLoader.h"
#include "VORViewer.h"

namespace {

// count stations on one level, each with one assigned input, one output and one resource.
struct StationsWithLists {
  explicit StationsWithLists(int count)
      : doc(VORProcess_var::Adopt(VORProcess::CreateNew("Line"))),
        viewer(VORHandle<VORViewer>::Adopt(new VORViewer(nullptr, "bench", 0, 800, 500, 0))) {
    VORModelDoor& door = doc->GetDoor();
    VORBaseUnknown_var root = doc->GetRootProcess();
    VORBaseUnknown_var products = doc->GetRootProduct();
    for (int i = 0; i < count; ++i) {
      const std::string n = std::to_string(i);
      VORBaseUnknown_var station, part, assembly, robot, input, output;
      door.CreateNode(root, "BIWActivityStation", station);
      door.SetPertPosition(station, true, 12.5 + 50.0 * (i % 100), 12.5 + 25.0 * (i / 100));
      door.CreateProduct(products, ("Part " + n).c_str(), part);
      door.CreateProduct(products, ("Assembly " + n).c_str(), assembly);
      door.CreateProduct(products, ("Robot " + n).c_str(), robot);
      door.MakeResource(robot, "Robot", "");
      door.AddProductIO(station, part, true, input);
      door.AssignItem(station, part, input);
      door.AddProductIO(station, assembly, false, output);
      door.AssignResource(station, robot);
      stations.push_back(station);
    }
    door.CreateProduct(products, "Extra part", extra);
    for (const VORBaseUnknown_var& s : stations) {
      managers.emplace_back(s);
      managers.back()->BuildZitBltReps(viewer);
    }
  }
  ~StationsWithLists() {
    for (const QELIZitBltMgr_var& m : managers)
      m->RemoveZitBlts();
    VORDeferredDeletion::Drain();
  }
  int InputLines(int index) {
    QELZitBltRep* rep = nullptr;
    managers[static_cast<size_t>(index)]->GetZitBlt("ProductInput", &rep);
    QELBaseScrollListZitBltRep* list = rep ? rep->GetScrollListRep() : nullptr;
    return list ? list->GetItems().Size() : -1;
  }

  VORProcess_var doc;
  VORHandle<VORViewer> viewer;
  std::vector<VORBaseUnknown_var> stations;
  std::vector<QELIZitBltMgr_var> managers;
  VORBaseUnknown_var extra;
};

void BM_InputAddedRefreshesItsLists(benchmark::State& state) {
  VORModuleLoader::LoadModule("QELZitBltModel");
  QELZitBltConfiguration::ForgetForTests();
  const int count = static_cast<int>(state.range(0));
  StationsWithLists level(count);
  const int target = count / 2;
  VORModelDoor& door = level.doc->GetDoor();
  int lines = 0;
  for (auto _ : state) {
    VORBaseUnknown_var input;
    door.AddProductIO(level.stations[static_cast<size_t>(target)], level.extra, true, input);
    state.PauseTiming();
    lines = level.InputLines(target);
    door.RemoveProductIO(input);
    VORDeferredDeletion::Drain();
    state.ResumeTiming();
  }
  // The station's input list (its assigned input; the new input's item is not assigned).
  state.counters["input_lines"] = lines;
  state.counters["stations"] = count;
}
BENCHMARK(BM_InputAddedRefreshesItsLists)->Arg(1000)->Arg(10000)->Unit(benchmark::kMicrosecond);

}  // namespace
