#pragma once

#include <string>
#include <vector>

#include "support/club.h"
#include "support/record_files.h"

namespace marlowbeck {

using TextList = Club::TextList;

/// Three of A Grade and two of B Grade, in the order of the file.
[[nodiscard]] inline std::vector<PlayerRecord> FivePlayers() {
  return {Player(1, "Moss", "Cy", "Rovers", "A Grade"), Player(2, "Dean", "Di", "Bees", "B Grade"),
          Player(3, "Archer", "Jo", "Cubs", "A Grade"), Player(4, "Young", "Al", "Cubs", "A Grade"),
          Player(5, "Ely", "Bo", "Crows", "B Grade")};
}

/// So many players of A Grade: "P1, X", "P2, X" and so on, in two teams.
[[nodiscard]] inline std::vector<PlayerRecord> ManyPlayers(int count) {
  std::vector<PlayerRecord> players;
  for (int id = 1; id <= count; ++id) {
    players.push_back(
        Player(id, "P" + std::to_string(id), "X", id % 2 == 0 ? "Cubs" : "Rovers", "A Grade"));
  }
  return players;
}

/// A list file with these players, each of A Grade, on 3 March 2004.
[[nodiscard]] inline std::string ListFile(TextList names, const std::string& grade) {
  std::string file;
  names.resize(64);
  for (const std::string& name : names) file += '"' + name + "\"\r\n";
  for (const std::string& name : names) file += name.empty() ? "\"\"\r\n" : "\"A Grade\"\r\n";
  return file + "#2004-03-03#\r\n\"" + grade + "\"\r\n";
}

inline constexpr const char* kNotFound =
    "The file name specified could    \rnot be found. Please retry.    ";

/// The knock-out opened over a competition.
class KnockOutTest : public ClubTest {
 protected:
  void Lay(const std::vector<PlayerRecord>& players) {
    WritePlayers("Winter.qza", players);
    NameOpenFile("Winter.qza");
  }
  /// To the first panel.
  void Open(Here here = Here::current()) { Do("click imgKO", here); }
  /// To the selection of all grades.
  void OpenSelection(Here here = Here::current()) { DoAll({"click imgKO", "click cmdOK"}, here); }
  void OpenFive(Here here = Here::current()) {
    Lay(FivePlayers());
    OpenSelection(here);
  }
  /// Moves the players of these lines, one after the other, into the table.
  void Select(const TextList& lines, Here here = Here::current()) {
    for (const std::string& line : lines) {
      DoAll({"pick lstAllPlayers =" + line, "click cmdADD"}, here);
    }
  }
  void TakeGrade(const std::string& grade, Here here = Here::current()) {
    DoAll({"click cmdKOGrade", "pick cboResGrade =" + grade, "click cmdGradeOK"}, here);
  }

  /// The players of the table down to the first free place.
  [[nodiscard]] TextList Players(Here here = Here::current()) { return Column(1, here); }
  [[nodiscard]] TextList Grades(Here here = Here::current()) { return Column(2, here); }
  [[nodiscard]] TextList Column(std::size_t column, Here here = Here::current()) {
    const auto cells = Cells("grdKO", here);
    TextList texts;
    for (std::size_t row = 1; row < cells.size() && !cells[row][1].empty(); ++row) {
      texts.push_back(cells[row][column]);
    }
    return texts;
  }
  [[nodiscard]] TextList Available(Here here = Here::current()) {
    return Lines("lstAllPlayers", here);
  }
  /// How many are not selected, selected, and available in all.
  [[nodiscard]] TextList Counts(Here here = Here::current()) {
    return {Caption("lblKONOP(1)", here), Caption("lblKONOP(3)", here),
            Caption("lblKONOP(4)", here)};
  }
};

}  // namespace marlowbeck
