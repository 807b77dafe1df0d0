// The renaming of a team and the deletion of a player at the limits, each against a plain copy of
// the files that it rewrites.

#include <string>
#include <utility>

#include <benchmark/benchmark.h>

#include "bench/ratios.h"
#include "bench/season.h"
#include "data/channels.h"
#include "data/competition.h"
#include "data/real_file_system.h"
#include "setup/player_deletion.h"
#include "setup/player_names.h"
#include "setup/renames.h"

namespace marlowbeck::bench {
namespace {

const Season& TheSeason() {
  static const Season season;
  return season;
}

void PlainCopyOfAllThree(benchmark::State& state) {
  const std::string to = TheSeason().Folder() + "/copy";
  for (auto _ : state) {
    PlainCopy(TheSeason().PlayerFile(), to);
    PlainCopy(TheSeason().ResultsFile(), to);
    PlainCopy(TheSeason().LadderFile(), to);
  }
}
BENCHMARK(PlainCopyOfAllThree)->Unit(benchmark::kMillisecond)->UseRealTime();

void RenameTeam(Session& session, Channels& channels, const Renaming& team) {
  OpenFile(session, channels);
  if (TeamInUse(channels, team.to)) return;
  OpenFile(session, channels);
  RenameTeamOfPlayers(channels, session.Grade, team);
  OpenResultSFile(session, channels);
  RenameTeamInResults(channels, team);
  OpenLadderFile(session, channels);
  RenameTeamInMatches(channels, team);
}

/// One name is given and taken back in turn.
void TeamRename(benchmark::State& state) {
  const Season season;
  RealFileSystem files;
  Channels channels(files);
  Session session = season.OpenSession();
  Renaming team{"Team 01", "Another name"};
  for (auto _ : state) {
    RenameTeam(session, channels, team);
    std::swap(team.from, team.to);
  }
}
BENCHMARK(TeamRename)->Unit(benchmark::kMillisecond)->UseRealTime();

void PlainCopyOfPlayersAndResults(benchmark::State& state) {
  const std::string to = TheSeason().Folder() + "/copy";
  for (auto _ : state) {
    PlainCopy(TheSeason().PlayerFile(), to);
    PlainCopy(TheSeason().ResultsFile(), to);
  }
}
BENCHMARK(PlainCopyOfPlayersAndResults)->Unit(benchmark::kMillisecond)->UseRealTime();

/// Player 500, whose team is the fiftieth. Answers how many results went.
int DeletePlayer(Session& session, Channels& channels) {
  OpenFile(session, channels);
  const auto player = FirstListed(channels, {"Team 50", kGrade, "Surname 500, First 500"});
  channels.CloseAll();
  if (!player) return 0;
  OpenResultSFile(session, channels);
  const int results = CountResultsOf(channels, player->id);
  channels.CloseAll();
  OpenResultSFile(session, channels);
  RemoveResultsOf(channels, player->id);
  OpenFile(session, channels);
  RemovePlayer(channels, player->id);
  return results;
}

void PlayerDeletion(benchmark::State& state) {
  const Season season;
  RealFileSystem files;
  Channels channels(files);
  Session session = season.OpenSession();
  for (auto _ : state) {
    state.PauseTiming();
    PlainCopy(TheSeason().PlayerFile(), season.PlayerFile());
    PlainCopy(TheSeason().ResultsFile(), season.ResultsFile());
    state.ResumeTiming();
    if (DeletePlayer(session, channels) == 0) state.SkipWithError("the player is not there");
  }
}
BENCHMARK(PlayerDeletion)->Unit(benchmark::kMillisecond)->UseRealTime();

}  // namespace
}  // namespace marlowbeck::bench

int main(int argc, char** argv) {
  return marlowbeck::bench::RunAndCompare(
      argc, argv,
      {{"TeamRename", "PlainCopyOfAllThree", 4.0},
       {"PlayerDeletion", "PlainCopyOfPlayersAndResults", 4.0}});
}
