// The player list of a score sheet at the limits, against a plain read of the same two files.

#include <memory>

#include <benchmark/benchmark.h>

#include "bench/ratios.h"
#include "bench/season.h"
#include "data/channels.h"
#include "data/real_file_system.h"
#include "results/player_listing.h"

namespace marlowbeck::bench {
namespace {

const Season& TheSeason() {
  static const Season season;
  return season;
}

void PlainReadOfBoth(benchmark::State& state) {
  for (auto _ : state) {
    benchmark::DoNotOptimize(PlainRead(TheSeason().PlayerFile()));
    benchmark::DoNotOptimize(PlainRead(TheSeason().ResultsFile()));
  }
}
BENCHMARK(PlainReadOfBoth)->Unit(benchmark::kMillisecond)->UseRealTime();

void PlayerList(benchmark::State& state) {
  RealFileSystem files;
  Channels channels(files);
  Session session = TheSeason().OpenSession();
  session.Team = "Team 01";
  session.WorkDate = Season::GameDate(20);
  for (auto _ : state) {
    const PlayerListing listing = ReadPlayerListing(session, channels, "Team 02");
    benchmark::DoNotOptimize(listing.ToEnter());
    benchmark::DoNotOptimize(listing.Entered());
  }
}
BENCHMARK(PlayerList)->Unit(benchmark::kMillisecond)->UseRealTime();

}  // namespace
}  // namespace marlowbeck::bench

int main(int argc, char** argv) {
  return marlowbeck::bench::RunAndCompare(argc, argv, {{"PlayerList", "PlainReadOfBoth", 3.0}});
}
