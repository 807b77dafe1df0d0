#pragma once

#include <array>
#include <string>
#include <string_view>

#include "setup/best_of_three.h"
#include "ui/controls.h"

namespace marlowbeck {

/// The five check boxes that choose the games played as the best of three: one for each game, All
/// and None, which keep each other true.
struct BestOfThreeBoxes {
  /// `names` are those of the three games' boxes, of All and of None.
  BestOfThreeBoxes(const Owner& owner, const std::array<std::string_view, 5>& names);

  CheckBox first;
  CheckBox second;
  CheckBox third;
  CheckBox all;
  CheckBox none;

  /// After a person has changed any of them.
  Handler Changed;

  /// Names the boxes of the games.
  void Caption(const std::array<std::string, 6>& game_names);
  /// The code that the boxes show; 0 while none is ticked.
  [[nodiscard]] int Code() const;
  /// Ticks what agrees with a code.
  void SetCode(int code);

 private:
  void SetGames(bool ticked);
  void Game_Click(const CheckBox& game);
  void All_Click();
  void None_Click();
};

}  // namespace marlowbeck
