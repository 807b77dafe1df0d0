// Every file operation failed once while the entry panel, or the ladder tab, comes to show another
// grade or date: what stood there before is gone, so that nothing is saved where it does not
// belong.

#include "ladder/ladder_league.h"
#include "support/sweep.h"

namespace marlowbeck {
namespace {

using TextList = Club::TextList;

/// Two grades with teams of their own; only some of A's teams have a match on the 17th.
void LayTwoGrades(Club& club) {
  std::vector<PlayerRecord> players = OnePlayerEach({"Alpha", "Bravo", "Charlie", "Delta"});
  for (const PlayerRecord& player : OnePlayerEach({"Xerxes", "Yankee"}, "B")) {
    players.push_back(player);
  }
  LayGrade(club, players,
           {MatchOn(3, "Alpha", 7, "Bravo", 4), MatchOn(17, "Alpha", 6, "Bravo", 5)});
  club.WriteFile("Winter_B.qzi", kUsualRules);
  club.WriteFile("Winter_B.qzs", "\"Winter B\"\r\n");
  club.WriteFile("Winter_B.qzl", FileOf(std::vector{MatchOn(10, "Xerxes", 6, "Yankee", 5)}));
}

/// A match of grade A is typed for the 17th and not yet saved.
void LeadToTypedMatch(Club& club) {
  LayTwoGrades(club);
  club.DoAll({"click imgLadder", "click cmdGotoResults", "pick lstTeams =Charlie",
              "pick lstTeams =Delta", "type txtHomeScore 6", "type txtAwayScore 5"});
}

struct Panel {
  TextList header;
  TextList teams;
  TextList done;
  friend bool operator==(const Panel&, const Panel&) = default;
};

const Panel kNothing = {{"", ""}, {}, {}};
const Panel kThirdOfMarch = {
    {"A", "Wednesday, 3 March 2004"}, {"Charlie", "Delta"}, {"Alpha (7) defeated  Bravo (4)  "}};
const Panel kGradeB = {
    {"B", "Wednesday, 10 March 2004"}, {}, {"Xerxes (6) defeated  Yankee (5)  "}};

/// Nothing is there to be saved, and what is listed is all that the panel was to show, or nothing.
void ExpectNothingStale(Club& club, const Panel& meant) {
  if (club.Shown("fraChangeGrade")) {
    EXPECT_FALSE(club.Shown("fraScoresIn") && club.Enabled("cmdRecord"));
  }
  EXPECT_FALSE(club.Shown("cmdRecord") && club.Enabled("cmdRecord"));
  if (!club.Shown("fraScoresIn")) return;
  for (const char* box : {"txtHome", "txtAway", "txtHomeScore", "txtAwayScore"}) {
    EXPECT_EQ(club.Text(box), "") << box;
  }
  const Panel seen = {{club.Caption("lblHeader(0)"), club.Caption("lblHeader(1)")},
                      club.Lines("lstTeams"),
                      club.Lines("lstDone")};
  EXPECT_TRUE(seen == meant || seen == kNothing)
      << ::testing::PrintToString(seen.header) << ::testing::PrintToString(seen.teams)
      << ::testing::PrintToString(seen.done);
}

/// Both ladders are as they were, but for a match of B's that is saved afterwards on its own date.
void ExpectTheNextMatchWhereItBelongs(Club& club) {
  club.Do("forget");
  club.DoAll({"close frmLadder", "click imgLadder", "pick cboResGrade =B", "date Cal 2004-03-24",
              "click cmdGotoResults", "pick lstTeams =Yankee", "pick lstTeams =Xerxes",
              "type txtHomeScore 8", "type txtAwayScore 3", "click cmdRecord"});
  EXPECT_TRUE(
      SameMatches(club.File(kLadderOfA), FileOf(std::vector{MatchOn(3, "Alpha", 7, "Bravo", 4),
                                                            MatchOn(17, "Alpha", 6, "Bravo", 5)})));
  EXPECT_TRUE(SameMatches(club.File("Winter_B.qzl"),
                          FileOf(std::vector{MatchOn(10, "Xerxes", 6, "Yankee", 5),
                                             MatchOn(24, "Yankee", 8, "Xerxes", 3)})));
}

/// Fails each operation of the work; its last line is what leads to another grade or date.
void FailEverywhere(const std::function<void(Club&)>& prepare, const std::vector<std::string>& work,
                    const Panel& meant) {
  EXPECT_GE(SweepFailures({prepare, work,
                           [&](Club& club) {
                             ExpectNothingStale(club, meant);
                             ExpectTheNextMatchWhereItBelongs(club);
                           }}),
            8);
}

TEST(StalePanel, ADateButtonThatFailsLeavesNoMatchOfTheDateBefore) {
  FailEverywhere(LeadToTypedMatch, {"click cmdFirst"}, kThirdOfMarch);
}

TEST(StalePanel, AnotherDateThatFailsLeavesNoMatchOfTheDateBefore) {
  FailEverywhere(
      [](Club& club) {
        LeadToTypedMatch(club);
        club.DoAll({"click cmdChangeGrade", "date Cal 2004-03-03"});
      },
      {"click cmdGotoResults"}, kThirdOfMarch);
}

TEST(StalePanel, AnotherGradeThatFailsLeavesNoMatchOfTheGradeBefore) {
  FailEverywhere(
      [](Club& club) {
        LeadToTypedMatch(club);
        club.DoAll({"click cmdChangeGrade", "pick cboResGrade =B", "date Cal 2004-03-10"});
      },
      {"click cmdGotoResults"}, kGradeB);
}

TEST(StalePanel, AnotherGradeThatFailsOnCancelLeavesNoMatchOfTheGradeBefore) {
  FailEverywhere(
      [](Club& club) {
        LeadToTypedMatch(club);
        club.DoAll({"click cmdChangeGrade", "pick cboResGrade =B", "date Cal 2004-03-10"});
      },
      {"click cmdCancelCal"}, kGradeB);
}

TEST(StalePanel, TheWayBackFromAnotherGradesLadderLeavesNoMatchOfTheDateBefore) {
  FailEverywhere(
      [](Club& club) {
        LeadToTypedMatch(club);
        club.DoAll(
            {"click cmdPL", "pick cboTGrades =B", "pick cboTGrades =A", "pick lstTableDates 0"});
      },
      {"click cmdSC"}, kThirdOfMarch);
}

TEST(StalePanel, AStepToADateOfNoCalendarLeavesNothingToBeSavedThere) {
  Club club(ModelFaceAlone());
  LayTwoGrades(club);
  LadderRecord odd = MatchOn(31, "Alpha", 6, "Bravo", 5);
  odd.GameDate.days = 1e300;
  club.WriteFile(kLadderOfA, FileOf(std::vector{MatchOn(3, "Alpha", 7, "Bravo", 4), odd}));
  club.DoAll({"click imgLadder", "click cmdGotoResults", "pick lstTeams =Charlie",
              "pick lstTeams =Delta", "type txtHomeScore 6", "type txtAwayScore 5",
              "click cmdLast"});
  EXPECT_EQ(club.Count("error"), 1);
  ExpectNothingStale(club, kNothing);
}

TEST(StalePanel, DatesOfAFileThatCannotBeReadAreNotWalked) {
  Club club(ModelFaceAlone());
  LeadToTypedMatch(club);
  // The players, the rules, the work date written, the matches, and the dates.
  bool failed_late = false;
  for (int nth = 1; nth <= 8 && !failed_late; ++nth) {
    club.DoAll({"fault open " + std::to_string(nth) + " 71", "click cmdFirst", "fault off"});
    failed_late = club.InSession("DateCount") == 0;
  }
  ASSERT_TRUE(failed_late);
  club.Do("click cmdNextDate");
  EXPECT_EQ(club.InSession("WorkDate"), "2004-03-03");
  EXPECT_EQ(club.Count("beep"), 0);
}

/// Where points can be given, it is to a team of the grade in hand on a date of the list.
TEST(StalePanel, ALadderTabThatCannotBeFilledOffersNoPointsOfTheGradeBefore) {
  const SweptWork work = {
      [](Club& club) {
        LayTwoGrades(club);
        club.DoAll({"click imgLadder", "click cmdGotoResults", "click cmdPL", "click cmdSC",
                    "click cmdChangeGrade", "pick cboResGrade =B", "date Cal 2004-03-10",
                    "click cmdGotoResults"});
      },
      {"click cmdPL"},
      [](Club& club) {
        if (!club.Shown("fraPL")) return;
        if (club.Shown("cmdPenalty")) {
          EXPECT_EQ(club.InSession("Grade"), club.Text("cboTGrades"));
          EXPECT_EQ(club.Lines("lstTableDates"), (TextList{"03/03/2004", "17/03/2004"}));
        } else {
          EXPECT_FALSE(club.Shown("grdLad"));
        }
      }};
  EXPECT_GE(SweepFailures(work), 8);
}

/// The points are stored, and the table that does not know them yet is not to be seen.
TEST(StalePanel, ATableThatCannotBeWorkedOutAnewAfterAnAdjustmentIsNotShown) {
  const SweptWork work = {
      [](Club& club) {
        LayTwoGrades(club);
        club.DoAll({"click imgLadder", "click cmdGotoResults", "click cmdPL", "click cmdPenalty",
                    "pick lstPenalty =Bravo", "type txtPenPts 3"});
      },
      {"click cmdPenOK"},
      [](Club& club) {
        const bool stored = MatchesIn(club.File(kLadderOfA)).at(1).AwayPenalty == 3;
        if (!club.Shown("grdLad") || club.Shown("fraPenPts")) return;
        EXPECT_EQ(club.Row("grdLad", 2)[0], "Bravo");
        EXPECT_EQ(club.Row("grdLad", 2)[9], stored ? "+3" : "0");
      }};
  EXPECT_GE(SweepFailures(work), 5);
}

}  // namespace
}  // namespace marlowbeck
