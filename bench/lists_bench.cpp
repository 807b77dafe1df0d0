// The lists of the highest and the averages of all grades at the limits, side files included,
// against a plain read of the files that each of them reads, and against the time that a database
// takes to answer the same question from indexed tables of the same data.

#include <array>
#include <filesystem>
#include <string>
#include <vector>

#include <benchmark/benchmark.h>

#include "bench/database.h"
#include "bench/ratios.h"
#include "bench/season.h"
#include "data/channels.h"
#include "data/real_file_system.h"
#include "stats/grade_reports.h"

namespace marlowbeck::bench {
namespace {

constexpr int kNight = 30;  // most of the season lies behind it
const std::vector<std::string> kGrades = {"A Grade", "B Grade", "C Grade"};

/// A season at the limits in each of three grades: the same results for the first and the third,
/// another order of them for the second.
class ThreeGrades {
 public:
  ThreeGrades() {
    namespace fs = std::filesystem;
    fs::copy_file(Season(Entry::Shuffled).ResultsFile(), ResultsFile(1));
    fs::copy_file(ResultsFile(0), ResultsFile(2));
  }
  [[nodiscard]] std::string Folder() const { return season_.Folder(); }
  [[nodiscard]] std::string PlayerFile() const { return season_.PlayerFile(); }
  [[nodiscard]] std::string ResultsFile(std::size_t grade) const {
    return season_.Folder() + "/Limits_" + kGrades[grade] + ".qzr";
  }
  [[nodiscard]] Session OpenSession() const {
    Session session = season_.OpenSession();
    session.WorkDate = Season::GameDate(kNight);
    return session;
  }

