#include "stats/grade_reports.h"

#include "data/competition.h"
#include "stats/read_records.h"

namespace marlowbeck {
namespace {

constexpr const char* kHighestFile = "Highest.qz3";
constexpr const char* kCombineFile = "Combine.qz3";

HighestOf ListInHand(const Session& session) {
  return static_cast<HighestOf>(session.ReportChoice);
}

void KeepHighest(Session& session, Channels& channels, const std::vector<HighestRow>& rows) {
  channels.OpenOutput(Channel::Side, kHighestFile, Keeping::Working);
  WriteHighest(channels.Writer(Channel::Side), rows);
  channels.CloseAll();
  session.RowCount = static_cast<int>(rows.size());
}

void KeepCombined(Session& session, Channels& channels, const std::vector<CombinedRow>& rows) {
  channels.OpenOutput(Channel::Side, kCombineFile, Keeping::Working);
  WriteCombined(channels.Writer(Channel::Side), rows);
  channels.CloseAll();
  session.RowCount = static_cast<int>(rows.size());
}

}  // namespace

void GetHiDates(Session& session, Channels& channels) {
  session.TeamDates.clear();
  session.DateCount = 0;
  std::vector<Date> dates;
  // KEPT: the dates stand as the records lie, and one that comes again after another is listed
  // again, since results are taken to be in date order; a repair would sort them.
  ReadResults(session, channels, [&](const ResultView& result) {
    const Date date = result.GameDate();
    if (dates.empty() || dates.back() != date) dates.push_back(date);
  });
  channels.CloseAll();
  // The place after the last one is empty, which is how date 0 reads.
  if (!dates.empty() && dates.back() == Date{}) dates.pop_back();
  session.TeamDates = std::move(dates);
  session.DateCount = static_cast<int>(session.TeamDates.size());
}

void CalcHi(Session& session, Channels& channels) {
  session.RowCount = 0;
  HighestOfDate highest(ListInHand(session), session.WorkDate);
  ReadResults(session, channels, [&](const ResultView& result) { highest.AddResult(result); });
  if (highest.Any()) {
    session.HiLabel = HeadingOf(ListInHand(session), ListSpan::OneDate);
    ReadPlayers(session, channels, [&](const PlayerView& player) { highest.AddPlayer(player); });
  }
  KeepHighest(session, channels, highest.TakeRows());
}

void CalcHiProg(Session& session, Channels& channels) {
  session.RowCount = 0;
  session.HiLabel = HeadingOf(ListInHand(session), ListSpan::UpToDate);
  HighestUpToDate highest(ListInHand(session), session.WorkDate);
  ReadPlayers(session, channels, [&](const PlayerView& player) { highest.AddPlayer(player); });
  ReadResults(session, channels, [&](const ResultView& result) { highest.AddResult(result); });
  KeepHighest(session, channels, highest.Rows());
}

std::vector<HighestRow> ReadHighestFile(const Session& session, Channels& channels) {
  channels.OpenInput(Channel::Side, kHighestFile);
  std::vector<HighestRow> rows = ReadHighest(channels.Reader(Channel::Side), session.RowCount);
  channels.CloseAll();
  return rows;
}

void CombineAV(Session& session, Channels& channels, const std::vector<std::string>& grades) {
  session.RowCount = 0;
  CombinedAverages averages(session.WorkDate);
  ReadPlayers(session, channels, [&](const PlayerView& player) { averages.AddPlayer(player); });
  for (const std::string& grade : grades) {
    session.ResultsFile = GradeFileName(session.PlayerFile, grade, ".qzr");
    ReadResults(session, channels, [&](const ResultView& result) { averages.AddResult(result); });
    averages.EndGrade();
  }
  KeepCombined(session, channels, averages.Rows());
}

void CombineSort(Session& session, Channels& channels, CombinedOrder order) {
  KeepCombined(session, channels, Ordered(ReadCombineFile(session, channels), order));
}

std::vector<CombinedRow> ReadCombineFile(const Session& session, Channels& channels) {
  channels.OpenInput(Channel::Side, kCombineFile);
  std::vector<CombinedRow> rows = ReadCombined(channels.Reader(Channel::Side), session.RowCount);
  channels.CloseAll();
  return rows;
}

}  // namespace marlowbeck
