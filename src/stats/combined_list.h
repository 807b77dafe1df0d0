#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <vector>

#include "data/id_index.h"
#include "data/records.h"
#include "data/side_file.h"

namespace marlowbeck {

/// A player in the list of all grades.
struct CombinedRow {
  std::int32_t id = 0;
  std::string name;  ///< "Surname, First name"
  std::string team;
  std::string grade;
  double avg = 0;  ///< points per shot, cut to two places
  std::int32_t games = 0;

  friend bool operator==(const CombinedRow&, const CombinedRow&) = default;
};

/// Averages over all grades, up to a date and with it. It is handed every player record in file
/// order, then, grade by grade, every result record of the grade in file order.
class CombinedAverages {
 public:
  explicit CombinedAverages(Date until) : until_(until) {}

  /// Throws SubscriptOutOfRange past 1000 players.
  void AddPlayer(const PlayerView& player);
  void AddResult(const ResultView& result);
  /// The results of a grade have all been handed over.
  void EndGrade();

  /// Those with an average above 0, from the last player record to the first. A player of several
  /// grades has the average of the last one that gives any, and the games of all.
  [[nodiscard]] std::vector<CombinedRow> Rows() const;

 private:
  /// What the results of one id come to.
  struct Sums {
    std::int64_t agg = 0;  ///< of the grade in hand
    std::int64_t shots = 0;
    double avg = 0;
    std::int32_t games = 0;
  };

  Date until_;
  std::vector<CombinedRow> players_;
  std::vector<int> places_;  ///< of their ids
  IdIndex ids_;
  std::vector<Sums> sums_;  ///< in the ids' places
};

enum class CombinedOrder { ByAverage, Alphabetical };

/// Best average first, or A to Z by the bytes of the names; equal ones as the sorting pass leaves
/// them. Rows without an average are left out.
[[nodiscard]] std::vector<CombinedRow> Ordered(std::vector<CombinedRow> rows, CombinedOrder order);

/// A line a row: id, name, team, grade, avg, games.
void WriteCombined(SideFileWriter& writer, const std::vector<CombinedRow>& rows);
/// Reads `count` rows back. Throws InputPastEnd or TypeMismatch where they are not there.
[[nodiscard]] std::vector<CombinedRow> ReadCombined(SideFileReader& reader, int count);

/// The cells of a row, `number` being its place from 1.
[[nodiscard]] std::array<std::string, 6> CombinedCells(int number, const CombinedRow& row);

}  // namespace marlowbeck
