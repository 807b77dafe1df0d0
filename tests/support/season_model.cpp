#include "support/season_model.h"

#include <algorithm>
#include <set>

#include "data/real_file_system.h"
#include "data/text.h"

namespace marlowbeck {
namespace {

constexpr std::size_t kNameWidth = 30;
constexpr std::size_t kGradeWidth = 20;
constexpr const char* kNoSuchFile = "PATH NOT FOUND    ";

std::string Padded(std::string_view name) { return FixedWidth(name, kNameWidth); }

bool IsOf(const PlayerRecord& player, std::string_view grade, std::string_view team) {
  return Trimmed(player.Grade) == grade && Trimmed(player.Team) == team;
}

std::string LineOf(const PlayerRecord& player) {
  return Trim(player.Surname) + ", " + Trim(player.FirstName);
}

/// Moves a grade's file to another name. Answers false where it is not there, or the other one is.
template <typename Files>
bool Move(Files& files, const std::string& from, const std::string& to) {
  if (!files.contains(from) || files.contains(to)) return false;
  files[to] = files[from];
  files.erase(from);
  return true;
}

std::string RenamedBox(std::string_view from, std::string_view to) {
  return "    " + std::string(from) + "\rhas been changed to    \r    " + std::string(to) + "    ";
}

/// Names the fields that differ where the file holds records.
::testing::AssertionResult Same(std::string_view key, std::string_view actual,
                                std::string_view expected) {
  if (key.ends_with(".QZA")) return SamePlayers(actual, expected);
  if (key.ends_with(".QZR")) return SameResults(actual, expected);
  if (key.ends_with(".QZL")) return SameMatches(actual, expected);
  if (actual == expected) return ::testing::AssertionSuccess();
  return ::testing::AssertionFailure() << actual << ", expected " << expected;
}

void RenameIn(std::string& field, std::string_view from, std::string_view to) {
  if (Trimmed(field) == from) field = Padded(to);
}

}  // namespace

/// A slash parts folders, of which there is none by such a name.
bool SeasonModel::NamesAFile(std::string_view grade) {
  return grade.find('/') == std::string_view::npos;
}

std::vector<std::string> SeasonModel::Grades() const {
  std::set<std::string> grades;
  for (const PlayerRecord& player : players) grades.insert(Trim(player.Grade));
  return {grades.begin(), grades.end()};
}

std::vector<std::string> SeasonModel::Teams(std::string_view grade) const {
  std::set<std::string> teams;
  for (const PlayerRecord& player : players) {
    if (Trimmed(player.Grade) == grade) teams.insert(Trim(player.Team));
  }
  return {teams.begin(), teams.end()};
}

std::vector<std::string> SeasonModel::Lines(std::string_view grade, std::string_view team) const {
  std::vector<std::string> lines;
  for (const PlayerRecord& player : players) {
    if (IsOf(player, grade, team)) lines.push_back(LineOf(player));
  }
  return lines;
}

bool SeasonModel::GradeIsTaken(std::string_view name) const {
  return std::ranges::any_of(players, [&](const PlayerRecord& player) {
    return UpperCase(Trimmed(player.Grade)) == UpperCase(Trimmed(name));
  });
}

bool SeasonModel::TeamIsTaken(std::string_view name) const {
  return std::ranges::any_of(players, [&](const PlayerRecord& player) {
    return UpperCase(Trimmed(player.Team)) == UpperCase(Trimmed(name));
  });
}

std::int32_t SeasonModel::CodeOf(std::string_view grade) const {
  for (const PlayerRecord& player : players) {
    if (Trimmed(player.Grade) == grade) return player.BestOfThree;
  }
  return 0;
}

SeasonModel::Boxes SeasonModel::Add(std::string_view grade, std::string_view team,
                                    std::string_view surname, std::string_view first_name) {
  PlayerRecord player;
  for (const PlayerRecord& other : players) player.ID = std::max(player.ID, other.ID);
  ++player.ID;
  player.Surname = Padded(surname);
  player.FirstName = Padded(first_name);
  player.Team = Padded(team);
  player.Grade = FixedWidth(grade, kGradeWidth);
  player.Reserved1 = players.back().Reserved1;
  player.BestOfThree = CodeOf(grade);
  players.push_back(player);
  return {};
}

bool SeasonModel::IsBound(std::string_view grade, std::string_view team, std::string_view line) {
  if (!NamesAFile(grade)) return true;
  std::int32_t id = 0;
  for (const PlayerRecord& player : players) {
    if (IsOf(player, grade, team) && LineOf(player) == line) id = player.ID;
  }
  const auto& all = results[UpperCase(grade)];  // the look makes the file
  return std::ranges::any_of(all, [&](const ResultRecord& result) { return result.ID == id; });
}

SeasonModel::Boxes SeasonModel::EditPlayer(std::string_view grade, std::string_view team,
                                           std::string_view line, const Edit& edit) {
  const bool bound = IsBound(grade, team, line);
  PlayerRecord* edited = nullptr;
  for (PlayerRecord& player : players) {
    if (IsOf(player, grade, team) && LineOf(player) == line) edited = &player;
  }
  const Date reserved = players.back().Reserved1;
  const std::int32_t code = CodeOf(bound ? grade : std::string_view(edit.grade));
  edited->Surname = Padded(edit.surname);
  edited->FirstName = Padded(edit.first_name);
  edited->Team = Padded(bound ? team : std::string_view(edit.team));
  edited->Grade = FixedWidth(bound ? grade : std::string_view(edit.grade), kGradeWidth);
  edited->Reserved1 = reserved;
  edited->BestOfThree = code;
  return NamesAFile(grade) ? Boxes() : Boxes{kNoSuchFile};
}

SeasonModel::Boxes SeasonModel::DeletePlayer(std::string_view grade, std::string_view team,
                                             std::string_view line, bool sure) {
  if (!NamesAFile(grade)) return {kNoSuchFile};
  const auto doomed = std::ranges::find_if(players, [&](const PlayerRecord& player) {
    return IsOf(player, grade, team) && LineOf(player) == line;
  });
  const std::int32_t id = doomed->ID;
  auto& all = results[UpperCase(grade)];
  const auto games =
      std::ranges::count_if(all, [&](const ResultRecord& result) { return result.ID == id; });
  std::string found = "   (No results were found for this player)    ";
  if (games == 1) found = "   (This includes results found for 1 game.)    ";
  if (games > 1) {
    found = "   (This includes results found for " + std::to_string(games) + " games.)    ";
  }
  if (sure) {
    std::erase_if(all, [&](const ResultRecord& result) { return result.ID == id; });
    std::erase_if(players, [&](const PlayerRecord& player) { return player.ID == id; });
  }
  return {"You are about to permanently erase the following player from your file.    \r\r" +
          Trim(line) + "\r" + found + "\r\rDo you wish to proceed ?    "};
}

SeasonModel::Boxes SeasonModel::RenameTeam(std::string_view grade, std::string_view team,
                                           std::string_view reply) {
  const std::string_view name = reply.substr(0, kNameWidth);
  if (Trimmed(name).empty() || team.empty()) return {};
  if (TeamIsTaken(name)) return {"Name is already in use.    "};
  for (PlayerRecord& player : players) {
    if (Trimmed(player.Grade) == grade) RenameIn(player.Team, team, reply);
  }
  if (!NamesAFile(grade)) return {kNoSuchFile};
  for (ResultRecord& result : results[UpperCase(grade)]) {
    RenameIn(result.Team, team, reply);
    RenameIn(result.Opposition, team, reply);
  }
  for (LadderRecord& match : matches[UpperCase(grade)]) {
    RenameIn(match.HomeTeam, team, reply);
    RenameIn(match.AwayTeam, team, reply);
  }
  return {RenamedBox(team, reply)};
}

SeasonModel::Boxes SeasonModel::RenameGrade(std::string_view grade, std::string_view reply) {
  const std::string name = FixedWidth(reply, kGradeWidth);
  if (Trimmed(name).empty()) return {};
  if (GradeIsTaken(name)) return {"Name is already in use.    "};
  for (PlayerRecord& player : players) {
    if (Trimmed(player.Grade) == grade) player.Grade = name;
  }
  const std::string from = UpperCase(grade);
  const std::string to = UpperCase(Trimmed(name));
  if (NamesAFile(grade) && NamesAFile(name) && Move(results, from, to) && Move(matches, from, to) &&
      Move(configurations, from, to)) {
    Move(seasons, from, to);
  }
  return {RenamedBox(grade, reply)};
}

/// By upper-cased name, without the base.
std::map<std::string, std::string> SeasonModel::Contents() const {
  std::map<std::string, std::string> files = {{".QZA", FileOf(players)}};
  for (const auto& [grade, records] : results) files["_" + grade + ".QZR"] = FileOf(records);
  for (const auto& [grade, records] : matches) files["_" + grade + ".QZL"] = FileOf(records);
  for (const auto& [grade, text] : configurations) files["_" + grade + ".QZI"] = text;
  for (const auto& [grade, text] : seasons) files["_" + grade + ".QZS"] = text;
  return files;
}

void SeasonModel::Lay(Club& club, const std::string& base) const {
  for (const auto& [name, content] : Contents()) {
    club.WriteFile(name == ".QZA" ? base + ".qza" : base + Utf8FromCp1252(name), content);
  }
  club.NameOpenFile(base + ".qza");
}

void SeasonModel::ExpectFiles(const Club& club, const std::string& base) const {
  std::map<std::string, std::string> left = Contents();
  for (const auto& entry : std::filesystem::directory_iterator(club.Folder())) {
    const std::string name = TextOfPath(entry.path().filename());
    if (!UpperCase(name).starts_with(UpperCase(base))) continue;
    const std::string key = UpperCase(name).substr(base.size());
    const auto expected = left.find(key);
    if (expected == left.end()) {
      ADD_FAILURE() << name << " should not be there";
      continue;
    }
    const std::string actual = club.File(entry.path().filename().string());
    EXPECT_TRUE(Same(key, actual, expected->second)) << name;
    left.erase(expected);
  }
  for (const auto& [name, content] : left) ADD_FAILURE() << name << " is missing";
  EXPECT_FALSE(club.HasFile("TEMP.RES"));
}

}  // namespace marlowbeck
