// The rules of the score boxes, as they are left and once more at the save.

#include "data/numbers.h"
#include "data/text.h"
#include "results/score_boxes.h"
#include "session/messages.h"

namespace marlowbeck {

void ScoreBoxes::ShowAverage() {
  txtAvg.SetText("");
  const double aggregate = Val(txtAgg.Text());
  const double shots = Val(txtShots.Text());
  if (aggregate > 0 && shots > 0) txtAvg.SetText(TwoPlaces(SheetAverage(aggregate, shots)));
}

bool ScoreBoxes::LeaveAggregate() {
  txtAvg.SetText("");
  if (Val(txtAgg.Text()) > kHighestAggregate) {
    Warning(context_, "Score is too high !");
    return false;
  }
  ShowAverage();
  return true;
}

bool ScoreBoxes::HasAggregateAndShots() {
  if (Val(txtAgg.Text()) >= 1 && Val(txtShots.Text()) >= 1) return true;
  Refuse("Must have AGGREGATE and SHOTS before saving !", nullptr, &txtAgg);
  return false;
}

bool ScoreBoxes::AverageIsPossible() {
  if (Val(txtAvg.Text()) <= kHighestAverage) return true;
  Warning(context_, "Some entries seem too high !");
  return false;
}

bool ScoreBoxes::HasLegs() {
  if (Val(txtAgg.Text()) < 1 || Val(txtLegs.Text()) >= 1) return true;
  Refuse("You must enter Legs before saving !", &txtLegs, &txtLegs);
  return false;
}

CenturiesCheck ScoreBoxes::CheckCenturies() const {
  return CheckScores(Val(txtHS.Text()), Val(txtCent.Text()), Val(txtHowMany180s.Text()));
}

void ScoreBoxes::TellCenturies(CenturiesCheck found) {
  constexpr const char* kToZero = "Total Centuries will be set to zero.";
  switch (found) {
    case CenturiesCheck::NothingScored:
    case CenturiesCheck::Passed:
      return;
    case CenturiesCheck::HighScoreAbove180:
      return Refuse("Highest score cannot be more than 180!", &txtHS, &txtHS);
    case CenturiesCheck::NoHighScore:
      return Refuse(Lines({"Highest score has not been entered.", kToZero}), &txtCent, &txtHS);
    case CenturiesCheck::HighScoreBelow100:
      return Refuse(Lines({"Highest score is less than 100.", kToZero}), &txtCent, &txtHS);
    case CenturiesCheck::NoCenturies:
      return Refuse("Please enter Total Centuries scored!", &txtCent, nullptr);
    case CenturiesCheck::No180s:
      return Refuse("Please enter number of 180's scored!", nullptr, &txtHowMany180s);
    case CenturiesCheck::HighScoreNot180:
      return AskFor180();
    case CenturiesCheck::FewerCenturiesThan180s:
      return Refuse(
          Lines({"Number of Centuries MUST be EQUAL to", "or GREATER than the number of 180's."}),
          &txtCent, &txtCent);
  }
}

void ScoreBoxes::Refuse(std::string_view text, TextBox* blanked, TextBox* focus) {
  Warning(context_, text);
  if (blanked != nullptr) blanked->SetText("");
  if (focus != nullptr) focus->SetFocus();
}

void ScoreBoxes::AskFor180() {
  const int answer = WarningYesNo(context_, "180's = " + txtHowMany180s.Text() +
                                                ". Do you want the Highest Score updated to 180 ?");
  if (answer == kAnswerYes) {
    txtHS.SetText("180");
  } else {
    txtHowMany180s.SetText("");
  }
  txtHowMany180s.SetFocus();
}

}  // namespace marlowbeck
