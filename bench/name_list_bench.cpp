// The sorted list behind instances and variables: searches walk it, the last-hit cache
// answers repeated searches without walking.
#include "runtime/name_list.h"
#include "runtime/records.h"

#include <benchmark/benchmark.h>

#include <memory>
#include <string>
#include <vector>

namespace {

using morvex::runtime::NameList;
using morvex::runtime::VariableRecord;

std::vector<std::string> namesOf(int count) {
  std::vector<std::string> names;
  for (int i = 0; i < count; ++i) {
    names.push_back("Variable" + std::to_string(i));
  }
  return names;
}

void fill(NameList<VariableRecord> &list, const std::vector<std::string> &names) {
  for (const std::string &name : names) {
    list.insertOrReplace(std::make_unique<VariableRecord>(name.c_str()));
  }
}

// A search for the same name again and again: the cache answers.
void repeatedFind(benchmark::State &state) {
  NameList<VariableRecord> list;
  const auto names = namesOf(static_cast<int>(state.range(0)));
  fill(list, names);
  const char *wanted = names[names.size() / 2].c_str();
  for (auto _ : state) {
    benchmark::DoNotOptimize(list.find(wanted));
  }
}
BENCHMARK(repeatedFind)->Arg(10)->Arg(100)->Arg(1000);

// Searches that alternate between names: each one walks the list.
void alternatingFind(benchmark::State &state) {
  NameList<VariableRecord> list;
  const auto names = namesOf(static_cast<int>(state.range(0)));
  fill(list, names);
  std::size_t i = 0;
  for (auto _ : state) {
    benchmark::DoNotOptimize(list.find(names[i].c_str()));
    i = (i + 7) % names.size();
  }
}
BENCHMARK(alternatingFind)->Arg(10)->Arg(100)->Arg(1000);

// Building a list of n names from scratch and clearing it.
void insertAndClear(benchmark::State &state) {
  const auto names = namesOf(static_cast<int>(state.range(0)));
  for (auto _ : state) {
    NameList<VariableRecord> list;
    fill(list, names);
    benchmark::DoNotOptimize(list.size());
  }
}
BENCHMARK(insertAndClear)->Arg(10)->Arg(100)->Arg(1000);

} // namespace
