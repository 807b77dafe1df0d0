// From starting the process to its first painted window: the program against an empty window.

#include <spawn.h>
#include <sys/wait.h>

#include <array>
#include <cstdlib>
#include <filesystem>
#include <string>

#include <QApplication>
#include <QEvent>
#include <QMainWindow>
#include <QTimer>
#include <QWidget>
#include <benchmark/benchmark.h>

#include "bench/ratios.h"
#include "desktop/desktop.h"
#include "desktop/theme.h"

extern char** environ;

namespace marlowbeck::bench {
namespace {

constexpr const char* kProgram = "--program";
constexpr const char* kEmptyWindow = "--empty-window";

/// Ends the process once a window has been painted.
class EndAfterFirstPaint : public QObject {
 public:
  bool eventFilter(QObject* object, QEvent* event) override {
    const auto* widget = qobject_cast<QWidget*>(object);
    if (event->type() == QEvent::Paint && widget != nullptr && widget->window()->isVisible()) {
      QTimer::singleShot(0, [] { std::_Exit(0); });
    }
    return false;
  }
};

int ShowEmptyWindow() {
  QMainWindow window;
  window.resize(800, 600);
  window.show();
  return QApplication::exec();
}

int StartProgram(const std::string& folder) {
  ApplyTheme();
  Desktop desktop(folder, QString::fromStdString(folder));
  return desktop.Start() ? QApplication::exec() : 1;
}

/// What a child process of this program does.
int RunChild(int argc, char** argv) {
  QApplication application(argc, argv);
  EndAfterFirstPaint end;
  application.installEventFilter(&end);
  return std::string(argv[1]) == kProgram ? StartProgram(argv[2]) : ShowEmptyWindow();
}

std::string TemporaryFolder() {
  std::string pattern = (std::filesystem::temp_directory_path() / "marlowbeck-XXXXXX").string();
  if (mkdtemp(pattern.data()) == nullptr) std::abort();
  return pattern;
}

void StartOnce(benchmark::State& state, const char* what, std::string folder) {
  std::string self = std::filesystem::read_symlink("/proc/self/exe").string();
  std::string argument = what;
  const std::array<char*, 4> arguments = {self.data(), argument.data(), folder.data(), nullptr};
  pid_t child = 0;
  int status = 1;
  if (posix_spawn(&child, self.c_str(), nullptr, nullptr, arguments.data(), environ) != 0 ||
      waitpid(child, &status, 0) != child || status != 0) {
    state.SkipWithError("the window did not come up");
  }
}

void EmptyWindow(benchmark::State& state) {
  for (auto _ : state) StartOnce(state, kEmptyWindow, "");
}
BENCHMARK(EmptyWindow)->Unit(benchmark::kMillisecond)->UseRealTime();

void Start(benchmark::State& state) {
  const std::string folder = TemporaryFolder();
  for (auto _ : state) StartOnce(state, kProgram, folder);
  std::filesystem::remove_all(folder);
}
BENCHMARK(Start)->Unit(benchmark::kMillisecond)->UseRealTime();

}  // namespace
}  // namespace marlowbeck::bench

int main(int argc, char** argv) {
  using namespace marlowbeck::bench;
  const std::string first = argc > 1 ? argv[1] : "";
  if (argc > 2 && (first == kProgram || first == kEmptyWindow)) return RunChild(argc, argv);
  return RunAndCompare(argc, argv, {{"Start", "EmptyWindow", 1.5}});
}
