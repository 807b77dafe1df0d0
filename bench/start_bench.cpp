// From starting the process to its first painted window: the program against an empty window.
// To be run on a display. Drawn offscreen, the empty window needs nothing of what a window on a
// display needs, and the ratio is larger.

#include <spawn.h>
#include <sys/wait.h>

#include <array>
#include <filesystem>
#include <string>

#include <QApplication>
#include <benchmark/benchmark.h>

#include "bench/first_paint.h"
#include "bench/ratios.h"
#include "desktop/desktop.h"
#include "desktop/fonts_ahead.h"
#include "desktop/theme.h"

extern char** environ;

namespace marlowbeck::bench {
namespace {

constexpr const char* kProgram = "--program";

/// What main() does, in a folder of the measurement's own.
int StartProgram(int argc, char** argv) {
  FontsAhead fonts;
  QApplication application(argc, argv);
  EndAfterFirstPaint end;
  application.installEventFilter(&end);
  ApplyTheme();
  const QString folder = QString::fromLocal8Bit(argv[2]);
  Desktop desktop(folder, folder);
  return desktop.Start([&fonts] { fonts.Wait(); }) ? QApplication::exec() : 1;
}

std::string TemporaryFolder() {
  std::string pattern = (std::filesystem::temp_directory_path() / "marlowbeck-XXXXXX").string();
  if (mkdtemp(pattern.data()) == nullptr) std::abort();
  return pattern;
}

const std::filesystem::path& Self() {
  static const std::filesystem::path self = std::filesystem::read_symlink("/proc/self/exe");
  return self;
}

/// Runs a program of the two, which ends itself once its window is painted.
void StartOnce(benchmark::State& state, const std::filesystem::path& program, std::string folder) {
  std::string path = program.string();
  std::string argument = kProgram;
  const std::array<char*, 4> arguments = {path.data(), argument.data(), folder.data(), nullptr};
  pid_t child = 0;
  int status = 1;
  if (posix_spawn(&child, path.c_str(), nullptr, nullptr, arguments.data(), environ) != 0 ||
      waitpid(child, &status, 0) != child || status != 0) {
    state.SkipWithError("the window did not come up");
  }
}

void EmptyWindow(benchmark::State& state) {
  for (auto _ : state) {
    StartOnce(state, Self().parent_path() / "empty_window", "");
  }
}
BENCHMARK(EmptyWindow)->Unit(benchmark::kMillisecond)->UseRealTime();

void Start(benchmark::State& state) {
  const std::string folder = TemporaryFolder();
  for (auto _ : state) StartOnce(state, Self(), folder);
  std::filesystem::remove_all(folder);
}
BENCHMARK(Start)->Unit(benchmark::kMillisecond)->UseRealTime();

}  // namespace
}  // namespace marlowbeck::bench

int main(int argc, char** argv) {
  using namespace marlowbeck::bench;
  if (argc > 2 && std::string(argv[1]) == kProgram) return StartProgram(argc, argv);
  return RunAndCompare(argc, argv, {{"Start", "EmptyWindow", 1.5}});
}
