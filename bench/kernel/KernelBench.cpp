// Cost of the component model's hot operations: interface casts and list look-ups.
#include <benchmark/benchmark.h>

#include "VORExtensionRegistry.h"
#include "VORLateTypes.h"
#include "VORLists.h"

namespace {

class IBenchShape : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(IBenchShape)
 public:
  virtual int Corners() const = 0;
};
class IBenchExtra : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(IBenchExtra)
 public:
  virtual int Extra() const = 0;
};

class Shape : public IBenchShape {
  VOR_DECLARE_CLASS(Shape, VORBaseUnknown)
 public:
  int Corners() const override { return 4; }
  const char* GetLateType() const override { return "BenchStation"; }
};

class ExtraExtension : public VORExtension, public IBenchExtra {
 public:
  int Extra() const override { return 1; }
};

void BM_QueryImplementedInterface(benchmark::State& state) {
  VORBaseUnknown_var object = VORBaseUnknown_var::Adopt(new Shape());
  for (auto _ : state) {
    VORHandle<IBenchShape> shape(object);
    benchmark::DoNotOptimize(shape.get());
  }
}
BENCHMARK(BM_QueryImplementedInterface);

void BM_QueryDataExtensionThroughLateTypeChain(benchmark::State& state) {
  VORLateTypes::Declare("BenchActivity", "");
  VORLateTypes::Declare("BenchPhysical", "BenchActivity");
  VORLateTypes::Declare("BenchStation", "BenchPhysical");
  VORExtensionRegistry::Register(
      "BenchActivity", IBenchExtra::IID(), []() -> VORExtension* { return new ExtraExtension(); },
      VORExtensionKind::Data);
  VORBaseUnknown_var object = VORBaseUnknown_var::Adopt(new Shape());
  for (auto _ : state) {
    VORHandle<IBenchExtra> extra(object);
    benchmark::DoNotOptimize(extra.get());
  }
}
BENCHMARK(BM_QueryDataExtensionThroughLateTypeChain);

void BM_QueryMissingInterface(benchmark::State& state) {
  VORBaseUnknown_var object = VORBaseUnknown_var::Adopt(new Shape());
  VORExtensionRegistry::Unregister("BenchActivity", IBenchExtra::IID());
  for (auto _ : state) {
    VORHandle<IBenchExtra> extra(object);
    benchmark::DoNotOptimize(extra.get());
  }
}
BENCHMARK(BM_QueryMissingInterface);

void BM_ListLocateByIdentity(benchmark::State& state) {
  VORListValVORBaseUnknown_var list;
  for (int i = 0; i < state.range(0); ++i)
    list.Append(VORBaseUnknown_var::Adopt(new Shape()));
  VORBaseUnknown_var last = list[list.Size()];
  for (auto _ : state)
    benchmark::DoNotOptimize(list.Locate(last));
  state.SetComplexityN(state.range(0));
}
BENCHMARK(BM_ListLocateByIdentity)->Range(16, 16384)->Complexity();

void BM_ListRemoveDuplicates(benchmark::State& state) {
  VORListValVORBaseUnknown_var base;
  for (int i = 0; i < state.range(0); ++i)
    base.Append(VORBaseUnknown_var::Adopt(new Shape()));
  for (int i = 1; i <= state.range(0); i += 2)
    base.Append(base[i]);
  for (auto _ : state) {
    VORListValVORBaseUnknown_var copy = base;
    copy.RemoveDuplicates();
    benchmark::DoNotOptimize(copy.Size());
  }
}
BENCHMARK(BM_ListRemoveDuplicates)->Range(64, 16384);

}  // namespace
