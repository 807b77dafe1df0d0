// Every file operation of a deletion, a swap of oppositions and an added player failed once, cut
// once and killed once: nothing is lost but what was to be changed, and the next command works.

#include "support/league.h"
#include "support/sweep.h"

namespace marlowbeck {
namespace {

using Results = std::vector<ResultRecord>;

Results Before() {
  return {Night(31, "Cubs", "Gone"), Night(11, "Hawks", "Lions"), Night(12, "Hawks", "Lions"),
          Night(11, "Hawks", "Cubs", 24)};
}

Results WithoutTheSecond() {
  Results results = Before();
  results.erase(results.begin() + 1);
  return results;
}

Results Swapped() {
  Results results = Before();
  results[1].Opposition = "Rovers";
  results[2].Opposition = "Rovers";
  return results;
}

void LeadToTeam(Club& club) {
  LayLeague(club);
  club.WriteResults(kAResults, Before());
  club.DoAll(ToTeam("A Grade", "Hawks"));
}

void LeadToDeletion(Club& club) {
  LeadToTeam(club);
  club.DoAll({"pick lstFinished =Hill,  Al", "focus cmdEdDelete"});
}

void LeadToSwap(Club& club) {
  LeadToTeam(club);
  club.DoAll({"click panChangeOpp", "pick cboReDoOpp =Rovers", "focus cmdSaveOp"});
}

void LeadToNewPlayer(Club& club) {
  LeadToTeam(club);
  club.DoAll(
      {"click panAddNames", "type txtAddSn0 Hall", "type txtAddFn0 Joy", "focus cmdAddSave0"});
}

std::vector<PlayerRecord> WithNewPlayer() {
  std::vector<PlayerRecord> players = LeaguePlayers();
  players.push_back(Player(52, "Hall", "Joy", "Hawks", "A Grade", 333));
  return players;
}

void OpenAgain(Club& club) {
  club.DoAll({"forget"});
  club.Try("close frmResults");
  club.DoAll(ToTeam("A Grade", "Hawks"));
}

/// The results are those of before or those of after; what else there is has not changed.
Results ExpectOldOrNew(Club& club, const Results& after) {
  const bool is_old = club.File(kAResults) == FileOf(Before());
  EXPECT_TRUE(is_old || SameResults(club.File(kAResults), FileOf(after)));
  EXPECT_EQ(club.File(kLeagueFile), FileOf(LeaguePlayers()));
  EXPECT_EQ(club.File("WkDate.qz3"), "#2004-03-31#\r\n");
  return is_old ? Before() : after;
}

/// Another player's result can be deleted from what is left.
void ExpectNextDeletion(Club& club, Results left) {
  OpenAgain(club);
  club.DoAll({"pick lstFinished =Hope,  Bo", "answer yes", "click cmdEdDelete"});
  std::erase_if(left, [](const ResultRecord& result) { return result.ID == 12; });
  // The screen may have put the file in date order when it was closed.
  EXPECT_EQ(club.Results(kAResults).size(), left.size());
  EXPECT_EQ(club.Lines("lstFinished").size(), left.size() - 2);
}

SweptWork Deletion() {
  return {LeadToDeletion, {"answer yes", "click cmdEdDelete"}, [](Club& club) {
            ExpectNextDeletion(club, ExpectOldOrNew(club, WithoutTheSecond()));
          }};
}

SweptWork Swap() {
  return {LeadToSwap, {"answer yes", "click cmdSaveOp"}, [](Club& club) {
            const Results left = ExpectOldOrNew(club, Swapped());
            OpenAgain(club);
            EXPECT_EQ(club.Text("cboOpp"), left[1].Opposition == "Rovers" ? "Rovers" : "Lions");
            EXPECT_EQ(club.Lines("lstFinished").size(), 2U);
          }};
}

SweptWork NewPlayer() {
  return {LeadToNewPlayer, {"click cmdAddSave0"}, [](Club& club) {
            // Half a record at the end is none, and is written over.
            const std::string file = FileOf(club.Players(kLeagueFile));
            const bool is_old = file == FileOf(LeaguePlayers());
            EXPECT_TRUE(is_old || SamePlayers(file, FileOf(WithNewPlayer())));
            EXPECT_EQ(club.File(kAResults), FileOf(Before()));
            OpenAgain(club);
            const std::size_t listed = is_old ? 6 : 7;
            EXPECT_EQ(club.Lines("lstResPlayers").size(), listed);
            club.DoAll({"click panAddNames", "type txtAddSn0 Next", "type txtAddFn0 One",
                        "click cmdAddSave0"});
            EXPECT_EQ(club.Lines("lstResPlayers").size(), listed + 1);
            EXPECT_EQ(club.Players(kLeagueFile).size(),
                      LeaguePlayers().size() + (is_old ? 1U : 2U));
          }};
}

void BreakEverywhere(const SweptWork& work) {
  EXPECT_GT(SweepFailures(work), 5);
  EXPECT_GE(SweepCutWrites(work), 1);
  EXPECT_GT(SweepPowerCuts(work), 5);
}

TEST(CorrectionsFaults, ADeletionLosesNothingElse) { BreakEverywhere(Deletion()); }
TEST(CorrectionsFaults, ASwapIsDoneWholeOrNotAtAll) { BreakEverywhere(Swap()); }
TEST(CorrectionsFaults, ANewPlayerIsWholeOrNotThere) { BreakEverywhere(NewPlayer()); }

/// Counts the operations by name that a script's last line takes.
long Done(Club& club, FileOperation operation, const std::vector<std::string>& lines) {
  const long before = club.Faults().Done(operation);
  club.DoAll(lines);
  return club.Faults().Done(operation) - before;
}

TEST(CorrectionsFaults, ADeletionTakesOneRenameAndNoDeletion) {
  for (const FileOperation operation : {FileOperation::Rename, FileOperation::Delete}) {
    Club club(ModelFaceAlone());
    LeadToDeletion(club);
    EXPECT_EQ(Done(club, operation, {"answer yes", "click cmdEdDelete"}),
              operation == FileOperation::Rename ? 1 : 0);
  }
}

TEST(CorrectionsFaults, ACopyThatDidNotReachTheDiskTakesNoOnesPlace) {
  Club club(ModelFaceAlone());
  LeadToDeletion(club);
  club.DoAll({"fault sync 1 57", "answer yes", "click cmdEdDelete"});
  EXPECT_EQ(club.Count("error"), 1);
  EXPECT_EQ(club.File(kAResults), FileOf(Before()));
}

TEST(CorrectionsFaults, ADeletionTriedAgainTakesOutTheSameRecord) {
  for (const char* fault : {"fault write 1 61", "fault sync 1 57", "fault rename 1 75"}) {
    SCOPED_TRACE(fault);
    Club club(ModelFaceAlone());
    LeadToDeletion(club);
    club.DoAll({fault, "answer yes", "click cmdEdDelete"});
    EXPECT_EQ(club.Count("error"), 1);
    EXPECT_TRUE(club.Shown("fraEdButtons"));
    club.DoAll({"answer yes", "click cmdEdDelete"});
    EXPECT_TRUE(SameResults(club.File(kAResults), FileOf(WithoutTheSecond())));
  }
}

TEST(CorrectionsFaults, ASheetWhoseRecordIsGoneIsClosedSoThatNoOtherOneIsDeleted) {
  Club club(ModelFaceAlone());
  LeadToDeletion(club);
  // The results, the copy, and then the count of what is left.
  club.DoAll({"fault open 3 57", "answer yes", "click cmdEdDelete"});
  EXPECT_EQ(club.Count("error"), 1);
  EXPECT_TRUE(SameResults(club.File(kAResults), FileOf(WithoutTheSecond())));
  EXPECT_FALSE(club.Shown("fraResults"));
  EXPECT_FALSE(club.Shown("fraEdButtons"));
  EXPECT_TRUE(club.Shown("fraTeams"));
  EXPECT_TRUE(club.Shown("fraResControls"));
  EXPECT_EQ(club.InSession("EditRecord"), 0);
}

TEST(CorrectionsFaults, APlayerSavedAgainAfterHeDidNotReachTheDiskStandsOnce) {
  Club club(ModelFaceAlone());
  LeadToNewPlayer(club);
  club.DoAll({"fault sync 1 57", "click cmdAddSave0"});
  EXPECT_EQ(club.Count("error"), 1);
  EXPECT_EQ(club.Count("sound"), 0);
  club.Do("click cmdAddSave0");
  EXPECT_EQ(club.Count("sound"), 1);
  EXPECT_TRUE(SamePlayers(club.File(kLeagueFile), FileOf(WithNewPlayer())));
}

TEST(CorrectionsFaults, APlayerSavedAgainUnderAnotherNameStandsOnceUnderThat) {
  Club club(ModelFaceAlone());
  LeadToNewPlayer(club);
  club.DoAll({"fault sync 1 57", "click cmdAddSave0", "type txtAddSn0 Hewitt", "fault sync 1 57",
              "click cmdAddSave0", "type txtAddFn0 Jo", "click cmdAddSave0"});
  std::vector<PlayerRecord> expected = LeaguePlayers();
  expected.push_back(Player(52, "Hewitt", "Jo", "Hawks", "A Grade", 333));
  EXPECT_TRUE(SamePlayers(club.File(kLeagueFile), FileOf(expected)));
}

TEST(CorrectionsFaults, APlayerGivenUpAfterHeDidNotReachTheDiskIsNotWrittenOverByTheNext) {
  Club club(ModelFaceAlone());
  LeadToNewPlayer(club);
  club.DoAll({"fault sync 1 57", "click cmdAddSave0", "click cmdAddCancel0", "click panAddNames",
              "type txtAddSn0 Next", "type txtAddFn0 One", "click cmdAddSave0"});
  std::vector<PlayerRecord> expected = WithNewPlayer();
  expected.push_back(Player(53, "Next", "One", "Hawks", "A Grade", 333));
  EXPECT_TRUE(SamePlayers(club.File(kLeagueFile), FileOf(expected)));
}

}  // namespace
}  // namespace marlowbeck
