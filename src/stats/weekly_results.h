#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "data/id_index.h"
#include "data/records.h"
#include "data/side_file.h"

namespace marlowbeck {

/// One player's night in the weekly table.
struct WeeklyRow {
  std::string name;  ///< "Surname, First name", with " *" behind it on a forfeit row
  std::int16_t agg = 0;
  std::int32_t shots = 0;
  std::int16_t c180 = 0;
  std::int16_t c100 = 0;
  std::int16_t hs = 0;
  std::array<std::int16_t, 6> pegs{};

  friend bool operator==(const WeeklyRow&, const WeeklyRow&) = default;
};

/// The results of one team on one date. It is handed every result record of the grade in file
/// order, then every player record in file order, and answers the rows.
class WeeklyResults {
 public:
  /// `team` must outlive this.
  WeeklyResults(std::string_view team, Date date) : team_(team), date_(date) {}

  void AddResult(const ResultView& result);
  /// Of several players with one id the first one counts.
  void AddPlayer(const PlayerView& player);

  /// The team played: that of the last result of the night, empty when its player is in the file no
  /// more. Nothing where the night has no results.
  [[nodiscard]] std::optional<std::string> Opposition() const;

  /// One row for each result whose player is in the file, best average first. Throws
  /// SubscriptOutOfRange past 1000 rows, and DivisionByZero where a row without shots has to be
  /// put in order with another.
  [[nodiscard]] std::vector<WeeklyRow> Rows() const;

 private:
  struct Night {
    std::int32_t id = 0;
    bool forfeit = false;
    WeeklyRow row;  ///< still without its name
    std::string opposition;
  };

  /// Null where the player is in the file no more.
  [[nodiscard]] const std::string* NameOf(std::int32_t id) const;

  std::string_view team_;
  Date date_;
  std::vector<Night> nights_;
  IdIndex ids_;                                    ///< those that played
  std::vector<std::optional<std::string>> names_;  ///< in their places, once they have been found
};

/// The hand-over to the grid, two lines a row and no count: name, agg, shots, c180, c100 and hs,
/// then the six pegs.
void WriteWeekly(SideFileWriter& writer, const std::vector<WeeklyRow>& rows);
/// Reads `count` rows back. Throws InputPastEnd or TypeMismatch where they are not there.
[[nodiscard]] std::vector<WeeklyRow> ReadWeekly(SideFileReader& reader, int count);

/// The cells of a row in the weekly table.
[[nodiscard]] std::array<std::string, 10> WeeklyCells(const WeeklyRow& row);

/// "57, 121" for the two pegs of a game; a peg of 0 or less is left out.
[[nodiscard]] std::string PegText(int first, int second);

/// A figure of a table that is left blank unless it is above 0.
[[nodiscard]] std::string FigureAboveZero(double figure);

}  // namespace marlowbeck
