// The weekly results and the progressive details of one team at the limits, side files included,
// against a plain read of the same two files, and against the time that a database takes to answer
// the same two questions from indexed tables of the same data.

#include <string>

#include <benchmark/benchmark.h>

#include "bench/database.h"
#include "bench/ratios.h"
#include "bench/season.h"
#include "data/channels.h"
#include "data/real_file_system.h"
#include "stats/team_reports.h"

namespace marlowbeck::bench {
namespace {

constexpr int kNight = 30;  // most of the season lies behind it
constexpr const char* kTeam = "Team 07";

const Season& InOrder() {
  static const Season season;
  return season;
}

Session TeamSession() {
  Session session = InOrder().OpenSession();
  session.Team = kTeam;
  session.WorkDate = Season::GameDate(kNight);
  return session;
}

void PlainReadOfBothFiles(benchmark::State& state) {
  for (auto _ : state) {
    benchmark::DoNotOptimize(PlainRead(InOrder().PlayerFile()) +
                             PlainRead(InOrder().ResultsFile()));
  }
}
BENCHMARK(PlainReadOfBothFiles)->Unit(benchmark::kMicrosecond)->UseRealTime();

void CalcWeeklyAndCalcProg(benchmark::State& state) {
  RealFileSystem files;
  files.ChangeFolder(InOrder().Folder());
  Channels channels(files);
  Session session = TeamSession();
  TeamReports reports;
  for (auto _ : state) {
    reports.CalcWeekly(session, channels);
    if (session.RowCount == 0) state.SkipWithError("no rows");
    benchmark::DoNotOptimize(reports.CalcProg(session, channels));
  }
}
BENCHMARK(CalcWeeklyAndCalcProg)->Unit(benchmark::kMicrosecond)->UseRealTime();

std::string WeeklyQuestion() {
  const std::string day = std::to_string(Season::GameDate(kNight).days);
  return "SELECT p.name, r.opposition, r.agg, r.shots, r.c180, r.c100, r.hs, r.p1, r.p2, r.p3,"
         " r.p4, r.p5, r.p6, r.forfeit FROM result r JOIN player p ON p.id = r.id"
         " WHERE r.team = '" +
         std::string(kTeam) + "' AND r.day = " + day +
         " ORDER BY CASE WHEN r.forfeit = 'F' THEN 1.0 ELSE r.agg * 1.0 / r.shots END DESC";
}

std::string ProgressiveQuestion() {
  const std::string day = std::to_string(Season::GameDate(kNight).days);
  return "SELECT p.name, sum(r.agg), sum(r.shots), max(r.hs), sum(r.c180), sum(r.c100),"
         " sum((r.p1 > 0) + (r.p2 > 0) + (r.p3 > 0) + (r.p4 > 0) + (r.p5 > 0) + (r.p6 > 0)),"
         " max(max(r.p1, r.p2, r.p3, r.p4, r.p5, r.p6)), count(r.id), sum(r.forfeit = 'F')"
         " FROM player p LEFT JOIN result r ON r.id = p.id AND r.day <= " +
         day + " WHERE p.team = '" + std::string(kTeam) + "' AND p.grade = '" + kGrade +
         "' GROUP BY p.rowid ORDER BY sum(r.agg) * 1.0 / sum(r.shots) DESC";
}

void DatabaseAnswers(benchmark::State& state) {
  static Database database(InOrder().Folder() + "/season.db", InOrder().PlayerFile(),
                           {{kGrade, InOrder().ResultsFile()}},
                           "CREATE INDEX player_id ON player(id);"
                           "CREATE INDEX player_team ON player(team, grade);"
                           "CREATE INDEX result_night ON result(team, day);"
                           "CREATE INDEX result_player ON result(id, day);");
  for (auto _ : state) {
    if (database.Ask(WeeklyQuestion()) == 0 || database.Ask(ProgressiveQuestion()) == 0) {
      state.SkipWithError("no rows");
    }
  }
}
BENCHMARK(DatabaseAnswers)->Unit(benchmark::kMicrosecond)->UseRealTime();

}  // namespace
}  // namespace marlowbeck::bench

int main(int argc, char** argv) {
  return marlowbeck::bench::RunAndCompare(argc, argv,
                                          {{"CalcWeeklyAndCalcProg", "PlainReadOfBothFiles", 5.0},
                                           {"CalcWeeklyAndCalcProg", "DatabaseAnswers", 1.0}});
}
