#include "ladder/clipboard_text.h"

#include "data/text.h"
#include "print/tabbed_text.h"

namespace marlowbeck {
namespace {

// KEPT: the fourth head says "Lost" here and "Loss" on the screen; a repair would choose one word.
constexpr const char* kHeads =
    "Team\tPlayed\tWon\tLost\tDraw\tFor\tAgainst\tPercent\tPoints\tAdjust";

}  // namespace

std::string LadderClipboardText(const Session& session, Date up_to, const LadderTab& tab) {
  TabbedText text;
  text.Line(session.AssociationName)
      .Line(Trim(session.SeasonDescription))
      .Line(Trim(tab.game_details));
  for (const auto& row : tab.results) text.Row(row, TabbedText::LastTab::Yes);
  text.Line("PREMIERSHIP LADDER  -  up to  " + ShortDate(up_to)).Line(kHeads);
  for (const auto& row : tab.ladder) text.Row(row, TabbedText::LastTab::Yes);
  return text.Text();
}

}  // namespace marlowbeck
