#include "drive/arguments.h"

#include <charconv>
#include <utility>

#include "data/text.h"
#include "drive/refusal.h"

namespace marlowbeck {
namespace {

constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";

std::string_view WithoutLeadingBlanks(std::string_view text) {
  const auto first = text.find_first_not_of(' ');
  return first == std::string_view::npos ? std::string_view() : text.substr(first);
}

/// No control character, and none of the places of the code page that are empty.
bool IsWritten(char letter) {
  constexpr std::string_view kEmptyPlaces = "\x7F\x81\x8D\x8F\x90\x9D";
  return static_cast<unsigned char>(letter) >= ' ' &&
         kEmptyPlaces.find(letter) == std::string_view::npos;
}

}  // namespace

std::optional<std::string> ReadScriptLine(std::string_view line) {
  if (line.starts_with(kByteOrderMark)) line.remove_prefix(kByteOrderMark.size());
  if (line.ends_with('\n')) line.remove_suffix(1);
  if (line.ends_with('\r')) line.remove_suffix(1);
  if (line.empty() || line.front() == '#') return std::nullopt;
  return TextOfName(line);
}

std::optional<int> WholeNumber(std::string_view word) {
  int number = 0;
  const auto [end, error] = std::from_chars(word.data(), word.data() + word.size(), number);
  if (error != std::errc() || end != word.data() + word.size()) return std::nullopt;
  return number;
}

Arguments::Arguments(std::string_view line) : rest_(line) {
  command_ = AtEnd() ? std::string() : Word("a command");
}

bool Arguments::AtEnd() const { return WithoutLeadingBlanks(rest_).empty(); }

std::string Arguments::Word(std::string_view what) {
  rest_ = WithoutLeadingBlanks(rest_);
  if (rest_.empty()) Refuse("needs " + std::string(what));
  const auto end = rest_.find(' ');
  const std::string word(rest_.substr(0, end));
  rest_ = end == std::string_view::npos ? std::string_view() : rest_.substr(end);
  return word;
}

int Arguments::Number(std::string_view what, int least) {
  const std::string word = Word(what);
  const auto number = WholeNumber(word);
  if (!number) Refuse("needs a number for " + std::string(what) + ", not \"" + word + "\"");
  if (*number < least) Refuse(std::string(what) + " must be at least " + std::to_string(least));
  return *number;
}

Date Arguments::Day(std::string_view what) {
  const std::string word = Word(what);
  const auto date = DateFromIso(word);
  if (!date) Refuse("needs a date as YYYY-MM-DD, not \"" + word + "\"");
  return *date;
}

std::string Arguments::RestAsName() {
  if (rest_.starts_with(' ')) rest_.remove_prefix(1);
  return std::string(std::exchange(rest_, {}));
}

std::string Arguments::Rest() { return WithoutEscapes(RestAsName()); }

std::string Arguments::TypedName() {
  std::string text = RestAsName();
  for (const char letter : WithoutEscapes(text)) {
    if (IsWritten(letter)) continue;
    Refuse("there is no key that writes character " +
           std::to_string(static_cast<unsigned char>(letter)) + " into a box");
  }
  return text;
}

std::string Arguments::Typed() { return WithoutEscapes(TypedName()); }

void Arguments::Finish() const {
  if (!AtEnd()) {
    Refuse("has \"" + std::string(WithoutLeadingBlanks(rest_)) + "\" more than it takes");
  }
}

void Arguments::Refuse(std::string_view why) const {
  throw Refusal(command_ + (about_.empty() ? "" : " " + about_) + ": " + std::string(why));
}

}  // namespace marlowbeck
