// Every file operation of a save, of an opening, of a removal and of the listing failed once, cut
// once and killed once: a saved list is the old or the new, nobody is lost or there twice, and the
// next command works.

#include <algorithm>

#include "knockout/knock_out.h"
#include "support/sweep.h"

namespace marlowbeck {
namespace {

constexpr const char* kOld = "old";

void LeadToSelection(Club& club) {
  club.WritePlayers("Winter.qza", FivePlayers());
  club.NameOpenFile("Winter.qza");
  club.WriteFile("Cup.ko4", ListFile({"Moss, Cy"}, "A Grade"));
  club.DoAll({"click imgKO", "click cmdOK", "click cmdALL"});
}

TextList PlayersOf(Club& club) {
  TextList players;
  for (int row = 1; row <= 64; ++row) {
    const std::string player = club.Row("grdKO", row)[1];
    if (!player.empty()) players.push_back(player);
  }
  return players;
}

/// Everybody of the competition stands in the table or in the list, and once.
void ExpectEverybodyOnce(Club& club) {
  TextList all = PlayersOf(club);
  for (const std::string& line : club.Lines("lstAllPlayers")) {
    all.push_back(line.substr(0, line.find(" : ")));
  }
  std::sort(all.begin(), all.end());
  EXPECT_EQ(all, (TextList{"Archer, Jo", "Dean, Di", "Ely, Bo", "Moss, Cy", "Young, Al"}));
}

void ExpectRunning(Club& club) {
  EXPECT_EQ(club.File("Winter.qza"), FileOf(FivePlayers()));
  if (!club.Loaded("frmKnockOut")) club.DoAll({"click imgKO", "click cmdOK", "click cmdALL"});
  club.DoAll({"file Next.ko4", "click cmdSaveKO"});
  EXPECT_TRUE(club.HasFile("Next.ko4"));
}

SweptWork Save() {
  return {[](Club& club) {
            LeadToSelection(club);
            club.WriteFile("Cup.ko4", kOld);
          },
          {"file Cup.ko4", "click cmdSaveKO"},
          [](Club& club) {
            const std::string cup = club.File("Cup.ko4");
            if (cup != kOld) {
              EXPECT_EQ(std::count(cup.begin(), cup.end(), '\n'), 130) << cup;
              EXPECT_EQ(cup.find("\"Moss, Cy\"\r\n\"Dean, Di\"\r\n"), 0U);
            }
            EXPECT_FALSE(club.HasFile("Cup.ko4.new") && club.Loaded("frmKnockOut"));
            ExpectRunning(club);
          }};
}

SweptWork Opening() {
  return {LeadToSelection, {"file Cup.ko4", "click cmdOpen"}, [](Club& club) {
            EXPECT_EQ(club.File("Cup.ko4"), ListFile({"Moss, Cy"}, "A Grade"));
            if (club.Loaded("frmKnockOut")) club.DoAll({"file Cup.ko4", "click cmdOpen"});
            ExpectRunning(club);
          }};
}

SweptWork Removal() {
  return {LeadToSelection, {"dblcell grdKO 2 1"}, [](Club& club) {
            if (club.Loaded("frmKnockOut")) ExpectEverybodyOnce(club);
            ExpectRunning(club);
          }};
}

SweptWork Listing() {
  return {LeadToSelection, {"answer yes", "click cmdKOGrade", "click cmdSelAll"}, [](Club& club) {
            club.Do("forget");
            if (club.Loaded("frmKnockOut")) {
              club.Try("click Command2");
              club.DoAll({"click cmdReRun", "click cmdOK", "click cmdALL"});
              ExpectEverybodyOnce(club);
            }
            ExpectRunning(club);
          }};
}

TEST(KnockOutFaults, ASaveThatFailsLeavesTheOldListOrTheNew) {
  EXPECT_GT(SweepFailures(Save()), 4);
  SweepCutWrites(Save());
  SweepPowerCuts(Save());
}

TEST(KnockOutFaults, AnOpeningThatFailsTouchesNoFile) {
  EXPECT_GT(SweepFailures(Opening(), 57), 4);
  SweepPowerCuts(Opening());
}

TEST(KnockOutFaults, ARemovalThatFailsLosesNobody) {
  EXPECT_GT(SweepFailures(Removal()), 4);
  SweepCutWrites(Removal());
  SweepPowerCuts(Removal());
}

TEST(KnockOutFaults, AListingThatFailsCanBeDoneAgain) {
  EXPECT_GT(SweepFailures(Listing(), 57), 4);
  SweepPowerCuts(Listing());
}

/// The table is emptied before the players are read, and nothing is drawn, printed or saved by the
/// numbers that stood there before.
TEST(KnockOutFaults, AGradeThatCannotBeListedLeavesNobodyAndNoNumberOfTheOneBefore) {
  for (const char* operation : {"open 1", "read 1", "close 1"}) {
    Club club(ModelFaceAlone());
    LeadToSelection(club);
    club.DoAll({"answer yes", "click cmdKOGrade", "pick cboResGrade =B Grade",
                std::string("fault ") + operation + " 57", "click cmdGradeOK"});
    EXPECT_EQ(club.BoxTexts(), (TextList{"DEVICE I/O ERROR    "})) << operation;
    EXPECT_TRUE(PlayersOf(club).empty()) << operation;
    EXPECT_TRUE(club.Lines("lstAllPlayers").empty()) << operation;
    for (const char* number : {"lblKONOP(1)", "lblKONOP(3)", "lblKONOP(4)"}) {
      EXPECT_EQ(club.Caption(number), "0") << operation << ' ' << number;
    }
    EXPECT_EQ(club.Caption("lblGrade"), "All Association Grades") << operation;
    club.DoAll({"fault off", "click cmdPrnt"});
    EXPECT_EQ(club.BoxTexts(), (TextList{"Nothing to PRINT!"})) << operation;
    club.Do("click cmdScramble");
    club.DoAll({"click cmdKOGrade", "pick cboResGrade =B Grade", "click cmdGradeOK"});
    EXPECT_EQ(club.Lines("lstAllPlayers"), (TextList{"Dean, Di : B Grade", "Ely, Bo : B Grade"}));
    EXPECT_EQ(club.Caption("lblGrade"), "B Grade") << operation;
  }
}

/// What is told of a failure: the file words for list files, the error box for the rest.
TEST(KnockOutFaults, FailuresAreToldInTheirWords) {
  Club club(ModelFaceAlone());
  LeadToSelection(club);
  club.DoAll({"fault write 1 61", "file Cup.ko4", "click cmdSaveKO"});
  EXPECT_EQ(club.BoxTexts(), (TextList{kNotFound}));
  club.DoAll({"fault read 1 57", "file Cup.ko4", "click cmdOpen"});
  EXPECT_EQ(club.BoxTexts(), (TextList{kNotFound}));
  club.DoAll({"click cmdReRun", "click cmdOK", "click cmdALL", "fault write 1 61"});
  club.Do("dblcell grdKO 2 1");
  EXPECT_EQ(club.BoxTexts(), (TextList{"DISK FULL    "}));
  EXPECT_EQ(PlayersOf(club).size(), 5U);
}

}  // namespace
}  // namespace marlowbeck
