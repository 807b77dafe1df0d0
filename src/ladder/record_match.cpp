// The save of a match: the questions about its scores, and the record.

#include "data/competition.h"
#include "data/numbers.h"
#include "data/text.h"
#include "ladder/frmLadder.h"
#include "ladder/match_lines.h"
#include "session/messages.h"

namespace marlowbeck {

void frmLadder::cmdRecord_Click() {
  if (!ScoresPass(txtHomeScore, txtAwayScore)) return AskForScoresAgain();
  const TypedMatch typed = {txtHome.Text(), txtHomeScore.Text(), Val(txtHomeScore.Text()),
                            txtAway.Text(), txtAwayScore.Text(), Val(txtAwayScore.Text())};
  WriteMatch();
  lstDone.AddLine(LineOfTyped(typed));
  OKSound(context_);
  try {
    SortLadderFile();
  } catch (const RunTimeError&) {
    // The match is saved, and must not stand there to be saved again.
    context_.channels.AbandonAll();
    AfterRecording();
    throw;
  }
  AfterRecording();
}

void frmLadder::AskForScoresAgain() {
  txtHomeScore.SetText({});
  txtAwayScore.SetText({});
  txtHomeScore.SetFocus();
}

/// Tells what is wrong with two scores, and asks about what is odd; answers whether they are to be
/// saved.
bool frmLadder::ScoresPass(const TextBox& home_box, const TextBox& away_box) {
  const double home = Val(home_box.Text());
  const double away = Val(away_box.Text());
  if (!ScoresAreInRange(home, away)) return false;
  if (home == away) {
    return WarningYesNo(context_, Lines({"Both scores are the same!    ",
                                         "Do you wish to record a DRAW?    "})) == kAnswerYes;
  }
  if (home + away == session_.GamesPerMatch) return true;
  const std::string games = std::to_string(session_.GamesPerMatch);
  return WarningYesNo(context_, Lines({"Scores don't add up to " + games + ".   ",
                                       "Do you still wish to record them?    "})) == kAnswerYes;
}

bool frmLadder::ScoresAreInRange(double home, double away) {
  const double most = session_.GamesPerMatch;
  const std::string games = std::to_string(session_.GamesPerMatch);
  if (home < 0 || home > most || away < 0 || away > most) {
    Warning(context_, "Scores must be in the range from (0 to " + games + ").    ");
    return false;
  }
  if (home + away > most) {
    Warning(context_, "Combined scores can't total more than " + games);
    return false;
  }
  return true;
}

// KEPT: a bye is a draw of nothing against nobody, asked about and counted as any other; a repair
// would mark it as a bye.
/// A bye has no away team, whatever was picked before.
void frmLadder::WriteMatch() {
  LadderRecord match;
  match.HomeTeam = session_.SelectedHome;
  if (!txtAway.Text().empty()) match.AwayTeam = session_.SelectedAway;
  match.GameDate = session_.WorkDate;
  match.HomeScore = static_cast<std::int16_t>(int{Integer::Narrow(Val(txtHomeScore.Text()))});
  match.AwayScore = static_cast<std::int16_t>(int{Integer::Narrow(Val(txtAwayScore.Text()))});
  Channels& channels = context_.channels;
  OpenLadderFile(session_, channels);
  const int last = session_.LadderCount;
  LadderBytes last_bytes{};
  if (unconfirmed_ && last > 0) channels.Get(Channel::Ladder, last, last_bytes);
  // One that did not reach the disk for certain is written again, and not a second time.
  if (!unconfirmed_ || last == 0 || last_bytes != *unconfirmed_) ++session_.LadderCount;
  const LadderBytes bytes = Encode(match);
  unconfirmed_ = bytes;
  channels.Put(Channel::Ladder, session_.LadderCount, bytes);
  channels.CloseAll();
  unconfirmed_.reset();
}

}  // namespace marlowbeck
