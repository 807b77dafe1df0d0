#pragma once

#include <functional>
#include <string>
#include <vector>

#include "support/club.h"

namespace marlowbeck {

/// A piece of work to be broken at every file operation. Sweeps work the models alone: what is
/// broken lies below the screens, where both faces are one, and a sweep starts the program hundreds
/// of times.
struct SweptWork {
  /// Lays the files and leads up to the work.
  std::function<void(Club&)> prepare;
  /// The lines of the work, the last of which acts. They may end in any way.
  std::vector<std::string> lines;
  /// Looks at what is left: the old or the new, and nothing between. After a power cut the program
  /// has been started anew.
  std::function<void(Club&)> check;
};

/// Runs the work in a new club with its first file operation failing with an error number, with its
/// second, and so on until it goes through. Answers how many operations it has; a work without any
/// fails the test.
int SweepFailures(const SweptWork& work, int error_number = 61);

/// The same with every write in turn leaving only half of its bytes on the disk before it fails.
int SweepCutWrites(const SweptWork& work, int error_number = 61);

/// The same with the power cut in the place of each operation.
int SweepPowerCuts(const SweptWork& work);

}  // namespace marlowbeck
