#include "stats/team_reports.h"

#include <utility>

#include "stats/read_records.h"
#include "stats/team_dates.h"

namespace marlowbeck {
namespace {

constexpr const char* kWeeklyFile = "weekly.qz3";
constexpr const char* kProgressiveFile = "progweek.qz3";

}  // namespace

void TeamReports::CalcWeekly(Session& session, Channels& channels) {
  season_.reset();
  WeeklyResults weekly(session.Team, session.WorkDate);
  ProgressiveDetails season(session.Team, session.Grade, session.WorkDate);
  ReadPlayers(session, channels, [&](const PlayerView& player) { season.AddPlayer(player); });
  ReadResults(session, channels, [&](const ResultView& result) {
    weekly.AddResult(result);
    season.AddResult(result);
  });
  ReadPlayers(session, channels, [&](const PlayerView& player) { weekly.AddPlayer(player); });
  if (const auto opposition = weekly.Opposition()) session.Opposition = *opposition;
  const std::vector<WeeklyRow> rows = weekly.Rows();
  session.RowCount = static_cast<int>(rows.size());
  channels.OpenOutput(Channel::Side, kWeeklyFile, Keeping::Working);
  WriteWeekly(channels.Writer(Channel::Side), rows);
  channels.CloseAll();
  season_ = std::move(season);
}

std::vector<WeeklyRow> ReadWeeklyFile(const Session& session, Channels& channels) {
  channels.OpenInput(Channel::Side, kWeeklyFile);
  std::vector<WeeklyRow> rows = ReadWeekly(channels.Reader(Channel::Side), session.RowCount);
  channels.CloseAll();
  return rows;
}

std::vector<ProgressiveRow> TeamReports::CalcProg(Session& session, Channels& channels) {
  session.RowCount = 0;
  std::optional<ProgressiveDetails> season = std::exchange(season_, std::nullopt);
  if (!season || !season->IsFor(session.Team, session.Grade, session.WorkDate)) {
    season.emplace(session.Team, session.Grade, session.WorkDate);
    ReadPlayers(session, channels, [&](const PlayerView& player) { season->AddPlayer(player); });
    ReadResults(session, channels, [&](const ResultView& result) { season->AddResult(result); });
  }
  std::vector<ProgressiveRow> rows = season->Rows();
  session.RowCount = static_cast<int>(rows.size());
  channels.OpenOutput(Channel::Side, kProgressiveFile, Keeping::Working);
  WriteProgressive(channels.Writer(Channel::Side), rows);
  channels.CloseAll();
  return rows;
}

void GetDates(Session& session, Channels& channels) {
  session.TeamDates.clear();
  session.DateCount = 0;
  TeamDates dates(session.Team);
  ReadResults(session, channels, [&](const ResultView& result) { dates.AddResult(result); });
  channels.CloseAll();
  session.TeamDates = dates.Sorted();
  session.DateCount = static_cast<int>(session.TeamDates.size());
}

}  // namespace marlowbeck
