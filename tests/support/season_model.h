#pragma once

#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "support/club.h"
#include "support/record_files.h"

namespace marlowbeck {

/// A competition as plain lists in memory, and what each correction makes of them: the same steps
/// told a second time, record by record, without files. Texts are as the records hold them, padded;
/// names handed in are trimmed.
///
/// Each correction answers the texts of the boxes that are to come, as code page 1252.
class SeasonModel {
 public:
  using Boxes = std::vector<std::string>;

  std::vector<PlayerRecord> players;
  // What lies on disk for each grade. The grade is upper-cased, as file names are without regard to
  // case. A grade that stands here has the file.
  std::map<std::string, std::vector<ResultRecord>> results;
  std::map<std::string, std::vector<LadderRecord>> matches;
  std::map<std::string, std::string> configurations;
  std::map<std::string, std::string> seasons;

  /// A new player at the end of the file.
  Boxes Add(std::string_view grade, std::string_view team, std::string_view surname,
            std::string_view first_name);
  /// Other names for the player of a line of the list, and another place if that is free to choose.
  struct Edit {
    std::string surname;
    std::string first_name;
    std::string team;
    std::string grade;
  };
  Boxes EditPlayer(std::string_view grade, std::string_view team, std::string_view line,
                   const Edit& edit);
  /// `sure` is the answer to the question.
  Boxes DeletePlayer(std::string_view grade, std::string_view team, std::string_view line,
                     bool sure);
  Boxes RenameTeam(std::string_view grade, std::string_view team, std::string_view reply);
  Boxes RenameGrade(std::string_view grade, std::string_view reply);

  /// Whether the player of a line, when it is edited, is bound to team and grade.
  [[nodiscard]] bool IsBound(std::string_view grade, std::string_view team, std::string_view line);

  [[nodiscard]] std::vector<std::string> Grades() const;
  /// The teams of a grade, and the lines of a team's list in the order of the records.
  [[nodiscard]] std::vector<std::string> Teams(std::string_view grade) const;
  [[nodiscard]] std::vector<std::string> Lines(std::string_view grade, std::string_view team) const;

  /// Lays all files into a club, under the base name, and names the player file as the open one.
  void Lay(Club& club, const std::string& base) const;
  /// Compares all files of the club with that base, byte for byte.
  void ExpectFiles(const Club& club, const std::string& base) const;

 private:
  [[nodiscard]] bool GradeIsTaken(std::string_view name) const;
  [[nodiscard]] bool TeamIsTaken(std::string_view name) const;
  [[nodiscard]] std::int32_t CodeOf(std::string_view grade) const;
  [[nodiscard]] std::map<std::string, std::string> Contents() const;
};

}  // namespace marlowbeck
