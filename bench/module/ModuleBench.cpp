// The node organiser side by side with a plain layered layout, the whole ArrangeNodes on a
// viewer, and opening the viewer, on generated line-shaped levels. Run with VORStartupPath set
// to resources/ and VOR_MODULE_PATH to the build's lib/ (the viewer command is loaded by name).
#include <benchmark/benchmark.h>

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <cstdlib>
#include <string>
#include <vector>

#include "QELFpaProductFlowViewer.h"
#include "QELPFVLayoutCore.h"
#include "QELPFVNodeOrganiser.h"
#include "QELPertClientVisuServices.h"
#include "VORApplicationFrame.h"
#include "VORDeferredDeletion.h"
#include "VORDocument.h"
#include "VORDriver.h"
#include "VORModelDoor.h"

namespace {

// A line as planners store it: kLanes parallel lanes of stations, lane after lane, each station
// leading to the next one of its lane and, every tenth station, also to the next station of the
// neighbouring lane (lanes that exchange parts meet on equal levels, so nothing is cyclic).
constexpr int kLanes = 4;

QELPFVLayoutCore::Successors LineSuccessors(int n) {
  const int length = n / kLanes;
  QELPFVLayoutCore::Successors succ(static_cast<size_t>(length * kLanes));
  auto id = [length](int lane, int step) { return lane * length + step; };
  for (int lane = 0; lane < kLanes; ++lane) {
    for (int step = 0; step + 1 < length; ++step) {
      auto& s = succ[static_cast<size_t>(id(lane, step))];
      s.push_back(id(lane, step + 1));
      if (step % 10 == 9)
        s.push_back(id((lane + 1) % kLanes, step + 1));
    }
  }
  return succ;
}

double Snap(double v) {
  double x = v;
  double y = 0.0;
  QELPertClientVisuServices::CalculateSnapPositionInPert(x, y, 1, QELIPertNode_var());
  return x;
}

// The organiser's computation on indexes: levels, exchange-sort order, level lists, the square
// and the snapped column positions (as ArrangeNodes computes them, without writing them).
void BM_OrganiserComputation(benchmark::State& state) {
  const QELPFVLayoutCore::Successors succ = LineSuccessors(static_cast<int>(state.range(0)));
  std::vector<double> xs(succ.size());
  std::vector<double> ys(succ.size());
  for (auto _ : state) {
    const QELPFVLayoutCore::Levels levels = QELPFVLayoutCore::ComputeLevels(succ);
    const std::vector<int> order = QELPFVLayoutCore::StableLevelOrder(levels.level);
    const auto lists = QELPFVLayoutCore::LevelLists(succ, levels.level, order);
    const float side = QELPFVLayoutCore::ChartSide(levels.level);
    const int highest = static_cast<int>(lists.size()) - 1;
    const float xStep = highest > 0 ? side / static_cast<float>(highest) : 0.0f;
    double x = 0.0;
    double y = 0.0;
    for (const auto& list : lists) {
      const float yStep = list.empty() ? 0.0f : side / static_cast<float>(list.size());
      if (!list.empty())
        y = side / static_cast<float>(2 * list.size());
      for (int node : list) {
        QELPertClientVisuServices::CalculateSnapPositionInPert(x, y, 1, QELIPertNode_var());
        xs[static_cast<size_t>(node)] = x;
        ys[static_cast<size_t>(node)] = y;
        y += yStep;
      }
      x += xStep;
    }
    benchmark::DoNotOptimize(xs.data());
    benchmark::DoNotOptimize(ys.data());
  }
  state.SetItemsProcessed(state.iterations() * state.range(0));
}

// A plain O(N + E) layered layout of the same graph: longest-path levels in topological order
// (Kahn), nodes spread evenly in their column in index order, snapped the same way.
void BM_PlainLongestPathLayering(benchmark::State& state) {
  const QELPFVLayoutCore::Successors succ = LineSuccessors(static_cast<int>(state.range(0)));
  const size_t n = succ.size();
  std::vector<double> xs(n);
  std::vector<double> ys(n);
  for (auto _ : state) {
    std::vector<int> indegree(n, 0);
    for (const auto& s : succ)
      for (int t : s)
        ++indegree[static_cast<size_t>(t)];
    std::vector<int> queue;
    queue.reserve(n);
    for (size_t i = 0; i < n; ++i)
      if (indegree[i] == 0)
        queue.push_back(static_cast<int>(i));
    std::vector<int> level(n, 0);
    for (size_t head = 0; head < queue.size(); ++head) {
      const int v = queue[head];
      for (int t : succ[static_cast<size_t>(v)]) {
        level[static_cast<size_t>(t)] =
            std::max(level[static_cast<size_t>(t)], level[static_cast<size_t>(v)] + 1);
        if (--indegree[static_cast<size_t>(t)] == 0)
          queue.push_back(t);
      }
    }
    const int highest = *std::max_element(level.begin(), level.end());
    std::vector<int> count(static_cast<size_t>(highest) + 1, 0);
    for (int l : level)
      ++count[static_cast<size_t>(l)];
    const int widest = *std::max_element(count.begin(), count.end());
    const double side = 50.0 * std::max(highest, widest);
    std::vector<int> row(count.size(), 0);
    for (size_t i = 0; i < n; ++i) {
      const size_t l = static_cast<size_t>(level[i]);
      xs[i] = Snap(highest > 0 ? side / highest * static_cast<double>(l) : 0.0);
      ys[i] = Snap(side / count[l] * (row[l]++ + 0.5));
    }
    benchmark::DoNotOptimize(xs.data());
    benchmark::DoNotOptimize(ys.data());
  }
  state.SetItemsProcessed(state.iterations() * state.range(0));
}

// A process document whose root holds a generated line of n stations, named "Line".
VORProcess_var MakeLineDocument(int n) {
  VORProcess_var doc = VORProcess_var::Adopt(VORProcess::CreateNew("Line"));
  VORBaseUnknown_var root = doc->GetRootProcess();
  const QELPFVLayoutCore::Successors succ = LineSuccessors(n);
  std::vector<VORBaseUnknown_var> nodes(succ.size());
  for (size_t i = 0; i < succ.size(); ++i) {
    doc->GetDoor().CreateNode(root, "BIWActivityStation", nodes[i]);
    doc->GetDoor().SetLabel(nodes[i], VORUnicodeString("S" + std::to_string(i + 1)));
  }
  for (size_t i = 0; i < succ.size(); ++i)
    for (int t : succ[i])
      doc->GetDoor().AddFlow(nodes[i], nodes[static_cast<size_t>(t)]);
  return doc;
}

// The same line where every station consumes one part, produces one and uses one resource: each
// of its three list ZitBlts has one item.
VORProcess_var MakeEquippedLineDocument(int n) {
  VORProcess_var doc = MakeLineDocument(n);
  VORModelDoor& door = doc->GetDoor();
  VORListValVORBaseUnknown_var* stations = nullptr;
  VORIGENode_var(doc->GetRootProcess())->GetChildren(stations);
  int i = 0;
  for (const VORBaseUnknown_var& station : *stations) {
    const std::string tag = std::to_string(++i);
    VORBaseUnknown_var in, out, tool, io;
    door.CreateProduct(doc->GetRootProduct(), VORUnicodeString("In" + tag), in);
    door.CreateProduct(doc->GetRootProduct(), VORUnicodeString("Out" + tag), out);
    door.CreateProduct(doc->GetRootProduct(), VORUnicodeString("Robot" + tag), tool);
    door.AddProductIO(station, in, true, io);
    door.AssignItem(station, in, io);
    door.AddProductIO(station, out, false, io);
    door.MakeResource(tool, "Robot", "");
    door.AssignResource(station, tool);
  }
  delete stations;
  return doc;
}

// Opens a newly generated level of n stations in a new editor of the driver's frame (each
// benchmark starts from a level no viewer has shown yet).
bool OpenLine(VORDriver& driver, int n, bool equipped) {
  VORProcess_var doc = equipped ? MakeEquippedLineDocument(n) : MakeLineDocument(n);
  return VORApplicationFrame::GetApplicationFrame()->OpenDocument(doc) != nullptr &&
         driver.PickObject("Line");
}

QELFpaProductFlowViewer* FindViewer() {
  for (VORFrmWindow* w : VORFrmLayout::GetCurrentLayout()->GetWindowList())
    if (w->IsAKindOf(QELFpaProductFlowViewer::ClassName()))
      return static_cast<QELFpaProductFlowViewer*>(w);
  return nullptr;
}

// The whole ArrangeNodes on an open viewer: positions written to the document, chart boxes and
// links refreshed, one position notification per node (each moving the node's ZitBlts).
int Arrange(QELFpaProductFlowViewer& viewer) {
  auto* organiser = new QELPFVNodeOrganiser();
  const int done = organiser->ArrangeNodes(viewer.GetRootNode(), viewer.GetPertController());
  organiser->RequestDelayedDestruction();
  VORDeferredDeletion::Drain();
  return done;
}

// One untimed arrangement comes first, as one untimed opening does for the openings: the
// organiser's tables are then timed in memory the heap already holds.
void ArrangeRepeatedly(benchmark::State& state, bool equipped) {
  VORDriver driver;
  if (!OpenLine(driver, static_cast<int>(state.range(0)), equipped) ||
      !driver.StartCommand("QELFpaProductFlowViewerCmd") || FindViewer() == nullptr) {
    state.SkipWithError(("cannot open the viewer: " + driver.LastError()).c_str());
    return;
  }
  QELFpaProductFlowViewer* viewer = FindViewer();
  Arrange(*viewer);
  for (auto _ : state)
    benchmark::DoNotOptimize(Arrange(*viewer));
  state.SetItemsProcessed(state.iterations() * state.range(0));
}

void BM_ArrangeNodesWithRefresh(benchmark::State& state) {
  ArrangeRepeatedly(state, false);
}

// The same on a line whose stations each list one input, one output and one resource.
void BM_ArrangeNodesWithLists(benchmark::State& state) {
  ArrangeRepeatedly(state, true);
}

// Closes the viewer and forgets the positions, so that every node is new to the next open.
void CloseViewerAndForgetPositions(VORDriver& driver, VORListValVORBaseUnknown_var& children) {
  FindViewer()->DeleteWindow();
  driver.DrainDeferred();
  for (VORBaseUnknown_var& child : children)
    driver.GetDocument()->GetDoor().SetPertPosition(child, false, 0.0, 0.0);
}

// Opens the viewer on the level of file once per iteration; closing it and forgetting the
// positions are not timed. With warm, one untimed open comes first: every size is then timed
// with the heap already grown to the chart's size, since the first touch of fresh memory is
// the machine's cost (large and erratic on a virtual machine), not the viewer's. Without it,
// the first open is timed (run it with one iteration).
void OpenViewerRepeatedly(benchmark::State& state, bool equipped, bool warm = true) {
  VORDriver driver;
  if (!OpenLine(driver, static_cast<int>(state.range(0)), equipped)) {
    state.SkipWithError(("cannot open the level: " + driver.LastError()).c_str());
    return;
  }
  VORListValVORBaseUnknown_var* children = nullptr;
  VORIGENode_var(driver.GetDocument()->GetRootProcess())->GetChildren(children);
  if (warm) {
    if (!driver.StartCommand("QELFpaProductFlowViewerCmd") || FindViewer() == nullptr) {
      state.SkipWithError(driver.LastError().c_str());
      delete children;
      return;
    }
    CloseViewerAndForgetPositions(driver, *children);
  }
  for (auto _ : state) {
    if (!driver.StartCommand("QELFpaProductFlowViewerCmd") || FindViewer() == nullptr) {
      state.SkipWithError(driver.LastError().c_str());
      break;
    }
    state.PauseTiming();
    CloseViewerAndForgetPositions(driver, *children);
    state.ResumeTiming();
  }
  delete children;
}

// Picking the level and running the viewer command: window, viewer, controller with every node
// box and link, and the first layout of all (new) nodes.
void BM_OpenViewer(benchmark::State& state) {
  OpenViewerRepeatedly(state, false);
}

// Opening the viewer on a line whose stations each list one input, one output and one
// resource: as above, plus every station's ZitBlts built, their list commands created and run,
// and each list drawn with its item.
void BM_OpenViewerWithLists(benchmark::State& state) {
  OpenViewerRepeatedly(state, true);
}

// The same open as the first one of a new process: it touches fresh pages on the way.
void BM_FirstOpenViewerWithLists(benchmark::State& state) {
  OpenViewerRepeatedly(state, true, false);
}

}  // namespace

