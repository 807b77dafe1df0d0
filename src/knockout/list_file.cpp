#include "knockout/list_file.h"

#include <string_view>
#include <vector>

namespace marlowbeck {
namespace {

constexpr std::size_t kPlaces = kMostEntrants;
constexpr std::size_t kDateItem = 2 * kPlaces;
constexpr std::size_t kGradeItem = kDateItem + 1;
constexpr std::size_t kItems = kGradeItem + 1;
constexpr std::string_view kBetweenTexts = "\",\"";

/// An item has a line of its own, so that a text ends at the last quote there, whatever it holds.
std::vector<std::string> ItemsOf(const std::string& content) {
  SideFileReader reader(content);
  std::vector<std::string> items;
  while (!reader.AtEnd()) items.push_back(reader.TextToLastQuote());
  return items;
}

/// The last line begins with a quote and has not another one at its end.
bool IsCutShort(std::string_view content) {
  if (content.ends_with('\n')) content.remove_suffix(1);
  if (content.ends_with('\r')) content.remove_suffix(1);
  const std::string_view line = content.substr(content.rfind('\n') + 1);
  return line.starts_with('"') && (line.size() == 1 || !line.ends_with('"'));
}

/// Answers whether the item is a date.
bool TakeDate(const std::string& item, Date& date) {
  try {
    date = SideFileReader(item).Day();
    return true;
  } catch (const RunTimeError&) {
    return false;
  }
}

}  // namespace

void WriteList(SideFileWriter& writer, const KnockOutList& list) {
  for (const Entrant& place : list.places) writer.Text(place.name).EndLine();
  for (const Entrant& place : list.places) writer.Text(place.grade).EndLine();
  writer.Day(list.date).EndLine();
  writer.Text(list.grade).EndLine();
}

ListReading ReadList(const std::string& content) {
  const std::vector<std::string> items = ItemsOf(content);
  ListReading reading;
  for (std::size_t i = 0; i < kPlaces; ++i) {
    if (i < items.size()) reading.list.places[i].name = items[i];
    if (kPlaces + i < items.size()) reading.list.places[i].grade = items[kPlaces + i];
  }
  if (!items.empty()) reading.last_item = items.back();
  reading.whole = items.size() == kItems && !IsCutShort(content) &&
                  TakeDate(items[kDateItem], reading.list.date);
  if (reading.whole) reading.list.grade = items[kGradeItem];
  return reading;
}

void WriteWorkFile(SideFileWriter& writer, const WorkingList& list) {
  for (const Entrant& place : list.places) writer.Text(place.name).Text(place.grade).EndLine();
  writer.Text(list.grade).EndLine();
}

/// A name may hold what parts two items; a grade does not.
WorkingList ReadWorkFile(SideFileReader& reader) {
  WorkingList list;
  for (Entrant& place : list.places) {
    const std::string line = reader.TextToLastQuote();
    const auto cut = line.rfind(kBetweenTexts);
    if (cut == std::string::npos) throw RunTimeError(ErrorNumber::TypeMismatch);
    place = {line.substr(0, cut), line.substr(cut + kBetweenTexts.size())};
  }
  list.grade = reader.TextToLastQuote();
  return list;
}

}  // namespace marlowbeck
