#include "data/side_file.h"

#include <algorithm>

#include "data/numbers.h"
#include "data/text.h"

namespace marlowbeck {

SideFileWriter& SideFileWriter::Text(std::string_view text) {
  Item("\"");
  content_.append(text).append(1, '"');
  return *this;
}

SideFileWriter& SideFileWriter::Number(double number) {
  Item(NumberText(number));
  return *this;
}

SideFileWriter& SideFileWriter::Day(Date date) {
  Item('#' + IsoDate(date) + '#');
  return *this;
}

SideFileWriter& SideFileWriter::Truth(bool truth) {
  Item(truth ? "#TRUE#" : "#FALSE#");
  return *this;
}

SideFileWriter& SideFileWriter::Nothing() {
  Item({});
  return *this;
}

SideFileWriter& SideFileWriter::EndLine() {
  content_ += "\r\n";
  line_begun_ = false;
  return *this;
}

SideFileWriter& SideFileWriter::PlainLine(std::string_view text) {
  content_ += text;
  return EndLine();
}

void SideFileWriter::Item(std::string_view written) {
  if (line_begun_) content_ += ',';
  content_ += written;
  line_begun_ = true;
}

bool SideFileReader::AtEnd() const { return place_ >= content_.size(); }

std::string SideFileReader::Text() { return Item(); }

std::string SideFileReader::TextToFirstQuote() { return Item(Quotes::ToFirst); }

std::string SideFileReader::TextToLastQuote() { return Item(Quotes::ToLast); }

double SideFileReader::Number() { return NumberOf(Item()); }

Date SideFileReader::Day() {
  const std::string item = Item();
  if (item.size() < 2 || item.front() != '#' || item.back() != '#') {
    throw RunTimeError(ErrorNumber::TypeMismatch);
  }
  const auto date = DateFromIso(std::string_view(item).substr(1, item.size() - 2));
  if (!date) throw RunTimeError(ErrorNumber::TypeMismatch);
  return *date;
}

bool SideFileReader::Truth() {
  const std::string item = Item();
  if (item != "#TRUE#" && item != "#FALSE#") throw RunTimeError(ErrorNumber::TypeMismatch);
  return item == "#TRUE#";
}

std::string SideFileReader::Item(Quotes quotes) {
  if (AtEnd()) throw RunTimeError(ErrorNumber::InputPastEnd);
  place_ = content_.find_first_not_of(" \t", place_);
  if (place_ == std::string::npos) {
    place_ = content_.size();
    return {};
  }
  std::string item;
  if (content_[place_] == '"') {
    const auto end = ClosingQuote(quotes);
    item = content_.substr(place_ + 1, end - place_ - 1);
    place_ = end;
    place_ = std::min(content_.find_first_of(",\r\n", place_), content_.size());
  } else {
    const auto end = std::min(content_.find_first_of(",\r\n", place_), content_.size());
    item = Trim(std::string_view(content_).substr(place_, end - place_));
    place_ = end;
  }
  PassSeparator();
  return item;
}

/// Where the quoted text ends that begins at the present place. A whole text ends at the first
/// quote of its line with nothing but blanks between it and the item's end, or else at the first
/// quote there is.
std::size_t SideFileReader::ClosingQuote(Quotes quotes) const {
  const auto line_end = std::min(content_.find_first_of("\r\n", place_), content_.size());
  const auto first = std::min(content_.find('"', place_ + 1), content_.size());
  if (quotes == Quotes::ToFirst || first >= line_end) return first;
  if (quotes == Quotes::ToLast) return content_.rfind('"', line_end - 1);
  for (auto quote = first; quote < line_end; quote = content_.find('"', quote + 1)) {
    const auto next = content_.find_first_not_of(" \t", quote + 1);
    if (next == std::string::npos || next == line_end || content_[next] == ',') return quote;
  }
  return first;
}

void SideFileReader::PassSeparator() {
  if (AtEnd()) return;
  const bool windows_line_end = content_.compare(place_, 2, "\r\n") == 0;
  place_ += windows_line_end ? 2 : 1;
}

bool SideFileIsAtFault(const RunTimeError& error) {
  switch (static_cast<ErrorNumber>(error.Number())) {
    case ErrorNumber::FileNotFound:
    case ErrorNumber::InputPastEnd:
    case ErrorNumber::TypeMismatch:
      return true;
    default:
      return false;
  }
}

}  // namespace marlowbeck
