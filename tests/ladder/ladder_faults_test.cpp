// Every file operation of each procedure that saves failed once, cut once and killed once: the
// matches are the old or the new ones, and the next command works.

#include "ladder/ladder_league.h"
#include "support/sweep.h"

namespace marlowbeck {
namespace {

using Matches = std::vector<LadderRecord>;

void LeadToScores(Club& club) {
  LayGrade(club, OnePlayerEach({"Alpha", "Bravo", "Charlie", "Delta", "Echo", "Foxtrot"}),
           ThreeRounds());
  club.DoAll({"click imgLadder", "click cmdGotoResults"});
}

void LeadToNewMatch(Club& club) {
  LeadToScores(club);
  club.DoAll({"pick lstTeams =Echo", "pick lstTeams =Foxtrot", "type txtHomeScore 6",
              "type txtAwayScore 5"});
}

void LeadToEdit(Club& club) {
  LeadToScores(club);
  club.DoAll({"pick lstDone 0", "type txtEdHomeScore 8", "type txtEdAwayScore 3"});
}

Matches WithNewMatch() {
  Matches matches = ThreeRounds();
  matches.push_back(MatchOn(17, "Echo", 6, "Foxtrot", 5));
  return matches;
}

Matches Edited() {
  Matches matches = ThreeRounds();
  matches[4] = Adjusted(MatchOn(17, "Alpha", 8, "Charlie", 3), 0, -1);
  return matches;
}

Matches WithoutTheFifth() {
  Matches matches = ThreeRounds();
  matches.erase(matches.begin() + 4);
  return matches;
}

Matches WithPoints() {
  Matches matches = ThreeRounds();
  matches[4].HomePenalty = 7;
  return matches;
}

/// The whole matches on file are those of before or those of after; everything else is as it was,
/// and a match can be saved.
void ExpectOldOrNew(Club& club, const Matches& after) {
  const std::string file = FileOf(MatchesIn(club.File(kLadderOfA)));
  EXPECT_TRUE(file == FileOf(ThreeRounds()) || SameMatches(file, FileOf(after)));
  EXPECT_EQ(club.File(kRulesOfA), kUsualRules);
  EXPECT_EQ(club.File("WkDate.qz3"), "#2004-03-17#\r\n");
  const std::size_t before = MatchesIn(file).size();
  club.Do("forget");
  club.Try("close frmLadder");
  club.DoAll({"click imgLadder", "date Cal 2004-03-24", "click cmdGotoResults",
              "pick lstTeams =Bravo", "pick lstTeams =Delta", "type txtHomeScore 9",
              "type txtAwayScore 2", "click cmdRecord"});
  EXPECT_EQ(club.Count("sound"), 1);
  EXPECT_EQ(MatchesIn(club.File(kLadderOfA)).size(), before + 1);
  EXPECT_TRUE(SameMatches(club.File(kLadderOfA).substr(0, before * kLadderLength), file));
}

void BreakEverywhere(const SweptWork& work) {
  EXPECT_GE(SweepFailures(work), 5);
  EXPECT_GE(SweepCutWrites(work), 1);
  EXPECT_GE(SweepPowerCuts(work), 5);
}

TEST(LadderFaults, ANewMatchIsWholeOrNotThere) {
  BreakEverywhere({LeadToNewMatch, {"click cmdRecord"}, [](Club& club) {
                     ExpectOldOrNew(club, WithNewMatch());
                   }});
}

TEST(LadderFaults, AnEditIsWholeOrNotDone) {
  BreakEverywhere(
      {LeadToEdit, {"click cmdSaveEdit"}, [](Club& club) { ExpectOldOrNew(club, Edited()); }});
}

TEST(LadderFaults, ADeletionTakesOneMatchOrNone) {
  BreakEverywhere({LeadToEdit, {"answer ok", "click cmdDeleteEdit"}, [](Club& club) {
                     ExpectOldOrNew(club, WithoutTheFifth());
                   }});
}

TEST(LadderFaults, PointsAreGivenOrNot) {
  BreakEverywhere({[](Club& club) {
                     LeadToScores(club);
                     club.DoAll({"click cmdPL", "click cmdPenalty", "pick lstPenalty =Alpha",
                                 "type txtPenPts 7"});
                   },
                   {"click cmdPenOK"},
                   [](Club& club) { ExpectOldOrNew(club, WithPoints()); }});
}

TEST(LadderFaults, TheSortOnTheWayBackToTheScoresLosesNoMatch) {
  BreakEverywhere({[](Club& club) {
                     LeadToScores(club);
                     club.Do("click cmdPL");
                   },
                   {"click cmdSC"},
                   [](Club& club) { ExpectOldOrNew(club, ThreeRounds()); }});
}

TEST(LadderFaults, TheRulesAreTheOldOrTheNew) {
  const SweptWork work = {[](Club& club) {
                            LeadToScores(club);
                            club.DoAll({"click cmdCF", "type cfgWin 3"});
                          },
                          {"click cmdSaveConfig"},
                          [](Club& club) {
                            const std::string rules = club.File(kRulesOfA);
                            EXPECT_TRUE(rules == kUsualRules || rules == " 3  0  1  4  11 \r\n")
                                << rules;
                            EXPECT_EQ(club.File(kLadderOfA), FileOf(ThreeRounds()));
                          }};
  BreakEverywhere(work);
}

TEST(LadderFaults, OpeningTheScoresLeavesAWholeDateAndTheMatchesAsTheyAre) {
  const SweptWork work = {[](Club& club) {
                            LayGrade(club, OnePlayerEach(kFourTeams), ThreeRounds());
                            club.DoAll({"click imgLadder", "date Cal 2004-03-10"});
                          },
                          {"click cmdGotoResults"},
                          [](Club& club) {
                            EXPECT_EQ(club.File("WkDate.qz3"), "#2004-03-10#\r\n");
                            EXPECT_EQ(club.File(kLadderOfA), FileOf(ThreeRounds()));
                            // A read of the rules that fails gives them up, as a missing file does.
                            EXPECT_EQ(club.File(kRulesOfA), kUsualRules);
                          }};
  BreakEverywhere(work);
}

TEST(LadderFaults, ADeletionThatFailsClosesThePanelSoThatNoOtherMatchIsDeleted) {
  for (const char* fault : {"fault write 1 61", "fault sync 1 57", "fault rename 1 75"}) {
    SCOPED_TRACE(fault);
    Club club(ModelFaceAlone());
    LeadToEdit(club);
    club.DoAll({fault, "answer ok", "click cmdDeleteEdit"});
    EXPECT_EQ(club.Count("error"), 1);
    EXPECT_FALSE(club.Shown("fraEdScore"));
    EXPECT_EQ(club.InSession("EditRecord"), 0);
    EXPECT_EQ(club.File(kLadderOfA), FileOf(ThreeRounds()));
    club.DoAll({"pick lstDone 0", "answer ok", "click cmdDeleteEdit"});
    EXPECT_TRUE(SameMatches(club.File(kLadderOfA), FileOf(WithoutTheFifth())));
  }
}

TEST(LadderFaults, AnEditThatDidNotReachTheDiskCanBeSavedAgainOnItsNewDate) {
  Club club(ModelFaceAlone());
  LeadToEdit(club);
  club.DoAll({"date EdCal 2004-03-24", "fault sync 1 57", "click cmdSaveEdit"});
  EXPECT_EQ(club.Count("error"), 1);
  EXPECT_TRUE(club.Shown("fraEdScore"));
  club.Do("click cmdSaveEdit");
  EXPECT_EQ(club.Count("sound"), 1);
  EXPECT_EQ(MatchesIn(club.File(kLadderOfA)).back().HomeScore, 8);
}

TEST(LadderFaults, ASortTakesOneRenameAndNoDeletion) {
  Club club(ModelFaceAlone());
  LeadToScores(club);
  club.Do("click cmdPL");
  const long renames = club.Faults().Done(FileOperation::Rename);
  const long deletions = club.Faults().Done(FileOperation::Delete);
  club.Do("click cmdSC");
  // The work date is kept by one of its own.
  EXPECT_EQ(club.Faults().Done(FileOperation::Rename) - renames, 2);
  EXPECT_EQ(club.Faults().Done(FileOperation::Delete) - deletions, 0);
}

}  // namespace
}  // namespace marlowbeck
