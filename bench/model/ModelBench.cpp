// Loading and saving a generated 10,000-activity line (target: each under one second).
#include <benchmark/benchmark.h>

#include <cstdio>
#include <filesystem>
#include <string>

#include "VORModel.h"
#include "VORModelGenerator.h"
#include "VORXercesPlatform.h"

namespace {

VORProcess* Line(int activities) {
  static VORProcess_var cached;
  static int cachedSize = 0;
  if (!cached || cachedSize != activities) {
    VORModelGeneratorOptions o;
    o.activities = activities;
    o.hub = true;
    cached = VORProcess_var::Adopt(VORModelGenerator::Generate(o));
    cachedSize = activities;
  }
  return cached.get();
}

std::string TempFile() {
  return (std::filesystem::temp_directory_path() / "pfv-model-bench.pprx").string();
}

void Counters(benchmark::State& state, VORProcess* doc, std::size_t bytes) {
  const VORProcessStatistics s = doc->GetStatistics();
  state.counters["activities"] = s.activities;
  state.counters["objects"] = s.activities + s.productIOs + s.products + s.controlNodes;
  state.counters["MiB"] = static_cast<double>(bytes) / (1 << 20);
}

void BM_SaveToFile(benchmark::State& state) {
  VORProcess* doc = Line(static_cast<int>(state.range(0)));
  const std::string path = TempFile();
  std::string error;
  for (auto _ : state) {
    if (!doc->SaveAs(path, error))
      state.SkipWithError(error.c_str());
  }
  Counters(state, doc, std::filesystem::file_size(path));
  std::filesystem::remove(path);
  std::filesystem::remove(path + ".bak");
}

void BM_LoadFromFile(benchmark::State& state) {
  VORProcess* source = Line(static_cast<int>(state.range(0)));
  const std::string path = TempFile();
  std::string error;
  source->SaveAs(path, error);
  for (auto _ : state) {
    VORProcess_var doc = VORProcess_var::Adopt(VORProcess::Load(path, error));
    if (!doc)
      state.SkipWithError(error.c_str());
    benchmark::DoNotOptimize(doc.get());
  }
  Counters(state, source, std::filesystem::file_size(path));
  std::filesystem::remove(path);
  std::filesystem::remove(path + ".bak");
}

// The DOM parse alone (hardened parser), to tell it from building the model.
void BM_ParseOnly(benchmark::State& state) {
  VORProcess* source = Line(static_cast<int>(state.range(0)));
  const std::string text = source->SaveToString();
  std::string error;
  for (auto _ : state) {
    VORXercesPlatform::Document dom = VORXercesPlatform::ParseMemory(text, "bench", error);
    if (!dom)
      state.SkipWithError(error.c_str());
  }
}

void BM_InvariantCheck(benchmark::State& state) {
  VORProcess* doc = Line(static_cast<int>(state.range(0)));
  for (auto _ : state) {
    std::vector<std::string> problems;
    benchmark::DoNotOptimize(VORModelChecker::Check(doc, problems));
  }
}

void BM_Generate(benchmark::State& state) {
  for (auto _ : state) {
    VORModelGeneratorOptions o;
    o.activities = static_cast<int>(state.range(0));
    VORProcess_var doc = VORProcess_var::Adopt(VORModelGenerator::Generate(o));
    benchmark::DoNotOptimize(doc.get());
  }
}

}  // namespace

// A nested-entity bomb is refused before any expansion: the time stays that of a tiny parse.
void BM_RefuseEntityBomb(benchmark::State& state) {
  std::string bomb = "<?xml version=\"1.0\"?>\n<!DOCTYPE lolz [\n<!ENTITY lol \"lol\">\n";
  for (int i = 1; i <= 9; ++i) {
    bomb += "<!ENTITY lol" + std::to_string(i) + " \"";
    for (int k = 0; k < 10; ++k)
      bomb += i == 1 ? "&lol;" : "&lol" + std::to_string(i - 1) + ";";
    bomb += "\">\n";
  }
  bomb += "]>\n<pprDocument version=\"1\">&lol9;</pprDocument>\n";
  for (auto _ : state) {
    std::string error;
    VORProcess_var doc =
        VORProcess_var::Adopt(VORProcess::LoadFromString(bomb, "bomb.pprx", error));
    if (doc)
      state.SkipWithError("the entity bomb was accepted");
    benchmark::DoNotOptimize(error);
  }
}

BENCHMARK(BM_SaveToFile)->Arg(1000)->Arg(10000)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_LoadFromFile)->Arg(1000)->Arg(10000)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_ParseOnly)->Arg(10000)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_InvariantCheck)->Arg(10000)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_Generate)->Arg(10000)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_RefuseEntityBomb)->Unit(benchmark::kMicrosecond);
