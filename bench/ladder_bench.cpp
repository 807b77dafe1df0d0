// The ladder at its limits: the table of 50 teams worked out of 32767 matches, sorted and put in
// its grid, against a plain read of the matches; and the entry panel filled anew at 2000 matches,
// against a frame of the screen and what the disk takes to keep the work date.

#include <chrono>
#include <span>
#include <string>
#include <thread>
#include <vector>

#include <benchmark/benchmark.h>

#include "bench/ratios.h"
#include "bench/season.h"
#include "data/channels.h"
#include "data/real_file_system.h"
#include "ladder/frmLadder.h"
#include "program/program.h"
#include "tests/desktop/still_world.h"

namespace marlowbeck::bench {
namespace {

constexpr int kMatchesOfASeason = 2000;
constexpr std::chrono::milliseconds kFrame{16};

std::string TeamNamed(int index) {
  const int number = index % kTeams + 1;
  return "Team " + std::string(number < 10 ? "0" : "") + std::to_string(number);
}

/// Few games, so that no team's games For leave 16 bits a hundredfold.
LadderRecord MatchOf(int index, int count) {
  LadderRecord match;
  match.HomeTeam = TeamNamed(index);
  match.AwayTeam = TeamNamed(index * 7 + 3 + index / kTeams);
  if (match.AwayTeam == match.HomeTeam) match.AwayTeam = TeamNamed(index + 1);
  match.HomeScore = index % 7 == 0 ? 1 : 0;
  match.AwayScore = index % 11 == 0 ? 1 : 0;
  match.GameDate = Season::GameDate(index * kDates / count);
  return match;
}

/// The ladder's screen over a season with so many matches, with its table on the latest date.
class OpenLadder {
 public:
  explicit OpenLadder(int matches) {
    Lay(matches);
    program_.GetScreens().Show("frmLadder");
    Screen().cmdGotoResults_Click();
    Screen().setTAB1();
  }

  [[nodiscard]] frmLadder& Screen() {
    return static_cast<frmLadder&>(*program_.GetScreens().Find("frmLadder"));
  }
  [[nodiscard]] std::string LadderFile() const { return season_.LadderFile(); }
  [[nodiscard]] std::string Folder() const { return season_.Folder(); }

 private:
  void Lay(int matches) {
    std::vector<std::byte> bytes;
    for (int index = 0; index < matches; ++index) {
      const LadderBytes match = Encode(MatchOf(index, matches));
      bytes.insert(bytes.end(), match.begin(), match.end());
    }
    Write(season_.LadderFile(), bytes);
    WriteText("FileName.qz3", "\"" + season_.PlayerFile() + "\"\r\n");
    WriteText("Limits_A Grade.qzs", "\"At the limits\"\r\n");
    WriteText("Limits_A Grade.qzi", " 2  0  1  4  11 \r\n");
  }
  void WriteText(const std::string& name, const std::string& text) {
    Write(season_.Folder() + "/" + name, std::as_bytes(std::span(text)));
  }
  void Write(const std::string& path, std::span<const std::byte> bytes) {
    const auto file = files_.Open(path, OpenMode::Truncate);
    file->WriteAt(0, bytes);
    file->Close();
  }

  Season season_;
  StillWorld world_;
  RealFileSystem files_;
  Program program_{world_.platform, files_, season_.Folder()};
};

OpenLadder& AtTheLimits() {
  static OpenLadder ladder(kMatches);
  return ladder;
}

OpenLadder& OfASeason() {
  static OpenLadder ladder(kMatchesOfASeason);
  return ladder;
}

void PlainReadOfMatches(benchmark::State& state) {
  for (auto _ : state) benchmark::DoNotOptimize(PlainRead(AtTheLimits().LadderFile()));
}
BENCHMARK(PlainReadOfMatches)->Unit(benchmark::kMicrosecond)->UseRealTime();

void WorkOutTable(benchmark::State& state) {
  frmLadder& screen = AtTheLimits().Screen();
  for (auto _ : state) {
    screen.WorkOutTable();
    if (screen.grdLad.Rows() != kTeams + 1) state.SkipWithError("no table");
  }
}
BENCHMARK(WorkOutTable)->Unit(benchmark::kMicrosecond)->UseRealTime();

/// The work date kept on the disk, as the panel keeps it, and one frame more.
void SyncAndOneFrame(benchmark::State& state) {
  RealFileSystem files;
  Channels channels(files);
  const std::string path = OfASeason().Folder() + "/sync.qz3";
  for (auto _ : state) {
    channels.ReplaceWhole(path, "#2004-03-31#\r\n");
    std::this_thread::sleep_for(kFrame);
  }
}
BENCHMARK(SyncAndOneFrame)->Unit(benchmark::kMicrosecond)->UseRealTime();

void EnterScores(benchmark::State& state) {
  frmLadder& screen = OfASeason().Screen();
  for (auto _ : state) {
    screen.EnterScores();
    if (screen.lstDone.Count() == 0) state.SkipWithError("no matches");
  }
}
BENCHMARK(EnterScores)->Unit(benchmark::kMicrosecond)->UseRealTime();

}  // namespace
}  // namespace marlowbeck::bench

int main(int argc, char** argv) {
  return marlowbeck::bench::RunAndCompare(
      argc, argv,
      {{"WorkOutTable", "PlainReadOfMatches", 3.0}, {"EnterScores", "SyncAndOneFrame", 1.0}});
}
