// The copier over a competition of three grades at the limits, against the system's own copy of the
// same files with a sync of each.

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>

#include <benchmark/benchmark.h>

#include "bench/ratios.h"
#include "data/real_file_system.h"
#include "data/records.h"
#include "filecopy/whole_copy.h"

namespace marlowbeck::bench {
namespace {

namespace fs = std::filesystem;

constexpr std::size_t kMostRecords = 32767;
constexpr std::size_t kMostPlayers = 999;

/// A folder with the files of the competition, and one that is empty before each copy.
class Competition {
 public:
  Competition() : folder_(fs::temp_directory_path() / "marlowbeck-copy-bench") {
    fs::remove_all(folder_);
    fs::create_directories(From());
    Make("Winter.qza", kMostPlayers * kPlayerLength);
    for (const std::string grade : {"A Grade", "B Grade", "C Grade"}) {
      Make("Winter_" + grade + ".qzr", kMostRecords * kResultLength);
      Make("Winter_" + grade + ".qzl", kMostRecords * kLadderLength);
      Make("Winter_" + grade + ".qzi", 40);
      Make("Winter_" + grade + ".qzs", 30);
    }
  }
  Competition(const Competition&) = delete;
  Competition& operator=(const Competition&) = delete;
  ~Competition() { fs::remove_all(folder_); }

  [[nodiscard]] fs::path From() const { return folder_ / "from"; }
  [[nodiscard]] fs::path To() const { return folder_ / "to"; }
  void EmptyTarget() const {
    fs::remove_all(To());
    fs::create_directory(To());
  }

 private:
  void Make(const std::string& name, std::size_t length) const {
    std::ofstream(From() / name, std::ios::binary) << std::string(length, 'x');
  }

  fs::path folder_;
};

const Competition& Files() {
  static const Competition competition;
  return competition;
}

void SystemsCopyWithSync(benchmark::State& state) {
  const std::string to = Files().To().string();
  const std::string command =
      "cp -p " + Files().From().string() + "/* " + to + " && sync " + to + "/* " + to;
  for (auto _ : state) {
    state.PauseTiming();
    Files().EmptyTarget();
    state.ResumeTiming();
    if (std::system(command.c_str()) != 0) state.SkipWithError("cp and sync failed");  // NOLINT
  }
}
BENCHMARK(SystemsCopyWithSync)->Unit(benchmark::kMillisecond)->UseRealTime();

void CopyOfACompetition(benchmark::State& state) {
  RealFileSystem files;
  for (auto _ : state) {
    state.PauseTiming();
    Files().EmptyTarget();
    state.ResumeTiming();
    for (const auto& entry : fs::directory_iterator(Files().From())) {
      CopyWhole(files, entry.path().string(), Files().To().string());
    }
    files.SyncFolder(Files().To().string());
  }
}
BENCHMARK(CopyOfACompetition)->Unit(benchmark::kMillisecond)->UseRealTime();

}  // namespace
}  // namespace marlowbeck::bench

int main(int argc, char** argv) {
  return marlowbeck::bench::RunAndCompare(argc, argv,
                                          {{"CopyOfACompetition", "SystemsCopyWithSync", 1.2}});
}
