// Every file operation of New fails once and is the last one once: afterwards the old competition
// is open or the new one, each whole.

#include "support/record_files.h"
#include "support/sweep.h"

namespace marlowbeck {
namespace {

std::vector<PlayerRecord> Season() {
  return {Player(1, "Archer", "Jo", "Rovers", "A Grade"),
          Player(2, "Bull", "Ann", "Hawks", "A Grade")};
}

void OpenWinter(Club& club) {
  club.WritePlayers("Winter.qza", Season());
  club.NameOpenFile("Winter.qza");
  club.Start();
}

std::string Naming(const Club& club, const std::string& name) {
  return '"' + club.FilePath(name).string() + "\"\r\n";
}

/// Winter is open, with nothing begun beside it, or Summer is, whole.
void ExpectWinterOr(Club& club, const std::vector<PlayerRecord>& summer) {
  EXPECT_TRUE(SamePlayers(club.File("Winter.qza"), FileOf(Season())));
  const std::string named = club.File("FileName.qz3");
  const bool is_new = named == Naming(club, "Summer.qza");
  EXPECT_TRUE(is_new || named == Naming(club, "Winter.qza")) << named;
  if (is_new) {
    EXPECT_TRUE(SamePlayers(club.File("Summer.qza"), FileOf(summer)));
  }
  const bool is_empty = is_new && summer.empty();
  EXPECT_EQ(club.Caption("lblHMPlayers"),
            is_empty ? " Current File is Empty " : "2 Players Listed in File. ");
}

void ExpectNothingBegun(Club& club) {
  const bool is_new = club.File("FileName.qz3") == Naming(club, "Summer.qza");
  EXPECT_EQ(club.HasFile("Summer.qza"), is_new);
  EXPECT_FALSE(club.HasFile("Summer.qza.new"));
}

void ExpectWinterCanBeOpened(Club& club) {
  club.DoAll({"fault off", "forget", "file Winter.qza", "click mnuOpen"});
  EXPECT_EQ(club.Title("frmDB"), "[Marlowbeck] Filename: WINTER");
}

SweptWork CarryOver() {
  return {OpenWinter, {"answer yes", "file Summer.qza", "click mnuNew"}, [](Club& club) {
            ExpectWinterOr(club, Season());
            ExpectWinterCanBeOpened(club);
          }};
}

SweptWork NewInThePlaceOfTheOpenOne() {
  return {OpenWinter,
          {"answer no", "answer yes", "file Summer.qza", "answer no", "click mnuNew"},
          [](Club& club) {
            ExpectWinterOr(club, {});
            ExpectWinterCanBeOpened(club);
          }};
}

SweptWork NewOnAFirstStart() {
  return {[](Club& club) { club.Start(); },
          {"file Summer.qza", "answer no", "click mnuNew"},
          [](Club& club) {
            const bool named = club.HasFile("FileName.qz3") &&
                               club.File("FileName.qz3") == Naming(club, "Summer.qza");
            EXPECT_EQ(club.Caption("lblHMPlayers"),
                      named ? " Current File is Empty " : " No File Open ");
            club.DoAll({"fault off", "forget"});
            // Summer, where it is open, is to be closed first.
            if (named) club.Do("answer yes");
            club.DoAll({"file Autumn.qza", "answer no", "click mnuNew"});
            EXPECT_EQ(club.Title("frmDB"), "[Marlowbeck] Filename: AUTUMN");
          }};
}

/// After a failure, unlike a power cut, there is somebody to clear away what was begun.
SweptWork ClearingAway(SweptWork work) {
  work.check = [check = work.check](Club& club) {
    ExpectNothingBegun(club);
    check(club);
  };
  return work;
}

TEST(NewCompetition, EachFailureLeavesTheOldOneOpenOrTheNewOneWhole) {
  EXPECT_GT(SweepFailures(ClearingAway(CarryOver())), 10);
  EXPECT_GT(SweepFailures(ClearingAway(NewInThePlaceOfTheOpenOne())), 5);
}

TEST(NewCompetition, EachWriteCutShortLeavesTheOldOneOpenOrTheNewOneWhole) {
  EXPECT_GT(SweepCutWrites(ClearingAway(CarryOver())), 1);
}

TEST(NewCompetition, EachPowerCutLeavesTheOldOneOpenOrTheNewOneWhole) {
  EXPECT_GT(SweepPowerCuts(CarryOver()), 10);
  EXPECT_GT(SweepPowerCuts(NewInThePlaceOfTheOpenOne()), 5);
}

TEST(NewCompetition, EachFailureOnAFirstStartLeavesAWayToBegin) {
  EXPECT_GT(SweepFailures(NewOnAFirstStart()), 5);
  EXPECT_GT(SweepPowerCuts(NewOnAFirstStart()), 5);
}

}  // namespace
}  // namespace marlowbeck
