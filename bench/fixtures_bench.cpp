// From the answer of the entry dialog to the painted chart of 50 teams, against a frame of a
// display that shows sixty in a second.

#include <string>

#include <benchmark/benchmark.h>

#include "bench/desk.h"
#include "bench/ratios.h"
#include "desktop/theme.h"

namespace marlowbeck::bench {
namespace {

constexpr double kFrame = 0.016;  // seconds

void AFrame(benchmark::State& state) {
  for (auto _ : state) state.SetIterationTime(kFrame);
}
BENCHMARK(AFrame)->Unit(benchmark::kMillisecond)->UseManualTime()->Iterations(1);

/// A world in which somebody asks for 50 teams.
class FiftyTeams : public StillWorld {
 protected:
  std::string ShowInput(const InputBoxRequest& /*request*/) override { return "50"; }
};

void ChartOfFiftyTeams(benchmark::State& state) {
  FiftyTeams world;
  Desk desk(world.platform);
  desk.Start();
  for (auto _ : state) {
    desk.Click("frmDB", "mnuFix");
    state.PauseTiming();
    desk.Click("frmFixtures", "cmdFixCancel");
    state.ResumeTiming();
  }
}
BENCHMARK(ChartOfFiftyTeams)->Unit(benchmark::kMillisecond)->UseRealTime();

}  // namespace
}  // namespace marlowbeck::bench

int main(int argc, char** argv) {
  const QApplication application(argc, argv);
  marlowbeck::ApplyTheme();
  return marlowbeck::bench::RunAndCompare(argc, argv, {{"ChartOfFiftyTeams", "AFrame", 1.0}});
}