BENCHMARK(BM_OrganiserComputation)
    ->Arg(1000)
    ->Arg(20000)
    ->Arg(100000)
    ->Unit(benchmark::kMillisecond);
BENCHMARK(BM_PlainLongestPathLayering)
    ->Arg(1000)
    ->Arg(20000)
    ->Arg(100000)
    ->Unit(benchmark::kMillisecond);
// Opening and organising at 1,000, 10,000 and 100,000 stations. The machine is shared and its
// speed wanders for tens of seconds at a time: each size runs kRuns times on a level of its own,
// and the median is the figure. Run with --benchmark_enable_random_interleaving=true (as
// scripts/bench does), the runs of the three sizes are shuffled together, so that a slow spell
// reaches a few runs of every size rather than most runs of one, and the ratio of two sizes
// compares runs made under the same conditions. A spell has taken three of seven runs of one
// size: with eleven, the median moves only when six are slow. Every run starts from a heap
// without free memory: closing the previous run's document gave it back to the system.
namespace {

constexpr int kRuns = 11;

benchmark::internal::Benchmark* Runs(benchmark::internal::Benchmark* b, int iterations) {
  return b->Unit(benchmark::kMillisecond)
      ->Iterations(iterations)
      ->Repetitions(kRuns)
      ->DisplayAggregatesOnly(true);
}

// The two smaller sizes with several iterations per run, 100,000 stations with one.
void RegisterBySize(const char* name, void (*run)(benchmark::State&), int iterations) {
  Runs(benchmark::RegisterBenchmark(name, run)->Arg(1000)->Arg(10000), iterations);
  Runs(benchmark::RegisterBenchmark(name, run)->Arg(100000), 1);
}

const bool registeredBySize = [] {
  RegisterBySize("BM_ArrangeNodesWithRefresh", BM_ArrangeNodesWithRefresh, 10);
  RegisterBySize("BM_ArrangeNodesWithLists", BM_ArrangeNodesWithLists, 10);
  RegisterBySize("BM_OpenViewer", BM_OpenViewer, 5);
  RegisterBySize("BM_OpenViewerWithLists", BM_OpenViewerWithLists, 5);
  Runs(benchmark::RegisterBenchmark("BM_FirstOpenViewerWithLists", BM_FirstOpenViewerWithLists)
           ->Arg(10000)
           ->Arg(100000),
       1);
  return true;
}();

}  // namespace
