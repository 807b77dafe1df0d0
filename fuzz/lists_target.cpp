// Player and results files through the lists of the highest, and the side files of the lists.

#include <algorithm>
#include <string>
#include <vector>

#include "data/competition.h"
#include "fuzz/checks.h"
#include "fuzz/memory_file_system.h"
#include "fuzz/targets.h"
#include "stats/grade_reports.h"

namespace marlowbeck::fuzz {
namespace {

/// A name with a line end in it cannot come back from a side file; all else does.
bool HoldsLineEnds(const std::vector<std::byte>& bytes) {
  return std::any_of(bytes.begin(), bytes.end(), [](std::byte byte) {
    return byte == std::byte{'\r'} || byte == std::byte{'\n'};
  });
}

template <typename Row, typename Value>
void MustDescend(const std::vector<Row>& rows, Value value) {
  Must(std::is_sorted(rows.begin(), rows.end(),
                      [&](const Row& a, const Row& b) { return value(a) > value(b); }),
       "the highest comes first");
  Must(std::all_of(rows.begin(), rows.end(), [&](const Row& row) { return value(row) > 0; }),
       "who has no value is not listed");
}

/// Works a list out and reads it back.
void RankBy(Session& session, Channels& channels, bool whole_names) {
  const auto value = [](const HighestRow& row) { return row.value; };
  for (const auto calculate : {CalcHi, CalcHiProg}) {
    if (!Try([&] { calculate(session, channels); })) continue;
    std::vector<HighestRow> rows;
    const bool read = Try([&] { rows = ReadHighestFile(session, channels); });
    Must(read || !whole_names, "a list comes back from its file");
    if (whole_names) MustDescend(rows, value);
  }
  channels.AbandonAll();
}

void Combine(Session& session, Channels& channels, bool whole_names) {
  if (!Try([&] { CombineAV(session, channels, {"A", "B"}); })) return channels.AbandonAll();
  for (const CombinedOrder order : {CombinedOrder::ByAverage, CombinedOrder::Alphabetical}) {
    std::vector<CombinedRow> rows;
    const bool sorted = Try([&] {
      CombineSort(session, channels, order);
      rows = ReadCombineFile(session, channels);
    });
    Must(sorted || !whole_names, "the list of all grades comes back from its file");
    if (!whole_names) continue;
    if (order == CombinedOrder::ByAverage) {
      MustDescend(rows, [](const CombinedRow& row) { return row.avg; });
    } else {
      Must(std::is_sorted(
               rows.begin(), rows.end(),
               [](const CombinedRow& a, const CombinedRow& b) { return a.name < b.name; }),
           "names ascend");
    }
  }
  channels.AbandonAll();
}

void WorkOut(Input input) {
  MemoryFileSystem files;
  const std::size_t players =
      input.empty() ? 0 : std::min(input.size() - 1, std::to_integer<std::size_t>(input[0]) * 39);
  const Input rest = input.subspan(input.empty() ? 0 : 1);
  const Input results = rest.subspan(players);
  files.Bytes("a.qza").assign(rest.begin(), rest.begin() + static_cast<std::ptrdiff_t>(players));
  files.Bytes("a_A.qzr").assign(results.begin(), results.end());
  const Input half = results.first(results.size() / kResultLength / 2 * kResultLength);
  files.Bytes("a_B.qzr").assign(half.begin(), half.end());
  const bool whole_names =
      !HoldsLineEnds(files.Bytes("a.qza")) && !HoldsLineEnds(files.Bytes("a_A.qzr"));

  Channels channels(files);
  Session session;
  session.PlayerFile = "a.qza";
  session.Grade = "A";
  NameGradeFiles(session);
  Try([&] { GetHiDates(session, channels); });
  if (!session.TeamDates.empty()) session.WorkDate = session.TeamDates.back();
  for (session.ReportChoice = 0; session.ReportChoice <= 5; ++session.ReportChoice) {
    RankBy(session, channels, whole_names);
  }
  Combine(session, channels, whole_names);
}

/// What can be read can be written and read again, and then stays as it is.
template <typename Row, typename Read, typename Write>
void ReadAndWrite(const std::string& content, Read read, Write write) {
  std::vector<Row> rows;
  SideFileReader reader(content);
  if (!Try([&] { rows = read(reader, 2); })) return;
  SideFileWriter first;
  write(first, rows);
  SideFileReader again(first.Content());
  if (!Try([&] { rows = read(again, 2); })) {
    // A number that no double can hold is read as one without end, and not written as a number.
    Must(first.Content().find("inf") != std::string::npos, "what was written is read back");
    return;
  }
  SideFileWriter second;
  write(second, rows);
  Must(first.Content() == second.Content(), "what was read back is written the same");
}

}  // namespace

void Lists(Input input) {
  WorkOut(input);
  const std::string content(reinterpret_cast<const char*>(input.data()), input.size());
  ReadAndWrite<HighestRow>(content, ReadHighest, WriteHighest);
  ReadAndWrite<CombinedRow>(content, ReadCombined, WriteCombined);
}

}  // namespace marlowbeck::fuzz
