#include "ladder/clipboard_text.h"

#include "data/text.h"

namespace marlowbeck {
namespace {

constexpr const char* kLineEnd = "\r\n";
// KEPT: the fourth head says "Lost" here and "Loss" on the screen; a repair would choose one word.
constexpr const char* kHeads =
    "Team\tPlayed\tWon\tLost\tDraw\tFor\tAgainst\tPercent\tPoints\tAdjust";

std::string RowsAsText(const TextRows& rows) {
  std::string text;
  for (const auto& row : rows) {
    for (const std::string& cell : row) text += cell + "\t";
    text += kLineEnd;
  }
  return text;
}

}  // namespace

std::string LadderClipboardText(const Session& session, Date up_to, const LadderTab& tab) {
  std::string text;
  for (const std::string& line :
       {session.AssociationName, Trim(session.SeasonDescription), Trim(tab.game_details)}) {
    text += line + kLineEnd;
  }
  text += RowsAsText(tab.results);
  text += "PREMIERSHIP LADDER  -  up to  " + ShortDate(up_to) + kLineEnd;
  text += kHeads;
  return text + kLineEnd + RowsAsText(tab.ladder);
}

}  // namespace marlowbeck