 private:
  Season season_;
};

const ThreeGrades& Club() {
  static const ThreeGrades club;
  return club;
}

Database& TheDatabase() {
  static Database database(Club().Folder() + "/season.db", Club().PlayerFile(),
                           {{kGrades[0], Club().ResultsFile(0)},
                            {kGrades[1], Club().ResultsFile(1)},
                            {kGrades[2], Club().ResultsFile(2)}},
                           "CREATE INDEX player_id ON player(id);"
                           "CREATE INDEX result_date ON result(grade, day);"
                           "CREATE INDEX result_player ON result(id, grade, day);");
  return database;
}

/// What a list ranks by, in the database's words: of a result, and of a player's results.
struct ListQuestion {
  std::string name;
  std::string of_result;
  std::string of_player;
};

const std::string kPegCount =
    "(r.p1 > 0) + (r.p2 > 0) + (r.p3 > 0) + (r.p4 > 0) + (r.p5 > 0) + (r.p6 > 0)";
const std::string kHighestPeg = "max(r.p1, r.p2, r.p3, r.p4, r.p5, r.p6)";
const std::array<ListQuestion, 6> kLists = {{
    {"Averages", "CAST(r.agg * 100.0 / r.shots AS INTEGER) / 100.0",
     "CAST(sum(max(r.agg, 0)) * 100.0 / sum(max(r.shots, 0)) AS INTEGER) / 100.0"},
    {"HighPegs", kHighestPeg, "max(" + kHighestPeg + ")"},
    {"HighScores", "r.hs", "max(r.hs)"},
    {"MostPegs", kPegCount, "sum(" + kPegCount + ")"},
    {"Centuries", "r.c100", "sum(r.c100)"},
    {"Scores180", "r.c180", "sum(r.c180)"},
}};

std::string Day() { return std::to_string(Season::GameDate(kNight).days); }

/// Of several players with one id the first one has the name.
std::string DateQuestion(const ListQuestion& list) {
  return "SELECT r.id, (SELECT p.name FROM player p WHERE p.id = r.id ORDER BY p.rowid LIMIT 1),"
         " r.team, " +
         list.of_result + " AS value FROM result r WHERE r.grade = '" + kGrades[0] +
         "' AND r.day = " + Day() +
         " AND r.agg >= 1 AND r.shots > 0 AND value > 0 ORDER BY value DESC";
}

std::string ProgressiveQuestion(const ListQuestion& list) {
  return "SELECT p.id, p.name, p.team, " + list.of_player +
         " AS value, sum(r.agg > 0 AND r.shots > 0) FROM player p JOIN result r ON r.id = p.id"
         " AND r.grade = '" +
         kGrades[0] + "' AND r.day <= " + Day() +
         " GROUP BY p.rowid HAVING value > 0 ORDER BY value DESC";
}

/// Of the sums of each grade that of the last one counts, and the games of all.
std::string CombinedQuestion() {
  return "WITH sums AS (SELECT id, grade, sum(max(agg, 0)) AS points, sum(max(shots, 0)) AS thrown,"
         " sum(agg > 0 AND shots > 0) AS games FROM result WHERE day <= " +
         Day() +
         " GROUP BY id, grade)"
         " SELECT p.id, p.name, p.team, p.grade, max(s.grade),"
         " CAST(s.points * 100.0 / s.thrown AS INTEGER) / 100.0 AS value, sum(s.games)"
         " FROM player p JOIN sums s ON s.id = p.id WHERE s.points > 0 AND s.thrown > 0"
         " GROUP BY p.rowid ORDER BY value DESC";
}

using Work = void (*)(Session& session, Channels& channels);

void AllGrades(Session& session, Channels& channels) {
  CombineAV(session, channels, kGrades);
  CombineSort(session, channels, CombinedOrder::ByAverage);
}

void MeasureReport(benchmark::State& state, int choice, Work work) {
  RealFileSystem files;
  files.ChangeFolder(Club().Folder());
  Channels channels(files);
  Session session = Club().OpenSession();
  session.ReportChoice = choice;
  for (auto _ : state) {
    work(session, channels);
    if (session.RowCount == 0) state.SkipWithError("no rows");
  }
}

void MeasureQuestion(benchmark::State& state, const std::string& question) {
  for (auto _ : state) {
    if (TheDatabase().Ask(question) == 0) state.SkipWithError("no rows");
  }
}

void MeasurePlainRead(benchmark::State& state, std::size_t grades) {
  for (auto _ : state) {
    std::uint64_t sum = PlainRead(Club().PlayerFile());
    for (std::size_t grade = 0; grade < grades; ++grade)
      sum += PlainRead(Club().ResultsFile(grade));
    benchmark::DoNotOptimize(sum);
  }
}

template <typename Function, typename... Arguments>
std::string Register(const std::string& name, Function function, Arguments... arguments) {
  benchmark::RegisterBenchmark(name.c_str(),
                               [=](benchmark::State& state) { function(state, arguments...); })
      ->Unit(benchmark::kMicrosecond)
      ->UseRealTime();
  return name;
}

/// A report against the files and the database.
void Add(std::vector<Ratio>& ratios, const std::string& report, const std::string& plain,
         const std::string& database) {
  ratios.push_back({report, plain, 5.0});
  ratios.push_back({report, database, 1.0});
}

std::vector<Ratio> RegisterAll() {
  std::vector<Ratio> ratios;
  const auto one_grade = Register("PlainReadOfOneGrade", MeasurePlainRead, std::size_t{1});
  const auto all_grades = Register("PlainReadOfAllGrades", MeasurePlainRead, kGrades.size());
  int choice = 0;
  for (const ListQuestion& list : kLists) {
    Add(ratios, Register("Date" + list.name, MeasureReport, choice, CalcHi), one_grade,
        Register("DatabaseDate" + list.name, MeasureQuestion, DateQuestion(list)));
    Add(ratios, Register("Progressive" + list.name, MeasureReport, choice, CalcHiProg), one_grade,
        Register("DatabaseProgressive" + list.name, MeasureQuestion, ProgressiveQuestion(list)));
    ++choice;
  }
  Add(ratios, Register("CombinedAverages", MeasureReport, 0, AllGrades), all_grades,
      Register("DatabaseCombinedAverages", MeasureQuestion, CombinedQuestion()));
  return ratios;
}

}  // namespace
}  // namespace marlowbeck::bench

int main(int argc, char** argv) {
  return marlowbeck::bench::RunAndCompare(argc, argv, marlowbeck::bench::RegisterAll());
}
