// The players list of a grade and the search for a name at the limits, against a plain read of the
// player file.

#include <benchmark/benchmark.h>

#include "bench/ratios.h"
#include "bench/season.h"
#include "data/channels.h"
#include "data/competition.h"
#include "data/real_file_system.h"
#include "season/name_search.h"
#include "season/team_lists.h"

namespace marlowbeck::bench {
namespace {

const Season& TheSeason() {
  static const Season season;
  return season;
}

void PlainReadOfPlayers(benchmark::State& state) {
  for (auto _ : state) benchmark::DoNotOptimize(PlainRead(TheSeason().PlayerFile()));
}
BENCHMARK(PlainReadOfPlayers)->Unit(benchmark::kMicrosecond)->UseRealTime();

void PlayersListOfAGrade(benchmark::State& state) {
  RealFileSystem files;
  Channels channels(files);
  Session session = TheSeason().OpenSession();
  for (auto _ : state) {
    TeamLists teams(session.Grade);
    OpenFile(session, channels);
    channels.ForEachRecord(Channel::Players,
                           [&](Bytes record, int) { teams.Add(PlayerView(record)); });
    channels.CloseAll();
    if (teams.TakeLines().size() != kPlayers + 3 * kTeams) state.SkipWithError("not everybody");
  }
}
BENCHMARK(PlayersListOfAGrade)->Unit(benchmark::kMicrosecond)->UseRealTime();

void SearchThatFindsEverybody(benchmark::State& state) {
  RealFileSystem files;
  Channels channels(files);
  Session session = TheSeason().OpenSession();
  for (auto _ : state) {
    NameSearch search("NAME");
    OpenFile(session, channels);
    channels.ForEachRecord(Channel::Players, [&](Bytes record, int) { search.Add(record); });
    channels.CloseAll();
    if (search.Count() != kPlayers) state.SkipWithError("not everybody");
    for (int place = 0; place < search.Count(); ++place) {
      benchmark::DoNotOptimize(search.Row(place));
    }
  }
}
BENCHMARK(SearchThatFindsEverybody)->Unit(benchmark::kMicrosecond)->UseRealTime();

}  // namespace
}  // namespace marlowbeck::bench

int main(int argc, char** argv) {
  return marlowbeck::bench::RunAndCompare(
      argc, argv,
      {{"PlayersListOfAGrade", "PlainReadOfPlayers", 5.0},
       {"SearchThatFindsEverybody", "PlainReadOfPlayers", 5.0}});
}
