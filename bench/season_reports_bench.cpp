// Peg ratios of a grade and the season reports of its players at the limits, against a plain read
// of the files that they read.

#include <string>

#include <benchmark/benchmark.h>

#include "bench/ratios.h"
#include "bench/season.h"
#include "data/channels.h"
#include "data/competition.h"
#include "data/real_file_system.h"
#include "season/peg_ratios.h"
#include "season/season_results.h"

namespace marlowbeck::bench {
namespace {

const Season& TheSeason() {
  static const Season season;
  return season;
}

void PlainReadOfBothFiles(benchmark::State& state) {
  for (auto _ : state) {
    benchmark::DoNotOptimize(PlainRead(TheSeason().PlayerFile()) +
                             PlainRead(TheSeason().ResultsFile()));
  }
}
BENCHMARK(PlainReadOfBothFiles)->Unit(benchmark::kMicrosecond)->UseRealTime();

void Ratios(benchmark::State& state) {
  RealFileSystem files;
  Channels channels(files);
  Session session = TheSeason().OpenSession();
  for (auto _ : state) {
    PegRatios ratios(session.Grade);
    OpenFile(session, channels);
    channels.ForEachRecord(Channel::Players,
                           [&](Bytes record, int) { ratios.AddPlayer(PlayerView(record)); });
    OpenResultSFile(session, channels);
    channels.ForEachRecord(Channel::Results,
                           [&](Bytes record, int) { ratios.AddResult(ResultView(record)); });
    channels.CloseAll();
    std::vector<RatioRow> rows = ratios.Rows();
    if (rows.empty()) state.SkipWithError("no rows");
    SortRatios(rows, RatioOrder::HighToLow);
    SideFileWriter writer;
    WriteRatios(writer, rows);
    benchmark::DoNotOptimize(writer.Content().size());
  }
}
BENCHMARK(Ratios)->Unit(benchmark::kMicrosecond)->UseRealTime();

void OneSeasonReport(benchmark::State& state) {
  RealFileSystem files;
  Channels channels(files);
  Session session = TheSeason().OpenSession();
  for (auto _ : state) {
    const SeasonResults season(session, channels);
    if (season.ReportOf(7).Games().empty()) state.SkipWithError("no games");
    SideFileWriter writer;
    WriteAnnual(writer, season.NameOf(7), season.ReportOf(7));
    benchmark::DoNotOptimize(writer.Content().size());
  }
}
BENCHMARK(OneSeasonReport)->Unit(benchmark::kMicrosecond)->UseRealTime();

/// A thousand reports, side files included, against a second.
void ASecond(benchmark::State& state) {
  for (auto _ : state) state.SetIterationTime(1);
}
BENCHMARK(ASecond)->Unit(benchmark::kMillisecond)->UseManualTime()->Iterations(1);

void SeasonReportsOfAll(benchmark::State& state) {
  RealFileSystem files;
  Channels channels(files);
  Session session = TheSeason().OpenSession();
  const std::string work_file = TheSeason().Folder() + "/season.qz3";
  for (auto _ : state) {
    const SeasonResults season(session, channels);
    for (int id = 1; id <= kPlayers; ++id) {
      channels.OpenOutput(Channel::Side, work_file, Keeping::Working);
      WriteAnnual(channels.Writer(Channel::Side), season.NameOf(id), season.ReportOf(id));
      channels.CloseAll();
    }
  }
}
BENCHMARK(SeasonReportsOfAll)->Unit(benchmark::kMillisecond)->UseRealTime()->Iterations(1);

}  // namespace
}  // namespace marlowbeck::bench

int main(int argc, char** argv) {
  return marlowbeck::bench::RunAndCompare(argc, argv,
                                          {{"Ratios", "PlainReadOfBothFiles", 5.0},
                                           {"OneSeasonReport", "PlainReadOfBothFiles", 5.0},
                                           {"SeasonReportsOfAll", "ASecond", 1.0}});
}
