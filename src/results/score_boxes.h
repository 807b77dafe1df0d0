#pragma once

#include <array>
#include <string_view>

#include "data/records.h"
#include "results/score_rules.h"
#include "ui/context.h"
#include "ui/controls.h"

namespace marlowbeck {

/// The boxes of one night's figures, in the order of the paper sheet, with the rules that hold
/// wherever such figures are typed. A rule that is broken is told in a message box; its procedure
/// answers false.
struct ScoreBoxes {
  ScoreBoxes(const Owner& owner, const Context& context);

  TextBox txtAgg;
  TextBox txtShots;
  TextBox txtAvg;
  TextBox txtHS;
  TextBox txtCent;
  TextBox txtHowMany180s;
  std::array<Label, 6> lblP;
  std::array<TextBox, 6> txtP;
  Label lblLegs;
  TextBox txtLegs;

  [[nodiscard]] std::array<TextBox*, 13> All();
  void Enable();
  void Disable();
  void Blank();
  /// Shows the peg boxes that a Best of Three code has, with the names of their games.
  void ShowPegBoxes(int best_of_three, const std::array<std::string, 6>& game_names);

  // Figures in and out.
  /// A saved result as it is opened. Boxes of figures that it does not have stay as they are.
  void Fill(const ResultRecord& saved);
  /// A saved result in the place of figures that were refused.
  void Restore(const ResultRecord& saved);
  /// Throws Overflow for what a field cannot hold.
  void MoveInto(ResultRecord& record) const;

  // The rules.
  /// Shows the average where there are aggregate and shots, and nothing otherwise.
  void ShowAverage();
  /// The aggregate is left: false when it is too high, which leaves no average.
  [[nodiscard]] bool LeaveAggregate();
  /// What there is to be said of high score, centuries and 180s.
  [[nodiscard]] CenturiesCheck CheckCenturies() const;
  void TellCenturies(CenturiesCheck found);
  [[nodiscard]] bool HasAggregateAndShots();
  [[nodiscard]] bool AverageIsPossible();
  [[nodiscard]] bool HasLegs();

 private:
  void FillScores(const ResultRecord& saved);
  void AskFor180();
  /// Warns, then blanks one box and puts the focus into one, where there is one to be.
  void Refuse(std::string_view text, TextBox* blanked, TextBox* focus);

  const Context& context_;
};

}  // namespace marlowbeck
