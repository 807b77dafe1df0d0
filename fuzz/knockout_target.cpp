// The list file of a knock-out, through its reader, the draw and its writer.

#include <algorithm>
#include <string>

#include "fuzz/checks.h"
#include "fuzz/targets.h"
#include "knockout/draw.h"
#include "knockout/list_file.h"

namespace marlowbeck::fuzz {
namespace {

/// A line end within a text parts it when it is written.
bool CanBeWritten(const KnockOutList& list) {
  const auto is_line = [](const std::string& text) {
    return text.find_first_of("\r\n") == text.npos;
  };
  return is_line(list.grade) &&
         std::all_of(list.places.begin(), list.places.end(), [&](const Entrant& place) {
           return is_line(place.name) && is_line(place.grade);
         });
}

void WriteAndReadAgain(const KnockOutList& list) {
  SideFileWriter writer;
  WriteList(writer, list);
  const ListReading again = ReadList(writer.Content());
  Must(again.whole, "what was written is whole");
  Must(again.list.places == list.places, "the places read back");
  Must(again.list.date == list.date && again.list.grade == list.grade, "date and grade read back");
  Must(!ReadList(writer.Content() + "\"\"\r\n").whole, "a line more is one too many");
}

void DrawThem(const KnockOutList& list) {
  std::vector<Entrant> entrants;
  for (const Entrant& place : list.places) {
    if (!place.IsFree()) entrants.push_back(place);
  }
  Chance chance(entrants.size());
  const std::vector<Entrant> drawn = Draw(entrants, [&chance] { return chance.Next(); });
  Must(std::is_permutation(drawn.begin(), drawn.end(), entrants.begin(), entrants.end()),
       "a draw loses and adds nobody");
}

void CloseUp(const KnockOutList& list) {
  SideFileWriter writer;
  WriteWorkFile(writer, {list.places, list.grade});
  SideFileReader reader(writer.Content());
  Must(ReadWorkFile(reader).grade == list.grade, "the work file reads back");
}

}  // namespace

void KnockOut(Input input) {
  const std::string content(reinterpret_cast<const char*>(input.data()), input.size());
  const ListReading reading = ReadList(content);
  DrawThem(reading.list);
  if (!reading.whole) return;
  Must(reading.last_item == reading.list.grade, "the last item is the grade");
  if (!CanBeWritten(reading.list)) return;
  WriteAndReadAgain(reading.list);
  CloseUp(reading.list);
}

}  // namespace marlowbeck::fuzz
