#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "data/id_index.h"
#include "data/records.h"
#include "data/side_file.h"

namespace marlowbeck {

/// One player's season up to a date. The sums hold any number of records' worth.
struct ProgressiveRow {
  std::string name;  ///< "Surname, First name"
  std::int32_t id = 0;
  std::int64_t agg = 0;
  std::int64_t shots = 0;
  std::int16_t hs = 0;
  std::int64_t c180 = 0;
  std::int64_t c100 = 0;
  std::int32_t pegs = 0;  ///< pegs above 0
  std::int16_t hipeg = 0;
  std::int32_t games = 0;  ///< forfeits among them
  std::int32_t forfeits = 0;
  double avg = 0;  ///< points per shot, cut to two places; 0 for none

  friend bool operator==(const ProgressiveRow&, const ProgressiveRow&) = default;
};

/// The season of the players who stand in one team and grade, up to a date and with it. It is
/// handed every player record in file order, then every result record of the grade in file order,
/// and answers the rows. A result counts for its player whatever team it names.
class ProgressiveDetails {
 public:
  ProgressiveDetails(std::string_view team, std::string_view grade, Date until)
      : team_(team), grade_(grade), until_(until) {}

  [[nodiscard]] bool IsFor(std::string_view team, std::string_view grade, Date until) const {
    return team_ == team && grade_ == grade && until_ == until;
  }

  void AddPlayer(const PlayerView& player);
  void AddResult(const ResultView& result);

  /// A row for each player record of the team, also without a result, best average first.
  /// Throws SubscriptOutOfRange past 1000 players of the team.
  [[nodiscard]] std::vector<ProgressiveRow> Rows() const;

 private:
  /// What the results of one id add up to.
  struct Sums {
    ProgressiveRow totals;
    std::int64_t average_agg = 0;  ///< as they stood when both were last above 0
    std::int64_t average_shots = 0;
  };

  static void Count(Sums& sums, const ResultView& result);
  static void CountPegs(ProgressiveRow& totals, const ResultView& result);
  [[nodiscard]] ProgressiveRow RowOf(const std::string& name, std::int32_t id) const;

  std::string team_;
  std::string grade_;
  Date until_;
  std::vector<std::pair<std::string, std::int32_t>> players_;  ///< name and id
  IdIndex ids_;
  std::vector<Sums> sums_;  ///< of the ids in their places
};

/// A line a row: name, agg, shots, hs, c180, c100, pegs, hipeg, games, avg.
void WriteProgressive(SideFileWriter& writer, const std::vector<ProgressiveRow>& rows);

enum class Forfeits { Counted, LeftOut };

/// The cells of a row in the progressive table. Forfeits are counted as games played or not;
/// nothing else depends on it.
[[nodiscard]] std::array<std::string, 10> ProgressiveCells(const ProgressiveRow& row,
                                                           Forfeits forfeits);

}  // namespace marlowbeck
