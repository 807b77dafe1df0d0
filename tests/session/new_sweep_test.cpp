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

void ExpectOldOrNew(Club& club) {
  EXPECT_TRUE(SamePlayers(club.File("Winter.qza"), FileOf(Season())));
  const std::string named = club.File("FileName.qz3");
  const bool is_new = named == Naming(club, "Summer.qza");
  EXPECT_TRUE(is_new || named == Naming(club, "Winter.qza")) << named;
  if (is_new) {
    EXPECT_TRUE(SamePlayers(club.File("Summer.qza"), FileOf(Season())));
  }
  EXPECT_EQ(club.Caption("lblHMPlayers"), "2 Players Listed in File. ");
  // The next command works.
  club.DoAll({"fault off", "forget", "file Winter.qza", "click mnuOpen"});
  EXPECT_EQ(club.Title("frmDB"), "[Marlowbeck] Filename: WINTER");
}

SweptWork CarryOver() {
  return {OpenWinter, {"answer yes", "file Summer.qza", "click mnuNew"}, ExpectOldOrNew};
}

TEST(NewCompetition, EachFailureLeavesTheOldOneOpenOrTheNewOneWhole) {
  EXPECT_GT(SweepFailures(CarryOver()), 10);
}

TEST(NewCompetition, EachWriteCutShortLeavesTheOldOneOpenOrTheNewOneWhole) {
  EXPECT_GT(SweepCutWrites(CarryOver()), 1);
}

TEST(NewCompetition, EachPowerCutLeavesTheOldOneOpenOrTheNewOneWhole) {
  EXPECT_GT(SweepPowerCuts(CarryOver()), 10);
}

}  // namespace
}  // namespace marlowbeck
