#pragma once

#include <cstddef>
#include <span>
#include <string_view>

namespace marlowbeck {

// The Best of Three code of a grade: a 3 at the hundreds for the first game, at the tens for the
// second, at the units for the third; 111 for none of them, 0 while nobody has chosen.

inline constexpr int kNoGames = 111;

/// Which games of a match are played as the best of three legs.
struct BestOfThreeChoice {
  bool first = false;
  bool second = false;
  bool third = false;
  bool none = false;  ///< said to be none, whatever the others say

  [[nodiscard]] bool All() const { return first && second && third; }
  friend bool operator==(const BestOfThreeChoice&, const BestOfThreeChoice&) = default;
};

/// 0 where nothing is chosen.
[[nodiscard]] int CodeOf(const BestOfThreeChoice& choice);

/// Nothing chosen for 0 and for a number that is no code.
[[nodiscard]] BestOfThreeChoice ChoiceOf(int code);

/// Puts the code into a player record when it is one of a grade (compared trimmed). Answers whether
/// it is.
bool StampBestOfThree(std::span<std::byte> player, std::string_view grade, int code);

}  // namespace marlowbeck
