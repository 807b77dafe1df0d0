// What the score boxes do as they are left.

#include "data/numbers.h"
#include "data/text.h"
#include "results/frmResults.h"
#include "session/messages.h"

namespace marlowbeck {

void frmResults::txtAgg_LostFocus() {
  if (scores.LeaveAggregate()) return;
  RestoreWhenEditing();
  scores.txtAgg.SetFocus();
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
  const CenturiesCheck found = scores.CheckCenturies();
  // KEPT: with all three boxes empty the flag of the last failed check stands, so that a save stops
  // without a word; a repair would clear it.
  if (found == CenturiesCheck::NothingScored) return;
  context_.session.Flag = found == CenturiesCheck::Passed ? 0 : 1;
  scores.TellCenturies(found);
}

}  // namespace marlowbeck
