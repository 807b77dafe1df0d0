// The rules of the score boxes, as they are left and once more at the save.

#include "data/numbers.h"
#include "data/text.h"
#include "results/frmResults.h"
#include "session/messages.h"

namespace marlowbeck {

void frmResults::ShowAverage() {
  const double aggregate = Val(txtAgg.Text());
  const double shots = Val(txtShots.Text());
  if (aggregate > 0 && shots > 0) txtAvg.SetText(TwoPlaces(SheetAverage(aggregate, shots)));
}

void frmResults::txtAgg_LostFocus() {
  txtAvg.SetText("");
  if (Val(txtAgg.Text()) <= kHighestAggregate) return ShowAverage();
  Warning(context_, "Score is too high !");
  RestoreWhenEditing();
  txtAgg.SetFocus();
}

void frmResults::txtShots_LostFocus() {
  txtAvg.SetText("");
  ShowAverage();
}

void frmResults::RestoreWhenEditing() {
  if (context_.session.EditRecord > 0) GetOldScores();
}

void frmResults::CheckPeg(TextBox& peg) {
  if (Val(peg.Text()) > kHighestPeg) PegHi(peg);
}

void frmResults::PegHi(TextBox& peg) {
  Warning(context_, Lines({"What a Peg !!!", "", "Unfortunately, the maximum peg",
                           "is only 170, please re-enter."}));
  peg.SetText("");
  peg.SetFocus();
}

void frmResults::CheckCenturies() {
  const CenturiesCheck found =
      CheckScores(Val(txtHS.Text()), Val(txtCent.Text()), Val(txtHowMany180s.Text()));
  // KEPT: with all three boxes empty the flag of the last failed check stands, so that a save stops
  // without a word; a repair would clear it.
  if (found == CenturiesCheck::NothingScored) return;
  context_.session.Flag = found == CenturiesCheck::Passed ? 0 : 1;
  TellCenturies(found);
}

void frmResults::TellCenturies(CenturiesCheck found) {
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

void frmResults::Refuse(std::string_view text, TextBox* blanked, TextBox* focus) {
  Warning(context_, text);
  if (blanked != nullptr) blanked->SetText("");
  if (focus != nullptr) focus->SetFocus();
}

void frmResults::AskFor180() {
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
