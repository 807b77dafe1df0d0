#pragma once

#include <string>
#include <vector>

namespace marlowbeck::bench {

/// One benchmark's time told in times of another one's from the same run.
struct Ratio {
  std::string of;      ///< name of a registered benchmark
  std::string to;      ///< name of the one it is measured against
  double at_most = 0;  ///< what it may not exceed
};

/// Runs the registered benchmarks, nine times each in turn, and prints a line for each ratio of
/// their median times. Answers the program's exit status: 1 when one exceeds what it may be.
[[nodiscard]] int RunAndCompare(int argc, char** argv, const std::vector<Ratio>& ratios);

}  // namespace marlowbeck::bench
