#include "fuzz/targets.h"

#include <algorithm>
#include <cmath>
#include <string>
#include <vector>

#include "data/channels.h"
#include "data/competition.h"
#include "data/date.h"
#include "data/numbers.h"
#include "data/side_file.h"
#include "data/text.h"
#include "fuzz/checks.h"
#include "fuzz/memory_file_system.h"
#include "results/opposition_finder.h"
#include "results/player_listing.h"
#include "session/sort_pass.h"

namespace marlowbeck::fuzz {
namespace {

std::string TextOf(Input input) {
  return {reinterpret_cast<const char*>(input.data()), input.size()};
}

std::vector<std::string> TextsOf(const std::string& content) {
  SideFileReader reader(content);
  std::vector<std::string> texts;
  while (!reader.AtEnd()) texts.push_back(reader.Text());
  Must(!Try([&] { (void)reader.Text(); }), "reading past the end is an error");
  return texts;
}

/// What a quoted text cannot carry: a line end, or a quote that looks like its last one.
bool CanBeQuoted(const std::string& text) {
  if (text.find_first_of("\r\n") != std::string::npos) return false;
  for (auto quote = text.find('"'); quote != std::string::npos; quote = text.find('"', quote + 1)) {
    const auto next = text.find_first_not_of(" \t", quote + 1);
    if (next != std::string::npos && (text[next] == ',' || text[next] == '"')) return false;
  }
  return true;
}

void ReadAsKinds(const std::string& content) {
  SideFileReader reader(content);
  for (std::size_t item = 0; !reader.AtEnd(); ++item) {
    Try([&] {
      if (item % 3 == 0) (void)reader.Number();
      if (item % 3 == 1) (void)reader.Day();
      if (item % 3 == 2) (void)reader.Truth();
    });
  }
}

void SortAndCompare(MemoryFileSystem& files, Channels& channels) {
  const auto before = files.Bytes("a_.qzr");
  const bool sorted = Try([&] { SortResults(channels, "a_.qzr", "a_.qz3", [](int) {}); });
  channels.AbandonAll();
  const auto after = files.Bytes("a_.qzr");
  if (!sorted) return Must(before == after, "a failed sort leaves the file as it was");
  auto records = RecordsOf(before, kResultLength);
  std::stable_sort(records.begin(), records.end(), [](const auto& a, const auto& b) {
    return ResultView(a).GameDate() < ResultView(b).GameDate();
  });
  Must(records == RecordsOf(after, kResultLength), "the sort keeps the order within a date");
}

void List(Session& session, Channels& channels, const std::vector<std::string>& teams) {
  const std::string team = teams.empty() ? "" : teams.front();
  PlayerListing listing(team, session.Grade, "", Date{38077}, session.PlayerCount);
  OppositionFinder finder(teams, team, Date{38077});
  channels.ForEachRecord(Channel::Players,
                         [&](Bytes bytes, int) { listing.AddPlayer(PlayerView(bytes)); });
  channels.ForEachRecord(Channel::Results, [&](Bytes bytes, int) {
    listing.AddResult(ResultView(bytes));
    finder.AddResult(ResultView(bytes));
  });
  (void)listing.ToEnter();
  (void)listing.Entered();
  Must(finder.Free().size() <= teams.size(), "only teams of the list are free");
}

}  // namespace

void SideFile(Input input) {
  const std::string content = TextOf(input);
  ReadAsKinds(content);
  SideFileWriter writer;
  std::vector<std::string> written;
  for (const std::string& text : TextsOf(content)) {
    if (!CanBeQuoted(text)) continue;
    writer.Text(text).EndLine();
    written.push_back(text);
  }
  Must(TextsOf(writer.Content()) == written, "what was written is read back");
}

void Records(Input input) {
  MemoryFileSystem files;
  const std::size_t players =
      input.empty() ? 0 : std::min(input.size() - 1, std::to_integer<std::size_t>(input[0]) * 39);
  const Input rest = input.subspan(input.empty() ? 0 : 1);
  files.Bytes("a.qza").assign(rest.begin(), rest.begin() + static_cast<std::ptrdiff_t>(players));
  files.Bytes("a_.qzr").assign(rest.begin() + static_cast<std::ptrdiff_t>(players), rest.end());

  Channels channels(files);
  Session session;
  session.PlayerFile = "a.qza";
  NameGradeFiles(session);
  Try([&] {
    OpenFile(session, channels);
    OpenResultSFile(session, channels);
    const auto grades = SortedDistinct(GradesInFile(channels));
    Must(std::is_sorted(grades.begin(), grades.end()), "grades ascend");
    if (!grades.empty()) session.Grade = grades.front();
    List(session, channels, SortedDistinct(TeamsInFile(channels, session.Grade)));
  });
  channels.AbandonAll();
  SortAndCompare(files, channels);
}

void Words(Input input) {
  const std::string text = TextOf(input);
  Must(!std::isnan(Val(text)), "a reading is a number");
  double number = 0;
  if (Try([&] { number = NumberOf(text); })) {
    Must(number == Val(Trim(text)) || text.find('\t') != std::string::npos,
         "whole and prefix agree");
    if (std::isfinite(number)) {
      Must(std::abs(Val(NumberText(number)) - number) <= std::abs(number) * 1e-14, "written back");
    }
  }
  Try([&] { (void)CInt(text); });
  Date date;
  if (Try([&] { date = DateFromText(text); })) {
    Must(DateFromText(ShortDate(date)) == date, "a short date reads back");
    Must(DateFromText(LongDate(date)) == date, "a long date reads back");
    Must(DateFromIso(IsoDate(date)) == date, "a date of a side file reads back");
  }
  Must(Cp1252FromUtf8(Utf8FromCp1252(text)) == text, "the code page comes back");
  Must(Cp1252FromUtf8(text).size() <= text.size(), "no character is made two");
  Must(NameOfText(TextOfName(text)) == text, "the name of a file comes back");
  Must(UpperCase(UpperCase(text)) == UpperCase(text), "capitals stay");
}

}  // namespace marlowbeck::fuzz
