// Hundreds of corrections on a made-up competition, typed on the screen and told to a plain model:
// every box, and after each hundred every file, is as the model says, through a new start too.

#include <algorithm>
#include <cstdlib>
#include <iostream>
#include <iterator>
#include <random>

#include "data/text.h"
#include "setup_test.h"
#include "support/season_model.h"

namespace marlowbeck {
namespace {

constexpr int kRounds = 4;
constexpr int kCorrectionsInARound = 100;
constexpr std::size_t kFewPlayers = 12;
constexpr int kErrorBox = 16;
constexpr const char* kBase = "Winter";

using Names = std::vector<std::string>;

/// Names as people type them: with blanks round them, too long, in other capitals, with all that a
/// keyboard has, some of which no file can be named for.
const Names kTeamReplies = {
    "Rovers",
    "ROVERS",
    "  Hawks ",
    "O'Hara's \"Best\", II",
    "Caf\xe9 & Bar",
    "CAF\xc9 & BAR",
    "123456789012345678901234567890",
    "123456789012345678901234567890 more",
    "      ",
    "",
    "Lions/2\\3:*?",
    "Foxes",
    "Bears",
    "Oxen",
};
const Names kGradeReplies = {
    "Premier",    "PREMIER", " A Grade  ", "A/B", "\"First\", Caf\xe9",   "Twenty-one characters",
    "  Reserves", "",        "   ",        "C",   "Twenty-one character",
};
const Names kSurnames = {"Archer",
                         "Cole",
                         " Cole ",
                         "O'Hara, \"Flo\"",
                         "de la M\xfclle",
                         "x/y",
                         "Anderson-Featherstonehaugh-Wychwood"};
const Names kFirstNames = {"Jo", "Di", "D, J", "Al \"Ace\""};

class RandomCorrections : public ::testing::Test, protected Club {
 protected:
  RandomCorrections() : Club(ModelFaceAlone()), seed_(std::random_device()()), chance_(seed_) {
    if (const char* given = std::getenv("MARLOWBECK_SEED")) seed_ = std::stoul(given);
    chance_.seed(static_cast<std::mt19937::result_type>(seed_));
    std::cout << "MARLOWBECK_SEED=" << seed_ << "\n";
  }

  /// A correction and how often it is to come.
  struct Correction {
    int weight;
    void (RandomCorrections::*carry_out)();
  };
  static std::vector<Correction> Corrections() {
    return {
        {6, &RandomCorrections::RenameATeam},   {3, &RandomCorrections::RenameAGrade},
        {4, &RandomCorrections::DeleteAPlayer}, {6, &RandomCorrections::EditAPlayer},
        {5, &RandomCorrections::AddAPlayer},
    };
  }

  void CorrectAnything() {
    const std::vector<Correction> corrections = Corrections();
    int total = 0;
    for (const Correction& correction : corrections) total += correction.weight;
    int drawn = Below(total);
    for (const Correction& correction : corrections) {
      drawn -= correction.weight;
      if (drawn < 0) return (this->*correction.carry_out)();
    }
  }

  void RenameATeam() {
    PickATeam();
    const std::string reply = OneOf(kTeamReplies);
    Say("rename team " + team_ + " of " + grade_ + " to " + reply);
    Do8("input " + reply);
    Do("click cmdEdTeamName");
    ExpectBoxes(model_.RenameTeam(grade_, team_, reply));
    // After a failure the lists are those of before until the screen is opened anew.
    if (Boxes().size() == 1 && Boxes()[0].style == kErrorBox) {
      DoAll({"click cmdAddCancel", "click imgPlayers"});
    }
  }

  void RenameAGrade() {
    PickATeam();
    const std::string reply = OneOf(kGradeReplies);
    Say("rename grade " + grade_ + " to " + reply);
    Do8("input " + reply);
    Do("click cmdEdGradeName");
    ExpectBoxes(model_.RenameGrade(grade_, reply));
  }

  void DeleteAPlayer() {
    if (model_.players.size() <= kFewPlayers) return AddAPlayer();
    const std::string line = PickAPlayer();
    const bool sure = Below(4) > 0;
    Say("delete " + line + " of " + team_ + " in " + grade_ + (sure ? "" : ", not sure"));
    Do(sure ? "answer ok" : "answer cancel");
    Do("click cmdDelName");
    ExpectBoxes(model_.DeletePlayer(grade_, team_, line, sure));
    Do("forget");
    if (Shown("fraNamesMenu")) Do("click cmdCancelDel");
  }

  void EditAPlayer() {
    const std::string line = PickAPlayer();
    SeasonModel::Edit edit{OneOf(kSurnames), OneOf(kFirstNames), team_, grade_};
    Say("edit " + line + " of " + team_ + " in " + grade_ + " to " + edit.surname + ", " +
        edit.first_name);
    Do("click cmdEdName");
    std::vector<std::string> boxes = BoxTexts();
    const bool bound = model_.IsBound(grade_, team_, line);
    EXPECT_EQ(Get("cboAddTm")["locked"], bound);
    if (!bound && Below(2) == 0) {
      edit.grade = OneOf(model_.Grades());
      edit.team = OneOf(model_.Teams(edit.grade));
      Do8("pick cboAddGrd =" + edit.grade);
      Do8("pick cboAddTm =" + edit.team);
    }
    Do8("type txtAddSn " + edit.surname);
    Do8("type txtAddFn " + edit.first_name);
    Do("click cmdAddSave");
    std::ranges::copy(BoxTexts(), std::back_inserter(boxes));
    ExpectBoxes(boxes, model_.EditPlayer(grade_, team_, line, edit));
  }

