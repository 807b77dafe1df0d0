// Evenings of a careless recorder: teams picked and put back, scores that make no sense, matches
// put right, moved and deleted, points given. After each step file and panel are those of a plain
// model.

#include <random>

#include "ladder/plain_scores.h"

namespace marlowbeck {
namespace {

class RandomScores : public LadderTest {
 protected:
  static constexpr int kGames = 11;
  struct Verdict {
    TextList boxes;
    bool saved = false;
  };

  int Up(int most) { return std::uniform_int_distribution<int>(0, most)(chance_); }
  bool OneIn(int count) { return Up(count - 1) == 0; }
  int SomeDay() { return 3 + 7 * Up(3); }
  static std::string March(int day) { return IsoDate(PlainScores::March(day)); }

  void Begin(unsigned evening) {
    chance_.seed(evening);
    plain_ = {};
    // Some names are part of others.
    TextList names = {"Bull", "Bull & Bush", "Head", "Kings", "Kings Head", "Red", "Redcliffe"};
    std::shuffle(names.begin(), names.end(), chance_);
    names.resize(static_cast<std::size_t>(2 + Up(5)));
    std::sort(names.begin(), names.end());
    plain_.teams = names;
    if (OneIn(2)) {
      plain_.matches = {Adjusted(MatchOn(3, names[0], 6, names[1], 5), 2, 0),
                        Adjusted(MatchOn(10, names[1], 5, names[0], 5), 0, -3)};
      plain_.matches[1].Reserved1 = 77;
    }
    LayGrade(*this, OnePlayerEach(names), plain_.matches);
    if (plain_.matches.empty()) WriteFile(kLadderOfA, "");
    WriteFile("WkDate.qz3", "#2004-03-03#\r\n");
    DoAll({"click imgLadder", "click cmdGotoResults"});
    plain_.Fill();
  }

  void ExpectAsThePlainModel() {
    EXPECT_TRUE(OnFile(plain_.matches));
    EXPECT_EQ(Lines("lstDone"), plain_.done);
    EXPECT_EQ(Lines("lstTeams"), plain_.left);
    EXPECT_EQ(Enabled("lstTeams"), plain_.list_enabled);
    EXPECT_EQ(Caption("lblHomeAway"), plain_.prompt);
    EXPECT_EQ(Text("txtHome"), plain_.home);
    EXPECT_EQ(Text("txtAway"), plain_.away);
    EXPECT_EQ(Text("txtHomeScore"), plain_.home_score);
    EXPECT_EQ(Text("txtAwayScore"), plain_.away_score);
    EXPECT_EQ(Enabled("cmdHomeBack"), !plain_.home.empty());
    EXPECT_EQ(Enabled("cmdBackAway"), !plain_.away.empty());
    EXPECT_EQ(Enabled("cmdRecord"), plain_.CanRecord());
    EXPECT_EQ(InSession("WorkDate"), March(plain_.day));
  }

  std::pair<std::string, double> SomeScore() {
    const int games = Up(kGames);
    switch (Up(9)) {
      case 0:
        return {"B", 0};
      case 1:
        return {"x" + std::to_string(games), 0};
      case 2:
        return {std::to_string(games) + ".5", games + 0.5};
      case 3:
        return {std::to_string(-games), -games};
      case 4:
        return {std::to_string(games) + "x", games};
      default:
        return {std::to_string(games), games};
    }
  }

  /// Prepares an answer where one will be asked for.
  Verdict Judge(double home, double away) {
    const std::string games = std::to_string(kGames);
    if (home < 0 || home > kGames || away < 0 || away > kGames) {
      return {{"Scores must be in the range from (0 to " + games + ").    "}, false};
    }
    if (home + away > kGames) return {{"Combined scores can't total more than " + games}, false};
    if (home != away && home + away == kGames) return {{}, true};
    const bool yes = !OneIn(4);
    Do(yes ? "answer yes" : "answer no");
    if (home == away) {
      return {{"Both scores are the same!    \rDo you wish to record a DRAW?    "}, yes};
    }
    return {{"Scores don't add up to " + games + ".   \rDo you still wish to record them?    "},
            yes};
  }

  void PickATeam() {
    if (plain_.left.empty() || !plain_.list_enabled) return;
    const int line = Up(static_cast<int>(plain_.left.size()) - 1);
    Do("pick lstTeams " + std::to_string(line));
    plain_.Pick(static_cast<std::size_t>(line));
  }

  void PutBack() {
    if (!plain_.home.empty() && OneIn(2)) {
      Do("click cmdHomeBack");
      plain_.HomeBack();
    } else if (!plain_.away.empty()) {
      Do("click cmdBackAway");
      plain_.AwayBack();
    }
  }

  void TypeScoresAndSave() {
    const auto [home_text, home] = SomeScore();
    const auto [away_text, away] = SomeScore();
    plain_.home_score = home_text;
    plain_.away_score = OneIn(5) ? "" : away_text;
    DoAll({"type txtHomeScore " + home_text, "type txtAwayScore " + plain_.away_score});
    if (!plain_.CanRecord()) return;
    const double away_games = plain_.away_score.empty() ? 0 : away;
    const Verdict verdict = Judge(home, away_games);
    Do("click cmdRecord");
    EXPECT_EQ(BoxTexts(), verdict.boxes);
    EXPECT_EQ(Count("sound"), verdict.saved ? 1 : 0);
    if (verdict.saved) {
      plain_.Record(home, away_games);
    } else {
      plain_.home_score = plain_.away_score = {};
    }
  }

  void GoToAnotherDay() {
    const int day = SomeDay();
    Do("click cmdChangeGrade");
    if (day != plain_.day) Do("date Cal " + March(day));
    Do(OneIn(2) ? "click cmdGotoResults" : "click cmdCancelCal");
    plain_.day = day;
    plain_.Fill();
  }

