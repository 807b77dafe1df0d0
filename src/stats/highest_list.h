#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "data/id_index.h"
#include "data/records.h"
#include "data/side_file.h"

namespace marlowbeck {

/// The six lists of the highest, by the number that ReportChoice has for each.
enum class HighestOf { Averages = 0, HighPegs, HighScores, Pegs, Centuries, Scores180 };

/// One date alone, or everything up to it.
enum class ListSpan { OneDate, UpToDate };

struct HighestRow {
  std::int32_t id = 0;
  std::string name;  ///< "Surname, First name"; empty for a player who is in the file no more
  std::string team;
  double value = 0;
  std::int32_t games = 0;  ///< with points and shots; counted up to a date only

  friend bool operator==(const HighestRow&, const HighestRow&) = default;
};

/// What the values of a list are headed with.
[[nodiscard]] std::string_view HeadingOf(HighestOf list, ListSpan span);

/// The highest of one date. It is handed every result record of the grade in file order, then every
/// player record in file order, and answers the rows.
class HighestOfDate {
 public:
  HighestOfDate(HighestOf list, Date date) : list_(list), date_(date) {}

  /// A result without points or without shots, as a forfeit's, counts for no list. Throws
  /// SubscriptOutOfRange past 1000 results of the date.
  void AddResult(const ResultView& result) {
    if (result.GameDate() == date_) AddResultOfDate(result);
  }
  /// Of several players with one id the first one counts.
  void AddPlayer(const PlayerView& player);

  [[nodiscard]] bool Any() const { return !rows_.empty(); }
  /// Those with a value above 0, the highest first. A row to a result, with the result's team. They
  /// are handed over once.
  [[nodiscard]] std::vector<HighestRow> TakeRows();

 private:
  static constexpr int kNone = -1;

  /// The rows of one id, which wait for its player's name.
  struct Waiting {
    int last = kNone;
    bool named = false;
  };

  void AddResultOfDate(const ResultView& result);

  HighestOf list_;
  Date date_;
  std::vector<HighestRow> rows_;
  std::vector<int> same_id_before_;  ///< the row before each with its id
  IdIndex ids_;
  std::vector<Waiting> waiting_;  ///< in the ids' places
};

/// The highest of everything up to a date and with it. It is handed every player record in file
/// order, then every result record of the grade in file order.
class HighestUpToDate {
 public:
  HighestUpToDate(HighestOf list, Date until) : list_(list), until_(until) {}

  /// Throws SubscriptOutOfRange past 1000 players: each has a place, listed or not.
  void AddPlayer(const PlayerView& player);
  void AddResult(const ResultView& result);

  /// Those with a value above 0, the highest first. A row to a player record, with its team.
  [[nodiscard]] std::vector<HighestRow> Rows() const;

 private:
  /// What the results of one id come to.
  struct Sums {
    std::int64_t agg = 0;
    std::int64_t shots = 0;
    std::int64_t value = 0;  ///< of all lists but the averages
    std::int32_t games = 0;
  };

  void Count(Sums& sums, const ResultView& result) const;
  [[nodiscard]] double ValueOf(const Sums& sums) const;

  HighestOf list_;
  Date until_;
  std::vector<HighestRow> players_;
  std::vector<int> places_;  ///< of their ids
  IdIndex ids_;
  std::vector<Sums> sums_;  ///< in the ids' places
};

/// A line a row: id, name, team, value, games.
void WriteHighest(SideFileWriter& writer, const std::vector<HighestRow>& rows);
/// Reads `count` rows back. Throws InputPastEnd or TypeMismatch where they are not there.
[[nodiscard]] std::vector<HighestRow> ReadHighest(SideFileReader& reader, int count);

/// The cells of a row, `number` being its place from 1; the games are left out of a list of one
/// date.
[[nodiscard]] std::array<std::string, 5> HighestCells(int number, const HighestRow& row,
                                                      HighestOf list);

}  // namespace marlowbeck
