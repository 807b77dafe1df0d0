// The sort pass of a results file at the limits, all its records out of order, against a plain copy
// of that file.

#include <filesystem>
#include <memory>

#include <benchmark/benchmark.h>

#include "bench/ratios.h"
#include "bench/season.h"
#include "data/channels.h"
#include "data/real_file_system.h"
#include "session/sort_pass.h"

namespace marlowbeck::bench {
namespace {

const Season& Shuffled() {
  static const Season season(Entry::Shuffled);
  return season;
}

void PlainCopyOfResults(benchmark::State& state) {
  const std::string from = Shuffled().ResultsFile();
  const std::string to = Shuffled().Folder() + "/copy";
  for (auto _ : state) {
    // A copy is a new file, as the sorted one is: to write over an old one's blocks costs less.
    state.PauseTiming();
    std::filesystem::remove(to);
    state.ResumeTiming();
    PlainCopy(from, to);
  }
}
BENCHMARK(PlainCopyOfResults)->Unit(benchmark::kMillisecond)->UseRealTime();

void SortPass(benchmark::State& state) {
  const std::string folder = Shuffled().Folder();
  const std::string results = folder + "/sort.qzr";
  RealFileSystem files;
  Channels channels(files);
  for (auto _ : state) {
    state.PauseTiming();
    PlainCopy(Shuffled().ResultsFile(), results);
    state.ResumeTiming();
    SortResults(channels, results, folder + "/sort.qz3", [](int) {});
  }
}
BENCHMARK(SortPass)->Unit(benchmark::kMillisecond)->UseRealTime();

}  // namespace
}  // namespace marlowbeck::bench

int main(int argc, char** argv) {
  return marlowbeck::bench::RunAndCompare(argc, argv, {{"SortPass", "PlainCopyOfResults", 3.0}});
}
