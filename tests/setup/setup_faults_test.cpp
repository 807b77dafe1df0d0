// Every file operation of what the setup screens save, failed and killed once: what is left is the
// old or the new, and the next command works.

#include "setup_test.h"
#include "support/sweep.h"

namespace marlowbeck {
namespace {

using Work = SweptWork;

void BreakEverywhere(const Work& work) {
  EXPECT_GT(SweepFailures(work), 3);
  EXPECT_GT(SweepCutWrites(work), 0);
  EXPECT_GT(SweepPowerCuts(work), 3);
}

void Lay(Club& club, const std::vector<PlayerRecord>& players) {
  club.WritePlayers(kPlayerFile, players);
  club.NameOpenFile(kPlayerFile);
}

void ExpectOneOf(const std::string& actual, const std::string& before, const std::string& after) {
  EXPECT_TRUE(actual == before || actual == after) << actual.size() << " bytes: " << actual;
}

/// Whole records only: what is left behind them is never read.
void ExpectPlayers(Club& club, const std::vector<PlayerRecord>& before,
                   const std::vector<PlayerRecord>& after) {
  ExpectOneOf(FileOf(club.Players(kPlayerFile)), FileOf(before), FileOf(after));
}

/// The program still saves a player, wherever it stands.
void ExpectNextPlayerSaved(Club& club) {
  club.Try("close frmNames");
  club.Do("click imgPlayers");
  const std::size_t before = club.Players(kPlayerFile).size();
  const bool first = before == 0;
  if (first) {
    club.DoAll({"type txtAddSn0 Next", "type txtAddFn0 One", "type txtAddTm0 T",
                "type txtAddGrd0 G", "click chkAll", "click cmdAddSave0"});
  } else {
    club.DoAll({"type txtAddSn Next", "type txtAddFn One", "click cmdAddSave"});
  }
  EXPECT_EQ(club.Players(kPlayerFile).size(), before + 1);
}

TEST(SetupFaults, FirstPlayer) {
  const std::vector<PlayerRecord> after = {Player(1, "Archer", "Jo", "Rovers", "A Grade", 111)};
  BreakEverywhere({[](Club& club) {
                     Lay(club, {});
                     club.DoAll({"click imgPlayers", "type txtAddSn0 Archer", "type txtAddFn0 Jo",
                                 "type txtAddTm0 Rovers", "type txtAddGrd0 A Grade",
                                 "click chkNone"});
                   },
                   {"click cmdAddSave0"},
                   [&](Club& club) {
                     ExpectPlayers(club, {}, after);
                     ExpectNextPlayerSaved(club);
                   }});
}

TEST(SetupFaults, AddedPlayer) {
  std::vector<PlayerRecord> after = TwoGrades();
  after.push_back(Player(5, "Evans", "Flo", "Bulls", "A Grade", 330));
  BreakEverywhere({[](Club& club) {
                     Lay(club, TwoGrades());
                     club.DoAll({"click imgPlayers", "type txtAddSn Evans", "type txtAddFn Flo"});
                   },
                   {"click cmdAddSave"},
                   [&](Club& club) {
                     ExpectPlayers(club, TwoGrades(), after);
                     ExpectNextPlayerSaved(club);
                   }});
}

TEST(SetupFaults, ChangeOfBestOfThree) {
  std::vector<PlayerRecord> after = TwoGrades();
  for (std::size_t i = 0; i < 3; ++i) after[i].BestOfThree = 111;
  BreakEverywhere({[](Club& club) {
                     Lay(club, TwoGrades());
                     club.DoAll({"click imgPlayers", "click cmdEdBOT", "click chkNun"});
                   },
                   {"click cmdNoPOK"},
                   [&](Club& club) {
                     ExpectOneOf(club.File(kPlayerFile), FileOf(TwoGrades()), FileOf(after));
                     ExpectNextPlayerSaved(club);
                   }});
}

TEST(SetupFaults, GameNames) {
  const std::string before = "Triples\r\nDoubles\r\nSingles\r\nTpls\r\nDbls\r\nSgls\r\n";
  const std::string after = "Teams\r\nDoubles\r\nSingles\r\nTpls\r\nDbls\r\nSgls\r\n";
  BreakEverywhere({[](Club& club) {
                     Lay(club, TwoGrades());
                     club.DoAll({"click mnuGameNames", "type txtFirst Teams"});
                   },
                   {"click cmdSave"},
                   [&](Club& club) {
                     ExpectOneOf(club.File("GameName.qz3"), before, after);
                     club.Try("close frmGameNames");
                     club.DoAll({"click mnuGameNames", "type txtThird Ones", "click cmdSave"});
                     EXPECT_NE(club.File("GameName.qz3").find("\r\nOnes\r\n"), std::string::npos);
                   }});
}

TEST(SetupFaults, GameNamesThatCannotBeReadForAMomentStay) {
  const std::string names = "Teams\r\nPairs\r\nOnes\r\nTms\r\nPrs\r\n1s\r\n";
  BreakEverywhere({[&](Club& club) {
                     club.WriteFile("GameName.qz3", names);
                     Lay(club, TwoGrades());
                     club.Start();
                   },
                   {"click mnuGameNames"},
                   [&](Club& club) { EXPECT_EQ(club.File("GameName.qz3"), names); }});
}

TEST(SetupFaults, SeasonDescription) {
  constexpr const char* kFile = "Winter_B Grade.qzs";
  BreakEverywhere(
      {[](Club& club) {
         Lay(club, TwoGrades());
         club.WriteFile("Winter_B Grade.qzs", "\"Winter 2003\"\r\n");
         club.DoAll({"click mnuSeason", "pick cboGrades 1", "type txtNewSeason Winter 2004"});
       },
       {"click cmdLicSave"},
       [](Club& club) {
         ExpectOneOf(club.File(kFile), "\"Winter 2003\"\r\n", "\"Winter 2004\"\r\n");
         club.Try("close frmSeason");
         club.DoAll({"click mnuSeason", "pick cboGrades 1", "type txtNewSeason Winter 2005",
                     "click cmdLicSave"});
         EXPECT_EQ(club.File(kFile), "\"Winter 2005\"\r\n");
       }});
}

}  // namespace
}  // namespace marlowbeck
