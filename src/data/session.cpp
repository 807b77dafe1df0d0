#include "data/session.h"

namespace marlowbeck {

std::vector<SessionField> FieldsOf(const Session& session) {
  const Session& s = session;
  return {
      {"PlayerFile", s.PlayerFile},
      {"ResultsFile", s.ResultsFile},
      {"LadderFile", s.LadderFile},
      {"LadderConfigFile", s.LadderConfigFile},
      {"SeasonFile", s.SeasonFile},
      {"SeasonReportFile", s.SeasonReportFile},
      {"SeasonDescription", s.SeasonDescription},
      {"Grade", s.Grade},
      {"Team", s.Team},
      {"PlayerCount", int{s.PlayerCount}},
      {"ResultCount", int{s.ResultCount}},
      {"LadderCount", int{s.LadderCount}},
      {"WorkDate", s.WorkDate},
      {"BestOfThree", int{s.BestOfThree}},
      {"BestOfThreeText", s.BestOfThreeText},
      {"GameNames", std::vector<std::string>(s.GameNames.begin(), s.GameNames.end())},
      {"EditRecord", int{s.EditRecord}},
      {"Flag", int{s.Flag}},
      {"MessageText", s.MessageText},
      {"MessageAnswer", s.MessageAnswer},
      {"ErrorNumber", int{s.ErrorNumber}},
      {"AssociationName", s.AssociationName},
      {"WinPoints", int{s.WinPoints}},
      {"LossPoints", int{s.LossPoints}},
      {"DrawPoints", int{s.DrawPoints}},
      {"FinalsTeams", int{s.FinalsTeams}},
      {"GamesPerMatch", int{s.GamesPerMatch}},
      {"LadderDate", s.LadderDate},
      {"SelectedHome", s.SelectedHome},
      {"SelectedAway", s.SelectedAway},
      {"TeamCount", int{s.TeamCount}},
      {"DateList", s.DateList},
      {"SearchText", s.SearchText},
      {"Opposition", s.Opposition},
      {"HiLabel", s.HiLabel},
      {"TeamDates", s.TeamDates},
      {"MeanAverage", s.MeanAverage},
      {"ReportChoice", s.ReportChoice},
      {"DateCount", int{s.DateCount}},
      {"RowCount", int{s.RowCount}},
      {"PrintFontName", s.PrintFontName},
      {"PrintFontSize", int{s.PrintFontSize}},
      {"PrintFontBold", s.PrintFontBold},
      {"PrintFontItalic", s.PrintFontItalic},
      {"PrintBoldBase", s.PrintBoldBase},
      {"Quiet", s.Quiet},
  };
}

}  // namespace marlowbeck
