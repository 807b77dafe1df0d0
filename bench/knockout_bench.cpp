// A list of 999 players, on its windows: filled, and a player moved into the table and back,
// against what nobody waits for.

#include <fstream>

#include <benchmark/benchmark.h>

#include "bench/desk.h"
#include "bench/ratios.h"
#include "bench/season.h"
#include "desktop/theme.h"

namespace marlowbeck::bench {
namespace {

constexpr double kNoWait = 0.1;  // seconds

void NoVisibleWait(benchmark::State& state) {
  for (auto _ : state) state.SetIterationTime(kNoWait);
}
BENCHMARK(NoVisibleWait)->Unit(benchmark::kMillisecond)->UseManualTime()->Iterations(1);

/// The knock-out with its list filled.
class Selection {
 public:
  Selection() {
    std::ofstream(desk.Folder() / "FileName.qz3") << '"' << season.PlayerFile() << "\"\r\n";
    desk.Start();
    desk.Click("frmDB", "imgKO");
    desk.Click("frmKnockOut", "cmdOK");
  }
  Season season;
  StillWorld world;
  Desk desk{world.platform};
};

void FillOf999Players(benchmark::State& state) {
  Selection selection;
  for (auto _ : state) {
    state.PauseTiming();
    selection.desk.Click("frmKnockOut", "cmdReRun");
    state.ResumeTiming();
    selection.desk.Click("frmKnockOut", "cmdOK");
  }
}
BENCHMARK(FillOf999Players)->Unit(benchmark::kMillisecond)->UseRealTime();

void MoveOfAPlayerThereAndBack(benchmark::State& state) {
  Selection selection;
  Desk& desk = selection.desk;
  Control& list = desk.Find("frmKnockOut", "lstAllPlayers");
  Control& table = desk.Find("frmKnockOut", "grdKO");
  for (auto _ : state) {
    desk.Do([&](Hand& hand) { return hand.PickTwice(list, 500); });
    desk.Do([&](Hand& hand) { return hand.DoubleClickCell(table, 1, 1); });
  }
}
BENCHMARK(MoveOfAPlayerThereAndBack)->Unit(benchmark::kMillisecond)->UseRealTime();

}  // namespace
}  // namespace marlowbeck::bench

int main(int argc, char** argv) {
  const QApplication application(argc, argv);
  marlowbeck::ApplyTheme();
  return marlowbeck::bench::RunAndCompare(argc, argv,
                                          {{"FillOf999Players", "NoVisibleWait", 1.0},
                                           {"MoveOfAPlayerThereAndBack", "NoVisibleWait", 1.0}});
}
