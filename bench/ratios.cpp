#include "bench/ratios.h"

#include <algorithm>
#include <cstdio>
#include <map>

#include <benchmark/benchmark.h>

namespace marlowbeck::bench {
namespace {

/// Prints as ever and remembers the time of every repetition.
class Collector : public benchmark::ConsoleReporter {
 public:
  Collector() : ConsoleReporter(OO_Tabular) {}

  void ReportRuns(const std::vector<Run>& runs) override {
    ConsoleReporter::ReportRuns(runs);
    for (const Run& run : runs) {
      if (run.run_type != Run::RT_Iteration || run.error_occurred) continue;
      times_[run.run_name.function_name].push_back(run.GetAdjustedRealTime());
    }
  }

  /// 0 for a benchmark that did not run.
  [[nodiscard]] double Median(const std::string& name) const {
    const auto entry = times_.find(name);
    if (entry == times_.end()) return 0;
    std::vector<double> times = entry->second;
    std::sort(times.begin(), times.end());
    return times[times.size() / 2];
  }

 private:
  std::map<std::string, std::vector<double>> times_;
};

/// Nine rounds, the benchmarks of each in a random order, so that a busy moment of the machine
/// does not fall on one alone. What the caller asks for stands behind and wins.
std::vector<char*> WithRounds(int argc, char** argv) {
  static std::string rounds = "--benchmark_repetitions=9";
  static std::string mixed = "--benchmark_enable_random_interleaving=true";
  static std::string shortly = "--benchmark_min_time=0.05";
  std::vector<char*> arguments = {argv[0], rounds.data(), mixed.data(), shortly.data()};
  arguments.insert(arguments.end(), argv + 1, argv + argc);
  return arguments;
}

}  // namespace

int RunAndCompare(int argc, char** argv, const std::vector<Ratio>& ratios) {
  std::vector<char*> arguments = WithRounds(argc, argv);
  int count = static_cast<int>(arguments.size());
  benchmark::Initialize(&count, arguments.data());
  Collector collector;
  benchmark::RunSpecifiedBenchmarks(&collector);
  bool all_within = true;
  for (const Ratio& ratio : ratios) {
    const double base = collector.Median(ratio.to);
    const double times = base > 0 ? collector.Median(ratio.of) / base : 0;
    const bool within = times > 0 && times <= ratio.at_most;
    all_within = all_within && within;
    std::printf("RATIO | %s | %s | %.2f | %.2f | %s\n", ratio.of.c_str(), ratio.to.c_str(), times,
                ratio.at_most, within ? "within" : "OVER");
  }
  return all_within ? 0 : 1;
}

}  // namespace marlowbeck::bench
