// Selections of a whole large level, and the pick path through a state command.
#include <benchmark/benchmark.h>

#include <vector>

#include "VORCSO.h"
#include "VORCommandEngine.h"
#include "VORDeferredDeletion.h"
#include "VORPathElementAgent.h"
#include "VORSelectionContext.h"
#include "VORStateCommand.h"

namespace {
class Thing : public VORBaseUnknown {
  VOR_DECLARE_CLASS(Thing, VORBaseUnknown)
};

struct Level {
  explicit Level(int n) : root(VORBaseUnknown_var::Adopt(new Thing())) {
    for (int i = 0; i < n; ++i) {
      VORBaseUnknown_var leaf = VORBaseUnknown_var::Adopt(new Thing());
      VORListValVORBaseUnknown_var chain;
      chain.Append(root);
      chain.Append(leaf);
      leaves.push_back(leaf);
      paths.Append(VORBaseUnknown_var(VORPathElement_var::Adopt(new VORPathElement(chain)).get()));
    }
  }
  VORBaseUnknown_var root;
  std::vector<VORBaseUnknown_var> leaves;
  VORListValVORBaseUnknown_var paths;
};

// Selecting every node of a level at once ("select all").
void BM_CSOSelectAll(benchmark::State& state) {
  Level level(static_cast<int>(state.range(0)));
  for (auto _ : state) {
    auto cso = VORCSO_var::Adopt(new VORCSO());
    cso->AddElements(level.paths);
    benchmark::DoNotOptimize(cso->GetSize());
  }
  state.SetComplexityN(state.range(0));
}
BENCHMARK(BM_CSOSelectAll)->Arg(1000)->Arg(10000)->Arg(40000)->Complexity();

// Picking the nodes one by one into one selection, as repeated picks do.
void BM_CSOPickOneByOne(benchmark::State& state) {
  Level level(static_cast<int>(state.range(0)));
  for (auto _ : state) {
    auto cso = VORCSO_var::Adopt(new VORCSO());
    for (const VORBaseUnknown_var& p : level.paths)
      cso->AddElement(p);
    benchmark::DoNotOptimize(cso->GetSize());
  }
  state.SetComplexityN(state.range(0));
}
BENCHMARK(BM_CSOPickOneByOne)->Arg(1000)->Arg(10000)->Complexity();

// Is this object selected? (a rep deciding how to draw itself)
void BM_CSOLocateObject(benchmark::State& state) {
  Level level(static_cast<int>(state.range(0)));
  auto cso = VORCSO_var::Adopt(new VORCSO());
  cso->AddElements(level.paths);
  auto outside = VORBaseUnknown_var::Adopt(new Thing());
  for (auto _ : state)
    benchmark::DoNotOptimize(cso->IsPresent(outside));
}
BENCHMARK(BM_CSOLocateObject)->Arg(10000);

class PickCommand : public VORStateCommand {
 public:
  PickCommand() : VORStateCommand("Bench") {}
  void BuildGraph() override {
    _agent = VORPathElementAgent_var::Adopt(new VORPathElementAgent("Pick"));
    _agent->SetBehavior(VORAgentBehavior::RepeatedPicks);
    VORDialogState* st = GetInitialState("Pick");
    st->AddDialogAgent(_agent);
    AddTransition(st, st, IsOutputSetCondition(_agent), Action(this, &PickCommand::Count));
  }
  bool Count(void*) {
    ++picks;
    return true;
  }
  long picks = 0;

 private:
  VORPathElementAgent_var _agent;
};

// One user pick through the engine, the agent, the CSO and a transition.
void BM_PickThroughStateCommand(benchmark::State& state) {
  Level level(1000);
  auto cso = VORCSO_var::Adopt(new VORCSO());
  VORSelectionContext::Set(cso, nullptr, nullptr, nullptr);
  auto* command = new PickCommand();
  VORCommandEngine::Start(command);
  command->Release();
  int i = 0;
  for (auto _ : state) {
    VORCommandEngine::OfferPath(static_cast<VORPathElement*>(level.paths[1 + i].get()));
    i = (i + 1) % level.paths.Size();
  }
  VORCommandEngine::CancelCurrent();
  VORSelectionContext::Set(nullptr, nullptr, nullptr, nullptr);
  VORDeferredDeletion::Drain();
}
BENCHMARK(BM_PickThroughStateCommand);
}  // namespace
