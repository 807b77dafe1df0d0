#include "data/competition.h"

#include "data/gap_sort.h"
#include "data/table.h"
#include "data/text.h"

namespace marlowbeck {
namespace {

constexpr int kListPlaces = 1000;
constexpr const char* kWorkDateFile = "WkDate.qz3";

/// Collects a name from the player records that `wanted` lets pass.
template <typename Wanted, typename Name>
std::vector<std::string> NamesInFile(Channels& channels, Wanted wanted, Name name) {
  std::vector<std::string> names;
  channels.ForEachRecord(Channel::Players, [&](Bytes bytes, int) {
    const PlayerView player(bytes);
    if (wanted(player)) names.emplace_back(name(player));
    // The look at the entry after the last needs a place of its own.
    if (names.size() >= kListPlaces) throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
  });
  return names;
}

}  // namespace

std::string WithExtension(std::string_view path, std::string_view extension) {
  return WithoutLast(path, 4) + std::string(extension);
}

std::string GradeFileName(std::string_view player_file, std::string_view grade,
                          std::string_view extension) {
  return WithoutLast(player_file, 4) + "_" + Trim(grade) + std::string(extension);
}

void NameGradeFiles(Session& session) {
  session.ResultsFile = GradeFileName(session.PlayerFile, session.Grade, ".qzr");
  session.LadderFile = WithExtension(session.ResultsFile, ".qzl");
  session.LadderConfigFile = WithExtension(session.ResultsFile, ".qzi");
  session.SeasonFile = WithExtension(session.ResultsFile, ".qzs");
  session.SeasonReportFile = WithExtension(session.ResultsFile, ".qz3");
}

void OpenFile(Session& session, Channels& channels) {
  channels.Close(Channel::Players);
  if (session.PlayerFile.empty()) return;
  channels.OpenRandom(Channel::Players, session.PlayerFile, kPlayerLength);
  session.PlayerCount = channels.RecordCount(Channel::Players);
}

void OpenResultSFile(Session& session, Channels& channels) {
  channels.Close(Channel::Results);
  if (session.ResultsFile.empty()) return;
  channels.OpenRandom(Channel::Results, session.ResultsFile, kResultLength);
  session.ResultCount = channels.RecordCount(Channel::Results);
}

void OpenLadderFile(Session& session, Channels& channels) {
  channels.CloseAll();
  channels.OpenRandom(Channel::Ladder, session.LadderFile, kLadderLength);
  session.LadderCount = channels.RecordCount(Channel::Ladder);
}

std::vector<std::string> GradesInFile(Channels& channels) {
  return NamesInFile(
      channels, [](const PlayerView&) { return true; },
      [](const PlayerView& player) { return player.Grade(); });
}

std::vector<std::string> TeamsInFile(Channels& channels, std::string_view grade) {
  const std::string_view wanted = Trimmed(grade);
  return NamesInFile(
      channels, [&](const PlayerView& player) { return player.Grade() == wanted; },
      [](const PlayerView& player) { return player.Team(); });
}

std::vector<std::string> SortedDistinct(const std::vector<std::string>& names) {
  const int count = static_cast<int>(names.size());
  Table<std::string> table(1, kListPlaces);
  for (int i = 1; i <= count; ++i) table[i] = names[static_cast<std::size_t>(i - 1)];
  GapSort(
      count, [&](int j, int k) { return !(table[k] < table[j]); },
      [&](int j, int k) { table.Swap(j, k); });
  std::vector<std::string> distinct;
  for (int i = 1; i <= count; ++i) {
    if (i == count || table[i] != table[i + 1]) distinct.push_back(table[i]);
  }
  return distinct;
}

Date ReadWorkDate(Channels& channels) {
  channels.OpenInput(Channel::Side, kWorkDateFile);
  const Date date = channels.Reader(Channel::Side).Day();
  channels.Close(Channel::Side);
  return date;
}

void WriteWorkDate(Channels& channels, Date date) {
  channels.OpenOutput(Channel::Side, kWorkDateFile, Keeping::Lasting);
  channels.Writer(Channel::Side).Day(date).EndLine();
  channels.Close(Channel::Side);
}

std::string ReadOneString(Channels& channels, const std::string& path) {
  channels.OpenInput(Channel::Side, path);
  std::string text = channels.Reader(Channel::Side).TextToLastQuote();
  channels.Close(Channel::Side);
  return text;
}

void WriteOneString(Channels& channels, const std::string& path, std::string_view text) {
  channels.OpenOutput(Channel::Side, path, Keeping::Lasting);
  channels.Writer(Channel::Side).Text(text).EndLine();
  channels.Close(Channel::Side);
}

}  // namespace marlowbeck
