#pragma once

#include <optional>

#include "drive/world.h"

namespace marlowbeck {

/// What the driver is started with.
struct DriveOptions {
  WorldSettings world;
  bool window = false;
};

/// Reads the command line and makes the working folder when it is missing. Answers nothing, with
/// `exit_status` set, when the driver is to end at once: 0 after help, 2 when the arguments make no
/// sense, which is told on standard error.
[[nodiscard]] std::optional<DriveOptions> ReadOptions(int argc, const char* const* argv,
                                                      int& exit_status);

}  // namespace marlowbeck
