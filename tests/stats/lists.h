#pragma once

#include "stats/reports.h"

namespace marlowbeck {

/// A club with two grades and the lists of the highest in front of it.
class ListsTest : public ReportsTest {
 protected:
  using TextList = Club::TextList;

  /// Grade A: Archer and Baker of the Rovers, Clark of the Hawks. On the first night they average
  /// 25, 30 and 25 points; on the second Archer 25.25 and Clark 30, and Baker forfeits. Up to then
  /// that is 25.12, 30 and 27.22. Grade B: Dean alone, 20.
  void LayClub() {
    WritePlayers("Winter.qza",
                 {Person(1, "Archer", "Jo", "Rovers", "A"), Person(2, "Baker", "Al", "Rovers", "A"),
                  Person(3, "Clark", "Ed", "Hawks", "A"), Person(4, "Dean", "Di", "Bees", "B")});
    WriteResults("Winter_A.qzr",
                 {With(Night(1, "Rovers", "Hawks", kFirstNight, 500, 20), 100, 2, 1),
                  With(Night(2, "Rovers", "Hawks", kFirstNight, 300, 10), 140, 3, 0),
                  With(Night(3, "Hawks", "Rovers", kFirstNight, 250, 10), 180, 0, 0),
                  With(Night(1, "Rovers", "Hawks", kSecondNight, 505, 20), 125, 4, 0),
                  ForfeitNight(2, "Rovers", "Hawks", kSecondNight),
                  With(Night(3, "Hawks", "Rovers", kSecondNight, 240, 8), 60, 1, 0)});
    WriteResults("Winter_B.qzr", {Night(4, "Bees", "Crows", kFirstNight, 400, 20)});
    WriteFile("Winter_A.qzs", "\"Winter 2004 \"\r\n");
    WriteFile("Winter_B.qzs", "\"Summer 2004\"\r\n");
    WriteFile("Association.qz3", "\"Marlow Darts\"\r\n");
    NameOpenFile("Winter.qza");
  }

  static ResultRecord With(ResultRecord result, std::int16_t high_score, std::int16_t centuries,
                           std::int16_t scores180) {
    result.HighScore = high_score;
    result.Centuries = centuries;
    result.Scores180 = scores180;
    return result;
  }

  /// Opens a list by its entry in the menu.
  void OpenList(const std::string& entry = "Image1", Here here = Here::current()) {
    OpenReports(here);
    Do("click " + entry, here);
  }

  /// "name value" of the rows below the heading.
  TextList Ranked(Here here = Here::current()) {
    TextList ranked;
    const auto cells = Cells("grdHI", here);
    for (std::size_t row = 1; row < cells.size(); ++row) {
      ranked.push_back(cells[row][1] + " " + cells[row][3]);
    }
    return ranked;
  }
};

}  // namespace marlowbeck
