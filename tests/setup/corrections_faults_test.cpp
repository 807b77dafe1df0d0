// Every file operation of an edit, of the renames and of a deletion, failed, cut short and killed
// once: nothing is lost but what was chosen, and the work can be brought to its end.

#include "setup_test.h"
#include "support/sweep.h"

namespace marlowbeck {
namespace {

/// The bytes of a competition's three files of records.
struct Files {
  std::string players;
  std::string results;
  std::string ladder;
};

Files Before() {
  return {FileOf(TwoGrades()),
          FileOf(std::vector<ResultRecord>{
              Night(2, "Rovers", "Hawks", 24), Night(3, "Hawks", "Rovers", 24),
              Night(1, "Rovers", "Hawks", 24), Night(2, "Rovers", "Hawks", 31)}),
          FileOf(std::vector<LadderRecord>{Match("Hawks", "Rovers"), Match("Rovers", "Lions"),
                                           Match("Hawks", "Lions")})};
}

void Lay(Club& club) {
  club.WriteFile(kPlayerFile, Before().players);
  club.WriteFile(kAResults, Before().results);
  club.WriteFile(kALadder, Before().ladder);
  club.WriteFile("Winter_A Grade.qzi", "3\r\n0\r\n1\r\n4\r\n11\r\n");
  club.WriteFile("Winter_A Grade.qzs", "\"Winter\"\r\n");
  club.NameOpenFile(kPlayerFile);
}

/// Brings a club to the setup screen and a team of it, wherever it stands.
void OpenTeam(Club& club, const std::string& team) {
  club.Try("forget");
  club.Try("close frmNames");
  club.DoAll({"click imgPlayers", "pick cboAddGrd 0", "pick cboAddTm =" + team});
}

void BreakEverywhere(const SweptWork& work) {
  EXPECT_GT(SweepFailures(work), 5);
  EXPECT_GT(SweepCutWrites(work), 0);
  EXPECT_GT(SweepPowerCuts(work), 5);
}

/// Answers whether the file is the new one already.
bool IsNew(const std::string& actual, const std::string& before, const std::string& after) {
  EXPECT_TRUE(actual == before || actual == after) << actual.size() << " bytes: " << actual;
  return actual != before;
}

/// Expects files to have been replaced in this order, each of them whole.
void ExpectInOrder(const std::vector<bool>& replaced) {
  for (std::size_t i = 1; i < replaced.size(); ++i) {
    EXPECT_TRUE(replaced[i - 1] || !replaced[i]) << "file " << i << " before the one before it";
  }
}

TEST(CorrectionFaults, AnEditedPlayer) {
  std::vector<PlayerRecord> after = TwoGrades();
  after[1].Surname = "Barker";
  const auto edit = [](Club& club) {
    club.DoAll({"pick lstPlayers 1", "click cmdEdName", "type txtAddSn Barker"});
  };
  BreakEverywhere({[&](Club& club) {
                     Lay(club);
                     OpenTeam(club, "Rovers");
                     edit(club);
                   },
                   {"click cmdAddSave"},
                   [&](Club& club) {
                     IsNew(club.File(kPlayerFile), Before().players, FileOf(after));
                     OpenTeam(club, "Rovers");
                     edit(club);
                     club.Do("click cmdAddSave");
                     EXPECT_TRUE(SamePlayers(club.File(kPlayerFile), FileOf(after)));
                     EXPECT_EQ(club.File(kAResults), Before().results);
                   }});
}

/// The typing that follows a failed look changes nobody else, and moves nobody who has results.
TEST(CorrectionFaults, TheTakingUpOfAPlayer) {
  const std::vector<std::string> lines = {"click cmdEdName",        "type cboAddTm Hawks",
                                          "type cboAddGrd B Grade", "type txtAddSn Barker",
                                          "type txtAddFn Al",       "click cmdAddSave"};
  std::vector<PlayerRecord> after = TwoGrades();
  after[1].Surname = "Barker";
  BreakEverywhere({[](Club& club) {
                     Lay(club);
                     OpenTeam(club, "Rovers");
                     club.Do("pick lstPlayers 1");
                   },
                   lines,
                   [&](Club& club) {
                     IsNew(club.File(kPlayerFile), Before().players, FileOf(after));
                     EXPECT_EQ(club.File(kAResults), Before().results);
                   }});
}

/// The files of A Grade and what becomes of them: each has one of the two names, in the order of
/// the chain, and all its bytes.
std::vector<bool> ExpectGradeFiles(const Club& club) {
  std::vector<bool> renamed;
  Club laid(ModelFaceAlone());
  Lay(laid);
  for (const char* extension : {".qzr", ".qzl", ".qzi", ".qzs"}) {
    const std::string old_name = std::string("Winter_A Grade") + extension;
    const std::string new_name = std::string("Winter_Premier") + extension;
    renamed.push_back(club.HasFile(new_name));
    EXPECT_NE(club.HasFile(old_name), club.HasFile(new_name)) << extension;
    EXPECT_EQ(club.File(renamed.back() ? new_name : old_name), laid.File(old_name));
  }
  return renamed;
}

TEST(CorrectionFaults, ARenamedGrade) {
  std::vector<PlayerRecord> after = TwoGrades();
  for (std::size_t i = 0; i < 3; ++i) after[i].Grade = "Premier";
  BreakEverywhere({[](Club& club) {
                     Lay(club);
                     OpenTeam(club, "Rovers");
                     club.Do("input Premier");
                   },
                   {"click cmdEdGradeName"},
                   [&](Club& club) {
                     std::vector<bool> replaced = ExpectGradeFiles(club);
                     replaced.insert(replaced.begin(), IsNew(club.File(kPlayerFile),
                                                             Before().players, FileOf(after)));
                     ExpectInOrder(replaced);
                     if (!replaced[0]) return;
                     // Named back, all is as it was.
                     club.Try("forget");
                     club.Try("close frmNames");
                     club.DoAll({"click imgPlayers", "pick cboAddGrd =Premier", "input A Grade",
                                 "click cmdEdGradeName"});
                     EXPECT_EQ(club.File(kPlayerFile), Before().players);
                     EXPECT_EQ(ExpectGradeFiles(club), std::vector<bool>(4, false));
                   }});
}

TEST(CorrectionFaults, ARenamedTeam) {
  Files after = Before();
  for (std::string* file : {&after.players, &after.results, &after.ladder}) {
    for (auto at = file->find("Rovers "); at != std::string::npos; at = file->find("Rovers ")) {
      file->replace(at, 7, "Rangers");
    }
  }
  const auto rename = [](Club& club, const std::string& from, const std::string& to) {
    OpenTeam(club, from);
    club.DoAll({"input " + to, "click cmdEdTeamName"});
  };
  BreakEverywhere(
      {[](Club& club) {
         Lay(club);
         OpenTeam(club, "Rovers");
         club.Do("input Rangers");
       },
       {"click cmdEdTeamName"},
       [&](Club& club) {
         const Files before = Before();
         const bool players = IsNew(club.File(kPlayerFile), before.players, after.players);
         ExpectInOrder({players, IsNew(club.File(kAResults), before.results, after.results),
                        IsNew(club.File(kALadder), before.ladder, after.ladder)});
         // A team that was left half renamed is named back, and then goes through.
         if (players) rename(club, "Rangers", "Rovers");
         rename(club, "Rovers", "Rangers");
         EXPECT_TRUE(SamePlayers(club.File(kPlayerFile), after.players));
         EXPECT_TRUE(SameResults(club.File(kAResults), after.results));
         EXPECT_TRUE(SameMatches(club.File(kALadder), after.ladder));
       }});
}

TEST(CorrectionFaults, ADeletedPlayerWithResults) {
  Files after = Before();
  after.players.erase(kPlayerLength, kPlayerLength);
  after.results = after.results.substr(kResultLength, 2 * kResultLength);
  BreakEverywhere(
      {[](Club& club) {
         Lay(club);
         OpenTeam(club, "Rovers");
         club.DoAll({"pick lstPlayers 1", "answer ok"});
       },
       {"click cmdDelName"},
       [&](Club& club) {
         const Files before = Before();
         const bool gone = IsNew(club.File(kPlayerFile), before.players, after.players);
         ExpectInOrder({IsNew(club.File(kAResults), before.results, after.results), gone});
         EXPECT_EQ(club.File(kALadder), before.ladder);
         OpenTeam(club, "Rovers");
         if (!gone) club.DoAll({"pick lstPlayers 1", "answer ok", "click cmdDelName"});
         EXPECT_TRUE(SamePlayers(club.File(kPlayerFile), after.players));
         EXPECT_TRUE(SameResults(club.File(kAResults), after.results));
         EXPECT_FALSE(club.HasFile("TEMP.RES"));
       }});
}

TEST(CorrectionFaults, ADeletedPlayerWithoutResults) {
  Files after = Before();
  after.players.resize(3 * kPlayerLength);
  BreakEverywhere({[](Club& club) {
                     Lay(club);
                     OpenTeam(club, "Bulls");
                     club.DoAll({"pick cboAddGrd =B Grade", "pick lstPlayers 0", "answer ok"});
                   },
                   {"click cmdDelName"},
                   [&](Club& club) {
                     IsNew(club.File(kPlayerFile), Before().players, after.players);
                     EXPECT_EQ(club.File(kAResults), Before().results);
                     club.Try("close frmNames");
                     club.DoAll({"click imgPlayers", "click cmdAddCancel"});
                     EXPECT_EQ(club.Front(), "frmDB");
                   }});
}

/// Counts a kind of operation that the last line of a script takes.
long Done(FileOperation operation, const std::vector<std::string>& lines) {
  Club club(ModelFaceAlone());
  Lay(club);
  OpenTeam(club, "Rovers");
  for (std::size_t i = 0; i + 1 < lines.size(); ++i) club.Do(lines[i]);
  const long before = club.Faults().Done(operation);
  club.Do(lines.back());
  EXPECT_EQ(club.Count("error"), 0);
  return club.Faults().Done(operation) - before;
}

/// Each file is replaced in one step once its new content has reached the disk.
void ExpectReplaced(int files, const std::vector<std::string>& lines) {
  SCOPED_TRACE(lines.back());
  EXPECT_EQ(Done(FileOperation::Rename, lines), files);
  EXPECT_EQ(Done(FileOperation::Sync, lines), files);
  EXPECT_EQ(Done(FileOperation::Delete, lines), 0);
}

TEST(CorrectionFaults, EachFileIsReplacedByOneRenameAndNoneIsDeleted) {
  ExpectReplaced(3, {"input Rangers", "click cmdEdTeamName"});
  ExpectReplaced(2, {"pick lstPlayers 1", "answer ok", "click cmdDelName"});
  ExpectReplaced(1, {"pick cboAddGrd =B Grade", "pick cboAddTm =Bulls", "pick lstPlayers 0",
                     "answer ok", "click cmdDelName"});
}

TEST(CorrectionFaults, ARenamedGradeTakesFourRenamesBesidesThatOfThePlayers) {
  const std::vector<std::string> lines = {"input Premier", "click cmdEdGradeName"};
  EXPECT_EQ(Done(FileOperation::Rename, lines), 5);
  EXPECT_EQ(Done(FileOperation::Delete, lines), 0);
}

}  // namespace
}  // namespace marlowbeck
