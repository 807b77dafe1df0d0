#include "support/random_corrections.h"

#include <algorithm>
#include <cstdlib>
#include <iostream>

#include "data/text.h"
#include "support/league.h"
#include "support/random_names.h"

namespace marlowbeck {

RandomCorrections::RandomCorrections()
    : Club(ModelFaceAlone()), seed_(std::random_device()()), chance_(seed_) {
  if (const char* given = std::getenv("MARLOWBECK_SEED")) seed_ = std::stoul(given);
  chance_.seed(static_cast<std::mt19937::result_type>(seed_));
  std::cout << "MARLOWBECK_SEED=" << seed_ << "\n";
}

std::vector<RandomCorrections::Correction> RandomCorrections::Corrections() {
  return {
      {6, &RandomCorrections::RenameATeam},    {3, &RandomCorrections::RenameAGrade},
      {4, &RandomCorrections::DeleteAPlayer},  {6, &RandomCorrections::EditAPlayer},
      {4, &RandomCorrections::AddAPlayer},     {6, &RandomCorrections::SwapAnOpposition},
      {6, &RandomCorrections::DeleteAResult},  {3, &RandomCorrections::AddAPlayerFromSheets},
      {10, &RandomCorrections::CorrectAScore}, {8, &RandomCorrections::ChangeADate},
  };
}

void RandomCorrections::CorrectAnything() {
  const std::vector<Correction> corrections = Corrections();
  int total = 0;
  for (const Correction& correction : corrections) total += correction.weight;
  int drawn = Below(total);
  for (const Correction& correction : corrections) {
    drawn -= correction.weight;
    if (drawn < 0) return (this->*correction.carry_out)();
  }
}

void RandomCorrections::MakeCompetition() {
  const std::vector<std::pair<std::string, int>> grades = {
      {"A Grade", 330}, {"B Grade", 111}, {"C", 3}};
  for (const auto& [grade, code] : grades) {
    for (const std::string team : {"Rovers", "Hawks", "Lions", "Cubs"}) {
      for (int i = 0; i < 4; ++i) AddMadeUp(grade, team + " " + grade.substr(0, 1), code);
    }
    for (const int day : {17, 3, 31, 10, 24}) MakeNight(grade, day);
    for (int i = 0; i < 30; ++i) {
      LadderRecord match;
      match.HomeTeam = OneOf(model.Teams(grade));
      match.AwayTeam = OneOf(model.Teams(grade));
      match.HomeScore = static_cast<std::int16_t>(Below(12));
      match.AwayScore = static_cast<std::int16_t>(Below(12));
      match.GameDate = March(1 + Below(31));
      model.matches[UpperCase(grade)].push_back(match);
    }
    model.configurations[UpperCase(grade)] = "3\r\n0\r\n1\r\n4\r\n11\r\n";
    model.seasons[UpperCase(grade)] = "\"Winter of " + grade + "\"\r\n";
  }
  model.seasons.erase("C");
}

void RandomCorrections::AddMadeUp(const std::string& grade, const std::string& team, int code) {
  PlayerRecord player =
      Player(static_cast<int>(model.players.size()) * 3 + 1, FixedWidth(OneOf(kSurnames), 30),
             FixedWidth(OneOf(kFirstNames), 30), FixedWidth(team, 30), FixedWidth(grade, 20), code);
  player.Reserved1 = March(1 + Below(30));
  model.players.push_back(player);
}

/// Two matches, of which a side or two may not be entered yet, and among them what nobody can
/// explain any more.
void RandomCorrections::MakeNight(const std::string& grade, int day) {
  std::vector<std::string> teams = model.Teams(grade);
  std::ranges::shuffle(teams, chance_);
  std::vector<ResultRecord>& results = model.results[UpperCase(grade)];
  for (const std::size_t side : {0U, 1U, 2U, 3U}) {
    if (OneIn(3)) continue;
    for (const PlayerRecord& player : model.players) {
      if (Trimmed(player.Team) != teams[side] || OneIn(4)) continue;
      results.push_back(MadeUpResult(player.ID, teams[side], teams[side ^ 1U], day));
    }
  }
  for (int i = 0; i < 3; ++i) {
    results.push_back(
        MadeUpResult(OneOf(model.players).ID, OneOf(model.Teams(grade)), OneOf(teams), day));
  }
}

ResultRecord RandomCorrections::MadeUpResult(std::int32_t id, const std::string& team,
                                             const std::string& opposition, int day) {
  ResultRecord result = Night(id, team, opposition, day);
  result.Grade = "as it was";
  result.Aggregate = static_cast<std::int16_t>(1 + Below(2000));
  for (std::int16_t& peg : result.Pegs) peg = static_cast<std::int16_t>(Below(171));
  if (!OneIn(10)) return result;
  result = Night(id, team, opposition, day);
  for (std::int16_t* figure :
       {&result.Legs, &result.Aggregate, &result.HighScore, &result.Centuries}) {
    *figure = 0;
  }
  result.Shots = 0;
  result.Forfeit = "F";
  return result;
}

void RandomCorrections::LeaveTheScreens() {
  if (in_setup_) Do("click cmdAddCancel");
  in_setup_ = false;
  EXPECT_EQ(Front(), "frmDB") << told_;
}

void RandomCorrections::Do8(const std::string& line) { Do(Utf8FromCp1252(line)); }

void RandomCorrections::Say(const std::string& what) { told_ = Utf8FromCp1252(what); }

void RandomCorrections::ExpectBoxes(const SeasonModel::Boxes& expected) {
  ExpectBoxes(BoxTexts(), expected);
}

void RandomCorrections::ExpectBoxes(const std::vector<std::string>& actual,
                                    const SeasonModel::Boxes& expected) {
  ExpectLines(actual, expected);
}

void RandomCorrections::ExpectLines(std::vector<std::string> actual, const Names& expected) {
  std::vector<std::string> wanted;
  for (const std::string& line : expected) wanted.push_back(Utf8FromCp1252(line));
  EXPECT_EQ(actual, wanted) << told_;
}

}  // namespace marlowbeck
