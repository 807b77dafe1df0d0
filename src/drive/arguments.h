#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "data/date.h"

namespace marlowbeck {

/// A line of a script as the program's own text: from UTF-8 to code page 1252, with escapes for
/// what has no place there, and without the line end. Nothing for a line that is passed over: an
/// empty one or a comment.
[[nodiscard]] std::optional<std::string> ReadScriptLine(std::string_view line);

/// What stands in a script line, taken off from the front. All that cannot be read is a Refusal
/// that names the command, the control that it is about, and what is wrong.
class Arguments {
 public:
  explicit Arguments(std::string_view line);

  [[nodiscard]] const std::string& Command() const { return command_; }
  /// What the command turns out to be about: refusals name it from here on.
  void About(std::string_view name) { about_ = name; }
  [[nodiscard]] bool AtEnd() const;

  /// The next word, which `what` names to the reader of a refusal.
  std::string Word(std::string_view what);
  /// A whole number, no smaller than `least`.
  int Number(std::string_view what, int least);
  Date Day(std::string_view what);
  /// All that follows the one blank after the last word, blanks included, as a name of the disk;
  /// may be empty.
  std::string RestAsName();
  /// The same without escapes.
  std::string Rest();
  /// The same as what is typed into a box, as a name or without escapes. Refuses what no key writes
  /// there.
  std::string TypedName();
  std::string Typed();
  /// Refuses when anything is left.
  void Finish() const;

  [[noreturn]] void Refuse(std::string_view why) const;

 private:
  std::string command_;
  std::string about_;
  std::string_view rest_;
};

/// A word that is a whole number and nothing else.
[[nodiscard]] std::optional<int> WholeNumber(std::string_view word);

}  // namespace marlowbeck
