// Dropping a product input of one station on the next one, on a 10,000-station level shown by
// the Product Flow Viewer with its lists: timed from the end of the drag (the button let go)
// to the reassignment done and both stations' lists refreshed (deferred work drained). The
// pick, the drag moves and the undo that restores the level between iterations are not timed.
// Run with VORStartupPath set to resources/ and VOR_MODULE_PATH to the build's lib/.
#include <benchmark/benchmark.h>

#include <sstream>
#include <string>

#include "ChainLevel.h"
#include "QELBaseScrollListZitBltRep.h"
#include "QELIZitBltMgr.h"
#include "VORScript.h"
#include "VORViewer.h"

namespace {

constexpr int kSource = 5000;

// S0 -> S1 -> ..., each station taking its own part.
std::string ChainFile(int n) {
  return SaveChainLevel(
      "/tmp/pfv-item-drop-bench-" + std::to_string(n) + ".pprx", n,
      [](VORModelDoor& door, VORProcess& doc, VORBaseUnknown_var& station, int i) {
        VORBaseUnknown_var part, input;
        door.CreateProduct(doc.GetRootProduct(), VORUnicodeString("P" + std::to_string(i)), part);
        door.AddProductIO(station, part, true, input);
        door.AssignItem(station, part, input);
      });
}

QELBaseScrollListZitBltRep* InputList(VORDriver& driver, int station) {
  QELIZitBltMgr_var manager{VORBaseUnknown_var(driver.FindObject(StationLabel(station)))};
  QELZitBltRep* rep = nullptr;
  if (manager)
    manager->GetZitBlt("ProductInput", &rep);
  return rep != nullptr ? rep->GetScrollListRep() : nullptr;
}

bool Run(VORDriver& driver, const std::string& steps) {
  std::ostringstream out;
  VORScript script(driver, out);
  return script.Run(steps);
}

void BM_DropInputOnNextStation(benchmark::State& state) {
  const int n = static_cast<int>(state.range(0));
  VORDriver driver;
  const std::string source = StationLabel(kSource);
  if (!OpenInViewer(driver, ChainFile(n)) ||
      !Run(driver, "expand " + source + " ProductInput\nexpand " + StationLabel(kSource + 1) +
                       " ProductInput\n")) {
    state.SkipWithError(("cannot open the viewer: " + driver.LastError()).c_str());
    return;
  }
  const VORMathPoint2D target{StationX(kSource + 1), 12.5};
  for (auto _ : state) {
    state.PauseTiming();
    QELBaseScrollListZitBltRep* list = InputList(driver, kSource);
    const bool picked =
        list != nullptr &&
        Run(driver, "pick-item " + source + " ProductInput P" + std::to_string(kSource) + "\n") &&
        list->GetItemManipulator()->GetElementCount() == 1;
    if (!picked) {
      state.SkipWithError("cannot pick the input");
      break;
    }
    VOR2DManipulator* m = list->GetItemManipulator();
    VOR2DRep* item = m->GetElements().front().get();
    m->PointerPress(list->GetViewer(),
                    {item->GetBoundingBox().CentreX(), item->GetBoundingBox().CentreY()}, 0, item);
    m->PointerDrag({target.x - 10.0, target.y}, 0);
    m->PointerDrag(target, 0);
    state.ResumeTiming();
    m->PointerRelease(target, 0);
    driver.DrainDeferred();
    state.PauseTiming();
    if (InputList(driver, kSource + 1)->GetItems().Size() != 2 || !driver.Undo()) {
      state.SkipWithError("the drop was not carried out or not undoable");
      break;
    }
    driver.TakeEvents();
    state.ResumeTiming();
  }
}

}  // namespace

BENCHMARK(BM_DropInputOnNextStation)->Arg(10000)->Unit(benchmark::kMillisecond)->Iterations(20);
