#pragma once

#include <optional>
#include <string_view>

#include "drive/command_table.h"

namespace marlowbeck {

/// The whole program with a script in the place of mouse, keyboard, printer and clock: a line in,
/// an answer out.
class Driver {
 public:
  /// Starts the program.
  explicit Driver(const WorldSettings& settings, const FaceMaker& make_face = MakeModelFace,
                  const Program::Registration& registration = RegisterScreens);

  /// The answer to one line of UTF-8, with or without its line end; nothing for one that is passed
  /// over. Throws nothing of its own; what a crash that is a test's own throws goes through.
  std::optional<Json> Answer(std::string_view line);

  [[nodiscard]] World& GetWorld() { return world_; }

 private:
  Json Carry(const std::string& line);

  CommandTable commands_;
  World world_;
};

}  // namespace marlowbeck
