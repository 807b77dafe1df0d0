#pragma once

#include <string>
#include <vector>

#include "stats/report_records.h"
#include "support/club.h"

namespace marlowbeck {

inline constexpr double kFirstNight = 38063;   // 17/03/2004
inline constexpr double kSecondNight = 38070;  // 24/03/2004

/// A club with the Reports screen in front of it.
class ReportsTest : public ClubTest {
 protected:
  /// One grade, "A", with its season's title, as the file that is open at the start.
  void Lay(const std::vector<PlayerRecord>& players, const std::vector<ResultRecord>& results) {
    WritePlayers("Winter.qza", players);
    WriteResults("Winter_A.qzr", results);
    WriteFile("Winter_A.qzs", "\"Winter 2004\"\r\n");
    NameOpenFile("Winter.qza");
  }

  /// Two players of the Rovers who met the Hawks on the first night and the Swifts on the second,
  /// on which one of them forfeited.
  void LayRovers() {
    Lay({Person(1, "Archer", "Jo", "Rovers", "A"), Person(2, "Baker", "Al", "Rovers", "A")},
        {Night(1, "Rovers", "Hawks", kFirstNight, 500, 20),
         Night(2, "Rovers", "Hawks", kFirstNight, 300, 10),
         Night(1, "Rovers", "Swifts", kSecondNight, 505, 20),
         ForfeitNight(2, "Rovers", "Swifts", kSecondNight)});
  }

  void OpenReports(Here here = Here::current()) { Do("click imgPrinter", here); }
  void OpenWeekly(Here here = Here::current()) {
    OpenReports(here);
    Do("click Image6", here);
  }

  /// The error numbers that the last command told.
  std::vector<int> Errors() const {
    std::vector<int> numbers;
    for (const Json& error : EventsNamed("error")) numbers.push_back(error["number"]);
    return numbers;
  }
};

}  // namespace marlowbeck
