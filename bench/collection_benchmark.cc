// Look-up by key must cost the same whatever the collection's size; adding
// and removing by key are measured beside it.
#include <benchmark/benchmark.h>

#include <string>
#include <vector>

#include "automation/basic_collection.h"

namespace {

std::vector<std::string> Keys(int64_t n) {
  std::vector<std::string> keys;
  keys.reserve(n);
  for (int64_t i = 0; i < n; ++i) keys.push_back("{GUID-" + std::to_string(i) + "}");
  return keys;
}

void BM_AddByKey(benchmark::State& state) {
  std::vector<std::string> keys = Keys(state.range(0));
  for (auto _ : state) {
    automation::BasicCollection<int> c;
    for (size_t i = 0; i < keys.size(); ++i) c.Add(int(i), keys[i]);
    benchmark::DoNotOptimize(c.Count());
  }
  state.SetItemsProcessed(state.iterations() * state.range(0));
}

void BM_LookUpByKey(benchmark::State& state) {
  std::vector<std::string> keys = Keys(state.range(0));
  automation::BasicCollection<int> c;
  for (size_t i = 0; i < keys.size(); ++i) c.Add(int(i), keys[i]);
  // Keys in insertion order: what a walk over a selection does.
  size_t i = 0;
  for (auto _ : state) {
    benchmark::DoNotOptimize(c.Item(keys[i]));
    if (++i == keys.size()) i = 0;
  }
}

void BM_RemoveByKeyAndAddBack(benchmark::State& state) {
  std::vector<std::string> keys = Keys(state.range(0));
  automation::BasicCollection<int> c;
  for (size_t i = 0; i < keys.size(); ++i) c.Add(int(i), keys[i]);
  size_t i = 0;
  for (auto _ : state) {
    c.Remove(keys[i]);
    c.Add(int(i), keys[i]);
    i = (i + 7919) % keys.size();
  }
}

BENCHMARK(BM_AddByKey)->Arg(10)->Arg(1000)->Arg(100000);
BENCHMARK(BM_LookUpByKey)->Arg(10)->Arg(1000)->Arg(100000);
BENCHMARK(BM_RemoveByKeyAndAddBack)->Arg(10)->Arg(1000)->Arg(100000);

}  // namespace
