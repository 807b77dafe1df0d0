#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

#include "data/date.h"
#include "data/integer.h"
#include "data/table.h"

namespace marlowbeck {

/// The one set of shared values, alive from start to exit: beside the files, all that screens tell
/// each other.
struct Session {
  std::string PlayerFile;   ///< full path of the open player file; empty: no file is open
  std::string ResultsFile;  ///< of the grade in hand, as the five below
  std::string LadderFile;
  std::string LadderConfigFile;
  std::string SeasonFile;
  std::string SeasonReportFile;
  std::string SeasonDescription;  ///< last read from or written to SeasonFile
  std::string Grade;              ///< grade in hand, trimmed
  std::string Team;               ///< team in hand
  Integer PlayerCount;            ///< records in the player file when it was last opened
  Integer ResultCount;
  Integer LadderCount;
  Date WorkDate;
  Integer BestOfThree;  ///< code in hand, as in the player record
  std::string BestOfThreeText;
  std::array<std::string, 6> GameNames;  ///< three names and their three short forms
  Integer EditRecord;                    ///< record being edited; 0 while a new one is made
  Integer Flag;                          ///< hand-over from one event to the next
  std::string MessageText;               ///< text for the next box
  int MessageAnswer = 0;                 ///< answer of the last box
  Integer ErrorNumber;                   ///< handed to the error box
  std::string AssociationName;           ///< printed at the head of reports
  Integer WinPoints;   ///< the ladder configuration of the grade in hand, with the
  Integer LossPoints;  ///< four below
  Integer DrawPoints;
  Integer FinalsTeams;
  Integer GamesPerMatch;

  Date LadderDate;           ///< up to which the ladder is shown
  std::string SelectedHome;  ///< the teams picked for the match in hand
  std::string SelectedAway;
  Integer TeamCount;           ///< teams of the grade in hand, on the ladder
  std::vector<Date> DateList;  ///< the distinct dates of the ladder file

  std::string SearchText;  ///< upper-cased part of a surname to look for

  std::string Opposition;       ///< the opposing team of the date in hand (reports)
  std::string HiLabel;          ///< what the values of the list in hand are headed with (reports)
  std::vector<Date> TeamDates;  ///< the distinct dates of the team or grade in hand
  double MeanAverage = 0;       ///< that handicaps were last worked out from (reports)
  int ReportChoice = 0;         ///< which entry of the Reports menu is open
  Integer DateCount;            ///< the dates of TeamDates, or those of the ladder
  Integer RowCount;             ///< rows of the table in hand

  std::string PrintFontName = "MS Sans Serif";
  std::int32_t PrintFontSize = 10;  ///< whole points
  bool PrintFontBold = false;
  bool PrintFontItalic = false;
  bool PrintBoldBase = false;  ///< the printer's bold once it is prepared

  bool Quiet = false;  ///< warnings of a guard are held back (score sheets)
};

using SessionValue =
    std::variant<std::string, int, bool, double, Date, std::vector<std::string>, std::vector<Date>>;

struct SessionField {
  std::string_view name;
  SessionValue value;
};

/// Every field by name, in the order of the record.
[[nodiscard]] std::vector<SessionField> FieldsOf(const Session& session);

}  // namespace marlowbeck
