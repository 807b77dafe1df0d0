#include "setup/best_of_three_boxes.h"

namespace marlowbeck {

BestOfThreeBoxes::BestOfThreeBoxes(const Owner& owner, const std::array<std::string_view, 5>& names)
    : first(owner, names[0]),
      second(owner, names[1]),
      third(owner, names[2]),
      all(owner, names[3], "All"),
      none(owner, names[4], "None") {
  for (CheckBox* game : {&first, &second, &third}) {
    game->Click = [this, game] { Game_Click(*game); };
  }
  all.Click = [this] { All_Click(); };
  none.Click = [this] { None_Click(); };
}

void BestOfThreeBoxes::Caption(const std::array<std::string, 6>& game_names) {
  first.SetCaption(game_names[0]);
  second.SetCaption(game_names[1]);
  third.SetCaption(game_names[2]);
}

int BestOfThreeBoxes::Code() const {
  return CodeOf({first.Value(), second.Value(), third.Value(), none.Value()});
}

void BestOfThreeBoxes::SetCode(int code) {
  const BestOfThreeChoice choice = ChoiceOf(code);
  first.SetValue(choice.first);
  second.SetValue(choice.second);
  third.SetValue(choice.third);
  all.SetValue(choice.All());
  none.SetValue(choice.none);
}

void BestOfThreeBoxes::SetGames(bool ticked) {
  for (CheckBox* game : {&first, &second, &third}) game->SetValue(ticked);
}

void BestOfThreeBoxes::Game_Click(const CheckBox& game) {
  if (game.Value()) none.SetValue(false);
  all.SetValue(first.Value() && second.Value() && third.Value());
  if (Changed) Changed();
}

void BestOfThreeBoxes::All_Click() {
  if (all.Value()) {
    SetGames(true);
    none.SetValue(false);
  }
  if (Changed) Changed();
}

void BestOfThreeBoxes::None_Click() {
  if (none.Value()) {
    SetGames(false);
    all.SetValue(false);
  }
  if (Changed) Changed();
}

}  // namespace marlowbeck
