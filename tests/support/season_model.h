#pragma once

#include <array>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "support/club.h"
#include "support/record_files.h"

namespace marlowbeck {

/// A team of a grade on a date.
struct TeamNight {
  std::string grade;
  std::string team;
  Date date;
};

/// A night's figures as they are typed; those that are 0 are left blank, but for the first two.
struct Figures {
  int aggregate = 0;
  int shots = 0;
  int high_score = 0;
  int centuries = 0;
  int scores_180 = 0;
  std::array<int, 6> pegs{};
  int legs = 0;
};

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

  // On the score sheets of a team's night.

  /// The teams that stand in no result of the date, without the one in hand.
  [[nodiscard]] std::vector<std::string> FreeTeams(const TeamNight& at) const;
  /// The one that is met, else the first that is free, else nobody.
  [[nodiscard]] std::string OppositionOn(const TeamNight& at) const;
  /// Whether another opposition is offered.
  [[nodiscard]] bool CanSwap(const TeamNight& at) const;
  Boxes SwapOpposition(const TeamNight& at, const std::string& to, bool sure);
  /// The lines of those who are entered, one for each result.
  [[nodiscard]] std::vector<std::string> Entered(const TeamNight& at) const;
  /// Nothing where no saved sheet comes up for a line.
  std::optional<Boxes> DeleteResult(const TeamNight& at, std::string_view line, bool sure);
  /// `typed` need not be of the grade in hand.
  Boxes AddFromSheets(std::string_view grade_in_hand, const Edit& typed);
  /// The results of a grade are put in the order of their dates.
  void CloseSheets(std::string_view grade);

  // On the weekly table of a team's night.

  [[nodiscard]] std::vector<Date> Dates(std::string_view grade, std::string_view team) const;
  /// The first cells of the table, in no order.
  [[nodiscard]] std::vector<std::string> Rows(const TeamNight& at) const;
  /// Whether there is a box for a peg, of six from 0 on, when a row is corrected.
  [[nodiscard]] bool HasPegBox(const TeamNight& at, std::string_view row, std::size_t peg) const;
  Boxes CorrectScore(const TeamNight& at, std::string_view row, const Figures& typed);
  Boxes ChangeDate(const TeamNight& at, Date to);

  /// Whether a grade's name can be part of a file's.
  [[nodiscard]] static bool NamesAFile(std::string_view grade);
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
  [[nodiscard]] const std::vector<ResultRecord>& ResultsOf(std::string_view grade) const;
  [[nodiscard]] const PlayerRecord* Listed(std::string_view grade, std::string_view team,
                                           std::string_view line, std::string_view between) const;
  [[nodiscard]] std::string WeeklyOpposition(const TeamNight& at) const;
  [[nodiscard]] bool GradeIsTaken(std::string_view name) const;
  [[nodiscard]] bool TeamIsTaken(std::string_view name) const;
  [[nodiscard]] std::int32_t CodeOf(std::string_view grade) const;
  [[nodiscard]] std::map<std::string, std::string> Contents() const;
};

}  // namespace marlowbeck
