#pragma once

#include <array>
#include <string>
#include <string_view>
#include <vector>

#include "data/records.h"

namespace marlowbeck {

/// The players whose surname has a text in it, in whatever letters it is written. Fed with the
/// records of the player file, each once and in order.
class NameSearch {
 public:
  /// `text` is in capitals.
  explicit NameSearch(std::string_view text) : text_(text) {}

  void Add(Bytes player);

  [[nodiscard]] int Count() const { return static_cast<int>(found_.size()); }
  /// Surname, first name, team and grade of one who was found, counted from 0, each as the record
  /// holds it, padding included.
  [[nodiscard]] std::array<std::string_view, 4> Row(int place) const;

 private:
  std::string text_;
  std::vector<PlayerBytes> found_;
};

}  // namespace marlowbeck