  void OpenAMatch() {
    if (plain_.done.empty()) return;
    const int line = Up(static_cast<int>(plain_.done.size()) - 1);
    Do("pick lstDone " + std::to_string(line));
    LadderRecord* const match = plain_.Opened(plain_.done[static_cast<std::size_t>(line)]);
    ASSERT_EQ(Shown("fraEdScore"), match != nullptr);
    if (match == nullptr) return;
    EXPECT_EQ((TextList{Text("txtEdHome"), Text("txtEdHomeScore"), Text("txtEdAway"),
                        Text("txtEdAwayScore")}),
              (TextList{Trim(match->HomeTeam), std::to_string(match->HomeScore),
                        Trim(match->AwayTeam), std::to_string(match->AwayScore)}));
    if (OneIn(3)) return Delete(*match);
    PutRight(*match);
  }

  void Delete(LadderRecord& match) {
    const bool sure = OneIn(2);
    DoAll({sure ? "answer ok" : "answer cancel", "click cmdDeleteEdit"});
    if (!sure) {
      Do("click cmdCancelEdit");
      return;
    }
    plain_.matches.erase(plain_.matches.begin() + (&match - plain_.matches.data()));
    plain_.Fill();
  }

  void PutRight(LadderRecord& match) {
    const int day = OneIn(2) ? SomeDay() : plain_.day;
    if (day != plain_.day) Do("date EdCal " + March(day));
    const auto [home_text, home] = SomeScore();
    const auto [away_text, away] = SomeScore();
    DoAll({"type txtEdHomeScore " + home_text, "type txtEdAwayScore " + away_text});
    const bool in_the_way = plain_.IsInTheWay(Trim(match.HomeTeam), day);
    const Verdict verdict = in_the_way ? Verdict() : Judge(home, away);
    Do("click cmdSaveEdit");
    if (in_the_way) {
      EXPECT_EQ(Boxes().size(), 1U);
    } else {
      EXPECT_EQ(BoxTexts(), verdict.boxes);
    }
    EXPECT_EQ(Count("sound"), verdict.saved ? 1 : 0);
    if (!verdict.saved) {
      Do("click cmdCancelEdit");
      return;
    }
    // Points and reserved numbers become those of the last match.
    const LadderRecord last = plain_.matches.back();
    match.GameDate = PlainScores::March(day);
    match.HomeScore = static_cast<std::int16_t>(RoundedEven(home));
    match.AwayScore = static_cast<std::int16_t>(RoundedEven(away));
    match.HomePenalty = last.HomePenalty;
    match.AwayPenalty = last.AwayPenalty;
    match.Reserved1 = last.Reserved1;
    match.Reserved2 = last.Reserved2;
    plain_.Fill();
  }

  void GivePoints() {
    if (plain_.matches.empty()) return;
    const std::string& team =
        plain_.teams[static_cast<std::size_t>(Up(static_cast<int>(plain_.teams.size()) - 1))];
    DoAll({"click cmdPL", "click cmdPenalty", "pick lstPenalty =" + team});
    // The tab comes up on the latest date.
    const Date date = plain_.matches.back().GameDate;
    const int points = Up(20) - 8;
    DoAll({"type txtPenPts " + std::to_string(points), "click cmdPenOK"});
    if (points > kGames) Do("click cmdPenCancel");
    for (LadderRecord& match : plain_.matches) {
      const bool at_home = Trim(match.HomeTeam) == team;
      if (match.GameDate != date || (!at_home && Trim(match.AwayTeam) != team)) continue;
      if (points <= kGames) {
        (at_home ? match.HomePenalty : match.AwayPenalty) = static_cast<std::int16_t>(points);
      }
      break;
    }
    ExpectTheTable(date);
    Do("click cmdSC");
    for (plain_.day = 3; PlainScores::March(plain_.day) != date;) ++plain_.day;
    plain_.Fill();
  }

  void ExpectTheTable(Date up_to) {
    auto rows = PlainLadder(plain_.teams, plain_.matches, {}, up_to);
    PlainSort(rows);
    for (std::size_t i = 0; i < rows.size(); ++i) {
      const TextList cells = Row("grdLad", static_cast<int>(i) + 1);
      const PlainRow& row = rows[i];
      EXPECT_EQ((TextList{cells[0], cells[1], cells[2], cells[4], cells[5], cells[6], cells[8]}),
                (TextList{row.team, std::to_string(row.played), std::to_string(row.won),
                          std::to_string(row.draw), std::to_string(row.games_for),
                          std::to_string(row.against), std::to_string(row.points)}));
    }
  }

  void Step() {
    switch (Up(11)) {
      case 0:
        return GoToAnotherDay();
      case 1:
        return PutBack();
      case 2:
        return GivePoints();
      case 3:
      case 4:
        return OpenAMatch();
      case 5:
      case 6:
      case 7:
        return TypeScoresAndSave();
      default:
        return PickATeam();
    }
  }

  std::mt19937 chance_;
  PlainScores plain_;
};

TEST_F(RandomScores, FileAndPanelAreThoseOfThePlainModel) {
  const unsigned evenings = InModelsAlone() ? 60 : 4;
  for (unsigned evening = 1; evening <= evenings; ++evening) {
    Begin(evening);
    for (int step = 1; step <= 60; ++step) {
      SCOPED_TRACE("evening " + std::to_string(evening) + ", step " + std::to_string(step));
      Step();
      Do("forget");
      ExpectAsThePlainModel();
      if (HasFailure()) return;
    }
    Do("click cmdExit");
  }
}

}  // namespace
}  // namespace marlowbeck
