#pragma once

#include <algorithm>
#include <string>
#include <vector>

#include "support/league.h"

namespace marlowbeck {

/// The league with its season's title, so that the reports open without a question.
inline void LayLeagueForReports(Club& club, const std::vector<ResultRecord>& results) {
  LayLeague(club);
  club.WriteResults(kAResults, results);
  club.WriteFile("Winter_A Grade.qzs", "\"Winter 2004\"\r\n");
  club.WriteFile("Winter_B Grade.qzs", "\"Winter 2004, B\"\r\n");
  club.WriteFile("Forfeits.qz3", "1\r\n");
}

/// Lines that bring a club to the weekly table of a team, with its latest night.
inline std::vector<std::string> ToWeekly(const std::string& team) {
  return {"click imgPrinter", "click Image6", "pick cboResTeam =" + team};
}

/// The dialogs that are opened from the weekly table of the league.
class FromReports : public ScoreSheets {
 protected:
  void Lay(const std::vector<ResultRecord>& results) { LayLeagueForReports(*this, results); }
  void OpenWeekly(const std::string& team = "Hawks", Here here = Here::current()) {
    DoAll(ToWeekly(team), here);
  }

  /// The error numbers that the last command told.
  [[nodiscard]] std::vector<int> Errors() const {
    std::vector<int> numbers;
    for (const Json& error : EventsNamed("error")) numbers.push_back(error["number"]);
    return numbers;
  }

  /// The Reports screen is in front again, and nothing is left of the dialog.
  void ExpectReports(const std::string& dialog, Here here = Here::current()) {
    EXPECT_EQ(Front(here), "frmPMenu");
    EXPECT_FALSE(Loaded(dialog, here));
    EXPECT_TRUE(Enabled("cboResTeam", here));
    EXPECT_TRUE(Shown("fraWkProg", here));
  }

  /// The Reports screen cannot be worked while the dialog is open.
  void ExpectReportsOutOfReach(Here here = Here::current()) {
    const Json loaded = Do("screens", here)["screens"];
    const auto reports = std::find_if(loaded.begin(), loaded.end(), [](const Json& screen) {
      return screen["name"] == "frmPMenu";
    });
    ASSERT_NE(reports, loaded.end());
    EXPECT_EQ((*reports)["visible"], false);
    EXPECT_EQ((*reports)["enabled"], false);
    Refused("pick frmPMenu.lstAllDates 0", here);
    Refused("click frmPMenu.cmdCancelWK", here);
    Refused("close frmPMenu", here);
  }
};

}  // namespace marlowbeck
