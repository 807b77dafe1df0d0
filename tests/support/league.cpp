#include "support/league.h"

namespace marlowbeck {

std::vector<PlayerRecord> LeaguePlayers() {
  const auto at = [](int id, const char* surname, const char* first, const char* team) {
    return Player(id, surname, first, team, "A Grade", 333);
  };
  const auto bt = [](int id, const char* surname, const char* team) {
    return Player(id, surname, "Di", team, "B Grade", 111);
  };
  return {at(1, "Reed", "Jo", "Rovers"),  at(2, "Rudd", "Ann", "Rovers"),
          at(11, "Hill", "Al", "Hawks"),  at(12, "Hope", "Bo", "Hawks"),
          at(13, "Hunt", "Cy", "Hawks"),  at(14, "Holt", "Di", "Hawks"),
          at(15, "Hart", "Ed", "Hawks"),  at(16, "Head", "Fay", "Hawks"),
          at(17, "Hyde", "Gus", "Hawks"), at(18, "Hogg", "Ida", "Hawks"),
          at(21, "Lamb", "Max", "Lions"), at(31, "Carr", "Pat", "Cubs"),
          bt(41, "Bell", "Bees"),         bt(42, "Cook", "Crows"),
          bt(43, "Dunn", "Ducks"),        Player(51, "Ash", "Vi", "Alone", "C Grade", 330)};
}

Date March(int day) { return *DateFromCivil({2004, 3, day}); }

ResultRecord Night(int id, std::string_view team, std::string_view opposition, int night) {
  ResultRecord result;
  result.ID = id;
  result.Team = team;
  result.Opposition = opposition;
  result.GameDate = March(night);
  result.Legs = 9;
  result.Aggregate = 950;
  result.Shots = 20;
  result.HighScore = 140;
  result.Centuries = 2;
  return result;
}

void LayLeague(Club& club) {
  club.WritePlayers(kLeagueFile, LeaguePlayers());
  club.NameOpenFile(kLeagueFile);
  club.WriteFile("WkDate.qz3", "#2004-03-31#\r\n");
}

std::vector<std::string> ToTeam(const std::string& grade, const std::string& team) {
  return {"click imgSheets", "pick cboResGrade =" + grade, "click cmdGotoResults",
          "pick cboResTeam =" + team};
}

Entries GoodSheet() {
  return {
      {"txtAgg", "1000"}, {"txtShots", "50"}, {"txtHS", "140"}, {"txtCent", "2"}, {"txtLegs", "9"}};
}

void ScoreSheets::OpenGrade(const std::string& grade) {
  DoAll({"click imgSheets", "pick cboResGrade =" + grade, "click cmdGotoResults"});
}

void ScoreSheets::OpenTeam(const std::string& team, const std::string& grade) {
  DoAll(ToTeam(grade, team));
}

void ScoreSheets::OpenSheet(const std::string& line) {
  OpenTeam("Hawks");
  Do("pick lstResPlayers =" + line);
}

void ScoreSheets::TypeInto(const Entries& entries) {
  for (const auto& [box, text] : entries) Do("type " + box + " " + text);
}

void ScoreSheets::SaveGoodSheet(const std::string& line) {
  Do("pick lstResPlayers =" + line);
  TypeInto(GoodSheet());
  Do("click cmdSave");
}

std::string ScoreSheets::TheBox() {
  const std::vector<std::string> boxes = BoxTexts();
  EXPECT_EQ(boxes.size(), 1U);
  return boxes.size() == 1 ? boxes.front() : std::string();
}

}  // namespace marlowbeck