  void AddAPlayer() {
    PickATeam();
    const std::string surname = OneOf(kSurnames);
    const std::string first_name = OneOf(kFirstNames);
    Say("add " + surname + ", " + first_name + " to " + team_ + " in " + grade_);
    Do8("type txtAddSn " + surname);
    Do8("type txtAddFn " + first_name);
    Do("click cmdAddSave");
    ExpectBoxes(model_.Add(grade_, team_, surname, first_name));
  }

  /// Three grades of four teams; whoever has a number has a few nights of results, in any order.
  void MakeCompetition() {
    for (const std::string grade : {"A Grade", "B Grade", "C"}) {
      for (const std::string team : {"Rovers", "Hawks", "Lions", "Cubs"}) {
        for (int i = 0; i < 4; ++i) AddMadeUp(grade, team + " " + grade.substr(0, 1));
      }
      for (int i = 0; i < 90; ++i) model_.results[UpperCase(grade)].push_back(MadeUpResult(grade));
      for (int i = 0; i < 30; ++i) {
        model_.matches[UpperCase(grade)].push_back(
            Match(OneOf(model_.Teams(grade)), OneOf(model_.Teams(grade)), Below(12), Below(12)));
      }
      model_.configurations[UpperCase(grade)] = "3\r\n0\r\n1\r\n4\r\n11\r\n";
      model_.seasons[UpperCase(grade)] = "\"Winter of " + grade + "\"\r\n";
    }
    model_.seasons.erase("C");
  }

  SeasonModel model_;

  int Below(int end) { return std::uniform_int_distribution<int>(0, end - 1)(chance_); }

 private:
  void AddMadeUp(const std::string& grade, const std::string& team) {
    PlayerRecord player = Player(
        static_cast<int>(model_.players.size()) * 3 + 1, FixedWidth(OneOf(kSurnames), 30),
        FixedWidth(OneOf(kFirstNames), 30), FixedWidth(team, 30), FixedWidth(grade, 20), 330);
    player.Reserved1 = March(1 + Below(30));
    model_.players.push_back(player);
  }

  ResultRecord MadeUpResult(const std::string& grade) {
    const PlayerRecord& player =
        model_.players[static_cast<std::size_t>(Below(static_cast<int>(model_.players.size())))];
    ResultRecord result =
        Night(player.ID, OneOf(model_.Teams(grade)), OneOf(model_.Teams(grade)), 3 + 7 * Below(5));
    result.Grade = grade;
    result.Aggregate = static_cast<std::int16_t>(Below(2000));
    return result;
  }

  void PickATeam() {
    grade_ = OneOf(model_.Grades());
    team_ = OneOf(model_.Teams(grade_));
    Do8("pick cboAddGrd =" + grade_);
    Do8("pick cboAddTm =" + team_);
    const std::vector<std::string> lines = model_.Lines(grade_, team_);
    ASSERT_EQ(Lines("lstPlayers").size(), lines.size());
  }

  std::string PickAPlayer() {
    PickATeam();
    const std::string line = OneOf(model_.Lines(grade_, team_));
    Do8("pick lstPlayers =" + line);
    return line;
  }

  /// A line of code page 1252.
  void Do8(const std::string& line) { Do(Utf8FromCp1252(line)); }

  const std::string& OneOf(const Names& names) {
    return names[static_cast<std::size_t>(Below(static_cast<int>(names.size())))];
  }
  std::string OneOf(Names&& names) { return OneOf(names); }

  void Say(const std::string& what) { told_ = Utf8FromCp1252(what); }

  void ExpectBoxes(const SeasonModel::Boxes& expected) { ExpectBoxes(BoxTexts(), expected); }
  void ExpectBoxes(const std::vector<std::string>& actual, const SeasonModel::Boxes& expected) {
    std::vector<std::string> wanted;
    for (const std::string& box : expected) wanted.push_back(Utf8FromCp1252(box));
    EXPECT_EQ(actual, wanted) << told_;
  }

  unsigned long seed_;
  std::mt19937 chance_;
  std::string grade_;
  std::string team_;
  std::string told_;  ///< the correction in hand
};

TEST_F(RandomCorrections, EveryFileIsAsAPlainModelSays) {
  MakeCompetition();
  model_.Lay(*this, kBase);
  for (int round = 0; round < kRounds && !HasFailure(); ++round) {
    Do("click imgPlayers");
    for (int i = 0; i < kCorrectionsInARound && !HasFailure(); ++i) CorrectAnything();
    model_.ExpectFiles(*this, kBase);
    Restart();
  }
}

}  // namespace
}  // namespace marlowbeck
