// Building the ZitBlts of a level of 10,000 stations with the bundled configuration, as the
// viewer does when it opens (BuildZitBltReps on every activity), and tearing them down. Run with
// VORStartupPath set to resources/ and VOR_MODULE_PATH to the build's lib/.
#include <benchmark/benchmark.h>

#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>
#include <vector>

#include "QELIZitBltMgr.h"
#include "QELZitBltConfiguration.h"
#include "VORDeferredDeletion.h"
#include "VORDocument.h"
#include "VORModelDoor.h"
#include "VORModuleLoader.h"
#include "VORViewer.h"

namespace {

struct Level {
  VORProcess_var doc;
  std::vector<VORBaseUnknown_var> activities;
  explicit Level(int count) : doc(VORProcess_var::Adopt(VORProcess::CreateNew("Line"))) {
    VORBaseUnknown_var root = doc->GetRootProcess();
    for (int i = 0; i < count; ++i) {
      VORBaseUnknown_var node;
      doc->GetDoor().CreateNode(root, "BIWActivityStation", node);
      doc->GetDoor().SetPertPosition(node, true, 12.5 + 50.0 * (i % 100), 12.5 + 25.0 * (i / 100));
      activities.push_back(node);
    }
  }
};

void RemoveAll(const std::vector<QELIZitBltMgr_var>& managers) {
  for (const QELIZitBltMgr_var& m : managers)
    m->RemoveZitBlts();
  VORDeferredDeletion::Drain();
}

// Four loadable ZitBlts per station (the bundled file's list ZitBlts wait for their rep class):
// a configuration in a temporary directory searched first, the bundled icons after it.
class FourPerStation {
 public:
  FourPerStation() {
    _dir =
        std::filesystem::temp_directory_path() / ("pfv-zitblt-bench-" + std::to_string(getpid()));
    std::filesystem::create_directories(_dir);
    std::ofstream out(_dir / "zitbltcfg.xml");
    out << "<Config><ActivityZitBlt ActivityType=\"BIWActivityStation\">";
    const char* zitblts[][3] = {{"ProductInput", "lefttop", "I_ZitBltProductInput"},
                                {"ProductOutput", "righttop", "I_ZitBltProductOutput"},
                                {"Resource", "bottommiddle", "I_ZitBltResource"},
                                {"BIWStationStatusBars", "topmiddle", "I_ZitBltStatusBar"}};
    for (const auto& z : zitblts)
      out << "<ZitBlt Name=\"" << z[0] << "\" Type=\"QELZitBltRep\" LoadModule=\"QELZitBltVisu\" "
          << "Location=\"" << z[1] << "\" IconFile=\"" << z[2] << "\"/>";
    out << "</ActivityZitBlt></Config>";
    out.close();
    const char* old = std::getenv("VORStartupPath");
    _old = old ? old : "";
    setenv("VORStartupPath", (_dir.string() + ":" + _old).c_str(), 1);
    QELZitBltConfiguration::ForgetForTests();
  }
  ~FourPerStation() {
    setenv("VORStartupPath", _old.c_str(), 1);
    QELZitBltConfiguration::ForgetForTests();
    std::filesystem::remove_all(_dir);
  }

 private:
  std::filesystem::path _dir;
  std::string _old;
};

void BuildZitBlts(benchmark::State& state) {
  VORModuleLoader::LoadModule("QELZitBltModel");
  Level level(static_cast<int>(state.range(0)));
  auto viewer = VORHandle<VORViewer>::Adopt(new VORViewer(nullptr, "bench", 0, 800, 500, 0));
  std::vector<QELIZitBltMgr_var> managers;
  for (const VORBaseUnknown_var& a : level.activities)
    managers.emplace_back(a);
  // Warm: the configuration is parsed once per process.
  managers.front()->BuildZitBltReps(viewer);
  RemoveAll(managers);
  int zitBlts = 0;
  for (auto _ : state) {
    for (const QELIZitBltMgr_var& m : managers)
      m->BuildZitBltReps(viewer);
    state.PauseTiming();
    VORListValVORUnicodeString* names = nullptr;
    managers.front()->GetZitBltNames(names);
    zitBlts = names->Size();
    delete names;
    RemoveAll(managers);
    state.ResumeTiming();
  }
  state.counters["zitblts_per_activity"] = zitBlts;
  state.counters["activities"] = static_cast<double>(managers.size());
  RemoveAll(managers);
}
// The bundled configuration: a station's list ZitBlts name the scroll list rep, which is skipped
// quietly until it exists, so a station shows its status bar.
void BM_BuildZitBltsBundled(benchmark::State& state) {
  QELZitBltConfiguration::ForgetForTests();
  BuildZitBlts(state);
}
BENCHMARK(BM_BuildZitBltsBundled)->Arg(1000)->Arg(10000)->Unit(benchmark::kMillisecond);

// Closing the viewer: every activity drops its ZitBlts and its subscription on the root.
void BM_RemoveZitBlts(benchmark::State& state) {
  VORModuleLoader::LoadModule("QELZitBltModel");
  QELZitBltConfiguration::ForgetForTests();
  Level level(static_cast<int>(state.range(0)));
  auto viewer = VORHandle<VORViewer>::Adopt(new VORViewer(nullptr, "bench", 0, 800, 500, 0));
  std::vector<QELIZitBltMgr_var> managers;
  for (const VORBaseUnknown_var& a : level.activities)
    managers.emplace_back(a);
  for (auto _ : state) {
    state.PauseTiming();
    for (const QELIZitBltMgr_var& m : managers)
      m->BuildZitBltReps(viewer);
    state.ResumeTiming();
    RemoveAll(managers);
  }
}
BENCHMARK(BM_RemoveZitBlts)->Arg(10000)->Unit(benchmark::kMillisecond);

void BM_BuildZitBltsFourPerStation(benchmark::State& state) {
  FourPerStation config;
  BuildZitBlts(state);
}
BENCHMARK(BM_BuildZitBltsFourPerStation)->Arg(10000)->Unit(benchmark::kMillisecond);

}  // namespace
