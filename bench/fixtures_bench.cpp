// From the answer of the entry dialog to the painted chart of 50 teams, against a frame of a
// display that shows sixty in a second.

#include <filesystem>
#include <string>

#include <QApplication>
#include <benchmark/benchmark.h>

#include "bench/ratios.h"
#include "data/real_file_system.h"
#include "desktop/theme.h"
#include "desktop/windows.h"
#include "program/program.h"
#include "tests/desktop/still_world.h"

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

std::string TemporaryFolder() {
  std::string pattern = (std::filesystem::temp_directory_path() / "marlowbeck-XXXXXX").string();
  if (mkdtemp(pattern.data()) == nullptr) std::abort();
  return pattern;
}

void ChartOfFiftyTeams(benchmark::State& state) {
  const std::string folder = TemporaryFolder();
  {
    FiftyTeams world;
    RealFileSystem files;
    Program program(world.platform, files, folder);
    Windows windows(program.GetScreens(), program.GetHand(), [] {});
    program.Start();
    windows.Refresh();
    const auto click = [&](const char* screen, const char* control) {
      Control& clicked = *program.GetScreens().Find(screen)->Find(control);
      windows.Do(nullptr, [&](Hand& hand) { return hand.Click(clicked); });
      QApplication::processEvents();
    };
    for (auto _ : state) {
      click("frmDB", "mnuFix");
      const Screen* const fixtures = program.GetScreens().Find("frmFixtures");
      if (fixtures == nullptr) return state.SkipWithError("no chart");
      windows.WindowOf(*fixtures)->Window().repaint();
      state.PauseTiming();
      click("frmFixtures", "cmdFixCancel");
      state.ResumeTiming();
    }
  }
  std::filesystem::remove_all(folder);
}
BENCHMARK(ChartOfFiftyTeams)->Unit(benchmark::kMillisecond)->UseRealTime();

}  // namespace
}  // namespace marlowbeck::bench

int main(int argc, char** argv) {
  const QApplication application(argc, argv);
  marlowbeck::ApplyTheme();
  return marlowbeck::bench::RunAndCompare(argc, argv, {{"ChartOfFiftyTeams", "AFrame", 1.0}});
}
