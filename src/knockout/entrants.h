#pragma once

#include <array>
#include <string>
#include <string_view>
#include <vector>

#include "data/records.h"

namespace marlowbeck {

inline constexpr int kMostEntrants = 64;
/// Stands in a grade's place for all of them.
inline constexpr const char* kAllGrades = "All Association Grades";

/// Somebody who can be, or is, in a knock-out. Without a name it is a free place.
struct Entrant {
  std::string name;  ///< "Surname, First name"
  std::string grade;

  [[nodiscard]] bool IsFree() const { return name.empty(); }
  friend bool operator==(const Entrant&, const Entrant&) = default;
};

/// The places of a knock-out in the order of the draw.
using Places = std::array<Entrant, kMostEntrants>;

/// "Surname, First name : Grade", the line of a list of players.
[[nodiscard]] std::string LineOf(const Entrant& entrant);

/// Every player of a competition by the line that the list of available players has for them.
class Available {
 public:
  /// To be handed the player records in file order. Throws SubscriptOutOfRange for more than 1000.
  const Entrant& Add(const PlayerView& player);
  void Clear();

  /// The first of those that a line stands for. A line that stands for nobody any more, such as
  /// that of a player of an old list, is taken apart.
  [[nodiscard]] Entrant Behind(std::string_view line) const;

 private:
  std::vector<Entrant> players_;
  std::vector<std::string> lines_;
};

}  // namespace marlowbeck
